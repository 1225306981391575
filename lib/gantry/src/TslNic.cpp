#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/NetstackInstance.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/Port.h"
#include "gantry/network/TslNic.h"

namespace Gantry {
namespace Network {

ConnectionPoint::~ConnectionPoint() {}
NetstackInstance::~NetstackInstance() {}
NetworkInfo::~NetworkInfo() {}
Port::~Port() {}
TslNic::~TslNic() {}

}  // namespace Network
}  // namespace Gantry
