#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip dns server list
class IpDNSServerList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpDNSServerList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
