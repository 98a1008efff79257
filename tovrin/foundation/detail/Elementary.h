// The library's own 80-bit elementary kernels: e^x, ln x and x^y in Extended.
#pragma once

#include <cmath>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// e^x.
inline Extended Exp80(Extended x) { return std::exp(x); }
// e^(hi + lo) for a sum split exactly by the caller (such as -z*z/2 formed with its rounding
// error), |lo| at most a few units in the last place of hi.
inline Extended Exp80(Extended hi, Extended lo) { return std::exp(hi) * (1 + lo); }
// ln x.
inline Extended Ln80(Extended x) { return std::log(x); }
// x^y.
inline Extended Pow80(Extended x, Extended y) { return std::pow(x, y); }

}  // namespace tovrin::detail
