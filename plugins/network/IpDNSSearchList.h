#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns search list
class IpDNSSearchList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSSearchList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
