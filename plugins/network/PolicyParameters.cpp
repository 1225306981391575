#include "PolicyParameters.h"

#include <cstdint>
#include <limits>
#include <string>

#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Plinth::CallSpec::InputSpec;
using Plinth::CallSpec::ParameterConstraint;
using Plinth::CallSpec::ParameterSpec;
using Plinth::CallSpec::ParameterType;

namespace {

boost::shared_ptr<ParameterSpec> OptionalParameter(std::string const& name, ParameterType type,
                                                   std::string const& shortName,
                                                   std::string const& description) {
    boost::shared_ptr<ParameterSpec> parameter = ParameterSpec::New(name, type);
    parameter->SetRequired(false);
    parameter->SetShortName(shortName);
    parameter->SetDescription(description);
    return parameter;
}

}  // namespace

void AddFailoverParameters(boost::shared_ptr<InputSpec> inputSpec) {
    boost::shared_ptr<ParameterSpec> loadBalancing = OptionalParameter(
        "load-balancing", Plinth::CallSpec::PARAMETER_STRING, "l",
        "Set the load balancing policy for this policy. This can be one of the following options: "
        "%FULLENUM%");
    boost::shared_ptr<ParameterConstraint> balancingWords =
        ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_STRING_ENUM);
    balancingWords->AddStringEnum("portid", "Route based on the originating virtual port ID.");
    balancingWords->AddStringEnum("iphash", "Route based on hashing the src and destination IP addresses");
    balancingWords->AddStringEnum("mac", "Route based on the MAC address of the packet source.");
    balancingWords->AddStringEnum("explicit",
                                  "Always use the highest order uplink from the list of active adapters "
                                  "which pass failover criteria.");
    loadBalancing->SetConstraint(balancingWords);
    inputSpec->AddParameter(loadBalancing);

    boost::shared_ptr<ParameterSpec> failureDetection = OptionalParameter(
        "failure-detection", Plinth::CallSpec::PARAMETER_STRING, "f",
        "Set the method of determining how a network outage is detected. %FULLENUM%");
    boost::shared_ptr<ParameterConstraint> detectionWords =
        ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_STRING_ENUM);
    detectionWords->AddStringEnum("link", "Detect failures based on the NIC link state");
    detectionWords->AddStringEnum("beacon", "Detect failures based on active beaconing to the vswitch");
    failureDetection->SetConstraint(detectionWords);
    inputSpec->AddParameter(failureDetection);

    inputSpec->AddParameter(OptionalParameter(
        "notify-switches", Plinth::CallSpec::PARAMETER_BOOL, "n",
        "Indicate whether to send a notification to physical switches on failover"));
    inputSpec->AddParameter(OptionalParameter(
        "failback", Plinth::CallSpec::PARAMETER_BOOL, "b",
        "Configure whether a NIC will be used immediately when it comes back in service after a "
        "failover"));
    inputSpec->AddParameter(OptionalParameter(
        "active-uplinks", Plinth::CallSpec::PARAMETER_STRING, "a",
        "Configure the list of active adapters and their failover order. This list must be a comma "
        "seperated list of values with the uplink name and no spaces. Example:  "
        "--active-uplinks=pnet0,pnet3,pnet7,pnet1"));
    inputSpec->AddParameter(OptionalParameter(
        "standby-uplinks", Plinth::CallSpec::PARAMETER_STRING, "s",
        "Configure the list of standby adapters and their failover order. This list must be a comma "
        "seperated list of values with the uplink name and no spaces. Example:  "
        "--standby-uplinks=pnet2,pnet4,pnet8,pnet6,pnet11"));
}

void AddSecurityParameters(boost::shared_ptr<InputSpec> inputSpec) {
    inputSpec->AddParameter(OptionalParameter("allow-promiscuous", Plinth::CallSpec::PARAMETER_BOOL, "o",
                                         "Allow ports on the virtual switch to enter promiscuous mode."));
    inputSpec->AddParameter(OptionalParameter("allow-mac-change", Plinth::CallSpec::PARAMETER_BOOL, "m",
                                         "Allow ports on the virtual switch to change their MAC address."));
    inputSpec->AddParameter(OptionalParameter(
        "allow-forged-transmits", Plinth::CallSpec::PARAMETER_BOOL, "f",
        "Allow ports on the virtual switch to send packets with forged source information."));
}

void AddShapingParameters(boost::shared_ptr<InputSpec> inputSpec) {
    inputSpec->AddParameter(OptionalParameter(
        "enabled", Plinth::CallSpec::PARAMETER_BOOL, "e",
        "Indicate whether to enable traffic shaping on this policy. If this is true then the "
        "--avg-bandwidth, --peak-bandwidth and --burst-size options are required."));

    boost::shared_ptr<ParameterConstraint> positive =
        ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_INT_RANGE);
    positive->SetIntRange(1, std::numeric_limits<std::int64_t>::max());

    boost::shared_ptr<ParameterSpec> average = OptionalParameter(
        "avg-bandwidth", Plinth::CallSpec::PARAMETER_INT, "b",
        "The averge bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
        "bits/s)");
    average->SetConstraint(positive);
    inputSpec->AddParameter(average);

    boost::shared_ptr<ParameterSpec> peak = OptionalParameter(
        "peak-bandwidth", Plinth::CallSpec::PARAMETER_INT, "k",
        "The peak bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
        "bits/s)");
    peak->SetConstraint(positive);
    inputSpec->AddParameter(peak);

    boost::shared_ptr<ParameterSpec> burst = OptionalParameter(
        "burst-size", Plinth::CallSpec::PARAMETER_INT, "t",
        "The largest burst size allowed for this shaping policy. This value is in Kib (1 Kib = 1024 "
        "bits)");
    burst->SetConstraint(positive);
    inputSpec->AddParameter(burst);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
