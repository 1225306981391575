#include "gantry/network/PciDevice.h"

namespace Gantry {
namespace Network {

PciDevice::~PciDevice() = default;

}  // namespace Network
}  // namespace Gantry
