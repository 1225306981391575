#!/usr/bin/env bash
# network ip netstack, route and neighbor: a second netstack built up with an
# interface, routes and default gateways, listed in every formatter and torn
# down in the order the host allows; refusals with their texts and exit
# statuses, and a host that every refusal leaves as it was.
. "$CLI_TEST_LIB"

# Runs a command that must fail with status 1, the text and no output, and
# checks that the host did not change.
expect_refusal() {
  local text=$1
  shift
  local before
  before=$("$HALDENSIM" export)
  cli "$@"
  expect_status 1
  expect_stderr "$text"
  expect_stdout_empty
  [ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"
}

check "the default host's netstack, routes and neighbours"
cli network ip netstack list
expect_status 0
expect_stdout "defaultTcpipStack
   Key: defaultTcpipStack
   Name: defaultTcpipStack
   State: 4660"
cli network ip route ipv4 list
expect_status 0
expect_stdout "Network       Netmask        Gateway      Interface  Source
------------  -------------  -----------  ---------  ------
192.0.2.0     255.255.255.0  0.0.0.0      tsl0       MANUAL
198.51.100.0  255.255.255.0  192.0.2.254  tsl0       MANUAL
default       0.0.0.0        192.0.2.1    tsl0       MANUAL"
cli network ip route ipv6 list
expect_stdout "Network     Netmask                Gateway      Interface
----------  ---------------------  -----------  ---------
2001:db8::  ffff:ffff:ffff:ffff::  ::           tsl0
default     ::                     2001:db8::1  tsl0"
cli network ip neighbor list
expect_status 0
expect_stdout "Neighbor     Mac Address        Tslnic  Expiry    State      Type
-----------  -----------------  ------  --------  ---------  -------
192.0.2.1    00:1c:73:5e:0a:02  tsl0    1185 sec             Dynamic
192.0.2.254  00:1c:73:5e:0a:03  tsl0    907 sec              Dynamic
2001:db8::1  00:1c:73:5e:0a:02  tsl0    26 sec    Reachable  Router"

check "set's help offers the host's congestion control algorithms"
cli network ip netstack set --help
expect_status 0
expect_stdout_contains "  -c|--ccalgo=<str>     The TCP Congestion Contol Algorithm for this netstack
                        instance (not applied to existing connections).:
                          newreno: Set newreno as the algorithm
                          cubic: Set cubic as the algorithm
  -i|--ipv6enabled=<bool>
                        To enable IPv6 for this netstack instance (aplied only
                        during netstack creation)."

check "a netstack added disabled is created by set before its new limit is stored"
cli network ip netstack add -N backupStack --disabled
expect_status 0
expect_stdout_empty
cli network ip netstack get -N backupStack
expect_stdout_contains "   Enabled: false"
expect_stdout_contains "   State: 0"
cli network ip netstack set -N backupStack -e true -m 20000 -n Backup -c cubic
expect_status 0
expect_stdout_empty
cli network ip netstack get -N backupStack
expect_stdout "backupStack
   Key: backupStack
   Name: Backup
   Enabled: true
   Max Connections: 20000
   Current Max Connections: 11000
   Congestion Control Algorithm: cubic
   IPv6 Enabled: true
   Current IPv6 Enabled: true
   State: 4660"

check "the netstack gets an interface, routes and default gateways"
cli network ip interface add -p "Guest Network" -N backupStack -i tsl1
expect_status 0
cli network ip interface ipv4 set -i tsl1 -t static -I 198.51.100.10 -N 255.255.255.0
expect_status 0
cli network ip interface ipv6 address add -i tsl1 -I 2001:db8:1::10/64
expect_status 0
for words in "ipv4 add -n 203.0.113.0/24 -g 198.51.100.254" "ipv4 add -n default -g 198.51.100.1" \
             "ipv6 add -n 2001:db8:5::/48 -g 2001:db8:1::fe" "ipv6 add --network default --gateway 2001:db8:1::1"; do
  # shellcheck disable=SC2086
  cli network ip route $words -N backupStack
  expect_status 0
  expect_stdout_empty
done
cli network ip route ipv6 list -N backupStack
expect_stdout "Network       Netmask                Gateway         Interface
------------  ---------------------  --------------  ---------
2001:db8:1::  ffff:ffff:ffff:ffff::  ::              tsl1
2001:db8:5::  ffff:ffff:ffff::       2001:db8:1::fe  tsl1
default       ::                     2001:db8:1::1   tsl1"
# The default netstack's routes are where they were.
cli --formatter csv network ip route ipv4 list
expect_stdout "Network,Netmask,Gateway,Interface,Source
192.0.2.0,255.255.255.0,0.0.0.0,tsl0,MANUAL
198.51.100.0,255.255.255.0,192.0.2.254,tsl0,MANUAL
default,0.0.0.0,192.0.2.1,tsl0,MANUAL"

check "the netstack's IPv4 routes in every formatter"
cli network ip route ipv4 list -N backupStack
expect_stdout "Network       Netmask        Gateway         Interface  Source
------------  -------------  --------------  ---------  ------
198.51.100.0  255.255.255.0  0.0.0.0         tsl1       MANUAL
203.0.113.0   255.255.255.0  198.51.100.254  tsl1       MANUAL
default       0.0.0.0        198.51.100.1    tsl1       MANUAL"
cli --formatter simple network ip route ipv4 list -N backupStack
expect_stdout "Ipv4Route
   Network: 198.51.100.0
   Netmask: 255.255.255.0
   Gateway: 0.0.0.0
   Interface: tsl1
   Source: MANUAL

Ipv4Route
   Network: 203.0.113.0
   Netmask: 255.255.255.0
   Gateway: 198.51.100.254
   Interface: tsl1
   Source: MANUAL

Ipv4Route
   Network: default
   Netmask: 0.0.0.0
   Gateway: 198.51.100.1
   Interface: tsl1
   Source: MANUAL"
cli --formatter json network ip route ipv4 list -N backupStack
expect_stdout '[{"Network":"198.51.100.0","Netmask":"255.255.255.0","Gateway":"0.0.0.0","Interface":"tsl1","Source":"MANUAL"},{"Network":"203.0.113.0","Netmask":"255.255.255.0","Gateway":"198.51.100.254","Interface":"tsl1","Source":"MANUAL"},{"Network":"default","Netmask":"0.0.0.0","Gateway":"198.51.100.1","Interface":"tsl1","Source":"MANUAL"}]'
cli --formatter xml network ip route ipv4 list -N backupStack
expect_stdout_contains '    <structure name="Ipv4Route">
      <field name="Network">
        <string>default</string>
      </field>
      <field name="Netmask">
        <string>0.0.0.0</string>
      </field>
      <field name="Gateway">
        <string>198.51.100.1</string>
      </field>'
cli --formatter csv network ip route ipv4 list -N backupStack
expect_stdout "Network,Netmask,Gateway,Interface,Source
198.51.100.0,255.255.255.0,0.0.0.0,tsl1,MANUAL
203.0.113.0,255.255.255.0,198.51.100.254,tsl1,MANUAL
default,0.0.0.0,198.51.100.1,tsl1,MANUAL"
cli --formatter keyvalue network ip route ipv4 list -N backupStack
expect_stdout_contains "Ipv4Route.Network.string=default
Ipv4Route.Netmask.string=0.0.0.0
Ipv4Route.Gateway.string=198.51.100.1
Ipv4Route.Interface.string=tsl1
Ipv4Route.Source.string=MANUAL"

check "a wrong default gateway is reported with the result true, and nothing changes"
before=$("$HALDENSIM" export)
cli network ip route ipv4 remove -n default -g 198.51.100.9 -N backupStack
expect_status 1
expect_stderr "198.51.100.9 is not a default route."
expect_stdout_empty
cli --formatter json network ip route ipv6 remove -n default -g 2001:db8:1::9 -N backupStack
expect_status 1
expect_stderr "2001:db8:1::9 is not a default route."
expect_stdout "true"
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "torn down: default gateways, then the interface with the routes it reached, then the netstack"
expect_refusal "Unable to Remove Netstack Instance. Error was : Unable to remove netstack instance backupStack: it has interfaces (tsl1)" \
  network ip netstack remove -N backupStack
cli network ip route ipv4 remove -n default -g 198.51.100.1 -N backupStack
expect_status 0
cli network ip route ipv6 remove -n default -g 2001:db8:1::1 -N backupStack
expect_status 0
cli network ip route ipv4 list -N backupStack
expect_stdout_lacks "default"
cli network ip interface remove -i tsl1
expect_status 0
cli --formatter json network ip route ipv4 list -N backupStack
expect_stdout "[]"
cli network ip netstack remove -N backupStack
expect_status 0
expect_stdout_empty
cli --formatter json network ip netstack list
expect_stdout '[{"Key":"defaultTcpipStack","Name":"defaultTcpipStack","State":4660}]'
expect_refusal "Netstack instance backupStack does not exist" network ip route ipv4 list -N backupStack

check "refusals print their text, exit 1 and leave the host as it was"
expect_refusal "Unable to add Netstack Instance. Error was : Unable to add netstack instance defaultTcpipStack: an instance of that key exists already" \
  network ip netstack add -N defaultTcpipStack
expect_refusal "Unable to find a Netstack instance nope" network ip netstack get -N nope
expect_refusal "Unable to find a Netstack instance nope" network ip netstack set -N nope -e true
expect_refusal "Unable to Remove Netstack Instance. Error was : Unable to remove netstack instance defaultTcpipStack: it is the host's default instance" \
  network ip netstack remove -N defaultTcpipStack
expect_refusal "Error setting configuration for the netstack instance . Error was : Unable to disable netstack instance defaultTcpipStack: the host's default instance stays in the kernel" \
  network ip netstack set -N defaultTcpipStack -e false
expect_refusal "Invalid IPv4 network: Default" network ip route ipv4 add -n Default -g 192.0.2.1
expect_refusal "Invalid IPv6 address: 2001:db8::zz" network ip route ipv6 remove -n 2001:db8::/64 -g 2001:db8::zz
expect_refusal "Unable to add the route to 198.51.100.0/24 via 192.0.2.254: netstack defaultTcpipStack has a route to that network already, via 192.0.2.254" \
  network ip route ipv4 add -n 198.51.100.0/24 -g 192.0.2.254
expect_refusal "Netstack instance defaultTcpipStack has no neighbour entry for 203.0.113.9" \
  network ip neighbor remove -v 4 -a 203.0.113.9
expect_refusal "Unable to find a Tessel interface with the name tsl9" network ip neighbor list -i tsl9

check "an algorithm the host does not offer is refused before the command runs"
before=$("$HALDENSIM" export)
cli network ip netstack set -N defaultTcpipStack -c bbr
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --ccalgo: 'bbr' is not one of newreno, cubic."
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "without the host's algorithms, set has neither help nor a call"
"$HALDENSIM" fault add --operation NetstackInstanceImpl::GetCongestionControlAlgorithmList \
  --message "congestion control module not loaded" >/dev/null
cli network ip netstack set --help
expect_status 1
expect_stderr "congestion control module not loaded"
expect_stdout_empty
expect_refusal "congestion control module not loaded" network ip netstack set -N defaultTcpipStack -c cubic
"$HALDENSIM" fault clear >/dev/null

check "a host failure in the neighbour list is the tool's one line"
"$HALDENSIM" fault add --operation RoutingInfoImpl::GetCurrentIpv6TesselNeighbors --message "neighbour table busy" >/dev/null
cli network ip neighbor list
expect_status 1
expect_stderr "neighbour table busy"
expect_stdout_empty
cli network ip neighbor list -v 4
expect_status 0
"$HALDENSIM" fault clear >/dev/null

check "neighbour entries removed by version, none of IPv6 while the kernel has it off"
cli network ip neighbor remove -v 4 -a 192.0.2.254 -i tsl0
expect_status 0
expect_stdout_empty
cli --formatter csv network ip neighbor list -v 4
expect_stdout "Neighbor,Mac Address,Tslnic,Expiry,State,Type
192.0.2.1,00:1c:73:5e:0a:02,tsl0,1185,,Dynamic"
"$HALDENSIM" export | python3 -c '
import json, sys
host = json.load(sys.stdin)
host["ipSettings"]["ipv6Enabled"] = False
json.dump(host, sys.stdout)' >"$CLI_TEST_DIR/no-ipv6.json"
"$HALDENSIM" import "$CLI_TEST_DIR/no-ipv6.json" >/dev/null
cli network ip neighbor remove -v 6 -a 2001:db8::1
expect_status 0
cli --formatter json network ip neighbor list -v 6
expect_stdout "[]"
"$HALDENSIM" export | grep -q '"address": "2001:db8::1"' || fail_check "the IPv6 entry was removed"

finish
