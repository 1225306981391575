// What one command costs inside a running tool, start-up left out: the
// command line parsed and checked, the command run against an open host and
// its result formatted, per command family, on the default host and on one
// 100 times its size.
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <filesystem>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "plinth/autocli/Namespace.h"
#include "plinth/autocli/PluginEntry.h"
#include "plinth/cli/Tool.h"
#include "trellis/host/HostSession.h"

namespace {

// The hosts, made once with haldensim: "default" and "scaled".
std::string HostPath(std::string const& which) {
    static std::map<std::string, std::string> paths;
    auto found = paths.find(which);
    if (found != paths.end()) return found->second;
    std::string const dir = (std::filesystem::temp_directory_path() / "halden-benchmarks").string();
    std::filesystem::create_directories(dir);
    std::string const path = dir + "/" + which + ".db";
    std::filesystem::remove(path);
    std::string const init = which == "scaled" ? " init --scale 100" : " init";
    if (std::system((std::string(HALDENSIM_PATH) + " --host " + path + init).c_str()) != 0) std::abort();
    return paths[which] = path;
}

// Runs the command line again and again on one tool and one open host.
void RunCommandLine(benchmark::State& state, std::string const& host, int status,
                    std::vector<std::string> const& words) {
    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    AutoCli_RegisterNamespaces(root);
    Trellis::Host::OpenHost(HostPath(host));
    Plinth::Cli::Tool tool(root, "haldencli", [](std::string const&) {});
    tool.SetHostHold(Trellis::Host::HoldHost, Trellis::Host::ReleaseHost);
    std::ostringstream out, err;
    for (auto _ : state) {
        out.str("");
        err.str("");
        if (tool.Run(words, out, err) != status) state.SkipWithError(err.str().c_str());
    }
    Trellis::Host::CloseHost();
}

#define STATUS_BENCHMARK(name, host, status, ...)                                                \
    void name(benchmark::State& state) { RunCommandLine(state, host, status, {__VA_ARGS__}); } \
    BENCHMARK(name)
#define COMMAND_BENCHMARK(name, host, ...) STATUS_BENCHMARK(name, host, 0, __VA_ARGS__)

// Firewall.
COMMAND_BENCHMARK(FirewallGet, "default", "network", "firewall", "get");
COMMAND_BENCHMARK(FirewallRulesetListOne, "default", "network", "firewall", "ruleset", "list", "-r", "dns");
COMMAND_BENCHMARK(FirewallRulesetListOneScaled, "scaled", "network", "firewall", "ruleset", "list", "-r", "dns");
COMMAND_BENCHMARK(FirewallRulesetList, "default", "network", "firewall", "ruleset", "list");
COMMAND_BENCHMARK(FirewallRulesetListScaled, "scaled", "network", "firewall", "ruleset", "list");
COMMAND_BENCHMARK(FirewallRuleList, "default", "network", "firewall", "ruleset", "rule", "list");
COMMAND_BENCHMARK(FirewallAllowedipList, "default", "network", "firewall", "ruleset", "allowedip", "list");
COMMAND_BENCHMARK(FirewallRulesetSet, "default", "network", "firewall", "ruleset", "set", "-r", "dns", "-e", "true");

// Standard switches and port groups.
COMMAND_BENCHMARK(VswitchListOne, "default", "network", "vswitch", "standard", "list", "-v", "switch0");
COMMAND_BENCHMARK(VswitchListOneScaled, "scaled", "network", "vswitch", "standard", "list", "-v", "switch0");
COMMAND_BENCHMARK(VswitchList, "default", "network", "vswitch", "standard", "list");
COMMAND_BENCHMARK(VswitchListScaled, "scaled", "network", "vswitch", "standard", "list");
COMMAND_BENCHMARK(PortGroupList, "default", "network", "vswitch", "standard", "portgroup", "list");
COMMAND_BENCHMARK(PortGroupListScaled, "scaled", "network", "vswitch", "standard", "portgroup", "list");
COMMAND_BENCHMARK(PortGroupSet, "default", "network", "vswitch", "standard", "portgroup", "set", "-p", "Guest Network",
                  "-v", "0");

// The tool alone: a refused command line never reaches the host.
STATUS_BENCHMARK(RefusedCommandLine, "default", 2, "network", "vswitch", "standard", "set", "-v", "switch0", "-m", "x");

}  // namespace

BENCHMARK_MAIN();
