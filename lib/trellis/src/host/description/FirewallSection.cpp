// "firewall": the firewall's global state, its rulesets and its dynamic rules.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/HostCopy.h"
#include "host/description/Section.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/FirewallRecords.h"

namespace Trellis {
namespace Host {

namespace {

class FirewallSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        if (!value.IsPresent()) return;  // a host without a firewall configuration
        value.ExpectObject();
        state_.enabled = value.Bool("enabled");
        state_.defaultAction = value.Word<FirewallAction>("defaultAction", kFirewallActionWords);
        state_.rulesetsLoaded = value.Bool("rulesetsLoaded");

        std::set<std::string> labels;
        for (const JsonReader& element : value.Array("rulesets")) {
            FirewallRulesetRecord ruleset = FirewallRulesetRecord::FromJson(element);
            if (!labels.insert(ruleset.name).second)
                element.Member("name").Fail("duplicate ruleset \"" + ruleset.name + "\"");
            rulesets_.push_back(ruleset);
        }
        std::set<std::string> ruleNames;
        for (const JsonReader& element : value.Array("dynamicRules")) {
            FirewallDynamicRuleRecord rule = FirewallDynamicRuleRecord::FromJson(element);
            if (!ruleNames.insert(rule.name).second)
                element.Member("name").Fail("duplicate dynamic rule \"" + rule.name + "\"");
            dynamicRules_.push_back(rule);
        }
        value.RejectUnknownMembers();
    }

    void Write(Transaction& t) const override {
        t.Put(state_);
        for (const FirewallRulesetRecord& ruleset : rulesets_) t.Put(ruleset);
        for (const FirewallDynamicRuleRecord& rule : dynamicRules_) t.Put(rule);
    }

    Json Export(const Transaction& t) const override {
        FirewallStateRecord state =
            t.Find<FirewallStateRecord>(FirewallStateRecord::kName).value_or(FirewallStateRecord());
        Json firewall = state.ToJson();
        firewall["rulesets"] = Json::array();
        for (const FirewallRulesetRecord& ruleset : t.List<FirewallRulesetRecord>())
            firewall["rulesets"].push_back(ruleset.ToJson());
        firewall["dynamicRules"] = Json::array();
        for (const FirewallDynamicRuleRecord& rule : t.List<FirewallDynamicRuleRecord>())
            firewall["dynamicRules"].push_back(rule.ToJson());
        return firewall;
    }

    // The state stays single; the dynamic rules are run-time state of the
    // one firewall and are not copied either.
    void AddCopy(HostCopy& copy, Json& value) const override {
        for (FirewallRulesetRecord ruleset : rulesets_) {
            ruleset.name = copy.Name(FirewallRulesetRecord::kKind, ruleset.name);
            value["rulesets"].push_back(ruleset.ToJson());
        }
    }

private:
    FirewallStateRecord state_;  // the defaults when the section is absent
    std::vector<FirewallRulesetRecord> rulesets_;
    std::vector<FirewallDynamicRuleRecord> dynamicRules_;
};

const SectionRegistration kFirewall("firewall", 20, [] { return std::make_unique<FirewallSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis
