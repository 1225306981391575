#!/usr/bin/env bash
# network nic list, get, set, up, down, stats and vlan stats, negotiate
# restart: the default host's NICs in each formatter, settings changed and read
# back, a NIC taken down and up again as the list shows it, and the refusals
# with their texts and exit statuses, leaving the host as it was.
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

check "nic list shows every NIC as a table, the pseudo NIC without a PCI device"
cli network nic list
expect_status 0
expect_stderr_empty
expect_stdout "Name   PCI Device    Driver  Admin Status  Link Status  Speed  Duplex  MAC Address        MTU   Description
-----  ------------  ------  ------------  -----------  -----  ------  -----------------  ----  ---------------------------------------------------------------
pnet0  0000:03:00.0  ixgbe   Up            Up           10000  Full    a0:36:9f:1c:2e:40  1500  Intel Corporation 82599 10 Gigabit Dual Port Network Connection
pnet1  0000:03:00.1  ixgbe   Up            Up           10000  Full    a0:36:9f:1c:2e:41  1500  Intel Corporation 82599 10 Gigabit Dual Port Network Connection
pnet2  0000:05:00.0  igb     Down          Down         0      Half    a0:36:9f:2b:11:80  1500  Intel Corporation I350 Gigabit Network Connection
pnet3  0000:81:00.0  ixgbe   Up            Up           10000  Full    a0:36:9f:3d:5a:10  9000  Intel Corporation Ethernet Controller X710 for 10GbE SFP+
pnet4  0000:81:00.1  ixgbe   Up            Up           10000  Full    a0:36:9f:3d:5a:11  9000  Intel Corporation Ethernet Controller X710 for 10GbE SFP+
pnet5  0000:81:00.2  ixgbe   Up            Up           10000  Full    a0:36:9f:3d:5a:12  9000  Intel Corporation Ethernet Controller X710 for 10GbE SFP+
pnet6  Pseudo        hvnet   Up            Up           10000  Full    00:50:56:00:00:06  1500  Unknown Unknown"

check "nic list in the other formatters; only json and the like show Link"
cli --formatter json network nic list
expect_status 0
expect_stdout_contains '{"Name":"pnet6","PCI Device":"Pseudo","Driver":"hvnet","Link":"Up","Admin Status":"Up","Link Status":"Up","Speed":10000,"Duplex":"Full","MAC Address":"00:50:56:00:00:06","MTU":1500,"Description":"Unknown Unknown"}]'
for pair in "simple|   PCI Device: Pseudo" "csv|pnet2,0000:05:00.0,igb,Down,Down,0,Half,a0:36:9f:2b:11:80,1500,Intel Corporation I350 Gigabit Network Connection" \
            "xml|<string>Unknown Unknown</string>" "keyvalue|Nic.Link.string=Down"; do
  cli --formatter "${pair%%|*}" network nic list
  expect_status 0
  expect_stdout_contains "${pair#*|}"
done
cli --formatter simple network nic list
expect_stdout_lacks "Link: "

check "nic get shows a NIC's settings, and leaves out pause where it has none"
cli network nic get -n pnet0
expect_status 0
expect_stdout "NICInfo
   Name: pnet0
   Supported Ports: FIBRE, DA
   Supports Auto Negotiation: true
   Advertised Link Modes: 1000baseT/Full, 10000baseT/Full
   Advertised Auto Negotiation: true
   Cable Type: DA
   PHY Address: 1
   Transceiver: internal
   Auto Negotiation: true
   Supports Wakeon: true
   Wakeon: MagicPacket(tm)
   Current Message Level: 7
   Link Detected: true
   Supports Pause: true
   Pause Autonegotiate: true
   Pause RX: true
   Pause TX: true
   Link Status: Up
   Driver Info:
      NICDriverInfo
         Driver: ixgbe
         Version: 5.19.9
         Firmware Version: 0x800009e0
         Bus Info: 0000:03:00.0"
cli --formatter json network nic get -n pnet5
expect_status 0
expect_stdout '{"Name":"pnet5","Supported Ports":["FIBRE"],"Supports Auto Negotiation":false,"Advertised Link Modes":[],"Advertised Auto Negotiation":false,"Cable Type":"FIBRE","PHY Address":0,"Transceiver":"external","Auto Negotiation":false,"Supports Wakeon":false,"Wakeon":["None"],"Current Message Level":-1,"Link Detected":true,"Supports Pause":false,"Pause Autonegotiate":null,"Pause RX":null,"Pause TX":null,"Link Status":"Up","Driver Info":{"Driver":"ixgbe","Version":"2.22.18","Firmware Version":"8.50 0x8000b6e3 1.3179.0","Bus Info":"0000:81:00.2"}}'
cli --formatter keyvalue network nic get -n pnet6
expect_stdout_contains "NICInfo.Supported Ports[].string=UNKNOWN
NICInfo.Supports Auto Negotiation.boolean=false"
expect_stdout_contains "NICInfo.Cable Type.string=
"

check "settings set are read back by get, and speed by list"
cli network nic set -n pnet0 -p fibre -P 3 -t external -w pg -l 15
expect_status 0
expect_stdout_empty
cli network nic get -n pnet0
expect_stdout_contains "   Cable Type: FIBRE
   PHY Address: 3
   Transceiver: external"
expect_stdout_contains "   Wakeon: PHY Activity, MagicPacket(tm)
   Current Message Level: 15"
cli network nic set -n pnet0 --speed 1000 --duplex full
expect_status 0
cli network nic list
expect_stdout_matches "^pnet0  0000:03:00.0  ixgbe   Up            Up           1000   Full"
cli --formatter json network nic set -n pnet0 -a
expect_stdout "true"
cli network nic get -n pnet0
expect_stdout_contains "   Auto Negotiation: true"

check "set refuses what is no change, unsupported or incomplete, and changes nothing"
expect_refusal "There is no change for nic pnet0" network nic set -n pnet0 -p fibre -P -1
expect_refusal "Invalid PHY address value." network nic set -n pnet0 -P 0
expect_refusal "Invalid wol value." network nic set -n pnet0 -p tp -w gd
expect_refusal "Not Support wol." network nic set -n pnet5 -w g
expect_refusal "Not Support msglvl." network nic set -n pnet6 -l 1
expect_refusal "The --speed and --duplex options must be specified together" network nic set -n pnet0 -S 1000 -a
expect_refusal "The options --speed and --duplex cannot be specified with the --auto option." \
  network nic set -n pnet0 -S 1000 -D half -a
expect_refusal "Physical NIC pnet0 does not support the port type MII" network nic set -n pnet0 -p mii

check "the tool refuses a speed, a duplex or a wake-on letter outside the choices"
cli network nic set -n pnet0 -S 300 -D full
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --speed: 300 is not one of 10, 100, 1000, 2500, 5000, 10000, 20000, 25000, 40000, 50000, 56000, 100000."
cli network nic set -n pnet0 -w gx
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --wake-on-lan: 'gx' does not match the pattern [pumbagsd]+."
cli network nic set --help
expect_stdout_contains "                          da: Select DA (Direct Attach copper) as the device
                          port"

check "a NIC taken down shows no link in the list, and its link again once up"
cli network nic down -n pnet1
expect_status 0
expect_stdout_empty
cli network nic list
expect_stdout_matches "^pnet1  0000:03:00.1  ixgbe   Down          Down         0      Half"
cli network nic up -n pnet1
expect_status 0
cli network nic list
expect_stdout_matches "^pnet1  0000:03:00.1  ixgbe   Up            Up           10000  Full"
cli --formatter json network nic up -n pnet2
expect_stdout "true"
cli --formatter json network nic list
expect_stdout_contains '"Name":"pnet2","PCI Device":"0000:05:00.0","Driver":"igb","Link":"Down","Admin Status":"Up","Link Status":"Down"'

check "an unknown NIC is named in each command's own words"
expect_refusal "There is no pnic with name pnet9" network nic get -n pnet9
expect_refusal "There is no pnic with name pnet9" network nic up -n pnet9
expect_refusal "There is no pnic with name pnet9" network nic down -n pnet9
expect_refusal "There is no pnic with name pnet9" network nic set -n pnet9 -a
expect_refusal "Pnic with name pnet9 not found" network nic negotiate restart -n pnet9
expect_refusal "Unable to get stats for NIC: Physical NIC pnet9 does not exist" network nic stats get -n pnet9
expect_refusal "pnet9 is not a valid NIC connected to any virtual switch." network nic vlan stats get -n pnet9

check "negotiate restart delivers an unset boolean, and is refused without autonegotiation"
cli --formatter json network nic negotiate restart -n pnet0
expect_status 0
expect_stdout "null"
expect_refusal "Unable to restart negotiation on pnet3: autonegotiation is off" network nic negotiate restart --pnet pnet3

check "nic stats get titles the counters with the NIC's name"
cli network nic stats get -n pnet0
expect_status 0
expect_stdout_contains "NIC statistics for pnet0
   Packets received: 13902213
   Packets sent: 10694010"
expect_stdout_contains "   Total receive errors: 7"
cli --formatter json network nic stats get -n pnet6
expect_stdout_contains '[{"NIC Name":"pnet6","Packets received":0,'

check "VLAN counters: read on the uplink's switch, switched off and on again"
cli network nic vlan stats get -n pnet0
expect_status 0
expect_stdout "VLAN 0
   Packets received: 13020114
   Packets sent: 9917733

VLAN 100
   Packets received: 882100
   Packets sent: 500000"
cli network nic vlan stats set -n pnet0 -e false
expect_status 0
expect_stdout_empty
cli --formatter json network nic vlan stats get -n pnet0
expect_stdout "[]"
cli network nic vlan stats set -n pnet0 -e true
cli --formatter json network nic vlan stats get -n pnet0
expect_stdout '[{"VLAN ID":0,"Packets received":0,"Packets sent":0}]'

check "vlan stats set on a NIC on no switch reports it and still delivers true"
before=$("$HALDENSIM" export)
cli --formatter json network nic vlan stats set -n pnet1 -e true
expect_status 1
expect_stderr "pnet1 is not a valid NIC connected to any virtual switch."
expect_stdout "true"
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "a host failure is printed in the command's words"
"$HALDENSIM" fault add --operation Pnic::GetMacAddress --message "device busy" >/dev/null
expect_refusal "Unable to list NICs.  Error was device busy" network nic list
"$HALDENSIM" fault clear >/dev/null
"$HALDENSIM" fault add --operation PortsetImpl::GetUplinkVlanStats --message "device busy" >/dev/null
expect_refusal "Unable to get VLAN stats: device busy" network nic vlan stats get -n pnet0
"$HALDENSIM" fault clear >/dev/null

finish
