#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard add
class VirtualSwitchStandardAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
