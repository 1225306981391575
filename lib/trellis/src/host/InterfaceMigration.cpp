// The step that brings netstacks and kernel interfaces to a host made before
// they existed: the default host's netstacks, and each of the default host's
// interfaces whose port the host holds as the default host does (the port of
// "tsl0" on "Host Management"), unless its name or MAC address is taken.

#include "host/InterfaceMigration.h"

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Host {

namespace {

bool HoldsPortOf(const Transaction& t, const Json& defaults, const TslNicRecord& nic) {
    for (const Json& port : defaults.value("ports", Json::array())) {
        if (port.value("clientKind", "") != "tesselNic" || port.value("clientName", "") != nic.name) continue;
        std::optional<Json> held = t.FindData(PortRecord::kKind, std::to_string(port.value("id", 0)));
        return held && held->value("clientName", "") == nic.name && held->value("portset", "") == port.value("portset", "") &&
               held->value("portGroup", "") == port.value("portGroup", "") && held->value("dvPort", "") == port.value("dvPort", "");
    }
    return false;
}

}  // namespace

void MigrateToKernelInterfaces(Transaction& t) {
    const Json& defaults = DefaultDescription();
    if (t.Count<NetstackRecord>() == 0) WriteSectionOfDefault(t, "netstacks");
    std::vector<TslNicRecord> held = t.List<TslNicRecord>();
    for (const Json& value : defaults.value("tesselNics", Json::array())) {
        TslNicRecord nic = TslNicRecord::FromJson(JsonReader(&value, "tesselNics"));
        bool taken = !t.Contains<NetstackRecord>(nic.netstack);
        for (const TslNicRecord& other : held) taken = taken || other.name == nic.name || other.macAddress == nic.macAddress;
        if (!taken && HoldsPortOf(t, defaults, nic)) t.Put(nic);
    }
}

}  // namespace Host
}  // namespace Trellis
