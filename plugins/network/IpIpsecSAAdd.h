#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip ipsec sa add
class IpIpsecSAAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpIpsecSAAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
