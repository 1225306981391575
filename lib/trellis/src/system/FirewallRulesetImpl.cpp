#include "trellis/system/FirewallRulesetImpl.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "host/records/AllowedIpText.h"
#include "system/FirewallHost.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace System {

namespace {

using Gantry::System::FirewallRule;
using Host::AllowedIp;
using Host::FirewallRulesetRecord;
using Host::Operation;
using Host::Transaction;

const Operation kGetName("FirewallRuleset::GetName");
const Operation kIsEnabled("FirewallRuleset::IsEnabled");
const Operation kEnable("FirewallRuleset::Enable");
const Operation kDisable("FirewallRuleset::Disable");
const Operation kGetRules("FirewallRuleset::GetRules");
const Operation kIsLoaded("FirewallRuleset::IsLoaded");
const Operation kIsAllowedAll("FirewallRuleset::IsAllowedAll");
const Operation kSetAllowedAll("FirewallRuleset::SetAllowedAll");
const Operation kGetAllowedIpList("FirewallRuleset::GetAllowedIpList");
const Operation kAddAllowedIp("FirewallRuleset::AddAllowedIp");
const Operation kRemoveAllowedIp("FirewallRuleset::RemoveAllowedIp");

AllowedIp RequireAllowedIp(const std::string& text) {
    std::optional<AllowedIp> entry = Host::ParseAllowedIp(text);
    if (!entry) throw Gantry::Lib::GantryException("Invalid IP address or network: " + Host::Printable(text));
    return *entry;
}

// Applies change to the stored configuration of a ruleset present in the
// firewall, in one host operation, and returns the stored result.
template <class Change>
FirewallRulesetRecord ChangeRuleset(const Operation& operation, const std::string& name, Change&& change) {
    return operation.Write([&](Transaction& t) {
        FirewallRulesetRecord ruleset = RequirePresentRuleset(t, name);
        change(ruleset);
        t.Put(ruleset);
        return ruleset;
    });
}

}  // namespace

FirewallRulesetImpl::FirewallRulesetImpl(Snapshot snapshot) : snapshot_(std::move(snapshot)) {}

FirewallRulesetImpl::~FirewallRulesetImpl() = default;

std::string FirewallRulesetImpl::GetName() {
    kGetName.Check();
    return snapshot_.name;
}

bool FirewallRulesetImpl::IsEnabled() {
    kIsEnabled.Check();
    return snapshot_.enabled;
}

void FirewallRulesetImpl::Enable() {
    ChangeRuleset(kEnable, snapshot_.name, [](FirewallRulesetRecord& r) { r.enabled = true; });
    snapshot_.enabled = true;
}

void FirewallRulesetImpl::Disable() {
    ChangeRuleset(kDisable, snapshot_.name, [](FirewallRulesetRecord& r) { r.enabled = false; });
    snapshot_.enabled = false;
}

std::vector<FirewallRule*> FirewallRulesetImpl::GetRules() {
    kGetRules.Check();
    std::vector<FirewallRule*> rules;
    rules.reserve(snapshot_.rules.size());
    for (const FirewallRule& rule : snapshot_.rules) rules.push_back(new FirewallRule(rule));
    return rules;
}

bool FirewallRulesetImpl::IsLoaded() {
    kIsLoaded.Check();
    return snapshot_.loaded;
}

bool FirewallRulesetImpl::IsAllowedAll() {
    kIsAllowedAll.Check();
    return snapshot_.allowedAll;
}

void FirewallRulesetImpl::SetAllowedAll(bool allowedAll) {
    ChangeRuleset(kSetAllowedAll, snapshot_.name, [&](FirewallRulesetRecord& r) { r.allowedAll = allowedAll; });
    snapshot_.allowedAll = allowedAll;
}

Gantry::System::FirewallAllowedIpList* FirewallRulesetImpl::GetAllowedIpList() {
    kGetAllowedIpList.Check();
    return new Gantry::System::FirewallAllowedIpList(snapshot_.allowedIps);
}

void FirewallRulesetImpl::AddAllowedIp(std::string const& ip) {
    FirewallRulesetRecord stored = ChangeRuleset(kAddAllowedIp, snapshot_.name, [&](FirewallRulesetRecord& r) {
        AllowedIp entry = RequireAllowedIp(ip);
        std::vector<std::string>& list = Host::ListOfKind(r.allowedIps, entry.kind);
        if (std::find(list.begin(), list.end(), entry.text) != list.end())
            throw Gantry::Lib::GantryException(entry.text + " is already in the allowed IP list of the ruleset " +
                                               r.name);
        list.push_back(entry.text);
    });
    snapshot_.allowedIps = ToGantryAllowedIps(stored.allowedIps);
}

void FirewallRulesetImpl::RemoveAllowedIp(std::string const& ip) {
    FirewallRulesetRecord stored = ChangeRuleset(kRemoveAllowedIp, snapshot_.name, [&](FirewallRulesetRecord& r) {
        AllowedIp entry = RequireAllowedIp(ip);
        std::vector<std::string>& list = Host::ListOfKind(r.allowedIps, entry.kind);
        auto found = std::find(list.begin(), list.end(), entry.text);
        if (found == list.end())
            throw Gantry::Lib::GantryException(entry.text + " is not in the allowed IP list of the ruleset " + r.name);
        list.erase(found);
    });
    snapshot_.allowedIps = ToGantryAllowedIps(stored.allowedIps);
}

}  // namespace System
}  // namespace Trellis
