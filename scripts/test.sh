#!/usr/bin/env bash
# Builds and runs every test: the plain build, then the whole suite again
# under AddressSanitizer + UndefinedBehaviorSanitizer, then the concurrency
# tests under ThreadSanitizer.
set -euo pipefail
here=$(cd "$(dirname "$0")/.." && pwd)
"$here/scripts/setup.sh"
jobs=$(nproc)

echo "== plain build"
"$here/scripts/build.sh" "$here/build" plain
(cd "$here/build" && ctest --output-on-failure -j "$jobs")

echo "== AddressSanitizer + UndefinedBehaviorSanitizer"
"$here/scripts/build.sh" "$here/build-asan" asan
(cd "$here/build-asan" && ctest --output-on-failure -j "$jobs")

echo "== ThreadSanitizer (concurrency tests)"
TSM_TARGETS="test_frame_concurrency test_fft_concurrency" "$here/scripts/build.sh" "$here/build-tsan" tsan
(cd "$here/build-tsan" && ctest --output-on-failure -j "$jobs" -L concurrency)
