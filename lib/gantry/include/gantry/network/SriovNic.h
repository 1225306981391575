#pragma once

#include <cstdint>
#include <string>

namespace Gantry {
namespace Network {

// One virtual function of an SR-IOV NIC.
struct SriovNicVFInfo {
    int vfId = 0;
    bool active = false;
    std::string pciAddress;
    std::string ownerWorldId;  // the world of the VM that has it, "" for none
};

// The counters of one virtual function.
struct SriovNicVFStats {
    std::uint64_t rxUnicastPkts = 0;
    std::uint64_t rxUnicastBytes = 0;
    std::uint64_t rxMulticastPkts = 0;
    std::uint64_t rxMulticastBytes = 0;
    std::uint64_t rxBroadcastPkts = 0;
    std::uint64_t rxBroadcastBytes = 0;
    std::uint64_t rxOutOfBufferDrops = 0;
    std::uint64_t rxErrorDrops = 0;
    std::uint64_t rxLroPkts = 0;
    std::uint64_t rxLroBytes = 0;
    std::uint64_t txUnicastPkts = 0;
    std::uint64_t txUnicastBytes = 0;
    std::uint64_t txMulticastPkts = 0;
    std::uint64_t txMulticastBytes = 0;
    std::uint64_t txBroadcastPkts = 0;
    std::uint64_t txBroadcastBytes = 0;
    std::uint64_t txErrors = 0;
    std::uint64_t txDiscards = 0;
    std::uint64_t txTsoPkts = 0;
    std::uint64_t txTsoBytes = 0;
};

}  // namespace Network
}  // namespace Gantry
