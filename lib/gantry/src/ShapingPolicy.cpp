#include "gantry/network/ShapingPolicy.h"

namespace Gantry {
namespace Network {

ShapingPolicy::ShapingPolicy() : enabled(false), peakBps(0), averageBps(0), burstSize(0), setMask(0) {}

void ShapingPolicy::SetEnabled(bool enable) {
    enabled = enable;
    setMask |= MASK_ENABLED;
}

void ShapingPolicy::SetAverageBps(unsigned long long bps) {
    averageBps = bps;
    setMask |= MASK_AVERAGE_BPS;
}

void ShapingPolicy::SetPeakBps(unsigned long long bps) {
    peakBps = bps;
    setMask |= MASK_PEAK_BPS;
}

void ShapingPolicy::SetBurstSize(unsigned long long bytes) {
    burstSize = bytes;
    setMask |= MASK_BURST_SIZE;
}

void ShapingPolicy::UnsetAll() {
    setMask = 0;
}

ShapingPolicy ShapingPolicy::GetDefaultPolicy() {
    ShapingPolicy policy;
    policy.SetEnabled(false);
    policy.SetAverageBps(100000ULL * 1000);  // 100000 Kbps
    policy.SetPeakBps(100000ULL * 1000);
    policy.SetBurstSize(102400ULL << 7);  // 102400 Kib of 128 bytes
    return policy;
}

bool operator==(ShapingPolicy const& a, ShapingPolicy const& b) {
    return a.enabled == b.enabled && a.peakBps == b.peakBps && a.averageBps == b.averageBps &&
           a.burstSize == b.burstSize && a.setMask == b.setMask;
}

}  // namespace Network
}  // namespace Gantry
