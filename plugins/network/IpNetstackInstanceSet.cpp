#include "IpNetstackInstanceSet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/NetstackInstance.h"
#include "trellis/network/NetstackInstanceImpl.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Plinth::CallSpec::CONSTRAINT_STRING_ENUM;
using Plinth::CallSpec::ParameterConstraint;

const Parameter kNetstack =
    Parameter::String("netstack", "N",
                      "The network stack instance. This name must be an interface listed in the netstack list command.")
        .Required();
const Parameter kEnable = Parameter::Bool("enable", "e", "Enable the netstack instance (create in kernel)");
const Parameter kName = Parameter::String("name", "n", "The name for this netstack instance.");
const Parameter kMaxConn = Parameter::Int(
    "maxconn", "m",
    "The maximum number of connections for this netstack instance (applied only during netstack creation).");
// Its choices are the host's algorithms, asked for each time the options are read
// (GetInputSpecInternal sets them).
const Parameter kCcAlgo = Parameter::String(
    "ccalgo", "c",
    "The TCP Congestion Contol Algorithm for this netstack instance (not applied to existing connections).: "
    "%FULLENUM%");
const Parameter kIpv6Enabled = Parameter::Bool(
    "ipv6enabled", "i", "To enable IPv6 for this netstack instance (aplied only during netstack creation).");

// The host's algorithms, in its order, each with its help line.
boost::shared_ptr<ParameterConstraint> AlgorithmChoices() {
    boost::shared_ptr<ParameterConstraint> choices = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
    for (std::string const& name : Trellis::Network::NetstackInstanceImpl::GetCongestionControlAlgorithmList())
        choices->AddStringEnum(name, "Set " + name + " as the algorithm");
    return choices;
}

}  // namespace

IpNetstackInstanceSet::IpNetstackInstanceSet() {
    SetDescription("Configure settings for a given Netstack Instance.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpNetstackInstanceSet::GetInputSpecInternal() {
    boost::shared_ptr<ParameterConstraint> algorithms = AlgorithmChoices();
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kNetstack, kEnable, kName, kMaxConn, kCcAlgo, kIpv6Enabled);
    inputSpec->FindByName(kCcAlgo)->SetConstraint(algorithms);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> IpNetstackInstanceSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void IpNetstackInstanceSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string key = input->GetString(kNetstack);
        std::unique_ptr<Gantry::Network::NetstackInstance> instance(networkInfo.LookupNetstackInstanceByKey(key));
        if (!instance) {
            output->SetError("Unable to find a Netstack instance " + key);
            return;
        }
        // In this order: the limit and the IPv6 switch given with enable
        // true come after the instance is created in the kernel.
        std::string name = input->GetString(kName);
        if (!name.empty()) instance->SetName(name, true);
        if (input->HasParameter(kEnable)) {
            if (input->GetBool(kEnable)) {
                instance->Enable();
            } else {
                instance->Disable();
            }
        }
        if (input->HasParameter(kMaxConn)) instance->SetMaxConnections(input->GetInt(kMaxConn), true);
        std::string algorithm = input->GetString(kCcAlgo);
        if (!algorithm.empty()) instance->SetCongestionControlAlgorithm(algorithm, true);
        if (input->HasParameter(kIpv6Enabled)) instance->SetIpv6Enabled(input->GetBool(kIpv6Enabled), true);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        // The text names no instance, though its wording leads up to one.
        output->SetError(std::string("Error setting configuration for the netstack instance ") + ". Error was : " +
                         e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
