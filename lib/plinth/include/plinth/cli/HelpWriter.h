#pragma once

#include <string>

#include "plinth/autocli/Command.h"
#include "plinth/autocli/NamespaceNode.h"
#include "plinth/callspec/ParameterSpec.h"

namespace Plinth {
namespace Cli {

// The help texts of the tool, each ending with a line break. Lines are
// wrapped at 80 columns; option texts start at column 24.
class HelpWriter {
public:
    explicit HelpWriter(std::string programName);

    // Usage line, description, and the namespace's children: namespaces and
    // commands in two lists, each in registration order. For the root (a
    // node without parent) the tool's global options are listed as well.
    std::string NamespaceHelp(AutoCli::NamespaceNode& node) const;
    // Usage line with the command's path, description, one entry per
    // parameter in declaration order, and the examples if there are any.
    std::string CommandHelp(AutoCli::Command& command) const;

    // "-s|--long=<type>": type bool, long or str; nothing for a flag.
    static std::string OptionSignature(CallSpec::ParameterSpec const& parameter);
    // The help text with %ENUM% (the allowed values, "[a, b]") and %FULLENUM%
    // (one "value: description" line per value) expanded, and " (required)"
    // appended for a required parameter.
    static std::string OptionText(CallSpec::ParameterSpec const& parameter);

private:
    std::string programName_;
};

}  // namespace Cli
}  // namespace Plinth
