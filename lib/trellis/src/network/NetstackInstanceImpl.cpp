#include "trellis/network/NetstackInstanceImpl.h"

#include <algorithm>
#include <utility>

#include "RoutingStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::NetstackRecord;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kGetCongestionControlAlgorithmList("NetstackInstanceImpl::GetCongestionControlAlgorithmList");
const Operation kGetKey("NetstackInstance::GetKey");
const Operation kGetName("NetstackInstance::GetName");
const Operation kSetName("NetstackInstance::SetName");
const Operation kGetMaxConnections("NetstackInstance::GetMaxConnections");
const Operation kSetMaxConnections("NetstackInstance::SetMaxConnections");
const Operation kGetCurrentMaxConnections("NetstackInstance::GetCurrentMaxConnections");
const Operation kGetCongestionControlAlgorithm("NetstackInstance::GetCongestionControlAlgorithm");
const Operation kSetCongestionControlAlgorithm("NetstackInstance::SetCongestionControlAlgorithm");
const Operation kGetIpv6Enabled("NetstackInstance::GetIpv6Enabled");
const Operation kGetCurrentIpv6Enabled("NetstackInstance::GetCurrentIpv6Enabled");
const Operation kSetIpv6Enabled("NetstackInstance::SetIpv6Enabled");
const Operation kGetState("NetstackInstance::GetState");
const Operation kEnable("NetstackInstance::Enable");
const Operation kDisable("NetstackInstance::Disable");

const std::vector<std::string> kAlgorithms = {"newreno", "cubic"};

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

}  // namespace

NetstackInstanceImpl::NetstackInstanceImpl(std::string const& key, unsigned int maxConnections,
                                           std::string congestionControl, bool /*flag*/, unsigned int /*reserved*/) {
    snapshot_.name = key;
    snapshot_.displayName = key;
    snapshot_.maxConnections = static_cast<int>(std::min<unsigned int>(maxConnections, NetstackRecord::kMaxConnections));
    snapshot_.currentMaxConnections = snapshot_.maxConnections;
    snapshot_.congestionControl = std::move(congestionControl);
    snapshot_.inKernel = false;
}

NetstackInstanceImpl::NetstackInstanceImpl(NetstackRecord snapshot) : snapshot_(std::move(snapshot)) {}

NetstackInstanceImpl::~NetstackInstanceImpl() {}

std::vector<std::string> NetstackInstanceImpl::GetCongestionControlAlgorithmList() {
    kGetCongestionControlAlgorithmList.Check();
    return kAlgorithms;
}

// Re-reads the record, lets change edit it, writes it back and takes it as
// the snapshot.
template <class Change>
void NetstackInstanceImpl::Update(Operation const& operation, Change&& change) {
    snapshot_ = operation.Write([&](Transaction& t) {
        NetstackRecord record = RoutingStore::RequireNetstack(t, snapshot_.name);
        change(record);
        t.Put(record);
        return record;
    });
}

std::string NetstackInstanceImpl::GetKey() {
    kGetKey.Check();
    return snapshot_.name;
}

std::string NetstackInstanceImpl::GetName() {
    kGetName.Check();
    return snapshot_.displayName;
}

void NetstackInstanceImpl::SetName(std::string const& name, bool /*persist*/) {
    Update(kSetName, [&](NetstackRecord& record) {
        std::string problem = Trellis::Host::TextProblem(name);
        if (!problem.empty()) Refuse("Invalid name for netstack instance " + record.name + ": the name " + problem);
        record.displayName = name;
    });
}

int NetstackInstanceImpl::GetMaxConnections() {
    kGetMaxConnections.Check();
    return snapshot_.maxConnections;
}

void NetstackInstanceImpl::SetMaxConnections(int maxConnections, bool /*persist*/) {
    Update(kSetMaxConnections, [&](NetstackRecord& record) {
        if (maxConnections < 1 || maxConnections > NetstackRecord::kMaxConnections)
            Refuse("Invalid maximum of connections " + std::to_string(maxConnections) + " for netstack instance " +
                   record.name + ": it must be from 1 to " + std::to_string(NetstackRecord::kMaxConnections));
        record.maxConnections = maxConnections;
    });
}

int NetstackInstanceImpl::GetCurrentMaxConnections() {
    kGetCurrentMaxConnections.Check();
    return snapshot_.currentMaxConnections;
}

std::string NetstackInstanceImpl::GetCongestionControlAlgorithm() {
    kGetCongestionControlAlgorithm.Check();
    return snapshot_.congestionControl;
}

void NetstackInstanceImpl::SetCongestionControlAlgorithm(std::string const& algorithm, bool /*persist*/) {
    Update(kSetCongestionControlAlgorithm, [&](NetstackRecord& record) {
        if (std::find(kAlgorithms.begin(), kAlgorithms.end(), algorithm) == kAlgorithms.end())
            Refuse("Invalid congestion control algorithm " + Trellis::Host::Printable(algorithm) +
                   " for netstack instance " + record.name + ": the host offers newreno and cubic");
        record.congestionControl = algorithm;
    });
}

bool NetstackInstanceImpl::GetIpv6Enabled() {
    kGetIpv6Enabled.Check();
    return snapshot_.ipv6Enabled;
}

bool NetstackInstanceImpl::GetCurrentIpv6Enabled() {
    kGetCurrentIpv6Enabled.Check();
    return snapshot_.currentIpv6Enabled;
}

void NetstackInstanceImpl::SetIpv6Enabled(bool enabled, bool /*persist*/) {
    Update(kSetIpv6Enabled, [&](NetstackRecord& record) { record.ipv6Enabled = enabled; });
}

int NetstackInstanceImpl::GetState() {
    kGetState.Check();
    return snapshot_.inKernel ? STATE_IN_KERNEL : 0;
}

// Creating the instance in the kernel takes the configured values into force,
// also for an instance that is there already.
void NetstackInstanceImpl::Enable() {
    Update(kEnable, [](NetstackRecord& record) {
        record.inKernel = true;
        record.currentMaxConnections = record.maxConnections;
        record.currentIpv6Enabled = record.ipv6Enabled;
    });
}

void NetstackInstanceImpl::Disable() {
    Update(kDisable, [](NetstackRecord& record) {
        if (record.name == NetstackRecord::kDefaultKey)
            Refuse("Unable to disable netstack instance " + record.name + ": the host's default instance stays in the kernel");
        record.inKernel = false;
    });
}

}  // namespace Network
}  // namespace Trellis
