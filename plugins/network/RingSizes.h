#pragma once

#include "CommandSupport.h"
#include "gantry/network/NetworkInfo.h"

namespace KorvexCli {
namespace NetworkNamespace {

// Which of the two values of GetRingParams a ring get shows.
enum class RingSizes { Preset, Current };

// The steps of ring preset get and ring current get: the NIC that nicName
// names (unknown: "NIC with name X not found"), its ring sizes of the kind
// chosen, delivered in entry, a fresh RingInfo structure.
void ShowRingSizes(Gantry::Network::NetworkInfo& networkInfo, Input const& input, Output& output,
                   Parameter const& nicName, boost::shared_ptr<MetaStruct> entry, RingSizes sizes);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
