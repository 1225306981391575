#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip neighbor remove
class IpNeighborRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNeighborRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
