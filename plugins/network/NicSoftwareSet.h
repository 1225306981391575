#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic software set
class NicSoftwareSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicSoftwareSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
