#pragma once

#include <cstdint>

namespace Gantry {
namespace Network {

// How a NIC team detects a network outage. Beacon detection is in force
// exactly when BEACON_BIT is on in criteriaMask and off in criteriaValue;
// in every other case (an empty policy too) detection is by link state.
class LinkCriteriaSelectionPolicy {
public:
    static constexpr std::uint32_t BEACON_BIT = 0x10;

    LinkCriteriaSelectionPolicy();
    virtual ~LinkCriteriaSelectionPolicy();
    LinkCriteriaSelectionPolicy(LinkCriteriaSelectionPolicy const&) = default;
    LinkCriteriaSelectionPolicy& operator=(LinkCriteriaSelectionPolicy const&) = default;

    // Turns BEACON_BIT on in criteriaMask and sets it in criteriaValue to the
    // argument. Mind the sense: SetBeacon(true) selects link state detection
    // and SetBeacon(false) beacon detection.
    void SetBeacon(bool value);
    bool IsBeaconDetection() const;

    std::uint32_t criteriaMask;
    std::uint32_t criteriaValue;
    // Only copied.
    std::uint32_t reserved0;
    std::uint32_t reserved1;
    std::uint32_t reserved2;
};

bool operator==(LinkCriteriaSelectionPolicy const& a, LinkCriteriaSelectionPolicy const& b);
inline bool operator!=(LinkCriteriaSelectionPolicy const& a, LinkCriteriaSelectionPolicy const& b) {
    return !(a == b);
}

}  // namespace Network
}  // namespace Gantry
