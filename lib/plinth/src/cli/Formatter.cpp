#include "plinth/cli/Formatter.h"

#include "plinth/cli/Formatters.h"

namespace Plinth {
namespace Cli {

std::vector<std::string> FormatterNames() { return {"simple", "table", "json", "xml", "csv", "keyvalue"}; }

std::unique_ptr<Formatter> MakeFormatter(std::string const& name) {
    if (name == "simple") return std::unique_ptr<Formatter>(new SimpleFormatter());
    if (name == "table") return std::unique_ptr<Formatter>(new TableFormatter());
    if (name == "json") return std::unique_ptr<Formatter>(new JsonFormatter());
    if (name == "xml") return std::unique_ptr<Formatter>(new XmlFormatter());
    if (name == "csv") return std::unique_ptr<Formatter>(new CsvFormatter());
    if (name == "keyvalue") return std::unique_ptr<Formatter>(new KeyValueFormatter());
    return std::unique_ptr<Formatter>();
}

}  // namespace Cli
}  // namespace Plinth
