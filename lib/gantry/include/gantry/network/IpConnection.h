#pragma once

#include <cstdint>
#include <string>

namespace Gantry {
namespace Network {

// A connection of a netstack, as the kernel's tables show it.
struct IpConnection {
    std::string protocol;  // "tcp", "udp", "ip"
    int recvQueue = 0;
    int sendQueue = 0;
    std::string localAddress;
    std::uint16_t localPort = 0;
    std::string foreignAddress;
    std::uint16_t foreignPort = 0;
    int state = 0;  // TCP's state codes: 0 CLOSED ... 10 TIME_WAIT
    std::uint32_t worldId = 0;
    std::string congestionControl;
};

}  // namespace Network
}  // namespace Gantry
