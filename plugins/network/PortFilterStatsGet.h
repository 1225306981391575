#pragma once

#include "gantry/network/FilterStats.h"
#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network port filter stats get
class PortFilterStatsGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(PortFilterStatsGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

// The order of a port's filter records: the receive path first, by agent
// (groupName) ascending in byte order, then the transmit path by agent
// descending, so that each path lists its filters in the order a packet
// meets them. Whether a stands before b.
bool sortFilterStats(Gantry::Network::FilterStats* a, Gantry::Network::FilterStats* b);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
