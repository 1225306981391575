#pragma once

#include <cstdint>

namespace Gantry {
namespace Network {

// The security policy of a switch or a port group. setMask says which
// settings are set at this level; the fields are read directly.
class PortSecurityPolicy {
public:
    static constexpr std::uint32_t MASK_PROMISCUOUS = 0x01;
    static constexpr std::uint32_t MASK_MAC_ADDRESS_CHANGE = 0x02;
    static constexpr std::uint32_t MASK_FORGED_TRANSMITS = 0x04;

    // Nothing set, everything refused.
    PortSecurityPolicy();
    virtual ~PortSecurityPolicy();
    PortSecurityPolicy(PortSecurityPolicy const&) = default;
    PortSecurityPolicy& operator=(PortSecurityPolicy const&) = default;

    // Each setter sets its field and its bit in setMask.
    void SetAllowPromiscuous(bool allow);
    void SetAllowMacAddressChange(bool allow);
    void SetAllowForgedTransmits(bool allow);
    // Clears setMask only.
    void UnsetAll();

    // The policy of a new standard switch: all three set, all refused.
    static PortSecurityPolicy GetDefaultPolicy();

    std::uint32_t setMask;
    bool allowPromiscuous;
    bool allowMacAddressChange;
    bool allowForgedTransmits;
};

}  // namespace Network
}  // namespace Gantry
