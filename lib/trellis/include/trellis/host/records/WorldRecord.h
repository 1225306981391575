#pragma once

#include <cstdint>
#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// A running VM of the host, a world with an id.
struct WorldRecord {
    static constexpr const char* kKind = "world";

    std::string name;  // the world id in decimal: the key
    std::int64_t id = 0;
    std::string vmName;

    Json ToJson() const;  // {"id", "name"}
    static WorldRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
