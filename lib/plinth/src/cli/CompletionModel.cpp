#include "plinth/cli/CompletionModel.h"

#include <algorithm>

#include "plinth/cli/HelpWriter.h"

namespace Plinth {
namespace Cli {

using AutoCli::Command;
using AutoCli::NamespaceNode;
using CallSpec::ParameterSpec;

namespace {

std::string FirstLine(std::string const& text) { return text.substr(0, text.find('\n')); }

std::vector<std::string> EnumeratedValues(ParameterSpec const& parameter) {
    std::vector<std::string> values;
    if (parameter.GetType() == CallSpec::PARAMETER_BOOL) return {"true", "false"};
    if (CallSpec::ParameterConstraint const* constraint = parameter.GetConstraint().get()) {
        if (constraint->GetType() == CallSpec::CONSTRAINT_STRING_ENUM) {
            for (auto const& value : constraint->GetStringEnum()) values.push_back(value.first);
        } else if (constraint->GetType() == CallSpec::CONSTRAINT_INT_ENUM) {
            for (long long value : constraint->GetIntEnum()) values.push_back(std::to_string(value));
        }
    }
    return values;
}

CompletionOption OptionOf(ParameterSpec const& parameter, CompletionSource const& source) {
    CompletionOption option;
    option.name = parameter.GetName();
    option.shortName = parameter.GetShortName();
    option.help = FirstLine(HelpWriter::OptionText(parameter));
    option.takesValue = parameter.GetType() != CallSpec::PARAMETER_FLAG;
    if (option.takesValue) option.values = EnumeratedValues(parameter);
    std::vector<std::string> const& hosted = source.hostNameParameters;
    option.hostNames = option.takesValue && option.values.empty() &&
                       std::find(hosted.begin(), hosted.end(), option.name) != hosted.end();
    return option;
}

std::vector<CompletionOption> OptionsOf(Command& command, CompletionSource const& source) {
    boost::shared_ptr<CallSpec::InputSpec> inputSpec;
    try {
        inputSpec = source.inputSpecOf ? source.inputSpecOf(command) : command.GetInputSpec();
    } catch (std::exception const&) {
        // A command whose options cannot be had now completes no options.
    }
    std::vector<CompletionOption> options;
    if (inputSpec) {
        for (auto const& parameter : inputSpec->GetParameters()) options.push_back(OptionOf(*parameter, source));
    }
    return options;
}

void Collect(NamespaceNode& node, CompletionSource const& source, std::vector<CompletionNode>& nodes) {
    CompletionNode entry;
    entry.path = node.GetPathString(' ');
    entry.help = FirstLine(node.GetDescription());
    if (Command* command = dynamic_cast<Command*>(&node)) {
        entry.command = true;
        entry.options = OptionsOf(*command, source);
        nodes.push_back(entry);
        return;
    }
    entry.children = node.GetNamespaceNodeNames();
    nodes.push_back(entry);
    for (auto const& child : node.GetNamespaceNodes()) Collect(*child, source, nodes);
}

}  // namespace

std::vector<CompletionNode> CompletionNodes(NamespaceNode& root, CompletionSource const& source) {
    std::vector<CompletionNode> nodes;
    Collect(root, source, nodes);
    return nodes;
}

}  // namespace Cli
}  // namespace Plinth
