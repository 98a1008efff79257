#!/usr/bin/env python3
"""Turns the output of bench/run_all.sh into the Markdown table of bench/RESULTS.md.

    python3 bench/tabulate.py build/bench-results              # the timing table
    python3 bench/tabulate.py build/bench-results --accuracy   # the accuracy table

Each row pairs one of our benchmarks with its yardstick from the same program run on the same
inputs. The figure is the median CPU time over the repetitions, per call or per element where
the benchmark counts items (items_per_second or a per_call counter), else per iteration; the
ratio is ours / peer (below 1: we are faster).
"""
import json
import os
import sys


def load(path):
    with open(path) as f:
        data = json.load(f)
    medians, spreads = {}, {}
    for b in data["benchmarks"]:
        run = b.get("run_name", b["name"])
        agg = b.get("aggregate_name")
        if agg not in ("median", "stddev", None):
            continue
        scale = {"ns": 1e-9, "us": 1e-6, "ms": 1e-3, "s": 1.0}[b.get("time_unit", "ns")]
        if "per_call" in b:
            seconds = b["per_call"]
        elif "items_per_second" in b and agg != "stddev":
            seconds = 1.0 / b["items_per_second"]
        else:
            seconds = b["cpu_time"] * scale
        if agg == "stddev":
            spreads[run] = b["cpu_time"] * scale
        else:
            medians[run] = (seconds, "items_per_second" in b or "per_call" in b,
                            b["cpu_time"] * scale)
    return medians, spreads


def fmt(seconds):
    for unit, factor in (("s", 1.0), ("ms", 1e-3), ("µs", 1e-6), ("ns", 1e-9)):
        if seconds >= factor:
            return "%.3g %s" % (seconds / factor, unit)
    return "%.3g ns" % (seconds / 1e-9)


# (program, section, [(what, ours, peer name, peer run)])
VECTOR_SHAPES = ["random", "sorted", "reversed", "all equal", "10 distinct values"]
ELEMENTS = [("TQENFloatVector", "Extended"), ("TQENDoubleVector", "Double"),
            ("TQENLIntVector", "LongInt"), ("TQENByteVector", "Byte")]


def vector_rows():
    rows = []
    for fam in ("SumVector", "SumSqVector", "MinMaxVector"):
        loop = fam.replace("Vector", "Loop")
        for v, e in ELEMENTS:
            rows.append(("`%s` %s, 10^6, per element" % (fam, e), "BM_%s<%s>" % (fam, v),
                         "plain loop", "BM_%s<%s>" % (loop, v)))
    for v, e in ELEMENTS[:3]:
        for i, shape in enumerate(VECTOR_SHAPES):
            rows.append(("`QSortVector` %s, 10^6 %s, per element" % (e, shape),
                         "BM_QSortVector<%s>/%d" % (v, i), "std::sort", "BM_StdSort<%s>/%d" % (v, i)))
    rows.append(("`Vector2RankVector` Double, 10^6, per element", "BM_Vector2RankVector",
                 "one std::sort of the input", "BM_StdSortOfRankInput"))
    return rows


def matrix_rows():
    rows = []
    for t, e in (("PackedExtended", "Extended"), ("Double", "Double"), ("Single", "Single")):
        for n in (64, 256, 512):
            rows.append(("`MultiplyMatrices` %s %dx%d, per multiply-add" % (e, n, n), "BM_MultiplyMatrices<%s>/%d" % (t, n),
                         "naive triple loop", "BM_NaiveProduct<%s>/%d" % (t, n)))
    for t, e in (("PackedExtended", "Extended"), ("Double", "Double")):
        for fam, plain, method in (("MatrixInverse", "PlainInverse", "Gauss-Jordan"),
                                   ("MatrixDeterminant", "PlainDeterminant", "Gaussian elimination")):
            for n in (100, 300):
                rows.append(("`%s` %s %dx%d, per call" % (fam, e, n, n), "BM_%s<%s>/%d" % (fam, t, n),
                             "plain %s in the element type" % method, "BM_%s<%s>/%d" % (plain, t, n)))
    rows.append(("`QSortMatrixRowsOnCol` 10^5 rows x 4, repeated keys, per sort", "BM_QSortMatrixRowsOnCol",
                 "std::sort of the rows", "BM_StdSortRows"))
    return rows


def statistics_rows():
    pairs = [("QENMean", "Loop_Mean", "loop"),
             ("SampleVariance", "Loop_TwoPassVariance", "two-pass loop"),
             ("SampleVarianceAndMean", "Loop_OnePassVarianceAndMean", "one-pass loop"),
             ("QSortVector_GetMedian", "Std_SortMedian", "std::sort + middle"),
             ("QSortVector_GetMedian", "Std_NthElementMedian", "std::nth_element"),
             ("GetSampleKurtosis", "Loop_SampleKurtosis", "loop"),
             ("GetQuadraticCurve", "Loop_QuadraticCurve", "loop + 3x3 solve"),
             ("CoeffCorrelation", "Loop_Correlation", "loop")]
    return [("`%s`, 10^6 Double, per element" % ours.replace("QSortVector_", "QSortVector + "),
             "BM_" + ours, peer, "BM_" + p) for ours, p, peer in pairs]


def random_rows():
    r = [("`VerdanRandom`", "BM_VerdanRandom", "std::uniform_real_distribution<double> on mt19937_64", "BM_Std_UniformDouble"),
         ("`VerdanRandom`", "BM_VerdanRandom", "std::generate_canonical<long double, 64>", "BM_Std_CanonicalLongDouble64"),
         ("`Random_Normal`", "BM_Random_Normal", "std::normal_distribution<double>", "BM_Std_Normal"),
         ("`Random_Normal`, mt19937_64 as source", "BM_Random_Normal_MtSource", "std::normal_distribution<double>", "BM_Std_Normal"),
         ("`Random_Exponential`", "BM_Random_Exponential", "std::exponential_distribution", "BM_Std_Exponential"),
         ("`Random_Gamma` shape 0.5", "BM_Random_Gamma/5", "std::gamma_distribution", "BM_Std_Gamma/5"),
         ("`Random_Gamma` shape 5", "BM_Random_Gamma/50", "std::gamma_distribution", "BM_Std_Gamma/50"),
         ("`Random_Beta`", "BM_Random_Beta", "boost::random::beta_distribution", "BM_Boost_Beta"),
         ("`Random_Beta`", "BM_Random_Beta", "two std::gamma_distribution draws", "BM_Std_BetaByGammas"),
         ("`Random_Binomial2` N 1000, P 0.3", "BM_Random_Binomial2/1000/30", "std::binomial_distribution", "BM_Std_Binomial/1000/30"),
         ("`Random_Binomial2` N 20, P 0.3", "BM_Random_Binomial2/20/30", "std::binomial_distribution", "BM_Std_Binomial/20/30"),
         ("`Random_Binomial1` N 1000, P 0.3", "BM_Random_Binomial1/1000/30", "std::binomial_distribution", "BM_Std_Binomial/1000/30"),
         ("`Random_Binomial1` N 20, P 0.3", "BM_Random_Binomial1/20/30", "std::binomial_distribution", "BM_Std_Binomial/20/30"),
         ("`Random_Poisson` mean 4", "BM_Random_Poisson/4", "std::poisson_distribution", "BM_Std_Poisson/4"),
         ("`Random_Poisson` mean 100", "BM_Random_Poisson/100", "std::poisson_distribution", "BM_Std_Poisson/100")]
    return [(what + ", per draw", ours, peer, p) for what, ours, peer, p in r]


def currency_rows():
    return [("`QSortVector` Currency, 10^5, per element", "BM_QSortVector_Currency", "std::sort of int64", "BM_StdSort_Int64"),
            ("`QSortVector` Int64, 10^5, per element", "BM_QSortVector_Int64", "std::sort of int64", "BM_StdSort_Int64"),
            ("`SumVector` Currency, 10^5, per element", "BM_SumVector_Currency", "plain int64 loop", "BM_PlainLoopSum_Int64"),
            ("`Vector2QENCurrVector` Extended to Currency, 10^5, per element", "BM_Vector2QENCurrVector_Float",
             "llroundl loop", "BM_PlainLoopLlroundl_Float")]


def elementary_rows():
    r = [("`Exp80`", "BM_Exp80", "expl", "BM_Expl"), ("`Exp80`", "BM_Exp80", "exp (double)", "BM_ExpDouble"),
         ("`Exp80(hi, lo)`", "BM_Exp80Split", "expl", "BM_Expl"),
         ("`Ln80`", "BM_Ln80", "logl", "BM_Logl"), ("`Ln80`", "BM_Ln80", "log (double)", "BM_LogDouble"),
         ("`Pow80`", "BM_Pow80", "powl", "BM_Powl"), ("`Pow80`", "BM_Pow80", "pow (double)", "BM_PowDouble")]
    return [(what + ", per call", ours, peer, p) for what, ours, peer, p in r]


DISTRIBUTIONS = ["NormalLess", "InvNormalLess", "IncompleteGamma", "ChiSquareLess", "InvChiSquareLess",
                 "StudentTLess", "InvStudentTLess", "FDistLess", "InvFDistLess", "BetaDistLess",
                 "BinomialLess", "PoissonLess"]
SPECIAL = [("Gamma", "GammaOps"), ("LnGamma", "LnGammaOps"), ("Beta", "BetaOps"),
           ("IncompleteBeta", "IncompleteBetaOps"),
           ("IncompleteBeta, shapes <= 1000", "IncompleteBetaSmallShapesOps"),
           ("IncompleteBeta, a shape > 1000", "IncompleteBetaLargeShapesOps"),
           ("InverseIncompleteBeta", "InverseIncompleteBetaOps")]

SECTIONS = [
    ("vector_bench", "Vectors", vector_rows()),
    ("matrix_bench", "Matrices", matrix_rows()),
    ("statistics_bench", "Statistics", statistics_rows()),
    ("gammabeta_bench", "Gamma and beta family (reference-table rows, per call)",
     [("`%s`" % name, "tovrin/" + ops, "Boost.Math", "boost/" + ops) for name, ops in SPECIAL]),
    ("distributions_bench", "Distributions (reference-table rows, per call)",
     [("`%s`" % d, d + "/tovrin", "Boost.Math", d + "/boost") for d in DISTRIBUTIONS]),
    ("random_bench", "Random variates", random_rows()),
    ("elementary_bench", "80-bit elementary functions", elementary_rows()),
    ("currency_bench", "Money vectors", currency_rows()),
]


def table_lines(path):
    with open(path) as f:
        for line in f:
            cells = [c.strip() for c in line.strip().strip("|").split("|")]
            if line.startswith("|") and not set(line.strip()) <= set("|-") and cells[0] != "function":
                yield cells


def accuracy(out):
    """One table from the accuracy reports that the two programs print before timing."""
    print("| Function | Reference | Rows | tovrin, rel. | Boost, rel. | tovrin, abs. | Boost, abs. |")
    print("|---|---|---|---|---|---|---|")
    special = {}
    for name, who, rows, _, worst in table_lines(os.path.join(out, "gammabeta_bench.txt")):
        special.setdefault(name, {"rows": rows})[who] = worst
    for name, v in special.items():
        label = "`%s`,%s" % tuple(name.split(",", 1)) if "," in name else "`%s`" % name
        print("| %s | 256-bit mpmath table | %s | %s | %s | | |" % (
            label, v["rows"], v.get("tovrin", "-"), v.get("Boost", "-")))
    for name, rows, rel, ab, brel, babs in table_lines(os.path.join(out, "distributions_bench.txt")):
        print("| `%s` | 40-digit mpmath table | %s | %s | %s | %s | %s |" % (name, rows, rel, brel, ab, babs))


def main():
    out = sys.argv[1]
    if len(sys.argv) > 2 and sys.argv[2] == "--accuracy":
        accuracy(out)
        return 0
    missing = []
    print("| Benchmark | tovrin | Peer | Peer's figure | Ratio |")
    print("|---|---|---|---|---|")
    for program, title, rows in SECTIONS:
        path = os.path.join(out, program + ".json")
        if not os.path.exists(path):
            missing.append(program)
            continue
        medians, _ = load(path)
        print("| **%s** | | | | |" % title)
        for what, ours, peer_name, peer in rows:
            if ours not in medians or peer not in medians:
                missing.append(ours if ours not in medians else peer)
                continue
            a, b = medians[ours][0], medians[peer][0]
            print("| %s | %s | %s | %s | %.2f |" % (what, fmt(a), peer_name, fmt(b), a / b))
    if missing:
        sys.stderr.write("not found: %s\n" % ", ".join(missing))
        return 1
    return 0


if __name__ == "__main__":
    sys.exit(main())
