#include <algorithm>

#include <boost/algorithm/string/trim.hpp>

#include "plinth/cli/CodePointWidth.h"
#include "plinth/cli/Formatters.h"
#include "plinth/cli/TableRows.h"
#include "plinth/cli/ValueText.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaList.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

// Cells arrive escaped, so a row is one line and its width is what it shows.
void WriteRow(std::ostream& out, std::vector<std::string> const& cells, std::vector<size_t> const& widths) {
    std::string line;
    for (size_t i = 0; i < cells.size(); ++i) {
        if (i > 0) line += "  ";
        line += cells[i];
        line.append(widths[i] - DisplayWidth(cells[i]), ' ');
    }
    boost::algorithm::trim_right(line);
    out << line << "\n";
}

std::vector<std::string> OneLineCells(std::vector<std::string> const& cells) {
    std::vector<std::string> escaped;
    for (std::string const& cell : cells) escaped.push_back(OneLineText(cell));
    return escaped;
}

}  // namespace

void TableFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                           boost::shared_ptr<MetaObject> const& shape, FormatHints const& hints) const {
    if (result->GetMetaType() == META_BOOL) {
        MetaBool const& value = static_cast<MetaBool const&>(*result);
        if (value.IsSet() && !value.GetValue()) out << "false\n";
        return;
    }
    TableRows const table = MakeTableRows(result, shape, hints, true);
    if (!table.isTable) {
        for (std::string const& line : table.plainLines) out << OneLineText(line) << "\n";
        return;
    }
    std::vector<std::string> const columns = OneLineCells(table.columns);
    std::vector<std::vector<std::string> > rows;
    for (auto const& row : table.rows) rows.push_back(OneLineCells(row));

    std::vector<size_t> widths;
    for (std::string const& title : columns) widths.push_back(DisplayWidth(title));
    for (auto const& row : rows) {
        for (size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], DisplayWidth(row[i]));
    }
    std::vector<std::string> dashes;
    for (size_t width : widths) dashes.push_back(std::string(width, '-'));
    WriteRow(out, columns, widths);
    WriteRow(out, dashes, widths);
    for (auto const& row : rows) WriteRow(out, row, widths);
}

}  // namespace Cli
}  // namespace Plinth
