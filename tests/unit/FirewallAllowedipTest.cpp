// network firewall ruleset allowedip list, add and remove.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FirewallRulesetAllowedipAdd.h"
#include "FirewallRulesetAllowedipList.h"
#include "FirewallRulesetAllowedipRemove.h"
#include "FirewallTestSupport.h"
#include "TempHost.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace FirewallTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(FirewallRulesetAllowedipList, AddressesComeBeforeNetworksAndAllowedAllReadsAll) {
    TempHost host([](TempHost::Json& d) {
        d["firewall"]["rulesets"][0]["allowedIps"]["ipv4Addresses"].push_back("192.0.2.44");
        d["firewall"]["rulesets"][1]["allowedAll"] = false;
    });
    CommandRun run = RunCommand<FirewallRulesetAllowedipList>({"-r", "webAccess"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([{"Ruleset": "webAccess", "Allowed IP Addresses":
        ["192.0.2.10", "203.0.113.5", "2001:db8::10", "198.51.100.0/24", "2001:db8:100::/48"]}])"));

    run = RunCommand<FirewallRulesetAllowedipList>();
    Json rows = run.Parsed();
    ASSERT_EQ(rows.size(), Firewall()["rulesets"].size());
    // sshServer stores an address but admits everybody; sshClient admits nobody.
    EXPECT_EQ(rows[0], Json({{"Ruleset", "sshServer"}, {"Allowed IP Addresses", {"All"}}}));
    EXPECT_EQ(rows[1], Json({{"Ruleset", "sshClient"}, {"Allowed IP Addresses", Json::array()}}));

    EXPECT_EQ(RunCommand<FirewallRulesetAllowedipList>({"-r", "nope"}).errors, Errors{"Ruleset Not Found: nope"});
    ArmFault({"SystemInfoImpl::GetFirewallRulesetById", "lookup broke", 0, 1});
    EXPECT_EQ(RunCommand<FirewallRulesetAllowedipList>({"-r", "webAccess"}).errors,
              Errors{"Failed to check loaded status: webAccess"});
    ArmFault({"FirewallRuleset::GetAllowedIpList", "list unreadable", 0, {}});
    run = RunCommand<FirewallRulesetAllowedipList>();
    EXPECT_EQ(run.errors, Errors{"list unreadable"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallRulesetAllowedipAdd, AddsInCanonicalFormAndListsIt) {
    TempHost host;
    CommandRun run = RunCommand<FirewallRulesetAllowedipAdd>({"-r", "webAccess", "-i", "2001:DB8::BEEF"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    run = RunCommand<FirewallRulesetAllowedipAdd>({"-r", "webAccess", "-i", "192.0.2.130/25"});
    EXPECT_EQ(run.errors, Errors{});
    Json listed = RunCommand<FirewallRulesetAllowedipList>({"-r", "webAccess"}).Parsed()[0]["Allowed IP Addresses"];
    EXPECT_EQ(listed, Json({"192.0.2.10", "203.0.113.5", "2001:db8::10", "2001:db8::beef", "198.51.100.0/24",
                            "192.0.2.128/25", "2001:db8:100::/48"}));

    // A malformed or repeated address is the host's to refuse.
    const Json before = Firewall();
    EXPECT_EQ(RunCommand<FirewallRulesetAllowedipAdd>({"-r", "webAccess", "-i", "300.1.1.1"}).errors,
              Errors{"Invalid IP address or network: 300.1.1.1"});
    EXPECT_EQ(RunCommand<FirewallRulesetAllowedipAdd>({"-r", "webAccess", "-i", "192.0.2.10"}).errors,
              Errors{"192.0.2.10 is already in the allowed IP list of the ruleset webAccess"});
    EXPECT_EQ(Firewall(), before);
}

TEST(FirewallRulesetAllowedipRemove, RemovesByCanonicalForm) {
    TempHost host;
    CommandRun run = RunCommand<FirewallRulesetAllowedipRemove>({"-r", "webAccess", "-i", "2001:DB8:0::10"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Ruleset("webAccess")["allowedIps"]["ipv6Addresses"], Json::array());

    run = RunCommand<FirewallRulesetAllowedipRemove>({"-r", "webAccess", "-i", "192.0.2.99"});
    EXPECT_EQ(run.errors, Errors{"192.0.2.99 is not in the allowed IP list of the ruleset webAccess"});
    EXPECT_FALSE(run.HasResult());
}

// Add and remove differ only in the host call, so their refusals are checked together.
TEST(FirewallRulesetAllowedipAdd, RefusalsOfBothCommands) {
    TempHost host;
    const Json before = Firewall();
    for (bool add : {true, false}) {
        auto run = [add](const std::vector<std::string>& words) {
            return add ? RunCommand<FirewallRulesetAllowedipAdd>(words)
                       : RunCommand<FirewallRulesetAllowedipRemove>(words);
        };
        CommandRun refused = run({"-r", "nope", "-i", "192.0.2.1"});
        EXPECT_EQ(refused.errors, Errors{"Invalid Ruleset Id."});
        EXPECT_FALSE(refused.HasResult());

        refused = run({"-r", "dns", "-i", "192.0.2.1"});
        EXPECT_EQ(refused.errors, Errors{"Couldn't update allowed ip list when allowed-all flag is true."});
        EXPECT_FALSE(refused.HasResult());

        // An empty address is reported and true is delivered all the same.
        CommandRun empty = run({"-r", "webAccess", "-i", ""});
        EXPECT_EQ(empty.errors, Errors{"Invalid allowedip parameter."});
        EXPECT_EQ(empty.Json(), "true");

        ArmFault({add ? "FirewallRuleset::AddAllowedIp" : "FirewallRuleset::RemoveAllowedIp", "list locked", 0, 1});
        refused = run({"-r", "webAccess", "-i", "192.0.2.10"});
        EXPECT_EQ(refused.errors, Errors{"list locked"});
        EXPECT_FALSE(refused.HasResult());
    }
    EXPECT_EQ(Firewall(), before);
}
