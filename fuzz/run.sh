#!/usr/bin/env bash
# Builds the libFuzzer targets with clang (address and undefined-behaviour sanitizers) and runs
# each for a bounded time, adding what it finds to fuzz/corpus/<target>/.
#   bash fuzz/run.sh [seconds per target, default 60] [target ...]
set -euo pipefail
cd "$(dirname "$0")/.."
seconds=${1:-60}
shift || true
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
  cmake --build $build --target "${t}_fuzz" -j2
  mkdir -p "fuzz/corpus/$t"
  work=$(mktemp -d)
  # -fork keeps fuzzing after a finding (crash, leak or 1 s time-out), whose input lands in
  # $findings/<target>-*; the corpus is merged whatever happened.
  "$build/${t}_fuzz" -fork=1 -ignore_crashes=1 -ignore_timeouts=1 -ignore_ooms=1 \
    -max_total_time="$seconds" -timeout=1 -rss_limit_mb=2048 \
    -artifact_prefix="$findings/${t}-" "$work" "fuzz/corpus/$t" || true
  # Keep a minimal set of the inputs that reached new code.
  "$build/${t}_fuzz" -merge=1 "fuzz/corpus/$t" "$work" >/dev/null 2>&1 || true
  rm -rf "$work"
done
if [ -n "$(ls -A "$findings")" ]; then
  ls "$findings"/*
  echo "findings above (in $findings): reduce each, fix, then keep the input in fuzz/corpus/<target>/"
  exit 1
fi
echo "no findings"
