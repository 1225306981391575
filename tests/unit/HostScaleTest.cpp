// A host N times the default's size (haldensim init --scale N): what is
// copied and how it is named, that every copy's references resolve within it
// (its export imports again), and that the host's port limit holds.

#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include "TempHost.h"
#include "host/description/DescriptionIo.h"
#include "host/description/ScaledDescription.h"
#include "trellis/host/Description.h"

using namespace Trellis::Host;
using Json = TempHost::Json;

namespace {

const Json& Named(const Json& entries, const std::string& name) {
    for (const Json& entry : entries)
        if (entry["name"] == name) return entry;
    throw std::out_of_range("nothing named " + name);
}

}  // namespace

TEST(HostScale, ScaleOneIsTheDefaultHostAndAScaleOutsideTheRangeChangesNothing) {
    TempHost host([](Json& d) { d["firewall"]["enabled"] = false; });
    const std::string before = ExportHost();
    EXPECT_THROW(ImportScaledDefaultHost(0), std::invalid_argument);
    EXPECT_THROW(ImportScaledDefaultHost(kMaxHostScale + 1), std::invalid_argument);
    EXPECT_EQ(ExportHost(), before);
    ImportScaledDefaultHost(1);
    EXPECT_EQ(ExportHost(), kDefaultHostDescription);
}

TEST(HostScale, EachCopyIsTheDefaultHostRenamedWithItsReferencesWithinIt) {
    TempHost host;
    ImportScaledDefaultHost(3);
    const Json scaled = Json::parse(ExportHost());
    const Json original = Json::parse(kDefaultHostDescription);

    EXPECT_EQ(scaled["modules"], original["modules"]);
    for (const char* single : {"enabled", "defaultAction", "rulesetsLoaded", "dynamicRules"})
        EXPECT_EQ(scaled["firewall"][single], original["firewall"][single]) << single;
    EXPECT_EQ(scaled["firewall"]["rulesets"].size(), 3 * original["firewall"]["rulesets"].size());
    EXPECT_EQ(scaled["nics"].size(), 21u);
    EXPECT_EQ(scaled["standardSwitches"].size(), 3u);
    EXPECT_EQ(scaled["portGroups"].size(), 6u);
    EXPECT_EQ(scaled["distributedSwitches"].size(), 6u);
    EXPECT_EQ(scaled["worlds"].size(), 15u);
    EXPECT_EQ(scaled["ports"].size(), 24u);

    // Copy 2: numbered names move past the default's, the others take a suffix.
    Json ruleset = Named(original["firewall"]["rulesets"], "webAccess");
    ruleset["name"] = "webAccess-2";
    EXPECT_EQ(Named(scaled["firewall"]["rulesets"], "webAccess-2"), ruleset);
    // A NIC's address and its virtual function's VM are the copy's own.
    Json nic = Named(original["nics"], "pnet1");
    nic["name"] = "pnet15";
    nic["macAddress"] = "a0:36:9f:1c:30:41";
    nic["sriov"]["virtualFunctions"][0]["ownerWorldId"] = std::to_string(Named(scaled["worlds"], "web03")["id"].get<int>());
    EXPECT_EQ(Named(scaled["nics"], "pnet15"), nic);
    const Json& vswitch = Named(scaled["standardSwitches"], "switch2");
    EXPECT_EQ(vswitch["uplinks"], Json({"pnet14"}));
    EXPECT_EQ(vswitch["policy"]["teaming"]["uplinkOrder"], Json({"pnet14"}));
    EXPECT_EQ(vswitch["numPorts"], 128);  // three times 128 is within the host's limit
    EXPECT_EQ(Named(scaled["portGroups"], "Guest Network-2")["vswitch"], "switch2");
    const Json& interfacePort = scaled["ports"][17];
    EXPECT_EQ(interfacePort["id"], 33554436 + 2 * 18);
    EXPECT_EQ(interfacePort["portGroup"], "Host Management-2");
    EXPECT_EQ(interfacePort["clientName"], "tsl2");
    // A VM's adapter on a distributed switch: its switch, world, NIC and
    // address are the copy's own.
    const Json& adapterPort = scaled["ports"][23];
    const Json& world = Named(scaled["worlds"], "web03");
    EXPECT_EQ(adapterPort["portset"], "dvSwitch4");
    EXPECT_EQ(adapterPort["clientName"], world["name"].get<std::string>() + ".eth1");
    EXPECT_EQ(adapterPort["worldId"], world["id"]);
    EXPECT_EQ(adapterPort["teamUplink"], "pnet18");
    EXPECT_EQ(adapterPort["macAddresses"], Json({"00:50:56:a1:02:03"}));
    const Json& dvs = Named(scaled["distributedSwitches"], "dvSwitch4");
    EXPECT_EQ(dvs["lacpGroups"][0]["nics"][0]["name"], "pnet18");
    EXPECT_NE(dvs["id"], Named(scaled["distributedSwitches"], "dvSwitch0")["id"]);

    const std::string exported = ExportHost();
    ImportHost(exported);
    EXPECT_EQ(ExportHost(), exported);
}

// ParseDescription refuses more than 4608 configured ports in all and a
// switch with more ports in use than it has.
TEST(HostScale, TheLargestHostKeepsThePortLimitAndEverySwitchItsUsedPorts) {
    const Json scaled = ScaledDescription(DefaultDescription(), kMaxHostScale);
    ParseDescription(scaled);
    EXPECT_EQ(scaled["standardSwitches"].size(), static_cast<std::size_t>(kMaxHostScale));
    EXPECT_EQ(Named(scaled["standardSwitches"], "switch0")["numPorts"], 128);
}

TEST(HostScale, ASwitchThatUsesMoreThanItsShareKeepsWhatItUses) {
    // switch0 takes nearly all of the host's ports; busy has 30 of its 40 in use.
    Json original = Json::parse(TempHost::Edited([](Json& d) {
        d["standardSwitches"][0]["numPorts"] = 4096;
        d["standardSwitches"].push_back({{"name", "busy"}, {"numPorts", 40}, {"mtu", 1500}, {"cdpStatus", "listen"},
                                         {"beacon", {{"enabled", false}, {"interval", 1}, {"threshold", 3}}},
                                         {"uplinks", Json::array()}});
        d["portGroups"].push_back({{"name", "Crowd"}, {"vswitch", "busy"}, {"vlanId", 0}});
        for (int i = 0; i < 30; ++i)
            d["ports"].push_back({{"id", 100 + i}, {"portset", "busy"}, {"portGroup", "Crowd"},
                                  {"clientKind", "tesselNic"}, {"clientName", "tsl" + std::to_string(10 + i)}});
    }));
    Json scaled = ScaledDescription(original, 5);
    ParseDescription(scaled);
    EXPECT_EQ(Named(scaled["standardSwitches"], "busy-4")["numPorts"], 30);
    EXPECT_GT(Named(scaled["standardSwitches"], "switch4")["numPorts"], 3);
}
