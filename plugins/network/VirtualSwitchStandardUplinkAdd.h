#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard uplink add
class VirtualSwitchStandardUplinkAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardUplinkAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
