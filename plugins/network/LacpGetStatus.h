#pragma once

#include "gantry/network/LacpTypes.h"
#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch dvs korvex lacp status get
class LacpGetStatus : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(LacpGetStatus)
    // LAG, with its Nic List of NicStatus.
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
    // NicStatus, with its LocalInfo and PartnerInfo.
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetLACPNicInfoStruct();
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetLACPLocalInfoStruct();
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetLACPPartnerInfoStruct();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
