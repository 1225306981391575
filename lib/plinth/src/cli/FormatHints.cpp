#include "plinth/cli/FormatHints.h"

#include <boost/algorithm/string/classification.hpp>
#include <boost/algorithm/string/split.hpp>
#include <boost/algorithm/string/trim.hpp>

#include "plinth/cli/ValueText.h"

namespace Plinth {
namespace Cli {

using MetaObj::MetaStruct;

FormatHints::FormatHints(std::map<std::string, std::string> parameters) : parameters_(std::move(parameters)) {}

std::string const* FormatHints::Find(std::string const& key) const {
    auto found = parameters_.find(key);
    return found == parameters_.end() ? nullptr : &found->second;
}

std::vector<std::string> FormatHints::Select(MetaStruct const& structure, std::string const& list) const {
    std::vector<std::string> titles;
    boost::algorithm::split(titles, list, boost::algorithm::is_any_of(","));
    std::vector<std::string> present;
    for (std::string& title : titles) {
        boost::algorithm::trim(title);
        if (structure.HasField(title)) present.push_back(title);
    }
    return present;
}

std::vector<std::string> FormatHints::Fields(MetaStruct const& structure) const {
    if (std::string const* list = Find("fields:" + structure.GetName())) return Select(structure, *list);
    std::vector<std::string> all;
    for (auto const& field : structure.GetFields()) all.push_back(field.first);
    return all;
}

std::vector<std::string> FormatHints::TableColumns(MetaStruct const& structure, bool topLevel) const {
    if (topLevel) {
        if (std::string const* list = Find("table-columns")) return Select(structure, *list);
    }
    if (std::string const* list = Find("table-columns:" + structure.GetName())) return Select(structure, *list);
    return Fields(structure);
}

bool FormatHints::HasHeader(MetaStruct const& structure) const {
    std::string const* header = Find("header:" + structure.GetName());
    return !header || *header != "<NONE>";
}

std::string FormatHints::Header(MetaStruct const& structure) const {
    std::string const* pattern = Find("header:" + structure.GetName());
    if (!pattern) return structure.GetName();
    if (*pattern == "<NONE>") return "";
    std::string header;
    size_t position = 0;
    while (position < pattern->size()) {
        size_t const open = pattern->find('%', position);
        size_t const close = open == std::string::npos ? std::string::npos : pattern->find('%', open + 1);
        if (close == std::string::npos) {
            header += pattern->substr(position);
            break;
        }
        header += pattern->substr(position, open - position);
        std::string const title = pattern->substr(open + 1, close - open - 1);
        header += structure.HasField(title) ? InlineText(structure.GetField(title), *this)
                                            : pattern->substr(open, close - open + 1);
        position = close + 1;
    }
    return header;
}

std::string FormatHints::Unit(std::string const& structName, std::string const& fieldTitle) const {
    std::string const* unit = Find("units:" + structName + "." + fieldTitle);
    return unit ? *unit : std::string();
}

}  // namespace Cli
}  // namespace Plinth
