#pragma once

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// Brings the NICs' device facts (PCI device, link settings, pause,
// diagnostics, counters, tuning, SR-IOV) to a host of an older schema.
void MigrateToNicDevices(Transaction& t);

}  // namespace Host
}  // namespace Trellis
