// The library's own 80-bit elementary kernels: e^x, ln x and x^y in Extended (Tang's
// table-driven reductions, TOVRINElementary.cpp). Each result is within one unit in the last
// place of the exact value and is the correctly rounded one in all but a small fraction of
// cases (bench/RESULTS.md); the special values are those of the C library's expl, logl and powl.
#pragma once

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// e^x: +inf above about 11356.52, +0 below about -11399.5, subnormal between.
Extended Exp80(Extended x);
// e^(hi + lo) for a sum split exactly by the caller (such as -z*z/2 formed with its rounding
// error), |lo| at most a few units in the last place of hi.
Extended Exp80(Extended hi, Extended lo);
// ln x: -inf at +-0, NaN below 0, +inf at +inf.
Extended Ln80(Extended x);
// x^y, with every special case of the C library's powl: x^0 = 1 and 1^y = 1 even for NaN, a
// negative x only with an integer y (else NaN), the signed zeros and infinities of 0 and inf
// raised to odd and even integers.
Extended Pow80(Extended x, Extended y);

}  // namespace tovrin::detail
