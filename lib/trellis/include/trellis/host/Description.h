#pragma once

// Host descriptions of the open host: the JSON text that haldensim imports
// and exports (docs/host-format.md).

#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// The default host, as data/default-host.json holds it.
extern const char* const kDefaultHostDescription;

// The open host as a description, in canonical text (2-space indents, keys
// in a fixed order, a final line break).
std::string ExportHost();

// Replaces the whole open host (records, faults, exec log) with the
// description, in one transaction. Checks everything first: a description
// that is refused (DescriptionError, "path: problem") leaves the host as it
// was.
void ImportHost(const std::string& descriptionText);

// The largest scale ImportScaledDefaultHost takes.
constexpr int kMaxHostScale = 1000;

// Replaces the whole open host, as ImportHost does, with the default host
// scale times its size (1 to kMaxHostScale): the default host and scale - 1
// renamed copies of its switching, NICs and firewall rulesets, each copy's
// references resolving within it (docs/host-format.md). The description is
// checked as an imported one is.
void ImportScaledDefaultHost(int scale);

}  // namespace Host
}  // namespace Trellis
