#include "plinth/cli/ConstraintCheck.h"

#include <algorithm>

#include <boost/regex.hpp>

namespace Plinth {
namespace Cli {

using CallSpec::ParameterConstraint;

namespace {

std::string JoinInts(std::vector<long long> const& values) {
    std::string joined;
    for (long long value : values) {
        if (!joined.empty()) joined += ", ";
        joined += std::to_string(value);
    }
    return joined;
}

std::string JoinStringEnum(std::vector<ParameterConstraint::StringEnumValue> const& values) {
    std::string joined;
    for (auto const& value : values) {
        if (!joined.empty()) joined += ", ";
        joined += value.first;
    }
    return joined;
}

}  // namespace

std::string CheckIntConstraint(ParameterConstraint const& constraint, long long value) {
    switch (constraint.GetType()) {
    case CallSpec::CONSTRAINT_INT_RANGE:
        if (value < constraint.GetRangeLow() || value > constraint.GetRangeHigh()) {
            return std::to_string(value) + " is not in the range " + std::to_string(constraint.GetRangeLow()) +
                   " to " + std::to_string(constraint.GetRangeHigh());
        }
        return "";
    case CallSpec::CONSTRAINT_INT_ENUM: {
        auto const& allowed = constraint.GetIntEnum();
        if (std::find(allowed.begin(), allowed.end(), value) == allowed.end()) {
            return std::to_string(value) + " is not one of " + JoinInts(allowed);
        }
        return "";
    }
    default:
        return "";
    }
}

std::string CheckStringConstraint(ParameterConstraint const& constraint, std::string const& value) {
    switch (constraint.GetType()) {
    case CallSpec::CONSTRAINT_STRING_ENUM: {
        auto const& allowed = constraint.GetStringEnum();
        bool const listed = std::any_of(allowed.begin(), allowed.end(),
                                        [&value](ParameterConstraint::StringEnumValue const& entry) {
                                            return entry.first == value;
                                        });
        return listed ? "" : "'" + value + "' is not one of " + JoinStringEnum(allowed);
    }
    case CallSpec::CONSTRAINT_STRING_REGEX:
        try {
            if (!boost::regex_match(value, boost::regex(constraint.GetStringRegex()))) {
                return "'" + value + "' does not match the pattern " + constraint.GetStringRegex();
            }
        } catch (boost::regex_error const&) {
            return "the command's pattern " + constraint.GetStringRegex() + " is not a valid regular expression";
        }
        return "";
    default:
        return "";
    }
}

}  // namespace Cli
}  // namespace Plinth
