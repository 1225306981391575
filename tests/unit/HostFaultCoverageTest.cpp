// Every host operation's fault fires where a user can arm it: for each
// registered operation, a fault armed on it fails a command line of the
// network tree that reaches it (exit 1, the message on standard error). An
// operation that no built command reaches yet is called directly instead.
// A new host operation must join one of the two tables, or this test fails.

#include <functional>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "FailureOf.h"
#include "TempHost.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/autocli/Namespace.h"
#include "plinth/autocli/PluginEntry.h"
#include "plinth/cli/Tool.h"
#include "trellis/host/Faults.h"
#include "trellis/host/Operation.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/util/Exec.h"

namespace {

using Gantry::Network::NetworkFactory;
using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Trellis::Host::Fault;
using Trellis::Host::FaultKind;
using Trellis::Host::Operation;
using Words = std::vector<std::string>;

struct CommandRow {
    std::string operation;
    Words commandLine;
    std::string host = {};  // a host description; the default host when empty
};

struct DirectRow {
    std::string operation;
    // Calls the operation and returns what its caller sees of the fault.
    std::function<std::string()> seen;
};

// The operations the unit tests register for themselves, all named "HostTest::...".
bool IsTestOnly(const std::string& operation) { return operation.rfind("HostTest::", 0) == 0; }

const Words kFirewallGet = {"network", "firewall", "get"};
const Words kFirewallRefresh = {"network", "firewall", "refresh"};
const Words kFirewallUnload = {"network", "firewall", "unload"};
const Words kRulesetList = {"network", "firewall", "ruleset", "list"};
const Words kDisableDns = {"network", "firewall", "ruleset", "set", "-r", "dns", "-e", "false"};
const Words kVswitchList = {"network", "vswitch", "standard", "list"};
const Words kVswitchSetMtu = {"network", "vswitch", "standard", "set", "-v", "switch0", "-m", "9000"};
const Words kPortGroupList = {"network", "vswitch", "standard", "portgroup", "list"};

std::string UnloadedFirewall() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["modules"][0]["loaded"] = false;
        d["firewall"]["rulesetsLoaded"] = false;
    });
}

std::string WithDynamicRule() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["firewall"]["dynamicRules"] = TempHost::Json::array({{{"name", "probe"},
                                                                 {"portType", "dst"},
                                                                 {"portBegin", 9000},
                                                                 {"portEnd", 9000},
                                                                 {"direction", "inbound"},
                                                                 {"protocol", "tcp"}}});
    });
}

const std::vector<CommandRow>& CommandTable() {
    static const std::vector<CommandRow> rows = {
        {"SystemInfoImpl::SystemInfoImpl", kFirewallGet},
        {"SystemInfoImpl::IsFirewallEnabled", kFirewallGet},
        {"SystemInfoImpl::GetFirewallDefaultAction", kFirewallGet},
        {"SystemInfoImpl::SetFirewallEnabled", {"network", "firewall", "set", "-e", "false"}},
        {"SystemInfoImpl::SetFirewallDefaultAction", {"network", "firewall", "set", "-d", "true"}},
        {"SystemInfoImpl::GetFirewallDynamicRules", kFirewallRefresh},
        {"SystemInfoImpl::LoadFirewallRulesets", kFirewallRefresh},
        {"SystemInfoImpl::AddFirewallDynamicRule", kFirewallRefresh, WithDynamicRule()},
        {"SystemInfoImpl::DestroyFirewallFilters", kFirewallUnload},
        {"SystemInfoImpl::GetFirewallRulesets", kRulesetList},
        {"SystemInfoImpl::GetFirewallRulesetById", kDisableDns},
        {"ModuleImpl::ModuleImpl", kFirewallGet},
        {"ModuleImpl::IsLoaded", kFirewallGet},
        {"ModuleImpl::Load", {"network", "firewall", "load"}, UnloadedFirewall()},
        {"ModuleImpl::Unload", kFirewallUnload},
        {"FirewallRuleset::GetName", kRulesetList},
        {"FirewallRuleset::IsEnabled", kRulesetList},
        {"FirewallRuleset::IsLoaded", kDisableDns},
        {"FirewallRuleset::IsAllowedAll", kDisableDns},
        {"FirewallRuleset::Disable", kDisableDns},
        {"FirewallRuleset::Enable", {"network", "firewall", "ruleset", "set", "-r", "sshServer", "-e", "true"}},
        {"FirewallRuleset::SetAllowedAll", {"network", "firewall", "ruleset", "set", "-r", "dns", "-a", "false"}},
        {"FirewallRuleset::GetRules", {"network", "firewall", "ruleset", "rule", "list"}},
        {"FirewallRuleset::GetAllowedIpList",
         {"network", "firewall", "ruleset", "allowedip", "list", "-r", "webAccess"}},
        {"FirewallRuleset::AddAllowedIp",
         {"network", "firewall", "ruleset", "allowedip", "add", "-r", "webAccess", "-i", "192.0.2.77"}},
        {"FirewallRuleset::RemoveAllowedIp",
         {"network", "firewall", "ruleset", "allowedip", "remove", "-r", "webAccess", "-i", "192.0.2.10"}},

        {"VirtualSwitchInfoImpl::VirtualSwitchInfoImpl", {"network", "vswitch", "standard", "add", "-v", "switch1"}},
        {"VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy",
         {"network", "vswitch", "standard", "add", "-v", "switch1"}},
        {"VirtualSwitchInfoImpl::GetVirtualSwitches", kVswitchList},
        {"VirtualSwitchInfoImpl::GetVirtualSwitchByName", kVswitchSetMtu},
        {"VirtualSwitchInfoImpl::RemoveVirtualSwitch", {"network", "vswitch", "standard", "remove", "-v", "switch0"}},
        {"PortsetImpl::IsValidVirtualSwitch", kVswitchSetMtu},
        {"Portset::GetName", kVswitchList},
        {"Portset::GetClass", kVswitchList},
        {"Portset::GetNumPorts", kVswitchList},
        {"Portset::GetUsedPorts", kVswitchList},
        {"Portset::GetConfiguredPorts", kVswitchList},
        {"Portset::GetUplinks", kVswitchList},
        {"VirtualSwitch::GetMtu", kVswitchList},
        {"VirtualSwitch::GetCdpStatus", kVswitchList},
        {"VirtualSwitch::GetBeaconEnabled", kVswitchList},
        {"VirtualSwitch::GetBeaconInterval", kVswitchList},
        {"VirtualSwitch::GetBeaconThreshold", kVswitchList},
        {"VirtualSwitch::GetBeaconRequiredBy", kVswitchList},
        {"VirtualSwitch::GetPortGroups", kVswitchList},
        {"VirtualSwitch::SetMtu", kVswitchSetMtu},
        {"VirtualSwitch::SetCdpStatus", {"network", "vswitch", "standard", "set", "-v", "switch0", "-c", "down"}},
        {"NetworkFactory::GetVirtualSwitchById",
         {"network", "vswitch", "standard", "uplink", "add", "-v", "switch0", "-u", "pnet1"}},
        {"VirtualSwitch::AddUplink", {"network", "vswitch", "standard", "uplink", "add", "-v", "switch0", "-u", "pnet1"}},
        {"VirtualSwitch::RemoveUplink",
         {"network", "vswitch", "standard", "uplink", "remove", "-v", "switch0", "-u", "pnet0"}},
        {"VirtualSwitch::AddPortGroup",
         {"network", "vswitch", "standard", "portgroup", "add", "-p", "Storage", "-v", "switch0"}},
        {"VirtualSwitch::RemovePortGroup",
         {"network", "vswitch", "standard", "portgroup", "remove", "-p", "Guest Network", "-v", "switch0"}},
        {"NetworkInfoImpl::NetworkInfoImpl", kPortGroupList},
        {"NetworkInfoImpl::GetPnics", kVswitchList},
        {"Pnic::GetName", kVswitchList},
        {"NetworkInfoImpl::GetAllPortGroups", kPortGroupList},
        {"PortGroup::GetName", kPortGroupList},
        {"PortGroup::GetVirtualSwitchName", kPortGroupList},
        {"PortGroupImpl::GetActiveClients", kPortGroupList},
        {"PortGroup::GetVlanId", kPortGroupList},
        {"NetworkFactory::GetPortGroupByName",
         {"network", "vswitch", "standard", "portgroup", "set", "-p", "Guest Network", "-v", "10"}},
        {"PortGroup::SetVlanId",
         {"network", "vswitch", "standard", "portgroup", "set", "-p", "Guest Network", "-v", "10"}},
    };
    return rows;
}

std::unique_ptr<Gantry::Network::VirtualSwitch> Switch0() {
    return std::unique_ptr<Gantry::Network::VirtualSwitch>(NetworkFactory::GetVirtualSwitchById("switch0"));
}

std::unique_ptr<Gantry::Network::PortGroup> GuestNetwork() {
    return std::unique_ptr<Gantry::Network::PortGroup>(NetworkFactory::GetPortGroupByName("Guest Network"));
}

std::function<std::string()> Thrown(std::function<void()> call) {
    return [call] { return FailureOf(call); };
}

// Operations that no built command reaches, called through their facade or
// host object on the default host. A row moves to the command table when a
// command that reaches its operation is built (the policy get and set
// commands of switches and port groups, for most of them).
const std::vector<DirectRow>& DirectTable() {
    static const std::vector<DirectRow> rows = {
        {"VirtualSwitch::GetSecurityPolicy", Thrown([] { Switch0()->GetSecurityPolicy(); })},
        {"VirtualSwitch::ApplySecurityPolicy",
         Thrown([] { Switch0()->ApplySecurityPolicy(PortSecurityPolicy::GetDefaultPolicy()); })},
        {"VirtualSwitch::GetShapingPolicy", Thrown([] { Switch0()->GetShapingPolicy(); })},
        {"VirtualSwitch::ApplyShapingPolicy",
         Thrown([] { Switch0()->ApplyShapingPolicy(ShapingPolicy::GetDefaultPolicy()); })},
        {"VirtualSwitch::GetTeamingPolicy", Thrown([] { Switch0()->GetTeamingPolicy(); })},
        {"VirtualSwitch::GetLocalTeamingPolicy", Thrown([] { Switch0()->GetLocalTeamingPolicy(); })},
        {"VirtualSwitch::ApplyTeamingPolicy",
         Thrown([] { Switch0()->ApplyTeamingPolicy(NicTeamingPolicy::GetDefaultPolicy()); })},
        {"PortGroup::GetSecurityPolicy", Thrown([] { GuestNetwork()->GetSecurityPolicy(); })},
        {"PortGroup::GetLocalSecurityPolicy", Thrown([] { GuestNetwork()->GetLocalSecurityPolicy(); })},
        {"PortGroup::ApplySecurityPolicy",
         Thrown([] { GuestNetwork()->ApplySecurityPolicy(PortSecurityPolicy::GetDefaultPolicy()); })},
        {"PortGroup::GetShapingPolicy", Thrown([] { GuestNetwork()->GetShapingPolicy(); })},
        {"PortGroup::GetLocalShapingPolicy", Thrown([] { GuestNetwork()->GetLocalShapingPolicy(); })},
        {"PortGroup::ApplyShapingPolicy",
         Thrown([] { GuestNetwork()->ApplyShapingPolicy(ShapingPolicy::GetDefaultPolicy()); })},
        {"PortGroup::GetTeamingPolicy", Thrown([] { GuestNetwork()->GetTeamingPolicy(); })},
        {"PortGroup::GetLocalTeamingPolicy", Thrown([] { GuestNetwork()->GetLocalTeamingPolicy(); })},
        {"PortGroup::ApplyTeamingPolicy",
         Thrown([] { GuestNetwork()->ApplyTeamingPolicy(NicTeamingPolicy::GetDefaultPolicy()); })},
        {"PortGroup::GetVirtualSwitch",
         Thrown([] { std::unique_ptr<Gantry::Network::VirtualSwitch>(GuestNetwork()->GetVirtualSwitch()); })},
        // The failover set commands check the NICs they are given with it.
        {"PnicImpl::IsValidPnic", Thrown([] { Trellis::Network::PnicImpl::IsValidPnic("pnet0"); })},
        // No command looks a NIC up by its name yet.
        {"NetworkInfoImpl::GetPnicByName", Thrown([] {
             std::unique_ptr<Gantry::Network::Pnic>(Trellis::Network::NetworkInfoImpl().GetPnicByName("pnet0"));
         })},
        // No command runs a shell command line yet.
        {"Trellis_Exec",
         [] { return "status " + std::to_string(Trellis::Util::Trellis_Exec("true", false, true, false)); }},
    };
    return rows;
}

// A fault that tells its operation apart from every other.
Fault DistinctFault(const std::string& operation) {
    if (Operation::KindOf(operation) == FaultKind::Status) return {operation, "", 77, {}};
    return {operation, "Fault injected into " + operation, 0, {}};
}

std::string WhatTheCallerSees(const Fault& fault) {
    return fault.message.empty() ? "status " + std::to_string(fault.status) : fault.message;
}

void ExpectCommandFails(const CommandRow& row) {
    TempHost host(row.host);
    const Fault fault = DistinctFault(row.operation);
    Trellis::Host::ArmFault(fault);

    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    AutoCli_RegisterNamespaces(root);
    // The TempHost has opened the host already.
    Plinth::Cli::Tool tool(root, "haldencli", [](const std::string&) {});
    std::ostringstream out, err;
    EXPECT_EQ(tool.Run(row.commandLine, out, err), Plinth::Cli::EXIT_FAILED) << row.operation;
    const std::string seen = WhatTheCallerSees(fault);
    EXPECT_TRUE(err.str().find(seen) != std::string::npos)
        << row.operation << ": \"" << seen << "\" is not on standard error, which holds\n" << err.str();
}

void ExpectDirectCallFails(const DirectRow& row) {
    TempHost host;
    const Fault fault = DistinctFault(row.operation);
    Trellis::Host::ArmFault(fault);
    EXPECT_EQ(row.seen(), WhatTheCallerSees(fault)) << row.operation;
}

}  // namespace

TEST(HostFaultCoverage, AFaultOnEveryHostOperationFailsItsCaller) {
    std::map<std::string, const CommandRow*> commandRows;
    std::map<std::string, const DirectRow*> directRows;
    for (const CommandRow& row : CommandTable()) commandRows.emplace(row.operation, &row);
    for (const DirectRow& row : DirectTable()) directRows.emplace(row.operation, &row);

    for (const std::string& operation : Operation::KnownNames()) {
        if (IsTestOnly(operation)) continue;
        if (commandRows.count(operation)) {
            ExpectCommandFails(*commandRows.at(operation));
        } else if (directRows.count(operation)) {
            ExpectDirectCallFails(*directRows.at(operation));
        } else {
            ADD_FAILURE() << operation << " has no row: add a command line that reaches it, or a direct call "
                             "while no command does";
        }
    }

    // A row whose operation is gone (renamed, or misspelt) would test nothing.
    for (const auto& [operation, row] : commandRows)
        EXPECT_TRUE(Operation::IsKnown(operation)) << operation << " is not a host operation";
    for (const auto& [operation, row] : directRows) {
        EXPECT_TRUE(Operation::IsKnown(operation)) << operation << " is not a host operation";
        EXPECT_EQ(commandRows.count(operation), 0u) << operation << " has a command row: drop its direct row";
    }
}
