#include "trellis/host/Operation.h"

#include <map>
#include <stdexcept>

#include "host/Store.h"

namespace Trellis {
namespace Host {

namespace {

// Filled while the libraries load, by the constructors of the Operation constants.
std::map<std::string, FaultKind>& Registry() {
    static std::map<std::string, FaultKind> registry;
    return registry;
}

Store& StoreOutsideTransaction(const std::string& operation) {
    Store& store = CurrentStore();
    if (store.InTransaction())
        throw std::logic_error("The host operation " + operation +
                               " was called inside another one; operations do not nest");
    return store;
}

std::optional<Fault> HitFault(Store& store, const std::string& operation) {
    return GuardedSql(store, [&] { return store.Faults().Hit(operation); });
}

}  // namespace

Operation::Operation(std::string name, FaultKind kind) : name_(std::move(name)), kind_(kind) {
    Registry().emplace(name_, kind_);
}

void Operation::Check() const {
    Store& store = StoreOutsideTransaction(name_);
    if (kind_ != FaultKind::Message) return;
    std::optional<Fault> fault = HitFault(store, name_);
    if (fault) throw Gantry::Lib::GantryException(fault->message);
}

int Operation::FaultStatus() const {
    Store& store = StoreOutsideTransaction(name_);
    if (kind_ != FaultKind::Status) return 0;
    std::optional<Fault> fault = HitFault(store, name_);
    return fault ? fault->status : 0;
}

TransactionScope Operation::Begin(bool write) const {
    return TransactionScope(CurrentStore(), write);
}

bool Operation::IsKnown(const std::string& name) {
    return Registry().count(name) > 0;
}

FaultKind Operation::KindOf(const std::string& name) {
    return Registry().at(name);
}

std::vector<std::string> Operation::KnownNames() {
    std::vector<std::string> names;
    for (const auto& entry : Registry()) names.push_back(entry.first);
    return names;
}

}  // namespace Host
}  // namespace Trellis
