// network nic list, up, get, set, down, stats get, vlan stats get and set,
// negotiate restart against the default host's NICs: what each shows of NICs
// that lack a device, wake-on, a message level or pause; how set folds its
// options into the NIC's settings; and each command's report of a host
// failure. The round trips as a user sees them are in tests/cli/nic.test.sh.

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "InterfaceTestSupport.h"
#include "NicDown.h"
#include "NicGet.h"
#include "NicList.h"
#include "NicNegotiationRestart.h"
#include "NicSet.h"
#include "NicStatsGet.h"
#include "NicUp.h"
#include "NicVlanStatsGet.h"
#include "NicVlanStatsSet.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using InterfaceTest::Errors;
using InterfaceTest::ExpectDone;
using InterfaceTest::ExpectFailure;
using InterfaceTest::Json;
using Trellis::Host::ArmFault;

namespace {

Json Listed(const std::string& name) {
    for (const Json& nic : RunCommand<NicList>().Parsed())
        if (nic["Name"] == name) return nic;
    return nullptr;
}

Json Got(const std::string& name) { return RunCommand<NicGet>({"-n", name}).Parsed(); }

CommandRun Set(const std::string& name, std::vector<std::string> words) {
    words.insert(words.begin(), {"-n", name});
    return RunCommand<NicSet>(words);
}

CommandRun VlanStats(const std::string& name) { return RunCommand<NicVlanStatsGet>({"-n", name}); }

// Runs the command and checks that it changed nothing on the host.
void ExpectRefusal(const std::function<CommandRun()>& command, const std::string& text) {
    const std::string before = Trellis::Host::ExportHost();
    ExpectFailure(command(), text);
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
}

}  // namespace

TEST(NicList, ShowsEveryNicInTheHostsOrderAPseudoNicAndADownOne) {
    TempHost host;
    CommandRun run = RunCommand<NicList>();
    EXPECT_EQ(run.errors, Errors{});
    Json names = Json::array();
    for (const Json& nic : run.Parsed()) names.push_back(nic["Name"]);
    EXPECT_EQ(names, Json::parse(R"(["pnet0","pnet1","pnet2","pnet3","pnet4","pnet5","pnet6"])"));
    EXPECT_EQ(run.Parsed()[2], Json::parse(R"({"Name":"pnet2","PCI Device":"0000:05:00.0","Driver":"igb",
        "Link":"Down","Admin Status":"Down","Link Status":"Down","Speed":0,"Duplex":"Half",
        "MAC Address":"a0:36:9f:2b:11:80","MTU":1500,"Description":"Intel Corporation I350 Gigabit Network Connection"})"));
    EXPECT_EQ(run.Parsed()[6], Json::parse(R"({"Name":"pnet6","PCI Device":"Pseudo","Driver":"hvnet","Link":"Up",
        "Admin Status":"Up","Link Status":"Up","Speed":10000,"Duplex":"Full","MAC Address":"00:50:56:00:00:06",
        "MTU":1500,"Description":"Unknown Unknown"})"));
}

TEST(NicList, AHostWithoutNicsListsNothing) {
    TempHost host([](Json& d) { d["nics"] = Json::array(); });
    CommandRun run = RunCommand<NicList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "[]");
}

TEST(NicUpDown, AreSeenByListAndALinkComesBackOnlyWithAPartner) {
    TempHost host;
    ExpectDone(RunCommand<NicDown>({"-n", "pnet0"}));
    EXPECT_EQ(Listed("pnet0")["Admin Status"], "Down");
    EXPECT_EQ(Listed("pnet0")["Link"], "Down");
    EXPECT_EQ(Listed("pnet0")["Speed"], 0);
    ExpectDone(RunCommand<NicUp>({"--nic-name", "pnet0"}));
    EXPECT_EQ(Listed("pnet0")["Link"], "Up");
    EXPECT_EQ(Listed("pnet0")["Speed"], 10000);
    EXPECT_EQ(Listed("pnet0")["Duplex"], "Full");

    // pnet2 has no link partner: up, but without a link.
    ExpectDone(RunCommand<NicUp>({"-n", "pnet2"}));
    EXPECT_EQ(Listed("pnet2")["Admin Status"], "Up");
    EXPECT_EQ(Listed("pnet2")["Link"], "Down");

    ExpectRefusal([] { return RunCommand<NicUp>({"-n", "nope"}); }, "There is no pnic with name nope");
    ExpectRefusal([] { return RunCommand<NicDown>({"-n", "pnet"}); }, "There is no pnic with name pnet");
}

TEST(NicGet, ShowsEverySettingOfANicThatHasThemAll) {
    TempHost host;
    EXPECT_EQ(RunCommand<NicGet>({"-n", "pnet0"}).Json(),
              R"({"Name":"pnet0","Supported Ports":["FIBRE","DA"],"Supports Auto Negotiation":true,)"
              R"("Advertised Link Modes":["1000baseT/Full","10000baseT/Full"],"Advertised Auto Negotiation":true,)"
              R"("Cable Type":"DA","PHY Address":1,"Transceiver":"internal","Auto Negotiation":true,)"
              R"j("Supports Wakeon":true,"Wakeon":["MagicPacket(tm)"],"Current Message Level":7,"Link Detected":true,)j"
              R"("Supports Pause":true,"Pause Autonegotiate":true,"Pause RX":true,"Pause TX":true,"Link Status":"Up",)"
              R"("Driver Info":{"Driver":"ixgbe","Version":"5.19.9","Firmware Version":"0x800009e0",)"
              R"("Bus Info":"0000:03:00.0"}})");
    ExpectFailure(RunCommand<NicGet>({"-n", "nope"}), "There is no pnic with name nope");
}

TEST(NicGet, ShowsWhatANicLacksDistinctFromWhatIsOff) {
    TempHost host;
    // Wake-on supported with none on, pause supported and all off, no link.
    InterfaceTest::ExpectFields(Got("pnet2"), R"({"Supported Ports":["TP"],"Cable Type":"Twisted Pair",
        "Supports Wakeon":true,"Wakeon":[],"Current Message Level":3,"Link Detected":false,"Supports Pause":true,
        "Pause Autonegotiate":false,"Pause RX":false,"Pause TX":false,"Link Status":"Down"})");
    // No wake-on, no message level, no pause: the pause settings stay unset.
    InterfaceTest::ExpectFields(Got("pnet5"), R"({"Supports Wakeon":false,"Wakeon":["None"],
        "Current Message Level":-1,"Supports Pause":false,"Pause Autonegotiate":null,"Pause RX":null,
        "Pause TX":null,"Advertised Link Modes":[],"Transceiver":"external"})");
    // A port type without a name.
    InterfaceTest::ExpectFields(Got("pnet6"), R"({"Supported Ports":["UNKNOWN"],"Cable Type":"",
        "Driver Info":{"Driver":"hvnet","Version":"1.0.0","Firmware Version":"N/A","Bus Info":"N/A"}})");
}

TEST(NicGet, ALinkModeOfADuplexTheDeviceCannotTellEndsAtTheSlash) {
    TempHost host([](Json& d) {
        Json mode = {{"speed", 100}, {"duplex", "unknown"}};
        d["nics"][2]["link"]["supportedModes"].push_back(mode);
        d["nics"][2]["link"]["advertisedModes"] = Json::array({mode});
    });
    EXPECT_EQ(Got("pnet2")["Advertised Link Modes"], Json::array({"100baseT/"}));
}

TEST(NicGet, NamesEveryWakeOnValue) {
    TempHost host([](Json& d) { d["nics"][1]["wakeOn"] = {{"supported", "pumbags"}, {"enabled", "pumbags"}}; });
    EXPECT_EQ(Got("pnet1")["Wakeon"], Json::parse(R"j(["PHY Activity","Unicast Messagess","Multicast Messages",
        "Broadcast Messages","ARP","MagicPacket(tm)",
        "Enable SecureOn(tm) Password for                            MagicPacket(tm)"])j"));
}

TEST(NicSet, EachSettingAloneReachesTheNicWhenItDiffers) {
    TempHost host;
    ExpectDone(Set("pnet0", {"-p", "fibre"}));
    ExpectDone(Set("pnet0", {"-P", "5"}));
    ExpectDone(Set("pnet0", {"-t", "external"}));
    ExpectDone(Set("pnet0", {"-w", "pgg"}));
    ExpectDone(Set("pnet0", {"-l", "15"}));
    InterfaceTest::ExpectFields(Got("pnet0"), R"j({"Cable Type":"FIBRE","PHY Address":5,"Transceiver":"external",
        "Wakeon":["PHY Activity","MagicPacket(tm)"],"Current Message Level":15})j");

    // What the NIC has already is no change; -1 leaves the PHY address alone.
    for (auto words : {std::vector<std::string>{}, {"-p", "fibre"}, {"-P", "5"}, {"-P", "-1"}, {"-t", "external"},
                       {"-l", "15"}, {"-p", "fibre", "-P", "-1", "-l", "15"}}) {
        ExpectRefusal([&] { return Set("pnet0", words); }, "There is no change for nic pnet0");
    }
    // Wake-on counts as a change even when it is the same set.
    ExpectDone(Set("pnet0", {"-w", "gp"}));

    // Compared on 64 bits, stored in the low 32: 2^32 + 15 differs from 15 and
    // leaves 15; 2^32 stores 0.
    ExpectDone(Set("pnet0", {"-l", "4294967311"}));
    EXPECT_EQ(Got("pnet0")["Current Message Level"], 15);
    ExpectDone(Set("pnet0", {"-l", "4294967296"}));
    EXPECT_EQ(Got("pnet0")["Current Message Level"], 0);
}

TEST(NicSet, RefusesBeforeAnythingReachesTheNic) {
    TempHost host;
    ExpectRefusal([] { return Set("pnet0", {"-P", "0"}); }, "Invalid PHY address value.");
    ExpectRefusal([] { return Set("pnet0", {"-P", "-2"}); }, "Invalid PHY address value.");
    // A good port before a bad wake-on letter is not applied either.
    ExpectRefusal([] { return Set("pnet0", {"-p", "fibre", "-w", "gd"}); }, "Invalid wol value.");
    ExpectRefusal([] { return Set("pnet5", {"-w", "d"}); }, "Not Support wol.");
    ExpectRefusal([] { return Set("pnet5", {"-l", "1"}); }, "Not Support msglvl.");
    ExpectRefusal([] { return Set("nope", {"-p", "tp"}); }, "There is no pnic with name nope");
    // The NIC's own refusal, in its words.
    ExpectRefusal([] { return Set("pnet0", {"-p", "mii"}); }, "Physical NIC pnet0 does not support the port type MII");
}

TEST(NicSet, SpeedAndDuplexGoTogetherAndAreAppliedAfterTheSettings) {
    TempHost host;
    for (auto words : {std::vector<std::string>{"-S", "1000"}, {"-D", "full"}, {"-S", "1000", "-a"}})
        ExpectRefusal([&] { return Set("pnet0", words); }, "The --speed and --duplex options must be specified together");
    ExpectRefusal([] { return Set("pnet0", {"-S", "1000", "-D", "full", "-a"}); },
                  "The options --speed and --duplex cannot be specified with the --auto option.");

    ExpectDone(Set("pnet0", {"-S", "1000", "-D", "full"}));
    EXPECT_EQ(Listed("pnet0")["Speed"], 1000);
    EXPECT_EQ(Got("pnet0")["Auto Negotiation"], false);
    ExpectDone(Set("pnet0", {"-a"}));
    EXPECT_EQ(Listed("pnet0")["Speed"], 10000);
    EXPECT_EQ(Got("pnet0")["Auto Negotiation"], true);
    // Applied again though nothing differs.
    ExpectDone(Set("pnet0", {"-a", "-p", "da"}));

    // The settings reach the NIC first and stay when the link change fails.
    ExpectFailure(Set("pnet0", {"-p", "fibre", "-S", "100", "-D", "half"}),
                  "Physical NIC pnet0 does not support 100 Mbps half duplex");
    EXPECT_EQ(Got("pnet0")["Cable Type"], "FIBRE");
    ExpectFailure(Set("pnet6", {"-a"}), "Physical NIC pnet6 does not support autonegotiation");
}

TEST(NicNegotiationRestart, DeliversAnUnsetBooleanAndNamesItsUnknownNicItsOwnWay) {
    TempHost host;
    CommandRun run = RunCommand<NicNegotiationRestart>({"--pnet", "pnet0"});
    EXPECT_EQ(run.errors, Errors{});
    ASSERT_TRUE(run.HasResult());
    EXPECT_FALSE(run.result->IsSet());
    EXPECT_EQ(run.Json(), "null");
    ExpectFailure(RunCommand<NicNegotiationRestart>({"-n", "pnet3"}),
                  "Unable to restart negotiation on pnet3: autonegotiation is off");
    ExpectFailure(RunCommand<NicNegotiationRestart>({"-n", "nope"}), "Pnic with name nope not found");
}

TEST(NicStatsGet, ShowsEachCounterUnderItsOwnTitle) {
    // Counters 1 to 23 in the order of the record: a field read from the
    // wrong counter shows.
    TempHost host([](Json& d) {
        int n = 0;
        for (auto& [counter, value] : d["nics"][1]["counters"].items()) value = ++n;
    });
    EXPECT_EQ(RunCommand<NicStatsGet>({"-n", "pnet1"}).Json(),
              R"([{"NIC Name":"pnet1","Packets received":1,"Packets sent":2,"Bytes received":3,"Bytes sent":4,)"
              R"("Receive packets dropped":5,"Transmit packets dropped":6,"Multicast packets received":7,)"
              R"("Broadcast packets received":8,"Multicast packets sent":9,"Broadcast packets sent":10,)"
              R"("Total receive errors":11,"Receive length errors":12,"Receive over errors":13,)"
              R"("Receive CRC errors":14,"Receive frame errors":15,"Receive FIFO errors":16,)"
              R"("Receive missed errors":17,"Total transmit errors":18,"Transmit aborted errors":19,)"
              R"("Transmit carrier errors":20,"Transmit FIFO errors":21,"Transmit heartbeat errors":22,)"
              R"("Transmit window errors":23}])");
    ExpectFailure(RunCommand<NicStatsGet>({"-n", "nope"}),
                  "Unable to get stats for NIC: Physical NIC nope does not exist");
}

TEST(NicVlanStats, AreReadAndSwitchedOnTheSwitchThatHasTheNic) {
    // pnet10 is an uplink of switch0 but no NIC: pnet1 must not match it.
    TempHost host([](Json& d) { d["standardSwitches"][0]["uplinks"].push_back("pnet10"); });
    EXPECT_EQ(VlanStats("pnet0").Json(), R"([{"VLAN ID":0,"Packets received":13020114,"Packets sent":9917733},)"
                                         R"({"VLAN ID":100,"Packets received":882100,"Packets sent":500000}])");
    // Off drops the counters; on starts them anew for the VLANs of switch0's
    // port groups (both VLAN 0).
    ExpectDone(RunCommand<NicVlanStatsSet>({"-n", "pnet0", "--enabled", "false"}));
    EXPECT_EQ(VlanStats("pnet0").Json(), "[]");
    ExpectDone(RunCommand<NicVlanStatsSet>({"-n", "pnet0", "-e", "true"}));
    EXPECT_EQ(VlanStats("pnet0").Json(), R"([{"VLAN ID":0,"Packets received":0,"Packets sent":0}])");
    // An uplink of a distributed switch, whose port groups carry no VLAN here.
    EXPECT_EQ(VlanStats("pnet4").Json(), "[]");
    ExpectDone(RunCommand<NicVlanStatsSet>({"-n", "pnet4", "-e", "true"}));

    // A NIC on no switch: get gives nothing, set reports it and delivers true.
    const std::string text = "pnet1 is not a valid NIC connected to any virtual switch.";
    ExpectFailure(VlanStats("pnet1"), text);
    const std::string before = Trellis::Host::ExportHost();
    CommandRun set = RunCommand<NicVlanStatsSet>({"-n", "pnet1", "-e", "true"});
    EXPECT_EQ(set.errors, Errors{text});
    EXPECT_EQ(set.Json(), "true");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
}

TEST(NicCommands, EachReportsAHostFailureInItsOwnWords) {
    TempHost host;
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
        std::string text;
    };
    const std::vector<Case> cases = {
        {"NetworkFactory::GetNetworkInfo", [] { return RunCommand<NicList>(); }, "Unable to list NICs.  Error was busy"},
        {"PciDevice::GetVendorName", [] { return RunCommand<NicList>(); }, "Unable to list NICs.  Error was busy"},
        {"Pnic::GetMtu", [] { return RunCommand<NicList>(); }, "Unable to list NICs.  Error was busy"},
        {"NetworkInfoImpl::GetPnicByName", [] { return RunCommand<NicGet>({"-n", "pnet0"}); }, "busy"},
        {"Pnic::GetDriverInfo", [] { return RunCommand<NicGet>({"-n", "pnet0"}); }, "busy"},
        {"Pnic::SetAdminUp", [] { return RunCommand<NicDown>({"-n", "pnet0"}); }, "busy"},
        {"Pnic::SetPnicInfo", [] { return Set("pnet0", {"-p", "fibre"}); }, "busy"},
        {"Pnic::SetSpeedDuplex", [] { return Set("pnet0", {"-a"}); }, "busy"},
        {"Pnic::RestartNegotiation", [] { return RunCommand<NicNegotiationRestart>({"-n", "pnet0"}); }, "busy"},
        {"PnicImpl::GetPnicStats", [] { return RunCommand<NicStatsGet>({"-n", "pnet0"}); },
         "Unable to get stats for NIC: busy"},
        {"Portset::GetUplinks", [] { return VlanStats("pnet0"); }, "Unable to get VLAN stats: busy"},
        {"PortsetImpl::GetUplinkVlanStats", [] { return VlanStats("pnet0"); }, "Unable to get VLAN stats: busy"},
        {"PortsetImpl::SetUplinkVlanStatsEnabled",
         [] { return RunCommand<NicVlanStatsSet>({"-n", "pnet0", "-e", "false"}); }, "Unable to set VLAN stats: busy"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "busy", 0, 1});
        ExpectFailure(c.run(), c.text);
    }
    EXPECT_EQ(Listed("pnet0")["Admin Status"], "Up");

    // The first facade's failure is not the command's to report.
    ArmFault({"NetworkInfoImpl::NetworkInfoImpl", "no inventory", 0, 1});
    EXPECT_THROW(RunCommand<NicUp>({"-n", "pnet0"}), Gantry::Lib::GantryException);
}
