#include "VirtualSwitchStandardPolicyFailoverGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "The name of the virtual switch to use when fetching the switch failover policy.").Required();

}  // namespace

VirtualSwitchStandardPolicyFailoverGet::VirtualSwitchStandardPolicyFailoverGet() {
    SetDescription("Get the failover policy settings governing the given virtual switch");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:VirtualSwitchFailoverPolicy",
                              "Load Balancing,Network Failure Detection,Notify Switches,Failback,Active Adapters,"
                              "Standby Adapters,Unused Adapters");
    SetDefaultOutputParameter("header:VirtualSwitchFailoverPolicy", "<NONE>");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicyFailoverGet::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicyFailoverGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchStandardPolicyFailoverGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitchFailoverPolicy");
    DeclareFailoverFields(*result);
    return result;
}

void VirtualSwitchStandardPolicyFailoverGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    boost::shared_ptr<MetaStruct> result = GetOutputStructure();
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        Gantry::Network::NicTeamingPolicy inForce = vswitch.GetTeamingPolicy();
        SetFailoverFields(*result, inForce, vswitch.GetUplinks());
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
