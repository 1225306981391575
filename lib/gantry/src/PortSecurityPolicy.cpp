#include "gantry/network/PortSecurityPolicy.h"

namespace Gantry {
namespace Network {

PortSecurityPolicy::PortSecurityPolicy()
    : setMask(0), allowPromiscuous(false), allowMacAddressChange(false), allowForgedTransmits(false) {}

PortSecurityPolicy::~PortSecurityPolicy() = default;

void PortSecurityPolicy::SetAllowPromiscuous(bool allow) {
    allowPromiscuous = allow;
    setMask |= MASK_PROMISCUOUS;
}

void PortSecurityPolicy::SetAllowMacAddressChange(bool allow) {
    allowMacAddressChange = allow;
    setMask |= MASK_MAC_ADDRESS_CHANGE;
}

void PortSecurityPolicy::SetAllowForgedTransmits(bool allow) {
    allowForgedTransmits = allow;
    setMask |= MASK_FORGED_TRANSMITS;
}

void PortSecurityPolicy::UnsetAll() {
    setMask = 0;
}

PortSecurityPolicy PortSecurityPolicy::GetDefaultPolicy() {
    PortSecurityPolicy policy;
    policy.SetAllowPromiscuous(false);
    policy.SetAllowMacAddressChange(false);
    policy.SetAllowForgedTransmits(false);
    return policy;
}

}  // namespace Network
}  // namespace Gantry
