// network firewall ruleset list, ruleset set and ruleset rule list: the
// host's failures at each step and the rules of a ruleset word by word.
// Their texts for the user and their changes across calls are proven in
// tests/cli/firewall.test.sh.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FirewallRulesetList.h"
#include "FirewallRulesetRuleList.h"
#include "FirewallRulesetSet.h"
#include "FirewallTestSupport.h"
#include "TempHost.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace FirewallTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(FirewallRulesetList, LookupFailuresNameTheLabelAndOthersGiveTheHostsText) {
    TempHost host;
    ArmFault({"FirewallRuleset::IsLoaded", "lookup broke", 0, 1});
    CommandRun run = RunCommand<FirewallRulesetList>({"-r", "dns"});
    EXPECT_EQ(run.errors, Errors{"Failed to check loaded status: dns"});
    EXPECT_FALSE(run.HasResult());

    ArmFault({"SystemInfoImpl::GetFirewallRulesets", "listing broke", 0, 1});
    EXPECT_EQ(RunCommand<FirewallRulesetList>().errors, Errors{"listing broke"});

    ArmFault({"FirewallRuleset::IsEnabled", "state unknown", 0, 1});
    run = RunCommand<FirewallRulesetList>();
    EXPECT_EQ(run.errors, Errors{"state unknown"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetRuleList, ShowsEachRuleWithItsWordsForOneRulesetOrAll) {
    TempHost host([](TempHost::Json& d) { d["firewall"]["rulesets"][2]["rules"][1]["portType"] = "src"; });
    CommandRun run = RunCommand<FirewallRulesetRuleList>({"-r", "dhcp"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
        {"Ruleset": "dhcp", "Port Type": "Dst", "Port Begin": 67, "Port End": 68,
         "Direction": "Inbound", "Protocol": "UDP"},
        {"Ruleset": "dhcp", "Port Type": "Src", "Port Begin": 67, "Port End": 68,
         "Direction": "Outbound", "Protocol": "UDP"}
    ])"));

    run = RunCommand<FirewallRulesetRuleList>();
    size_t rules = 0;
    const Json firewall = Firewall();
    for (const Json& ruleset : firewall["rulesets"]) rules += ruleset["rules"].size();
    EXPECT_EQ(run.Parsed().size(), rules);
    EXPECT_EQ(run.Parsed()[0]["Protocol"], "TCP");
}

TEST(FirewallRulesetSet, EnabledChangesEitherWayButARepeatedAllowedAllFailsBeforeAnyEnable) {
    TempHost host;
    EXPECT_EQ(RunCommand<FirewallRulesetSet>({"-r", "dns", "-e", "true"}).errors, Errors{});
    EXPECT_EQ(RunCommand<FirewallRulesetSet>({"-r", "dns", "-e", "false"}).errors, Errors{});
    EXPECT_EQ(Ruleset("dns")["enabled"], false);
    // The text is fixed whichever the value; the change of --enabled in the same call is not made.
    CommandRun run = RunCommand<FirewallRulesetSet>({"-r", "webAccess", "-a", "false", "-e", "false"});
    EXPECT_EQ(run.errors, Errors{"Already allowed all ip"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(Ruleset("webAccess")["enabled"], true);
}

TEST(FirewallRulesetSet, AnAllowedAllChangeStaysWhenTheEnableFails) {
    TempHost host;
    ArmFault({"FirewallRuleset::Enable", "ruleset locked", 0, {}});
    CommandRun run = RunCommand<FirewallRulesetSet>({"-r", "ntpClient", "-a", "false", "-e", "true"});
    EXPECT_EQ(run.errors, Errors{"ruleset locked"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(Ruleset("ntpClient")["allowedAll"], false);
    EXPECT_EQ(Ruleset("ntpClient")["enabled"], false);
}
