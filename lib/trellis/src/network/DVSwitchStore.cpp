#include "DVSwitchStore.h"

#include <algorithm>
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

// A port holds its NIC's name only while a NIC is connected to it.
std::vector<std::string> UplinksOf(Transaction const& t, std::string const& dvswitch) {
    std::vector<std::string> nics = t.ChildrenTextsOf<DVPortRecord>(dvswitch, "nic");
    nics.erase(std::remove(nics.begin(), nics.end(), std::string()), nics.end());
    return nics;
}

// A port on a distributed switch holds the id of its DVPort; the ports are
// read in the store, not decoded, as there are many on a large host.
std::map<std::string, std::vector<std::string>> ClientsByPort(Transaction const& t, std::string const& dvswitch) {
    std::map<std::string, std::vector<std::string>> clients;
    for (auto& [dvPort, client] : t.ChildrenTextPairsOf<Trellis::Host::PortRecord>(dvswitch, "dvPort", "clientName"))
        if (!dvPort.empty()) clients[dvPort].push_back(std::move(client));
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
