#pragma once

#include <string>

#include "gantry/network/Pnic.h"

namespace Trellis {
namespace Network {

// A physical NIC of the simulated host, made by a lookup that found it or as
// a handle on a name. It holds its name only, so that making it reads
// nothing: what it answers beyond its name is read when asked.
class PortImpl;

class PnicImpl : public virtual Gantry::Network::Pnic {
public:
    explicit PnicImpl(std::string name);
    ~PnicImpl() override;

    std::string GetName() override;
    // The NIC's own port on the switch it is an uplink of, owned by the
    // caller; throws GantryException when it has none.
    PortImpl* GetUplinkPort();

    // Whether a physical NIC of that name exists on the host.
    static bool IsValidPnic(std::string const& name);

private:
    std::string name_;
};

}  // namespace Network
}  // namespace Trellis
