#include "trellis/host/records/DVSwitchRecords.h"

#include <cstdint>
#include <limits>

#include <nlohmann/json.hpp>

#include "gantry/network/LacpTypes.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Host {

namespace {

constexpr std::int64_t kMaxCounter = std::numeric_limits<std::int64_t>::max();

std::string RequiredText(const JsonReader& in, const char* key, const char* what) {
    std::string text = in.String(key);
    if (text.empty()) in.Member(key).Fail(std::string("expected ") + what);
    return text;
}

// A text the host keeps in a fixed-size field of its kernel records.
std::string KernelText(const JsonReader& in, const char* key, std::size_t size) {
    std::string text = in.String(key);
    if (text.size() >= size) in.Member(key).Fail("expected at most " + std::to_string(size - 1) + " bytes");
    return text;
}

std::uint16_t Uint16(const JsonReader& in, const char* key) {
    return static_cast<std::uint16_t>(in.Int(key, 0, std::numeric_limits<std::uint16_t>::max()));
}

std::uint8_t Uint8(const JsonReader& in, const char* key) {
    return static_cast<std::uint8_t>(in.Int(key, 0, std::numeric_limits<std::uint8_t>::max()));
}

bool IsDecimal(const std::string& text) {
    if (text.empty() || text.size() > 9) return false;
    for (char c : text)
        if (c < '0' || c > '9') return false;
    return true;
}

}  // namespace

Json LagRecord::ToJson() const {
    return Json{{"id", id},
                {"name", name},
                {"mode", kLacpModeWords[mode]},
                {"loadBalance", loadBalance},
                {"uplinkCount", uplinkCount}};
}

LagRecord LagRecord::FromJson(const JsonReader& in) {
    LagRecord record;
    record.id = in.String("id");
    if (!IsDecimal(record.id)) in.Member("id").Fail("expected one to nine decimal digits");
    record.name = RequiredText(in, "name", "a LAG name");
    record.mode = static_cast<int>(in.Word("mode", kLacpModeWords, 3));
    record.loadBalance = static_cast<int>(in.Int("loadBalance", 0, kMaxLacpLoadBalance));
    record.uplinkCount = static_cast<std::uint32_t>(in.Int("uplinkCount", 0, 64));
    in.RejectUnknownMembers();
    return record;
}

Json LacpNicRecord::ToJson() const {
    return Json{{"name", name},
                {"state", state},
                {"shortTimeout", shortTimeout},
                {"portNumber", portNumber},
                {"portPriority", portPriority},
                {"adminKey", adminKey},
                {"operKey", operKey},
                {"portState", portState},
                {"partner",
                 Json{{"flags", partnerFlags},
                      {"deviceId", partnerDeviceId},
                      {"age", partnerAge},
                      {"portNumber", partnerPortNumber},
                      {"portPriority", partnerPortPriority},
                      {"operKey", partnerOperKey},
                      {"portState", partnerPortState}}},
                {"counters",
                 Json{{"rxLacpdus", rxLacpdus}, {"txLacpdus", txLacpdus}, {"rxErrors", rxErrors}, {"txErrors", txErrors}}}};
}

LacpNicRecord LacpNicRecord::FromJson(const JsonReader& in) {
    LacpNicRecord record;
    record.name = KernelText(in, "name", sizeof(Gantry::Network::LacpNic::name));
    if (record.name.empty()) in.Member("name").Fail("expected a NIC name");
    record.state = KernelText(in, "state", sizeof(Gantry::Network::LacpNic::state));
    record.shortTimeout = in.Bool("shortTimeout");
    record.portNumber = Uint16(in, "portNumber");
    record.portPriority = Uint16(in, "portPriority");
    record.adminKey = Uint16(in, "adminKey");
    record.operKey = Uint16(in, "operKey");
    record.portState = Uint8(in, "portState");
    if ((record.portState & Gantry::Network::LACP_STATE_TIMEOUT) != 0)
        in.Member("portState").Fail("the timeout bit (2) follows shortTimeout and is not given");
    JsonReader partner = in.Object("partner");
    record.partnerFlags = KernelText(partner, "flags", sizeof(Gantry::Network::LacpNic::partnerFlags));
    record.partnerDeviceId = KernelText(partner, "deviceId", sizeof(Gantry::Network::LacpNic::partnerDeviceId));
    record.partnerAge = static_cast<std::uint32_t>(partner.Int("age", 0, std::numeric_limits<std::uint32_t>::max()));
    record.partnerPortNumber = Uint16(partner, "portNumber");
    record.partnerPortPriority = Uint16(partner, "portPriority");
    record.partnerOperKey = Uint16(partner, "operKey");
    record.partnerPortState = Uint8(partner, "portState");
    partner.RejectUnknownMembers();
    JsonReader counters = in.Object("counters");
    record.rxLacpdus = static_cast<std::uint64_t>(counters.Int("rxLacpdus", 0, kMaxCounter));
    record.txLacpdus = static_cast<std::uint64_t>(counters.Int("txLacpdus", 0, kMaxCounter));
    record.rxErrors = static_cast<std::uint64_t>(counters.Int("rxErrors", 0, kMaxCounter));
    record.txErrors = static_cast<std::uint64_t>(counters.Int("txErrors", 0, kMaxCounter));
    counters.RejectUnknownMembers();
    in.RejectUnknownMembers();
    return record;
}

Json LacpGroupRecord::ToJson() const {
    Json list = Json::array();
    for (const LacpNicRecord& nic : nics) list.push_back(nic.ToJson());
    return Json{{"lagId", lagId}, {"mode", kLacpModeWords[mode]}, {"nics", list}};
}

LacpGroupRecord LacpGroupRecord::FromJson(const JsonReader& in) {
    LacpGroupRecord record;
    record.lagId = static_cast<std::uint32_t>(in.Int("lagId", 0, 999999999));
    record.mode = static_cast<int>(in.Word("mode", kLacpModeWords, 3));
    for (const JsonReader& element : in.Array("nics")) {
        LacpNicRecord nic = LacpNicRecord::FromJson(element);
        for (const LacpNicRecord& other : record.nics)
            if (other.name == nic.name) element.Member("name").Fail("duplicate NIC \"" + nic.name + "\"");
        record.nics.push_back(nic);
    }
    in.RejectUnknownMembers();
    return record;
}

Json DVSwitchRecord::ToJson() const {
    Json lagList = Json::array();
    for (const LagRecord& lag : lags) lagList.push_back(lag.ToJson());
    Json groupList = Json::array();
    for (const LacpGroupRecord& group : lacpGroups) groupList.push_back(group.ToJson());
    return Json{{"name", name},
                {"id", id},
                {"numPorts", numPorts},
                {"mtu", mtu},
                {"cdpStatus", WordOf(cdpStatus, kCdpStatusWords)},
                {"beaconTimeout", beaconTimeout},
                {"korvexBranded", korvexBranded},
                {"lags", lagList},
                {"lacpGroups", groupList}};
}

DVSwitchRecord DVSwitchRecord::FromJson(const JsonReader& in) {
    DVSwitchRecord record;
    record.name = RequiredText(in, "name", "a switch name");
    record.id = RequiredText(in, "id", "the switch's identity");
    if (record.id.find('/') != std::string::npos) in.Member("id").Fail("expected an identity without \"/\"");
    record.numPorts =
        static_cast<int>(in.Int("numPorts", SwitchLimits::kMinPorts, SwitchLimits::kMaxPortsPerSwitch));
    record.mtu = static_cast<int>(in.Int("mtu", SwitchLimits::kMinMtu, SwitchLimits::kMaxMtu));
    record.cdpStatus = in.Word<Gantry::Network::CdpStatus>("cdpStatus", kCdpStatusWords);
    record.beaconTimeout = static_cast<int>(in.Int("beaconTimeout", -1, 3600));
    record.korvexBranded = in.Bool("korvexBranded");
    for (const JsonReader& element : in.Array("lags")) {
        LagRecord lag = LagRecord::FromJson(element);
        for (const LagRecord& other : record.lags)
            if (other.name == lag.name || other.id == lag.id)
                element.Fail("a LAG of that name or id is already configured");
        record.lags.push_back(lag);
    }
    for (const JsonReader& element : in.Array("lacpGroups")) {
        LacpGroupRecord group = LacpGroupRecord::FromJson(element);
        for (const LacpGroupRecord& other : record.lacpGroups)
            if (other.lagId == group.lagId) element.Member("lagId").Fail("duplicate LACP group");
        record.lacpGroups.push_back(group);
    }
    // The ports are read by the description's section (they are records of their own).
    in.Member("ports");
    in.RejectUnknownMembers();
    return record;
}

Json DVPortRecord::ToDescriptionJson() const {
    Json port{{"id", portId}, {"portGroupId", portGroupId}};
    if (IsUplink()) {
        port["uplinkName"] = uplinkName;
        if (!nic.empty()) port["nic"] = nic;
        port["lacp"] = Json{{"enabled", lacpEnabled}, {"mode", kLacpModeWords[lacpMode]}};
    }
    if (connectionId != 0) port["connectionId"] = connectionId;
    return port;
}

DVPortRecord DVPortRecord::FromDescription(const JsonReader& in, std::string const& dvswitch,
                                           std::string const& dvsId) {
    DVPortRecord record;
    record.dvswitch = dvswitch;
    record.dvsId = dvsId;
    record.portId = in.String("id");
    if (!IsDecimal(record.portId)) in.Member("id").Fail("expected a port id of one to nine decimal digits");
    record.name = KeyOf(dvsId, record.portId);
    record.portGroupId = RequiredText(in, "portGroupId", "the port group's identity");
    record.uplinkName = in.String("uplinkName", "");
    record.nic = in.String("nic", "");
    JsonReader lacp = in.Member("lacp");
    if (!record.IsUplink() && (!record.nic.empty() || lacp.IsPresent()))
        in.Fail("only an uplink port (with an uplinkName) has a NIC or a LACP setting");
    if (in.Member("connectionId").IsPresent())
        record.connectionId =
            static_cast<std::uint32_t>(in.Int("connectionId", 0, std::numeric_limits<std::uint32_t>::max()));
    if (lacp.IsPresent()) {
        record.lacpEnabled = lacp.Bool("enabled");
        record.lacpMode = static_cast<int>(lacp.Word("mode", kLacpModeWords, 3));
        lacp.RejectUnknownMembers();
    }
    in.RejectUnknownMembers();
    return record;
}

Json DVPortRecord::ToJson() const {
    Json port = ToDescriptionJson();
    port["dvswitch"] = dvswitch;
    port["dvsId"] = dvsId;
    return port;
}

DVPortRecord DVPortRecord::FromJson(const JsonReader& in) {
    std::string dvswitch = in.String("dvswitch");
    std::string dvsId = in.String("dvsId");
    return FromDescription(in, dvswitch, dvsId);
}

}  // namespace Host
}  // namespace Trellis
