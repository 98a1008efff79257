// The library's own 80-bit elementary kernels: e^x, ln x and x^y in Extended. Each result is
// within one unit in the last place of the exact value and is the correctly rounded one in all
// but a small fraction of cases (bench/RESULTS.md); the special values are those of the C
// library's expl, logl and powl. Exp80 is inline (a call costs a third of its time); Ln80 is
// not, as reading the bits of an argument held in a register stalls where those of one passed in
// memory do not: a caller whose argument is still its own stack-passed parameter inlines
// LnInline instead.
//
// e^x is Tang's: x = (256 m + j) ln2/256 + r with |r| <= ln2/512, e^x = 2^m 2^(j/256) e^r,
// 2^(j/256) from a table in 64 + 53 bits and e^r - 1 a Taylor polynomial of degree 6; r is kept in
// two pieces so that only the last addition rounds at the scale of the result. ln x reduces
// x = 2^k m to t = m r - 1 with r ~ 1/m from a table (r a multiple of 2^-12, so m r is exact in
// two pieces and |t| < 2^-8.8), ln x = k ln2 - ln r + ln(1 + t) with a Taylor polynomial of
// degree 8, k ln2 - ln r being exact in one Extended. x^y (TOVRINElementary.cpp) is e^(y ln x)
// with ln x carried to about 85 bits and y ln x formed exactly in two pieces.
#pragma once

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {
namespace elementary {

#include "tovrin/foundation/TOVRINElementary_tables.inc"

inline constexpr Extended Inf = std::numeric_limits<Extended>::infinity();

// The layout of an Extended: the 64-bit significand with its explicit leading bit, then the sign
// and the biased exponent. The two are read separately (reading all 16 bytes at once stalls).
struct ExtendedBits {
  std::uint64_t significand;
  std::uint16_t signExponent;
  unsigned char padding[6];
};
static_assert(sizeof(ExtendedBits) == sizeof(Extended));
inline std::uint64_t SignificandOf(const Extended& x) {
  std::uint64_t s = 0;
  std::memcpy(&s, &x, sizeof s);
  return s;
}
inline unsigned SignExponentOf(const Extended& x) {
  std::uint16_t e = 0;
  std::memcpy(&e, reinterpret_cast<const unsigned char*>(&x) + sizeof(std::uint64_t), sizeof e);
  return e;
}
inline constexpr int ExponentBias = 16383;

// 2^m for a normal m (-16382 <= m <= 16383).
inline Extended TwoTo(int m) {
  return std::bit_cast<Extended>(
      ExtendedBits{std::uint64_t{1} << 63, static_cast<std::uint16_t>(m + ExponentBias), {}});
}

struct TwoPart {
  Extended hi, lo;
};

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

// ln x for any x, inline for callers whose argument is still in memory (an argument passed on
// the stack): Ln80 is this body out of line.
[[gnu::always_inline]] inline Extended LnInline(Extended x) {
  if (SignExponentOf(x) - 1u >= 0x7FFEu) {  // not a positive normal number
    if (x == 0) return -Inf;
    if (x < 0) return std::numeric_limits<Extended>::quiet_NaN();
    if (!(x < Inf)) return x + x;  // +inf or NaN
  }
  const LnReduced q = LnReduce(x);
  const Extended t = q.t, t2 = t * t;
  const Extended head = LnHead(q);
  const Extended s = head + t;  // fast two-sum
  const Extended e = t - (s - head);
  const Extended p = t2 * (-0.5L + t * (1.0 / 3) + t2 * (-0.25L + t * 0.2) +
                           t2 * t2 * ((-1.0 / 6) + t * (1.0 / 7) - t2 * 0.125L));
  return s + ((e + (q.tl * (1 - t) + LnTail(q))) + p);
}

}  // namespace elementary

// e^x: +inf above about 11356.52, +0 below about -11399.5, subnormal between.
[[gnu::always_inline]] inline Extended Exp80(Extended x) { return elementary::ExpChecked(x, 0); }
// e^(hi + lo) for a sum split exactly by the caller (such as -z*z/2 formed with its rounding
// error), |lo| at most a few units in the last place of hi.
[[gnu::always_inline]] inline Extended Exp80(Extended hi, Extended lo) {
  return elementary::ExpChecked(hi, lo);
}
// ln x: -inf at +-0, NaN below 0, +inf at +inf.
Extended Ln80(Extended x);
// x^y, with every special case of the C library's powl: x^0 = 1 and 1^y = 1 even for NaN, a
// negative x only with an integer y (else NaN), the signed zeros and infinities of 0 and inf
// raised to odd and even integers.
Extended Pow80(Extended x, Extended y);

}  // namespace tovrin::detail
