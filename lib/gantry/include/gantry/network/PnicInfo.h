#pragma once

#include <string>
#include <vector>

namespace Gantry {
namespace Network {

// One speed and duplex a NIC can run at. Duplex: 0 auto, 1 full, 2 half.
struct PnicLinkMode {
    int speed = 0;  // Mbps
    int duplex = 0;
};

// The generic settings of a NIC, read by Pnic::GetPnicInfo and handed back to
// Pnic::SetPnicInfo, which applies only the settings whose change marker is
// set. The markers are false in a value that GetPnicInfo has filled.
//
// Port types: 0 TP, 1 AUI, 2 BNC, 3 MII, 4 FIBRE, 5 DA; a device may report
// others. Wake-on values: 0 PHY activity, 1 unicast, 2 multicast,
// 3 broadcast, 4 ARP, 5 MagicPacket, 6 SecureOn password.
struct PnicInfo {
    std::vector<int> supportedPorts;
    std::vector<PnicLinkMode> supportedLinkModes;
    bool supportsAutoNegotiation = false;
    std::vector<PnicLinkMode> advertisedLinkModes;
    bool advertisedAutoNegotiation = false;
    bool portChanged = false;
    bool phyAddressChanged = false;
    bool transceiverChanged = false;
    int port = 0;
    int phyAddress = 0;
    int transceiver = 0;  // 0 internal, 1 external
    bool autoNegotiation = false;
    bool wakeOnChanged = false;
    bool supportsWakeOn = false;
    std::vector<int> supportedWakeOn;
    std::vector<int> wakeOn;
    bool messageLevelChanged = false;
    bool supportsMessageLevel = false;
    unsigned int messageLevel = 0;
    std::string linkStatus;
};

}  // namespace Network
}  // namespace Gantry
