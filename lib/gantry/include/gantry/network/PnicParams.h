#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace Gantry {
namespace Network {

// The plain values that Pnic reads and writes besides PnicInfo. Each starts
// zero-initialised; a getter fills it, a setter applies it.

// Ethernet flow control. The resolutions are the outcome of autonegotiation
// with the link partner: 0 none available, 1 pause on in that direction, any
// other value off.
struct PnicPauseParams {
    bool supported = false;
    bool autonegotiate = false;
    bool rx = false;
    bool tx = false;
    int rxResolution = 0;
    int txResolution = 0;
};

// Interrupt coalescing.
struct PnicCoalesceParams {
    bool adaptiveRx = false;
    bool adaptiveTx = false;
    std::uint32_t sampleInterval = 0;  // seconds
    std::uint32_t rxUsecs = 0;
    std::uint32_t rxMaxFrames = 0;
    std::uint32_t txUsecs = 0;
    std::uint32_t txMaxFrames = 0;
};

// Ring sizes. The mask tells SetRingParams which rings to change.
struct PnicRingParams {
    static constexpr std::uint8_t RX = 0x1;
    static constexpr std::uint8_t RX_MINI = 0x2;
    static constexpr std::uint8_t RX_JUMBO = 0x4;
    static constexpr std::uint8_t TX = 0x8;

    std::uint8_t mask = 0;
    std::uint32_t rx = 0;
    std::uint32_t rxMini = 0;
    std::uint32_t rxJumbo = 0;
    std::uint32_t tx = 0;
};

// Offloads done by the device. The mask tells SetOffloadParams which
// settings to apply.
struct PnicOffloadParams {
    static constexpr std::uint8_t RX_CHECKSUM = 0x1;
    static constexpr std::uint8_t TX_CHECKSUM = 0x2;
    static constexpr std::uint8_t SCATTER_GATHER = 0x4;
    static constexpr std::uint8_t TSO = 0x8;

    std::uint8_t mask = 0;
    bool rxChecksum = false;
    bool txChecksum = false;
    bool scatterGather = false;
    bool tso = false;
};

// Offload features the host simulates in software for the NIC. The mask
// tells SetSoftwareParams which features to change; the bits follow the
// order of the fields (IPV4_CSO 0x1 ... GENEVE_OFFLOAD 0x2000).
struct PnicSoftwareParams {
    static constexpr std::uint32_t IPV4_CSO = 0x1;
    static constexpr std::uint32_t IPV4_TSO = 0x2;
    static constexpr std::uint32_t SG = 0x4;
    static constexpr std::uint32_t OBO = 0x8;
    static constexpr std::uint32_t VXLAN_ENCAP = 0x10;
    static constexpr std::uint32_t IPV6_TSO = 0x20;
    static constexpr std::uint32_t IPV6_TSO_EXT = 0x40;
    static constexpr std::uint32_t IPV6_CSO = 0x80;
    static constexpr std::uint32_t IPV6_CSO_EXT = 0x100;
    static constexpr std::uint32_t HIGH_DMA = 0x200;
    static constexpr std::uint32_t SG_SPAN_PAGES = 0x400;
    static constexpr std::uint32_t TAGGING = 0x800;
    static constexpr std::uint32_t UNTAGGING = 0x1000;
    static constexpr std::uint32_t GENEVE_OFFLOAD = 0x2000;

    std::uint32_t mask = 0;
    bool ipv4Cso = false;
    bool ipv4Tso = false;
    bool sg = false;
    bool obo = false;
    bool vxlanEncap = false;
    bool ipv6Tso = false;
    bool ipv6TsoExt = false;
    bool ipv6Cso = false;
    bool ipv6CsoExt = false;
    bool highDma = false;
    bool sgSpanPages = false;
    bool tagging = false;
    bool untagging = false;
    bool geneveOffload = false;
};

// What the driver says of itself.
struct PnicDriverInfo {
    std::string driver;
    std::string version;
    std::string firmwareVersion;
    std::string busInfo;
};

// The outcome of a self test: whether it passed, and one line per test run.
struct PnicSelfTestResult {
    bool passed = false;
    std::vector<std::string> details;
};

}  // namespace Network
}  // namespace Gantry
