#include <nlohmann/json.hpp>

#include "plinth/cli/Formatters.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

nlohmann::ordered_json ToJson(boost::shared_ptr<MetaObject> const& value) {
    if (!value || !value->IsSet()) return nullptr;
    switch (value->GetMetaType()) {
    case META_BOOL:
        return static_cast<MetaBool const&>(*value).GetValue();
    case META_INT:
        return static_cast<MetaInt const&>(*value).GetValue();
    case META_STRING:
        return static_cast<MetaString const&>(*value).GetValue();
    case META_LIST: {
        nlohmann::ordered_json array = nlohmann::ordered_json::array();
        for (auto const& element : static_cast<MetaList const&>(*value).GetElements()) {
            array.push_back(ToJson(element));
        }
        return array;
    }
    case META_STRUCT: {
        nlohmann::ordered_json object = nlohmann::ordered_json::object();
        for (auto const& field : static_cast<MetaStruct const&>(*value).GetFields()) {
            object[field.first] = ToJson(field.second);
        }
        return object;
    }
    }
    return nullptr;
}

}  // namespace

void JsonFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                          boost::shared_ptr<MetaObject> const&, FormatHints const&) const {
    out << ToJson(result).dump(-1, ' ', false, nlohmann::ordered_json::error_handler_t::replace) << "\n";
}

}  // namespace Cli
}  // namespace Plinth
