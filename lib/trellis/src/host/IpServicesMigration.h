#pragma once

#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

// Brings name servers, connections, the host's own worlds and IPsec to a host
// of an older schema.
void MigrateToIpServices(Transaction& t);

}  // namespace Host
}  // namespace Trellis
