#pragma once

// The one path of every host operation: fault check, then one transaction.
//
// Each operation of a facade or host object has one Operation constant,
// defined at namespace scope in the object's source so that its name is
// registered when the library loads:
//
//   const Trellis::Host::Operation kEnable("FirewallRuleset::Enable");
//
//   void FirewallRulesetImpl::Enable() {
//       kEnable.Write([&](Trellis::Host::Transaction& t) {
//           auto r = t.Require<FirewallRulesetRecord>(name_);
//           r.enabled = true;
//           t.Put(r);
//       });
//   }
//   bool FirewallRulesetImpl::IsEnabled() { kIsEnabled.Check(); return snapshot_.enabled; }
//
// The name is "Class::Operation", the class as the interface declares the
// operation ("SystemInfoImpl::LoadFirewallRulesets", "FirewallRuleset::Enable",
// "SystemInfoImpl::SystemInfoImpl" for a facade's constructor).
//
// Operations do not nest: an operation's function never calls another
// operation (nor Check); code shared between operations takes the
// Transaction& as a parameter. A nested call throws std::logic_error.

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// What an armed fault makes the operation do.
enum class FaultKind {
    Message,  // throw GantryException with the fault's message (every operation but one)
    Status,   // return the fault's status instead of 0 (Trellis_Exec)
};

class Operation {
public:
    // Registers name in the process-wide list of operations.
    explicit Operation(std::string name, FaultKind kind = FaultKind::Message);

    // Throws Gantry::Lib::GantryException with the message of the fault armed
    // for this operation, if any (counting the hit down). Throws
    // GantryException "No host is open" when no host is open.
    void Check() const;

    // Check(), then fn(Transaction&) in one transaction: BEGIN for Read,
    // BEGIN IMMEDIATE for Write. Commits when fn returns and rolls back when
    // it throws; the exception passes on unchanged. Returns what fn returns.
    template <class Fn>
    auto Read(Fn&& fn) const {
        return Run(false, std::forward<Fn>(fn));
    }
    template <class Fn>
    auto Write(Fn&& fn) const {
        return Run(true, std::forward<Fn>(fn));
    }

    // "Class::Operation".
    const std::string& Name() const { return name_; }

    // For a FaultKind::Status operation: the status of the fault armed for it
    // (counting the hit down), or 0 when none is armed.
    int FaultStatus() const;

    // The registry of every operation of the process, by name.
    static bool IsKnown(const std::string& name);
    static FaultKind KindOf(const std::string& name);  // name must be known
    static std::vector<std::string> KnownNames();      // sorted

private:
    template <class Fn>
    auto Run(bool write, Fn&& fn) const {
        Check();
        TransactionScope scope = Begin(write);
        using Result = decltype(fn(scope.Get()));
        if constexpr (std::is_void_v<Result>) {
            fn(scope.Get());
            scope.Commit();
        } else {
            Result result = fn(scope.Get());
            scope.Commit();
            return result;
        }
    }
    TransactionScope Begin(bool write) const;

    std::string name_;
    FaultKind kind_;
};

}  // namespace Host
}  // namespace Trellis
