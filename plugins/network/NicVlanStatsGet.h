#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic vlan stats get
class NicVlanStatsGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicVlanStatsGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
