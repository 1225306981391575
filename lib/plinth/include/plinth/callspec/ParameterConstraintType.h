#pragma once

namespace Plinth {
namespace CallSpec {

enum ParameterConstraintType {
    CONSTRAINT_INT_RANGE = 1,     // SetIntRange(low, high), both inclusive
    CONSTRAINT_INT_ENUM = 2,      // AddIntEnum(value) for each allowed value
    CONSTRAINT_STRING_ENUM = 3,   // AddStringEnum(value, description) for each
    CONSTRAINT_STRING_REGEX = 4,  // SetStringRegex(pattern): the whole value matches
};

}  // namespace CallSpec
}  // namespace Plinth
