#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard policy failover set
class VirtualSwitchStandardPolicyFailoverSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardPolicyFailoverSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
