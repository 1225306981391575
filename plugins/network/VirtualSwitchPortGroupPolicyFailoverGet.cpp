#include "VirtualSwitchPortGroupPolicyFailoverGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName = Parameter::String(
    "portgroup-name", "p", "The name of the port group to use when fetching the port group failover policy.").Required();

}  // namespace

VirtualSwitchPortGroupPolicyFailoverGet::VirtualSwitchPortGroupPolicyFailoverGet() {
    SetDescription("Get the network failover policy settings governing the given port group");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:PortGroupFailoverPolicy",
                              "Load Balancing,Network Failure Detection,Notify Switches,Failback,Active Adapters,"
                              "Standby Adapters,Unused Adapters,Override Vswitch Load Balancing,Override Vswitch "
                              "Network Failure Detection,Override Vswitch Notify Switches,Override Vswitch "
                              "Failback,Override Vswitch Uplinks");
    SetDefaultOutputParameter("header:PortGroupFailoverPolicy", "<NONE>");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicyFailoverGet::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicyFailoverGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchPortGroupPolicyFailoverGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PortGroupFailoverPolicy");
    DeclareFailoverFields(*result);
    DeclareOverrideFields(*result, {"Override Vswitch Load Balancing", "Override Vswitch Network Failure Detection",
                                    "Override Vswitch Notify Switches", "Override Vswitch Failback",
                                    "Override Vswitch Uplinks"});
    return result;
}

void VirtualSwitchPortGroupPolicyFailoverGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                              boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch(portGroup.GetVirtualSwitch());
        Gantry::Network::NicTeamingPolicy inForce = portGroup.GetTeamingPolicy();
        Gantry::Network::NicTeamingPolicy local = portGroup.GetLocalTeamingPolicy();
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        SetFailoverFields(*result, inForce, vswitch->GetUplinks());
        SetFailoverOverrides(*result, local);
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
