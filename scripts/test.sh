#!/usr/bin/env bash
# Sets up what is missing, builds everything and runs every test. The desktop backend's
# tests need an X server: they run under a virtual one (Xvfb) and skip only where none starts.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${REDIZOR_BUILD_DIR:-$root/build}
bash "$root/scripts/setup.sh"
bash "$root/scripts/build.sh"
cd "$build"
if [ -z "${DISPLAY:-}" ] && command -v xvfb-run >/dev/null 2>&1; then
  exec xvfb-run -a -s "-screen 0 1280x1024x24" ctest -j"$(nproc)" --output-on-failure "$@"
fi
exec ctest -j"$(nproc)" --output-on-failure "$@"
