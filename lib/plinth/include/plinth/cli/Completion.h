#pragma once

#include <functional>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"
#include "plinth/autocli/NamespaceNode.h"
#include "plinth/callspec/InputSpec.h"

namespace Plinth {
namespace Cli {

// What a completion script is made of beyond the tree.
struct CompletionSource {
    std::string programName;               // the command the script completes
    std::vector<std::string> formatters;   // the values of --formatter
    // The parameters whose values are names of host objects: the script asks
    // the program for them (programName [--host PATH] --complete-names NAME).
    std::vector<std::string> hostNameParameters;
    // The input specification of a command; null, or an exception, leaves
    // the command without options in the script. Unset: GetInputSpec.
    std::function<boost::shared_ptr<CallSpec::InputSpec>(AutoCli::Command&)> inputSpecOf;
};

// The shells a script is written for: bash, zsh and fish.
std::vector<std::string> CompletionShells();

// The completion script of the tree below root for shell: the namespaces
// and commands at each level, each command's long and short options, the
// values of enumerated options (string and int enums, true/false for a
// bool), the tool's global options, and host object names asked of the
// program at completion time. Throws UsageError for an unknown shell.
std::string CompletionScript(std::string const& shell, AutoCli::NamespaceNode& root, CompletionSource const& source);

}  // namespace Cli
}  // namespace Plinth
