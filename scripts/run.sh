#!/usr/bin/env bash
# Sets up what is missing, builds the game and its data pack, and starts it.
# Options after the script's name go to the game (see: scripts/run.sh --help).
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
bash "$root/scripts/setup.sh"
bash "$root/scripts/build.sh"
exec "${REDIZOR_BUILD_DIR:-$root/build}/redizor" "$@"
