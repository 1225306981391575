#include <cstdio>

#include "plinth/cli/Formatters.h"
#include "plinth/cli/Utf8.h"
#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

bool XmlForbids(char32_t codePoint) {
    return (codePoint < 0x20 && codePoint != '\t' && codePoint != '\n' && codePoint != '\r') || codePoint == 0xFFFE ||
           codePoint == 0xFFFF;
}

// For element text and attribute values alike. The controls XML allows go
// as character references: parsers keep those exactly, while a literal line
// break or tab in an attribute is read as a blank and a literal carriage
// return as a line feed. The characters XML cannot carry at all, even as
// references, and bytes that are not UTF-8 become U+FFFD.
std::string Escape(std::string const& text) {
    std::string escaped;
    std::size_t position = 0;
    char32_t codePoint = 0;
    while (NextCodePointOrReplacement(text, position, codePoint)) {
        switch (codePoint) {
        case '&': escaped += "&amp;"; break;
        case '<': escaped += "&lt;"; break;
        case '>': escaped += "&gt;"; break;
        case '"': escaped += "&quot;"; break;
        default:
            if (XmlForbids(codePoint)) {
                AppendUtf8(escaped, kReplacementCharacter);
            } else if (IsControl(codePoint)) {
                char reference[16];
                std::snprintf(reference, sizeof reference, "&#x%X;", static_cast<unsigned>(codePoint));
                escaped += reference;
            } else {
                AppendUtf8(escaped, codePoint);
            }
        }
    }
    return escaped;
}

char const* ScalarElement(MetaType type) {
    switch (type) {
    case META_BOOL: return "boolean";
    case META_INT: return "integer";
    default: return "string";
    }
}

class XmlWriter {
public:
    XmlWriter(std::ostream& out, FormatHints const& hints) : out_(out), hints_(hints) {}

    void Value(boost::shared_ptr<MetaObject> const& value, int depth) {
        std::string const indent(2 * depth, ' ');
        if (!value) {
            out_ << indent << "<unset/>\n";
        } else if (value->GetMetaType() == META_STRUCT) {
            MetaStruct const& structure = static_cast<MetaStruct const&>(*value);
            out_ << indent << "<structure name=\"" << Escape(structure.GetName()) << "\">\n";
            for (auto const& field : structure.GetFields()) Field(field.first, field.second, depth + 1);
            out_ << indent << "</structure>\n";
        } else if (value->GetMetaType() == META_LIST) {
            out_ << indent << "<list>\n";
            for (auto const& element : static_cast<MetaList const&>(*value).GetElements()) {
                Value(element, depth + 1);
            }
            out_ << indent << "</list>\n";
        } else if (!value->IsSet()) {
            out_ << indent << "<" << ScalarElement(value->GetMetaType()) << "/>\n";
        } else {
            char const* element = ScalarElement(value->GetMetaType());
            out_ << indent << "<" << element << ">" << Escape(InlineText(value, hints_)) << "</" << element
                 << ">\n";
        }
    }

    void Field(std::string const& title, boost::shared_ptr<MetaObject> const& value, int depth) {
        std::string const indent(2 * depth, ' ');
        out_ << indent << "<field name=\"" << Escape(title) << "\"";
        if (!value || !value->IsSet()) {
            out_ << "/>\n";
            return;
        }
        out_ << ">\n";
        Value(value, depth + 1);
        out_ << indent << "</field>\n";
    }

private:
    std::ostream& out_;
    FormatHints const& hints_;
};

}  // namespace

void XmlFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                         boost::shared_ptr<MetaObject> const&, FormatHints const& hints) const {
    out << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<output>\n";
    XmlWriter(out, hints).Value(result, 1);
    out << "</output>\n";
}

}  // namespace Cli
}  // namespace Plinth
