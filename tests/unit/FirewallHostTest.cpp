// The host's firewall objects on their own: the module's life cycle, the
// presence of rulesets, dynamic rules, and the allowed lists' canonical forms.
// What the commands pass on of them is proven in tests/cli/firewall.test.sh.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "FirewallTestSupport.h"
#include "TempHost.h"
#include "host/records/AllowedIpText.h"
#include "trellis/host/Description.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

using namespace FirewallTest;
using Gantry::System::FirewallRule;
using Gantry::System::FirewallRuleset;
using Trellis::System::ModuleImpl;
using Trellis::System::SystemInfoImpl;

namespace {

std::unique_ptr<FirewallRuleset> Lookup(const std::string& name) {
    return std::unique_ptr<FirewallRuleset>(SystemInfoImpl().GetFirewallRulesetById(name));
}

std::vector<std::string> PresentRulesets() {
    std::vector<FirewallRuleset*> rulesets = SystemInfoImpl().GetFirewallRulesets();
    std::vector<std::string> names;
    for (FirewallRuleset* ruleset : rulesets) names.push_back(ruleset->GetName());
    Trellis::Util::DeleteVector(rulesets);
    return names;
}

FirewallRule Rule(const std::string& name, int portType, int begin, int end, int direction, int protocol) {
    FirewallRule rule;
    rule.name = name;
    rule.portType = portType;
    rule.portBegin = begin;
    rule.portEnd = end;
    rule.direction = direction;
    rule.protocol = protocol;
    return rule;
}

std::vector<std::string> DynamicRuleNames() {
    std::vector<FirewallRule*> rules = SystemInfoImpl().GetFirewallDynamicRules();
    std::vector<std::string> names;
    for (FirewallRule* rule : rules) names.push_back(rule->name);
    Trellis::Util::DeleteVector(rules);
    return names;
}

}  // namespace

TEST(FirewallHost, AllowedEntriesHaveOneCanonicalFormPerList) {
    using Trellis::Host::AllowedIpKind;
    using Trellis::Host::ParseAllowedIp;
    struct Case {
        const char* text;
        AllowedIpKind kind;
        const char* canonical;
    };
    for (const Case& c : std::vector<Case>{
             {"192.0.2.1", AllowedIpKind::Ipv4Address, "192.0.2.1"},
             {"192.0.2.7/24", AllowedIpKind::Ipv4Network, "192.0.2.0/24"},
             {"10.1.2.3/0", AllowedIpKind::Ipv4Network, "0.0.0.0/0"},
             {"2001:DB8:0::1", AllowedIpKind::Ipv6Address, "2001:db8::1"},
             {"::ffff:192.0.2.1", AllowedIpKind::Ipv6Address, "::ffff:192.0.2.1"},
             {"2001:db8::5/64", AllowedIpKind::Ipv6Network, "2001:db8::/64"},
             {"2001:db8::ffff/125", AllowedIpKind::Ipv6Network, "2001:db8::fff8/125"},
             {"2001:db8:1:2:3:4:5:6/128", AllowedIpKind::Ipv6Network, "2001:db8:1:2:3:4:5:6/128"},
         }) {
        auto entry = ParseAllowedIp(c.text);
        ASSERT_TRUE(entry) << c.text;
        EXPECT_EQ(entry->kind, c.kind) << c.text;
        EXPECT_EQ(entry->text, c.canonical) << c.text;
    }
    for (const char* text :
         {"", "300.1.1.1", "192.0.2.1/33", "192.0.2", "2001:db8::1/129", "fe80::1%eth0", "any", "192.0.2.1 "})
        EXPECT_FALSE(ParseAllowedIp(text)) << text;
}

TEST(FirewallHost, AllowedListChangesCompareCanonicalFormsAndRefusalsChangeNothing) {
    TempHost host;
    std::unique_ptr<FirewallRuleset> webAccess = Lookup("webAccess");

    webAccess->AddAllowedIp("2001:DB8::20");
    webAccess->AddAllowedIp("203.0.113.77/25");
    Json ips = Ruleset("webAccess")["allowedIps"];
    EXPECT_EQ(ips["ipv6Addresses"], Json({"2001:db8::10", "2001:db8::20"}));
    EXPECT_EQ(ips["ipv4Networks"], Json({"198.51.100.0/24", "203.0.113.0/25"}));
    // The object sees its own change.
    std::unique_ptr<Gantry::System::FirewallAllowedIpList> list(webAccess->GetAllowedIpList());
    ASSERT_EQ(list->ipv6Addresses.size(), 2u);
    EXPECT_EQ(list->ipv6Addresses[1].GetStringAddress(), "2001:db8::20");

    const Json before = Firewall();
    EXPECT_EQ(FailureOf([&] { webAccess->AddAllowedIp("2001:db8:0::20"); }),
              "2001:db8::20 is already in the allowed IP list of the ruleset webAccess");
    EXPECT_EQ(FailureOf([&] { webAccess->AddAllowedIp("198.51.100.200/24"); }),
              "198.51.100.0/24 is already in the allowed IP list of the ruleset webAccess");
    EXPECT_EQ(FailureOf([&] { webAccess->RemoveAllowedIp("not-an-ip"); }), "Invalid IP address or network: not-an-ip");
    EXPECT_EQ(Firewall(), before);

    webAccess->RemoveAllowedIp("2001:DB8:0:0::10");
    webAccess->RemoveAllowedIp("2001:db8:100::/48");
    ips = Ruleset("webAccess")["allowedIps"];
    EXPECT_EQ(ips["ipv6Addresses"], Json({"2001:db8::20"}));
    EXPECT_EQ(ips["ipv6Networks"], Json::array());
}

TEST(FirewallHost, RulesetsArePresentOnlyWhileTheModuleAndItsFiltersAreLoaded) {
    TempHost host;
    SystemInfoImpl systemInfo;
    ModuleImpl module("haldenfw");
    std::unique_ptr<FirewallRuleset> sshServer = Lookup("sshServer");
    ASSERT_TRUE(sshServer->IsLoaded());
    EXPECT_FALSE(Lookup("noSuchRuleset")->IsLoaded());

    // A loaded module refuses, while its filters exist, an unload.
    EXPECT_EQ(FailureOf([&] { module.Unload(); }),
              "Module haldenfw is busy: the firewall filters must be destroyed before it is unloaded");

    systemInfo.DestroyFirewallFilters();
    EXPECT_TRUE(PresentRulesets().empty());
    EXPECT_FALSE(Lookup("sshServer")->IsLoaded());
    EXPECT_EQ(FailureOf([&] { sshServer->Enable(); }), "The ruleset sshServer is not present in the firewall");
    EXPECT_TRUE(systemInfo.IsFirewallEnabled());  // the module still answers

    module.Unload();
    EXPECT_FALSE(module.IsLoaded());
    EXPECT_FALSE(ModuleImpl("haldenfw").IsLoaded());
    const std::string notLoaded = "The firewall module haldenfw is not loaded";
    EXPECT_EQ(FailureOf([&] { systemInfo.IsFirewallEnabled(); }), notLoaded);
    EXPECT_EQ(FailureOf([&] { systemInfo.SetFirewallDefaultAction(true); }), notLoaded);
    EXPECT_EQ(FailureOf([&] { systemInfo.LoadFirewallRulesets(); }), notLoaded);
    EXPECT_EQ(FailureOf([&] { module.Unload(); }), "Module haldenfw is not loaded");
    EXPECT_TRUE(PresentRulesets().empty());
    // The configuration is kept meanwhile.
    EXPECT_EQ(Firewall()["enabled"], true);
    EXPECT_EQ(Firewall()["rulesets"].size(), 17u);

    // A fresh load starts with empty filters, until the rulesets are loaded.
    module.Load("", false);
    EXPECT_TRUE(ModuleImpl("haldenfw").IsLoaded());
    EXPECT_TRUE(PresentRulesets().empty());
    systemInfo.LoadFirewallRulesets();
    std::vector<std::string> present = PresentRulesets();
    ASSERT_EQ(present.size(), 17u);
    EXPECT_EQ(std::vector<std::string>(present.begin(), present.begin() + 4),
              (std::vector<std::string>{"sshServer", "sshClient", "dhcp", "dns"}));
    EXPECT_TRUE(systemInfo.IsFirewallEnabled());
    EXPECT_FALSE(systemInfo.GetFirewallDefaultAction());

    EXPECT_EQ(FailureOf([] { ModuleImpl("nosuchmod").Load("", false); }),
              "Cannot load module nosuchmod: no such module on the host");
    EXPECT_FALSE(ModuleImpl("nosuchmod").IsLoaded());
}

TEST(FirewallHost, ForcedLoadReloadsWithNewOptionsOnlyWhenTheModuleIsIdle) {
    TempHost host;
    ModuleImpl module("haldenfw");
    EXPECT_EQ(FailureOf([&] { module.Load("debug=1", true); }),
              "Module haldenfw is busy: the firewall filters must be destroyed before it is unloaded");
    SystemInfoImpl().DestroyFirewallFilters();
    EXPECT_EQ(FailureOf([&] { module.Load("debug=1\n", true); }),
              "Cannot load module haldenfw: the option text contains the control character U+000A");
    module.Load("debug=1", true);
    EXPECT_EQ(Json::parse(Trellis::Host::ExportHost())["modules"][0]["options"], "debug=1");
    EXPECT_TRUE(module.IsLoaded());
}

TEST(FirewallHost, DynamicRulesLiveUntilTheRulesetsAreLoadedOrTheFiltersDestroyed) {
    TempHost host;
    SystemInfoImpl systemInfo;
    FirewallRule vnc = Rule("vnc", FirewallRule::PORT_TYPE_DST, 5900, 5964, FirewallRule::DIRECTION_INBOUND,
                            FirewallRule::PROTOCOL_TCP);
    FirewallRule probe = Rule("probe", FirewallRule::PORT_TYPE_SRC, 33434, 33534, FirewallRule::DIRECTION_OUTBOUND,
                              FirewallRule::PROTOCOL_UDP);
    systemInfo.AddFirewallDynamicRule(vnc);
    systemInfo.AddFirewallDynamicRule(probe);

    std::vector<FirewallRule*> rules = systemInfo.GetFirewallDynamicRules();
    ASSERT_EQ(rules.size(), 2u);
    EXPECT_EQ(rules[1]->portType, FirewallRule::PORT_TYPE_SRC);
    EXPECT_EQ(rules[1]->direction, FirewallRule::DIRECTION_OUTBOUND);
    EXPECT_EQ(rules[1]->protocol, FirewallRule::PROTOCOL_UDP);
    EXPECT_EQ(rules[1]->portBegin, 33434);
    EXPECT_EQ(rules[1]->portEnd, 33534);
    Trellis::Util::DeleteVector(rules);
    EXPECT_EQ(Firewall()["dynamicRules"][1]["portType"], "src");

    FirewallRule reversed = Rule("bad", FirewallRule::PORT_TYPE_DST, 90, 80, 0, 0);
    FirewallRule tooHigh = Rule("bad", FirewallRule::PORT_TYPE_DST, 80, 70000, 0, 0);
    EXPECT_EQ(FailureOf([&] { systemInfo.AddFirewallDynamicRule(reversed); }),
              "Invalid port range 90-80 of the firewall rule \"bad\": ports run from 0 to 65535, the first not above "
              "the last");
    EXPECT_NE(FailureOf([&] { systemInfo.AddFirewallDynamicRule(tooHigh); }), "");
    FirewallRule escape = Rule("vnc\x1b", FirewallRule::PORT_TYPE_DST, 5900, 5900, 0, 0);
    EXPECT_EQ(FailureOf([&] { systemInfo.AddFirewallDynamicRule(escape); }),
              "Invalid firewall rule \"vnc\\u001b\": its name contains the control character U+001B");

    systemInfo.LoadFirewallRulesets();
    EXPECT_TRUE(DynamicRuleNames().empty());

    systemInfo.AddFirewallDynamicRule(vnc);
    systemInfo.DestroyFirewallFilters();
    EXPECT_TRUE(DynamicRuleNames().empty());
    EXPECT_EQ(FailureOf([&] { systemInfo.AddFirewallDynamicRule(vnc); }), "The firewall rulesets are not loaded");
}
