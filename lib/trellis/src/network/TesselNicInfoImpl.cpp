#include "trellis/network/TesselNicInfoImpl.h"

#include <algorithm>
#include <cstdio>
#include <optional>
#include <set>
#include <utility>

#include "ConnectionPoints.h"
#include "DVSwitchStore.h"
#include "SwitchStore.h"
#include "TslNicStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/TslNicImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::ConnectionKind;
using Trellis::Host::ConnectionRecord;
using Trellis::Host::Operation;
using Trellis::Host::PortClientKind;
using Trellis::Host::PortRecord;
using Trellis::Host::Transaction;
using Trellis::Host::TslNicRecord;

const Operation kConstruct("TesselNicInfoImpl::TesselNicInfoImpl");
const Operation kAddTesselNic("TesselNicInfoImpl::AddTesselNic");
const Operation kRemoveTesselNic("TesselNicInfoImpl::RemoveTesselNic");
const Operation kGetTesselNics("TesselNicInfoImpl::GetTesselNics");
const Operation kGetTesselNicsByInstanceKey("TesselNicInfoImpl::GetTesselNicsByInstanceKey");
const Operation kGetTesselNicsByTag("TesselNicInfoImpl::GetTesselNicsByTag");
const Operation kGetTesselNicNamesByInstanceKey("TesselNicInfoImpl::GetTesselNicNamesByInstanceKey");
const Operation kGetTesselNicByInterface("TesselNicInfoImpl::GetTesselNicByInterface");

// Interface MAC addresses the host hands out: 00:50:56:6e:00:00 and up.
constexpr unsigned int kAssignedMacBase = 0x6e0000;

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

// By number: tsl2 before tsl10.
std::vector<TslNicRecord> ByNumber(std::vector<TslNicRecord> nics) {
    std::sort(nics.begin(), nics.end(), [](TslNicRecord const& a, TslNicRecord const& b) {
        return TslNicRecord::NumberOf(a.name) < TslNicRecord::NumberOf(b.name);
    });
    return nics;
}

std::vector<Gantry::Network::TslNic*> Objects(std::vector<TslNicRecord> records) {
    std::vector<Gantry::Network::TslNic*> nics;
    for (TslNicRecord& record : ByNumber(std::move(records))) nics.push_back(new TslNicImpl(std::move(record)));
    return nics;
}

std::string FreeName(std::vector<TslNicRecord> const& nics, std::string const& refusal) {
    std::set<int> taken;
    for (TslNicRecord const& nic : nics) taken.insert(TslNicRecord::NumberOf(nic.name));
    for (int number = 0; number <= TslNicRecord::kMaxNumber; ++number)
        if (taken.count(number) == 0) return "tsl" + std::to_string(number);
    Refuse(refusal + "all " + std::to_string(TslNicRecord::kMaxNumber + 1) + " interface names are taken");
}

std::string FreeMac(std::vector<TslNicRecord> const& nics) {
    std::set<std::string> taken;
    for (TslNicRecord const& nic : nics) taken.insert(nic.macAddress);
    for (unsigned int device = kAssignedMacBase;; ++device) {
        char text[18];
        std::snprintf(text, sizeof text, "00:50:56:%02x:%02x:%02x", (device >> 16) & 0xff, (device >> 8) & 0xff,
                      device & 0xff);
        if (taken.count(text) == 0) return text;
    }
}

// Takes a port for the interface on the point's switch: refuses a point that
// cannot take one and a switch without a free port. An opaque network takes
// no port of the host's.
void TakePort(Transaction& t, TslNicRecord const& nic, std::string const& refusal) {
    PortRecord port;
    port.clientKind = PortClientKind::TesselNic;
    port.clientName = nic.name;
    port.macAddresses = {nic.macAddress};
    int numPorts = 0;
    int used = 0;
    std::vector<std::string> uplinks;
    if (nic.connection.kind == ConnectionKind::PortGroup) {
        Trellis::Host::PortGroupRecord group = SwitchStore::RequirePortGroup(t, nic.connection.portGroup);
        Trellis::Host::StandardSwitchRecord vswitch = SwitchStore::RequireSwitch(t, group.vswitch);
        port.portset = vswitch.name;
        port.portGroup = group.name;
        numPorts = vswitch.numPorts;
        used = SwitchStore::UsedPortsOf(t, vswitch);
        uplinks = vswitch.uplinks;
    } else if (nic.connection.kind == ConnectionKind::DVPort) {
        Trellis::Host::DVSwitchRecord dvs = DVSwitchStore::RequireDVSwitch(t, nic.connection.dvSwitch);
        std::optional<Trellis::Host::DVPortRecord> dvPort =
            t.Find<Trellis::Host::DVPortRecord>(Trellis::Host::DVPortRecord::KeyOf(dvs.id, nic.connection.dvPort));
        if (!dvPort) Refuse(refusal + "distributed switch " + dvs.name + " has no DVPort " + nic.connection.dvPort);
        if (dvPort->IsUplink())
            Refuse(refusal + "DVPort " + dvPort->portId + " of " + dvs.name + " is an uplink port");
        std::vector<std::string> clients = DVSwitchStore::ClientsByPort(t, dvs.name)[dvPort->portId];
        if (!clients.empty())
            Refuse(refusal + "DVPort " + dvPort->portId + " of " + dvs.name + " is in use by " + clients.front());
        port.portset = dvs.name;
        port.dvPort = dvPort->portId;
        numPorts = dvs.numPorts;
        uplinks = DVSwitchStore::UplinksOf(t, dvs.name);
        used = static_cast<int>(SwitchStore::ClientPortsOf(t, dvs.name)) + static_cast<int>(uplinks.size());
    } else {
        return;
    }
    if (used >= numPorts)
        Refuse(refusal + "all " + std::to_string(numPorts) + " ports of " + port.portset + " are in use");
    port.teamUplink = uplinks.empty() ? "" : uplinks.front();
    port.id = SwitchStore::NewPortId(t);
    port.name = std::to_string(port.id);
    t.Put(port);
}

bool SamePoint(ConnectionRecord const& a, ConnectionRecord const& b) {
    if (a.kind != b.kind) return false;
    switch (a.kind) {
        case ConnectionKind::PortGroup:
            return a.portGroup == b.portGroup;
        case ConnectionKind::DVPort:
            return a.dvSwitch == b.dvSwitch && a.dvPort == b.dvPort;
        case ConnectionKind::OpaqueNetwork:
            return a.networkId == b.networkId;
        case ConnectionKind::None:
            break;
    }
    return false;
}

std::string PointText(ConnectionRecord const& point) {
    switch (point.kind) {
        case ConnectionKind::PortGroup:
            return "port group " + Trellis::Host::Printable(point.portGroup);
        case ConnectionKind::DVPort:
            return "DVPort " + Trellis::Host::Printable(point.dvPort) + " of " + Trellis::Host::Printable(point.dvSwitch);
        case ConnectionKind::OpaqueNetwork:
            return "opaque network " + Trellis::Host::Printable(point.networkId);
        case ConnectionKind::None:
            break;
    }
    return "no connection point";
}

}  // namespace

TesselNicInfoImpl::TesselNicInfoImpl() { kConstruct.Check(); }

TesselNicInfoImpl::~TesselNicInfoImpl() {}

// The point is read through its own operations before the interface is
// created in one transaction. The flags have no meaning on the simulated host.
Gantry::Network::TslNic* TesselNicInfoImpl::AddTesselNic(Gantry::Network::ConnectionPoint* point,
                                                        std::string const& netstackKey,
                                                        Gantry::Network::IpConfig ipConfig,
                                                        Gantry::Network::MacAddress mac, unsigned int /*flags*/,
                                                        unsigned int mtu, std::string name) {
    if (point == nullptr) Refuse("Unable to add an interface: no connection point was given");
    ConnectionRecord connection = ConnectionOf(*point);
    TslNicRecord created = kAddTesselNic.Write([&](Transaction& t) {
        std::vector<TslNicRecord> nics = t.List<TslNicRecord>();
        const std::string refusal =
            "Unable to add interface" + (name.empty() ? std::string() : " " + Trellis::Host::Printable(name)) + ": ";
        TslNicRecord nic;
        nic.name = name.empty() ? FreeName(nics, refusal) : name;
        if (TslNicRecord::NumberOf(nic.name) < 0) Refuse(refusal + "an interface is named tsl0 to tsl255");
        if (t.Contains<TslNicRecord>(nic.name)) Refuse(refusal + "an interface of that name exists already");
        const std::string nicRefusal = "Unable to add interface " + nic.name + ": ";
        if (mtu != 0 && (mtu < static_cast<unsigned int>(Gantry::Network::TslNic::MIN_MTU) ||
                         mtu > static_cast<unsigned int>(Gantry::Network::TslNic::MAX_MTU)))
            Refuse(nicRefusal + "the MTU " + std::to_string(mtu) + " is outside " +
                   std::to_string(Gantry::Network::TslNic::MIN_MTU) + " to " +
                   std::to_string(Gantry::Network::TslNic::MAX_MTU));
        nic.mtu = mtu == 0 ? TslNicRecord::kDefaultMtu : static_cast<int>(mtu);
        TslNicStore::RequireNetstack(t, netstackKey, nicRefusal);
        nic.netstack = netstackKey;
        if (mac.IsUnset()) {
            nic.macAddress = FreeMac(nics);
        } else {
            if (mac.IsMulticast()) Refuse(nicRefusal + mac.GetStringAddress() + " is a multicast address");
            nic.macAddress = mac.GetStringAddress();
            for (TslNicRecord const& other : nics)
                if (other.macAddress == nic.macAddress)
                    Refuse(nicRefusal + "interface " + other.name + " has the MAC address " + nic.macAddress);
        }
        nic.connection = connection;
        TakePort(t, nic, nicRefusal);
        TslNicStore::StoreIpConfig(t, nic, ipConfig);
        t.Put(nic);
        return nic;
    });
    return new TslNicImpl(std::move(created));
}

void TesselNicInfoImpl::RemoveTesselNic(Gantry::Network::ConnectionPoint* point, std::string const& netstackKey) {
    if (point == nullptr) Refuse("Unable to remove an interface: no connection point was given");
    ConnectionRecord connection = ConnectionOf(*point);
    kRemoveTesselNic.Write([&](Transaction& t) {
        for (TslNicRecord const& nic : t.ChildrenOf<TslNicRecord>(netstackKey))
            if (SamePoint(nic.connection, connection)) {
                TslNicStore::RemoveTslNic(t, nic);
                return;
            }
        Refuse("Unable to remove an interface: no interface of netstack " + Trellis::Host::Printable(netstackKey) +
               " is attached to " + PointText(connection));
    });
}

std::vector<Gantry::Network::TslNic*> TesselNicInfoImpl::GetTesselNics() {
    return Objects(kGetTesselNics.Read([](Transaction& t) { return t.List<TslNicRecord>(); }));
}

std::vector<Gantry::Network::TslNic*> TesselNicInfoImpl::GetTesselNicsByInstanceKey(std::string const& netstackKey) {
    return Objects(
        kGetTesselNicsByInstanceKey.Read([&](Transaction& t) { return t.ChildrenOf<TslNicRecord>(netstackKey); }));
}

std::vector<Gantry::Network::TslNic*> TesselNicInfoImpl::GetTesselNicsByTag(Gantry::Network::TslNicTagType tag) {
    std::vector<TslNicRecord> tagged = kGetTesselNicsByTag.Read([&](Transaction& t) {
        std::vector<TslNicRecord> nics = t.List<TslNicRecord>();
        nics.erase(std::remove_if(nics.begin(), nics.end(),
                                  [&](TslNicRecord const& nic) {
                                      return std::find(nic.tags.begin(), nic.tags.end(), static_cast<int>(tag)) ==
                                             nic.tags.end();
                                  }),
                   nics.end());
        return nics;
    });
    return Objects(std::move(tagged));
}

void TesselNicInfoImpl::GetTesselNicNamesByInstanceKey(std::vector<std::string>& names, std::string const& netstackKey) {
    std::vector<TslNicRecord> nics =
        kGetTesselNicNamesByInstanceKey.Read([&](Transaction& t) { return t.ChildrenOf<TslNicRecord>(netstackKey); });
    for (TslNicRecord const& nic : ByNumber(std::move(nics))) names.push_back(nic.name);
}

Gantry::Network::TslNic* TesselNicInfoImpl::GetTesselNicByInterface(std::string const& name, bool /*refresh*/) {
    std::optional<TslNicRecord> nic =
        kGetTesselNicByInterface.Read([&](Transaction& t) { return t.Find<TslNicRecord>(name); });
    return nic ? new TslNicImpl(std::move(*nic)) : nullptr;
}

}  // namespace Network
}  // namespace Trellis
