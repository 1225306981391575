#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic cso set
class NicCsoSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicCsoSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
