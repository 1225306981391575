#pragma once

#include <string>
#include <vector>

#include "plinth/cli/Completion.h"

namespace Plinth {
namespace Cli {

// One option of a command as a completion script offers it.
struct CompletionOption {
    std::string name;       // the long name, without "--"
    std::string shortName;  // "" when there is none
    std::string help;       // the first line of its help
    bool takesValue = true;            // false for a flag
    std::vector<std::string> values;   // the allowed values, when they are enumerated
    bool hostNames = false;            // the values are names of host objects
};

// One node of the tree: a namespace (with children) or a command (with
// options). The root's path is "".
struct CompletionNode {
    std::string path;  // the names from the root down, joined by blanks
    std::string help;  // the first line of its description
    bool command = false;
    std::vector<std::string> children;
    std::vector<CompletionOption> options;
};

// Every node of the tree below root, root first, parents before children,
// children in registration order.
std::vector<CompletionNode> CompletionNodes(AutoCli::NamespaceNode& root, CompletionSource const& source);

// The scripts of each shell.
std::string BashCompletionScript(std::vector<CompletionNode> const& nodes, CompletionSource const& source);
std::string FishCompletionScript(std::vector<CompletionNode> const& nodes, CompletionSource const& source);

}  // namespace Cli
}  // namespace Plinth
