#pragma once

// The host's IPsec databases and its key exchange configuration. An
// association is keyed by its name; an automatic one (no name) by its source,
// destination and SPI. A policy is keyed by its name.

#include <cstdint>
#include <string>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

inline constexpr const char* kIpSecModeWords[] = {"any", "transport", "tunnel"};
inline constexpr const char* kIpSecEncryptWords[] = {"null", "3des-cbc", "aes128-cbc"};
inline constexpr const char* kIpSecAuthWords[] = {"none", "hmac-sha1", "hmac-sha2-256"};
inline constexpr const char* kIpSecStateWords[] = {"larval", "mature", "dying", "dead"};
inline constexpr const char* kIpSecProtocolWords[] = {"any", "tcp", "udp", "icmp6"};
inline constexpr const char* kIpSecDirectionWords[] = {"none", "in", "out"};
inline constexpr const char* kIpSecActionWords[] = {"none", "discard", "ipsec"};

struct IpSecSaRecord {
    static constexpr const char* kKind = "ipsec.sa";

    std::string name;  // the key: KeyOf(...)
    std::string saName;  // empty for an automatic association
    std::string srcAddress;
    std::string dstAddress;
    std::uint32_t spi = 0;
    int mode = 0;
    int encryptionAlgorithm = 0;
    std::string encryptionKey;
    int integrityAlgorithm = 0;
    std::string integrityKey;
    int state = 1;
    std::uint64_t lifetime = 0;

    static std::string KeyOf(std::string const& saName, std::string const& src, std::string const& dst,
                             std::uint32_t spi);
    Json ToJson() const;
    static IpSecSaRecord FromJson(const JsonReader& in);
};

struct IpSecSpRecord {
    static constexpr const char* kKind = "ipsec.sp";
    static constexpr const char* kUnknownSa = "UNKNOWN";

    std::string name;
    std::string saName;  // empty, an association's name, or kUnknownSa once it is gone
    std::string srcAddress;
    unsigned int srcPrefixLength = 0;
    std::string dstAddress;
    unsigned int dstPrefixLength = 0;
    int srcPort = 0;
    int dstPort = 0;
    int protocol = 0;
    int direction = 0;
    int action = 0;
    int mode = 0;

    Json ToJson() const;
    static IpSecSpRecord FromJson(const JsonReader& in);
};

// The installed key exchange configuration: the file's text and where it
// came from. One record, named "host".
struct IkeConfigRecord {
    static constexpr const char* kKind = "ipsec.ike";
    static constexpr const char* kName = "host";

    std::string name = kName;
    std::string sourcePath;
    std::string text;

    Json ToJson() const;
    static IkeConfigRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
