#pragma once

#include <string>
#include <vector>

#include "gantry/network/IpAddress.h"
#include "trellis/host/records/NetstackRecord.h"

namespace Trellis {
namespace Network {

// The name servers and search domains of one netstack. Its constructor reads
// them (a host operation, "DnsConfigImpl::DnsConfigImpl", refusing an unknown
// netstack); the edits are checked against what it read and kept until
// SaveConfig, which applies them again to the configuration as it stands
// then, in one transaction, so that edits of two processes at once are both
// kept. An edit SaveConfig cannot apply any more refuses the whole save.
class DnsConfigImpl {
public:
    explicit DnsConfigImpl(std::string const& netstackKey);
    ~DnsConfigImpl();

    // Refuse an unset address, a server the list has, and one it lacks.
    void AddNameServer(Gantry::Network::IpAddress& server);
    void RemoveNameServer(Gantry::Network::IpAddress& server);
    void RemoveNameServers();
    // In order, as texts; with the edits not saved yet.
    std::vector<std::string> GetNameServers();

    // Domains compare without regard to case. Refuse an empty domain, one
    // with blanks or control characters, a domain the list has, and one it
    // lacks.
    void AddSearchDomain(std::string const& domain);
    void RemoveSearchDomain(std::string domain);
    // The domains in order, separated by blanks.
    std::string GetSearchDomainsString();

    void SaveConfig();

private:
    struct Edit {
        enum class Kind { AddServer, RemoveServer, RemoveServers, AddDomain, RemoveDomain } kind;
        std::string value;
    };
    void Apply(Edit const& edit, Trellis::Host::DnsRecord& dns) const;

    std::string netstackKey_;
    Trellis::Host::DnsRecord dns_;
    std::vector<Edit> edits_;
};

}  // namespace Network
}  // namespace Trellis
