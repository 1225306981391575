#pragma once

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/ConnectionPoint.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The DVPort options of network ip interface add and remove; each command
// declares its own port group option.
extern const Parameter kInterfaceDvsName;
extern const Parameter kInterfaceDvPortId;

// Whether the options name exactly one connection point: the port group
// option alone, or both DVPort options. An option counts when it is given,
// with an empty value too. Otherwise reports which rule is broken and gives
// false; a port group with half a DVPort counts as no point at all.
bool NamesOneConnectionPoint(Input& input, Output& output, std::string const& portGroupOption);

// The connection point that the options name, once NamesOneConnectionPoint
// has passed: the port group, or the DVPort with the connection id that the
// port holds (set first to the current time when it holds none, and 0 when
// the port does not exist). A point that cannot be made, or that is not valid,
// is reported and gives null. A host failure of the final validity check is
// not caught here: it leaves the command.
std::unique_ptr<Gantry::Network::ConnectionPoint> MakeConnectionPoint(Input& input, Output& output,
                                                                      std::string const& portGroupOption);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
