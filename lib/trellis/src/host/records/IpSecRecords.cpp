#include "trellis/host/records/IpSecRecords.h"

#include <limits>

#include <nlohmann/json.hpp>

#include "gantry/network/Ipv6Address.h"

namespace Trellis {
namespace Host {

namespace {

std::string Ipv6(const JsonReader& in, const char* key) {
    std::string text = in.String(key);
    if (!Gantry::Network::Ipv6Address::IsValidAddress(text)) in.Member(key).Fail("expected an IPv6 address");
    return Gantry::Network::Ipv6Address(text).GetStringAddress();
}

template <std::size_t N>
int Word(const JsonReader& in, const char* key, const char* const (&words)[N]) {
    return in.Member(key).IsPresent() ? static_cast<int>(in.Word(key, words, N)) : 0;
}

}  // namespace

std::string IpSecSaRecord::KeyOf(std::string const& saName, std::string const& src, std::string const& dst,
                                 std::uint32_t spi) {
    return saName.empty() ? "auto " + src + " " + dst + " " + std::to_string(spi) : saName;
}

Json IpSecSaRecord::ToJson() const {
    Json sa = Json::object();
    if (!saName.empty()) sa["name"] = saName;
    sa["source"] = srcAddress;
    sa["destination"] = dstAddress;
    sa["spi"] = spi;
    sa["mode"] = kIpSecModeWords[mode];
    sa["encryptionAlgorithm"] = kIpSecEncryptWords[encryptionAlgorithm];
    sa["encryptionKey"] = encryptionKey;
    sa["integrityAlgorithm"] = kIpSecAuthWords[integrityAlgorithm];
    sa["integrityKey"] = integrityKey;
    sa["state"] = kIpSecStateWords[state];
    sa["lifetime"] = lifetime;
    return sa;
}

IpSecSaRecord IpSecSaRecord::FromJson(const JsonReader& in) {
    IpSecSaRecord sa;
    sa.saName = in.String("name", "");
    sa.srcAddress = Ipv6(in, "source");
    sa.dstAddress = Ipv6(in, "destination");
    sa.spi = static_cast<std::uint32_t>(in.Int("spi", 0, std::numeric_limits<std::uint32_t>::max()));
    sa.mode = Word(in, "mode", kIpSecModeWords);
    sa.encryptionAlgorithm = Word(in, "encryptionAlgorithm", kIpSecEncryptWords);
    sa.encryptionKey = in.String("encryptionKey", "");
    sa.integrityAlgorithm = Word(in, "integrityAlgorithm", kIpSecAuthWords);
    sa.integrityKey = in.String("integrityKey", "");
    sa.state = in.Member("state").IsPresent() ? Word(in, "state", kIpSecStateWords) : 1;
    sa.lifetime = static_cast<std::uint64_t>(in.Int("lifetime", 0, std::numeric_limits<std::int64_t>::max()));
    sa.name = KeyOf(sa.saName, sa.srcAddress, sa.dstAddress, sa.spi);
    in.RejectUnknownMembers();
    return sa;
}

Json IpSecSpRecord::ToJson() const {
    return Json{{"name", name},
                {"saName", saName},
                {"source", srcAddress + "/" + std::to_string(srcPrefixLength)},
                {"destination", dstAddress + "/" + std::to_string(dstPrefixLength)},
                {"sourcePort", srcPort},
                {"destinationPort", dstPort},
                {"protocol", kIpSecProtocolWords[protocol]},
                {"direction", kIpSecDirectionWords[direction]},
                {"action", kIpSecActionWords[action]},
                {"mode", kIpSecModeWords[mode]}};
}

IpSecSpRecord IpSecSpRecord::FromJson(const JsonReader& in) {
    IpSecSpRecord sp;
    sp.name = in.String("name");
    if (sp.name.empty()) in.Member("name").Fail("expected the policy's name");
    sp.saName = in.String("saName", "");
    for (auto [key, address, prefix] : {std::tuple<const char*, std::string*, unsigned int*>{"source", &sp.srcAddress, &sp.srcPrefixLength},
                                        {"destination", &sp.dstAddress, &sp.dstPrefixLength}}) {
        std::string text = in.String(key);
        std::size_t slash = text.find('/');
        std::string digits = slash == std::string::npos ? "" : text.substr(slash + 1);
        if (slash == std::string::npos || !Gantry::Network::Ipv6Address::IsValidAddress(text.substr(0, slash)) ||
            digits.empty() || digits.size() > 3 || digits.find_first_not_of("0123456789") != std::string::npos ||
            std::stoi(digits) > 128)
            in.Member(key).Fail("expected an IPv6 address with its prefix length");
        *address = Gantry::Network::Ipv6Address(text.substr(0, slash)).GetStringAddress();
        *prefix = static_cast<unsigned int>(std::stoi(digits));
    }
    sp.srcPort = static_cast<int>(in.Int("sourcePort", 0, 65535));
    sp.dstPort = static_cast<int>(in.Int("destinationPort", 0, 65535));
    sp.protocol = Word(in, "protocol", kIpSecProtocolWords);
    sp.direction = Word(in, "direction", kIpSecDirectionWords);
    sp.action = Word(in, "action", kIpSecActionWords);
    sp.mode = Word(in, "mode", kIpSecModeWords);
    in.RejectUnknownMembers();
    return sp;
}

// The text is kept as its lines, which may hold tabs: a configuration file's
// own characters, never shown.
Json IkeConfigRecord::ToJson() const {
    Json lines = Json::array();
    std::size_t begin = 0;
    while (begin < text.size()) {
        std::size_t end = text.find('\n', begin);
        if (end == std::string::npos) end = text.size();
        lines.push_back(text.substr(begin, end - begin));
        begin = end + 1;
    }
    return Json{{"sourcePath", sourcePath}, {"lines", lines}};
}

IkeConfigRecord IkeConfigRecord::FromJson(const JsonReader& in) {
    IkeConfigRecord record;
    record.sourcePath = in.String("sourcePath", "");
    for (const JsonReader& line : in.Array("lines")) {
        if (!line.Value().is_string()) line.Fail("expected a line of text");
        std::string text = line.Value().get<std::string>();
        if (text.find_first_of(std::string("\n\0", 2)) != std::string::npos) line.Fail("expected one line");
        record.text += text + "\n";
    }
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
