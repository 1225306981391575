#pragma once

// Faults armed on the open host. An armed fault makes its operation throw
// GantryException with the message (or, for Trellis_Exec, return the status)
// instead of doing its work, for the next `remaining` calls of any process,
// or for every call while remaining is empty. One fault per operation:
// arming an operation again replaces its fault.

#include <optional>
#include <string>
#include <vector>

namespace Trellis {
namespace Host {

struct Fault {
    std::string operation;  // "FirewallRuleset::Enable", "Trellis_Exec"
    std::string message;    // for every operation but Trellis_Exec
    int status = 0;         // for Trellis_Exec: not 0
    std::optional<int> remaining;

    bool operator==(const Fault& other) const {
        return operation == other.operation && message == other.message && status == other.status &&
               remaining == other.remaining;
    }
};

// Refuses (std::invalid_argument, with a one-line reason) an operation no
// Operation has registered, a message for Trellis_Exec or a status for any
// other, a status of 0, a message that is empty, not valid UTF-8 or holds a
// control character, and a remaining count below 1.
void CheckFault(const Fault& fault);
// CheckFault, then arms the fault on the open host.
void ArmFault(const Fault& fault);
void ClearFaults();
// The armed faults, in the order they were first armed.
std::vector<Fault> ListFaults();

}  // namespace Host
}  // namespace Trellis
