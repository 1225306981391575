#include "gantry/network/MacAddress.h"

#include <algorithm>
#include <cctype>
#include <cstdio>

#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

namespace {

int HexValue(char c) {
    if (c >= '0' && c <= '9')
        return c - '0';
    c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return c >= 'a' && c <= 'f' ? c - 'a' + 10 : -1;
}

}  // namespace

MacAddress::MacAddress() : bytes_{} {}

MacAddress::MacAddress(Bytes const& bytes) : bytes_(bytes) {}

MacAddress::MacAddress(std::string const& text) : bytes_{} {
    if (!Parse(text, bytes_))
        throw Lib::GantryException("Invalid MAC address: " + text);
}

// ether_aton would do, but it takes single-digit octets ("0:1:2:3:4:5") and
// trailing text, which an interface's MAC address never has.
bool MacAddress::Parse(std::string const& text, Bytes& bytes) {
    if (text.size() != 17)
        return false;
    Bytes parsed{};
    for (std::size_t i = 0; i < parsed.size(); ++i) {
        std::size_t at = 3 * i;
        if (i > 0 && text[at - 1] != ':')
            return false;
        int high = HexValue(text[at]);
        int low = HexValue(text[at + 1]);
        if (high < 0 || low < 0)
            return false;
        parsed[i] = static_cast<std::uint8_t>(high << 4 | low);
    }
    bytes = parsed;
    return true;
}

bool MacAddress::IsValid(std::string const& text) {
    Bytes bytes;
    if (!Parse(text, bytes))
        return false;
    MacAddress address(bytes);
    return !address.IsMulticast() && !address.IsUnset();
}

bool MacAddress::IsUnset() const {
    return std::all_of(bytes_.begin(), bytes_.end(), [](std::uint8_t b) { return b == 0; });
}

std::string MacAddress::GetStringAddress() const {
    char text[18];
    std::snprintf(text, sizeof text, "%02x:%02x:%02x:%02x:%02x:%02x", bytes_[0], bytes_[1],
                  bytes_[2], bytes_[3], bytes_[4], bytes_[5]);
    return text;
}

}  // namespace Network
}  // namespace Gantry
