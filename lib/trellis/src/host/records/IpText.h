#pragma once

#include <string>

namespace Trellis {
namespace Host {

// Whether text is an address or an address/prefix network of the family in
// the one canonical text form (what inet_ntop prints, a prefix without
// leading zeros), so that a stored entry compares equal to its own text.
bool IsCanonicalIpv4Address(const std::string& text);
bool IsCanonicalIpv6Address(const std::string& text);
bool IsCanonicalIpv4Network(const std::string& text);
bool IsCanonicalIpv6Network(const std::string& text);

}  // namespace Host
}  // namespace Trellis
