#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/cli/FormatHints.h"
#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace Cli {

// A result laid out as rows and columns, for the table and csv formatters.
struct TableRows {
    bool isTable = false;                       // a structure or a list of structures
    std::vector<std::string> columns;           // field titles
    std::vector<std::vector<std::string> > rows;  // one cell per column
    std::vector<std::string> plainLines;        // otherwise: one line per plain value
};

// A structure is one row; a list of structures one row each. The columns come
// from the first structure, or from shape (the command's result type) when
// the list is empty. Cells are the values' one-line text; with withUnits, a
// unit hint is appended to a non-empty cell.
TableRows MakeTableRows(boost::shared_ptr<MetaObj::MetaObject> const& result,
                        boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints,
                        bool withUnits);

}  // namespace Cli
}  // namespace Plinth
