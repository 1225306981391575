#include "plinth/cli/Utf8.h"

#include <cstdio>

namespace Plinth {
namespace Cli {

namespace {

bool IsContinuation(unsigned char byte) { return (byte & 0xC0) == 0x80; }

}  // namespace

bool NextCodePoint(std::string const& text, std::size_t& position, char32_t& codePoint) {
    if (position >= text.size()) return false;
    unsigned char const lead = static_cast<unsigned char>(text[position]);
    std::size_t length = 0;
    char32_t value = 0;
    char32_t smallest = 0;  // below this the form is overlong
    if (lead < 0x80) {
        codePoint = lead;
        ++position;
        return true;
    } else if ((lead & 0xE0) == 0xC0) {
        length = 2, value = lead & 0x1F, smallest = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        length = 3, value = lead & 0x0F, smallest = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        length = 4, value = lead & 0x07, smallest = 0x10000;
    } else {
        return false;
    }
    if (text.size() - position < length) return false;
    for (std::size_t i = 1; i < length; ++i) {
        unsigned char const byte = static_cast<unsigned char>(text[position + i]);
        if (!IsContinuation(byte)) return false;
        value = (value << 6) | (byte & 0x3F);
    }
    if (value < smallest || value > 0x10FFFF || (value >= 0xD800 && value <= 0xDFFF)) return false;
    codePoint = value;
    position += length;
    return true;
}

bool NextCodePointOrReplacement(std::string const& text, std::size_t& position, char32_t& codePoint) {
    if (position >= text.size()) return false;
    if (!NextCodePoint(text, position, codePoint)) {
        codePoint = kReplacementCharacter;
        ++position;
    }
    return true;
}

void AppendUtf8(std::string& text, char32_t codePoint) {
    auto append = [&text](unsigned value) { text += static_cast<char>(value); };
    if (codePoint < 0x80) {
        append(codePoint);
    } else if (codePoint < 0x800) {
        append(0xC0 | (codePoint >> 6));
        append(0x80 | (codePoint & 0x3F));
    } else if (codePoint < 0x10000) {
        append(0xE0 | (codePoint >> 12));
        append(0x80 | ((codePoint >> 6) & 0x3F));
        append(0x80 | (codePoint & 0x3F));
    } else {
        append(0xF0 | (codePoint >> 18));
        append(0x80 | ((codePoint >> 12) & 0x3F));
        append(0x80 | ((codePoint >> 6) & 0x3F));
        append(0x80 | (codePoint & 0x3F));
    }
}

std::string ReplaceInvalidUtf8(std::string const& text) {
    if (IsValidUtf8(text)) return text;
    std::string replaced;
    std::size_t position = 0;
    char32_t codePoint = 0;
    while (NextCodePointOrReplacement(text, position, codePoint)) AppendUtf8(replaced, codePoint);
    return replaced;
}

bool IsValidUtf8(std::string const& text) {
    std::size_t position = 0;
    char32_t codePoint = 0;
    while (position < text.size()) {
        if (!NextCodePoint(text, position, codePoint)) return false;
    }
    return true;
}

bool IsControl(char32_t codePoint) { return codePoint < 0x20 || (codePoint >= 0x7F && codePoint <= 0x9F); }

std::string TextProblem(std::string const& text) {
    std::size_t position = 0;
    char32_t codePoint = 0;
    bool control = false;
    while (position < text.size()) {
        if (!NextCodePoint(text, position, codePoint)) return "is not valid UTF-8";
        control = control || IsControl(codePoint);
    }
    return control ? "contains a control character" : "";
}

std::string VisibleText(std::string const& text) {
    std::string visible;
    std::size_t position = 0;
    while (position < text.size()) {
        std::size_t const start = position;
        char32_t codePoint = 0;
        char escape[8];
        if (!NextCodePoint(text, position, codePoint)) {
            std::snprintf(escape, sizeof escape, "\\x%02X", static_cast<unsigned char>(text[position++]));
            visible += escape;
        } else if (IsControl(codePoint)) {
            std::snprintf(escape, sizeof escape, codePoint < 0x80 ? "\\x%02X" : "\\u%04X",
                          static_cast<unsigned>(codePoint));
            visible += escape;
        } else {
            visible.append(text, start, position - start);
        }
    }
    return visible;
}

}  // namespace Cli
}  // namespace Plinth
