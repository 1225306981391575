// network vswitch standard add, list, remove and set.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "VirtualSwitchStandardAdd.h"
#include "VirtualSwitchStandardList.h"
#include "VirtualSwitchStandardRemove.h"
#include "VirtualSwitchStandardSet.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace SwitchTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(VirtualSwitchStandardAdd, CreatesTheSwitchWithTheDefaultPortsOrThoseAsked) {
    TempHost host;
    CommandRun run = RunCommand<VirtualSwitchStandardAdd>({"-v", "switch1"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    Json created = Switch("switch1");
    EXPECT_EQ(created["numPorts"], 128);
    // The four default policies are stored in full.
    EXPECT_EQ(created["policy"]["teaming"],
              Json({{"loadBalancing", "srcport"}, {"failureDetection", "link"}, {"notifySwitches", true},
                    {"rollingRestoration", false}, {"uplinkOrder", Json::array()}, {"maxActiveUplinks", 0}}));
    EXPECT_EQ(created["policy"]["shaping"]["burstSize"], 102400 * 128);

    EXPECT_EQ(RunCommand<VirtualSwitchStandardAdd>({"--vswitch-name", "switch2", "-P", "4096"}).errors, Errors{});
    EXPECT_EQ(Switch("switch2")["numPorts"], 4096);

    // The host's own refusals pass through; the constraint stops what is not 1 to 4096.
    run = RunCommand<VirtualSwitchStandardAdd>({"-v", "switch3", "-P", "257"});  // 128 + 128 + 4096 + 257
    EXPECT_EQ(run.errors, Errors{"Unable to create virtual switch switch3: its 257 ports and the 4352 ports already "
                                 "allocated exceed the host's limit of 4608"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_THROW(RunCommand<VirtualSwitchStandardAdd>({"-v", "x", "-P", "4097"}), Plinth::Cli::UsageError);
    EXPECT_THROW(RunCommand<VirtualSwitchStandardAdd>({"-v", "x", "-P", "0"}), Plinth::Cli::UsageError);
    EXPECT_EQ(Switch("x"), nullptr);
}

TEST(VirtualSwitchStandardList, ShowsEverySwitchWithItsNicUplinksAndGroups) {
    TempHost host([](TempHost::Json& d) {
        d["standardSwitches"].push_back(SwitchEntry("bare", 64));
        // An uplink that no NIC of the host has any more is not shown.
        d["standardSwitches"].push_back(SwitchEntry("gone", 32, {"pnet9", "pnet1"}));
        d["portGroups"].push_back(PortGroupEntry("Backup", "gone"));
        d["portGroups"].back()["policy"] = {{"teaming", {{"failureDetection", "beacon"}}}};
    });
    CommandRun run = RunCommand<VirtualSwitchStandardList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
      {"Name": "switch0", "Class": "etherswitch", "Num Ports": 128, "Used Ports": 3, "Configured Ports": 128,
       "MTU": 1500, "CDP Status": "listen", "Beacon Enabled": false, "Beacon Interval": 1, "Beacon Threshold": 3,
       "Beacon Required By": [], "Uplinks": ["pnet0"], "Portgroups": ["Host Management", "Guest Network"]},
      {"Name": "bare", "Class": "etherswitch", "Num Ports": 64, "Used Ports": 0, "Configured Ports": 64,
       "MTU": 1500, "CDP Status": "listen", "Beacon Enabled": false, "Beacon Interval": 1, "Beacon Threshold": 3,
       "Beacon Required By": [], "Uplinks": [], "Portgroups": []},
      {"Name": "gone", "Class": "etherswitch", "Num Ports": 32, "Used Ports": 2, "Configured Ports": 32,
       "MTU": 1500, "CDP Status": "listen", "Beacon Enabled": false, "Beacon Interval": 1, "Beacon Threshold": 3,
       "Beacon Required By": ["Backup"], "Uplinks": ["pnet1"], "Portgroups": ["Backup"]}])"));

    run = RunCommand<VirtualSwitchStandardList>({"-v", "bare"});
    ASSERT_EQ(run.Parsed().size(), 1u);
    EXPECT_EQ(run.Parsed()[0]["Name"], "bare");
    run = RunCommand<VirtualSwitchStandardList>({"-v", ""});  // empty counts as absent
    EXPECT_EQ(run.Parsed().size(), 3u);
}

TEST(VirtualSwitchStandardList, AnUnknownNameOrAFailureDropsTheWholeList) {
    TempHost host;
    CommandRun run = RunCommand<VirtualSwitchStandardList>({"-v", "nosuch"});
    EXPECT_EQ(run.errors, Errors{"Unable to access all portsets"});
    EXPECT_FALSE(run.HasResult());

    for (const char* operation : {"NetworkInfoImpl::GetPnics", "Portset::GetUsedPorts", "VirtualSwitch::GetPortGroups",
                                  "PortGroup::GetName", "NetworkInfoImpl::NetworkInfoImpl"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "portset busy", 0, 1});
        run = RunCommand<VirtualSwitchStandardList>();
        EXPECT_EQ(run.errors, Errors{"portset busy"});
        EXPECT_FALSE(run.HasResult());
    }
    ArmFault({"VirtualSwitchInfoImpl::VirtualSwitchInfoImpl", "no switches", 0, 1});
    EXPECT_THROW(RunCommand<VirtualSwitchStandardList>(), Gantry::Lib::GantryException);
}

TEST(VirtualSwitchStandardRemove, RemovesAKnownSwitchAndNamesAnUnknownOne) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64, {"pnet1"})); });
    CommandRun run = RunCommand<VirtualSwitchStandardRemove>({"-v", "nosuch"});
    EXPECT_EQ(run.errors, Errors{"Unable to find virtual switch with the name nosuch"});
    EXPECT_FALSE(run.HasResult());

    run = RunCommand<VirtualSwitchStandardRemove>({"-v", "switch0"});
    EXPECT_EQ(run.errors,
              Errors{"Unable to remove virtual switch switch0: its port group Host Management has active clients"});
    EXPECT_NE(Switch("switch0"), nullptr);

    ArmFault({"PortsetImpl::IsValidVirtualSwitch", "lookup failed", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchStandardRemove>({"-v", "switch1"}).errors, Errors{"lookup failed"});

    run = RunCommand<VirtualSwitchStandardRemove>({"-v", "switch1"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Switch("switch1"), nullptr);
}

TEST(VirtualSwitchStandardSet, SetsMtuAndCdpStatusOrNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0"});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);

    run = RunCommand<VirtualSwitchStandardSet>({"-v", "nosuch", "-m", "9000"});
    EXPECT_EQ(run.errors, Errors{"nosuch is not a valid name for a virtual switch"});

    // A negative MTU stops the command before anything changes, the CDP status included.
    run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-m", "-1", "-c", "down"});
    EXPECT_EQ(run.errors, Errors{"MTU size should be a positive value"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);

    // Zero reaches the host, which refuses it.
    run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-m", "0"});
    EXPECT_EQ(run.errors, Errors{"Invalid MTU 0 for virtual switch switch0: the MTU must be from 1280 to 9000"});

    const std::vector<std::string> words = {"down", "listen", "advertise", "both"};
    for (const std::string& word : words) {
        EXPECT_EQ(RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "--cdp-status", word}).errors, Errors{});
        EXPECT_EQ(Switch("switch0")["cdpStatus"], word);
    }
    EXPECT_THROW(RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-c", "up"}), Plinth::Cli::UsageError);

    run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-m", "9000", "-c", "advertise"});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Switch("switch0")["mtu"], 9000);
    EXPECT_EQ(Switch("switch0")["cdpStatus"], "advertise");

    ArmFault({"VirtualSwitch::SetCdpStatus", "cdp daemon down", 0, {}});
    run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-m", "1500", "-c", "down"});
    EXPECT_EQ(run.errors, Errors{"cdp daemon down"});
    EXPECT_EQ(Switch("switch0")["mtu"], 1500);  // what was done before the failure stays
}
