#include "gantry/network/PortGroup.h"

namespace Gantry {
namespace Network {

PortGroup::~PortGroup() = default;

}  // namespace Network
}  // namespace Gantry
