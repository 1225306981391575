#pragma once

#include <cstddef>
#include <string>

namespace Plinth {
namespace Cli {

// Reads the code point that starts at text[position] and moves position past
// it. False, with position unchanged, where the bytes there are not strict
// UTF-8 (a stray or missing continuation byte, an overlong form, a surrogate,
// a value above U+10FFFF) or the text ends.
bool NextCodePoint(std::string const& text, std::size_t& position, char32_t& codePoint);

// The stand-in for bytes that are not strict UTF-8.
char32_t const kReplacementCharacter = 0xFFFD;

// Like NextCodePoint, but a byte where strict UTF-8 fails is read alone as
// U+FFFD, so a loop over any text moves on. False only at the end of text.
bool NextCodePointOrReplacement(std::string const& text, std::size_t& position, char32_t& codePoint);

void AppendUtf8(std::string& text, char32_t codePoint);

// text with every byte that is not part of strict UTF-8 replaced by U+FFFD.
std::string ReplaceInvalidUtf8(std::string const& text);

bool IsValidUtf8(std::string const& text);

// C0 controls, DEL and the C1 controls (U+0080 to U+009F).
bool IsControl(char32_t codePoint);

// Why a text may not be passed on to a command or the host: "is not valid
// UTF-8" or "contains a control character"; "" for a text that may.
std::string TextProblem(std::string const& text);

// The text as a message may quote it: a control character or a byte that is
// not part of valid UTF-8 is written as \xHH (\u0085 for a C1 control), so
// a refusal names a bad word without printing it raw.
std::string VisibleText(std::string const& text);

}  // namespace Cli
}  // namespace Plinth
