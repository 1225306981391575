#pragma once

// Shared by the firewall tests: the host's firewall as its description
// shows it.

#include <functional>
#include <string>

#include <nlohmann/json.hpp>

#include "FailureOf.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Description.h"

namespace FirewallTest {

using Json = Trellis::Host::Json;

// The "firewall" section of the open host.
inline Json Firewall() { return Json::parse(Trellis::Host::ExportHost())["firewall"]; }

// The stored configuration of one ruleset; null when there is none.
inline Json Ruleset(const std::string& name) {
    const Json firewall = Firewall();
    for (const Json& ruleset : firewall["rulesets"])
        if (ruleset["name"] == name) return ruleset;
    return nullptr;
}

inline bool ModuleLoaded() {
    const Json host = Json::parse(Trellis::Host::ExportHost());
    for (const Json& module : host["modules"])
        if (module["name"] == "haldenfw") return module["loaded"];
    return false;
}

}  // namespace FirewallTest
