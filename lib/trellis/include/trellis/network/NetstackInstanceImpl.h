#pragma once

#include <optional>
#include <string>
#include <vector>

#include "gantry/network/NetstackInstance.h"
#include "trellis/host/records/NetstackRecord.h"

namespace Trellis {
namespace Host {
class Operation;
}  // namespace Host

namespace Network {

// A netstack instance of the simulated host. Made on values (a new instance
// for NetworkInfoImpl::AddNetstackInstance), it answers from them and is not
// on the host; made by a lookup, it answers from the snapshot of its record,
// and its changing operations re-read and write the record in one
// transaction.
class NetstackInstanceImpl : public virtual Gantry::Network::NetstackInstance {
public:
    // The simulated host has no use for the flag and the last number.
    NetstackInstanceImpl(std::string const& key, unsigned int maxConnections, std::string congestionControl,
                         bool flag, unsigned int reserved);
    explicit NetstackInstanceImpl(Trellis::Host::NetstackRecord snapshot);
    ~NetstackInstanceImpl() override;

    // The congestion control algorithms the host offers: "newreno", "cubic".
    static std::vector<std::string> GetCongestionControlAlgorithmList();

    std::string GetKey() override;
    std::string GetName() override;
    void SetName(std::string const& name, bool persist) override;
    int GetMaxConnections() override;
    // Refuses a limit outside 1 to 1000000.
    void SetMaxConnections(int maxConnections, bool persist) override;
    int GetCurrentMaxConnections() override;
    std::string GetCongestionControlAlgorithm() override;
    // Refuses an algorithm the host does not offer.
    void SetCongestionControlAlgorithm(std::string const& algorithm, bool persist) override;
    bool GetIpv6Enabled() override;
    bool GetCurrentIpv6Enabled() override;
    void SetIpv6Enabled(bool enabled, bool persist) override;
    int GetState() override;
    void Enable() override;
    void Disable() override;

    // The values it was made with or read (for AddNetstackInstance).
    Trellis::Host::NetstackRecord const& Snapshot() const { return snapshot_; }

private:
    template <class Change>
    void Update(Trellis::Host::Operation const& operation, Change&& change);

    Trellis::Host::NetstackRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
