// network ip dns, ip get/set and ip connection list: edits of name servers
// and search domains per netstack, with a refused edit reported together with
// true; the IPv6 switch; the connections of each type in order, with their
// states, worlds and the cut of long endpoints; and each host failure once.
// The round trips through the tool are in tests/cli/ipservices.test.sh.

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "IpConnectionList.h"
#include "IpDNSSearchAdd.h"
#include "IpDNSSearchList.h"
#include "IpDNSSearchRemove.h"
#include "IpDNSServerAdd.h"
#include "IpDNSServerList.h"
#include "IpDNSServerRemove.h"
#include "IpGet.h"
#include "IpSet.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Json = TempHost::Json;
using Plinth::CallSpec::Input;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;
using Words = std::vector<std::string>;

namespace {

Words OnNetstack(Words words, const std::string& netstack) {
    if (!netstack.empty()) words.insert(words.end(), {"-N", netstack});
    return words;
}

Json Servers(const std::string& netstack = "") {
    return RunCommand<IpDNSServerList>(OnNetstack({}, netstack)).Parsed()["DNS Servers"];
}

Json Domains(const std::string& netstack = "") {
    return RunCommand<IpDNSSearchList>(OnNetstack({}, netstack)).Parsed()["DNS Search Domains"];
}

// An edit that went through: no text, true.
void ExpectDone(const CommandRun& run) {
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
}

// An edit the host refused: its text, and true all the same.
void ExpectRefusedWithTrue(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_EQ(run.Json(), "true");
}

void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

boost::shared_ptr<Input> RemoveAllInput(const std::string& netstack = "") {
    boost::shared_ptr<Input> input = Input::New();
    input->SetFlag("all");
    if (!netstack.empty()) input->SetString("netstack", netstack);
    return input;
}

// A second netstack with a name server and a search domain of its own.
void AddStorageNetstack(Json& d) {
    Json netstack = d["netstacks"][0];
    netstack["key"] = "storage";
    netstack["name"] = "storage";
    netstack.erase("routing");
    netstack["dns"] = {{"nameServers", {"198.51.100.53"}}, {"searchDomains", {"storage.example.com"}}};
    netstack["connections"] = Json::array();
    d["netstacks"].push_back(netstack);
}

Json Connection(const std::string& protocol, const std::string& local, int localPort, const std::string& foreign,
                int foreignPort, int state, long long worldId) {
    return {{"protocol", protocol},   {"recvQueue", 0},   {"sendQueue", 0}, {"localAddress", local},
            {"localPort", localPort}, {"foreignAddress", foreign}, {"foreignPort", foreignPort},
            {"state", state},         {"worldId", worldId},        {"congestionControl", "cubic"}};
}

std::vector<std::string> Column(const Json& rows, const std::string& title) {
    std::vector<std::string> values;
    for (const Json& row : rows) values.push_back(row[title].is_string() ? row[title].get<std::string>() : row[title].dump());
    return values;
}

}  // namespace

TEST(IpDnsServer, ServersOfEitherFamilyAreAddedAtTheEndAndRemovedOneOrAll) {
    TempHost host;
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53"}));
    ExpectDone(RunCommand<IpDNSServerAdd>({"--server", "203.0.113.53"}));
    ExpectDone(RunCommand<IpDNSServerAdd>({"-s", "2001:DB8:0:0::54"}));
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53", "203.0.113.53", "2001:db8::54"}));
    // An empty --netstack is the default one.
    ExpectDone(RunCommand<IpDNSServerRemove>({"-s", "2001:db8::53", "-N", ""}));
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "203.0.113.53", "2001:db8::54"}));
    ExpectDone(RunCommandOn<IpDNSServerRemove>(RemoveAllInput()));
    EXPECT_EQ(Servers(), Json::array());
    EXPECT_EQ(RunCommand<IpDNSServerList>().Json(), R"({"DNS Servers":[]})");
}

TEST(IpDnsServer, AnAddressNeitherFamilyAcceptsIsRefusedBeforeTheHost) {
    TempHost host;
    for (const char* text : {"192.0.2", "2001:db8::53/64", "dns.example.com", " 192.0.2.1"}) {
        SCOPED_TRACE(text);
        const std::string message =
            std::string("The specified address '") + text + "' is not recognised as a valid IP address";
        ExpectFailure(RunCommand<IpDNSServerAdd>({"-s", text}), message);
        ExpectFailure(RunCommand<IpDNSServerRemove>({"-s", text}), message);
    }
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53"}));
}

TEST(IpDnsServerRemove, TakesExactlyOneOfAllAndServer) {
    TempHost host;
    const std::string text = "You must specify exactly one of: --all, --server";
    ExpectFailure(RunCommand<IpDNSServerRemove>({"--all", "--server", "192.0.2.53"}), text);
    ExpectFailure(RunCommandOn<IpDNSServerRemove>(Input::New()), text);
    // --server is required as declared, so the tool refuses --all alone.
    EXPECT_THROW(RunCommand<IpDNSServerRemove>({"--all"}), Plinth::Cli::UsageError);
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53"}));
}

TEST(IpDnsSearch, DomainsAreAddedAtTheEndAndRemovedByName) {
    TempHost host;
    EXPECT_EQ(Domains(), Json({"example.com", "lab.example.net"}));
    ExpectDone(RunCommand<IpDNSSearchAdd>({"--domain", "corp.example.org"}));
    ExpectDone(RunCommand<IpDNSSearchRemove>({"-d", "example.com"}));
    EXPECT_EQ(Domains(), Json({"lab.example.net", "corp.example.org"}));
    ExpectDone(RunCommand<IpDNSSearchRemove>({"-d", "lab.example.net"}));
    ExpectDone(RunCommand<IpDNSSearchRemove>({"-d", "corp.example.org"}));
    EXPECT_EQ(RunCommand<IpDNSSearchList>().Json(), R"({"DNS Search Domains":[]})");
}

TEST(IpDns, EditsTheHostRefusesAreReportedWithTrue) {
    TempHost host;
    ExpectRefusedWithTrue(RunCommand<IpDNSServerAdd>({"-s", "192.0.2.53"}),
                          "The name server 192.0.2.53 is already configured for netstack defaultTcpipStack");
    ExpectRefusedWithTrue(RunCommand<IpDNSServerRemove>({"-s", "192.0.2.99"}),
                          "The name server 192.0.2.99 is not configured for netstack defaultTcpipStack");
    ExpectRefusedWithTrue(RunCommand<IpDNSSearchAdd>({"-d", "EXAMPLE.com"}),
                          "The search domain EXAMPLE.com is already configured for netstack defaultTcpipStack");
    ExpectRefusedWithTrue(RunCommand<IpDNSSearchRemove>({"-d", "nope.example"}),
                          "The search domain nope.example is not configured for netstack defaultTcpipStack");
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53"}));
    EXPECT_EQ(Domains(), Json({"example.com", "lab.example.net"}));
}

TEST(IpDns, EachNetstackKeepsItsOwnServersAndDomains) {
    TempHost host(AddStorageNetstack);
    ExpectDone(RunCommand<IpDNSServerAdd>({"-s", "198.51.100.54", "-N", "storage"}));
    ExpectDone(RunCommand<IpDNSSearchAdd>({"-d", "example.com", "-N", "storage"}));
    ExpectDone(RunCommand<IpDNSSearchRemove>({"-d", "storage.example.com", "--netstack", "storage"}));
    ExpectDone(RunCommandOn<IpDNSServerRemove>(RemoveAllInput()));
    EXPECT_EQ(Servers("storage"), Json({"198.51.100.53", "198.51.100.54"}));
    EXPECT_EQ(Domains("storage"), Json({"example.com"}));
    EXPECT_EQ(Servers(), Json::array());
    EXPECT_EQ(Domains(), Json({"example.com", "lab.example.net"}));
    ExpectRefusedWithTrue(RunCommand<IpDNSServerAdd>({"-s", "198.51.100.54", "-N", "storage"}),
                          "The name server 198.51.100.54 is already configured for netstack storage");
}

TEST(IpDns, ANetstackTheHostLacksEscapesFromTheFacadesConstruction) {
    TempHost host;
    // The facade is made before the guarded block: its failure is not reported.
    EXPECT_THROW(RunCommand<IpDNSServerList>({"-N", "nope"}), Gantry::Lib::GantryException);
    EXPECT_THROW(RunCommand<IpDNSSearchAdd>({"-d", "x.example", "-N", "nope"}), Gantry::Lib::GantryException);
    ArmFault({"DnsConfigImpl::DnsConfigImpl", "busy", 0, 1});
    EXPECT_THROW(RunCommand<IpDNSServerAdd>({"-s", "192.0.2.1"}), Gantry::Lib::GantryException);
}

TEST(IpDns, AHostFailureOfAnEditGivesItsTextAndTrueAndChangesNothing) {
    TempHost host;
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
    };
    const std::vector<Case> cases = {
        {"DnsConfigImpl::AddNameServer", [] { return RunCommand<IpDNSServerAdd>({"-s", "192.0.2.1"}); }},
        {"DnsConfigImpl::RemoveNameServer", [] { return RunCommand<IpDNSServerRemove>({"-s", "192.0.2.53"}); }},
        {"DnsConfigImpl::RemoveNameServers", [] { return RunCommandOn<IpDNSServerRemove>(RemoveAllInput()); }},
        {"DnsConfigImpl::AddSearchDomain", [] { return RunCommand<IpDNSSearchAdd>({"-d", "x.example"}); }},
        {"DnsConfigImpl::RemoveSearchDomain", [] { return RunCommand<IpDNSSearchRemove>({"-d", "example.com"}); }},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "busy", 0, 1});
        ExpectRefusedWithTrue(c.run(), "busy");
        // The edit was made but the save fails: lost with the object.
        ArmFault({"DnsConfigImpl::SaveConfig", "disk full", 0, 1});
        ExpectRefusedWithTrue(c.run(), "disk full");
    }
    EXPECT_EQ(Servers(), Json({"192.0.2.53", "2001:db8::53"}));
    EXPECT_EQ(Domains(), Json({"example.com", "lab.example.net"}));

    ArmFault({"DnsConfigImpl::GetNameServers", "busy", 0, 1});
    ExpectFailure(RunCommand<IpDNSServerList>(), "busy");
    ArmFault({"DnsConfigImpl::GetSearchDomainsString", "busy", 0, 1});
    ExpectFailure(RunCommand<IpDNSSearchList>(), "busy");
}

TEST(IpDns, IpGetAndSetReadAndChangeTheIpv6SwitchAndNoOptionChangesNothing) {
    TempHost host;
    EXPECT_EQ(RunCommand<IpGet>().Json(), R"({"IPv6 Enabled":true})");
    ExpectDone(RunCommand<IpSet>({"--ipv6-enabled", "false"}));
    EXPECT_EQ(RunCommand<IpGet>().Json(), R"({"IPv6 Enabled":false})");
    ExpectDone(RunCommand<IpSet>());
    EXPECT_EQ(RunCommand<IpGet>().Json(), R"({"IPv6 Enabled":false})");
    ExpectDone(RunCommand<IpSet>({"-e", "yes"}));
    EXPECT_EQ(RunCommand<IpGet>().Json(), R"({"IPv6 Enabled":true})");

    ArmFault({"NetworkInfoImpl::IsTslIpv6Enabled", "busy", 0, 1});
    ExpectFailure(RunCommand<IpGet>(), "busy");
    ArmFault({"NetworkInfoImpl::SetTslIpv6Enabled", "busy", 0, 1});
    ExpectFailure(RunCommand<IpSet>({"-e", "false"}), "busy");
    EXPECT_EQ(RunCommand<IpGet>().Json(), R"({"IPv6 Enabled":true})");
    ArmFault({"NetworkInfoImpl::NetworkInfoImpl", "busy", 0, 1});
    EXPECT_THROW(RunCommand<IpGet>(), Gantry::Lib::GantryException);
}

TEST(IpDns, ConnectionListShowsTcpThenUdpThenIpWithTheirWorldsAndStates) {
    TempHost host;
    CommandRun run = RunCommand<IpConnectionList>();
    EXPECT_EQ(run.errors, Errors{});
    Json rows = run.Parsed();
    EXPECT_EQ(Column(rows, "Proto"), (std::vector<std::string>{"tcp", "tcp", "tcp", "tcp", "tcp", "udp", "ip"}));
    EXPECT_EQ(Column(rows, "State"), (std::vector<std::string>{"LISTEN", "LISTEN", "ESTABLISHED", "ESTABLISHED",
                                                               "TIME_WAIT", "CLOSED", "CLOSED"}));
    EXPECT_EQ(Column(rows, "World Name"),
              (std::vector<std::string>{"sshd", "hostd", "hostd", "web01", "sshd", "ntpd", "hostd"}));
    // The fields come in the order they are set: CC Algo before World ID.
    EXPECT_EQ(rows[3].dump(), R"({"Proto":"tcp","Recv Q":0,"Send Q":0,"Local Address":"192.0.2.10:902",)"
                              R"("Foreign Address":"198.51.100.5:60114","State":"ESTABLISHED","CC Algo":"newreno",)"
                              R"("World ID":69312,"World Name":"web01"})");
    EXPECT_EQ(rows[1]["Local Address"], ":::443");
    EXPECT_EQ(run.hints.at("fields:IpConnection"),
              "Proto,Recv Q,Send Q,Local Address,Foreign Address,State,World ID,CC Algo,World Name");

    EXPECT_EQ(Column(RunCommand<IpConnectionList>({"-t", "udp"}).Parsed(), "Local Address"),
              (std::vector<std::string>{"0.0.0.0:123"}));
    EXPECT_EQ(Column(RunCommand<IpConnectionList>({"--type", "ip", "-N", ""}).Parsed(), "Proto"),
              (std::vector<std::string>{"ip"}));
    EXPECT_EQ(RunCommand<IpConnectionList>({"-t", "tcp", "-N", "defaultTcpipStack"}).Parsed().size(), 5u);
    EXPECT_EQ(RunCommand<IpConnectionList>({"-t", "all"}).Parsed(), rows);
    EXPECT_THROW(RunCommand<IpConnectionList>({"-t", "icmp"}), Plinth::Cli::UsageError);
}

TEST(IpDns, ConnectionListCutsLongEndpointsTo31CharactersAndLeavesUnknownStatesEmpty) {
    TempHost host([](Json& d) {
        d["netstacks"][0]["connections"] = {
            Connection("tcp", "2001:db8:1234:5678:9abc:def0:1234:5678", 443, "2001:db8::77", 51514, 11, 1000),
            Connection("tcp", "2001:db8:1234:5678:9abc::1", 8080, "::", 0, 1, 1000)};
    });
    Json rows = RunCommand<IpConnectionList>().Parsed();
    ASSERT_EQ(rows.size(), 2u);
    EXPECT_EQ(rows[0]["Local Address"], "2001:db8:1234:5678:9abc:def0:12");
    EXPECT_EQ(rows[0]["Foreign Address"], "2001:db8::77:51514");
    EXPECT_EQ(rows[0]["State"], "");
    EXPECT_EQ(rows[0]["CC Algo"], "cubic");
    // Exactly 31 characters stay whole.
    EXPECT_EQ(rows[1]["Local Address"], "2001:db8:1234:5678:9abc::1:8080");
}

TEST(IpDns, ConnectionListReportsAnyHostFailureBehindOneLineAndDropsTheRows) {
    TempHost host(AddStorageNetstack);
    // The storage netstack has no connections at all.
    EXPECT_EQ(RunCommand<IpConnectionList>({"-N", "storage"}).Json(), "[]");
    CommandRun unknown = RunCommand<IpConnectionList>({"-N", "nope"});
    ASSERT_EQ(unknown.errors.size(), 1u);
    EXPECT_EQ(unknown.errors[0].rfind("Unable to get connection list.\n", 0), 0u) << unknown.errors[0];
    EXPECT_FALSE(unknown.HasResult());

    for (const char* operation :
         {"NetworkInfoImpl::NetworkInfoImpl", "ResourceInfoImpl::ResourceInfoImpl", "ResourceInfoImpl::GetWorldName",
          "NetworkInfoImpl::GetCurrentTcpTesselConnections", "NetworkInfoImpl::GetCurrentUdpTesselConnections",
          "NetworkInfoImpl::GetCurrentIpTesselConnections"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(RunCommand<IpConnectionList>(), "Unable to get connection list.\nbusy");
    }
    // A world whose name cannot be read fails the whole list, not only its row.
    ArmFault({"ResourceInfoImpl::GetWorldName", "no world 1000", 0, {}});
    ExpectFailure(RunCommand<IpConnectionList>({"-t", "ip"}), "Unable to get connection list.\nno world 1000");
    Trellis::Host::ClearFaults();
    EXPECT_EQ(RunCommand<IpConnectionList>({"-t", "ip"}).errors, Errors{});
}
