// The address value types: which texts they take, how they print them, and
// the IP settings of an interface built from them.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "FailureOf.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"
#include "gantry/network/MacAddress.h"

using namespace Gantry::Network;

namespace {

// Texts that are none of the accepted forms of their type.
void ExpectRefused(std::vector<std::string> const& texts, bool (*isValid)(std::string const&)) {
    for (auto const& text : texts)
        EXPECT_FALSE(isValid(text)) << "accepted: '" << text << "'";
}

}  // namespace

TEST(Ipv4AddressTest, AcceptsDottedQuadsAndPrintsThemBack) {
    for (std::string text : {"0.0.0.0", "192.0.2.1", "255.255.255.255", "10.0.0.0", "1.2.3.4"}) {
        ASSERT_TRUE(Ipv4Address::IsValidAddress(text)) << text;
        EXPECT_EQ(text, Ipv4Address(text).GetStringAddress());
    }
    EXPECT_EQ(0xC0000201u, Ipv4Address("192.0.2.1").GetValue());
    EXPECT_EQ("192.0.2.1", Ipv4Address(0xC0000201u).GetStringAddress());
}

TEST(Ipv4AddressTest, RefusesEverythingElse) {
    ExpectRefused({"", "300.1.2.3", "256.0.0.1", "1.2.3.256", "01.2.3.4", "1.2.3.04", "1.2.3",
                   "10.1", "1", "1.2.3.4.5", "1.2.3.", ".1.2.3", "1..2.3", " 1.2.3.4",
                   "1.2.3.4 ", "1.2.3.4/24", "0x1.2.3.4", "1.2.3.-4", "a.b.c.d", "::1",
                   std::string("1.2.3.4\0junk", 12)},
                  &Ipv4Address::IsValidAddress);
    EXPECT_EQ("Invalid IPv4 address: 300.1.2.3", FailureOf([] { Ipv4Address("300.1.2.3"); }));
}

TEST(Ipv6AddressTest, AcceptsEveryStandardFormAndPrintsCanonically) {
    struct Case {
        std::string text;
        std::string canonical;
    };
    std::vector<Case> cases = {
        {"::", "::"},
        {"::1", "::1"},
        {"0:0:0:0:0:0:0:0", "::"},
        {"2001:DB8::A", "2001:db8::a"},
        {"2001:0db8:0000:0000:0000:0000:0000:0001", "2001:db8::1"},
        {"2001:db8:0:0:1:0:0:1", "2001:db8::1:0:0:1"},  // first of two equal runs
        {"1:0:0:2:0:0:0:3", "1:0:0:2::3"},              // the longest run
        {"2001:db8:0:1:1:1:1:1", "2001:db8:0:1:1:1:1:1"},  // one zero group stays
        {"1:2:3:4:5:6:7::", "1:2:3:4:5:6:7:0"},
        {"fe80::1", "fe80::1"},
        {"::ffff:192.0.2.1", "::ffff:192.0.2.1"},
        {"::FFFF:c000:0201", "::ffff:192.0.2.1"},
        {"64:ff9b::192.0.2.1", "64:ff9b::c000:201"},
        // No dotted form for an address that is not IPv4-mapped.
        {"::1:2", "::1:2"},
        {"::1.2.3.4", "::102:304"},
        {"::0.0.0.2", "::2"},
    };
    for (auto const& c : cases) {
        ASSERT_TRUE(Ipv6Address::IsValidAddress(c.text)) << c.text;
        EXPECT_EQ(c.canonical, Ipv6Address(c.text).GetStringAddress()) << c.text;
    }
}

TEST(Ipv6AddressTest, RefusesEverythingElse) {
    ExpectRefused({"", ":", ":::", "1:2:3:4:5:6:7:8:9", "1:2:3:4:5:6:7", "1::2::3", "12345::",
                   "g::1", "fe80::1%eth0", "[::1]", " ::1", "::1 ", "::1/128", "::ffff:1.2.3",
                   "::ffff:1.2.3.256", "::ffff:01.2.3.4", "1.2.3.4", "-::1"},
                  &Ipv6Address::IsValidAddress);
    EXPECT_EQ("Invalid IPv6 address: fe80::1%eth0", FailureOf([] { Ipv6Address("fe80::1%eth0"); }));
}

TEST(IpAddressTest, EmptyValuesAndFamilies) {
    EXPECT_EQ("0.0.0.0", Ipv4Address().GetStringAddress());
    EXPECT_EQ("::", Ipv6Address().GetStringAddress());
    EXPECT_TRUE(Ipv6Address().IsUnset());
    EXPECT_FALSE(Ipv6Address("::1").IsUnset());

    // The base takes either family; the IPv4 reading wins where both could.
    EXPECT_TRUE(IpAddress("192.0.2.1").IsIpv4());
    EXPECT_TRUE(IpAddress("::ffff:192.0.2.1").IsIpv6());
    EXPECT_EQ("Invalid IP address: nonsense", FailureOf([] { IpAddress("nonsense"); }));

    // Equal bytes of different families are different addresses.
    EXPECT_NE(static_cast<IpAddress>(Ipv4Address()), static_cast<IpAddress>(Ipv6Address()));
    EXPECT_EQ(Ipv6Address("2001:db8::1"), Ipv6Address("2001:DB8:0::0:1"));

    // A copy through the base keeps the family and the text.
    IpAddress copy = Ipv6Address("2001:db8::1");
    EXPECT_EQ("2001:db8::1", copy.GetStringAddress());
}

TEST(Ipv4NetworkTest, ParsesPrefixBoundsAndMasksHostBits) {
    Ipv4Network all("0.0.0.0/0");
    EXPECT_EQ("0.0.0.0", all.GetNetmask().GetStringAddress());
    EXPECT_EQ(Ipv4Network(), all);

    Ipv4Network host("192.0.2.7/32");
    EXPECT_EQ("192.0.2.7/32", host.GetStringAddress());
    EXPECT_EQ("255.255.255.255", host.GetNetmask().GetStringAddress());

    Ipv4Network net("192.0.2.77/26");
    EXPECT_EQ("192.0.2.64", net.GetNetwork().GetStringAddress());
    EXPECT_EQ("255.255.255.192", net.GetNetmask().GetStringAddress());
    EXPECT_EQ("192.0.2.64/26", net.GetStringAddress());
    EXPECT_EQ(Ipv4Network("192.0.2.64/26"), net);
    EXPECT_NE(Ipv4Network("192.0.2.64/27"), net);

    EXPECT_EQ(net, Ipv4Network(Ipv4Address("192.0.2.99"), Ipv4Address("255.255.255.192")));
    EXPECT_EQ("Invalid IPv4 netmask: 255.0.255.0",
              FailureOf([] { Ipv4Network(Ipv4Address("10.0.0.0"), Ipv4Address("255.0.255.0")); }));
    EXPECT_EQ("Invalid IPv4 prefix length: 33",
              FailureOf([] { Ipv4Network(Ipv4Address("10.0.0.0"), 33u); }));
}

TEST(Ipv4NetworkTest, RefusesBadText) {
    ExpectRefused({"192.0.2.0", "192.0.2.0/", "192.0.2.0/33", "192.0.2.0/-1", "192.0.2.0/+8",
                   "192.0.2.0/024", "192.0.2.0/ 24", "192.0.2.0/24 ", "192.0.2.0/x",
                   "192.0.2.0/24/8", "/24", "192.0.2/24", "192.0.2.0/99999999999999999999",
                   "::/0"},
                  &Ipv4Network::IsValidAddressAndNetmask);
    EXPECT_EQ("Invalid IPv4 network: 10.0.0.0/33", FailureOf([] { Ipv4Network("10.0.0.0/33"); }));
}

TEST(Ipv6NetworkTest, ParsesPrefixBoundsAndKeepsTheAddress) {
    for (std::string text : {"::/0", "::1/128", "2001:db8::5/64", "fe80::1/10", "::ffff:192.0.2.1/96"})
        EXPECT_TRUE(Ipv6Network::IsValidAddressAndNetmask(text)) << text;

    Ipv6Network net("2001:DB8::5/64");
    EXPECT_EQ("2001:db8::5", net.GetAddress().GetStringAddress());
    EXPECT_EQ(64u, net.GetNetmask());
    EXPECT_EQ("2001:db8::5/64", net.GetStringAddress());
    EXPECT_EQ(Ipv6Network::TYPE_STATIC, net.GetIpv6AddressType());
    EXPECT_EQ(Ipv6Network::STATUS_PREFERRED, net.GetIpv6AddressStatus());

    // Identity is address and prefix; type and status are state.
    Ipv6Network same("2001:db8::5/64");
    same.SetIpv6AddressStatus(Ipv6Network::STATUS_DEPRECATED);
    same.SetIpv6AddressType(Ipv6Network::TYPE_AUTOCONF);
    EXPECT_EQ(net, same);
    EXPECT_NE(net, Ipv6Network("2001:db8::5/48"));
    EXPECT_EQ(Ipv6Network(), Ipv6Network("::/0"));

    ExpectRefused({"2001:db8::5", "2001:db8::5/", "2001:db8::5/129", "2001:db8::5/-1",
                   "2001:db8::5/064", "2001:db8::5/6x", "fe80::1%eth0/64", "[::1]/128",
                   "192.0.2.0/24", " ::1/128"},
                  &Ipv6Network::IsValidAddressAndNetmask);
    EXPECT_EQ("Invalid IPv6 network: ::1/129", FailureOf([] { Ipv6Network("::1/129"); }));
}

TEST(Ipv6NetworkTest, NetmaskFromNumber) {
    EXPECT_EQ("::", Ipv6Network::NetmaskFromNumber(0).GetStringAddress());
    EXPECT_EQ("fe00::", Ipv6Network::NetmaskFromNumber(7).GetStringAddress());
    EXPECT_EQ("ffff:ffff:ffff:ffff::", Ipv6Network::NetmaskFromNumber(64).GetStringAddress());
    EXPECT_EQ("ffff:ffff:ffff:ffff:ffff:ffff:ffff:fff8",
              Ipv6Network::NetmaskFromNumber(125).GetStringAddress());
    EXPECT_EQ("ffff:ffff:ffff:ffff:ffff:ffff:ffff:ffff",
              Ipv6Network::NetmaskFromNumber(128).GetStringAddress());
    EXPECT_EQ("Invalid IPv6 prefix length: 129", FailureOf([] { Ipv6Network::NetmaskFromNumber(129); }));
}

TEST(MacAddressTest, ValidUnicastAddresses) {
    for (std::string text : {"00:50:56:a1:b2:c3", "00:50:56:A1:B2:C3", "02:00:00:00:00:01",
                             "fe:ff:ff:ff:ff:ff"})
        EXPECT_TRUE(MacAddress::IsValid(text)) << text;
    EXPECT_EQ("00:50:56:a1:b2:c3", MacAddress("00:50:56:A1:B2:C3").GetStringAddress());
    EXPECT_EQ(MacAddress("00:50:56:a1:b2:c3"), MacAddress("00:50:56:A1:B2:C3"));
    EXPECT_EQ("00:00:00:00:00:00", MacAddress().GetStringAddress());
    EXPECT_TRUE(MacAddress().IsUnset());
}

TEST(MacAddressTest, RefusesMalformedMulticastAndEmpty) {
    ExpectRefused({"", "00-50-56-a1-b2-c3", "00.50.56.a1.b2.c3", "0050.56a1.b2c3", "005056a1b2c3",
                   "0:50:56:a1:b2:c3", "00:50:56:a1:b2", "00:50:56:a1:b2:c3:d4", "00:50:56:a1:b2:c3:",
                   " 00:50:56:a1:b2:c3", "00:50:56:a1:b2:g3", "00:50:56:a1:b2:c3 ",
                   // multicast, broadcast and the empty value are no interface's address
                   "01:00:5e:00:00:01", "33:33:00:00:00:01", "ff:ff:ff:ff:ff:ff", "00:00:00:00:00:00"},
                  &MacAddress::IsValid);
    // What a host reports is taken even when it is no unicast address.
    EXPECT_TRUE(MacAddress("ff:ff:ff:ff:ff:ff").IsMulticast());
    EXPECT_EQ("Invalid MAC address: 00-50-56-a1-b2-c3",
              FailureOf([] { MacAddress("00-50-56-a1-b2-c3"); }));
}

TEST(IpConfigTest, Ipv4ModesStayConsistent) {
    IpConfig config;
    EXPECT_TRUE(config.GetIpv4UseNone());
    EXPECT_FALSE(config.GetUseDhcp());
    EXPECT_EQ("0.0.0.0", config.GetIpv4Broadcast().GetStringAddress());

    config.SetUseDhcp(true);
    config.SetIpv4Address(Ipv4Address("192.0.2.10"));
    config.SetIpv4Netmask(Ipv4Address("255.255.255.0"));
    EXPECT_FALSE(config.GetUseDhcp());
    EXPECT_FALSE(config.GetIpv4UseNone());
    EXPECT_EQ("192.0.2.255", config.GetIpv4Broadcast().GetStringAddress());

    // DHCP keeps the address as the lease; none drops it.
    config.SetUseDhcp(true);
    EXPECT_EQ("192.0.2.10", config.GetIpv4Address().GetStringAddress());
    config.SetDhcpDns(true);
    config.SetIpv4UseNone();
    EXPECT_TRUE(config.GetIpv4UseNone());
    EXPECT_FALSE(config.GetUseDhcp());
    EXPECT_EQ("0.0.0.0", config.GetIpv4Address().GetStringAddress());
    EXPECT_EQ("0.0.0.0", config.GetIpv4Broadcast().GetStringAddress());
    EXPECT_TRUE(config.GetDhcpDns());
}

TEST(IpConfigTest, Ipv6AddressesAddAndRemove) {
    IpConfig config;
    config.AddIpv6Network(Ipv6Network("2001:db8::5/64"));
    config.AddIpv6Network(Ipv6Network("fe80::1/64"));
    EXPECT_EQ("The IPv6 address 2001:db8::5 is already configured on the interface",
              FailureOf([&] { config.AddIpv6Network(Ipv6Network("2001:DB8::5/48")); }));
    EXPECT_EQ("The IPv6 address 2001:db8::5/48 is not configured on the interface",
              FailureOf([&] { config.RemoveIpv6Network(Ipv6Network("2001:db8::5/48")); }));

    IpConfig copy = config;
    copy.RemoveIpv6Network(Ipv6Network("2001:db8:0::5/64"));
    ASSERT_EQ(1u, copy.GetIpv6Network().size());
    EXPECT_EQ("fe80::1/64", copy.GetIpv6Network()[0].GetStringAddress());
    EXPECT_EQ(2u, config.GetIpv6Network().size());
    EXPECT_NE(config, copy);
}
