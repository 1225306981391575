#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface tag remove
class IpInterfaceTagRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceTagRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
