#include "tovrin/foundation/TOVRINFinancials.h"

#include <cmath>
#include <cstdint>

namespace tovrin {
namespace {

constexpr Extended kTwo63 = 9223372036854775808.0L;   // 2^63
constexpr Extended kTwo64 = 18446744073709551616.0L;  // 2^64

// The integer nearest to the exact product X * Scale (exact halves to even) as the stored
// integer of a type whose range is [Low, High]; rsInvalidValue beyond it, for a NaN and for an
// infinity. Scale is a small positive integer (at most 2^20), so the rounding error of the
// product p = X * Scale is recovered exactly by Dekker's two-product with X split into halves
// of 32 bits and Scale left whole (Hi * Scale and Lo * Scale are then exact). Only a half at
// p's own level can be moved by that error: |err| is at most half an ulp of p and, below 2^63,
// a fraction other than a half lies at least one ulp away from it.
Int64 ScaleFloat(Extended X, Int64 Scale, Int64 Low, Int64 High) {
  const auto s = static_cast<Extended>(Scale);
  // False for a NaN; the bound keeps the splitting free of overflow.
  if (!(std::fabs(X) < kTwo64 / s)) detail::RaiseMathError(rsInvalidValue);
  const Extended p = X * s;
  constexpr Extended kSplitter = 4294967297.0L;  // 2^32 + 1
  const Extended c = X * kSplitter;
  const Extended hi = c - (c - X);
  const Extended lo = X - hi;
  const Extended err = (hi * s - p) + lo * s;  // X * Scale = p + err exactly
  Int64 n = INT64_MIN;                         // p = -2^63 rounds to itself
  if (p != -kTwo63) {
    const Extended a = std::fabs(p);
    if (!(a < kTwo63)) detail::RaiseMathError(rsInvalidValue);
    const detail::MagnitudeAtHalf m = detail::SplitAtHalf(a);
    const Extended away = p < 0 ? -err : err;  // the error measured away from zero
    const bool up = m.VsHalf > 0 || (m.VsHalf == 0 && (away > 0 || (away == 0 && (m.Whole & 1))));
    const std::uint64_t magnitude = m.Whole + (up ? 1 : 0);  // at most 2^63
    if (p < 0) {
      n = static_cast<Int64>(std::uint64_t{0} - magnitude);  // -2^63 included
    } else {
      if (magnitude > static_cast<std::uint64_t>(INT64_MAX)) detail::RaiseMathError(rsInvalidValue);
      n = static_cast<Int64>(magnitude);
    }
  }
  if (n < Low || n > High) detail::RaiseMathError(rsInvalidValue);
  return n;
}

TQENCurrency CheckedCurr(Int64 X) {
  if (X < INT32_MIN || X > INT32_MAX) detail::RaiseMathError(rsInvalidValue);
  return static_cast<TQENCurrency>(static_cast<LongInt>(X));
}

// X * Factor with a raise instead of an overflow (Factor > 0).
Int64 CheckedScaleUp(Int64 X, Int64 Factor) {
  if (X > INT64_MAX / Factor || X < INT64_MIN / Factor) detail::RaiseMathError(rsInvalidValue);
  return X * Factor;
}

}  // namespace

namespace detail {

Int64 DivRoundHalfEven(Int64 Q, Int64 D) {
  Int64 quot = Q / D;  // truncated toward zero
  const Int64 rem = Q % D;
  const Int64 twice = rem < 0 ? -2 * rem : 2 * rem;  // |rem| < D <= 2^32: no overflow
  if (twice > D || (twice == D && quot % 2 != 0)) quot += (Q < 0 ? -1 : 1);
  return quot;
}

Int64 RoundWrapping(Extended X) {
  if (!std::isfinite(X)) return INT64_MIN;
  const Extended a = std::fabs(X);
  std::uint64_t magnitude = 0;  // |X| rounded, modulo 2^64
  if (a < kTwo63) {
    magnitude = RoundMagnitudeHalfEven(a);
  } else {
    magnitude = static_cast<std::uint64_t>(std::fmod(a, kTwo64));  // whole already; exact
  }
  return static_cast<Int64>(X < 0 ? std::uint64_t{0} - magnitude : magnitude);
}

template <>
TQENCurrency Float2Money<TQENCurrency>(Extended X) {
  return static_cast<TQENCurrency>(
      static_cast<LongInt>(ScaleFloat(X, kMoneyScale<TQENCurrency>, INT32_MIN, INT32_MAX)));
}
template <>
TQENLongCurrency Float2Money<TQENLongCurrency>(Extended X) {
  return static_cast<TQENLongCurrency>(
      ScaleFloat(X, kMoneyScale<TQENLongCurrency>, INT64_MIN, INT64_MAX));
}
template <>
Currency Float2Money<Currency>(Extended X) {
  return static_cast<Currency>(ScaleFloat(X, kMoneyScale<Currency>, INT64_MIN, INT64_MAX));
}

}  // namespace detail

Extended Currency2Float(TQENCurrency X) {
  return static_cast<Extended>(detail::StoredOf(X)) / detail::kMoneyScale<TQENCurrency>;
}
Extended Currency2Float(TQENLongCurrency X) {
  return static_cast<Extended>(detail::StoredOf(X)) / detail::kMoneyScale<TQENLongCurrency>;
}
Extended Currency2Float(Currency X) {
  return static_cast<Extended>(detail::StoredOf(X)) / detail::kMoneyScale<Currency>;
}

TQENCurrency Float2QENCurrency(Extended X) { return detail::Float2Money<TQENCurrency>(X); }
TQENLongCurrency Float2QENLongCurrency(Extended X) {
  return detail::Float2Money<TQENLongCurrency>(X);
}

TQENLongCurrency QENCurrency2QENLongCurrency(TQENCurrency X) {
  return static_cast<TQENLongCurrency>(detail::StoredOf(X) * 10000);
}
Currency QENCurrency2Currency(TQENCurrency X) {
  return static_cast<Currency>(detail::StoredOf(X) * 100);
}
TQENCurrency QENLongCurrency2QENCurrency(TQENLongCurrency X) {
  return CheckedCurr(detail::DivRoundHalfEven(detail::StoredOf(X), 10000));
}
Currency QENLongCurrency2Currency(TQENLongCurrency X) {
  return static_cast<Currency>(detail::DivRoundHalfEven(detail::StoredOf(X), 100));
}
TQENCurrency Currency2QENCurrency(Currency X) {
  return CheckedCurr(detail::DivRoundHalfEven(detail::StoredOf(X), 100));
}
TQENLongCurrency Currency2QENLongCurrency(Currency X) {
  return static_cast<TQENLongCurrency>(CheckedScaleUp(detail::StoredOf(X), 100));
}

bool SameCurrency(Currency X, Currency Y) { return X == Y; }

}  // namespace tovrin
