#pragma once

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The NIC parameter of nic vlan stats get and set.
extern const Parameter kVlanStatsNicName;

// How the search for a NIC's switch ended.
enum class UplinkSearch { Found, NotFound, OutOfMemory };

// The first switch, in the host's order, that has the NIC of exactly that
// name as an uplink, made as a standard or distributed switch object in
// found. OutOfMemory when a switch object could not be made. Host failures
// are thrown.
UplinkSearch FindUplinkSwitch(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, std::string const& nicName,
                              std::unique_ptr<Trellis::Network::PortsetImpl>& found);

// What both commands report for a NIC that no switch has as an uplink.
std::string NotAnUplinkText(std::string const& nicName);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
