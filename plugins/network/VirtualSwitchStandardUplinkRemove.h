#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard uplink remove
class VirtualSwitchStandardUplinkRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardUplinkRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
