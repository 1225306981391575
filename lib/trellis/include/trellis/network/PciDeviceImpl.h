#pragma once

#include <string>

#include "gantry/network/PciDevice.h"

namespace Trellis {
namespace Network {

// The PCI device of a NIC, as read with the NIC: it answers without host I/O.
class PciDeviceImpl : public virtual Gantry::Network::PciDevice {
public:
    PciDeviceImpl(std::string address, std::string vendorName, std::string deviceName);
    ~PciDeviceImpl() override;

    std::string GetAddressString() override;
    std::string GetVendorName() override;
    std::string GetDeviceName() override;

private:
    std::string address_;
    std::string vendorName_;
    std::string deviceName_;
};

}  // namespace Network
}  // namespace Trellis
