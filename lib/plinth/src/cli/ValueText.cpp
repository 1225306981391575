#include "plinth/cli/ValueText.h"

#include <algorithm>
#include <cstdio>

#include "plinth/cli/Utf8.h"

#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

std::string InlineText(boost::shared_ptr<MetaObject> const& value, FormatHints const& hints) {
    if (!value || !value->IsSet()) return "";
    switch (value->GetMetaType()) {
    case META_BOOL:
        return static_cast<MetaBool const&>(*value).GetValue() ? "true" : "false";
    case META_INT:
        return std::to_string(static_cast<MetaInt const&>(*value).GetValue());
    case META_STRING:
        return static_cast<MetaString const&>(*value).GetValue();
    case META_LIST: {
        std::string joined;
        bool first = true;
        for (auto const& element : static_cast<MetaList const&>(*value).GetElements()) {
            if (!first) joined += ", ";
            joined += InlineText(element, hints);
            first = false;
        }
        return joined;
    }
    case META_STRUCT: {
        MetaStruct const& structure = static_cast<MetaStruct const&>(*value);
        std::string joined;
        for (std::string const& title : hints.TableColumns(structure, false)) {
            if (!joined.empty()) joined += ", ";
            std::string text = InlineText(structure.GetField(title), hints);
            std::string const unit = hints.Unit(structure.GetName(), title);
            if (!unit.empty() && !text.empty()) text += " " + unit;
            joined += title + ": " + text;
        }
        return "{" + joined + "}";
    }
    }
    return "";
}

std::string OneLineText(std::string const& text) {
    // Printable ASCII without a backslash, the common case, stays as it is.
    if (std::all_of(text.begin(), text.end(), [](char c) { return c >= 0x20 && c < 0x7F && c != '\\'; }))
        return text;
    std::string escaped;
    std::size_t position = 0;
    char32_t codePoint = 0;
    while (NextCodePointOrReplacement(text, position, codePoint)) {
        switch (codePoint) {
        case '\\': escaped += "\\\\"; break;
        case '\t': escaped += "\\t"; break;
        case '\n': escaped += "\\n"; break;
        case '\r': escaped += "\\r"; break;
        default:
            if (IsControl(codePoint) || codePoint == 0x2028 || codePoint == 0x2029) {
                char hex[8];
                std::snprintf(hex, sizeof hex, "\\u%04x", static_cast<unsigned>(codePoint));
                escaped += hex;
            } else {
                AppendUtf8(escaped, codePoint);
            }
        }
    }
    return escaped;
}

bool IsStructList(boost::shared_ptr<MetaObject> const& value) {
    if (!value || value->GetMetaType() != META_LIST) return false;
    MetaList const& list = static_cast<MetaList const&>(*value);
    if (list.GetElementType() == META_STRUCT) return true;
    for (auto const& element : list.GetElements()) {
        if (element && element->GetMetaType() == META_STRUCT) return true;
    }
    return false;
}

}  // namespace Cli
}  // namespace Plinth
