#include "VirtualSwitchStandardList.h"

#include <vector>

#include "CommandSupport.h"
#include "KnownUplinks.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/VirtualSwitch.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "Limit the output of this command to only virtual switches with the given name.");

std::vector<std::string> PortGroupNames(Trellis::Network::VirtualSwitchImpl& vswitch) {
    OwnedVector<Gantry::Network::PortGroup> portGroups(vswitch.GetPortGroups());
    std::vector<std::string> names;
    for (Gantry::Network::PortGroup* portGroup : portGroups) names.push_back(portGroup->GetName());
    return names;
}

}  // namespace

VirtualSwitchStandardList::VirtualSwitchStandardList() {
    SetDescription("List the virtual switches current on the Halden host.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VirtualSwitch", "%Name%");
    SetDefaultOutputParameter("fields:VirtualSwitch",
                              "Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,"
                              "Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardList::GetInputSpecInternal() { return InputSpecOf(kVswitchName); }

boost::shared_ptr<OutputSpec> VirtualSwitchStandardList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VirtualSwitchStandardList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitch");
    result->SetField("Name", MetaString::New());
    result->SetField("Class", MetaString::New());
    result->SetField("Num Ports", MetaInt::New());
    result->SetField("Used Ports", MetaInt::New());
    result->SetField("Configured Ports", MetaInt::New());
    result->SetField("MTU", MetaInt::New());
    result->SetField("CDP Status", MetaString::New());
    result->SetField("Beacon Enabled", MetaBool::New());
    result->SetField("Beacon Interval", MetaInt::New());
    result->SetField("Beacon Threshold", MetaInt::New());
    result->SetField("Beacon Required By", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Uplinks", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Portgroups", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void VirtualSwitchStandardList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        Trellis::Network::NetworkInfoImpl networkInfo;
        OwnedVector<Gantry::Network::VirtualSwitch> vswitches;
        if (name.empty()) {
            vswitches = vswitchInfo.GetVirtualSwitches();
        } else {
            vswitches.Add(vswitchInfo.GetVirtualSwitchByName(name));
        }
        std::vector<std::string> pnicNames = PnicNames(networkInfo);

        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::VirtualSwitch* vswitch : vswitches) {
            auto* impl = dynamic_cast<Trellis::Network::VirtualSwitchImpl*>(vswitch);
            if (impl == nullptr) {
                output->SetError("Unable to access all portsets");
                return;
            }
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", impl->GetName());
            entry->SetField("Class", impl->GetClass());
            entry->SetField("Num Ports", impl->GetNumPorts());
            entry->SetField("Used Ports", impl->GetUsedPorts());
            entry->SetField("Configured Ports", impl->GetConfiguredPorts());
            entry->SetField("MTU", impl->GetMtu());
            entry->SetField("CDP Status", impl->GetCdpStatus());
            entry->SetField("Beacon Enabled", impl->GetBeaconEnabled());
            entry->SetField("Beacon Interval", impl->GetBeaconInterval());
            entry->SetField("Beacon Threshold", impl->GetBeaconThreshold());
            entry->SetField("Beacon Required By", impl->GetBeaconRequiredBy());
            entry->SetField("Uplinks", KnownUplinks(impl->GetUplinks(), pnicNames));
            entry->SetField("Portgroups", PortGroupNames(*impl));
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
