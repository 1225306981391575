#pragma once

#include <optional>
#include <string>
#include <vector>

#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/DVPort.h"
#include "trellis/host/records/DVSwitchRecords.h"

namespace Trellis {
namespace Host {
class Operation;
}  // namespace Host

namespace Network {

// A port of a distributed switch. Made by a lookup, it answers from the
// snapshot of its record and of the clients on it; made as a handle on a
// switch's identity and a port id, it does no host I/O until asked, and then
// reads its record inside the asking operation (a handle on a port that does
// not exist fails there with the host's text).
//
// It is also the connection point of an interface attached to the port; the
// param's connection id is the one the point was made with.
class DVPortImpl : public virtual Gantry::Network::DVPort, public virtual Gantry::Network::ConnectionPoint {
public:
    DVPortImpl(std::string const& dvsId, std::string const& portId);
    explicit DVPortImpl(Gantry::Network::DVPortParam const& param);
    DVPortImpl(Trellis::Host::DVPortRecord snapshot, std::vector<std::string> clients);
    ~DVPortImpl() override;

    std::string GetPortId() override;
    bool IsInUse(std::vector<std::string>& clients) override;
    std::string GetPortGroupId() override;
    std::string GetUplinkName() override;
    Gantry::Network::LacpPortConfig GetLacpConfig() override;
    // The same identity as GetPortGroupId, by the name the port walk uses.
    std::string GetDVPortgroupId();

    // Whether the port exists on its switch.
    bool IsValid() override;
    // The id of the connection held on the port (0 for none), and setting it.
    unsigned int GetConnectionId();
    void SetConnectionId(unsigned int connectionId);

    int GetType() override;
    // The name of the port's distributed switch.
    std::string GetPortsetName() override;
    std::string GetPortGroupName() override;
    Gantry::Network::DVPortParam GetDVPortParam() override;
    Gantry::Network::OpaqueNetworkParam GetOpaqueNetworkParam() override;
private:
    // The port's record, read inside operation on a handle.
    Trellis::Host::DVPortRecord const& Record(Trellis::Host::Operation const& operation);

    std::string dvsId_;
    std::string portId_;
    unsigned int connectionId_ = 0;
    std::optional<Trellis::Host::DVPortRecord> record_;
    std::optional<std::vector<std::string>> clients_;
};

}  // namespace Network
}  // namespace Trellis
