#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip add
class FirewallRulesetAllowedipAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetAllowedipAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
