#include "gantry/network/IpAddress.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <algorithm>
#include <cstdio>

#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

namespace {

bool AllZero(const std::uint8_t* begin, const std::uint8_t* end) {
    return std::all_of(begin, end, [](std::uint8_t b) { return b == 0; });
}

// glibc's inet_ntop writes an address whose first 96 bits are zero in the
// deprecated IPv4-compatible form ("::1:2" becomes "::0.1.0.2"). RFC 5952
// keeps dotted notation for IPv4-mapped addresses only, so such an address
// is written with hex groups here. Only addresses with a non-zero seventh
// group take this path: "::" and "::1" come out of inet_ntop right.
std::string FormatIpv4Compatible(const std::uint8_t* bytes) {
    unsigned int high = (bytes[12] << 8) | bytes[13];
    unsigned int low = (bytes[14] << 8) | bytes[15];
    char text[16];
    std::snprintf(text, sizeof text, "::%x:%x", high, low);
    return text;
}

}  // namespace

IpAddress::IpAddress() : family_(Family::Ipv4), bytes_{} {}

IpAddress::IpAddress(Family family, Bytes const& bytes) : family_(family), bytes_(bytes) {}

IpAddress::IpAddress(std::string const& text) : family_(Family::Ipv4), bytes_{} {
    if (Parse(Family::Ipv4, text, bytes_))
        return;
    family_ = Family::Ipv6;
    if (!Parse(Family::Ipv6, text, bytes_))
        throw Lib::GantryException("Invalid IP address: " + text);
}

IpAddress::~IpAddress() = default;

bool IpAddress::Parse(Family family, std::string const& text, Bytes& bytes) {
    // inet_pton reads a C string: an embedded NUL would hide what follows it.
    if (text.find('\0') != std::string::npos)
        return false;
    Bytes parsed{};
    int af = family == Family::Ipv4 ? AF_INET : AF_INET6;
    if (inet_pton(af, text.c_str(), parsed.data()) != 1)
        return false;
    bytes = parsed;
    return true;
}

bool IpAddress::IsUnset() const {
    return AllZero(bytes_.data(), bytes_.data() + bytes_.size());
}

std::string IpAddress::GetStringAddress() const {
    if (family_ == Family::Ipv6 && AllZero(bytes_.data(), bytes_.data() + 12) &&
        (bytes_[12] != 0 || bytes_[13] != 0))
        return FormatIpv4Compatible(bytes_.data());
    char text[INET6_ADDRSTRLEN];
    int af = family_ == Family::Ipv4 ? AF_INET : AF_INET6;
    if (inet_ntop(af, bytes_.data(), text, sizeof text) == nullptr)
        throw Lib::GantryException("Unable to format an IP address");
    return text;
}

bool operator==(IpAddress const& a, IpAddress const& b) {
    return a.family_ == b.family_ && a.bytes_ == b.bytes_;
}

}  // namespace Network
}  // namespace Gantry
