#include "trellis/network/IpSecConfigImpl.h"

#include <algorithm>
#include <optional>

#include "IkeConfigFile.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/IpSecRecords.h"
#include "trellis/util/Exec.h"

namespace Trellis {
namespace Network {

namespace {

using Gantry::Network::IpSecSadParam;
using Gantry::Network::IpSecSpdParam;
using Trellis::Host::IkeConfigRecord;
using Trellis::Host::IpSecSaRecord;
using Trellis::Host::IpSecSpRecord;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kConstruct("IpSecConfigImpl::IpSecConfigImpl");
const Operation kStringToIpSecMode("IpSecConfigImpl::StringToIpSecMode");
const Operation kStringToIpSecEncyptAlgo("IpSecConfigImpl::StringToIpSecEncyptAlgo");
const Operation kStringToIpSecAuthAlgo("IpSecConfigImpl::StringToIpSecAuthAlgo");
const Operation kStringToIpSecULProtoType("IpSecConfigImpl::StringToIpSecULProtoType");
const Operation kStringToIpSecDirection("IpSecConfigImpl::StringToIpSecDirection");
const Operation kStringToIpSecAction("IpSecConfigImpl::StringToIpSecAction");
const Operation kAddSADConfig("IpSecConfigImpl::AddSADConfig");
const Operation kRemoveSADConfig("IpSecConfigImpl::RemoveSADConfig");
const Operation kRemoveAutoSADConfig("IpSecConfigImpl::RemoveAutoSADConfig");
const Operation kFlushSADConfig("IpSecConfigImpl::FlushSADConfig");
const Operation kGetSADConfigList("IpSecConfigImpl::GetSADConfigList");
const Operation kAddSPDConfig("IpSecConfigImpl::AddSPDConfig");
const Operation kRemoveSPDConfig("IpSecConfigImpl::RemoveSPDConfig");
const Operation kFlushSPDConfig("IpSecConfigImpl::FlushSPDConfig");
const Operation kGetSPDConfigList("IpSecConfigImpl::GetSPDConfigList");
const Operation kCheckIKEConfig("IpSecConfigImpl::CheckIKEConfig");
const Operation kCopyIKEConfig("IpSecConfigImpl::CopyIKEConfig");
const Operation kRestartIKEDaemons("IpSecConfigImpl::RestartIKEDaemons");

// The daemons' restart, as the host runs it.
constexpr const char* kRestartCommand = "/etc/init.d/iked restart";

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

template <class Enum>
Enum FromText(Operation const& operation, std::vector<std::string> const& table, std::string const& text,
              const char* what) {
    operation.Check();
    if (text.empty()) return static_cast<Enum>(0);
    auto found = std::find(table.begin(), table.end(), text);
    if (found == table.end()) Refuse("Invalid " + std::string(what) + " " + Trellis::Host::Printable(text));
    return static_cast<Enum>(found - table.begin());
}

// A key is ASCII text of the algorithm's length in bytes, or twice as many
// hex digits, with or without "0x".
bool KeyFits(std::string const& key, std::size_t bytes) {
    if (key.size() == bytes) return true;
    std::string digits = key.rfind("0x", 0) == 0 ? key.substr(2) : key;
    return digits.size() == 2 * bytes && digits.find_first_not_of("0123456789abcdefABCDEF") == std::string::npos;
}

void CheckKey(std::string const& key, std::size_t bytes, std::string const& algorithm, std::string const& refusal) {
    if (bytes == 0) {
        if (!key.empty()) Refuse(refusal + "the algorithm " + algorithm + " takes no key");
        return;
    }
    if (!KeyFits(key, bytes))
        Refuse(refusal + "the algorithm " + algorithm + " takes a key of " + std::to_string(bytes) + " bytes (" +
               std::to_string(bytes) + " characters, or " + std::to_string(2 * bytes) + " hex digits)");
}

IpSecSadParam ParamOf(IpSecSaRecord const& record) {
    IpSecSadParam param;
    param.name = record.saName;
    param.srcAddress = Gantry::Network::Ipv6Address(record.srcAddress);
    param.dstAddress = Gantry::Network::Ipv6Address(record.dstAddress);
    param.spi = record.spi;
    param.mode = static_cast<Gantry::Network::IpSecMode>(record.mode);
    param.encryptionAlgorithm = static_cast<Gantry::Network::IpSecEncryptAlgo>(record.encryptionAlgorithm);
    param.encryptionKey = record.encryptionKey;
    param.integrityAlgorithm = static_cast<Gantry::Network::IpSecAuthAlgo>(record.integrityAlgorithm);
    param.integrityKey = record.integrityKey;
    param.state = static_cast<Gantry::Network::IpSecSaState>(record.state);
    param.lifetime = record.lifetime;
    return param;
}

IpSecSpdParam ParamOf(IpSecSpRecord const& record) {
    IpSecSpdParam param;
    param.name = record.name;
    param.saName = record.saName;
    param.srcAddress = Gantry::Network::Ipv6Address(record.srcAddress);
    param.dstAddress = Gantry::Network::Ipv6Address(record.dstAddress);
    param.srcPrefixLength = record.srcPrefixLength;
    param.dstPrefixLength = record.dstPrefixLength;
    param.srcPort = record.srcPort;
    param.dstPort = record.dstPort;
    param.protocol = static_cast<Gantry::Network::IpSecULProtoType>(record.protocol);
    param.direction = static_cast<Gantry::Network::IpSecDirection>(record.direction);
    param.action = static_cast<Gantry::Network::IpSecAction>(record.action);
    param.mode = static_cast<Gantry::Network::IpSecMode>(record.mode);
    return param;
}

}  // namespace

const std::vector<std::string> IpSecConfigImpl::SA_MODE = {"any", "transport", "tunnel"};
const std::vector<std::string> IpSecConfigImpl::SA_ENCPT_ALG = {"null", "3des-cbc", "aes128-cbc"};
const std::vector<std::string> IpSecConfigImpl::SA_AUTH_ALG = {"none", "hmac-sha1", "hmac-sha2-256"};
const std::vector<std::string> IpSecConfigImpl::SA_STATE = {"larval", "mature", "dying", "dead"};
const std::vector<std::string> IpSecConfigImpl::SP_UL_PROTO_TYPE = {"any", "tcp", "udp", "icmp6"};
const std::vector<std::string> IpSecConfigImpl::SP_DIRECTION = {"none", "in", "out"};
const std::vector<std::string> IpSecConfigImpl::SP_ACTION = {"none", "discard", "ipsec"};

IpSecConfigImpl::IpSecConfigImpl() { kConstruct.Check(); }

IpSecConfigImpl::~IpSecConfigImpl() {}

Gantry::Network::IpSecMode IpSecConfigImpl::StringToIpSecMode(std::string const& text) const {
    return FromText<Gantry::Network::IpSecMode>(kStringToIpSecMode, SA_MODE, text, "IPsec mode");
}

Gantry::Network::IpSecEncryptAlgo IpSecConfigImpl::StringToIpSecEncyptAlgo(std::string const& text) const {
    return FromText<Gantry::Network::IpSecEncryptAlgo>(kStringToIpSecEncyptAlgo, SA_ENCPT_ALG, text,
                                                        "encryption algorithm");
}

Gantry::Network::IpSecAuthAlgo IpSecConfigImpl::StringToIpSecAuthAlgo(std::string const& text) const {
    return FromText<Gantry::Network::IpSecAuthAlgo>(kStringToIpSecAuthAlgo, SA_AUTH_ALG, text, "integrity algorithm");
}

Gantry::Network::IpSecULProtoType IpSecConfigImpl::StringToIpSecULProtoType(std::string const& text) const {
    return FromText<Gantry::Network::IpSecULProtoType>(kStringToIpSecULProtoType, SP_UL_PROTO_TYPE, text,
                                                        "upper layer protocol");
}

Gantry::Network::IpSecDirection IpSecConfigImpl::StringToIpSecDirection(std::string const& text) const {
    return FromText<Gantry::Network::IpSecDirection>(kStringToIpSecDirection, SP_DIRECTION, text, "flow direction");
}

Gantry::Network::IpSecAction IpSecConfigImpl::StringToIpSecAction(std::string const& text) const {
    return FromText<Gantry::Network::IpSecAction>(kStringToIpSecAction, SP_ACTION, text, "policy action");
}

void IpSecConfigImpl::AddSADConfig(IpSecSadParam const& param) {
    kAddSADConfig.Write([&](Transaction& t) {
        const std::string refusal = "Unable to add security association " + Trellis::Host::Printable(param.name) + ": ";
        if (param.name.empty()) Refuse("Unable to add a security association: its name must not be empty");
        std::string problem = Trellis::Host::TextProblem(param.name);
        if (!problem.empty()) Refuse(refusal + "its name " + problem);
        IpSecSaRecord record;
        record.saName = param.name;
        record.srcAddress = param.srcAddress.GetStringAddress();
        record.dstAddress = param.dstAddress.GetStringAddress();
        record.spi = param.spi;
        record.mode = static_cast<int>(param.mode);
        record.encryptionAlgorithm = static_cast<int>(param.encryptionAlgorithm);
        record.encryptionKey = param.encryptionKey;
        record.integrityAlgorithm = static_cast<int>(param.integrityAlgorithm);
        record.integrityKey = param.integrityKey;
        record.state = 1;  // mature: a configured association is in use at once
        record.lifetime = param.lifetime;
        record.name = IpSecSaRecord::KeyOf(record.saName, record.srcAddress, record.dstAddress, record.spi);
        if (t.Contains<IpSecSaRecord>(record.name)) Refuse(refusal + "an association of that name exists already");
        for (IpSecSaRecord const& other : t.List<IpSecSaRecord>())
            if (other.srcAddress == record.srcAddress && other.dstAddress == record.dstAddress && other.spi == record.spi)
                Refuse(refusal + "association " + (other.saName.empty() ? std::string("(automatic)") : other.saName) +
                       " has the same source, destination and SPI");
        static const std::size_t kEncryptionBytes[] = {0, 24, 16};
        static const std::size_t kIntegrityBytes[] = {0, 20, 32};
        CheckKey(record.encryptionKey, kEncryptionBytes[record.encryptionAlgorithm],
                 SA_ENCPT_ALG[record.encryptionAlgorithm], refusal);
        CheckKey(record.integrityKey, kIntegrityBytes[record.integrityAlgorithm],
                 SA_AUTH_ALG[record.integrityAlgorithm], refusal);
        t.Put(record);
    });
}

void IpSecConfigImpl::RemoveSADConfig(std::string name) {
    kRemoveSADConfig.Write([&](Transaction& t) {
        std::optional<IpSecSaRecord> sa = name.empty() ? std::nullopt : t.Find<IpSecSaRecord>(name);
        if (!sa || sa->saName.empty())
            Refuse("Unable to remove security association " + Trellis::Host::Printable(name) + ": there is none of that name");
        t.Erase<IpSecSaRecord>(sa->name);
        for (IpSecSpRecord sp : t.List<IpSecSpRecord>())
            if (sp.saName == name) {
                sp.saName = IpSecSpRecord::kUnknownSa;
                t.Put(sp);
            }
    });
}

void IpSecConfigImpl::RemoveAutoSADConfig(IpSecSadParam const& param) {
    kRemoveAutoSADConfig.Write([&](Transaction& t) {
        const std::string key = IpSecSaRecord::KeyOf("", param.srcAddress.GetStringAddress(),
                                                     param.dstAddress.GetStringAddress(), param.spi);
        if (!t.Erase<IpSecSaRecord>(key))
            Refuse("Unable to remove the automatic security association from " + param.srcAddress.GetStringAddress() +
                   " to " + param.dstAddress.GetStringAddress() + " with SPI " + std::to_string(param.spi) +
                   ": there is none");
    });
}

void IpSecConfigImpl::FlushSADConfig() {
    kFlushSADConfig.Write([](Transaction& t) {
        for (IpSecSpRecord sp : t.List<IpSecSpRecord>())
            if (!sp.saName.empty() && sp.saName != IpSecSpRecord::kUnknownSa) {
                sp.saName = IpSecSpRecord::kUnknownSa;
                t.Put(sp);
            }
        t.EraseAll<IpSecSaRecord>();
    });
}

void IpSecConfigImpl::GetSADConfigList(std::vector<IpSecSadParam>& list) const {
    std::vector<IpSecSaRecord> records = kGetSADConfigList.Read([](Transaction& t) { return t.List<IpSecSaRecord>(); });
    std::stable_partition(records.begin(), records.end(), [](IpSecSaRecord const& sa) { return !sa.saName.empty(); });
    for (IpSecSaRecord const& record : records) list.push_back(ParamOf(record));
}

void IpSecConfigImpl::AddSPDConfig(IpSecSpdParam& param) {
    kAddSPDConfig.Write([&](Transaction& t) {
        const std::string refusal = "Unable to add security policy " + Trellis::Host::Printable(param.name) + ": ";
        if (param.name.empty()) Refuse("Unable to add a security policy: its name must not be empty");
        std::string problem = Trellis::Host::TextProblem(param.name);
        if (!problem.empty()) Refuse(refusal + "its name " + problem);
        if (t.Contains<IpSecSpRecord>(param.name)) Refuse(refusal + "a policy of that name exists already");
        for (int port : {param.srcPort, param.dstPort})
            if (port < 0 || port > 65535) Refuse(refusal + "the port " + std::to_string(port) + " is outside 0 to 65535");
        if (param.srcPrefixLength > 128 || param.dstPrefixLength > 128)
            Refuse(refusal + "a prefix length is above 128");
        if (!param.saName.empty()) {
            std::optional<IpSecSaRecord> sa = t.Find<IpSecSaRecord>(param.saName);
            if (!sa || sa->saName.empty())
                Refuse(refusal + "there is no security association " + Trellis::Host::Printable(param.saName));
        }
        IpSecSpRecord record;
        record.name = param.name;
        record.saName = param.saName;
        record.srcAddress = param.srcAddress.GetStringAddress();
        record.dstAddress = param.dstAddress.GetStringAddress();
        record.srcPrefixLength = param.srcPrefixLength;
        record.dstPrefixLength = param.dstPrefixLength;
        record.srcPort = param.srcPort;
        record.dstPort = param.dstPort;
        record.protocol = static_cast<int>(param.protocol);
        record.direction = static_cast<int>(param.direction);
        record.action = static_cast<int>(param.action);
        record.mode = static_cast<int>(param.mode);
        t.Put(record);
    });
}

void IpSecConfigImpl::RemoveSPDConfig(std::string name) {
    kRemoveSPDConfig.Write([&](Transaction& t) {
        if (!t.Erase<IpSecSpRecord>(name))
            Refuse("Unable to remove security policy " + Trellis::Host::Printable(name) + ": there is none of that name");
    });
}

void IpSecConfigImpl::FlushSPDConfig() {
    kFlushSPDConfig.Write([](Transaction& t) { t.EraseAll<IpSecSpRecord>(); });
}

void IpSecConfigImpl::GetSPDConfigList(std::vector<IpSecSpdParam>& list) const {
    for (IpSecSpRecord const& record : kGetSPDConfigList.Read([](Transaction& t) { return t.List<IpSecSpRecord>(); }))
        list.push_back(ParamOf(record));
}

void IpSecConfigImpl::CheckIKEConfig(std::string path) {
    kCheckIKEConfig.Check();
    ReadIkeConfig(path, MAX_IKE_CONFIG_SIZE);
}

// The file is read and checked again: it may have changed since the check.
void IpSecConfigImpl::CopyIKEConfig(std::string path) {
    IkeConfigRecord record;
    record.sourcePath = path;
    record.text = ReadIkeConfig(path, MAX_IKE_CONFIG_SIZE);
    kCopyIKEConfig.Write([&](Transaction& t) { t.Put(record); });
}

void IpSecConfigImpl::RestartIKEDaemons() {
    kRestartIKEDaemons.Check();
    int status = Trellis::Util::Trellis_Exec(kRestartCommand, false, true, false);
    if (status != 0)
        Refuse("Unable to restart the IKE daemons: " + std::string(kRestartCommand) + " returned " +
               std::to_string(status));
}

}  // namespace Network
}  // namespace Trellis
