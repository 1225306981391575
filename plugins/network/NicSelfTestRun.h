#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic selftest run
class NicSelfTestRun : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicSelfTestRun)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
