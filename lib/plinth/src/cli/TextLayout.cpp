#include "plinth/cli/TextLayout.h"

#include <sstream>

#include "plinth/cli/CodePointWidth.h"

namespace Plinth {
namespace Cli {

namespace {

void WrapLine(std::string const& line, size_t width, std::vector<std::string>& lines) {
    size_t const indent = line.find_first_not_of(' ');
    if (indent == std::string::npos) {
        lines.push_back("");
        return;
    }
    std::string const prefix(indent, ' ');
    std::string current = prefix;
    size_t currentWidth = indent;
    size_t position = indent;
    while (position < line.size()) {
        // The blanks before a word are kept as written within a line.
        size_t const wordStart = line.find_first_not_of(' ', position);
        if (wordStart == std::string::npos) break;
        size_t wordEnd = line.find(' ', wordStart);
        if (wordEnd == std::string::npos) wordEnd = line.size();
        std::string const gap = line.substr(position, wordStart - position);
        std::string const word = line.substr(wordStart, wordEnd - wordStart);
        size_t const wordWidth = DisplayWidth(word);
        bool const empty = current.size() == prefix.size();
        if (!empty && currentWidth + gap.size() + wordWidth > width) {
            lines.push_back(current);
            current = prefix + word;
            currentWidth = indent + wordWidth;
        } else {
            current += (empty ? "" : gap) + word;
            currentWidth += (empty ? 0 : gap.size()) + wordWidth;
        }
        position = wordEnd;
    }
    lines.push_back(current);
}

}  // namespace

std::vector<std::string> WrapText(std::string const& text, size_t width) {
    std::vector<std::string> lines;
    std::istringstream paragraphs(text);
    std::string line;
    while (std::getline(paragraphs, line)) WrapLine(line, width, lines);
    if (lines.empty()) lines.push_back("");
    return lines;
}

std::string FormatColumns(std::string const& left, std::string const& right, size_t indent, size_t column,
                          size_t totalWidth) {
    std::string const margin(column, ' ');
    size_t const rightWidth = totalWidth > column + 20 ? totalWidth - column : 20;
    std::string text = std::string(indent, ' ') + left;
    std::vector<std::string> lines = WrapText(right, rightWidth);
    while (!lines.empty() && lines.front().empty()) lines.erase(lines.begin());
    if (lines.empty()) return text + "\n";
    size_t first = 0;
    size_t const textWidth = DisplayWidth(text);
    if (textWidth + 1 <= column && !lines.empty()) {
        text += std::string(column - textWidth, ' ') + lines[0];
        first = 1;
    }
    text += "\n";
    for (size_t i = first; i < lines.size(); ++i) {
        text += lines[i].empty() ? "\n" : margin + lines[i] + "\n";
    }
    return text;
}

}  // namespace Cli
}  // namespace Plinth
