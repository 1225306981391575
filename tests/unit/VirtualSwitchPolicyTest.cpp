// The policy get and set commands of standard switches and port groups: the
// failover order folded through both levels, the override model with
// use-vswitch, shaping's units, limits and missing values, and the refusals
// that still deliver true. The round trips through the binary are in
// tests/cli/policy.test.sh.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "VirtualSwitchPortGroupPolicyFailoverGet.h"
#include "VirtualSwitchPortGroupPolicyFailoverSet.h"
#include "VirtualSwitchPortGroupPolicySecurityGet.h"
#include "VirtualSwitchPortGroupPolicySecuritySet.h"
#include "VirtualSwitchPortGroupPolicyShapingGet.h"
#include "VirtualSwitchPortGroupPolicyShapingSet.h"
#include "VirtualSwitchStandardPolicyFailoverGet.h"
#include "VirtualSwitchStandardPolicyFailoverSet.h"
#include "VirtualSwitchStandardPolicySecurityGet.h"
#include "VirtualSwitchStandardPolicySecuritySet.h"
#include "VirtualSwitchStandardPolicyShapingGet.h"
#include "VirtualSwitchStandardPolicyShapingSet.h"
#include "VirtualSwitchStandardUplinkAdd.h"

using namespace KorvexCli::NetworkNamespace;
using namespace SwitchTest;
using Errors = std::vector<std::string>;

namespace {

const std::string kGroup = "Guest Network";
const std::string kOtherGroup = "Host Management";

// The failover policy of a group as json: values and override flags.
Json GroupFailover(const std::string& group) {
    return RunCommand<VirtualSwitchPortGroupPolicyFailoverGet>({"-p", group}).Parsed();
}

// switch0 with both NICs connected: pnet0 active, pnet1 unused.
class TwoUplinks : public ::testing::Test {
protected:
    TwoUplinks() { RunCommand<VirtualSwitchStandardUplinkAdd>({"-v", "switch0", "-u", "pnet1"}); }
    TempHost host_;
};

}  // namespace

TEST_F(TwoUplinks, TheUplinkOrderFoldsThroughBothLevels) {
    Json before = RunCommand<VirtualSwitchStandardPolicyFailoverGet>({"-v", "switch0"}).Parsed();
    EXPECT_EQ(before["Active Adapters"], Json::array({"pnet0"}));
    EXPECT_EQ(before["Unused Adapters"], Json::array({"pnet1"}));

    // Only the standby list: the present active part survives in front of it.
    EXPECT_EQ(RunCommand<VirtualSwitchStandardPolicyFailoverSet>({"-v", "switch0", "-s", "pnet1"}).errors, Errors{});
    Json vswitch = RunCommand<VirtualSwitchStandardPolicyFailoverGet>({"-v", "switch0"}).Parsed();
    EXPECT_EQ(vswitch["Active Adapters"], Json::array({"pnet0"}));
    EXPECT_EQ(vswitch["Standby Adapters"], Json::array({"pnet1"}));

    // A group overriding only its standby list keeps the switch's active NIC.
    RunCommand<VirtualSwitchPortGroupPolicyFailoverSet>({"-p", kGroup, "--standby-uplinks="});
    Json group = GroupFailover(kGroup);
    EXPECT_EQ(group["Active Adapters"], Json::array({"pnet0"}));
    EXPECT_EQ(group["Standby Adapters"], Json::array());
    EXPECT_EQ(group["Unused Adapters"], Json::array({"pnet1"}));
    EXPECT_TRUE(group["Override Vswitch Uplinks"]);
    EXPECT_FALSE(group["Override Vswitch Load Balancing"]);

    // The switch's order changes underneath: the overriding group keeps its
    // own, the group that overrides nothing follows the switch.
    RunCommand<VirtualSwitchStandardPolicyFailoverSet>({"-v", "switch0", "-a", "pnet1", "-s", "pnet0", "-l", "iphash"});
    group = GroupFailover(kGroup);
    EXPECT_EQ(group["Active Adapters"], Json::array({"pnet0"}));
    EXPECT_EQ(group["Load Balancing"], "iphash");
    Json follower = GroupFailover(kOtherGroup);
    EXPECT_EQ(follower["Active Adapters"], Json::array({"pnet1"}));
    EXPECT_EQ(follower["Standby Adapters"], Json::array({"pnet0"}));
    for (auto const& field : follower.items()) {
        if (field.key().rfind("Override Vswitch ", 0) == 0) EXPECT_FALSE(field.value()) << field.key();
    }

    // use-vswitch drops the group's own values first, then applies the rest.
    RunCommand<VirtualSwitchPortGroupPolicyFailoverSet>({"-p", kGroup, "-u", "-b", "false"});
    group = GroupFailover(kGroup);
    EXPECT_EQ(group["Active Adapters"], Json::array({"pnet1"}));
    EXPECT_FALSE(group["Override Vswitch Uplinks"]);
    EXPECT_TRUE(group["Override Vswitch Failback"]);
    EXPECT_FALSE(group["Failback"]);
}

TEST_F(TwoUplinks, ARefusedFailoverSetStoresNothingAndStillDeliversTrue) {
    const Json before = Section("standardSwitches");
    CommandRun run = RunCommand<VirtualSwitchStandardPolicyFailoverSet>(
        {"-v", "switch0", "-a", "pnet0,pnet9", "-s", "pnet0", "-l", "mac"});
    EXPECT_EQ(run.errors, (Errors{"Unknown NIC name in active uplinks : pnet9",
                                  "some NICs appear in the input for more than once."}));
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Section("standardSwitches"), before);

    run = RunCommand<VirtualSwitchPortGroupPolicyFailoverSet>({"-p", "No Such Group", "-l", "mac"});
    EXPECT_EQ(run.errors, Errors{"Unable to find a port group with the name No Such Group"});
    EXPECT_FALSE(run.HasResult());
}

TEST(VirtualSwitchPolicySecurity, TheSwitchSetsWhatIsInForceAndAGroupOnlyWhatItOverrides) {
    TempHost host;
    // The switch's own option letters: -p for promiscuous mode.
    RunCommand<VirtualSwitchStandardPolicySecuritySet>({"-v", "switch0", "-p", "true"});
    Json vswitch = RunCommand<VirtualSwitchStandardPolicySecurityGet>({"-v", "switch0"}).Parsed();
    EXPECT_EQ(vswitch, (Json{{"Allow Promiscuous", true},
                             {"Allow MAC Address Change", false},
                             {"Allow Forged Transmits", false}}));

    RunCommand<VirtualSwitchPortGroupPolicySecuritySet>({"-p", kGroup, "-m", "true"});
    RunCommand<VirtualSwitchPortGroupPolicySecuritySet>({"-p", kGroup, "--use-vswitch", "-o", "false"});
    Json group = RunCommand<VirtualSwitchPortGroupPolicySecurityGet>({"-p", kGroup}).Parsed();
    EXPECT_FALSE(group["Allow Promiscuous"]);
    EXPECT_FALSE(group["Allow MAC Address Change"]);  // the reset dropped the group's own value
    EXPECT_TRUE(group["Override Vswitch Allow Promiscuous"]);
    EXPECT_FALSE(group["Override Vswitch Allow MAC Address Change"]);
    // A later change on the switch reaches the field the group does not override.
    RunCommand<VirtualSwitchStandardPolicySecuritySet>({"-v", "switch0", "-m", "true"});
    EXPECT_TRUE(RunCommand<VirtualSwitchPortGroupPolicySecurityGet>({"-p", kGroup}).Parsed()["Allow MAC Address Change"]);

    for (std::string name : {"nosuch", ""}) {
        CommandRun run = RunCommand<VirtualSwitchStandardPolicySecurityGet>({"-v", name});
        EXPECT_EQ(run.errors, Errors{"Unable to find a legacy virtual switch with the name " + name});
        EXPECT_FALSE(run.HasResult());
    }
}

TEST(VirtualSwitchPolicyShaping, UnitsDisabledValuesAndTheLargestValuesKept) {
    TempHost host;
    Json off = RunCommand<VirtualSwitchStandardPolicyShapingGet>({"-v", "switch0"}).Parsed();
    EXPECT_EQ(off, (Json{{"Enabled", false}, {"Average Bandwidth", -1}, {"Peak Bandwidth", -1}, {"Burst Size", -1}}));

    // Kbps and Kib in, bits per second and bytes kept, the same units out.
    EXPECT_EQ(RunCommand<VirtualSwitchStandardPolicyShapingSet>(
                  {"-v", "switch0", "-e", "true", "-b", "9223372036854775", "-k", "1", "-t", "72057594037927935"})
                  .errors,
              Errors{});
    Json on = RunCommand<VirtualSwitchStandardPolicyShapingGet>({"-v", "switch0"}).Parsed();
    EXPECT_EQ(on["Average Bandwidth"], 9223372036854775LL);
    EXPECT_EQ(on["Burst Size"], 72057594037927935LL);
    EXPECT_EQ(Switch("switch0")["policy"]["shaping"]["averageBps"], 9223372036854775000ULL);

    // One more Kib is 2^63 bytes: refused by the host, nothing stored.
    CommandRun tooBig = RunCommand<VirtualSwitchStandardPolicyShapingSet>({"-v", "switch0", "-t", "72057594037927936"});
    EXPECT_EQ(tooBig.errors, Errors{"Invalid burst size 9223372036854775808 for virtual switch switch0: the host "
                                    "keeps at most 9223372036854775807 bytes"});
    EXPECT_EQ(RunCommand<VirtualSwitchStandardPolicyShapingGet>({"-v", "switch0"}).Parsed(), on);
    // The largest option wraps in unsigned arithmetic and is refused the same way.
    EXPECT_EQ(RunCommand<VirtualSwitchStandardPolicyShapingSet>({"-v", "switch0", "-b", "9223372036854775807"})
                  .errors.size(),
              1u);

    // The group inherits, and shows no override.
    Json group = RunCommand<VirtualSwitchPortGroupPolicyShapingGet>({"-p", kGroup}).Parsed();
    EXPECT_EQ(group["Peak Bandwidth"], 1);
    EXPECT_FALSE(group["Override Vswitch Enabled"]);
}

TEST(VirtualSwitchPolicyShaping, AGroupEnabledWithoutValuesAnywhereIsRefusedAndStoresNothing) {
    TempHost host([](TempHost::Json& d) {
        for (auto& vswitch : d["standardSwitches"]) vswitch["policy"]["shaping"] = TempHost::Json::object();
    });
    const Json before = PortGroup(kGroup);
    CommandRun run = RunCommand<VirtualSwitchPortGroupPolicyShapingSet>({"-p", kGroup, "--enabled=true"});
    EXPECT_EQ(run.errors,
              (Errors{"Missing required parameter --avg-bandwidth", "Missing required parameter --peak-bandwidth",
                      "Missing required parameter --burst-size",
                      "Unable to set shaping policy. A Peak BPS value must be set on either this port group or on "
                      "the parent virtual switch.",
                      "Unable to set shaping policy. An Average BPS value must be set on either this port group or "
                      "on the parent virtual switch.",
                      "Unable to set shaping policy. A Burst Size value must be set on either this port group or on "
                      "the parent virtual switch."}));
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(PortGroup(kGroup), before);

    // With every value the group overrides all four fields; use-vswitch alone
    // clears them again without the test.
    RunCommand<VirtualSwitchPortGroupPolicyShapingSet>({"-p", kGroup, "-e", "true", "-b", "8", "-k", "16", "-t", "2"});
    Json group = RunCommand<VirtualSwitchPortGroupPolicyShapingGet>({"-p", kGroup}).Parsed();
    EXPECT_EQ(group["Average Bandwidth"], 8);
    EXPECT_TRUE(group["Override Vswitch Burst Size"]);
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupPolicyShapingSet>({"-p", kGroup, "--use-vswitch"}).errors, Errors{});
    group = RunCommand<VirtualSwitchPortGroupPolicyShapingGet>({"-p", kGroup}).Parsed();
    EXPECT_FALSE(group["Enabled"]);
    EXPECT_FALSE(group["Override Vswitch Enabled"]);
}
