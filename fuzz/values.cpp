// The value types' parsers, and the IPv4 configuration built from them: any
// text is either taken or refused with a GantryException, and an address
// taken reads back as a text the same parser takes to the same text;
// nothing else may happen.

#include <cstddef>
#include <cstdint>
#include <string>

#include "gantry/lib/GantryException.h"
#include "gantry/network/IpAddress.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"
#include "gantry/network/MacAddress.h"

namespace {

// Parses text as T; when taken, its canonical text must parse to an equal text.
template <class T, class Text>
void RoundTrip(std::string const& text, Text canonical) {
    try {
        T value(text);
        std::string shown = canonical(value);
        T again(shown);
        if (canonical(again) != shown) __builtin_trap();
    } catch (Gantry::Lib::GantryException const&) {
    }
}

// A network is taken or refused; what it shows is its address alone.
template <class T>
void Parse(std::string const& text) {
    try {
        T(text).GetStringAddress();
    } catch (Gantry::Lib::GantryException const&) {
    }
}

// An interface's IPv4 configuration from "address/netmask", as the commands
// build one from their two options: its broadcast address follows from both.
void Ipv4Configuration(std::string const& text) {
    const std::string::size_type slash = text.find('/');
    if (slash == std::string::npos) return;
    try {
        Gantry::Network::IpConfig config;
        config.SetIpv4Address(Gantry::Network::Ipv4Address(text.substr(0, slash)));
        config.SetIpv4Netmask(Gantry::Network::Ipv4Address(text.substr(slash + 1)));
        config.GetIpv4Broadcast().GetStringAddress();
        Gantry::Network::Ipv4Network::IsValidNetmask(config.GetIpv4Netmask());
    } catch (Gantry::Lib::GantryException const&) {
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    RoundTrip<Gantry::Network::Ipv4Address>(text, [](auto& v) { return v.GetStringAddress(); });
    RoundTrip<Gantry::Network::Ipv6Address>(text, [](auto& v) { return v.GetStringAddress(); });
    RoundTrip<Gantry::Network::IpAddress>(text, [](auto& v) { return v.GetStringAddress(); });
    RoundTrip<Gantry::Network::MacAddress>(text, [](auto& v) { return v.GetStringAddress(); });
    Parse<Gantry::Network::Ipv4Network>(text);
    Parse<Gantry::Network::Ipv6Network>(text);
    Ipv4Configuration(text);
    return 0;
}
