#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall get
class FirewallGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
