// The texts the host keeps are valid UTF-8 without control characters: the
// check itself, and the store's own refusal behind the host operations'
// checks (which their objects' tests prove).

#include <gtest/gtest.h>

#include "FailureOf.h"
#include "HostTestRecords.h"
#include "TempHost.h"
#include "host/StoredText.h"

using namespace Trellis::Host;

namespace {

const Operation kWrite("HostTest::WriteText");

}  // namespace

TEST(HostText, ControlCharactersAreC0DelAndC1AndBadBytesAreFoundWhereTheirCharacterStarts) {
    for (const std::string text : {"", "Gäste-Netz", "\xc2\xa0", "\xf0\x9f\x98\x80"}) EXPECT_EQ(TextProblem(text), "");
    EXPECT_EQ(TextProblem(std::string("a\0b", 3)), "contains the control character U+0000");
    EXPECT_EQ(TextProblem("\x1f"), "contains the control character U+001F");
    EXPECT_EQ(TextProblem("del\x7f"), "contains the control character U+007F");
    EXPECT_EQ(TextProblem("\xc2\x80"), "contains the control character U+0080");
    EXPECT_EQ(TextProblem("next\xc2\x9fline"), "contains the control character U+009F");
    EXPECT_EQ(TextProblem("\xed\xa0\x80"), "is not valid UTF-8");  // a surrogate

    EXPECT_EQ(InvalidUtf8Offset("ab\xff" "cd"), 2u);
    EXPECT_EQ(InvalidUtf8Offset("ab\xe2\x82"), 2u);      // cut short at the end
    EXPECT_EQ(InvalidUtf8Offset("ab\xe2\x82" "c"), 2u);  // cut short before "c"
    EXPECT_EQ(InvalidUtf8Offset("\xc3\xa9\x80"), 2u);    // a stray byte after a whole character
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
}
