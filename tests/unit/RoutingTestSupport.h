#pragma once

// Shared by the netstack, route and neighbour tests: the host's netstacks as
// its description shows them, and a second netstack with an interface of its
// own to describe into a host.

#include <string>

#include <nlohmann/json.hpp>

#include "trellis/host/Description.h"

namespace RoutingTest {

using Json = nlohmann::ordered_json;

// The stored netstack of that key; null when there is none.
inline Json Netstack(const std::string& key) {
    const Json host = Json::parse(Trellis::Host::ExportHost());
    for (const Json& netstack : host["netstacks"])
        if (netstack["key"] == key) return netstack;
    return nullptr;
}

inline Json Routing(const std::string& key) { return Netstack(key)["routing"]; }

// Adds to the description the netstack "backupStack", in the kernel, with
// the interface tsl1 (198.51.100.10/24, 2001:db8:1::10/64) attached nowhere,
// and with the routing given.
inline void AddBackupStack(Json& description, const Json& routing = Json::object()) {
    description["netstacks"].push_back({{"key", "backupStack"},
                                        {"name", "backupStack"},
                                        {"inKernel", true},
                                        {"maxConnections", 11000},
                                        {"congestionControl", "newreno"},
                                        {"ipv6Enabled", true},
                                        {"routing", routing}});
    Json nic = description["tesselNics"][0];
    nic.erase("connectionPoint");
    nic["name"] = "tsl1";
    nic["macAddress"] = "00:50:56:6e:41:0b";
    nic["netstack"] = "backupStack";
    nic["ipv4"]["address"] = "198.51.100.10";
    nic["ipv6"]["addresses"] = Json::array({{{"address", "2001:db8:1::10/64"}, {"status", "preferred"}}});
    nic["tags"] = Json::array();
    description["tesselNics"].push_back(nic);
}

}  // namespace RoutingTest
