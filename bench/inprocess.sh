#!/usr/bin/env bash
# The in-process benchmarks (bench/inprocess, Google Benchmark): what each
# command family costs inside a running tool, start-up left out. Arguments
# are passed to the benchmark program (e.g. --benchmark_filter=Vswitch).
set -euo pipefail
top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
"$top/scripts/build.sh" tools
cmake --build "$top/build" --target command_benchmarks >&2
exec "$top/build/bin/command_benchmarks" "$@"
