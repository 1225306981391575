#include "trellis/network/DVSwitchImpl.h"

#include <algorithm>
#include <cstring>
#include <utility>

#include "DVSwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/host/Operation.h"
#include "trellis/network/DVPortImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::DVPortRecord;
using Trellis::Host::DVSwitchRecord;
using Trellis::Host::LacpGroupRecord;
using Trellis::Host::LacpNicRecord;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kGetId("DVSwitch::GetId");
const Operation kGetMtu("DVSwitch::GetMtu");
const Operation kGetBeaconTimeout("DVSwitch::GetBeaconTimeout");
const Operation kGetCdpStatus("DVSwitch::GetCdpStatus");
const Operation kIsKorvexBranded("DVSwitchImpl::IsKorvexBranded");
const Operation kGetDVPorts("DVSwitch::GetDVPorts");
const Operation kGetUplinkPortParams("DVSwitch::GetUplinkPortParams");
const Operation kGetUplinkPortNames("DVSwitch::GetUplinkPortNames");
const Operation kGetUplinkPort("DVSwitch::GetUplinkPort");
const Operation kGetLagConfigs("DVSwitch::GetLagConfigs");
const Operation kGetLacpGroups("DVSwitch::GetLacpGroups");
const Operation kFreeLacpGroups("DVSwitch::FreeLacpGroups");
const Operation kSetLacpTimeout("DVSwitch::SetLacpTimeout");

template <std::size_t N>
void CopyText(char (&field)[N], std::string const& text) {
    std::memset(field, 0, N);
    std::memcpy(field, text.data(), std::min(text.size(), N - 1));
}

// The kernel's record of one NIC: the local flags tell the timeout (Slow or
// Fast LACPDUs) and the mode (Active or Passive).
Gantry::Network::LacpNic* KernelRecord(LacpNicRecord const& nic, int mode) {
    auto* record = new Gantry::Network::LacpNic{};
    CopyText(record->name, nic.name);
    CopyText(record->state, nic.state);
    CopyText(record->localFlags, std::string(nic.shortTimeout ? "F" : "S") +
                                     (mode == Gantry::Network::LACP_MODE_PASSIVE ? "P" : "A"));
    record->portNumber = nic.portNumber;
    record->portPriority = nic.portPriority;
    record->adminKey = nic.adminKey;
    record->operKey = nic.operKey;
    record->portState = static_cast<std::uint8_t>(nic.portState | (nic.shortTimeout ? Gantry::Network::LACP_STATE_TIMEOUT : 0));
    CopyText(record->partnerFlags, nic.partnerFlags);
    CopyText(record->partnerDeviceId, nic.partnerDeviceId);
    record->partnerAge = nic.partnerAge;
    record->partnerPortNumber = nic.partnerPortNumber;
    record->partnerPortPriority = nic.partnerPortPriority;
    record->partnerOperKey = nic.partnerOperKey;
    record->partnerPortState = nic.partnerPortState;
    record->rxLacpdus = nic.rxLacpdus;
    record->txLacpdus = nic.txLacpdus;
    record->rxErrors = nic.rxErrors;
    record->txErrors = nic.txErrors;
    return record;
}

}  // namespace

DVSwitchImpl::DVSwitchImpl(std::string const& name, int numPorts) : PortsetImpl(name, numPorts, CLASS_NAME) {
    snapshot_.name = name;
}

DVSwitchImpl::DVSwitchImpl(DVSwitchRecord snapshot, std::vector<std::string> uplinks)
    : PortsetImpl(snapshot.name, snapshot.numPorts, std::move(uplinks), CLASS_NAME), snapshot_(std::move(snapshot)) {}

DVSwitchImpl::~DVSwitchImpl() {}

void DVSwitchImpl::Load(Transaction const& t) {
    Refresh(DVSwitchStore::RequireDVSwitch(t, name_), DVSwitchStore::UplinksOf(t, name_));
}

void DVSwitchImpl::Refresh(DVSwitchRecord record, std::vector<std::string> uplinks) {
    numPorts_ = record.numPorts;
    uplinks_ = std::move(uplinks);
    snapshot_ = std::move(record);
}

std::string DVSwitchImpl::GetId() {
    Answer(kGetId);
    return snapshot_.id;
}

int DVSwitchImpl::GetMtu() {
    Answer(kGetMtu);
    return snapshot_.mtu;
}

int DVSwitchImpl::GetBeaconTimeout() {
    Answer(kGetBeaconTimeout);
    return snapshot_.beaconTimeout;
}

std::string DVSwitchImpl::GetCdpStatus() {
    Answer(kGetCdpStatus);
    return Trellis::Host::WordOf(snapshot_.cdpStatus, Trellis::Host::kCdpStatusWords);
}

bool DVSwitchImpl::IsKorvexBranded() {
    Answer(kIsKorvexBranded);
    return snapshot_.korvexBranded;
}

std::vector<Gantry::Network::DVPort*> DVSwitchImpl::GetDVPorts() {
    struct Read {
        std::vector<DVPortRecord> ports;
        std::map<std::string, std::vector<std::string>> clients;
    };
    Read read = kGetDVPorts.Read([&](Transaction& t) {
        EnsureLoaded(t);
        return Read{DVSwitchStore::PortsOf(t, name_), DVSwitchStore::ClientsByPort(t, name_)};
    });
    std::vector<Gantry::Network::DVPort*> ports;
    for (DVPortRecord& port : read.ports) {
        std::vector<std::string> clients = read.clients[port.portId];
        ports.push_back(new DVPortImpl(std::move(port), std::move(clients)));
    }
    return ports;
}

std::map<std::string, Gantry::Network::DVPortParam> DVSwitchImpl::GetUplinkPortParams() {
    return kGetUplinkPortParams.Read([&](Transaction& t) {
        EnsureLoaded(t);
        std::map<std::string, Gantry::Network::DVPortParam> params;
        for (DVPortRecord const& port : DVSwitchStore::PortsOf(t, name_))
            if (port.IsUplink() && !port.nic.empty()) params[port.uplinkName] = {port.dvsId, port.portId};
        return params;
    });
}

void DVSwitchImpl::GetUplinkPortNames(std::vector<std::string>& nicNames, std::vector<std::string>& portNames) {
    kGetUplinkPortNames.Read([&](Transaction& t) {
        EnsureLoaded(t);
        for (DVPortRecord const& port : DVSwitchStore::PortsOf(t, name_)) {
            if (!port.IsUplink()) continue;
            if (!port.nic.empty()) nicNames.push_back(port.nic);
            portNames.push_back(port.uplinkName);
        }
    });
}

Gantry::Network::DVPort* DVSwitchImpl::GetUplinkPort(std::string const& name) {
    return kGetUplinkPort.Read([&](Transaction& t) -> Gantry::Network::DVPort* {
        EnsureLoaded(t);
        for (DVPortRecord& port : DVSwitchStore::PortsOf(t, name_))
            if (port.IsUplink() && port.uplinkName == name) {
                std::vector<std::string> clients = DVSwitchStore::ClientsByPort(t, name_)[port.portId];
                return new DVPortImpl(std::move(port), std::move(clients));
            }
        return nullptr;
    });
}

std::vector<Gantry::Network::LagConfig> DVSwitchImpl::GetLagConfigs() {
    Answer(kGetLagConfigs);
    std::vector<Gantry::Network::LagConfig> lags;
    for (Trellis::Host::LagRecord const& lag : snapshot_.lags)
        lags.push_back({lag.id, lag.name, lag.mode, lag.loadBalance, lag.uplinkCount});
    return lags;
}

std::vector<Gantry::Network::LacpGroup*>* DVSwitchImpl::GetLacpGroups() {
    Answer(kGetLacpGroups);
    auto* groups = new std::vector<Gantry::Network::LacpGroup*>;
    for (LacpGroupRecord const& group : snapshot_.lacpGroups) {
        auto* running = new Gantry::Network::LacpGroup;
        running->lagId = group.lagId;
        running->mode = group.mode;
        groups->push_back(running);
        for (LacpNicRecord const& nic : group.nics) running->nics.push_back(KernelRecord(nic, group.mode));
    }
    return groups;
}

// What GetLacpGroups handed out is released even when the host then reports
// a failure.
void DVSwitchImpl::FreeLacpGroups(std::vector<Gantry::Network::LacpGroup*>* groups) {
    if (groups != nullptr) {
        for (Gantry::Network::LacpGroup* group : *groups) {
            for (Gantry::Network::LacpNic* nic : group->nics) delete nic;
            delete group;
        }
        delete groups;
    }
    kFreeLacpGroups.Check();
}

void DVSwitchImpl::SetLacpTimeout(int lagId, bool timeout, std::string const& nicName) {
    struct Written {
        DVSwitchRecord record;
        std::vector<std::string> uplinks;
    };
    Written written = kSetLacpTimeout.Write([&](Transaction& t) {
        DVSwitchRecord record = DVSwitchStore::RequireDVSwitch(t, name_);
        const std::string refusal = "Unable to set the LACP timeout on distributed switch " + name_ + ": ";
        auto group = std::find_if(record.lacpGroups.begin(), record.lacpGroups.end(), [&](LacpGroupRecord const& g) {
            return lagId >= 0 && g.lagId == static_cast<std::uint32_t>(lagId);
        });
        if (group == record.lacpGroups.end())
            throw Gantry::Lib::GantryException(refusal + "it has no running LAG " + std::to_string(lagId));
        bool found = nicName.empty();
        for (LacpNicRecord& nic : group->nics)
            if (nicName.empty() || nic.name == nicName) {
                nic.shortTimeout = timeout;
                found = true;
            }
        if (!found)
            throw Gantry::Lib::GantryException(refusal + "LAG " + std::to_string(lagId) + " has no NIC " +
                                               Trellis::Host::Printable(nicName));
        t.Put(record);
        return Written{record, DVSwitchStore::UplinksOf(t, name_)};
    });
    Refresh(std::move(written.record), std::move(written.uplinks));
    MarkLoaded();
}

}  // namespace Network
}  // namespace Trellis
