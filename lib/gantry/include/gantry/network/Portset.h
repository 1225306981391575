#pragma once

#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Network {

// The base of every switch of the host, standard or distributed: its name,
// its ports and its uplinks. Every operation reports failure by throwing
// GantryException.
class Portset : public virtual Gantry::Lib::GantryObject {
public:
    // The number of ports a new standard switch gets when none is asked for.
    static constexpr int DEF_NUM_PORTS = 128;

    ~Portset() override;

    virtual std::string GetName() = 0;
    // The ports the switch has.
    virtual int GetNumPorts() = 0;
    // The ports configured for it (what it was created with).
    virtual int GetConfiguredPorts() = 0;
    // The ports in use: those of its clients and those of its uplinks.
    virtual int GetUsedPorts() = 0;
    // The names of the NICs connected to it, in the order they were added.
    virtual std::vector<std::string> GetUplinks() = 0;
    // The host's word for the kind of switch.
    virtual std::string GetClass() = 0;
};

}  // namespace Network
}  // namespace Gantry
