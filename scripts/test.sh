#!/usr/bin/env bash
# Sets everything up, builds, and runs every test (engine and window, offscreen).
#   bash scripts/test.sh              the Release build in build/ (quick)
#   bash scripts/test.sh --sanitize   a Debug build in build-asan/ under AddressSanitizer
#                                     and UndefinedBehaviorSanitizer; any report fails
set -euo pipefail
cd "$(dirname "$0")/.."
case "${1:-}" in
  "")
    bash scripts/build.sh
    folder=build ;;
  --sanitize)
    bash scripts/setup.sh
    cmake -S . -B build-asan -DCMAKE_BUILD_TYPE=Debug -DTINTROLLA_SANITIZE=ON >/dev/null
    cmake --build build-asan -j"$(nproc)"
    folder=build-asan ;;
  *)
    echo "usage: bash scripts/test.sh [--sanitize]" >&2
    exit 2 ;;
esac
export QT_QPA_PLATFORM=offscreen
cd "$folder"
# ctest ends with its count ("100% tests passed, 0 tests failed out of N"),
# failed or not; set -e acts only on its exit status after that.
ctest --output-on-failure -j"$(nproc)" --timeout 300
