#pragma once

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// The description of a host scale times the size of original: original and
// scale - 1 copies of it, made by each section (see HostCopy.h). It is not
// checked yet: it goes through ParseDescription like any other.
// DescriptionError when original itself is refused.
Json ScaledDescription(const Json& original, int scale);

}  // namespace Host
}  // namespace Trellis
