#pragma once

// A port in use on a switch, standard or distributed: one record per
// connected client (a kernel interface, a VM's adapter) and per uplink that
// has a port of its own. A switch's used ports are its client ports plus its
// uplinks.

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// What is connected to a port.
enum class PortClientKind { TesselNic, VmAdapter, Uplink };
inline constexpr const char* kPortClientKindWords[] = {"tesselNic", "vmAdapter", "uplink"};

// The port's counters. Of the packets of each direction, the multicast and
// broadcast ones are a part: they never add up to more than the packets.
struct PortStatsRecord {
    std::uint64_t bytesSent = 0;
    std::uint64_t bytesReceived = 0;
    std::uint64_t packetsSent = 0;
    std::uint64_t multicastSent = 0;
    std::uint64_t broadcastSent = 0;
    std::uint64_t packetsReceived = 0;
    std::uint64_t multicastReceived = 0;
    std::uint64_t broadcastReceived = 0;
    std::uint64_t transmitDropped = 0;
    std::uint64_t receiveDropped = 0;

    Json ToJson() const;
    static PortStatsRecord FromJson(const JsonReader& in);
};

// One filter of the port on one path (reversePath: the transmit path as the
// VM sees it), with its counters; the last five only with extendedCounters.
struct PortFilterRecord {
    std::string name;
    std::string groupName;
    bool active = false;
    bool reversePath = false;
    bool extendedCounters = false;
    std::uint64_t counters[8] = {};  // in, out, dropped, filtered, faulted, queued, injected, errors

    Json ToJson() const;
    static PortFilterRecord FromJson(const JsonReader& in);
};

// The counters of one VLAN on an uplink's port.
struct VlanCounterRecord {
    int vlanId = 0;
    std::uint64_t rxPackets = 0;
    std::uint64_t txPackets = 0;
};

struct PortRecord {
    static constexpr const char* kKind = "port";

    std::string name;  // the port id in decimal: the key
    std::int64_t id = 0;
    std::string portset;    // the switch the port is on
    std::string portGroup;  // the port group, on a standard switch (none for an uplink)
    std::string dvPort;     // the DVPort, on a distributed switch
    PortClientKind clientKind = PortClientKind::TesselNic;
    // The client: a kernel interface ("tsl0"), a VM's adapter as the VM's
    // name, a point and the adapter ("web01.eth0"), or an uplink's NIC.
    std::string clientName;
    std::int64_t worldId = 0;  // the VM that owns the port; 0 for none
    std::vector<std::string> macAddresses;
    std::string ipv4Address;  // empty for none
    std::string teamUplink;   // the NIC carrying the port's traffic
    PortStatsRecord stats;
    std::vector<PortFilterRecord> filters;
    // An uplink's counters per active VLAN, in the order of their ids; none
    // while their collection is off.
    std::optional<std::vector<VlanCounterRecord>> vlanStats;

    std::string Parent() const { return portset; }
    Json ToJson() const;  // without the name
    static PortRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
