#include "IpIpsecSet.h"

#include <string>

#include "CommandSupport.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kIkeConf = Parameter::String("ike-conf", "f",
                                             "Pass an IKE config path to IKE daemon, this will copy the config to IKE "
                                             "config and restart IKE daemons")
                               .Required();

}  // namespace

IpIpsecSet::IpIpsecSet() {
    SetDescription("Set IKE config file path.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpIpsecSet::GetInputSpecInternal() { return InputSpecOf(kIkeConf); }

boost::shared_ptr<OutputSpec> IpIpsecSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpIpsecSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::IpSecConfigImpl ipsecConfig;
    try {
        std::string path = input->GetString(kIkeConf);
        // A file the check refuses is neither installed nor made effective.
        ipsecConfig.CheckIKEConfig(path);
        ipsecConfig.CopyIKEConfig(path);
        ipsecConfig.RestartIKEDaemons();
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
