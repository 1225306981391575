#include "gantry/network/NicTeamingPolicy.h"

namespace Gantry {
namespace Network {

NicTeamingPolicy::NicTeamingPolicy()
    : setMask(0),
      teamPolicy(static_cast<TeamPolicyType>(0)),
      reserved0(false),
      notifySwitchOnFailure(false),
      rollingRestoration(false),
      reserved1(0),
      maxActiveUplinks(0) {}

NicTeamingPolicy::~NicTeamingPolicy() = default;

void NicTeamingPolicy::SetTeamingPolicy(TeamPolicyType type) {
    teamPolicy = type;
    setMask |= MASK_TEAM_POLICY;
}

void NicTeamingPolicy::SetLinkCriteria(LinkCriteriaSelectionPolicy const& criteria) {
    linkCriteria = criteria;
    setMask |= MASK_LINK_CRITERIA;
}

void NicTeamingPolicy::SetNotifySwitchOnFailure(bool notify) {
    notifySwitchOnFailure = notify;
    setMask |= MASK_NOTIFY_SWITCH;
}

void NicTeamingPolicy::SetRollingRestoration(bool rolling) {
    rollingRestoration = rolling;
    setMask |= MASK_ROLLING_RESTORATION;
}

void NicTeamingPolicy::SetUplinkOrder(std::vector<std::string> const& order) {
    uplinkOrder = order;
    setMask |= MASK_UPLINK_ORDER;
}

void NicTeamingPolicy::SetMaxActiveUplinks(int count) {
    maxActiveUplinks = count;
    setMask |= MASK_MAX_ACTIVE_UPLINKS;
}

void NicTeamingPolicy::UnsetAll() {
    setMask = 0;
}

NicTeamingPolicy NicTeamingPolicy::GetDefaultPolicy() {
    NicTeamingPolicy policy;
    policy.SetTeamingPolicy(TeamPolicyType::OriginatingPort);
    policy.SetLinkCriteria(LinkCriteriaSelectionPolicy());
    policy.SetNotifySwitchOnFailure(true);
    policy.SetRollingRestoration(false);
    policy.SetUplinkOrder({});
    policy.SetMaxActiveUplinks(0);
    policy.setMask |= MASK_RESERVED0;
    return policy;
}

bool operator==(NicTeamingPolicy const& a, NicTeamingPolicy const& b) {
    return a.setMask == b.setMask && a.teamPolicy == b.teamPolicy && a.reserved0 == b.reserved0 &&
           a.notifySwitchOnFailure == b.notifySwitchOnFailure &&
           a.rollingRestoration == b.rollingRestoration && a.linkCriteria == b.linkCriteria &&
           a.reserved1 == b.reserved1 && a.uplinkOrder == b.uplinkOrder &&
           a.maxActiveUplinks == b.maxActiveUplinks;
}

}  // namespace Network
}  // namespace Gantry
