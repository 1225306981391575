#include "trellis/network/TslNicTags.h"

#include <strings.h>

namespace Trellis {
namespace Network {

namespace {
// By id, from 1.
constexpr const char* kTagNames[] = {"Management",     "Glide",        "FaultTolerance", "Replication",
                                     "ReplicationNFC", "Provisioning", "Storage"};
constexpr int kTagCount = sizeof(kTagNames) / sizeof(kTagNames[0]);
}  // namespace

Gantry::Network::TslNicTagType TslNicTagNameToId(std::string const& name) {
    for (int id = 1; id <= kTagCount; ++id)
        if (strcasecmp(name.c_str(), kTagNames[id - 1]) == 0 && name.size() == std::char_traits<char>::length(kTagNames[id - 1]))
            return static_cast<Gantry::Network::TslNicTagType>(id);
    return Gantry::Network::TSLNIC_TAG_INVALID;
}

std::string TslNicTagIdToName(Gantry::Network::TslNicTagType tag) {
    const int id = static_cast<int>(tag);
    return id >= 1 && id <= kTagCount ? kTagNames[id - 1] : "";
}

}  // namespace Network
}  // namespace Trellis
