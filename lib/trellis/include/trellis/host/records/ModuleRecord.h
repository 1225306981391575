#pragma once

#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// A kernel module of the host ("haldenfw", the packet filter).
struct ModuleRecord {
    static constexpr const char* kKind = "module";

    std::string name;
    bool loaded = false;
    std::string options;  // the options of the last load

    Json ToJson() const;
    static ModuleRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
