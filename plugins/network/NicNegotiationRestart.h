#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic negotiate restart
class NicNegotiationRestart : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicNegotiationRestart)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
