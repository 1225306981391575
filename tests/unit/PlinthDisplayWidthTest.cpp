// The columns a text takes on a terminal, which the table and help layouts
// pad and wrap by.
#include <gtest/gtest.h>

#include "plinth/cli/CodePointWidth.h"

using Plinth::Cli::DisplayWidth;

TEST(PlinthDisplayWidth, WideCharactersTwoMarksNoneInvalidBytesOne) {
    EXPECT_EQ(0u, DisplayWidth(""));
    EXPECT_EQ(9u, DisplayWidth("pnet0 Ærø"));
    EXPECT_EQ(10u, DisplayWidth("東京ｗｅｂ"));                         // ideographs, fullwidth forms
    EXPECT_EQ(8u, DisplayWidth("한か\xF0\x9F\x99\x82\xF0\xA0\x80\x80"));  // Hangul, kana, emoji, beyond U+FFFF
    EXPECT_EQ(3u, DisplayWidth("\u303F\u4DC0\uFF61"));                  // narrow neighbours of wide ranges
    // Marks and zero-width characters add nothing.
    EXPECT_EQ(DisplayWidth("Café"), DisplayWidth("Cafe\u0301"));
    EXPECT_EQ(2u, DisplayWidth("\u1112\u1161\u11AB"));  // a conjoining Hangul syllable
    EXPECT_EQ(2u, DisplayWidth("\u0915\u094D\u0937"));  // Devanagari letters joined by a virama
    EXPECT_EQ(2u, DisplayWidth("a\u200Bb\uFEFF"));
    // Each byte that is not UTF-8 shows as one stand-in: a stray byte, a
    // truncated sequence, an overlong form.
    EXPECT_EQ(6u, DisplayWidth("\xFF\xE6\x9D\xC0\xAF" "a"));
}
