#include "trellis/network/DVPortImpl.h"

#include <utility>

#include "ConnectionPoints.h"
#include "DVSwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"

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
const Operation kGetConnectionId("DVPortImpl::GetConnectionId");
const Operation kSetConnectionId("DVPortImpl::SetConnectionId");

DVPortRecord RequirePort(Transaction const& t, std::string const& dvsId, std::string const& portId) {
    std::optional<DVPortRecord> port = t.Find<DVPortRecord>(DVPortRecord::KeyOf(dvsId, portId));
    if (!port)
        throw Gantry::Lib::GantryException("DVPort " + Trellis::Host::Printable(portId) +
                                           " does not exist on the distributed switch " +
                                           Trellis::Host::Printable(dvsId));
    return *port;
}

}  // namespace

DVPortImpl::DVPortImpl(std::string const& dvsId, std::string const& portId) : dvsId_(dvsId), portId_(portId) {}

DVPortImpl::DVPortImpl(Gantry::Network::DVPortParam const& param)
    : dvsId_(param.dvsId), portId_(param.portId), connectionId_(param.connectionId) {}

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
            return DVSwitchStore::ClientsByPort(t, record_->dvswitch)[record_->portId];
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

bool DVPortImpl::IsValid() {
    return kConnectionPointIsValid.Read(
        [&](Transaction& t) { return t.Contains<DVPortRecord>(DVPortRecord::KeyOf(dvsId_, portId_)); });
}

unsigned int DVPortImpl::GetConnectionId() {
    return kGetConnectionId.Read([&](Transaction& t) { return RequirePort(t, dvsId_, portId_).connectionId; });
}

void DVPortImpl::SetConnectionId(unsigned int connectionId) {
    kSetConnectionId.Write([&](Transaction& t) {
        DVPortRecord port = RequirePort(t, dvsId_, portId_);
        port.connectionId = connectionId;
        t.Put(port);
    });
    record_.reset();
}

int DVPortImpl::GetType() {
    kConnectionPointGetType.Check();
    return TYPE_DVPORT;
}

std::string DVPortImpl::GetPortsetName() { return Record(kConnectionPointGetPortsetName).dvswitch; }

std::string DVPortImpl::GetPortGroupName() {
    kConnectionPointGetPortGroupName.Check();
    RefusePayload("DVPort " + portId_, "port group");
}

Gantry::Network::DVPortParam DVPortImpl::GetDVPortParam() {
    kConnectionPointGetDVPortParam.Check();
    return {dvsId_, portId_, connectionId_};
}

Gantry::Network::OpaqueNetworkParam DVPortImpl::GetOpaqueNetworkParam() {
    kConnectionPointGetOpaqueNetworkParam.Check();
    RefusePayload("DVPort " + portId_, "opaque network");
}

}  // namespace Network
}  // namespace Trellis
