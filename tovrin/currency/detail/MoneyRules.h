// How the three money types add, scale, transform, test their sign and compare for ranking.
// The money vector and matrix units pass these rules to the numeric unit's algorithm
// templates in tovrin/detail, so each algorithm exists once; detail::ElementRules<T> is the
// sibling that holds the rules of the ten numeric element types.
//
// Stored integers add and subtract with wrap-around at their own width (32 bits for
// TQENCurrency, 64 for the others), done in unsigned arithmetic. Products by an Extended
// constant, the linear transforms and the conversions from floats round the Extended result
// half to even with unreported overflow (detail::RoundWrapping): one rule for all three types.
// The linear transform of TQENCurrency and TQENLongCurrency goes through the conversion
// services; the Currency transform works on the stored integer.
#pragma once

#include <cstdint>

#include "tovrin/currency/TOVRINFinancials.h"
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin::detail {

template <typename T>
struct MoneyRules;

template <>
struct MoneyRules<TQENCurrency> {
  using T = TQENCurrency;
  static constexpr std::uint32_t U(T x) { return static_cast<std::uint32_t>(StoredOf(x)); }
  static constexpr T FromBits(std::uint32_t x) { return T(static_cast<LongInt>(x)); }
  static T Add(T a, T b) { return FromBits(U(a) + U(b)); }
  static T Sub(T a, T b) { return FromBits(U(a) - U(b)); }
  static T Mul(Extended K, T x) { return WrapToCurr(RoundWrapping(K * StoredOf(x))); }
  static T Linear(T x, Extended A, Extended B) {
    return Float2QENCurrency(Currency2Float(x) * A + B);
  }
  // Round(Sum / N) of the 32-bit wrapping sum.
  using Sum = std::uint32_t;
  static Sum AddToSum(Sum s, T x) { return s + U(x); }
  static T MeanOf(Sum s, LongWord N) {
    return T(static_cast<LongInt>(DivRoundHalfEven(static_cast<LongInt>(s), N)));
  }
  static bool IsNegative(T x) { return StoredOf(x) < 0; }
  static bool IsPositive(T x) { return StoredOf(x) > 0; }
  static bool IsZero(T x) { return StoredOf(x) == 0; }
};

template <>
struct MoneyRules<TQENLongCurrency> {
  using T = TQENLongCurrency;
  static constexpr std::uint64_t U(T x) { return static_cast<std::uint64_t>(StoredOf(x)); }
  static constexpr T FromBits(std::uint64_t x) { return T(static_cast<Int64>(x)); }
  static T Add(T a, T b) { return FromBits(U(a) + U(b)); }
  static T Sub(T a, T b) { return FromBits(U(a) - U(b)); }
  static T Mul(Extended K, T x) { return T(RoundWrapping(K * StoredOf(x))); }
  static T Linear(T x, Extended A, Extended B) {
    return Float2QENLongCurrency(Currency2Float(x) * A + B);
  }
  using Sum = std::uint64_t;
  static Sum AddToSum(Sum s, T x) { return s + U(x); }
  static T MeanOf(Sum s, LongWord N) { return T(DivRoundHalfEven(static_cast<Int64>(s), N)); }
  static bool IsNegative(T x) { return StoredOf(x) < 0; }
  static bool IsPositive(T x) { return StoredOf(x) > 0; }
  static bool IsZero(T x) { return StoredOf(x) == 0; }
};

template <>
struct MoneyRules<Currency> {
  using T = Currency;
  static constexpr std::uint64_t U(T x) { return static_cast<std::uint64_t>(StoredOf(x)); }
  static constexpr T FromBits(std::uint64_t x) { return T(static_cast<Int64>(x)); }
  static T Add(T a, T b) { return FromBits(U(a) + U(b)); }
  static T Sub(T a, T b) { return FromBits(U(a) - U(b)); }
  static T Mul(Extended K, T x) { return T(RoundWrapping(K * StoredOf(x))); }
  // stored x A + B x 10000: B is an amount, not a stored unit.
  static T Linear(T x, Extended A, Extended B) {
    return T(RoundWrapping(StoredOf(x) * A + B * kMoneyScale<Currency>));
  }
  // Summed in 64 bits, exact while the sum stays within them (beyond, it wraps).
  using Sum = std::uint64_t;
  static Sum AddToSum(Sum s, T x) { return s + U(x); }
  static T MeanOf(Sum s, LongWord N) { return T(DivRoundHalfEven(static_cast<Int64>(s), N)); }
  // The amount against the tolerance, as the float vectors do.
  static bool IsNegative(T x) { return FloatIsNegative(Currency2Float(x)); }
  static bool IsPositive(T x) { return FloatIsPositive(Currency2Float(x)); }
  static bool IsZero(T x) { return FloatIsZero(Currency2Float(x)); }
};

// Equality of ranking: SameCurrency on Currency values that carry the stored integers as
// they are (not divided by their scale), so two elements are equal exactly when their stored
// integers are.
struct MoneyRankEquals {
  template <typename T>
  bool operator()(T a, T b) const {
    return SameCurrency(Currency{StoredOf(a)}, Currency{StoredOf(b)});
  }
};

}  // namespace tovrin::detail
