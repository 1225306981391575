#include "plinth/cli/Completion.h"

#include "plinth/cli/CompletionModel.h"
#include "plinth/cli/UsageError.h"
#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

namespace {

// zsh completes through its emulation of bash's completion.
std::string ZshPrologue(std::string const& program) {
    return "# zsh completion for " + program + ", through zsh's emulation of bash completion.\n"
           "autoload -U +X compinit && { (( $+functions[compdef] )) || compinit; }\n"
           "autoload -U +X bashcompinit && bashcompinit\n";
}

}  // namespace

std::vector<std::string> CompletionShells() { return {"bash", "zsh", "fish"}; }

std::string CompletionScript(std::string const& shell, AutoCli::NamespaceNode& root, CompletionSource const& source) {
    if (shell != "bash" && shell != "zsh" && shell != "fish") {
        throw UsageError("Unknown shell '" + VisibleText(shell) + "' for --completion; choose bash, zsh or fish.");
    }
    std::vector<CompletionNode> const nodes = CompletionNodes(root, source);
    if (shell == "fish") return FishCompletionScript(nodes, source);
    std::string const script = BashCompletionScript(nodes, source);
    return shell == "zsh" ? ZshPrologue(source.programName) + script : script;
}

}  // namespace Cli
}  // namespace Plinth
