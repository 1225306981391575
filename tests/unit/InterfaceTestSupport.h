#pragma once

// Shared by the kernel interface tests: hosts with more interfaces and
// netstacks, the interfaces as the host holds them, and the check of a
// refusal.

#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "CommandRunner.h"
#include "trellis/host/Description.h"

namespace InterfaceTest {

using Json = Trellis::Host::Json;
using Errors = std::vector<std::string>;

// Adds a netstack instance in the kernel, without routes or connections.
inline void AddNetstack(Json& d, const std::string& key) {
    d["netstacks"].push_back({{"key", key}, {"inKernel", true}, {"maxConnections", 11000},
                              {"congestionControl", "newreno"}, {"ipv6Enabled", true}});
}

// Adds tslN on the netstack with the tags, on a port of "Guest Network", or
// attached nowhere when portGroup is empty; IPv4 192.0.2.(10+N), no IPv6.
inline void AddNic(Json& d, int n, const std::string& netstack, const Json& tags,
                   const std::string& portGroup = "Guest Network") {
    const std::string name = "tsl" + std::to_string(n);
    Json nic = d["tesselNics"][0];
    nic["name"] = name;
    nic["macAddress"] = "00:50:56:6e:42:" + std::string(n < 10 ? "0" : "") + std::to_string(n);
    nic["netstack"] = netstack;
    nic["tags"] = tags;
    nic["ipv4"]["address"] = "192.0.2." + std::to_string(10 + n);
    nic["ipv6"]["addresses"] = Json::array();
    nic.erase("connectionPoint");
    if (!portGroup.empty()) {
        nic["connectionPoint"] = {{"portGroup", portGroup}};
        d["ports"].push_back({{"id", 33554500 + n}, {"portset", "switch0"}, {"portGroup", portGroup},
                              {"clientKind", "tesselNic"}, {"clientName", name}});
    }
    d["tesselNics"].push_back(nic);
}

// The host's interfaces by name, as its description holds them.
inline Json Nics() {
    const Json host = Json::parse(Trellis::Host::ExportHost());
    Json nics = Json::object();
    for (const Json& nic : host["tesselNics"]) nics[nic["name"].get<std::string>()] = nic;
    return nics;
}

// Checks the fields that fields names, and no others.
inline void ExpectFields(const Json& entry, const std::string& fields) {
    const Json expected = Json::parse(fields);
    for (auto const& [title, value] : expected.items()) EXPECT_EQ(entry.value(title, Json()), value) << title;
}

inline void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

inline void ExpectDone(const CommandRun& run) {
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
}

}  // namespace InterfaceTest
