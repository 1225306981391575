#include "gantry/network/NicCapabilities.h"

namespace Gantry {
namespace Network {

NicCapabilities::NicCapabilities()
    : checksumOffload(false), tcpSegmentationOffload(false), scatterGather(false), vlanTagOffload(false) {}

NicCapabilities NicCapabilities::GetDefaultPolicy() {
    NicCapabilities capabilities;
    capabilities.checksumOffload = true;
    capabilities.tcpSegmentationOffload = true;
    capabilities.scatterGather = true;
    capabilities.vlanTagOffload = true;
    return capabilities;
}

}  // namespace Network
}  // namespace Gantry
