#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface remove
class IpInterfaceRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
