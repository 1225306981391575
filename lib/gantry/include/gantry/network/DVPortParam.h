#pragma once

#include <string>

namespace Gantry {
namespace Network {

// The coordinates of one port of a distributed switch: the switch's identity
// (DVSwitch::GetId) and the port's id on it.
struct DVPortParam {
    std::string dvsId;
    std::string portId;
};

}  // namespace Network
}  // namespace Gantry
