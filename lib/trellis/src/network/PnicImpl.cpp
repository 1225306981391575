#include "trellis/network/PnicImpl.h"

#include <algorithm>
#include <optional>
#include <utility>

#include "DVSwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/PortImpl.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetName("Pnic::GetName");
const Trellis::Host::Operation kIsValidPnic("PnicImpl::IsValidPnic");
const Trellis::Host::Operation kGetUplinkPort("PnicImpl::GetUplinkPort");
}  // namespace

PnicImpl::PnicImpl(std::string name) : name_(std::move(name)) {}

PnicImpl::~PnicImpl() {}

std::string PnicImpl::GetName() {
    kGetName.Check();
    return name_;
}

PortImpl* PnicImpl::GetUplinkPort() {
    std::optional<Trellis::Host::PortRecord> port = kGetUplinkPort.Read([&](Trellis::Host::Transaction& t) {
        std::optional<Trellis::Host::PortRecord> found;
        std::string vswitch;
        for (Trellis::Host::StandardSwitchRecord const& record : t.List<Trellis::Host::StandardSwitchRecord>())
            if (std::find(record.uplinks.begin(), record.uplinks.end(), name_) != record.uplinks.end())
                vswitch = record.name;
        if (vswitch.empty()) vswitch = DVSwitchStore::SwitchOfNic(t, name_);
        if (vswitch.empty()) return found;
        for (Trellis::Host::PortRecord& record : t.ChildrenOf<Trellis::Host::PortRecord>(vswitch))
            if (record.clientKind == Trellis::Host::PortClientKind::Uplink && record.clientName == name_)
                found = std::move(record);
        return found;
    });
    if (!port)
        throw Gantry::Lib::GantryException("Physical NIC " + Trellis::Host::Printable(name_) +
                                           " has no uplink port on any switch");
    return new PortImpl(std::move(*port));
}

bool PnicImpl::IsValidPnic(std::string const& name) {
    return kIsValidPnic.Read(
        [&](Trellis::Host::Transaction& t) { return t.Contains<Trellis::Host::PnicRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis
