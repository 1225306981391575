#include "host/StoredText.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include <nlohmann/json.hpp>

namespace Trellis {
namespace Host {

namespace {

bool IsContinuationByte(unsigned char byte) { return (byte & 0xc0) == 0x80; }

std::string ControlCharacterProblem(unsigned int codePoint) {
    char name[8];
    std::snprintf(name, sizeof name, "U+%04X", codePoint);
    return std::string("contains the control character ") + name;
}

// The serializer names the byte where decoding failed; the character that
// fails may have started up to three bytes before it.
std::size_t StartOfCharacter(const std::string& text, std::size_t failed) {
    for (std::size_t back = 1; back <= 3 && back <= failed; ++back) {
        auto byte = static_cast<unsigned char>(text[failed - back]);
        if (IsContinuationByte(byte)) continue;
        std::size_t length = byte >= 0xf0 ? 4 : byte >= 0xe0 ? 3 : byte >= 0xc0 ? 2 : 1;
        return length > back ? failed - back : failed;
    }
    return failed;
}

}  // namespace

// The JSON library's serializer validates UTF-8 strictly (no overlong forms,
// no surrogates, nothing above U+10FFFF); its refusal names the index of the
// byte where decoding failed, or says that the text ends inside a character.
std::optional<std::size_t> InvalidUtf8Offset(const std::string& text) {
    try {
        (void)nlohmann::json(text).dump();
        return std::nullopt;
    } catch (const nlohmann::json::type_error& e) {
        const std::string message = e.what();
        const std::string marker = "at index ";
        std::size_t at = message.find(marker);
        std::size_t failed = at == std::string::npos
                                 ? text.size()
                                 : std::strtoull(message.c_str() + at + marker.size(), nullptr, 10);
        return StartOfCharacter(text, std::min(failed, text.size()));
    }
}

std::string TextProblem(const std::string& text) {
    bool ascii = true;
    for (unsigned char byte : text) {
        if (byte < 0x20 || byte == 0x7f) return ControlCharacterProblem(byte);
        if (byte >= 0x80) ascii = false;
    }
    if (ascii) return "";
    if (!IsValidUtf8(text)) return "is not valid UTF-8";
    // In valid UTF-8, U+0080 to U+009F are the byte 0xC2 followed by 0x80 to 0x9F.
    for (std::size_t i = 0; i + 1 < text.size(); ++i) {
        auto lead = static_cast<unsigned char>(text[i]);
        auto next = static_cast<unsigned char>(text[i + 1]);
        if (lead == 0xc2 && next <= 0x9f) return ControlCharacterProblem(next);
    }
    return "";
}

std::string Printable(const std::string& text) {
    if (TextProblem(text).empty()) return text;
    return nlohmann::json(text).dump(-1, ' ', true, nlohmann::json::error_handler_t::replace);
}

std::string Quoted(const std::string& text) {
    std::string shown = Printable(text);
    return shown == text ? "\"" + text + "\"" : shown;
}

}  // namespace Host
}  // namespace Trellis
