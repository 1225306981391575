#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace MetaObj {

MetaObject::~MetaObject() = default;
bool MetaObject::IsSet() const { return true; }

}  // namespace MetaObj
}  // namespace Plinth
