#pragma once

#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// The tool's own options, which stand before the command path:
// --host PATH, --formatter NAME, --batch FILE (each also as --name=value),
// --force and --help.
struct GlobalOptions {
    std::string host;       // "" when not given
    std::string formatter;  // "" when not given
    std::string batch;      // "" when not given; "-" for standard input
    bool force = false;     // with --batch: run every line, whatever fails
    bool help = false;
    std::vector<std::string> commandWords;  // the path and the command's options
};

// Reads the global options up to the first word that does not start with
// "-". Throws UsageError for an unknown option, a missing value, an option
// given twice, --force without --batch, and --batch with --formatter or
// with a command path.
GlobalOptions ParseGlobalOptions(std::vector<std::string> const& words);

}  // namespace Cli
}  // namespace Plinth
