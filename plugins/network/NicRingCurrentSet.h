#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic ring current set
class NicRingCurrentSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicRingCurrentSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
