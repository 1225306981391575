#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall ruleset list
class FirewallRulesetList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRulesetList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
