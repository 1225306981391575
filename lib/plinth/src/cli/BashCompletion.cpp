// The bash completion script (zsh runs it through bashcompinit, so it keeps
// to what both shells read alike).
#include <cctype>

#include "plinth/cli/CompletionModel.h"

namespace Plinth {
namespace Cli {

namespace {

// A word in single quotes, for bash and zsh.
std::string Quoted(std::string const& word) {
    std::string quoted = "'";
    for (char c : word) quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
    return quoted + "'";
}

std::string QuotedList(std::vector<std::string> const& words) {
    std::string list;
    for (std::string const& word : words) list += (list.empty() ? "" : " ") + Quoted(word);
    return list;
}

// The prefix of the script's function names: "_haldencli".
std::string FunctionPrefix(std::string const& program) {
    std::string prefix = "_";
    for (char c : program) prefix += std::isalnum(static_cast<unsigned char>(c)) ? c : '_';
    return prefix;
}

// P_node PATH: what is below a path. Sets P_type (namespace, command, or ""
// for no such path) and P_list (the children of a namespace, the long and
// short options of a command).
std::string NodeFunction(std::vector<CompletionNode> const& nodes, std::string const& p) {
    std::string text = p + "_node() {\n    case $1 in\n";
    for (CompletionNode const& node : nodes) {
        std::vector<std::string> list = node.children;
        if (node.command) {
            list.clear();
            for (CompletionOption const& option : node.options) {
                list.push_back("--" + option.name);
                if (!option.shortName.empty()) list.push_back("-" + option.shortName);
            }
        }
        text += "    " + Quoted(node.path) + ") " + p + "_type=" + (node.command ? "command" : "namespace") + "; " + p +
                "_list=(" + QuotedList(list) + ") ;;\n";
    }
    text += "    *) " + p + "_type=''; " + p + "_list=() ;;\n    esac\n}\n\n";
    return text;
}

// P_value PATH OPTION: the value an option of a command takes. Sets P_param
// (its long name; "" for a flag or an unknown option), P_list (its
// enumerated values) and P_hosted (1 when the values are host names).
std::string ValueFunction(std::vector<CompletionNode> const& nodes, std::string const& p) {
    std::string text = p + "_value() {\n    " + p + "_param=''; " + p + "_list=(); " + p + "_hosted=''\n    case \"$1 $2\" in\n";
    for (CompletionNode const& node : nodes) {
        for (CompletionOption const& option : node.options) {
            if (!option.takesValue) continue;
            text += "    " + Quoted(node.path + " --" + option.name);
            if (!option.shortName.empty()) text += "|" + Quoted(node.path + " -" + option.shortName);
            text += ") " + p + "_param=" + Quoted(option.name) + "; " + p + "_list=(" + QuotedList(option.values) + ")";
            if (option.hostNames) text += "; " + p + "_hosted=1";
            text += " ;;\n";
        }
    }
    text += "    esac\n}\n\n";
    return text;
}

// The fixed part: word handling, the tool's own options, and the walk of the
// command line. @P@ stands for the prefix, @PROGRAM@ for the program, and
// @FORMATTERS@ for the formatter names.
char const* const kBody = R"SCRIPT(# Offers the words that start with the current one ($1), quoted for the
# command line: escaped, or as they are inside a quote the word opened.
@P@_reply() {
    local cur=$1 word quote=''
    shift
    case $cur in
    \'*|\"*) quote=${cur:0:1}; cur=${cur:1} ;;
    *) cur=${cur//\\/} ;;
    esac
    for word in "$@"; do
        [[ $word == "$cur"* ]] || continue
        [[ -n $quote ]] || printf -v word '%q' "$word"
        COMPREPLY+=("$word")
    done
}

# A word of the command line as the program receives it (quotes and
# escapes removed, a leading ~ expanded).
@P@_dequote() {
    local word=$1
    case $word in
    \'*) word=${word#\'}; word=${word%\'} ;;
    \"*) word=${word#\"}; word=${word%\"} ;;
    *) word=${word//\\/} ;;
    esac
    case $word in
    \~/*) word=$HOME/${word#\~/} ;;
    esac
    printf '%s' "$word"
}

# Offers the names of the host's objects that a parameter ($3) names, asked
# of the program ($1) on the host ($2, "" for its default).
@P@_names() {
    local -a args names
    local name
    args=(--complete-names "$3")
    [[ -z $2 ]] || args=(--host "$2" "${args[@]}")
    while IFS= read -r name; do
        names+=("$name")
    done < <("$1" "${args[@]}" 2>/dev/null </dev/null)
    @P@_reply "$4" "${names[@]}"
}

@P@_files() {
    local file
    while IFS= read -r file; do
        COMPREPLY+=("$file")
    done < <(compgen -f -- "$(@P@_dequote "$1")")
    compopt -o filenames 2>/dev/null
}

@P@() {
    [[ -z ${ZSH_VERSION-} ]] || setopt localoptions ksharrays
    local cur=${COMP_WORDS[COMP_CWORD]} prev='' word program host='' path='' next i=1 before
    local @P@_type @P@_param @P@_hosted
    local -a @P@_list
    COMPREPLY=()
    program=$(@P@_dequote "${COMP_WORDS[0]}")

    # The option before the current word: "--name value" or "--name=value"
    # (bash splits the latter at the "=").
    if [[ $cur == = ]]; then
        prev=${COMP_WORDS[COMP_CWORD-1]}; cur=''; before=$((COMP_CWORD - 1))
    elif (( COMP_CWORD >= 2 )) && [[ ${COMP_WORDS[COMP_CWORD-1]} == = ]]; then
        prev=${COMP_WORDS[COMP_CWORD-2]}; before=$((COMP_CWORD - 2))
    else
        prev=${COMP_WORDS[COMP_CWORD-1]}; before=$((COMP_CWORD - 1))
    fi

    # The tool's own options stand before the path.
    while (( i < before )); do
        word=${COMP_WORDS[i]}
        case $word in
        --host|--formatter|--batch|--completion)
            (( i += 1 ))
            [[ ${COMP_WORDS[i]} != = ]] || (( i += 1 ))
            [[ $word != --host ]] || host=$(@P@_dequote "${COMP_WORDS[i]}")
            (( i += 1 )) ;;
        -*) (( i += 1 )) ;;
        *) break ;;
        esac
    done
    if (( i >= before )) && (( before >= 1 )); then
        case $prev in
        --host|--batch) @P@_files "$cur"; return 0 ;;
        --formatter) @P@_reply "$cur" @FORMATTERS@; return 0 ;;
        --completion) @P@_reply "$cur" bash zsh fish; return 0 ;;
        esac
    fi

    # The path: namespaces down to a command.
    @P@_node ''
    while (( i < COMP_CWORD )) && [[ $@P@_type == namespace ]]; do
        word=${COMP_WORDS[i]}
        next=${path:+$path }$word
        @P@_node "$next"
        [[ -n $@P@_type ]] || return 0
        path=$next
        (( i += 1 ))
    done
    if [[ $@P@_type == namespace ]]; then
        if [[ -z $path && $cur == -* ]]; then
            @P@_reply "$cur" --host --formatter --batch --force --help --completion
        elif [[ $cur == -* ]]; then
            @P@_reply "$cur" --help
        else
            @P@_reply "$cur" "${@P@_list[@]}"
        fi
        return 0
    fi

    # A command's options and their values.
    if (( before >= i )); then
        @P@_value "$path" "$prev"
        if [[ -n $@P@_param ]]; then
            if [[ -n $@P@_hosted ]]; then
                @P@_names "$program" "$host" "$@P@_param" "$cur"
            else
                @P@_reply "$cur" "${@P@_list[@]}"
            fi
            return 0
        fi
    fi
    @P@_node "$path"
    @P@_reply "$cur" "${@P@_list[@]}" --help
}

complete -F @P@ @PROGRAM@
)SCRIPT";

void ReplaceAll(std::string& text, std::string const& from, std::string const& to) {
    for (size_t at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
}

}  // namespace

std::string BashCompletionScript(std::vector<CompletionNode> const& nodes, CompletionSource const& source) {
    std::string const p = FunctionPrefix(source.programName);
    std::string body = kBody;
    ReplaceAll(body, "@P@", p);
    ReplaceAll(body, "@PROGRAM@", Quoted(source.programName));
    ReplaceAll(body, "@FORMATTERS@", QuotedList(source.formatters));
    return "# bash completion for " + source.programName + ", generated from its command tree by `" +
           source.programName + " --completion bash`.\n\n" + NodeFunction(nodes, p) + ValueFunction(nodes, p) + body;
}

}  // namespace Cli
}  // namespace Plinth
