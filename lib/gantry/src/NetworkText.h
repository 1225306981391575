#pragma once

#include <string>

namespace Gantry {
namespace Network {

// Splits "address/prefix" text. The prefix must be plain decimal digits
// without sign, blanks or leading zeros, at most maxPrefix. False for text
// without exactly one '/' or with a bad prefix; the address part is not
// checked here.
bool SplitNetworkText(std::string const& text, unsigned int maxPrefix, std::string& address,
                      unsigned int& prefixLength);

}  // namespace Network
}  // namespace Gantry
