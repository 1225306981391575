#pragma once

// Option parsing for haldensim's commands: "--name value", "--name=value",
// flags, positional arguments. A problem is a UsageError.

#include <map>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace Trellis {
namespace Sim {

class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

struct OptionSpec {
    std::string name;  // without the dashes
    bool takesValue;
};

class ParsedOptions {
public:
    bool Has(const std::string& name) const { return values_.count(name) > 0; }
    std::optional<std::string> Get(const std::string& name) const;
    std::vector<std::string> positionals;

private:
    friend ParsedOptions ParseOptions(const std::vector<std::string>&, std::size_t, const std::vector<OptionSpec>&);
    std::map<std::string, std::string> values_;
};

// Parses args from index first on. "--help" is always accepted as a flag.
ParsedOptions ParseOptions(const std::vector<std::string>& args, std::size_t first, const std::vector<OptionSpec>& specs);

// A decimal integer, optionally signed, that fits an int.
int ParseInt(const std::string& option, const std::string& text);

}  // namespace Sim
}  // namespace Trellis
