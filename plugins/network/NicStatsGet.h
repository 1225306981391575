#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic stats get
class NicStatsGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicStatsGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
