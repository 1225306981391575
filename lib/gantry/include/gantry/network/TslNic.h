#pragma once

#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/MacAddress.h"
#include "gantry/network/Port.h"
#include "gantry/network/TslNicTagType.h"

namespace Gantry {
namespace Network {

// A kernel network interface of the host ("tsl0"). Objects it hands out
// belong to the caller. Every operation reports failure by throwing
// GantryException.
class TslNic : public virtual Gantry::Lib::GantryObject {
public:
    // The MTUs an interface takes.
    static constexpr int MIN_MTU = 1280;
    static constexpr int MAX_MTU = 9000;

    ~TslNic() override;

    virtual std::string GetName() = 0;
    virtual MacAddress GetMacAddress() = 0;
    // Where it is attached; null when nowhere.
    virtual ConnectionPoint* GetConnectionPoint() = 0;
    virtual std::string GetNetstackInstanceKey() = 0;
    virtual int GetMtu() = 0;
    virtual void SetMtu(int mtu) = 0;
    // The TSO maximum segment size.
    virtual int GetTsoMss() = 0;
    virtual bool IsEnabled() = 0;
    virtual void Enable() = 0;
    virtual void Disable() = 0;
    // Its port on the switch; null when it has none.
    virtual Port* GetPort() = 0;
    // Deletes the interface from the host.
    virtual void Remove() = 0;
    // The last step of creating an interface.
    virtual void Activate() = 0;

    // The settings in force (under DHCP with the leased address), and as
    // configured.
    virtual IpConfig GetIpConfig() = 0;
    virtual IpConfig GetConfiguredIpConfig() = 0;
    virtual void SetIpConfig(IpConfig config) = 0;

    virtual std::vector<TslNicTagType> GetTags() = 0;
    virtual void AddTag(TslNicTagType tag, bool persistOnly) = 0;
    virtual void RemoveTag(TslNicTagType tag) = 0;
};

}  // namespace Network
}  // namespace Gantry
