// network ip interface ipv4, ipv6 and tag: IPv4 round trips through static,
// DHCP and none with the refusals of the static options, IPv6 settings and
// addresses of every origin and state, tags by any case of their names and
// those of the dedicated stacks, and each host failure once.

#include <functional>
#include <string>
#include <tuple>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "InterfaceTestSupport.h"
#include "IpInterfaceIpv4Get.h"
#include "IpInterfaceIpv4Set.h"
#include "IpInterfaceIpv6AddressAdd.h"
#include "IpInterfaceIpv6AddressList.h"
#include "IpInterfaceIpv6AddressRemove.h"
#include "IpInterfaceIpv6Get.h"
#include "IpInterfaceIpv6Set.h"
#include "IpInterfaceTagAdd.h"
#include "IpInterfaceTagGet.h"
#include "IpInterfaceTagRemove.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace InterfaceTest;
using Trellis::Host::ArmFault;
using Trellis::Host::ExportHost;
using Words = std::vector<std::string>;

namespace {

const std::string kSupportedTags =
    "Supported tags are: Management, Glide, FaultTolerance, Replication, ReplicationNFC, Provisioning, Storage";

Json Ipv4(const std::string& name) { return RunCommand<IpInterfaceIpv4Get>({"-i", name}).Parsed()[0]; }
Json Ipv4Row(const std::string& name, const std::string& address, const std::string& netmask,
             const std::string& broadcast, const std::string& type, bool dhcpDns) {
    return Json{{"Name", name},           {"IPv4 Address", address}, {"IPv4 Netmask", netmask},
                {"IPv4 Broadcast", broadcast}, {"Address Type", type},    {"DHCP DNS", dhcpDns}};
}
Json Ipv6Row(const std::string& address, int netmask, const std::string& type, const std::string& status) {
    return Json{{"Interface", "tsl0"}, {"Address", address}, {"Netmask", netmask}, {"Type", type}, {"Status", status}};
}
Json Tags(const std::string& name) { return RunCommand<IpInterfaceTagGet>({"-i", name}).Parsed()["Tags"]; }

}  // namespace

TEST(IpInterfaceIpv4, GoesToDhcpStaticAndNoneAndBack) {
    TempHost host([](Json& d) {
        AddNetstack(d, "glide");
        AddNic(d, 1, "glide", Json::array());
    });
    const Json tsl0 = Ipv4Row("tsl0", "192.0.2.10", "255.255.255.0", "192.0.2.255", "STATIC", false);
    const Json tsl1 = Ipv4Row("tsl1", "192.0.2.11", "255.255.255.0", "192.0.2.255", "STATIC", false);
    EXPECT_EQ(RunCommand<IpInterfaceIpv4Get>().Parsed(), Json({tsl0, tsl1}));
    EXPECT_EQ(RunCommand<IpInterfaceIpv4Get>({"-N", ""}).Parsed(), Json({tsl0, tsl1}));
    EXPECT_EQ(RunCommand<IpInterfaceIpv4Get>({"-N", "glide"}).Parsed(), Json({tsl1}));
    // A name wins over a netstack.
    EXPECT_EQ(RunCommand<IpInterfaceIpv4Get>({"-i", "tsl0", "-N", "glide"}).Parsed(), Json({tsl0}));

    // The lease is in force; the DNS flag shown is the configured one.
    ExpectDone(RunCommand<IpInterfaceIpv4Set>({"-i", "tsl1", "-t", "dhcp", "-P", "true"}));
    EXPECT_EQ(Ipv4("tsl1"), Ipv4Row("tsl1", "203.0.113.11", "255.255.255.0", "203.0.113.255", "DHCP", true));
    // --peer-dns counts only with dhcp.
    ExpectDone(RunCommand<IpInterfaceIpv4Set>(
        {"-i", "tsl1", "-t", "static", "-I", "192.0.2.50", "-N", "255.255.255.128", "-P", "false"}));
    EXPECT_EQ(Ipv4("tsl1"), Ipv4Row("tsl1", "192.0.2.50", "255.255.255.128", "192.0.2.127", "STATIC", false));
    ExpectDone(RunCommand<IpInterfaceIpv4Set>({"-i", "tsl1", "-t", "dhcp"}));
    EXPECT_EQ(Ipv4("tsl1")["DHCP DNS"], true);
    ExpectDone(RunCommand<IpInterfaceIpv4Set>({"-i", "tsl1", "-t", "none", "-P", "true"}));
    EXPECT_EQ(Ipv4("tsl1"), Ipv4Row("tsl1", "0.0.0.0", "0.0.0.0", "0.0.0.0", "NONE", false));
    EXPECT_EQ(Ipv4("tsl0"), tsl0);
}

TEST(IpInterfaceIpv4Set, ReportsEveryFaultOfTheStaticOptionsInOrderAndChangesNothing) {
    TempHost host;
    const std::string before = ExportHost();
    const std::string missing = "The --type=static requires the --ipv4 and --netmask options.";
    const std::string badIpv4 = "Invalid --ipv4 option provided. This address is not a valid IPv4 address";
    const std::string badNetmask = "Invalid --netmask option provided. This address is not a valid IPv4 address";
    for (auto const& [words, errors] : std::vector<std::pair<Words, Errors>>{
             {{}, {missing, badIpv4, badNetmask}},
             {{"-I", "192.0.2.20"}, {missing, badNetmask}},
             {{"-I", "192.0.2.300", "-N", "255.255.0"}, {badIpv4, badNetmask}},
         }) {
        Words line = {"-i", "tsl0", "-t", "static"};
        line.insert(line.end(), words.begin(), words.end());
        CommandRun run = RunCommand<IpInterfaceIpv4Set>(line);
        EXPECT_EQ(run.errors, errors);
        EXPECT_FALSE(run.HasResult());
    }
    const std::string unknown = "Unable to find a Tessel interface with the name tsl9";
    ExpectFailure(RunCommand<IpInterfaceIpv4Set>({"-i", "tsl9", "-t", "none"}), unknown);
    ExpectFailure(RunCommand<IpInterfaceIpv4Get>({"-i", "tsl9"}), unknown);
    EXPECT_EQ(ExportHost(), before);
}

TEST(IpInterfaceIpv6, SettingsAndAddressesOfEveryOriginAndState) {
    TempHost host([](Json& d) {
        d["tesselNics"][0]["ipv6"]["addresses"].push_back({{"address", "2001:db8::11/64"}, {"status", "tentative"}});
        d["tesselNics"][0]["ipv6"]["addresses"].push_back({{"address", "2001:db8::12/64"}, {"status", "duplicated"}});
        d["tesselNics"][0]["ipv6"]["addresses"].push_back({{"address", "2001:db8::13/64"}, {"status", "deprecated"}});
    });
    EXPECT_EQ(RunCommand<IpInterfaceIpv6Get>().Json(),
              R"([{"Name":"tsl0","DHCPv6 Enabled":false,"Router Adv Enabled":false,"DHCP DNS":false}])");
    // The DNS flag is kept, and shown once DHCPv6 is on.
    ExpectDone(RunCommand<IpInterfaceIpv6Set>({"-i", "tsl0", "-P", "true"}));
    EXPECT_EQ(RunCommand<IpInterfaceIpv6Get>({"-n", "tsl0"}).Parsed()[0]["DHCP DNS"], false);
    ExpectDone(RunCommand<IpInterfaceIpv6Set>({"-i", "tsl0", "-d", "true", "-r", "true"}));
    EXPECT_EQ(RunCommand<IpInterfaceIpv6Get>({"-n", "tsl0"}).Json(),
              R"([{"Name":"tsl0","DHCPv6 Enabled":true,"Router Adv Enabled":true,"DHCP DNS":true}])");

    ExpectDone(RunCommand<IpInterfaceIpv6AddressAdd>({"-i", "tsl0", "-I", "2001:db8::20/48"}));
    const Json statics = {Ipv6Row("2001:db8::10", 64, "STATIC", "PREFERRED"),
                          Ipv6Row("2001:db8::11", 64, "STATIC", "TENTATIVE"),
                          Ipv6Row("2001:db8::12", 64, "STATIC", "DUPLICATED"),
                          Ipv6Row("2001:db8::13", 64, "STATIC", "DEPRECATED")};
    Json all = statics;
    all.push_back(Ipv6Row("2001:db8::20", 48, "STATIC", "PREFERRED"));
    all.push_back(Ipv6Row("2001:db8:0:1:250:56ff:fe6e:410a", 64, "AUTOCONF", "PREFERRED"));
    all.push_back(Ipv6Row("2001:db8:0:2::1", 64, "DHCP", "PREFERRED"));
    EXPECT_EQ(RunCommand<IpInterfaceIpv6AddressList>({"-i", "tsl0"}).Parsed(), all);

    // The addresses the host obtained itself go with the settings.
    ExpectDone(RunCommand<IpInterfaceIpv6Set>({"-i", "tsl0", "-d", "false", "-r", "false"}));
    ExpectDone(RunCommand<IpInterfaceIpv6AddressRemove>({"-i", "tsl0", "-I", "2001:db8::20/48"}));
    EXPECT_EQ(RunCommand<IpInterfaceIpv6AddressList>().Parsed(), statics);

    ExpectFailure(RunCommand<IpInterfaceIpv6AddressAdd>({"-i", "tsl9", "-I", "2001:db8::30"}),
                  "Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   "
                  "Example: 1:2:3:4::/64");
    ExpectFailure(RunCommand<IpInterfaceIpv6AddressList>({"-i", "tsl9"}),
                  "Unable to find a Tessel interface with the name tsl9");
}

TEST(IpInterfaceTag, AddsAndRemovesByAnyCaseOfTheNameAndRefusesUnknownTagsAndInterfaces) {
    TempHost host;
    EXPECT_EQ(IpInterfaceTagAdd::New()->GetDescription(),
              "Adds a tag on a given Tessel network interface. " + kSupportedTags);
    EXPECT_EQ(RunCommand<IpInterfaceTagGet>({"-i", "tsl0"}).Json(), R"({"Tags":["Management"]})");
    ExpectDone(RunCommand<IpInterfaceTagAdd>({"-i", "tsl0", "-t", "storage"}));
    EXPECT_EQ(Tags("tsl0"), Json({"Management", "Storage"}));
    ExpectDone(RunCommand<IpInterfaceTagRemove>({"-i", "tsl0", "-t", "MANAGEMENT"}));
    EXPECT_EQ(Tags("tsl0"), Json({"Storage"}));

    const std::string before = ExportHost();
    for (CommandRun run : {RunCommand<IpInterfaceTagAdd>({"-i", "tsl9", "-t", "Bogus"}),
                           RunCommand<IpInterfaceTagRemove>({"-i", "tsl9", "-t", "Bogus"})}) {
        EXPECT_EQ(run.errors, (Errors{"Invalid tag name Bogus", kSupportedTags}));
        EXPECT_FALSE(run.HasResult());
    }
    ExpectFailure(RunCommand<IpInterfaceTagAdd>({"-i", "tsl9", "-t", "Storage"}),
                  "Unable to find tslnic with name tsl9");
    EXPECT_EQ(ExportHost(), before);
}

TEST(IpInterfaceTagAdd, RefusesTheTagOfADedicatedStackThatHasInterfacesAndAnotherTagOnADedicatedStack) {
    TempHost host([](Json& d) {
        AddNetstack(d, "glide");
        AddNetstack(d, "MeridonProvisioning");
        AddNic(d, 1, "glide", {"Glide"});
    });
    const std::string before = ExportHost();
    ExpectFailure(RunCommand<IpInterfaceTagAdd>({"-i", "tsl0", "-t", "Glide"}),
                  "Failed to add Glide tag when dedicated stack is instantiated");
    ExpectFailure(RunCommand<IpInterfaceTagAdd>({"-i", "tsl1", "-t", "glide"}),
                  "Failed to add glide tag when dedicated stack is instantiated");
    ExpectFailure(RunCommand<IpInterfaceTagAdd>({"-i", "tsl1", "-t", "Storage"}), "netstack mismatch for tagStorage");
    ExpectFailure(RunCommand<IpInterfaceTagAdd>({"-i", "tsl1", "-t", "faulttolerance"}),
                  "netstack mismatch for tagfaulttolerance");
    EXPECT_EQ(ExportHost(), before);
    // A dedicated stack without interfaces, or without an instance, blocks nothing.
    ExpectDone(RunCommand<IpInterfaceTagAdd>({"-i", "tsl0", "-t", "Provisioning"}));
    ExpectDone(RunCommand<IpInterfaceTagAdd>({"-i", "tsl0", "-t", "FaultTolerance"}));
    EXPECT_EQ(Tags("tsl0"), Json({"Management", "Provisioning", "FaultTolerance"}));
    // Any tag comes off any interface.
    ExpectDone(RunCommand<IpInterfaceTagRemove>({"-i", "tsl1", "-t", "Glide"}));
    EXPECT_EQ(Tags("tsl1"), Json::array());
}

TEST(IpInterfaceAddressCommands, ReportEachHostFailureInTheirOwnWords) {
    TempHost host([](Json& d) {
        AddNetstack(d, "glide");
        AddNic(d, 1, "glide", {"Glide"});
        d["tesselNics"][0]["ipv6"]["dhcp"] = true;
    });
    using Run = std::function<CommandRun()>;
    auto command = [](auto make, Words words) -> Run { return [make, words] { return make(words); }; };
    const std::string ipv4Get = "Error getting IPv4 configuration. . Error was : busy";
    const std::string ipv6Get = "Error getting IPv6 configuration. . Error was : busy";
    const std::string ipv6Adding = "Error adding IPv6 address for the interface tsl0. Error was : busy";
    for (auto const& [operation, run, text] : std::vector<std::tuple<std::string, Run, std::string>>{
             {"TslNic::GetIpConfig", command(RunCommand<IpInterfaceIpv4Get>, {}), ipv4Get},
             {"TslNic::SetIpConfig", command(RunCommand<IpInterfaceIpv4Set>, {"-i", "tsl0", "-t", "none"}),
              "Error changing IPv4 configuration for the interface tsl0. Error was : busy"},
             {"TslNic::GetConfiguredIpConfig", command(RunCommand<IpInterfaceIpv6Get>, {}), ipv6Get},
             {"TslNic::GetConfiguredIpConfig", command(RunCommand<IpInterfaceIpv6Set>, {"-i", "tsl0"}),
              "Error changing IPv6 configuration for the interface tsl0. Error was : busy"},
             {"TslNic::SetIpConfig", command(RunCommand<IpInterfaceIpv6AddressAdd>, {"-i", "tsl0", "-I", "::5/64"}),
              ipv6Adding},
             {"TslNic::GetIpConfig", command(RunCommand<IpInterfaceIpv6AddressRemove>, {"-i", "tsl0", "-I", "::5/64"}),
              ipv6Adding},
             {"TslNic::GetName", command(RunCommand<IpInterfaceIpv6AddressList>, {}),
              "Unable to list IPv6 Addresses. Error was: busy"},
             {"NetworkInfo::GetNetstackInstanceState",
              command(RunCommand<IpInterfaceTagAdd>, {"-i", "tsl0", "-t", "Glide"}),
              "Error setting tag Glide on interface tsl0. Error was : busy"},
             {"TslNic::AddTag", command(RunCommand<IpInterfaceTagAdd>, {"-i", "tsl0", "-t", "Storage"}),
              "Error setting tag Storage on interface tsl0. Error was : busy"},
             {"TslNic::GetTags", command(RunCommand<IpInterfaceTagGet>, {"-i", "tsl0"}),
              "Error getting tags on interface tsl0. Error was : busy"},
             {"TslNic::RemoveTag", command(RunCommand<IpInterfaceTagRemove>, {"-i", "tsl0", "-t", "Management"}),
              "Error removing tag Management from interface tsl0. Error was : busy"},
         }) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(run(), text);
        Trellis::Host::ClearFaults();
    }
    // The directory is opened before the guarded block; tag add opens it
    // before it looks at the tag's name, tag remove after.
    ArmFault({"TesselNicInfoImpl::TesselNicInfoImpl", "busy", 0, {}});
    EXPECT_THROW(RunCommand<IpInterfaceIpv4Get>(), Gantry::Lib::GantryException);
    EXPECT_THROW(RunCommand<IpInterfaceTagAdd>({"-i", "tsl0", "-t", "Bogus"}), Gantry::Lib::GantryException);
    EXPECT_EQ(RunCommand<IpInterfaceTagRemove>({"-i", "tsl0", "-t", "Bogus"}).errors.size(), 2u);
}
