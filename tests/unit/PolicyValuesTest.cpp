// The policy value classes of switches and port groups: the inverted sense of
// SetBeacon, UnsetAll and copies. The setters' bits are proven where the
// commands fold their parameters, the defaults where a new switch stores them.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "gantry/network/LinkCriteriaSelectionPolicy.h"
#include "gantry/network/NicTeamingPolicy.h"

using namespace Gantry::Network;

TEST(LinkCriteriaSelectionPolicyTest, SetBeaconHasTheInvertedSense) {
    LinkCriteriaSelectionPolicy criteria;
    EXPECT_FALSE(criteria.IsBeaconDetection());  // an empty policy: link state

    criteria.SetBeacon(false);  // what "beacon" calls
    EXPECT_EQ(0x10u, criteria.criteriaMask);
    EXPECT_EQ(0x00u, criteria.criteriaValue);
    EXPECT_TRUE(criteria.IsBeaconDetection());

    criteria.criteriaValue |= 0x01;  // other bits are left alone
    criteria.SetBeacon(true);  // what "link" calls
    EXPECT_EQ(0x10u, criteria.criteriaMask);
    EXPECT_EQ(0x11u, criteria.criteriaValue);
    EXPECT_FALSE(criteria.IsBeaconDetection());
}

// Each setter's field and bit are proven by the failover folding
// (FailoverPolicyFoldingTest); UnsetAll forgets what is set, not the values.
TEST(NicTeamingPolicyTest, UnsetAllForgetsWhatIsSetNotTheValues) {
    NicTeamingPolicy all = NicTeamingPolicy::GetDefaultPolicy();
    all.SetUplinkOrder({"pnet1", "pnet0"});
    NicTeamingPolicy copy = all;
    copy.UnsetAll();
    EXPECT_EQ(0u, copy.setMask);
    EXPECT_EQ(all.uplinkOrder, copy.uplinkOrder);
    EXPECT_NE(all, copy);
}

TEST(NicTeamingPolicyTest, CopiesKeepTheUnnamedFields) {
    NicTeamingPolicy policy;
    policy.reserved0 = true;
    policy.reserved1 = 0xdeadbeef;
    policy.linkCriteria.reserved2 = 7;
    NicTeamingPolicy copy;
    copy = policy;
    EXPECT_TRUE(copy.reserved0);
    EXPECT_EQ(0xdeadbeefu, copy.reserved1);
    EXPECT_EQ(7u, copy.linkCriteria.reserved2);
    EXPECT_EQ(policy, copy);
    copy.linkCriteria.reserved2 = 8;
    EXPECT_NE(policy, copy);
}
