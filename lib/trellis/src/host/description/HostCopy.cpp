#include "host/description/HostCopy.h"

#include <arpa/inet.h>

#include <algorithm>
#include <cstdio>
#include <optional>

namespace Trellis {
namespace Host {

namespace {

// More digits than this make no number a copy could count on: such a name
// takes a suffix like any other.
constexpr std::size_t kMaxDigits = 15;

struct Numbered {
    std::string stem;
    std::string digits;
};

std::optional<Numbered> SplitTrailingNumber(const std::string& name) {
    std::size_t stemEnd = name.find_last_not_of("0123456789") + 1;  // 0 when it is all digits
    std::size_t digits = name.size() - stemEnd;
    if (digits == 0 || digits > kMaxDigits) return std::nullopt;
    return Numbered{name.substr(0, stemEnd), name.substr(stemEnd)};
}

}  // namespace

std::string HostCopy::Name(const std::string& family, const std::string& name) {
    std::optional<Numbered> numbered = SplitTrailingNumber(name);
    if (!numbered) return index_ == 0 ? name : name + "-" + std::to_string(index_);
    const std::int64_t number = std::stoll(numbered->digits);
    const auto key = std::make_pair(family, numbered->stem);
    if (index_ == 0) {
        Span& span = spans_.emplace(key, Span{number, number}).first->second;
        span.min = std::min(span.min, number);
        span.max = std::max(span.max, number);
        return name;
    }
    const Span& span = spans_.at(key);  // every name was met in copy 0
    std::string digits = std::to_string(number + index_ * (span.max - span.min + 1));
    if (digits.size() < numbered->digits.size()) digits.insert(0, numbered->digits.size() - digits.size(), '0');
    return numbered->stem + digits;
}

}  // namespace Host
}  // namespace Trellis

namespace Trellis {
namespace Host {

std::string HostCopy::Mac(const std::string& mac) const {
    unsigned int octets[6] = {};
    if (std::sscanf(mac.c_str(), "%2x:%2x:%2x:%2x:%2x:%2x", &octets[0], &octets[1], &octets[2], &octets[3],
                    &octets[4], &octets[5]) != 6)
        return mac;
    unsigned int device =
        ((octets[3] << 16) | (octets[4] << 8) | octets[5]) + static_cast<unsigned int>(index_) * 0x100;
    char text[18];
    std::snprintf(text, sizeof text, "%02x:%02x:%02x:%02x:%02x:%02x", octets[0], octets[1], octets[2],
                  (device >> 16) & 0xff, (device >> 8) & 0xff, device & 0xff);
    return text;
}

std::string HostCopy::Ipv4(const std::string& address) const {
    in_addr parsed{};
    if (inet_pton(AF_INET, address.c_str(), &parsed) != 1) return address;
    const std::uint32_t value = (10u << 24) | ((static_cast<std::uint32_t>(index_) & 0xffff) << 8) |
                                (ntohl(parsed.s_addr) & 0xff);
    return std::to_string(value >> 24) + "." + std::to_string((value >> 16) & 0xff) + "." +
           std::to_string((value >> 8) & 0xff) + "." + std::to_string(value & 0xff);
}

std::string HostCopy::Ipv6(const std::string& network) const {
    const std::size_t slash = network.find('/');
    const std::string address = network.substr(0, slash);
    in6_addr parsed{};
    if (inet_pton(AF_INET6, address.c_str(), &parsed) != 1) return network;
    parsed.s6_addr[4] = static_cast<unsigned char>((index_ >> 8) & 0xff);
    parsed.s6_addr[5] = static_cast<unsigned char>(index_ & 0xff);
    char text[INET6_ADDRSTRLEN];
    inet_ntop(AF_INET6, &parsed, text, sizeof text);
    return std::string(text) + (slash == std::string::npos ? "" : network.substr(slash));
}

}  // namespace Host
}  // namespace Trellis
