#pragma once

#include <boost/shared_ptr.hpp>
#include <string>
#include <utility>
#include <vector>

#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"

namespace Plinth {
namespace CallSpec {

// One parameter of a command, declared once as a constant of the command's
// source. It builds the parameter's specification, and it is the name the
// command reads the value by:
//
//   const Parameter kRulesetId = Parameter::String("ruleset-id", "r", "The label of the ruleset.").Required();
//   const Parameter kPorts = Parameter::Int("ports", "P", "The number of ports.").Range(1, 4096);
//
//   return InputSpecOf(kRulesetId, kPorts);          // in GetInputSpecInternal
//   std::string id = input->GetString(kRulesetId);   // in ExecuteInternal
//
// The builders return a changed copy, so a declaration reads as one line.
class Parameter {
public:
    typedef std::pair<std::string, std::string> Word;  // value, help line

    // Read with GetString.
    static Parameter String(std::string name, std::string shortName, std::string help);
    // Read with GetInt: the tool refuses a value outside the 32-bit range.
    static Parameter Int(std::string name, std::string shortName, std::string help);
    // Read as a 64-bit value (GetLongLong): the whole signed 64-bit range.
    static Parameter Int64(std::string name, std::string shortName, std::string help);
    // Read with GetBool.
    static Parameter Bool(std::string name, std::string shortName, std::string help);
    // Given or not: read with GetFlag.
    static Parameter Flag(std::string name, std::string shortName, std::string help);

    Parameter Required() const;
    // The constraint, one kind per parameter.
    Parameter Range(long long low, long long high) const;
    Parameter IntEnum(std::vector<long long> values) const;
    Parameter StringEnum(std::vector<Word> words) const;
    Parameter Regex(std::string pattern) const;

    // So that input->GetString(kRulesetId) reads the value by this name.
    operator std::string const&() const { return name_; }

    // A new specification of the parameter, with a new constraint object.
    boost::shared_ptr<ParameterSpec> NewSpec() const;

private:
    Parameter(std::string name, ParameterType type, IntWidth width, std::string shortName, std::string help);
    boost::shared_ptr<ParameterConstraint> NewConstraint() const;

    std::string name_;
    ParameterType type_;
    IntWidth width_;
    std::string shortName_;
    std::string help_;
    bool required_ = false;
    int constraintType_ = 0;  // a ParameterConstraintType, 0 for none
    long long low_ = 0;
    long long high_ = 0;
    std::vector<long long> intEnum_;
    std::vector<Word> stringEnum_;
    std::string regex_;
};

// A new input specification of the parameters, in this order.
template <class... Parameters>
boost::shared_ptr<InputSpec> InputSpecOf(Parameters const&... parameters) {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    (inputSpec->AddParameter(parameters.NewSpec()), ...);
    return inputSpec;
}

}  // namespace CallSpec
}  // namespace Plinth
