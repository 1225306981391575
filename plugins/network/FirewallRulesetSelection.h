#pragma once

#include <vector>

#include <boost/shared_ptr.hpp>

#include "gantry/system/FirewallRuleset.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/Output.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The rulesets a listing command shows: the one named by --ruleset-id, or
// all of them in the firewall's order. Fills rulesets, which the caller then
// owns, and returns true; or reports on output and returns false with
// nothing taken. A missing ruleset reads "Ruleset Not Found: <label>"; a
// failure to look it up "Failed to check loaded status: <label>", without
// the host's text.
bool SelectFirewallRulesets(Trellis::System::SystemInfoImpl& systemInfo,
                            boost::shared_ptr<Plinth::CallSpec::Input> input,
                            boost::shared_ptr<Plinth::CallSpec::Output> output,
                            std::vector<Gantry::System::FirewallRuleset*>& rulesets);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
