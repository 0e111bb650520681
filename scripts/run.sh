#!/usr/bin/env bash
# Sets everything up, builds, and starts Tint-Rolla.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/build.sh
if [ -z "${DISPLAY:-}" ] && [ -z "${WAYLAND_DISPLAY:-}" ]; then
  echo "Tint-Rolla is built (build/tintrolla), but there is no display to show its window on."
  echo "Run this command again from a desktop session."
  exit 2
fi
exec build/tintrolla "$@"
