#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip ipsec set
class IpIpsecSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpIpsecSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
