#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic set
class NicSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
