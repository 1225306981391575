// Splitting a batch line into words: what a user who knows the shell expects,
// without any expansion.
#include <gtest/gtest.h>

#include "plinth/cli/BatchLine.h"

using Plinth::Cli::BatchLineError;
using Plinth::Cli::SplitBatchLine;
using Words = std::vector<std::string>;

namespace {

std::string RefusalOf(std::string const& line) {
    try {
        SplitBatchLine(line);
    } catch (BatchLineError const& refusal) {
        return refusal.what();
    }
    return "(split)";
}

}  // namespace

TEST(PlinthBatchLine, BlanksSeparateWordsAndCommentsEndTheLine) {
    EXPECT_EQ((Words{"network", "firewall", "get"}), SplitBatchLine("  network\tfirewall   get \t"));
    EXPECT_EQ(Words{}, SplitBatchLine(""));
    EXPECT_EQ(Words{}, SplitBatchLine(" \t "));
    EXPECT_EQ(Words{}, SplitBatchLine("# network firewall get"));
    EXPECT_EQ((Words{"network", "get"}), SplitBatchLine("network get # the status 'unclosed"));
    // Only a # that starts a word begins a comment.
    EXPECT_EQ((Words{"-d", "a#b", "#c"}), SplitBatchLine("-d a#b '#c'"));
}

TEST(PlinthBatchLine, QuotesAndBackslashesKeepWhatTheyEnclose) {
    EXPECT_EQ((Words{"-r", "a b\t\\c $HOME \"x\""}), SplitBatchLine("-r 'a b\t\\c $HOME \"x\"'"));
    EXPECT_EQ((Words{"say \"hi\" \\ $ ` \\n"}), SplitBatchLine(R"("say \"hi\" \\ \$ \` \n")"));
    EXPECT_EQ((Words{"a b", "'", "#", "\\"}), SplitBatchLine(R"(a\ b \' \# \\)"));
    // Quoted parts join the word around them; an empty pair is an empty word.
    EXPECT_EQ((Words{"--name=Guest Network", "", "ab"}), SplitBatchLine(R"(--name="Guest Network" '' a""b)"));
    // Bytes beyond ASCII pass as they are.
    EXPECT_EQ((Words{"r\xC3\xA9seau", "\xE2\x80\x94"}), SplitBatchLine("r\xC3\xA9seau '\xE2\x80\x94'"));
}

TEST(PlinthBatchLine, AnOpenQuoteOrAFinalBackslashIsRefused) {
    EXPECT_EQ("the single quote is not closed", RefusalOf("network get -r 'dns"));
    EXPECT_EQ("the double quote is not closed", RefusalOf("network get -r \"dns\\\""));
    EXPECT_EQ("the double quote is not closed", RefusalOf("-r \"dns\\"));
    EXPECT_EQ("it ends with a backslash", RefusalOf("network get \\"));
}
