#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic vlan stats set
class NicVlanStatsSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicVlanStatsSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
