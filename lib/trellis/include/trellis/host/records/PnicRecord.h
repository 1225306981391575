#pragma once

#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// Duplex of a link; the values are the host's (0 auto, 1 full, 2 half).
enum class PnicDuplex { Auto, Full, Half };
inline constexpr const char* kPnicDuplexWords[] = {"auto", "full", "half"};

// A physical NIC of the host ("pnet0"), as far as the switches need it and
// with the first of its driver facts. Only a NIC that has a record exists on
// the host: a switch's uplink of another name is no NIC.
struct PnicRecord {
    static constexpr const char* kKind = "pnic";

    std::string name;
    bool linkUp = false;
    std::string driver;        // "hxgbe"
    unsigned int speed = 0;    // Mbps; 0 while the link is down
    PnicDuplex duplex = PnicDuplex::Full;
    std::string macAddress;    // lower case with colons
    int mtu = 1500;
    std::string description;   // vendor and device, free text

    Json ToJson() const;
    static PnicRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
