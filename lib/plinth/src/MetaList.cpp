#include "plinth/metaobj/MetaList.h"

#include "plinth/metaobj/MetaString.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace MetaObj {

boost::shared_ptr<MetaList> MetaList::New(MetaType elementType) {
    return New(elementType, boost::shared_ptr<MetaObject>());
}
boost::shared_ptr<MetaList> MetaList::New(MetaType elementType, boost::shared_ptr<MetaObject> shape) {
    return boost::shared_ptr<MetaList>(new MetaList(elementType, shape));
}
boost::shared_ptr<MetaList> MetaList::New(int elementType) {
    return New(static_cast<MetaType>(elementType));
}
boost::shared_ptr<MetaList> MetaList::New(int elementType, boost::shared_ptr<MetaObject> shape) {
    return New(static_cast<MetaType>(elementType), shape);
}

MetaList::MetaList(MetaType elementType, boost::shared_ptr<MetaObject> shape)
    : elementType_(elementType), shape_(shape) {}
MetaList::~MetaList() = default;

MetaType MetaList::GetMetaType() const { return META_LIST; }

void MetaList::AddMetaString(boost::shared_ptr<MetaString> value) { elements_.push_back(value); }
void MetaList::AddMetaStruct(boost::shared_ptr<MetaStruct> value) { elements_.push_back(value); }
void MetaList::AddCString(char const* value) {
    elements_.push_back(value ? MetaString::New(value) : MetaString::New());
}
void MetaList::AddString(std::string const& value) { elements_.push_back(MetaString::New(value)); }

MetaType MetaList::GetElementType() const { return elementType_; }
boost::shared_ptr<MetaObject> MetaList::GetShape() const { return shape_; }
std::vector<boost::shared_ptr<MetaObject> > const& MetaList::GetElements() const { return elements_; }
size_t MetaList::Size() const { return elements_.size(); }

}  // namespace MetaObj
}  // namespace Plinth
