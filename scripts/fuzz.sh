#!/usr/bin/env bash
# Builds the libFuzzer targets with clang, AddressSanitizer and UndefinedBehaviorSanitizer, and
# runs each from its seed corpus in fuzz/corpus for SECONDS (default 60). A crash, a leak, a
# hang or an allocation over the bound fails the run. Long runs: scripts/fuzz.sh 3600.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
seconds=${1:-60}
build=${REDIZOR_FUZZ_BUILD_DIR:-$root/build-fuzz}
CC=clang CXX=clang++ cmake -S "$root" -B "$build" -DREDIZOR_FUZZ=ON -DREDIZOR_SANITIZE=ON \
  -DREDIZOR_BUILD_TESTS=OFF -DCMAKE_BUILD_TYPE=RelWithDebInfo >/dev/null
targets=()
for t in dc8 script ranking; do
  [ -f "$root/fuzz/${t}_fuzz.cpp" ] && targets+=("$t")
done
cmake --build "$build" -j"$(nproc)" --target "${targets[@]/%/_fuzz}"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
for t in "${targets[@]}"; do
  mkdir -p "$work/$t"
  cp -r "$root/fuzz/corpus/$t/." "$work/$t/" 2>/dev/null || true
  echo "fuzzing $t for ${seconds}s"
  (cd "$work" && "$build/fuzz/${t}_fuzz" -max_total_time="$seconds" -timeout=10 \
      -rss_limit_mb=1024 -malloc_limit_mb=256 -print_final_stats=1 "$work/$t" 2>"$work/$t.log") || {
    tail -40 "$work/$t.log"
    echo "fuzzing $t failed"
    exit 1
  }
  grep -E '^stat::number_of_executed_units' "$work/$t.log" || true
done
echo "fuzzing passed"
