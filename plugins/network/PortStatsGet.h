#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network port stats get
class PortStatsGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(PortStatsGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
