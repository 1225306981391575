#include "plinth/metaobj/MetaStruct.h"

#include <algorithm>

#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"

namespace Plinth {
namespace MetaObj {

boost::shared_ptr<MetaStruct> MetaStruct::New(std::string const& name) {
    return boost::shared_ptr<MetaStruct>(new MetaStruct(name));
}

MetaStruct::MetaStruct(std::string const& name) : name_(name) {}
MetaStruct::~MetaStruct() = default;

MetaType MetaStruct::GetMetaType() const { return META_STRUCT; }

void MetaStruct::Store(std::string const& title, boost::shared_ptr<MetaObject> value) {
    for (Field& field : fields_) {
        if (field.first == title) {
            field.second = value;
            return;
        }
    }
    fields_.emplace_back(title, value);
}

void MetaStruct::SetField(std::string const& title, boost::shared_ptr<MetaString> value) { Store(title, value); }
void MetaStruct::SetField(std::string const& title, boost::shared_ptr<MetaBool> value) { Store(title, value); }
void MetaStruct::SetField(std::string const& title, boost::shared_ptr<MetaInt> value) { Store(title, value); }
void MetaStruct::SetField(std::string const& title, boost::shared_ptr<MetaList> value) { Store(title, value); }
void MetaStruct::SetField(std::string const& title, boost::shared_ptr<MetaStruct> value) { Store(title, value); }

void MetaStruct::SetField(std::string const& title, std::string const& value) {
    Store(title, MetaString::New(value));
}
void MetaStruct::SetField(std::string const& title, char const* value) {
    Store(title, value ? MetaString::New(value) : MetaString::New());
}
void MetaStruct::SetField(std::string const& title, bool value) { Store(title, MetaBool::New(value)); }
void MetaStruct::SetField(std::string const& title, int value) { Store(title, MetaInt::New(value)); }
void MetaStruct::SetField(std::string const& title, long long value) { Store(title, MetaInt::New(value)); }
void MetaStruct::SetField(std::string const& title, unsigned int value) {
    Store(title, MetaInt::New(static_cast<long long>(value)));
}
void MetaStruct::SetField(std::string const& title, unsigned long value) {
    Store(title, MetaInt::New(static_cast<long long>(value)));
}

void MetaStruct::SetField(std::string const& title, std::vector<std::string> const& value) {
    boost::shared_ptr<MetaList> list = MetaList::New(META_STRING);
    for (std::string const& element : value) list->AddString(element);
    Store(title, list);
}

std::string const& MetaStruct::GetName() const { return name_; }
std::vector<MetaStruct::Field> const& MetaStruct::GetFields() const { return fields_; }

boost::shared_ptr<MetaObject> MetaStruct::GetField(std::string const& title) const {
    for (Field const& field : fields_) {
        if (field.first == title) return field.second;
    }
    return boost::shared_ptr<MetaObject>();
}

bool MetaStruct::HasField(std::string const& title) const {
    return std::any_of(fields_.begin(), fields_.end(),
                       [&title](Field const& field) { return field.first == title; });
}

}  // namespace MetaObj
}  // namespace Plinth
