#pragma once

#include <cstdint>
#include <string>

namespace Gantry {
namespace Network {

// The counters of one filter of a port on one path: the receive path, or
// with reversePath the transmit path, as a VM sees them.
struct FilterStats {
    std::string name;
    std::string groupName;  // the filter's agent
    bool active = false;
    bool reversePath = false;
    bool hasExtendedCounters = false;
    std::uint64_t packetsIn = 0;
    std::uint64_t packetsOut = 0;
    std::uint64_t packetsDropped = 0;
    std::uint64_t packetsFiltered = 0;
    std::uint64_t packetsFaulted = 0;
    std::uint64_t packetsQueued = 0;
    std::uint64_t packetsInjected = 0;
    std::uint64_t packetErrors = 0;
};

}  // namespace Network
}  // namespace Gantry
