"""What the reference-table scripts (<unit>_reference.py) share: their pseudo-random inputs and
the ways they write a value as a C++ long double literal.

A script run in place finds this module in tovrin/testing beside its own folder; when
scripts/check-references.sh runs a script in a scratch folder, it puts tovrin/testing on
PYTHONPATH. Literals are written at the working precision the calling script has set on
mpmath's global context.
"""
from fractions import Fraction

import mpmath
from mpmath import inf, mpf, nstr, workprec


def lcg(seed):
    """Knuth's MMIX linear congruential generator, yielding the high 31 bits of each state."""
    state = seed
    while True:
        state = (state * 6364136223846793005 + 1442695040888963407) % 2**64
        yield state >> 33


def q2mp(q):
    """A Fraction as an mpf (rounded to the working precision)."""
    return mpf(q.numerator) / q.denominator


def ext(x):
    """x rounded to the 80-bit extended format (64-bit mantissa)."""
    with workprec(64):
        return +mpf(x)


def fixed_lit(x, digits=30):
    """A value as a decimal long double literal, fixed notation between 1e-5 and 1e5."""
    return nstr(mpf(x), digits, min_fixed=-5, max_fixed=5, strip_zeros=False) + "L"


def sci_lit(x):
    """A C++ long double literal in scientific notation that reads back as x (exact for values
    of 64-bit mantissa); infinity is written kInf."""
    x = mpf(x)
    if x == 0:
        return "0.0L"
    if x == inf:
        return "kInf"
    return nstr(x, 30, min_fixed=1, max_fixed=0, strip_zeros=False) + "L"


def exact_lit(q):
    """A dyadic rational as an exact decimal literal."""
    q = Fraction(q)
    assert q.denominator & (q.denominator - 1) == 0
    text = nstr(mpf(q.numerator) / q.denominator, 40, min_fixed=-40, max_fixed=40)
    if "." not in text:
        text += ".0"
    return text + "L"


def hexfloat(x):
    """An mpf as an exact C++ long double hex literal (x must fit in 64 bits of mantissa)."""
    x = mpf(x)
    if x == 0:
        return "0.0L"
    sign = "-" if x < 0 else ""
    man, exp = mpmath.mpf(abs(x)).man_exp
    assert man.bit_length() <= 64, "value does not fit the extended format"
    return f"{sign}0x{man:x}p{exp}L"
