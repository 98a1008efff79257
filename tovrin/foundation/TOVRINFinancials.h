// Money conversions.
//
// The three money types hold a whole number of stored units: TQENCurrency hundredths,
// Currency ten-thousandths and TQENLongCurrency millionths of an amount.
//
// Rounding rule (every conversion that can lose digits): the result is the stored integer
// nearest to the exact value (the exact product X * scale for a float, the exact quotient for
// a conversion to a coarser money type); an exact half goes to the even integer. The product
// is never rounded to Extended first, so Float2QENCurrency(0.125) is 12 (a true half) while
// Float2QENCurrency(1.005L) is 100 or 101 as the binary value of 1.005L lies below or above
// the half.
//
// Range rule: a result that does not fit the stored integer of its type, and a NaN or an
// infinity, raise EMathError(rsInvalidValue); nothing is stored then.
#pragma once

#include <cmath>
#include <cstdint>
#include <type_traits>
#include <utility>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- To and from extended floats ------------------------------------------------------------
// The amount: stored integer / scale, correctly rounded to Extended.
Extended Currency2Float(TQENCurrency X);
Extended Currency2Float(TQENLongCurrency X);
Extended Currency2Float(Currency X);
// X as an amount: round(X * 100) and round(X * 1000000) by the rule above.
TQENCurrency Float2QENCurrency(Extended X);
TQENLongCurrency Float2QENLongCurrency(Extended X);

// --- Between money types ----------------------------------------------------------------------
// Widening conversions are exact; only QENCurrency2... never raises.
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

// X rounded to the nearest integer, an exact half to the even one, whatever the floating-point
// rounding mode. X must be finite.
inline Extended RoundHalfEven(Extended X) {
  const Extended a = std::fabs(X);
  if (!(a < 9223372036854775808.0L)) return X;             // 2^63 and beyond hold no fraction
  const auto whole = static_cast<std::uint64_t>(a);        // truncation is floor here
  const Extended frac = a - static_cast<Extended>(whole);  // exact (Sterbenz, or whole = 0)
  const std::uint64_t r = (frac > 0.5L || (frac == 0.5L && (whole & 1) != 0)) ? whole + 1 : whole;
  return X < 0 ? -static_cast<Extended>(r) : static_cast<Extended>(r);
}

// The rounding of the money arithmetic whose overflow is not reported (products by a
// constant, the Currency linear transform, grand means): X rounded half to even and reduced
// modulo 2^64 into an Int64 (two's complement); a NaN or an infinity gives -2^63, the x87
// integer indefinite. Storing into a TQENCurrency then keeps the low 32 bits.
Int64 RoundWrapping(Extended X);

// Q / D rounded to the nearest integer, an exact half to the even one, in integer
// arithmetic (0 < D <= 2^32).
Int64 DivRoundHalfEven(Int64 Q, Int64 D);

// Float X times the money scale of T, rounded by the rule of this header into T's stored
// integer; raises rsInvalidValue out of range. Float2QENCurrency and Float2QENLongCurrency
// are this for their types; the Currency instance serves float-to-Currency vector conversion.
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
