#pragma once

#include <string>
#include <vector>

namespace Trellis {
namespace Host {

// The kinds of host objects that a command line names.
enum class ObjectKind {
    StandardSwitch,     // "switch0"
    PortGroup,          // "Guest Network"
    PhysicalNic,        // "pnet0"
    KernelInterface,    // "tsl0"
    FirewallRuleset,    // "sshServer"
    Netstack,           // "defaultTcpipStack"
    DistributedSwitch,  // the distributed switches by name
};

// The names of the open host's objects of a kind, in the order the host
// lists them, read in one read transaction. It runs no host operation, so it
// neither consults nor counts down an armed fault, and it writes nothing.
// Throws GantryException when no host is open or the store fails.
std::vector<std::string> ObjectNames(ObjectKind kind);

}  // namespace Host
}  // namespace Trellis
