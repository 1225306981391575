#pragma once

#include <cstdint>
#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// A world of the host with its id: a running VM, or one of the host's own
// processes (system), which own no ports of VMs.
struct WorldRecord {
    static constexpr const char* kKind = "world";

    std::string name;  // the world id in decimal: the key
    std::int64_t id = 0;
    std::string vmName;  // the VM's or the process's name
    bool system = false;

    Json ToJson() const;  // {"id", "name"}, with "system": true for the host's own
    static WorldRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
