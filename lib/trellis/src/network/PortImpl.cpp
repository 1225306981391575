#include "trellis/network/PortImpl.h"

#include <utility>

#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PortClientKind;

const Operation kGetPortId("PortImpl::GetPortId");
const Operation kGetWorldId("PortImpl::GetWorldId");
const Operation kGetPortGroupName("PortImpl::GetPortGroupName");
const Operation kGetDVPortId("PortImpl::GetDVPortId");
const Operation kGetMacAddresses("PortImpl::GetMacAddresses");
const Operation kGetIpv4Address("PortImpl::GetIpv4Address");
const Operation kGetTeamUplink("PortImpl::GetTeamUplink");
const Operation kGetClientType("PortImpl::GetClientType");
const Operation kGetByteStats("PortImpl::GetByteStats");
const Operation kGetPacketStats("PortImpl::GetPacketStats");
const Operation kGetFilterStats("PortImpl::GetFilterStats");

}  // namespace

PortImpl::PortImpl(Trellis::Host::PortRecord snapshot) : snapshot_(std::move(snapshot)) {}

PortImpl::~PortImpl() {}

int PortImpl::GetPortId() {
    kGetPortId.Check();
    return static_cast<int>(snapshot_.id);
}

int PortImpl::GetWorldId() {
    kGetWorldId.Check();
    return static_cast<int>(snapshot_.worldId);
}

std::string PortImpl::GetPortGroupName() {
    kGetPortGroupName.Check();
    return snapshot_.portGroup;
}

std::string PortImpl::GetDVPortId() {
    kGetDVPortId.Check();
    return snapshot_.dvPort;
}

// A port without an address of its own (an uplink's, say) answers the empty
// address, so that the list always has a first element.
std::vector<Gantry::Network::MacAddress> PortImpl::GetMacAddresses() {
    kGetMacAddresses.Check();
    std::vector<Gantry::Network::MacAddress> addresses;
    for (std::string const& text : snapshot_.macAddresses) addresses.emplace_back(text);
    if (addresses.empty()) addresses.emplace_back();
    return addresses;
}

Gantry::Network::Ipv4Address PortImpl::GetIpv4Address() {
    kGetIpv4Address.Check();
    return snapshot_.ipv4Address.empty() ? Gantry::Network::Ipv4Address()
                                         : Gantry::Network::Ipv4Address(snapshot_.ipv4Address);
}

std::string PortImpl::GetTeamUplink() {
    kGetTeamUplink.Check();
    if (snapshot_.clientKind == PortClientKind::Uplink && snapshot_.teamUplink.empty()) return snapshot_.clientName;
    return snapshot_.teamUplink;
}

int PortImpl::GetClientType() {
    kGetClientType.Check();
    switch (snapshot_.clientKind) {
        case PortClientKind::TesselNic:
            return CLIENT_TYPE_TESSEL_NIC;
        case PortClientKind::Uplink:
            return CLIENT_TYPE_UPLINK;
        case PortClientKind::VmAdapter:
            break;
    }
    return CLIENT_TYPE_VM_ADAPTER;
}

void PortImpl::GetByteStats(PortByteStats& stats) {
    kGetByteStats.Check();
    stats.bytesSent = snapshot_.stats.bytesSent;
    stats.bytesReceived = snapshot_.stats.bytesReceived;
}

void PortImpl::GetPacketStats(PortPacketStats& stats) {
    kGetPacketStats.Check();
    Trellis::Host::PortStatsRecord const& s = snapshot_.stats;
    stats = PortPacketStats{s.packetsSent,       s.multicastSent,     s.broadcastSent,   s.packetsReceived,
                            s.multicastReceived, s.broadcastReceived, s.transmitDropped, s.receiveDropped};
}

std::vector<Gantry::Network::FilterStats*> PortImpl::GetFilterStats() {
    kGetFilterStats.Check();
    std::vector<Gantry::Network::FilterStats*> records;
    for (Trellis::Host::PortFilterRecord const& filter : snapshot_.filters) {
        auto* stats = new Gantry::Network::FilterStats;
        stats->name = filter.name;
        stats->groupName = filter.groupName;
        stats->active = filter.active;
        stats->reversePath = filter.reversePath;
        stats->hasExtendedCounters = filter.extendedCounters;
        std::uint64_t const* c = filter.counters;
        stats->packetsIn = c[0];
        stats->packetsOut = c[1];
        stats->packetsDropped = c[2];
        stats->packetsFiltered = c[3];
        stats->packetsFaulted = c[4];
        stats->packetsQueued = c[5];
        stats->packetsInjected = c[6];
        stats->packetErrors = c[7];
        records.push_back(stats);
    }
    return records;
}

}  // namespace Network
}  // namespace Trellis
