#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic ring preset get
class NicRingPresetGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicRingPresetGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
