#pragma once

namespace Gantry {
namespace Network {

// Whether a standard switch takes part in the Cisco Discovery Protocol: its
// words are "down", "listen", "advertise" and "both".
enum class CdpStatus : int {
    Down = 0,
    Listen = 1,
    Advertise = 2,
    Both = 3,
};

}  // namespace Network
}  // namespace Gantry
