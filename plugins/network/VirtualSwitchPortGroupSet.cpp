#include "VirtualSwitchPortGroupSet.h"

#include <string>

#include "gantry/lib/GantryException.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/PortGroup.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupSet::VirtualSwitchPortGroupSet() {
    SetDescription("Set the vlan id for the given port group");
    SetMetaDataField("type", "operator");
}

VirtualSwitchPortGroupSet::~VirtualSwitchPortGroupSet() {}

boost::shared_ptr<VirtualSwitchPortGroupSet> VirtualSwitchPortGroupSet::New() {
    return boost::shared_ptr<VirtualSwitchPortGroupSet>(new VirtualSwitchPortGroupSet());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchPortGroupSet::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> portGroupName =
        Plinth::CallSpec::ParameterSpec::New("portgroup-name", Plinth::CallSpec::PARAMETER_STRING);
    portGroupName->SetRequired(true);
    portGroupName->SetShortName("p");
    portGroupName->SetDescription("The name of the port group to set vlan id for.");
    inputSpec->AddParameter(portGroupName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vlanId =
        Plinth::CallSpec::ParameterSpec::New("vlan-id", Plinth::CallSpec::PARAMETER_INT);
    vlanId->SetRequired(false);
    vlanId->SetShortName("v");
    vlanId->SetDescription("The vlan id for this port group. This value is in the range (" +
                           std::to_string(Gantry::Network::PortGroup::MIN_VLAN_ID) + " - " +
                           std::to_string(Gantry::Network::PortGroup::MAX_VLAN_ID) + ")");
    boost::shared_ptr<Plinth::CallSpec::ParameterConstraint> vlanRange =
        Plinth::CallSpec::ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_INT_RANGE);
    vlanRange->SetIntRange(Gantry::Network::PortGroup::MIN_VLAN_ID, Gantry::Network::PortGroup::MAX_VLAN_ID);
    vlanId->SetConstraint(vlanRange);
    inputSpec->AddParameter(vlanId);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchPortGroupSet::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchPortGroupSet::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Gantry::Network::PortGroup* portGroup = nullptr;
    try {
        std::string name = input->GetString("portgroup-name");
        // Optional, yet read without a test: a missing id sets what GetInt gives for it.
        int vlanId = input->GetInt("vlan-id");
        portGroup = Gantry::Network::NetworkFactory::GetPortGroupByName(name);
        if (portGroup == nullptr) {
            output->SetError("Unable to find a port group with the name " + name);
            return;
        }
        portGroup->SetVlanId(vlanId);
        delete portGroup;
        portGroup = nullptr;
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        delete portGroup;
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
