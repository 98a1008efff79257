#include "tovrin/currency/TOVRINFinancials.h"

#include <cmath>
#include <cstdint>

namespace tovrin {
namespace {

constexpr Extended kTwo63 = 9223372036854775808.0L;   // 2^63
constexpr Extended kTwo64 = 18446744073709551616.0L;  // 2^64

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
  return WrapToCurr(RoundWrapping(X * kMoneyScale<TQENCurrency>));
}
template <>
TQENLongCurrency Float2Money<TQENLongCurrency>(Extended X) {
  return TQENLongCurrency{RoundWrapping(X * kMoneyScale<TQENLongCurrency>)};
}
template <>
Currency Float2Money<Currency>(Extended X) {
  return Currency{RoundWrapping(X * kMoneyScale<Currency>)};
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
  return detail::WrapToCurr(detail::DivRoundHalfEven(detail::StoredOf(X), 10000));
}
Currency QENLongCurrency2Currency(TQENLongCurrency X) {
  return static_cast<Currency>(detail::DivRoundHalfEven(detail::StoredOf(X), 100));
}
TQENCurrency Currency2QENCurrency(Currency X) {
  return detail::WrapToCurr(detail::DivRoundHalfEven(detail::StoredOf(X), 100));
}
TQENLongCurrency Currency2QENLongCurrency(Currency X) {
  const auto stored = static_cast<std::uint64_t>(detail::StoredOf(X));
  return static_cast<TQENLongCurrency>(static_cast<Int64>(stored * 100));  // modulo 2^64
}

bool SameCurrency(Currency X, Currency Y) { return X == Y; }

}  // namespace tovrin
