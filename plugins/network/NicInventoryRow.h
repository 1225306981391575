#pragma once

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"

namespace KorvexCli {
namespace NetworkNamespace {

// Fills the fields that nic list and sriovnic list show of a NIC, asking the
// NIC in the order of their steps: name, PCI device ("Pseudo" and "Unknown
// Unknown" for a NIC without one), driver, link, then Admin Status and Link
// Status when withStates, speed, duplex, MAC address, MTU, description.
void FillNicInventoryRow(MetaStruct& row, Gantry::Network::Pnic& nic, bool withStates);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
