// network vswitch standard add, list, remove and set: what a new switch
// holds, the lists' details and the host's failures at each step. The
// refusals with their texts and the constraints are proven in
// tests/cli/vswitch.test.sh.

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
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace SwitchTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(VirtualSwitchStandardAdd, CreatesTheSwitchWithTheDefaultPortsAndPoliciesOrThePortsAsked) {
    TempHost host;
    CommandRun run = RunCommand<VirtualSwitchStandardAdd>({"-v", "switch1"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    Json created = Switch("switch1");
    EXPECT_EQ(created["numPorts"], 128);
    // The default policies are stored in full: every setting is set.
    EXPECT_EQ(created["policy"], Json::parse(R"({
        "teaming": {"loadBalancing": "srcport", "failureDetection": "link", "notifySwitches": true,
                    "rollingRestoration": false, "uplinkOrder": [], "maxActiveUplinks": 0},
        "security": {"allowPromiscuous": false, "allowMacAddressChange": false, "allowForgedTransmits": false},
        "shaping": {"enabled": false, "averageBps": 100000000, "peakBps": 100000000, "burstSize": 13107200}})"));

    EXPECT_EQ(RunCommand<VirtualSwitchStandardAdd>({"--vswitch-name", "switch2", "-P", "4096"}).errors, Errors{});
    EXPECT_EQ(Switch("switch2")["numPorts"], 4096);
}

TEST(VirtualSwitchStandardList, ShowsWhoRequiresBeaconsAndTakesAnEmptyNameForAll) {
    TempHost host([](TempHost::Json& d) {
        d["standardSwitches"].push_back(SwitchEntry("bare", 64));
        d["portGroups"].push_back(PortGroupEntry("Backup", "bare"));
        d["portGroups"].back()["policy"] = {{"teaming", {{"failureDetection", "beacon"}}}};
    });
    CommandRun run = RunCommand<VirtualSwitchStandardList>({"-v", "bare"});
    EXPECT_EQ(run.errors, Errors{});
    ASSERT_EQ(run.Parsed().size(), 1u);
    EXPECT_EQ(run.Parsed()[0]["Beacon Required By"], Json({"Backup"}));
    EXPECT_EQ(run.Parsed()[0]["Portgroups"], Json({"Backup"}));
    run = RunCommand<VirtualSwitchStandardList>({"-v", ""});  // empty counts as absent
    EXPECT_EQ(run.Parsed().size(), 2u);
}

TEST(VirtualSwitchStandardList, AFailureDropsTheWholeList) {
    TempHost host;
    for (const char* operation : {"NetworkInfoImpl::GetPnics", "Portset::GetUsedPorts", "VirtualSwitch::GetPortGroups",
                                  "PortGroup::GetName", "NetworkInfoImpl::NetworkInfoImpl"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "portset busy", 0, 1});
        CommandRun run = RunCommand<VirtualSwitchStandardList>();
        EXPECT_EQ(run.errors, Errors{"portset busy"});
        EXPECT_FALSE(run.HasResult());
    }
    ArmFault({"VirtualSwitchInfoImpl::VirtualSwitchInfoImpl", "no switches", 0, 1});
    EXPECT_THROW(RunCommand<VirtualSwitchStandardList>(), Gantry::Lib::GantryException);
}

TEST(VirtualSwitchStandardRemove, AFailingLookupIsTheHostsTextAndRemovesNothing) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64)); });
    ArmFault({"PortsetImpl::IsValidVirtualSwitch", "lookup failed", 0, 1});
    CommandRun run = RunCommand<VirtualSwitchStandardRemove>({"-v", "switch1"});
    EXPECT_EQ(run.errors, Errors{"lookup failed"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_NE(Switch("switch1"), nullptr);
}

TEST(VirtualSwitchStandardSet, EachCdpWordIsStoredAndAFailureKeepsWhatWasDoneBefore) {
    TempHost host;
    for (const std::string word : {"down", "listen", "advertise", "both"}) {
        EXPECT_EQ(RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "--cdp-status", word}).errors, Errors{});
        EXPECT_EQ(Switch("switch0")["cdpStatus"], word);
    }
    ArmFault({"VirtualSwitch::SetCdpStatus", "cdp daemon down", 0, {}});
    CommandRun run = RunCommand<VirtualSwitchStandardSet>({"-v", "switch0", "-m", "9000", "-c", "down"});
    EXPECT_EQ(run.errors, Errors{"cdp daemon down"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(Switch("switch0")["mtu"], 9000);  // what was done before the failure stays
}
