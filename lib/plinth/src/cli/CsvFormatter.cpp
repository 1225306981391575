#include "plinth/cli/Formatters.h"
#include "plinth/cli/TableRows.h"
#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

using namespace MetaObj;

namespace {

std::string Quote(std::string const& cell) {
    std::string const text = ReplaceInvalidUtf8(cell);
    if (text.find_first_of(",\"\r\n") == std::string::npos) return text;
    std::string quoted = "\"";
    for (char c : text) {
        if (c == '"') quoted += '"';
        quoted += c;
    }
    return quoted + "\"";
}

void WriteRecord(std::ostream& out, std::vector<std::string> const& cells) {
    for (size_t i = 0; i < cells.size(); ++i) out << (i > 0 ? "," : "") << Quote(cells[i]);
    out << "\n";
}

}  // namespace

void CsvFormatter::Write(std::ostream& out, boost::shared_ptr<MetaObject> const& result,
                         boost::shared_ptr<MetaObject> const& shape, FormatHints const& hints) const {
    TableRows const table = MakeTableRows(result, shape, hints, false);
    if (!table.isTable) {
        for (std::string const& line : table.plainLines) out << Quote(line) << "\n";
        return;
    }
    WriteRecord(out, table.columns);
    for (auto const& row : table.rows) WriteRecord(out, row);
}

}  // namespace Cli
}  // namespace Plinth
