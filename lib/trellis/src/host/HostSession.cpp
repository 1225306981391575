#include "trellis/host/HostSession.h"

#include <cstdlib>

#include "host/Store.h"

namespace Trellis {
namespace Host {

namespace {

std::unique_ptr<Store>& Current() {
    static std::unique_ptr<Store> current;
    return current;
}

std::string EnvOrEmpty(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

}  // namespace

std::string ResolveHostPath(const std::string& hostOption) {
    if (!hostOption.empty()) return hostOption;
    std::string fromEnv = EnvOrEmpty("HALDEN_HOST");
    if (!fromEnv.empty()) return fromEnv;
    std::string stateHome = EnvOrEmpty("XDG_STATE_HOME");
    // The XDG base directory rules: a relative path there is to be ignored.
    if (stateHome.empty() || stateHome[0] != '/') {
        std::string home = EnvOrEmpty("HOME");
        if (home.empty())
            throw HostOpenError(
                "Cannot locate the host: neither --host, HALDEN_HOST, an absolute XDG_STATE_HOME nor HOME is set");
        stateHome = home + "/.local/state";
    }
    return stateHome + "/halden/host.db";
}

void OpenHost(const std::string& path) {
    CloseHost();
    Current() = Store::Open(path);
}

void CloseHost() {
    Current().reset();
}

void HoldHost() {
    if (Current()) Current()->Hold();
}

void ReleaseHost() {
    if (Current()) Current()->Release();
}

Store& CurrentStore() {
    if (!Current()) throw Gantry::Lib::GantryException("No host is open");
    return *Current();
}

}  // namespace Host
}  // namespace Trellis
