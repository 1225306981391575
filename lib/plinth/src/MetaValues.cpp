// The plain result values: MetaObject, MetaBool, MetaInt, MetaString.
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaObject.h"
#include "plinth/metaobj/MetaString.h"

namespace Plinth {
namespace MetaObj {

MetaObject::~MetaObject() = default;
bool MetaObject::IsSet() const { return true; }

// MetaBool
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

// MetaInt
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

// MetaString
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
