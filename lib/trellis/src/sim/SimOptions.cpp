#include "sim/SimOptions.h"

#include <cerrno>
#include <climits>
#include <cstdlib>

#include "host/StoredText.h"

namespace Trellis {
namespace Sim {

std::optional<std::string> ParsedOptions::Get(const std::string& name) const {
    auto it = values_.find(name);
    if (it == values_.end()) return std::nullopt;
    return it->second;
}

ParsedOptions ParseOptions(const std::vector<std::string>& args, std::size_t first, const std::vector<OptionSpec>& specs) {
    ParsedOptions parsed;
    for (std::size_t i = first; i < args.size(); ++i) {
        const std::string& arg = args[i];
        if (arg.size() < 3 || arg.compare(0, 2, "--") != 0) {
            parsed.positionals.push_back(arg);
            continue;
        }
        std::string name = arg.substr(2);
        std::optional<std::string> value;
        auto equals = name.find('=');
        if (equals != std::string::npos) {
            value = name.substr(equals + 1);
            name.erase(equals);
        }
        const OptionSpec* option = nullptr;
        static const OptionSpec kHelp{"help", false};
        if (name == "help") option = &kHelp;
        for (const OptionSpec& candidate : specs)
            if (candidate.name == name) option = &candidate;
        if (!option) throw UsageError("unknown option --" + Host::Printable(name));
        if (parsed.Has(name)) throw UsageError("--" + name + " is given twice");
        if (option->takesValue && !value) {
            if (i + 1 >= args.size()) throw UsageError("--" + name + " needs a value");
            value = args[++i];
        } else if (!option->takesValue && value) {
            throw UsageError("--" + name + " takes no value");
        }
        parsed.values_[name] = value.value_or("");
    }
    return parsed;
}

int ParseInt(const std::string& option, const std::string& text) {
    errno = 0;
    char* end = nullptr;
    long value = std::strtol(text.c_str(), &end, 10);
    bool digitsOnly = !text.empty() && *end == '\0' && text.find_first_of(" \t\n") == std::string::npos;
    if (!digitsOnly || errno == ERANGE || value < INT_MIN || value > INT_MAX)
        throw UsageError(option + " expects an integer, not " + Host::Quoted(text));
    return static_cast<int>(value);
}

}  // namespace Sim
}  // namespace Trellis
