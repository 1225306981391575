#include "trellis/network/DVPortImpl.h"

#include <utility>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PortRecord.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::DVPortRecord;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kGetPortId("DVPort::GetPortId");
const Operation kIsInUse("DVPort::IsInUse");
const Operation kGetPortGroupId("DVPort::GetPortGroupId");
const Operation kGetUplinkName("DVPort::GetUplinkName");
const Operation kGetLacpConfig("DVPort::GetLacpConfig");
const Operation kGetDVPortgroupId("DVPortImpl::GetDVPortgroupId");

DVPortRecord RequirePort(Transaction const& t, std::string const& dvsId, std::string const& portId) {
    std::optional<DVPortRecord> port = t.Find<DVPortRecord>(DVPortRecord::KeyOf(dvsId, portId));
    if (!port)
        throw Gantry::Lib::GantryException("DVPort " + Trellis::Host::Printable(portId) +
                                           " does not exist on the distributed switch " +
                                           Trellis::Host::Printable(dvsId));
    return *port;
}

std::vector<std::string> ClientsOf(Transaction const& t, DVPortRecord const& port) {
    std::vector<std::string> clients;
    for (Trellis::Host::PortRecord const& client : t.ChildrenOf<Trellis::Host::PortRecord>(port.dvswitch))
        if (client.dvPort == port.portId) clients.push_back(client.clientName);
    return clients;
}

}  // namespace

DVPortImpl::DVPortImpl(std::string const& dvsId, std::string const& portId) : dvsId_(dvsId), portId_(portId) {}

DVPortImpl::DVPortImpl(DVPortRecord snapshot, std::vector<std::string> clients)
    : dvsId_(snapshot.dvsId), portId_(snapshot.portId), record_(std::move(snapshot)), clients_(std::move(clients)) {}

DVPortImpl::~DVPortImpl() {}

DVPortRecord const& DVPortImpl::Record(Operation const& operation) {
    if (record_)
        operation.Check();
    else
        record_ = operation.Read([&](Transaction& t) { return RequirePort(t, dvsId_, portId_); });
    return *record_;
}

std::string DVPortImpl::GetPortId() {
    kGetPortId.Check();
    return portId_;
}

bool DVPortImpl::IsInUse(std::vector<std::string>& clients) {
    if (clients_) {
        kIsInUse.Check();
    } else {
        clients_ = kIsInUse.Read([&](Transaction& t) {
            if (!record_) record_ = RequirePort(t, dvsId_, portId_);
            return ClientsOf(t, *record_);
        });
    }
    clients = *clients_;
    return !clients.empty();
}

std::string DVPortImpl::GetPortGroupId() { return Record(kGetPortGroupId).portGroupId; }

std::string DVPortImpl::GetUplinkName() { return Record(kGetUplinkName).nic; }

Gantry::Network::LacpPortConfig DVPortImpl::GetLacpConfig() {
    DVPortRecord const& record = Record(kGetLacpConfig);
    return Gantry::Network::LacpPortConfig{record.lacpEnabled, record.lacpMode};
}

std::string DVPortImpl::GetDVPortgroupId() { return Record(kGetDVPortgroupId).portGroupId; }

}  // namespace Network
}  // namespace Trellis
