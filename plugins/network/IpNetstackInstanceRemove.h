#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip netstack remove
class IpNetstackInstanceRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNetstackInstanceRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
