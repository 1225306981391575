#include "PolicyParameters.h"

#include <cstdint>
#include <limits>

namespace KorvexCli {
namespace NetworkNamespace {

constexpr Parameter::Word kLoadBalancingWords[] = {
    {"portid", "Route based on the originating virtual port ID."},
    {"iphash", "Route based on hashing the src and destination IP addresses"},
    {"mac", "Route based on the MAC address of the packet source."},
    {"explicit",
     "Always use the highest order uplink from the list of active adapters which pass failover criteria."}};
const Parameter kLoadBalancing =
    Parameter::String("load-balancing", "l",
                      "Set the load balancing policy for this policy. This can be one of the following options: "
                      "%FULLENUM%")
        .StringEnum(kLoadBalancingWords);
constexpr Parameter::Word kFailureDetectionWords[] = {
    {"link", "Detect failures based on the NIC link state"},
    {"beacon", "Detect failures based on active beaconing to the vswitch"}};
const Parameter kFailureDetection =
    Parameter::String("failure-detection", "f",
                      "Set the method of determining how a network outage is detected. %FULLENUM%")
        .StringEnum(kFailureDetectionWords);
const Parameter kNotifySwitches =
    Parameter::Bool("notify-switches", "n", "Indicate whether to send a notification to physical switches on failover");
const Parameter kFailback = Parameter::Bool(
    "failback", "b", "Configure whether a NIC will be used immediately when it comes back in service after a failover");
const Parameter kActiveUplinks = Parameter::String(
    "active-uplinks", "a",
    "Configure the list of active adapters and their failover order. This list must be a comma seperated list "
    "of values with the uplink name and no spaces. Example:  --active-uplinks=pnet0,pnet3,pnet7,pnet1");
const Parameter kStandbyUplinks = Parameter::String(
    "standby-uplinks", "s",
    "Configure the list of standby adapters and their failover order. This list must be a comma seperated list "
    "of values with the uplink name and no spaces. Example:  --standby-uplinks=pnet2,pnet4,pnet8,pnet6,pnet11");

const Parameter kAllowPromiscuous =
    Parameter::Bool("allow-promiscuous", "o", "Allow ports on the virtual switch to enter promiscuous mode.");
const Parameter kAllowMacChange =
    Parameter::Bool("allow-mac-change", "m", "Allow ports on the virtual switch to change their MAC address.");
const Parameter kAllowForgedTransmits = Parameter::Bool(
    "allow-forged-transmits", "f", "Allow ports on the virtual switch to send packets with forged source information.");

const Parameter kShapingEnabled = Parameter::Bool(
    "enabled", "e",
    "Indicate whether to enable traffic shaping on this policy. If this is true then the --avg-bandwidth, "
    "--peak-bandwidth and --burst-size options are required.");
// Read as 64-bit values, from 1 to the largest signed 64-bit value.
const Parameter kAvgBandwidth =
    Parameter::Int64("avg-bandwidth", "b",
                     "The averge bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
                     "bits/s)")
        .Range(1, std::numeric_limits<std::int64_t>::max());
// Its range constraint is kAvgBandwidth's.
const Parameter kPeakBandwidth =
    Parameter::Int64("peak-bandwidth", "k",
                     "The peak bandwidth allowed for this shaping policy. This value is in Kbps (1 Kbps = 1000 "
                     "bits/s)");
const Parameter kBurstSize = Parameter::Int64(
    "burst-size", "t",
    "The largest burst size allowed for this shaping policy. This value is in Kib (1 Kib = 1024 bits)");

void AddFailoverParameters(boost::shared_ptr<InputSpec> inputSpec) {
    for (Parameter const* parameter :
         {&kLoadBalancing, &kFailureDetection, &kNotifySwitches, &kFailback, &kActiveUplinks, &kStandbyUplinks}) {
        inputSpec->AddParameter(parameter->NewSpec());
    }
}

void AddSecurityParameters(boost::shared_ptr<InputSpec> inputSpec) {
    for (Parameter const* parameter : {&kAllowPromiscuous, &kAllowMacChange, &kAllowForgedTransmits}) {
        inputSpec->AddParameter(parameter->NewSpec());
    }
}

void AddShapingParameters(boost::shared_ptr<InputSpec> inputSpec) {
    inputSpec->AddParameter(kShapingEnabled.NewSpec());
    // The three numbers share one range constraint object.
    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> average = kAvgBandwidth.NewSpec();
    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> peak = kPeakBandwidth.NewSpec();
    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> burst = kBurstSize.NewSpec();
    peak->SetConstraint(average->GetConstraint());
    burst->SetConstraint(average->GetConstraint());
    for (auto const& number : {average, peak, burst}) inputSpec->AddParameter(number);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
