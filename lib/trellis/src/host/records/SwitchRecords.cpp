#include "trellis/host/records/SwitchRecords.h"

#include <algorithm>

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

namespace {

std::string RequireName(const JsonReader& in, const char* what) {
    std::string name = in.String("name");
    if (name.empty()) in.Member("name").Fail(std::string("expected ") + what);
    return name;
}

std::vector<std::string> ReadUplinks(const JsonReader& in) {
    std::vector<std::string> uplinks;
    for (const JsonReader& element : in.Array("uplinks")) {
        std::string name = element.AsString();
        if (name.empty()) element.Fail("expected a NIC name");
        if (std::find(uplinks.begin(), uplinks.end(), name) != uplinks.end())
            element.Fail("duplicate uplink \"" + name + "\"");
        uplinks.push_back(name);
    }
    return uplinks;
}

}  // namespace

Json StandardSwitchRecord::ToJson() const {
    return Json{{"name", name},
                {"numPorts", numPorts},
                {"mtu", mtu},
                {"cdpStatus", WordOf(cdpStatus, kCdpStatusWords)},
                {"beacon", Json{{"enabled", beaconEnabled}, {"interval", beaconInterval}, {"threshold", beaconThreshold}}},
                {"uplinks", uplinks},
                {"policy", policies.ToJson()}};
}

StandardSwitchRecord StandardSwitchRecord::FromJson(const JsonReader& in) {
    StandardSwitchRecord record;
    record.name = RequireName(in, "a switch name");
    record.numPorts =
        static_cast<int>(in.Int("numPorts", SwitchLimits::kMinPorts, SwitchLimits::kMaxPortsPerSwitch));
    record.mtu = static_cast<int>(in.Int("mtu", SwitchLimits::kMinMtu, SwitchLimits::kMaxMtu));
    record.cdpStatus = in.Word<Gantry::Network::CdpStatus>("cdpStatus", kCdpStatusWords);
    JsonReader beacon = in.Object("beacon");
    record.beaconEnabled = beacon.Bool("enabled");
    record.beaconInterval = static_cast<int>(beacon.Int("interval", 1, 60));
    record.beaconThreshold = static_cast<int>(beacon.Int("threshold", 1, 60));
    beacon.RejectUnknownMembers();
    record.uplinks = ReadUplinks(in);
    record.policies = StoredPolicies::FromJson(in.Member("policy"));
    in.RejectUnknownMembers();
    return record;
}

Json PortGroupRecord::ToJson() const {
    return Json{{"name", name}, {"vswitch", vswitch}, {"vlanId", vlanId}, {"policy", policies.ToJson()}};
}

PortGroupRecord PortGroupRecord::FromJson(const JsonReader& in) {
    PortGroupRecord record;
    record.name = RequireName(in, "a port group name");
    record.vswitch = in.String("vswitch");
    if (record.vswitch.empty()) in.Member("vswitch").Fail("expected a switch name");
    record.vlanId = static_cast<int>(in.Int("vlanId", 0, 4095));
    record.policies = StoredPolicies::FromJson(in.Member("policy"));
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
