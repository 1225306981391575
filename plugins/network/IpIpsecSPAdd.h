#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip ipsec sp add
class IpIpsecSPAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpIpsecSPAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
