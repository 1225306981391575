#include "VfList.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/SriovNic.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName = Parameter::String("nic-name", "n",
                                             "The name of the SRIOV NIC to configured. This must be one of the "
                                             "cards listed in the sriovNic list command.")
                               .Required();

}  // namespace

VfList::VfList() {
    SetDescription("Get the generic configuration of VFs for SRIOV NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:VFList", "VF ID,Active,PCI Address,Owner World ID");
}

boost::shared_ptr<InputSpec> VfList::GetInputSpecInternal() { return InputSpecOf(kNicName); }

boost::shared_ptr<OutputSpec> VfList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VfList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VFList");
    result->SetField("VF ID", MetaInt::New());
    result->SetField("Active", MetaBool::New());
    result->SetField("PCI Address", MetaString::New());
    result->SetField("Owner World ID", MetaString::New());
    return result;
}

void VfList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::string name = input->GetString(kNicName);
        // Only asked whether the NIC is one.
        if (!std::unique_ptr<Gantry::Network::Pnic>(networkInfo.GetSriovNicByName(name))) {
            output->SetError("There is no SRIOV Nic with name " + name);
            return;
        }
        OwnedVector<Gantry::Network::SriovNicVFInfo> functions(networkInfo.GetSriovNicVFInfo(name));
        for (Gantry::Network::SriovNicVFInfo* function : functions) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("VF ID", function->vfId);
            entry->SetField("Active", function->active);
            entry->SetField("PCI Address", function->pciAddress);
            entry->SetField("Owner World ID", function->ownerWorldId);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get VF Info. Error:" + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
