#pragma once

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// Brings netstacks and kernel interfaces to a host of an older schema.
void MigrateToKernelInterfaces(Transaction& t);

}  // namespace Host
}  // namespace Trellis
