#!/usr/bin/env bash
# Builds halden-network in ./build, installing the Debian packages it needs
# first when they are missing. Incremental: when nothing changed since the
# last successful build of the same scope, it returns at once.
#
#   scripts/build.sh tools            haldencli, haldensim and the network plug-in
#   scripts/build.sh all              everything, tests included
#   scripts/build.sh all sanitized    everything, built with AddressSanitizer and
#                                     UndefinedBehaviorSanitizer, in ./build-sanitized
#
# All of its own output goes to standard error, so that the wrappers can run
# it in front of a command whose standard output scripts read.
set -euo pipefail

scope=${1:-all}
variant=${2:-}
top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
build="$top/build"
cmake_flags=(-DCMAKE_BUILD_TYPE=RelWithDebInfo)
case "$variant" in
  "") ;;
  sanitized)
    build="$top/build-sanitized"
    sanitizers="-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer"
    # GCC warns of uninitialised values inside its own headers when sanitizing.
    warnings="-Wno-maybe-uninitialized"
    cmake_flags=(-DCMAKE_BUILD_TYPE=Debug "-DCMAKE_CXX_FLAGS=$sanitizers $warnings -O1"
                 "-DCMAKE_EXE_LINKER_FLAGS=$sanitizers" "-DCMAKE_SHARED_LINKER_FLAGS=$sanitizers"
                 "-DCMAKE_MODULE_LINKER_FLAGS=$sanitizers")
    ;;
  *) echo "build.sh: unknown variant '$variant'" >&2; exit 2 ;;
esac
stamp="$build/.built-$scope"

sources_changed() {
  [ -e "$stamp" ] || return 0
  [ -n "$(find "$top/CMakeLists.txt" "$top/lib" "$top/plugins" "$top/tools" "$top/tests" "$top/data" \
            -newer "$stamp" -print -quit 2>/dev/null)" ]
}

sources_changed || exit 0

# One build at a time: scripts may start many tool invocations at once.
mkdir -p "$build"
exec 9>"$build/.lock"
flock 9
sources_changed || exit 0

"$top/scripts/install-packages.sh" g++ cmake ninja-build pkg-config libboost1.81-dev \
  libsqlite3-dev nlohmann-json3-dev libgtest-dev libbenchmark-dev

if [ ! -f "$build/CMakeCache.txt" ]; then
  cmake -S "$top" -B "$build" -G Ninja "${cmake_flags[@]}" >&2
fi
touch "$stamp.new"
if [ "$scope" = tools ]; then
  cmake --build "$build" --target haldencli haldensim network >&2
else
  cmake --build "$build" >&2
fi
mv "$stamp.new" "$stamp"
