#!/usr/bin/env python3
"""Reference values for the special-function tests (TOVRINMath_GammaBeta_test.cpp).

Writes TOVRINMath_GammaBeta_reference.inc beside this script. Every argument is an exact 80-bit value
(written as a hexadecimal literal); every expected value is computed here with mpmath at
256 bits and printed to 25 significant digits. The incomplete beta is evaluated from its
hypergeometric series with positive terms, summed on whichever side of the point is shorter,
so it shares no method with the library's continued fraction. Not run by CI:

    python3 TOVRINMath_GammaBeta_reference.py  # regenerate the table (about two minutes)
"""
import os
import random
import sys

from mpmath import mp, mpf

mp.prec = 256
HERE = os.path.dirname(os.path.abspath(__file__))


def ld(v):
    """Round to the nearest 80-bit long double (64-bit significand)."""
    with mp.workprec(64):
        return +mpf(v)


def hexlit(v):
    v = ld(v)
    if v == 0:
        return "0.0L"
    sign, man, exp, _ = v._mpf_
    return "%s0x%xp%+dL" % ("-" if sign else "", man, exp)


def declit(v):
    if v == 0:
        return "0.0L"
    return mp.nstr(v, 25, min_fixed=0, max_fixed=0, strip_zeros=False) + "L"


def lngamma_abs(x):
    x = mpf(x)
    if x > 0:
        return mp.loggamma(x)
    return mp.log(abs(mp.gamma(x)))


def ibeta_series(x, a, b):
    """I_x(a, b) = x^a y^b / (a B(a, b)) * 2F1(a + b, 1; a + 1; x), positive terms."""
    x, a, b = mpf(x), mpf(a), mpf(b)
    lpref = a * mp.log(x) + b * mp.log1p(-x) - (mp.loggamma(a) + mp.loggamma(b) - mp.loggamma(a + b))
    c = a + b
    term = mpf(1)
    total = mpf(1)
    n = 0
    while True:
        term = term * (c + n) * x / (a + 1 + n)
        total += term
        n += 1
        if term < total * mpf(10) ** -80 and (c + n) * x < (a + 1 + n):
            break
        if n > 10 ** 7:
            raise RuntimeError("series did not converge")
    return mp.exp(lpref) * total / a


def ibeta(x, a, b):
    """Regularised I_x(a, b) at 256 bits."""
    x, a, b = mpf(x), mpf(a), mpf(b)
    if x == 0:
        return mpf(0)
    if x == 1:
        return mpf(1)
    # Sum on the side whose series is shorter: the terms grow while (c + n) x > a + 1 + n and
    # then fall by about x per term.
    c = a + b
    y = 1 - x
    if x < mpf("1e-50"):
        return ibeta_series(x, a, b)
    if y < mpf("1e-50"):
        return 1 - ibeta_series(y, b, a)
    nx = max(mpf(0), (c * x - a) / y) + 80 / -mp.log(x)
    ny = max(mpf(0), (c * y - b) / x) + 80 / -mp.log(y)
    if nx <= ny:
        return ibeta_series(x, a, b)
    v = 1 - ibeta_series(y, b, a)
    if v < mpf("1e-40"):
        # The complement lost the digits of a tiny lower tail: sum on the x side after all.
        return ibeta_series(x, a, b)
    return v


def beta_density(x, a, b):
    x, a, b = mpf(x), mpf(a), mpf(b)
    return mp.exp((a - 1) * mp.log(x) + (b - 1) * mp.log1p(-x)
                  - (mp.loggamma(a) + mp.loggamma(b) - mp.loggamma(a + b)))


def inverse_ibeta(p, a, b, start):
    """The x with I_x(a, b) = p: Newton's method on the logarithm of the smaller tail, from
    start, with a bisection guard."""
    p, a, b = mpf(p), mpf(a), mpf(b)
    q = 1 - p
    lower = p <= q
    lo, hi = mpf(0), mpf(1)
    x = mpf(start)
    if not (0 < x < 1):
        x = mpf(0.5)
    for _ in range(400):
        v = ibeta(x, a, b)
        if v - p < 0:
            lo = x
        else:
            hi = x
        if abs(v - p) <= min(p, q) * mpf(10) ** -60:
            return x
        d = beta_density(x, a, b)
        if lower:
            g = mp.log(v) - mp.log(p) if v > 0 else mpf(-10) ** 9
            slope = d / v if v > 0 else mpf(0)
        else:
            g = mp.log(q) - mp.log(1 - v) if v < 1 else mpf(10) ** 9
            slope = d / (1 - v) if v < 1 else mpf(0)
        nx = x - g / slope if slope > 0 else mpf(-1)
        if not (lo < nx < hi):
            nx = (lo + hi) / 2 if lo > 0 and hi / lo < 4 else (mp.sqrt(lo * hi) if lo > 0 else hi / 1024)
        if abs(nx - x) <= abs(x) * mpf(10) ** -70:
            return nx
        x = nx
    raise RuntimeError("no convergence for p=%s a=%s b=%s" % (p, a, b))


def loguniform(rng, lo, hi):
    return ld(mp.exp(mp.log(lo) + (mp.log(hi) - mp.log(lo)) * mpf(rng.random())))


ORDINARY = "1e-17L"
HARD = "1e-15L"


def gamma_cases(rng):
    xs = [loguniform(rng, mpf("1e-10"), 1754) for _ in range(160)]
    xs += [ld(v) for v in ["1e-10", "1e-5", "0.25", "0.5", "1", "1.5", "2", "2.5", "3", "10",
                           "11.5", "12", "12.5", "20", "100.5", "170.5", "171", "1000", "1754",
                           "1754.5", "1755", "1755.25"]]
    xs += [ld(1 + mpf("1e-12")), ld(2 - mpf("1e-12")), ld(mpf(1) / 3)]
    neg = [ld(v) for v in ["-1e-10", "-0.25", "-0.5", "-0.75", "-1.5", "-2.25", "-3.5", "-9.75",
                           "-11.5", "-12.5", "-20.3", "-100.5", "-170.7", "-1000.25", "-1700.5"]]
    neg += [ld(-1 + mpf("1e-9")), ld(-3 - mpf("1e-9"))]
    rows = []
    for x in xs:
        rows.append((x, mp.gamma(x), ORDINARY))
    for x in neg:
        rows.append((x, mp.gamma(x), ORDINARY))
    return rows


def lngamma_cases(rng):
    rows = []
    xs = [loguniform(rng, mpf("1e-10"), 1754) for _ in range(120)]
    xs += [loguniform(rng, 1754, mpf("1e4000")) for _ in range(40)]
    xs += [ld(v) for v in ["1e-300", "1e-10", "0.5", "1.5", "2.5", "3", "12", "1e6", "1e20",
                           "1e300", "1e4900"]]
    # Around the zeros at 1 and 2 the relative error must hold too.
    for d in ["1e-15", "1e-10", "1e-5", "0.001", "0.1", "0.3"]:
        for c in [1, 2]:
            xs += [ld(c + mpf(d)), ld(c - mpf(d))]
    for x in xs:
        rows.append((x, lngamma_abs(x), ORDINARY))
    # Negative non-integers away from the zeros of ln|Gamma| (those lie in (-4, -2)).
    for v in ["-1e-10", "-0.5", "-1.5", "-4.5", "-7.25", "-11.5", "-12.5", "-50.5", "-1000.3",
              "-99999.75", "-100000.5"]:
        x = ld(mpf(v))
        rows.append((x, lngamma_abs(x), ORDINARY))
    return rows


def beta_cases(rng):
    rows = []
    for _ in range(80):
        a = loguniform(rng, mpf("1e-3"), mpf("1e5"))
        b = loguniform(rng, mpf("1e-3"), mpf("1e5"))
        v = mp.beta(a, b)
        if v < mpf("1e-4900"):
            continue
        rows.append((a, b, v, ORDINARY))
    for a, b in [(1, 1), (0.5, 0.5), (2, 3), (1e-3, 1e-3), (1e5, 1e5), (0.5, 1e5), (12, 12),
                 # a small shape beside a large one
                 (1e-30, 12), (1e-10, 1e30), (1e-5, 1e10), (1e-20, 1e5), (0.05, 1e20),
                 (0.0999, 50)]:
        a, b = ld(a), ld(b)
        v = mp.beta(a, b)
        if v < mpf("1e-4900"):
            continue
        rows.append((a, b, v, ORDINARY))
    return rows


def ibeta_cases(rng):
    rows = []

    def add(x, a, b, tol):
        x, a, b = ld(x), ld(a), ld(b)
        if x <= 0 or x >= 1:
            return
        v = ibeta(x, a, b)
        if v < mpf("1e-4900") or 1 - v == 0:
            return
        rows.append((x, a, b, v, tol))

    # Random shapes over 1e-3..1e5 with x spread around the mean.
    for _ in range(150):
        a = loguniform(rng, mpf("1e-3"), mpf("1e5"))
        b = loguniform(rng, mpf("1e-3"), mpf("1e5"))
        mean = a / (a + b)
        sd = mp.sqrt(a * b / ((a + b) ** 2 * (a + b + 1)))
        x = mean + sd * mpf(rng.uniform(-3, 3))
        if not (0 < x < 1):
            x = mpf(rng.random())
        add(x, a, b, ORDINARY)
    # Ordinary shapes over the whole interval, including within 1e-12 of both ends.
    for a, b in [(0.5, 0.5), (1, 1), (2, 3), (0.5, 10), (10, 0.5), (5, 5), (0.1, 0.2), (30, 7),
                 (1e-3, 1e-3), (1e-3, 2), (2, 1e-3), (0.5, 200), (200, 0.5), (150, 400)]:
        for x in ["1e-12", "1e-6", "0.01", "0.1", "0.25", "0.5", "0.75", "0.9", "0.99",
                  "0.999999", 1 - mpf("1e-12")]:
            add(mpf(x), a, b, ORDINARY)
    # Student t: I_x(df/2, 1/2) with x = df / (df + t^2), and I_x(1/2, df/2).
    for df in [1, 2, 3, 5, 10, 30, 100, 1000, 1e5]:
        for t in ["0.01", "0.5", "1", "2", "5", "30", "1000"]:
            x = mpf(df) / (df + mpf(t) ** 2)
            add(x, mpf(df) / 2, 0.5, ORDINARY)
            add(1 - ld(x), 0.5, mpf(df) / 2, ORDINARY)
    # Large shapes near the mean (the hard region).
    for a, b in [(1e3, 1e3), (1e4, 3e4), (1e5, 1e5), (5e4, 1e5), (1e5, 200), (2000, 1e5),
                 (1e5, 0.5), (0.5, 1e5)]:
        a, b = mpf(a), mpf(b)
        mean = a / (a + b)
        sd = mp.sqrt(a * b / ((a + b) ** 2 * (a + b + 1)))
        for k in [-10, -3, -1, -0.1, 0, 0.1, 1, 3, 10]:
            add(mean + k * sd, a, b, ORDINARY)
    return rows


def inverse_cases(rng):
    shapes = [(0.5, 0.5), (1, 1), (2, 3), (0.5, 10), (10, 0.5), (5, 5), (30, 7), (0.1, 0.2),
              (1e-3, 2), (2, 1e-3), (150, 400), (1e3, 1e3), (1e5, 1e5), (0.5, 1e5), (1e5, 0.5)]
    ps = ["1e-300", "1e-100", "1e-20", "1e-5", "0.01", "0.3", "0.5", "0.7", "0.99", 1 - mpf("1e-10"),
          1 - mpf("1e-18")]
    rows = []
    for a, b in shapes:
        a, b = ld(a), ld(b)
        for p in ps:
            p = ld(mpf(p))
            # A start for Newton's method: the normal or power-law estimate in mpmath.
            x = inverse_start(p, a, b)
            try:
                    root = inverse_ibeta(p, a, b, x)
            except RuntimeError:
                continue
            if root < mpf("1e-4900"):
                continue
            # Below a shape of 1/2 the root is flat in its tail (I ~ x^a): a relative error d
            # in I moves x by about d / a, whatever the method.
            tol = ORDINARY if min(a, b) >= 0.5 else HARD
            rows.append((p, a, b, root, tol))
    return rows


def inverse_start(p, a, b):
    p, a, b = mpf(p), mpf(a), mpf(b)
    lb = mp.loggamma(a) + mp.loggamma(b) - mp.loggamma(a + b)
    lo_tail = mp.exp((mp.log(a * p) + lb) / a)
    hi_tail = 1 - mp.exp((mp.log(b * (1 - p)) + lb) / b)
    mean = a / (a + b)
    if lo_tail < mean:
        return lo_tail
    if hi_tail > mean:
        return hi_tail
    return mean


STRUCTS = ["// {x, f(x), tolerance}",
           "struct SpecialCase1 {", "  Extended x;", "  Extended expected;", "  Extended tolerance;", "};",
           "// {a, b, f(a, b), tolerance}",
           "struct SpecialCase2 {", "  Extended a;", "  Extended b;", "  Extended expected;",
           "  Extended tolerance;", "};",
           "// {x, a, b, f(x, a, b), tolerance}",
           "struct SpecialCase3 {", "  Extended x;", "  Extended a;", "  Extended b;",
           "  Extended expected;", "  Extended tolerance;", "};", ""]


def write_table(path):
    rng = random.Random(20261121)
    out = ["// Generated by TOVRINMath_GammaBeta_reference.py (mpmath, 256-bit working precision).",
           "// Do not edit: regenerate with python3 TOVRINMath_GammaBeta_reference.py.", ""]
    out += STRUCTS

    def table(comment, declaration, cases):
        # Each case is (inputs..., value, tolerance): inputs exact in hex, the value in decimal.
        out.append(comment)
        out.append("inline constexpr %s = {" % declaration)
        for *inputs, value, tol in cases:
            out.append("    {%s}," % ", ".join([hexlit(x) for x in inputs] + [declit(value), str(tol)]))
        out.append("};\n")

    table("// {x, Gamma(x), tolerance}", "SpecialCase1 kGammaTable[]", gamma_cases(rng))
    table("// {x, ln|Gamma(x)|, tolerance}", "SpecialCase1 kLnGammaTable[]", lngamma_cases(rng))
    table("// {a, b, Beta(a, b), tolerance}", "SpecialCase2 kBetaTable[]", beta_cases(rng))
    print("incomplete beta...", file=sys.stderr)
    table("// {x, a, b, I_x(a, b), tolerance}", "SpecialCase3 kIncompleteBetaTable[]",
          ibeta_cases(rng))
    print("inverse...", file=sys.stderr)
    table("// {p, a, b, x with I_x(a, b) = p, tolerance}",
          "SpecialCase3 kInverseIncompleteBetaTable[]", inverse_cases(rng))
    out[-1] = "};"
    with open(path, "w") as f:
        f.write("\n".join(out) + "\n")


if __name__ == "__main__":
    write_table(os.path.join(HERE, "TOVRINMath_GammaBeta_reference.inc"))
