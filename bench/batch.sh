#!/usr/bin/env bash
# Commands per second in batch mode: LINES lines of `network firewall get` on
# the default host, in one haldencli process (goal: at least 20,000 a
# second), and a mixed file of reads and writes, with the changes checked.
#
#   bench/batch.sh [LINES]      (default 100000)
. "$(dirname "${BASH_SOURCE[0]}")/lib.sh"
bench_setup
lines=${1:-100000}
host="$work/host.db"
bench_host "$host"

seq "$lines" | sed "s/.*/network firewall get/" >"$work/reads.txt"
start=$(date +%s%N)
"$cli" --host "$host" --batch "$work/reads.txt" >/dev/null
elapsed=$(( $(date +%s%N) - start ))
echo "firewall get: $lines commands in $((elapsed / 1000000)) ms: $(( lines * 1000000000 / elapsed )) a second (goal: at least 20000)"

# Mixed: each group of four lines adds a port group, sets its VLAN, lists
# the groups and reads the firewall.
groups=$(( lines / 4 ))
for i in $(seq 1 "$groups"); do
  echo "network vswitch standard portgroup add -p bench$i -v switch0"
  echo "network vswitch standard portgroup set -p bench$i -v $(( i % 4095 ))"
  echo "network firewall ruleset list -r dns"
  echo "network firewall get"
done >"$work/mixed.txt"
start=$(date +%s%N)
"$cli" --host "$host" --batch "$work/mixed.txt" >/dev/null
elapsed=$(( $(date +%s%N) - start ))
kept=$("$cli" --host "$host" --formatter json network vswitch standard portgroup list | grep -o '"bench[0-9]*"' | wc -l)
echo "mixed reads and writes: $(( groups * 4 )) commands in $((elapsed / 1000000)) ms: $(( groups * 4 * 1000000000 / elapsed )) a second; $kept of $groups port groups kept"
