#include "NetworkText.h"

#include <algorithm>
#include <cctype>

namespace Gantry {
namespace Network {

bool SplitNetworkText(std::string const& text, unsigned int maxPrefix, std::string& address,
                      unsigned int& prefixLength) {
    std::string::size_type slash = text.find('/');
    if (slash == std::string::npos || text.find('/', slash + 1) != std::string::npos)
        return false;
    std::string digits = text.substr(slash + 1);
    bool allDigits = std::all_of(digits.begin(), digits.end(),
                                 [](unsigned char c) { return std::isdigit(c) != 0; });
    // Three digits cover every prefix length and keep stoul from overflowing.
    if (digits.empty() || digits.size() > 3 || !allDigits || (digits.size() > 1 && digits[0] == '0'))
        return false;
    unsigned int value = static_cast<unsigned int>(std::stoul(digits));
    if (value > maxPrefix)
        return false;
    address = text.substr(0, slash);
    prefixLength = value;
    return true;
}

}  // namespace Network
}  // namespace Gantry
