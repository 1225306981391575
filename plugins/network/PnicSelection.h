#pragma once

#include <string>

#include "CommandSupport.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/Pnic.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The NICs a listing works on: the one that the parameter nameParameter
// names, or every NIC in the host's order when it is not given. A name the
// host does not have is reported as unknownNic followed by the name and
// " not found" (each command keeps its own first words), and gives false.
bool SelectPnics(Gantry::Network::NetworkInfo& networkInfo, Input const& input, Output& output,
                 std::string const& nameParameter, std::string const& unknownNic,
                 OwnedVector<Gantry::Network::Pnic>& nics);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
