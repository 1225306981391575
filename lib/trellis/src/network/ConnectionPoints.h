#pragma once

// What the three kinds of connection point share: their operations' names,
// and the refusal of a payload that belongs to another kind. An opaque
// network is only ever handed out by an interface attached to one.

#include <string>

#include "gantry/network/ConnectionPoint.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Network {

extern const Trellis::Host::Operation kConnectionPointGetType;
extern const Trellis::Host::Operation kConnectionPointIsValid;
extern const Trellis::Host::Operation kConnectionPointGetPortsetName;
extern const Trellis::Host::Operation kConnectionPointGetPortGroupName;
extern const Trellis::Host::Operation kConnectionPointGetDVPortParam;
extern const Trellis::Host::Operation kConnectionPointGetOpaqueNetworkParam;

// Throws GantryException: a point of kind has no payload of the kind asked.
[[noreturn]] void RefusePayload(std::string const& pointKind, std::string const& payload);

class OpaqueNetworkImpl : public virtual Gantry::Network::ConnectionPoint {
public:
    explicit OpaqueNetworkImpl(Trellis::Host::ConnectionRecord connection);
    ~OpaqueNetworkImpl() override;

    int GetType() override;
    bool IsValid() override;  // always: the network is outside the host
    std::string GetPortsetName() override;  // empty: no switch of the host
    std::string GetPortGroupName() override;
    Gantry::Network::DVPortParam GetDVPortParam() override;
    Gantry::Network::OpaqueNetworkParam GetOpaqueNetworkParam() override;

private:
    Trellis::Host::ConnectionRecord connection_;
};

// The point as the host stores it for an interface: its kind and payload,
// read through the point's own operations.
Trellis::Host::ConnectionRecord ConnectionOf(Gantry::Network::ConnectionPoint& point);

}  // namespace Network
}  // namespace Trellis
