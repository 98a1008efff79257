#include "tovrin/foundation/TOVRINFinancials.h"

#include <cmath>
#include <cstdint>

namespace tovrin {
namespace {

constexpr Extended kTwo63 = 9223372036854775808.0L;   // 2^63
constexpr Extended kTwo64 = 18446744073709551616.0L;  // 2^64

// The integer nearest to the exact product X * Scale (exact halves to even), for a finite X
// with |X * Scale| < 2^64. Scale is a small positive integer (at most 2^20), so the product's
// rounding error is recovered exactly by Dekker's two-product with X split into halves of 32
// bits each and Scale left whole: Hi * Scale and Lo * Scale are then exact.
Extended RoundExactProduct(Extended X, Int64 Scale) {
  const auto s = static_cast<Extended>(Scale);
  const Extended p = X * s;
  constexpr Extended kSplitter = 4294967297.0L;  // 2^32 + 1
  const Extended c = X * kSplitter;
  const Extended hi = c - (c - X);
  const Extended lo = X - hi;
  const Extended err = (hi * s - p) + lo * s;  // X * Scale = p + err exactly
  Extended n = detail::RoundHalfEven(p);
  // Only a half at p's level can be moved by err (|err| is at most half an ulp of p, and
  // every p below 2^63 has an ulp of at most 1/2).
  const Extended d = p - n;
  if (d == 0.5L && err > 0) n += 1;
  if (d == -0.5L && err < 0) n -= 1;
  return n;
}

// The rounded product as the stored integer of a type whose range is [Low, High].
Int64 ScaleFloat(Extended X, Int64 Scale, Extended Low, Extended High) {
  // The comparison is false for a NaN, and the bound keeps the splitting free of overflow.
  if (!(std::fabs(X) < kTwo64 / static_cast<Extended>(Scale))) {
    detail::RaiseMathError(rsInvalidValue);
  }
  const Extended n = RoundExactProduct(X, Scale);
  if (n < Low || n > High) detail::RaiseMathError(rsInvalidValue);
  return static_cast<Int64>(n);
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
  Extended r = std::fmod(RoundHalfEven(X), kTwo64);  // exact, in (-2^64, 2^64)
  if (r < 0) r += kTwo64;                            // exact: an integer below 2^64
  return static_cast<Int64>(static_cast<std::uint64_t>(r));
}

template <>
TQENCurrency Float2Money<TQENCurrency>(Extended X) {
  return static_cast<TQENCurrency>(static_cast<LongInt>(
      ScaleFloat(X, kMoneyScale<TQENCurrency>, static_cast<Extended>(INT32_MIN),
                 static_cast<Extended>(INT32_MAX))));
}
template <>
TQENLongCurrency Float2Money<TQENLongCurrency>(Extended X) {
  return static_cast<TQENLongCurrency>(
      ScaleFloat(X, kMoneyScale<TQENLongCurrency>, -kTwo63, kTwo63 - 1));
}
template <>
Currency Float2Money<Currency>(Extended X) {
  return static_cast<Currency>(ScaleFloat(X, kMoneyScale<Currency>, -kTwo63, kTwo63 - 1));
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
