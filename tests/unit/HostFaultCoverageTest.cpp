// Every host operation's fault fires where a user can arm it: for each
// registered operation, a fault armed on it fails a command line of the
// network tree that reaches it (exit 1, the message on standard error). An
// operation that no built command reaches yet is called directly instead.
// A new host operation must join one of the two tables, or this test fails.

#include <fstream>
#include <functional>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "FailureOf.h"
#include "TempHost.h"
#include "plinth/autocli/Namespace.h"
#include "plinth/autocli/PluginEntry.h"
#include "plinth/cli/Tool.h"
#include "trellis/host/Faults.h"
#include "trellis/host/Operation.h"
#include "trellis/network/DnsConfigImpl.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/network/PortImpl.h"
#include "trellis/util/Exec.h"

namespace {

using Trellis::Host::Fault;
using Trellis::Host::FaultKind;
using Trellis::Host::Operation;
using Words = std::vector<std::string>;

struct CommandRow {
    std::string operation;
    Words commandLine;
    std::string host = {};  // a host description; the default host when empty
};

struct DirectRow {
    std::string operation;
    // Calls the operation and returns what its caller sees of the fault.
    std::function<std::string()> seen;
};

// The operations the unit tests register for themselves, all named "HostTest::...".
bool IsTestOnly(const std::string& operation) { return operation.rfind("HostTest::", 0) == 0; }

const Words kFirewallGet = {"network", "firewall", "get"};
const Words kFirewallRefresh = {"network", "firewall", "refresh"};
const Words kFirewallUnload = {"network", "firewall", "unload"};
const Words kRulesetList = {"network", "firewall", "ruleset", "list"};
const Words kDisableDns = {"network", "firewall", "ruleset", "set", "-r", "dns", "-e", "false"};
const Words kVswitchList = {"network", "vswitch", "standard", "list"};
const Words kVswitchSetMtu = {"network", "vswitch", "standard", "set", "-v", "switch0", "-m", "9000"};
const Words kPortGroupList = {"network", "vswitch", "standard", "portgroup", "list"};
const Words kSwitchFailoverSet = {"network", "vswitch", "standard", "policy", "failover", "set", "-v", "switch0", "-a", "pnet0"};
const Words kGroupSecurityGet = {"network", "vswitch", "standard", "portgroup", "policy", "security", "get", "-p", "Guest Network"};
const Words kGroupShapingGet = {"network", "vswitch", "standard", "portgroup", "policy", "shaping", "get", "-p", "Guest Network"};
const Words kGroupFailoverGet = {"network", "vswitch", "standard", "portgroup", "policy", "failover", "get", "-p", "Guest Network"};

const Words kDvsList = {"network", "vswitch", "dvs", "korvex", "list"};
const Words kLacpConfig = {"network", "vswitch", "dvs", "korvex", "lacp", "config", "get"};
const Words kLacpStatus = {"network", "vswitch", "dvs", "korvex", "lacp", "status", "get"};
const Words kLacpTimeout = {"network", "vswitch", "dvs", "korvex", "lacp", "timeout", "set", "-t", "true", "-l", "1", "-s", "dvSwitch0"};
const Words kVmList = {"network", "vm", "list"};
const Words kVmPortList = {"network", "vm", "port", "list", "-w", "69312"};
const Words kPortStats = {"network", "port", "stats", "get", "-p", "33554437"};
const Words kFilterStats = {"network", "port", "filter", "stats", "get", "-p", "33554437"};

// dvSwitch1 with an uplink port that has LACP on and no NIC: its LACP
// configuration is found through the uplink ports' names.
std::string UplinkPortWithoutNic() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["distributedSwitches"][1]["ports"][3] = {{"id", "3"},
                                                   {"portGroupId", "dvportgroup-200"},
                                                   {"uplinkName", "uplink1"},
                                                   {"lacp", {{"enabled", true}, {"mode", "passive"}}}};
    });
}

const Words kIfList = {"network", "ip", "interface", "list"};
const Words kIfAdd = {"network", "ip", "interface", "add", "-p", "Guest Network"};
const Words kIfAddOnDvPort = {"network", "ip", "interface", "add", "-s", "dvSwitch0", "-P", "3"};
const Words kIfSet = {"network", "ip", "interface", "set", "-i", "tsl0", "-e", "false", "-m", "9000"};
const Words kIpv4Set = {"network", "ip", "interface", "ipv4", "set", "-i", "tsl0", "-t", "static", "-I", "192.0.2.11", "-N", "255.255.255.0"};
const Words kTagAdd = {"network", "ip", "interface", "tag", "add", "-i", "tsl0", "-t", "Glide"};
const Words kNetstackGet = {"network", "ip", "netstack", "get", "-N", "defaultTcpipStack"};
const Words kNetstackSet = {"network", "ip", "netstack", "set", "-N", "defaultTcpipStack", "-n", "Main", "-e", "true", "-m", "500", "-c", "cubic", "-i", "true"};
const Words kRoute4List = {"network", "ip", "route", "ipv4", "list"};
const Words kRoute4RemoveDefault = {"network", "ip", "route", "ipv4", "remove", "-n", "default", "-g", "192.0.2.1"};
const Words kRoute6RemoveDefault = {"network", "ip", "route", "ipv6", "remove", "-n", "default", "-g", "2001:db8::1"};
const Words kNeighborList = {"network", "ip", "neighbor", "list"};
const Words kNicList = {"network", "nic", "list"};
const Words kNicGet = {"network", "nic", "get", "-n", "pnet0"};

// The netstack of live migration, in the kernel.
std::string WithGlideNetstack() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["netstacks"].push_back({{"key", "glide"}, {"inKernel", true}, {"maxConnections", 11000},
                                  {"congestionControl", "newreno"}, {"ipv6Enabled", true}});
    });
}

// tsl0 attached to DVPort 3 of dvSwitch0, or to an opaque network.
std::string WithInterfaceOn(const TempHost::Json& point) {
    return TempHost::Edited([&](TempHost::Json& d) {
        d["tesselNics"][0]["connectionPoint"] = point;
        for (auto& port : d["ports"])
            if (port["clientName"] == "tsl0") {
                if (point.contains("dvPort")) {
                    port["portset"] = "dvSwitch0";
                    port.erase("portGroup");
                    port["dvPort"] = "3";
                } else {
                    port["clientName"] = "tsl9";  // a port without its interface
                }
            }
    });
}

const Words kDnsServerAdd = {"network", "ip", "dns", "server", "add", "-s", "192.0.2.1"};
const Words kDnsServerList = {"network", "ip", "dns", "server", "list"};
const Words kConnectionList = {"network", "ip", "connection", "list"};
const Words kSaAdd = {"network", "ip", "ipsec", "sa", "add", "-n", "sa-new", "-s", "any", "-d", "any", "-p", "99",
                      "-e", "null", "-i", "hmac-sha1", "-K", "0123456789abcdef0123"};
const Words kSpAdd = {"network", "ip", "ipsec", "sp", "add", "-n", "sp-new", "-s", "any", "-d", "any", "-p", "0",
                      "-P", "0", "-A", "ipsec", "-a", "sa-web", "-m", "transport", "-u", "tcp", "-w", "in"};

// A key exchange configuration the host accepts, for the steps behind its check.
Words IpsecSetOfAGoodFile() {
    static const std::string path = [] {
        std::string file = ::testing::TempDir() + "halden-fault-coverage-ike.conf";
        std::ofstream(file) << "[global]\nlog = info\n";
        return file;
    }();
    return {"network", "ip", "ipsec", "set", "-f", path};
}

std::string UnloadedFirewall() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["modules"][0]["loaded"] = false;
        d["firewall"]["rulesetsLoaded"] = false;
    });
}

std::string WithDynamicRule() {
    return TempHost::Edited([](TempHost::Json& d) {
        d["firewall"]["dynamicRules"] = TempHost::Json::array({{{"name", "probe"},
                                                                 {"portType", "dst"},
                                                                 {"portBegin", 9000},
                                                                 {"portEnd", 9000},
                                                                 {"direction", "inbound"},
                                                                 {"protocol", "tcp"}}});
    });
}

const std::vector<CommandRow>& CommandTable() {
    static const std::vector<CommandRow> rows = {
        {"SystemInfoImpl::SystemInfoImpl", kFirewallGet},
        {"SystemInfoImpl::IsFirewallEnabled", kFirewallGet},
        {"SystemInfoImpl::GetFirewallDefaultAction", kFirewallGet},
        {"SystemInfoImpl::SetFirewallEnabled", {"network", "firewall", "set", "-e", "false"}},
        {"SystemInfoImpl::SetFirewallDefaultAction", {"network", "firewall", "set", "-d", "true"}},
        {"SystemInfoImpl::GetFirewallDynamicRules", kFirewallRefresh},
        {"SystemInfoImpl::LoadFirewallRulesets", kFirewallRefresh},
        {"SystemInfoImpl::AddFirewallDynamicRule", kFirewallRefresh, WithDynamicRule()},
        {"SystemInfoImpl::DestroyFirewallFilters", kFirewallUnload},
        {"SystemInfoImpl::GetFirewallRulesets", kRulesetList},
        {"SystemInfoImpl::GetFirewallRulesetById", kDisableDns},
        {"ModuleImpl::ModuleImpl", kFirewallGet},
        {"ModuleImpl::IsLoaded", kFirewallGet},
        {"ModuleImpl::Load", {"network", "firewall", "load"}, UnloadedFirewall()},
        {"ModuleImpl::Unload", kFirewallUnload},
        {"FirewallRuleset::GetName", kRulesetList},
        {"FirewallRuleset::IsEnabled", kRulesetList},
        {"FirewallRuleset::IsLoaded", kDisableDns},
        {"FirewallRuleset::IsAllowedAll", kDisableDns},
        {"FirewallRuleset::Disable", kDisableDns},
        {"FirewallRuleset::Enable", {"network", "firewall", "ruleset", "set", "-r", "sshServer", "-e", "true"}},
        {"FirewallRuleset::SetAllowedAll", {"network", "firewall", "ruleset", "set", "-r", "dns", "-a", "false"}},
        {"FirewallRuleset::GetRules", {"network", "firewall", "ruleset", "rule", "list"}},
        {"FirewallRuleset::GetAllowedIpList",
         {"network", "firewall", "ruleset", "allowedip", "list", "-r", "webAccess"}},
        {"FirewallRuleset::AddAllowedIp",
         {"network", "firewall", "ruleset", "allowedip", "add", "-r", "webAccess", "-i", "192.0.2.77"}},
        {"FirewallRuleset::RemoveAllowedIp",
         {"network", "firewall", "ruleset", "allowedip", "remove", "-r", "webAccess", "-i", "192.0.2.10"}},

        {"VirtualSwitchInfoImpl::VirtualSwitchInfoImpl", {"network", "vswitch", "standard", "add", "-v", "switch1"}},
        {"VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy",
         {"network", "vswitch", "standard", "add", "-v", "switch1"}},
        {"VirtualSwitchInfoImpl::GetVirtualSwitches", kVswitchList},
        {"VirtualSwitchInfoImpl::GetVirtualSwitchByName", kVswitchSetMtu},
        {"VirtualSwitchInfoImpl::RemoveVirtualSwitch", {"network", "vswitch", "standard", "remove", "-v", "switch0"}},
        {"PortsetImpl::IsValidVirtualSwitch", kVswitchSetMtu},
        {"Portset::GetName", kVswitchList},
        {"Portset::GetClass", kVswitchList},
        {"Portset::GetNumPorts", kVswitchList},
        {"Portset::GetUsedPorts", kVswitchList},
        {"Portset::GetConfiguredPorts", kVswitchList},
        {"Portset::GetUplinks", kVswitchList},
        {"VirtualSwitch::GetMtu", kVswitchList},
        {"VirtualSwitch::GetCdpStatus", kVswitchList},
        {"VirtualSwitch::GetBeaconEnabled", kVswitchList},
        {"VirtualSwitch::GetBeaconInterval", kVswitchList},
        {"VirtualSwitch::GetBeaconThreshold", kVswitchList},
        {"VirtualSwitch::GetBeaconRequiredBy", kVswitchList},
        {"VirtualSwitch::GetPortGroups", kVswitchList},
        {"VirtualSwitch::SetMtu", kVswitchSetMtu},
        {"VirtualSwitch::SetCdpStatus", {"network", "vswitch", "standard", "set", "-v", "switch0", "-c", "down"}},
        {"NetworkFactory::GetVirtualSwitchById",
         {"network", "vswitch", "standard", "uplink", "add", "-v", "switch0", "-u", "pnet1"}},
        {"VirtualSwitch::AddUplink", {"network", "vswitch", "standard", "uplink", "add", "-v", "switch0", "-u", "pnet1"}},
        {"VirtualSwitch::RemoveUplink",
         {"network", "vswitch", "standard", "uplink", "remove", "-v", "switch0", "-u", "pnet0"}},
        {"VirtualSwitch::AddPortGroup",
         {"network", "vswitch", "standard", "portgroup", "add", "-p", "Storage", "-v", "switch0"}},
        {"VirtualSwitch::RemovePortGroup",
         {"network", "vswitch", "standard", "portgroup", "remove", "-p", "Guest Network", "-v", "switch0"}},
        {"NetworkInfoImpl::NetworkInfoImpl", kPortGroupList},
        {"NetworkInfoImpl::GetPnics", kVswitchList},
        {"Pnic::GetName", kVswitchList},
        {"NetworkInfoImpl::GetAllPortGroups", kPortGroupList},
        {"PortGroup::GetName", kPortGroupList},
        {"PortGroup::GetVirtualSwitchName", kPortGroupList},
        {"PortGroupImpl::GetActiveClients", kPortGroupList},
        {"PortGroup::GetVlanId", kPortGroupList},
        {"NetworkFactory::GetPortGroupByName",
         {"network", "vswitch", "standard", "portgroup", "set", "-p", "Guest Network", "-v", "10"}},
        {"PortGroup::SetVlanId",
         {"network", "vswitch", "standard", "portgroup", "set", "-p", "Guest Network", "-v", "10"}},

        {"VirtualSwitch::GetSecurityPolicy", {"network", "vswitch", "standard", "policy", "security", "get", "-v", "switch0"}},
        {"VirtualSwitch::ApplySecurityPolicy",
         {"network", "vswitch", "standard", "policy", "security", "set", "-v", "switch0", "-p", "true"}},
        {"VirtualSwitch::GetShapingPolicy", {"network", "vswitch", "standard", "policy", "shaping", "get", "-v", "switch0"}},
        {"VirtualSwitch::ApplyShapingPolicy",
         {"network", "vswitch", "standard", "policy", "shaping", "set", "-v", "switch0", "-e", "false"}},
        {"VirtualSwitch::GetTeamingPolicy", {"network", "vswitch", "standard", "policy", "failover", "get", "-v", "switch0"}},
        {"VirtualSwitch::GetLocalTeamingPolicy", kSwitchFailoverSet},
        {"VirtualSwitch::ApplyTeamingPolicy", kSwitchFailoverSet},
        {"PnicImpl::IsValidPnic", kSwitchFailoverSet},
        {"PortGroup::GetSecurityPolicy", kGroupSecurityGet},
        {"PortGroup::GetLocalSecurityPolicy", kGroupSecurityGet},
        {"PortGroup::ApplySecurityPolicy",
         {"network", "vswitch", "standard", "portgroup", "policy", "security", "set", "-p", "Guest Network", "-o", "true"}},
        {"PortGroup::GetShapingPolicy", kGroupShapingGet},
        {"PortGroup::GetLocalShapingPolicy", kGroupShapingGet},
        {"PortGroup::GetVirtualSwitch", kGroupShapingGet},
        {"PortGroup::ApplyShapingPolicy",
         {"network", "vswitch", "standard", "portgroup", "policy", "shaping", "set", "-p", "Guest Network", "-e", "false"}},
        {"PortGroup::GetTeamingPolicy", kGroupFailoverGet},
        {"PortGroup::GetLocalTeamingPolicy", kGroupFailoverGet},
        {"PortGroup::ApplyTeamingPolicy",
         {"network", "vswitch", "standard", "portgroup", "policy", "failover", "set", "-p", "Guest Network", "-b", "true"}},
        {"VirtualSwitchInfoImpl::GetDVSwitches", kDvsList},
        {"DVSwitch::GetId", kDvsList},
        {"DVSwitch::GetMtu", kDvsList},
        {"DVSwitch::GetBeaconTimeout", kDvsList},
        {"DVSwitch::GetCdpStatus", kDvsList},
        {"DVSwitchImpl::IsKorvexBranded", kDvsList},
        {"DVSwitch::GetDVPorts", kDvsList},
        {"DVPort::GetPortId", kDvsList},
        {"DVPort::IsInUse", kDvsList},
        {"DVPort::GetPortGroupId", kDvsList},
        {"DVSwitch::GetUplinkPortParams", kLacpConfig},
        {"NetworkFactory::GetDVPort", kLacpConfig},
        {"DVPort::GetLacpConfig", kLacpConfig},
        {"DVPort::GetUplinkName", kLacpConfig},
        {"DVSwitch::GetLagConfigs", kLacpConfig},
        {"DVSwitch::GetUplinkPortNames", {"network", "vswitch", "dvs", "korvex", "lacp", "config", "get", "-s", "dvSwitch1"}},
        {"DVSwitch::GetUplinkPort", {"network", "vswitch", "dvs", "korvex", "lacp", "config", "get", "-s", "dvSwitch1"},
         UplinkPortWithoutNic()},
        {"DVSwitch::GetLacpGroups", kLacpStatus},
        {"DVSwitch::FreeLacpGroups", {"network", "vswitch", "dvs", "korvex", "lacp", "stats", "get"}},
        {"NetworkFactory::GetDVSwitchByName", kLacpTimeout},
        {"DVSwitch::SetLacpTimeout", kLacpTimeout},
        {"VirtualSwitchInfoImpl::GetAllSwitches", kVmList},
        {"VirtualSwitchInfoImpl::IsLegacySwitch", kVmList},
        {"PortsetImpl::GetPorts", kVmList},
        {"PortImpl::GetWorldId", kVmList},
        {"PortImpl::GetPortGroupName", kVmList},
        {"PortImpl::GetDVPortId", kVmList},
        {"DVPortImpl::GetDVPortgroupId", kVmList},
        {"WorldImpl::GetWorldName", kVmList},
        {"PortImpl::GetPortId", kVmPortList},
        {"PortImpl::GetMacAddresses", kVmPortList},
        {"PortImpl::GetIpv4Address", kVmPortList},
        {"PortImpl::GetTeamUplink", kVmPortList},
        {"PortImpl::GetFilterStats", kVmPortList},
        {"PortImpl::GetByteStats", kPortStats},
        {"PortImpl::GetPacketStats", kPortStats},
        {"PortImpl::GetClientType", kFilterStats},
        {"TesselNicInfoImpl::TesselNicInfoImpl", kIfList},
        {"TesselNicInfoImpl::GetTesselNics", kIfList},
        {"TesselNicInfoImpl::GetTesselNicsByInstanceKey", {"network", "ip", "interface", "list", "-N", "defaultTcpipStack"}},
        {"TesselNicInfoImpl::GetTesselNicByInterface", kIpv4Set},
        {"TesselNicInfoImpl::AddTesselNic", kIfAdd},
        {"TesselNicInfoImpl::RemoveTesselNic", {"network", "ip", "interface", "remove", "-p", "Host Management"}},
        {"TesselNicInfoImpl::GetTesselNicsByTag", {"network", "ip", "interface", "add", "-p", "Guest Network", "-N", "glide"},
         WithGlideNetstack()},
        {"TesselNicInfoImpl::GetTesselNicNamesByInstanceKey", kTagAdd, WithGlideNetstack()},
        {"NetworkFactory::GetNetworkInfo", kTagAdd},
        {"NetworkInfo::GetNetstackInstanceState", kTagAdd},
        {"PortGroupImpl::PortGroupImpl", kIfAdd},
        {"ConnectionPoint::IsValid", kIfAdd},
        {"ConnectionPoint::GetType", kIfList},
        {"ConnectionPoint::GetPortsetName", kIfList},
        {"ConnectionPoint::GetPortGroupName", kIfList},
        {"ConnectionPoint::GetDVPortParam", kIfAddOnDvPort},
        {"ConnectionPoint::GetOpaqueNetworkParam", kIfList,
         WithInterfaceOn({{"opaqueNetwork", {{"networkId", "net-7"}, {"networkType", "overlay"}, {"externalId", "x"}}}})},
        {"VirtualSwitchInfoImpl::GetDVSwitchByName", kIfList,
         WithInterfaceOn({{"dvSwitch", "dvSwitch0"}, {"dvPort", "3"}, {"connectionId", 7}})},
        {"DVPortImpl::GetConnectionId", kIfAddOnDvPort},
        {"DVPortImpl::SetConnectionId", kIfAddOnDvPort},
        {"TslNic::GetName", kIfList},
        {"TslNic::GetMacAddress", kIfList},
        {"TslNic::GetConnectionPoint", kIfList},
        {"TslNic::GetNetstackInstanceKey", kIfList},
        {"TslNic::GetMtu", kIfList},
        {"TslNic::GetTsoMss", kIfList},
        {"TslNic::IsEnabled", kIfList},
        {"TslNic::GetPort", kIfList},
        {"TslNic::Activate", kIfAdd},
        {"TslNic::Disable", kIfSet},
        {"TslNic::Enable", {"network", "ip", "interface", "set", "-i", "tsl0", "-e", "true"}},
        {"TslNic::SetMtu", kIfSet},
        {"TslNic::Remove", {"network", "ip", "interface", "remove", "-i", "tsl0"}},
        {"TslNic::GetIpConfig", {"network", "ip", "interface", "ipv4", "get"}},
        {"TslNic::GetConfiguredIpConfig", {"network", "ip", "interface", "ipv6", "set", "-i", "tsl0", "-r", "true"}},
        {"TslNic::SetIpConfig", kIpv4Set},
        {"TslNic::GetTags", {"network", "ip", "interface", "tag", "get", "-i", "tsl0"}},
        {"TslNic::AddTag", {"network", "ip", "interface", "tag", "add", "-i", "tsl0", "-t", "Storage"}},
        {"TslNic::RemoveTag", {"network", "ip", "interface", "tag", "remove", "-i", "tsl0", "-t", "Management"}},
        {"NetstackInstanceImpl::GetCongestionControlAlgorithmList", kNetstackSet},
        {"NetworkInfoImpl::AddNetstackInstance", {"network", "ip", "netstack", "add", "-N", "backupStack"}},
        {"NetworkInfoImpl::RemoveNetstackInstance", {"network", "ip", "netstack", "remove", "-N", "glide"},
         WithGlideNetstack()},
        {"NetworkInfoImpl::ListNetstackInstances", {"network", "ip", "netstack", "list"}},
        {"NetworkInfoImpl::LookupNetstackInstanceByKey", kNetstackGet},
        {"NetworkInfoImpl::IsTslIpv6Enabled", kNeighborList},
        {"NetstackInstance::GetKey", kNetstackGet},
        {"NetstackInstance::GetName", kNetstackGet},
        {"NetstackInstance::GetMaxConnections", kNetstackGet},
        {"NetstackInstance::GetCurrentMaxConnections", kNetstackGet},
        {"NetstackInstance::GetCongestionControlAlgorithm", kNetstackGet},
        {"NetstackInstance::GetIpv6Enabled", kNetstackGet},
        {"NetstackInstance::GetCurrentIpv6Enabled", kNetstackGet},
        {"NetstackInstance::GetState", kNetstackGet},
        {"NetstackInstance::SetName", kNetstackSet},
        {"NetstackInstance::Enable", kNetstackSet},
        {"NetstackInstance::Disable", {"network", "ip", "netstack", "set", "-N", "defaultTcpipStack", "-e", "false"}},
        {"NetstackInstance::SetMaxConnections", kNetstackSet},
        {"NetstackInstance::SetCongestionControlAlgorithm", kNetstackSet},
        {"NetstackInstance::SetIpv6Enabled", kNetstackSet},
        {"RoutingInfoImpl::AddTesselRoute", {"network", "ip", "route", "ipv4", "add", "-n", "203.0.113.0/24", "-g", "192.0.2.254"}},
        {"RoutingInfoImpl::RemoveTesselRoute", {"network", "ip", "route", "ipv4", "remove", "-n", "198.51.100.0/24", "-g", "192.0.2.254"}},
        {"RoutingInfoImpl::AddIpv6TesselRoute", {"network", "ip", "route", "ipv6", "add", "-n", "2001:db8:5::/48", "-g", "2001:db8::fe"}},
        {"RoutingInfoImpl::RemoveIpv6TesselRoute", {"network", "ip", "route", "ipv6", "remove", "-n", "2001:db8:5::/48", "-g", "2001:db8::fe"}},
        {"RoutingInfoImpl::GetCurrentTesselRoutes", kRoute4List},
        {"RoutingInfoImpl::GetDefaultGatewaySource", kRoute4List},
        {"RoutingInfoImpl::GetCurrentIpv6TesselRoutes", {"network", "ip", "route", "ipv6", "list"}},
        {"RoutingInfoImpl::GetTesselDefaultGateway", kRoute4RemoveDefault},
        {"RoutingInfoImpl::GetTesselConfigDefaultGateway", {"network", "ip", "route", "ipv4", "remove", "-n", "default", "-g", "192.0.2.99"}},
        {"RoutingInfoImpl::SetTesselDefaultGateway", kRoute4RemoveDefault},
        {"RoutingInfoImpl::GetIpv6TesselDefaultGateway", kRoute6RemoveDefault},
        {"RoutingInfoImpl::GetIpv6TesselConfigDefaultGateway", {"network", "ip", "route", "ipv6", "remove", "-n", "default", "-g", "2001:db8::99"}},
        {"RoutingInfoImpl::SetIpv6TesselDefaultGateway", kRoute6RemoveDefault},
        {"RoutingInfoImpl::GetCurrentIpv4TesselNeighbors", kNeighborList},
        {"RoutingInfoImpl::GetCurrentIpv6TesselNeighbors", kNeighborList},
        {"RoutingInfoImpl::GetIpv4NeighborType", kNeighborList},
        {"RoutingInfoImpl::GetIpv6NeighborType", kNeighborList},
        {"RoutingInfoImpl::GetIpv6NeighborState", kNeighborList},
        {"RoutingInfoImpl::RemoveIpv4Neighbor", {"network", "ip", "neighbor", "remove", "-v", "4", "-a", "192.0.2.1"}},
        {"RoutingInfoImpl::RemoveIpv6Neighbor", {"network", "ip", "neighbor", "remove", "-v", "6", "-a", "2001:db8::1"}},
        {"NetworkInfoImpl::SetTslIpv6Enabled", {"network", "ip", "set", "-e", "false"}},
        {"NetworkInfoImpl::GetCurrentTcpTesselConnections", kConnectionList},
        {"NetworkInfoImpl::GetCurrentUdpTesselConnections", kConnectionList},
        {"NetworkInfoImpl::GetCurrentIpTesselConnections", kConnectionList},
        {"ResourceInfoImpl::ResourceInfoImpl", kConnectionList},
        {"ResourceInfoImpl::GetWorldName", kConnectionList},
        {"DnsConfigImpl::DnsConfigImpl", kDnsServerList},
        {"DnsConfigImpl::GetNameServers", kDnsServerList},
        {"DnsConfigImpl::AddNameServer", kDnsServerAdd},
        {"DnsConfigImpl::SaveConfig", kDnsServerAdd},
        {"DnsConfigImpl::RemoveNameServer", {"network", "ip", "dns", "server", "remove", "-s", "192.0.2.53"}},
        {"DnsConfigImpl::GetSearchDomainsString", {"network", "ip", "dns", "search", "list"}},
        {"DnsConfigImpl::AddSearchDomain", {"network", "ip", "dns", "search", "add", "-d", "x.example"}},
        {"DnsConfigImpl::RemoveSearchDomain", {"network", "ip", "dns", "search", "remove", "-d", "example.com"}},
        {"IpSecConfigImpl::IpSecConfigImpl", {"network", "ip", "ipsec", "sa", "list"}},
        {"IpSecConfigImpl::GetSADConfigList", {"network", "ip", "ipsec", "sa", "list"}},
        {"IpSecConfigImpl::StringToIpSecMode", kSaAdd},
        {"IpSecConfigImpl::StringToIpSecEncyptAlgo", kSaAdd},
        {"IpSecConfigImpl::StringToIpSecAuthAlgo", kSaAdd},
        {"IpSecConfigImpl::AddSADConfig", kSaAdd},
        {"IpSecConfigImpl::RemoveSADConfig", {"network", "ip", "ipsec", "sa", "remove", "-n", "sa-web"}},
        {"IpSecConfigImpl::RemoveAutoSADConfig",
         {"network", "ip", "ipsec", "sa", "remove", "-n", "auto", "-s", "2001:db8::21", "-d", "2001:db8::10", "-p", "c0de"}},
        {"IpSecConfigImpl::FlushSADConfig", {"network", "ip", "ipsec", "sa", "remove", "-a"}},
        {"IpSecConfigImpl::StringToIpSecULProtoType", kSpAdd},
        {"IpSecConfigImpl::StringToIpSecDirection", kSpAdd},
        {"IpSecConfigImpl::StringToIpSecAction", kSpAdd},
        {"IpSecConfigImpl::AddSPDConfig", kSpAdd},
        {"IpSecConfigImpl::GetSPDConfigList", {"network", "ip", "ipsec", "sp", "list"}},
        {"IpSecConfigImpl::RemoveSPDConfig", {"network", "ip", "ipsec", "sp", "remove", "-n", "sp-drop"}},
        {"IpSecConfigImpl::FlushSPDConfig", {"network", "ip", "ipsec", "sp", "remove", "-a"}},
        {"IpSecConfigImpl::CheckIKEConfig", {"network", "ip", "ipsec", "set", "-f", "/nonexistent/ike.conf"}},
        {"IpSecConfigImpl::CopyIKEConfig", IpsecSetOfAGoodFile()},
        {"IpSecConfigImpl::RestartIKEDaemons", IpsecSetOfAGoodFile()},
        {"NetworkInfoImpl::GetPnicByName", {"network", "nic", "register", "dump", "-n", "pnet0"}},
        {"Pnic::GetRegisterDump", {"network", "nic", "register", "dump", "-n", "pnet0"}},
        {"Pnic::GetEepromDump", {"network", "nic", "eeprom", "dump", "-n", "pnet0"}},
        {"Pnic::SetEepromValue", {"network", "nic", "eeprom", "change", "-n", "pnet0", "-m", "284917894", "-o", "0", "-v", "0"}},
        {"Pnic::SetEepromFromFile", {"network", "nic", "eeprom", "change", "-n", "pnet0", "-m", "284917894", "-f", "/nonexistent"}},
        {"Pnic::RunSelfTest", {"network", "nic", "selftest", "run", "-n", "pnet0"}},
        {"Pnic::GetPciDevice", kNicList},
        {"PciDevice::GetAddressString", kNicList},
        {"PciDevice::GetVendorName", kNicList},
        {"PciDevice::GetDeviceName", kNicList},
        {"Pnic::GetDriverName", kNicList},
        {"Pnic::IsLinkUp", kNicList},
        {"Pnic::IsAdminUp", kNicList},
        {"Pnic::IsLinkStatusUp", kNicList},
        {"Pnic::GetSpeed", kNicList},
        {"Pnic::GetDuplex", kNicList},
        {"Pnic::GetMacAddress", kNicList},
        {"Pnic::GetMtu", kNicList},
        {"Pnic::GetPnicInfo", kNicGet},
        {"Pnic::GetPauseParams", kNicGet},
        {"Pnic::GetDriverInfo", kNicGet},
        {"Pnic::SetAdminUp", {"network", "nic", "down", "-n", "pnet0"}},
        {"Pnic::SetPnicInfo", {"network", "nic", "set", "-n", "pnet0", "-p", "fibre"}},
        {"Pnic::SetSpeedDuplex", {"network", "nic", "set", "-n", "pnet0", "-a"}},
        {"Pnic::RestartNegotiation", {"network", "nic", "negotiate", "restart", "-n", "pnet0"}},
        {"PnicImpl::GetPnicStats", {"network", "nic", "stats", "get", "-n", "pnet0"}},
        {"PortsetImpl::GetUplinkVlanStats", {"network", "nic", "vlan", "stats", "get", "-n", "pnet0"}},
        {"PortsetImpl::SetUplinkVlanStatsEnabled", {"network", "nic", "vlan", "stats", "set", "-n", "pnet0", "-e", "false"}},
        {"Pnic::GetOffloadParams", {"network", "nic", "cso", "get"}},
        {"Pnic::SetOffloadParams", {"network", "nic", "sg", "set", "-n", "pnet0", "-e", "0"}},
        {"Pnic::GetCoalesceParams", {"network", "nic", "coalesce", "get"}},
        {"Pnic::SetCoalesceParams", {"network", "nic", "coalesce", "set", "-n", "pnet0", "-t", "64"}},
        {"Pnic::SetPauseParams", {"network", "nic", "pauseParams", "set", "-n", "pnet0", "-r", "false"}},
        {"Pnic::GetRingParams", {"network", "nic", "ring", "current", "get", "-n", "pnet0"}},
        {"Pnic::SetRingParams", {"network", "nic", "ring", "current", "set", "-n", "pnet0", "-t", "1024"}},
        {"Pnic::GetSoftwareParams", {"network", "nic", "software", "list"}},
        {"Pnic::SetSoftwareParams", {"network", "nic", "software", "set", "-n", "pnet0", "--sg", "true"}},
        {"NetworkInfoImpl::GetSriovNics", {"network", "sriovnic", "list"}},
        {"NetworkInfoImpl::GetSriovNicByName", {"network", "sriovnic", "vf", "list", "-n", "pnet1"}},
        {"NetworkInfoImpl::GetSriovNicVFInfo", {"network", "sriovnic", "vf", "list", "-n", "pnet1"}},
        {"NetworkInfoImpl::GetSriovNicVFStats", {"network", "sriovnic", "vf", "stats", "-n", "pnet1", "-v", "0"}},
    };
    return rows;
}

std::function<std::string()> Thrown(std::function<void()> call) {
    return [call] { return FailureOf(call); };
}

// Operations that no built command reaches, called through their facade or
// host object on the default host. A row moves to the command table when a
// command that reaches its operation is built.
const std::vector<DirectRow>& DirectTable() {
    static const std::vector<DirectRow> rows = {
        // dns server remove declares --server required, so the tool refuses --all
        // alone, which is the only way to this operation.
        {"DnsConfigImpl::RemoveNameServers",
         Thrown([] { Trellis::Network::DnsConfigImpl("defaultTcpipStack").RemoveNameServers(); })},
        // ipsec set reaches it, but reports the status in the host's words
        // ("... returned 77"), which IpIpsecTest checks.
        {"Trellis_Exec",
         [] { return "status " + std::to_string(Trellis::Util::Trellis_Exec("true", false, true, false)); }},
        // vm port list reports this failure as an uplink port id of 0.
        {"PnicImpl::GetUplinkPort", Thrown([] {
             std::unique_ptr<Trellis::Network::PortImpl>(Trellis::Network::PnicImpl("pnet0").GetUplinkPort());
         })},
    };
    return rows;
}

// A fault that tells its operation apart from every other.
Fault DistinctFault(const std::string& operation) {
    if (Operation::KindOf(operation) == FaultKind::Status) return {operation, "", 77, {}};
    return {operation, "Fault injected into " + operation, 0, {}};
}

std::string WhatTheCallerSees(const Fault& fault) {
    return fault.message.empty() ? "status " + std::to_string(fault.status) : fault.message;
}

void ExpectCommandFails(const CommandRow& row) {
    TempHost host(row.host);
    const Fault fault = DistinctFault(row.operation);
    Trellis::Host::ArmFault(fault);

    boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root = Plinth::AutoCli::Namespace::New();
    AutoCli_RegisterNamespaces(root);
    // The TempHost has opened the host already.
    Plinth::Cli::Tool tool(root, "haldencli", [](const std::string&) {});
    std::ostringstream out, err;
    EXPECT_EQ(tool.Run(row.commandLine, out, err), Plinth::Cli::EXIT_FAILED) << row.operation;
    const std::string seen = WhatTheCallerSees(fault);
    EXPECT_TRUE(err.str().find(seen) != std::string::npos)
        << row.operation << ": \"" << seen << "\" is not on standard error, which holds\n" << err.str();
}

void ExpectDirectCallFails(const DirectRow& row) {
    TempHost host;
    const Fault fault = DistinctFault(row.operation);
    Trellis::Host::ArmFault(fault);
    EXPECT_EQ(row.seen(), WhatTheCallerSees(fault)) << row.operation;
}

}  // namespace

TEST(HostFaultCoverage, AFaultOnEveryHostOperationFailsItsCaller) {
    std::map<std::string, const CommandRow*> commandRows;
    std::map<std::string, const DirectRow*> directRows;
    for (const CommandRow& row : CommandTable()) commandRows.emplace(row.operation, &row);
    for (const DirectRow& row : DirectTable()) directRows.emplace(row.operation, &row);

    for (const std::string& operation : Operation::KnownNames()) {
        if (IsTestOnly(operation)) continue;
        if (commandRows.count(operation)) {
            ExpectCommandFails(*commandRows.at(operation));
        } else if (directRows.count(operation)) {
            ExpectDirectCallFails(*directRows.at(operation));
        } else {
            ADD_FAILURE() << operation << " has no row: add a command line that reaches it, or a direct call "
                             "while no command does";
        }
    }

    // A row whose operation is gone (renamed, or misspelt) would test nothing.
    for (const auto& [operation, row] : commandRows)
        EXPECT_TRUE(Operation::IsKnown(operation)) << operation << " is not a host operation";
    for (const auto& [operation, row] : directRows) {
        EXPECT_TRUE(Operation::IsKnown(operation)) << operation << " is not a host operation";
        EXPECT_EQ(commandRows.count(operation), 0u) << operation << " has a command row: drop its direct row";
    }
}
