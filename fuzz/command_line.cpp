// The command line over the real tree: the input is a line of words, split
// as a batch line is; the tool's options, the path and the command's options
// are parsed and checked against the command's specification. Any words are
// taken or refused with a UsageError (or a BatchLineError for the line);
// the commands are not run.

#include <cstddef>
#include <cstdint>
#include <list>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "FuzzHost.h"
#include "gantry/lib/GantryException.h"
#include "plinth/autocli/Command.h"
#include "plinth/autocli/Namespace.h"
#include "plinth/cli/BatchLine.h"
#include "plinth/cli/GlobalOptions.h"
#include "plinth/cli/HelpWriter.h"
#include "plinth/cli/OptionParser.h"
#include "plinth/cli/UsageError.h"

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root);

namespace {

boost::shared_ptr<Plinth::AutoCli::NamespaceNode> Tree() {
    static boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root = [] {
        boost::shared_ptr<Plinth::AutoCli::NamespaceNode> made = Plinth::AutoCli::Namespace::New();
        AutoCli_RegisterNamespaces(made);
        return made;
    }();
    return root;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    OpenFuzzHost();  // a few commands ask the host for their options
    const std::string line(reinterpret_cast<const char*>(data), size);
    std::vector<std::string> words;
    try {
        words = Plinth::Cli::SplitBatchLine(line);
        Plinth::Cli::GlobalOptions options = Plinth::Cli::ParseGlobalOptions(words);
        std::list<std::string> path(options.commandWords.begin(), options.commandWords.end());
        boost::shared_ptr<Plinth::AutoCli::NamespaceNode> node = Tree()->ResolveNode(path);
        boost::shared_ptr<Plinth::AutoCli::Command> command = boost::dynamic_pointer_cast<Plinth::AutoCli::Command>(node);
        static Plinth::Cli::HelpWriter help("haldencli");
        if (!command) {
            help.NamespaceHelp(*node);
            return 0;
        }
        help.CommandHelp(*command);
        Plinth::Cli::ParseCommandOptions(*command->GetInputSpec(), std::vector<std::string>(path.begin(), path.end()));
    } catch (Plinth::Cli::BatchLineError const&) {
    } catch (Plinth::Cli::UsageError const&) {
    } catch (Gantry::Lib::GantryException const&) {
    }
    return 0;
}
