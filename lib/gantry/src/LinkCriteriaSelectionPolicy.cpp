#include "gantry/network/LinkCriteriaSelectionPolicy.h"

namespace Gantry {
namespace Network {

LinkCriteriaSelectionPolicy::LinkCriteriaSelectionPolicy()
    : criteriaMask(0), criteriaValue(0), reserved0(0), reserved1(0), reserved2(0) {}

LinkCriteriaSelectionPolicy::~LinkCriteriaSelectionPolicy() = default;

void LinkCriteriaSelectionPolicy::SetBeacon(bool value) {
    criteriaMask |= BEACON_BIT;
    if (value)
        criteriaValue |= BEACON_BIT;
    else
        criteriaValue &= ~BEACON_BIT;
}

bool LinkCriteriaSelectionPolicy::IsBeaconDetection() const {
    return (criteriaMask & BEACON_BIT) != 0 && (criteriaValue & BEACON_BIT) == 0;
}

bool operator==(LinkCriteriaSelectionPolicy const& a, LinkCriteriaSelectionPolicy const& b) {
    return a.criteriaMask == b.criteriaMask && a.criteriaValue == b.criteriaValue &&
           a.reserved0 == b.reserved0 && a.reserved1 == b.reserved1 && a.reserved2 == b.reserved2;
}

}  // namespace Network
}  // namespace Gantry
