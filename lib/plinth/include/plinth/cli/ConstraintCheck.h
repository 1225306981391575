#pragma once

#include <string>

#include "plinth/callspec/ParameterConstraint.h"

namespace Plinth {
namespace Cli {

// Checks a value that already has the parameter's type against a constraint.
// Returns "" when the value is allowed, else the reason, worded to follow
// "Invalid value for option --name: " (e.g. "4097 is not in the range 1 to
// 4096"). An int constraint applies to int values, a string constraint to
// string values; a constraint of the other family is ignored.
std::string CheckIntConstraint(CallSpec::ParameterConstraint const& constraint, long long value);
std::string CheckStringConstraint(CallSpec::ParameterConstraint const& constraint, std::string const& value);

}  // namespace Cli
}  // namespace Plinth
