#include "plinth/cli/Formatters.h"
#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

char const* TypeName(MetaType type) {
    switch (type) {
    case META_BOOL: return "boolean";
    case META_INT: return "integer";
    default: return "string";
    }
}

class KeyValueWriter {
public:
    KeyValueWriter(std::ostream& out, FormatHints const& hints) : out_(out), hints_(hints) {}

    // key is the path so far ("" at the top level).
    void Value(std::string const& key, boost::shared_ptr<MetaObject> const& value) {
        if (!value) {
            out_ << OneLineText(key) << "=\n";
        } else if (value->GetMetaType() == META_STRUCT) {
            MetaStruct const& structure = static_cast<MetaStruct const&>(*value);
            std::string const prefix = key.empty() ? structure.GetName() : key;
            for (auto const& field : structure.GetFields()) Value(prefix + "." + field.first, field.second);
        } else if (value->GetMetaType() == META_LIST) {
            for (auto const& element : static_cast<MetaList const&>(*value).GetElements()) {
                Value(key.empty() ? key : key + "[]", element);
            }
        } else {
            std::string const type = TypeName(value->GetMetaType());
            out_ << OneLineText(key.empty() ? type : key + "." + type) << "="
                 << OneLineText(InlineText(value, hints_)) << "\n";
        }
    }

private:
    std::ostream& out_;
    FormatHints const& hints_;
};

}  // namespace

void KeyValueFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                              boost::shared_ptr<MetaObject> const&, FormatHints const& hints) const {
    KeyValueWriter(out, hints).Value("", result);
}

}  // namespace Cli
}  // namespace Plinth
