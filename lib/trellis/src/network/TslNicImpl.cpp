#include "trellis/network/TslNicImpl.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "ConnectionPoints.h"
#include "DVSwitchStore.h"
#include "TslNicStore.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/PortGroupImpl.h"
#include "trellis/network/PortImpl.h"
#include "trellis/network/TslNicTags.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::ConnectionKind;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;
using Trellis::Host::TslNicRecord;

const Operation kGetName("TslNic::GetName");
const Operation kGetMacAddress("TslNic::GetMacAddress");
const Operation kGetConnectionPoint("TslNic::GetConnectionPoint");
const Operation kGetNetstackInstanceKey("TslNic::GetNetstackInstanceKey");
const Operation kGetMtu("TslNic::GetMtu");
const Operation kSetMtu("TslNic::SetMtu");
const Operation kGetTsoMss("TslNic::GetTsoMss");
const Operation kIsEnabled("TslNic::IsEnabled");
const Operation kEnable("TslNic::Enable");
const Operation kDisable("TslNic::Disable");
const Operation kGetPort("TslNic::GetPort");
const Operation kRemove("TslNic::Remove");
const Operation kActivate("TslNic::Activate");
const Operation kGetIpConfig("TslNic::GetIpConfig");
const Operation kGetConfiguredIpConfig("TslNic::GetConfiguredIpConfig");
const Operation kSetIpConfig("TslNic::SetIpConfig");
const Operation kGetTags("TslNic::GetTags");
const Operation kAddTag("TslNic::AddTag");
const Operation kRemoveTag("TslNic::RemoveTag");

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

}  // namespace

TslNicImpl::TslNicImpl(TslNicRecord snapshot) : snapshot_(std::move(snapshot)) {}

TslNicImpl::~TslNicImpl() {}

template <class Change>
void TslNicImpl::Update(Operation const& operation, Change&& change) {
    snapshot_ = operation.Write([&](Transaction& t) {
        TslNicRecord record = TslNicStore::RequireTslNic(t, snapshot_.name);
        change(t, record);
        t.Put(record);
        return record;
    });
}

std::string TslNicImpl::GetName() {
    kGetName.Check();
    return snapshot_.name;
}

Gantry::Network::MacAddress TslNicImpl::GetMacAddress() {
    kGetMacAddress.Check();
    return Gantry::Network::MacAddress(snapshot_.macAddress);
}

Gantry::Network::ConnectionPoint* TslNicImpl::GetConnectionPoint() {
    Trellis::Host::ConnectionRecord const& connection = snapshot_.connection;
    switch (connection.kind) {
        case ConnectionKind::PortGroup: {
            // A group that went away still names the point.
            Trellis::Host::PortGroupRecord group = kGetConnectionPoint.Read([&](Transaction& t) {
                std::optional<Trellis::Host::PortGroupRecord> found =
                    t.Find<Trellis::Host::PortGroupRecord>(connection.portGroup);
                Trellis::Host::PortGroupRecord named;
                named.name = connection.portGroup;
                return found ? *found : named;
            });
            return new PortGroupImpl(std::move(group));
        }
        case ConnectionKind::DVPort: {
            std::string dvsId = kGetConnectionPoint.Read([&](Transaction& t) {
                std::optional<Trellis::Host::DVSwitchRecord> dvs =
                    t.Find<Trellis::Host::DVSwitchRecord>(connection.dvSwitch);
                return dvs ? dvs->id : std::string();
            });
            return new DVPortImpl(Gantry::Network::DVPortParam{dvsId, connection.dvPort, connection.connectionId});
        }
        case ConnectionKind::OpaqueNetwork:
            kGetConnectionPoint.Check();
            return new OpaqueNetworkImpl(connection);
        case ConnectionKind::None:
            break;
    }
    kGetConnectionPoint.Check();
    return nullptr;
}

std::string TslNicImpl::GetNetstackInstanceKey() {
    kGetNetstackInstanceKey.Check();
    return snapshot_.netstack;
}

int TslNicImpl::GetMtu() {
    kGetMtu.Check();
    return snapshot_.mtu;
}

void TslNicImpl::SetMtu(int mtu) {
    Update(kSetMtu, [&](Transaction&, TslNicRecord& record) {
        if (mtu < MIN_MTU || mtu > MAX_MTU)
            Refuse("Invalid MTU " + std::to_string(mtu) + " for interface " + record.name + ": the MTU must be from " +
                   std::to_string(MIN_MTU) + " to " + std::to_string(MAX_MTU));
        record.mtu = mtu;
    });
}

int TslNicImpl::GetTsoMss() {
    kGetTsoMss.Check();
    return snapshot_.tsoMss;
}

bool TslNicImpl::IsEnabled() {
    kIsEnabled.Check();
    return snapshot_.enabled;
}

void TslNicImpl::Enable() {
    Update(kEnable, [](Transaction&, TslNicRecord& record) { record.enabled = true; });
}

void TslNicImpl::Disable() {
    Update(kDisable, [](Transaction&, TslNicRecord& record) { record.enabled = false; });
}

Gantry::Network::Port* TslNicImpl::GetPort() {
    std::optional<Trellis::Host::PortRecord> port =
        kGetPort.Read([&](Transaction& t) { return TslNicStore::PortOf(t, snapshot_); });
    return port ? new PortImpl(std::move(*port)) : nullptr;
}

void TslNicImpl::Remove() {
    kRemove.Write([&](Transaction& t) {
        TslNicStore::RemoveTslNic(t, TslNicStore::RequireTslNic(t, snapshot_.name));
    });
}

// The simulated interface is up as soon as it is stored.
void TslNicImpl::Activate() { kActivate.Check(); }

Gantry::Network::IpConfig TslNicImpl::GetIpConfig() {
    kGetIpConfig.Check();
    return TslNicStore::IpConfigInForce(snapshot_);
}

Gantry::Network::IpConfig TslNicImpl::GetConfiguredIpConfig() {
    kGetConfiguredIpConfig.Check();
    return TslNicStore::ConfiguredIpConfig(snapshot_);
}

void TslNicImpl::SetIpConfig(Gantry::Network::IpConfig config) {
    Update(kSetIpConfig, [&](Transaction& t, TslNicRecord& record) { TslNicStore::StoreIpConfig(t, record, config); });
}

std::vector<Gantry::Network::TslNicTagType> TslNicImpl::GetTags() {
    kGetTags.Check();
    std::vector<Gantry::Network::TslNicTagType> tags;
    for (int tag : snapshot_.tags) tags.push_back(static_cast<Gantry::Network::TslNicTagType>(tag));
    return tags;
}

// The simulated host keeps every tag in its configuration: the flag that asks
// for the configuration alone changes nothing.
void TslNicImpl::AddTag(Gantry::Network::TslNicTagType tag, bool /*persistOnly*/) {
    Update(kAddTag, [&](Transaction&, TslNicRecord& record) {
        if (TslNicTagIdToName(tag).empty())
            Refuse("Unable to tag interface " + record.name + ": " + std::to_string(static_cast<int>(tag)) +
                   " is no tag");
        if (std::find(record.tags.begin(), record.tags.end(), tag) == record.tags.end()) record.tags.push_back(tag);
    });
}

void TslNicImpl::RemoveTag(Gantry::Network::TslNicTagType tag) {
    Update(kRemoveTag, [&](Transaction&, TslNicRecord& record) {
        auto found = std::find(record.tags.begin(), record.tags.end(), static_cast<int>(tag));
        if (found == record.tags.end()) {
            std::string name = TslNicTagIdToName(tag);
            Refuse("Interface " + record.name + " does not carry the tag " +
                   (name.empty() ? std::to_string(static_cast<int>(tag)) : name));
        }
        record.tags.erase(found);
    });
}

}  // namespace Network
}  // namespace Trellis
