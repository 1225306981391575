#pragma once

#include <cstdint>

namespace Gantry {
namespace Network {

// The traffic shaping policy of a switch or a port group: a plain value.
// Bandwidths are in bits per second, the burst size in bytes. setMask says
// which settings are set at this level; the fields are read directly.
class ShapingPolicy {
public:
    static constexpr std::uint32_t MASK_PEAK_BPS = 0x01;
    static constexpr std::uint32_t MASK_AVERAGE_BPS = 0x02;
    static constexpr std::uint32_t MASK_BURST_SIZE = 0x04;
    static constexpr std::uint32_t MASK_ENABLED = 0x08;

    // Nothing set, disabled, all values 0.
    ShapingPolicy();

    // Each setter sets its field and its bit in setMask.
    void SetEnabled(bool enable);
    void SetAverageBps(unsigned long long bps);
    void SetPeakBps(unsigned long long bps);
    void SetBurstSize(unsigned long long bytes);
    // Clears setMask only.
    void UnsetAll();

    // The policy of a new standard switch, every setting set: disabled, with
    // the values that apply once shaping is enabled: 100000 Kbps average and
    // peak, a burst of 102400 Kib.
    static ShapingPolicy GetDefaultPolicy();

    bool enabled;
    std::uint64_t peakBps;
    std::uint64_t averageBps;
    std::uint64_t burstSize;
    std::uint32_t setMask;
};

bool operator==(ShapingPolicy const& a, ShapingPolicy const& b);
inline bool operator!=(ShapingPolicy const& a, ShapingPolicy const& b) { return !(a == b); }

}  // namespace Network
}  // namespace Gantry
