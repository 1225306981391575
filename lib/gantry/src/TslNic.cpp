#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/Port.h"
#include "gantry/network/TslNic.h"

namespace Gantry {
namespace Network {

ConnectionPoint::~ConnectionPoint() {}
NetworkInfo::~NetworkInfo() {}
Port::~Port() {}
TslNic::~TslNic() {}

}  // namespace Network
}  // namespace Gantry
