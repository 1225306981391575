#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip netstack add
class IpNetstackInstanceAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNetstackInstanceAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
