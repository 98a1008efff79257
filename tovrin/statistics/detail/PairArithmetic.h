// Numbers carried to twice the working precision as an unevaluated sum hi + lo, enough to form
// the arguments of the precise distribution functions (z = (x - mean) / sd, t^2 / (DF + t^2),
// x / mean) without rounding away the information that a far tail depends on.
#pragma once

#include <cmath>

#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/detail/ExactArithmetic.h"

namespace tovrin::detail {

struct Pair {
  Extended hi;
  Extended lo = 0.0L;
};

// a + b exactly (Knuth's TwoSum).
inline Pair ExactSum(Extended a, Extended b) {
  const Extended s = a + b;
  return {s, SumError(a, b, s)};
}

// a * b exactly (Dekker's product with Veltkamp's split), for products inside the range; a
// non-finite product comes back with lo = 0.
inline Pair ExactProduct(Extended a, Extended b) {
  const Extended p = a * b;
  if (!std::isfinite(p) || std::fabs(a) > 0x1p16000L || std::fabs(b) > 0x1p16000L) return {p};
  return {p, ProductError(a, b, p)};
}

inline Pair Renormalized(Extended hi, Extended lo) {
  const Pair s = ExactSum(hi, lo);
  return std::isfinite(s.hi) ? s : Pair{hi + lo};
}

inline Pair Sum(const Pair& a, const Pair& b) {
  const Pair s = ExactSum(a.hi, b.hi);
  return Renormalized(s.hi, s.lo + a.lo + b.lo);
}

inline Pair Product(const Pair& a, const Pair& b) {
  const Pair p = ExactProduct(a.hi, b.hi);
  return Renormalized(p.hi, p.lo + a.hi * b.lo + a.lo * b.hi);
}

// n / d with the remainder of the first quotient folded into lo.
inline Pair Quotient(const Pair& n, const Pair& d) {
  const Extended q = n.hi / d.hi;
  if (!std::isfinite(q) || q == 0.0L) return {q};
  const Pair qd = ExactProduct(q, d.hi);
  return Renormalized(q, (((n.hi - qd.hi) - qd.lo) + n.lo - q * d.lo) / d.hi);
}

}  // namespace tovrin::detail
