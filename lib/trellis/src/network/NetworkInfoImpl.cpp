#include "trellis/network/NetworkInfoImpl.h"

#include <algorithm>
#include <iterator>
#include <optional>
#include <utility>

#include "PnicDevice.h"
#include "RoutingStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/IpSettingsRecord.h"
#include "trellis/host/records/TslNicRecord.h"
#include "trellis/network/NetstackInstanceImpl.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/network/PortGroupImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PnicRecord;
using Trellis::Host::PortGroupRecord;
using Trellis::Host::Transaction;

const Operation kConstruct("NetworkInfoImpl::NetworkInfoImpl");
const Operation kGetNetstackInstanceState("NetworkInfo::GetNetstackInstanceState");
const Operation kAddNetstackInstance("NetworkInfoImpl::AddNetstackInstance");
const Operation kRemoveNetstackInstance("NetworkInfoImpl::RemoveNetstackInstance");
const Operation kListNetstackInstances("NetworkInfoImpl::ListNetstackInstances");
const Operation kLookupNetstackInstanceByKey("NetworkInfoImpl::LookupNetstackInstanceByKey");
const Operation kIsTslIpv6Enabled("NetworkInfoImpl::IsTslIpv6Enabled");
const Operation kSetTslIpv6Enabled("NetworkInfoImpl::SetTslIpv6Enabled");
const Operation kGetCurrentTcpTesselConnections("NetworkInfoImpl::GetCurrentTcpTesselConnections");
const Operation kGetCurrentUdpTesselConnections("NetworkInfoImpl::GetCurrentUdpTesselConnections");
const Operation kGetCurrentIpTesselConnections("NetworkInfoImpl::GetCurrentIpTesselConnections");

void ConnectionsOf(Operation const& operation, int protocol, std::string const& key,
                   std::vector<Gantry::Network::IpConnection>& connections) {
    Trellis::Host::NetstackRecord netstack =
        operation.Read([&](Transaction& t) { return RoutingStore::RequireNetstack(t, key); });
    for (Trellis::Host::SocketRecord const& socket : netstack.connections) {
        if (socket.protocol != protocol) continue;
        Gantry::Network::IpConnection connection;
        connection.protocol = Trellis::Host::kSocketProtocolWords[socket.protocol];
        connection.recvQueue = socket.recvQueue;
        connection.sendQueue = socket.sendQueue;
        connection.localAddress = socket.localAddress;
        connection.localPort = static_cast<std::uint16_t>(socket.localPort);
        connection.foreignAddress = socket.foreignAddress;
        connection.foreignPort = static_cast<std::uint16_t>(socket.foreignPort);
        connection.state = socket.state;
        connection.worldId = static_cast<std::uint32_t>(socket.worldId);
        connection.congestionControl = socket.congestionControl;
        connections.push_back(connection);
    }
}
const Operation kGetPnics("NetworkInfoImpl::GetPnics");
const Operation kGetPnicByName("NetworkInfoImpl::GetPnicByName");
const Operation kGetAllPortGroups("NetworkInfoImpl::GetAllPortGroups");
const Operation kGetSriovNics("NetworkInfoImpl::GetSriovNics");
const Operation kGetSriovNicByName("NetworkInfoImpl::GetSriovNicByName");
const Operation kGetSriovNicVFInfo("NetworkInfoImpl::GetSriovNicVFInfo");
const Operation kGetSriovNicVFStats("NetworkInfoImpl::GetSriovNicVFStats");

// The virtual functions of an SR-IOV NIC; refuses any other NIC.
std::vector<Trellis::Host::SriovVfRecord> RequireVirtualFunctions(Transaction const& t, std::string const& name) {
    PnicRecord nic = PnicDevice::RequireNic(t, name);
    if (!nic.sriov) throw Gantry::Lib::GantryException(PnicDevice::Subject(nic) + "has no SR-IOV");
    return std::move(*nic.sriov);
}

// Each counter of SriovNicVFStats, in the order of the stored counters.
constexpr std::uint64_t Gantry::Network::SriovNicVFStats::*kVfStatsFields[] = {
    &Gantry::Network::SriovNicVFStats::rxUnicastPkts,      &Gantry::Network::SriovNicVFStats::rxUnicastBytes,
    &Gantry::Network::SriovNicVFStats::rxMulticastPkts,    &Gantry::Network::SriovNicVFStats::rxMulticastBytes,
    &Gantry::Network::SriovNicVFStats::rxBroadcastPkts,    &Gantry::Network::SriovNicVFStats::rxBroadcastBytes,
    &Gantry::Network::SriovNicVFStats::rxOutOfBufferDrops, &Gantry::Network::SriovNicVFStats::rxErrorDrops,
    &Gantry::Network::SriovNicVFStats::rxLroPkts,          &Gantry::Network::SriovNicVFStats::rxLroBytes,
    &Gantry::Network::SriovNicVFStats::txUnicastPkts,      &Gantry::Network::SriovNicVFStats::txUnicastBytes,
    &Gantry::Network::SriovNicVFStats::txMulticastPkts,    &Gantry::Network::SriovNicVFStats::txMulticastBytes,
    &Gantry::Network::SriovNicVFStats::txBroadcastPkts,    &Gantry::Network::SriovNicVFStats::txBroadcastBytes,
    &Gantry::Network::SriovNicVFStats::txErrors,           &Gantry::Network::SriovNicVFStats::txDiscards,
    &Gantry::Network::SriovNicVFStats::txTsoPkts,          &Gantry::Network::SriovNicVFStats::txTsoBytes};
static_assert(std::size(kVfStatsFields) == std::size(Trellis::Host::kVfCounterNames));

}  // namespace

NetworkInfoImpl::NetworkInfoImpl() { kConstruct.Check(); }

NetworkInfoImpl::~NetworkInfoImpl() {}

std::vector<Gantry::Network::Pnic*> NetworkInfoImpl::GetPnics() {
    std::vector<std::string> names = kGetPnics.Read([](Transaction& t) { return t.Names<PnicRecord>(); });
    std::vector<Gantry::Network::Pnic*> nics;
    for (std::string& name : names) nics.push_back(new PnicImpl(std::move(name)));
    return nics;
}

Gantry::Network::Pnic* NetworkInfoImpl::GetPnicByName(std::string const& name) {
    bool found = kGetPnicByName.Read([&](Transaction& t) { return t.Contains<PnicRecord>(name); });
    return found ? new PnicImpl(name) : nullptr;
}

std::vector<Gantry::Network::Pnic*> NetworkInfoImpl::GetSriovNics() {
    std::vector<PnicRecord> records = kGetSriovNics.Read([](Transaction& t) { return t.List<PnicRecord>(); });
    std::vector<Gantry::Network::Pnic*> nics;
    for (PnicRecord& record : records)
        if (record.sriov) nics.push_back(new PnicImpl(std::move(record)));
    return nics;
}

Gantry::Network::Pnic* NetworkInfoImpl::GetSriovNicByName(std::string const& name) {
    std::optional<PnicRecord> record = kGetSriovNicByName.Read([&](Transaction& t) { return t.Find<PnicRecord>(name); });
    return record && record->sriov ? new PnicImpl(std::move(*record)) : nullptr;
}

std::vector<Gantry::Network::SriovNicVFInfo*> NetworkInfoImpl::GetSriovNicVFInfo(std::string const& nicName) {
    std::vector<Trellis::Host::SriovVfRecord> functions =
        kGetSriovNicVFInfo.Read([&](Transaction& t) { return RequireVirtualFunctions(t, nicName); });
    std::sort(functions.begin(), functions.end(),
              [](Trellis::Host::SriovVfRecord const& a, Trellis::Host::SriovVfRecord const& b) { return a.id < b.id; });
    std::vector<Gantry::Network::SriovNicVFInfo*> infos;
    for (Trellis::Host::SriovVfRecord const& vf : functions)
        infos.push_back(new Gantry::Network::SriovNicVFInfo{vf.id, vf.active, vf.pciAddress, vf.ownerWorldId});
    return infos;
}

void NetworkInfoImpl::GetSriovNicVFStats(Gantry::Network::SriovNicVFStats* stats, std::string const& nicName, int vfId) {
    Trellis::Host::SriovVfRecord vf = kGetSriovNicVFStats.Read([&](Transaction& t) {
        for (Trellis::Host::SriovVfRecord& function : RequireVirtualFunctions(t, nicName))
            if (function.id == vfId) return function;
        throw Gantry::Lib::GantryException("Physical NIC " + Trellis::Host::Printable(nicName) +
                                           " has no virtual function " + std::to_string(vfId));
    });
    if (stats == nullptr) return;
    for (std::size_t i = 0; i < std::size(kVfStatsFields); ++i) stats->*kVfStatsFields[i] = vf.counters[i];
}

std::vector<Gantry::Network::PortGroup*> NetworkInfoImpl::GetAllPortGroups() {
    std::vector<PortGroupRecord> records =
        kGetAllPortGroups.Read([](Transaction& t) { return t.List<PortGroupRecord>(); });
    std::vector<Gantry::Network::PortGroup*> groups;
    for (PortGroupRecord& record : records) groups.push_back(new PortGroupImpl(std::move(record)));
    return groups;
}

void NetworkInfoImpl::AddNetstackInstance(Gantry::Network::NetstackInstance* instance, bool disabled) {
    auto* made = dynamic_cast<NetstackInstanceImpl*>(instance);
    if (made == nullptr) throw Gantry::Lib::GantryException("Unable to add a netstack instance: none was given");
    Trellis::Host::NetstackRecord record = made->Snapshot();
    kAddNetstackInstance.Write([&](Transaction& t) {
        const std::string refusal = "Unable to add netstack instance " + Trellis::Host::Printable(record.name) + ": ";
        if (record.name.empty())
            throw Gantry::Lib::GantryException("Unable to add a netstack instance: its key must not be empty");
        std::string problem = Trellis::Host::TextProblem(record.name);
        if (!problem.empty()) throw Gantry::Lib::GantryException(refusal + "its key " + problem);
        if (t.Contains<Trellis::Host::NetstackRecord>(record.name))
            throw Gantry::Lib::GantryException(refusal + "an instance of that key exists already");
        record.inKernel = !disabled;
        record.currentMaxConnections = record.maxConnections;
        record.currentIpv6Enabled = record.ipv6Enabled;
        record.routing = Trellis::Host::RoutingRecord();
        t.Put(record);
    });
}

void NetworkInfoImpl::RemoveNetstackInstance(std::string const& key, bool /*flag*/) {
    kRemoveNetstackInstance.Write([&](Transaction& t) {
        RoutingStore::RequireNetstack(t, key);
        const std::string refusal = "Unable to remove netstack instance " + key + ": ";
        if (key == Trellis::Host::NetstackRecord::kDefaultKey)
            throw Gantry::Lib::GantryException(refusal + "it is the host's default instance");
        std::vector<Trellis::Host::TslNicRecord> nics = t.ChildrenOf<Trellis::Host::TslNicRecord>(key);
        if (!nics.empty())
            throw Gantry::Lib::GantryException(refusal + "it has interfaces (" + nics.front().name +
                                               (nics.size() > 1 ? " and " + std::to_string(nics.size() - 1) + " more" : "") + ")");
        t.Erase<Trellis::Host::NetstackRecord>(key);
    });
}

std::vector<Gantry::Network::NetstackInstance*> NetworkInfoImpl::ListNetstackInstances() {
    std::vector<Trellis::Host::NetstackRecord> records =
        kListNetstackInstances.Read([](Transaction& t) { return t.List<Trellis::Host::NetstackRecord>(); });
    std::vector<Gantry::Network::NetstackInstance*> instances;
    for (Trellis::Host::NetstackRecord& record : records) instances.push_back(new NetstackInstanceImpl(std::move(record)));
    return instances;
}

Gantry::Network::NetstackInstance* NetworkInfoImpl::LookupNetstackInstanceByKey(std::string const& key) {
    std::optional<Trellis::Host::NetstackRecord> record = kLookupNetstackInstanceByKey.Read(
        [&](Transaction& t) { return t.Find<Trellis::Host::NetstackRecord>(key); });
    return record ? new NetstackInstanceImpl(std::move(*record)) : nullptr;
}

bool NetworkInfoImpl::IsTslIpv6Enabled() {
    return kIsTslIpv6Enabled.Read([](Transaction& t) {
        return t.Find<Trellis::Host::IpSettingsRecord>(Trellis::Host::IpSettingsRecord::kName)
            .value_or(Trellis::Host::IpSettingsRecord())
            .ipv6Enabled;
    });
}

void NetworkInfoImpl::SetTslIpv6Enabled(bool enabled) {
    kSetTslIpv6Enabled.Write([&](Transaction& t) {
        Trellis::Host::IpSettingsRecord settings =
            t.Find<Trellis::Host::IpSettingsRecord>(Trellis::Host::IpSettingsRecord::kName).value_or(Trellis::Host::IpSettingsRecord());
        settings.ipv6Enabled = enabled;
        t.Put(settings);
    });
}

void NetworkInfoImpl::GetCurrentTcpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                                     std::string const& netstackKey) {
    ConnectionsOf(kGetCurrentTcpTesselConnections, 0, netstackKey, connections);
}

void NetworkInfoImpl::GetCurrentUdpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                                     std::string const& netstackKey) {
    ConnectionsOf(kGetCurrentUdpTesselConnections, 1, netstackKey, connections);
}

void NetworkInfoImpl::GetCurrentIpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                                    std::string const& netstackKey) {
    ConnectionsOf(kGetCurrentIpTesselConnections, 2, netstackKey, connections);
}

int NetworkInfoImpl::GetNetstackInstanceState(std::string const& key) {
    return kGetNetstackInstanceState.Read([&](Transaction& t) {
        std::optional<Trellis::Host::NetstackRecord> netstack = t.Find<Trellis::Host::NetstackRecord>(key);
        return netstack && netstack->inKernel ? NETSTACK_STATE_IN_KERNEL : 0;
    });
}

}  // namespace Network
}  // namespace Trellis
