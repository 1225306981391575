#pragma once

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// Brings the host's IP settings and its netstacks' routing to a host of an
// older schema.
void MigrateToRouting(Transaction& t);

}  // namespace Host
}  // namespace Trellis
