#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns search remove
class IpDNSSearchRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSSearchRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
