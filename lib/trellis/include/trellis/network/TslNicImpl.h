#pragma once

#include <string>
#include <vector>

#include "gantry/network/TslNic.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Host {
class Operation;
class Transaction;
}  // namespace Host

namespace Network {

// A kernel interface of the simulated host. Its getters answer from the
// snapshot of its record taken by the lookup that made it; its changing
// operations re-read and write the stored record in one transaction and then
// refresh the snapshot.
class TslNicImpl : public virtual Gantry::Network::TslNic {
public:
    explicit TslNicImpl(Trellis::Host::TslNicRecord snapshot);
    ~TslNicImpl() override;

    std::string GetName() override;
    Gantry::Network::MacAddress GetMacAddress() override;
    Gantry::Network::ConnectionPoint* GetConnectionPoint() override;
    std::string GetNetstackInstanceKey() override;
    int GetMtu() override;
    // Refuses an MTU outside MIN_MTU..MAX_MTU.
    void SetMtu(int mtu) override;
    int GetTsoMss() override;
    bool IsEnabled() override;
    void Enable() override;
    void Disable() override;
    Gantry::Network::Port* GetPort() override;
    // Deletes the interface and frees its port.
    void Remove() override;
    void Activate() override;

    Gantry::Network::IpConfig GetIpConfig() override;
    Gantry::Network::IpConfig GetConfiguredIpConfig() override;
    void SetIpConfig(Gantry::Network::IpConfig config) override;

    std::vector<Gantry::Network::TslNicTagType> GetTags() override;
    // Refuses an unknown tag; a tag the interface has already is kept once.
    void AddTag(Gantry::Network::TslNicTagType tag, bool persistOnly) override;
    // Refuses a tag the interface does not carry.
    void RemoveTag(Gantry::Network::TslNicTagType tag) override;

private:
    template <class Change>
    void Update(Trellis::Host::Operation const& operation, Change&& change);

    Trellis::Host::TslNicRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
