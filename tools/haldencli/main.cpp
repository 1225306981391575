// haldencli: loads the plug-ins and hands the command line to the framework.
#include <cstdlib>
#include <filesystem>
#include <map>
#include <iostream>
#include <string>
#include <vector>

#include "plinth/autocli/Namespace.h"
#include "plinth/cli/PluginLoader.h"
#include "plinth/cli/Tool.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/ObjectNames.h"

namespace {

void OpenHost(std::string const& hostOption) {
    Trellis::Host::OpenHost(Trellis::Host::ResolveHostPath(hostOption));
}

// The parameters whose values name host objects, and the kind they name.
std::map<std::string, Trellis::Host::ObjectKind> const& HostNameParameters() {
    using Trellis::Host::ObjectKind;
    static std::map<std::string, ObjectKind> const parameters = {
        {"vswitch-name", ObjectKind::StandardSwitch},     {"portgroup-name", ObjectKind::PortGroup},
        {"nic-name", ObjectKind::PhysicalNic},            {"pnet", ObjectKind::PhysicalNic},
        {"uplink-name", ObjectKind::PhysicalNic},         {"interface-name", ObjectKind::KernelInterface},
        {"ruleset-id", ObjectKind::FirewallRuleset},      {"netstack", ObjectKind::Netstack},
        {"vds-name", ObjectKind::DistributedSwitch},      {"vds", ObjectKind::DistributedSwitch},
    };
    return parameters;
}

// For completion: the names on the host as it is. A host that does not exist
// is not created for it, and no host operation runs.
std::vector<std::string> HostNames(std::string const& parameter, std::string const& hostOption) {
    auto const kind = HostNameParameters().find(parameter);
    if (kind == HostNameParameters().end()) return {};
    std::string const path = Trellis::Host::ResolveHostPath(hostOption);
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error)) return {};
    Trellis::Host::OpenHost(path);
    return Trellis::Host::ObjectNames(kind->second);
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
    std::vector<std::string> hostNameParameters;
    for (auto const& parameter : HostNameParameters()) hostNameParameters.push_back(parameter.first);
    tool.SetHostNames(hostNameParameters, HostNames);
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
