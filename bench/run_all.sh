#!/usr/bin/env bash
# Runs every benchmark program and the `tovrin describe` comparison one after another, on one
# machine, in one go, and writes the raw results to OUT (default build/bench-results):
#   <program>.json   Google Benchmark's JSON (median, mean and spread of the repetitions)
#   <program>.txt    what the program printed (the accuracy tables come first)
#   describe.txt     bench/describe_bench.sh
#   machine.txt      CPU, cores, load before and after, compiler, date
# Then `python3 bench/tabulate.py OUT` prints the table of bench/RESULTS.md.
#
#   bash bench/run_all.sh [OUT]      (REPS=3 MIN_TIME=0.5 by default)
# Run it on an otherwise idle machine: the programs run one at a time on one core.
set -euo pipefail
ROOT=$(cd "$(dirname "$0")/.." && pwd)
OUT=${1:-$ROOT/build/bench-results}
BUILD=${BUILD:-$ROOT/build/bench}
REPS=${REPS:-3}
MIN_TIME=${MIN_TIME:-0.5}
mkdir -p "$OUT"

bash "$ROOT/scripts/setup-bench.sh"
cmake -S "$ROOT" -B "$BUILD" -DCMAKE_BUILD_TYPE=Release -DTOVRIN_BUILD_BENCHMARKS=ON \
  -DTOVRIN_BUILD_TESTS=OFF -DTOVRIN_BUILD_TOOLS=OFF >/dev/null
cmake --build "$BUILD" -j"${JOBS:-2}" >/dev/null

{
  echo "cpu: $(lscpu | sed -n 's/^Model name: *//p'), $(nproc) cores"
  echo "compiler: $(c++ --version | head -n1)"
  echo "date: $(date -u '+%Y-%m-%d %H:%M UTC')"
  echo "load before: $(cut -d' ' -f1-3 /proc/loadavg)"
} >"$OUT/machine.txt"

for program in "$BUILD"/*_bench; do
  name=$(basename "$program")
  echo "running $name" >&2
  "$program" --benchmark_min_time="$MIN_TIME" --benchmark_repetitions="$REPS" \
    --benchmark_report_aggregates_only=true --benchmark_out="$OUT/$name.json" \
    --benchmark_out_format=json >"$OUT/$name.txt"
done
echo "running describe_bench.sh" >&2
bash "$ROOT/bench/describe_bench.sh" "$ROOT/build/bench-cli" >"$OUT/describe.txt"
echo "load after: $(cut -d' ' -f1-3 /proc/loadavg)" >>"$OUT/machine.txt"
echo "results in $OUT" >&2
