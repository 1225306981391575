#pragma once

#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"
#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// The policies stored at one level (a switch or a port group): only the
// settings set at that level, as each policy's setMask tells.
struct StoredPolicies {
    Gantry::Network::NicTeamingPolicy teaming;
    Gantry::Network::PortSecurityPolicy security;
    Gantry::Network::ShapingPolicy shaping;

    Json ToJson() const;
    static StoredPolicies FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
