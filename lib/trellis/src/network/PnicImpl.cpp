#include "trellis/network/PnicImpl.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "DVSwitchStore.h"
#include "PnicDevice.h"
#include "SwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/PciDeviceImpl.h"
#include "trellis/network/PortImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PnicRecord;
using Trellis::Host::Transaction;

const Operation kGetName("Pnic::GetName");
const Operation kGetPciDevice("Pnic::GetPciDevice");
const Operation kGetDuplex("Pnic::GetDuplex");
const Operation kIsLinkUp("Pnic::IsLinkUp");
const Operation kIsLinkStatusUp("Pnic::IsLinkStatusUp");
const Operation kIsAdminUp("Pnic::IsAdminUp");
const Operation kGetSpeed("Pnic::GetSpeed");
const Operation kSetSpeedDuplex("Pnic::SetSpeedDuplex");
const Operation kGetDriverName("Pnic::GetDriverName");
const Operation kGetMacAddress("Pnic::GetMacAddress");
const Operation kSetAdminUp("Pnic::SetAdminUp");
const Operation kGetMtu("Pnic::GetMtu");
const Operation kGetPnicInfo("Pnic::GetPnicInfo");
const Operation kGetPauseParams("Pnic::GetPauseParams");
const Operation kGetCoalesceParams("Pnic::GetCoalesceParams");
const Operation kGetRingParams("Pnic::GetRingParams");
const Operation kGetOffloadParams("Pnic::GetOffloadParams");
const Operation kGetSoftwareParams("Pnic::GetSoftwareParams");
const Operation kGetDriverInfo("Pnic::GetDriverInfo");
const Operation kSetPnicInfo("Pnic::SetPnicInfo");
const Operation kSetPauseParams("Pnic::SetPauseParams");
const Operation kSetCoalesceParams("Pnic::SetCoalesceParams");
const Operation kSetRingParams("Pnic::SetRingParams");
const Operation kSetOffloadParams("Pnic::SetOffloadParams");
const Operation kSetSoftwareParams("Pnic::SetSoftwareParams");
const Operation kRestartNegotiation("Pnic::RestartNegotiation");
const Operation kIsValidPnic("PnicImpl::IsValidPnic");
const Operation kGetUplinkPort("PnicImpl::GetUplinkPort");

Gantry::Network::PnicRingParams RingsOf(Trellis::Host::PnicRingsRecord const& rings) {
    Gantry::Network::PnicRingParams params;
    params.mask = Gantry::Network::PnicRingParams::RX | Gantry::Network::PnicRingParams::RX_MINI |
                  Gantry::Network::PnicRingParams::RX_JUMBO | Gantry::Network::PnicRingParams::TX;
    params.rx = rings.rx;
    params.rxMini = rings.rxMini;
    params.rxJumbo = rings.rxJumbo;
    params.tx = rings.tx;
    return params;
}

}  // namespace

PnicImpl::PnicImpl(std::string name) : name_(std::move(name)) {}

PnicImpl::PnicImpl(PnicRecord snapshot)
    : name_(snapshot.name), snapshot_(std::make_unique<PnicRecord>(std::move(snapshot))) {}

PnicImpl::~PnicImpl() {}

PnicRecord const& PnicImpl::Answer(Operation const& operation) {
    if (snapshot_) {
        operation.Check();
    } else {
        snapshot_ = std::make_unique<PnicRecord>(operation.Read([&](Transaction& t) { return PnicDevice::RequireNic(t, name_); }));
    }
    return *snapshot_;
}

void PnicImpl::Change(Operation const& operation, std::function<void(PnicRecord&)> const& change) {
    PnicRecord changed = operation.Write([&](Transaction& t) {
        PnicRecord nic = PnicDevice::RequireNic(t, name_);
        change(nic);
        t.Put(nic);
        return nic;
    });
    snapshot_ = std::make_unique<PnicRecord>(std::move(changed));
}

// A NIC knows its name without asking the host.
std::string PnicImpl::GetName() {
    kGetName.Check();
    return name_;
}

Gantry::Network::PciDevice* PnicImpl::GetPciDevice() {
    PnicRecord const& nic = Answer(kGetPciDevice);
    return nic.pci ? new PciDeviceImpl(nic.pci->address, nic.pci->vendor, nic.pci->device) : nullptr;
}

int PnicImpl::GetDuplex() {
    PnicRecord const& nic = Answer(kGetDuplex);
    return nic.LinkDetected() ? static_cast<int>(nic.duplex) : 0;
}

bool PnicImpl::IsLinkUp() { return Answer(kIsLinkUp).LinkDetected(); }

bool PnicImpl::IsLinkStatusUp() { return Answer(kIsLinkStatusUp).LinkDetected(); }

bool PnicImpl::IsAdminUp() { return Answer(kIsAdminUp).adminUp; }

unsigned int PnicImpl::GetSpeed() {
    PnicRecord const& nic = Answer(kGetSpeed);
    return nic.LinkDetected() ? nic.speed : 0;
}

void PnicImpl::SetSpeedDuplex(unsigned int speed, int duplex) {
    Change(kSetSpeedDuplex, [&](PnicRecord& nic) { PnicDevice::ForceSpeedDuplex(nic, speed, duplex); });
}

std::string PnicImpl::GetDriverName() { return Answer(kGetDriverName).driver; }

Gantry::Network::MacAddress PnicImpl::GetMacAddress() {
    return Gantry::Network::MacAddress(Answer(kGetMacAddress).macAddress);
}

// Coming up, a NIC that autonegotiates negotiates its link anew.
void PnicImpl::SetAdminUp(bool up) {
    Change(kSetAdminUp, [&](PnicRecord& nic) {
        if (up && !nic.adminUp && nic.link.autoNegotiation) PnicDevice::Negotiate(nic);
        nic.adminUp = up;
    });
}

int PnicImpl::GetMtu() { return Answer(kGetMtu).mtu; }

void PnicImpl::GetPnicInfo(Gantry::Network::PnicInfo& info) { PnicDevice::FillInfo(Answer(kGetPnicInfo), info); }

void PnicImpl::GetPauseParams(Gantry::Network::PnicPauseParams& params) {
    PnicDevice::FillPause(Answer(kGetPauseParams), params);
}

void PnicImpl::GetCoalesceParams(Gantry::Network::PnicCoalesceParams& params) {
    Trellis::Host::PnicCoalesceRecord const& coalesce = Answer(kGetCoalesceParams).coalesce;
    params.adaptiveRx = coalesce.adaptiveRx;
    params.adaptiveTx = coalesce.adaptiveTx;
    params.sampleInterval = coalesce.sampleInterval;
    params.rxUsecs = coalesce.rxUsecs;
    params.rxMaxFrames = coalesce.rxMaxFrames;
    params.txUsecs = coalesce.txUsecs;
    params.txMaxFrames = coalesce.txMaxFrames;
}

void PnicImpl::GetRingParams(Gantry::Network::PnicRingParams& preset, Gantry::Network::PnicRingParams& current) {
    PnicRecord const& nic = Answer(kGetRingParams);
    preset = RingsOf(nic.ringMaxima);
    current = RingsOf(nic.rings);
}

// The mask tells which offloads the device has.
void PnicImpl::GetOffloadParams(Gantry::Network::PnicOffloadParams& params) {
    PnicRecord const& nic = Answer(kGetOffloadParams);
    params.mask = static_cast<std::uint8_t>(nic.supportedOffloads);
    params.rxChecksum = (nic.enabledOffloads & Gantry::Network::PnicOffloadParams::RX_CHECKSUM) != 0;
    params.txChecksum = (nic.enabledOffloads & Gantry::Network::PnicOffloadParams::TX_CHECKSUM) != 0;
    params.scatterGather = (nic.enabledOffloads & Gantry::Network::PnicOffloadParams::SCATTER_GATHER) != 0;
    params.tso = (nic.enabledOffloads & Gantry::Network::PnicOffloadParams::TSO) != 0;
}

void PnicImpl::GetSoftwareParams(Gantry::Network::PnicSoftwareParams& params) {
    PnicDevice::FillSoftware(Answer(kGetSoftwareParams), params);
}

void PnicImpl::GetDriverInfo(Gantry::Network::PnicDriverInfo& info) {
    PnicRecord const& nic = Answer(kGetDriverInfo);
    info.driver = nic.driver;
    info.version = nic.driverVersion;
    info.firmwareVersion = nic.firmwareVersion;
    info.busInfo = nic.busInfo;
}

void PnicImpl::SetPnicInfo(Gantry::Network::PnicInfo const& info) {
    Change(kSetPnicInfo, [&](PnicRecord& nic) { PnicDevice::ApplyInfo(nic, info); });
}

void PnicImpl::SetPauseParams(Gantry::Network::PnicPauseParams const& params) {
    Change(kSetPauseParams, [&](PnicRecord& nic) { PnicDevice::ApplyPause(nic, params); });
}

void PnicImpl::SetCoalesceParams(Gantry::Network::PnicCoalesceParams const& params) {
    Change(kSetCoalesceParams, [&](PnicRecord& nic) {
        nic.coalesce = Trellis::Host::PnicCoalesceRecord{params.adaptiveRx, params.adaptiveTx, params.sampleInterval,
                                                         params.rxUsecs,    params.rxMaxFrames, params.txUsecs,
                                                         params.txMaxFrames};
    });
}

void PnicImpl::SetRingParams(Gantry::Network::PnicRingParams const& params) {
    Change(kSetRingParams, [&](PnicRecord& nic) { PnicDevice::ApplyRings(nic, params); });
}

void PnicImpl::SetOffloadParams(Gantry::Network::PnicOffloadParams const& params) {
    Change(kSetOffloadParams, [&](PnicRecord& nic) { PnicDevice::ApplyOffloads(nic, params); });
}

void PnicImpl::SetSoftwareParams(Gantry::Network::PnicSoftwareParams const& params) {
    Change(kSetSoftwareParams, [&](PnicRecord& nic) { PnicDevice::ApplySoftware(nic, params); });
}

void PnicImpl::RestartNegotiation() {
    Change(kRestartNegotiation, [&](PnicRecord& nic) {
        if (!nic.link.autoNegotiation)
            throw Gantry::Lib::GantryException("Unable to restart negotiation on " + Trellis::Host::Printable(nic.name) +
                                               ": autonegotiation is off");
        PnicDevice::Negotiate(nic);
    });
}

PortImpl* PnicImpl::GetUplinkPort() {
    std::optional<Trellis::Host::PortRecord> port = kGetUplinkPort.Read([&](Transaction& t) {
        std::string vswitch;
        for (Trellis::Host::StandardSwitchRecord const& record : t.List<Trellis::Host::StandardSwitchRecord>())
            if (std::find(record.uplinks.begin(), record.uplinks.end(), name_) != record.uplinks.end())
                vswitch = record.name;
        if (vswitch.empty()) vswitch = DVSwitchStore::SwitchOfNic(t, name_);
        return vswitch.empty() ? std::nullopt : SwitchStore::UplinkPortOf(t, vswitch, name_);
    });
    if (!port)
        throw Gantry::Lib::GantryException("Physical NIC " + Trellis::Host::Printable(name_) +
                                           " has no uplink port on any switch");
    return new PortImpl(std::move(*port));
}

bool PnicImpl::IsValidPnic(std::string const& name) {
    return kIsValidPnic.Read([&](Transaction& t) { return t.Contains<PnicRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis
