#pragma once

#include <string>

namespace Gantry {
namespace System {

// One port rule of the firewall, of a ruleset or added at run time. A plain
// record: the codes below are how the packet filter numbers each field, and
// any value other than the one named reads as the other choice (a portType
// other than PORT_TYPE_DST is a source port, and so on).
struct FirewallRule {
    static constexpr int PORT_TYPE_SRC = 0;
    static constexpr int PORT_TYPE_DST = 1;
    static constexpr int DIRECTION_INBOUND = 0;
    static constexpr int DIRECTION_OUTBOUND = 1;
    static constexpr int PROTOCOL_TCP = 0;
    static constexpr int PROTOCOL_UDP = 1;

    std::string name;  // not shown by the commands
    int portType = PORT_TYPE_DST;
    int portBegin = 0;
    int portEnd = 0;
    int direction = DIRECTION_INBOUND;
    int protocol = PROTOCOL_TCP;
};

}  // namespace System
}  // namespace Gantry
