#include "VirtualSwitchStandardList.h"

#include <algorithm>
#include <string>
#include <vector>

#include "gantry/lib/GantryException.h"
#include "gantry/network/Pnic.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchStandardList::VirtualSwitchStandardList() {
    SetDescription("List the virtual switches current on the Halden host.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:VirtualSwitch", "%Name%");
    SetDefaultOutputParameter("fields:VirtualSwitch",
                              "Name,Class,Num Ports,Used Ports,Configured Ports,MTU,CDP Status,Beacon Enabled,"
                              "Beacon Interval,Beacon Threshold,Beacon Required By,Uplinks,Portgroups");
}

VirtualSwitchStandardList::~VirtualSwitchStandardList() {}

boost::shared_ptr<VirtualSwitchStandardList> VirtualSwitchStandardList::New() {
    return boost::shared_ptr<VirtualSwitchStandardList>(new VirtualSwitchStandardList());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchStandardList::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(false);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("Limit the output of this command to only virtual switches with the given name.");
    inputSpec->AddParameter(vswitchName);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchStandardList::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> VirtualSwitchStandardList::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = Plinth::MetaObj::MetaStruct::New("VirtualSwitch");
    result->SetField("Name", Plinth::MetaObj::MetaString::New());
    result->SetField("Class", Plinth::MetaObj::MetaString::New());
    result->SetField("Num Ports", Plinth::MetaObj::MetaInt::New());
    result->SetField("Used Ports", Plinth::MetaObj::MetaInt::New());
    result->SetField("Configured Ports", Plinth::MetaObj::MetaInt::New());
    result->SetField("MTU", Plinth::MetaObj::MetaInt::New());
    result->SetField("CDP Status", Plinth::MetaObj::MetaString::New());
    result->SetField("Beacon Enabled", Plinth::MetaObj::MetaBool::New());
    result->SetField("Beacon Interval", Plinth::MetaObj::MetaInt::New());
    result->SetField("Beacon Threshold", Plinth::MetaObj::MetaInt::New());
    result->SetField("Beacon Required By", Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Uplinks", Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Portgroups", Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void VirtualSwitchStandardList::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    std::vector<Gantry::Network::VirtualSwitch*> vswitches;
    std::vector<Gantry::Network::Pnic*> pnics;
    std::vector<Gantry::Network::PortGroup*> portGroups;
    try {
        std::string name = input->GetString("vswitch-name");
        Trellis::Network::NetworkInfoImpl networkInfo;
        if (name.empty()) {
            vswitches = vswitchInfo.GetVirtualSwitches();
        } else {
            vswitches.push_back(vswitchInfo.GetVirtualSwitchByName(name));
        }

        pnics = networkInfo.GetPnics();
        std::vector<std::string> pnicNames;
        for (Gantry::Network::Pnic* pnic : pnics) {
            pnicNames.push_back(pnic->GetName());
        }
        Trellis::Util::DeleteVector(pnics);

        boost::shared_ptr<Plinth::MetaObj::MetaList> result =
            Plinth::MetaObj::MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::VirtualSwitch* vswitch : vswitches) {
            Trellis::Network::VirtualSwitchImpl* impl = dynamic_cast<Trellis::Network::VirtualSwitchImpl*>(vswitch);
            if (impl == nullptr) {
                Trellis::Util::DeleteVector(vswitches);
                output->SetError("Unable to access all portsets");
                return;
            }
            boost::shared_ptr<Plinth::MetaObj::MetaStruct> entry = GetOutputStructure();
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

            // An uplink that the host does not own as a physical NIC is not shown.
            std::vector<std::string> uplinks = impl->GetUplinks();
            uplinks.erase(std::remove_if(uplinks.begin(), uplinks.end(),
                                         [&](std::string const& uplink) {
                                             return std::find(pnicNames.begin(), pnicNames.end(), uplink) ==
                                                    pnicNames.end();
                                         }),
                          uplinks.end());
            entry->SetField("Uplinks", uplinks);

            portGroups = impl->GetPortGroups();
            std::vector<std::string> portGroupNames;
            for (Gantry::Network::PortGroup* portGroup : portGroups) {
                portGroupNames.push_back(portGroup->GetName());
            }
            Trellis::Util::DeleteVector(portGroups);
            entry->SetField("Portgroups", portGroupNames);

            result->AddMetaStruct(entry);
        }
        Trellis::Util::DeleteVector(vswitches);
        output->SetResult(result);
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        Trellis::Util::DeleteVector(portGroups);
        Trellis::Util::DeleteVector(pnics);
        Trellis::Util::DeleteVector(vswitches);
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
