#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall load
class FirewallLoad : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallLoad)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
