#include "IpInterfaceTagRemove.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "InterfaceTags.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface from which tags should be removed. This name must be "
                      "an interface listed  in the interface list command.")
        .Required();
const Parameter kTagName = Parameter::String("tagname", "t", "Tag name to assign to the interface").Required();

}  // namespace

IpInterfaceTagRemove::IpInterfaceTagRemove() {
    SetDescription("Removes a tag on a given Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceTagRemove::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kTagName);
}

boost::shared_ptr<OutputSpec> IpInterfaceTagRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceTagRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    std::string tagName = input->GetString(kTagName);
    Gantry::Network::TslNicTagType tag = TagNamed(*output, tagName);
    if (tag == Gantry::Network::TSLNIC_TAG_INVALID) return;
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::unique_ptr<Gantry::Network::TslNic> nic(nicInfo.GetTesselNicByInterface(name, false));
        if (!nic) {
            output->SetError("Unable to find tslnic with name " + name);
            return;
        }
        // Any tag comes off any interface: no stack is checked here.
        nic->RemoveTag(tag);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error removing tag " + tagName + " from interface " + name +
                         ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
