#pragma once

// How a simulated NIC behaves as a device: the rules its setters apply to
// the stored NIC, shared by the operations of PnicImpl. Each refuses by
// throwing GantryException before it changes anything.

#include <string>

#include "gantry/network/PnicInfo.h"
#include "gantry/network/PnicParams.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Network {
namespace PnicDevice {

// The stored NIC of that name; refuses an unknown one with "Physical NIC X
// does not exist".
Trellis::Host::PnicRecord RequireNic(Trellis::Host::Transaction const& t, std::string const& name);

// "Physical NIC pnet0 " with the name as a message may show it.
std::string Subject(Trellis::Host::PnicRecord const& nic);

// The link runs at the best mode it advertises (the highest speed, full
// duplex before half); with none advertised it keeps its speed.
void Negotiate(Trellis::Host::PnicRecord& nic);
// speed 0 with duplex 0: autonegotiation on; else a supported mode, forced.
void ForceSpeedDuplex(Trellis::Host::PnicRecord& nic, unsigned int speed, int duplex);
// The settings whose change markers are set.
void ApplyInfo(Trellis::Host::PnicRecord& nic, Gantry::Network::PnicInfo const& info);
void ApplyPause(Trellis::Host::PnicRecord& nic, Gantry::Network::PnicPauseParams const& params);
void ApplyRings(Trellis::Host::PnicRecord& nic, Gantry::Network::PnicRingParams const& params);
void ApplyOffloads(Trellis::Host::PnicRecord& nic, Gantry::Network::PnicOffloadParams const& params);
void ApplySoftware(Trellis::Host::PnicRecord& nic, Gantry::Network::PnicSoftwareParams const& params);

// The value of a NIC as its getters fill it.
void FillInfo(Trellis::Host::PnicRecord const& nic, Gantry::Network::PnicInfo& info);
void FillPause(Trellis::Host::PnicRecord const& nic, Gantry::Network::PnicPauseParams& params);
void FillSoftware(Trellis::Host::PnicRecord const& nic, Gantry::Network::PnicSoftwareParams& params);

}  // namespace PnicDevice
}  // namespace Network
}  // namespace Trellis
