// Command options: the accepted forms, the types and each constraint kind at
// and beyond its bounds, and the refusals.
#include <gtest/gtest.h>

#include "PlinthScriptedCommand.h"
#include "plinth/callspec/Parameter.h"
#include "plinth/cli/OptionParser.h"
#include "plinth/cli/UsageError.h"

using namespace Plinth::CallSpec;
using Plinth::Cli::ParseCommandOptions;
using Plinth::Cli::UsageError;
using PlinthTest::MakeParameter;

namespace {

// One parameter of each type and each constraint kind, declared as commands do.
const Parameter kName = Parameter::String("name", "n", "");
const Parameter kCount = Parameter::Int64("count", "c", "");
const Parameter kMtu = Parameter::Int("mtu", "m", "");
const Parameter kEnabled = Parameter::Bool("enabled", "e", "");
const Parameter kVerbose = Parameter::Flag("verbose", "v", "");
const Parameter kPorts = Parameter::Int("ports", "", "").Range(1, 4096);
constexpr long long kSpeedValues[] = {10, 100};
const Parameter kSpeed = Parameter::Int("speed", "", "").IntEnum(kSpeedValues);
constexpr Parameter::Word kTypeWords[] = {{"static", ""}, {"dhcp", ""}};
const Parameter kType = Parameter::String("type", "", "").StringEnum(kTypeWords);
const Parameter kInterface = Parameter::String("interface", "", "").Regex("tsl[0-9]+");

boost::shared_ptr<InputSpec> OptionsSpec() {
    return InputSpecOf(kName, kCount, kMtu, kEnabled, kVerbose, kPorts, kSpeed, kType, kInterface);
}

boost::shared_ptr<Input> Parse(std::vector<std::string> const& words) { return ParseCommandOptions(*OptionsSpec(), words); }

// The refusal text for words, or "" when they are accepted.
std::string Refusal(std::vector<std::string> const& words) {
    try {
        Parse(words);
    } catch (UsageError const& refusal) {
        return refusal.what();
    }
    return "";
}

}  // namespace

// Every form reaching the command is proven through the binary (tests/cli/frame.test.sh).
TEST(PlinthOptionParser, ValuesThatLookLikeOptionsOrHoldAnEqualsSign) {
    // A separate value may start with '-' where it is a number.
    EXPECT_EQ(-5, Parse({"-c", "-5"})->GetInt("count"));
    // A value may contain '=' and may start with '-' in the inline form.
    boost::shared_ptr<Input> input = Parse({"-n=a=b", "--count=+7"});
    EXPECT_EQ("a=b", input->GetString("name"));
    EXPECT_EQ(7, input->GetInt("count"));
    EXPECT_EQ("-x", Parse({"--name=-x"})->GetString("name"));
    EXPECT_EQ("", Parse({"--name="})->GetString("name"));
    EXPECT_TRUE(Parse({"--name="})->HasParameter("name"));
}

TEST(PlinthOptionParser, BooleansAcceptThreeSpellingsInAnyCase) {
    for (std::string word : {"true", "TRUE", "Yes", "1"}) EXPECT_TRUE(Parse({"-e", word})->GetBool("enabled")) << word;
    for (std::string word : {"false", "No", "NO", "0"}) {
        boost::shared_ptr<Input> input = Parse({"-e", word});
        EXPECT_TRUE(input->HasParameter("enabled")) << word;
        EXPECT_FALSE(input->GetBool("enabled")) << word;
    }
    EXPECT_EQ("Invalid value for option --enabled: 'on' is not a boolean (use true/false, yes/no or 1/0).",
              Refusal({"--enabled", "on"}));
    EXPECT_NE("", Refusal({"-e", "2"}));
}

TEST(PlinthOptionParser, IntegersAreDecimalAndFitWhatTheCommandReads) {
    // An option read with GetInt takes the 32-bit range, one read as 64 bits the whole range.
    EXPECT_EQ(2147483647, Parse({"-m", "2147483647"})->GetInt("mtu"));
    EXPECT_EQ(-2147483647 - 1, Parse({"-m", "-2147483648"})->GetInt("mtu"));
    EXPECT_EQ("Invalid value for option --mtu: '2147483648' is outside the 32-bit integer range "
              "(-2147483648 to 2147483647).",
              Refusal({"-m", "2147483648"}));
    EXPECT_NE("", Refusal({"--mtu=-2147483649"}));
    EXPECT_NE("", Refusal({"--mtu=4294968796"}));
    EXPECT_EQ(2147483648LL, Parse({"-c", "2147483648"})->GetLongLong("count"));
    EXPECT_EQ(-2147483649LL, Parse({"-c", "-2147483649"})->GetLongLong("count"));
    EXPECT_EQ(9223372036854775807LL, Parse({"-c", "9223372036854775807"})->GetLongLong("count"));
    EXPECT_EQ(-9223372036854775807LL - 1, Parse({"-c", "-9223372036854775808"})->GetLongLong("count"));
    EXPECT_EQ("Invalid value for option --count: '9223372036854775808' is outside the 64-bit integer range.",
              Refusal({"-c", "9223372036854775808"}));
    EXPECT_NE("", Refusal({"-c", "-9223372036854775809"}));
    EXPECT_EQ("Invalid value for option --count: 'abc' is not an integer.", Refusal({"--count", "abc"}));
    for (std::string word : {"0x10", "1.5", "12a", " 3", "+", "1e3"}) {
        EXPECT_NE("", Refusal({"--count=" + word})) << word;
    }
}

TEST(PlinthOptionParser, IntRangeIsInclusive) {
    EXPECT_EQ(1, Parse({"--ports", "1"})->GetInt("ports"));
    EXPECT_EQ(4096, Parse({"--ports", "4096"})->GetInt("ports"));
    EXPECT_EQ("Invalid value for option --ports: 4097 is not in the range 1 to 4096.", Refusal({"--ports", "4097"}));
    EXPECT_EQ("Invalid value for option --ports: 0 is not in the range 1 to 4096.", Refusal({"--ports", "0"}));
    EXPECT_NE("", Refusal({"--ports", "-1"}));
}

TEST(PlinthOptionParser, EnumsAcceptExactlyTheListedValues) {
    EXPECT_EQ(100, Parse({"--speed", "100"})->GetInt("speed"));
    EXPECT_EQ("Invalid value for option --speed: 1000 is not one of 10, 100.", Refusal({"--speed", "1000"}));
    EXPECT_EQ("static", Parse({"--type", "static"})->GetString("type"));
    EXPECT_EQ("Invalid value for option --type: 'Static' is not one of static, dhcp.", Refusal({"--type", "Static"}));
    EXPECT_NE("", Refusal({"--type", "stat"}));
    EXPECT_NE("", Refusal({"--type", ""}));
}

TEST(PlinthOptionParser, RegexMustMatchTheWholeValue) {
    EXPECT_EQ("tsl0", Parse({"--interface", "tsl0"})->GetString("interface"));
    EXPECT_EQ("Invalid value for option --interface: 'tsl' does not match the pattern tsl[0-9]+.",
              Refusal({"--interface", "tsl"}));
    EXPECT_NE("", Refusal({"--interface", "xtsl0"}));
    EXPECT_NE("", Refusal({"--interface", "tsl0x"}));
}

TEST(PlinthOptionParser, RefusesMalformedCommandLines) {
    EXPECT_EQ("Unknown option --nme.", Refusal({"--nme", "x"}));
    EXPECT_EQ("Unknown option -x.", Refusal({"-x", "1"}));
    EXPECT_EQ("Option --name was given more than once.", Refusal({"--name", "a", "-n", "b"}));
    EXPECT_EQ("Option --verbose was given more than once.", Refusal({"-v", "--verbose"}));
    EXPECT_EQ("Option --verbose is a flag and takes no value.", Refusal({"--verbose=true"}));
    EXPECT_EQ("Option --name requires a value.", Refusal({"--name"}));
    EXPECT_EQ("Option --name requires a value.", Refusal({"--name", "--count", "1"}));
    EXPECT_EQ("Unexpected argument 'extra'.", Refusal({"-v", "extra"}));
    // A flag does not swallow the next word.
    EXPECT_EQ("Unexpected argument 'true'.", Refusal({"-v", "true"}));
}

TEST(PlinthOptionParser, TextsMustBeUtf8WithoutControlCharacters) {
    EXPECT_EQ("Gr\xc3\xbcn \xe7\xbd\x91", Parse({"-n", "Gr\xc3\xbcn \xe7\xbd\x91"})->GetString("name"));
    EXPECT_EQ("Invalid value for option --name: 'bad\\xFF' is not valid UTF-8.", Refusal({"-n", "bad\xff"}));
    // An overlong form and a lone surrogate are not UTF-8 either.
    EXPECT_NE("", Refusal({"-n", "\xc0\xaf"}));
    EXPECT_NE("", Refusal({"-n", "\xed\xa0\x80"}));
    EXPECT_EQ("Invalid value for option --name: 'a\\x0Ab' contains a control character.", Refusal({"-n", "a\nb"}));
    EXPECT_NE("", Refusal({"--name=tab\there"}));
    EXPECT_NE("", Refusal({"--name=c1\xc2\x85"}));
    // A value of another type is checked as a text first; refusals quote a bad word visibly.
    EXPECT_EQ("Invalid value for option --mtu: '1\\x00' contains a control character.",
              Refusal({"--mtu", std::string("1\0", 2)}));
    EXPECT_EQ("Unexpected argument '\\xFE'.", Refusal({"\xfe"}));
    EXPECT_EQ("Unknown option --x\\x1B.", Refusal({"--x\x1b"}));
}

TEST(PlinthOptionParser, RequiredOptionsMustBeGiven) {
    // Its text is checked where the tool prints it (PlinthToolTest).
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    inputSpec->AddParameter(MakeParameter("ruleset-id", PARAMETER_STRING, "r", "", true));
    inputSpec->AddParameter(MakeParameter("enabled", PARAMETER_BOOL, "e", "", true));
    EXPECT_THROW(ParseCommandOptions(*inputSpec, {"-e", "true"}), UsageError);
    EXPECT_NO_THROW(ParseCommandOptions(*inputSpec, {"-r", "dns", "-e", "0"}));
    // A command without parameters takes an empty command line only.
    EXPECT_NO_THROW(ParseCommandOptions(*InputSpec::New(), {}));
    EXPECT_THROW(ParseCommandOptions(*InputSpec::New(), {"--any"}), UsageError);
}
