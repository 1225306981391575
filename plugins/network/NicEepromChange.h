#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic eeprom change
class NicEepromChange : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicEepromChange)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
