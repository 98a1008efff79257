// Error-free transformations in the 80-bit Extended type: the rounding error of a sum and of a
// product, so that a + b = s + SumError(a, b, s) and a * b = p + ProductError(a, b, p) exactly.
// The special functions and the precise distribution family build their double-length numbers
// on these.
#pragma once

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// For s = a + b rounded (Knuth's TwoSum; no condition on the order of a and b).
inline Extended SumError(Extended a, Extended b, Extended s) {
  const Extended bb = s - a;
  return (a - (s - bb)) + (b - bb);
}

// For p = a * b rounded (Dekker's product with Veltkamp's 32/32 split of the 64-bit
// significand). The split multiplies by 2^32 + 1: the caller keeps |a| and |b| below 2^16000
// and p finite.
inline Extended ProductError(Extended a, Extended b, Extended p) {
  constexpr Extended kSplitter = 4294967297.0L;  // 2^32 + 1
  const Extended ta = kSplitter * a;
  const Extended a_hi = ta - (ta - a);
  const Extended a_lo = a - a_hi;
  const Extended tb = kSplitter * b;
  const Extended b_hi = tb - (tb - b);
  const Extended b_lo = b - b_hi;
  return ((a_hi * b_hi - p) + a_hi * b_lo + a_lo * b_hi) + a_lo * b_lo;
}

}  // namespace tovrin::detail
