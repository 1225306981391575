// The host side of DNS, connections and IPsec: edits of two DNS objects at
// once, what the IPsec databases refuse, what removing an association leaves
// in the policies, and a key exchange configuration read as a host tool reads
// a file a user names.

#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv6Address.h"
#include "trellis/host/ExecLog.h"
#include "trellis/host/Faults.h"
#include "trellis/network/DnsConfigImpl.h"
#include "trellis/network/IpSecConfigImpl.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/resource/ResourceInfoImpl.h"

using namespace SwitchTest;
using Gantry::Network::IpSecSadParam;
using Gantry::Network::Ipv6Address;
using Names = std::vector<std::string>;

namespace {

IpSecSadParam Association(const std::string& name, const std::string& destination, std::uint32_t spi) {
    IpSecSadParam sa;
    sa.name = name;
    sa.srcAddress = Ipv6Address("2001:db8::10");
    sa.dstAddress = Ipv6Address(destination);
    sa.spi = spi;
    sa.encryptionAlgorithm = Gantry::Network::IpSecEncryptAlgo::Aes128Cbc;
    sa.encryptionKey = "0x00112233445566778899aabbccddeeff";
    sa.integrityAlgorithm = Gantry::Network::IpSecAuthAlgo::HmacSha1;
    sa.integrityKey = "abcdefghijklmnopqrst";
    return sa;
}

std::string WriteFile(const std::string& dir, const std::string& name, const std::string& text) {
    std::string path = dir + "/" + name;
    std::ofstream(path) << text;
    return path;
}

}  // namespace

TEST(IpServicesHost, TwoDnsEditorsAtOnceLoseNothingAndRefusalsNameTheEntry) {
    TempHost host;
    Trellis::Network::DnsConfigImpl first("defaultTcpipStack");
    Trellis::Network::DnsConfigImpl second("defaultTcpipStack");
    Gantry::Network::Ipv4Address a("192.0.2.54");
    Gantry::Network::Ipv6Address b("2001:db8::54");
    first.AddNameServer(a);
    second.AddNameServer(b);
    first.SaveConfig();
    second.SaveConfig();
    EXPECT_EQ(Trellis::Network::DnsConfigImpl("defaultTcpipStack").GetNameServers(),
              (Names{"192.0.2.53", "2001:db8::53", "192.0.2.54", "2001:db8::54"}));

    Trellis::Network::DnsConfigImpl dns("defaultTcpipStack");
    EXPECT_EQ(FailureOf([&] { dns.AddNameServer(a); }),
              "The name server 192.0.2.54 is already configured for netstack defaultTcpipStack");
    EXPECT_EQ(FailureOf([&] { dns.AddSearchDomain("EXAMPLE.com"); }),
              "The search domain EXAMPLE.com is already configured for netstack defaultTcpipStack");
    EXPECT_EQ(FailureOf([&] { dns.AddSearchDomain("bad domain"); }),
              "Invalid search domain bad domain: a domain name has no blanks or control characters");
    dns.RemoveSearchDomain("Lab.Example.Net");
    // Another editor removed it meanwhile: the save is refused whole.
    Trellis::Network::DnsConfigImpl other("defaultTcpipStack");
    other.RemoveSearchDomain("lab.example.net");
    other.SaveConfig();
    EXPECT_EQ(FailureOf([&] { dns.SaveConfig(); }),
              "The search domain Lab.Example.Net is not configured for netstack defaultTcpipStack");
    EXPECT_EQ(Trellis::Network::DnsConfigImpl("defaultTcpipStack").GetSearchDomainsString(), "example.com");
    EXPECT_EQ(FailureOf([&] { Trellis::Network::DnsConfigImpl("nosuch"); }), "Netstack instance nosuch does not exist");

    std::vector<Gantry::Network::IpConnection> udp;
    Trellis::Network::NetworkInfoImpl().GetCurrentUdpTesselConnections(udp, "defaultTcpipStack");
    ASSERT_EQ(udp.size(), 1u);
    EXPECT_EQ(Trellis::Resource::ResourceInfoImpl().GetWorldName(udp[0].worldId), "ntpd");
    EXPECT_EQ(FailureOf([] { Trellis::Resource::ResourceInfoImpl().GetWorldName(77); }), "World 77 does not exist");
}

TEST(IpServicesHost, TheIpsecDatabasesRefuseWhatCannotBeAndKeepPoliciesOfRemovedAssociations) {
    TempHost host;
    Trellis::Network::IpSecConfigImpl ipsec;
    ipsec.AddSADConfig(Association("sa-lab", "2001:db8::30", 0x2000));
    EXPECT_EQ(FailureOf([&] { ipsec.AddSADConfig(Association("sa-lab", "2001:db8::31", 0x2001)); }),
              "Unable to add security association sa-lab: an association of that name exists already");
    EXPECT_EQ(FailureOf([&] { ipsec.AddSADConfig(Association("sa-copy", "2001:db8::30", 0x2000)); }),
              "Unable to add security association sa-copy: association sa-lab has the same source, destination and SPI");
    IpSecSadParam shortKey = Association("sa-short", "2001:db8::32", 0x2002);
    shortKey.encryptionKey = "0123";
    EXPECT_EQ(FailureOf([&] { ipsec.AddSADConfig(shortKey); }),
              "Unable to add security association sa-short: the algorithm aes128-cbc takes a key of 16 bytes (16 "
              "characters, or 32 hex digits)");

    Gantry::Network::IpSecSpdParam policy;
    policy.name = "sp-lab";
    policy.saName = "sa-lab";
    policy.action = Gantry::Network::IpSecAction::Ipsec;
    policy.dstPort = 70000;
    EXPECT_EQ(FailureOf([&] { ipsec.AddSPDConfig(policy); }),
              "Unable to add security policy sp-lab: the port 70000 is outside 0 to 65535");
    policy.dstPort = 443;
    policy.saName = "sa-none";
    EXPECT_EQ(FailureOf([&] { ipsec.AddSPDConfig(policy); }),
              "Unable to add security policy sp-lab: there is no security association sa-none");
    policy.saName = "sa-lab";
    ipsec.AddSPDConfig(policy);

    ipsec.RemoveSADConfig("sa-lab");
    std::vector<Gantry::Network::IpSecSpdParam> policies;
    ipsec.GetSPDConfigList(policies);
    EXPECT_EQ(policies.back().saName, "UNKNOWN");
    std::vector<IpSecSadParam> associations;
    ipsec.GetSADConfigList(associations);
    EXPECT_EQ(associations.back().name, "");  // the automatic one comes last
    IpSecSadParam automatic = associations.back();
    automatic.spi += 1;
    EXPECT_NE(FailureOf([&] { ipsec.RemoveAutoSADConfig(automatic); }), "");
    automatic.spi -= 1;
    ipsec.RemoveAutoSADConfig(automatic);
    EXPECT_EQ(FailureOf([&] { ipsec.RemoveSADConfig("sa-lab"); }),
              "Unable to remove security association sa-lab: there is none of that name");
}

TEST(IpServicesHost, AKeyExchangeConfigurationIsReadOnlyFromARegularFileItChecks) {
    TempHost host;
    const std::string dir = std::filesystem::path(host.Path()).parent_path().string();
    Trellis::Network::IpSecConfigImpl ipsec;
    const std::string good = WriteFile(dir, "ike.conf", "# lab peers\n[peer lab]\naddress = 2001:db8::30\n");
    const std::string bad = WriteFile(dir, "bad.conf", "[peer lab]\njust words\n");
    const std::string empty = WriteFile(dir, "empty.conf", "# nothing\n");
    const std::string large = WriteFile(dir, "large.conf", std::string(70000, '#'));
    const std::string fifo = dir + "/ike.fifo";
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    struct Case {
        std::string path, refusal;
    };
    for (const Case& c : std::vector<Case>{
             {dir + "/missing.conf", "it does not exist"},
             {dir, "it is a directory"},
             {fifo, "it is a FIFO, not a regular file"},
             {large, "it is larger than 65536 bytes"},
             {bad, "line 2 is neither a [section] nor a name = value setting"},
             {empty, "it holds no setting"},
         })
        EXPECT_EQ(FailureOf([&] { ipsec.CheckIKEConfig(c.path); }),
                  "Unable to use the IKE configuration " + c.path + ": " + c.refusal);

    ipsec.CheckIKEConfig(good);
    ipsec.CopyIKEConfig(good);
    ipsec.RestartIKEDaemons();
    EXPECT_EQ(Section("ipsec")["ikeConfig"]["lines"], Json({"# lab peers", "[peer lab]", "address = 2001:db8::30"}));
    EXPECT_EQ(Trellis::Host::ReadExecLog().back().commandLine, "/etc/init.d/iked restart");
    Trellis::Host::ArmFault({"Trellis_Exec", "", 3, {}});
    EXPECT_EQ(FailureOf([&] { ipsec.RestartIKEDaemons(); }),
              "Unable to restart the IKE daemons: /etc/init.d/iked restart returned 3");
}
