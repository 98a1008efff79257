#!/usr/bin/env python3
"""Accuracy of the 80-bit kernels Exp80, Ln80 and Pow80 (and of the C library's expl, logl,
powl on the same arguments) against mpmath at 320 bits, on random arguments over the whole
range and on the hard cases: Ln near 1 and among the subnormals, Exp near 0 and at the
overflow and underflow ends, Pow with x near 1 and large y, integer y, negative x. Prints, per
function and set, the largest error in units in the last place and the share of results that
are the correctly rounded ones.

    python3 TOVRINElementary_accuracy.py BUILD/tools/tovrin_elementary_accuracy [N] [SEED]

N arguments per set (default 200000; 150000 took 17 minutes on a shared 2-core machine).
"""
import random
import subprocess
import sys

from mpmath import mp, mpf, exp, log, floor, inf

mp.prec = 320
EMIN = -16382  # the least normal binary exponent
QMIN = EMIN - 63  # the exponent of the least subnormal
MAX = (2 - mpf(2) ** -63) * mpf(2) ** 16383


def to_int_pair(v):
    """A 64-bit-significand v as (s, e), v = s 2^e exactly."""
    v = mpf(v)
    if v == 0:
        return 0, 0
    man, e = v.man, v.exp
    sign = -1 if v < 0 else 1
    while man.bit_length() > 64:
        raise ValueError("not an Extended")
    return sign * int(man), int(e)


def extended(v):
    """v rounded to 64 significant bits (normal range), as (s, e)."""
    with mp.workprec(64):
        r = +mpf(v)
    return to_int_pair(r)


def value(s, e):
    return mpf(s) * mpf(2) ** e


def parse(tokens, i):
    t = tokens[i]
    if t in ("nan", "inf", "-inf"):
        return {"nan": mp.nan, "inf": inf, "-inf": -inf}[t], i + 1
    return value(int(t), int(tokens[i + 1])), i + 2


def ulps(got, exact):
    """|got - exact| in units in the last place of exact (subnormals included); inf beyond."""
    if exact == 0:
        return 0 if got == 0 else inf
    if abs(exact) >= MAX * (1 + mpf(2) ** -65):  # rounds to infinity
        return 0 if got == (inf if exact > 0 else -inf) else inf
    if got in (inf, -inf) or got != got:
        return inf
    q = max(int(floor(log(abs(exact), 2))) - 63, QMIN)
    return abs(got - exact) / mpf(2) ** q


def rand_ext(rng, lo, hi):
    return extended(mpf(lo) + (mpf(hi) - mpf(lo)) * mpf(rng.getrandbits(80)) / mpf(2) ** 80)


def rand_positive(rng, emin, emax):
    return (rng.getrandbits(63) | (1 << 63), rng.randint(emin, emax) - 63)


def sets(rng, n):
    out = []
    # Exp
    out.append(("Exp", "whole range [-11400, 11357]",
                [("e", rand_ext(rng, -11400, 11357)) for _ in range(n)]))
    out.append(("Exp", "[-50, 50]", [("e", rand_ext(rng, -50, 50)) for _ in range(n)]))
    out.append(("Exp", "near 0 (magnitude 2^-70 .. 2^-1)",
                [("e", (rng.choice((-1, 1)) * (rng.getrandbits(63) | (1 << 63)),
                        -63 - rng.randint(1, 70))) for _ in range(n)]))
    out.append(("Exp", "overflow end [11350, 11356.6]",
                [("e", rand_ext(rng, 11350, 11356.6)) for _ in range(n)]))
    out.append(("Exp", "underflow end (subnormal results)",
                [("e", rand_ext(rng, -11399.6, -11355)) for _ in range(n)]))
    # Ln
    out.append(("Ln", "whole range (all binary exponents)",
                [("l", rand_positive(rng, EMIN, 16383)) for _ in range(n)]))
    out.append(("Ln", "near 1 (x = 1 +- 2^-64 .. 2^-1)",
                [("l", extended(1 + rng.choice((-1, 1)) * mpf(rng.random() + 0.5) *
                                mpf(2) ** -rng.randint(2, 64))) for _ in range(n)]))
    out.append(("Ln", "[0.5, 4]", [("l", rand_ext(rng, 0.5, 4)) for _ in range(n)]))
    out.append(("Ln", "subnormals",
                [("l", (rng.getrandbits(rng.randint(1, 63)) | 1, QMIN)) for _ in range(n)]))
    # Pow
    def pow_case(x, z_max):
        """(x, y) with y = z / ln x, z uniform in [-z_max, z_max]."""
        lx = log(value(*x))
        y = extended((mpf(rng.random()) * 2 - 1) * z_max / lx)
        return ("p", x, y)
    out.append(("Pow", "x in [2^-100, 2^100], y ln x within +-11000",
                [pow_case(rand_positive(rng, -100, 100), 11000) for _ in range(n)]))
    out.append(("Pow", "x in [0.5, 2], y ln x within +-50",
                [pow_case(rand_ext(rng, 0.5, 2), 50) for _ in range(n)]))
    out.append(("Pow", "x near 1 (1 +- 2^-60 .. 2^-4), y ln x within +-11000",
                [pow_case(extended(1 + rng.choice((-1, 1)) * mpf(rng.random() + 0.5) *
                                   mpf(2) ** -rng.randint(4, 60)), 11000) for _ in range(n)]))
    def integer_case():
        x = rand_ext(rng, 0.1, 10)
        ymax = int(11000 / abs(float(log(value(*x))) or 1))
        y = rng.randint(-min(ymax, 5000), min(ymax, 5000))
        return ("p", x, (y, 0))
    out.append(("Pow", "x in [0.1, 10], integer y within +-5000", [integer_case() for _ in range(n)]))
    def negative_case():
        x = rand_ext(rng, -3, -0.3)
        return ("p", x, (rng.randint(-200, 200), 0))
    out.append(("Pow", "x in [-3, -0.3], integer y within +-200",
                [negative_case() for _ in range(n)]))
    return out


def main():
    driver = sys.argv[1]
    n = int(sys.argv[2]) if len(sys.argv) > 2 else 200000
    rng = random.Random(int(sys.argv[3]) if len(sys.argv) > 3 else 20261124)
    all_sets = sets(rng, n)
    lines = []
    for _, _, cases in all_sets:
        for c in cases:
            lines.append(" ".join([c[0]] + [f"{s} {e}" for s, e in c[1:]]))
    result = subprocess.run([driver], input="\n".join(lines) + "\n", capture_output=True,
                            text=True, check=True).stdout.splitlines()
    print("| Function | Arguments | N | ours: max ulps | ours: correctly rounded | "
          "glibc: max ulps | glibc: correctly rounded |")
    print("|---|---|---|---|---|---|---|")
    row = 0
    for name, label, cases in all_sets:
        worst = [mpf(0), mpf(0)]
        right = [0, 0]
        for c in cases:
            tokens = result[row].split()
            row += 1
            ours, i = parse(tokens, 0)
            theirs, _ = parse(tokens, i)
            args = [value(s, e) for s, e in c[1:]]
            if c[0] == "e":
                exact = exp(args[0])
            elif c[0] == "l":
                exact = log(args[0])
            else:
                x, y = args
                exact = (abs(x) ** y) * (-1 if x < 0 and int(y) % 2 else 1)
            for k, got in enumerate((ours, theirs)):
                u = ulps(got, exact)
                worst[k] = max(worst[k], u)
                right[k] += u <= 0.5
        print(f"| {name} | {label} | {len(cases)} | {float(worst[0]):.3f} | "
              f"{100 * right[0] / len(cases):.4f} % | {float(worst[1]):.3f} | "
              f"{100 * right[1] / len(cases):.4f} % |")


if __name__ == "__main__":
    main()
