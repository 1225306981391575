#!/usr/bin/env bash
# What each command costs, start-up included, against the floor: a C++
# program that loads one shared library and calls one function. Commands of
# every family of the tree run on the default host, each run paired with a run of
# the floor just before it; the goal is at most 1.5 times the floor's wall
# time for every command.
#
#   bench/startup.sh [ROUNDS]      (default 200)
. "$(dirname "${BASH_SOURCE[0]}")/lib.sh"
bench_setup
rounds=${1:-200}
host="$work/host.db"
bench_host "$host"
c="$cli --host $host"

# One round leaves the host as it found it: what a line adds, a later line
# removes again.
"$paired" "$rounds" "$floor" <<LINES | awk -F'\t' '
  BEGIN { printf "%8s %8s %6s %6s  %s\n", "floor us", "cmd us", "wall", "cpu", "command"; worst = 0 }
  { sub(/.*--host [^ ]* /, "", $5); printf "%8d %8d %6.2f %6.2f  %s\n", $1, $2, $3, $4, $5
    if ($3 > worst) { worst = $3; which = $5 } }
  END { printf "worst wall ratio %.2f (%s); goal: at most 1.50\n", worst, which }'
$c network --help
$c network firewall get
$c network firewall set -e true
$c network firewall refresh
$c network firewall ruleset list
$c network firewall ruleset list -r dns
$c network firewall ruleset set -r dns -e true
$c network firewall ruleset rule list -r dns
$c network firewall ruleset allowedip list
$c network firewall ruleset allowedip add -r sshClient -i 192.0.2.7
$c network firewall ruleset allowedip remove -r sshClient -i 192.0.2.7
$c network vswitch standard list
$c network vswitch standard list -v switch0
$c network vswitch standard add -v bench0
$c network vswitch standard set -v bench0 -m 9000 -c both
$c network vswitch standard uplink add -v bench0 -u pnet1
$c network vswitch standard uplink remove -v bench0 -u pnet1
$c network vswitch standard portgroup add -p BenchGroup -v bench0
$c network vswitch standard portgroup set -p BenchGroup -v 10
$c network vswitch standard portgroup list
$c network vswitch standard policy failover get -v switch0
$c network vswitch standard policy failover set -v switch0 -l portid
$c network vswitch standard policy security get -v switch0
$c network vswitch standard policy security set -v switch0 -p false
$c network vswitch standard policy shaping get -v switch0
$c network vswitch standard policy shaping set -v switch0 -e false
$c network vswitch standard portgroup policy failover get -p "Guest Network"
$c network vswitch standard portgroup policy failover set -p "Guest Network" -u
$c network vswitch standard portgroup policy security get -p "Guest Network"
$c network vswitch standard portgroup policy security set -p "Guest Network" -u
$c network vswitch standard portgroup policy shaping get -p "Guest Network"
$c network vswitch standard portgroup policy shaping set -p "Guest Network" -u
$c network vswitch standard portgroup remove -p BenchGroup -v bench0
$c network vswitch standard remove -v bench0
$c network vswitch dvs korvex list
$c network vswitch dvs korvex lacp config get
$c network vswitch dvs korvex lacp status get
$c network vswitch dvs korvex lacp stats get
$c network vswitch dvs korvex lacp timeout set -s dvSwitch0 -l 1 -t false
$c network vm list
$c network vm port list -w 69312
$c network port stats get -p 33554437
$c network port filter stats get -p 33554437
$c network ip get
$c network ip dns server list
$c network ip connection list
$c network ip ipsec sa list
$c network ip interface list
$c network ip interface ipv4 get -i tsl0
$c network ip interface set -i tsl0 -m 1500
$c network ip netstack list
$c network ip route ipv4 list
$c network ip neighbor list
$c network nic list
$c network nic get -n pnet0
$c network nic set -n pnet0 -P 3
$c network nic set -n pnet0 -P 1
$c network nic stats get -n pnet0
$c network nic vlan stats get -n pnet0
$c network nic eeprom dump -n pnet0
$c network nic coalesce get
$c network nic software list
$c network nic ring current get -n pnet0
$c network sriovnic vf list -n pnet1
$c network firewall unload
$c network firewall load
LINES
