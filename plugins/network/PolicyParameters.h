#pragma once

#include "CommandSupport.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The parameters that the failover, security and shaping set commands of
// switches and port groups share, none of them required. Each function
// appends its parameters, in a fixed order, to the input specification
// after the command's own.

// load-balancing, failure-detection, notify-switches, failback,
// active-uplinks, standby-uplinks.
void AddFailoverParameters(boost::shared_ptr<InputSpec> inputSpec);
extern const Parameter kLoadBalancing;
extern const Parameter kFailureDetection;
extern const Parameter kNotifySwitches;
extern const Parameter kFailback;
extern const Parameter kActiveUplinks;
extern const Parameter kStandbyUplinks;

// allow-promiscuous (-o), allow-mac-change, allow-forged-transmits.
void AddSecurityParameters(boost::shared_ptr<InputSpec> inputSpec);
extern const Parameter kAllowPromiscuous;
extern const Parameter kAllowMacChange;
extern const Parameter kAllowForgedTransmits;

// enabled, avg-bandwidth, peak-bandwidth, burst-size; the three numbers are
// read as 64-bit values and share one range constraint, 1 to the largest
// signed 64-bit value.
void AddShapingParameters(boost::shared_ptr<InputSpec> inputSpec);
extern const Parameter kShapingEnabled;
extern const Parameter kAvgBandwidth;
extern const Parameter kPeakBandwidth;
extern const Parameter kBurstSize;

}  // namespace NetworkNamespace
}  // namespace KorvexCli
