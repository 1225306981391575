#include "PolicyFields.h"

#include <algorithm>
#include <cstdint>

#include "gantry/network/TeamPolicyType.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Gantry::Network::TeamPolicyType;

namespace {

// The words that get commands print; two differ from those set accepts.
std::string LoadBalancingWord(TeamPolicyType type) {
    switch (type) {
    case TeamPolicyType::IpHash: return "iphash";
    case TeamPolicyType::SourceMac: return "srcmac";
    case TeamPolicyType::OriginatingPort: return "srcport";
    case TeamPolicyType::ExplicitOrder: return "explicit";
    default: return "unknown";
    }
}

bool Has(std::uint32_t mask, std::uint32_t bits) { return (mask & bits) != 0; }

// Bandwidths in Kbps, burst size in Kib: divided as signed 64-bit numbers.
long long Shown(std::uint64_t value, long long unit) { return static_cast<long long>(value) / unit; }

}  // namespace

void DeclareFailoverFields(MetaStruct& result) {
    result.SetField("Load Balancing", MetaString::New());
    result.SetField("Network Failure Detection", MetaString::New());
    result.SetField("Notify Switches", MetaBool::New());
    result.SetField("Failback", MetaBool::New());
    result.SetField("Active Adapters", MetaList::New(2));
    result.SetField("Standby Adapters", MetaList::New(2));
    result.SetField("Unused Adapters", MetaList::New(2));
}

void DeclareSecurityFields(MetaStruct& result) {
    result.SetField("Allow Promiscuous", MetaBool::New());
    result.SetField("Allow MAC Address Change", MetaBool::New());
    result.SetField("Allow Forged Transmits", MetaBool::New());
}

void DeclareShapingFields(MetaStruct& result) {
    result.SetField("Enabled", MetaBool::New());
    result.SetField("Average Bandwidth", MetaInt::New());
    result.SetField("Peak Bandwidth", MetaInt::New());
    result.SetField("Burst Size", MetaInt::New());
}

void DeclareOverrideFields(MetaStruct& result, std::vector<char const*> const& titles) {
    for (char const* title : titles) result.SetField(title, MetaBool::New());
}

void SetFailoverFields(MetaStruct& result, NicTeamingPolicy const& inForce, std::vector<std::string> const& connected) {
    std::vector<std::string> const& order = inForce.uplinkOrder;
    std::vector<std::string> active;
    std::vector<std::string> standby;
    // A negative active count shows no name in either list.
    if (inForce.maxActiveUplinks >= 0) {
        std::size_t const count = std::min(static_cast<std::size_t>(inForce.maxActiveUplinks), order.size());
        active.assign(order.begin(), order.begin() + static_cast<long>(count));
        standby.assign(order.begin() + static_cast<long>(count), order.end());
    }
    std::vector<std::string> unused;
    for (std::string const& nic : connected) {
        if (std::find(order.begin(), order.end(), nic) == order.end()) unused.push_back(nic);
    }
    result.SetField("Load Balancing", LoadBalancingWord(inForce.teamPolicy));
    result.SetField("Network Failure Detection", inForce.linkCriteria.IsBeaconDetection() ? "beacon" : "link");
    result.SetField("Notify Switches", inForce.notifySwitchOnFailure);
    result.SetField("Failback", !inForce.rollingRestoration);
    result.SetField("Active Adapters", active);
    result.SetField("Standby Adapters", standby);
    result.SetField("Unused Adapters", unused);
}

void SetSecurityFields(MetaStruct& result, PortSecurityPolicy const& inForce) {
    result.SetField("Allow Promiscuous", inForce.allowPromiscuous);
    result.SetField("Allow MAC Address Change", inForce.allowMacAddressChange);
    result.SetField("Allow Forged Transmits", inForce.allowForgedTransmits);
}

void SetShapingFields(MetaStruct& result, ShapingPolicy const& inForce) {
    result.SetField("Enabled", inForce.enabled);
    result.SetField("Average Bandwidth", inForce.enabled ? Shown(inForce.averageBps, 1000) : -1LL);
    result.SetField("Peak Bandwidth", inForce.enabled ? Shown(inForce.peakBps, 1000) : -1LL);
    result.SetField("Burst Size", inForce.enabled ? Shown(inForce.burstSize, 128) : -1LL);
}

void SetFailoverOverrides(MetaStruct& result, NicTeamingPolicy const& local) {
    std::uint32_t const mask = local.setMask;
    result.SetField("Override Vswitch Load Balancing", Has(mask, NicTeamingPolicy::MASK_TEAM_POLICY));
    result.SetField("Override Vswitch Network Failure Detection", Has(mask, NicTeamingPolicy::MASK_LINK_CRITERIA));
    result.SetField("Override Vswitch Notify Switches", Has(mask, NicTeamingPolicy::MASK_NOTIFY_SWITCH));
    result.SetField("Override Vswitch Failback", Has(mask, NicTeamingPolicy::MASK_ROLLING_RESTORATION));
    result.SetField("Override Vswitch Uplinks",
                    Has(mask, NicTeamingPolicy::MASK_MAX_ACTIVE_UPLINKS | NicTeamingPolicy::MASK_UPLINK_ORDER));
}

void SetSecurityOverrides(MetaStruct& result, PortSecurityPolicy const& local) {
    std::uint32_t const mask = local.setMask;
    result.SetField("Override Vswitch Allow Promiscuous", Has(mask, PortSecurityPolicy::MASK_PROMISCUOUS));
    result.SetField("Override Vswitch Allow MAC Address Change", Has(mask, PortSecurityPolicy::MASK_MAC_ADDRESS_CHANGE));
    result.SetField("Override Vswitch Allow Forged Transmits", Has(mask, PortSecurityPolicy::MASK_FORGED_TRANSMITS));
}

void SetShapingOverrides(MetaStruct& result, ShapingPolicy const& local) {
    std::uint32_t const mask = local.setMask;
    result.SetField("Override Vswitch Enabled", Has(mask, ShapingPolicy::MASK_ENABLED));
    result.SetField("Override Vswitch Average Bandwidth", Has(mask, ShapingPolicy::MASK_AVERAGE_BPS));
    result.SetField("Override Vswitch Peak Bandwidth", Has(mask, ShapingPolicy::MASK_PEAK_BPS));
    result.SetField("Override Vswitch Burst Size", Has(mask, ShapingPolicy::MASK_BURST_SIZE));
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
