#!/usr/bin/env bash
# Builds Penmoor and runs the whole test suite: unit, window and file-format tests under
# AddressSanitizer and UndefinedBehaviorSanitizer, then a short bounded run of every fuzzer.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install-deps.sh

# Independent readers must be present: in the suite a missing reader fails, it never skips.
export PENMOOR_REQUIRE_READERS=1
export ASAN_OPTIONS=${ASAN_OPTIONS:-detect_leaks=1:abort_on_error=1}
export UBSAN_OPTIONS=${UBSAN_OPTIONS:-print_stacktrace=1:halt_on_error=1}

cmake --preset ci
cmake --build --preset ci
ctest --preset ci

scripts/fuzz.sh "${PENMOOR_FUZZ_SECONDS:-20}"
