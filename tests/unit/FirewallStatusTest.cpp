// network firewall get, set, load, refresh and unload.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FirewallGet.h"
#include "FirewallLoad.h"
#include "FirewallRefresh.h"
#include "FirewallSet.h"
#include "FirewallTestSupport.h"
#include "FirewallUnload.h"
#include "TempHost.h"
#include "trellis/host/Faults.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

using namespace KorvexCli::NetworkNamespace;
using namespace FirewallTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

namespace {

void UnloadedModule(TempHost::Json& d) {
    d["modules"][0]["loaded"] = false;
    d["firewall"]["rulesetsLoaded"] = false;
}

std::vector<std::string> DynamicRuleNames() {
    std::vector<std::string> names;
    const Json firewall = Firewall();
    for (const Json& rule : firewall["dynamicRules"]) names.push_back(rule["name"]);
    return names;
}

void AddDynamicRules(const std::vector<std::string>& names) {
    Trellis::System::SystemInfoImpl systemInfo;
    for (const std::string& name : names) {
        Gantry::System::FirewallRule rule;
        rule.name = name;
        rule.portBegin = rule.portEnd = 9000;
        systemInfo.AddFirewallDynamicRule(rule);
    }
}

}  // namespace

TEST(FirewallGet, ReportsTheModuleAndAsksAnUnloadedOneNothingMore) {
    {
        TempHost host;
        CommandRun run = RunCommand<FirewallGet>();
        EXPECT_EQ(run.errors, Errors{});
        EXPECT_EQ(run.Json(), R"({"Loaded":true,"Enabled":true,"DefaultAction":"DROP"})");
    }
    {
        TempHost host(UnloadedModule);
        ArmFault({"SystemInfoImpl::IsFirewallEnabled", "must not be asked", 0, {}});
        CommandRun run = RunCommand<FirewallGet>();
        EXPECT_EQ(run.errors, Errors{});
        EXPECT_EQ(run.Json(), R"({"Loaded":false,"Enabled":false,"DefaultAction":"PASS"})");
    }
    {
        TempHost host;
        ArmFault({"SystemInfoImpl::GetFirewallDefaultAction", "filter busy", 0, {}});
        CommandRun run = RunCommand<FirewallGet>();
        EXPECT_EQ(run.errors, Errors{"Unable to get firewall status.\nfilter busy"});
        EXPECT_FALSE(run.HasResult());
    }
}

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

    Trellis::Host::ClearFaults();
    run = RunCommand<FirewallSet>({"--enabled", "true"});
    EXPECT_EQ(run.errors, Errors{"Firewall module is not loaded"});
    EXPECT_FALSE(run.HasResult());
}

TEST(FirewallSet, ARepeatedEnabledPassesButARepeatedDefaultActionFails) {
    TempHost host;
    CommandRun run = RunCommand<FirewallSet>({"-e", "true"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");

    run = RunCommand<FirewallSet>({"-e", "false", "-d", "true"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(Firewall()["enabled"], false);
    EXPECT_EQ(Firewall()["defaultAction"], "PASS");

    // The first change stays when the second fails.
    run = RunCommand<FirewallSet>({"--enabled", "true", "--default-action", "true"});
    EXPECT_EQ(run.errors, Errors{"Default action already PASS"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(Firewall()["enabled"], true);

    RunCommand<FirewallSet>({"-d", "false"});
    run = RunCommand<FirewallSet>({"-d", "false"});
    EXPECT_EQ(run.errors, Errors{"Default action already DROP"});

    ArmFault({"SystemInfoImpl::SetFirewallEnabled", "switch stuck", 0, {}});
    run = RunCommand<FirewallSet>({"-e", "false", "-d", "true"});
    EXPECT_EQ(run.errors, Errors{"switch stuck"});
    EXPECT_EQ(Firewall()["defaultAction"], "DROP");
}

TEST(FirewallLoad, RefusesALoadedModuleAndLoadsAnUnloadedOneWithItsRulesets) {
    TempHost host;
    CommandRun run = RunCommand<FirewallLoad>();
    EXPECT_EQ(run.errors, Errors{"Module haldenfw is already loaded"});
    EXPECT_FALSE(run.HasResult());

    ASSERT_EQ(RunCommand<FirewallUnload>().errors, Errors{});
    run = RunCommand<FirewallLoad>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_TRUE(ModuleLoaded());
    EXPECT_EQ(Firewall()["rulesetsLoaded"], true);

    // A failure after the module is in stays as it is: the module is loaded,
    // its filters are empty.
    RunCommand<FirewallUnload>();
    ArmFault({"SystemInfoImpl::LoadFirewallRulesets", "bad configuration", 0, {}});
    run = RunCommand<FirewallLoad>();
    EXPECT_EQ(run.errors, Errors{"bad configuration"});
    EXPECT_TRUE(ModuleLoaded());
    EXPECT_EQ(Firewall()["rulesetsLoaded"], false);
}

TEST(FirewallRefresh, PutsTheDynamicRulesBackUnlessTheReloadFails) {
    TempHost host;
    AddDynamicRules({"first", "second"});
    CommandRun run = RunCommand<FirewallRefresh>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(DynamicRuleNames(), (std::vector<std::string>{"first", "second"}));

    // A failed reload loses nothing, a failed re-add loses the rules not yet back.
    ArmFault({"SystemInfoImpl::LoadFirewallRulesets", "reload failed", 0, 1});
    EXPECT_EQ(RunCommand<FirewallRefresh>().errors, Errors{"reload failed"});
    EXPECT_EQ(DynamicRuleNames(), (std::vector<std::string>{"first", "second"}));

    ArmFault({"SystemInfoImpl::AddFirewallDynamicRule", "filter full", 0, 1});
    run = RunCommand<FirewallRefresh>();
    EXPECT_EQ(run.errors, Errors{"filter full"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_EQ(DynamicRuleNames(), std::vector<std::string>{});
}

TEST(FirewallRefresh, FailsOnAnUnloadedModule) {
    TempHost host(UnloadedModule);
    EXPECT_EQ(RunCommand<FirewallRefresh>().errors, Errors{"The firewall module haldenfw is not loaded"});
}

TEST(FirewallUnload, DestroysTheFiltersThenUnloadsAndSucceedsOnAnUnloadedModule) {
    TempHost host;
    ArmFault({"ModuleImpl::Unload", "module in use", 0, 1});
    CommandRun run = RunCommand<FirewallUnload>();
    EXPECT_EQ(run.errors, Errors{"module in use"});
    EXPECT_TRUE(ModuleLoaded());
    EXPECT_EQ(Firewall()["rulesetsLoaded"], false);

    run = RunCommand<FirewallUnload>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_FALSE(ModuleLoaded());

    ArmFault({"SystemInfoImpl::DestroyFirewallFilters", "must not be called", 0, {}});
    run = RunCommand<FirewallUnload>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
}
