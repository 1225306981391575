#include "trellis/network/PciDeviceImpl.h"

#include <utility>

#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetAddressString("PciDevice::GetAddressString");
const Trellis::Host::Operation kGetVendorName("PciDevice::GetVendorName");
const Trellis::Host::Operation kGetDeviceName("PciDevice::GetDeviceName");
}  // namespace

PciDeviceImpl::PciDeviceImpl(std::string address, std::string vendorName, std::string deviceName)
    : address_(std::move(address)), vendorName_(std::move(vendorName)), deviceName_(std::move(deviceName)) {}

PciDeviceImpl::~PciDeviceImpl() {}

std::string PciDeviceImpl::GetAddressString() {
    kGetAddressString.Check();
    return address_;
}

std::string PciDeviceImpl::GetVendorName() {
    kGetVendorName.Check();
    return vendorName_;
}

std::string PciDeviceImpl::GetDeviceName() {
    kGetDeviceName.Check();
    return deviceName_;
}

}  // namespace Network
}  // namespace Trellis
