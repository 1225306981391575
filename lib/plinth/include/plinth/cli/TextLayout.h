#pragma once

#include <string>
#include <vector>

namespace Plinth {
namespace Cli {

// Breaks text into lines of at most width columns (DisplayWidth) at blanks. Line breaks in
// text start new lines; the leading blanks of such a line indent its
// continuation lines too. A word longer than the width stands alone. Trailing
// blanks are dropped.
std::vector<std::string> WrapText(std::string const& text, size_t width);

// A two-column entry: left starts after indent blanks, right starts at
// display column (0-based) and is wrapped so no line passes totalWidth; its following
// lines start at column too. When left does not leave a blank before column,
// right starts on the next line. Every line ends with '\n'.
std::string FormatColumns(std::string const& left, std::string const& right, size_t indent, size_t column,
                          size_t totalWidth);

}  // namespace Cli
}  // namespace Plinth
