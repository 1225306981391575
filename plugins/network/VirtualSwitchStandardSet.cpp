#include "VirtualSwitchStandardSet.h"

#include "gantry/lib/GantryException.h"
#include "gantry/network/CdpStatus.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchStandardSet::VirtualSwitchStandardSet() {
    SetDescription("This command sets the MTU size and CDP status of a given virtual switch.");
    SetMetaDataField("type", "operation");
}

VirtualSwitchStandardSet::~VirtualSwitchStandardSet() {}

boost::shared_ptr<VirtualSwitchStandardSet> VirtualSwitchStandardSet::New() {
    return boost::shared_ptr<VirtualSwitchStandardSet>(new VirtualSwitchStandardSet());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchStandardSet::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("The name of virtual switch to apply the configurations.");
    inputSpec->AddParameter(vswitchName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> mtu =
        Plinth::CallSpec::ParameterSpec::New("mtu", Plinth::CallSpec::PARAMETER_INT);
    mtu->SetRequired(false);
    mtu->SetShortName("m");
    mtu->SetDescription("The MTU size of the given virtual switch.");
    inputSpec->AddParameter(mtu);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> cdpStatus =
        Plinth::CallSpec::ParameterSpec::New("cdp-status", Plinth::CallSpec::PARAMETER_STRING);
    cdpStatus->SetRequired(false);
    cdpStatus->SetShortName("c");
    cdpStatus->SetDescription(
        "The CDP status of the given virtual switch. It can be 'down', 'listen', 'advertise' or 'both'");
    boost::shared_ptr<Plinth::CallSpec::ParameterConstraint> cdpWords =
        Plinth::CallSpec::ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_STRING_ENUM);
    cdpWords->AddStringEnum("down", "CDP status is 'down'");
    cdpWords->AddStringEnum("listen", "CDP status is 'listen'");
    cdpWords->AddStringEnum("advertise", "CDP status is 'advertise'");
    cdpWords->AddStringEnum("both", "CDP status is 'both'");
    cdpStatus->SetConstraint(cdpWords);
    inputSpec->AddParameter(cdpStatus);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchStandardSet::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchStandardSet::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                               boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    Gantry::Network::VirtualSwitch* vswitch = nullptr;
    try {
        std::string name = input->GetString("vswitch-name");
        if (!Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            output->SetError(name + " is not a valid name for a virtual switch");
            return;
        }
        vswitch = vswitchInfo.GetVirtualSwitchByName(name);
        if (vswitch == nullptr) {
            output->SetError("Unable to find a virtual switch with name " + name);
            return;
        }
        if (input->HasParameter("mtu")) {
            int mtu = input->GetInt("mtu");
            if (mtu < 0) {
                output->SetError("MTU size should be a positive value");
                delete vswitch;
                return;
            }
            vswitch->SetMtu(mtu);
        }
        if (input->HasParameter("cdp-status")) {
            std::string word = input->GetString("cdp-status");
            // Any word but the first three means both; the constraint lets only "both" through.
            Gantry::Network::CdpStatus status = Gantry::Network::CdpStatus::Both;
            if (word == "down") {
                status = Gantry::Network::CdpStatus::Down;
            } else if (word == "listen") {
                status = Gantry::Network::CdpStatus::Listen;
            } else if (word == "advertise") {
                status = Gantry::Network::CdpStatus::Advertise;
            }
            vswitch->SetCdpStatus(status);
        }
        delete vswitch;
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        delete vswitch;
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
