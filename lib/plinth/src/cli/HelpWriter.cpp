#include "plinth/cli/HelpWriter.h"

#include <algorithm>

#include <boost/algorithm/string/replace.hpp>

#include "plinth/cli/CodePointWidth.h"
#include "plinth/cli/Formatter.h"
#include "plinth/cli/TextLayout.h"

namespace Plinth {
namespace Cli {

using AutoCli::NamespaceNode;
using CallSpec::ParameterConstraint;
using CallSpec::ParameterSpec;

namespace {

size_t const kWidth = 80;
size_t const kOptionColumn = 24;

std::string EnumValues(ParameterConstraint const* constraint) {
    std::string joined;
    auto append = [&joined](std::string const& value) {
        if (!joined.empty()) joined += ", ";
        joined += value;
    };
    if (constraint) {
        for (auto const& value : constraint->GetStringEnum()) append(value.first);
        for (long long value : constraint->GetIntEnum()) append(std::to_string(value));
    }
    return "[" + joined + "]";
}

std::string FullEnumValues(ParameterConstraint const* constraint) {
    std::string lines;
    if (constraint) {
        for (auto const& value : constraint->GetStringEnum()) {
            lines += "\n  " + value.first + (value.second.empty() ? "" : ": " + value.second);
        }
        for (long long value : constraint->GetIntEnum()) lines += "\n  " + std::to_string(value);
    }
    return lines + "\n";
}

std::string ListChildren(std::vector<boost::shared_ptr<NamespaceNode> > const& nodes) {
    size_t widest = 0;
    for (auto const& node : nodes) widest = std::max(widest, DisplayWidth(node->GetName()));
    std::string text;
    for (auto const& node : nodes) {
        text += FormatColumns(node->GetName(), node->GetDescription(), 2, 2 + widest + 2, kWidth);
    }
    return text;
}

std::string Paragraph(std::string const& text, size_t indent) {
    std::string out;
    for (std::string const& line : WrapText(text, kWidth - indent)) {
        out += line.empty() ? "\n" : std::string(indent, ' ') + line + "\n";
    }
    return out;
}

std::string GlobalOptions() {
    std::string formatters;
    for (std::string const& name : FormatterNames()) formatters += (formatters.empty() ? "" : ", ") + name;
    return "Options:\n" +
           FormatColumns("--batch=<str>",
                         "Run the command lines of a file (- for standard input), one a line, on one host; "
                         "stop at the first that fails.",
                         2, kOptionColumn, kWidth) +
           FormatColumns("--completion=<str>",
                         "Print the completion script of a shell: bash, zsh or fish.", 2, kOptionColumn, kWidth) +
           FormatColumns("--force", "With --batch: run every line, even after one fails.", 2, kOptionColumn,
                         kWidth) +
           FormatColumns("--formatter=<str>",
                         "The output format: " + formatters + ". The default is the command's own.", 2,
                         kOptionColumn, kWidth) +
           FormatColumns("--help", "Show the help of the namespace or command.", 2, kOptionColumn, kWidth) +
           FormatColumns("--host=<str>",
                         "The host store to work on. The default is $HALDEN_HOST, else "
                         "$XDG_STATE_HOME/halden/host.db.",
                         2, kOptionColumn, kWidth);
}

}  // namespace

HelpWriter::HelpWriter(std::string programName) : programName_(std::move(programName)) {}

std::string HelpWriter::NamespaceHelp(NamespaceNode& node) const {
    std::string text = "Usage: " + programName_ + " [options] {namespace}+ {cmd} [cmd options]\n";
    if (!node.GetDescription().empty()) text += "\n" + Paragraph(node.GetDescription(), 0);
    if (!node.GetParent()) text += "\n" + GlobalOptions();

    std::vector<boost::shared_ptr<NamespaceNode> > namespaces;
    std::vector<boost::shared_ptr<NamespaceNode> > commands;
    for (auto const& child : node.GetNamespaceNodes()) {
        (child->GetDispatcher() ? commands : namespaces).push_back(child);
    }
    if (!namespaces.empty()) text += "\nAvailable Namespaces:\n" + ListChildren(namespaces);
    if (!commands.empty()) text += "\nAvailable Commands:\n" + ListChildren(commands);
    return text;
}

std::string HelpWriter::CommandHelp(AutoCli::Command& command) const {
    std::string text = "Usage: " + programName_ + " " + command.GetPathString(' ') + " [cmd options]\n";
    text += "\nDescription:\n" + Paragraph(command.GetDescription(), 2);
    text += "\nCmd options:\n";
    boost::shared_ptr<CallSpec::InputSpec> const inputSpec = command.GetInputSpec();
    for (auto const& parameter : inputSpec->GetParameters()) {
        text += FormatColumns(OptionSignature(*parameter), OptionText(*parameter), 2, kOptionColumn, kWidth);
    }
    std::vector<AutoCli::Command::Example> const examples = command.GetExamples();
    if (!examples.empty()) {
        text += "\nExamples:\n";
        for (auto const& example : examples) {
            text += Paragraph(example.first, 2) + Paragraph(example.second, 4);
        }
    }
    return text;
}

std::string HelpWriter::OptionSignature(ParameterSpec const& parameter) {
    std::string signature;
    if (!parameter.GetShortName().empty()) signature = "-" + parameter.GetShortName() + "|";
    signature += "--" + parameter.GetName();
    switch (parameter.GetType()) {
    case CallSpec::PARAMETER_BOOL:
        return signature + "=<bool>";
    case CallSpec::PARAMETER_INT:
        return signature + "=<long>";
    case CallSpec::PARAMETER_FLAG:
        return signature;
    default:
        return signature + "=<str>";
    }
}

std::string HelpWriter::OptionText(ParameterSpec const& parameter) {
    ParameterConstraint const* constraint = parameter.GetConstraint().get();
    std::string text = parameter.GetDescription();
    boost::algorithm::replace_all(text, "%FULLENUM%", FullEnumValues(constraint));
    boost::algorithm::replace_all(text, "%ENUM%", EnumValues(constraint));
    while (text.find(" \n") != std::string::npos) boost::algorithm::replace_all(text, " \n", "\n");
    while (!text.empty() && (text.back() == '\n' || text.back() == ' ')) text.pop_back();
    if (parameter.IsRequired()) text += text.empty() ? "(required)" : " (required)";
    return text;
}

}  // namespace Cli
}  // namespace Plinth
