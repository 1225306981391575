#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard remove
class VirtualSwitchStandardRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
