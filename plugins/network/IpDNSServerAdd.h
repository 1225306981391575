#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns server add
class IpDNSServerAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSServerAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
