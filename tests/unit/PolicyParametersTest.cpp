// The shared policy parameters as the tool parses them, the uplink list
// splitter, and the folding of security and shaping parameters.

#include <gtest/gtest.h>

#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTestInput.h"
#include "UplinkList.h"
#include "plinth/cli/UsageError.h"

using namespace KorvexCli::NetworkNamespace;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Names = std::vector<std::string>;

namespace {

bool Refused(AddPolicyParameters add, Names const& words) {
    try {
        ParsePolicyWords(add, words);
    } catch (Plinth::Cli::UsageError const&) {
        return true;
    }
    return false;
}

struct Shaped {
    ShapingPolicy policy;
    Names errors;
};

Shaped FoldShaping(ShapingPolicy policy, Names const& words, bool requireAll = false) {
    boost::shared_ptr<Plinth::CallSpec::Output> output = Plinth::CallSpec::Output::New();
    SetShapingPolicy(ParsePolicyWords(AddShapingParameters, words), output, policy, requireAll);
    return {policy, output->GetErrors()};
}

// Enabled with 2000 Kbps average, 3000 Kbps peak and a burst of 40 Kib.
ShapingPolicy EnabledShaping() {
    ShapingPolicy policy;
    policy.SetEnabled(true);
    policy.SetAverageBps(2000000);
    policy.SetPeakBps(3000000);
    policy.SetBurstSize(5120);
    return policy;
}

const Names kAllMissing = {"Missing required parameter --avg-bandwidth",
                           "Missing required parameter --peak-bandwidth",
                           "Missing required parameter --burst-size"};

}  // namespace

TEST(PolicyParameters, ConstraintsRefuseWhatTheToolMustNotPass) {
    // The words the get commands print for two of the balancing kinds.
    EXPECT_TRUE(Refused(AddFailoverParameters, {"--load-balancing=srcport"}));
    EXPECT_TRUE(Refused(AddFailoverParameters, {"-l", "srcmac"}));
    EXPECT_TRUE(Refused(AddFailoverParameters, {"-f", "Link"}));

    // All three numbers run from 1 to the largest signed 64-bit value.
    EXPECT_FALSE(Refused(AddShapingParameters, {"-b", "1", "-k", "9223372036854775807", "-t", "1"}));
    EXPECT_TRUE(Refused(AddShapingParameters, {"--avg-bandwidth=0"}));
    EXPECT_TRUE(Refused(AddShapingParameters, {"--peak-bandwidth", "-1"}));
    EXPECT_TRUE(Refused(AddShapingParameters, {"--burst-size=9223372036854775808"}));
}

TEST(SplitUplinks, CutsAtEveryCommaAndTrimsNothing) {
    EXPECT_EQ(Names{}, SplitUplinks(""));
    EXPECT_EQ((Names{"pnet0", "pnet1", "pnet0"}), SplitUplinks("pnet0,pnet1,pnet0"));
    // Leading and doubled commas give empty names, a trailing one nothing.
    EXPECT_EQ((Names{"", "pnet0"}), SplitUplinks(",pnet0"));
    EXPECT_EQ((Names{"pnet0", "", "pnet1"}), SplitUplinks("pnet0,,pnet1"));
    EXPECT_EQ((Names{"pnet0", "pnet1"}), SplitUplinks("pnet0,pnet1,"));
    EXPECT_EQ(Names{""}, SplitUplinks(","));
    EXPECT_EQ((Names{"pnet0", " pnet1 "}), SplitUplinks("pnet0, pnet1 "));
}

TEST(SetSecurityPolicy, SetsOnlyTheOptionsGiven) {
    PortSecurityPolicy policy;
    policy.SetAllowMacAddressChange(true);
    boost::shared_ptr<Plinth::CallSpec::Output> output = Plinth::CallSpec::Output::New();
    SetSecurityPolicy(ParsePolicyWords(AddSecurityParameters, {"-o", "true", "--allow-forged-transmits=false"}),
                      output, policy);
    EXPECT_TRUE(policy.allowPromiscuous);
    EXPECT_TRUE(policy.allowMacAddressChange);
    EXPECT_FALSE(policy.allowForgedTransmits);
    EXPECT_EQ(0x07u, policy.setMask);

    PortSecurityPolicy fresh;
    SetSecurityPolicy(ParsePolicyWords(AddSecurityParameters, {"-m", "yes"}), output, fresh);
    EXPECT_EQ(PortSecurityPolicy::MASK_MAC_ADDRESS_CHANGE, fresh.setMask);
    EXPECT_TRUE(fresh.allowMacAddressChange);
    EXPECT_FALSE(output->HasError());
}

TEST(SetShapingPolicy, MissingValuesAreReportedOnlyWhenThisCallEnables) {
    Shaped run = FoldShaping(ShapingPolicy(), {"--enabled=true", "--avg-bandwidth=100"});
    EXPECT_EQ(Names(kAllMissing.begin() + 1, kAllMissing.end()), run.errors);
    EXPECT_TRUE(run.policy.enabled);
    EXPECT_EQ(100000u, run.policy.averageBps);
    EXPECT_EQ(ShapingPolicy::MASK_ENABLED | ShapingPolicy::MASK_AVERAGE_BPS, run.policy.setMask);

    // Values stored already do not excuse a call that enables shaping itself.
    EXPECT_EQ(kAllMissing, FoldShaping(EnabledShaping(), {"-e", "yes"}).errors);
    EXPECT_EQ(kAllMissing, FoldShaping(EnabledShaping(), {}, true).errors);

    // Shaping on already: the values given are taken, the others stay.
    run = FoldShaping(EnabledShaping(), {"--peak-bandwidth=7", "-t", "3"});
    EXPECT_EQ(Names{}, run.errors);
    EXPECT_EQ(7000u, run.policy.peakBps);
    EXPECT_EQ(384u, run.policy.burstSize);  // 3 Kib = 3072 bits
    EXPECT_EQ(2000000u, run.policy.averageBps);
}

TEST(SetShapingPolicy, ADisabledPolicyDropsTheValuesWithoutAWord) {
    Shaped run = FoldShaping(EnabledShaping(), {"--enabled=false", "--avg-bandwidth=100"});
    EXPECT_EQ(Names{}, run.errors);
    EXPECT_FALSE(run.policy.enabled);
    EXPECT_EQ(2000000u, run.policy.averageBps);
    EXPECT_EQ(EnabledShaping().setMask, run.policy.setMask);

    ShapingPolicy disabled = EnabledShaping();
    disabled.SetEnabled(false);
    run = FoldShaping(disabled, {"--avg-bandwidth=100", "--burst-size=4"}, true);
    EXPECT_EQ(Names{}, run.errors);
    EXPECT_EQ(disabled, run.policy);
}

TEST(SetShapingPolicy, ValuesAreConvertedIn64Bits) {
    Shaped run = FoldShaping(ShapingPolicy(), {"-e", "true", "-b", "5000000000", "-k", "9223372036854775807",
                                               "-t", "9223372036854775807"});
    EXPECT_EQ(Names{}, run.errors);
    EXPECT_EQ(5000000000000u, run.policy.averageBps);
    // (2^63 - 1) * 1000 = 500 * 2^64 - 1000 and (2^63 - 1) * 128 = 64 * 2^64 - 128, modulo 2^64.
    EXPECT_EQ(18446744073709550616u, run.policy.peakBps);
    EXPECT_EQ(18446744073709551488u, run.policy.burstSize);
}
