#include "VirtualSwitchStandardPolicySecuritySet.h"

#include "CommandSupport.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "The name of the virtual switch to use when setting the switch security policy.").Required();
// The switch's own three, not those port groups share: -p where port groups have -o.
const Parameter kAllowPromiscuous =
    Parameter::Bool("allow-promiscuous", "p", "Allow ports on the virtual switch to enter promiscuous mode.");
const Parameter kAllowMacChange =
    Parameter::Bool("allow-mac-change", "m", "Allow ports on the virtual switch to change their MAC address.");
const Parameter kAllowForgedTransmits = Parameter::Bool(
    "allow-forged-transmits", "f", "Allow ports on the virtual switch to send packets with forged source information.");

}  // namespace

VirtualSwitchStandardPolicySecuritySet::VirtualSwitchStandardPolicySecuritySet() {
    SetDescription("Set the security policy for a given virtual switch");
    SetMetaDataField("type", "operator");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicySecuritySet::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName, kAllowPromiscuous, kAllowMacChange, kAllowForgedTransmits);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicySecuritySet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardPolicySecuritySet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        // The policy in force is the base: storing it sets every field at this level.
        Gantry::Network::PortSecurityPolicy policy = vswitch.GetSecurityPolicy();
        if (input->HasParameter(kAllowPromiscuous)) policy.SetAllowPromiscuous(input->GetBool(kAllowPromiscuous));
        if (input->HasParameter(kAllowMacChange)) policy.SetAllowMacAddressChange(input->GetBool(kAllowMacChange));
        if (input->HasParameter(kAllowForgedTransmits)) {
            policy.SetAllowForgedTransmits(input->GetBool(kAllowForgedTransmits));
        }
        vswitch.ApplySecurityPolicy(policy);
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
