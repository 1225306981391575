#pragma once

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The form of an interface name that add and remove accept: tsl0 to tsl255.
inline constexpr const char* kInterfaceNamePattern = "tsl([0-9]|[1-9][0-9]|1[0-9][0-9]|2[0-4][0-9]|25[0-5])";

// The interface of that name; null after reporting "Unable to find a Tessel
// interface with the name <name>". Host failures are thrown.
std::unique_ptr<Gantry::Network::TslNic> FindInterface(Trellis::Network::TesselNicInfoImpl& nicInfo, Output& output,
                                                       std::string const& name);

// The interfaces that a command showing addresses or settings works on: the
// one named, else those of the netstack, else (both empty) all of them. An
// unknown name is reported as FindInterface does and gives false. Host
// failures are thrown.
bool SelectInterfaces(Trellis::Network::TesselNicInfoImpl& nicInfo, Output& output, std::string const& name,
                      std::string const& netstack, OwnedVector<Gantry::Network::TslNic>& nics);

// The first of the interfaces whose name is exactly name, or null.
Gantry::Network::TslNic* InterfaceNamed(OwnedVector<Gantry::Network::TslNic> const& nics, std::string const& name);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
