#include "NicInventoryRow.h"

#include <memory>
#include <string>

#include "gantry/network/PciDevice.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const char* UpOrDown(bool up) { return up ? "Up" : "Down"; }

}  // namespace

void FillNicInventoryRow(MetaStruct& row, Gantry::Network::Pnic& nic, bool withStates) {
    row.SetField("Name", nic.GetName());
    std::string address = "Pseudo", vendor = "Unknown", device = "Unknown";
    std::unique_ptr<Gantry::Network::PciDevice> pciDevice(nic.GetPciDevice());
    if (pciDevice) {
        address = pciDevice->GetAddressString();
        vendor = pciDevice->GetVendorName();
        device = pciDevice->GetDeviceName();
    }
    row.SetField("PCI Device", address);
    row.SetField("Driver", nic.GetDriverName());
    row.SetField("Link", UpOrDown(nic.IsLinkUp()));
    if (withStates) {
        row.SetField("Admin Status", UpOrDown(nic.IsAdminUp()));
        row.SetField("Link Status", UpOrDown(nic.IsLinkStatusUp()));
    }
    row.SetField("Speed", nic.GetSpeed());
    row.SetField("Duplex", nic.GetDuplex() == 1 ? "Full" : "Half");
    row.SetField("MAC Address", nic.GetMacAddress().GetStringAddress());
    row.SetField("MTU", nic.GetMtu());
    row.SetField("Description", vendor + " " + device);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
