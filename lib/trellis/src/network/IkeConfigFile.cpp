#include "IkeConfigFile.h"

#include <sstream>

#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "util/UserFile.h"

namespace Trellis {
namespace Network {

namespace {

std::string Trim(std::string const& text) {
    std::size_t begin = text.find_first_not_of(" \t\r");
    if (begin == std::string::npos) return "";
    std::size_t end = text.find_last_not_of(" \t\r");
    return text.substr(begin, end - begin + 1);
}

// Why the text is no configuration; "" when it is one.
std::string ConfigProblem(std::string const& text) {
    std::istringstream lines(text);
    std::string line;
    int number = 0;
    int settings = 0;
    while (std::getline(lines, line)) {
        ++number;
        std::string trimmed = Trim(line);
        if (trimmed.empty() || trimmed[0] == '#') continue;
        if (trimmed.front() == '[') {
            if (trimmed.back() != ']' || Trim(trimmed.substr(1, trimmed.size() - 2)).empty())
                return "line " + std::to_string(number) + " opens a section but does not name and close it";
            continue;
        }
        std::size_t equals = trimmed.find('=');
        if (equals == std::string::npos || Trim(trimmed.substr(0, equals)).empty())
            return "line " + std::to_string(number) + " is neither a [section] nor a name = value setting";
        ++settings;
    }
    if (settings == 0) return "it holds no setting";
    return "";
}

}  // namespace

std::string ReadIkeConfig(std::string const& path, long maxSize) {
    const std::string refusal = "Unable to use the IKE configuration " + Trellis::Host::Printable(path) + ": ";
    auto refuse = [&](std::string const& reason) { throw Gantry::Lib::GantryException(refusal + reason); };
    if (path.empty()) throw Gantry::Lib::GantryException("Unable to use an IKE configuration: no path was given");
    std::string text;
    try {
        text = Trellis::Util::ReadUserFile(path, static_cast<std::size_t>(maxSize));
    } catch (const Trellis::Util::UnreadableFile& e) {
        refuse(e.what());
    }
    // Line ends and tabs are the text's own; other control characters are not.
    std::string withoutLineEnds = text;
    for (char& c : withoutLineEnds)
        if (c == '\n' || c == '\t' || c == '\r') c = ' ';
    std::string problem = Trellis::Host::TextProblem(withoutLineEnds);
    if (!problem.empty()) refuse("its text " + problem);
    problem = ConfigProblem(text);
    if (!problem.empty()) refuse(problem);
    return text;
}

}  // namespace Network
}  // namespace Trellis
