#pragma once

#include <string>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/DVPortParam.h"

namespace Gantry {
namespace Network {

// The three strings that name an opaque network, in this order.
struct OpaqueNetworkParam {
    std::string networkId;
    std::string networkType;
    std::string externalId;
};

// Where a kernel interface is attached: a port group of a standard switch, a
// DVPort of a distributed switch, or an opaque network. Every operation
// reports failure by throwing GantryException.
class ConnectionPoint : public virtual Gantry::Lib::GantryObject {
public:
    // GetType's kinds.
    static constexpr int TYPE_PORTGROUP = 1;
    static constexpr int TYPE_DVPORT = 2;
    static constexpr int TYPE_OPAQUE_NETWORK = 3;

    ~ConnectionPoint() override;

    virtual int GetType() = 0;
    // Whether the point exists and can take an interface.
    virtual bool IsValid() = 0;
    // The name of the switch the point is on; empty when it has none.
    virtual std::string GetPortsetName() = 0;
    // The payload of each kind; the others throw GantryException.
    virtual std::string GetPortGroupName() = 0;
    virtual DVPortParam GetDVPortParam() = 0;
    virtual OpaqueNetworkParam GetOpaqueNetworkParam() = 0;
};

}  // namespace Network
}  // namespace Gantry
