#!/usr/bin/env bash
# Sets up what is missing, builds everything and runs every test, then the robustness runs:
# the whole suite again under AddressSanitizer and UndefinedBehaviorSanitizer (with a soak run
# of 200000 passes), and each fuzz target for a bounded time. The desktop backend's tests run
# under a virtual X server (Xvfb) and skip only where none starts.
#   REDIZOR_QUICK=1 bash scripts/test.sh   runs only the first, plain suite.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
build=${REDIZOR_BUILD_DIR:-$root/build}
bash "$root/scripts/setup.sh"

run_suite() {  # build-dir, then extra ctest arguments
  local dir=$1
  shift
  if [ -z "${DISPLAY:-}" ] && command -v xvfb-run >/dev/null 2>&1; then
    (cd "$dir" && xvfb-run -a -s "-screen 0 1280x1024x24" ctest -j"$(nproc)" --output-on-failure "$@")
  else
    (cd "$dir" && ctest -j"$(nproc)" --output-on-failure "$@")
  fi
}

echo "== tests"
bash "$root/scripts/build.sh"
run_suite "$build"
[ -n "${REDIZOR_QUICK:-}" ] && exit 0

echo "== tests under AddressSanitizer and UndefinedBehaviorSanitizer, with the soak run"
asan=${REDIZOR_ASAN_BUILD_DIR:-$root/build-asan}
REDIZOR_BUILD_DIR=$asan bash "$root/scripts/build.sh" -DREDIZOR_SANITIZE=ON -DREDIZOR_BUILD_BENCH=OFF
export ASAN_OPTIONS="halt_on_error=1:abort_on_error=1:quarantine_size_mb=16"
export UBSAN_OPTIONS="halt_on_error=1:print_stacktrace=1"
export LSAN_OPTIONS="suppressions=$root/tests/lsan.supp:print_suppressions=0"
export REDIZOR_SOAK_PASSES=200000
run_suite "$asan"

echo "== fuzzing"
bash "$root/scripts/fuzz.sh" "${REDIZOR_FUZZ_SECONDS:-60}"
