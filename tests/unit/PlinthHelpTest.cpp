// Help texts: command options, enum markers, wrapping. Namespace listings are
// proven through the test plug-in in tests/cli/frame.test.sh.
#include <gtest/gtest.h>

#include <sstream>

#include "PlinthScriptedCommand.h"
#include "plinth/cli/HelpWriter.h"
#include "plinth/cli/TextLayout.h"

using namespace Plinth::AutoCli;
using namespace Plinth::CallSpec;
using Plinth::Cli::HelpWriter;
using PlinthTest::MakeParameter;
using PlinthTest::ScriptedCommand;

namespace {

std::vector<std::string> Lines(std::string const& text) {
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) lines.push_back(line);
    return lines;
}

boost::shared_ptr<ParameterSpec> WithEnum(std::string const& help) {
    boost::shared_ptr<ParameterSpec> type = MakeParameter("type", PARAMETER_STRING, "t", help, true);
    boost::shared_ptr<ParameterConstraint> types = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
    types->AddStringEnum("static", "Set Static IPv4 information for this interface.");
    types->AddStringEnum("dhcp", "Use DHCP to aquire IPv4 setting for this interface.");
    types->AddStringEnum("none", "");
    type->SetConstraint(types);
    return type;
}

}  // namespace

TEST(PlinthHelp, EnumMarkersExpandFromTheConstraint) {
    EXPECT_EQ("IP version : [static, dhcp, none] (required)",
              HelpWriter::OptionText(*WithEnum("IP version : %ENUM%")));
    EXPECT_EQ("IPv4 Address type :\n"
              "  static: Set Static IPv4 information for this interface.\n"
              "  dhcp: Use DHCP to aquire IPv4 setting for this interface.\n"
              "  none (required)",
              HelpWriter::OptionText(*WithEnum("IPv4 Address type : %FULLENUM%")));

    boost::shared_ptr<ParameterSpec> speed = MakeParameter("speed", PARAMETER_INT, "S", "Acceptable values are :%ENUM%");
    boost::shared_ptr<ParameterConstraint> speeds = ParameterConstraint::New(CONSTRAINT_INT_ENUM);
    speeds->AddIntEnum(10);
    speeds->AddIntEnum(100);
    speed->SetConstraint(speeds);
    EXPECT_EQ("Acceptable values are :[10, 100]", HelpWriter::OptionText(*speed));
}

TEST(PlinthHelp, CommandHelpLayout) {
    boost::shared_ptr<Namespace> root = Namespace::New();
    boost::shared_ptr<ScriptedCommand> set = ScriptedCommand::New("Set firewall ruleset status.");
    root->SubNamespace("network")->SubNamespace("firewall")->RegisterNamespaceNode(set, "set");
    set->inputSpec = [] {
        boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
        inputSpec->AddParameter(MakeParameter("enabled", PARAMETER_BOOL, "e",
                                         "Set to true to enable ruleset, set to false to disable it. This text is "
                                         "long enough to wrap onto a second line."));
        inputSpec->AddParameter(MakeParameter("ruleset-id", PARAMETER_STRING, "r", "The label of the ruleset.", true));
        inputSpec->AddParameter(MakeParameter("override-vswitch-allow-promiscuous", PARAMETER_BOOL, "",
                                         "Too wide for the column."));
        inputSpec->AddParameter(MakeParameter("all", PARAMETER_FLAG, "a", ""));
        return inputSpec;
    };
    EXPECT_EQ((std::vector<std::string>{
                  "Usage: haldencli network firewall set [cmd options]",
                  "",
                  "Description:",
                  "  Set firewall ruleset status.",
                  "",
                  "Cmd options:",
                  "  -e|--enabled=<bool>   Set to true to enable ruleset, set to false to disable",
                  "                        it. This text is long enough to wrap onto a second line.",
                  "  -r|--ruleset-id=<str> The label of the ruleset. (required)",
                  "  --override-vswitch-allow-promiscuous=<bool>",
                  "                        Too wide for the column.",
                  "  -a|--all",
              }),
              Lines(HelpWriter("haldencli").CommandHelp(*set)));
}

TEST(PlinthTextLayout, WrapsAtBlanksAndKeepsLongWordsWhole) {
    EXPECT_EQ((std::vector<std::string>{"one two", "three"}), Plinth::Cli::WrapText("one two three", 8));
    EXPECT_EQ((std::vector<std::string>{"a", "averyveryverylongword", "b"}),
              Plinth::Cli::WrapText("a averyveryverylongword b", 8));
    EXPECT_EQ((std::vector<std::string>{"x:", "  aa bb", "  cc"}), Plinth::Cli::WrapText("x:\n  aa bb cc", 7));
    for (std::string const& line : Lines(Plinth::Cli::FormatColumns(
             "--x", std::string(300, 'w') + " " + std::string(30, 'y') + " z", 2, 24, 80))) {
        EXPECT_TRUE(line.size() <= 80 || line.find(' ', 24) == std::string::npos) << line;
    }
    // The blanks of the help text stay within a line.
    EXPECT_EQ((std::vector<std::string>{"listed  by name"}), Plinth::Cli::WrapText("listed  by name", 40));
    EXPECT_EQ((std::vector<std::string>{"listed", "by name"}), Plinth::Cli::WrapText("listed  by name", 8));
}

TEST(PlinthTextLayout, MeasuresDisplayColumnsNotBytes) {
    // An ideograph takes two columns and three bytes; "ß" one column and two bytes.
    EXPECT_EQ((std::vector<std::string>{"東京 大阪", "京都"}), Plinth::Cli::WrapText("東京 大阪 京都", 9));
    EXPECT_EQ("  名前    The name\n  Straße  The street\n",
              Plinth::Cli::FormatColumns("名前", "The name", 2, 10, 80) +
                  Plinth::Cli::FormatColumns("Straße", "The street", 2, 10, 80));
}
