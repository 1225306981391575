#include "plinth/cli/TableRows.h"

#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

MetaStruct const* AsStruct(boost::shared_ptr<MetaObject> const& value) {
    return value && value->GetMetaType() == META_STRUCT ? static_cast<MetaStruct const*>(value.get()) : nullptr;
}

// The structure that gives the columns when the result has no rows.
MetaStruct const* ShapeStruct(boost::shared_ptr<MetaObject> const& value) {
    if (MetaStruct const* structure = AsStruct(value)) return structure;
    if (value && value->GetMetaType() == META_LIST) {
        return AsStruct(static_cast<MetaList const&>(*value).GetShape());
    }
    return nullptr;
}

}  // namespace

TableRows MakeTableRows(boost::shared_ptr<MetaObject> const& result, boost::shared_ptr<MetaObject> const& shape,
                        FormatHints const& hints, bool withUnits) {
    TableRows table;
    std::vector<MetaStruct const*> structures;
    if (MetaStruct const* structure = AsStruct(result)) {
        structures.push_back(structure);
    } else if (IsStructList(result) || (result->GetMetaType() == META_LIST &&
                                        static_cast<MetaList const&>(*result).Size() == 0)) {
        for (auto const& element : static_cast<MetaList const&>(*result).GetElements()) {
            if (MetaStruct const* structure = AsStruct(element)) structures.push_back(structure);
        }
    } else {
        if (result->GetMetaType() == META_LIST) {
            for (auto const& element : static_cast<MetaList const&>(*result).GetElements()) {
                table.plainLines.push_back(InlineText(element, hints));
            }
        } else if (result->IsSet()) {
            table.plainLines.push_back(InlineText(result, hints));
        }
        return table;
    }

    MetaStruct const* model = !structures.empty() ? structures.front() : ShapeStruct(result);
    if (!model) model = ShapeStruct(shape);
    if (!model) return table;
    table.isTable = true;
    table.columns = hints.TableColumns(*model, true);
    // The units of the columns, looked up again only for a structure of another name.
    std::string unitsOf;
    std::vector<std::string> units(table.columns.size());
    for (MetaStruct const* structure : structures) {
        if (withUnits && (unitsOf != structure->GetName() || structure == structures.front())) {
            unitsOf = structure->GetName();
            for (size_t i = 0; i < table.columns.size(); ++i) units[i] = hints.Unit(unitsOf, table.columns[i]);
        }
        std::vector<std::string> row;
        row.reserve(table.columns.size());
        for (size_t i = 0; i < table.columns.size(); ++i) {
            std::string cell = InlineText(structure->GetField(table.columns[i]), hints);
            if (!units[i].empty() && !cell.empty()) cell += " " + units[i];
            row.push_back(std::move(cell));
        }
        table.rows.push_back(std::move(row));
    }
    return table;
}

}  // namespace Cli
}  // namespace Plinth
