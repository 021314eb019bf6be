#!/usr/bin/env bash
# Builds everything and runs the autotests under CTest on the offscreen platform.
#
#   scripts/test.sh            normal build (build/)
#   scripts/test.sh --asan     AddressSanitizer + UndefinedBehaviorSanitizer build (build-asan/)
#   scripts/test.sh --tsan     ThreadSanitizer build (build-tsan/)
#   scripts/test.sh -R REGEX   only the tests matching REGEX
#
# CTest's summary is the last thing printed.
set -euo pipefail

ROOT="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
SETUP_ARGS=()
CTEST_ARGS=()
BUILD_DIR="$ROOT/build"
while [[ $# -gt 0 ]]; do
    case "$1" in
        --asan) SETUP_ARGS+=(--asan); BUILD_DIR="$ROOT/build-asan"; shift ;;
        --tsan) SETUP_ARGS+=(--tsan); BUILD_DIR="$ROOT/build-tsan"; shift ;;
        -R) CTEST_ARGS+=(-R "$2"); shift 2 ;;
        *) echo "test.sh: unknown option $1" >&2; exit 2 ;;
    esac
done

"$ROOT/scripts/setup.sh" --build-dir "$BUILD_DIR" "${SETUP_ARGS[@]}"
"$ROOT/scripts/check-test-tools.sh"

export QT_QPA_PLATFORM=offscreen
export ASAN_OPTIONS="${ASAN_OPTIONS:-detect_leaks=0:abort_on_error=1}"
export UBSAN_OPTIONS="${UBSAN_OPTIONS:-print_stacktrace=1:halt_on_error=1}"
export TSAN_OPTIONS="${TSAN_OPTIONS:-halt_on_error=1 second_deadlock_stack=1 suppressions=$ROOT/scripts/tsan.supp}"

# The installed package must work for a host project: install, then build the consumer.
cmake --install "$BUILD_DIR" >/dev/null

cd "$BUILD_DIR"
exec ctest --output-on-failure --parallel "$(nproc)" "${CTEST_ARGS[@]}"
