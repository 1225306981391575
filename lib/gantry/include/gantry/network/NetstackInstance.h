#pragma once

#include <string>

#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Network {

// A netstack instance: a network stack of the kernel with its own interfaces
// and routes, by key. The maximum connections and the IPv6 switch are taken
// into force only when the instance is created in the kernel. The bool of the
// setters asks for the change to be kept in the configuration; the simulated
// host always keeps it. Every operation reports failure by throwing
// GantryException.
class NetstackInstance : public virtual Gantry::Lib::GantryObject {
public:
    // GetState of an instance that exists in the kernel; 0 otherwise.
    static constexpr int STATE_IN_KERNEL = 0x1234;

    ~NetstackInstance() override;

    virtual std::string GetKey() = 0;
    virtual std::string GetName() = 0;
    virtual void SetName(std::string const& name, bool persist) = 0;
    virtual int GetMaxConnections() = 0;
    virtual void SetMaxConnections(int maxConnections, bool persist) = 0;
    virtual int GetCurrentMaxConnections() = 0;
    virtual std::string GetCongestionControlAlgorithm() = 0;
    virtual void SetCongestionControlAlgorithm(std::string const& algorithm, bool persist) = 0;
    virtual bool GetIpv6Enabled() = 0;
    virtual bool GetCurrentIpv6Enabled() = 0;
    virtual void SetIpv6Enabled(bool enabled, bool persist) = 0;
    virtual int GetState() = 0;
    // Creates the instance in the kernel, taking the configured values into
    // force; or takes it out.
    virtual void Enable() = 0;
    virtual void Disable() = 0;
};

}  // namespace Network
}  // namespace Gantry
