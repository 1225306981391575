// The texts the host keeps are valid UTF-8 without control characters: the
// check itself, every host operation that stores a caller's text, and the
// store's own refusal behind them. Descriptions are covered in
// HostDescriptionTest.cpp, haldensim's fault messages in
// tests/cli/haldensim.test.sh.

#include <sqlite3.h>

#include <memory>

#include <gtest/gtest.h>

#include "FailureOf.h"
#include "HostTestRecords.h"
#include "TempHost.h"
#include "gantry/network/PortGroup.h"
#include "host/StoredText.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"
#include "trellis/util/Exec.h"

using namespace Trellis::Host;
using Gantry::Network::NicTeamingPolicy;

namespace {

const Operation kWrite("HostTextTest::Write");

void AddSwitch(const std::string& name) {
    Trellis::Network::VirtualSwitchInfoImpl info;
    delete info.AddVirtualSwitchWithPolicy(NicTeamingPolicy::GetDefaultPolicy(),
                                           Gantry::Network::PortSecurityPolicy::GetDefaultPolicy(),
                                           Gantry::Network::ShapingPolicy::GetDefaultPolicy(),
                                           Gantry::Network::NicCapabilities::GetDefaultPolicy(), name, 8);
}

std::unique_ptr<Gantry::Network::VirtualSwitch> Switch0() {
    return std::unique_ptr<Gantry::Network::VirtualSwitch>(
        Trellis::Network::VirtualSwitchInfoImpl().GetVirtualSwitchByName("switch0"));
}

}  // namespace

TEST(HostText, ValidUtf8WithoutControlCharactersIsAllThatPasses) {
    for (const std::string text : {"", "switch0", "Gäste-Netz", "\xc2\xa0", "\xf0\x9f\x98\x80", "\xf4\x8f\xbf\xbf"})
        EXPECT_EQ(TextProblem(text), "") << text;

    struct Case {
        std::string text;
        std::string problem;
    };
    const std::vector<Case> cases = {
        {std::string("a\0b", 3), "contains the control character U+0000"},
        {"tab\there", "contains the control character U+0009"},
        {"\x1b[31m", "contains the control character U+001B"},
        {"del\x7f", "contains the control character U+007F"},
        {"next\xc2\x85line", "contains the control character U+0085"},
        {"\xc2\x9f", "contains the control character U+009F"},
        {"bad\xff", "is not valid UTF-8"},
        {"\xc0\x80", "is not valid UTF-8"},           // an overlong NUL
        {"\xed\xa0\x80", "is not valid UTF-8"},       // a surrogate
        {"\xf4\x90\x80\x80", "is not valid UTF-8"},   // above U+10FFFF
        {"euro\xe2\x82", "is not valid UTF-8"},       // cut short
        {"\x80", "is not valid UTF-8"},               // a lone continuation byte
    };
    for (const Case& c : cases) EXPECT_EQ(TextProblem(c.text), c.problem) << Printable(c.text);

    EXPECT_EQ(InvalidUtf8Offset("ok"), std::nullopt);
    EXPECT_EQ(InvalidUtf8Offset("ab\xff" "cd"), 2u);
    EXPECT_EQ(InvalidUtf8Offset("ab\xe2\x82"), 2u);       // cut short at the end
    EXPECT_EQ(InvalidUtf8Offset("ab\xe2\x82" "c"), 2u);   // cut short before "c"
    EXPECT_EQ(InvalidUtf8Offset("\xc3\xa9\x80"), 2u);       // a stray byte after a whole character

    EXPECT_EQ(Printable("Gäste-Netz"), "Gäste-Netz");
    EXPECT_EQ(Printable("a\x1b"), "\"a\\u001b\"");
    EXPECT_EQ(Printable("bad\xff"), "\"bad\\ufffd\"");
    EXPECT_EQ(Quoted("x"), "\"x\"");
}

TEST(HostText, HostOperationsRefuseTextTheHostCannotKeepAndChangeNothing) {
    TempHost host;
    const std::string before = ExportHost();

    EXPECT_EQ(FailureOf([] { AddSwitch("sw\x1b"); }),
              "Unable to create virtual switch \"sw\\u001b\": its name contains the control character U+001B");
    EXPECT_EQ(FailureOf([] { AddSwitch("sw\xff"); }),
              "Unable to create virtual switch \"sw\\ufffd\": its name is not valid UTF-8");
    EXPECT_EQ(FailureOf([] { delete Switch0()->AddPortGroup("bad\xff"); }),
              "Unable to add port group \"bad\\ufffd\" to virtual switch switch0: its name is not valid UTF-8");
    EXPECT_EQ(FailureOf([] { delete Switch0()->AddPortGroup("Guest\xc2\x85"); }),
              "Unable to add port group \"Guest\\u0085\" to virtual switch switch0: its name contains the control "
              "character U+0085");
    NicTeamingPolicy order;
    order.SetUplinkOrder({"pnet0", "pnet\x01"});
    EXPECT_EQ(FailureOf([&] { Switch0()->ApplyTeamingPolicy(order); }),
              "Invalid uplink \"pnet\\u0001\" in the teaming policy of virtual switch switch0: its name contains the "
              "control character U+0001");

    EXPECT_EQ(FailureOf([] { Trellis::System::ModuleImpl("haldenfw").Load("debug=1\n", true); }),
              "Cannot load module haldenfw: the option text contains the control character U+000A");
    Gantry::System::FirewallRule rule;
    rule.name = "vnc\x1b";
    rule.portBegin = rule.portEnd = 5900;
    EXPECT_EQ(FailureOf([&] { Trellis::System::SystemInfoImpl().AddFirewallDynamicRule(rule); }),
              "Invalid firewall rule \"vnc\\u001b\": its name contains the control character U+001B");
    EXPECT_EQ(FailureOf([] { Trellis::Util::Trellis_Exec("echo \xff", false, false, false); }),
              "Trellis_Exec: the command line is not valid UTF-8");

    EXPECT_EQ(ExportHost(), before);
}

TEST(HostText, TheStoreRefusesTextItCannotWriteWithItsOwnError) {
    TempHost host;
    // Behind the operations' checks: a record whose name or data is not UTF-8.
    EXPECT_EQ(FailureOf([] { Increment("bad\xff"); }),
              "The host cannot store the test.counter record \"bad\\ufffd\": it holds text that is not valid UTF-8");
    EXPECT_EQ(FailureOf([] {
                  kWrite.Write([](Transaction& t) {
                      t.PutData("test.counter", "ok", Json{{"name", "ok"}, {"note", "caf\xe9"}});
                  });
              }),
              "The host cannot store the test.counter record \"ok\": it holds text that is not valid UTF-8");
    EXPECT_EQ(kReadCounter.Read([](Transaction& t) { return t.Count<CounterRecord>(); }), 0u);

    // A fault message stored by a build that did not check it: export fails
    // with the host's error, and clearing the faults mends the host.
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db, "INSERT INTO faults VALUES ('FirewallRuleset::Enable', CAST(x'ff' AS TEXT), 0, NULL)",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    EXPECT_EQ(FailureOf([] { ExportHost(); }),
              "The host store holds text that is not valid UTF-8; it cannot be exported");
    ClearFaults();
    EXPECT_EQ(ExportHost(), kDefaultHostDescription);
}
