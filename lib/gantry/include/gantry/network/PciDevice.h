#pragma once

#include <string>

#include "gantry/lib/GantryObject.h"

namespace Gantry {
namespace Network {

// The PCI device behind a NIC. Owned by whoever asked Pnic::GetPciDevice.
class PciDevice : public virtual Gantry::Lib::GantryObject {
public:
    ~PciDevice() override;

    // "0000:03:00.0"
    virtual std::string GetAddressString() = 0;
    virtual std::string GetVendorName() = 0;
    virtual std::string GetDeviceName() = 0;
};

}  // namespace Network
}  // namespace Gantry
