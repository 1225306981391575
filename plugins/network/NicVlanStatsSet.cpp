#include "NicVlanStatsSet.h"

#include <memory>
#include <new>
#include <string>

#include "CommandSupport.h"
#include "NicUplinkSwitch.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kEnabled = Parameter::Bool("enabled", "e", "Whether to enable or disable VLAN statistics").Required();

}  // namespace

NicVlanStatsSet::NicVlanStatsSet() {
    SetDescription("Enable/disable VLAN statistics collection on the NIC.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicVlanStatsSet::GetInputSpecInternal() {
    return InputSpecOf(kVlanStatsNicName, kEnabled);
}

boost::shared_ptr<OutputSpec> NicVlanStatsSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicVlanStatsSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVlanStatsNicName);
        bool enabled = input->GetBool(kEnabled);
        std::unique_ptr<Trellis::Network::PortsetImpl> uplinkSwitch;
        UplinkSearch search = FindUplinkSwitch(vswitchInfo, name, uplinkSwitch);
        // No sentence of its own: the failure passes out like any other
        // failed allocation.
        if (search == UplinkSearch::OutOfMemory) throw std::bad_alloc();
        if (search == UplinkSearch::Found) {
            uplinkSwitch->SetUplinkVlanStatsEnabled(name, enabled);
        } else {
            // Reported, and true is delivered all the same.
            output->SetError(NotAnUplinkText(name));
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to set VLAN stats: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
