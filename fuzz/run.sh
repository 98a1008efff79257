#!/usr/bin/env bash
# Builds the libFuzzer targets with clang (address and undefined-behaviour sanitizers), runs
# each for a bounded time from its seed corpus, then replaces fuzz/corpus/<target>/ by a fresh
# minimal seed set of the old seeds and this run's new inputs (the corpus never only grows).
#   bash fuzz/run.sh [seconds per target, default 60] [target ...]
set -euo pipefail
cd "$(dirname "$0")/.."
seconds=${1:-60}
shift || true
bash scripts/setup-clang.sh
build=build/fuzz
CXX=clang++ cmake -S . -B $build -DCMAKE_BUILD_TYPE=RelWithDebInfo -DTOVRIN_BUILD_FUZZERS=ON \
  -DTOVRIN_BUILD_TESTS=OFF -DTOVRIN_BUILD_BENCHMARKS=OFF -DTOVRIN_BUILD_TOOLS=OFF \
  -DCMAKE_CXX_FLAGS="-fsanitize=fuzzer-no-link,address,undefined -fno-sanitize-recover=all" >/dev/null
# This run's findings go to a folder of their own, so that earlier ones are not reported again.
findings=$build/findings-$(date -u +%Y%m%d-%H%M%S)-$$
mkdir -p "$findings"
targets=("$@")
if [ ${#targets[@]} -eq 0 ]; then
  for f in fuzz/*_fuzz.cpp; do targets+=("$(basename "$f" _fuzz.cpp)"); done
fi
for t in "${targets[@]}"; do
  cmake --build $build --target "${t}_fuzz" "${t}_fuzz_seeds" -j2
  mkdir -p "fuzz/corpus/$t"
  work=$(mktemp -d)
  # -fork keeps fuzzing after a finding (crash, leak or 1 s time-out), whose input lands in
  # $findings/<target>-*; new inputs land in $work whatever happened.
  "$build/${t}_fuzz" -fork=1 -ignore_crashes=1 -ignore_timeouts=1 -ignore_ooms=1 \
    -max_total_time="$seconds" -timeout=1 -rss_limit_mb=2048 \
    -artifact_prefix="$findings/${t}-" "$work" "fuzz/corpus/$t" || true
  # First libFuzzer's merge into an empty folder (inputs that crash or hang are left out), then
  # the fewest of those that still reach every edge (see fuzz/seeds_main.cpp).
  merged=$(mktemp -d)
  "$build/${t}_fuzz" -merge=1 -timeout=1 -rss_limit_mb=2048 "$merged" \
    "fuzz/corpus/$t" "$work" >/dev/null 2>&1 || true
  seeds=$(mktemp -d)
  "$build/${t}_fuzz_seeds" "fuzz/corpus/$t" "$merged" | xargs -r cp -t "$seeds"
  rm -rf "fuzz/corpus/$t" "$work" "$merged"
  mv "$seeds" "fuzz/corpus/$t"
  chmod 755 "fuzz/corpus/$t"
done
if [ -n "$(ls -A "$findings")" ]; then
  ls "$findings"/*
  echo "findings above (in $findings): reduce each, fix, then keep the input as fuzz/findings/<target>-<what>"
  exit 1
fi
echo "no findings"
