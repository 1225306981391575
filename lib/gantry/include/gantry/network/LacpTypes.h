#pragma once

// The link aggregation records a distributed switch hands out: the LACP
// setting of one uplink port, the configuration of a named LAG, and the
// running groups with the protocol state of each of their NICs.

#include <cstdint>
#include <string>
#include <vector>

namespace Gantry {
namespace Network {

// LACP modes as the host numbers them.
enum : std::int32_t { LACP_MODE_ACTIVE = 1, LACP_MODE_PASSIVE = 2 };

struct LacpPortConfig {
    bool enabled = false;
    std::int32_t mode = 0;  // 1 active, 2 passive
};

// A named LAG: its uplink ports are keyed "<name>-<index>" in the switch's
// uplink ports, index 0 to uplinkCount less one.
struct LagConfig {
    std::string id;  // decimal digits
    std::string name;
    std::int32_t mode = 0;         // 1 active, 2 passive
    std::int32_t loadBalance = 0;  // 0 to 20
    std::uint32_t uplinkCount = 0;
};

// Bits of a LACP port state, from the lowest up.
enum : std::uint8_t {
    LACP_STATE_ACTIVITY = 1 << 0,
    LACP_STATE_TIMEOUT = 1 << 1,  // short timeout
    LACP_STATE_AGGREGATION = 1 << 2,
    LACP_STATE_SYNCHRONIZATION = 1 << 3,
    LACP_STATE_COLLECTING = 1 << 4,
    LACP_STATE_DISTRIBUTING = 1 << 5,
    LACP_STATE_DEFAULTED = 1 << 6,
    LACP_STATE_EXPIRED = 1 << 7,
};

// One NIC of a running group, the kernel's record: texts are fixed-size and
// NUL-terminated.
#pragma pack(push, 1)
struct LacpNic {
    char name[32];
    char state[32];
    char localFlags[8];
    std::uint16_t portNumber;
    std::uint16_t portPriority;
    std::uint16_t adminKey;
    std::uint16_t operKey;
    std::uint8_t portState;
    char partnerFlags[8];
    char partnerDeviceId[32];
    std::uint32_t partnerAge;  // seconds
    std::uint16_t partnerPortNumber;
    std::uint16_t partnerPortPriority;
    std::uint16_t partnerOperKey;
    std::uint8_t partnerPortState;
    std::uint64_t rxLacpdus;
    std::uint64_t txLacpdus;
    std::uint64_t rxErrors;
    std::uint64_t txErrors;
};
#pragma pack(pop)

struct LacpGroup {
    std::uint32_t lagId = 0;
    std::int32_t mode = 0;  // 2 passive, any other active
    std::vector<LacpNic*> nics;
};

}  // namespace Network
}  // namespace Gantry
