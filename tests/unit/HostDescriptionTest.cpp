// Host descriptions: the round trip, the refusal of bad ones (a representative
// set; a missing field and a port out of range are refused through haldensim
// in tests/cli/haldensim.test.sh), replacement.

#include <gtest/gtest.h>

#include "TempHost.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"
#include "trellis/host/JsonReader.h"

using namespace Trellis::Host;
using Json = TempHost::Json;

namespace {

std::string RefusalOf(const std::string& description) {
    try {
        ImportHost(description);
    } catch (const DescriptionError& e) {
        return e.what();
    }
    return "";
}

std::string Edited(const std::function<void(Json&)>& edit) {
    return TempHost::Edited(edit);
}

}  // namespace

TEST(HostDescription, ExportAfterImportGivesTheSameDocument) {
    TempHost host;
    // The default host exports exactly as data/default-host.json is written.
    EXPECT_EQ(ExportHost(), kDefaultHostDescription);

    // Every kind of content, including faults and the exec log.
    std::string busy = Edited([](Json& d) {
        d["modules"].push_back({{"name", "vmknet"}, {"loaded", false}, {"options", "debug=1"}});
        d["firewall"]["enabled"] = false;
        d["firewall"]["defaultAction"] = "PASS";
        d["firewall"]["rulesetsLoaded"] = false;
        d["firewall"]["rulesets"][5]["allowedIps"]["ipv6Networks"].push_back("2001:db8::/32");
        d["firewall"]["dynamicRules"].push_back({{"name", "dyn-1"}, {"portType", "src"}, {"portBegin", 0},
                                                 {"portEnd", 65535}, {"direction", "outbound"}, {"protocol", "udp"}});
        d["faults"] = Json::array({Json{{"operation", "Trellis_Exec"}, {"status", -1}, {"remaining", 2}}});
        d["exec"] = Json::array({Json{{"commandLine", "/etc/init.d/xfrd restart"},
                                      {"options", {false, true, false}},
                                      {"status", 0}}});
    });
    ImportHost(busy);
    EXPECT_EQ(ExportHost(), Json::parse(busy).dump(2) + "\n");
    std::string exported = ExportHost();
    ImportHost(exported);
    EXPECT_EQ(ExportHost(), exported);
}

TEST(HostDescription, ObjectsKeepTheOrderOfTheirMembersThroughParsingAndChanges) {
    // Keys out of alphabetical order, each with nested values, in an object
    // that grows well past its first allocations while it is parsed.
    std::string text = "{";
    for (int i = 0; i < 40; ++i) {
        const std::string n = std::to_string((i * 17) % 40);
        text += (i ? "," : "") + ("\"k" + n + "\":") + "{\"list\":[" + n + ",{\"z\":\"" + n + "\",\"a\":[]}],\"n\":" + n + "}";
    }
    text += "}";
    Json parsed = Json::parse(text);
    EXPECT_EQ(parsed.dump(), text);
    EXPECT_EQ(parsed.at("k34")["list"][1]["z"], "34");
    Json copy = parsed;
    copy.erase("k17");
    copy["new"] = 1;
    EXPECT_EQ(copy.size(), 40u);
    EXPECT_EQ(copy.begin().key(), "k0");
    EXPECT_EQ((++copy.begin()).key(), "k34");  // k17 stood between them
    EXPECT_EQ(copy.back(), 1);
    EXPECT_EQ(parsed.dump(), text);  // the copy is a copy

    // Stored text with a key twice: the key keeps its first place and the
    // last value, as ever (descriptions refuse it, see below).
    EXPECT_EQ(Json::parse(R"({"a":1,"b":2,"a":3})").dump(), R"({"a":3,"b":2})");
}

TEST(HostDescription, AMemberNotAskedForIsRefusedWhereverItStands) {
    // More members than a reader marks by their place alone.
    Json object = Json::object();
    std::vector<std::string> keys;
    for (int i = 0; i < 70; ++i) keys.push_back("m" + std::to_string(i));
    for (std::size_t i = 0; i < keys.size(); ++i) object[keys[i]] = i;
    const auto unknownWhenSkipping = [&](std::size_t skipped) -> std::string {
        JsonReader in(&object, "list[1]");
        for (std::size_t i = 0; i < keys.size(); ++i)
            if (i != skipped) in.Int(keys[i].c_str(), 0, 100);
        in.Int("m68", 0, 100);  // asked twice
        try {
            in.RejectUnknownMembers();
        } catch (const DescriptionError& e) {
            return e.what();
        }
        return "";
    };
    EXPECT_EQ(unknownWhenSkipping(3), "list[1].m3: unknown field");
    EXPECT_EQ(unknownWhenSkipping(66), "list[1].m66: unknown field");
    EXPECT_EQ(unknownWhenSkipping(keys.size()), "");
}

TEST(HostDescription, BadDescriptionsAreRefusedWithTheirPathAndChangeNothing) {
    TempHost host([](Json& d) {
        d["exec"].push_back({{"commandLine", "/etc/init.d/xfrd restart"}, {"options", {false, true, false}}, {"status", 1}});
    });
    ArmFault({"Trellis_Exec", "", 4, {}});
    const std::string before = ExportHost();
    ASSERT_NE(before.find("xfrd"), std::string::npos);

    struct Case {
        std::function<void(Json&)> edit;
        std::string refusal;
    };
    const std::vector<Case> cases = {
        {[](Json& d) { d["format"] = 2; }, "format: expected 1, the format this version reads"},
        {[](Json& d) { d["switchez"] = Json::array(); }, "switchez: unknown field"},
        {[](Json& d) { d["modules"] = Json::object(); }, "modules: expected an array"},
        {[](Json& d) { d["modules"][0]["loaded"] = "yes"; }, "modules[0].loaded: expected true or false"},
        {[](Json& d) { d["modules"].push_back(d["modules"][0]); }, "modules[1].name: duplicate module \"haldenfw\""},
        {[](Json& d) { d["firewall"]["defaultAction"] = "drop"; },
         "firewall.defaultAction: expected \"DROP\" or \"PASS\""},
        {[](Json& d) { d["firewall"]["rulesets"][2]["rules"][0]["portBegin"] = 67.0; },
         "firewall.rulesets[2].rules[0].portBegin: expected an integer from 0 to 65535"},
        {[](Json& d) { d["firewall"]["rulesets"][2]["rules"][1]["portEnd"] = 66; },
         "firewall.rulesets[2].rules[1].portEnd: expected a port not below portBegin (67)"},
        {[](Json& d) { d["firewall"]["rulesets"][0]["rules"][0]["protocol"] = "TCP"; },
         "firewall.rulesets[0].rules[0].protocol: expected \"tcp\" or \"udp\""},
        {[](Json& d) { d["firewall"]["rulesets"][0]["rules"][0]["colour"] = "red"; },
         "firewall.rulesets[0].rules[0].colour: unknown field"},
        {[](Json& d) { d["firewall"]["rulesets"][5]["allowedIps"]["ipv4Addresses"][0] = "192.0.2.010"; },
         "firewall.rulesets[5].allowedIps.ipv4Addresses[0]: expected an IPv4 address in canonical form, such as "
         "\"192.0.2.1\""},
        {[](Json& d) { d["firewall"]["rulesets"][5]["allowedIps"]["ipv6Addresses"][0] = "192.0.2.1"; },
         "firewall.rulesets[5].allowedIps.ipv6Addresses[0]: expected an IPv6 address in canonical form, such as "
         "\"2001:db8::1\""},
        {[](Json& d) { d["firewall"]["rulesets"][5]["allowedIps"]["ipv6Networks"][0] = "2001:DB8:100::/48"; },
         "firewall.rulesets[5].allowedIps.ipv6Networks[0]: expected an IPv6 network in canonical form, such as "
         "\"2001:db8::/32\""},
        {[](Json& d) { d["firewall"]["rulesets"][5]["allowedIps"]["ipv4Addresses"][1] = "192.0.2.10"; },
         "firewall.rulesets[5].allowedIps.ipv4Addresses[1]: duplicate entry \"192.0.2.10\""},
        {[](Json& d) { d["faults"] = Json::array({Json{{"operation", "Nope::Nope"}, {"message", "x"}}}); },
         "faults[0].operation: unknown operation \"Nope::Nope\""},
        {[](Json& d) { d["faults"] = Json::array({Json{{"operation", "Trellis_Exec"}, {"message", "x"}}}); },
         "faults[0].status: missing required field"},
        {[](Json& d) {
             d["faults"] = Json::array({Json{{"operation", "Trellis_Exec"}, {"status", 1}, {"remaining", 0}}});
         },
         "faults[0].remaining: expected an integer from 1 to 2147483647"},
        {[](Json& d) { d["exec"] = Json::array({Json{{"commandLine", "x"}, {"options", {true}}, {"status", 0}}}); },
         "exec[0].options: expected three flags"},
    };
    for (const Case& c : cases) {
        std::string description = Edited(c.edit);
        SCOPED_TRACE(description);
        EXPECT_EQ(RefusalOf(description), c.refusal);
    }
    EXPECT_EQ(RefusalOf("{\"format\": 1,\n  \"modules\": [}"),
              "not valid JSON: parse error at line 2, column 15: syntax error while parsing value - "
              "unexpected '}'; expected '[', '{', or a literal");
    EXPECT_EQ(RefusalOf("[]"), "top level: expected an object");
    // Found by fuzzing: a number beyond a double's range escaped as the JSON
    // library's own exception.
    EXPECT_EQ(RefusalOf("{\"format\": 1, \"nics\": [{\"speed\": 65e18701}]}"),
              "not valid JSON: number overflow parsing '65e18701'");
    EXPECT_EQ(ExportHost(), before);
}

TEST(HostDescription, ImportReplacesTheWholeHost) {
    TempHost host;
    ArmFault({"Trellis_Exec", "", 4, {}});
    ImportHost("{\"format\": 1}");
    Json empty = Json::parse(ExportHost());
    EXPECT_EQ(empty, Json::parse(R"({"format": 1, "modules": [], "ipSettings": {"ipv6Enabled": true},
        "firewall": {"enabled": false, "defaultAction": "PASS", "rulesetsLoaded": false, "rulesets": [], "dynamicRules": []},
        "nics": [], "standardSwitches": [], "portGroups": [], "distributedSwitches": [], "netstacks": [], "worlds": [],
        "ports": [], "tesselNics": [],
        "ipsec": {"associations": [], "policies": [], "ikeConfig": {"sourcePath": "", "lines": []}},
        "faults": [], "exec": []})"));
    EXPECT_TRUE(ListFaults().empty());  // the faults were replaced too, and this process knows it
}

TEST(HostDescription, TextThatCannotBeReadAsOneDescriptionIsRefusedWithItsPlace) {
    TempHost host;
    const std::string before = ExportHost();
    const std::vector<std::pair<std::string, std::string>> cases = {
        // A key twice: the parser alone would keep the last and say nothing.
        {R"({"format": 1, "format": 1})", "top level: duplicate key \"format\""},
        {R"({"format": 1, "modules": [1, [2, {}], {"a": 1, "a": 2}]})", "modules[2]: duplicate key \"a\""},
        // Numbers that are no integers, even where their value is one.
        {R"({"format": 1.0})", "format: expected 1, the format this version reads"},
        {R"({"format": 1, "portGroups": [{"name": "pg", "vswitch": "s", "vlanId": 1e0}]})",
         "portGroups[0].vlanId: expected an integer from 0 to 4095"},
        // Control characters in names and keys; an empty fault message.
        {R"({"format": 1, "modules": [{"name": "fw\u001b[2J", "loaded": true}]})",
         "modules[0].name: the text contains the control character U+001B"},
        {R"({"format": 1, "x\u0085": 1})", "\"x\\u0085\": unknown field"},
        {R"({"format": 1, "faults": [{"operation": "FirewallRuleset::Enable", "message": ""}]})",
         "faults[0]: The fault message must not be empty"},
        // Bytes that are not UTF-8, inside a string or outside one.
        {"{\"format\": 1,\n  \"modules\": [{\"name\": \"caf\xe9\", \"loaded\": true}]}",
         "not valid UTF-8: the byte 0xE9 at line 2, column 28"},
        {"{\"format\": 1}\xff", "not valid UTF-8: the byte 0xFF at line 1, column 14"},
    };
    for (const auto& [text, refusal] : cases) EXPECT_EQ(RefusalOf(text), refusal) << text;
    EXPECT_EQ(ExportHost(), before);
}
