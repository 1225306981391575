#pragma once

// The host's standard switches and their port groups. Each stores its own
// (local) policies: a setting counts as set at that level exactly when its
// bit is on in the policy's setMask, and only set settings are kept; a
// setting that is not set follows the parent (the port group its switch, the
// switch the host's defaults).

#include <string>
#include <vector>

#include "gantry/network/CdpStatus.h"
#include "trellis/host/JsonReader.h"
#include "trellis/host/records/StoredPolicies.h"

namespace Trellis {
namespace Host {

inline constexpr const char* kCdpStatusWords[] = {"down", "listen", "advertise", "both"};

// The limits the host puts on its switches.
struct SwitchLimits {
    static constexpr int kMinPorts = 1;
    static constexpr int kMaxPortsPerSwitch = 4096;
    static constexpr int kMaxPortsPerHost = 4608;  // configured ports, summed over all switches
    static constexpr int kMinMtu = 1280;
    static constexpr int kMaxMtu = 9000;
};

// A standard switch ("switch0").
struct StandardSwitchRecord {
    static constexpr const char* kKind = "vswitch.standard";

    std::string name;
    int numPorts = 128;  // configured ports
    int mtu = 1500;
    Gantry::Network::CdpStatus cdpStatus = Gantry::Network::CdpStatus::Listen;
    bool beaconEnabled = false;
    int beaconInterval = 1;   // seconds between probes
    int beaconThreshold = 3;  // missed probes before an uplink counts as failed
    std::vector<std::string> uplinks;  // NIC names, in the order they were added
    StoredPolicies policies;

    Json ToJson() const;
    static StandardSwitchRecord FromJson(const JsonReader& in);
};

// A port group of a standard switch; its name is unique on the host.
struct PortGroupRecord {
    static constexpr const char* kKind = "vswitch.portGroup";

    std::string name;
    std::string vswitch;  // the switch it belongs to
    int vlanId = 0;
    StoredPolicies policies;

    std::string Parent() const { return vswitch; }
    Json ToJson() const;
    static PortGroupRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
