# Shared by the bench scripts: builds the tools and the measuring programs,
# and gives each script a work folder removed at exit.
#
#   . "$(dirname "${BASH_SOURCE[0]}")/lib.sh"
#   bench_setup          # sets top, cli, sim, work, floor, paired
set -euo pipefail

bench_setup() {
  top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
  "$top/scripts/build.sh" tools
  cli="$top/build/bin/haldencli"
  sim="$top/build/bin/haldensim"
  work=$(mktemp -d "${TMPDIR:-/tmp}/halden-bench.XXXXXX")
  trap 'rm -rf "$work"' EXIT
  # The floor: a C++ program that loads one shared library and calls it.
  g++ -O2 -fPIC -shared "$top/bench/tools/floor_library.cpp" -o "$work/libfloor.so"
  g++ -O2 "$top/bench/tools/floor_main.cpp" -o "$work/floor" -ldl
  floor="$work/floor $work/libfloor.so"
  g++ -O2 "$top/bench/tools/paired_runs.cpp" -o "$work/paired_runs"
  paired="$work/paired_runs"
}

# A fresh host at $1: the default one, or N times its size with $2 = N.
bench_host() {
  if [ $# -gt 1 ]; then "$sim" --host "$1" init --scale "$2"; else "$sim" --host "$1" init; fi
}
