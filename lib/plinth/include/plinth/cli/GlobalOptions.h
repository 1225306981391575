#pragma once

#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// The tool's own options, which stand before the command path:
// --host PATH, --formatter NAME (both also as --name=value) and --help.
struct GlobalOptions {
    std::string host;       // "" when not given
    std::string formatter;  // "" when not given
    bool help = false;
    std::vector<std::string> commandWords;  // the path and the command's options
};

// Reads the global options up to the first word that does not start with
// "-". Throws UsageError for an unknown option, a missing value, or an
// option given twice.
GlobalOptions ParseGlobalOptions(std::vector<std::string> const& words);

}  // namespace Cli
}  // namespace Plinth
