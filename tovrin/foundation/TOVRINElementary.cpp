// The 80-bit elementary kernels. e^x is Tang's: x = (256 m + j) ln2/256 + r with |r| <= ln2/512,
// e^x = 2^m 2^(j/256) e^r, 2^(j/256) from a table in 64 + 53 bits and e^r - 1 a Taylor
// polynomial of degree 6; the reduction keeps r in two pieces so that only the last addition
// rounds at the scale of the result. ln x reduces x = 2^k m to t = m r - 1 with r ~ 1/m from a
// table (r a multiple of 2^-12, so m r is exact in two pieces and |t| < 2^-8.8), ln x = k ln2 -
// ln r + ln(1 + t) with a Taylor polynomial of degree 8, k ln2 + (-ln r) being exact. x^y is
// e^(y ln x) with ln x carried to about 85 bits and y ln x formed exactly in two pieces.
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>

#include "tovrin/foundation/detail/Elementary.h"

namespace tovrin::detail {
namespace {

#include "tovrin/foundation/TOVRINElementary_tables.inc"

constexpr Extended Inf = std::numeric_limits<Extended>::infinity();

// The layout of an Extended: the 64-bit significand with its explicit leading bit, then the sign
// and the biased exponent. The two are read separately (reading all 16 bytes at once stalls).
struct ExtendedBits {
  std::uint64_t significand;
  std::uint16_t signExponent;
  unsigned char padding[6];
};
static_assert(sizeof(ExtendedBits) == sizeof(Extended));
std::uint64_t SignificandOf(const Extended& x) {
  std::uint64_t s = 0;
  std::memcpy(&s, &x, sizeof s);
  return s;
}
unsigned SignExponentOf(const Extended& x) {
  std::uint16_t e = 0;
  std::memcpy(&e, reinterpret_cast<const unsigned char*>(&x) + sizeof(std::uint64_t), sizeof e);
  return e;
}
constexpr int ExponentBias = 16383;

// 2^m for a normal m (-16382 <= m <= 16383).
Extended TwoTo(int m) {
  return std::bit_cast<Extended>(
      ExtendedBits{std::uint64_t{1} << 63, static_cast<std::uint16_t>(m + ExponentBias), {}});
}

struct TwoPart {
  Extended hi, lo;
};
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

// e^(hi + lo) for -11400 <= hi <= 11357 and |lo| small beside ln2/512.
[[gnu::always_inline]] inline Extended ExpCore(Extended hi, Extended lo) {
  // n = hi * 256/ln2 rounded to an integer: adding 1.5 2^63 leaves it in the low bits.
  constexpr Extended Shifter = 0x1.8p63L;
  const Extended shifted = hi * InvLn2By256 + Shifter;
  const Extended nf = shifted - Shifter;
  const auto n = static_cast<std::int64_t>(SignificandOf(shifted) - 0xC000000000000000u);
  // hi - n ln2_hi is exact (Sterbenz; n ln2_hi itself is exact, ln2_hi having 41 bits).
  const Extended rHi = hi - nf * Ln2By256Hi;
  const Extended rLo = lo - nf * Ln2By256Lo;
  const Extended r = rHi + rLo;
  const Extended r2 = r * r;
  // (Coefficients in double where their rounding is far below the result's.)
  const Extended q =
      r2 * (0.5L + r * (1.0 / 6)) + r2 * r2 * ((1.0 / 24) + r * (1.0 / 120) + r2 * (1.0 / 720));
  const Extended p = rHi + (rLo + q);  // e^r - 1
  const auto j = static_cast<int>(n & 255);
  const auto m = static_cast<int>(n >> 8);
  const Extended t = ExpTableHi[j];
  const Extended s = t + (ExpTableLo[j] + t * p);
  if (m >= -1022 && m <= 1023)
    return s * std::bit_cast<double>(static_cast<std::uint64_t>(m + 1023) << 52);
  if (m > 16383) return (s * TwoTo(m - 1)) * 2;  // overflows unless s < 1
  if (m >= -16382) return s * TwoTo(m);
  return (s * TwoTo(m + 128)) * 0x1p-128L;  // one rounding into the subnormals
}

[[gnu::always_inline]] inline Extended ExpChecked(Extended hi, Extended lo) {
  if (hi > 11357) return Inf;
  if (hi < -11400) return 0;
  if (std::isnan(hi)) return hi + hi;
  return ExpCore(hi, lo);
}

// x = 2^k m, m r_j = 1 + t + tl exactly with |t| < 2^-8.8, for a positive finite x.
struct LnReduced {
  int k, j;
  Extended t, tl;
};
[[gnu::always_inline]] inline LnReduced LnReduce(Extended x) {
  std::uint64_t s = SignificandOf(x);
  int k = static_cast<int>(SignExponentOf(x)) - ExponentBias;
  if (k == -ExponentBias) {  // subnormal
    const Extended scaled = x * 0x1p64L;
    s = SignificandOf(scaled);
    k = static_cast<int>(SignExponentOf(scaled)) - ExponentBias - 64;
  }
  // The nearest of 1 + j/256 to m = s 2^-63, j = 0..256.
  const auto j = static_cast<int>(((s >> 54) - 511) >> 1);
  const Extended r = LnTableR[j];
  // m = mHi + mLo, 32 bits each: mHi r and mLo r are exact, and so is mHi r - 1.
  const Extended mHi = static_cast<Extended>(static_cast<std::int64_t>(s >> 32)) * 0x1p-31L;
  const Extended mLo = static_cast<Extended>(static_cast<std::int64_t>(s & 0xFFFFFFFFu)) * 0x1p-63L;
  const Extended a = mHi * r - 1;
  const Extended b = mLo * r;
  // Fast two-sum: |a| >= |b| whenever a + b is inexact.
  const Extended t = a + b;
  // r_256 = 1/2: ln x = (k + 1) ln2 + ln(1 + t), exactly ln(1 + t) just below x = 1.
  return {k + (j >> 8), j & 255, t, b - (t - a)};
}

// k ln2 - ln r_j, exact in one Extended (both terms are multiples of 2^-48).
[[gnu::always_inline]] inline Extended LnHead(const LnReduced& q) {
  return static_cast<Extended>(q.k) * Ln2Hi + LnTableHi[q.j];  // (not in double)
}
[[gnu::always_inline]] inline Extended LnTail(const LnReduced& q) {
  return q.k * Ln2Lo + LnTableLo[q.j];
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

Extended Exp80(Extended x) { return ExpChecked(x, 0); }
Extended Exp80(Extended hi, Extended lo) { return ExpChecked(hi, lo); }

Extended Ln80(Extended x) {
  if (SignExponentOf(x) - 1u >= 0x7FFEu) {  // not a positive normal number
    if (x == 0) return -Inf;
    if (x < 0) return std::numeric_limits<Extended>::quiet_NaN();
    if (!(x < Inf)) return x + x;  // +inf or NaN
  }
  const LnReduced q = LnReduce(x);
  const Extended t = q.t, t2 = t * t;
  const Extended head = LnHead(q);
  const Extended s = head + t;  // fast two-sum, as in LnTwoPart
  const Extended e = t - (s - head);
  const Extended p = t2 * (-0.5L + t * (1.0 / 3) + t2 * (-0.25L + t * 0.2) +
                           t2 * t2 * ((-1.0 / 6) + t * (1.0 / 7) - t2 * 0.125L));
  return s + ((e + (q.tl * (1 - t) + LnTail(q))) + p);
}

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
