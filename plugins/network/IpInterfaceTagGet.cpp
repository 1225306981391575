#include "IpInterfaceTagGet.h"

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"
#include "trellis/network/TslNicTags.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i", "Name of tslnic whose tags are to be read").Required();

}  // namespace

IpInterfaceTagGet::IpInterfaceTagGet() {
    SetDescription("Gets the tags set on the given Tessel network interface.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    // "IntefaceTag" names no structure: every field of InterfaceTag shows.
    SetDefaultOutputParameter("fields:IntefaceTag", "Tags");
    SetDefaultOutputParameter("header:InterfaceTag", "<NONE>");
}

boost::shared_ptr<InputSpec> IpInterfaceTagGet::GetInputSpecInternal() { return InputSpecOf(kInterfaceName); }

boost::shared_ptr<OutputSpec> IpInterfaceTagGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> IpInterfaceTagGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("InterfaceTag");
    result->SetField("Tags", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void IpInterfaceTagGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        OwnedVector<Gantry::Network::TslNic> nics(nicInfo.GetTesselNics());
        Gantry::Network::TslNic* nic = InterfaceNamed(nics, name);
        if (nic == nullptr) {
            output->SetError("Unable to find an interface with name " + name);
            return;
        }
        std::vector<std::string> tags;
        for (Gantry::Network::TslNicTagType tag : nic->GetTags())
            tags.push_back(Trellis::Network::TslNicTagIdToName(tag));
        result->SetField("Tags", tags);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error getting tags on interface " + name + ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
