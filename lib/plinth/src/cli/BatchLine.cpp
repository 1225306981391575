#include "plinth/cli/BatchLine.h"

namespace Plinth {
namespace Cli {

namespace {

bool IsBlank(char c) { return c == ' ' || c == '\t'; }

// The characters a backslash escapes inside double quotes; before any other
// the backslash stays, as in the shell.
bool EscapableInDoubleQuotes(char c) { return c == '"' || c == '\\' || c == '$' || c == '`'; }

}  // namespace

std::vector<std::string> SplitBatchLine(std::string const& line) {
    std::vector<std::string> words;
    std::string word;
    bool inWord = false;
    size_t i = 0;
    while (i < line.size()) {
        char const c = line[i];
        if (IsBlank(c)) {
            if (inWord) words.push_back(std::move(word));
            word.clear();
            inWord = false;
            ++i;
        } else if (c == '#' && !inWord) {
            break;
        } else if (c == '\\') {
            if (i + 1 == line.size()) throw BatchLineError("it ends with a backslash");
            word += line[i + 1];
            inWord = true;
            i += 2;
        } else if (c == '\'') {
            size_t const close = line.find('\'', i + 1);
            if (close == std::string::npos) throw BatchLineError("the single quote is not closed");
            word.append(line, i + 1, close - i - 1);
            inWord = true;
            i = close + 1;
        } else if (c == '"') {
            for (++i;; ++i) {
                if (i == line.size()) throw BatchLineError("the double quote is not closed");
                if (line[i] == '"') break;
                if (line[i] == '\\' && i + 1 < line.size() && EscapableInDoubleQuotes(line[i + 1])) ++i;
                word += line[i];
            }
            inWord = true;
            ++i;
        } else {
            word += c;
            inWord = true;
            ++i;
        }
    }
    if (inWord) words.push_back(std::move(word));
    return words;
}

}  // namespace Cli
}  // namespace Plinth
