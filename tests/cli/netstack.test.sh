#!/usr/bin/env bash
# network ip netstack, route and neighbor: a second netstack built up with an
# interface, routes and a default gateway, listed in every formatter and torn
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

check "set's help offers the host's congestion control algorithms"
cli network ip netstack set --help
expect_status 0
expect_stdout_contains "(not applied to existing connections).:
                          newreno: Set newreno as the algorithm
                          cubic: Set cubic as the algorithm"

check "a netstack added disabled is created by set before its new limit is stored"
cli network ip netstack add -N backupStack --disabled
expect_status 0
expect_stdout_empty
cli network ip netstack set -N backupStack -e true -m 20000 -n Backup -c cubic
expect_status 0
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

check "the netstack's interface, route and default gateway, listed in every formatter"
cli network ip interface add -p "Guest Network" -N backupStack -i tsl1
expect_status 0
cli network ip interface ipv4 set -i tsl1 -t static -I 198.51.100.10 -N 255.255.255.0
expect_status 0
cli network ip route ipv4 add -n 203.0.113.0/24 -g 198.51.100.254 -N backupStack
expect_status 0
cli network ip route ipv4 add --network default --gateway 198.51.100.1 --netstack backupStack
expect_status 0
expect_stdout_empty
cli network ip route ipv4 list -N backupStack
expect_stdout "Network       Netmask        Gateway         Interface  Source
------------  -------------  --------------  ---------  ------
198.51.100.0  255.255.255.0  0.0.0.0         tsl1       MANUAL
203.0.113.0   255.255.255.0  198.51.100.254  tsl1       MANUAL
default       0.0.0.0        198.51.100.1    tsl1       MANUAL"
cli --formatter json network ip route ipv4 list -N backupStack
expect_stdout '[{"Network":"198.51.100.0","Netmask":"255.255.255.0","Gateway":"0.0.0.0","Interface":"tsl1","Source":"MANUAL"},{"Network":"203.0.113.0","Netmask":"255.255.255.0","Gateway":"198.51.100.254","Interface":"tsl1","Source":"MANUAL"},{"Network":"default","Netmask":"0.0.0.0","Gateway":"198.51.100.1","Interface":"tsl1","Source":"MANUAL"}]'
for pair in "simple|   Gateway: 198.51.100.254" "csv|default,0.0.0.0,198.51.100.1,tsl1,MANUAL" \
            "xml|<string>198.51.100.254</string>" "keyvalue|Ipv4Route.Gateway.string=198.51.100.1"; do
  cli --formatter "${pair%%|*}" network ip route ipv4 list -N backupStack
  expect_status 0
  expect_stdout_contains "${pair#*|}"
done
cli network ip route ipv4 list
expect_stdout_contains "default       0.0.0.0        192.0.2.1    tsl0       MANUAL"

check "a wrong default gateway is reported with the result true, and nothing changes"
before=$("$HALDENSIM" export)
cli --formatter json network ip route ipv4 remove -n default -g 198.51.100.9 -N backupStack
expect_status 1
expect_stderr "198.51.100.9 is not a default route."
expect_stdout "true"
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "torn down: the default gateway, the interface with the route it reached, then the netstack"
expect_refusal "Unable to Remove Netstack Instance. Error was : Unable to remove netstack instance backupStack: it has interfaces (tsl1)" \
  network ip netstack remove -N backupStack
cli network ip route ipv4 remove -n default -g 198.51.100.1 -N backupStack
expect_status 0
cli network ip interface remove -i tsl1
expect_status 0
cli --formatter json network ip route ipv4 list -N backupStack
expect_stdout "[]"
cli network ip netstack remove -N backupStack
expect_status 0
cli --formatter json network ip netstack list
expect_stdout '[{"Key":"defaultTcpipStack","Name":"defaultTcpipStack","State":4660}]'

check "refusals print their text, exit 1 and leave the host as it was"
expect_refusal "Unable to add Netstack Instance. Error was : Unable to add netstack instance defaultTcpipStack: an instance of that key exists already" \
  network ip netstack add -N defaultTcpipStack
expect_refusal "Unable to find a Netstack instance nope" network ip netstack get -N nope
expect_refusal "Error setting configuration for the netstack instance . Error was : Unable to disable netstack instance defaultTcpipStack: the host's default instance stays in the kernel" \
  network ip netstack set -N defaultTcpipStack -e false
expect_refusal "Unable to Remove Netstack Instance. Error was : Unable to remove netstack instance defaultTcpipStack: it is the host's default instance" \
  network ip netstack remove -N defaultTcpipStack
expect_refusal "Netstack instance defaultTcpipStack has no neighbour entry for 203.0.113.9" \
  network ip neighbor remove -v 4 -a 203.0.113.9

check "an algorithm the host does not offer is refused before the command runs"
cli network ip netstack set -N defaultTcpipStack -c bbr
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --ccalgo: 'bbr' is not one of newreno, cubic."

check "without the host's algorithms, set has neither help nor a call"
"$HALDENSIM" fault add --operation NetstackInstanceImpl::GetCongestionControlAlgorithmList \
  --message "congestion control module not loaded" >/dev/null
cli network ip netstack set --help
expect_status 1
expect_stderr "congestion control module not loaded"
expect_refusal "congestion control module not loaded" network ip netstack set -N defaultTcpipStack -n Main
"$HALDENSIM" fault clear >/dev/null

check "the neighbour list shows expiry in seconds, and a host failure as the tool's one line"
cli network ip neighbor list -v 4
expect_stdout_contains "192.0.2.1    00:1c:73:5e:0a:02  tsl0    1185 sec         Dynamic"
"$HALDENSIM" fault add --operation RoutingInfoImpl::GetCurrentIpv6TesselNeighbors --message "neighbour table busy" >/dev/null
cli network ip neighbor list
expect_status 1
expect_stderr "neighbour table busy"
expect_stdout_empty
"$HALDENSIM" fault clear >/dev/null

finish
