#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic eeprom dump
class NicEepromDump : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicEepromDump)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
