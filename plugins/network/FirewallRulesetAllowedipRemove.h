#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip remove
class FirewallRulesetAllowedipRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetAllowedipRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
