#include "trellis/network/PortsetImpl.h"

#include <utility>

#include "SwitchStore.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetName("Portset::GetName");
const Trellis::Host::Operation kGetNumPorts("Portset::GetNumPorts");
const Trellis::Host::Operation kGetConfiguredPorts("Portset::GetConfiguredPorts");
const Trellis::Host::Operation kGetUsedPorts("Portset::GetUsedPorts");
const Trellis::Host::Operation kGetUplinks("Portset::GetUplinks");
const Trellis::Host::Operation kGetClass("Portset::GetClass");
const Trellis::Host::Operation kIsValidVirtualSwitch("PortsetImpl::IsValidVirtualSwitch");
}  // namespace

PortsetImpl::PortsetImpl(std::string name, int numPorts, std::vector<std::string> uplinks, std::string className)
    : name_(std::move(name)), numPorts_(numPorts), uplinks_(std::move(uplinks)), className_(std::move(className)) {}

PortsetImpl::~PortsetImpl() {}

std::string PortsetImpl::GetName() {
    kGetName.Check();
    return name_;
}

// The simulated host reserves no ports of its own: a switch has the ports it
// was configured with.
int PortsetImpl::GetNumPorts() {
    kGetNumPorts.Check();
    return numPorts_;
}

int PortsetImpl::GetConfiguredPorts() {
    kGetConfiguredPorts.Check();
    return numPorts_;
}

int PortsetImpl::GetUsedPorts() {
    return kGetUsedPorts.Read([&](Trellis::Host::Transaction& t) {
        return static_cast<int>(SwitchStore::ClientPortsOf(t, name_)) + static_cast<int>(uplinks_.size());
    });
}

std::vector<std::string> PortsetImpl::GetUplinks() {
    kGetUplinks.Check();
    return uplinks_;
}

std::string PortsetImpl::GetClass() {
    kGetClass.Check();
    return className_;
}

bool PortsetImpl::IsValidVirtualSwitch(std::string const& name) {
    return kIsValidVirtualSwitch.Read(
        [&](Trellis::Host::Transaction& t) { return t.Contains<Trellis::Host::StandardSwitchRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis
