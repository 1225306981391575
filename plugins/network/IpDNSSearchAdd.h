#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns search add
class IpDNSSearchAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSSearchAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
