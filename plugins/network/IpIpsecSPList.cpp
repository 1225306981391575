#include "IpIpsecSPList.h"

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "IpsecValues.h"
#include "gantry/network/IpSec.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Trellis::Network::IpSecConfigImpl;

namespace {

// The association name the host gives a policy whose association was removed.
const char* const kDeletedSa = "UNKNOWN";

std::string NetworkText(Gantry::Network::Ipv6Address const& address, unsigned int prefixLength) {
    return address.GetStringAddress() + "/" + std::to_string(prefixLength);
}

}  // namespace

IpIpsecSPList::IpIpsecSPList() {
    SetDescription("List configured Security Policys");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SecurityPolicy",
                              "Name,Source Address,Source Port,Destination Address,Destination Port,Protocol,Flow,"
                              "Action,Mode,SA Name");
}

boost::shared_ptr<InputSpec> IpIpsecSPList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> IpIpsecSPList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpIpsecSPList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("SecurityPolicy");
    result->SetField("Name", MetaString::New());
    result->SetField("Source Address", MetaString::New());
    result->SetField("Source Port", MetaInt::New());
    result->SetField("Destination Address", MetaString::New());
    result->SetField("Destination Port", MetaInt::New());
    result->SetField("Protocol", MetaString::New());
    result->SetField("Flow", MetaString::New());
    result->SetField("Action", MetaString::New());
    result->SetField("Mode", MetaString::New());
    result->SetField("SA Name", MetaString::New());
    return result;
}

void IpIpsecSPList::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    IpSecConfigImpl ipsecConfig;
    try {
        std::vector<Gantry::Network::IpSecSpdParam> policies;
        ipsecConfig.GetSPDConfigList(policies);
        bool deletedSa = false;
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::IpSecSpdParam const& policy : policies) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", policy.name);
            entry->SetField("Source Address", NetworkText(policy.srcAddress, policy.srcPrefixLength));
            entry->SetField("Source Port", policy.srcPort);
            entry->SetField("Destination Address", NetworkText(policy.dstAddress, policy.dstPrefixLength));
            entry->SetField("Destination Port", policy.dstPort);
            entry->SetField("Protocol", TextOf(IpSecConfigImpl::SP_UL_PROTO_TYPE, policy.protocol));
            entry->SetField("Flow", TextOf(IpSecConfigImpl::SP_DIRECTION, policy.direction));
            entry->SetField("Action", TextOf(IpSecConfigImpl::SP_ACTION, policy.action));
            entry->SetField("Mode", TextOf(IpSecConfigImpl::SA_MODE, policy.mode));
            if (policy.saName == kDeletedSa) {
                entry->SetField("SA Name", policy.saName + "*");
                deletedSa = true;
            } else {
                entry->SetField("SA Name", policy.saName);
            }
            result->AddMetaStruct(entry);
        }
        // A note on the starred rows, which come with it.
        if (deletedSa)
            output->SetError(
                "*Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used "
                "anymore.");
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
