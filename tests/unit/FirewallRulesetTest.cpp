// network firewall ruleset list, ruleset set and ruleset rule list.

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

TEST(FirewallRulesetList, ListsEveryRulesetInOrderOrTheOneAskedFor) {
    TempHost host;
    CommandRun run = RunCommand<FirewallRulesetList>();
    EXPECT_EQ(run.errors, Errors{});
    Json rows = run.Parsed();
    ASSERT_EQ(rows.size(), Firewall()["rulesets"].size());
    EXPECT_EQ(rows[0], Json({{"Name", "sshServer"}, {"Enabled", false}}));
    EXPECT_EQ(rows[2], Json({{"Name", "dhcp"}, {"Enabled", true}}));

    run = RunCommand<FirewallRulesetList>({"-r", "dns"});
    EXPECT_EQ(run.Json(), R"([{"Name":"dns","Enabled":true}])");

    run = RunCommand<FirewallRulesetList>({"--ruleset-id", "nope"});
    EXPECT_EQ(run.errors, Errors{"Ruleset Not Found: nope"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetList, AnEmptyFirewallIsAnEmptyList) {
    TempHost host([](TempHost::Json& d) { d["firewall"]["rulesets"] = TempHost::Json::array(); });
    CommandRun run = RunCommand<FirewallRulesetList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "[]");
}

TEST(FirewallRulesetList, LookupFailuresNameTheLabelAndOthersGiveTheHostsText) {
    TempHost host;
    for (const char* operation : {"SystemInfoImpl::GetFirewallRulesetById", "FirewallRuleset::IsLoaded"}) {
        ArmFault({operation, "lookup broke", 0, 1});
        CommandRun run = RunCommand<FirewallRulesetList>({"-r", "dns"});
        EXPECT_EQ(run.errors, Errors{"Failed to check loaded status: dns"}) << operation;
        EXPECT_FALSE(run.HasResult());
    }
    ArmFault({"SystemInfoImpl::GetFirewallRulesets", "listing broke", 0, 1});
    EXPECT_EQ(RunCommand<FirewallRulesetList>().errors, Errors{"listing broke"});

    ArmFault({"FirewallRuleset::IsEnabled", "state unknown", 0, 1});
    CommandRun run = RunCommand<FirewallRulesetList>();
    EXPECT_EQ(run.errors, Errors{"state unknown"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetRuleList, ShowsEachRuleWithItsWords) {
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

    EXPECT_EQ(RunCommand<FirewallRulesetRuleList>({"-r", "sshserver"}).errors, Errors{"Ruleset Not Found: sshserver"});
    ArmFault({"FirewallRuleset::GetRules", "rules unreadable", 0, {}});
    run = RunCommand<FirewallRulesetRuleList>();
    EXPECT_EQ(run.errors, Errors{"rules unreadable"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetSet, NeedsAParameterAndAKnownRuleset) {
    TempHost host;
    CommandRun run = RunCommand<FirewallRulesetSet>({"-r", "dns"});
    EXPECT_EQ(run.errors, Errors{"Need parameter --enabled or --allowed-all"});
    EXPECT_FALSE(run.HasResult());

    run = RunCommand<FirewallRulesetSet>({"-r", "nope", "-e", "true"});
    EXPECT_EQ(run.errors, Errors{"Invalid Ruleset Id."});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetSet, ChangesPersistAndARepeatedAllowedAllFailsFirst) {
    TempHost host;
    CommandRun run = RunCommand<FirewallRulesetSet>({"-r", "sshServer", "-e", "true"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Ruleset("sshServer")["enabled"], true);
    // A repeated --enabled is no failure.
    EXPECT_EQ(RunCommand<FirewallRulesetSet>({"-r", "sshServer", "-e", "true"}).errors, Errors{});

    // The text is fixed whichever the value; a change of --enabled in the same call is not made.
    run = RunCommand<FirewallRulesetSet>({"-r", "sshServer", "-a", "true", "-e", "false"});
    EXPECT_EQ(run.errors, Errors{"Already allowed all ip"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(Ruleset("sshServer")["enabled"], true);
    EXPECT_EQ(RunCommand<FirewallRulesetSet>({"-r", "webAccess", "-a", "false"}).errors,
              Errors{"Already allowed all ip"});

    run = RunCommand<FirewallRulesetSet>({"-r", "sshServer", "-a", "false", "-e", "false"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(Ruleset("sshServer")["allowedAll"], false);
    EXPECT_EQ(Ruleset("sshServer")["enabled"], false);
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
