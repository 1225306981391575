// The policy value classes of switches and port groups: setMask bits, the
// inverted sense of SetBeacon, UnsetAll and the policies of a new switch.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "gantry/network/LinkCriteriaSelectionPolicy.h"
#include "gantry/network/NicCapabilities.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"

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

TEST(NicTeamingPolicyTest, EachSetterSetsItsFieldAndBit) {
    LinkCriteriaSelectionPolicy beacon;
    beacon.SetBeacon(false);

    struct Case {
        void (*set)(NicTeamingPolicy&, LinkCriteriaSelectionPolicy const&);
        std::uint32_t bit;
    };
    std::vector<Case> cases = {
        {[](NicTeamingPolicy& p, auto&) { p.SetTeamingPolicy(TeamPolicyType::IpHash); }, 0x01},
        {[](NicTeamingPolicy& p, auto&) { p.SetNotifySwitchOnFailure(false); }, 0x04},
        {[](NicTeamingPolicy& p, auto& c) { p.SetLinkCriteria(c); }, 0x08},
        {[](NicTeamingPolicy& p, auto&) { p.SetRollingRestoration(true); }, 0x20},
        {[](NicTeamingPolicy& p, auto&) { p.SetUplinkOrder({"pnet1", "pnet0"}); }, 0x10},
        {[](NicTeamingPolicy& p, auto&) { p.SetMaxActiveUplinks(1); }, 0x40},
    };
    NicTeamingPolicy all;
    for (auto const& c : cases) {
        NicTeamingPolicy one;
        c.set(one, beacon);
        EXPECT_EQ(c.bit, one.setMask);
        c.set(all, beacon);
    }
    EXPECT_EQ(0x7Du, all.setMask);
    EXPECT_EQ(TeamPolicyType::IpHash, all.teamPolicy);
    EXPECT_FALSE(all.notifySwitchOnFailure);
    EXPECT_TRUE(all.linkCriteria.IsBeaconDetection());
    EXPECT_TRUE(all.rollingRestoration);
    EXPECT_EQ((std::vector<std::string>{"pnet1", "pnet0"}), all.uplinkOrder);
    EXPECT_EQ(1, all.maxActiveUplinks);

    // UnsetAll forgets what is set, not the values.
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

TEST(PortSecurityAndShapingPolicyTest, EachSetterSetsItsBit) {
    PortSecurityPolicy security;
    security.SetAllowMacAddressChange(true);
    EXPECT_EQ(0x02u, security.setMask);
    EXPECT_TRUE(security.allowMacAddressChange);
    security.SetAllowPromiscuous(false);
    security.SetAllowForgedTransmits(true);
    EXPECT_EQ(0x07u, security.setMask);
    security.UnsetAll();
    EXPECT_EQ(0u, security.setMask);
    EXPECT_TRUE(security.allowForgedTransmits);

    ShapingPolicy shaping;
    shaping.SetPeakBps(2000);
    EXPECT_EQ(0x01u, shaping.setMask);
    shaping.SetAverageBps(1000);
    EXPECT_EQ(0x03u, shaping.setMask);
    shaping.SetBurstSize(128);
    EXPECT_EQ(0x07u, shaping.setMask);
    shaping.SetEnabled(true);
    EXPECT_EQ(0x0Fu, shaping.setMask);
    EXPECT_EQ(2000u, shaping.peakBps);
    EXPECT_EQ(1000u, shaping.averageBps);
    EXPECT_EQ(128u, shaping.burstSize);
    shaping.UnsetAll();
    EXPECT_EQ(0u, shaping.setMask);
    EXPECT_TRUE(shaping.enabled);
}

TEST(DefaultPolicyTest, ANewSwitchSetsEverySetting) {
    NicTeamingPolicy teaming = NicTeamingPolicy::GetDefaultPolicy();
    EXPECT_EQ(0x7Fu, teaming.setMask);
    EXPECT_EQ(TeamPolicyType::OriginatingPort, teaming.teamPolicy);
    EXPECT_FALSE(teaming.linkCriteria.IsBeaconDetection());
    EXPECT_TRUE(teaming.notifySwitchOnFailure);
    EXPECT_FALSE(teaming.rollingRestoration);
    EXPECT_TRUE(teaming.uplinkOrder.empty());
    EXPECT_EQ(0, teaming.maxActiveUplinks);

    PortSecurityPolicy security = PortSecurityPolicy::GetDefaultPolicy();
    EXPECT_EQ(0x07u, security.setMask);
    EXPECT_FALSE(security.allowPromiscuous || security.allowMacAddressChange ||
                 security.allowForgedTransmits);

    ShapingPolicy shaping = ShapingPolicy::GetDefaultPolicy();
    EXPECT_EQ(0x0Fu, shaping.setMask);
    EXPECT_FALSE(shaping.enabled);
    // In the units of the command line: 100000 Kbps and 102400 Kib.
    EXPECT_EQ(100000u, shaping.averageBps / 1000);
    EXPECT_EQ(100000u, shaping.peakBps / 1000);
    EXPECT_EQ(102400u, shaping.burstSize / 128);

    EXPECT_NE(NicCapabilities(), NicCapabilities::GetDefaultPolicy());
}
