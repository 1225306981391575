#pragma once

#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// A netstack instance: a network stack of the kernel with its own interfaces
// and routes ("defaultTcpipStack"). The values in force change only when the
// instance is created in the kernel.
struct NetstackRecord {
    static constexpr const char* kKind = "netstack";

    std::string name;  // the key
    std::string displayName;
    bool inKernel = true;
    int maxConnections = 11000;
    int currentMaxConnections = 11000;
    std::string congestionControl = "newreno";
    bool ipv6Enabled = true;
    bool currentIpv6Enabled = true;

    Json ToJson() const;  // the key as "key", the display name as "name"
    static NetstackRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
