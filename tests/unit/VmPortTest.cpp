// network vm list, vm port list, port stats get and port filter stats get:
// the walk over the ports of both kinds of switch, the worlds they belong to
// (world 0 being none), the counters' arithmetic, the order of the filters,
// and each host failure once. The default host's rows in every formatter are
// in tests/cli/dvs.test.sh.

#include <algorithm>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "PortFilterStatsGet.h"
#include "PortStatsGet.h"
#include "TempHost.h"
#include "VMList.h"
#include "VMPortList.h"
#include "gantry/network/FilterStats.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Json = TempHost::Json;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

namespace {

Json& Port(Json& d, long long id) {
    for (Json& port : d["ports"])
        if (port["id"] == id) return port;
    throw std::runtime_error("no port " + std::to_string(id));
}

Json VmPort(long long id, const std::string& portGroup, const std::string& client, int worldId) {
    return Json{{"id", id},          {"portset", "switch0"},  {"portGroup", portGroup},
                {"clientKind", "vmAdapter"}, {"clientName", client}, {"worldId", worldId},
                {"teamUplink", "pnet0"}};
}

Json Filter(const std::string& group, bool reversePath, bool active = true) {
    return Json{{"name", group + ".0"}, {"groupName", group}, {"active", active}, {"reversePath", reversePath},
                {"extendedCounters", false}, {"packetsIn", 1}, {"packetsOut", 1}, {"packetsDropped", 0},
                {"packetsFiltered", 0}, {"packetsFaulted", 0}, {"packetsQueued", 0}, {"packetsInjected", 0},
                {"packetErrors", 0}};
}

std::vector<Json> Column(const Json& rows, const std::string& title) {
    std::vector<Json> values;
    for (const Json& row : rows) values.push_back(row[title]);
    return values;
}

void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

}  // namespace

TEST(VMList, ListsEachWorldInIdOrderWithANetworkForEachOfItsPorts) {
    TempHost host([](Json& d) {
        d["worlds"].push_back({{"id", 100}, {"name", "app01"}});
        d["ports"].push_back(VmPort(33554440, "Guest Network", "app01.eth0", 100));
        d["ports"].push_back(VmPort(33554441, "Guest Network", "web01.eth2", 69312));
    });
    CommandRun run = RunCommand<VMList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
        {"World ID":100,"Name":"app01","Num Ports":1,"Networks":["Guest Network"]},
        {"World ID":69312,"Name":"web01","Num Ports":3,
         "Networks":["Guest Network","Guest Network","dvportgroup-101"]},
        {"World ID":69540,"Name":"db01","Num Ports":1,"Networks":["Guest Network"]}])"));
}

TEST(VMList, AHostWithoutVmsListsNoneAndFindsNoPortsForAnyWorld) {
    TempHost host([](Json& d) {
        Json ports = Json::array();
        for (const Json& port : d["ports"])
            if (!port.contains("worldId")) ports.push_back(port);
        d["ports"] = ports;
    });
    EXPECT_EQ(RunCommand<VMList>().Json(), "[]");
    ExpectFailure(RunCommand<VMPortList>({"-w", "69312"}), "Couldn't find VM with given world ID");
    ExpectFailure(RunCommand<VMPortList>({"-w", "-1"}), "Couldn't find VM with given world ID");
}

TEST(VMPortList, ListsTheWorldsPortsOnBothKindsOfSwitch) {
    TempHost host;
    CommandRun run = RunCommand<VMPortList>({"--world-id", "69312"});
    EXPECT_EQ(run.errors, Errors{});
    Json ports = run.Parsed();
    ASSERT_EQ(ports.size(), 2u);
    // A filter with records on both paths is named once; an inactive one not at all.
    EXPECT_EQ(ports[0], Json::parse(R"({"Port ID":33554437,"vSwitch":"switch0","Portgroup":"Guest Network",
        "DVPort ID":"","MAC Address":"00:50:56:a1:00:01","IP Address":"192.0.2.21","Team Uplink":"pnet0",
        "Uplink Port ID":33554434,"Active Filters":["fw-agent.0","mon-agent.0"]})"));
    EXPECT_EQ(ports[1], Json::parse(R"({"Port ID":33554451,"vSwitch":"dvSwitch0","Portgroup":"dvportgroup-101",
        "DVPort ID":"0","MAC Address":"00:50:56:a1:00:03","IP Address":"198.51.100.21","Team Uplink":"pnet4",
        "Uplink Port ID":33554449,"Active Filters":["fw-agent.1"]})"));
}

TEST(VMPortList, WorldZeroListsThePortsThatBelongToNoVm) {
    TempHost host;
    Json ports = RunCommand<VMPortList>({"-w", "0"}).Parsed();
    EXPECT_EQ(Column(ports, "Port ID"),
              (std::vector<Json>{33554434, 33554436, 33554448, 33554449, 33554450}));
    EXPECT_EQ(ports[0]["Team Uplink"], "pnet0");
    EXPECT_EQ(ports[0]["Uplink Port ID"], 33554434);
}

TEST(VMPortList, ATeamUplinkWithoutAnUplinkPortShowsPortZero) {
    TempHost host([](Json& d) { Port(d, 33554438)["teamUplink"] = "pnet1"; });
    Json port = RunCommand<VMPortList>({"-w", "69540"}).Parsed()[0];
    EXPECT_EQ(port["Team Uplink"], "pnet1");
    EXPECT_EQ(port["Uplink Port ID"], 0);
    ArmFault({"PnicImpl::GetUplinkPort", "no uplink", 0, {}});
    CommandRun run = RunCommand<VMPortList>({"-w", "69312"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(Column(run.Parsed(), "Uplink Port ID"), (std::vector<Json>{0, 0}));
}

TEST(VMList, AHostFailureIsReportedBehindTheCommandsWords) {
    TempHost host;
    for (const char* operation : {"VirtualSwitchInfoImpl::GetAllSwitches", "VirtualSwitchInfoImpl::IsLegacySwitch",
                                  "PortsetImpl::GetPorts", "PortImpl::GetWorldId", "PortImpl::GetPortGroupName",
                                  "DVSwitch::GetId", "PortImpl::GetDVPortId", "DVPortImpl::GetDVPortgroupId"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<VMList>(), "Unable to list VM's: busy");
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<VMPortList>({"-w", "69312"}), "Unable to list ports for VM: busy");
    }
    ArmFault({"WorldImpl::GetWorldName", "busy", 0, 1});
    ExpectFailure(RunCommand<VMList>(), "Unable to list VM's: busy");
    for (const char* operation : {"PortImpl::GetPortId", "PortImpl::GetMacAddresses", "PortImpl::GetIpv4Address",
                                  "PortImpl::GetTeamUplink", "PortImpl::GetFilterStats"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<VMPortList>({"-w", "69312"}), "Unable to list ports for VM: busy");
    }
}

TEST(PortStatsGet, UnicastIsWhatIsNeitherBroadcastNorMulticast) {
    TempHost host([](Json& d) {
        Port(d, 33554438)["stats"] = {{"bytesSent", 9000000000000LL}, {"bytesReceived", 7}, {"packetsSent", 100},
                                      {"multicastSent", 10}, {"broadcastSent", 5}, {"packetsReceived", 50},
                                      {"multicastReceived", 20}, {"broadcastReceived", 30},
                                      {"transmitDropped", 3}, {"receiveDropped", 4}};
    });
    CommandRun run = RunCommand<PortStatsGet>({"--portid", "33554438"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([{"Port ID":33554438,"Packets received":50,"Packets sent":100,
        "Bytes received":7,"Bytes sent":9000000000000,"Broadcast packets received":30,"Broadcast packets sent":5,
        "Multicast packets received":20,"Multicast packets sent":10,"Unicast packets received":0,
        "Unicast packets sent":85,"Receive packets dropped":4,"Transmit packets dropped":3}])"));
    EXPECT_EQ(RunCommand<PortStatsGet>({"-p", "33554451"}).Parsed()[0]["Port ID"], 33554451);
    for (const char* operation :
         {"VirtualSwitchInfoImpl::GetAllSwitches", "PortImpl::GetByteStats", "PortImpl::GetPacketStats"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<PortStatsGet>({"-p", "33554437"}), "Unable to get stats for port: busy");
    }
}

TEST(PortFilterStatsGet, ListsTheActiveFiltersReceivePathFirstAndTurnsRoundAtAnUplink) {
    TempHost host([](Json& d) {
        Port(d, 33554434)["filters"] = {Filter("up", true), Filter("up", false)};
    });
    Json filters = RunCommand<PortFilterStatsGet>({"-p", "33554437"}).Parsed();
    EXPECT_EQ(Column(filters, "Filter name"), (std::vector<Json>{"fw-agent.0", "mon-agent.0", "fw-agent.0"}));
    EXPECT_EQ(Column(filters, "Filter direction"), (std::vector<Json>{"Receive", "Receive", "Transmit"}));
    EXPECT_TRUE(filters[0]["Packet errors"].is_number());
    EXPECT_TRUE(filters[1]["Packets filtered"].is_null());  // no extended counters
    EXPECT_TRUE(filters[1]["Packet errors"].is_null());

    Json uplink = RunCommand<PortFilterStatsGet>({"-p", "33554434"}).Parsed();
    EXPECT_EQ(Column(uplink, "Filter direction"), (std::vector<Json>{"Transmit", "Receive"}));
    EXPECT_EQ(RunCommand<PortFilterStatsGet>({"-p", "33554438"}).Json(), "[]");
    ExpectFailure(RunCommand<PortFilterStatsGet>({"-p", "0"}), "Couldn't find requested port");
    for (const char* operation : {"PortImpl::GetFilterStats", "PortImpl::GetClientType", "PortsetImpl::GetPorts"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<PortFilterStatsGet>({"-p", "33554437"}), "Unable to get filter stats for port: busy");
    }
}

TEST(PortFilterStatsGet, SortsTheReceivePathByAgentAscendingInByteOrderAndTheTransmitPathDescending) {
    std::vector<Gantry::Network::FilterStats> records;
    for (auto [group, reverse] : std::vector<std::pair<std::string, bool>>{
             {"b", false}, {"a", true}, {"ab", false}, {"b", true}, {"a", false}, {"Z", false}, {"ab", true},
             {"\xc3\xa9", false}}) {
        Gantry::Network::FilterStats record;
        record.groupName = group;
        record.reversePath = reverse;
        records.push_back(record);
    }
    std::vector<Gantry::Network::FilterStats*> order;
    for (auto& record : records) order.push_back(&record);
    std::sort(order.begin(), order.end(), sortFilterStats);
    std::vector<std::string> groups;
    for (auto* record : order) groups.push_back(record->groupName + (record->reversePath ? "<" : ">"));
    EXPECT_EQ(groups, (std::vector<std::string>{"Z>", "a>", "ab>", "b>", "\xc3\xa9>", "b<", "ab<", "a<"}));
    EXPECT_FALSE(sortFilterStats(order[0], order[0]));
}
