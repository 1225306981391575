#pragma once

#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Network {

// A port in use on a switch, as a kernel interface hands out its own.
class Port : public virtual Gantry::Lib::GantryObject {
public:
    ~Port() override;

    virtual int GetPortId() = 0;
};

}  // namespace Network
}  // namespace Gantry
