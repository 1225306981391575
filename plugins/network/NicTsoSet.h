#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic tso set
class NicTsoSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicTsoSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
