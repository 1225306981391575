#pragma once

#include <string>

#include "gantry/network/Pnic.h"

namespace Trellis {
namespace Network {

// A physical NIC of the simulated host, made by a lookup that found it. It
// holds its name only, so that listing the NICs reads no record: a NIC
// answers nothing else yet, and what it comes to answer from its record is
// read when asked.
class PnicImpl : public virtual Gantry::Network::Pnic {
public:
    explicit PnicImpl(std::string name);
    ~PnicImpl() override;

    std::string GetName() override;

    // Whether a physical NIC of that name exists on the host.
    static bool IsValidPnic(std::string const& name);

private:
    std::string name_;
};

}  // namespace Network
}  // namespace Trellis
