#pragma once

// A port in use on a switch: one record per connected client port. Uplinks
// use ports too but have no record; a switch's used ports are its client
// ports plus its uplinks.

#include <cstdint>
#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// What is connected to a port.
enum class PortClientKind { TesselNic, VmAdapter };
inline constexpr const char* kPortClientKindWords[] = {"tesselNic", "vmAdapter"};

struct PortRecord {
    static constexpr const char* kKind = "port";

    std::string name;  // the port id in decimal: the key
    std::int64_t id = 0;
    std::string portset;    // the switch the port is on
    std::string portGroup;  // the port group it belongs to
    PortClientKind clientKind = PortClientKind::TesselNic;
    // The client: a kernel interface ("tsl0"), or a VM's adapter as the
    // VM's name, a point and the adapter ("web01.eth0").
    std::string clientName;

    std::string Parent() const { return portset; }
    Json ToJson() const;  // without the name
    static PortRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
