#include "plinth/cli/ValueParser.h"

#include <cctype>
#include <cerrno>
#include <cstdlib>

#include <boost/algorithm/string/case_conv.hpp>

namespace Plinth {
namespace Cli {

bool ParseBool(std::string const& text, bool& value) {
    std::string const word = boost::algorithm::to_lower_copy(text);
    if (word == "true" || word == "yes" || word == "1") {
        value = true;
        return true;
    }
    if (word == "false" || word == "no" || word == "0") {
        value = false;
        return true;
    }
    return false;
}

IntParse ParseInt(std::string const& text, long long& value) {
    size_t digits = (!text.empty() && (text[0] == '-' || text[0] == '+')) ? 1 : 0;
    if (digits == text.size()) return IntParse::NotANumber;
    for (size_t i = digits; i < text.size(); ++i) {
        if (!std::isdigit(static_cast<unsigned char>(text[i]))) return IntParse::NotANumber;
    }
    errno = 0;
    long long const parsed = std::strtoll(text.c_str(), nullptr, 10);
    if (errno == ERANGE) return IntParse::OutOfRange;
    value = parsed;
    return IntParse::Ok;
}

}  // namespace Cli
}  // namespace Plinth
