#include "trellis/host/records/PortRecord.h"

#include <arpa/inet.h>

#include <limits>

#include <nlohmann/json.hpp>

#include "gantry/network/MacAddress.h"

namespace Trellis {
namespace Host {

namespace {

constexpr std::int64_t kMaxCounter = std::numeric_limits<std::int64_t>::max();
constexpr const char* kFilterCounterKeys[] = {"packetsIn",       "packetsOut",     "packetsDropped",
                                              "packetsFiltered", "packetsFaulted", "packetsQueued",
                                              "packetsInjected", "packetErrors"};

std::uint64_t Counter(const JsonReader& in, const char* key) {
    return in.Member(key).IsPresent() ? static_cast<std::uint64_t>(in.Int(key, 0, kMaxCounter)) : 0;
}

std::string OptionalText(const JsonReader& in, const char* key) { return in.String(key, ""); }

}  // namespace

Json PortStatsRecord::ToJson() const {
    return Json{{"bytesSent", bytesSent},
                {"bytesReceived", bytesReceived},
                {"packetsSent", packetsSent},
                {"multicastSent", multicastSent},
                {"broadcastSent", broadcastSent},
                {"packetsReceived", packetsReceived},
                {"multicastReceived", multicastReceived},
                {"broadcastReceived", broadcastReceived},
                {"transmitDropped", transmitDropped},
                {"receiveDropped", receiveDropped}};
}

PortStatsRecord PortStatsRecord::FromJson(const JsonReader& in) {
    PortStatsRecord stats;
    if (!in.IsPresent()) return stats;
    stats.bytesSent = Counter(in, "bytesSent");
    stats.bytesReceived = Counter(in, "bytesReceived");
    stats.packetsSent = Counter(in, "packetsSent");
    stats.multicastSent = Counter(in, "multicastSent");
    stats.broadcastSent = Counter(in, "broadcastSent");
    stats.packetsReceived = Counter(in, "packetsReceived");
    stats.multicastReceived = Counter(in, "multicastReceived");
    stats.broadcastReceived = Counter(in, "broadcastReceived");
    stats.transmitDropped = Counter(in, "transmitDropped");
    stats.receiveDropped = Counter(in, "receiveDropped");
    in.RejectUnknownMembers();
    // Each sum below stays under 2^64, the parts being under 2^63.
    if (stats.multicastSent + stats.broadcastSent > stats.packetsSent)
        in.Fail("more multicast and broadcast packets sent than packets sent");
    if (stats.multicastReceived + stats.broadcastReceived > stats.packetsReceived)
        in.Fail("more multicast and broadcast packets received than packets received");
    return stats;
}

Json PortFilterRecord::ToJson() const {
    Json filter{{"name", name},
                {"groupName", groupName},
                {"active", active},
                {"reversePath", reversePath},
                {"extendedCounters", extendedCounters}};
    for (std::size_t i = 0; i < 8; ++i) filter[kFilterCounterKeys[i]] = counters[i];
    return filter;
}

PortFilterRecord PortFilterRecord::FromJson(const JsonReader& in) {
    PortFilterRecord filter;
    filter.name = in.String("name");
    if (filter.name.empty()) in.Member("name").Fail("expected the filter's name");
    filter.groupName = in.String("groupName");
    filter.active = in.Bool("active");
    filter.reversePath = in.Bool("reversePath");
    filter.extendedCounters = in.Bool("extendedCounters");
    for (std::size_t i = 0; i < 8; ++i) filter.counters[i] = Counter(in, kFilterCounterKeys[i]);
    in.RejectUnknownMembers();
    return filter;
}

Json PortRecord::ToJson() const {
    Json port{{"id", id}, {"portset", portset}};
    if (!portGroup.empty()) port["portGroup"] = portGroup;
    if (!dvPort.empty()) port["dvPort"] = dvPort;
    port["clientKind"] = WordOf(clientKind, kPortClientKindWords);
    port["clientName"] = clientName;
    if (worldId != 0) port["worldId"] = worldId;
    if (!macAddresses.empty()) port["macAddresses"] = macAddresses;
    if (!ipv4Address.empty()) port["ipv4Address"] = ipv4Address;
    if (!teamUplink.empty()) port["teamUplink"] = teamUplink;
    port["stats"] = stats.ToJson();
    if (!filters.empty()) {
        Json filterList = Json::array();
        for (const PortFilterRecord& filter : filters) filterList.push_back(filter.ToJson());
        port["filters"] = filterList;
    }
    if (vlanStats) {
        Json vlans = Json::array();
        for (const VlanCounterRecord& vlan : *vlanStats)
            vlans.push_back(Json{{"vlanId", vlan.vlanId}, {"rxPackets", vlan.rxPackets}, {"txPackets", vlan.txPackets}});
        port["vlanStats"] = vlans;
    }
    return port;
}

PortRecord PortRecord::FromJson(const JsonReader& in) {
    PortRecord record;
    record.id = in.Int("id", 1, std::numeric_limits<std::int32_t>::max());
    record.name = std::to_string(record.id);
    record.portset = in.String("portset");
    if (record.portset.empty()) in.Member("portset").Fail("expected a switch name");
    record.portGroup = OptionalText(in, "portGroup");
    record.dvPort = OptionalText(in, "dvPort");
    record.clientKind = in.Word<PortClientKind>("clientKind", kPortClientKindWords);
    if (!record.portGroup.empty() && !record.dvPort.empty())
        in.Fail("a port is in a port group or on a DVPort, not both");
    if (record.clientKind != PortClientKind::Uplink && record.portGroup.empty() && record.dvPort.empty())
        in.Member("portGroup").Fail("expected a port group name (or a dvPort)");
    if (record.clientKind == PortClientKind::Uplink && !record.portGroup.empty())
        in.Member("portGroup").Fail("an uplink's port is in no port group");
    record.clientName = in.String("clientName");
    if (record.clientName.empty()) in.Member("clientName").Fail("expected the client's name");
    record.worldId = in.Member("worldId").IsPresent() ? in.Int("worldId", 0, std::numeric_limits<std::int32_t>::max()) : 0;
    if (record.clientKind == PortClientKind::VmAdapter && record.worldId == 0)
        in.Member("worldId").Fail("expected the world of the VM that owns the adapter");
    if (record.clientKind != PortClientKind::VmAdapter && record.worldId != 0)
        in.Member("worldId").Fail("only a VM's adapter belongs to a world");
    for (const JsonReader& element : in.Array("macAddresses")) {
        std::string text = element.AsString();
        try {
            record.macAddresses.push_back(Gantry::Network::MacAddress(text).GetStringAddress());
        } catch (const std::exception&) {
            element.Fail("expected a MAC address");
        }
    }
    record.ipv4Address = OptionalText(in, "ipv4Address");
    in_addr parsed{};
    if (!record.ipv4Address.empty() && inet_pton(AF_INET, record.ipv4Address.c_str(), &parsed) != 1)
        in.Member("ipv4Address").Fail("expected an IPv4 address");
    record.teamUplink = OptionalText(in, "teamUplink");
    record.stats = PortStatsRecord::FromJson(in.Member("stats"));
    for (const JsonReader& element : in.Array("filters")) record.filters.push_back(PortFilterRecord::FromJson(element));
    if (in.Member("vlanStats").IsPresent()) {
        if (record.clientKind != PortClientKind::Uplink)
            in.Member("vlanStats").Fail("only an uplink's port counts per VLAN");
        record.vlanStats.emplace();
        for (const JsonReader& element : in.Array("vlanStats")) {
            VlanCounterRecord vlan;
            vlan.vlanId = static_cast<int>(element.Int("vlanId", 0, 4095));
            if (!record.vlanStats->empty() && record.vlanStats->back().vlanId >= vlan.vlanId)
                element.Member("vlanId").Fail("expected VLAN ids in ascending order, each once");
            vlan.rxPackets = Counter(element, "rxPackets");
            vlan.txPackets = Counter(element, "txPackets");
            element.RejectUnknownMembers();
            record.vlanStats->push_back(vlan);
        }
    }
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
