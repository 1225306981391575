#include "host/records/IpText.h"

#include <arpa/inet.h>

namespace Trellis {
namespace Host {

namespace {

bool IsCanonicalAddress(int family, const std::string& text) {
    unsigned char binary[16];
    char printed[INET6_ADDRSTRLEN];
    return inet_pton(family, text.c_str(), binary) == 1 &&
           inet_ntop(family, binary, printed, sizeof printed) != nullptr && text == printed;
}

bool IsCanonicalNetwork(int family, unsigned maxPrefix, const std::string& text) {
    auto slash = text.find('/');
    if (slash == std::string::npos) return false;
    std::string prefix = text.substr(slash + 1);
    if (prefix.empty() || prefix.size() > 3 || (prefix.size() > 1 && prefix[0] == '0')) return false;
    for (char c : prefix)
        if (c < '0' || c > '9') return false;
    return std::stoul(prefix) <= maxPrefix && IsCanonicalAddress(family, text.substr(0, slash));
}

}  // namespace

bool IsCanonicalIpv4Address(const std::string& text) { return IsCanonicalAddress(AF_INET, text); }
bool IsCanonicalIpv6Address(const std::string& text) { return IsCanonicalAddress(AF_INET6, text); }
bool IsCanonicalIpv4Network(const std::string& text) { return IsCanonicalNetwork(AF_INET, 32, text); }
bool IsCanonicalIpv6Network(const std::string& text) { return IsCanonicalNetwork(AF_INET6, 128, text); }

}  // namespace Host
}  // namespace Trellis
