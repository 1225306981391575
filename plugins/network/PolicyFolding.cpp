#include "PolicyFolding.h"

#include <algorithm>
#include <cstdint>

#include "PolicyParameters.h"
#include "UplinkList.h"
#include "gantry/network/LinkCriteriaSelectionPolicy.h"
#include "gantry/network/TeamPolicyType.h"
#include "trellis/network/PnicImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::LinkCriteriaSelectionPolicy;
using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;
using Gantry::Network::TeamPolicyType;

namespace {

bool Contains(std::vector<std::string> const& names, std::string const& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

// Appends to ordered each name of the list that is a known NIC connected to
// the switch, and reports each other one. unknownNicText names the list.
void AppendUsableUplinks(std::string const& list, std::string const& unknownNicText,
                         std::vector<std::string> const& connected, Output& output, std::vector<std::string>& ordered) {
    for (std::string const& name : SplitUplinks(list)) {
        if (!Trellis::Network::PnicImpl::IsValidPnic(name)) {
            output.SetError(unknownNicText + name);
        } else if (!Contains(connected, name)) {
            output.SetError("NIC is not connected to the vswitch : " + name);
        } else {
            ordered.push_back(name);
        }
    }
}

// Only active uplinks were given: the present standby names, less those now
// active, follow them. A present active count outside the present order
// (negative, or the whole order active) leaves no standby part.
void AppendPresentStandby(NicTeamingPolicy const& reference, std::vector<std::string>& ordered) {
    std::vector<std::string> present = reference.uplinkOrder;
    std::int32_t activeCount = reference.maxActiveUplinks;
    if (activeCount < 0 || static_cast<std::size_t>(activeCount) >= present.size()) return;

    std::vector<std::string> standby(present.begin() + activeCount, present.end());
    standby.erase(std::remove_if(standby.begin(), standby.end(),
                                 [&ordered](std::string const& name) { return Contains(ordered, name); }),
                  standby.end());
    ordered.insert(ordered.end(), standby.begin(), standby.end());
}

// Only standby uplinks were given: the present active names, less those now
// standby, stay in front of them and keep being active. A negative present
// active count leaves no active part.
void PrependPresentActive(NicTeamingPolicy const& reference, NicTeamingPolicy& policy,
                          std::vector<std::string>& ordered) {
    std::vector<std::string> present = reference.uplinkOrder;
    std::int32_t count = reference.maxActiveUplinks;
    for (std::size_t position = 0; static_cast<std::int64_t>(position) < count && position < present.size();) {
        if (Contains(ordered, present[position])) {
            present.erase(present.begin() + position);
            --count;
        } else {
            ++position;
        }
    }
    policy.SetMaxActiveUplinks(count);

    std::size_t kept = count < 0 ? 0 : static_cast<std::size_t>(count);
    if (kept < present.size()) present.resize(kept);
    present.insert(present.end(), ordered.begin(), ordered.end());
    ordered = present;
}

bool HasDuplicate(std::vector<std::string> names) {
    std::sort(names.begin(), names.end());
    return std::adjacent_find(names.begin(), names.end()) != names.end();
}

}  // namespace

void SetFailoverPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output, NicTeamingPolicy& policy,
                       NicTeamingPolicy& reference, std::vector<std::string> const& connected) {
    if (input->HasParameter(kLoadBalancing)) {
        std::string word = input->GetString(kLoadBalancing);
        if (word == "portid") {
            policy.SetTeamingPolicy(TeamPolicyType::OriginatingPort);
        } else if (word == "iphash") {
            policy.SetTeamingPolicy(TeamPolicyType::IpHash);
        } else if (word == "mac") {
            policy.SetTeamingPolicy(TeamPolicyType::SourceMac);
        } else if (word == "explicit") {
            policy.SetTeamingPolicy(TeamPolicyType::ExplicitOrder);
        } else {
            output->SetError("Unknown Load Balancing policy: " + word);
        }
    }

    if (input->HasParameter(kFailureDetection)) {
        std::string word = input->GetString(kFailureDetection);
        LinkCriteriaSelectionPolicy criteria;
        // SetBeacon's argument has the opposite sense of its name.
        if (word == "link") {
            criteria.SetBeacon(true);
        } else if (word == "beacon") {
            criteria.SetBeacon(false);
        } else {
            output->SetError("Unknown failure detection type " + word);
        }
        policy.SetLinkCriteria(criteria);
    }

    if (input->HasParameter(kNotifySwitches)) {
        policy.SetNotifySwitchOnFailure(input->GetBool(kNotifySwitches));
    }
    if (input->HasParameter(kFailback)) {
        policy.SetRollingRestoration(!input->GetBool(kFailback));
    }

    bool activeGiven = input->HasParameter(kActiveUplinks);
    bool standbyGiven = input->HasParameter(kStandbyUplinks);
    std::vector<std::string> ordered;

    if (activeGiven) {
        AppendUsableUplinks(input->GetString(kActiveUplinks), "Unknown NIC name in active uplinks : ", connected,
                            *output, ordered);
        int activeCount = static_cast<int>(ordered.size());
        if (!standbyGiven) AppendPresentStandby(reference, ordered);
        policy.SetMaxActiveUplinks(activeCount);
        reference.SetMaxActiveUplinks(activeCount);
    }

    if (standbyGiven) {
        AppendUsableUplinks(input->GetString(kStandbyUplinks), "Unknown NIC name in standby uplinks : ", connected,
                            *output, ordered);
        if (!activeGiven) PrependPresentActive(reference, policy, ordered);
    }

    if (!activeGiven && !standbyGiven) return;
    if (HasDuplicate(ordered)) {
        output->SetError("some NICs appear in the input for more than once.");
        return;
    }
    policy.SetUplinkOrder(ordered);
}

void SetSecurityPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> /*output*/,
                       PortSecurityPolicy& policy) {
    if (input->HasParameter(kAllowPromiscuous)) {
        policy.SetAllowPromiscuous(input->GetBool(kAllowPromiscuous));
    }
    if (input->HasParameter(kAllowMacChange)) {
        policy.SetAllowMacAddressChange(input->GetBool(kAllowMacChange));
    }
    if (input->HasParameter(kAllowForgedTransmits)) {
        policy.SetAllowForgedTransmits(input->GetBool(kAllowForgedTransmits));
    }
}

void SetShapingPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output, ShapingPolicy& policy,
                      bool requireAll) {
    bool enabledNow = false;
    if (input->HasParameter(kShapingEnabled)) {
        enabledNow = input->GetBool(kShapingEnabled);
        policy.SetEnabled(enabledNow);
    }
    if (!policy.enabled) return;

    // The values are positive 64-bit numbers; the unit conversions wrap in
    // unsigned 64-bit arithmetic rather than overflow.
    auto given = [&input](Parameter const& number) { return static_cast<std::uint64_t>(input->GetLongLong(number)); };
    bool reportMissing = requireAll || enabledNow;

    if (input->HasParameter(kAvgBandwidth)) {
        policy.SetAverageBps(given(kAvgBandwidth) * 1000);
    } else if (reportMissing) {
        output->SetError("Missing required parameter --avg-bandwidth");
    }
    if (input->HasParameter(kPeakBandwidth)) {
        policy.SetPeakBps(given(kPeakBandwidth) * 1000);
    } else if (reportMissing) {
        output->SetError("Missing required parameter --peak-bandwidth");
    }
    if (input->HasParameter(kBurstSize)) {
        policy.SetBurstSize(given(kBurstSize) << 7);
    } else if (reportMissing) {
        output->SetError("Missing required parameter --burst-size");
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
