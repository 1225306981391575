#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns server remove
class IpDNSServerRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSServerRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
