#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "gantry/network/Pnic.h"
#include "gantry/network/PnicStats.h"

namespace Trellis {
namespace Host {
class Operation;
class Transaction;
struct PnicRecord;
}  // namespace Host
namespace Network {
class PortImpl;
}  // namespace Network
}  // namespace Trellis

namespace Trellis {
namespace Network {

// A physical NIC of the simulated host, made by a lookup that found it (with
// a snapshot of its record) or as a handle on a name, which reads nothing
// until its first operation. A getter answers from the snapshot, reading it
// first on a handle; a setter changes the stored NIC in one transaction and
// refreshes the snapshot. An unknown NIC fails on the first operation that
// needs its record, with "Physical NIC X does not exist".
class PnicImpl : public virtual Gantry::Network::Pnic {
public:
    explicit PnicImpl(std::string name);
    explicit PnicImpl(Trellis::Host::PnicRecord snapshot);
    ~PnicImpl() override;

    std::string GetName() override;
    Gantry::Network::PciDevice* GetPciDevice() override;
    int GetDuplex() override;
    bool IsLinkUp() override;
    bool IsLinkStatusUp() override;
    bool IsAdminUp() override;
    unsigned int GetSpeed() override;
    void SetSpeedDuplex(unsigned int speed, int duplex) override;
    std::string GetDriverName() override;
    Gantry::Network::MacAddress GetMacAddress() override;
    void SetAdminUp(bool up) override;
    int GetMtu() override;
    void GetPnicInfo(Gantry::Network::PnicInfo& info) override;
    void GetPauseParams(Gantry::Network::PnicPauseParams& params) override;
    void GetCoalesceParams(Gantry::Network::PnicCoalesceParams& params) override;
    void GetRingParams(Gantry::Network::PnicRingParams& preset, Gantry::Network::PnicRingParams& current) override;
    void GetOffloadParams(Gantry::Network::PnicOffloadParams& params) override;
    void GetSoftwareParams(Gantry::Network::PnicSoftwareParams& params) override;
    void GetDriverInfo(Gantry::Network::PnicDriverInfo& info) override;
    void SetPnicInfo(Gantry::Network::PnicInfo const& info) override;
    void SetPauseParams(Gantry::Network::PnicPauseParams const& params) override;
    void SetCoalesceParams(Gantry::Network::PnicCoalesceParams const& params) override;
    void SetRingParams(Gantry::Network::PnicRingParams const& params) override;
    void SetOffloadParams(Gantry::Network::PnicOffloadParams const& params) override;
    void SetSoftwareParams(Gantry::Network::PnicSoftwareParams const& params) override;
    void GetRegisterDump(std::vector<std::uint32_t>& registers) override;
    void GetEepromDump(std::vector<unsigned char>& bytes, unsigned int length, unsigned int offset) override;
    void SetEepromValue(unsigned int magic, unsigned int offset, unsigned int value) override;
    void SetEepromFromFile(unsigned int magic, std::string fileName) override;
    void RunSelfTest(Gantry::Network::PnicSelfTestResult& result, bool online) override;
    void RestartNegotiation() override;

    // The NIC's counters.
    void GetPnicStats(Gantry::Network::PnicStats& stats);
    // The NIC's own port on the switch it is an uplink of, owned by the
    // caller; throws GantryException when it has none.
    PortImpl* GetUplinkPort();

    // Whether a physical NIC of that name exists on the host.
    static bool IsValidPnic(std::string const& name);

private:
    // The snapshot, read inside operation's transaction on a handle, checked
    // against an armed fault of operation on a loaded object.
    Trellis::Host::PnicRecord const& Answer(Trellis::Host::Operation const& operation);
    // Reads the stored NIC, lets change alter it, stores it and keeps it as
    // the snapshot, all in one transaction of operation.
    void Change(Trellis::Host::Operation const& operation,
                std::function<void(Trellis::Host::PnicRecord&)> const& change);

    std::string name_;
    std::unique_ptr<Trellis::Host::PnicRecord> snapshot_;
};

}  // namespace Network
}  // namespace Trellis
