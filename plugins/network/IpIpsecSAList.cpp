#include "IpIpsecSAList.h"

#include <vector>

#include "CommandSupport.h"
#include "IpsecValues.h"
#include "gantry/network/IpSec.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Trellis::Network::IpSecConfigImpl;

IpIpsecSAList::IpIpsecSAList() {
    SetDescription("List configured Security Associations");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SecurityAssociation",
                              "Name,Source Address,Destination Address,State,SPI,Mode,Encryption Algorithm,"
                              "Integrity Algorithm,Lifetime");
}

boost::shared_ptr<InputSpec> IpIpsecSAList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> IpIpsecSAList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpIpsecSAList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("SecurityAssociation");
    result->SetField("Name", MetaString::New());
    result->SetField("Source Address", MetaString::New());
    result->SetField("Destination Address", MetaString::New());
    result->SetField("State", MetaString::New());
    result->SetField("SPI", MetaString::New());
    result->SetField("Mode", MetaString::New());
    result->SetField("Encryption Algorithm", MetaString::New());
    result->SetField("Integrity Algorithm", MetaString::New());
    result->SetField("Lifetime", MetaString::New());
    return result;
}

void IpIpsecSAList::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    IpSecConfigImpl ipsecConfig;
    try {
        std::vector<Gantry::Network::IpSecSadParam> associations;
        ipsecConfig.GetSADConfigList(associations);
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::IpSecSadParam const& association : associations) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", association.name);
            entry->SetField("Source Address", association.srcAddress.GetStringAddress());
            entry->SetField("Destination Address", association.dstAddress.GetStringAddress());
            entry->SetField("State", TextOf(IpSecConfigImpl::SA_STATE, association.state));
            entry->SetField("SPI", SpiText(association.spi));
            entry->SetField("Mode", TextOf(IpSecConfigImpl::SA_MODE, association.mode));
            entry->SetField("Encryption Algorithm", TextOf(IpSecConfigImpl::SA_ENCPT_ALG, association.encryptionAlgorithm));
            entry->SetField("Integrity Algorithm", TextOf(IpSecConfigImpl::SA_AUTH_ALG, association.integrityAlgorithm));
            entry->SetField("Lifetime", ConvertToHrsMinsAndSecs(association.lifetime));
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
