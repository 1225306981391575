#include "plinth/metaobj/MetaInt.h"

namespace Plinth {
namespace MetaObj {

boost::shared_ptr<MetaInt> MetaInt::New() { return boost::shared_ptr<MetaInt>(new MetaInt()); }
boost::shared_ptr<MetaInt> MetaInt::New(long long value) {
    return boost::shared_ptr<MetaInt>(new MetaInt(value));
}
MetaInt::MetaInt() = default;
MetaInt::MetaInt(long long value) : value_(value), set_(true) {}
MetaInt::~MetaInt() = default;
MetaType MetaInt::GetMetaType() const { return META_INT; }
bool MetaInt::IsSet() const { return set_; }
long long MetaInt::GetValue() const { return value_; }

}  // namespace MetaObj
}  // namespace Plinth
