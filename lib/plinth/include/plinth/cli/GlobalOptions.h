#pragma once

#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// The tool's own options, which stand before the command path:
// --host PATH, --formatter NAME, --batch FILE, --completion SHELL (each also
// as --name=value), --force and --help; and the hidden --complete-names
// PARAMETER that completion scripts call.
struct GlobalOptions {
    std::string host;       // "" when not given
    std::string formatter;  // "" when not given
    std::string batch;      // "" when not given; "-" for standard input
    bool force = false;     // with --batch: run every line, whatever fails
    bool help = false;
    std::string completion;     // "" when not given: the shell of the completion script to print
    std::string completeNames;  // "" when not given: the parameter whose host names to print
    std::vector<std::string> commandWords;  // the path and the command's options
};

// Reads the global options up to the first word that does not start with
// "-". Throws UsageError for an unknown option, a missing value, an option
// given twice, --force without --batch, and --batch with --formatter or
// with a command path, and --completion or --complete-names with a command
// path or another of --batch, --completion and --complete-names.
GlobalOptions ParseGlobalOptions(std::vector<std::string> const& words);

}  // namespace Cli
}  // namespace Plinth
