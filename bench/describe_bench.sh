#!/usr/bin/env bash
# Times `tovrin describe` beside GNU datamash on the same file of 10^6 numbers, and measures
# the peak memory of `tovrin describe` on 10^7 numbers.
#
# Usage: bench/describe_bench.sh [BUILD_DIR]   (default build/bench-cli, a Release build)
# Installs Debian's datamash with apt-get when it is missing.
set -euo pipefail

ROOT=$(cd "$(dirname "$0")/.." && pwd)
BUILD=${1:-$ROOT/build/bench-cli}
RUNS=${RUNS:-5}
WORK=$(mktemp -d)
trap 'rm -rf "$WORK"' EXIT

if ! command -v datamash >/dev/null; then
  SUDO=""
  [ "$(id -u)" -ne 0 ] && SUDO=sudo
  export DEBIAN_FRONTEND=noninteractive
  $SUDO apt-get update -qq
  $SUDO apt-get install -y -qq --no-install-recommends datamash >/dev/null
fi

cmake -S "$ROOT" -B "$BUILD" -DCMAKE_BUILD_TYPE=Release -DTOVRIN_BUILD_TESTS=OFF \
  -DTOVRIN_BUILD_BENCHMARKS=OFF -DTOVRIN_BUILD_TOOLS=ON >/dev/null
cmake --build "$BUILD" --target tovrin_cli -j"${JOBS:-1}" >/dev/null
TOVRIN=$BUILD/tools/tovrin

# Normal variates with 6 decimals (mean 1000, sd 100), one per line, from a fixed seed.
make_numbers() {
  python3 - "$1" "$2" <<'PY'
import random, sys
n, path = int(sys.argv[1]), sys.argv[2]
rng = random.Random(20261121)
with open(path, "w") as f:
    for start in range(0, n, 100000):
        f.write("".join("%.6f\n" % rng.gauss(1000, 100) for _ in range(min(100000, n - start))))
PY
}
make_numbers 1000000 "$WORK/1e6.txt"

# Best and median wall time of RUNS runs, in seconds.
time_runs() {
  local times=()
  for _ in $(seq "$RUNS"); do
    local start end
    start=$(date +%s.%N)
    "$@" >/dev/null
    end=$(date +%s.%N)
    times+=("$(awk -v a="$start" -v b="$end" 'BEGIN { print b - a }')")
  done
  printf '%s\n' "${times[@]}" | sort -g | awk '{ t[NR] = $1 } END { printf "%.3f %.3f", t[1], t[int((NR + 1) / 2)] }'
}

DATAMASH=(datamash -W count 1 min 1 max 1 sum 1 mean 1 median 1 q1 1 q3 1 svar 1 sskew 1 skurt 1)
read -r tovrin_best tovrin_median < <(time_runs "$TOVRIN" describe "$WORK/1e6.txt")
read -r dm_best dm_median < <(time_runs sh -c '"$@" < "$0"' "$WORK/1e6.txt" "${DATAMASH[@]}")

peak_kib() { /usr/bin/time -f %M "$@" 2>&1 >/dev/null | tail -n1; }
tovrin_rss6=$(peak_kib "$TOVRIN" describe "$WORK/1e6.txt")
dm_rss6=$(peak_kib sh -c '"$@" < "$0"' "$WORK/1e6.txt" "${DATAMASH[@]}")

make_numbers 10000000 "$WORK/1e7.txt"
rm -f "$WORK/1e6.txt"
start=$(date +%s.%N)
tovrin_rss7=$(peak_kib "$TOVRIN" describe "$WORK/1e7.txt")
end=$(date +%s.%N)
tovrin_time7=$(awk -v a="$start" -v b="$end" 'BEGIN { print b - a }')

cat <<EOT
machine: $(lscpu | sed -n 's/^Model name: *//p'), $(nproc) cores; $(date -u +%Y-%m-%d)
runs: $RUNS each (best / median wall time)
10^6 numbers: tovrin describe  ${tovrin_best} s / ${tovrin_median} s, peak ${tovrin_rss6} KiB
10^6 numbers: datamash         ${dm_best} s / ${dm_median} s, peak ${dm_rss6} KiB
10^7 numbers: tovrin describe  $(printf %.3f "$tovrin_time7") s, peak ${tovrin_rss7} KiB
EOT
echo "--- tovrin describe (10^7):"
"$TOVRIN" describe "$WORK/1e7.txt"
