#pragma once

// One copy of a host, as the description sections make it for a host N times
// the size of another (haldensim init --scale N), and the names its objects
// take. Every reference of a copy resolves within that copy because each
// section renames the names it holds and the names it refers to by the same
// rule, per family of names (a record kind, or "tesselNic" and "vm" for the
// clients of ports):
//
// - A name that ends in a number is renumbered past every name of its family
//   and stem in the original, keeping at least as many digits: with "pnet0",
//   "pnet1" and "pnet2" in the original, copy 1 has "pnet3" to "pnet5" and
//   copy 2 "pnet6" to "pnet8"; "web01" becomes "web02"; a port id "33554436"
//   is a name of the empty stem.
// - Any other name gets the copy's number as a suffix: "Host Management-1".
//
// Before copy 1 the sections make copy 0, which keeps every name and only
// learns the numbers in use; what they add for it is dropped.

#include <cstdint>
#include <map>
#include <string>
#include <utility>

namespace Trellis {
namespace Host {

class ParsedDescription;

class HostCopy {
public:
    // Copies 1 to copies of original; original is not changed.
    HostCopy(const ParsedDescription& original, int copies) : original_(original), copies_(copies) {}

    // Starts copy n: 0 to learn the names, then 1 to Copies().
    void Begin(int n) { index_ = n; }
    int Index() const { return index_; }
    int Copies() const { return copies_; }
    const ParsedDescription& Original() const { return original_; }

    // The name in this copy of the object named name in the original.
    std::string Name(const std::string& family, const std::string& name);

    // Addresses of a copy, each unique to it (texts as the original's):
    // - a MAC address moves on by 256 per copy in its last three octets;
    // - an IPv4 address takes the copy's own /24 of 10.0.0.0/8: 10.<copy's
    //   number, two octets>.<its last octet>;
    // - an IPv6 address (with or without "/prefix") takes the copy's number
    //   as its third group: 2001:db8::10 becomes 2001:db8:2::10 in copy 2.
    std::string Mac(const std::string& mac) const;
    std::string Ipv4(const std::string& address) const;
    std::string Ipv6(const std::string& network) const;

private:
    struct Span {
        std::int64_t min;
        std::int64_t max;
    };

    const ParsedDescription& original_;
    int copies_;
    int index_ = 0;
    std::map<std::pair<std::string, std::string>, Span> spans_;  // by family and stem
};

}  // namespace Host
}  // namespace Trellis
