#pragma once

#include <string>

#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Network {

// One physical NIC of the host ("pnet0"). An object from a lookup belongs to
// the caller, who deletes it through its virtual destructor. Every operation
// reports failure by throwing GantryException.
class Pnic : public virtual Gantry::Lib::GantryObject {
public:
    ~Pnic() override;

    // The device name, such as "pnet0".
    virtual std::string GetName() = 0;
};

}  // namespace Network
}  // namespace Gantry
