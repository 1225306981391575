#include "IpInterfaceTagAdd.h"

#include <memory>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "InterfaceTags.h"
#include "Netstacks.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface on which tags should be set. This name must be an "
                      "interface listed in the interface list command.")
        .Required();
const Parameter kTagName = Parameter::String("tagname", "t", "Tag name to assign to the interface").Required();

// Whether the dedicated stack exists in the kernel with interfaces of its own.
bool DedicatedStackInUse(Trellis::Network::TesselNicInfoImpl& nicInfo, Gantry::Network::NetworkInfo& networkInfo,
                         std::string const& netstack) {
    if (netstack == kDefaultNetstack ||
        networkInfo.GetNetstackInstanceState(netstack) != Gantry::Network::NetworkInfo::NETSTACK_STATE_IN_KERNEL)
        return false;
    std::vector<std::string> names;
    nicInfo.GetTesselNicNamesByInstanceKey(names, netstack);
    return !names.empty();
}

}  // namespace

IpInterfaceTagAdd::IpInterfaceTagAdd() {
    SetDescription(WithTagNames("Adds a tag on a given Tessel network interface. Supported tags are: "));
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceTagAdd::GetInputSpecInternal() { return InputSpecOf(kInterfaceName, kTagName); }

boost::shared_ptr<OutputSpec> IpInterfaceTagAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceTagAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    std::string tagName = input->GetString(kTagName);
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        Gantry::Network::TslNicTagType tag = TagNamed(*output, tagName);
        if (tag == Gantry::Network::TSLNIC_TAG_INVALID) return;
        std::string dedicated = DedicatedStackOfTag(tag);
        std::string netstack = dedicated.empty() ? kDefaultNetstack : dedicated;
        // The tag of a dedicated stack is set when an interface is added to it.
        std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
        if (DedicatedStackInUse(nicInfo, *networkInfo, netstack)) {
            output->SetError("Failed to add " + tagName + " tag when dedicated stack is instantiated");
            return;
        }
        std::unique_ptr<Gantry::Network::TslNic> nic(nicInfo.GetTesselNicByInterface(name, false));
        if (!nic) {
            output->SetError("Unable to find tslnic with name " + name);
            return;
        }
        // An interface on a dedicated stack takes only that stack's tag.
        Gantry::Network::TslNicTagType stackTag = TagOfDedicatedStack(nic->GetNetstackInstanceKey());
        if (stackTag != Gantry::Network::TSLNIC_TAG_INVALID && stackTag != tag) {
            output->SetError("netstack mismatch for tag" + tagName);
            return;
        }
        nic->AddTag(tag, false);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error setting tag " + tagName + " on interface " + name + ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
