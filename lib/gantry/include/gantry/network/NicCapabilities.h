#pragma once

namespace Gantry {
namespace Network {

// The offloads a switch may use on its uplinks.
class NicCapabilities {
public:
    // Nothing offloaded.
    NicCapabilities();

    // What a new standard switch uses: every offload.
    static NicCapabilities GetDefaultPolicy();

    bool checksumOffload;
    bool tcpSegmentationOffload;
    bool scatterGather;
    bool vlanTagOffload;
};

}  // namespace Network
}  // namespace Gantry
