#include "plinth/metaobj/MetaBool.h"

namespace Plinth {
namespace MetaObj {

boost::shared_ptr<MetaBool> MetaBool::New() { return boost::shared_ptr<MetaBool>(new MetaBool()); }
boost::shared_ptr<MetaBool> MetaBool::New(bool value) {
    return boost::shared_ptr<MetaBool>(new MetaBool(value));
}
MetaBool::MetaBool() = default;
MetaBool::MetaBool(bool value) : value_(value), set_(true) {}
MetaBool::~MetaBool() = default;
MetaType MetaBool::GetMetaType() const { return META_BOOL; }
bool MetaBool::IsSet() const { return set_; }
bool MetaBool::GetValue() const { return value_; }

}  // namespace MetaObj
}  // namespace Plinth
