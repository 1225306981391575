#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic coalesce set
class NicCoalesceSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicCoalesceSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
