#include "VirtualSwitchPortGroupList.h"

#include <vector>

#include "CommandSupport.h"
#include "gantry/network/PortGroup.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/PortGroupImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupList::VirtualSwitchPortGroupList() {
    SetDescription("List all of the port groups currently on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:PortGroup", "Name,Virtual Switch,Active Clients,VLAN ID");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VirtualSwitchPortGroupList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PortGroup");
    result->SetField("Name", MetaString::New());
    result->SetField("Virtual Switch", MetaString::New());
    result->SetField("Active Clients", MetaInt::New());
    result->SetField("VLAN ID", MetaInt::New());
    return result;
}

void VirtualSwitchPortGroupList::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::PortGroup> portGroups(networkInfo.GetAllPortGroups());
        std::vector<Trellis::Network::PortGroupImpl*> impls;
        Trellis::Util::CastVector(portGroups.Items(), impls);
        for (Trellis::Network::PortGroupImpl* portGroup : impls) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", portGroup->GetName());
            entry->SetField("Virtual Switch", portGroup->GetVirtualSwitchName());
            entry->SetField("Active Clients", static_cast<long long>(portGroup->GetActiveClients()));
            entry->SetField("VLAN ID", portGroup->GetVlanId());
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
