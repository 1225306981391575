#!/usr/bin/env bash
# Runs one fuzz target for a number of seconds:
#
#   scripts/fuzz.sh TARGET SECONDS
#
# TARGET is one of command_line, values, host_description, batch_input,
# user_files (fuzz/*.cpp). The targets are built with clang, libFuzzer,
# AddressSanitizer and UndefinedBehaviorSanitizer in ./build-fuzz. The run
# starts from the seeds in fuzz/corpus/TARGET and keeps what it finds new in
# build-fuzz/corpus/TARGET; an input that crashes a target is written to
# build-fuzz/findings/TARGET/ and the run fails.
set -euo pipefail
top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
if [ $# -ne 2 ] || [ ! -f "$top/fuzz/$1.cpp" ] || ! [[ $2 =~ ^[0-9]+$ ]]; then
  echo "usage: scripts/fuzz.sh TARGET SECONDS; targets: $(cd "$top/fuzz" && ls *.cpp | sed 's/\.cpp$//' | tr '\n' ' ')" >&2
  exit 2
fi
target=$1
seconds=$2
build="$top/build-fuzz"
"$top/scripts/install-packages.sh" clang libclang-rt-14-dev cmake ninja-build pkg-config libboost1.81-dev \
  libsqlite3-dev nlohmann-json3-dev
sanitizers="-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer"
if [ ! -f "$build/CMakeCache.txt" ]; then
  CXX=clang++ cmake -S "$top" -B "$build" -G Ninja -DHALDEN_FUZZ=ON -DBUILD_TESTING=OFF \
    -DCMAKE_BUILD_TYPE=Debug "-DCMAKE_CXX_FLAGS=$sanitizers -fsanitize=fuzzer-no-link -O1" \
    "-DCMAKE_EXE_LINKER_FLAGS=$sanitizers" >&2
fi
cmake --build "$build" -j2 --target "fuzz_$target" >&2
mkdir -p "$build/corpus/$target" "$build/findings/$target"
# Leaks are the sanitized test suite's to find; a fuzz run looks for crashes,
# hangs and undefined behaviour.
ASAN_OPTIONS=detect_leaks=0 "$build/bin/fuzz_$target" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 \
  -artifact_prefix="$build/findings/$target/" "$build/corpus/$target" "$top/fuzz/corpus/$target"
