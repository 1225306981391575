#include "plinth/cli/GlobalOptions.h"

#include "plinth/cli/UsageError.h"
#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

namespace {

// Reads the value of --name or --name=value at words[i]; false when words[i]
// is neither form.
bool ReadValueOption(std::string const& name, std::vector<std::string> const& words, size_t& i, std::string& value,
                     bool& seen) {
    std::string const& word = words[i];
    std::string const option = "--" + name;
    bool const inlineForm = word.compare(0, option.size() + 1, option + "=") == 0;
    if (word != option && !inlineForm) return false;
    if (seen) throw UsageError("Option " + option + " was given more than once.");
    seen = true;
    if (inlineForm) {
        value = word.substr(option.size() + 1);
    } else if (i + 1 < words.size()) {
        value = words[++i];
    } else {
        throw UsageError("Option " + option + " requires a value.");
    }
    if (value.empty()) throw UsageError("Option " + option + " requires a value.");
    return true;
}

// A completion entry prints what the shell needs and runs nothing else.
void CheckCompletionOptions(GlobalOptions const& options) {
    int const entries = !options.batch.empty() + !options.completion.empty() + !options.completeNames.empty();
    if (entries > 1) throw UsageError("Options --batch, --completion and --complete-names exclude each other.");
    std::string const entry = !options.completion.empty() ? "--completion" : "--complete-names";
    if ((!options.completion.empty() || !options.completeNames.empty()) && !options.commandWords.empty()) {
        throw UsageError("Unexpected argument '" + VisibleText(options.commandWords.front()) + "': " + entry +
                         " takes no command path.");
    }
}

// The command lines of a batch come from its lines, each with its own
// formatter.
void CheckBatchOptions(GlobalOptions const& options) {
    if (options.batch.empty()) {
        if (options.force) throw UsageError("Option --force is only valid with --batch.");
        return;
    }
    if (!options.formatter.empty()) {
        throw UsageError("Option --formatter cannot be combined with --batch; give it on the batch's lines.");
    }
    if (!options.help && !options.commandWords.empty()) {
        throw UsageError("Unexpected argument '" + VisibleText(options.commandWords.front()) +
                         "': --batch takes its command lines from the file.");
    }
}

}  // namespace

GlobalOptions ParseGlobalOptions(std::vector<std::string> const& words) {
    GlobalOptions options;
    bool hostSeen = false;
    bool formatterSeen = false;
    bool batchSeen = false;
    bool completionSeen = false;
    bool completeNamesSeen = false;
    size_t i = 0;
    for (; i < words.size() && !words[i].empty() && words[i][0] == '-'; ++i) {
        if (words[i] == "--help") {
            options.help = true;
        } else if (words[i] == "--force") {
            if (options.force) throw UsageError("Option --force was given more than once.");
            options.force = true;
        } else if (!ReadValueOption("host", words, i, options.host, hostSeen) &&
                   !ReadValueOption("formatter", words, i, options.formatter, formatterSeen) &&
                   !ReadValueOption("batch", words, i, options.batch, batchSeen) &&
                   !ReadValueOption("completion", words, i, options.completion, completionSeen) &&
                   !ReadValueOption("complete-names", words, i, options.completeNames, completeNamesSeen)) {
            throw UsageError("Unknown option " + VisibleText(words[i]) + ".");
        }
    }
    options.commandWords.assign(words.begin() + static_cast<long>(i), words.end());
    CheckCompletionOptions(options);
    CheckBatchOptions(options);
    return options;
}

}  // namespace Cli
}  // namespace Plinth
