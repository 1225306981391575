#include "trellis/host/Operation.h"

#include <algorithm>
#include <stdexcept>

#include "host/Store.h"

namespace Trellis {
namespace Host {

namespace {

// Filled while the libraries load, by the constructors of the Operation
// constants, which live as long as the process. Kept as it comes, as that
// costs every start of the tool least; it is searched only when a fault is
// armed or the names are listed.
std::vector<const Operation*>& Registry() {
    static std::vector<const Operation*> registry;
    return registry;
}

const Operation* Find(const std::string& name) {
    for (const Operation* operation : Registry())
        if (operation->Name() == name) return operation;
    return nullptr;
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
    Registry().push_back(this);
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

bool Operation::IsKnown(const std::string& name) { return Find(name) != nullptr; }

FaultKind Operation::KindOf(const std::string& name) {
    const Operation* operation = Find(name);
    if (operation == nullptr) throw std::out_of_range("Unknown host operation " + name);
    return operation->kind_;
}

std::vector<std::string> Operation::KnownNames() {
    std::vector<std::string> names;
    for (const Operation* operation : Registry()) names.push_back(operation->Name());
    std::sort(names.begin(), names.end());
    names.erase(std::unique(names.begin(), names.end()), names.end());
    return names;
}

}  // namespace Host
}  // namespace Trellis
