#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "gantry/network/PnicParams.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The steps that the offload commands (cso, tso, sg) share over one value,
// PnicOffloadParams; each command keeps its own parameters and texts.

// One structure of a get's list: the NIC's name and its offload settings.
typedef std::function<boost::shared_ptr<MetaStruct>(std::string const& nic,
                                                    Gantry::Network::PnicOffloadParams const& offloads)>
    OffloadEntry;

// "on" or "off".
std::string OnOff(bool enabled);

// get: a list of shape with one entry for the NIC that pnet names, or for
// every NIC in the host's order. An unknown NIC is reported; a failure of any
// NIC ends the listing.
void ListOffloadSettings(Trellis::Network::NetworkInfoImpl& networkInfo, Input const& input, Output& output,
                         Parameter const& pnet, boost::shared_ptr<MetaStruct> shape, OffloadEntry const& entry);

// set: the NIC that pnet names takes the value of enable (not 0: on) in the
// settings of mask, stored in fields; its other settings go back as read.
// Delivers the unset boolean.
void SetOffloadSetting(Trellis::Network::NetworkInfoImpl& networkInfo, Input const& input, Output& output,
                       Parameter const& pnet, Parameter const& enable, std::uint8_t mask,
                       std::vector<bool Gantry::Network::PnicOffloadParams::*> const& fields);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
