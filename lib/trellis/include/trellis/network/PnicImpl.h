#pragma once

#include <string>

#include "gantry/network/Pnic.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Network {

// A physical NIC of the simulated host. Holds the snapshot of its record
// taken by the lookup that made it.
class PnicImpl : public virtual Gantry::Network::Pnic {
public:
    explicit PnicImpl(Trellis::Host::PnicRecord snapshot);
    ~PnicImpl() override;

    std::string GetName() override;

    // Whether a physical NIC of that name exists on the host.
    static bool IsValidPnic(std::string const& name);

private:
    Trellis::Host::PnicRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
