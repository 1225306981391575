// The host side of kernel interfaces: what creating one checks and takes,
// the IP settings the host refuses, what is in force under DHCP and router
// advertisements, removal, and what a description may hold.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <sqlite3.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"
#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/PortGroupImpl.h"
#include "trellis/network/TesselNicInfoImpl.h"
#include "trellis/network/TslNicImpl.h"
#include "util/OwnedVector"

using namespace SwitchTest;
using Gantry::Network::IpConfig;
using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv6Network;
using Gantry::Network::MacAddress;
using Gantry::Network::TslNic;

namespace {

const std::string kDvsId = "50 2f 8c 1a 3e 77 4b 90-a1 0c 5d e2 7f 33 91 04";

std::unique_ptr<TslNic> Add(Gantry::Network::ConnectionPoint& point, const std::string& name = "",
                            const std::string& netstack = "defaultTcpipStack", MacAddress mac = MacAddress(),
                            unsigned int mtu = 0) {
    return std::unique_ptr<TslNic>(
        Trellis::Network::TesselNicInfoImpl().AddTesselNic(&point, netstack, IpConfig(), mac, 0, mtu, name));
}

std::unique_ptr<TslNic> Nic(const std::string& name) {
    return std::unique_ptr<TslNic>(Trellis::Network::TesselNicInfoImpl().GetTesselNicByInterface(name, false));
}

IpConfig Static(const std::string& address, const std::string& netmask) {
    IpConfig config;
    config.SetIpv4Address(Ipv4Address(address));
    config.SetIpv4Netmask(Ipv4Address(netmask));
    return config;
}

int UsedPorts(const std::string& dvs) {
    return Trellis::Network::DVSwitchImpl(dvs, Gantry::Network::Portset::DEF_NUM_PORTS).GetUsedPorts();
}

}  // namespace

TEST(TslNicHost, AnInterfaceTakesAPortOnItsPointAndTheHostRefusesWhatCannotBe) {
    TempHost host;
    Trellis::Network::PortGroupImpl guests("Guest Network");
    std::unique_ptr<TslNic> tsl1 = Add(guests);
    EXPECT_EQ(tsl1->GetName(), "tsl1");  // the lowest free name
    EXPECT_EQ(tsl1->GetMacAddress().GetStringAddress(), "00:50:56:6e:00:00");
    EXPECT_EQ(tsl1->GetMtu(), 1500);
    EXPECT_EQ(std::unique_ptr<Gantry::Network::Port>(tsl1->GetPort())->GetPortId(), 33554452);
    EXPECT_EQ(guests.GetActiveClients(), 3);

    Trellis::Network::DVPortImpl free({kDvsId, "3", 0});
    EXPECT_EQ(UsedPorts("dvSwitch0"), 4);
    std::unique_ptr<TslNic> onDvPort = Add(free, "tsl7", "defaultTcpipStack", MacAddress("00:50:56:aa:bb:cc"), 9000);
    EXPECT_EQ(UsedPorts("dvSwitch0"), 5);
    std::unique_ptr<Gantry::Network::ConnectionPoint> point(onDvPort->GetConnectionPoint());
    EXPECT_EQ(point->GetType(), Gantry::Network::ConnectionPoint::TYPE_DVPORT);
    EXPECT_EQ(point->GetPortsetName(), "dvSwitch0");

    Trellis::Network::DVPortImpl busy({kDvsId, "0", 0});
    Trellis::Network::DVPortImpl uplink({kDvsId, "8", 0});
    EXPECT_EQ(FailureOf([&] { Add(busy); }), "Unable to add interface tsl2: DVPort 0 of dvSwitch0 is in use by web01.eth1");
    EXPECT_EQ(FailureOf([&] { Add(uplink); }), "Unable to add interface tsl2: DVPort 8 of dvSwitch0 is an uplink port");
    EXPECT_EQ(FailureOf([&] { Add(guests, "tsl7"); }), "Unable to add interface tsl7: an interface of that name exists already");
    EXPECT_EQ(FailureOf([&] { Add(guests, "eth0"); }), "Unable to add interface eth0: an interface is named tsl0 to tsl255");
    EXPECT_EQ(FailureOf([&] { Add(guests, "", "glide"); }),
              "Unable to add interface tsl2: there is no netstack instance glide");
    EXPECT_EQ(FailureOf([&] { Add(guests, "", "defaultTcpipStack", MacAddress("00:50:56:aa:bb:cc")); }),
              "Unable to add interface tsl2: interface tsl7 has the MAC address 00:50:56:aa:bb:cc");
    EXPECT_EQ(FailureOf([&] { Add(guests, "", "defaultTcpipStack", MacAddress(), 1279); }),
              "Unable to add interface tsl2: the MTU 1279 is outside 1280 to 9000");

    // Removal frees the port, by name or by point.
    tsl1->Remove();
    EXPECT_EQ(guests.GetActiveClients(), 2);
    Trellis::Network::TesselNicInfoImpl().RemoveTesselNic(&free, "defaultTcpipStack");
    EXPECT_EQ(UsedPorts("dvSwitch0"), 4);
    EXPECT_EQ(Nic("tsl7"), nullptr);
    EXPECT_EQ(FailureOf([&] { Trellis::Network::TesselNicInfoImpl().RemoveTesselNic(&free, "defaultTcpipStack"); }),
              "Unable to remove an interface: no interface of netstack defaultTcpipStack is attached to DVPort 3 of "
              "dvSwitch0");
}

TEST(TslNicHost, AFullSwitchTakesNoInterface) {
    TempHost host([](Json& d) { d["standardSwitches"][0]["numPorts"] = 4; });  // an uplink and three clients
    Trellis::Network::PortGroupImpl guests("Guest Network");
    EXPECT_EQ(FailureOf([&] { Add(guests); }), "Unable to add interface tsl1: all 4 ports of switch0 are in use");
    EXPECT_EQ(Nic("tsl1"), nullptr);
}

TEST(TslNicHost, TheHostRefusesAddressesAnInterfaceCannotHaveAndShowsWhatIsInForce) {
    TempHost host;
    Trellis::Network::PortGroupImpl guests("Guest Network");
    std::unique_ptr<TslNic> nic = Add(guests);
    struct Case {
        std::string address, netmask, refusal;
    };
    const std::vector<Case> cases = {
        {"192.0.2.50", "255.0.255.0", "Invalid IPv4 netmask 255.0.255.0 for interface tsl1: a netmask is a run of one bits from the left, at least one"},
        {"0.0.0.0", "255.255.255.0", "Invalid IPv4 address 0.0.0.0 for interface tsl1: it is the unspecified address"},
        {"127.0.0.2", "255.0.0.0", "Invalid IPv4 address 127.0.0.2 for interface tsl1: it is a loopback address"},
        {"224.1.2.3", "255.255.255.0", "Invalid IPv4 address 224.1.2.3 for interface tsl1: it is a multicast address"},
        {"198.51.100.0", "255.255.255.0", "Invalid IPv4 address 198.51.100.0 for interface tsl1: it is the address of its network"},
        {"198.51.100.255", "255.255.255.0", "Invalid IPv4 address 198.51.100.255 for interface tsl1: it is the broadcast address of its network"},
        {"192.0.2.10", "255.255.255.0", "Invalid IPv4 address 192.0.2.10 for interface tsl1: interface tsl0 of netstack defaultTcpipStack has it already"},
    };
    for (const Case& c : cases) EXPECT_EQ(FailureOf([&] { nic->SetIpConfig(Static(c.address, c.netmask)); }), c.refusal);
    IpConfig zoned = nic->GetIpConfig();
    zoned.AddIpv6Network(Ipv6Network("2001:db8::10/64"));
    EXPECT_EQ(FailureOf([&] { nic->SetIpConfig(zoned); }),
              "Invalid IPv6 address 2001:db8::10/64 for interface tsl1: interface tsl0 of netstack defaultTcpipStack has it already");
    EXPECT_EQ(nic->GetIpConfig(), IpConfig());  // nothing was taken

    IpConfig dhcp;
    dhcp.SetUseDhcp(true);
    dhcp.SetUseIpv6RouterAdvertised(true);
    dhcp.SetUseIpv6Dhcp(true);
    dhcp.AddIpv6Network(Ipv6Network("2001:db8:5::1/48"));
    nic->SetIpConfig(dhcp);
    IpConfig inForce = nic->GetIpConfig();
    EXPECT_EQ(inForce.GetIpv4Address().GetStringAddress(), "203.0.113.11");
    EXPECT_EQ(inForce.GetIpv4Broadcast().GetStringAddress(), "203.0.113.255");
    EXPECT_EQ(nic->GetConfiguredIpConfig().GetIpv4Address().GetStringAddress(), "0.0.0.0");
    std::vector<std::string> addresses;
    for (const Ipv6Network& network : inForce.GetIpv6Network())
        addresses.push_back(network.GetStringAddress() + " " + std::to_string(network.GetIpv6AddressType()));
    EXPECT_EQ(addresses, (std::vector<std::string>{"2001:db8:5::1/48 0", "2001:db8:0:1:250:56ff:fe6e:0/64 7",
                                                   "2001:db8:0:2::2/64 9"}));
    // Handed back whole, the addresses the host obtained itself are not kept as static ones.
    nic->SetIpConfig(inForce);
    EXPECT_EQ(nic->GetConfiguredIpConfig().GetIpv6Network().size(), 1u);
    // The interface's port shows the address in force.
    for (const Json& port : Section("ports"))
        if (port["clientName"] == "tsl1") EXPECT_EQ(port["ipv4Address"], "203.0.113.11");
}

TEST(TslNicHost, TagsAndTheNetstackStateAsTheHostKeepsThem) {
    TempHost host([](Json& d) { d["netstacks"].push_back({{"key", "glide"}, {"inKernel", false}, {"maxConnections", 11000},
                                                          {"congestionControl", "newreno"}, {"ipv6Enabled", true}}); });
    std::unique_ptr<Gantry::Network::NetworkInfo> info(Gantry::Network::NetworkFactory::GetNetworkInfo());
    EXPECT_EQ(info->GetNetstackInstanceState("defaultTcpipStack"), 4660);
    EXPECT_EQ(info->GetNetstackInstanceState("glide"), 0);
    EXPECT_EQ(info->GetNetstackInstanceState("nosuch"), 0);

    std::unique_ptr<TslNic> tsl0 = Nic("tsl0");
    tsl0->AddTag(Gantry::Network::TSLNIC_TAG_GLIDE, false);
    tsl0->AddTag(Gantry::Network::TSLNIC_TAG_GLIDE, false);
    EXPECT_EQ(Nic("tsl0")->GetTags(), (std::vector<Gantry::Network::TslNicTagType>{
                                          Gantry::Network::TSLNIC_TAG_MANAGEMENT, Gantry::Network::TSLNIC_TAG_GLIDE}));
    tsl0->RemoveTag(Gantry::Network::TSLNIC_TAG_MANAGEMENT);
    EXPECT_EQ(FailureOf([&] { tsl0->RemoveTag(Gantry::Network::TSLNIC_TAG_MANAGEMENT); }),
              "Interface tsl0 does not carry the tag Management");
    EXPECT_EQ(FailureOf([&] { tsl0->SetMtu(0); }), "Invalid MTU 0 for interface tsl0: the MTU must be from 1280 to 9000");
}

TEST(TslNicHost, TheDescriptionRefusesInterfacesThatCannotBe) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    struct Case {
        std::function<void(Json&)> edit;
        std::string refusal;
    };
    const std::vector<Case> cases = {
        {[](Json& d) { d["tesselNics"][0]["netstack"] = "glide"; },
         "netstacks[0].routing: no interface \"tsl0\" in \"defaultTcpipStack\""},
        {[](Json& d) {
             d["tesselNics"][0]["netstack"] = "glide";
             d["netstacks"][0].erase("routing");
         },
         "tesselNics[0].netstack: no netstack \"glide\""},
        {[](Json& d) { d["tesselNics"][0]["name"] = "tsl256"; }, "tesselNics[0].name: expected tsl0 to tsl255"},
        {[](Json& d) { d["tesselNics"][0]["connectionPoint"] = {{"portGroup", "Guest Network"}}; },
         "tesselNics[0].connectionPoint: no port of \"tsl0\" in \"Guest Network\" (section ports)"},
        {[](Json& d) { d["tesselNics"][0].erase("connectionPoint"); },
         "tesselNics[0].connectionPoint: \"tsl0\" has a port on \"switch0\" but no connection point there"},
        {[](Json& d) {
             Json copy = d["tesselNics"][0];
             copy["name"] = "tsl1";
             copy["macAddress"] = "00:50:56:00:00:01";
             copy.erase("connectionPoint");
             d["tesselNics"].push_back(copy);
         },
         "tesselNics[1].ipv4: interface tsl0 of netstack defaultTcpipStack has the address 192.0.2.10 already"},
    };
    for (const Case& c : cases) EXPECT_EQ(DescriptionRefusal(c.edit), c.refusal);
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(TslNicHost, AnOlderHostGetsTheDefaultNetstacksAndTheInterfaceOfItsPort) {
    TempHost host;
    Trellis::Host::CloseHost();
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db, "DELETE FROM records WHERE kind IN ('tslnic', 'netstack'); PRAGMA user_version = 5;",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    host.Reopen();
    EXPECT_EQ(Section("netstacks").size(), 1u);
    EXPECT_EQ(Section("tesselNics"), Json::parse(TempHost::Edited([](Json&) {}))["tesselNics"]);
}
