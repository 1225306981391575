#include "plinth/metaobj/MetaString.h"

namespace Plinth {
namespace MetaObj {

boost::shared_ptr<MetaString> MetaString::New() {
    return boost::shared_ptr<MetaString>(new MetaString());
}
boost::shared_ptr<MetaString> MetaString::New(std::string const& value) {
    return boost::shared_ptr<MetaString>(new MetaString(value));
}
MetaString::MetaString() = default;
MetaString::MetaString(std::string const& value) : value_(value), set_(true) {}
MetaString::~MetaString() = default;
MetaType MetaString::GetMetaType() const { return META_STRING; }
bool MetaString::IsSet() const { return set_; }
std::string MetaString::GetValue() const { return value_; }

}  // namespace MetaObj
}  // namespace Plinth
