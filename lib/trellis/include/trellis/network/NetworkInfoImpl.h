#pragma once

#include <string>
#include <vector>

#include "gantry/network/IpConnection.h"
#include "gantry/network/NetstackInstance.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/Pnic.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/SriovNic.h"

namespace Trellis {
namespace Network {

// The host's network inventory. A stack object; what it returns belongs to
// the caller. Its constructor is a host operation ("NetworkInfoImpl::NetworkInfoImpl"),
// so an armed fault makes it throw.
class NetworkInfoImpl : public virtual Gantry::Network::NetworkInfo {
public:
    NetworkInfoImpl();
    ~NetworkInfoImpl() override;

    int GetNetstackInstanceState(std::string const& key) override;

    // Every physical NIC, in the host's order.
    std::vector<Gantry::Network::Pnic*> GetPnics() override;
    // The NIC of that name, or null.
    Gantry::Network::Pnic* GetPnicByName(std::string const& name) override;
    // Every NIC with SR-IOV enabled (a physical function), in the host's order.
    std::vector<Gantry::Network::Pnic*> GetSriovNics();
    // The SR-IOV NIC of that name, or null (also for a NIC without SR-IOV).
    Gantry::Network::Pnic* GetSriovNicByName(std::string const& name);
    // One entry per virtual function of the NIC, in the order of their ids;
    // released by DeleteVector. Refuses a NIC that is no SR-IOV NIC.
    std::vector<Gantry::Network::SriovNicVFInfo*> GetSriovNicVFInfo(std::string const& nicName);
    // The counters of one virtual function. Refuses a NIC that is no SR-IOV
    // NIC and an id that is no function of it.
    void GetSriovNicVFStats(Gantry::Network::SriovNicVFStats* stats, std::string const& nicName, int vfId);
    // Stores a new instance (made on values), in the kernel unless disabled.
    // Refuses an empty key and a key the host has.
    void AddNetstackInstance(Gantry::Network::NetstackInstance* instance, bool disabled);
    // Refuses an unknown key, "defaultTcpipStack", and an instance that has
    // interfaces. The simulated host has no use for the flag.
    void RemoveNetstackInstance(std::string const& key, bool flag);
    // Every instance, in the order they were added.
    std::vector<Gantry::Network::NetstackInstance*> ListNetstackInstances();
    // The instance of that key, or null.
    Gantry::Network::NetstackInstance* LookupNetstackInstanceByKey(std::string const& key);
    // Whether IPv6 is on in the host's kernel; setting it takes effect after
    // a reboot of the host, and the simulated host reflects it at once.
    bool IsTslIpv6Enabled();
    void SetTslIpv6Enabled(bool enabled);
    // The connections of a protocol in a netstack, appended to connections in
    // the kernel's order; refuses an unknown netstack.
    void GetCurrentTcpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                        std::string const& netstackKey);
    void GetCurrentUdpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                        std::string const& netstackKey);
    void GetCurrentIpTesselConnections(std::vector<Gantry::Network::IpConnection>& connections,
                                       std::string const& netstackKey);

    // Every port group of every standard switch.
    std::vector<Gantry::Network::PortGroup*> GetAllPortGroups();
};

}  // namespace Network
}  // namespace Trellis
