#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip ipsec sp remove
class IpIpsecSPRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpIpsecSPRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
