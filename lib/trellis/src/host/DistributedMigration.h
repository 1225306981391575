#pragma once

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// Brings worlds and distributed switches to a host of an older schema.
void MigrateToDistributedSwitches(Transaction& t);

}  // namespace Host
}  // namespace Trellis
