#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall unload
class FirewallUnload : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallUnload)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
