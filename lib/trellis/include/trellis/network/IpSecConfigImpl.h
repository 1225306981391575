#pragma once

#include <string>
#include <vector>

#include "gantry/network/IpSec.h"

namespace Trellis {
namespace Network {

// The host's IPsec databases and the configuration of its key exchange
// daemons. A stack object; each operation takes effect on the host at once.
class IpSecConfigImpl {
public:
    // The texts of the enumerations, indexed by their values.
    static const std::vector<std::string> SA_MODE;       // "any", "transport", "tunnel"
    static const std::vector<std::string> SA_ENCPT_ALG;  // "null", "3des-cbc", "aes128-cbc"
    static const std::vector<std::string> SA_AUTH_ALG;   // "none", "hmac-sha1", "hmac-sha2-256"
    static const std::vector<std::string> SA_STATE;      // "larval", "mature", "dying", "dead"
    static const std::vector<std::string> SP_UL_PROTO_TYPE;  // "any", "tcp", "udp", "icmp6"
    static const std::vector<std::string> SP_DIRECTION;      // "none", "in", "out"
    static const std::vector<std::string> SP_ACTION;         // "none", "discard", "ipsec"

    // The key exchange configuration a file may hold: at most 64 KiB.
    static constexpr long MAX_IKE_CONFIG_SIZE = 64 * 1024;

    IpSecConfigImpl();
    ~IpSecConfigImpl();

    // Map a text to its value: the texts of the tables above; the empty text
    // gives the first value (the default). Throw GantryException for any
    // other text.
    Gantry::Network::IpSecMode StringToIpSecMode(std::string const& text) const;
    Gantry::Network::IpSecEncryptAlgo StringToIpSecEncyptAlgo(std::string const& text) const;
    Gantry::Network::IpSecAuthAlgo StringToIpSecAuthAlgo(std::string const& text) const;
    Gantry::Network::IpSecULProtoType StringToIpSecULProtoType(std::string const& text) const;
    Gantry::Network::IpSecDirection StringToIpSecDirection(std::string const& text) const;
    Gantry::Network::IpSecAction StringToIpSecAction(std::string const& text) const;

    // Refuses an empty or taken name, a (source, destination, SPI) the
    // database has, and a key of the wrong length for its algorithm (as
    // ASCII or as hex digits, "0x" allowed).
    void AddSADConfig(Gantry::Network::IpSecSadParam const& param);
    // Refuses a name no association has. Policies that named it show
    // "UNKNOWN".
    void RemoveSADConfig(std::string name);
    // Removes the automatic association of that source, destination and SPI.
    void RemoveAutoSADConfig(Gantry::Network::IpSecSadParam const& param);
    void FlushSADConfig();
    // The named associations in the order they were added, then the
    // automatic ones.
    void GetSADConfigList(std::vector<Gantry::Network::IpSecSadParam>& list) const;

    // Refuses an empty or taken name, an SA name no association has, and
    // ports outside 0 to 65535.
    void AddSPDConfig(Gantry::Network::IpSecSpdParam& param);
    void RemoveSPDConfig(std::string name);
    void FlushSPDConfig();
    void GetSPDConfigList(std::vector<Gantry::Network::IpSecSpdParam>& list) const;

    // Reads the file as the host reads a file a user names: read-only and
    // without waiting, a regular file of at most MAX_IKE_CONFIG_SIZE, and
    // checks what it holds. Each refusal names the path and the reason.
    void CheckIKEConfig(std::string path);
    // Reads and checks the file again and installs what it holds in the
    // host's store; nothing is written outside it.
    void CopyIKEConfig(std::string path);
    // Restarts the daemons through Trellis_Exec (logged, never run).
    void RestartIKEDaemons();
};

}  // namespace Network
}  // namespace Trellis
