#include "IpsecValues.h"

#include <sstream>

namespace KorvexCli {
namespace NetworkNamespace {

const char* const kAnyAddress = "any";

namespace {

// The unspecified IPv6 address, which stands for any.
const char* const kUnspecifiedIpv6Address = "::";

}  // namespace

std::string AnyAsUnspecified(std::string const& text) { return text == kAnyAddress ? kUnspecifiedIpv6Address : text; }

bool ReadSpi(std::string const& text, std::uint32_t& spi) {
    std::istringstream stream(text);
    stream >> std::hex >> spi;
    return !stream.fail() && stream.eof();
}

std::string SpiText(std::uint32_t spi) {
    std::ostringstream text;
    text << "0x" << std::hex << spi;
    return text.str();
}

std::string ConvertToHrsMinsAndSecs(unsigned long long seconds) {
    if (seconds == 0) return "infinite";
    unsigned long long hours = seconds / 3600;
    unsigned long long minutes = seconds % 3600 / 60;
    seconds %= 60;
    std::string text;
    if (hours != 0) text += std::to_string(hours) + "h ";
    if (minutes != 0) text += std::to_string(minutes) + "m ";
    if (seconds != 0) text += std::to_string(seconds) + "s ";
    return text;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
