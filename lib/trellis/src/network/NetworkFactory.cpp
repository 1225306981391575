// The lookups of Gantry::Network::NetworkFactory, provided by the
// implementation library.

#include "gantry/network/NetworkFactory.h"

#include <optional>
#include <utility>

#include "DVSwitchStore.h"
#include "SwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "gantry/network/DVPortParam.h"
#include "host/StoredText.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/host/Operation.h"
#include "trellis/network/PortGroupImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace Gantry {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::Transaction;
using Gantry::Lib::GantryException;

const Operation kGetPortGroupByName("NetworkFactory::GetPortGroupByName");
const Operation kGetVirtualSwitchById("NetworkFactory::GetVirtualSwitchById");
const Operation kGetDVSwitchByName("NetworkFactory::GetDVSwitchByName");
const Operation kGetDVPort("NetworkFactory::GetDVPort");
const Operation kGetNetworkInfo("NetworkFactory::GetNetworkInfo");

}  // namespace

NetworkInfo* NetworkFactory::GetNetworkInfo() {
    kGetNetworkInfo.Check();
    return new Trellis::Network::NetworkInfoImpl();
}

PortGroup* NetworkFactory::GetPortGroupByName(std::string const& name) {
    std::optional<Trellis::Host::PortGroupRecord> record = kGetPortGroupByName.Read(
        [&](Transaction& t) { return t.Find<Trellis::Host::PortGroupRecord>(name); });
    return record ? new Trellis::Network::PortGroupImpl(std::move(*record)) : nullptr;
}

VirtualSwitch* NetworkFactory::GetVirtualSwitchById(std::string const& name) {
    Trellis::Host::StandardSwitchRecord record = kGetVirtualSwitchById.Read(
        [&](Transaction& t) { return Trellis::Network::SwitchStore::RequireSwitch(t, name); });
    return new Trellis::Network::VirtualSwitchImpl(std::move(record));
}

// An unknown name is answered with null, not refused: a caller that needs the
// host's own words for it uses a handle (DVSwitchImpl(name, ports)), whose
// first operation fails with them.
DVSwitch* NetworkFactory::GetDVSwitchByName(std::string const& name) {
    return kGetDVSwitchByName.Read([&](Transaction& t) -> DVSwitch* {
        std::optional<Trellis::Host::DVSwitchRecord> record = t.Find<Trellis::Host::DVSwitchRecord>(name);
        if (!record) return nullptr;
        std::vector<std::string> uplinks = Trellis::Network::DVSwitchStore::UplinksOf(t, name);
        return new Trellis::Network::DVSwitchImpl(std::move(*record), std::move(uplinks));
    });
}

DVPort* NetworkFactory::GetDVPort(DVPortParam const& param) {
    Trellis::Host::DVPortRecord port = kGetDVPort.Read([&](Transaction& t) {
        std::optional<Trellis::Host::DVPortRecord> found =
            t.Find<Trellis::Host::DVPortRecord>(Trellis::Host::DVPortRecord::KeyOf(param.dvsId, param.portId));
        if (!found)
            throw GantryException("DVPort " + Trellis::Host::Printable(param.portId) +
                                  " does not exist on the distributed switch " + Trellis::Host::Printable(param.dvsId));
        return *found;
    });
    // The clients are read when IsInUse asks.
    return new Trellis::Network::DVPortImpl(port.dvsId, port.portId);
}

}  // namespace Network
}  // namespace Gantry
