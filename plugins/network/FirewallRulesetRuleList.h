#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset rule list
class FirewallRulesetRuleList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetRuleList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
