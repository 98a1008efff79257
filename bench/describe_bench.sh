#!/usr/bin/env bash
# Times `tovrin describe` beside GNU datamash on the same file of 10^6 numbers, and the grouped
# describe of a numeric column by a text column (a CSV of 10^6 rows with a header) beside
# `datamash -s -g` computing the same statistics; measures the peak memory of `tovrin describe`
# on 10^7 numbers. The data are made on the fly from fixed seeds and deleted afterwards.
#
# Usage: bench/describe_bench.sh [BUILD_DIR]   (default build/bench-cli, a Release build)
# Installs Debian's datamash with apt-get when it is missing (scripts/setup-bench.sh does too).
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

# A CSV table: a header, then 10^6 rows of a city name (100 names, drawn at random, so every
# name recurs all through the file) and a normal variate with 6 decimals.
make_table() {
  python3 - "$1" "$2" <<'PY'
import random, sys
n, path = int(sys.argv[1]), sys.argv[2]
rng = random.Random(20261124)
names = ["%s-%d" % (rng.choice(["Oslo", "Lima", "Pune", "Kyiv", "Baku"]), i) for i in range(100)]
with open(path, "w") as f:
    f.write("city,value\n")
    for start in range(0, n, 100000):
        f.write("".join("%s,%.6f\n" % (rng.choice(names), rng.gauss(1000, 100))
                        for _ in range(min(100000, n - start))))
PY
}
make_table 1000000 "$WORK/g1e6.csv"

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

STATS="count 2 min 2 max 2 sum 2 mean 2 median 2 q1 2 q3 2 svar 2 sskew 2 skurt 2"
read -r g_best g_median g_cpu g_rss < <(time_runs "$TOVRIN" describe -t , -H -g 1 -f 2 "$WORK/g1e6.csv")
# shellcheck disable=SC2086  # STATS is a list of words
read -r dg_best dg_median dg_cpu dg_rss < <(time_runs sh -c '"$@" < "$0"' "$WORK/g1e6.csv" \
  datamash -t, -H -s -g 1 $STATS)
"$TOVRIN" describe -t , -H -g 1 -f 2 --decimals 6 \
  --stats NoOfValues,Minimum,Maximum,Sum,Mean,Median,Variance,Skew,Kurtosis "$WORK/g1e6.csv" |
  sed 1d | sort >"$WORK/tovrin_groups"
# shellcheck disable=SC2086
datamash -t, -H -s -g 1 $STATS <"$WORK/g1e6.csv" | sed 1d >"$WORK/datamash_groups"
rm -f "$WORK/g1e6.csv"

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
10^6 rows, 100 groups: tovrin describe -g  ${g_best} s / ${g_median} s, cpu ${g_cpu} s, peak ${g_rss} KiB
10^6 rows, 100 groups: datamash -s -g      ${dg_best} s / ${dg_median} s, cpu ${dg_cpu} s, peak ${dg_rss} KiB
grouped, tovrin / datamash: wall (best) $(awk -v a="$g_best" -v b="$dg_best" 'BEGIN { printf "%.2f", a / b }'), cpu $(awk -v a="$g_cpu" -v b="$dg_cpu" 'BEGIN { printf "%.2f", a / b }')
EOT
echo "--- the same 10^6 numbers, tovrin describe --decimals 6:"
cat "$WORK/tovrin6"
echo "--- datamash (count min max sum mean median q1 q3 svar sskew skurt):"
cat "$WORK/datamash6"
echo "--- grouped, tovrin --stats NoOfValues,Minimum,Maximum,Sum,Mean,Median,Variance,Skew,Kurtosis:"
sed -n 1,3p "$WORK/tovrin_groups"
echo "--- grouped, datamash -s -g 1 $STATS:"
sed -n 1,3p "$WORK/datamash_groups"
