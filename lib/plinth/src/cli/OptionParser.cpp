#include "plinth/cli/OptionParser.h"

#include <cstdint>
#include <set>

#include "plinth/cli/ConstraintCheck.h"
#include "plinth/cli/UsageError.h"
#include "plinth/cli/Utf8.h"
#include "plinth/cli/ValueParser.h"

namespace Plinth {
namespace Cli {

using CallSpec::Input;
using CallSpec::InputSpec;
using CallSpec::ParameterSpec;

namespace {

struct OptionWord {
    std::string typed;  // the option as written, without any "=value"
    std::string name;   // without the leading hyphens
    bool isShort = false;
    bool hasValue = false;
    std::string value;
};

bool IsOptionWord(std::string const& word) {
    if (word.size() < 2 || word[0] != '-') return false;
    long long number = 0;
    return ParseInt(word, number) == IntParse::NotANumber;  // "-5" is a value
}

OptionWord SplitOption(std::string const& word) {
    OptionWord option;
    size_t const equals = word.find('=');
    option.typed = word.substr(0, equals);
    if (equals != std::string::npos) {
        option.hasValue = true;
        option.value = word.substr(equals + 1);
    }
    option.isShort = option.typed.compare(0, 2, "--") != 0;
    option.name = option.typed.substr(option.isShort ? 1 : 2);
    return option;
}

void Refuse(std::string const& text) { throw UsageError(text); }

void RefuseValue(std::string const& option, std::string const& reason) {
    Refuse("Invalid value for option " + option + ": " + reason + ".");
}

// What an int parameter's width lets through, as a refusal; "" when it fits.
std::string CheckIntWidth(ParameterSpec const& parameter, std::string const& text, long long value) {
    if (parameter.GetIntWidth() == CallSpec::IntWidth::Int64) return "";
    if (value >= INT32_MIN && value <= INT32_MAX) return "";
    return "'" + text + "' is outside the 32-bit integer range (" + std::to_string(INT32_MIN) + " to " +
           std::to_string(INT32_MAX) + ")";
}

void StoreValue(ParameterSpec const& parameter, std::string const& text, Input& input) {
    std::string const option = "--" + parameter.GetName();
    boost::shared_ptr<CallSpec::ParameterConstraint> const constraint = parameter.GetConstraint();
    std::string const problem = TextProblem(text);
    if (!problem.empty()) RefuseValue(option, "'" + VisibleText(text) + "' " + problem);
    switch (parameter.GetType()) {
    case CallSpec::PARAMETER_BOOL: {
        bool value = false;
        if (!ParseBool(text, value)) {
            RefuseValue(option, "'" + text + "' is not a boolean (use true/false, yes/no or 1/0)");
        }
        input.SetBool(parameter.GetName(), value);
        return;
    }
    case CallSpec::PARAMETER_INT: {
        long long value = 0;
        switch (ParseInt(text, value)) {
        case IntParse::NotANumber:
            RefuseValue(option, "'" + text + "' is not an integer");
            break;
        case IntParse::OutOfRange:
            RefuseValue(option, "'" + text + "' is outside the 64-bit integer range");
            break;
        case IntParse::Ok:
            break;
        }
        std::string const tooWide = CheckIntWidth(parameter, text, value);
        if (!tooWide.empty()) RefuseValue(option, tooWide);
        if (constraint) {
            std::string const reason = CheckIntConstraint(*constraint, value);
            if (!reason.empty()) RefuseValue(option, reason);
        }
        input.SetInt(parameter.GetName(), value);
        return;
    }
    default: {
        if (constraint) {
            std::string const reason = CheckStringConstraint(*constraint, text);
            if (!reason.empty()) RefuseValue(option, reason);
        }
        input.SetString(parameter.GetName(), text);
        return;
    }
    }
}

}  // namespace

boost::shared_ptr<Input> ParseCommandOptions(InputSpec const& inputSpec, std::vector<std::string> const& words) {
    boost::shared_ptr<Input> input = Input::New();
    std::set<std::string> given;
    for (size_t i = 0; i < words.size(); ++i) {
        if (!IsOptionWord(words[i])) Refuse("Unexpected argument '" + VisibleText(words[i]) + "'.");
        OptionWord option = SplitOption(words[i]);
        boost::shared_ptr<ParameterSpec> const parameter =
            option.isShort ? inputSpec.FindByShortName(option.name) : inputSpec.FindByName(option.name);
        if (!parameter) Refuse("Unknown option " + VisibleText(option.typed) + ".");

        std::string const longOption = "--" + parameter->GetName();
        if (!given.insert(parameter->GetName()).second) {
            Refuse("Option " + longOption + " was given more than once.");
        }
        if (parameter->GetType() == CallSpec::PARAMETER_FLAG) {
            if (option.hasValue) Refuse("Option " + longOption + " is a flag and takes no value.");
            input->SetFlag(parameter->GetName());
            continue;
        }
        if (!option.hasValue) {
            if (i + 1 >= words.size() || IsOptionWord(words[i + 1])) {
                Refuse("Option " + longOption + " requires a value.");
            }
            option.value = words[++i];
        }
        StoreValue(*parameter, option.value, *input);
    }
    for (auto const& parameter : inputSpec.GetParameters()) {
        if (parameter->IsRequired() && !given.count(parameter->GetName())) {
            Refuse("Missing required option --" + parameter->GetName() + ".");
        }
    }
    return input;
}

}  // namespace Cli
}  // namespace Plinth
