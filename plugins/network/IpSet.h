#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip set
class IpSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
