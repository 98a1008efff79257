#!/usr/bin/env python3
"""Exact reference values for RandomNormal.TransformedVIsRoundedOnceToDouble and
RandomNormal.PairsAtTheBoundsFollowTheExtendedQuotient.

The standard normal holds its uniforms and the transformed v = (v - 0.5) * 1.7156 as doubles,
but computes v in 80-bit arithmetic with the 80-bit constant 1.7156 and rounds once to double
when storing it. This script redoes that with mpmath at an explicit precision (64-bit mantissa
for the Extended steps, 53-bit for the double store) and prints, for a few scripted second
uniforms v with the first uniform u = 0.5 (accepted at once, so the result is v / 0.5 = 2 v),
the expected result beside the result that plain double arithmetic (a double constant and a
double product) would give instead. The listed cases are ones where the two differ.
"""
import mpmath as mp
from mpmath import mpf

mp.mp.prec = 300


def rnd(x, bits):
    with mp.workprec(bits):
        return +x


C64 = rnd(mpf('1.7156'), 64)  # the Extended literal 1.7156
C53 = rnd(mpf('1.7156'), 53)  # the double literal 1.7156

for text in ('0.5021', '0.5065', '0.5089'):
    v = rnd(rnd(mpf(text), 64), 53)  # the Extended literal, rounded to double on drawing
    once = rnd(rnd(rnd(v - mpf('0.5'), 64) * C64, 64), 53)
    plain = rnd(rnd(v - mpf('0.5'), 53) * C53, 53)
    print(text, 'expected', float(2 * once).hex(), 'double arithmetic', float(2 * plain).hex())

# Pairs (u = 0.5, v) whose q lies within 1e-15 of one of the bounds 0.27597 and 0.27846 (for
# RandomNormal.PairsAtTheBoundsFollowTheExtendedQuotient): the outcome of each test as the
# method states it, with x, y, q worked out in Extended and stored as doubles, and 2 v.
E = lambda s: rnd(mpf(s), 64)


def leva(u, v):
    v2 = rnd(rnd(rnd(v - E('0.5'), 64) * E('1.7156'), 64), 53)
    x = rnd(rnd(u - E('0.449871'), 64), 53)
    y = rnd(rnd(abs(v2) + E('0.386595'), 64), 53)
    with mp.workprec(64):
        t = +(E('0.196') * y)
        t = +(t - +(E('0.25472') * x))
        t = +(y * t)
        q = +(+(x * x) + t)
    q = rnd(q, 53)
    if q < E('0.27597'):
        return 'accepted by the inner bound', v2
    if q > E('0.27846'):
        return 'rejected by the outer bound', v2
    return ('accepted' if v2 * v2 < -4 * u * u * mp.log(u) else 'rejected') + ' by the log test', v2


for text in ('0x1.f6fd66ad92a84p-1', '0x1.f6fd66ad92a85p-1', '0x1.f8972c00f75c0p-1',
             '0x1.f8972c00f75c1p-1'):
    kind, v2 = leva(mpf(0.5), mpf(float.fromhex(text)))
    print(text, kind, 'result if accepted', float(2 * v2).hex())
