#pragma once

#include <cstdint>

namespace Gantry {
namespace Network {

// The counters of a physical NIC. The two totals of errors are counters of
// their own, not sums of the kinds beside them.
struct PnicStats {
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
    std::uint64_t rxBytes = 0;
    std::uint64_t txBytes = 0;
    std::uint64_t rxDropped = 0;
    std::uint64_t txDropped = 0;
    std::uint64_t rxMulticast = 0;
    std::uint64_t rxBroadcast = 0;
    std::uint64_t txMulticast = 0;
    std::uint64_t txBroadcast = 0;
    std::uint64_t rxErrors = 0;
    std::uint64_t rxLengthErrors = 0;
    std::uint64_t rxOverErrors = 0;
    std::uint64_t rxCrcErrors = 0;
    std::uint64_t rxFrameErrors = 0;
    std::uint64_t rxFifoErrors = 0;
    std::uint64_t rxMissedErrors = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t txAbortedErrors = 0;
    std::uint64_t txCarrierErrors = 0;
    std::uint64_t txFifoErrors = 0;
    std::uint64_t txHeartbeatErrors = 0;
    std::uint64_t txWindowErrors = 0;
};

// The counters of one VLAN on a switch's uplink.
struct VlanStats {
    int vlanId = 0;
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
};

}  // namespace Network
}  // namespace Gantry
