#!/usr/bin/env bash
# network vswitch standard policy and portgroup policy: a switch's three
# policies and a port group's overrides set and read back through the
# binary, in each formatter, and refusals that leave the host as it was.
. "$CLI_TEST_LIB"

# A refusal: its texts on standard error, exit 1, and the host unchanged.
expect_unchanged_refusal() {
  local text=$1
  shift
  local before
  before=$("$HALDENSIM" export)
  cli "$@"
  expect_status 1
  expect_stderr "$text"
  [ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"
}

check "a switch's failover policy is set and read back; the group that overrides nothing follows it"
cli network vswitch standard uplink add -v switch0 -u pnet1
cli network vswitch standard policy failover set -v switch0 -l iphash -f beacon -s pnet1
expect_status 0
expect_stdout_empty
cli network vswitch standard policy failover get -v switch0
expect_stdout "   Load Balancing: iphash
   Network Failure Detection: beacon
   Notify Switches: true
   Failback: true
   Active Adapters: pnet0
   Standby Adapters: pnet1
   Unused Adapters:"
cli --formatter json network vswitch standard portgroup policy failover get -p "Guest Network"
expect_stdout '{"Load Balancing":"iphash","Network Failure Detection":"beacon","Notify Switches":true,"Failback":true,"Active Adapters":["pnet0"],"Standby Adapters":["pnet1"],"Unused Adapters":[],"Override Vswitch Load Balancing":false,"Override Vswitch Network Failure Detection":false,"Override Vswitch Notify Switches":false,"Override Vswitch Failback":false,"Override Vswitch Uplinks":false}'

check "a group's override shows as such in every formatter, and use-vswitch takes it back"
cli network vswitch standard portgroup policy security set -p "Guest Network" --allow-promiscuous true
expect_status 0
cli --formatter keyvalue network vswitch standard portgroup policy security get -p "Guest Network"
expect_stdout_contains "PortGroupSecurityPolicy.Allow Promiscuous.boolean=true"
expect_stdout_contains "PortGroupSecurityPolicy.Override Vswitch Allow Promiscuous.boolean=true"
cli --formatter csv network vswitch standard portgroup policy security get -p "Guest Network"
expect_stdout "Allow Promiscuous,Allow MAC Address Change,Allow Forged Transmits,Override Vswitch Allow Promiscuous,Override Vswitch Allow MAC Address Change,Override Vswitch Allow Forged Transmits
true,false,false,true,false,false"
cli --formatter xml network vswitch standard portgroup policy security get -p "Guest Network"
expect_stdout_contains '<structure name="PortGroupSecurityPolicy">'
cli network vswitch standard portgroup policy security set -p "Guest Network" -u
cli --formatter table network vswitch standard portgroup policy security get -p "Guest Network"
expect_stdout_matches "^false +false +false +false +false +false$"

check "shaping shows its units, and -1 when it is off"
cli network vswitch standard policy shaping get -v switch0
expect_stdout "   Enabled: false
   Average Bandwidth: -1 Kbps
   Peak Bandwidth: -1 Kbps
   Burst Size: -1 Kib"
cli network vswitch standard policy shaping set -v switch0 -e true -b 1000 -k 2000 -t 64
expect_status 0
cli network vswitch standard portgroup policy shaping get -p "Host Management"
expect_stdout_contains "   Average Bandwidth: 1000 Kbps"
expect_stdout_contains "   Burst Size: 64 Kib"
expect_stdout_contains "   Override Vswitch Enabled: false"

check "refusals print their exact texts, exit 1, and change nothing"
expect_unchanged_refusal "Unable to find a legacy virtual switch with the name nosuch" \
  network vswitch standard policy failover set -v nosuch -l mac
expect_unchanged_refusal "Unable to find a port group with the name nosuch" \
  network vswitch standard portgroup policy shaping set -p nosuch -e false
expect_unchanged_refusal "NIC is not connected to the vswitch : pnet2" \
  network vswitch standard portgroup policy failover set -p "Guest Network" -a pnet2
expect_unchanged_refusal "Invalid peak bandwidth 18446744073709550616 for virtual switch switch0: the host keeps at most 9223372036854775807 bits per second" \
  network vswitch standard policy shaping set -v switch0 -k 9223372036854775807
cli network vswitch standard policy failover set -v switch0 -l srcport
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --load-balancing: 'srcport' is not one of portid, iphash, mac, explicit."

check "the shaping numbers take 64-bit values; an int option does not"
cli network vswitch standard policy shaping set --help
expect_stdout_contains "-b|--avg-bandwidth=<long>"
cli network vswitch standard policy shaping set -v switch0 -b 9223372036854775808
expect_status 2
cli network vswitch standard set -v switch0 -m 2147483648
expect_status 2

finish
