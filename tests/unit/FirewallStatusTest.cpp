// network firewall get, set, load and refresh: what tests/cli/firewall.test.sh
// cannot see through the binary (the order of the checks, the state a failure
// leaves, a first facade that fails).

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FirewallGet.h"
#include "FirewallLoad.h"
#include "FirewallRefresh.h"
#include "FirewallSet.h"
#include "FirewallTestSupport.h"
#include "TempHost.h"
#include "trellis/host/Faults.h"
#include "trellis/system/SystemInfoImpl.h"

using namespace KorvexCli::NetworkNamespace;
using namespace FirewallTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;
using Names = std::vector<std::string>;

namespace {

void UnloadedModule(TempHost::Json& d) {
    d["modules"][0]["loaded"] = false;
    d["firewall"]["rulesetsLoaded"] = false;
}

Names DynamicRuleNames() {
    Names names;
    const Json firewall = Firewall();
    for (const Json& rule : firewall["dynamicRules"]) names.push_back(rule["name"]);
    return names;
}

}  // namespace

TEST(FirewallGet, AFailingFirstFacadeIsNotHandled) {
    TempHost host;
    ArmFault({"SystemInfoImpl::SystemInfoImpl", "no system", 0, {}});
    EXPECT_THROW(RunCommand<FirewallGet>(), Gantry::Lib::GantryException);
}

TEST(FirewallSet, NeedsAParameterBeforeTheModuleIsLookedAt) {
    TempHost host(UnloadedModule);
    ArmFault({"ModuleImpl::ModuleImpl", "must not be made", 0, {}});
    CommandRun run = RunCommand<FirewallSet>();
    EXPECT_EQ(run.errors, Errors{"Need parameter --enabled or --default-action"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallSet, EnabledIsStoredAndMayRepeatButARepeatedDefaultActionFails) {
    TempHost host;
    CommandRun run = RunCommand<FirewallSet>({"-e", "true"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Firewall()["enabled"], true);
    run = RunCommand<FirewallSet>({"--enabled", "false"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Firewall()["enabled"], false);
    EXPECT_EQ(RunCommand<FirewallSet>({"-e", "true"}).Json(), "true");
    EXPECT_EQ(Firewall()["enabled"], true);
    EXPECT_EQ(RunCommand<FirewallSet>({"-d", "false"}).errors, Errors{"Default action already DROP"});

    // A failure stops the call: the default action is not changed after it.
    ArmFault({"SystemInfoImpl::SetFirewallEnabled", "switch stuck", 0, {}});
    run = RunCommand<FirewallSet>({"-e", "false", "-d", "true"});
    EXPECT_EQ(run.errors, Errors{"switch stuck"});
    EXPECT_EQ(Firewall()["enabled"], true);
    EXPECT_EQ(Firewall()["defaultAction"], "DROP");
}

TEST(FirewallLoad, AFailureAfterTheModuleIsInLeavesItLoadedWithEmptyFilters) {
    TempHost host(UnloadedModule);
    ArmFault({"SystemInfoImpl::LoadFirewallRulesets", "bad configuration", 0, {}});
    CommandRun run = RunCommand<FirewallLoad>();
    EXPECT_EQ(run.errors, Errors{"bad configuration"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_TRUE(ModuleLoaded());
    EXPECT_EQ(Firewall()["rulesetsLoaded"], false);
}

TEST(FirewallRefresh, PutsTheDynamicRulesBackInOrderAndAFailedReloadLosesNone) {
    TempHost host;
    Trellis::System::SystemInfoImpl systemInfo;
    for (const char* name : {"first", "second"}) {
        Gantry::System::FirewallRule rule;
        rule.name = name;
        rule.portBegin = rule.portEnd = 9000;
        systemInfo.AddFirewallDynamicRule(rule);
    }
    CommandRun run = RunCommand<FirewallRefresh>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(DynamicRuleNames(), (Names{"first", "second"}));

    ArmFault({"SystemInfoImpl::LoadFirewallRulesets", "reload failed", 0, 1});
    EXPECT_EQ(RunCommand<FirewallRefresh>().errors, Errors{"reload failed"});
    EXPECT_EQ(DynamicRuleNames(), (Names{"first", "second"}));
}
