#!/usr/bin/env bash
# Runs the built tovrin program and checks its output and exit statuses.
# Usage: cli_test.sh PATH/TO/tovrin SOURCE_DIR
set -u
TOVRIN=$1
SRC=$2
DATA=$SRC/data/michelson1879.txt
WORK=$(mktemp -d)
trap 'rm -rf "$WORK"' EXIT
failures=0
checks=0

fail() {
  echo "FAIL: $*" >&2
  failures=$((failures + 1))
}

# run EXPECTED_STATUS ARGS... ; leaves stdout in $WORK/out and stderr in $WORK/err.
run() {
  local expected=$1
  shift
  checks=$((checks + 1))
  "$TOVRIN" "$@" >"$WORK/out" 2>"$WORK/err" <"${STDIN:-/dev/null}"
  local status=$?
  if [ "$status" -ne "$expected" ]; then
    fail "tovrin $* exited $status, expected $expected (stderr: $(head -c 300 "$WORK/err"))"
  fi
}

# expect_out TEXT: stdout is exactly TEXT (plus the final newline).
expect_out() {
  checks=$((checks + 1))
  if [ "$(cat "$WORK/out")" != "$1" ]; then
    fail "unexpected output:"$'\n'"$(cat "$WORK/out")"$'\n'"expected:"$'\n'"$1"
  fi
}
# expect_line TEXT: stdout has a line exactly TEXT.
expect_line() {
  checks=$((checks + 1))
  grep -qxF -- "$1" "$WORK/out" || fail "no line '$1' in:"$'\n'"$(cat "$WORK/out")"
}
expect_err() {
  checks=$((checks + 1))
  grep -qF -- "$1" "$WORK/err" || fail "stderr lacks '$1': $(cat "$WORK/err")"
}
# expect_near VALUE TOLERANCE: stdout is one number within TOLERANCE of VALUE.
expect_near() {
  checks=$((checks + 1))
  awk -v want="$1" -v tol="$2" 'NR == 1 { d = $1 - want; if (d < 0) d = -d; ok = (d <= tol) }
      END { exit !(ok && NR == 1) }' "$WORK/out" || fail "expected $1 +- $2, got $(cat "$WORK/out")"
}
expect_no_out() {
  checks=$((checks + 1))
  [ ! -s "$WORK/out" ] || fail "stdout should be empty: $(head -c 300 "$WORK/out")"
}

TAB=$'\t'

# --- top level ---------------------------------------------------------------------------------
run 0 --version
checks=$((checks + 1))
grep -qE '^tovrin [0-9]+\.[0-9]+\.[0-9]+$' "$WORK/out" || fail "--version: $(cat "$WORK/out")"
run 0 --help
for sub in describe regress grouped eval random; do
  expect_line "$(grep -m1 "^  $sub" "$WORK/out")"
  grep -q "^  $sub" "$WORK/out" || fail "--help does not list $sub"
done
run 2
expect_no_out
run 2 frobnicate
expect_err "unknown subcommand 'frobnicate'"
for sub in describe regress grouped eval random; do
  run 0 "$sub" --help
  expect_line "$(head -n1 "$WORK/out")"
  grep -q "^Usage: tovrin $sub" "$WORK/out" || fail "$sub --help: $(head -n1 "$WORK/out")"
done

# --- describe ----------------------------------------------------------------------------------
# Michelson's 100 measurements; reference values by exact rational arithmetic (python3
# fractions): sum 29985240, sum of squares 8991146796600, variance 6242.6666..., standard
# deviation 79.01054781905177, skew -0.018538863775218, kurtosis 0.339684598420114; 299810
# and 299880 occur ten times each (no mode); quartile positions 25.5 and 75.5.
run 0 describe "$DATA"
expect_out "Number of Values:${TAB}100
Maximum:${TAB}300070.0000
Minimum:${TAB}299620.0000
Range:${TAB}450.0000
Sum:${TAB}29985240.0000
Sum of Squares:${TAB}8991146796600.0000
Mean:${TAB}299852.4000
No Modal Value
Median:${TAB}299850.0000
Variance:${TAB}6242.6667
Standard Deviation:${TAB}79.0105
Kurtosis:${TAB}0.3397
Skew:${TAB}-0.0185
First Quartile:${TAB}299805.0000
Third Quartile:${TAB}299895.0000
Inter-Quartile Range:${TAB}90.0000
Lower Fence for Outliers:${TAB}299670.0000
Upper Fence for Outliers:${TAB}300030.0000"

# Standard input, commas, comments, blank lines, CRLF line ends.
printf '4,2 # first line\r\n\r\n# only a comment\n1\t3\n' >"$WORK/in1"
STDIN=$WORK/in1 run 0 describe
expect_line "Number of Values:${TAB}4"
expect_line "Sum of Squares:${TAB}30.0000"
expect_line "Variance:${TAB}1.6667"
expect_line "Kurtosis:${TAB}-1.2000"
expect_line "First Quartile:${TAB}1.5000"
expect_line "No Modal Value"

# Several files and '-' in order; population and decimals.
printf '1\n' >"$WORK/a"
printf '2 3\n' >"$WORK/b"
printf '4' >"$WORK/c"  # no final newline
STDIN=$WORK/b run 0 describe --population --decimals 2 "$WORK/a" - "$WORK/c"
expect_line "Number of Values:${TAB}4"
expect_line "Variance:${TAB}1.25"
expect_line "Standard Deviation:${TAB}1.12"
expect_line "Kurtosis:${TAB}-1.36"
run 0 describe --decimals=0 "$WORK/a" "$WORK/b"
expect_line "Mean:${TAB}2"
expect_line "Not enough Values for Kurtosis"
expect_line "Skew:${TAB}0"

# One value: the sample report's bare lines.
printf '2.5\n' >"$WORK/one"
run 0 describe "$WORK/one"
expect_line "Not enough Values for Variance"
expect_line "Not enough Values for Standard Deviation"
expect_line "Mode:${TAB}2.5000"

# Exponents, signs and a long mantissa are read exactly.
printf '1e-3 -2.5E+1 +.5 3. 0.1000000000000000000000000001\n' >"$WORK/forms"
run 0 describe --decimals 20 "$WORK/forms"
expect_line "Minimum:${TAB}-25.00000000000000000000"
expect_line "Maximum:${TAB}3.00000000000000000000"

# A file of several 1 MiB read blocks: tokens and long comments cut by block ends.
# Values i + 0.5 for i = 0 .. 199999 sum to 200000^2 / 2.
python3 - "$WORK/big" <<'PY'
import sys
with open(sys.argv[1], "w") as f:
    for i in range(200000):
        f.write("%d.5%s" % (i, ",\n" if i % 3 else " "))
        if i % 997 == 0:
            f.write("# " + "comment 1 2 3 " * 700 + "\n")
PY
run 0 describe --decimals 1 "$WORK/big"
expect_line "Number of Values:${TAB}200000"
expect_line "Sum:${TAB}20000000000.0"
expect_line "Minimum:${TAB}0.5"
expect_line "Maximum:${TAB}199999.5"
STDIN=$WORK/big run 0 describe --decimals 1
expect_line "Sum:${TAB}20000000000.0"

# Exact reading: every number must come back as the Extended nearest to its decimal value
# (64-bit significand, ties to even); 21 significant digits identify an Extended, so the
# printed value, rounded again, must be that same Extended. Fast-path and long forms both.
checks=$((checks + 1))
python3 - "$TOVRIN" <<'PY' || fail "numbers are not read exactly"
import random, subprocess, sys
from fractions import Fraction

def nearest_extended(q):
    if q == 0:
        return q
    sign, q = (-1 if q < 0 else 1), abs(q)
    e = q.numerator.bit_length() - q.denominator.bit_length()
    if Fraction(2) ** e > q:
        e -= 1
    scaled = q * Fraction(2) ** (63 - e)
    m = scaled.numerator // scaled.denominator
    rest = scaled - m
    if rest > Fraction(1, 2) or (rest == Fraction(1, 2) and m % 2 == 1):
        m += 1
    return sign * Fraction(m) * Fraction(2) ** (e - 63)

rng = random.Random(5)
texts = ["18446744073709551617", "18446744073709551619", "0.1", "-2.5e-3", "123456789012345678",
         "9999999999999999999", "1.0000000000000000000000001", "3.", ".25", "7e27", "7e28"]
for _ in range(60):
    digits = "".join(rng.choice("0123456789") for _ in range(rng.randint(1, 25))).lstrip("0") or "7"
    point = rng.randint(0, len(digits))
    text = digits[:point] + "." + digits[point:] + "e%d" % rng.randint(-40, 40)
    texts.append(("-" if rng.random() < 0.3 else "") + text)
bad = 0
for text in texts:
    out = subprocess.run([sys.argv[1], "eval", "MaxXY", text, text], capture_output=True,
                         text=True, check=True).stdout.strip()
    if nearest_extended(Fraction(out)) != nearest_extended(Fraction(text)):
        print("read %s, printed %s" % (text, out), file=sys.stderr)
        bad += 1
sys.exit(1 if bad else 0)
PY

# JSON.
run 0 describe --json "$DATA"
checks=$((checks + 1))
python3 - "$WORK/out" <<'PY' || fail "describe --json"
import json, sys
d = json.load(open(sys.argv[1]))
keys = ["NoOfValues", "Maximum", "Minimum", "Range", "Sum", "SumSq", "Mean", "Mode", "Median",
        "Variance", "StdDev", "Kurtosis", "Skew", "Quartile1st", "Quartile3rd", "IQR",
        "FenceLower", "FenceUpper"]
assert list(d) == keys, list(d)
assert d["NoOfValues"] == 100 and d["Mode"] is None
assert d["Sum"] == 29985240 and d["SumSq"] == 8991146796600
assert abs(d["Mean"] - 299852.4) < 1e-9 and abs(d["Variance"] - 18728 / 3) < 1e-9
assert abs(d["StdDev"] - 79.01054781905177) < 1e-12
assert abs(d["Skew"] + 0.018538863775218) < 1e-13 and abs(d["Kurtosis"] - 0.339684598420114) < 1e-13
PY
printf '5 5 1\n' >"$WORK/mode"
run 0 describe --json "$WORK/mode"
checks=$((checks + 1))
python3 -c 'import json,sys; d=json.load(open(sys.argv[1])); assert d["Mode"] == 5, d' "$WORK/out" ||
  fail "describe --json mode"

# No numbers at all.
run 0 describe
expect_out "Vector is empty"
printf '# nothing here\n\n' >"$WORK/blank"
run 0 describe "$WORK/blank"
expect_out "Vector is empty"

# Bad input: nothing on stdout, file, line and token on stderr, status 1.
printf '1 2\n3 4,x5\n' >"$WORK/bad"
run 1 describe "$WORK/bad"
expect_no_out
expect_err "$WORK/bad:2: not a number: 'x5'"
for token in nan inf 1,5e 0x10 1e 1e+ . - 1..2 1e5000; do
  printf '1\n%s\n' "$token" >"$WORK/bad"
  run 1 describe "$WORK/bad"
  expect_no_out
done
printf '7\n8 oops\n' >"$WORK/bad"
STDIN=$WORK/bad run 1 describe
expect_err "<stdin>:2: not a number: 'oops'"
# A bad token in a later file: the good files before it print nothing either.
printf '1\n2\n\n# c\n3 4 ,5;\n' >"$WORK/bad2"
STDIN=$WORK/b run 1 describe "$WORK/a" - "$WORK/bad2"
expect_no_out
expect_err "$WORK/bad2:5: not a number: '5;'"
run 1 describe "$WORK/does-not-exist"
expect_err "does-not-exist"

# Usage errors.
run 2 describe --decimals 21 "$DATA"
expect_no_out
run 2 describe --decimals
run 2 describe --decimals x "$DATA"
run 2 describe --json=1 "$DATA"
run 2 describe --frobnicate "$DATA"
expect_err "unknown option --frobnicate"

# --- describe: tables --------------------------------------------------------------------------
# A CSV with a header, a quoted name holding the delimiter, a quoted header name, doubled
# quotes, missing values (NA, NaN and the empty field) and a CRLF line end. Exact values:
# temp 4, 16, 6, 19, 18, 2: sum 65, sum of squares 997, mean 65/6, variance (997 - 65^2/6)/5
# = 1757/30 = 58.5666...; rain 800, 700, 10 (three missing): mean 1510/3, variance 555100/3.
# By city: Oslo temp 4, 6, 2 (mean 4, variance 4), Rome 16, 18 (mean 17, variance 2, rain all
# missing), "Lima, Peru" 19 (one value: no variance).
printf 'city,temp,rain,"note, free"\nOslo,4,800,"cold, wet"\r\nRome,16,NA,warm\n\nOslo,6,700,"say ""hi"""\n"Lima, Peru",19,10,x\nRome,18,,y\nOslo,2,NaN,z\n' >"$WORK/cities.csv"
run 0 describe -t , -H -f temp "$WORK/cities.csv"
expect_line "Number of Values:${TAB}6"
expect_line "Sum:${TAB}65.0000"
expect_line "Sum of Squares:${TAB}997.0000"
expect_line "Mean:${TAB}10.8333"
expect_line "Variance:${TAB}58.5667"
checks=$((checks + 1))
grep -q "Missing" "$WORK/out" && fail "a field without missing values reports them"
run 0 describe -t, --header --field 3 "$WORK/cities.csv"
expect_line "Number of Values:${TAB}3"
expect_line "Missing Values:${TAB}3"
expect_line "Mean:${TAB}503.3333"
expect_line "Variance:${TAB}185033.3333"
# Groups in order of first appearance, the quoted name whole, NA where undefined.
run 0 describe -t , -H -g city -f temp "$WORK/cities.csv"
expect_line "Statistic${TAB}Oslo${TAB}Rome${TAB}Lima, Peru"
expect_line "Number of Values:${TAB}3${TAB}2${TAB}1"
expect_line "Mean:${TAB}4.0000${TAB}17.0000${TAB}19.0000"
expect_line "Variance:${TAB}4.0000${TAB}2.0000${TAB}NA"
expect_line "Mode:${TAB}NA${TAB}NA${TAB}19.0000"
# Several fields by group; Rome's rain is all missing.
run 0 describe -t , -H -g 1 -f temp,rain --decimals 1 "$WORK/cities.csv"
expect_line "Statistic${TAB}Oslo:temp${TAB}Oslo:rain${TAB}Rome:temp${TAB}Rome:rain${TAB}Lima, Peru:temp${TAB}Lima, Peru:rain"
expect_line "Number of Values:${TAB}3${TAB}2${TAB}2${TAB}0${TAB}1${TAB}1"
expect_line "Missing Values:${TAB}0${TAB}1${TAB}0${TAB}2${TAB}0${TAB}0"
expect_line "Mean:${TAB}4.0${TAB}750.0${TAB}17.0${TAB}NA${TAB}19.0${TAB}10.0"
# Several fields without groups, by range.
run 0 describe -t , -H -f 2-3 "$WORK/cities.csv"
expect_line "Statistic${TAB}temp${TAB}rain"
expect_line "Sum:${TAB}65.0000${TAB}1510.0000"
# --stats: a TSV table at full precision; --decimals rounds it.
run 0 describe -t , -H -g city -f temp --stats Mean,Variance,Missing,NoOfValues "$WORK/cities.csv"
expect_out "group${TAB}Mean${TAB}Variance${TAB}Missing${TAB}NoOfValues
Oslo${TAB}4${TAB}4${TAB}0${TAB}3
Rome${TAB}17${TAB}2${TAB}0${TAB}2
Lima, Peru${TAB}19${TAB}NA${TAB}0${TAB}1"
run 0 describe -t , -H -f temp,rain --stats Sum,Mean --decimals 2 "$WORK/cities.csv"
expect_out "field${TAB}Sum${TAB}Mean
temp${TAB}65.00${TAB}10.83
rain${TAB}1510.00${TAB}503.33"
run 2 describe -t , -H -f temp --stats Mean,Average "$WORK/cities.csv"
expect_err "'Average'"
# JSON: null for every undefined statistic, Missing counted, groups in order.
run 0 describe -t , -H -g city -f rain --json "$WORK/cities.csv"
checks=$((checks + 1))
python3 - "$WORK/out" <<'PY' || fail "describe -g --json"
import json, sys
d = json.load(open(sys.argv[1]))
assert list(d) == ["Oslo", "Rome", "Lima, Peru"], list(d)
assert d["Oslo"]["NoOfValues"] == 2 and d["Oslo"]["Missing"] == 1 and d["Oslo"]["Mean"] == 750
assert d["Oslo"]["Variance"] == 5000 and d["Oslo"]["Mode"] is None and d["Oslo"]["Skew"] is None
rome = d["Rome"]
assert rome["NoOfValues"] == 0 and rome["Missing"] == 2
assert all(rome[k] is None for k in rome if k not in ("NoOfValues", "Missing")), rome
lima = d["Lima, Peru"]
assert lima["Mean"] == 10 and lima["Mode"] == 10 and lima["Variance"] is None
assert lima["StdDev"] is None and lima["Kurtosis"] is None
PY
run 0 describe -t , -H -f temp,rain --json --stats Sum,Missing,Range "$WORK/cities.csv"
expect_out '{"temp": {"Sum": 65, "Missing": 0, "Range": 17}, "rain": {"Sum": 1510, "Missing": 3, "Range": 790}}'
# One chosen field: JSON names it; without -f, field 1 and one object.
run 0 describe -t , -H -f rain --json "$WORK/cities.csv"
checks=$((checks + 1))
python3 - "$WORK/out" <<'PY' || fail "describe -f rain --json"
import json, sys
d = json.load(open(sys.argv[1]))
assert list(d) == ["rain"] and d["rain"]["NoOfValues"] == 3 and d["rain"]["Missing"] == 3, d
assert d["rain"]["Sum"] == 1510 and d["rain"]["Mode"] is None and d["rain"]["Kurtosis"] is None
PY
printf 'n\n1\n\n3\nNA\n' >"$WORK/col.csv"
run 0 describe -t , -H --json --stats NoOfValues,Missing,Mean,Variance,Skew "$WORK/col.csv"
expect_out '{"NoOfValues": 2, "Missing": 1, "Mean": 2, "Variance": 2, "Skew": null}'
# An all-missing field: the empty-list report and its missing count.
printf 'a;b\n1;NA\n2;\n' >"$WORK/semi.csv"
run 0 describe -t ';' -H -f b "$WORK/semi.csv"
expect_out "Vector is empty
Missing Values:${TAB}2"
# --na replaces the missing texts; -W, TSV, several files each with a header.
printf 'x y\n1 -\n 3   5\n' >"$WORK/ws.txt"
run 0 describe -W -H -f y --na - "$WORK/ws.txt"
expect_line "Number of Values:${TAB}1"
expect_line "Missing Values:${TAB}1"
printf 'v\tw\n1\t"a\tb"\n' >"$WORK/t1.tsv"
printf 'v\tw\n5\tc\n' >"$WORK/t2.tsv"
run 0 describe -t tab -H -f v "$WORK/t1.tsv" "$WORK/t2.tsv"
expect_line "Number of Values:${TAB}2"
expect_line "Sum:${TAB}6.0000"
# A quoted field over two lines: the line numbers of later records stay right.
printf 'n,t\n1,"two\nlines"\n2,x\nzz,y\n' >"$WORK/multi.csv"
run 1 describe -t , -H -f n "$WORK/multi.csv"
expect_no_out
expect_err "multi.csv:5: field 'n': not a number: 'zz'"
printf 'n\n1\n"2\n' >"$WORK/open.csv"
run 1 describe -t , -H "$WORK/open.csv"
expect_err "not closed"
# Records cut by the ends of the 1 MiB read blocks, quoted fields among them, and a record
# longer than a block: values i + 0.5 for i = 0 .. 149999 sum to 150000^2 / 2; the long
# record is in a group of its own with a missing value.
python3 - "$WORK/big.csv" <<'PY'
import sys
with open(sys.argv[1], "w") as f:
    f.write("k,v\n")
    for i in range(150000):
        f.write('"k%d, ""q""",%d.5\n' % (i % 7, i) if i % 3 else "k%d,%d.5\r\n" % (i % 7, i))
        if i == 70000:
            f.write('"%s",NA\n' % ("long\n" * 300000))
PY
run 0 describe -t , -H -f v --decimals 1 "$WORK/big.csv"
expect_line "Number of Values:${TAB}150000"
expect_line "Missing Values:${TAB}1"
expect_line "Sum:${TAB}11250000000.0"
STDIN=$WORK/big.csv run 0 describe -t , -H -g k -f v --stats NoOfValues
checks=$((checks + 1))
[ "$(grep -c "$TAB" "$WORK/out")" -eq 16 ] || fail "expected 15 groups: $(head -c 300 "$WORK/out")"
expect_line "k1${TAB}7143"
expect_line "k1, \"q\"${TAB}14286"
printf 'z,x\n' >>"$WORK/big.csv"
run 1 describe -t , -H -f v "$WORK/big.csv"
expect_err "big.csv:450003: field 'v': not a number: 'x'"
# The long option names and the escape \t; a column of a table gives the same report (and the
# same JSON) as the plain stream of its numbers.
grep -v '^#' "$DATA" | tr -s ' ,\t' '\n' | grep . | awk '{ print "m\t" $1 }' >"$WORK/michelson.tsv"
run 0 describe "$DATA"
cp "$WORK/out" "$WORK/plain"
run 0 describe --delimiter '\t' --field 2 "$WORK/michelson.tsv"
checks=$((checks + 1))
cmp -s "$WORK/out" "$WORK/plain" || fail "a table's column and the plain numbers differ"
run 0 describe --whitespace --group 1 --field 2 --stats NoOfValues,Mean,Median "$WORK/michelson.tsv"
expect_out "group${TAB}NoOfValues${TAB}Mean${TAB}Median
m${TAB}100${TAB}299852.4${TAB}299850"
# Bad values: nothing on stdout, the file, line, field and text on stderr.
run 1 describe -t , -H -f 4 "$WORK/cities.csv"
expect_no_out
expect_err "cities.csv:2: field 'note, free': not a number: 'cold, wet'"
printf '1,2\n3,x\n' >"$WORK/nohead.csv"
STDIN=$WORK/nohead.csv run 1 describe -t, -f 2
expect_no_out
expect_err "<stdin>:2: field 2: not a number: 'x'"
printf '1,2\n3\n' >"$WORK/short.csv"
run 1 describe -t , -f 2 "$WORK/short.csv"
expect_err "short.csv:2: no field 2"
# Usage errors name the field or the option.
run 2 describe -t , -H -f humidity "$WORK/cities.csv"
expect_no_out
expect_err "'humidity'"
run 2 describe -t , -H -f 5 "$WORK/cities.csv"
expect_err "field 5 does not exist"
run 2 describe -t , -f temp "$WORK/nohead.csv"
expect_err "-H/--header"
run 2 describe -t , -H -g town "$WORK/cities.csv"
expect_err "-g/--group: no field 'town'"
run 2 describe -t ab "$WORK/cities.csv"
expect_err "-t/--delimiter"
run 2 describe -t , -W "$WORK/cities.csv"
run 2 describe -t , -f 3-2 "$WORK/cities.csv"

# --- regress -----------------------------------------------------------------------------------
printf '0 1\n1 3\n\n2 5 # exact line\n' >"$WORK/pairs"
run 0 regress "$WORK/pairs"
expect_line "Number of Pairs:${TAB}3"
expect_line "Mean of X Values:${TAB}1.0000"
expect_line "Standard Deviation of X Values:${TAB}1.0000"
expect_line "Mean of Y Values:${TAB}3.0000"
expect_line "Standard Deviation of Y Values:${TAB}2.0000"
expect_line "Covariance:${TAB}2.0000"
expect_line "Coefficient of Correlation${TAB}1.0000"
expect_line "Coefficient of Determination${TAB}1.0000"
expect_line "Regression Line:${TAB}y = 1.0000 + 2.0000x"
expect_line "Intercept:${TAB}1.0000"
expect_line "Slope:${TAB}2.0000"
expect_line "Sum of Squares Error:${TAB}0.0000"
printf '0 1\n1 2\n2 5\n3 10\n' >"$WORK/parabola"  # y = 1 + x^2
run 0 regress --decimals 2 "$WORK/parabola"
expect_line "Quadratic Curve:${TAB}y = 1.00 + 0.00x + 1.00x^2"
printf '0 1\n1 3\n2 5 7\n' >"$WORK/pairs3"
run 1 regress "$WORK/pairs3"
expect_no_out
expect_err ":3: more than two numbers on a line: '7'"
printf '0 1\n1\n' >"$WORK/pairs1"
run 1 regress "$WORK/pairs1"
expect_err ":2: a pair needs two numbers"
printf '0 1\n' >"$WORK/pair"
run 1 regress "$WORK/pair"
run 2 regress --population "$WORK/pairs"
# A table: x and y by name, a line with a missing y skipped; y = 1 + 2x exactly.
printf 'id,y,x\na,1,0\nb,NA,7\nc,3,1\nd,5,2\n' >"$WORK/pairs.csv"
run 0 regress -t , -H -f x,y "$WORK/pairs.csv"
expect_line "Number of Pairs:${TAB}3"
expect_line "Lines Skipped (missing values):${TAB}1"
expect_line "Regression Line:${TAB}y = 1.0000 + 2.0000x"
run 2 regress -t , -H -f x "$WORK/pairs.csv"
expect_err "two fields"
run 1 regress -t , -H -f id,y "$WORK/pairs.csv"
expect_err "field 'id': not a number: 'a'"

# --- grouped -----------------------------------------------------------------------------------
# Frequencies 1, 2, 1 over [0, 10), [10, 20), [20, 30): midpoints 5, 15, 25; mean 15;
# median class 1: 10 + (2 - 1) 10 / 2 = 15; mode 15; Q1 target 1: class 0, 0 + 1*10/1 = 10;
# Q3 target 3: class 1, 10 + (3 - 1) 10 / 2 = 20; sample variance (100 + 0 + 100) / 3.
run 0 grouped --start 0 --width 10 1 2 1
expect_line "Mean:${TAB}15.0000"
expect_line "Median:${TAB}15.0000"
expect_line "Mode:${TAB}15.0000"
expect_line "First Quartile:${TAB}10.0000"
expect_line "Third Quartile:${TAB}20.0000"
expect_line "Sample Variance:${TAB}66.6667"
expect_line "Population Variance:${TAB}50.0000"
expect_line "Decile 5:${TAB}15.0000"
run 0 grouped --width 1 --start -0.5 --decimals 1 2 2
expect_line "No Modal Value"
run 2 grouped --width 10 1 2 1
expect_err "--start"
run 2 grouped --start 0 --width 10
run 2 grouped --start 0 --width 10 1 -2 1
run 2 grouped --start 0 --width 10 1 2.5
run 2 grouped --start zero --width 10 1

# --- eval --------------------------------------------------------------------------------------
run 0 eval NormalLess 0
expect_out "0.5"
run 0 eval AreaTriangle 3 4 5
expect_out "6"
run 0 eval BinomialBetween 0.5 4 1 3
expect_out "0.375"
run 0 eval BinomialBetween 0.5 4 3 1
expect_out "0.875"
run 0 eval BinomialCoeff 10 3
expect_out "120"
run 0 eval Factorial 20
expect_out "2432902008176640000"
run 0 eval SameFloat 1 1.0000000000001
expect_out "True"
run 0 eval FloatIsNegative -1e-3
expect_out "True"
run 0 eval FloatIsZero 1e-3
expect_out "False"
run 0 eval XtoY 2 -2
expect_out "0.25"
run 0 eval ZAlpha 0.025
checks=$((checks + 1))
case $(cat "$WORK/out") in 1.95996398454005*) ;; *) fail "ZAlpha 0.025: $(cat "$WORK/out")" ;; esac
run 0 eval InvStudentTLess 0.975 10
checks=$((checks + 1))
case $(cat "$WORK/out") in 2.228138851986*) ;; *) fail "InvStudentTLess: $(cat "$WORK/out")" ;; esac
run 0 eval NormalLess 1.96
checks=$((checks + 1))
# 21 significant digits: 0. then 21 digits.
grep -qE '^0\.975002104851[0-9]{9}$' "$WORK/out" || fail "NormalLess 1.96: $(cat "$WORK/out")"
run 0 eval BetaDistLess 0.5 2 2
expect_near 0.5 1e-15
run 0 eval BetaDistLess 5 2 2 0 10
expect_near 0.5 1e-15
run 0 eval BetaDistLess 2.5 2 2 10 0  # bounds in either order
expect_near 0.15625 1e-15
run 0 eval LineIntersection 0 0 2 2 0 2 2 0
expect_out "True
X${TAB}1
Y${TAB}1"
run 0 eval LinesAreParallel 0 0 1 1 0 1 1 2
expect_out "True"
run 0 eval GetCircleWithPoints 0 0 2 0 0 2
expect_line "CX${TAB}1"
expect_line "CY${TAB}1"
run 0 eval Currency2Float 150
expect_out "1.5"
run 0 eval Currency2Float Currency:15000
expect_out "1.5"
run 0 eval Currency2Float TQENLongCurrency:1500000
expect_out "1.5"
run 0 eval Float2QENCurrency 0.125
expect_out "12"
run 0 eval SameCurrency Currency:5 5
expect_out "True"
run 2 eval Currency2Float Euro:1
run 2 eval QENCurrency2Currency Currency:1
run 1 eval AreaTriangle 1 1 3
expect_no_out
expect_err "Sides do not form a triangle"
run 1 eval Factorial 1755
run 2 eval NoSuchFunction 1
expect_err "unknown function 'NoSuchFunction'"
run 2 eval NormalLess
expect_err "NormalLess Z"
run 2 eval NormalLess 1 2
run 2 eval NormalLess abc
expect_err "'abc'"
# The precise family: far tails computed directly, degrees of freedom as real numbers.
run 0 eval --precise NormalGreater 40
checks=$((checks + 1))
grep -qE '^3\.6558935409150297[0-9]*e-350$' "$WORK/out" || fail "precise NormalGreater 40: $(cat "$WORK/out")"
run 0 eval --precise PoissonEq 1000 1754
checks=$((checks + 1))
grep -qE '^2\.564571632953611[0-9]*e-103$' "$WORK/out" || fail "precise PoissonEq: $(cat "$WORK/out")"
run 0 eval --precise --digits 6 StudentTLess 1e-6 4e9
expect_out "0.5"
run 0 eval --precise --list
checks=$((checks + 1))
grep -qE '^IncompleteGammaUpper A X +regularised upper' "$WORK/out" || fail "precise --list"
run 1 eval --precise ChiSquareLess 1 0
expect_no_out
run 2 eval --precise ChiSquareBetween 1 2 3
expect_err "unknown precise function 'ChiSquareBetween'"
run 2 eval ChiSquareLess 1 -2
run 2 eval ChiSquareLess 1 2.5
run 2 eval
# The list: signature, then a description in one column.
run 0 eval --list
checks=$((checks + 1))
grep -qE '^NormalLess Z +standard normal: P\(Z < z\)$' "$WORK/out" || fail "eval --list NormalLess"
for signature in "BinomialBetween P N R1 R2" "AreaTriangle A B C" "Gamma X"; do
  checks=$((checks + 1))
  grep -qE "^$signature  +[a-z]" "$WORK/out" || fail "eval --list lacks '$signature' or its description"
done
checks=$((checks + 1))
[ "$(wc -l <"$WORK/out")" -ge 150 ] || fail "eval --list lists only $(wc -l <"$WORK/out") functions"
checks=$((checks + 1))
awk '!/^[A-Za-z0-9_]+( [A-Za-z0-9:]+)*(\.\.\.)?  +[^ ]/ { print; bad = 1 } END { exit bad }' \
  "$WORK/out" >"$WORK/undescribed" || fail "eval --list without descriptions: $(cat "$WORK/undescribed")"
# --digits: significant digits of real results, the labelled lines too; integers as well.
run 0 eval --digits 6 NormalLess 1.96
expect_out "0.975002"
run 0 eval --digits=3 GetCircleWithPoints 0 0 2 0 0 2
expect_out "CX${TAB}1
CY${TAB}1
R${TAB}1.41"
run 0 eval --digits 2 SameFloat 1 1
expect_out "True"
run 2 eval --digits 0 Gamma 2
expect_err "--digits"
run 2 eval --digits
run 2 eval Gamma 2 --digits 3

# --- random ------------------------------------------------------------------------------------
run 0 random Random_Normal --count 5 --seed 42
cp "$WORK/out" "$WORK/first"
checks=$((checks + 1))
[ "$(wc -l <"$WORK/out")" -eq 5 ] || fail "random --count 5 printed $(wc -l <"$WORK/out") lines"
run 0 random --seed 42 Random_Normal --count=5
checks=$((checks + 1))
cmp -s "$WORK/out" "$WORK/first" || fail "the same seed gave different output"
run 0 random Random_Normal --count 5 --seed 43
checks=$((checks + 1))
cmp -s "$WORK/out" "$WORK/first" && fail "different seeds gave the same output"
# Real variates carry 21 significant digits (fewer only where trailing zeros are dropped).
checks=$((checks + 1))
awk '{ t = $1; sub(/^-/, "", t); sub(/[eE].*/, "", t); sub(/\./, "", t); sub(/^0+/, "", t)
       n = length(t); if (n > 21 || t !~ /^[0-9]+$/) bad = 1; if (n == 21) full++ }
     END { exit bad || full < 3 }' "$WORK/first" || fail "random digits: $(cat "$WORK/first")"
run 0 random Random_Normal 100 -2 --count 3 --seed 1
run 0 random Random_Binomial2 100 0.3 --count 200 --seed 7
checks=$((checks + 1))
awk '!/^[0-9]+$/ || $1 > 100 { bad = 1 } END { exit bad }' "$WORK/out" ||
  fail "Random_Binomial2 out of range: $(head -c 200 "$WORK/out")"
run 0 random Random_Gamma 2.5 --count 1000 --seed 3
checks=$((checks + 1))
awk '{ s += $1; if ($1 <= 0) bad = 1 } END { m = s / NR; exit (bad || m < 2.2 || m > 2.8) }' \
  "$WORK/out" || fail "Random_Gamma 2.5: mean off"
run 0 random Random_MVNorm 0 0 1 0.5 1 --count 4 --seed 9
checks=$((checks + 1))
awk 'NF != 2 { bad = 1 } END { exit bad || NR != 4 }' "$WORK/out" || fail "Random_MVNorm lines"
run 1 random Random_MVNorm 0 0 -1 0 1
expect_err "not positive definite"
run 2 random Random_MVNorm 0 0 1 0.5
run 1 random Random_Gamma 0
expect_no_out
expect_err "Invalid shape parameter"
run 0 random Random_Poisson 4 --count 0 --seed 1
expect_no_out
run 2 random Random_Gamma
run 2 random NoSuchGenerator
run 2 random Random_Normal --count -1
run 2 random Random_Normal --seed x
run 2 random
run 0 random --list
for signature in "Random_Gamma Shape" "Random_Binomial2 N P" "Random_Cauchy"; do
  checks=$((checks + 1))
  grep -qE "^$signature  +[a-z]" "$WORK/out" || fail "random --list lacks '$signature' or its description"
done

echo "$checks checks, $failures failures"
[ "$failures" -eq 0 ]
