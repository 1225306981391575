#include "trellis/system/SystemInfoImpl.h"

#include <optional>
#include <string>
#include <utility>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "system/FirewallHost.h"
#include "trellis/host/Operation.h"
#include "trellis/system/FirewallRulesetImpl.h"

namespace Trellis {
namespace System {

namespace {

using Gantry::System::FirewallRule;
using Host::FirewallAction;
using Host::FirewallDynamicRuleRecord;
using Host::FirewallRulesetRecord;
using Host::FirewallStateRecord;
using Host::Operation;
using Host::Transaction;

const Operation kConstruct("SystemInfoImpl::SystemInfoImpl");
const Operation kIsFirewallEnabled("SystemInfoImpl::IsFirewallEnabled");
const Operation kSetFirewallEnabled("SystemInfoImpl::SetFirewallEnabled");
const Operation kGetFirewallDefaultAction("SystemInfoImpl::GetFirewallDefaultAction");
const Operation kSetFirewallDefaultAction("SystemInfoImpl::SetFirewallDefaultAction");
const Operation kLoadFirewallRulesets("SystemInfoImpl::LoadFirewallRulesets");
const Operation kGetFirewallDynamicRules("SystemInfoImpl::GetFirewallDynamicRules");
const Operation kAddFirewallDynamicRule("SystemInfoImpl::AddFirewallDynamicRule");
const Operation kDestroyFirewallFilters("SystemInfoImpl::DestroyFirewallFilters");
const Operation kGetFirewallRulesets("SystemInfoImpl::GetFirewallRulesets");
const Operation kGetFirewallRulesetById("SystemInfoImpl::GetFirewallRulesetById");

// The global state of a loaded module, for a change.
FirewallStateRecord LoadedFirewallState(const Transaction& t) {
    RequireFirewallModule(t);
    return FirewallState(t);
}

void CheckPortRange(const FirewallRule& rule) {
    if (rule.portBegin < 0 || rule.portEnd > 65535 || rule.portEnd < rule.portBegin)
        throw Gantry::Lib::GantryException("Invalid port range " + std::to_string(rule.portBegin) + "-" +
                                           std::to_string(rule.portEnd) + " of the firewall rule \"" + rule.name +
                                           "\": ports run from 0 to 65535, the first not above the last");
}

}  // namespace

SystemInfoImpl::SystemInfoImpl() { kConstruct.Check(); }

SystemInfoImpl::~SystemInfoImpl() = default;

bool SystemInfoImpl::IsFirewallEnabled() {
    return kIsFirewallEnabled.Read([](Transaction& t) { return LoadedFirewallState(t).enabled; });
}

void SystemInfoImpl::SetFirewallEnabled(bool enabled) {
    kSetFirewallEnabled.Write([&](Transaction& t) {
        FirewallStateRecord state = LoadedFirewallState(t);
        state.enabled = enabled;
        t.Put(state);
    });
}

bool SystemInfoImpl::GetFirewallDefaultAction() {
    return kGetFirewallDefaultAction.Read(
        [](Transaction& t) { return LoadedFirewallState(t).defaultAction == FirewallAction::Pass; });
}

void SystemInfoImpl::SetFirewallDefaultAction(bool pass) {
    kSetFirewallDefaultAction.Write([&](Transaction& t) {
        FirewallStateRecord state = LoadedFirewallState(t);
        state.defaultAction = pass ? FirewallAction::Pass : FirewallAction::Drop;
        t.Put(state);
    });
}

void SystemInfoImpl::LoadFirewallRulesets() {
    // The filters are built from the stored configuration itself, so loading
    // them marks them loaded; what was added at run time is gone.
    kLoadFirewallRulesets.Write([](Transaction& t) {
        FirewallStateRecord state = LoadedFirewallState(t);
        state.rulesetsLoaded = true;
        t.Put(state);
        t.EraseAll<FirewallDynamicRuleRecord>();
    });
}

std::vector<FirewallRule*> SystemInfoImpl::GetFirewallDynamicRules() {
    std::vector<FirewallRule> rules = kGetFirewallDynamicRules.Read([](Transaction& t) {
        RequireFirewallModule(t);
        std::vector<FirewallRule> found;
        for (const FirewallDynamicRuleRecord& record : t.List<FirewallDynamicRuleRecord>())
            found.push_back(ToGantryRule(record.rule));
        return found;
    });
    std::vector<FirewallRule*> owned;
    owned.reserve(rules.size());
    for (const FirewallRule& rule : rules) owned.push_back(new FirewallRule(rule));
    return owned;
}

void SystemInfoImpl::AddFirewallDynamicRule(FirewallRule& rule) {
    kAddFirewallDynamicRule.Write([&](Transaction& t) {
        std::string problem = Host::TextProblem(rule.name);
        if (!problem.empty())
            throw Gantry::Lib::GantryException("Invalid firewall rule " + Host::Quoted(rule.name) + ": its name " +
                                               problem);
        CheckPortRange(rule);
        if (!LoadedFirewallState(t).rulesetsLoaded)
            throw Gantry::Lib::GantryException("The firewall rulesets are not loaded");
        t.Put(FirewallDynamicRuleRecord(ToPortRule(rule)));
    });
}

void SystemInfoImpl::DestroyFirewallFilters() {
    kDestroyFirewallFilters.Write([](Transaction& t) {
        RequireFirewallModule(t);
        ClearFirewallFilters(t);
    });
}

std::vector<Gantry::System::FirewallRuleset*> SystemInfoImpl::GetFirewallRulesets() {
    std::vector<FirewallRulesetImpl::Snapshot> snapshots = kGetFirewallRulesets.Read([](Transaction& t) {
        std::vector<FirewallRulesetImpl::Snapshot> found;
        if (!AreRulesetsPresent(t)) return found;
        for (const FirewallRulesetRecord& record : t.List<FirewallRulesetRecord>()) found.push_back(ToSnapshot(record));
        return found;
    });
    std::vector<Gantry::System::FirewallRuleset*> rulesets;
    rulesets.reserve(snapshots.size());
    for (FirewallRulesetImpl::Snapshot& snapshot : snapshots)
        rulesets.push_back(new FirewallRulesetImpl(std::move(snapshot)));
    return rulesets;
}

Gantry::System::FirewallRuleset* SystemInfoImpl::GetFirewallRulesetById(std::string const& id) {
    FirewallRulesetImpl::Snapshot snapshot = kGetFirewallRulesetById.Read([&](Transaction& t) {
        std::optional<FirewallRulesetRecord> record;
        if (AreRulesetsPresent(t)) record = t.Find<FirewallRulesetRecord>(id);
        if (record) return ToSnapshot(*record);
        FirewallRulesetImpl::Snapshot absent;
        absent.name = id;
        return absent;
    });
    return new FirewallRulesetImpl(std::move(snapshot));
}

}  // namespace System
}  // namespace Trellis
