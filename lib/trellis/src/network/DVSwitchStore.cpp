#include "DVSwitchStore.h"

#include <optional>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/records/PortRecord.h"

namespace Trellis {
namespace Network {
namespace DVSwitchStore {

using Trellis::Host::DVPortRecord;
using Trellis::Host::DVSwitchRecord;
using Trellis::Host::Transaction;

DVSwitchRecord RequireDVSwitch(Transaction const& t, std::string const& name) {
    std::optional<DVSwitchRecord> dvs = t.Find<DVSwitchRecord>(name);
    if (!dvs)
        throw Gantry::Lib::GantryException("Distributed switch " + Trellis::Host::Printable(name) + " does not exist");
    return *dvs;
}

std::vector<DVPortRecord> PortsOf(Transaction const& t, std::string const& dvswitch) {
    return t.ChildrenOf<DVPortRecord>(dvswitch);
}

std::vector<std::string> UplinksOf(Transaction const& t, std::string const& dvswitch) {
    std::vector<std::string> nics;
    for (DVPortRecord const& port : PortsOf(t, dvswitch))
        if (!port.nic.empty()) nics.push_back(port.nic);
    return nics;
}

std::map<std::string, std::vector<std::string>> ClientsByPort(Transaction const& t, std::string const& dvswitch) {
    std::map<std::string, std::vector<std::string>> clients;
    for (Trellis::Host::PortRecord const& port : t.ChildrenOf<Trellis::Host::PortRecord>(dvswitch))
        if (!port.dvPort.empty()) clients[port.dvPort].push_back(port.clientName);
    return clients;
}

std::string SwitchOfNic(Transaction const& t, std::string const& nic) {
    for (DVPortRecord const& port : t.List<DVPortRecord>())
        if (port.nic == nic) return port.dvswitch;
    return "";
}

}  // namespace DVSwitchStore
}  // namespace Network
}  // namespace Trellis
