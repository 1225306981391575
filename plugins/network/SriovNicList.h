#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network sriovnic list
class SriovNicList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(SriovNicList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
