#include "LacpSetTimeout.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/NetworkFactory.h"
#include "trellis/network/DVSwitchImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kTimeout =
    Parameter::Bool("timeout", "t", "Set long or short timeout: 1 for short timeout and 0 for long timeout.")
        .Required();
const Parameter kNicName = Parameter::String(
    "nic-name", "n", "The nic name. If it is set, then only this pnet in the lag will be configured.");
const Parameter kLagId = Parameter::Int("lag-id", "l", "The ID of LAG to be configured.").Required();
const Parameter kVds = Parameter::String("vds", "s", "The name of VDS.").Required();

}  // namespace

// This command sets no "type".
LacpSetTimeout::LacpSetTimeout() { SetDescription("Set long/short timeout for pnets in one LACP LAG"); }

boost::shared_ptr<InputSpec> LacpSetTimeout::GetInputSpecInternal() {
    return InputSpecOf(kTimeout, kNicName, kLagId, kVds);
}

boost::shared_ptr<OutputSpec> LacpSetTimeout::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void LacpSetTimeout::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        if (!input->HasParameter(kTimeout)) {
            output->SetError("Timeout is empty");
            return;
        }
        bool timeout = input->GetBool(kTimeout);
        if (!input->HasParameter(kVds)) {
            output->SetError("VDS name is empty");
            return;
        }
        std::string vds = input->GetString(kVds);
        std::unique_ptr<Gantry::Network::DVSwitch> dvSwitch(Gantry::Network::NetworkFactory::GetDVSwitchByName(vds));
        if (!dvSwitch) {
            // A handle on the name: the host refuses an unknown switch when
            // the timeout is set, with its own text.
            dvSwitch.reset(new Trellis::Network::DVSwitchImpl(vds, Gantry::Network::Portset::DEF_NUM_PORTS));
        }
        if (!input->HasParameter(kLagId)) {
            output->SetError("LAG ID is empty");
            return;
        }
        int lagId = input->GetInt(kLagId);
        std::string nicName = input->HasParameter(kNicName) ? input->GetString(kNicName) : std::string();
        dvSwitch->SetLacpTimeout(lagId, timeout, nicName);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
