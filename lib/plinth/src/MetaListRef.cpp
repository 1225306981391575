#include "plinth/metaobj/MetaListRef.h"

#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace MetaObj {

ListNotMadeError::ListNotMadeError()
    : std::logic_error("The command appended a row to a result list that was never made.") {}

MetaListRef& MetaListRef::operator=(boost::shared_ptr<MetaList> list) {
    list_ = list;
    return *this;
}

void MetaListRef::AddMetaStruct(boost::shared_ptr<MetaStruct> value) {
    if (!list_) throw ListNotMadeError();
    list_->AddMetaStruct(value);
}

boost::shared_ptr<MetaList> MetaListRef::Get() const { return list_; }

}  // namespace MetaObj
}  // namespace Plinth
