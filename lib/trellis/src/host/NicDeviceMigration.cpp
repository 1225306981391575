// The step that brings the NICs' device facts to a host made before they were
// kept. A NIC the default host has by name takes the default's device facts
// (its own name, link, driver, speed, address and MTU stay); any other NIC
// keeps what it had and reads as a device that offers nothing more. The
// default host's NICs that the host lacks are added, on no switch.

#include "host/NicDeviceMigration.h"

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Host {

namespace {

// What a host of the older schema kept of a NIC, besides its description.
constexpr const char* kKeptMembers[] = {"name", "linkUp", "driver", "speed", "duplex", "macAddress", "mtu"};

}  // namespace

void MigrateToNicDevices(Transaction& t) {
    const Json& defaults = DefaultDescription();
    for (const Json& wanted : defaults.value("nics", Json::array())) {
        const std::string name = wanted.value("name", "");
        std::optional<Json> stored = t.FindData(PnicRecord::kKind, name);
        if (!stored) {
            t.Put(PnicRecord::FromJson(JsonReader(&wanted, "nics")));
            continue;
        }
        if (stored->contains("link")) continue;
        Json merged = wanted;
        for (const char* key : kKeptMembers)
            if (stored->contains(key)) merged[key] = (*stored)[key];
        t.Put(PnicRecord::FromJson(JsonReader(&merged, "nics")));
    }
}

}  // namespace Host
}  // namespace Trellis
