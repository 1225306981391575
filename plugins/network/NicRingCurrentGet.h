#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic ring current get
class NicRingCurrentGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicRingCurrentGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
