#!/usr/bin/env python3
"""Reference tables for TOVRINRandom_test.cpp, computed with mpmath at 30 digits.

Writes TOVRINRandom_reference.inc beside this script:
  - for each continuous case: the 39 inner quantiles at i/40 (equiprobable bins), the mean, the
    variance and the fourth central moment (NaN where they do not exist);
  - for each discrete case: bins of consecutive values with their probabilities, merged so that
    every bin expects at least 20 of kDraws draws, plus mean, variance and fourth central moment;
  - the chi-square critical values at upper-tail probability 1e-6;
  - the first xoshiro256** outputs of the SplitMix64-seeded state for seed 0;
  - Leva's standard normal on scripted uniforms (u = 0.5, accepted at once, so the result is
    2 v2): v2 = (v - 0.5) * 1.7156 is worked out in 80-bit arithmetic with the 80-bit constant
    and rounded once to double, which for the listed v differs from plain double arithmetic;
    and pairs whose quotient q lies within 1e-15 of a bound, with the outcome of each test.
"""
import os

import mpmath as mp

mp.mp.dps = 30
BINS = 40
DRAWS = 100000
P_FAIL = mp.mpf('1e-6')


def bisect(f, lo, hi, rel):
    flo = f(lo)
    for _ in range(200):
        mid = (lo + hi) / 2
        fm = f(mid)
        if (fm < 0) == (flo < 0):
            lo, flo = mid, fm
        else:
            hi = mid
        if hi - lo < rel * (1 + abs(mid)):
            break
    return lo, hi


def solve(f, lo, hi):
    lo, hi = bisect(f, lo, hi, mp.mpf('1e-8'))
    try:
        x = mp.findroot(f, (lo, hi), solver='anderson', tol=mp.mpf('1e-40'))
        if lo - (hi - lo) <= x <= hi + (hi - lo):
            return x
    except (ValueError, ZeroDivisionError):
        pass
    lo, hi = bisect(f, lo, hi, mp.mpf('1e-24'))
    return (lo + hi) / 2


def quantile(cdf, p, lo, hi, pdf=None):
    lo, hi = mp.mpf(lo), mp.mpf(hi)
    # strict bracket: cdf(lo) < p < cdf(hi) (bisect needs a sign change)
    while cdf(lo) >= p:
        lo = lo - (hi - lo)
    while cdf(hi) <= p:
        hi = hi + (hi - lo)
    if pdf is None:
        return solve(lambda x: cdf(x) - p, lo, hi)
    # costly cdf: a short bisection, then Newton steps with the density
    lo, hi = bisect(lambda x: cdf(x) - p, lo, hi, mp.mpf('1e-3'))
    x = (lo + hi) / 2
    for _ in range(12):
        step = (cdf(x) - p) / pdf(x)
        x -= step
        if abs(step) < mp.mpf('1e-24') * (1 + abs(x)):
            break
    return x


def moments(pdf, support):
    mean = mp.quad(lambda x: x * pdf(x), support)
    var = mp.quad(lambda x: (x - mean) ** 2 * pdf(x), support)
    c4 = mp.quad(lambda x: (x - mean) ** 4 * pdf(x), support)
    return mean, var, c4


def gamma_case(a, scale=1):
    cdf = lambda x: mp.gammainc(a, 0, x / scale, regularized=True) if x > 0 else mp.mpf(0)
    mom = (a * scale, a * scale ** 2, (3 * a * a + 6 * a) * scale ** 4)
    return cdf, mom, (mp.mpf(0), mp.mpf(a * scale + 1))


def beta_case(a, b):
    a, b = mp.mpf(a), mp.mpf(b)
    cdf = lambda x: mp.betainc(a, b, 0, min(max(x, 0), 1), regularized=True)
    pdf = lambda x: x ** (a - 1) * (1 - x) ** (b - 1) / mp.beta(a, b)
    return cdf, moments(pdf, [0, 1]), (mp.mpf(0), mp.mpf(1))


def t_case(n):
    n = mp.mpf(n)

    def cdf(x):
        tail = mp.betainc(n / 2, mp.mpf(1) / 2, 0, n / (n + x * x), regularized=True) / 2
        return 1 - tail if x > 0 else tail

    if n > 4:
        mom = (mp.mpf(0), n / (n - 2), 3 * n * n / ((n - 2) * (n - 4)))
    else:
        mom = (mp.nan, mp.nan, mp.nan)
    return cdf, mom, (mp.mpf(-1), mp.mpf(1))


def gig_case(lam, omega):
    lam, omega = mp.mpf(lam), mp.mpf(omega)
    norm = 2 * mp.besselk(lam, omega)
    pdf = lambda x: x ** (lam - 1) * mp.exp(-omega / 2 * (x + 1 / x)) / norm if x > 0 else mp.mpf(0)
    def cdf(x):
        return mp.quad(pdf, [0, x]) if x > 0 else mp.mpf(0)
    cdf.pdf = pdf
    return cdf, moments(pdf, [0, 1, mp.inf]), (mp.mpf('0.01'), mp.mpf(2))


def von_mises_case(k):
    k = mp.mpf(k)
    i0 = mp.besseli(0, k)
    ratios = [mp.besseli(j, k) / i0 for j in range(1, 80)]

    def cdf(x):
        if x <= -mp.pi:
            return mp.mpf(0)
        if x >= mp.pi:
            return mp.mpf(1)
        s = sum(r * mp.sin(j * x) / j for j, r in enumerate(ratios, start=1))
        return (x + mp.pi + 2 * s) / (2 * mp.pi)

    pdf = lambda x: mp.exp(k * mp.cos(x)) / (2 * mp.pi * i0)
    return cdf, moments(pdf, [-mp.pi, 0, mp.pi]), (-mp.pi, mp.pi)


def continuous_cases():
    yield 'StandardNormal', mp.ncdf, (mp.mpf(0), mp.mpf(1), mp.mpf(3)), (-1, 1)
    # log-normal with mean 2 and standard deviation 1.5
    m, s = mp.mpf(2), mp.mpf('1.5')
    sig2 = mp.log(1 + (s / m) ** 2)
    mu = mp.log(m) - sig2 / 2
    lcdf = lambda x: mp.ncdf((mp.log(x) - mu) / mp.sqrt(sig2)) if x > 0 else mp.mpf(0)
    lpdf = lambda x: mp.npdf(mp.log(x), mu, mp.sqrt(sig2)) / x
    yield 'LogNormal_2_1_5', lcdf, moments(lpdf, [0, 1, 2, 10, mp.inf]), (mp.mpf('0.5'), 3)
    for a in ('0.3', '0.5', '1', '2.5', '5', '30'):
        cdf, mom, br = gamma_case(mp.mpf(a))
        yield 'Gamma_' + a.replace('.', '_'), cdf, mom, br
    cdf, mom, br = gamma_case(mp.mpf('1.5'), 2)
    yield 'ChiSq_3', cdf, mom, br
    # Weibull with shape 2.5 and with shape -2 (E^(-1/2))
    w = mp.mpf('2.5')
    yield ('Weibull_2_5', lambda x: 1 - mp.exp(-x ** w) if x > 0 else mp.mpf(0),
           moments(lambda x: w * x ** (w - 1) * mp.exp(-x ** w), [0, 1, mp.inf]), (0, 2))
    # X = E^(-1/2): P(X <= x) = P(E >= x^-2) = exp(-x^-2); the variance is infinite.
    yield ('Weibull_neg2', lambda x: mp.exp(-x ** -2) if x > 0 else mp.mpf(0),
           (mp.sqrt(mp.pi), mp.inf, mp.nan), (mp.mpf('0.5'), 2))
    for a, b in (('2', '3'), ('0.5', '0.7'), ('3', '0.4'), ('0.2', '5')):
        cdf, mom, br = beta_case(a, b)
        yield 'Beta_%s_%s' % (a.replace('.', '_'), b.replace('.', '_')), cdf, mom, br
    for n in (1, 2, 3, 10):
        cdf, mom, br = t_case(n)
        yield 'T_%d' % n, cdf, mom, br
    for lam, om in (('0', '1'), ('0.5', '1.5'), ('2', '0.5'), ('6', '20')):
        cdf, mom, br = gig_case(lam, om)
        yield 'InvGauss_%s_%s' % (lam.replace('.', '_'), om.replace('.', '_')), cdf, mom, br
    for k in ('0', '0.3', '0.5', '2.7', '9.99'):
        cdf, mom, br = von_mises_case(k)
        yield 'VonMises_' + k.replace('.', '_'), cdf, mom, br
    yield ('Cauchy', lambda x: mp.atan(x) / mp.pi + mp.mpf(1) / 2, (mp.nan, mp.nan, mp.nan),
           (-1, 1))


def binomial_pmf(n, p, truncate_zero=False, reflect=False):
    p = mp.mpf(p)
    probs = {k: mp.binomial(n, k) * p ** k * (1 - p) ** (n - k) for k in range(n + 1)}
    if truncate_zero:
        # the inversion path of Random_Binomial2 redraws a would-be 0 (of min(P, 1 - P))
        q = min(p, 1 - p)
        base = {k: mp.binomial(n, k) * q ** k * (1 - q) ** (n - k) for k in range(1, n + 1)}
        total = sum(base.values())
        probs = {(n - k if reflect else k): v / total for k, v in base.items()}
    return probs


def poisson_pmf(mu):
    mu = mp.mpf(mu)
    top = int(mu + 40 * mp.sqrt(mu) + 60)
    return {k: mp.exp(-mu) * mu ** k / mp.factorial(k) for k in range(top)}


def negbin_pmf(r, p):
    r, p = mp.mpf(r), mp.mpf(p)
    probs = {}
    k = 0
    while True:
        v = mp.gamma(k + r) / (mp.gamma(r) * mp.factorial(k)) * (1 - p) ** r * p ** k
        probs[k] = v
        if k > 20 and v < mp.mpf('1e-25'):
            break
        k += 1
    return probs


def discrete_cases():
    for n, p in ((20, '0.3'), (10, '0.5'), (200, '0.7'), (1000, '0.05')):
        yield 'Binomial1_%d_%s' % (n, p.replace('.', '_')), binomial_pmf(n, p)
    for n, p in ((20, '0.3'), (20, '0.8'), (5, '0.5')):
        yield ('Binomial2_%d_%s' % (n, p.replace('.', '_')),
               binomial_pmf(n, p, truncate_zero=True, reflect=mp.mpf(p) > mp.mpf('0.5')))
    for n, p in ((1000, '0.3'), (200, '0.6'), (100000, '0.45'), (150, '0.5')):
        yield 'Binomial2_%d_%s' % (n, p.replace('.', '_')), binomial_pmf(n, p)
    for mu in ('0.5', '4', '10', '10.0001', '25', '100', '1000'):
        yield 'Poisson_' + mu.replace('.', '_'), poisson_pmf(mu)
    for r, p in (('2.5', '0.4'), ('3.7', '0.8'), ('1', '0.5'), ('0.4', '0.95')):
        yield 'NegBinomial_%s_%s' % (r.replace('.', '_'), p.replace('.', '_')), negbin_pmf(r, p)


def merge_bins(probs):
    need = mp.mpf(20) / DRAWS
    keys = sorted(probs)
    bins = []  # (last value of the bin, probability)
    acc = mp.mpf(0)
    for k in keys:
        acc += probs[k]
        if acc >= need:
            bins.append([k, acc])
            acc = mp.mpf(0)
    # the rest (a tail too small for a bin of its own) joins the last bin; the first bin takes
    # everything below, the last everything above
    total = sum(probs.values())
    bins[-1][1] += acc
    bins[-1][1] += 1 - total  # mass beyond the table, if any
    return bins


def chi2_critical(df):
    df = mp.mpf(df)
    f = lambda x: mp.gammainc(df / 2, x / 2, mp.inf, regularized=True) - P_FAIL
    return solve(f, df, df + 40 * mp.sqrt(df) + 80)


def moments_of(probs):
    mean = sum(k * v for k, v in probs.items())
    var = sum((k - mean) ** 2 * v for k, v in probs.items())
    c4 = sum((k - mean) ** 4 * v for k, v in probs.items())
    return mean, var, c4


def lit(x):
    if mp.isnan(x):
        return 'kNaN'
    if mp.isinf(x):
        return 'kInf'
    return mp.nstr(x, 22, min_fixed=-mp.inf, max_fixed=mp.inf, strip_zeros=False) + 'L'


def sci(x):
    if mp.isnan(x):
        return 'kNaN'
    if mp.isinf(x):
        return 'kInf'
    return mp.nstr(x, 22) + 'L'


def xoshiro_reference():
    mask = (1 << 64) - 1
    x = 0
    s = []
    for _ in range(4):
        x = (x + 0x9E3779B97F4A7C15) & mask
        z = x
        z = ((z ^ (z >> 30)) * 0xBF58476D1CE4E5B9) & mask
        z = ((z ^ (z >> 27)) * 0x94D049BB133111EB) & mask
        s.append(z ^ (z >> 31))
    rotl = lambda v, k: ((v << k) | (v >> (64 - k))) & mask
    out = []
    for _ in range(3):
        out.append((rotl((s[1] * 5) & mask, 7) * 9) & mask)
        t = (s[1] << 17) & mask
        s[2] ^= s[0]
        s[3] ^= s[1]
        s[1] ^= s[2]
        s[0] ^= s[3]
        s[2] ^= t
        s[3] = rotl(s[3], 45)
    return out


def rnd(x, bits):
    with mp.workprec(bits):
        return +x


def normal_reference():
    ext = lambda s: rnd(mp.mpf(s), 64)

    def leva(u, v):
        v2 = rnd(rnd(rnd(v - ext('0.5'), 64) * ext('1.7156'), 64), 53)
        x = rnd(rnd(u - ext('0.449871'), 64), 53)
        y = rnd(rnd(abs(v2) + ext('0.386595'), 64), 53)
        with mp.workprec(64):
            t = +(ext('0.196') * y)
            t = +(t - +(ext('0.25472') * x))
            t = +(y * t)
            q = +(+(x * x) + t)
        q = rnd(q, 53)
        if q < ext('0.27597'):
            return True, v2
        if q > ext('0.27846'):
            return False, v2
        return v2 * v2 < -4 * u * u * mp.log(u), v2

    with mp.workprec(300):
        lines = ['', '// {v, 2 v2} for u = 0.5: v2 rounded once to double',
                 'inline constexpr long double kNormalRounding[][2] = {']
        for text in ('0.5021', '0.5065', '0.5089'):
            v = rnd(rnd(mp.mpf(text), 64), 53)  # the Extended literal, rounded to double on drawing
            once = rnd(rnd(rnd(v - mp.mpf('0.5'), 64) * rnd(mp.mpf('1.7156'), 64), 64), 53)
            lines.append('    {%sL, %sL},' % (text, float(2 * once).hex()))
        lines += ['};', '// {v, accepted, 2 v2} for u = 0.5 and q within 1e-15 of a bound',
                  'inline constexpr long double kNormalAtBounds[][3] = {']
        for text in ('0x1.f6fd66ad92a84p-1', '0x1.f6fd66ad92a85p-1', '0x1.f8972c00f75c0p-1',
                     '0x1.f8972c00f75c1p-1'):
            accepted, v2 = leva(mp.mpf(0.5), mp.mpf(float.fromhex(text)))
            lines.append('    {%sL, %d, %sL},' % (text, accepted, float(2 * v2).hex()))
        lines.append('};')
    return lines


def main():
    lines = ['// Generated by TOVRINRandom_reference.py (mpmath, 30 digits). Do not edit.', '']
    lines.append('inline constexpr int kReferenceBins = %d;' % BINS)
    lines.append('inline constexpr int kReferenceDraws = %d;' % DRAWS)
    lines.append('inline constexpr long double kChiSquareCriticalBins = %s;' % sci(chi2_critical(BINS - 1)))
    lines.append('inline constexpr std::uint64_t kXoshiroSeed0[3] = {%s};' %
                 ', '.join('0x%016XULL' % v for v in xoshiro_reference()))
    lines.append('')
    lines.append('inline const ContinuousReference kContinuous[] = {')
    for name, cdf, mom, bracket in continuous_cases():
        lo, hi = mp.mpf(bracket[0]), mp.mpf(bracket[1])
        pdf = getattr(cdf, 'pdf', None)
        edges = [quantile(cdf, mp.mpf(i) / BINS, lo, hi, pdf) for i in range(1, BINS)]
        lines.append('    {"%s", {%s},' % (name, ', '.join(sci(e) for e in edges)))
        lines.append('     %s, %s, %s},' % (sci(mom[0]), sci(mom[1]), sci(mom[2])))
        print(name, flush=True)
    lines.append('};')
    lines.append('')
    lines.append('inline const DiscreteReference kDiscrete[] = {')
    for name, probs in discrete_cases():
        bins = merge_bins(probs)
        mean, var, c4 = moments_of(probs)
        lines.append('    {"%s",' % name)
        lines.append('     {%s},' % ', '.join(str(b[0]) for b in bins))
        lines.append('     {%s},' % ', '.join(sci(b[1]) for b in bins))
        lines.append('     %s, %s, %s, %s},' % (sci(mean), sci(var), sci(c4), sci(chi2_critical(len(bins) - 1))))
        print(name, len(bins), flush=True)
    lines.append('};')
    lines.extend(normal_reference())
    with open(os.path.join(os.path.dirname(os.path.abspath(__file__)), 'TOVRINRandom_reference.inc'), 'w') as f:
        f.write('\n'.join(lines) + '\n')


if __name__ == '__main__':
    main()
