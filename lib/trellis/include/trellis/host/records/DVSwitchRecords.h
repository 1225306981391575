#pragma once

// The host's distributed switches: the switch with its named LAGs and its
// running LACP groups, and each of its ports (DVPorts) as a record of its own,
// whose parent is the switch. An uplink port has an uplink name and may have
// a NIC connected; the NICs of a switch's uplink ports are its uplinks.

#include <cstdint>
#include <string>
#include <vector>

#include "gantry/network/CdpStatus.h"
#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// The LACP modes as descriptions write them; the host numbers them 0, 1, 2.
inline constexpr const char* kLacpModeWords[] = {"none", "active", "passive"};
// The largest load balance index the host hands out.
inline constexpr int kMaxLacpLoadBalance = 20;

struct LagRecord {
    std::string id;  // decimal digits
    std::string name;
    int mode = 1;
    int loadBalance = 0;
    std::uint32_t uplinkCount = 0;

    Json ToJson() const;
    static LagRecord FromJson(const JsonReader& in);
};

// One NIC of a running LACP group. The local flags and the timeout bit of the
// local port state follow shortTimeout and the group's mode.
struct LacpNicRecord {
    std::string name;
    std::string state;
    bool shortTimeout = false;
    std::uint16_t portNumber = 0;
    std::uint16_t portPriority = 0;
    std::uint16_t adminKey = 0;
    std::uint16_t operKey = 0;
    std::uint8_t portState = 0;
    std::string partnerFlags;
    std::string partnerDeviceId;
    std::uint32_t partnerAge = 0;
    std::uint16_t partnerPortNumber = 0;
    std::uint16_t partnerPortPriority = 0;
    std::uint16_t partnerOperKey = 0;
    std::uint8_t partnerPortState = 0;
    std::uint64_t rxLacpdus = 0;
    std::uint64_t txLacpdus = 0;
    std::uint64_t rxErrors = 0;
    std::uint64_t txErrors = 0;

    Json ToJson() const;
    static LacpNicRecord FromJson(const JsonReader& in);
};

struct LacpGroupRecord {
    std::uint32_t lagId = 0;
    int mode = 1;
    std::vector<LacpNicRecord> nics;

    Json ToJson() const;
    static LacpGroupRecord FromJson(const JsonReader& in);
};

struct DVSwitchRecord {
    static constexpr const char* kKind = "vswitch.distributed";

    std::string name;
    std::string id;  // the switch's identity, which addresses its ports
    int numPorts = 0;
    int mtu = 1500;
    Gantry::Network::CdpStatus cdpStatus = Gantry::Network::CdpStatus::Listen;
    int beaconTimeout = -1;  // seconds; -1 when beacon probing is off
    bool korvexBranded = true;
    std::vector<LagRecord> lags;
    std::vector<LacpGroupRecord> lacpGroups;

    Json ToJson() const;  // without the ports
    static DVSwitchRecord FromJson(const JsonReader& in);
};

struct DVPortRecord {
    static constexpr const char* kKind = "vswitch.dvport";

    std::string name;  // the key: KeyOf(dvsId, portId)
    std::string dvswitch;  // the switch's name
    std::string dvsId;
    std::string portId;
    std::string portGroupId;
    std::string uplinkName;  // empty for a port that is no uplink port
    std::string nic;         // the NIC connected to an uplink port, if any
    bool lacpEnabled = false;
    int lacpMode = 0;
    std::uint32_t connectionId = 0;  // of the connection an interface holds on it; 0 for none

    static std::string KeyOf(std::string const& dvsId, std::string const& portId) { return dvsId + "/" + portId; }
    std::string Parent() const { return dvswitch; }
    bool IsUplink() const { return !uplinkName.empty(); }
    // The stored form, which names its switch.
    Json ToJson() const;
    static DVPortRecord FromJson(const JsonReader& in);
    // As a description nests it in its switch: id, group, uplink, NIC, LACP.
    Json ToDescriptionJson() const;
    static DVPortRecord FromDescription(const JsonReader& in, std::string const& dvswitch, std::string const& dvsId);
};

}  // namespace Host
}  // namespace Trellis
