#include "plinth/cli/PluginLoader.h"

#include <dlfcn.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <sstream>

#include "plinth/autocli/PluginEntry.h"

namespace Plinth {
namespace Cli {

namespace fs = std::filesystem;

std::string ExecutableDirectory() {
    std::error_code error;
    fs::path const executable = fs::read_symlink("/proc/self/exe", error);
    return error ? std::string(".") : executable.parent_path().string();
}

std::vector<std::string> PluginFiles(std::string const& defaultDirectory) {
    std::vector<std::string> files;
    if (char const* list = std::getenv("HALDENCLI_PLUGINS")) {
        std::istringstream entries(list);
        std::string entry;
        while (std::getline(entries, entry, ':')) {
            if (!entry.empty()) files.push_back(entry);
        }
        return files;
    }
    std::error_code error;
    for (fs::directory_iterator it(defaultDirectory, error), end; !error && it != end; it.increment(error)) {
        if (it->path().extension() == ".so") files.push_back(it->path().string());
    }
    std::sort(files.begin(), files.end());
    return files;
}

void LoadPlugins(std::vector<std::string> const& files, boost::shared_ptr<AutoCli::NamespaceNode> root) {
    for (std::string const& file : files) {
        // Functions are bound on first call: a command uses a few dozen of the
        // hundreds a plug-in names, and binding them all at load was a
        // measurable part of every start.
        void* handle = dlopen(file.c_str(), RTLD_LAZY | RTLD_LOCAL);
        if (!handle) throw PluginLoadError("Cannot load the plug-in " + file + ": " + dlerror());
        dlerror();
        void* symbol = dlsym(handle, PLINTH_PLUGIN_ENTRY_SYMBOL);
        if (char const* problem = dlerror()) {
            throw PluginLoadError("Cannot load the plug-in " + file + ": " + problem);
        }
        try {
            reinterpret_cast<AutoCli_RegisterNamespacesFn>(symbol)(root);
        } catch (std::exception const& failure) {
            throw PluginLoadError("The plug-in " + file + " failed to register its commands: " + failure.what());
        } catch (...) {
            throw PluginLoadError("The plug-in " + file + " failed to register its commands.");
        }
    }
}

}  // namespace Cli
}  // namespace Plinth
