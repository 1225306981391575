#pragma once

#include <boost/shared_ptr.hpp>
#include <cstddef>
#include <string>
#include <type_traits>

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
//
// A Parameter holds only pointers to string literals and to static arrays,
// and every factory and builder is constexpr: a constant declared as above is
// laid out by the compiler, so no initialiser runs for it when the plug-in is
// loaded and nothing is destroyed at exit. The words of an enum are therefore
// a named array that outlives the parameter:
//
//   constexpr Parameter::Word kModeWords[] = {{"transport", ""}, {"tunnel", ""}};
//   const Parameter kMode = Parameter::String("mode", "m", "The mode: %ENUM%").StringEnum(kModeWords);
class Parameter {
public:
    // One word of a string enum.
    struct Word {
        const char* value;
        const char* help;  // its help line
    };

    // Read with GetString.
    static constexpr Parameter String(const char* name, const char* shortName, const char* help) {
        return Parameter(name, PARAMETER_STRING, IntWidth::Int32, shortName, help);
    }
    // Read with GetInt: the tool refuses a value outside the 32-bit range.
    static constexpr Parameter Int(const char* name, const char* shortName, const char* help) {
        return Parameter(name, PARAMETER_INT, IntWidth::Int32, shortName, help);
    }
    // Read as a 64-bit value (GetLongLong): the whole signed 64-bit range.
    static constexpr Parameter Int64(const char* name, const char* shortName, const char* help) {
        return Parameter(name, PARAMETER_INT, IntWidth::Int64, shortName, help);
    }
    // Read with GetBool.
    static constexpr Parameter Bool(const char* name, const char* shortName, const char* help) {
        return Parameter(name, PARAMETER_BOOL, IntWidth::Int32, shortName, help);
    }
    // Given or not: read with GetFlag.
    static constexpr Parameter Flag(const char* name, const char* shortName, const char* help) {
        return Parameter(name, PARAMETER_FLAG, IntWidth::Int32, shortName, help);
    }

    constexpr Parameter Required() const {
        Parameter changed = *this;
        changed.required_ = true;
        return changed;
    }
    // The constraint, one kind per parameter. The arrays of the enums are
    // kept by address: they are constants of static storage.
    constexpr Parameter Range(long long low, long long high) const {
        Parameter changed = *this;
        changed.constraintType_ = CONSTRAINT_INT_RANGE;
        changed.low_ = low;
        changed.high_ = high;
        return changed;
    }
    // A braced list would be a temporary array, gone once the declaration is
    // done: the array type is deduced from the argument, which a braced list
    // cannot give.
    template <class Values>
    constexpr Parameter IntEnum(Values const& values) const {
        static_assert(IsArrayOf<Values, long long>(), "the values are a named array of long long");
        Parameter changed = *this;
        changed.constraintType_ = CONSTRAINT_INT_ENUM;
        changed.intEnum_ = values;
        changed.enumCount_ = std::extent<Values>::value;
        return changed;
    }
    template <class Words>
    constexpr Parameter StringEnum(Words const& words) const {
        static_assert(IsArrayOf<Words, Word>(), "the words are a named array of Parameter::Word");
        Parameter changed = *this;
        changed.constraintType_ = CONSTRAINT_STRING_ENUM;
        changed.stringEnum_ = words;
        changed.enumCount_ = std::extent<Words>::value;
        return changed;
    }
    constexpr Parameter Regex(const char* pattern) const {
        Parameter changed = *this;
        changed.constraintType_ = CONSTRAINT_STRING_REGEX;
        changed.regex_ = pattern;
        return changed;
    }

    // So that input->GetString(kRulesetId) reads the value by this name.
    operator std::string() const { return name_; }

    // A new specification of the parameter, with a new constraint object.
    boost::shared_ptr<ParameterSpec> NewSpec() const;

private:
    template <class Array, class Element>
    static constexpr bool IsArrayOf() {
        return std::extent<Array>::value > 0 &&
               std::is_same<std::remove_cv_t<std::remove_extent_t<Array>>, Element>::value;
    }

    constexpr Parameter(const char* name, ParameterType type, IntWidth width, const char* shortName,
                        const char* help)
        : name_(name), type_(type), width_(width), shortName_(shortName), help_(help) {}
    boost::shared_ptr<ParameterConstraint> NewConstraint() const;

    const char* name_;
    ParameterType type_;
    IntWidth width_;
    const char* shortName_;
    const char* help_;
    bool required_ = false;
    int constraintType_ = 0;  // a ParameterConstraintType, 0 for none
    long long low_ = 0;
    long long high_ = 0;
    long long const* intEnum_ = nullptr;
    Word const* stringEnum_ = nullptr;
    std::size_t enumCount_ = 0;  // of intEnum_ or stringEnum_
    const char* regex_ = "";
};

// Nothing to run at load or at exit for a Parameter constant.
static_assert(std::is_trivially_destructible<Parameter>::value, "a Parameter constant must need no destructor");
static_assert(std::is_trivially_copyable<Parameter>::value, "a Parameter is plain data");

// A new input specification of the parameters, in this order.
template <class... Parameters>
boost::shared_ptr<InputSpec> InputSpecOf(Parameters const&... parameters) {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
    (inputSpec->AddParameter(parameters.NewSpec()), ...);
    return inputSpec;
}

}  // namespace CallSpec
}  // namespace Plinth
