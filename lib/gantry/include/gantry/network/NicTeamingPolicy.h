#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "gantry/network/LinkCriteriaSelectionPolicy.h"
#include "gantry/network/TeamPolicyType.h"

namespace Gantry {
namespace Network {

// The NIC teaming (failover) policy of a switch or a port group. setMask says
// which settings are set at this level; the others follow the parent. The
// fields are public and read directly; their order is fixed.
class NicTeamingPolicy {
public:
    static constexpr std::uint32_t MASK_TEAM_POLICY = 0x01;
    static constexpr std::uint32_t MASK_RESERVED0 = 0x02;
    static constexpr std::uint32_t MASK_NOTIFY_SWITCH = 0x04;
    static constexpr std::uint32_t MASK_LINK_CRITERIA = 0x08;
    static constexpr std::uint32_t MASK_UPLINK_ORDER = 0x10;
    static constexpr std::uint32_t MASK_ROLLING_RESTORATION = 0x20;
    static constexpr std::uint32_t MASK_MAX_ACTIVE_UPLINKS = 0x40;

    // Nothing set: every field zero, false or empty.
    NicTeamingPolicy();
    virtual ~NicTeamingPolicy();
    NicTeamingPolicy(NicTeamingPolicy const&) = default;
    NicTeamingPolicy& operator=(NicTeamingPolicy const&) = default;

    // Each setter sets its field and its bit in setMask.
    void SetTeamingPolicy(TeamPolicyType type);
    void SetLinkCriteria(LinkCriteriaSelectionPolicy const& criteria);
    void SetNotifySwitchOnFailure(bool notify);
    void SetRollingRestoration(bool rolling);
    void SetUplinkOrder(std::vector<std::string> const& order);
    void SetMaxActiveUplinks(int count);
    // Clears setMask only: the values stay, but nothing counts as set.
    void UnsetAll();

    // The policy of a new standard switch, every setting set: originating
    // port balancing, link state detection, notify switches, failback (no
    // rolling restoration), no uplinks in the order and none active.
    static NicTeamingPolicy GetDefaultPolicy();

    std::uint32_t setMask;
    TeamPolicyType teamPolicy;
    bool reserved0;  // only copied; its bit is MASK_RESERVED0
    bool notifySwitchOnFailure;
    // True: a NIC that comes back is not used again at once. The user's
    // "failback" is its negation.
    bool rollingRestoration;
    LinkCriteriaSelectionPolicy linkCriteria;
    std::uint32_t reserved1;  // only copied
    // Active uplinks first, then the standby ones.
    std::vector<std::string> uplinkOrder;
    // How many leading names of uplinkOrder are active.
    std::int32_t maxActiveUplinks;
};

bool operator==(NicTeamingPolicy const& a, NicTeamingPolicy const& b);
inline bool operator!=(NicTeamingPolicy const& a, NicTeamingPolicy const& b) { return !(a == b); }

}  // namespace Network
}  // namespace Gantry
