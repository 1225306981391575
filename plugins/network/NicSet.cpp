#include "NicSet.h"

#include <iterator>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "CommandSupport.h"
#include "NicLookup.h"
#include "trellis/lib/TrellisException.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const char* const kSource = "plugins/network/NicSet";

// In the order of their port type values, 0 to 5.
constexpr Parameter::Word kPorts[] = {
    {"tp", "Select TP (Twisted Pair) as the device port"},
    {"aui", "Select AUI (Attachment Unit Interface) as the device port"},
    {"bnc", "Select BNC (Bayonet Neill-Concelman) as the device port"},
    {"mii", "Select MII (Media Independent Interface) as the device port"},
    {"fibre", "Select fibre as the device port"},
    {"da", "Select DA (Direct Attach copper) as the device port"}};
// The wake-on letters, each at the index of its value.
constexpr std::string_view kWakeOnLetters = "pumbags";

const Parameter kPort =
    Parameter::String("port", "p", "Selects device port. Available device ports are %FULLENUM%").StringEnum(kPorts);
const Parameter kPhyAddress = Parameter::Int64("phy-address", "P", "Set the PHY address of the device");
constexpr Parameter::Word kTransceiverWords[] = {
    {"internal", "Set the transceiver type to internal"},
    {"external", "Set the transceiver type to external"}};
const Parameter kTransceiver =
    Parameter::String("transceiver-type", "t",
                      "Selects transeiver type. Currently only internal and external can be specified, in the future "
                      "future types might be added. Available transeiver types are %FULLENUM%")
        .StringEnum(kTransceiverWords);
// The pattern lets "d" through, which has no value: it is refused as an
// invalid letter.
const Parameter kWakeOnLan =
    Parameter::String("wake-on-lan", "w",
                      "Sets Wake-on-LAN options. Not all devices support this. The argument to this option is a "
                      "string of characters specifying which options to enable. \np Wake on phy activity\nu Wake on "
                      "unicast messages\nm Wake on multicast messages\nb Wake on broadcast messages\na Wake on ARP\ng "
                      "Wake on MagicPacket(tm)\ns Enable SecureOn(tm) password for MagicPacket(tm)\n")
        .Regex("[pumbagsd]+");
const Parameter kMessageLevel =
    Parameter::Int64("message-level", "l", "Sets the driver message level. Meaning differ per driver.");
constexpr long long kSpeedValues[] = {10, 100, 1000, 2500, 5000, 10000, 20000, 25000, 40000, 50000, 56000, 100000};
const Parameter kSpeed =
    Parameter::Int("speed", "S", "The speed to set this NIC to, in Mbps. Acceptable values are :%ENUM%")
        .IntEnum(kSpeedValues);
constexpr Parameter::Word kDuplexWords[] = {
    {"full", "Set this nic to full duplex"},
    {"half", "Set this nic to half duplex"}};
const Parameter kDuplex = Parameter::String("duplex", "D", "The duplex to set this NIC to. Acceptable values are :%ENUM%")
                              .StringEnum(kDuplexWords);
const Parameter kAuto = Parameter::Flag("auto", "a", "Set the speed and duplexity settings to autonegotiate.");

[[noreturn]] void Refuse(std::string const& message, unsigned int line) {
    throw Trellis::Lib::TrellisException(message, kSource, line);
}

// Folds the given settings into info, each marked changed only where it
// differs (wake-on always); true when any is. Refusals are thrown, before
// anything reaches the device.
bool FoldSettings(Input const& input, Gantry::Network::PnicInfo& info) {
    bool changed = false;
    if (input.HasParameter(kPort)) {
        std::string port = input.GetString(kPort);
        for (int value = 0; value < static_cast<int>(std::size(kPorts)); ++value) {
            if (kPorts[value].value != port) continue;
            if (value != info.port) {
                info.port = value;
                info.portChanged = changed = true;
            }
            break;
        }
    }
    if (input.HasParameter(kPhyAddress)) {
        long long address = input.GetLongLong(kPhyAddress);
        if (address > 0) {
            if (address != info.phyAddress) {
                info.phyAddress = static_cast<int>(address);
                info.phyAddressChanged = changed = true;
            }
        } else if (address != -1) {  // -1 leaves the address; 0 is no address
            Refuse("Invalid PHY address value.", __LINE__);
        }
    }
    if (input.HasParameter(kTransceiver)) {
        std::string transceiver = input.GetString(kTransceiver);
        int value = transceiver == "internal" ? 0 : transceiver == "external" ? 1 : -1;
        if (value != -1 && value != info.transceiver) {
            info.transceiver = value;
            info.transceiverChanged = changed = true;
        }
    }
    if (input.HasParameter(kWakeOnLan)) {
        if (!info.supportsWakeOn) Refuse("Not Support wol.", __LINE__);
        info.wakeOnChanged = true;
        info.wakeOn.clear();
        for (char letter : input.GetString(kWakeOnLan)) {
            std::string_view::size_type value = kWakeOnLetters.find(letter);
            if (value == std::string_view::npos) Refuse("Invalid wol value.", __LINE__);
            info.wakeOn.push_back(static_cast<int>(value));
        }
        changed = true;  // the set given counts as a change, the same as before or not
    }
    if (input.HasParameter(kMessageLevel)) {
        long long level = input.GetLongLong(kMessageLevel);
        if (!info.supportsMessageLevel) Refuse("Not Support msglvl.", __LINE__);
        // Compared on all 64 bits, stored in the low 32.
        if (level != static_cast<long long>(info.messageLevel)) {
            info.messageLevel = static_cast<unsigned int>(level);
            info.messageLevelChanged = changed = true;
        }
    }
    return changed;
}

}  // namespace

NicSet::NicSet() {
    SetDescription("Set the general options for the specified ethernet device.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicSet::GetInputSpecInternal() {
    return InputSpecOf(kNicToConfigure, kPort, kPhyAddress, kTransceiver, kWakeOnLan, kMessageLevel, kSpeed, kDuplex,
                       kAuto);
}

boost::shared_ptr<OutputSpec> NicSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kNicToConfigure);
        bool speedGiven = input->HasParameter(kSpeed);
        bool duplexGiven = input->HasParameter(kDuplex);
        bool autonegotiate = input->GetFlag(kAuto);
        if (speedGiven != duplexGiven) {
            output->SetError("The --speed and --duplex options must be specified together");
            return;
        }
        if (autonegotiate && speedGiven) {
            output->SetError("The options --speed and --duplex cannot be specified with the --auto option.");
            return;
        }
        bool linkChange = autonegotiate || speedGiven;

        std::unique_ptr<Gantry::Network::Pnic> pnic = FindPnic(networkInfo, *output, name);
        if (!pnic) return;
        Gantry::Network::PnicInfo info{};
        pnic->GetPnicInfo(info);
        bool changed = FoldSettings(*input, info);
        if (changed) pnic->SetPnicInfo(info);
        if (!linkChange && !changed) {
            output->SetError("There is no change for nic " + name);
            return;
        }
        // Speed and duplex are set even when they are those in force.
        if (linkChange) {
            unsigned int speed = 0;
            int duplex = 0;  // with --auto: autonegotiation
            if (speedGiven) {
                speed = static_cast<unsigned int>(input->GetInt(kSpeed));
                duplex = input->GetString(kDuplex) == "full" ? 1 : 2;
            }
            pnic->SetSpeedDuplex(speed, duplex);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
