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

// How much of an int parameter the command reads: GetInt reads a 32-bit int,
// so the tool refuses a value outside that range; a command that reads the
// value as 64 bits (GetLongLong) takes the whole signed 64-bit range.
enum class IntWidth { Int32, Int64 };

}  // namespace CallSpec
}  // namespace Plinth
