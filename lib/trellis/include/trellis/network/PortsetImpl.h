#pragma once

#include <string>
#include <vector>

#include "gantry/network/Portset.h"

namespace Trellis {
namespace Network {

// What every switch of the simulated host shares: its name, its ports and its
// uplinks, from the snapshot taken by the lookup that made the object. The
// used ports are counted on the host when asked.
class PortsetImpl : public virtual Gantry::Network::Portset {
public:
    ~PortsetImpl() override;

    std::string GetName() override;
    int GetNumPorts() override;
    int GetConfiguredPorts() override;
    int GetUsedPorts() override;
    std::vector<std::string> GetUplinks() override;
    std::string GetClass() override;

    // Whether a standard switch of that name exists.
    static bool IsValidVirtualSwitch(std::string const& name);

protected:
    PortsetImpl(std::string name, int numPorts, std::vector<std::string> uplinks, std::string className);

    std::string name_;
    int numPorts_;
    std::vector<std::string> uplinks_;

private:
    std::string className_;
};

}  // namespace Network
}  // namespace Trellis
