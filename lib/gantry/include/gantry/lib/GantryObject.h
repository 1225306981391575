#pragma once

namespace Gantry {
namespace Lib {

// The base of every host object of the interface library. Objects returned by
// a lookup belong to the caller, who deletes them through this virtual
// destructor.
class GantryObject {
public:
    virtual ~GantryObject();
};

}  // namespace Lib
}  // namespace Gantry
