// network firewall ruleset allowedip list, add and remove: what the commands
// do with stored entries and with the host's failures. Canonical forms and
// the host's refusals are proven in tests/cli/firewall.test.sh.

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

TEST(FirewallRulesetAllowedipList, AllowedAllReadsAllWhateverIsStored) {
    TempHost host([](TempHost::Json& d) {
        d["firewall"]["rulesets"][0]["allowedIps"]["ipv4Addresses"].push_back("192.0.2.44");
        d["firewall"]["rulesets"][1]["allowedAll"] = false;
    });
    CommandRun run = RunCommand<FirewallRulesetAllowedipList>();
    EXPECT_EQ(run.errors, Errors{});
    Json rows = run.Parsed();
    ASSERT_EQ(rows.size(), Firewall()["rulesets"].size());
    // sshServer stores an address but admits everybody; sshClient admits nobody.
    EXPECT_EQ(rows[0], Json({{"Ruleset", "sshServer"}, {"Allowed IP Addresses", {"All"}}}));
    EXPECT_EQ(rows[1], Json({{"Ruleset", "sshClient"}, {"Allowed IP Addresses", Json::array()}}));

    ArmFault({"FirewallRuleset::GetAllowedIpList", "list unreadable", 0, {}});
    run = RunCommand<FirewallRulesetAllowedipList>();
    EXPECT_EQ(run.errors, Errors{"list unreadable"});
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
