#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface tag add
class IpInterfaceTagAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceTagAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
