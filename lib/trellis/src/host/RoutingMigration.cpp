// The step that brings the host's own IP settings and the routing of its
// netstacks to a host made before they were kept: the default settings, and
// the default host's routing for each of its netstacks that the host has
// without routing and with the interfaces that routing names.

#include "host/RoutingMigration.h"

#include <optional>

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "trellis/host/records/IpSettingsRecord.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Host {

void MigrateToRouting(Transaction& t) {
    if (!t.Contains<IpSettingsRecord>(IpSettingsRecord::kName)) WriteSectionOfDefault(t, "ipSettings");
    for (const Json& value : DefaultDescription().value("netstacks", Json::array())) {
        NetstackRecord routed = NetstackRecord::FromJson(JsonReader(&value, "netstacks"));
        std::optional<NetstackRecord> held = t.Find<NetstackRecord>(routed.name);
        if (!held || !held->routing.ipv4Routes.empty() || !held->routing.ipv6Routes.empty() ||
            !held->routing.ipv4Gateway.empty() || !held->routing.ipv6Gateway.empty())
            continue;
        bool reachable = true;
        for (const auto* neighbors : {&routed.routing.ipv4Neighbors, &routed.routing.ipv6Neighbors})
            for (const NeighborRecord& neighbor : *neighbors) {
                std::optional<TslNicRecord> nic = t.Find<TslNicRecord>(neighbor.interfaceName);
                reachable = reachable && nic && nic->netstack == routed.name;
            }
        if (!reachable) continue;
        held->routing = routed.routing;
        t.Put(*held);
    }
}

}  // namespace Host
}  // namespace Trellis
