// The lookups of Gantry::Network::NetworkFactory, provided by the
// implementation library.

#include "gantry/network/NetworkFactory.h"

#include <optional>
#include <utility>

#include "SwitchStore.h"
#include "trellis/host/Operation.h"
#include "trellis/network/PortGroupImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace Gantry {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kGetPortGroupByName("NetworkFactory::GetPortGroupByName");
const Operation kGetVirtualSwitchById("NetworkFactory::GetVirtualSwitchById");

}  // namespace

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

}  // namespace Network
}  // namespace Gantry
