#pragma once

#include <stdexcept>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/NamespaceNode.h"

namespace Plinth {
namespace Cli {

// A plug-in could not be loaded or registered; the text names the file and
// gives the loader's reason (dlerror).
class PluginLoadError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The directory that holds the running program (through /proc/self/exe).
std::string ExecutableDirectory();

// The plug-in files to load: the colon-separated list in $HALDENCLI_PLUGINS
// when that is set (empty entries are skipped), else every "*.so" file in
// defaultDirectory in name order (none when it does not exist).
std::vector<std::string> PluginFiles(std::string const& defaultDirectory);

// Loads each file with dlopen and calls its AutoCli_RegisterNamespaces with
// root, in order. The libraries stay loaded for the life of the process, as
// the tree holds their objects. Throws PluginLoadError at the first failure.
void LoadPlugins(std::vector<std::string> const& files, boost::shared_ptr<AutoCli::NamespaceNode> root);

}  // namespace Cli
}  // namespace Plinth
