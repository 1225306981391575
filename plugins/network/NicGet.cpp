#include "NicGet.h"

#include <memory>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "NicLookup.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::PnicLinkMode;

// A port type as the list of supported ports names it.
std::string PortEntry(int port) {
    static const char* const kNames[] = {"TP", "AUI", "BNC", "MII", "FIBRE", "DA"};
    return port >= 0 && port <= 5 ? kNames[port] : "UNKNOWN";
}

// A port type as the cable type names it: twisted pair in full, nothing for
// a type without a name.
std::string CableType(int port) {
    static const char* const kNames[] = {"Twisted Pair", "AUI", "BNC", "MII", "FIBRE", "DA"};
    return port >= 0 && port <= 5 ? kNames[port] : "";
}

// "1000baseT/Full", whatever the medium; nothing after the slash for a
// duplex without a name.
std::string LinkModeEntry(PnicLinkMode const& mode) {
    static const char* const kDuplex[] = {"Auto", "Full", "Half"};
    return std::to_string(mode.speed) + "baseT/" + (mode.duplex >= 0 && mode.duplex <= 2 ? kDuplex[mode.duplex] : "");
}

std::string WakeOnEntry(int value) {
    static const char* const kNames[] = {
        "PHY Activity", "Unicast Messagess", "Multicast Messages", "Broadcast Messages", "ARP", "MagicPacket(tm)",
        "Enable SecureOn(tm) Password for                            MagicPacket(tm)", "Unsupported", "Disabled"};
    return value >= 0 && value <= 8 ? kNames[value] : "None";
}

template <class Value, class Text>
std::vector<std::string> Entries(std::vector<Value> const& values, Text text) {
    std::vector<std::string> entries;
    for (Value const& value : values) entries.push_back(text(value));
    return entries;
}

}  // namespace

NicGet::NicGet() {
    SetDescription("Get the generic configuration of a network device");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

boost::shared_ptr<InputSpec> NicGet::GetInputSpecInternal() { return InputSpecOf(kNicToConfigure); }

boost::shared_ptr<OutputSpec> NicGet::GetOutputSpecInternal() { return OutputSpec::Of(GetOutputStructure()); }

boost::shared_ptr<MetaStruct> NicGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NICInfo");
    result->SetField("Name", MetaString::New());
    result->SetField("Supported Ports", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Supports Auto Negotiation", MetaBool::New());
    result->SetField("Advertised Link Modes", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Advertised Auto Negotiation", MetaBool::New());
    result->SetField("Cable Type", MetaString::New());
    result->SetField("PHY Address", MetaInt::New());
    result->SetField("Transceiver", MetaString::New());
    result->SetField("Auto Negotiation", MetaBool::New());
    result->SetField("Supports Wakeon", MetaBool::New());
    result->SetField("Wakeon", MetaList::New(Plinth::MetaObj::META_STRING));
    result->SetField("Current Message Level", MetaInt::New());
    result->SetField("Link Detected", MetaBool::New());
    result->SetField("Supports Pause", MetaBool::New());
    result->SetField("Pause Autonegotiate", MetaBool::New());
    result->SetField("Pause RX", MetaBool::New());
    result->SetField("Pause TX", MetaBool::New());
    result->SetField("Link Status", MetaString::New());
    result->SetField("Driver Info", GetDriverInfoStructure());
    return result;
}

boost::shared_ptr<MetaStruct> NicGet::GetDriverInfoStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NICDriverInfo");
    result->SetField("Driver", MetaString::New());
    result->SetField("Version", MetaString::New());
    result->SetField("Firmware Version", MetaString::New());
    result->SetField("Bus Info", MetaString::New());
    return result;
}

void NicGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kNicToConfigure);
        std::unique_ptr<Gantry::Network::Pnic> pnic = FindPnic(networkInfo, *output, name);
        if (!pnic) return;
        Gantry::Network::PnicInfo info;
        Gantry::Network::PnicPauseParams pause;
        Gantry::Network::PnicDriverInfo driver;
        pnic->GetPnicInfo(info);
        pnic->GetPauseParams(pause);
        pnic->GetDriverInfo(driver);

        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        result->SetField("Name", name);  // as given, not as the NIC names itself
        result->SetField("Supported Ports", Entries(info.supportedPorts, PortEntry));
        result->SetField("Supports Auto Negotiation", info.supportsAutoNegotiation);
        result->SetField("Advertised Link Modes", Entries(info.advertisedLinkModes, LinkModeEntry));
        result->SetField("Advertised Auto Negotiation", info.advertisedAutoNegotiation);
        result->SetField("Cable Type", CableType(info.port));
        result->SetField("PHY Address", info.phyAddress);
        result->SetField("Transceiver", info.transceiver == 0 ? "internal" : info.transceiver == 1 ? "external" : "");
        result->SetField("Auto Negotiation", info.autoNegotiation);
        result->SetField("Wakeon", info.supportsWakeOn ? Entries(info.wakeOn, WakeOnEntry)
                                                       : std::vector<std::string>{"None"});
        result->SetField("Supports Wakeon", info.supportsWakeOn);
        result->SetField("Link Status", info.linkStatus);
        result->SetField("Current Message Level",
                         info.supportsMessageLevel ? static_cast<long long>(info.messageLevel) : -1LL);
        result->SetField("Link Detected", pnic->IsLinkUp());
        result->SetField("Supports Pause", pause.supported);
        // Without pause support the other three stay unset.
        if (pause.supported) {
            result->SetField("Pause Autonegotiate", pause.autonegotiate);
            result->SetField("Pause RX", pause.rx);
            result->SetField("Pause TX", pause.tx);
        }
        boost::shared_ptr<MetaStruct> driverInfo = GetDriverInfoStructure();
        driverInfo->SetField("Driver", driver.driver);
        driverInfo->SetField("Version", driver.version);
        driverInfo->SetField("Firmware Version", driver.firmwareVersion);
        driverInfo->SetField("Bus Info", driver.busInfo);
        result->SetField("Driver Info", driverInfo);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
