#pragma once

#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// The host's IP settings of its own: the IPv6 switch of its kernel. One
// record, named "host".
struct IpSettingsRecord {
    static constexpr const char* kKind = "ipSettings";
    static constexpr const char* kName = "host";

    std::string name = kName;
    bool ipv6Enabled = true;

    Json ToJson() const;
    static IpSettingsRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
