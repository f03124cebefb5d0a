#!/usr/bin/env bash
# Configures and builds Redizor (the game, its data pack and its tests) in build/.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${REDIZOR_BUILD_DIR:-$root/build}
cmake -S "$root" -B "$build" -DCMAKE_BUILD_TYPE=RelWithDebInfo "$@" >/dev/null
cmake --build "$build" -j"$(nproc)"
