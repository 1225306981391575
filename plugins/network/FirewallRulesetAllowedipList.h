#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset allowedip list
class FirewallRulesetAllowedipList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetAllowedipList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
