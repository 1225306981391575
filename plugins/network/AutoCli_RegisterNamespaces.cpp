#include <vector>

#include "FirewallGet.h"
#include "FirewallLoad.h"
#include "FirewallRefresh.h"
#include "FirewallRulesetAllowedipAdd.h"
#include "FirewallRulesetAllowedipList.h"
#include "FirewallRulesetAllowedipRemove.h"
#include "FirewallRulesetList.h"
#include "FirewallRulesetRuleList.h"
#include "FirewallRulesetSet.h"
#include "FirewallSet.h"
#include "FirewallUnload.h"
#include "IpConnectionList.h"
#include "IpDNSSearchAdd.h"
#include "IpDNSSearchList.h"
#include "IpDNSSearchRemove.h"
#include "IpDNSServerAdd.h"
#include "IpDNSServerList.h"
#include "IpDNSServerRemove.h"
#include "IpGet.h"
#include "IpInterfaceAdd.h"
#include "IpInterfaceIpv4Get.h"
#include "IpInterfaceIpv4Set.h"
#include "IpInterfaceIpv6AddressAdd.h"
#include "IpInterfaceIpv6AddressList.h"
#include "IpInterfaceIpv6AddressRemove.h"
#include "IpInterfaceIpv6Get.h"
#include "IpInterfaceIpv6Set.h"
#include "IpInterfaceList.h"
#include "IpInterfaceRemove.h"
#include "IpInterfaceSet.h"
#include "IpInterfaceTagAdd.h"
#include "IpInterfaceTagGet.h"
#include "IpInterfaceTagRemove.h"
#include "IpIpsecSAAdd.h"
#include "IpIpsecSAList.h"
#include "IpIpsecSARemove.h"
#include "IpIpsecSPAdd.h"
#include "IpIpsecSPList.h"
#include "IpIpsecSPRemove.h"
#include "IpIpsecSet.h"
#include "IpNeighborList.h"
#include "IpNeighborRemove.h"
#include "IpNetstackInstanceAdd.h"
#include "IpNetstackInstanceGet.h"
#include "IpNetstackInstanceList.h"
#include "IpNetstackInstanceRemove.h"
#include "IpNetstackInstanceSet.h"
#include "IpRouteIpv4Add.h"
#include "IpRouteIpv4List.h"
#include "IpRouteIpv4Remove.h"
#include "IpRouteIpv6Add.h"
#include "IpRouteIpv6List.h"
#include "IpRouteIpv6Remove.h"
#include "IpSet.h"
#include "LacpGetConfig.h"
#include "LacpGetStats.h"
#include "LacpGetStatus.h"
#include "LacpSetTimeout.h"
#include "NamespaceTreeBuilder.h"
#include "NicCoalesceGet.h"
#include "NicCoalesceSet.h"
#include "NicCsoGet.h"
#include "NicCsoSet.h"
#include "NicDown.h"
#include "NicEepromChange.h"
#include "NicEepromDump.h"
#include "NicGet.h"
#include "NicList.h"
#include "NicNegotiationRestart.h"
#include "NicPauseParamsList.h"
#include "NicPauseParamsSet.h"
#include "NicRegisterDump.h"
#include "NicRingCurrentGet.h"
#include "NicRingCurrentSet.h"
#include "NicRingPresetGet.h"
#include "NicSelfTestRun.h"
#include "NicSet.h"
#include "NicSgGet.h"
#include "NicSgSet.h"
#include "NicSoftwareList.h"
#include "NicSoftwareSet.h"
#include "NicStatsGet.h"
#include "NicTsoGet.h"
#include "NicTsoSet.h"
#include "NicUp.h"
#include "NicVlanStatsGet.h"
#include "NicVlanStatsSet.h"
#include "PortFilterStatsGet.h"
#include "PortStatsGet.h"
#include "SriovNicList.h"
#include "VMList.h"
#include "VMPortList.h"
#include "VfList.h"
#include "VfStats.h"
#include "VirtualSwitchDVSKorvexList.h"
#include "VirtualSwitchPortGroupAdd.h"
#include "VirtualSwitchPortGroupList.h"
#include "VirtualSwitchPortGroupPolicyFailoverGet.h"
#include "VirtualSwitchPortGroupPolicyFailoverSet.h"
#include "VirtualSwitchPortGroupPolicySecurityGet.h"
#include "VirtualSwitchPortGroupPolicySecuritySet.h"
#include "VirtualSwitchPortGroupPolicyShapingGet.h"
#include "VirtualSwitchPortGroupPolicyShapingSet.h"
#include "VirtualSwitchPortGroupRemove.h"
#include "VirtualSwitchPortGroupSet.h"
#include "VirtualSwitchStandardAdd.h"
#include "VirtualSwitchStandardList.h"
#include "VirtualSwitchStandardPolicyFailoverGet.h"
#include "VirtualSwitchStandardPolicyFailoverSet.h"
#include "VirtualSwitchStandardPolicySecurityGet.h"
#include "VirtualSwitchStandardPolicySecuritySet.h"
#include "VirtualSwitchStandardPolicyShapingGet.h"
#include "VirtualSwitchStandardPolicyShapingSet.h"
#include "VirtualSwitchStandardRemove.h"
#include "VirtualSwitchStandardSet.h"
#include "VirtualSwitchStandardUplinkAdd.h"
#include "VirtualSwitchStandardUplinkRemove.h"
#include "plinth/autocli/PluginEntry.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

// The whole `network` tree, depth first: each namespace row is followed by its
// commands and sub-namespaces in the order the user sees them in the help.
std::vector<TreeRow> NetworkTree() {
    return {
        NamespaceRow("network",
                     "Operations that pertain to the maintenance of networking on an Halden host. This includes a wide variety of commands to manipulate virtual networking components (vswitch, portgroup, etc) as well as local host IP, DNS and general host networking settings."),
        NamespaceRow("network ip",
                     "Operations that can be performed on tslnics"),
        CommandRow<IpGet>("network ip get"),
        CommandRow<IpSet>("network ip set"),
        NamespaceRow("network ip neighbor",
                     "Operations that can be performed on arp tables"),
        CommandRow<IpNeighborList>("network ip neighbor list"),
        CommandRow<IpNeighborRemove>("network ip neighbor remove"),
        NamespaceRow("network ip connection",
                     "List active tcpip connections"),
        CommandRow<IpConnectionList>("network ip connection list"),
        NamespaceRow("network ip dns",
                     "Operations pertaining to Domain Name Server configuration."),
        NamespaceRow("network ip dns server",
                     "Operations pertaining to DNS server configuration."),
        CommandRow<IpDNSServerList>("network ip dns server list"),
        CommandRow<IpDNSServerAdd>("network ip dns server add"),
        CommandRow<IpDNSServerRemove>("network ip dns server remove"),
        NamespaceRow("network ip dns search",
                     "Operations pertaining to DNS search domain configuration."),
        CommandRow<IpDNSSearchAdd>("network ip dns search add"),
        CommandRow<IpDNSSearchRemove>("network ip dns search remove"),
        CommandRow<IpDNSSearchList>("network ip dns search list"),
        NamespaceRow("network ip route",
                     "Operations pertaining to route configuration"),
        NamespaceRow("network ip route ipv4",
                     "IPv4 route operations"),
        CommandRow<IpRouteIpv4Add>("network ip route ipv4 add"),
        CommandRow<IpRouteIpv4Remove>("network ip route ipv4 remove"),
        CommandRow<IpRouteIpv4List>("network ip route ipv4 list"),
        NamespaceRow("network ip route ipv6",
                     "IPv6 route operations"),
        CommandRow<IpRouteIpv6Add>("network ip route ipv6 add"),
        CommandRow<IpRouteIpv6Remove>("network ip route ipv6 remove"),
        CommandRow<IpRouteIpv6List>("network ip route ipv6 list"),
        NamespaceRow("network ip ipsec",
                     "Operations on Internet Protocol Security"),
        CommandRow<IpIpsecSet>("network ip ipsec set"),
        NamespaceRow("network ip ipsec sa",
                     "Operations pertaining to Security Association"),
        CommandRow<IpIpsecSAAdd>("network ip ipsec sa add"),
        CommandRow<IpIpsecSARemove>("network ip ipsec sa remove"),
        CommandRow<IpIpsecSAList>("network ip ipsec sa list"),
        NamespaceRow("network ip ipsec sp",
                     "Operations pertaining to Security Policy"),
        CommandRow<IpIpsecSPAdd>("network ip ipsec sp add"),
        CommandRow<IpIpsecSPRemove>("network ip ipsec sp remove"),
        CommandRow<IpIpsecSPList>("network ip ipsec sp list"),
        NamespaceRow("network ip interface",
                     "Operations having to do with the creation, management and deletion of Tessel network interfaces (tslnic)."),
        CommandRow<IpInterfaceAdd>("network ip interface add"),
        CommandRow<IpInterfaceRemove>("network ip interface remove"),
        CommandRow<IpInterfaceList>("network ip interface list"),
        CommandRow<IpInterfaceSet>("network ip interface set"),
        NamespaceRow("network ip interface ipv4",
                     "Commands to get and set IPv4 settings for tslnic."),
        CommandRow<IpInterfaceIpv4Get>("network ip interface ipv4 get"),
        CommandRow<IpInterfaceIpv4Set>("network ip interface ipv4 set"),
        NamespaceRow("network ip interface ipv6",
                     "Commands to get and set IPv6 settings for tslnic."),
        CommandRow<IpInterfaceIpv6Set>("network ip interface ipv6 set"),
        CommandRow<IpInterfaceIpv6Get>("network ip interface ipv6 get"),
        NamespaceRow("network ip interface ipv6 address",
                     "Commands to list and update IPv6 addresses assigned to the system."),
        CommandRow<IpInterfaceIpv6AddressList>("network ip interface ipv6 address list"),
        CommandRow<IpInterfaceIpv6AddressAdd>("network ip interface ipv6 address add"),
        CommandRow<IpInterfaceIpv6AddressRemove>("network ip interface ipv6 address remove"),
        NamespaceRow("network ip interface tag",
                     "Commands to add and remove tags on tslnics."),
        CommandRow<IpInterfaceTagAdd>("network ip interface tag add"),
        CommandRow<IpInterfaceTagRemove>("network ip interface tag remove"),
        CommandRow<IpInterfaceTagGet>("network ip interface tag get"),
        NamespaceRow("network ip netstack",
                     "Operations having to do with the creation, management and deletion of Tessel Netstack Instances."),
        CommandRow<IpNetstackInstanceList>("network ip netstack list"),
        CommandRow<IpNetstackInstanceAdd>("network ip netstack add"),
        CommandRow<IpNetstackInstanceRemove>("network ip netstack remove"),
        CommandRow<IpNetstackInstanceGet>("network ip netstack get"),
        CommandRow<IpNetstackInstanceSet>("network ip netstack set"),
        NamespaceRow("network nic",
                     "Operations having to do with the configuration of Network Interface Card and getting and updating the NIC settings."),
        CommandRow<NicList>("network nic list"),
        CommandRow<NicUp>("network nic up"),
        CommandRow<NicGet>("network nic get"),
        CommandRow<NicSet>("network nic set"),
        CommandRow<NicDown>("network nic down"),
        NamespaceRow("network nic stats",
                     "Get packet statistics for a NIC"),
        CommandRow<NicStatsGet>("network nic stats get"),
        NamespaceRow("network nic vlan",
                     "Get VLAN information for a NIC"),
        NamespaceRow("network nic vlan stats",
                     "Commands to access VLAN statistics for a NIC"),
        CommandRow<NicVlanStatsGet>("network nic vlan stats get"),
        CommandRow<NicVlanStatsSet>("network nic vlan stats set"),
        NamespaceRow("network nic coalesce",
                     "Commands to access coalesce paramaters for a NIC"),
        CommandRow<NicCoalesceGet>("network nic coalesce get"),
        CommandRow<NicCoalesceSet>("network nic coalesce set"),
        NamespaceRow("network nic cso",
                     "Commands to access checksum offload settings for a NIC"),
        CommandRow<NicCsoGet>("network nic cso get"),
        CommandRow<NicCsoSet>("network nic cso set"),
        NamespaceRow("network nic tso",
                     "Commands to access TCP segmentation offload settings for a NIC"),
        CommandRow<NicTsoGet>("network nic tso get"),
        CommandRow<NicTsoSet>("network nic tso set"),
        NamespaceRow("network nic sg",
                     "Commands to access scatter-gather settings for a NIC"),
        CommandRow<NicSgGet>("network nic sg get"),
        CommandRow<NicSgSet>("network nic sg set"),
        NamespaceRow("network nic pauseParams",
                     "Commands to access pause parameters for a NIC"),
        CommandRow<NicPauseParamsList>("network nic pauseParams list"),
        CommandRow<NicPauseParamsSet>("network nic pauseParams set"),
        NamespaceRow("network nic register",
                     "Commands to access registers for a NIC"),
        CommandRow<NicRegisterDump>("network nic register dump"),
        NamespaceRow("network nic eeprom",
                     "Commands to access EEPROM for a NIC"),
        CommandRow<NicEepromDump>("network nic eeprom dump"),
        CommandRow<NicEepromChange>("network nic eeprom change"),
        NamespaceRow("network nic negotiate",
                     "Commands to access negotiation feature on a NIC"),
        CommandRow<NicNegotiationRestart>("network nic negotiate restart"),
        NamespaceRow("network nic selftest",
                     "Commands to access self test feature on a NIC"),
        CommandRow<NicSelfTestRun>("network nic selftest run"),
        NamespaceRow("network nic software",
                     "Commands to access NIC feature software simulation settings"),
        CommandRow<NicSoftwareList>("network nic software list"),
        CommandRow<NicSoftwareSet>("network nic software set"),
        NamespaceRow("network nic ring",
                     "Commands to access NIC RX/TX ring buffer parameters"),
        NamespaceRow("network nic ring preset",
                     "Commands to access preset NIC RX/TX ring buffer parameters"),
        CommandRow<NicRingPresetGet>("network nic ring preset get"),
        NamespaceRow("network nic ring current",
                     "Commands to access current NIC RX/TX ring buffer parameters"),
        CommandRow<NicRingCurrentGet>("network nic ring current get"),
        CommandRow<NicRingCurrentSet>("network nic ring current set"),
        NamespaceRow("network sriovnic",
                     "Operations having to do with the configuration of SRIOV enabled Network Interface Card and getting and updating the NIC settings."),
        CommandRow<SriovNicList>("network sriovnic list"),
        NamespaceRow("network sriovnic vf",
                     "Operations related to VFs of a SRIOV capable pNIC"),
        CommandRow<VfList>("network sriovnic vf list"),
        CommandRow<VfStats>("network sriovnic vf stats"),
        NamespaceRow("network vswitch",
                     "Commands to list and manipulate Virtual Switches on an Halden host."),
        NamespaceRow("network vswitch standard",
                     "Commands to list and manipulate Legacy Virtual Switches on an Halden host."),
        CommandRow<VirtualSwitchStandardAdd>("network vswitch standard add"),
        CommandRow<VirtualSwitchStandardSet>("network vswitch standard set"),
        CommandRow<VirtualSwitchStandardList>("network vswitch standard list"),
        CommandRow<VirtualSwitchStandardRemove>("network vswitch standard remove"),
        NamespaceRow("network vswitch standard uplink",
                     "Commands to add and remove uplink on given virtual switch."),
        CommandRow<VirtualSwitchStandardUplinkAdd>("network vswitch standard uplink add"),
        CommandRow<VirtualSwitchStandardUplinkRemove>("network vswitch standard uplink remove"),
        NamespaceRow("network vswitch standard policy",
                     "Commands to manipulate network policy settings governing the given virtual switch."),
        NamespaceRow("network vswitch standard policy shaping",
                     "Commands to manipulate shaping policy setting for the given virtual switch."),
        CommandRow<VirtualSwitchStandardPolicyShapingGet>("network vswitch standard policy shaping get"),
        CommandRow<VirtualSwitchStandardPolicyShapingSet>("network vswitch standard policy shaping set"),
        NamespaceRow("network vswitch standard policy security",
                     "Commands to manipulate security policy setting for the given virtual switch."),
        CommandRow<VirtualSwitchStandardPolicySecurityGet>("network vswitch standard policy security get"),
        CommandRow<VirtualSwitchStandardPolicySecuritySet>("network vswitch standard policy security set"),
        NamespaceRow("network vswitch standard policy failover",
                     "Commands to manipulate failover policy setting for the given virtual switch."),
        CommandRow<VirtualSwitchStandardPolicyFailoverGet>("network vswitch standard policy failover get"),
        CommandRow<VirtualSwitchStandardPolicyFailoverSet>("network vswitch standard policy failover set"),
        NamespaceRow("network vswitch standard portgroup",
                     "Commands to list and manipulate Port Groups on an Halden host."),
        CommandRow<VirtualSwitchPortGroupList>("network vswitch standard portgroup list"),
        CommandRow<VirtualSwitchPortGroupAdd>("network vswitch standard portgroup add"),
        CommandRow<VirtualSwitchPortGroupRemove>("network vswitch standard portgroup remove"),
        CommandRow<VirtualSwitchPortGroupSet>("network vswitch standard portgroup set"),
        NamespaceRow("network vswitch standard portgroup policy",
                     "Commands to manipulate network policy settings governing the given portgroup."),
        NamespaceRow("network vswitch standard portgroup policy shaping",
                     "Commands to manipulate shaping policy setting for the given portgroup."),
        CommandRow<VirtualSwitchPortGroupPolicyShapingGet>("network vswitch standard portgroup policy shaping get"),
        CommandRow<VirtualSwitchPortGroupPolicyShapingSet>("network vswitch standard portgroup policy shaping set"),
        NamespaceRow("network vswitch standard portgroup policy failover",
                     "Commands to manipulate failover policy setting for the given portgroup."),
        CommandRow<VirtualSwitchPortGroupPolicyFailoverGet>("network vswitch standard portgroup policy failover get"),
        CommandRow<VirtualSwitchPortGroupPolicyFailoverSet>("network vswitch standard portgroup policy failover set"),
        NamespaceRow("network vswitch standard portgroup policy security",
                     "Commands to manipulate security policy setting for the given portgroup."),
        CommandRow<VirtualSwitchPortGroupPolicySecurityGet>("network vswitch standard portgroup policy security get"),
        CommandRow<VirtualSwitchPortGroupPolicySecuritySet>("network vswitch standard portgroup policy security set"),
        NamespaceRow("network vswitch dvs",
                     "Commands to retrieve Distributed Virtual Switch information"),
        NamespaceRow("network vswitch dvs korvex",
                     "Commands to retrieve Korvex Meridon Distributed Switch information"),
        CommandRow<VirtualSwitchDVSKorvexList>("network vswitch dvs korvex list"),
        NamespaceRow("network vswitch dvs korvex lacp",
                     "A set of commands for LACP related operations"),
        NamespaceRow("network vswitch dvs korvex lacp config",
                     "Command to get LACP configuration"),
        CommandRow<LacpGetConfig>("network vswitch dvs korvex lacp config get"),
        NamespaceRow("network vswitch dvs korvex lacp status",
                     "Command to get LACP port status"),
        CommandRow<LacpGetStatus>("network vswitch dvs korvex lacp status get"),
        NamespaceRow("network vswitch dvs korvex lacp stats",
                     "Command to get LACP protocol statistics"),
        CommandRow<LacpGetStats>("network vswitch dvs korvex lacp stats get"),
        NamespaceRow("network vswitch dvs korvex lacp timeout",
                     "Command to set LACP LAG timeout"),
        CommandRow<LacpSetTimeout>("network vswitch dvs korvex lacp timeout set"),
        NamespaceRow("network firewall",
                     "A set of commands for firewall related operations"),
        CommandRow<FirewallGet>("network firewall get"),
        CommandRow<FirewallSet>("network firewall set"),
        CommandRow<FirewallLoad>("network firewall load"),
        CommandRow<FirewallRefresh>("network firewall refresh"),
        CommandRow<FirewallUnload>("network firewall unload"),
        NamespaceRow("network firewall ruleset",
                     "Commands to list and update firewall ruleset configuration"),
        CommandRow<FirewallRulesetList>("network firewall ruleset list"),
        CommandRow<FirewallRulesetSet>("network firewall ruleset set"),
        NamespaceRow("network firewall ruleset rule",
                     "Commands to list rules in the ruleset"),
        CommandRow<FirewallRulesetRuleList>("network firewall ruleset rule list"),
        NamespaceRow("network firewall ruleset allowedip",
                     "Commands to list and add/remove allowedip on ruleset"),
        CommandRow<FirewallRulesetAllowedipList>("network firewall ruleset allowedip list"),
        CommandRow<FirewallRulesetAllowedipAdd>("network firewall ruleset allowedip add"),
        CommandRow<FirewallRulesetAllowedipRemove>("network firewall ruleset allowedip remove"),
        NamespaceRow("network port",
                     "Commands to get information about a port"),
        NamespaceRow("network port stats",
                     "Commands to get port statistics"),
        CommandRow<PortStatsGet>("network port stats get"),
        NamespaceRow("network port filter",
                     "Commands to get port filter information"),
        NamespaceRow("network port filter stats",
                     "Commands to get port filter statistics"),
        CommandRow<PortFilterStatsGet>("network port filter stats get"),
        NamespaceRow("network vm",
                     "A set of commands for VM related operations"),
        CommandRow<VMList>("network vm list"),
        NamespaceRow("network vm port",
                     "Command to list ports of a given VM"),
        CommandRow<VMPortList>("network vm port list"),
    };
}

}  // namespace

}  // namespace NetworkNamespace
}  // namespace KorvexCli

extern "C" void AutoCli_RegisterNamespaces(boost::shared_ptr<Plinth::AutoCli::NamespaceNode> root) {
    KorvexCli::NetworkNamespace::BuildNamespaceTree(KorvexCli::NetworkNamespace::NetworkTree(), root);
}
