#pragma once

#include <string>

#include "gantry/network/TslNicTagType.h"

namespace Trellis {
namespace Network {

// The names of the interface tags: "Management", "Glide", "FaultTolerance",
// "Replication", "ReplicationNFC", "Provisioning", "Storage". A name is
// matched without regard to case; an unknown one gives TSLNIC_TAG_INVALID.
Gantry::Network::TslNicTagType TslNicTagNameToId(std::string const& name);
// The name of a tag; "" for TSLNIC_TAG_INVALID and any other value.
std::string TslNicTagIdToName(Gantry::Network::TslNicTagType tag);

}  // namespace Network
}  // namespace Trellis
