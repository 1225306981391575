#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy failover set
class VirtualSwitchPortGroupPolicyFailoverSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupPolicyFailoverSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
