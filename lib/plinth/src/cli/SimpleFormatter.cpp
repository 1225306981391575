#include <boost/algorithm/string/trim.hpp>

#include "plinth/cli/Formatters.h"
#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

int const kIndentStep = 3;

class SimpleWriter {
public:
    SimpleWriter(std::ostream& out, FormatHints const& hints) : out_(out), hints_(hints) {}

    // Escaped, so that a value holding a line break cannot start what looks
    // like the next field.
    void Line(int indent, std::string const& text) {
        out_ << boost::algorithm::trim_right_copy(std::string(indent, ' ') + OneLineText(text)) << "\n";
    }

    // A structure's title line at indent, its fields three spaces further.
    void Block(MetaStruct const& structure, int indent) {
        if (hints_.HasHeader(structure)) Line(indent, hints_.Header(structure));
        for (std::string const& title : hints_.Fields(structure)) {
            Field(structure.GetName(), title, structure.GetField(title), indent + kIndentStep);
        }
    }

    // Structures as blocks separated by a blank line; other elements one a line.
    void Elements(MetaList const& list, int indent) {
        bool first = true;
        for (auto const& element : list.GetElements()) {
            if (element && element->GetMetaType() == META_STRUCT) {
                if (!first) Line(0, "");
                Block(static_cast<MetaStruct const&>(*element), indent);
            } else {
                Line(indent, InlineText(element, hints_));
            }
            first = false;
        }
    }

    void Field(std::string const& structName, std::string const& title, boost::shared_ptr<MetaObject> const& value,
               int indent) {
        if (IsStructList(value)) {
            Line(indent, title + ":");
            Elements(static_cast<MetaList const&>(*value), indent + kIndentStep);
        } else if (value && value->GetMetaType() == META_STRUCT) {
            Line(indent, title + ":");
            Block(static_cast<MetaStruct const&>(*value), indent + kIndentStep);
        } else {
            std::string text = InlineText(value, hints_);
            std::string const unit = hints_.Unit(structName, title);
            if (!unit.empty() && !text.empty()) text += " " + unit;
            Line(indent, title + ": " + text);
        }
    }

private:
    std::ostream& out_;
    FormatHints const& hints_;
};

}  // namespace

void SimpleFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                            boost::shared_ptr<MetaObject> const&, FormatHints const& hints) const {
    SimpleWriter writer(out, hints);
    switch (result->GetMetaType()) {
    case META_BOOL: {
        MetaBool const& value = static_cast<MetaBool const&>(*result);
        if (value.IsSet() && !value.GetValue()) writer.Line(0, "false");
        return;
    }
    case META_STRUCT:
        writer.Block(static_cast<MetaStruct const&>(*result), 0);
        return;
    case META_LIST:
        writer.Elements(static_cast<MetaList const&>(*result), 0);
        return;
    default:
        if (result->IsSet()) writer.Line(0, InlineText(result, hints));
        return;
    }
}

}  // namespace Cli
}  // namespace Plinth
