// The JSON form of stored policies: an object per policy holding only the
// settings that are set at this level, so the setMask is the set of keys.

#include <cstdint>
#include <limits>

#include <nlohmann/json.hpp>

#include "trellis/host/records/StoredPolicies.h"

namespace Trellis {
namespace Host {

namespace {

using Gantry::Network::LinkCriteriaSelectionPolicy;
using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Gantry::Network::TeamPolicyType;

// The words of TeamPolicyType 1 to 4, as the host prints them.
constexpr const char* kLoadBalancingWords[] = {"iphash", "srcmac", "srcport", "explicit"};
constexpr const char* kFailureDetectionWords[] = {"link", "beacon"};

bool IsSet(std::uint32_t mask, std::uint32_t bit) { return (mask & bit) != 0; }

// A bandwidth or burst size: the host keeps what a get can show as a signed
// 64-bit number.
std::uint64_t ReadShapingValue(const JsonReader& in, const char* key) {
    return static_cast<std::uint64_t>(in.Int(key, 0, INT64_MAX));
}

Json TeamingToJson(const NicTeamingPolicy& policy) {
    Json out = Json::object();
    const std::uint32_t mask = policy.setMask;
    if (IsSet(mask, NicTeamingPolicy::MASK_TEAM_POLICY)) {
        auto value = static_cast<std::uint32_t>(policy.teamPolicy);
        // The host refuses other values before they are stored.
        out["loadBalancing"] = kLoadBalancingWords[value - 1];
    }
    if (IsSet(mask, NicTeamingPolicy::MASK_LINK_CRITERIA))
        out["failureDetection"] = policy.linkCriteria.IsBeaconDetection() ? "beacon" : "link";
    if (IsSet(mask, NicTeamingPolicy::MASK_NOTIFY_SWITCH)) out["notifySwitches"] = policy.notifySwitchOnFailure;
    if (IsSet(mask, NicTeamingPolicy::MASK_ROLLING_RESTORATION))
        out["rollingRestoration"] = policy.rollingRestoration;
    if (IsSet(mask, NicTeamingPolicy::MASK_UPLINK_ORDER)) out["uplinkOrder"] = policy.uplinkOrder;
    if (IsSet(mask, NicTeamingPolicy::MASK_MAX_ACTIVE_UPLINKS)) out["maxActiveUplinks"] = policy.maxActiveUplinks;
    return out;
}

NicTeamingPolicy TeamingFromJson(const JsonReader& in) {
    NicTeamingPolicy policy;
    if (!in.IsPresent()) return policy;
    in.ExpectObject();
    if (in.Member("loadBalancing").IsPresent())
        policy.SetTeamingPolicy(static_cast<TeamPolicyType>(in.Word<std::size_t>("loadBalancing", kLoadBalancingWords) + 1));
    if (in.Member("failureDetection").IsPresent()) {
        LinkCriteriaSelectionPolicy criteria;  // link state detection
        if (in.Word<std::size_t>("failureDetection", kFailureDetectionWords) == 1)
            criteria.SetBeacon(false);
        policy.SetLinkCriteria(criteria);
    }
    if (in.Member("notifySwitches").IsPresent()) policy.SetNotifySwitchOnFailure(in.Bool("notifySwitches"));
    if (in.Member("rollingRestoration").IsPresent()) policy.SetRollingRestoration(in.Bool("rollingRestoration"));
    if (in.Member("uplinkOrder").IsPresent()) policy.SetUplinkOrder(in.StringArray("uplinkOrder"));
    if (in.Member("maxActiveUplinks").IsPresent())
        policy.SetMaxActiveUplinks(static_cast<int>(in.Int("maxActiveUplinks", std::numeric_limits<std::int32_t>::min(),
                                                           std::numeric_limits<std::int32_t>::max())));
    in.RejectUnknownMembers();
    return policy;
}

Json SecurityToJson(const PortSecurityPolicy& policy) {
    Json out = Json::object();
    if (IsSet(policy.setMask, PortSecurityPolicy::MASK_PROMISCUOUS)) out["allowPromiscuous"] = policy.allowPromiscuous;
    if (IsSet(policy.setMask, PortSecurityPolicy::MASK_MAC_ADDRESS_CHANGE))
        out["allowMacAddressChange"] = policy.allowMacAddressChange;
    if (IsSet(policy.setMask, PortSecurityPolicy::MASK_FORGED_TRANSMITS))
        out["allowForgedTransmits"] = policy.allowForgedTransmits;
    return out;
}

PortSecurityPolicy SecurityFromJson(const JsonReader& in) {
    PortSecurityPolicy policy;
    if (!in.IsPresent()) return policy;
    in.ExpectObject();
    if (in.Member("allowPromiscuous").IsPresent()) policy.SetAllowPromiscuous(in.Bool("allowPromiscuous"));
    if (in.Member("allowMacAddressChange").IsPresent())
        policy.SetAllowMacAddressChange(in.Bool("allowMacAddressChange"));
    if (in.Member("allowForgedTransmits").IsPresent()) policy.SetAllowForgedTransmits(in.Bool("allowForgedTransmits"));
    in.RejectUnknownMembers();
    return policy;
}

Json ShapingToJson(const ShapingPolicy& policy) {
    Json out = Json::object();
    if (IsSet(policy.setMask, ShapingPolicy::MASK_ENABLED)) out["enabled"] = policy.enabled;
    if (IsSet(policy.setMask, ShapingPolicy::MASK_AVERAGE_BPS)) out["averageBps"] = policy.averageBps;
    if (IsSet(policy.setMask, ShapingPolicy::MASK_PEAK_BPS)) out["peakBps"] = policy.peakBps;
    if (IsSet(policy.setMask, ShapingPolicy::MASK_BURST_SIZE)) out["burstSize"] = policy.burstSize;
    return out;
}

ShapingPolicy ShapingFromJson(const JsonReader& in) {
    ShapingPolicy policy;
    if (!in.IsPresent()) return policy;
    in.ExpectObject();
    if (in.Member("enabled").IsPresent()) policy.SetEnabled(in.Bool("enabled"));
    if (in.Member("averageBps").IsPresent()) policy.SetAverageBps(ReadShapingValue(in, "averageBps"));
    if (in.Member("peakBps").IsPresent()) policy.SetPeakBps(ReadShapingValue(in, "peakBps"));
    if (in.Member("burstSize").IsPresent()) policy.SetBurstSize(ReadShapingValue(in, "burstSize"));
    in.RejectUnknownMembers();
    return policy;
}

}  // namespace

Json StoredPolicies::ToJson() const {
    return Json{{"teaming", TeamingToJson(teaming)},
                {"security", SecurityToJson(security)},
                {"shaping", ShapingToJson(shaping)}};
}

StoredPolicies StoredPolicies::FromJson(const JsonReader& in) {
    StoredPolicies policies;
    if (!in.IsPresent()) return policies;
    in.ExpectObject();
    policies.teaming = TeamingFromJson(in.Member("teaming"));
    policies.security = SecurityFromJson(in.Member("security"));
    policies.shaping = ShapingFromJson(in.Member("shaping"));
    in.RejectUnknownMembers();
    return policies;
}

}  // namespace Host
}  // namespace Trellis
