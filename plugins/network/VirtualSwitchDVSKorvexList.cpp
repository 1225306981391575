#include "VirtualSwitchDVSKorvexList.h"

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "KnownUplinks.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/NetworkFactory.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVdsName =
    Parameter::String("vds-name", "v", "Limit the output of this command to only vDS with the given name.");

}  // namespace

VirtualSwitchDVSKorvexList::VirtualSwitchDVSKorvexList() {
    SetDescription("List the Korvex Meridon Distributed Switch currently configured on the Halden host.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VDS", "%Name%");
    SetDefaultOutputParameter("table-columns",
                              "Name,VDS ID,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Timeout,"
                              "Uplinks,Korvex Branded,DVPort");
}

boost::shared_ptr<InputSpec> VirtualSwitchDVSKorvexList::GetInputSpecInternal() { return InputSpecOf(kVdsName); }

boost::shared_ptr<OutputSpec> VirtualSwitchDVSKorvexList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VirtualSwitchDVSKorvexList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VDS");
    result->SetField("Name", MetaString::New());
    result->SetField("VDS ID", MetaString::New());
    result->SetField("Class", MetaString::New());
    result->SetField("Num Ports", MetaInt::New());
    result->SetField("Used Ports", MetaInt::New());
    result->SetField("Configured Ports", MetaInt::New());
    result->SetField("MTU", MetaInt::New());
    result->SetField("CDP Status", MetaString::New());
    result->SetField("Beacon Timeout", MetaInt::New());
    result->SetField("Uplinks", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Korvex Branded", MetaBool::New());
    result->SetField("DVPort", MetaList::New(Plinth::MetaObj::META_STRUCT, GetDVPortStructure()));
    return result;
}

boost::shared_ptr<MetaStruct> VirtualSwitchDVSKorvexList::GetDVPortStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("DVPort");
    result->SetField("Port ID", MetaString::New());
    result->SetField("In Use", MetaBool::New());
    result->SetField("DVPortgroup ID", MetaString::New());
    result->SetField("Client", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

boost::shared_ptr<MetaList> VirtualSwitchDVSKorvexList::GetDVPortList(std::vector<Gantry::Network::DVPort*> ports) {
    OwnedVector<Gantry::Network::DVPort> owned(std::move(ports));
    std::vector<Trellis::Network::DVPortImpl*> impls;
    Trellis::Util::CastVector(owned.Items(), impls);
    boost::shared_ptr<MetaList> list = MetaList::New(Plinth::MetaObj::META_STRUCT, GetDVPortStructure());
    for (Trellis::Network::DVPortImpl* port : impls) {
        std::vector<std::string> clients;
        bool inUse = port->IsInUse(clients);
        boost::shared_ptr<MetaStruct> entry = GetDVPortStructure();
        entry->SetField("Port ID", port->GetPortId());
        entry->SetField("In Use", inUse);
        entry->SetField("DVPortgroup ID", port->GetPortGroupId());
        entry->SetField("Client", clients);
        list->AddMetaStruct(entry);
    }
    return list;
}

void VirtualSwitchDVSKorvexList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVdsName);
        Trellis::Network::NetworkInfoImpl networkInfo;
        OwnedVector<Gantry::Network::DVSwitch> dvSwitches;
        if (name.empty()) {
            dvSwitches = vswitchInfo.GetDVSwitches();
        } else {
            dvSwitches.Add(Gantry::Network::NetworkFactory::GetDVSwitchByName(name));
        }
        std::vector<std::string> pnicNames = PnicNames(networkInfo);

        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::DVSwitch* dvSwitch : dvSwitches) {
            auto* impl = dynamic_cast<Trellis::Network::DVSwitchImpl*>(dvSwitch);
            if (impl == nullptr) {
                output->SetError("Unable to access all vDS");
                return;
            }
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", impl->GetName());
            entry->SetField("VDS ID", impl->GetId());
            entry->SetField("Class", impl->GetClass());
            entry->SetField("Num Ports", impl->GetNumPorts());
            entry->SetField("Used Ports", impl->GetUsedPorts());
            entry->SetField("Configured Ports", impl->GetConfiguredPorts());
            entry->SetField("MTU", impl->GetMtu());
            entry->SetField("CDP Status", impl->GetCdpStatus());
            entry->SetField("Beacon Timeout", impl->GetBeaconTimeout());
            entry->SetField("Korvex Branded", impl->IsKorvexBranded());
            entry->SetField("DVPort", GetDVPortList(impl->GetDVPorts()));
            entry->SetField("Uplinks", KnownUplinks(impl->GetUplinks(), pnicNames));
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
