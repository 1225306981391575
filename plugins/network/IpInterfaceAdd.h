#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface add
class IpInterfaceAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
