// The diagnostic operations of a NIC: registers, EEPROM, self test and
// counters.

#include <algorithm>
#include <cstdint>
#include <cstdio>

#include "PnicDevice.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/network/PnicImpl.h"
#include "util/UserFile.h"

namespace Trellis {
namespace Network {

namespace {

using Gantry::Lib::GantryException;
using Trellis::Host::Operation;
using Trellis::Host::PnicRecord;

const Operation kGetRegisterDump("Pnic::GetRegisterDump");
const Operation kGetEepromDump("Pnic::GetEepromDump");
const Operation kSetEepromValue("Pnic::SetEepromValue");
const Operation kSetEepromFromFile("Pnic::SetEepromFromFile");
const Operation kRunSelfTest("Pnic::RunSelfTest");
const Operation kGetPnicStats("PnicImpl::GetPnicStats");

constexpr std::size_t kDoubleWord = 4;

// Each counter of PnicStats, in the order of the stored counters.
constexpr std::uint64_t Gantry::Network::PnicStats::*kStatsFields[] = {
    &Gantry::Network::PnicStats::rxPackets,         &Gantry::Network::PnicStats::txPackets,
    &Gantry::Network::PnicStats::rxBytes,           &Gantry::Network::PnicStats::txBytes,
    &Gantry::Network::PnicStats::rxDropped,         &Gantry::Network::PnicStats::txDropped,
    &Gantry::Network::PnicStats::rxMulticast,       &Gantry::Network::PnicStats::rxBroadcast,
    &Gantry::Network::PnicStats::txMulticast,       &Gantry::Network::PnicStats::txBroadcast,
    &Gantry::Network::PnicStats::rxErrors,          &Gantry::Network::PnicStats::rxLengthErrors,
    &Gantry::Network::PnicStats::rxOverErrors,      &Gantry::Network::PnicStats::rxCrcErrors,
    &Gantry::Network::PnicStats::rxFrameErrors,     &Gantry::Network::PnicStats::rxFifoErrors,
    &Gantry::Network::PnicStats::rxMissedErrors,    &Gantry::Network::PnicStats::txErrors,
    &Gantry::Network::PnicStats::txAbortedErrors,   &Gantry::Network::PnicStats::txCarrierErrors,
    &Gantry::Network::PnicStats::txFifoErrors,      &Gantry::Network::PnicStats::txHeartbeatErrors,
    &Gantry::Network::PnicStats::txWindowErrors};
static_assert(std::size(kStatsFields) == std::size(Trellis::Host::kPnicCounterNames));

std::string Hex(std::uint64_t value) {
    char text[24];
    std::snprintf(text, sizeof text, "0x%llx", static_cast<unsigned long long>(value));
    return text;
}

void RequireMagic(PnicRecord const& nic, unsigned int magic) {
    if (magic != nic.eeprom.magic)
        throw GantryException("Invalid EEPROM magic " + Hex(magic) + " for physical NIC " +
                              Trellis::Host::Printable(nic.name));
}

}  // namespace

void PnicImpl::GetRegisterDump(std::vector<std::uint32_t>& registers) {
    registers = Answer(kGetRegisterDump).registers;
}

// Offsets and lengths are counted in 64 bits, so no sum of the caller's
// numbers wraps; nothing past the end is read.
void PnicImpl::GetEepromDump(std::vector<unsigned char>& bytes, unsigned int length, unsigned int offset) {
    std::string const& eeprom = Answer(kGetEepromDump).eeprom.bytes;
    const std::uint64_t size = eeprom.size();
    const std::uint64_t begin = std::min<std::uint64_t>(offset, size);
    const std::uint64_t end = length == 0 ? size : std::min<std::uint64_t>(size, std::uint64_t{offset} + length);
    bytes.assign(eeprom.begin() + static_cast<std::ptrdiff_t>(begin),
                 eeprom.begin() + static_cast<std::ptrdiff_t>(std::max(begin, end)));
}

void PnicImpl::SetEepromValue(unsigned int magic, unsigned int offset, unsigned int value) {
    Change(kSetEepromValue, [&](PnicRecord& nic) {
        RequireMagic(nic, magic);
        std::string& eeprom = nic.eeprom.bytes;
        if (std::uint64_t{offset} + kDoubleWord > eeprom.size())
            throw GantryException("EEPROM offset " + Hex(offset) + " of physical NIC " +
                                  Trellis::Host::Printable(nic.name) + " leaves no room for a double word: the EEPROM has " +
                                  std::to_string(eeprom.size()) + " bytes");
        for (std::size_t i = 0; i < kDoubleWord; ++i) eeprom[offset + i] = static_cast<char>((value >> (8 * i)) & 0xff);
    });
}

// The magic is checked before the file is opened; the file is read as a
// host tool reads what a user names (see util/UserFile).
void PnicImpl::SetEepromFromFile(unsigned int magic, std::string fileName) {
    Change(kSetEepromFromFile, [&](PnicRecord& nic) {
        RequireMagic(nic, magic);
        std::string& eeprom = nic.eeprom.bytes;
        std::string content;
        try {
            content = Trellis::Util::ReadUserFile(fileName, eeprom.size());
            if (content.empty()) throw Trellis::Util::UnreadableFile("it is empty");
        } catch (Trellis::Util::UnreadableFile const& reason) {
            throw GantryException("Unable to write the EEPROM of " + Trellis::Host::Printable(nic.name) + " from " +
                                  Trellis::Host::Quoted(fileName) + ": " + reason.what());
        }
        eeprom.replace(0, content.size(), content);
    });
}

void PnicImpl::RunSelfTest(Gantry::Network::PnicSelfTestResult& result, bool online) {
    PnicRecord const& nic = Answer(kRunSelfTest);
    result.passed = true;
    result.details.clear();
    for (Trellis::Host::PnicSelfTestRecord const& test : nic.selfTests) {
        if (online && test.offline) continue;
        result.passed = result.passed && test.passes;
        result.details.push_back(test.name + (test.offline ? " (offline): " : " (online): ") +
                                 (test.passes ? "passed" : "failed"));
    }
}

void PnicImpl::GetPnicStats(Gantry::Network::PnicStats& stats) {
    PnicRecord const& nic = Answer(kGetPnicStats);
    for (std::size_t i = 0; i < std::size(kStatsFields); ++i) stats.*kStatsFields[i] = nic.counters[i];
}

}  // namespace Network
}  // namespace Trellis
