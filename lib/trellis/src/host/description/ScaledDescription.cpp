#include "host/description/ScaledDescription.h"

#include <utility>

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "host/description/HostCopy.h"

namespace Trellis {
namespace Host {

Json ScaledDescription(const Json& original, int scale) {
    const ParsedDescription parsed = ParseDescription(original);
    Json scaled = original;
    Json learned;  // what the sections add for copy 0, which only learns the names
    HostCopy copy(parsed, scale - 1);
    for (int n = 0; n < scale; ++n) {
        copy.Begin(n);
        Json& description = n == 0 ? learned : scaled;
        for (const ParsedDescription::Entry& entry : parsed.Sections()) {
            // A section the original lacks gains its key only when it adds something.
            Json value = description.contains(entry.key) ? std::move(description[entry.key]) : Json();
            entry.section->AddCopy(copy, value);
            if (!value.is_null()) description[entry.key] = std::move(value);
        }
    }
    return scaled;
}

}  // namespace Host
}  // namespace Trellis
