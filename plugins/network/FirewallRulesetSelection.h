#pragma once

#include "CommandSupport.h"
#include "gantry/system/FirewallRuleset.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The rulesets a listing command shows: the one named by its --ruleset-id, or
// all of them in the firewall's order. Fills rulesets and returns true; or
// reports on output and returns false with nothing taken. A missing ruleset
// reads "Ruleset Not Found: <label>"; a failure to look it up "Failed to
// check loaded status: <label>", without the host's text.
bool SelectFirewallRulesets(Trellis::System::SystemInfoImpl& systemInfo, boost::shared_ptr<Input> input,
                            Parameter const& rulesetIdParameter, boost::shared_ptr<Output> output,
                            OwnedVector<Gantry::System::FirewallRuleset>& rulesets);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
