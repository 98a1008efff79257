// ln x and x^y for the 80-bit kernels (detail/Elementary.h): x^y is e^(y ln x) with ln x carried
// to about 85 bits and the product y ln x formed exactly in two pieces.
#include <cmath>
#include <cstdint>
#include <limits>

#include "tovrin/foundation/detail/Elementary.h"

namespace tovrin::detail {
namespace {

using namespace elementary;

// a = hi + lo with hi holding the upper 32 bits of a's significand (Veltkamp).
[[gnu::always_inline]] inline TwoPart Split(Extended a) {
  const Extended c = a * 0x1.00000001p32L;
  const Extended hi = c - (c - a);
  return {hi, a - hi};
}
// a b = hi + lo exactly (Dekker).
[[gnu::always_inline]] inline TwoPart TwoProduct(Extended a, Extended b) {
  const Extended p = a * b;
  const TwoPart as = Split(a), bs = Split(b);
  return {p, ((as.hi * bs.hi - p) + as.hi * bs.lo + as.lo * bs.hi) + as.lo * bs.lo};
}

// ln x = hi + lo with a relative error of about 2^-85, for a positive finite x.
[[gnu::always_inline]] inline TwoPart LnTwoPart(Extended x) {
  const LnReduced q = LnReduce(x);
  const Extended t = q.t, t2 = t * t;
  const Extended head = LnHead(q);
  // |head| >= |t| unless head = 0: the sums below are fast two-sums.
  const Extended s = head + t;
  const Extended e = t - (s - head);
  // t^2/2 = half + halfLo: the 32-bit head's square is exact, the rest far below it.
  const TwoPart ts = Split(t);
  const Extended half = ts.hi * ts.hi * 0.5L;
  const Extended halfLo = ts.lo * (ts.hi + ts.lo * 0.5L);
  const Extended s2 = s - half;
  const Extended e2 = (s - s2) - half;
  const Extended p3 = t * t2 *
                      ((1.0L / 3) - t * 0.25L + t2 * (0.2 - t * (1.0 / 6)) +
                       t2 * t2 * ((1.0 / 7) - t * 0.125L + t2 * ((1.0 / 9) - t * 0.1)));
  // ln(1 + t + tl) = t + tl - t^2/2 - t tl + t^3/3 ...
  const Extended lo = e + e2 + ((q.tl * (1 - t) - halfLo + LnTail(q)) + p3);
  const Extended hi = s2 + lo;
  return {hi, lo - (hi - s2)};
}

// 0 for a y that is not an integer, 1 for an odd integer, 2 for an even one (or an infinity).
int Parity(Extended y) {
  const Extended ay = std::fabs(y);
  if (!(ay < 0x1p64L)) return 2;
  // ay + 2^63 - 2^63 rounds ay to an integer below 2^63; at and above, ay is one.
  if (ay < 0x1p63L) {
    const Extended shifted = ay + 0x1p63L;
    if (shifted - 0x1p63L != ay) return 0;
    return (SignificandOf(shifted) & 1) != 0 ? 1 : 2;
  }
  return (SignificandOf(ay) & 1) != 0 ? 1 : 2;
}

}  // namespace

Extended Ln80(Extended x) { return LnInline(x); }

Extended Pow80(Extended x, Extended y) {
  // The common case first, told from the exponent bits alone: x positive and normal, y normal
  // with |y| < 2^91.
  const unsigned yExponent = SignExponentOf(y) & 0x7FFFu;
  if (SignExponentOf(x) - 1u < 0x7FFEu && yExponent - 1u < ExponentBias + 90u) {
    const TwoPart l = LnTwoPart(x);
    const TwoPart z = TwoProduct(y, l.hi);
    return ExpChecked(z.hi, z.lo + y * l.lo);
  }
  if (y == 0 || x == 1) return 1;
  if (std::isnan(x) || std::isnan(y)) return x + y;
  const Extended ax = std::fabs(x), ay = std::fabs(y);
  bool negate = false;
  if (SignExponentOf(x) >= 0x8000u) {  // x negative, -0 or -inf
    const int parity = Parity(y);
    if (parity == 0 && ax != 0 && ax != Inf) return std::numeric_limits<Extended>::quiet_NaN();
    negate = parity == 1;
  }
  Extended result;
  if (ay == Inf) {
    if (ax == 1) return 1;
    result = (ax < 1) == (y < 0) ? Inf : 0;
  } else if (ax == 0) {
    result = y < 0 ? Inf : 0;
  } else if (ax == Inf) {
    result = y < 0 ? 0 : Inf;
  } else if (ay > 0x1p90L) {  // |y ln x| > 2^25 unless x = 1
    result = (ax < 1) == (y < 0) ? Inf : 0;
  } else {
    const TwoPart l = LnTwoPart(ax);
    const TwoPart z = TwoProduct(y, l.hi);
    result = ExpChecked(z.hi, z.lo + y * l.lo);
  }
  return negate ? -result : result;
}

}  // namespace tovrin::detail
