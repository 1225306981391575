#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network firewall refresh
class FirewallRefresh : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(FirewallRefresh)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
