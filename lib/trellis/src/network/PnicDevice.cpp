#include "PnicDevice.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <utility>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"

namespace Trellis {
namespace Network {
namespace PnicDevice {

namespace {

using Gantry::Lib::GantryException;
using Trellis::Host::PnicDuplex;
using Trellis::Host::PnicLinkModeRecord;
using Trellis::Host::PnicRecord;

constexpr int kMaxPhyAddress = 31;
constexpr const char* kPortNames[] = {"TP", "AUI", "BNC", "MII", "FIBRE", "DA"};
constexpr const char* kWakeOnNames[] = {"PHY activity",       "unicast messages", "multicast messages",
                                        "broadcast messages", "ARP",              "MagicPacket",
                                        "SecureOn password"};
constexpr const char* kOffloadNames[] = {"RX checksum offload", "TX checksum offload", "scatter-gather",
                                         "TCP segmentation offload"};
constexpr const char* kRingNames[] = {"RX", "RX mini", "RX jumbo", "TX"};

// The bool of each software feature, in the order of its mask bits.
constexpr bool Gantry::Network::PnicSoftwareParams::*kSoftwareFlags[] = {
    &Gantry::Network::PnicSoftwareParams::ipv4Cso,     &Gantry::Network::PnicSoftwareParams::ipv4Tso,
    &Gantry::Network::PnicSoftwareParams::sg,          &Gantry::Network::PnicSoftwareParams::obo,
    &Gantry::Network::PnicSoftwareParams::vxlanEncap,  &Gantry::Network::PnicSoftwareParams::ipv6Tso,
    &Gantry::Network::PnicSoftwareParams::ipv6TsoExt,  &Gantry::Network::PnicSoftwareParams::ipv6Cso,
    &Gantry::Network::PnicSoftwareParams::ipv6CsoExt,  &Gantry::Network::PnicSoftwareParams::highDma,
    &Gantry::Network::PnicSoftwareParams::sgSpanPages, &Gantry::Network::PnicSoftwareParams::tagging,
    &Gantry::Network::PnicSoftwareParams::untagging,   &Gantry::Network::PnicSoftwareParams::geneveOffload};

std::string PortName(int port) {
    return port >= 0 && port < static_cast<int>(std::size(kPortNames)) ? kPortNames[port] : std::to_string(port);
}

bool Better(PnicLinkModeRecord const& a, PnicLinkModeRecord const& b) {
    if (a.speed != b.speed) return a.speed > b.speed;
    return a.duplex == PnicDuplex::Full && b.duplex != PnicDuplex::Full;
}

void ApplyWakeOn(PnicRecord& nic, std::vector<int> const& values) {
    if (!nic.wakeOn) throw GantryException(Subject(nic) + "does not support wake-on-LAN");
    std::string letters;
    for (int value : values) {
        if (value < 0 || value >= static_cast<int>(std::size(kWakeOnNames)))
            throw GantryException("Invalid wake-on value " + std::to_string(value) + " for " + Subject(nic));
        if (nic.wakeOn->supported.find(Trellis::Host::kWakeOnLetters[value]) == std::string::npos)
            throw GantryException(Subject(nic) + "does not support wake-on " + kWakeOnNames[value]);
    }
    for (int value = 0; value < static_cast<int>(std::size(kWakeOnNames)); ++value)
        if (std::find(values.begin(), values.end(), value) != values.end()) letters += Trellis::Host::kWakeOnLetters[value];
    nic.wakeOn->enabled = letters;
}

}  // namespace

PnicRecord RequireNic(Trellis::Host::Transaction const& t, std::string const& name) {
    std::optional<PnicRecord> nic = t.Find<PnicRecord>(name);
    if (!nic) throw GantryException("Physical NIC " + Trellis::Host::Printable(name) + " does not exist");
    return std::move(*nic);
}

std::string Subject(PnicRecord const& nic) { return "Physical NIC " + Trellis::Host::Printable(nic.name) + " "; }

void Negotiate(PnicRecord& nic) {
    const std::vector<PnicLinkModeRecord>& modes = nic.link.advertisedModes;
    auto best = std::min_element(modes.begin(), modes.end(), Better);
    if (best == modes.end()) return;
    nic.speed = best->speed;
    nic.duplex = best->duplex;
}

void ForceSpeedDuplex(PnicRecord& nic, unsigned int speed, int duplex) {
    if (speed == 0 && duplex == 0) {
        if (!nic.link.supportsAutoNegotiation) throw GantryException(Subject(nic) + "does not support autonegotiation");
        nic.link.autoNegotiation = true;
        Negotiate(nic);
        return;
    }
    if (speed == 0 || (duplex != 1 && duplex != 2))
        throw GantryException("Invalid speed and duplex for " + Subject(nic) + "(" + std::to_string(speed) +
                              " Mbps, duplex " + std::to_string(duplex) + ")");
    const PnicLinkModeRecord wanted{speed, duplex == 1 ? PnicDuplex::Full : PnicDuplex::Half};
    const std::vector<PnicLinkModeRecord>& modes = nic.link.supportedModes;
    if (std::find(modes.begin(), modes.end(), wanted) == modes.end())
        throw GantryException(Subject(nic) + "does not support " + std::to_string(speed) + " Mbps " +
                              (duplex == 1 ? "full" : "half") + " duplex");
    nic.link.autoNegotiation = false;
    nic.speed = wanted.speed;
    nic.duplex = wanted.duplex;
}

void ApplyInfo(PnicRecord& nic, Gantry::Network::PnicInfo const& info) {
    if (info.portChanged) {
        const std::vector<int>& ports = nic.link.supportedPorts;
        if (std::find(ports.begin(), ports.end(), info.port) == ports.end())
            throw GantryException(Subject(nic) + "does not support the port type " + PortName(info.port));
        nic.link.port = info.port;
    }
    if (info.phyAddressChanged) {
        if (info.phyAddress < 0 || info.phyAddress > kMaxPhyAddress)
            throw GantryException("Invalid PHY address " + std::to_string(info.phyAddress) + " for " + Subject(nic) +
                                  ": expected 0 to " + std::to_string(kMaxPhyAddress));
        nic.link.phyAddress = info.phyAddress;
    }
    if (info.transceiverChanged) {
        if (info.transceiver != 0 && info.transceiver != 1)
            throw GantryException("Invalid transceiver type " + std::to_string(info.transceiver) + " for " + Subject(nic));
        nic.link.transceiver = info.transceiver;
    }
    if (info.wakeOnChanged) ApplyWakeOn(nic, info.wakeOn);
    if (info.messageLevelChanged) {
        if (!nic.messageLevel) throw GantryException(Subject(nic) + "has no driver message level");
        nic.messageLevel = info.messageLevel;
    }
}

void ApplyPause(PnicRecord& nic, Gantry::Network::PnicPauseParams const& params) {
    if (!nic.pause.supported && (params.autonegotiate || params.rx || params.tx))
        throw GantryException(Subject(nic) + "does not support pause frames");
    nic.pause.autonegotiate = params.autonegotiate;
    nic.pause.rx = params.rx;
    nic.pause.tx = params.tx;
}

void ApplyRings(PnicRecord& nic, Gantry::Network::PnicRingParams const& params) {
    std::uint32_t Trellis::Host::PnicRingsRecord::*const rings[] = {
        &Trellis::Host::PnicRingsRecord::rx, &Trellis::Host::PnicRingsRecord::rxMini,
        &Trellis::Host::PnicRingsRecord::rxJumbo, &Trellis::Host::PnicRingsRecord::tx};
    const std::uint32_t wanted[] = {params.rx, params.rxMini, params.rxJumbo, params.tx};
    for (std::size_t i = 0; i < std::size(rings); ++i) {
        if ((params.mask & (1u << i)) == 0) continue;
        const std::uint32_t maximum = nic.ringMaxima.*rings[i];
        if (wanted[i] > maximum)
            throw GantryException(Subject(nic) + "cannot have a " + kRingNames[i] + " ring of " +
                                  std::to_string(wanted[i]) + " entries: its maximum is " + std::to_string(maximum));
        nic.rings.*rings[i] = wanted[i];
    }
}

void ApplyOffloads(PnicRecord& nic, Gantry::Network::PnicOffloadParams const& params) {
    const bool wanted[] = {params.rxChecksum, params.txChecksum, params.scatterGather, params.tso};
    for (std::size_t i = 0; i < std::size(wanted); ++i) {
        const unsigned int bit = 1u << i;
        if ((params.mask & bit) == 0) continue;
        if (wanted[i] && (nic.supportedOffloads & bit) == 0)
            throw GantryException(Subject(nic) + "does not support " + kOffloadNames[i]);
        nic.enabledOffloads = wanted[i] ? (nic.enabledOffloads | bit) : (nic.enabledOffloads & ~bit);
    }
}

void ApplySoftware(PnicRecord& nic, Gantry::Network::PnicSoftwareParams const& params) {
    for (std::size_t i = 0; i < std::size(kSoftwareFlags); ++i) {
        const std::uint32_t bit = 1u << i;
        if ((params.mask & bit) == 0) continue;
        nic.softwareFeatures = params.*kSoftwareFlags[i] ? (nic.softwareFeatures | bit) : (nic.softwareFeatures & ~bit);
    }
}

void FillInfo(PnicRecord const& nic, Gantry::Network::PnicInfo& info) {
    auto modes = [](std::vector<PnicLinkModeRecord> const& from) {
        std::vector<Gantry::Network::PnicLinkMode> to;
        for (PnicLinkModeRecord const& mode : from)
            to.push_back(Gantry::Network::PnicLinkMode{static_cast<int>(mode.speed), static_cast<int>(mode.duplex)});
        return to;
    };
    info = Gantry::Network::PnicInfo();
    info.supportedPorts = nic.link.supportedPorts;
    info.supportedLinkModes = modes(nic.link.supportedModes);
    info.supportsAutoNegotiation = nic.link.supportsAutoNegotiation;
    info.advertisedLinkModes = modes(nic.link.advertisedModes);
    info.advertisedAutoNegotiation = nic.link.advertisedAutoNegotiation;
    info.port = nic.link.port;
    info.phyAddress = nic.link.phyAddress;
    info.transceiver = nic.link.transceiver;
    info.autoNegotiation = nic.link.autoNegotiation;
    info.supportsWakeOn = nic.wakeOn.has_value();
    if (nic.wakeOn) {
        for (int value = 0; value < static_cast<int>(std::size(kWakeOnNames)); ++value) {
            const char letter = Trellis::Host::kWakeOnLetters[value];
            if (nic.wakeOn->supported.find(letter) != std::string::npos) info.supportedWakeOn.push_back(value);
            if (nic.wakeOn->enabled.find(letter) != std::string::npos) info.wakeOn.push_back(value);
        }
    }
    info.supportsMessageLevel = nic.messageLevel.has_value();
    info.messageLevel = nic.messageLevel.value_or(0);
    info.linkStatus = nic.LinkDetected() ? "Up" : "Down";
}

void FillPause(PnicRecord const& nic, Gantry::Network::PnicPauseParams& params) {
    params.supported = nic.pause.supported;
    params.autonegotiate = nic.pause.autonegotiate;
    params.rx = nic.pause.rx;
    params.tx = nic.pause.tx;
    // Resolved with the partner only while pause is autonegotiated on a link.
    const bool resolved = nic.pause.supported && nic.pause.autonegotiate && nic.LinkDetected();
    params.rxResolution = !resolved ? 0 : (nic.pause.rx && nic.pause.partnerRx ? 1 : 2);
    params.txResolution = !resolved ? 0 : (nic.pause.tx && nic.pause.partnerTx ? 1 : 2);
}

void FillSoftware(PnicRecord const& nic, Gantry::Network::PnicSoftwareParams& params) {
    params.mask = (1u << std::size(kSoftwareFlags)) - 1;
    for (std::size_t i = 0; i < std::size(kSoftwareFlags); ++i)
        params.*kSoftwareFlags[i] = (nic.softwareFeatures & (1u << i)) != 0;
}

}  // namespace PnicDevice
}  // namespace Network
}  // namespace Trellis
