#!/usr/bin/env bash
# Measures what a command costs, start-up included, and that its cost follows
# what it reads: each command runs on the default host and on one with
# thousands of port groups. Uses hyperfine (Debian package "hyperfine") when
# it is there, else a plain loop.
#
#   bench/command-cost.sh [PORT_GROUPS]     (default 5000)
set -euo pipefail

top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
"$top/scripts/build.sh" tools
cli="$top/build/bin/haldencli"
sim="$top/build/bin/haldensim"
groups=${1:-5000}

work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
small="$work/default.db"
large="$work/large.db"
"$sim" --host "$small" init

# The default host with many more port groups on switch0.
{
  "$sim" --host "$small" export | sed -n '1,/"portGroups": \[/p'
  for i in $(seq 1 "$groups"); do
    printf '    {"name": "pg%d", "vswitch": "switch0", "vlanId": %d, "policy": {"teaming": {}, "security": {}, "shaping": {}}},\n' \
      "$i" $((i % 4095))
  done
  "$sim" --host "$small" export | sed -n '/"portGroups": \[/,$p' | tail -n +2
} >"$work/large.json"
"$sim" --host "$large" init --from "$work/large.json"

commands=(
  "network --help"
  "network firewall get"
  "network firewall ruleset list"
  "network vswitch standard list"
  "network vswitch standard portgroup list"
)

for command in "${commands[@]}"; do
  for host in "$small" "$large"; do
    label="$command  [$( [ "$host" = "$small" ] && echo default host || echo "$groups port groups")]"
    if command -v hyperfine >/dev/null; then
      hyperfine -N --warmup 3 --runs 30 --style basic -n "$label" "$cli --host $host $command" 2>/dev/null |
        grep -E "^Benchmark|Time \(mean"
    else
      start=$(date +%s%N)
      for _ in $(seq 30); do "$cli" --host "$host" $command >/dev/null; done
      echo "$label: $(( ($(date +%s%N) - start) / 30000000 )) ms"
    fi
  done
done
