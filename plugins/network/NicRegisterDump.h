#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic register dump
class NicRegisterDump : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicRegisterDump)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
