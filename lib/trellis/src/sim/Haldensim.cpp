#include "trellis/sim/Haldensim.h"

#include <algorithm>
#include <iostream>
#include <optional>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "sim/DescriptionInput.h"
#include "sim/SimOptions.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Sim {

namespace {

const char* const kMainHelp =
    "Usage: haldensim [--host PATH] <command> [options]\n"
    "\n"
    "Controls the simulated host that haldencli works on.\n"
    "\n"
    "Commands:\n"
    "  init [--empty | --from FILE | --scale N]\n"
    "                                 (Re)create the host: default inventory, empty, from a\n"
    "                                 description, or N times the default's size\n"
    "  export                         Print the host as a JSON description\n"
    "  import FILE                    Replace the host with a description (- reads standard input)\n"
    "  fault add ...                  Arm a fault for a host operation\n"
    "  fault list [--armed]           List the host operations and their armed faults\n"
    "  fault clear                    Disarm every fault\n"
    "\n"
    "Options:\n"
    "  --host PATH   The host store; else $HALDEN_HOST, else $XDG_STATE_HOME/halden/host.db\n"
    "                (~/.local/state/halden/host.db). A missing host is created with the\n"
    "                default inventory.\n"
    "  --help        Show help; '<command> --help' shows a command's.\n";

const char* const kInitHelp =
    "Usage: haldensim [--host PATH] init [--empty | --from FILE | --scale N]\n"
    "\n"
    "Replaces the whole host (records, faults, exec log) with the default inventory,\n"
    "with an empty host (--empty), or with the description in FILE (--from; '-' for\n"
    "standard input). FILE is a regular file of at most 256 MiB.\n"
    "\n"
    "--scale N (1 to 1000) makes the host N times the default's size: the default\n"
    "host and N-1 renamed copies of its NICs, standard switches, port groups, ports\n"
    "and firewall rulesets (switch0 -> switch1, pnet0 -> pnet3, dhcp -> dhcp-1, ...).\n"
    "Each copy's references stay within the copy; the host's singletons (the\n"
    "modules, the firewall's state) stay single; copied switches get fewer\n"
    "configured ports where the host's limit of 4608 requires.\n";

const char* const kExportHelp =
    "Usage: haldensim [--host PATH] export\n"
    "\n"
    "Prints the host as a JSON description (docs/host-format.md) on standard output.\n";

const char* const kImportHelp =
    "Usage: haldensim [--host PATH] import FILE\n"
    "\n"
    "Replaces the whole host with the description in FILE ('-' for standard input),\n"
    "a regular file of at most 256 MiB.\n"
    "The description is checked first; a refused one leaves the host unchanged.\n"
    "Faults and the exec log are replaced too: empty unless the description holds them.\n";

const char* const kFaultHelp =
    "Usage: haldensim [--host PATH] fault add --operation NAME (--message TEXT | --status N) [--times N]\n"
    "       haldensim [--host PATH] fault list [--armed]\n"
    "       haldensim [--host PATH] fault clear\n"
    "\n"
    "add    Makes the operation NAME (Class::Operation, e.g. FirewallRuleset::Enable)\n"
    "       throw an error with TEXT instead of doing its work; Trellis_Exec instead\n"
    "       returns the status N (not 0). --times N disarms it after N calls, counted\n"
    "       across all processes; without it, every call fails. Arming an operation\n"
    "       again replaces its fault.\n"
    "list   Prints every host operation, one per line, with its armed fault if any;\n"
    "       --armed prints only those with a fault.\n"
    "clear  Disarms every fault.\n";

// A well-formed call that cannot be done (unknown operation, unreadable file).
class Refused : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

struct Io {
    std::istream& in;
    std::ostream& out;
};

// The host is resolved and opened only by commands that work on it, never for help.
void OpenHostOf(const std::string& hostOption) {
    Host::OpenHost(Host::ResolveHostPath(hostOption));
}

void RequireNoPositionals(const ParsedOptions& options) {
    if (!options.positionals.empty()) throw UsageError("unexpected argument " + Host::Quoted(options.positionals[0]));
}

// The one of --empty, --from and --scale that init was given, if any.
std::optional<std::string> InitSource(const ParsedOptions& options) {
    std::optional<std::string> source;
    for (const char* name : {"empty", "from", "scale"}) {
        if (!options.Has(name)) continue;
        if (source) throw UsageError("--" + *source + " and --" + name + " exclude each other");
        source = name;
    }
    return source;
}

int ParseScale(const std::string& text) {
    int scale = ParseInt("--scale", text);
    if (scale < 1 || scale > Host::kMaxHostScale)
        throw UsageError("--scale expects an integer from 1 to " + std::to_string(Host::kMaxHostScale) + ", not " +
                         Host::Quoted(text));
    return scale;
}

int Init(const std::vector<std::string>& args, std::size_t next, const std::string& hostOption, Io& io) {
    ParsedOptions options = ParseOptions(args, next, {{"empty", false}, {"from", true}, {"scale", true}});
    if (options.Has("help")) return io.out << kInitHelp, kExitOk;
    RequireNoPositionals(options);
    std::optional<std::string> source = InitSource(options);
    if (source == "scale") {
        int scale = ParseScale(*options.Get("scale"));
        OpenHostOf(hostOption);
        Host::ImportScaledDefaultHost(scale);
        return kExitOk;
    }
    std::string description = Host::kDefaultHostDescription;
    if (source == "empty") description = "{\"format\": 1}";
    if (source == "from") description = ReadDescriptionInput(*options.Get("from"), io.in);
    OpenHostOf(hostOption);
    Host::ImportHost(description);
    return kExitOk;
}

int Export(const std::vector<std::string>& args, std::size_t next, const std::string& hostOption, Io& io) {
    ParsedOptions options = ParseOptions(args, next, {});
    if (options.Has("help")) return io.out << kExportHelp, kExitOk;
    RequireNoPositionals(options);
    OpenHostOf(hostOption);
    io.out << Host::ExportHost();
    return kExitOk;
}

int Import(const std::vector<std::string>& args, std::size_t next, const std::string& hostOption, Io& io) {
    ParsedOptions options = ParseOptions(args, next, {});
    if (options.Has("help")) return io.out << kImportHelp, kExitOk;
    if (options.positionals.size() != 1) throw UsageError("import takes one FILE");
    std::string description = ReadDescriptionInput(options.positionals[0], io.in);
    OpenHostOf(hostOption);
    Host::ImportHost(description);
    return kExitOk;
}

std::string DescribeFault(const Host::Fault& fault) {
    std::string text = Host::Operation::KindOf(fault.operation) == Host::FaultKind::Status
                           ? "status " + std::to_string(fault.status)
                           : "message \"" + fault.message + "\"";
    if (!fault.remaining) return text + ", every call";
    return text + ", " + std::to_string(*fault.remaining) + (*fault.remaining == 1 ? " more call" : " more calls");
}

// The fault that "fault add" asks for, refused before the host is touched.
Host::Fault FaultToAdd(const ParsedOptions& options) {
    if (!options.Has("operation")) throw UsageError("fault add needs --operation");
    if (options.Has("message") == options.Has("status")) throw UsageError("fault add needs --message or --status");
    Host::Fault fault;
    fault.operation = *options.Get("operation");
    if (options.Has("message")) fault.message = *options.Get("message");
    if (options.Has("status")) fault.status = ParseInt("--status", *options.Get("status"));
    if (options.Has("times")) fault.remaining = ParseInt("--times", *options.Get("times"));
    try {
        Host::CheckFault(fault);
    } catch (const std::invalid_argument& e) {
        throw Refused(e.what());
    }
    return fault;
}

int FaultList(const ParsedOptions& options, Io& io) {
    std::vector<Host::Fault> faults = Host::ListFaults();
    // The fault column lines up under the names printed: all, or the armed ones.
    std::size_t width = 0;
    if (options.Has("armed")) {
        for (const Host::Fault& fault : faults) width = std::max(width, fault.operation.size());
    } else {
        for (const std::string& name : Host::Operation::KnownNames()) width = std::max(width, name.size());
    }
    for (const std::string& name : Host::Operation::KnownNames()) {
        auto fault = std::find_if(faults.begin(), faults.end(), [&](const Host::Fault& f) { return f.operation == name; });
        if (fault == faults.end()) {
            if (!options.Has("armed")) io.out << name << "\n";
        } else {
            io.out << name << std::string(width - name.size() + 2, ' ') << DescribeFault(*fault) << "\n";
        }
    }
    return kExitOk;
}

int FaultCommand(const std::vector<std::string>& args, std::size_t next, const std::string& hostOption, Io& io) {
    if (next >= args.size()) throw UsageError("fault needs add, list or clear");
    const std::string& action = args[next];
    ParsedOptions options;
    if (action == "add") {
        options = ParseOptions(args, next + 1, {{"operation", true}, {"message", true}, {"status", true}, {"times", true}});
    } else if (action == "list") {
        options = ParseOptions(args, next + 1, {{"armed", false}});
    } else if (action == "clear") {
        options = ParseOptions(args, next + 1, {});
    } else if (action == "--help") {
        return io.out << kFaultHelp, kExitOk;
    } else {
        throw UsageError("unknown fault command " + Host::Quoted(action));
    }
    if (options.Has("help")) return io.out << kFaultHelp, kExitOk;
    RequireNoPositionals(options);
    if (action == "add") {
        Host::Fault fault = FaultToAdd(options);
        OpenHostOf(hostOption);
        Host::ArmFault(fault);
        return kExitOk;
    }
    OpenHostOf(hostOption);
    if (action == "list") return FaultList(options, io);
    Host::ClearFaults();
    return kExitOk;
}

int Dispatch(const std::vector<std::string>& args, Io& io) {
    std::size_t next = 0;
    std::string hostOption;
    bool hostSeen = false;
    while (next < args.size() && args[next].compare(0, 2, "--") == 0) {
        const std::string& arg = args[next];
        if (arg == "--help") return io.out << kMainHelp, kExitOk;
        bool isHost = arg == "--host" || arg.compare(0, 7, "--host=") == 0;
        if (isHost && hostSeen) throw UsageError("--host is given twice");
        hostSeen = hostSeen || isHost;
        if (arg == "--host") {
            if (next + 1 >= args.size()) throw UsageError("--host needs a value");
            hostOption = args[next + 1];
            next += 2;
        } else if (arg.compare(0, 7, "--host=") == 0) {
            hostOption = arg.substr(7);
            next += 1;
        } else {
            throw UsageError("unknown option " + Host::Printable(arg));
        }
        if (hostOption.empty()) throw UsageError("--host needs a path");
    }
    if (next >= args.size()) throw UsageError("no command given");
    const std::string& command = args[next];
    if (command == "init") return Init(args, next + 1, hostOption, io);
    if (command == "export") return Export(args, next + 1, hostOption, io);
    if (command == "import") return Import(args, next + 1, hostOption, io);
    if (command == "fault") return FaultCommand(args, next + 1, hostOption, io);
    throw UsageError("unknown command " + Host::Quoted(command));
}

}  // namespace

int RunHaldensim(const std::vector<std::string>& args, std::istream& in, std::ostream& out, std::ostream& err) {
    Io io{in, out};
    try {
        return Dispatch(args, io);
    } catch (const UsageError& e) {
        err << "haldensim: " << e.what() << " (see haldensim --help)\n";
        return kExitRefused;
    } catch (const Refused& e) {
        err << "haldensim: " << e.what() << "\n";
        return kExitRefused;
    } catch (const UnreadableInput& e) {
        err << "haldensim: " << e.what() << "\n";
        return kExitRefused;
    } catch (const Host::HostOpenError& e) {
        err << "haldensim: " << e.what() << "\n";
        return kExitRefused;
    } catch (const Host::DescriptionError& e) {
        err << "haldensim: bad description: " << e.what() << "\n";
        return kExitRefused;
    } catch (const std::exception& e) {
        err << "haldensim: " << e.what() << "\n";
        return kExitFailed;
    }
}

}  // namespace Sim
}  // namespace Trellis
