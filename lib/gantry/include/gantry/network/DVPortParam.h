#pragma once

#include <string>

namespace Gantry {
namespace Network {

// The coordinates of one port of a distributed switch: the switch's identity
// (DVSwitch::GetId) and the port's id on it, with the id of the connection an
// interface holds on it (0 for none).
struct DVPortParam {
    std::string dvsId;
    std::string portId;
    unsigned int connectionId = 0;
};

}  // namespace Network
}  // namespace Gantry
