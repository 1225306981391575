#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic sg set
class NicSgSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicSgSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
