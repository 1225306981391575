#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip netstack set
class IpNetstackInstanceSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNetstackInstanceSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
