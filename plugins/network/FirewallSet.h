#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall set
class FirewallSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
