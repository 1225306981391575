#pragma once

namespace Gantry {
namespace Network {

// The service tags of a kernel interface; 8 marks an unknown tag name. The
// names are the host library's (Trellis::Network::TslNicTagIdToName).
enum TslNicTagType {
    TSLNIC_TAG_MANAGEMENT = 1,
    TSLNIC_TAG_GLIDE = 2,  // live migration, tied to the "glide" netstack
    TSLNIC_TAG_FAULT_TOLERANCE = 3,  // tied to "faultTolerance"
    TSLNIC_TAG_REPLICATION = 4,
    TSLNIC_TAG_REPLICATION_NFC = 5,
    TSLNIC_TAG_PROVISIONING = 6,  // tied to "MeridonProvisioning"
    TSLNIC_TAG_STORAGE = 7,
    TSLNIC_TAG_INVALID = 8,
};

}  // namespace Network
}  // namespace Gantry
