#pragma once

// The texts the host keeps (names, messages, options, command lines) are
// valid UTF-8 without control characters: C0 (U+0000 to U+001F), DEL and C1
// (U+0080 to U+009F). A text that is not valid UTF-8 cannot even be written
// as JSON, and a control character would reach the terminal of whoever
// lists the host.

#include <cstddef>
#include <optional>
#include <string>

namespace Trellis {
namespace Host {

// Where text stops being valid UTF-8 (the offset of the first byte that
// cannot stand there), or nothing when it is valid.
std::optional<std::size_t> InvalidUtf8Offset(const std::string& text);

inline bool IsValidUtf8(const std::string& text) { return !InvalidUtf8Offset(text); }

// What keeps the host from keeping text, as the end of a sentence about it
// ("is not valid UTF-8", "contains the control character U+001B"), or ""
// when nothing does.
std::string TextProblem(const std::string& text);

// text as a message may show it: unchanged when it has no problem, else
// quoted with every control character and non-ASCII character escaped
// (\u001b) and invalid bytes replaced (\ufffd).
std::string Printable(const std::string& text);
// The same, always in double quotes.
std::string Quoted(const std::string& text);

}  // namespace Host
}  // namespace Trellis
