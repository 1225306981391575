// Splitting a text at separator characters.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "trellis/util/StringTokenize.h"

using Trellis::Util::StringTokenize;

TEST(StringTokenizeTest, SplitsAtAnySeparatorAndDropsEmptyPieces) {
    struct Case {
        std::string text;
        std::string separators;
        std::vector<std::string> tokens;
    };
    std::vector<Case> cases = {
        {"example.com corp.example.com", " ", {"example.com", "corp.example.com"}},
        {"  a  b ", " ", {"a", "b"}},
        {"a,b;c", ",;", {"a", "b", "c"}},
        {",,", ",", {}},
        {"", " ", {}},
        {"one", " ", {"one"}},
        {"a b", "", {"a b"}},
    };
    for (auto const& c : cases) {
        std::vector<std::string> tokens;
        StringTokenize(c.text, tokens, c.separators);
        EXPECT_EQ(c.tokens, tokens) << "'" << c.text << "' at '" << c.separators << "'";
    }
}

TEST(StringTokenizeTest, AppendsToWhatIsThere) {
    std::vector<std::string> tokens = {"first"};
    StringTokenize("second third", tokens, " ");
    EXPECT_EQ((std::vector<std::string>{"first", "second", "third"}), tokens);
}
