#!/usr/bin/env bash
# Builds everything with AddressSanitizer (leaks included) and
# UndefinedBehaviorSanitizer in ./build-sanitized and runs the whole suite
# there. Any report of either sanitizer fails the run. Arguments are passed
# to ctest, as with ./run-tests.
set -euo pipefail
top=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
"$top/scripts/build.sh" all sanitized
cd "$top/build-sanitized"
export ASAN_OPTIONS=detect_leaks=1:abort_on_error=0:halt_on_error=1:exitcode=86:strict_string_checks=1:detect_stack_use_after_return=1
export UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1:exitcode=87
ctest --output-on-failure -j"$(nproc)" "$@"
