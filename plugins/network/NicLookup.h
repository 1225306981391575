#pragma once

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The NIC parameter of nic get, set, up and down.
extern const Parameter kNicToConfigure;

// The NIC of that name; null after reporting "There is no pnic with name
// <name>". Host failures are thrown.
std::unique_ptr<Gantry::Network::Pnic> FindPnic(Trellis::Network::NetworkInfoImpl& networkInfo, Output& output,
                                                std::string const& name);

// The steps of nic up and nic down, which differ only in the state asked
// for: the NIC brought up (true) or down (false), true delivered.
void ChangeNicAdminState(Trellis::Network::NetworkInfoImpl& networkInfo, boost::shared_ptr<Input> input,
                         boost::shared_ptr<Output> output, bool up);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
