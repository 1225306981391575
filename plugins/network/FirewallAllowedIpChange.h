#pragma once

#include "CommandSupport.h"
#include "gantry/system/FirewallRuleset.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The parameters of allowedip add and allowedip remove.
extern const Parameter kAllowedIpRulesetId;
extern const Parameter kAllowedIpAddress;

// The steps that allowedip add and allowedip remove share; change is the
// ruleset's call that differs (AddAllowedIp or RemoveAllowedIp). An empty
// address is reported, and the call still delivers true.
void ChangeAllowedIps(Trellis::System::SystemInfoImpl& systemInfo, boost::shared_ptr<Input> input,
                      boost::shared_ptr<Output> output,
                      void (Gantry::System::FirewallRuleset::*change)(std::string const&));

}  // namespace NetworkNamespace
}  // namespace KorvexCli
