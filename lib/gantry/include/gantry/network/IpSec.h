#pragma once

// The plain values of the host's IPsec databases: security associations
// (SAD) and security policies (SPD), with their enumerations. The names of
// the enumerations' values are tables of the implementation library
// (Trellis::Network::IpSecConfigImpl::SA_MODE and the like).

#include <cstdint>
#include <string>

#include "gantry/network/Ipv6Address.h"

namespace Gantry {
namespace Network {

enum class IpSecMode { Any, Transport, Tunnel };
enum class IpSecEncryptAlgo { Null, TripleDesCbc, Aes128Cbc };
enum class IpSecAuthAlgo { None, HmacSha1, HmacSha2_256 };
enum class IpSecSaState { Larval, Mature, Dying, Dead };
enum class IpSecULProtoType { Any, Tcp, Udp, Icmp6 };
enum class IpSecDirection { None, In, Out };
enum class IpSecAction { None, Discard, Ipsec };

// A security association. An automatic one (negotiated by the key exchange
// daemons) has no name.
struct IpSecSadParam {
    std::string name;
    Ipv6Address srcAddress;
    Ipv6Address dstAddress;
    std::uint32_t spi = 0;
    IpSecMode mode = IpSecMode::Any;
    IpSecEncryptAlgo encryptionAlgorithm = IpSecEncryptAlgo::Null;
    std::string encryptionKey;
    IpSecAuthAlgo integrityAlgorithm = IpSecAuthAlgo::None;
    std::string integrityKey;
    IpSecSaState state = IpSecSaState::Mature;
    std::uint64_t lifetime = 0;  // seconds; 0 for no end
};

// A security policy: which traffic is protected through which association
// (saName, for action Ipsec; "UNKNOWN" once that association is gone).
struct IpSecSpdParam {
    std::string name;
    std::string saName;
    Ipv6Address srcAddress;
    Ipv6Address dstAddress;
    unsigned int srcPrefixLength = 0;
    unsigned int dstPrefixLength = 0;
    int srcPort = 0;  // 0 for any
    int dstPort = 0;
    IpSecULProtoType protocol = IpSecULProtoType::Any;
    IpSecDirection direction = IpSecDirection::None;
    IpSecAction action = IpSecAction::None;
    IpSecMode mode = IpSecMode::Any;
};

}  // namespace Network
}  // namespace Gantry
