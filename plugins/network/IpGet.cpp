#include "IpGet.h"

#include "CommandSupport.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

IpGet::IpGet() {
    SetDescription("Get global IP settings");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

boost::shared_ptr<InputSpec> IpGet::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> IpGet::GetOutputSpecInternal() { return OutputSpec::Of(GetOutputStructure()); }

boost::shared_ptr<MetaStruct> IpGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("IPInfo");
    result->SetField("IPv6 Enabled", MetaBool::New());
    return result;
}

void IpGet::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        result->SetField("IPv6 Enabled", networkInfo.IsTslIpv6Enabled());
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
