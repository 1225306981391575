#include "trellis/host/Faults.h"

#include <stdexcept>

#include "host/Store.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Host {

namespace {

template <class Fn>
auto OnStore(Fn&& fn) {
    Store& store = CurrentStore();
    return GuardedSql(store, [&] { return fn(store); });
}

}  // namespace

void CheckFault(const Fault& fault) {
    if (!Operation::IsKnown(fault.operation))
        throw std::invalid_argument("Unknown operation " + Quoted(fault.operation));
    if (Operation::KindOf(fault.operation) == FaultKind::Status) {
        if (!fault.message.empty())
            throw std::invalid_argument(fault.operation + " takes a status, not a message");
        if (fault.status == 0) throw std::invalid_argument(fault.operation + " takes a status other than 0");
    } else if (fault.status != 0) {
        throw std::invalid_argument(fault.operation + " takes a message, not a status");
    } else {
        // The message becomes the text of an error that a tool prints on one line.
        if (fault.message.empty()) throw std::invalid_argument("The fault message must not be empty");
        std::string problem = TextProblem(fault.message);
        if (!problem.empty()) throw std::invalid_argument("The fault message " + problem);
    }
    if (fault.remaining && *fault.remaining < 1)
        throw std::invalid_argument("The number of calls must be at least 1");
}

void ArmFault(const Fault& fault) {
    CheckFault(fault);
    OnStore([&](Store& store) { store.Faults().Arm(fault); });
}

void ClearFaults() {
    OnStore([](Store& store) { store.Faults().Clear(); });
}

std::vector<Fault> ListFaults() {
    return OnStore([](Store& store) { return store.Faults().List(); });
}

}  // namespace Host
}  // namespace Trellis
