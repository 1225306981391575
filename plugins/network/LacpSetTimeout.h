#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch dvs korvex lacp timeout set
class LacpSetTimeout : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(LacpSetTimeout)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
