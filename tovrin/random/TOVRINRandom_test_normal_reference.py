#!/usr/bin/env python3
"""Exact reference values for RandomNormal.TransformedVIsRoundedOnceToDouble.

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
