#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip ipsec sa remove
class IpIpsecSARemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpIpsecSARemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
