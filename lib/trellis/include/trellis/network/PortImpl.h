#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/FilterStats.h"
#include "gantry/network/Ipv4Address.h"
#include "gantry/network/MacAddress.h"
#include "gantry/network/Port.h"
#include "trellis/host/records/PortRecord.h"

namespace Trellis {
namespace Network {

// What GetByteStats fills.
struct PortByteStats {
    std::uint64_t bytesSent = 0;
    std::uint64_t bytesReceived = 0;
};

// What GetPacketStats fills.
struct PortPacketStats {
    std::uint64_t packetsSent = 0;
    std::uint64_t multicastSent = 0;
    std::uint64_t broadcastSent = 0;
    std::uint64_t packetsReceived = 0;
    std::uint64_t multicastReceived = 0;
    std::uint64_t broadcastReceived = 0;
    std::uint64_t transmitDropped = 0;
    std::uint64_t receiveDropped = 0;
};

// A port in use on a switch of the simulated host, standard or distributed:
// a VM's adapter, a kernel interface or an uplink. It answers from the
// snapshot of its record taken by the lookup that made it.
class PortImpl : public virtual Gantry::Network::Port {
public:
    // GetClientType: what is connected to the port.
    static constexpr int CLIENT_TYPE_TESSEL_NIC = 3;
    static constexpr int CLIENT_TYPE_UPLINK = 4;
    static constexpr int CLIENT_TYPE_VM_ADAPTER = 5;

    explicit PortImpl(Trellis::Host::PortRecord snapshot);
    ~PortImpl() override;

    int GetPortId() override;
    // The world (running VM) that owns the port; 0 when none does.
    int GetWorldId();
    // The port group on a standard switch; empty on a distributed one.
    std::string GetPortGroupName();
    // The DVPort on a distributed switch; empty on a standard one.
    std::string GetDVPortId();
    std::vector<Gantry::Network::MacAddress> GetMacAddresses();
    // The client's IPv4 address; 0.0.0.0 when it has none.
    Gantry::Network::Ipv4Address GetIpv4Address();
    // The NIC that carries the port's traffic; for an uplink, its own NIC.
    std::string GetTeamUplink();
    int GetClientType();
    void GetByteStats(PortByteStats& stats);
    void GetPacketStats(PortPacketStats& stats);
    // One record for each filter and path of the port; owned by the caller.
    std::vector<Gantry::Network::FilterStats*> GetFilterStats();

private:
    Trellis::Host::PortRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
