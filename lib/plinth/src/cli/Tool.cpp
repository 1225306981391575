#include "plinth/cli/Tool.h"

#include <algorithm>
#include <list>
#include <memory>

#include "plinth/cli/Batch.h"
#include "plinth/cli/BatchLine.h"
#include "plinth/cli/Completion.h"
#include "plinth/cli/FormatHints.h"
#include "plinth/cli/Formatter.h"
#include "plinth/cli/OptionParser.h"
#include "plinth/cli/UsageError.h"
#include "plinth/cli/Utf8.h"

namespace Plinth {
namespace Cli {

using AutoCli::Command;
using AutoCli::NamespaceNode;
using CallSpec::InputSpec;
using CallSpec::Output;

namespace {

// A failure of the host opener, told apart from the command's own failures.
struct HostUnavailable {
    std::string text;
};

char const* const kUnknownException = "The command failed with an unknown exception.";

// Holds the host for the life of the object.
class HostHeld {
public:
    HostHeld(std::function<void()> const& hold, std::function<void()> const& release) : release_(release) {
        if (hold) hold();
    }
    ~HostHeld() {
        try {
            if (release_) release_();
        } catch (...) {
            // Ending the process or the next hold releases the host anyway.
        }
    }
    HostHeld(HostHeld const&) = delete;
    HostHeld& operator=(HostHeld const&) = delete;

private:
    std::function<void()> const& release_;
};

// An exception's text as the one line that reports it.
std::string OneLine(std::string const& text) {
    if (text.empty()) return kUnknownException;
    return VisibleText(text);
}

std::string AvailableFormatters() {
    std::string names;
    for (std::string const& name : FormatterNames()) names += (names.empty() ? "" : ", ") + name;
    return names;
}

// The status of run(); an exception that escapes it is reported as one line,
// with status 1. A batch line's refusal passes through to the batch.
template <typename Run>
int Guarded(std::ostream& err, Run const& run) {
    try {
        return run();
    } catch (BatchLineError const&) {
        throw;
    } catch (std::exception const& failure) {
        err << OneLine(failure.what()) << "\n";
    } catch (...) {
        err << kUnknownException << "\n";
    }
    return EXIT_FAILED;
}

}  // namespace

Tool::Tool(boost::shared_ptr<NamespaceNode> root, std::string programName, HostOpener openHost)
    : root_(root), programName_(programName), help_(programName), openHost_(std::move(openHost)) {}

int Tool::Run(std::vector<std::string> const& words, std::ostream& out, std::ostream& err) {
    return Guarded(err, [&] { return RunWords(words, out, err, nullptr); });
}

int Tool::RunWords(std::vector<std::string> const& words, std::ostream& out, std::ostream& err,
                   std::string const* batchHost) {
    GlobalOptions options;
    try {
        options = ParseGlobalOptions(words);
    } catch (UsageError const& refusal) {
        err << "Error: " << refusal.what() << "\n\n" << help_.NamespaceHelp(*root_);
        return EXIT_REFUSED;
    }
    if (batchHost) {
        if (!options.batch.empty()) throw BatchLineError("--batch cannot be given on a line of a batch");
        if (!options.host.empty()) {
            throw BatchLineError("--host cannot be given on a line of a batch; give it before --batch");
        }
        if (!options.completion.empty() || !options.completeNames.empty()) {
            throw BatchLineError("--completion cannot be given on a line of a batch");
        }
        options.host = *batchHost;
    } else if (!options.completion.empty()) {
        return WriteCompletion(options, out, err);
    } else if (!options.completeNames.empty()) {
        return WriteHostNames(options, out);
    } else if (!options.batch.empty() && !options.help) {
        return RunBatchFile(options, out, err);
    }
    return RunPath(options, out, err);
}

void Tool::SetHostNames(std::vector<std::string> parameters, NameLister lister) {
    hostNameParameters_ = std::move(parameters);
    listNames_ = std::move(lister);
}

int Tool::WriteCompletion(GlobalOptions const& options, std::ostream& out, std::ostream& err) {
    CompletionSource source;
    source.programName = programName_;
    source.formatters = FormatterNames();
    source.hostNameParameters = hostNameParameters_;
    // The options of a few commands come from the host; as for their help,
    // the host is opened then.
    source.inputSpecOf = [&](Command& command) -> boost::shared_ptr<InputSpec> {
        try {
            return InputSpecOf(command, options);
        } catch (...) {
            return nullptr;
        }
    };
    try {
        out << CompletionScript(options.completion, *root_, source);
    } catch (UsageError const& refusal) {
        err << "Error: " << refusal.what() << "\n\n" << help_.NamespaceHelp(*root_);
        return EXIT_REFUSED;
    }
    return EXIT_OK;
}

int Tool::WriteHostNames(GlobalOptions const& options, std::ostream& out) {
    std::vector<std::string> const& known = hostNameParameters_;
    if (!listNames_ || std::find(known.begin(), known.end(), options.completeNames) == known.end()) return EXIT_OK;
    std::vector<std::string> names;
    try {
        names = listNames_(options.completeNames, options.host);
    } catch (...) {
        // A shell that completes wants names or nothing, never an error.
        return EXIT_OK;
    }
    for (std::string const& name : names) {
        if (name.find('\n') == std::string::npos) out << name << "\n";
    }
    return EXIT_OK;
}

int Tool::RunBatchFile(GlobalOptions const& options, std::ostream& out, std::ostream& err) {
    std::unique_ptr<BatchReader> reader;
    try {
        reader.reset(new BatchReader(options.batch));
    } catch (BatchInputError const& refusal) {
        err << "Error: " << refusal.what() << ".\n";
        return EXIT_REFUSED;
    }
    BatchLineRunner const runLine = [&](std::vector<std::string> const& words) {
        return Guarded(err, [&] { return RunWords(words, out, err, &options.host); });
    };
    return RunBatch(*reader, options.force, runLine, programName_, out, err);
}

int Tool::RunPath(GlobalOptions const& options, std::ostream& out, std::ostream& err) {
    if (!options.formatter.empty() && !MakeFormatter(options.formatter)) {
        err << "Error: Unknown formatter '" << VisibleText(options.formatter)
            << "'. Available formatters: " << AvailableFormatters() << ".\n";
        return EXIT_REFUSED;
    }

    std::list<std::string> path(options.commandWords.begin(), options.commandWords.end());
    boost::shared_ptr<NamespaceNode> node = root_->ResolveNode(path);
    std::vector<std::string> const rest(path.begin(), path.end());
    bool const helpAsked = options.help || std::find(rest.begin(), rest.end(), "--help") != rest.end();

    boost::shared_ptr<Command> command = boost::dynamic_pointer_cast<Command>(node);
    if (!command) {
        if (!rest.empty() && rest.front() != "--help") {
            std::string const where = node->GetPathString(' ');
            err << "Error: Unknown command or namespace " << (where.empty() ? "" : where + " ")
                << VisibleText(rest.front()) << ".\n\n"
                << help_.NamespaceHelp(*node);
            return EXIT_REFUSED;
        }
        out << help_.NamespaceHelp(*node);
        return EXIT_OK;
    }
    try {
        if (helpAsked) return ShowCommandHelp(*command, options, out, err);
        return RunCommand(*command, options, rest, out, err);
    } catch (HostUnavailable const& failure) {
        err << "Error: " << failure.text << "\n";
        return EXIT_REFUSED;
    }
}

void Tool::SetHostHold(std::function<void()> hold, std::function<void()> release) {
    holdHost_ = std::move(hold);
    releaseHost_ = std::move(release);
}

void Tool::OpenHostOnce(GlobalOptions const& options) {
    if (hostOpen_) return;
    try {
        if (openHost_) openHost_(options.host);
    } catch (std::exception const& failure) {
        throw HostUnavailable{failure.what()};
    }
    hostOpen_ = true;
}

boost::shared_ptr<InputSpec> Tool::InputSpecOf(Command& command, GlobalOptions const& options) {
    try {
        return command.GetInputSpec();
    } catch (std::exception const&) {
        if (hostOpen_) throw;
    }
    OpenHostOnce(options);
    return command.GetInputSpec();
}

int Tool::ShowCommandHelp(Command& command, GlobalOptions const& options, std::ostream& out, std::ostream& err) {
    // The options of a few commands come from the host; help opens it then.
    try {
        InputSpecOf(command, options);
    } catch (std::exception const& failure) {
        err << failure.what() << "\n";
        return EXIT_FAILED;
    }
    out << help_.CommandHelp(command);
    return EXIT_OK;
}

int Tool::RunCommand(Command& command, GlobalOptions const& options, std::vector<std::string> const& words,
                     std::ostream& out, std::ostream& err) {
    boost::shared_ptr<CallSpec::Input> input;
    try {
        input = ParseCommandOptions(*InputSpecOf(command, options), words);
    } catch (UsageError const& refusal) {
        err << "Error: " << refusal.what() << "\n\n" << help_.CommandHelp(command);
        return EXIT_REFUSED;
    } catch (std::exception const& failure) {
        err << failure.what() << "\n";
        return EXIT_FAILED;
    }

    std::string formatterName = options.formatter;
    if (formatterName.empty()) formatterName = command.GetDefaultOutputFormatter();
    std::unique_ptr<Formatter> formatter = MakeFormatter(formatterName);
    if (!formatter) formatter = MakeFormatter("simple");

    OpenHostOnce(options);
    boost::shared_ptr<Output> output = Output::New();
    std::string escaped;
    try {
        HostHeld held(holdHost_, releaseHost_);
        command.Execute(input, output);
    } catch (std::exception const& failure) {
        escaped = OneLine(failure.what());
    } catch (...) {
        escaped = kUnknownException;
    }

    for (std::string const& text : output->GetErrors()) err << text << "\n";
    if (!escaped.empty()) {
        err << escaped << "\n";
        return EXIT_FAILED;
    }
    if (boost::shared_ptr<MetaObj::MetaObject> result = output->GetResult()) {
        boost::shared_ptr<MetaObj::MetaObject> shape;
        try {
            shape = command.GetOutputSpec()->GetResultType();
        } catch (std::exception const&) {
            // The shape only names the columns of an empty table.
        }
        formatter->Write(out, result, shape, FormatHints(command.GetDefaultOutputFormatParameters()));
    }
    return output->HasError() ? EXIT_FAILED : EXIT_OK;
}

}  // namespace Cli
}  // namespace Plinth
