#pragma once

#include <string>

namespace Trellis {
namespace Host {

// Creates a host store at path with the default inventory, atomically: it is
// built beside path and moved into place only if path still does not exist.
// Creates missing parent directories. Throws HostOpenError.
void CreateHostFile(const std::string& path);

// Removes what creators of the host at path left when they were killed while
// building it: the temporary files beside path whose process no longer
// exists. A live creator's file is left alone.
void RemoveAbandonedTemporaries(const std::string& path);

}  // namespace Host
}  // namespace Trellis
