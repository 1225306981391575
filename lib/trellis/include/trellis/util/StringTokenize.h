#pragma once

#include <string>
#include <vector>

namespace Trellis {
namespace Util {

// Splits `text` at every character of `separators` and appends the pieces to
// `tokens`, in order. Empty pieces (separators side by side, at the start or
// at the end) are dropped, so "a  b " at " " gives "a" and "b", and an empty
// or all-separator text appends nothing. With no separators the whole
// non-empty text is one token. Entries already in `tokens` stay.
void StringTokenize(std::string const& text, std::vector<std::string>& tokens,
                    std::string const& separators);

}  // namespace Util
}  // namespace Trellis
