#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/InputSpec.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The parameters that the failover, security and shaping set commands of
// switches and port groups share. Each function appends its parameters, none
// of them required, to the input specification in a fixed order after the command's own.

// load-balancing, failure-detection, notify-switches, failback,
// active-uplinks, standby-uplinks.
void AddFailoverParameters(boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec);

// allow-promiscuous (-o), allow-mac-change, allow-forged-transmits.
void AddSecurityParameters(boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec);

// enabled, avg-bandwidth, peak-bandwidth, burst-size; the three numbers share
// one range constraint, 1 to the largest signed 64-bit value.
void AddShapingParameters(boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
