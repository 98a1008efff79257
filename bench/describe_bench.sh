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
RUNS_ALL=$RUNS
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

# Over RUNS runs: best and median wall time, best CPU time (user + system), in seconds, and
# the peak resident memory in KiB.
time_runs() {
  : >"$WORK/times"
  for _ in $(seq "$RUNS"); do
    /usr/bin/time -f '%e %U %S %M' -o "$WORK/time" "$@" >/dev/null
    cat "$WORK/time" >>"$WORK/times"
  done
  local wall_best wall_median cpu_best rss
  wall_best=$(awk '{ print $1 }' "$WORK/times" | sort -g | head -n1)
  wall_median=$(awk '{ print $1 }' "$WORK/times" | sort -g | sed -n "$(((RUNS + 1) / 2))p")
  cpu_best=$(awk '{ printf "%.2f\n", $2 + $3 }' "$WORK/times" | sort -g | head -n1)
  rss=$(awk '{ print $4 }' "$WORK/times" | sort -g | tail -n1)
  echo "$wall_best $wall_median $cpu_best $rss"
}

DATAMASH=(datamash -W count 1 min 1 max 1 sum 1 mean 1 median 1 q1 1 q3 1 svar 1 sskew 1 skurt 1)
read -r t_best t_median t_cpu t_rss < <(time_runs "$TOVRIN" describe "$WORK/1e6.txt")
read -r d_best d_median d_cpu d_rss < <(time_runs sh -c '"$@" < "$0"' "$WORK/1e6.txt" "${DATAMASH[@]}")

"$TOVRIN" describe --decimals 6 "$WORK/1e6.txt" >"$WORK/tovrin6"
"${DATAMASH[@]}" <"$WORK/1e6.txt" >"$WORK/datamash6"
make_numbers 10000000 "$WORK/1e7.txt"
rm -f "$WORK/1e6.txt"
RUNS=1
read -r t7_wall _ t7_cpu t7_rss < <(time_runs "$TOVRIN" describe "$WORK/1e7.txt")

cat <<EOT
machine: $(lscpu | sed -n 's/^Model name: *//p'), $(nproc) cores; $(date -u +%Y-%m-%d)
runs: $RUNS_ALL each; wall time best / median, CPU time (user + system) best, peak memory
10^6 numbers: tovrin describe  ${t_best} s / ${t_median} s, cpu ${t_cpu} s, peak ${t_rss} KiB
10^6 numbers: datamash         ${d_best} s / ${d_median} s, cpu ${d_cpu} s, peak ${d_rss} KiB
10^7 numbers: tovrin describe  ${t7_wall} s, cpu ${t7_cpu} s, peak ${t7_rss} KiB
EOT
echo "--- the same 10^6 numbers, tovrin describe --decimals 6:"
cat "$WORK/tovrin6"
echo "--- datamash (count min max sum mean median q1 q3 svar sskew skurt):"
cat "$WORK/datamash6"
