#include "trellis/network/DnsConfigImpl.h"

#include <algorithm>
#include <sstream>

#include "RoutingStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::DnsRecord;
using Trellis::Host::NetstackRecord;
using Trellis::Host::Operation;
using Trellis::Host::Transaction;

const Operation kConstruct("DnsConfigImpl::DnsConfigImpl");
const Operation kAddNameServer("DnsConfigImpl::AddNameServer");
const Operation kRemoveNameServer("DnsConfigImpl::RemoveNameServer");
const Operation kRemoveNameServers("DnsConfigImpl::RemoveNameServers");
const Operation kGetNameServers("DnsConfigImpl::GetNameServers");
const Operation kAddSearchDomain("DnsConfigImpl::AddSearchDomain");
const Operation kRemoveSearchDomain("DnsConfigImpl::RemoveSearchDomain");
const Operation kGetSearchDomainsString("DnsConfigImpl::GetSearchDomainsString");
const Operation kSaveConfig("DnsConfigImpl::SaveConfig");

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

}  // namespace

DnsConfigImpl::DnsConfigImpl(std::string const& netstackKey)
    : netstackKey_(netstackKey),
      dns_(kConstruct.Read([&](Transaction& t) { return RoutingStore::RequireNetstack(t, netstackKey).dns; })) {}

DnsConfigImpl::~DnsConfigImpl() {}

// Refuses an edit that does not fit dns: at the edit against what was read,
// and again at the save against the configuration as it stands then.
void DnsConfigImpl::Apply(Edit const& edit, DnsRecord& dns) const {
    auto& servers = dns.nameServers;
    auto& domains = dns.searchDomains;
    switch (edit.kind) {
        case Edit::Kind::AddServer:
            if (std::find(servers.begin(), servers.end(), edit.value) != servers.end())
                Refuse("The name server " + edit.value + " is already configured for netstack " + netstackKey_);
            servers.push_back(edit.value);
            break;
        case Edit::Kind::RemoveServer: {
            auto found = std::find(servers.begin(), servers.end(), edit.value);
            if (found == servers.end())
                Refuse("The name server " + edit.value + " is not configured for netstack " + netstackKey_);
            servers.erase(found);
            break;
        }
        case Edit::Kind::RemoveServers:
            servers.clear();
            break;
        case Edit::Kind::AddDomain:
            if (dns.HasDomain(edit.value))
                Refuse("The search domain " + edit.value + " is already configured for netstack " + netstackKey_);
            domains.push_back(edit.value);
            break;
        case Edit::Kind::RemoveDomain: {
            auto found = dns.FindDomain(edit.value);
            if (found == domains.end())
                Refuse("The search domain " + Trellis::Host::Printable(edit.value) + " is not configured for netstack " +
                       netstackKey_);
            domains.erase(found);
            break;
        }
    }
}

void DnsConfigImpl::AddNameServer(Gantry::Network::IpAddress& server) {
    kAddNameServer.Check();
    if (server.IsUnset()) Refuse("Invalid name server " + server.GetStringAddress() + ": it is the unspecified address");
    Edit edit{Edit::Kind::AddServer, server.GetStringAddress()};
    Apply(edit, dns_);
    edits_.push_back(edit);
}

void DnsConfigImpl::RemoveNameServer(Gantry::Network::IpAddress& server) {
    kRemoveNameServer.Check();
    Edit edit{Edit::Kind::RemoveServer, server.GetStringAddress()};
    Apply(edit, dns_);
    edits_.push_back(edit);
}

void DnsConfigImpl::RemoveNameServers() {
    kRemoveNameServers.Check();
    Edit edit{Edit::Kind::RemoveServers, ""};
    Apply(edit, dns_);
    edits_.push_back(edit);
}

std::vector<std::string> DnsConfigImpl::GetNameServers() {
    kGetNameServers.Check();
    return dns_.nameServers;
}

void DnsConfigImpl::AddSearchDomain(std::string const& domain) {
    kAddSearchDomain.Check();
    if (domain.empty()) Refuse("Invalid search domain: it is empty");
    if (domain.find_first_of(" \t") != std::string::npos || !Trellis::Host::TextProblem(domain).empty())
        Refuse("Invalid search domain " + Trellis::Host::Printable(domain) +
               ": a domain name has no blanks or control characters");
    Edit edit{Edit::Kind::AddDomain, domain};
    Apply(edit, dns_);
    edits_.push_back(edit);
}

void DnsConfigImpl::RemoveSearchDomain(std::string domain) {
    kRemoveSearchDomain.Check();
    Edit edit{Edit::Kind::RemoveDomain, domain};
    Apply(edit, dns_);
    edits_.push_back(edit);
}

std::string DnsConfigImpl::GetSearchDomainsString() {
    kGetSearchDomainsString.Check();
    std::ostringstream text;
    for (std::size_t i = 0; i < dns_.searchDomains.size(); ++i) text << (i == 0 ? "" : " ") << dns_.searchDomains[i];
    return text.str();
}

void DnsConfigImpl::SaveConfig() {
    dns_ = kSaveConfig.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        for (Edit const& edit : edits_) Apply(edit, netstack.dns);
        t.Put(netstack);
        return netstack.dns;
    });
    edits_.clear();
}

}  // namespace Network
}  // namespace Trellis
