#!/usr/bin/env python3
"""Reference values for TOVRINFinancials_test.cpp, in exact rational arithmetic.

For each decimal literal L (as written with an L suffix in C++), find the 80-bit value the
compiler stores (nearest with a 64-bit significand, ties to even), multiply it by the money
scale in 80-bit arithmetic (the exact product rounded to 64 significant bits, ties to even) and
round that to the nearest integer, exact halves to even: the money rule. Also report what
rounding the exact product would give, to show which cases tell the two rules apart.
"""
from fractions import Fraction
import math


def nearest_ext(q: Fraction) -> Fraction:
    if q == 0:
        return q
    sign = -1 if q < 0 else 1
    a = abs(q)
    e = math.floor(math.log2(a.numerator) - math.log2(a.denominator))
    while Fraction(2) ** e > a:
        e -= 1
    while Fraction(2) ** (e + 1) <= a:
        e += 1
    ulp = Fraction(2) ** (e - 63)
    m = a / ulp
    n = round_half_even(m)
    return sign * n * ulp


def round_half_even(q: Fraction) -> int:
    f = math.floor(q)
    d = q - f
    if d > Fraction(1, 2) or (d == Fraction(1, 2) and f % 2 != 0):
        return f + 1
    return f


for lit, scale in [("1.005", 100), ("2.675", 100), ("0.125", 100), ("1.015", 100),
                   ("0.0000005", 1000000), ("1.23456", 10000), ("1.0000005", 1000000),
                   ("-1.005", 100), ("1234567.885", 100), ("0.00015", 10000),
                   ("0.00065", 10000), ("0.00035", 10000)]:
    x = nearest_ext(Fraction(lit))
    exact = round_half_even(x * scale)
    prod80 = nearest_ext(x * scale)
    twostep = round_half_even(prod80)
    print(f"{lit}L x {scale}: the 80-bit product {float(prod80)!r} rounds to {twostep}; "
          f"the exact product would round to {exact}; "
          f"literal {'above' if x > Fraction(lit) else 'below' if x < Fraction(lit) else 'equal to'} decimal")
