#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic up
class NicUp : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicUp)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
