#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset set
class FirewallRulesetSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
