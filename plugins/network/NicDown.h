#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic down
class NicDown : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicDown)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
