#pragma once

// Shared by the netstack, route and neighbour tests: the host's netstacks as
// its description holds them, and a second netstack with an interface.

#include <string>

#include "InterfaceTestSupport.h"

namespace RoutingTest {

using namespace InterfaceTest;

// The stored netstack of that key; null when there is none.
inline Json Netstack(const std::string& key) {
    const Json host = Json::parse(Trellis::Host::ExportHost());
    for (const Json& netstack : host["netstacks"])
        if (netstack["key"] == key) return netstack;
    return nullptr;
}

inline Json Routing(const std::string& key) { return Netstack(key)["routing"]; }

// Adds "backupStack" with the routing given and its interface tsl1,
// 198.51.100.10/24 and attached nowhere.
inline void AddBackupStack(Json& d, const Json& routing = Json::object()) {
    AddNetstack(d, "backupStack");
    d["netstacks"].back()["routing"] = routing;
    AddNic(d, 1, "backupStack", Json::array(), "");
    d["tesselNics"].back()["ipv4"]["address"] = "198.51.100.10";
}

}  // namespace RoutingTest
