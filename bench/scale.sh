#!/usr/bin/env bash
# Costs that follow the work: the same commands on the default host and on a
# host N times its size (haldensim init --scale N). A command that reads one
# object should cost at most 1.2 times what it costs on the default host; a
# list should cost at most 2 microseconds for each row it gains.
#
#   bench/scale.sh [N] [ROUNDS]      (defaults 100 and 100)
. "$(dirname "${BASH_SOURCE[0]}")/lib.sh"
bench_setup
scale=${1:-100}
rounds=${2:-100}
small="$work/default.db"
large="$work/scaled.db"
bench_host "$small"
bench_host "$large" "$scale"

# Rows a listing command prints as json: its top-level list's length.
rows() { "$cli" --host "$1" --formatter json "${@:2}" | python3 -c 'import json,sys; print(len(json.load(sys.stdin)))'; }

one_object=(
  "network firewall get"
  "network firewall ruleset list -r dns"
  "network firewall ruleset rule list -r dns"
  "network vswitch standard list -v switch0"
  "network vswitch standard set -v switch0 -c listen"
  "network vswitch standard portgroup set -p \"Guest Network\" -v 0"
  "network vswitch dvs korvex list -v dvSwitch0"
  "network vswitch dvs korvex lacp status get -s dvSwitch0"
  "network vswitch dvs korvex lacp timeout set -t false -l 1 -s dvSwitch0"
  "network nic get -n pnet0"
  "network nic set -n pnet0 -P 3"
  "network nic vlan stats get -n pnet0"
)
lists=(
  "network firewall ruleset list"
  "network firewall ruleset rule list"
  "network firewall ruleset allowedip list"
  "network vswitch standard list"
  "network vswitch standard portgroup list"
  "network vswitch dvs korvex list"
  "network vm list"
  "network nic list"
)

# Each command runs on the scaled host paired with a run on the default host.
measure() {
  for command in "$@"; do echo "$cli --host $large $command"; done |
    "$paired" "$rounds" "$cli --host $small network --help" >/dev/null # warm the page cache
  for command in "$@"; do
    printf '%s\n' "$cli --host $large $command" | "$paired" "$rounds" "$cli --host $small $command"
  done
}

echo "One object, host of scale $scale against the default host (goal: at most 1.20):"
measure "${one_object[@]}" | awk -F'\t' '{ sub(/.*--host [^ ]* /, "", $5); printf "  %6.2f  %s\n", $3, $5 }'

echo "Lists: extra cost per extra row on the host of scale $scale (goal: at most 2.0 us):"
for command in "${lists[@]}"; do
  eval "words=($command)"
  small_rows=$(rows "$small" "${words[@]}")
  large_rows=$(rows "$large" "${words[@]}")
  measure "$command" | awk -F'\t' -v a="$small_rows" -v b="$large_rows" '
    { sub(/.*--host [^ ]* /, "", $5)
      printf "  %6.2f us/row  (%d -> %d rows, %d -> %d us)  %s\n", ($2 - $1) / (b - a), a, b, $1, $2, $5 }'
done
