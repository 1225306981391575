// The simulated host's NICs as devices: what a setter may change and what it
// refuses, the EEPROM's bounds and file, VLAN counters, SR-IOV functions, and
// a host of the format before NIC devices. The commands' texts are proven in
// the NIC command tests.

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <sqlite3.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "gantry/network/Portset.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "util/VectorUtil"

using namespace SwitchTest;
using Trellis::Network::PnicImpl;

namespace {

Gantry::Network::PnicInfo InfoOf(const std::string& nic) {
    Gantry::Network::PnicInfo info;
    PnicImpl(nic).GetPnicInfo(info);
    return info;
}

std::string WriteFile(const std::string& name, const std::string& content) {
    const std::string path = ::testing::TempDir() + name + "." + std::to_string(::getpid());
    std::ofstream(path, std::ios::binary) << content;
    return path;
}

}  // namespace

TEST(NicHost, LinkFollowsAdminStateCarrierAndNegotiation) {
    TempHost host;
    PnicImpl pnet0("pnet0");
    pnet0.SetSpeedDuplex(1000, 1);
    EXPECT_EQ(PnicImpl("pnet0").GetSpeed(), 1000u);
    EXPECT_FALSE(InfoOf("pnet0").autoNegotiation);
    EXPECT_EQ(FailureOf([] { PnicImpl("pnet0").SetSpeedDuplex(100, 2); }),
              "Physical NIC pnet0 does not support 100 Mbps half duplex");
    EXPECT_EQ(FailureOf([] { PnicImpl("pnet0").RestartNegotiation(); }),
              "Unable to restart negotiation on pnet0: autonegotiation is off");
    pnet0.SetSpeedDuplex(0, 0);  // back to the best advertised mode
    EXPECT_EQ(PnicImpl("pnet0").GetSpeed(), 10000u);
    EXPECT_EQ(FailureOf([] { PnicImpl("pnet6").SetSpeedDuplex(0, 0); }),
              "Physical NIC pnet6 does not support autonegotiation");

    pnet0.SetAdminUp(false);
    PnicImpl down("pnet0");
    EXPECT_FALSE(down.IsLinkUp());
    EXPECT_EQ(down.GetSpeed(), 0u);
    EXPECT_EQ(InfoOf("pnet0").linkStatus, "Down");
    pnet0.SetAdminUp(true);
    EXPECT_TRUE(PnicImpl("pnet0").IsLinkUp());
    // pnet2 has no link partner: up, it still has no link.
    PnicImpl("pnet2").SetAdminUp(true);
    EXPECT_TRUE(PnicImpl("pnet2").IsAdminUp());
    EXPECT_FALSE(PnicImpl("pnet2").IsLinkUp());
    EXPECT_EQ(FailureOf([] { PnicImpl("pnet9").IsAdminUp(); }), "Physical NIC pnet9 does not exist");
}

TEST(NicHost, SettersChangeOnlyWhatTheyMarkAndRefuseWhatTheDeviceLacks) {
    TempHost host;
    Gantry::Network::PnicInfo info = InfoOf("pnet0");
    info.phyAddress = 5;
    info.port = 3;  // MII, unmarked: ignored
    info.phyAddressChanged = true;
    PnicImpl("pnet0").SetPnicInfo(info);
    EXPECT_EQ(InfoOf("pnet0").phyAddress, 5);
    EXPECT_EQ(InfoOf("pnet0").port, 5);

    info = InfoOf("pnet0");
    info.portChanged = true;
    info.port = 3;
    EXPECT_EQ(FailureOf([&] { PnicImpl("pnet0").SetPnicInfo(info); }),
              "Physical NIC pnet0 does not support the port type MII");
    info = InfoOf("pnet0");
    info.wakeOnChanged = true;
    info.wakeOn = {5, 4};
    info.phyAddressChanged = true;
    info.phyAddress = 7;
    EXPECT_EQ(FailureOf([&] { PnicImpl("pnet0").SetPnicInfo(info); }),
              "Physical NIC pnet0 does not support wake-on ARP");
    EXPECT_EQ(InfoOf("pnet0").phyAddress, 5);  // nothing of a refused change stays
    info.wakeOn = {5, 1, 5};
    PnicImpl("pnet0").SetPnicInfo(info);
    EXPECT_EQ(InfoOf("pnet0").wakeOn, (std::vector<int>{1, 5}));

    Gantry::Network::PnicOffloadParams offloads;
    offloads.mask = Gantry::Network::PnicOffloadParams::TSO;
    offloads.tso = true;
    EXPECT_EQ(FailureOf([&] { PnicImpl("pnet6").SetOffloadParams(offloads); }),
              "Physical NIC pnet6 does not support TCP segmentation offload");
    offloads.tso = false;
    PnicImpl("pnet0").SetOffloadParams(offloads);
    PnicImpl("pnet0").GetOffloadParams(offloads);
    EXPECT_TRUE(offloads.rxChecksum && offloads.txChecksum && offloads.scatterGather && !offloads.tso);

    Gantry::Network::PnicRingParams rings;
    rings.mask = Gantry::Network::PnicRingParams::TX | Gantry::Network::PnicRingParams::RX;
    rings.tx = 2048;
    rings.rx = 8192;
    EXPECT_EQ(FailureOf([&] { PnicImpl("pnet0").SetRingParams(rings); }),
              "Physical NIC pnet0 cannot have a RX ring of 8192 entries: its maximum is 4096");
    rings.mask = Gantry::Network::PnicRingParams::TX;
    PnicImpl("pnet0").SetRingParams(rings);
    Gantry::Network::PnicRingParams preset, current;
    PnicImpl("pnet0").GetRingParams(preset, current);
    EXPECT_EQ(current.rx, 512u);
    EXPECT_EQ(current.tx, 2048u);
    EXPECT_EQ(preset.tx, 4096u);

    Gantry::Network::PnicPauseParams pause;
    PnicImpl("pnet5").GetPauseParams(pause);
    PnicImpl("pnet5").SetPauseParams(pause);  // all off: accepted
    pause.rx = true;
    EXPECT_EQ(FailureOf([&] { PnicImpl("pnet5").SetPauseParams(pause); }),
              "Physical NIC pnet5 does not support pause frames");
    PnicImpl("pnet3").GetPauseParams(pause);
    EXPECT_EQ(pause.rxResolution, 1);
    EXPECT_EQ(pause.txResolution, 2);
}

TEST(NicHost, EepromReadsWithinItsBytesAndWritesOnlyWithTheMagic) {
    TempHost host;
    PnicImpl pnet0("pnet0");
    std::vector<unsigned char> bytes;
    pnet0.GetEepromDump(bytes, 0, 0);
    EXPECT_EQ(bytes.size(), 64u);
    pnet0.GetEepromDump(bytes, 0xffffffffu, 0xfffffff0u);  // no sum wraps, nothing is read past the end
    EXPECT_TRUE(bytes.empty());
    pnet0.GetEepromDump(bytes, 10, 60);
    EXPECT_EQ(bytes.size(), 4u);

    pnet0.SetEepromValue(0x10fb8086, 60, 0x04030201);
    pnet0.GetEepromDump(bytes, 4, 60);
    EXPECT_EQ(bytes, (std::vector<unsigned char>{1, 2, 3, 4}));
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromValue(0x10fb8086, 61, 0); }),
              "EEPROM offset 0x3d of physical NIC pnet0 leaves no room for a double word: the EEPROM has 64 bytes");
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromValue(0x12345678, 0, 0); }),
              "Invalid EEPROM magic 0x12345678 for physical NIC pnet0");

    // The magic is checked before the file is looked at.
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromFromFile(1, "/nonexistent"); }),
              "Invalid EEPROM magic 0x1 for physical NIC pnet0");
    const std::string fifo = ::testing::TempDir() + "eeprom.fifo." + std::to_string(::getpid());
    ::unlink(fifo.c_str());
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromFromFile(0x10fb8086, fifo); }),
              "Unable to write the EEPROM of pnet0 from \"" + fifo + "\": it is a FIFO, not a regular file");
    const std::string large = WriteFile("eeprom.large", std::string(65, 'x'));
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromFromFile(0x10fb8086, large); }),
              "Unable to write the EEPROM of pnet0 from \"" + large + "\": it is larger than 64 bytes");
    const std::string empty = WriteFile("eeprom.empty", "");
    EXPECT_EQ(FailureOf([&] { pnet0.SetEepromFromFile(0x10fb8086, empty); }),
              "Unable to write the EEPROM of pnet0 from \"" + empty + "\": it is empty");
    pnet0.SetEepromFromFile(0x10fb8086, WriteFile("eeprom.good", "AB"));
    pnet0.GetEepromDump(bytes, 3, 0);
    EXPECT_EQ(bytes[0], 'A');
    EXPECT_EQ(bytes[1], 'B');
    EXPECT_NE(bytes[2], 'x');
}

TEST(NicHost, SelfTestOnlineRunsOnlyTheOnlineTests) {
    TempHost host;
    Gantry::Network::PnicSelfTestResult result;
    PnicImpl("pnet2").RunSelfTest(result, false);
    EXPECT_FALSE(result.passed);
    EXPECT_EQ(result.details.size(), 5u);
    EXPECT_EQ(result.details[3], "Loopback test (offline): failed");
    PnicImpl("pnet0").RunSelfTest(result, true);
    EXPECT_TRUE(result.passed);
    EXPECT_EQ(result.details, (std::vector<std::string>{"Link test (online): passed"}));
}

TEST(NicHost, VlanCountersLiveOnTheUplinkAndSriovFunctionsOnTheirNic) {
    TempHost host;
    Trellis::Network::VirtualSwitchImpl switch0("switch0", Gantry::Network::Portset::DEF_NUM_PORTS);
    std::vector<Gantry::Network::VlanStats*> vlans = switch0.GetUplinkVlanStats("pnet0");
    ASSERT_EQ(vlans.size(), 2u);
    EXPECT_EQ(vlans[1]->vlanId, 100);
    Trellis::Util::DeleteVector(vlans);
    switch0.SetUplinkVlanStatsEnabled("pnet0", false);
    EXPECT_TRUE(switch0.GetUplinkVlanStats("pnet0").empty());
    switch0.SetUplinkVlanStatsEnabled("pnet0", true);  // a zero counter per VLAN of its port groups
    vlans = switch0.GetUplinkVlanStats("pnet0");
    ASSERT_EQ(vlans.size(), 1u);
    EXPECT_EQ(vlans[0]->vlanId, 0);
    EXPECT_EQ(vlans[0]->rxPackets, 0u);
    Trellis::Util::DeleteVector(vlans);
    EXPECT_EQ(FailureOf([&] { switch0.GetUplinkVlanStats("pnet1"); }), "Physical NIC pnet1 is no uplink of switch switch0");

    Trellis::Network::NetworkInfoImpl info;
    std::vector<Gantry::Network::Pnic*> sriov = info.GetSriovNics();
    ASSERT_EQ(sriov.size(), 1u);
    EXPECT_EQ(sriov[0]->GetName(), "pnet1");
    Trellis::Util::DeleteVector(sriov);
    EXPECT_EQ(std::unique_ptr<Gantry::Network::Pnic>(info.GetSriovNicByName("pnet0")), nullptr);
    std::vector<Gantry::Network::SriovNicVFInfo*> functions = info.GetSriovNicVFInfo("pnet1");
    ASSERT_EQ(functions.size(), 4u);
    EXPECT_EQ(functions[0]->ownerWorldId, "69312");
    Trellis::Util::DeleteVector(functions);
    Gantry::Network::SriovNicVFStats stats;
    info.GetSriovNicVFStats(&stats, "pnet1", 1);
    EXPECT_EQ(stats.rxUnicastPkts, 1080u);
    EXPECT_EQ(FailureOf([&] { info.GetSriovNicVFStats(&stats, "pnet1", 9); }),
              "Physical NIC pnet1 has no virtual function 9");
    EXPECT_EQ(FailureOf([&] { info.GetSriovNicVFInfo("pnet0"); }), "Physical NIC pnet0 has no SR-IOV");
}

TEST(NicHost, ADescriptionOfADeviceThatContradictsItselfIsRefused) {
    TempHost host;
    auto nic0 = [](Json& d) -> Json& { return d["nics"][0]; };
    EXPECT_EQ(DescriptionRefusal([&](Json& d) { nic0(d)["link"]["advertisedModes"].push_back({{"speed", 100}, {"duplex", "half"}}); }),
              "nics[0].link.advertisedModes: a NIC advertises only link modes it supports");
    EXPECT_EQ(DescriptionRefusal([&](Json& d) { nic0(d)["wakeOn"]["enabled"] = "ga"; }),
              "nics[0].wakeOn.enabled: a NIC enables only wake-on letters it supports");
    EXPECT_EQ(DescriptionRefusal([&](Json& d) { nic0(d)["rings"]["current"]["rx"] = 5000; }),
              "nics[0].rings.current: a ring is never larger than its maximum");
    EXPECT_EQ(DescriptionRefusal([&](Json& d) { d["nics"][6]["offloads"]["enabled"] = {"tso"}; }),
              "nics[6].offloads.enabled: a NIC enables only offloads it supports");
    EXPECT_EQ(DescriptionRefusal([&](Json& d) { nic0(d)["eeprom"]["bytes"] = "0g"; }),
              "nics[0].eeprom.bytes: expected lower-case hex digits");
}

TEST(NicHost, AnOlderHostGetsTheDefaultDevicesOfItsNicsAndKeepsTheirState) {
    TempHost host;
    Trellis::Host::CloseHost();
    // The host as the format before NIC devices kept it: pnet0 with its link
    // down and a description, no pnet6.
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db,
                           "UPDATE records SET data = json_object('name', name, 'linkUp', json('false'),"
                           " 'driver', 'ixgbe', 'speed', 0, 'duplex', 'half', 'macAddress', 'a0:36:9f:1c:2e:40',"
                           " 'mtu', 1500, 'description', 'Intel 82599') WHERE kind = 'pnic' AND name = 'pnet0';"
                           "DELETE FROM records WHERE kind = 'pnic' AND name = 'pnet6';"
                           "PRAGMA user_version = 8;",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);

    host.Reopen();
    const Json pnet0 = Named("nics", "pnet0");
    EXPECT_EQ(pnet0["linkUp"], false);
    EXPECT_EQ(pnet0["pci"]["address"], "0000:03:00.0");
    EXPECT_EQ(pnet0["eeprom"]["magic"], 0x10fb8086);
    EXPECT_EQ(Section("nics").size(), 7u);
}
