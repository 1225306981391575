#!/usr/bin/env bash
# network vswitch standard: switches, uplinks and port groups from the command
# line, round trips through the real binaries, refusals with their texts and
# exit statuses, and a host that every refusal leaves as it was.
. "$CLI_TEST_LIB"

# Runs a command that must be refused with status 1 and the text, and checks
# that the host did not change.
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

check "the default host lists switch0 with its uplink and port groups"
cli network vswitch standard list
expect_status 0
expect_stdout "switch0
   Name: switch0
   Class: etherswitch
   Num Ports: 128
   Used Ports: 4
   Configured Ports: 128
   MTU: 1500
   CDP Status: listen
   Beacon Enabled: false
   Beacon Interval: 1
   Beacon Threshold: 3
   Beacon Required By:
   Uplinks: pnet0
   Portgroups: Host Management, Guest Network"
cli network vswitch standard portgroup list
expect_stdout "Name             Virtual Switch  Active Clients  VLAN ID
---------------  --------------  --------------  -------
Host Management  switch0         1               0
Guest Network    switch0         2               0"

check "a switch added with and without --ports, an uplink and a port group with a VLAN"
cli network vswitch standard add -v switch1
expect_status 0
expect_stdout_empty
cli network vswitch standard add --vswitch-name switch2 -P 384
expect_status 0
cli network vswitch standard uplink add -v switch1 -u pnet1
expect_status 0
cli network vswitch standard portgroup add -p Storage -v switch1
expect_status 0
cli network vswitch standard portgroup set -p Storage --vlan-id 20
expect_status 0
cli --formatter json network vswitch standard list -v switch1
expect_status 0
expect_stdout '[{"Name":"switch1","Class":"etherswitch","Num Ports":128,"Used Ports":1,"Configured Ports":128,"MTU":1500,"CDP Status":"listen","Beacon Enabled":false,"Beacon Interval":1,"Beacon Threshold":3,"Beacon Required By":[],"Uplinks":["pnet1"],"Portgroups":["Storage"]}]'
cli --formatter json network vswitch standard list -v switch2
expect_stdout_contains '"Num Ports":384,"Used Ports":0'
expect_stdout_contains '"Beacon Required By":[],"Uplinks":[],"Portgroups":[]'
cli --formatter json network vswitch standard portgroup list
expect_stdout '[{"Name":"Host Management","Virtual Switch":"switch0","Active Clients":1,"VLAN ID":0},{"Name":"Guest Network","Virtual Switch":"switch0","Active Clients":2,"VLAN ID":0},{"Name":"Storage","Virtual Switch":"switch1","Active Clients":0,"VLAN ID":20}]'

check "MTU and CDP status are set, and set with no option changes nothing"
cli network vswitch standard set -v switch1 -m 9000 -c both
expect_status 0
cli network vswitch standard list -v switch1
expect_stdout_contains "   MTU: 9000"
expect_stdout_contains "   CDP Status: both"
before=$("$HALDENSIM" export)
cli network vswitch standard set -v switch1
expect_status 0
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "refusals print their text, exit 1 and leave the host as it was"
expect_refusal "Unable to create virtual switch switch1: a virtual switch of that name already exists" \
  network vswitch standard add -v switch1
expect_refusal "Unable to create virtual switch big: its 4096 ports and the 640 ports already allocated exceed the host's limit of 4608" \
  network vswitch standard add -v big -P 4096
expect_refusal "Unable to add uplink pnet0 to virtual switch switch1: it is already an uplink of virtual switch switch0" \
  network vswitch standard uplink add -v switch1 -u pnet0
expect_refusal "Unable to add uplink pnet1 to virtual switch switch1: it is already an uplink of this switch" \
  network vswitch standard uplink add -v switch1 -u pnet1
expect_refusal "Unable to add uplink pnet7 to virtual switch switch1: there is no physical NIC of that name" \
  network vswitch standard uplink add -v switch1 -u pnet7
expect_refusal "Unable to remove uplink pnet2 from virtual switch switch1: it is not an uplink of this switch" \
  network vswitch standard uplink remove -v switch1 -u pnet2
expect_refusal "Virtual switch nosuch does not exist" \
  network vswitch standard uplink add -v nosuch -u pnet2
expect_refusal "Unable to add port group Storage to virtual switch switch2: a port group of that name already exists on virtual switch switch1" \
  network vswitch standard portgroup add -p Storage -v switch2
expect_refusal "Virtual switch nosuch does not exist" \
  network vswitch standard portgroup add -p Backup -v nosuch
expect_refusal "Unable to remove port group Guest Network from virtual switch switch0: it has 2 active clients" \
  network vswitch standard portgroup remove -p "Guest Network" -v switch0
expect_refusal "Unable to remove port group Storage from virtual switch switch2: the switch has no port group of that name" \
  network vswitch standard portgroup remove -p Storage -v switch2
expect_refusal "Unable to find a port group with the name Backup" \
  network vswitch standard portgroup set -p Backup -v 3
expect_refusal "Unable to remove virtual switch switch0: its port group Host Management has active clients" \
  network vswitch standard remove -v switch0
expect_refusal "Unable to find virtual switch with the name nosuch" \
  network vswitch standard remove -v nosuch
expect_refusal "nosuch is not a valid name for a virtual switch" \
  network vswitch standard set -v nosuch -m 1500
expect_refusal "MTU size should be a positive value" \
  network vswitch standard set -v switch1 -m -1 -c down
expect_refusal "Invalid MTU 0 for virtual switch switch1: the MTU must be from 1280 to 9000" \
  network vswitch standard set -v switch1 -m 0
expect_refusal "Unable to access all portsets" \
  network vswitch standard list -v nosuch

check "the constraints refuse out-of-range ports and VLAN ids with exit 2"
for ports in 4097 0; do
  cli network vswitch standard add -v x -P $ports
  expect_status 2
  expect_stderr_first_line "Error: Invalid value for option --ports: $ports is not in the range 1 to 4096."
done
cli network vswitch standard portgroup set -p Storage -v 4096
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --vlan-id: 4096 is not in the range 0 to 4095."
cli network vswitch standard set -v switch1 -c up
expect_status 2

check "an integer that does not fit the command's int and a text that is not clean UTF-8 are refused, not passed on"
before=$("$HALDENSIM" export)
cli network vswitch standard set -v switch1 -m 4294968796
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --mtu: '4294968796' is outside the 32-bit integer range (-2147483648 to 2147483647)."
cli network vswitch standard set -v switch1 -m 2147483648
expect_status 2
cli network vswitch standard portgroup add -p $'bad\xff' -v switch1
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --portgroup-name: 'bad\\xFF' is not valid UTF-8."
cli network vswitch standard portgroup add -p $'two\nlines' -v switch1
expect_status 2
expect_stderr_first_line "Error: Invalid value for option --portgroup-name: 'two\\x0Alines' contains a control character."
[ "$("$HALDENSIM" export)" == "$before" ] || fail_check "the host changed"

check "an armed fault reaches the command's handler"
sim fault add --operation "VirtualSwitch::AddPortGroup" --message "port group table full" --times 1
cli network vswitch standard portgroup add -p Backup -v switch1
expect_status 1
expect_stderr "port group table full"
cli network vswitch standard portgroup list
expect_stdout_lacks "Backup"
cli network vswitch standard portgroup add -p Backup -v switch1
expect_status 0

check "an uplink the host does not own as a NIC is hidden from Uplinks"
"$HALDENSIM" export | sed 's/"pnet1"$/"pnet1",\n        "vmnic9"/' >"$CLI_TEST_DIR/edited.json"
grep -q vmnic9 "$CLI_TEST_DIR/edited.json" || fail_check "the description was not edited"
sim import "$CLI_TEST_DIR/edited.json"
expect_status 0
cli --formatter json network vswitch standard list -v switch1
expect_stdout_contains '"Used Ports":2,'
expect_stdout_contains '"Uplinks":["pnet1"],'

check "removing everything again leaves the default host"
cli network vswitch standard portgroup remove -p Backup -v switch1
expect_status 0
cli network vswitch standard portgroup remove -p Storage -v switch1
expect_status 0
cli network vswitch standard uplink remove -v switch1 -u pnet1
expect_status 0
cli network vswitch standard remove -v switch1
expect_status 0
cli network vswitch standard remove -v switch2
expect_status 0
sim export
[ "$OUT" == "$(cat "$(dirname "${BASH_SOURCE[0]}")/../../data/default-host.json")" ] ||
  fail_check "the host differs from the default: $(diff <(printf '%s\n' "$OUT") "$(dirname "${BASH_SOURCE[0]}")/../../data/default-host.json" | head -20)"

finish
