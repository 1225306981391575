// The fish completion script: one `complete` line per namespace, command and
// option, each under the condition that the line's path is its parent's.
#include <cctype>
#include <map>

#include "plinth/cli/CompletionModel.h"

namespace Plinth {
namespace Cli {

namespace {

// A word in single quotes, as fish reads them.
std::string Quoted(std::string const& word) {
    std::string quoted = "'";
    for (char c : word) {
        if (c == '\\' || c == '\'') quoted += '\\';
        quoted += c;
    }
    return quoted + "'";
}

std::string JoinedValues(std::vector<std::string> const& values) {
    std::string joined;
    for (std::string const& value : values) joined += (joined.empty() ? "" : " ") + Quoted(value);
    return joined;
}

std::string FunctionPrefix(std::string const& program) {
    std::string prefix = "__";
    for (char c : program) prefix += std::isalnum(static_cast<unsigned char>(c)) ? c : '_';
    return prefix;
}

// The fixed part. @P@ stands for the prefix, @PROGRAM@ for the program.
char const* const kHelpers = R"SCRIPT(# The command path on the line before the cursor, past the tool's options.
function @P@_path
    set -l words (commandline -opc)
    set -e words[1]
    while set -q words[1]
        switch $words[1]
            case --host --formatter --batch --completion
                set -e words[1]
                set -q words[1]; and set -e words[1]
            case '-*'
                set -e words[1]
            case '*'
                break
        end
    end
    set -l path ''
    while set -q words[1]
        set -l next (string trim -- "$path $words[1]")
        contains -- $next $@P@_nodes; or break
        set path $next
        set -e words[1]
    end
    echo $path
end

# Whether the line's path is $argv[1].
function @P@_at
    set -l path (@P@_path)
    test "$path" = "$argv[1]"
end

# The names of the host's objects that a parameter names, asked of the
# program on the line's host.
function @P@_names
    set -l words (commandline -opc)
    set -l args --complete-names $argv[1]
    for i in (seq (count $words))
        if test "$words[$i]" = --host; and test $i -lt (count $words)
            set args --host $words[(math $i + 1)] $args
        else if string match -q -- '--host=*' $words[$i]
            set args --host (string replace -- '--host=' '' $words[$i]) $args
        end
    end
    command $words[1] $args 2>/dev/null
end

complete -c @PROGRAM@ -f
complete -c @PROGRAM@ -l help -d 'Show the help of the namespace or command'
complete -c @PROGRAM@ -n "@P@_at ''" -l host -r -F -d 'The host store to work on'
complete -c @PROGRAM@ -n "@P@_at ''" -l batch -r -F -d 'Run the command lines of a file'
complete -c @PROGRAM@ -n "@P@_at ''" -l force -d 'With --batch: run every line'
complete -c @PROGRAM@ -n "@P@_at ''" -l completion -x -a 'bash zsh fish' -d 'Print the completion script of a shell'
)SCRIPT";

void ReplaceAll(std::string& text, std::string const& from, std::string const& to) {
    for (size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
}

std::string OptionLine(std::string const& head, std::string const& p, CompletionOption const& option) {
    std::string line = head + " -l " + Quoted(option.name);
    if (!option.shortName.empty()) line += (option.shortName.size() == 1 ? " -s " : " -o ") + Quoted(option.shortName);
    if (option.takesValue) line += " -x";
    if (!option.values.empty()) line += " -a " + Quoted(JoinedValues(option.values));
    if (option.hostNames) line += " -a " + Quoted("(" + p + "_names " + Quoted(option.name) + ")");
    if (!option.help.empty()) line += " -d " + Quoted(option.help);
    return line + "\n";
}

}  // namespace

std::string FishCompletionScript(std::vector<CompletionNode> const& nodes, CompletionSource const& source) {
    std::string const p = FunctionPrefix(source.programName);
    std::string const program = Quoted(source.programName);
    std::string text = "# fish completion for " + source.programName + ", generated from its command tree by `" +
                       source.programName + " --completion fish`.\n\n";
    text += "# Every path of the tree.\nset -g " + p + "_nodes";
    for (CompletionNode const& node : nodes) {
        if (!node.path.empty()) text += " " + Quoted(node.path);
    }
    text += "\n\n";
    std::string helpers = kHelpers;
    ReplaceAll(helpers, "@P@", p);
    ReplaceAll(helpers, "@PROGRAM@", program);
    text += helpers;
    text += "complete -c " + program + " -n " + Quoted(p + "_at ''") + " -l formatter -x -a " +
            Quoted(JoinedValues(source.formatters)) + " -d 'The output format'\n";

    std::map<std::string, std::string> helpOf;
    for (CompletionNode const& node : nodes) helpOf[node.path] = node.help;
    for (CompletionNode const& node : nodes) {
        std::string const head = "complete -c " + program + " -n " + Quoted(p + "_at " + Quoted(node.path));
        for (std::string const& child : node.children) {
            std::string const help = helpOf[node.path.empty() ? child : node.path + " " + child];
            text += head + " -a " + Quoted(child) + (help.empty() ? "" : " -d " + Quoted(help)) + "\n";
        }
        for (CompletionOption const& option : node.options) text += OptionLine(head, p, option);
    }
    return text;
}

}  // namespace Cli
}  // namespace Plinth
