#include "trellis/network/NetworkInfoImpl.h"

#include <optional>
#include <utility>

#include "trellis/host/Operation.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/network/PortGroupImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PnicRecord;
using Trellis::Host::PortGroupRecord;
using Trellis::Host::Transaction;

const Operation kConstruct("NetworkInfoImpl::NetworkInfoImpl");
const Operation kGetNetstackInstanceState("NetworkInfo::GetNetstackInstanceState");
const Operation kGetPnics("NetworkInfoImpl::GetPnics");
const Operation kGetPnicByName("NetworkInfoImpl::GetPnicByName");
const Operation kGetAllPortGroups("NetworkInfoImpl::GetAllPortGroups");

}  // namespace

NetworkInfoImpl::NetworkInfoImpl() { kConstruct.Check(); }

NetworkInfoImpl::~NetworkInfoImpl() {}

std::vector<Gantry::Network::Pnic*> NetworkInfoImpl::GetPnics() {
    std::vector<std::string> names = kGetPnics.Read([](Transaction& t) { return t.Names<PnicRecord>(); });
    std::vector<Gantry::Network::Pnic*> nics;
    for (std::string& name : names) nics.push_back(new PnicImpl(std::move(name)));
    return nics;
}

Gantry::Network::Pnic* NetworkInfoImpl::GetPnicByName(std::string const& name) {
    bool found = kGetPnicByName.Read([&](Transaction& t) { return t.Contains<PnicRecord>(name); });
    return found ? new PnicImpl(name) : nullptr;
}

std::vector<Gantry::Network::PortGroup*> NetworkInfoImpl::GetAllPortGroups() {
    std::vector<PortGroupRecord> records =
        kGetAllPortGroups.Read([](Transaction& t) { return t.List<PortGroupRecord>(); });
    std::vector<Gantry::Network::PortGroup*> groups;
    for (PortGroupRecord& record : records) groups.push_back(new PortGroupImpl(std::move(record)));
    return groups;
}

int NetworkInfoImpl::GetNetstackInstanceState(std::string const& key) {
    return kGetNetstackInstanceState.Read([&](Transaction& t) {
        std::optional<Trellis::Host::NetstackRecord> netstack = t.Find<Trellis::Host::NetstackRecord>(key);
        return netstack && netstack->inKernel ? NETSTACK_STATE_IN_KERNEL : 0;
    });
}

}  // namespace Network
}  // namespace Trellis
