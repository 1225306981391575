// haldencli: loads the plug-ins and hands the command line to the framework.
#include <cstdlib>
#include <iostream>
#include <string>
#include <vector>

#include "plinth/autocli/Namespace.h"
#include "plinth/cli/PluginLoader.h"
#include "plinth/cli/Tool.h"
#include "trellis/host/HostSession.h"

namespace {

void OpenHost(std::string const& hostOption) {
    Trellis::Host::OpenHost(Trellis::Host::ResolveHostPath(hostOption));
}

}  // namespace

int main(int argc, char** argv) {
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    try {
        std::string const pluginDir = Plinth::Cli::ExecutableDirectory() + "/" + HALDEN_PLUGINDIR_FROM_BIN;
        Plinth::Cli::LoadPlugins(Plinth::Cli::PluginFiles(pluginDir), root);
    } catch (Plinth::Cli::PluginLoadError const& failure) {
        std::cerr << "Error: " << failure.what() << "\n";
        return Plinth::Cli::EXIT_REFUSED;
    }
    Plinth::Cli::Tool tool(root, "haldencli", OpenHost);
    tool.SetHostHold(Trellis::Host::HoldHost, Trellis::Host::ReleaseHost);
    int const status = tool.Run(std::vector<std::string>(argv + 1, argv + argc), std::cout, std::cerr);
    std::cout.flush();
#ifndef __SANITIZE_ADDRESS__
    // Every change of the call was committed when its operation returned, so
    // the end of the process gives back what it holds: the tree, the plug-in
    // and the libraries' objects are not taken apart one by one. A sanitized
    // build does take them apart, so that its leak check sees every object.
    std::_Exit(status);
#endif
    return status;
}
