#pragma once

#include <vector>

#include "gantry/network/DVPort.h"
#include "plinth/autocli/CommandClass.h"
#include "plinth/metaobj/MetaList.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch dvs korvex list
class VirtualSwitchDVSKorvexList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchDVSKorvexList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetDVPortStructure();
    // One DVPort structure for each port, in their order; takes the ports
    // over and deletes them.
    boost::shared_ptr<Plinth::MetaObj::MetaList> GetDVPortList(std::vector<Gantry::Network::DVPort*> ports);
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
