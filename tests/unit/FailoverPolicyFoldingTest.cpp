// Folding the failover parameters into a NIC teaming policy, on a host whose
// NICs are pnet0 to pnet4, against a present order of pnet0 and pnet1 active
// and pnet2 and pnet3 standby, with pnet4 not connected to the switch.

#include <gtest/gtest.h>

#include <algorithm>

#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTestInput.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Gantry::Network::NicTeamingPolicy;
using Names = std::vector<std::string>;

namespace {

// The default host, its NICs completed to pnet0 to pnet4 with copies of its first.
std::string HostWithNics() {
    return TempHost::Edited([](TempHost::Json& d) {
        TempHost::Json nics = d["nics"];
        for (int i = 0; i < 5; ++i) {
            std::string name = "pnet" + std::to_string(i);
            auto named = [&name](TempHost::Json const& nic) { return nic["name"] == name; };
            if (std::any_of(nics.begin(), nics.end(), named)) continue;
            TempHost::Json nic = d["nics"][0];
            nic["name"] = name;
            nic["macAddress"] = "00:50:56:00:00:1" + std::to_string(i);
            nics.push_back(nic);
        }
        d["nics"] = nics;
    });
}

NicTeamingPolicy PresentPolicy() {
    NicTeamingPolicy reference = NicTeamingPolicy::GetDefaultPolicy();
    reference.SetUplinkOrder({"pnet0", "pnet1", "pnet2", "pnet3"});
    reference.SetMaxActiveUplinks(2);
    return reference;
}

struct Folded {
    NicTeamingPolicy policy;
    NicTeamingPolicy reference;
    Names errors;
};

Folded Fold(Names const& words, NicTeamingPolicy policy = NicTeamingPolicy(),
            NicTeamingPolicy reference = PresentPolicy()) {
    boost::shared_ptr<Plinth::CallSpec::Output> output = Plinth::CallSpec::Output::New();
    SetFailoverPolicy(ParsePolicyWords(AddFailoverParameters, words), output, policy, reference,
                      {"pnet0", "pnet1", "pnet2", "pnet3"});
    return {policy, reference, output->GetErrors()};
}

class FailoverFolding : public ::testing::Test {
protected:
    TempHost host_{HostWithNics()};
};

}  // namespace

TEST_F(FailoverFolding, SingleSettingsSetTheirValueAndBit) {
    EXPECT_EQ(Gantry::Network::TeamPolicyType::OriginatingPort, Fold({"-l", "portid"}).policy.teamPolicy);
    EXPECT_EQ(Gantry::Network::TeamPolicyType::IpHash, Fold({"-l", "iphash"}).policy.teamPolicy);
    EXPECT_EQ(Gantry::Network::TeamPolicyType::SourceMac, Fold({"-l", "mac"}).policy.teamPolicy);
    EXPECT_EQ(Gantry::Network::TeamPolicyType::ExplicitOrder, Fold({"-l", "explicit"}).policy.teamPolicy);
    EXPECT_EQ(NicTeamingPolicy::MASK_TEAM_POLICY, Fold({"-l", "mac"}).policy.setMask);

    // "link" goes to SetBeacon(true), "beacon" to SetBeacon(false).
    Folded link = Fold({"--failure-detection=link"});
    EXPECT_EQ(0x10u, link.policy.linkCriteria.criteriaValue);
    EXPECT_EQ(NicTeamingPolicy::MASK_LINK_CRITERIA, link.policy.setMask);
    EXPECT_TRUE(Fold({"-f", "beacon"}).policy.linkCriteria.IsBeaconDetection());

    // Failback is the negation of rolling restoration.
    Folded failback = Fold({"--failback=true", "--notify-switches=true"});
    EXPECT_FALSE(failback.policy.rollingRestoration);
    EXPECT_TRUE(failback.policy.notifySwitchOnFailure);
    EXPECT_EQ(NicTeamingPolicy::MASK_ROLLING_RESTORATION | NicTeamingPolicy::MASK_NOTIFY_SWITCH,
              failback.policy.setMask);
    EXPECT_TRUE(Fold({"-b", "false"}).policy.rollingRestoration);

    // Without a list the uplinks of both policies stay as they were.
    NicTeamingPolicy local;
    local.SetUplinkOrder({"pnet3"});
    Folded unlisted = Fold({"-n", "false"}, local);
    EXPECT_EQ(Names{"pnet3"}, unlisted.policy.uplinkOrder);
    EXPECT_EQ(NicTeamingPolicy::MASK_UPLINK_ORDER | NicTeamingPolicy::MASK_NOTIFY_SWITCH, unlisted.policy.setMask);
    EXPECT_EQ(PresentPolicy(), unlisted.reference);
    EXPECT_EQ(Names{}, unlisted.errors);
}

TEST_F(FailoverFolding, UplinkListsFoldIntoThePresentOrder) {
    struct Case {
        Names words;
        Names order;
        int policyActive;
        int referenceActive;
        Names errors;
    };
    const Case cases[] = {
        // Active alone: the present standby names that are not now active follow.
        {{"-a", "pnet1"}, {"pnet1", "pnet2", "pnet3"}, 1, 1, {}},
        {{"-a", "pnet3,pnet2"}, {"pnet3", "pnet2"}, 2, 2, {}},
        {{"--active-uplinks="}, {"pnet2", "pnet3"}, 0, 0, {}},
        // Standby alone: the present active names that are not now standby
        // stay in front; only the policy's count follows.
        {{"-s", "pnet0,pnet3"}, {"pnet1", "pnet0", "pnet3"}, 1, 2, {}},
        {{"-s", "pnet1,pnet0"}, {"pnet1", "pnet0"}, 0, 2, {}},
        {{"-s", "pnet2"}, {"pnet0", "pnet1", "pnet2"}, 2, 2, {}},
        // Both: the order as typed.
        {{"-a", "pnet2,pnet0", "-s", "pnet3"}, {"pnet2", "pnet0", "pnet3"}, 2, 2, {}},
        {{"-a", "pnet3", "--standby-uplinks="}, {"pnet3"}, 1, 1, {}},
        // Rejected names are left out, the walk goes on, and only the names
        // that passed count as active. No blank is trimmed.
        {{"-a", "pnet9,pnet4,pnet2,,pnet3"}, {"pnet2", "pnet3"}, 2, 2,
         {"Unknown NIC name in active uplinks : pnet9", "NIC is not connected to the vswitch : pnet4",
          "Unknown NIC name in active uplinks : "}},
        {{"--active-uplinks=pnet0, pnet1"}, {"pnet0", "pnet2", "pnet3"}, 1, 1,
         {"Unknown NIC name in active uplinks :  pnet1"}},
        {{"-s", "pnet4,PNET2,pnet3"}, {"pnet0", "pnet1", "pnet3"}, 2, 2,
         {"NIC is not connected to the vswitch : pnet4", "Unknown NIC name in standby uplinks : PNET2"}},
    };
    for (Case const& c : cases) {
        std::string words = ::testing::PrintToString(c.words);
        Folded run = Fold(c.words);
        EXPECT_EQ(c.order, run.policy.uplinkOrder) << words;
        EXPECT_EQ(c.policyActive, run.policy.maxActiveUplinks) << words;
        EXPECT_EQ(c.referenceActive, run.reference.maxActiveUplinks) << words;
        EXPECT_EQ(c.errors, run.errors) << words;
        EXPECT_EQ(NicTeamingPolicy::MASK_UPLINK_ORDER | NicTeamingPolicy::MASK_MAX_ACTIVE_UPLINKS,
                  run.policy.setMask) << words;
    }

    // With the whole present order active there is no standby part to keep.
    NicTeamingPolicy allActive = PresentPolicy();
    allActive.SetMaxActiveUplinks(4);
    EXPECT_EQ(Names{"pnet2"}, Fold({"-a", "pnet2"}, NicTeamingPolicy(), allActive).policy.uplinkOrder);
}

TEST_F(FailoverFolding, ANameGivenTwiceLeavesTheOrderAsItWas) {
    NicTeamingPolicy local;
    local.SetUplinkOrder({"pnet1", "pnet2"});
    for (Names const& words : {Names{"-a", "pnet0,pnet0"}, Names{"-a", "pnet0", "-s", "pnet0"},
                               Names{"-s", "pnet3,pnet2,pnet3"}, Names{"-a", "pnet2,pnet1", "-s", "pnet3,pnet1"}}) {
        Folded run = Fold(words, local);
        EXPECT_EQ(Names{"some NICs appear in the input for more than once."}, run.errors) << words[1];
        EXPECT_EQ((Names{"pnet1", "pnet2"}), run.policy.uplinkOrder) << words[1];
    }
    // The active count is set before the duplicate test.
    EXPECT_EQ(2, Fold({"-a", "pnet0,pnet0"}, local).policy.maxActiveUplinks);
}

TEST_F(FailoverFolding, AHostFailureWhileCheckingANamePassesOut) {
    Trellis::Host::ArmFault({"PnicImpl::IsValidPnic", "Host is not responding", 0, {}});
    EXPECT_THROW(Fold({"-a", "pnet0"}), Gantry::Lib::GantryException);
    EXPECT_NO_THROW(Fold({"-l", "mac"}));  // without a list the host is not asked
}
