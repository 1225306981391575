#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// Duplex of a link; the values are the host's (0 auto, 1 full, 2 half), and a
// device may report one it cannot tell (3).
enum class PnicDuplex { Auto, Full, Half, Unknown };
inline constexpr const char* kPnicDuplexWords[] = {"auto", "full", "half", "unknown"};

// Port types by their values (0 TP ... 5 DA); "other" is a port the tools do
// not name.
inline constexpr const char* kPnicPortWords[] = {"tp", "aui", "bnc", "mii", "fibre", "da", "other"};
inline constexpr const char* kTransceiverWords[] = {"internal", "external"};
// Wake-on-LAN letters by their values (0 PHY activity ... 6 SecureOn).
inline constexpr char kWakeOnLetters[] = "pumbags";
// Offloads done by the device, by their bits (0x1, 0x2, 0x4, 0x8).
inline constexpr const char* kOffloadWords[] = {"rxChecksum", "txChecksum", "scatterGather", "tso"};
// Software simulated features, by their bits (0x1 ... 0x2000).
inline constexpr const char* kSoftwareFeatureWords[] = {
    "ipv4cso", "ipv4tso", "sg", "obo", "vxlanencap", "ipv6tso", "ipv6tsoext",
    "ipv6cso", "ipv6csoext", "highdma", "sgsp", "tagging", "untagging", "geneveoffload"};
// The counters of a NIC, in the order of Gantry::Network::PnicStats.
inline constexpr const char* kPnicCounterNames[] = {
    "rxPackets", "txPackets", "rxBytes", "txBytes", "rxDropped", "txDropped", "rxMulticast", "rxBroadcast",
    "txMulticast", "txBroadcast", "rxErrors", "rxLengthErrors", "rxOverErrors", "rxCrcErrors", "rxFrameErrors",
    "rxFifoErrors", "rxMissedErrors", "txErrors", "txAbortedErrors", "txCarrierErrors", "txFifoErrors",
    "txHeartbeatErrors", "txWindowErrors"};
// The counters of a virtual function, in the order of SriovNicVFStats.
inline constexpr const char* kVfCounterNames[] = {
    "rxUnicastPkts", "rxUnicastBytes", "rxMulticastPkts", "rxMulticastBytes", "rxBroadcastPkts",
    "rxBroadcastBytes", "rxOutOfBufferDrops", "rxErrorDrops", "rxLroPkts", "rxLroBytes", "txUnicastPkts",
    "txUnicastBytes", "txMulticastPkts", "txMulticastBytes", "txBroadcastPkts", "txBroadcastBytes", "txErrors",
    "txDiscards", "txTsoPkts", "txTsoBytes"};

struct PnicLinkModeRecord {
    unsigned int speed = 0;  // Mbps
    PnicDuplex duplex = PnicDuplex::Full;

    bool operator==(const PnicLinkModeRecord& other) const {
        return speed == other.speed && duplex == other.duplex;
    }
};

struct PciDeviceRecord {
    std::string address;  // "0000:03:00.0"
    std::string vendor;
    std::string device;
};

// What the link of a NIC can do and how it is set.
struct PnicLinkRecord {
    std::vector<int> supportedPorts;  // values of kPnicPortWords
    int port = 0;
    std::vector<PnicLinkModeRecord> supportedModes;
    bool supportsAutoNegotiation = false;
    std::vector<PnicLinkModeRecord> advertisedModes;
    bool advertisedAutoNegotiation = false;
    bool autoNegotiation = false;
    int phyAddress = 0;
    int transceiver = 0;  // index of kTransceiverWords
};

struct PnicWakeOnRecord {
    std::string supported;  // letters of kWakeOnLetters, in their order
    std::string enabled;    // a subset of supported, in the same order
};

// Flow control; the partner's settings decide the autonegotiated outcome.
struct PnicPauseRecord {
    bool supported = false;
    bool autonegotiate = false;
    bool rx = false;
    bool tx = false;
    bool partnerRx = false;
    bool partnerTx = false;
};

struct PnicEepromRecord {
    std::uint32_t magic = 0;
    std::string bytes;  // the content, byte by byte
};

struct PnicSelfTestRecord {
    std::string name;     // "Register test"
    bool offline = false; // run only by the full (offline) test
    bool passes = true;
};

struct PnicCoalesceRecord {
    bool adaptiveRx = false;
    bool adaptiveTx = false;
    std::uint32_t sampleInterval = 0;
    std::uint32_t rxUsecs = 0;
    std::uint32_t rxMaxFrames = 0;
    std::uint32_t txUsecs = 0;
    std::uint32_t txMaxFrames = 0;
};

struct PnicRingsRecord {
    std::uint32_t rx = 0;
    std::uint32_t rxMini = 0;
    std::uint32_t rxJumbo = 0;
    std::uint32_t tx = 0;
};

struct SriovVfRecord {
    int id = 0;
    bool active = false;
    std::string pciAddress;
    std::string ownerWorldId;  // "" for none
    std::array<std::uint64_t, std::size(kVfCounterNames)> counters{};
};

// A physical NIC of the host ("pnet0") with everything its device answers.
// Only a NIC that has a record exists on the host: a switch's uplink of
// another name is no NIC.
struct PnicRecord {
    static constexpr const char* kKind = "pnic";

    std::string name;
    bool adminUp = true;
    bool linkUp = false;       // a link partner is there; the link is detected while also adminUp
    std::string driver;        // "ixgbe"
    unsigned int speed = 0;    // Mbps in force while the link is detected
    PnicDuplex duplex = PnicDuplex::Full;
    std::string macAddress;    // lower case with colons
    int mtu = 1500;
    std::optional<PciDeviceRecord> pci;  // none for a pseudo NIC
    std::string driverVersion;
    std::string firmwareVersion;
    std::string busInfo;
    PnicLinkRecord link;
    std::optional<PnicWakeOnRecord> wakeOn;         // none: not supported
    std::optional<std::uint32_t> messageLevel;      // none: not supported
    PnicPauseRecord pause;
    std::vector<std::uint32_t> registers;
    PnicEepromRecord eeprom;
    std::vector<PnicSelfTestRecord> selfTests;
    std::array<std::uint64_t, std::size(kPnicCounterNames)> counters{};
    unsigned int supportedOffloads = 0;  // bits of kOffloadWords
    unsigned int enabledOffloads = 0;
    PnicCoalesceRecord coalesce;
    PnicRingsRecord ringMaxima;
    PnicRingsRecord rings;
    std::uint32_t softwareFeatures = 0;  // bits of kSoftwareFeatureWords
    std::optional<std::vector<SriovVfRecord>> sriov;  // none: no SR-IOV

    // Whether a link is detected.
    bool LinkDetected() const { return adminUp && linkUp; }

    Json ToJson() const;
    static PnicRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
