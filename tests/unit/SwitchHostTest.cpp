// The simulated host's standard switches, port groups and uplinks: the bounds
// the host keeps, and how it resolves the policies in force. The refusals the
// commands pass on are proven in tests/cli/vswitch.test.sh.

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <sqlite3.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/PortGroup.h"
#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/JsonReader.h"
#include "util/OwnedVector"
#include "trellis/network/PortGroupImpl.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

using namespace SwitchTest;
using Gantry::Network::NetworkFactory;
using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Trellis::Network::VirtualSwitchInfoImpl;
using Names = std::vector<std::string>;

namespace {

std::unique_ptr<Gantry::Network::VirtualSwitch> SwitchNamed(const std::string& name) {
    return std::unique_ptr<Gantry::Network::VirtualSwitch>(NetworkFactory::GetVirtualSwitchById(name));
}

std::unique_ptr<Gantry::Network::PortGroup> GroupNamed(const std::string& name) {
    return std::unique_ptr<Gantry::Network::PortGroup>(NetworkFactory::GetPortGroupByName(name));
}

void AddSwitch(const std::string& name, int numPorts) {
    VirtualSwitchInfoImpl info;
    delete info.AddVirtualSwitchWithPolicy(NicTeamingPolicy::GetDefaultPolicy(), PortSecurityPolicy::GetDefaultPolicy(),
                                           ShapingPolicy::GetDefaultPolicy(),
                                           Gantry::Network::NicCapabilities::GetDefaultPolicy(), name, numPorts);
}

}  // namespace

TEST(SwitchHost, CreatingASwitchChecksItsNameAndThePortBudgetOfTheHost) {
    TempHost host;  // switch0 has 128 ports
    EXPECT_EQ(FailureOf([] { AddSwitch("", 64); }), "Unable to create a virtual switch: its name must not be empty");
    EXPECT_EQ(FailureOf([] { AddSwitch("sw\x1b", 64); }),
              "Unable to create virtual switch \"sw\\u001b\": its name contains the control character U+001B");
    EXPECT_EQ(FailureOf([] { AddSwitch("x", 0); }),
              "Unable to create virtual switch x: 0 is not a valid number of ports (1 to 4096)");
    EXPECT_EQ(FailureOf([] { AddSwitch("x", 4097); }),
              "Unable to create virtual switch x: 4097 is not a valid number of ports (1 to 4096)");
    AddSwitch("big", 4096);  // 4224 in all
    EXPECT_EQ(FailureOf([] { AddSwitch("x", 385); }),
              "Unable to create virtual switch x: its 385 ports and the 4224 ports already allocated exceed the "
              "host's limit of 4608");
    AddSwitch("last", 384);  // exactly 4608
    EXPECT_EQ(Section("standardSwitches").size(), 3u);
}

TEST(SwitchHost, ARemovedSwitchGoesWithItsGroupsAndFreesItsUplinks) {
    TempHost host([](TempHost::Json& d) {
        d["standardSwitches"].push_back(SwitchEntry("switch1", 64, {"pnet1"}));
        d["portGroups"].push_back(PortGroupEntry("Storage", "switch1", 20));
    });
    VirtualSwitchInfoImpl info;
    EXPECT_EQ(FailureOf([&] { info.RemoveVirtualSwitch("nosuch"); }), "Virtual switch nosuch does not exist");
    info.RemoveVirtualSwitch("switch1");
    EXPECT_FALSE(Trellis::Network::PortsetImpl::IsValidVirtualSwitch("switch1"));
    EXPECT_EQ(GroupNamed("Storage"), nullptr);
    SwitchNamed("switch0")->AddUplink("pnet1");  // free again
    EXPECT_EQ(Switch("switch0")["uplinks"], Json({"pnet0", "pnet1"}));
}

TEST(SwitchHost, GroupsAndPortsCountOnTheirOwnSwitchAsGroupsComeAndGo) {
    TempHost host;
    Trellis::Host::ImportScaledDefaultHost(3);
    auto groupsOf = [](const std::string& vswitch) {
        Trellis::Util::OwnedVector<Gantry::Network::PortGroup> groups(SwitchNamed(vswitch)->GetPortGroups());
        Names names;
        for (Gantry::Network::PortGroup* group : groups) names.push_back(group->GetName());
        return names;
    };
    auto activeClients = [](const std::string& group) {
        return dynamic_cast<Trellis::Network::PortGroupImpl&>(*GroupNamed(group)).GetActiveClients();
    };
    EXPECT_EQ(groupsOf("switch1"), Names({"Host Management-1", "Guest Network-1"}));
    EXPECT_EQ(SwitchNamed("switch1")->GetUsedPorts(), 4);  // an uplink and three clients
    EXPECT_EQ(activeClients("Guest Network-1"), 2);

    delete SwitchNamed("switch1")->AddPortGroup("Extra");
    EXPECT_EQ(groupsOf("switch1"), Names({"Host Management-1", "Guest Network-1", "Extra"}));
    EXPECT_EQ(groupsOf("switch2"), Names({"Host Management-2", "Guest Network-2"}));
    EXPECT_EQ(activeClients("Extra"), 0);
    SwitchNamed("switch1")->RemovePortGroup("Extra");
    EXPECT_EQ(groupsOf("switch1"), Names({"Host Management-1", "Guest Network-1"}));
}

TEST(SwitchHost, AnUplinkTakesAPortOfTheSwitch) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("tiny", 1)); });
    auto tiny = SwitchNamed("tiny");
    tiny->AddUplink("pnet1");
    EXPECT_EQ(tiny->GetUplinks(), Names{"pnet1"});  // the object sees its own change
    EXPECT_EQ(tiny->GetUsedPorts(), 1);
    EXPECT_EQ(FailureOf([&] { tiny->AddUplink("pnet2"); }),
              "Unable to add uplink pnet2 to virtual switch tiny: all 1 ports of the switch are in use");
    tiny->RemoveUplink("pnet1");
    EXPECT_EQ(Switch("tiny")["uplinks"], Json::array());
}

TEST(SwitchHost, APortGroupNeedsANameAndAVlanIdInRange) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64)); });
    auto switch1 = SwitchNamed("switch1");
    EXPECT_EQ(FailureOf([&] { delete switch1->AddPortGroup(""); }),
              "Unable to add port group  to virtual switch switch1: a port group name must not be empty");
    EXPECT_EQ(FailureOf([&] { delete switch1->AddPortGroup("bad\xff"); }),
              "Unable to add port group \"bad\\ufffd\" to virtual switch switch1: its name is not valid UTF-8");

    std::unique_ptr<Gantry::Network::PortGroup> storage(switch1->AddPortGroup("Storage"));
    EXPECT_EQ(storage->GetVirtualSwitchName(), "switch1");
    EXPECT_EQ(storage->GetVlanId(), 0);
    EXPECT_EQ(FailureOf([&] { storage->SetVlanId(4096); }),
              "Invalid VLAN ID 4096 for port group Storage: the VLAN ID must be from 0 to 4095");
    EXPECT_EQ(FailureOf([&] { storage->SetVlanId(-1); }),
              "Invalid VLAN ID -1 for port group Storage: the VLAN ID must be from 0 to 4095");
    storage->SetVlanId(4095);
    EXPECT_EQ(storage->GetVlanId(), 4095);
    EXPECT_EQ(PortGroup("Storage")["vlanId"], 4095);
    switch1->RemovePortGroup("Storage");
    EXPECT_EQ(GroupNamed("Storage"), nullptr);
    EXPECT_EQ(FailureOf([&] { storage->SetVlanId(1); }), "Port group Storage does not exist");
}

TEST(SwitchHost, MtuAndCdpStatusStayWithinWhatTheHostTakes) {
    TempHost host;
    auto switch0 = SwitchNamed("switch0");
    for (int mtu : {0, 1279, 9001})
        EXPECT_EQ(FailureOf([&] { switch0->SetMtu(mtu); }),
                  "Invalid MTU " + std::to_string(mtu) +
                      " for virtual switch switch0: the MTU must be from 1280 to 9000");
    switch0->SetMtu(9000);
    switch0->SetCdpStatus(Gantry::Network::CdpStatus::Both);
    EXPECT_EQ(switch0->GetMtu(), 9000);
    EXPECT_EQ(Switch("switch0")["mtu"], 9000);
    EXPECT_EQ(Switch("switch0")["cdpStatus"], "both");
}

TEST(SwitchHost, ASwitchTakesWhatItDoesNotSetFromTheHostDefault) {
    TempHost host([](TempHost::Json& d) {
        Json vswitch = SwitchEntry("partial", 64, {"pnet1", "pnet2"});
        vswitch["policy"]["teaming"] = {{"failureDetection", "beacon"}, {"uplinkOrder", {"pnet2"}}};
        vswitch["policy"]["shaping"] = {{"enabled", true}, {"averageBps", 5000}};
        d["standardSwitches"].push_back(vswitch);
    });
    auto vswitch = SwitchNamed("partial");
    NicTeamingPolicy teaming = vswitch->GetTeamingPolicy();
    EXPECT_EQ(teaming.teamPolicy, Gantry::Network::TeamPolicyType::OriginatingPort);  // the default
    EXPECT_TRUE(teaming.notifySwitchOnFailure);
    EXPECT_TRUE(teaming.linkCriteria.IsBeaconDetection());
    EXPECT_EQ(teaming.uplinkOrder, Names{"pnet2"});
    EXPECT_EQ(teaming.maxActiveUplinks, 0);
    EXPECT_EQ(teaming.setMask, NicTeamingPolicy::MASK_LINK_CRITERIA | NicTeamingPolicy::MASK_UPLINK_ORDER);

    ShapingPolicy shaping = vswitch->GetShapingPolicy();
    EXPECT_TRUE(shaping.enabled);
    EXPECT_EQ(shaping.averageBps, 5000u);
    EXPECT_EQ(shaping.peakBps, 100000000u);  // the default's 100000 Kbps
    EXPECT_EQ(shaping.setMask, ShapingPolicy::MASK_ENABLED | ShapingPolicy::MASK_AVERAGE_BPS);
    EXPECT_EQ(vswitch->GetSecurityPolicy().setMask, 0u);
    EXPECT_EQ(vswitch->GetBeaconRequiredBy(), Names{"partial"});

    // The local view: values in force, the stored mask.
    NicTeamingPolicy local = vswitch->GetLocalTeamingPolicy();
    EXPECT_EQ(local.setMask, teaming.setMask);
    EXPECT_TRUE(local.notifySwitchOnFailure);
}

TEST(SwitchHost, APortGroupOverridesOnlyWhatItSetsAndAnEmptyMaskFollowsItsSwitch) {
    TempHost host([](TempHost::Json& d) {
        d["portGroups"][1]["policy"] = {{"teaming", {{"loadBalancing", "iphash"}, {"failureDetection", "beacon"}}},
                                        {"security", {{"allowPromiscuous", true}}},
                                        {"shaping", Json::object()}};
    });
    auto guests = GroupNamed("Guest Network");
    NicTeamingPolicy teaming = guests->GetTeamingPolicy();
    EXPECT_EQ(teaming.teamPolicy, Gantry::Network::TeamPolicyType::IpHash);
    EXPECT_TRUE(teaming.linkCriteria.IsBeaconDetection());
    EXPECT_EQ(teaming.uplinkOrder, Names{"pnet0"});  // switch0's
    EXPECT_EQ(teaming.maxActiveUplinks, 1);
    EXPECT_EQ(guests->GetLocalTeamingPolicy().setMask,
              NicTeamingPolicy::MASK_TEAM_POLICY | NicTeamingPolicy::MASK_LINK_CRITERIA);
    EXPECT_EQ(guests->GetLocalTeamingPolicy().uplinkOrder, Names{"pnet0"});

    PortSecurityPolicy security = guests->GetSecurityPolicy();
    EXPECT_TRUE(security.allowPromiscuous);
    EXPECT_FALSE(security.allowForgedTransmits);
    EXPECT_EQ(guests->GetLocalSecurityPolicy().setMask, PortSecurityPolicy::MASK_PROMISCUOUS);

    // A group that sets nothing shows its switch's policies, and follows a change of them.
    auto management = GroupNamed("Host Management");
    EXPECT_EQ(management->GetLocalShapingPolicy().setMask, 0u);
    ShapingPolicy switchShaping = SwitchNamed("switch0")->GetShapingPolicy();
    switchShaping.SetEnabled(true);
    SwitchNamed("switch0")->ApplyShapingPolicy(switchShaping);
    EXPECT_TRUE(management->GetShapingPolicy().enabled);
    EXPECT_EQ(SwitchNamed("switch0")->GetBeaconRequiredBy(), Names{"Guest Network"});

    // Applying stores the set settings only, and a cleared mask follows the switch again.
    PortSecurityPolicy changed = guests->GetLocalSecurityPolicy();
    changed.SetAllowForgedTransmits(true);
    guests->ApplySecurityPolicy(changed);
    EXPECT_EQ(PortGroup("Guest Network")["policy"]["security"],
              Json({{"allowPromiscuous", true}, {"allowForgedTransmits", true}}));
    changed.UnsetAll();
    guests->ApplySecurityPolicy(changed);
    EXPECT_EQ(PortGroup("Guest Network")["policy"]["security"], Json::object());
    EXPECT_FALSE(GroupNamed("Guest Network")->GetSecurityPolicy().allowPromiscuous);
}

TEST(SwitchHost, ATeamingPolicyWithAnUnknownLoadBalancingOrABadUplinkNameIsRefused) {
    TempHost host;
    NicTeamingPolicy policy;
    policy.SetTeamingPolicy(static_cast<Gantry::Network::TeamPolicyType>(7));
    EXPECT_EQ(FailureOf([&] { SwitchNamed("switch0")->ApplyTeamingPolicy(policy); }),
              "Invalid load balancing policy 7 for virtual switch switch0");
    EXPECT_EQ(FailureOf([&] { GroupNamed("Guest Network")->ApplyTeamingPolicy(policy); }),
              "Invalid load balancing policy 7 for port group Guest Network");
    NicTeamingPolicy order;
    order.SetUplinkOrder({"pnet0", "pnet\x01"});
    EXPECT_EQ(FailureOf([&] { SwitchNamed("switch0")->ApplyTeamingPolicy(order); }),
              "Invalid uplink \"pnet\\u0001\" in the teaming policy of virtual switch switch0: its name contains the "
              "control character U+0001");
}

TEST(SwitchHost, TheDescriptionRefusesSwitchingThatCannotBe) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    struct Case {
        std::function<void(Json&)> edit;
        std::string refusal;
    };
    const std::vector<Case> cases = {
        {[](Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64, {"pnet0"})); },
         "standardSwitches[1].uplinks: \"pnet0\" is already an uplink of \"switch0\""},
        {[](Json& d) {
             d["standardSwitches"].push_back(SwitchEntry("switch1", 4096));
             d["standardSwitches"].push_back(SwitchEntry("switch2", 385));
         },
         "standardSwitches[2].numPorts: the switches have more than 4608 ports in all"},
        {[](Json& d) { d["portGroups"].push_back(PortGroupEntry("Guest Network", "switch0")); },
         "portGroups[2].name: duplicate port group \"Guest Network\""},
        {[](Json& d) { d["portGroups"][0]["vswitch"] = "nosuch"; },
         "portGroups[0].vswitch: no standard switch \"nosuch\""},
        {[](Json& d) { d["portGroups"][0]["policy"]["teaming"]["loadBalancing"] = "portid"; },
         "portGroups[0].policy.teaming.loadBalancing: expected \"iphash\", \"srcmac\", \"srcport\" or \"explicit\""},
        {[](Json& d) { d["ports"][1]["portGroup"] = "Storage"; },
         "ports[1].portGroup: no port group \"Storage\" on \"switch0\""},
        {[](Json& d) { d["standardSwitches"][0]["numPorts"] = 2; },
         "ports[2]: \"switch0\" has no free port left (2 ports)"},
    };
    for (const Case& c : cases) EXPECT_EQ(DescriptionRefusal(c.edit), c.refusal);
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(SwitchHost, AnOlderHostGetsTheDefaultSwitchingAndKeepsTheRest) {
    TempHost host;
    SwitchNamed("switch0")->SetMtu(9000);
    Trellis::Host::CloseHost();
    // The host as the version before switching was: no switching records.
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db,
                           "DELETE FROM records WHERE kind IN ('pnic', 'vswitch.standard', 'vswitch.portGroup', 'port');"
                           "UPDATE records SET data = json_set(data, '$.enabled', json('false')) WHERE kind = 'firewall';"
                           "PRAGMA user_version = 2;",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);

    host.Reopen();
    EXPECT_EQ(Switch("switch0")["mtu"], 1500);  // seeded from the default host
    EXPECT_EQ(Section("nics").size(), 7u);
    EXPECT_EQ(Section("ports").size(), 8u);
    EXPECT_EQ(Section("distributedSwitches").size(), 2u);
    EXPECT_EQ(Section("firewall")["enabled"], false);
}
