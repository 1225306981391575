#pragma once

namespace Plinth {
namespace CallSpec {

// The type of a command parameter. A flag takes no value on the command line:
// it is given or not.
enum ParameterType {
    PARAMETER_STRING = 0,
    PARAMETER_INT = 1,
    PARAMETER_BOOL = 2,
    PARAMETER_FLAG = 3,
};

}  // namespace CallSpec
}  // namespace Plinth
