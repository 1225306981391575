#pragma once

#include <string>

namespace Plinth {
namespace Cli {

// true/false, yes/no, 1/0, in any case. False when text is none of these.
bool ParseBool(std::string const& text, bool& value);

enum class IntParse { Ok, NotANumber, OutOfRange };
// A decimal integer, optionally signed, that fits in 64 bits; nothing else
// (no blanks, no hex, no trailing text).
IntParse ParseInt(std::string const& text, long long& value);

}  // namespace Cli
}  // namespace Plinth
