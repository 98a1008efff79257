// Money conversions.
//
// The three money types hold a whole number of stored units: TQENCurrency hundredths,
// Currency ten-thousandths and TQENLongCurrency millionths of an amount.
//
// Rounding rule (every conversion that can lose digits, and every money operation of the
// currency units): all float work is done in Extended, so a float X becomes the stored integer
// nearest to the Extended product X * scale, an exact half going to the even integer; a
// conversion to a coarser money type rounds the quotient of the stored integers the same way
// (that quotient is never moved across a half by rounding). Float2QENCurrency(0.125) is 12 and
// Float2QENCurrency(2.675L) is 268: the binary value of 2.675L lies just below 2.675, but its
// product by 100 rounded to Extended is exactly 267.5.
//
// Overflow rule: overflow is not reported. A rounded value beyond the stored integer's range is
// reduced modulo 2^64 into 64 bits (two's complement), and a TQENCurrency keeps the low 32 bits
// of that; a NaN or an infinity gives the integer indefinite -2^63 (0 in a TQENCurrency). No
// conversion raises.
#pragma once

#include <cmath>
#include <cstdint>
#include <cstring>
#include <type_traits>
#include <utility>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- To and from extended floats ------------------------------------------------------------
// The amount: stored integer / scale, correctly rounded to Extended.
Extended Currency2Float(TQENCurrency X);
Extended Currency2Float(TQENLongCurrency X);
Extended Currency2Float(Currency X);
// X as an amount: round(X * 100) and round(X * 1000000) by the rules above.
TQENCurrency Float2QENCurrency(Extended X);
TQENLongCurrency Float2QENLongCurrency(Extended X);

// --- Between money types ----------------------------------------------------------------------
// QENCurrency2QENLongCurrency and QENCurrency2Currency are exact; the others round and wrap by
// the rules above.
TQENLongCurrency QENCurrency2QENLongCurrency(TQENCurrency X);
Currency QENCurrency2Currency(TQENCurrency X);
TQENCurrency QENLongCurrency2QENCurrency(TQENLongCurrency X);  // round(stored / 10000)
Currency QENLongCurrency2Currency(TQENLongCurrency X);         // round(stored / 100)
TQENCurrency Currency2QENCurrency(Currency X);                 // round(stored / 100)
TQENLongCurrency Currency2QENLongCurrency(Currency X);         // stored * 100

// Two Currency values are the same when their stored integers are equal (money is exact).
bool SameCurrency(Currency X, Currency Y);

inline void SwapXY(TQENCurrency& X, TQENCurrency& Y) { std::swap(X, Y); }
inline void SwapXY(TQENLongCurrency& X, TQENLongCurrency& Y) { std::swap(X, Y); }
inline void SwapXY(Currency& X, Currency& Y) { std::swap(X, Y); }

namespace detail {

// The number of stored units in one amount of each money type.
template <typename T>
inline constexpr Int64 kMoneyScale = 0;
template <>
inline constexpr Int64 kMoneyScale<TQENCurrency> = 100;
template <>
inline constexpr Int64 kMoneyScale<TQENLongCurrency> = 1000000;
template <>
inline constexpr Int64 kMoneyScale<Currency> = 10000;

// The stored integer of X, widened to Int64.
template <typename T>
constexpr Int64 StoredOf(T X) {
  return static_cast<Int64>(static_cast<std::underlying_type_t<T>>(X));
}

// A magnitude 0 <= A < 2^63 split into its whole part and how its fraction compares with
// one half (-1 below, 0 equal, +1 above), read from the bits of the 80-bit value (explicit
// integer bit, biased exponent): no floating-point rounding or conversion takes part, so the
// answer is the same whatever the rounding mode.
struct MagnitudeAtHalf {
  std::uint64_t Whole;
  int VsHalf;
};
inline MagnitudeAtHalf SplitAtHalf(Extended A) {
  std::uint64_t significand = 0;
  std::uint16_t signAndExponent = 0;
  std::memcpy(&significand, &A, sizeof significand);
  std::memcpy(&signAndExponent, reinterpret_cast<const unsigned char*>(&A) + 8,
              sizeof signAndExponent);
  const int k = (signAndExponent & 0x7fff) - 16383;  // A in [2^k, 2^(k+1))
  constexpr std::uint64_t kHalf = std::uint64_t{1} << 63;
  if (k < -1) return {0, -1};
  if (k == -1) return {0, significand > kHalf ? 1 : significand == kHalf ? 0 : -1};
  const std::uint64_t whole = significand >> (63 - k);
  const std::uint64_t fraction = significand << (k + 1);  // k <= 62 here
  return {whole, fraction > kHalf ? 1 : fraction == kHalf ? 0 : -1};
}

// The nearest whole number to a magnitude 0 <= A < 2^63, an exact half to the even one.
inline std::uint64_t RoundMagnitudeHalfEven(Extended A) {
  const MagnitudeAtHalf s = SplitAtHalf(A);
  return s.Whole + ((s.VsHalf > 0 || (s.VsHalf == 0 && (s.Whole & 1) != 0)) ? 1 : 0);
}

// X rounded to the nearest integer, an exact half to the even one, whatever the rounding mode.
inline Extended RoundHalfEven(Extended X) {
  const Extended a = std::fabs(X);
  if (!(a < 9223372036854775808.0L)) return X;  // 2^63 and beyond hold no fraction (or NaN)
  const auto r = static_cast<Extended>(RoundMagnitudeHalfEven(a));
  return X < 0 ? -r : r;
}

// The rounding of all money arithmetic and conversion: X rounded half to even and reduced
// modulo 2^64 into an Int64 (two's complement); a NaN or an infinity gives -2^63, the x87
// integer indefinite. Storing into a TQENCurrency then keeps the low 32 bits.
Int64 RoundWrapping(Extended X);

// Q / D rounded to the nearest integer, an exact half to the even one, in integer
// arithmetic (0 < D <= 2^32).
Int64 DivRoundHalfEven(Int64 Q, Int64 D);

// Float X times the money scale of T, rounded and wrapped by the rules of this header into T's
// stored integer. Float2QENCurrency and Float2QENLongCurrency are this for their types; the
// Currency instance serves float-to-Currency vector conversion.
template <typename T>
T Float2Money(Extended X);
template <>
TQENCurrency Float2Money<TQENCurrency>(Extended X);
template <>
TQENLongCurrency Float2Money<TQENLongCurrency>(Extended X);
template <>
Currency Float2Money<Currency>(Extended X);

// Low 32 bits of X as a TQENCurrency (the wrapping store).
constexpr TQENCurrency WrapToCurr(Int64 X) {
  return static_cast<TQENCurrency>(
      static_cast<LongInt>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(X))));
}

}  // namespace detail

}  // namespace tovrin
