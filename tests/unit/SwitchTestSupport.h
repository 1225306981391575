#pragma once

// Shared by the switch tests: the host's switching sections as its
// description shows them, hosts edited for a case, and the text of a host
// failure.

#include <functional>
#include <string>

#include <nlohmann/json.hpp>

#include "FailureOf.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Description.h"

namespace SwitchTest {

using Json = Trellis::Host::Json;

inline Json Section(const std::string& key) { return Json::parse(Trellis::Host::ExportHost())[key]; }

// The stored record of one switch or port group; null when there is none.
inline Json Named(const std::string& section, const std::string& name) {
    for (const Json& entry : Section(section))
        if (entry["name"] == name) return entry;
    return nullptr;
}
inline Json Switch(const std::string& name) { return Named("standardSwitches", name); }
inline Json PortGroup(const std::string& name) { return Named("portGroups", name); }

// A switch record as a description holds it, with nothing set in its policies.
inline Json SwitchEntry(const std::string& name, int numPorts, const Json& uplinks = Json::array()) {
    return Json{{"name", name},
                {"numPorts", numPorts},
                {"mtu", 1500},
                {"cdpStatus", "listen"},
                {"beacon", {{"enabled", false}, {"interval", 1}, {"threshold", 3}}},
                {"uplinks", uplinks},
                {"policy", {{"teaming", Json::object()}, {"security", Json::object()}, {"shaping", Json::object()}}}};
}

inline Json PortGroupEntry(const std::string& name, const std::string& vswitch, int vlanId = 0) {
    return Json{{"name", name}, {"vswitch", vswitch}, {"vlanId", vlanId}};
}

// What importing the default host, changed by edit, is refused with; "" when
// it is not refused.
inline std::string DescriptionRefusal(const std::function<void(Json&)>& edit) {
    try {
        Trellis::Host::ImportHost(TempHost::Edited(edit));
    } catch (const Trellis::Host::DescriptionError& e) {
        return e.what();
    }
    return "";
}

}  // namespace SwitchTest
