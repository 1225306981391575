#include "VirtualSwitchPortGroupPolicyShapingGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName = Parameter::String(
    "portgroup-name", "p", "The name of the port group to use when fetching the port group shaping policy.").Required();

}  // namespace

VirtualSwitchPortGroupPolicyShapingGet::VirtualSwitchPortGroupPolicyShapingGet() {
    SetDescription("Get the network shaping policy settings governing the given port group");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:PortGroupTrafficShapingPolicy",
                              "Enabled,Average Bandwidth,Peak Bandwidth,Burst Size,Override Vswitch Enabled,Override "
                              "Vswitch Average Bandwidth,Override Vswitch Peak Bandwidth,Override Vswitch Burst Size");
    SetDefaultOutputParameter("header:PortGroupTrafficShapingPolicy", "<NONE>");
    SetDefaultOutputParameter("units:PortGroupTrafficShapingPolicy.Average Bandwidth", "Kbps");
    SetDefaultOutputParameter("units:PortGroupTrafficShapingPolicy.Peak Bandwidth", "Kbps");
    SetDefaultOutputParameter("units:PortGroupTrafficShapingPolicy.Burst Size", "Kib");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicyShapingGet::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicyShapingGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchPortGroupPolicyShapingGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PortGroupTrafficShapingPolicy");
    DeclareShapingFields(*result);
    DeclareOverrideFields(*result, {"Override Vswitch Enabled", "Override Vswitch Average Bandwidth",
                                    "Override Vswitch Peak Bandwidth", "Override Vswitch Burst Size"});
    return result;
}

void VirtualSwitchPortGroupPolicyShapingGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        // Taken and given back: the values come from the group.
        std::unique_ptr<Gantry::Network::VirtualSwitch>(portGroup.GetVirtualSwitch());
        Gantry::Network::ShapingPolicy inForce = portGroup.GetShapingPolicy();
        Gantry::Network::ShapingPolicy local = portGroup.GetLocalShapingPolicy();
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        SetShapingFields(*result, inForce);
        SetShapingOverrides(*result, local);
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
