// The columns a text takes on a terminal, which the table and help layouts
// pad and wrap by.
#include <gtest/gtest.h>

#include "plinth/cli/Utf8.h"

using Plinth::Cli::DisplayWidth;

TEST(PlinthDisplayWidth, WideCharactersTwoMarksNoneInvalidBytesOne) {
    EXPECT_EQ(0u, DisplayWidth(""));
    EXPECT_EQ(11u, DisplayWidth("pnet0 ~ {x}"));
    EXPECT_EQ(5u, DisplayWidth("Ærø ß"));  // two-byte letters
    EXPECT_EQ(4u, DisplayWidth("東京"));
    EXPECT_EQ(6u, DisplayWidth("ｗｅｂ"));       // fullwidth forms
    EXPECT_EQ(9u, DisplayWidth("한국어 か"));  // Hangul syllables, kana
    EXPECT_EQ(4u, DisplayWidth("\xF0\x9F\x99\x82\xF0\xA0\x80\x80"));  // an emoji, an ideograph beyond U+FFFF
    // Precomposed and combining forms of the same text take the same width.
    EXPECT_EQ(DisplayWidth("Café"), DisplayWidth("Cafe\u0301"));
    EXPECT_EQ(2u, DisplayWidth("\u1112\u1161\u11AB"));  // a conjoining Hangul syllable
    EXPECT_EQ(2u, DisplayWidth("a\u200Bb\uFEFF"));      // zero-width space, zero-width no-break space
    EXPECT_EQ(2u, DisplayWidth("\u0915\u094D\u0937"));  // Devanagari letters joined by a virama
    // Neighbours of the wide ranges stay narrow.
    EXPECT_EQ(3u, DisplayWidth("\u303F\u4DC0\uFF61"));
    // Each byte that is not UTF-8 shows as one stand-in.
    EXPECT_EQ(3u, DisplayWidth("\xFF\xE6\x9D"));
    EXPECT_EQ(3u, DisplayWidth("a\xC0\xAF"));  // an overlong form
}
