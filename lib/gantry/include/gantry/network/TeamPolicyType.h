#pragma once

#include <cstdint>

namespace Gantry {
namespace Network {

// How a NIC team spreads traffic over its uplinks. A stored policy may hold
// any 32-bit value; values other than these four are shown as unknown.
enum class TeamPolicyType : std::uint32_t {
    IpHash = 1,           // hash of source and destination IP address
    SourceMac = 2,        // source MAC address
    OriginatingPort = 3,  // originating virtual port
    ExplicitOrder = 4,    // highest order uplink that passes failover criteria
};

}  // namespace Network
}  // namespace Gantry
