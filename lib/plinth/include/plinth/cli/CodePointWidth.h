#pragma once

#include <cstddef>
#include <string>

namespace Plinth {
namespace Cli {

// The terminal columns a code point takes: 2 for East Asian Wide and
// Fullwidth characters (CJK, kana, Hangul, fullwidth forms, most emoji), 0
// for combining marks, zero-width and format characters and controls, 1 for
// the rest.
int CodePointWidth(char32_t codePoint);

// The sum of the code points' widths; a byte that is not strict UTF-8 counts
// 1, as a terminal shows it as one stand-in character.
std::size_t DisplayWidth(std::string const& text);

}  // namespace Cli
}  // namespace Plinth
