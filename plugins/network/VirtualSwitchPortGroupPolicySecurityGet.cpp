#include "VirtualSwitchPortGroupPolicySecurityGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName = Parameter::String(
    "portgroup-name", "p", "The name of the port group to use when fetching the network security policy.").Required();

}  // namespace

VirtualSwitchPortGroupPolicySecurityGet::VirtualSwitchPortGroupPolicySecurityGet() {
    SetDescription("Get the Security Policy governing the given port group. ");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:PortGroupSecurityPolicy",
                              "Allow Promiscuous,Allow MAC Address Change,Allow Forged Transmits,Override Vswitch "
                              "Allow Promiscuous,Override Vswitch Allow MAC Address Change,Override Vswitch Allow "
                              "Forged Transmits");
    SetDefaultOutputParameter("header:PortGroupSecurityPolicy", "<NONE>");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicySecurityGet::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicySecurityGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchPortGroupPolicySecurityGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PortGroupSecurityPolicy");
    DeclareSecurityFields(*result);
    DeclareOverrideFields(*result, {"Override Vswitch Allow Promiscuous", "Override Vswitch Allow MAC Address Change",
                                    "Override Vswitch Allow Forged Transmits"});
    return result;
}

void VirtualSwitchPortGroupPolicySecurityGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                              boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        Gantry::Network::PortSecurityPolicy inForce = portGroup.GetSecurityPolicy();
        Gantry::Network::PortSecurityPolicy local = portGroup.GetLocalSecurityPolicy();
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        SetSecurityFields(*result, inForce);
        SetSecurityOverrides(*result, local);
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
