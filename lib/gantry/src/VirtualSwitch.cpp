#include "gantry/network/VirtualSwitch.h"

namespace Gantry {
namespace Network {

VirtualSwitch::~VirtualSwitch() = default;

}  // namespace Network
}  // namespace Gantry
