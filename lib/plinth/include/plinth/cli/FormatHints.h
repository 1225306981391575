#pragma once

#include <map>
#include <string>
#include <vector>

#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace Cli {

// A command's formatter hints (SetDefaultOutputParameter), read by structure
// name:
//   "fields:<Struct>"              which fields, in which order (simple, table)
//   "table-columns:<Struct>"       the same for a structure inside a table
//   "table-columns"                the columns of the result's top level
//   "header:<Struct>"              title line in simple; "<NONE>" for none
//   "units:<Struct>.<Field title>" a unit word printed after the value
// Titles in a list are separated by commas; blanks around them are ignored.
class FormatHints {
public:
    FormatHints() = default;
    explicit FormatHints(std::map<std::string, std::string> parameters);

    // The fields of structure in the order the "fields:" hint gives (titles
    // it lacks are left out), or all its fields in declaration order.
    std::vector<std::string> Fields(MetaObj::MetaStruct const& structure) const;
    // For a table: "table-columns" at the top level, else "table-columns:"
    // and then "fields:" of the structure, else all fields.
    std::vector<std::string> TableColumns(MetaObj::MetaStruct const& structure, bool topLevel) const;
    // The title line of structure in simple: the header hint with each
    // %Field title% replaced by the field's value (a reference to no field
    // stays as written), or the structure's name. Empty for "<NONE>".
    std::string Header(MetaObj::MetaStruct const& structure) const;
    bool HasHeader(MetaObj::MetaStruct const& structure) const;
    // "" when there is no unit for this field.
    std::string Unit(std::string const& structName, std::string const& fieldTitle) const;

private:
    std::string const* Find(std::string const& key) const;
    std::vector<std::string> Select(MetaObj::MetaStruct const& structure, std::string const& list) const;

    std::map<std::string, std::string> parameters_;
};

}  // namespace Cli
}  // namespace Plinth
