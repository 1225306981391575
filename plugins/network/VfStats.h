#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network sriovnic vf stats
class VfStats : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VfStats)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
