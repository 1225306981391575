#!/usr/bin/env bash
# network ip interface: interfaces added on a port group and on a DVPort with
# the ports they take and free, addresses of both families, tags, the list in
# every formatter, and each refusal with its text, its exit status and the
# host as it was.
. "$CLI_TEST_LIB"

IF=(network ip interface)

# Runs a command that must be refused with status 1 and the text (standard
# output as given, empty by default), and checks that the host did not change.
expect_refusal() {
  local text=$1 out=$2
  shift 2
  local before
  before=$("$HALDENSIM" export)
  cli "$@"
  expect_status 1
  expect_stderr "$text"
  expect_stdout "$out"
  [ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"
}

check "the default host's interface in every formatter"
for formatter in table simple json xml csv; do
  cli --formatter "$formatter" "${IF[@]}" list
  expect_status 0
  expect_stderr_empty
  expect_stdout_contains "33554436"
done
cli "${IF[@]}" list
expect_stdout "tsl0
   Name: tsl0
   MAC Address: 00:50:56:6e:41:0a
   Enabled: true
   Portset: switch0
   Portgroup: Host Management
   Netstack Instance: defaultTcpipStack
   VDS Name: N/A
   VDS UUID: N/A
   VDS Port: N/A
   VDS Connection: -1
   Opaque Network ID: N/A
   Opaque Network Type: N/A
   External ID: N/A
   MTU: 1500
   TSO MSS: 65535
   Port ID: 33554436"

check "an interface on a port group and one on a DVPort each take a port"
cli "${IF[@]}" add --portgroup-name "Guest Network" --interface-name tsl4 --mtu 9000 --mac-address 00:50:56:AA:BB:CC
expect_status 0
expect_stdout_empty
cli "${IF[@]}" add -s dvSwitch0 -P 3 -N defaultTcpipStack
expect_status 0
cli --formatter csv "${IF[@]}" list
expect_stdout_contains "
tsl4,00:50:56:aa:bb:cc,true,switch0,Guest Network,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,9000,65535,"
# The port's connection id is the time the interface was added.
expect_stdout_matches "^tsl1,[0-9a-f:]{17},true,dvSwitch0,N/A,defaultTcpipStack,dvSwitch0,50 2f 8c 1a 3e 77 4b 90-a1 0c 5d e2 7f 33 91 04,3,[1-9][0-9]*,N/A,N/A,N/A,1500,65535,[0-9]+$"
cli --formatter json network vswitch standard list -v switch0
expect_stdout_contains '"Used Ports":5,'
cli --formatter csv network vswitch standard portgroup list
expect_stdout_contains "Guest Network,switch0,3,0"
cli --formatter json network vswitch dvs korvex list -v dvSwitch0
expect_stdout_contains '{"Port ID":"3","In Use":true,"DVPortgroup ID":"dvportgroup-101","Client":["tsl1"]}'

check "IPv4 static and DHCP, IPv6 addresses of every origin, and back"
cli "${IF[@]}" ipv4 set -i tsl4 -t static -I 192.0.2.40 -N 255.255.255.192
expect_status 0
cli "${IF[@]}" ipv4 set -i tsl1 -t dhcp --peer-dns true
expect_status 0
cli "${IF[@]}" ipv4 get
expect_stdout "Name  IPv4 Address  IPv4 Netmask     IPv4 Broadcast  Address Type  DHCP DNS
----  ------------  ---------------  --------------  ------------  --------
tsl0  192.0.2.10    255.255.255.0    192.0.2.255     STATIC        false
tsl1  203.0.113.11  255.255.255.0    203.0.113.255   DHCP          true
tsl4  192.0.2.40    255.255.255.192  192.0.2.63      STATIC        false"
cli "${IF[@]}" ipv6 address add -i tsl4 -I 2001:db8::40/64
expect_status 0
cli "${IF[@]}" ipv6 set -i tsl4 --enable-router-adv true
expect_status 0
cli "${IF[@]}" ipv6 get -n tsl4
expect_stdout "Name  DHCPv6 Enabled  Router Adv Enabled  DHCP DNS
----  --------------  ------------------  --------
tsl4  false           true                false"
cli "${IF[@]}" ipv6 address list -i tsl4
expect_stdout "Interface  Address                          Netmask  Type      Status
---------  -------------------------------  -------  --------  ---------
tsl4       2001:db8::40                     64       STATIC    PREFERRED
tsl4       2001:db8:0:1:250:56ff:feaa:bbcc  64       AUTOCONF  PREFERRED"
cli "${IF[@]}" ipv6 set -i tsl4 -r false
cli "${IF[@]}" ipv6 address remove -i tsl4 -I 2001:db8::40/64
expect_status 0
cli "${IF[@]}" ipv6 address list -i tsl4
expect_stdout "Interface  Address  Netmask  Type  Status
---------  -------  -------  ----  ------"

check "tags are added and removed by any case of their names"
cli "${IF[@]}" tag add -i tsl4 -t replication
expect_status 0
cli "${IF[@]}" tag get -i tsl4
expect_stdout "   Tags: Replication"
cli "${IF[@]}" tag remove -i tsl4 -t Replication
expect_status 0
cli --formatter json "${IF[@]}" tag get -i tsl4
expect_stdout '{"Tags":[]}'

check "removal by name and by DVPort frees the ports"
cli "${IF[@]}" remove -i tsl4
expect_status 0
cli "${IF[@]}" remove --dvs-name dvSwitch0 --dvport-id 3
expect_status 0
cli --formatter csv "${IF[@]}" list
expect_stdout "Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,TSO MSS,Port ID
tsl0,00:50:56:6e:41:0a,true,switch0,Host Management,defaultTcpipStack,N/A,N/A,N/A,-1,N/A,N/A,N/A,1500,65535,33554436"
cli --formatter json network vswitch standard list -v switch0
expect_stdout_contains '"Used Ports":4,'
cli --formatter json network vswitch dvs korvex list -v dvSwitch0
expect_stdout_contains '{"Port ID":"3","In Use":false,"DVPortgroup ID":"dvportgroup-101","Client":[]}'

check "every refusal prints its text, exits with 1 and leaves the host as it was"
NO_POINT="A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time."
SUPPORTED="Supported tags are: Management, Glide, FaultTolerance, Replication, ReplicationNFC, Provisioning, Storage"
while IFS='|' read -r text out words; do
  eval "args=($words)"
  expect_refusal "$(printf '%b' "$text")" "$out" "${IF[@]}" "${args[@]}"
done <<EOF
$NO_POINT||add -s dvSwitch0
Only one connection point can be specified, vswitch port group or DVPort.||add -p x -s dvSwitch0 -P 1
Invalid unicast MAC address specified.||add -p x -M 01:00:5e:00:00:01
Invalid vswitch port group name nosuch. Error was: Port group nosuch does not exist||add -p nosuch
Unable to retrieve DVS info by specified DVS name nosuch. Error was: Distributed switch nosuch does not exist||add -s nosuch -P 1
Invalid vswitch port group or DVPort parameters.||add -s dvSwitch0 -P 99
Unable to add Tessel network interface. Error was : Unable to add interface tsl1: there is no netstack instance nosuch||add -p "Guest Network" -N nosuch
Please correctly and uniquely specify a way to remove it. A Tessel network interface can be uniquely specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection point are two ways to uniquely specify a Tessel network interface.||remove -i tsl0 -P 1
Unable to find Tessel network interface with the name tsl9|false|remove -i tsl9
Unable to remove Tessel network interface. Error was : Unable to remove an interface: no interface of netstack defaultTcpipStack is attached to port group Guest Network||remove -p "Guest Network"
Unable to find an interface with name tsl9||set -i tsl9 -e false
MTU size should be a positive value||set -i tsl0 -m -1
The --type=static requires the --ipv4 and --netmask options.\nInvalid --ipv4 option provided. This address is not a valid IPv4 address\nInvalid --netmask option provided. This address is not a valid IPv4 address||ipv4 set -i tsl0 -t static
Error changing IPv4 configuration for the interface tsl0. Error was : Invalid IPv4 address 127.0.0.1 for interface tsl0: it is a loopback address||ipv4 set -i tsl0 -t static -I 127.0.0.1 -N 255.0.0.0
Unable to find a Tessel interface with the name tsl9||ipv6 set -i tsl9 -d true
Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   Example: 1:2:3:4::/64||ipv6 address add -i tsl0 -I 2001:db8::50
Error adding IPv6 address for the interface tsl0. Error was : The IPv6 address 2001:db8::99/64 is not configured on the interface||ipv6 address remove -i tsl0 -I 2001:db8::99/64
Invalid tag name Bogus\n$SUPPORTED||tag add -i tsl0 -t Bogus
Unable to find tslnic with name tsl9||tag remove -i tsl9 -t Storage
Unable to find an interface with name tsl9||tag get -i tsl9
EOF
cli "${IF[@]}" ipv4 set -i tsl0 -t manual
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --type: 'manual' is not one of static, dhcp, none."

finish
