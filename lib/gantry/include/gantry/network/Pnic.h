#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/MacAddress.h"
#include "gantry/network/PciDevice.h"
#include "gantry/network/PnicInfo.h"
#include "gantry/network/PnicParams.h"

namespace Gantry {
namespace Network {

// One physical NIC of the host ("pnet0"): every device request of the NIC
// commands is one operation of it. An object from a lookup belongs to the
// caller, who deletes it through its virtual destructor. Every operation
// reports failure by throwing GantryException.
class Pnic : public virtual Gantry::Lib::GantryObject {
public:
    ~Pnic() override;

    // The device name, such as "pnet0".
    virtual std::string GetName() = 0;
    // The PCI device behind the NIC, owned by the caller; null for a NIC
    // without one (a pseudo NIC).
    virtual PciDevice* GetPciDevice() = 0;
    // 1 full duplex; any other value reads as half (0 while there is no link).
    virtual int GetDuplex() = 0;
    // Whether a link is detected: the NIC is up and has a link partner.
    virtual bool IsLinkUp() = 0;
    virtual bool IsLinkStatusUp() = 0;
    virtual bool IsAdminUp() = 0;
    // Mbps; 0 while there is no link.
    virtual unsigned int GetSpeed() = 0;
    // Forces the link to speed and duplex (1 full, 2 half); speed 0 with
    // duplex 0 turns autonegotiation on.
    virtual void SetSpeedDuplex(unsigned int speed, int duplex) = 0;
    virtual std::string GetDriverName() = 0;
    virtual MacAddress GetMacAddress() = 0;
    virtual void SetAdminUp(bool up) = 0;
    virtual int GetMtu() = 0;
    virtual void GetPnicInfo(PnicInfo& info) = 0;
    virtual void GetPauseParams(PnicPauseParams& params) = 0;
    virtual void GetCoalesceParams(PnicCoalesceParams& params) = 0;
    // Fills the maxima (presets) and the current sizes in one call.
    virtual void GetRingParams(PnicRingParams& preset, PnicRingParams& current) = 0;
    virtual void GetOffloadParams(PnicOffloadParams& params) = 0;
    virtual void GetSoftwareParams(PnicSoftwareParams& params) = 0;
    virtual void GetDriverInfo(PnicDriverInfo& info) = 0;
    // Applies the settings whose change markers are set.
    virtual void SetPnicInfo(PnicInfo const& info) = 0;
    virtual void SetPauseParams(PnicPauseParams const& params) = 0;
    virtual void SetCoalesceParams(PnicCoalesceParams const& params) = 0;
    // Applies the rings whose mask bits are set.
    virtual void SetRingParams(PnicRingParams const& params) = 0;
    // Applies the offloads whose mask bits are set.
    virtual void SetOffloadParams(PnicOffloadParams const& params) = 0;
    // Applies the features whose mask bits are set.
    virtual void SetSoftwareParams(PnicSoftwareParams const& params) = 0;
    // The device registers, one 32-bit value each.
    virtual void GetRegisterDump(std::vector<std::uint32_t>& registers) = 0;
    // EEPROM bytes from offset; length 0 reads to the end.
    virtual void GetEepromDump(std::vector<unsigned char>& bytes, unsigned int length, unsigned int offset) = 0;
    // Writes one double word at offset, guarded by the device's magic key.
    virtual void SetEepromValue(unsigned int magic, unsigned int offset, unsigned int value) = 0;
    // Writes the EEPROM from the content of the file, which the operation
    // reads itself.
    virtual void SetEepromFromFile(unsigned int magic, std::string fileName) = 0;
    // online: only the tests that do not interrupt normal operation.
    virtual void RunSelfTest(PnicSelfTestResult& result, bool online) = 0;
    // Restarts N-Way negotiation on the link.
    virtual void RestartNegotiation() = 0;
};

}  // namespace Network
}  // namespace Gantry
