#pragma once

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"
#include "plinth/autocli/NamespaceNode.h"
#include "plinth/cli/GlobalOptions.h"
#include "plinth/cli/HelpWriter.h"

namespace Plinth {
namespace Cli {

// Exit statuses of the tool.
enum ExitStatus {
    EXIT_OK = 0,       // the command set no error text (or help was shown)
    EXIT_FAILED = 1,   // the command set an error text, or threw
    EXIT_REFUSED = 2,  // refused before running: command line, plug-in or host
};

// One run of the tool over a loaded tree: global options, path resolution,
// help, option validation, execution and rendering of the Output.
class Tool {
public:
    // Opens the host that the --host option names ("" when not given). Any
    // std::exception it throws is a refusal: its text is shown, exit 2.
    typedef std::function<void(std::string const& hostOption)> HostOpener;
    // The names of the host objects that a parameter names, on the host that
    // --host names ("" when not given), for completion. It must leave the
    // host as it is; whatever it throws is taken as no names.
    typedef std::function<std::vector<std::string>(std::string const& parameter, std::string const& hostOption)>
        NameLister;

    Tool(boost::shared_ptr<AutoCli::NamespaceNode> root, std::string programName, HostOpener openHost);

    // Brackets the run of each command on the open host: hold before it,
    // release after it, also when it throws. The host's side may use it to
    // keep the host to the command while it runs. A hold that throws fails
    // the command (status 1) before it runs.
    void SetHostHold(std::function<void()> hold, std::function<void()> release);

    // The parameters whose values completion scripts take from the host
    // (--complete-names PARAMETER), and how to list them.
    void SetHostNames(std::vector<std::string> parameters, NameLister lister);

    // words: the command line after the program name. Writes the result and
    // help to out, error texts and refusals to err; returns the exit status.
    // An exception that escapes a command or the tool itself is reported as
    // one line, with status 1.
    //
    // With --batch FILE the command lines come from the file, one a line
    // (see RunBatch), all run by this Tool on the host opened once for the
    // first line that needs it. A line may not carry --host or --batch.
    int Run(std::vector<std::string> const& words, std::ostream& out, std::ostream& err);

private:
    // batchHost: the --host of the batch the words are a line of; null for
    // the words of the command line itself.
    int RunWords(std::vector<std::string> const& words, std::ostream& out, std::ostream& err,
                 std::string const* batchHost);
    int RunPath(GlobalOptions const& options, std::ostream& out, std::ostream& err);
    // --completion SHELL: the completion script of the tree.
    int WriteCompletion(GlobalOptions const& options, std::ostream& out, std::ostream& err);
    // --complete-names PARAMETER: one host name a line; never fails.
    int WriteHostNames(GlobalOptions const& options, std::ostream& out);
    int RunBatchFile(GlobalOptions const& options, std::ostream& out, std::ostream& err);
    int RunCommand(AutoCli::Command& command, GlobalOptions const& options, std::vector<std::string> const& words,
                   std::ostream& out, std::ostream& err);
    int ShowCommandHelp(AutoCli::Command& command, GlobalOptions const& options, std::ostream& out,
                        std::ostream& err);
    // The command's input specification. Some commands ask the host for it:
    // when the first request fails, the host is opened and it is asked again.
    boost::shared_ptr<CallSpec::InputSpec> InputSpecOf(AutoCli::Command& command, GlobalOptions const& options);
    void OpenHostOnce(GlobalOptions const& options);

    boost::shared_ptr<AutoCli::NamespaceNode> root_;
    std::string programName_;
    HelpWriter help_;
    HostOpener openHost_;
    std::function<void()> holdHost_;
    std::function<void()> releaseHost_;
    std::vector<std::string> hostNameParameters_;
    NameLister listNames_;
    bool hostOpen_ = false;
};

}  // namespace Cli
}  // namespace Plinth
