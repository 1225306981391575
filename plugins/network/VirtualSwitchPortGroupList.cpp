#include "VirtualSwitchPortGroupList.h"

#include <vector>

#include "gantry/lib/GantryException.h"
#include "gantry/network/PortGroup.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/PortGroupImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupList::VirtualSwitchPortGroupList() {
    SetDescription("List all of the port groups currently on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:PortGroup", "Name,Virtual Switch,Active Clients,VLAN ID");
}

VirtualSwitchPortGroupList::~VirtualSwitchPortGroupList() {}

boost::shared_ptr<VirtualSwitchPortGroupList> VirtualSwitchPortGroupList::New() {
    return boost::shared_ptr<VirtualSwitchPortGroupList>(new VirtualSwitchPortGroupList());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchPortGroupList::GetInputSpecInternal() {
    return Plinth::CallSpec::InputSpec::New();
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchPortGroupList::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> VirtualSwitchPortGroupList::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = Plinth::MetaObj::MetaStruct::New("PortGroup");
    result->SetField("Name", Plinth::MetaObj::MetaString::New());
    result->SetField("Virtual Switch", Plinth::MetaObj::MetaString::New());
    result->SetField("Active Clients", Plinth::MetaObj::MetaInt::New());
    result->SetField("VLAN ID", Plinth::MetaObj::MetaInt::New());
    return result;
}

void VirtualSwitchPortGroupList::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> /*input*/,
                                                 boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    std::vector<Gantry::Network::PortGroup*> portGroups;
    std::vector<Trellis::Network::PortGroupImpl*> impls;
    try {
        boost::shared_ptr<Plinth::MetaObj::MetaList> result =
            Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        portGroups = networkInfo.GetAllPortGroups();
        Trellis::Util::CastVector(portGroups, impls);
        for (Trellis::Network::PortGroupImpl* portGroup : impls) {
            boost::shared_ptr<Plinth::MetaObj::MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", portGroup->GetName());
            entry->SetField("Virtual Switch", portGroup->GetVirtualSwitchName());
            entry->SetField("Active Clients", static_cast<long long>(portGroup->GetActiveClients()));
            entry->SetField("VLAN ID", portGroup->GetVlanId());
            result->AddMetaStruct(entry);
        }
        Trellis::Util::DeleteVector(portGroups);
        impls.clear();
        output->SetResult(result);
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        Trellis::Util::DeleteVector(portGroups);
        impls.clear();
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
