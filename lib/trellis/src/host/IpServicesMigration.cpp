// The step that brings the host's IP services to a host made before they were
// kept: the default host's worlds of its own processes (where their ids and
// names are free), the name servers, search domains and connections of each
// of the default host's netstacks that the host has without any (the
// connections whose worlds it has), and the default IPsec databases.

#include "host/IpServicesMigration.h"

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "trellis/host/records/IpSecRecords.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/WorldRecord.h"

namespace Trellis {
namespace Host {

void MigrateToIpServices(Transaction& t) {
    const Json& defaults = DefaultDescription();
    std::vector<WorldRecord> held = t.List<WorldRecord>();
    for (const Json& value : defaults.value("worlds", Json::array())) {
        WorldRecord world = WorldRecord::FromJson(JsonReader(&value, "worlds"));
        bool taken = !world.system;
        for (const WorldRecord& other : held) taken = taken || other.id == world.id || other.vmName == world.vmName;
        if (!taken) t.Put(world);
    }
    for (const Json& value : defaults.value("netstacks", Json::array())) {
        NetstackRecord wanted = NetstackRecord::FromJson(JsonReader(&value, "netstacks"));
        std::optional<NetstackRecord> netstack = t.Find<NetstackRecord>(wanted.name);
        if (!netstack) continue;
        if (netstack->dns.nameServers.empty() && netstack->dns.searchDomains.empty()) netstack->dns = wanted.dns;
        if (netstack->connections.empty())
            for (const SocketRecord& socket : wanted.connections)
                if (t.Contains<WorldRecord>(std::to_string(socket.worldId))) netstack->connections.push_back(socket);
        t.Put(*netstack);
    }
    if (t.Count<IpSecSaRecord>() == 0 && t.Count<IpSecSpRecord>() == 0 && t.Count<IkeConfigRecord>() == 0)
        WriteSectionOfDefault(t, "ipsec");
}

}  // namespace Host
}  // namespace Trellis
