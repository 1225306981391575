#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Lib {

GantryObject::~GantryObject() = default;

}  // namespace Lib
}  // namespace Gantry
