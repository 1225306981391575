#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic pauseParams set
class NicPauseParamsSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicPauseParamsSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
