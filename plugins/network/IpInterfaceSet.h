#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface set
class IpInterfaceSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
