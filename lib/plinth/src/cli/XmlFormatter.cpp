#include "plinth/cli/Formatters.h"
#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

std::string Escape(std::string const& text) {
    std::string escaped;
    for (char c : text) {
        switch (c) {
        case '&': escaped += "&amp;"; break;
        case '<': escaped += "&lt;"; break;
        case '>': escaped += "&gt;"; break;
        case '"': escaped += "&quot;"; break;
        default: escaped += c;
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
