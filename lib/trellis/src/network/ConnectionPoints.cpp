#include "ConnectionPoints.h"

#include <utility>

#include "gantry/lib/GantryException.h"

namespace Trellis {
namespace Network {

using Trellis::Host::ConnectionKind;
using Trellis::Host::ConnectionRecord;

const Trellis::Host::Operation kConnectionPointGetType("ConnectionPoint::GetType");
const Trellis::Host::Operation kConnectionPointIsValid("ConnectionPoint::IsValid");
const Trellis::Host::Operation kConnectionPointGetPortsetName("ConnectionPoint::GetPortsetName");
const Trellis::Host::Operation kConnectionPointGetPortGroupName("ConnectionPoint::GetPortGroupName");
const Trellis::Host::Operation kConnectionPointGetDVPortParam("ConnectionPoint::GetDVPortParam");
const Trellis::Host::Operation kConnectionPointGetOpaqueNetworkParam("ConnectionPoint::GetOpaqueNetworkParam");

void RefusePayload(std::string const& pointKind, std::string const& payload) {
    throw Gantry::Lib::GantryException("A connection point on " + pointKind + " has no " + payload);
}

OpaqueNetworkImpl::OpaqueNetworkImpl(ConnectionRecord connection) : connection_(std::move(connection)) {}

OpaqueNetworkImpl::~OpaqueNetworkImpl() {}

int OpaqueNetworkImpl::GetType() {
    kConnectionPointGetType.Check();
    return TYPE_OPAQUE_NETWORK;
}

bool OpaqueNetworkImpl::IsValid() {
    kConnectionPointIsValid.Check();
    return true;
}

std::string OpaqueNetworkImpl::GetPortsetName() {
    kConnectionPointGetPortsetName.Check();
    return "";
}

std::string OpaqueNetworkImpl::GetPortGroupName() {
    kConnectionPointGetPortGroupName.Check();
    RefusePayload("an opaque network", "port group");
}

Gantry::Network::DVPortParam OpaqueNetworkImpl::GetDVPortParam() {
    kConnectionPointGetDVPortParam.Check();
    RefusePayload("an opaque network", "DVPort");
}

Gantry::Network::OpaqueNetworkParam OpaqueNetworkImpl::GetOpaqueNetworkParam() {
    kConnectionPointGetOpaqueNetworkParam.Check();
    return {connection_.networkId, connection_.networkType, connection_.externalId};
}

ConnectionRecord ConnectionOf(Gantry::Network::ConnectionPoint& point) {
    ConnectionRecord connection;
    switch (point.GetType()) {
        case Gantry::Network::ConnectionPoint::TYPE_PORTGROUP:
            connection.kind = ConnectionKind::PortGroup;
            connection.portGroup = point.GetPortGroupName();
            break;
        case Gantry::Network::ConnectionPoint::TYPE_DVPORT: {
            Gantry::Network::DVPortParam param = point.GetDVPortParam();
            connection.kind = ConnectionKind::DVPort;
            connection.dvSwitch = point.GetPortsetName();
            connection.dvPort = param.portId;
            connection.connectionId = param.connectionId;
            break;
        }
        case Gantry::Network::ConnectionPoint::TYPE_OPAQUE_NETWORK: {
            Gantry::Network::OpaqueNetworkParam param = point.GetOpaqueNetworkParam();
            connection.kind = ConnectionKind::OpaqueNetwork;
            connection.networkId = param.networkId;
            connection.networkType = param.networkType;
            connection.externalId = param.externalId;
            break;
        }
        default:
            throw Gantry::Lib::GantryException("Unknown kind of connection point " + std::to_string(point.GetType()));
    }
    return connection;
}

}  // namespace Network
}  // namespace Trellis
