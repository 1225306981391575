#include "VirtualSwitchPortGroupSet.h"

#include "CommandSupport.h"
#include "PolicyTargets.h"
#include "gantry/network/PortGroup.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::PortGroup;

const Parameter kPortgroupName =
    Parameter::String("portgroup-name", "p", "The name of the port group to set vlan id for.").Required();
// The help spells the bounds out; the assertion keeps them those of PortGroup.
static_assert(PortGroup::MIN_VLAN_ID == 0 && PortGroup::MAX_VLAN_ID == 4095, "the vlan-id help names the range");
const Parameter kVlanId =
    Parameter::Int("vlan-id", "v", "The vlan id for this port group. This value is in the range (0 - 4095)")
        .Range(PortGroup::MIN_VLAN_ID, PortGroup::MAX_VLAN_ID);

}  // namespace

VirtualSwitchPortGroupSet::VirtualSwitchPortGroupSet() {
    SetDescription("Set the vlan id for the given port group");
    SetMetaDataField("type", "operator");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupSet::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName, kVlanId);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        std::string name = input->GetString(kPortgroupName);
        // Optional, yet read without a test: a missing id sets what GetInt gives for it.
        int vlanId = input->GetInt(kVlanId);
        std::unique_ptr<PortGroup> portGroup = FindPortGroup(name, *output);
        if (!portGroup) return;
        portGroup->SetVlanId(vlanId);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
