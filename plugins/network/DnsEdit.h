#pragma once

#include <functional>

#include "CommandSupport.h"
#include "trellis/network/DnsConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The steps that the four DNS edits share: the configuration of the chosen
// netstack (made before the guarded block, so that a netstack the host lacks
// escapes), then edit and SaveConfig in one guarded block, then true. A
// GantryException is reported with its text and the answer is true all the
// same, though nothing was changed. An edit that reports a fault of its own
// returns false: the command then ends without a result.
void RunDnsEdit(Input const& input, Output& output,
                std::function<bool(Trellis::Network::DnsConfigImpl&)> const& edit);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
