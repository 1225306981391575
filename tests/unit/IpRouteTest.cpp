// network ip route ipv4/ipv6 and network ip neighbor: the routes of the
// netstack chosen, the default route's removal by the gateway in force, the
// configured one or a wrong one, the neighbour tables by version, interface
// and the kernel's IPv6 switch, and where each command's host failures go.
// The round trips a user makes are in tests/cli/netstack.test.sh.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FailureOf.h"
#include "IpNeighborList.h"
#include "IpNeighborRemove.h"
#include "IpRouteIpv4Add.h"
#include "IpRouteIpv4List.h"
#include "IpRouteIpv4Remove.h"
#include "IpRouteIpv6Add.h"
#include "IpRouteIpv6List.h"
#include "IpRouteIpv6Remove.h"
#include "RoutingTestSupport.h"
#include "TempHost.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace RoutingTest;
using Trellis::Host::ArmFault;

namespace {

const char* const kDefaultIpv6Routes =
    R"([{"Network":"2001:db8::","Netmask":"ffff:ffff:ffff:ffff::","Gateway":"::","Interface":"tsl0"},)"
    R"({"Network":"default","Netmask":"::","Gateway":"2001:db8::1","Interface":"tsl0"}])";

// backupStack with a DHCP default gateway and an entry in each neighbour
// table, all through tsl1.
void AddRoutedBackupStack(Json& d) {
    AddBackupStack(d, Json::parse(R"({"ipv4Gateway": "198.51.100.1", "ipv4GatewaySource": "dhcp",
        "ipv4Neighbors": [{"address": "198.51.100.1", "macAddress": "00:1c:73:5e:0b:01", "interface": "tsl1",
                           "expiry": 600, "type": "static"}],
        "ipv6Neighbors": [{"address": "2001:db8:1::1", "macAddress": "00:1c:73:5e:0b:01", "interface": "tsl1",
                           "expiry": 30, "type": "host", "state": "stale"}]})"));
}

std::vector<std::string> Column(const CommandRun& run, const char* field) {
    std::vector<std::string> values;
    for (const Json& row : run.Parsed()) values.push_back(row[field].get<std::string>());
    return values;
}

}  // namespace

TEST(IpRouteIpv4, ListsTheNetstackChosenAndAddsAndRemovesRoutesAndTheDefaultGateway) {
    TempHost host(AddRoutedBackupStack);
    EXPECT_EQ(RunCommand<IpRouteIpv4List>({"-N", ""}).Json(),
              R"([{"Network":"192.0.2.0","Netmask":"255.255.255.0","Gateway":"0.0.0.0","Interface":"tsl0",)"
              R"("Source":"MANUAL"},{"Network":"198.51.100.0","Netmask":"255.255.255.0","Gateway":"192.0.2.254",)"
              R"("Interface":"tsl0","Source":"MANUAL"},{"Network":"default","Netmask":"0.0.0.0",)"
              R"("Gateway":"192.0.2.1","Interface":"tsl0","Source":"MANUAL"}])");
    // The source is asked for every route: only the default one is DHCP's.
    EXPECT_EQ(Column(RunCommand<IpRouteIpv4List>({"-N", "backupStack"}), "Source"), (Errors{"MANUAL", "DHCP"}));

    CommandRun run = RunCommand<IpRouteIpv4Add>({"-n", "203.0.113.0/24", "-g", "198.51.100.254", "-N", "backupStack"});
    ExpectDone(run);
    EXPECT_EQ(Routing("backupStack")["ipv4Routes"],
              Json::parse(R"([{"network":"203.0.113.0/24","gateway":"198.51.100.254"}])"));
    EXPECT_EQ(RunCommand<IpRouteIpv4Remove>({"-n", "203.0.113.0/24", "-g", "198.51.100.254", "-N", "backupStack"})
                  .Json(),
              "true");
    EXPECT_EQ(RunCommand<IpRouteIpv4Remove>({"-n", "0.0.0.0/0", "-g", "198.51.100.1", "-N", "backupStack"}).errors,
              Errors{});
    EXPECT_EQ(RunCommand<IpRouteIpv4Add>({"-n", "default", "-g", "198.51.100.254", "-N", "backupStack"}).errors,
              Errors{});
    EXPECT_EQ(Routing("backupStack")["ipv4Gateway"], "198.51.100.254");
    EXPECT_EQ(Routing("backupStack")["ipv4Routes"], Json::array());
}

TEST(IpRouteRemove, TheDefaultRouteGoesByTheGatewayInForceOrConfiguredAndAWrongOneIsOnlyReported) {
    // The configured IPv6 gateway is on no interface's subnet: none is in force.
    TempHost host([](Json& d) { d["netstacks"][0]["routing"]["ipv6Gateway"] = "2001:db8:ff::1"; });
    std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<IpRouteIpv4Remove>({"-n", "default", "-g", "192.0.2.99"});
    EXPECT_EQ(run.errors, Errors{"192.0.2.99 is not a default route."});
    EXPECT_EQ(run.Json(), "true");
    run = RunCommand<IpRouteIpv6Remove>({"-n", "default", "-g", "2001:db8::1"});
    EXPECT_EQ(run.errors, Errors{"2001:db8::1 is not a default route."});
    EXPECT_EQ(run.Json(), "true");
    ExpectFailure(RunCommand<IpRouteIpv4Remove>({"-n", "Default", "-g", "192.0.2.1"}), "Invalid IPv4 network: Default");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);

    EXPECT_EQ(RunCommand<IpRouteIpv4Remove>({"-n", "default", "-g", "192.0.2.1"}).errors, Errors{});
    EXPECT_EQ(RunCommand<IpRouteIpv6Remove>({"-n", "::/0", "-g", "2001:db8:ff::1"}).errors, Errors{});
    EXPECT_FALSE(Routing("defaultTcpipStack").contains("ipv4Gateway"));
    EXPECT_FALSE(Routing("defaultTcpipStack").contains("ipv6Gateway"));
}

TEST(IpRouteIpv6, ListsAddsAndRemovesRoutesWithTheMaskShownAsAnAddress) {
    TempHost host;
    EXPECT_EQ(RunCommand<IpRouteIpv6List>().Json(), kDefaultIpv6Routes);
    EXPECT_EQ(RunCommand<IpRouteIpv6Add>({"-n", "2001:db8:5::/48", "-g", "2001:db8::fe"}).Json(), "true");
    EXPECT_EQ(RunCommand<IpRouteIpv6List>().Parsed()[1],
              Json::parse(R"({"Network":"2001:db8:5::","Netmask":"ffff:ffff:ffff::","Gateway":"2001:db8::fe",
                              "Interface":"tsl0"})"));
    EXPECT_EQ(RunCommand<IpRouteIpv6Remove>({"-n", "2001:db8:5::/48", "-g", "2001:db8::fe"}).errors, Errors{});
    EXPECT_EQ(RunCommand<IpRouteIpv6Remove>({"-n", "default", "-g", "2001:db8::1"}).errors, Errors{});
    EXPECT_EQ(RunCommand<IpRouteIpv6Add>({"-n", "default", "-g", "2001:db8::1"}).errors, Errors{});
    EXPECT_EQ(RunCommand<IpRouteIpv6List>().Json(), kDefaultIpv6Routes);
}

TEST(IpRoute, EachCommandReportsTheHostsTextAlone) {
    TempHost host;
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
    };
    auto remove4 = [](const char* gateway) { return RunCommand<IpRouteIpv4Remove>({"-n", "default", "-g", gateway}); };
    auto remove6 = [] { return RunCommand<IpRouteIpv6Remove>({"-n", "default", "-g", "2001:db8::1"}); };
    const std::vector<Case> cases = {
        {"RoutingInfoImpl::GetDefaultGatewaySource", [] { return RunCommand<IpRouteIpv4List>(); }},
        {"RoutingInfoImpl::GetCurrentIpv6TesselRoutes", [] { return RunCommand<IpRouteIpv6List>(); }},
        {"RoutingInfoImpl::AddTesselRoute",
         [] { return RunCommand<IpRouteIpv4Add>({"-n", "203.0.113.0/24", "-g", "192.0.2.254"}); }},
        {"RoutingInfoImpl::AddIpv6TesselRoute",
         [] { return RunCommand<IpRouteIpv6Add>({"-n", "2001:db8:5::/48", "-g", "2001:db8::fe"}); }},
        {"RoutingInfoImpl::RemoveTesselRoute",
         [] { return RunCommand<IpRouteIpv4Remove>({"-n", "198.51.100.0/24", "-g", "192.0.2.254"}); }},
        {"RoutingInfoImpl::SetTesselDefaultGateway", [&] { return remove4("192.0.2.1"); }},
        {"RoutingInfoImpl::GetTesselConfigDefaultGateway", [&] { return remove4("192.0.2.99"); }},
        {"RoutingInfoImpl::GetIpv6TesselDefaultGateway", remove6},
        {"RoutingInfoImpl::SetIpv6TesselDefaultGateway", remove6},
    };
    std::string before = Trellis::Host::ExportHost();
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "routing table busy", 0, 1});
        CommandRun run = c.run();
        ExpectFailure(run, "routing table busy");
    }
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
    // The gateway in force matches: the configured one is not read.
    ArmFault({"RoutingInfoImpl::GetTesselConfigDefaultGateway", "routing table busy", 0, 1});
    EXPECT_EQ(remove4("192.0.2.1").errors, Errors{});
}

TEST(IpNeighborList, ListsBothTablesByVersionAndFiltersTheNetstacksTableByInterface) {
    TempHost host(AddRoutedBackupStack);
    CommandRun run = RunCommand<IpNeighborList>();
    EXPECT_EQ(run.Parsed()[0], Json::parse(R"({"Neighbor":"192.0.2.1","Mac Address":"00:1c:73:5e:0a:02",
        "Tslnic":"tsl0","Expiry":1185,"State":"","Type":"Dynamic"})"));
    EXPECT_EQ(run.Parsed()[2], Json::parse(R"({"Neighbor":"2001:db8::1","Mac Address":"00:1c:73:5e:0a:02",
        "Tslnic":"tsl0","Expiry":26,"State":"Reachable","Type":"Router"})"));
    EXPECT_EQ(Column(run, "Neighbor"), (Errors{"192.0.2.1", "192.0.2.254", "2001:db8::1"}));
    EXPECT_EQ(Column(RunCommand<IpNeighborList>({"-v", "4"}), "Neighbor"), (Errors{"192.0.2.1", "192.0.2.254"}));
    EXPECT_EQ(Column(RunCommand<IpNeighborList>({"-v", "6", "-i", "tsl0"}), "Neighbor"), Errors{"2001:db8::1"});
    run = RunCommand<IpNeighborList>({"-v", "all", "-N", "backupStack"});
    EXPECT_EQ(Column(run, "Type"), (Errors{"Static", "Host"}));
    EXPECT_EQ(Column(run, "State"), (Errors{"", "Stale"}));
    // tsl1 exists, so the default netstack's table is read for it: empty.
    EXPECT_EQ(RunCommand<IpNeighborList>({"-i", "tsl1"}).Json(), "[]");
    run = RunCommand<IpNeighborList>({"-i", "tsl9"});
    ExpectFailure(run, "Unable to find a Tessel interface with the name tsl9");
}

TEST(IpNeighborRemove, RemovesFromTheNetstackChosenOrFromTheInterfacesOwn) {
    TempHost host(AddRoutedBackupStack);
    EXPECT_EQ(RunCommand<IpNeighborRemove>({"-v", "4", "-a", "192.0.2.254"}).Json(), "true");
    EXPECT_EQ(Routing("defaultTcpipStack")["ipv4Neighbors"].size(), 1u);
    EXPECT_EQ(RunCommand<IpNeighborRemove>({"-v", "4", "-a", "198.51.100.1", "-i", "tsl1", "-N", "defaultTcpipStack"})
                  .errors,
              Errors{});
    EXPECT_EQ(RunCommand<IpNeighborRemove>({"-v", "6", "-a", "2001:db8:1::1", "-N", "backupStack"}).errors, Errors{});
    EXPECT_EQ(Routing("backupStack")["ipv4Neighbors"], Json::array());
    EXPECT_EQ(Routing("backupStack")["ipv6Neighbors"], Json::array());
    CommandRun run = RunCommand<IpNeighborRemove>({"-v", "6", "-a", "2001:db8::1", "-i", "tsl1"});
    ExpectFailure(run, "Netstack instance backupStack has no neighbour entry for 2001:db8::1 on tsl1");
}

TEST(IpNeighbor, WithIpv6OffInTheKernelOnlyTheIpv4TableIsListedOrChanged) {
    TempHost host([](Json& d) { d["ipSettings"]["ipv6Enabled"] = false; });
    EXPECT_EQ(RunCommand<IpNeighborList>().Parsed().size(), 2u);
    EXPECT_EQ(RunCommand<IpNeighborList>({"-v", "6"}).Json(), "[]");
    EXPECT_EQ(RunCommand<IpNeighborRemove>({"-v", "6", "-a", "2001:db8::1"}).Json(), "true");
    EXPECT_EQ(Routing("defaultTcpipStack")["ipv6Neighbors"].size(), 1u);
}

TEST(IpNeighbor, ListLeavesHostFailuresToTheToolAndRemoveReportsThem) {
    TempHost host;
    for (const char* operation :
         {"RoutingInfoImpl::GetCurrentIpv4TesselNeighbors", "RoutingInfoImpl::GetIpv6NeighborState",
          "NetworkInfoImpl::IsTslIpv6Enabled", "TesselNicInfoImpl::GetTesselNicByInterface"}) {
        ArmFault({operation, "neighbour table busy", 0, 1});
        EXPECT_EQ(FailureOf([] { RunCommand<IpNeighborList>({"-i", "tsl0"}); }), "neighbour table busy") << operation;
    }
    ArmFault({"NetworkInfoImpl::IsTslIpv6Enabled", "neighbour table busy", 0, 1});
    EXPECT_EQ(RunCommand<IpNeighborList>({"-v", "4"}).errors, Errors{});  // IPv4 alone does not ask
    Trellis::Host::ClearFaults();

    for (const char* operation : {"RoutingInfoImpl::RemoveIpv6Neighbor", "NetworkInfoImpl::IsTslIpv6Enabled",
                                  "TslNic::GetNetstackInstanceKey", "NetworkInfoImpl::NetworkInfoImpl"}) {
        ArmFault({operation, "neighbour table busy", 0, 1});
        CommandRun run = RunCommand<IpNeighborRemove>({"-v", "6", "-a", "2001:db8::1", "-i", "tsl0"});
        EXPECT_EQ(run.errors, Errors{"neighbour table busy"}) << operation;
        EXPECT_FALSE(run.HasResult());
    }
    EXPECT_EQ(RunCommand<IpNeighborRemove>({"-v", "4", "-a", "2001:db8::1"}).errors,
              Errors{"Invalid IPv4 address: 2001:db8::1"});
    ArmFault({"TesselNicInfoImpl::TesselNicInfoImpl", "neighbour table busy", 0, 1});
    EXPECT_THROW(RunCommand<IpNeighborRemove>({"-v", "4", "-a", "192.0.2.1"}), Gantry::Lib::GantryException);
}
