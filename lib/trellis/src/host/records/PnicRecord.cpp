#include "trellis/host/records/PnicRecord.h"

#include <algorithm>
#include <cstring>
#include <limits>

#include <nlohmann/json.hpp>

#include "gantry/lib/GantryException.h"
#include "gantry/network/MacAddress.h"

namespace Trellis {
namespace Host {

namespace {

constexpr std::int64_t kMinMtu = 68;
constexpr std::int64_t kMaxMtu = 9000;
constexpr std::int64_t kMaxSpeed = 1000000;
constexpr std::int64_t kMaxCounter = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kMaxWord = std::numeric_limits<std::uint32_t>::max();
constexpr std::size_t kMaxRegisters = 4096;
constexpr std::size_t kMaxEepromBytes = 65536;
constexpr char kHexDigits[] = "0123456789abcdef";

std::string ReadMacAddress(const JsonReader& in) {
    std::string text = in.String("macAddress");
    try {
        Gantry::Network::MacAddress mac(text);
        if (mac.GetStringAddress() == text) return text;
    } catch (const Gantry::Lib::GantryException&) {
    }
    in.Member("macAddress").Fail("expected a MAC address in lower case, such as \"00:50:56:a1:b2:c3\"");
}

bool OptionalBool(const JsonReader& in, const char* key, bool fallback) {
    return in.Member(key).IsPresent() ? in.Bool(key) : fallback;
}

std::int64_t OptionalInt(const JsonReader& in, const char* key, std::int64_t min, std::int64_t max) {
    return in.Member(key).IsPresent() ? in.Int(key, min, max) : 0;
}

template <std::size_t N>
Json WordsOfBits(unsigned int bits, const char* const (&words)[N]) {
    Json list = Json::array();
    for (std::size_t i = 0; i < N; ++i)
        if ((bits & (1u << i)) != 0) list.push_back(words[i]);
    return list;
}

template <std::size_t N>
unsigned int BitsOfWords(const JsonReader& in, const char* key, const char* const (&words)[N]) {
    unsigned int bits = 0;
    for (const JsonReader& element : in.Array(key)) {
        const std::string word = element.AsString();
        const auto* found = std::find(std::begin(words), std::end(words), word);
        if (found == std::end(words)) {
            std::string expected;
            for (const char* w : words) expected += (expected.empty() ? "" : ", ") + std::string(w);
            element.Fail("expected one of " + expected);
        }
        bits |= 1u << (found - std::begin(words));
    }
    return bits;
}

template <std::size_t N>
Json CountersJson(const std::array<std::uint64_t, N>& counters, const char* const (&names)[N]) {
    Json object = Json::object();
    for (std::size_t i = 0; i < N; ++i) object[names[i]] = counters[i];
    return object;
}

template <std::size_t N>
std::array<std::uint64_t, N> ReadCounters(const JsonReader& in, const char* const (&names)[N]) {
    std::array<std::uint64_t, N> counters{};
    if (!in.IsPresent()) return counters;
    in.ExpectObject();
    for (std::size_t i = 0; i < N; ++i) counters[i] = static_cast<std::uint64_t>(OptionalInt(in, names[i], 0, kMaxCounter));
    in.RejectUnknownMembers();
    return counters;
}

Json ModesJson(const std::vector<PnicLinkModeRecord>& modes) {
    Json list = Json::array();
    for (const PnicLinkModeRecord& mode : modes)
        list.push_back(Json{{"speed", mode.speed}, {"duplex", WordOf(mode.duplex, kPnicDuplexWords)}});
    return list;
}

std::vector<PnicLinkModeRecord> ReadModes(const JsonReader& in, const char* key) {
    std::vector<PnicLinkModeRecord> modes;
    for (const JsonReader& element : in.Array(key)) {
        PnicLinkModeRecord mode;
        mode.speed = static_cast<unsigned int>(element.Int("speed", 1, kMaxSpeed));
        mode.duplex = element.Word<PnicDuplex>("duplex", kPnicDuplexWords);
        if (mode.duplex == PnicDuplex::Auto) element.Member("duplex").Fail("expected \"full\", \"half\" or \"unknown\"");
        element.RejectUnknownMembers();
        modes.push_back(mode);
    }
    return modes;
}

Json LinkJson(const PnicLinkRecord& link) {
    Json ports = Json::array();
    for (int port : link.supportedPorts) ports.push_back(kPnicPortWords[port]);
    return Json{{"supportedPorts", ports},
                {"port", kPnicPortWords[link.port]},
                {"supportedModes", ModesJson(link.supportedModes)},
                {"supportsAutoNegotiation", link.supportsAutoNegotiation},
                {"advertisedModes", ModesJson(link.advertisedModes)},
                {"advertisedAutoNegotiation", link.advertisedAutoNegotiation},
                {"autoNegotiation", link.autoNegotiation},
                {"phyAddress", link.phyAddress},
                {"transceiver", kTransceiverWords[link.transceiver]}};
}

PnicLinkRecord ReadLink(const JsonReader& in) {
    PnicLinkRecord link;
    if (!in.IsPresent()) return link;
    in.ExpectObject();
    for (const JsonReader& element : in.Array("supportedPorts")) {
        const std::string word = element.AsString();
        const auto* found = std::find(std::begin(kPnicPortWords), std::end(kPnicPortWords), word);
        if (found == std::end(kPnicPortWords)) element.Fail("expected tp, aui, bnc, mii, fibre, da or other");
        link.supportedPorts.push_back(static_cast<int>(found - std::begin(kPnicPortWords)));
    }
    if (in.Member("port").IsPresent()) link.port = static_cast<int>(in.Word("port", kPnicPortWords, std::size(kPnicPortWords)));
    link.supportedModes = ReadModes(in, "supportedModes");
    link.supportsAutoNegotiation = OptionalBool(in, "supportsAutoNegotiation", false);
    link.advertisedModes = ReadModes(in, "advertisedModes");
    for (const PnicLinkModeRecord& mode : link.advertisedModes)
        if (std::find(link.supportedModes.begin(), link.supportedModes.end(), mode) == link.supportedModes.end())
            in.Member("advertisedModes").Fail("a NIC advertises only link modes it supports");
    link.advertisedAutoNegotiation = OptionalBool(in, "advertisedAutoNegotiation", false);
    link.autoNegotiation = OptionalBool(in, "autoNegotiation", false);
    if (link.autoNegotiation && !link.supportsAutoNegotiation)
        in.Member("autoNegotiation").Fail("the NIC does not support autonegotiation");
    link.phyAddress = static_cast<int>(OptionalInt(in, "phyAddress", 0, 31));
    if (in.Member("transceiver").IsPresent())
        link.transceiver = static_cast<int>(in.Word("transceiver", kTransceiverWords, std::size(kTransceiverWords)));
    in.RejectUnknownMembers();
    return link;
}

// Letters of kWakeOnLetters, each once, in the table's order.
std::string ReadWakeOnLetters(const JsonReader& in, const char* key) {
    const std::string text = in.String(key);
    std::string letters;
    for (const char* letter = kWakeOnLetters; *letter != '\0'; ++letter)
        if (text.find(*letter) != std::string::npos) letters += *letter;
    if (letters.size() != text.size())
        in.Member(key).Fail("expected wake-on letters of \"pumbags\", each once");
    return letters;
}

std::string HexOf(const std::string& bytes) {
    std::string hex;
    hex.reserve(bytes.size() * 2);
    for (unsigned char byte : bytes) {
        hex += kHexDigits[byte >> 4];
        hex += kHexDigits[byte & 0xf];
    }
    return hex;
}

std::string BytesOfHex(const JsonReader& in, const char* key) {
    const std::string hex = in.String(key);
    if (hex.size() % 2 != 0 || hex.size() / 2 > kMaxEepromBytes)
        in.Member(key).Fail("expected an even number of hex digits, at most " + std::to_string(kMaxEepromBytes) + " bytes");
    std::string bytes;
    for (std::size_t i = 0; i < hex.size(); i += 2) {
        const char* high = std::strchr(kHexDigits, hex[i]);
        const char* low = std::strchr(kHexDigits, hex[i + 1]);
        if (hex[i] == '\0' || hex[i + 1] == '\0' || high == nullptr || low == nullptr)
            in.Member(key).Fail("expected lower-case hex digits");
        bytes += static_cast<char>(((high - kHexDigits) << 4) | (low - kHexDigits));
    }
    return bytes;
}

Json RingsJson(const PnicRingsRecord& rings) {
    return Json{{"rx", rings.rx}, {"rxMini", rings.rxMini}, {"rxJumbo", rings.rxJumbo}, {"tx", rings.tx}};
}

PnicRingsRecord ReadRings(const JsonReader& in) {
    PnicRingsRecord rings;
    if (!in.IsPresent()) return rings;
    in.ExpectObject();
    rings.rx = static_cast<std::uint32_t>(OptionalInt(in, "rx", 0, kMaxWord));
    rings.rxMini = static_cast<std::uint32_t>(OptionalInt(in, "rxMini", 0, kMaxWord));
    rings.rxJumbo = static_cast<std::uint32_t>(OptionalInt(in, "rxJumbo", 0, kMaxWord));
    rings.tx = static_cast<std::uint32_t>(OptionalInt(in, "tx", 0, kMaxWord));
    in.RejectUnknownMembers();
    return rings;
}

Json CoalesceJson(const PnicCoalesceRecord& c) {
    return Json{{"adaptiveRx", c.adaptiveRx}, {"adaptiveTx", c.adaptiveTx}, {"sampleInterval", c.sampleInterval},
                {"rxUsecs", c.rxUsecs},       {"rxMaxFrames", c.rxMaxFrames}, {"txUsecs", c.txUsecs},
                {"txMaxFrames", c.txMaxFrames}};
}

PnicCoalesceRecord ReadCoalesce(const JsonReader& in) {
    PnicCoalesceRecord c;
    if (!in.IsPresent()) return c;
    in.ExpectObject();
    c.adaptiveRx = OptionalBool(in, "adaptiveRx", false);
    c.adaptiveTx = OptionalBool(in, "adaptiveTx", false);
    c.sampleInterval = static_cast<std::uint32_t>(OptionalInt(in, "sampleInterval", 0, kMaxWord));
    c.rxUsecs = static_cast<std::uint32_t>(OptionalInt(in, "rxUsecs", 0, kMaxWord));
    c.rxMaxFrames = static_cast<std::uint32_t>(OptionalInt(in, "rxMaxFrames", 0, kMaxWord));
    c.txUsecs = static_cast<std::uint32_t>(OptionalInt(in, "txUsecs", 0, kMaxWord));
    c.txMaxFrames = static_cast<std::uint32_t>(OptionalInt(in, "txMaxFrames", 0, kMaxWord));
    in.RejectUnknownMembers();
    return c;
}

Json SriovJson(const std::vector<SriovVfRecord>& functions) {
    Json list = Json::array();
    for (const SriovVfRecord& vf : functions)
        list.push_back(Json{{"id", vf.id},
                            {"active", vf.active},
                            {"pciAddress", vf.pciAddress},
                            {"ownerWorldId", vf.ownerWorldId},
                            {"counters", CountersJson(vf.counters, kVfCounterNames)}});
    return Json{{"virtualFunctions", list}};
}

std::vector<SriovVfRecord> ReadSriov(const JsonReader& in) {
    in.ExpectObject();
    std::vector<SriovVfRecord> functions;
    for (const JsonReader& element : in.Array("virtualFunctions")) {
        SriovVfRecord vf;
        vf.id = static_cast<int>(element.Int("id", 0, 4095));
        for (const SriovVfRecord& other : functions)
            if (other.id == vf.id) element.Member("id").Fail("duplicate virtual function " + std::to_string(vf.id));
        vf.active = element.Bool("active");
        vf.pciAddress = element.String("pciAddress");
        vf.ownerWorldId = element.String("ownerWorldId", "");
        vf.counters = ReadCounters(element.Member("counters"), kVfCounterNames);
        element.RejectUnknownMembers();
        functions.push_back(vf);
    }
    in.RejectUnknownMembers();
    return functions;
}

}  // namespace

Json PnicRecord::ToJson() const {
    Json nic{{"name", name},
             {"adminUp", adminUp},
             {"linkUp", linkUp},
             {"driver", driver},
             {"speed", speed},
             {"duplex", WordOf(duplex, kPnicDuplexWords)},
             {"macAddress", macAddress},
             {"mtu", mtu}};
    if (pci) nic["pci"] = Json{{"address", pci->address}, {"vendor", pci->vendor}, {"device", pci->device}};
    nic["driverVersion"] = driverVersion;
    nic["firmwareVersion"] = firmwareVersion;
    nic["busInfo"] = busInfo;
    nic["link"] = LinkJson(link);
    if (wakeOn) nic["wakeOn"] = Json{{"supported", wakeOn->supported}, {"enabled", wakeOn->enabled}};
    if (messageLevel) nic["messageLevel"] = *messageLevel;
    nic["pause"] = Json{{"supported", pause.supported}, {"autonegotiate", pause.autonegotiate},
                        {"rx", pause.rx},               {"tx", pause.tx},
                        {"partnerRx", pause.partnerRx}, {"partnerTx", pause.partnerTx}};
    nic["registers"] = registers;
    nic["eeprom"] = Json{{"magic", eeprom.magic}, {"bytes", HexOf(eeprom.bytes)}};
    Json tests = Json::array();
    for (const PnicSelfTestRecord& test : selfTests)
        tests.push_back(Json{{"name", test.name}, {"offline", test.offline}, {"passes", test.passes}});
    nic["selfTests"] = tests;
    nic["counters"] = CountersJson(counters, kPnicCounterNames);
    nic["offloads"] = Json{{"supported", WordsOfBits(supportedOffloads, kOffloadWords)},
                           {"enabled", WordsOfBits(enabledOffloads, kOffloadWords)}};
    nic["coalesce"] = CoalesceJson(coalesce);
    nic["rings"] = Json{{"maxima", RingsJson(ringMaxima)}, {"current", RingsJson(rings)}};
    nic["software"] = WordsOfBits(softwareFeatures, kSoftwareFeatureWords);
    if (sriov) nic["sriov"] = SriovJson(*sriov);
    return nic;
}

PnicRecord PnicRecord::FromJson(const JsonReader& in) {
    PnicRecord record;
    record.name = in.String("name");
    if (record.name.empty()) in.Member("name").Fail("expected a NIC name");
    record.adminUp = OptionalBool(in, "adminUp", true);
    record.linkUp = in.Bool("linkUp");
    record.driver = in.String("driver");
    record.speed = static_cast<unsigned int>(in.Int("speed", 0, kMaxSpeed));
    record.duplex = in.Word<PnicDuplex>("duplex", kPnicDuplexWords);
    record.macAddress = ReadMacAddress(in);
    record.mtu = static_cast<int>(in.Int("mtu", kMinMtu, kMaxMtu));
    // Earlier hosts kept vendor and device as one text.
    const std::string description = in.String("description", "");
    if (JsonReader pci = in.Member("pci"); pci.IsPresent()) {
        pci.ExpectObject();
        record.pci = PciDeviceRecord{pci.String("address"), pci.String("vendor"), pci.String("device")};
        pci.RejectUnknownMembers();
    } else if (!description.empty()) {
        record.pci = PciDeviceRecord{"", description, ""};
    }
    record.driverVersion = in.String("driverVersion", "");
    record.firmwareVersion = in.String("firmwareVersion", "");
    record.busInfo = in.String("busInfo", "");
    record.link = ReadLink(in.Member("link"));
    if (JsonReader wake = in.Member("wakeOn"); wake.IsPresent()) {
        wake.ExpectObject();
        PnicWakeOnRecord wakeOn{ReadWakeOnLetters(wake, "supported"), ReadWakeOnLetters(wake, "enabled")};
        for (char letter : wakeOn.enabled)
            if (wakeOn.supported.find(letter) == std::string::npos)
                wake.Member("enabled").Fail("a NIC enables only wake-on letters it supports");
        wake.RejectUnknownMembers();
        record.wakeOn = wakeOn;
    }
    if (in.Member("messageLevel").IsPresent())
        record.messageLevel = static_cast<std::uint32_t>(in.Int("messageLevel", 0, kMaxWord));
    if (JsonReader pause = in.Member("pause"); pause.IsPresent()) {
        pause.ExpectObject();
        record.pause.supported = pause.Bool("supported");
        record.pause.autonegotiate = OptionalBool(pause, "autonegotiate", false);
        record.pause.rx = OptionalBool(pause, "rx", false);
        record.pause.tx = OptionalBool(pause, "tx", false);
        record.pause.partnerRx = OptionalBool(pause, "partnerRx", false);
        record.pause.partnerTx = OptionalBool(pause, "partnerTx", false);
        if (!record.pause.supported && (record.pause.autonegotiate || record.pause.rx || record.pause.tx))
            pause.Fail("a NIC without pause support has pause off");
        pause.RejectUnknownMembers();
    }
    std::vector<JsonReader> registers = in.Array("registers");
    if (registers.size() > kMaxRegisters)
        in.Member("registers").Fail("expected at most " + std::to_string(kMaxRegisters) + " registers");
    for (const JsonReader& element : registers) {
        if (!element.Value().is_number_unsigned() || element.Value().get<std::uint64_t>() > static_cast<std::uint64_t>(kMaxWord))
            element.Fail("expected an integer from 0 to 4294967295");
        record.registers.push_back(element.Value().get<std::uint32_t>());
    }
    if (JsonReader eeprom = in.Member("eeprom"); eeprom.IsPresent()) {
        eeprom.ExpectObject();
        record.eeprom.magic = static_cast<std::uint32_t>(eeprom.Int("magic", 0, kMaxWord));
        record.eeprom.bytes = BytesOfHex(eeprom, "bytes");
        eeprom.RejectUnknownMembers();
    }
    for (const JsonReader& element : in.Array("selfTests")) {
        PnicSelfTestRecord test;
        test.name = element.String("name");
        test.offline = element.Bool("offline");
        test.passes = element.Bool("passes");
        element.RejectUnknownMembers();
        record.selfTests.push_back(test);
    }
    record.counters = ReadCounters(in.Member("counters"), kPnicCounterNames);
    if (JsonReader offloads = in.Member("offloads"); offloads.IsPresent()) {
        offloads.ExpectObject();
        record.supportedOffloads = BitsOfWords(offloads, "supported", kOffloadWords);
        record.enabledOffloads = BitsOfWords(offloads, "enabled", kOffloadWords);
        if ((record.enabledOffloads & ~record.supportedOffloads) != 0)
            offloads.Member("enabled").Fail("a NIC enables only offloads it supports");
        offloads.RejectUnknownMembers();
    }
    record.coalesce = ReadCoalesce(in.Member("coalesce"));
    if (JsonReader rings = in.Member("rings"); rings.IsPresent()) {
        rings.ExpectObject();
        record.ringMaxima = ReadRings(rings.Member("maxima"));
        record.rings = ReadRings(rings.Member("current"));
        const PnicRingsRecord& max = record.ringMaxima;
        const PnicRingsRecord& now = record.rings;
        if (now.rx > max.rx || now.rxMini > max.rxMini || now.rxJumbo > max.rxJumbo || now.tx > max.tx)
            rings.Member("current").Fail("a ring is never larger than its maximum");
        rings.RejectUnknownMembers();
    }
    record.softwareFeatures = BitsOfWords(in, "software", kSoftwareFeatureWords);
    if (JsonReader sriov = in.Member("sriov"); sriov.IsPresent()) record.sriov = ReadSriov(sriov);
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
