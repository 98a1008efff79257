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
#include <type_traits>

#include "tovrin/currency/TOVRINFinancials.h"
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin::detail {

template <typename T>
struct MoneyRules;

// What the three types share: the stored integers (as Bits, the unsigned type of their width)
// add, subtract and sum with wrap-around; products by K are rounded with RoundWrapping and kept
// to the width; the linear transform works on the amount through the conversion services; a
// mean is the sum divided by N, rounded to the nearest unit, halves to even; the sign tests
// compare the stored integer exactly with 0.
template <typename T, typename Bits>
struct WrappingMoneyRules {
  using Stored = std::make_signed_t<Bits>;
  static constexpr Bits U(T x) { return static_cast<Bits>(StoredOf(x)); }
  static constexpr T FromBits(Bits x) { return T(static_cast<Stored>(x)); }
  static T Add(T a, T b) { return FromBits(U(a) + U(b)); }
  static T Sub(T a, T b) { return FromBits(U(a) - U(b)); }
  static T Mul(Extended K, T x) {
    return FromBits(static_cast<Bits>(RoundWrapping(K * StoredOf(x))));
  }
  static T Linear(T x, Extended A, Extended B) { return Float2Money<T>(Currency2Float(x) * A + B); }
  using Sum = Bits;
  static Sum AddToSum(Sum s, T x) { return s + U(x); }
  static T MeanOf(Sum s, LongWord N) {
    return T(static_cast<Stored>(DivRoundHalfEven(static_cast<Stored>(s), N)));
  }
  static bool IsNegative(T x) { return StoredOf(x) < 0; }
  static bool IsPositive(T x) { return StoredOf(x) > 0; }
  static bool IsZero(T x) { return StoredOf(x) == 0; }
  static bool IsNonZero(T x) { return StoredOf(x) != 0; }
};

// 32-bit wrapping sums and products.
template <>
struct MoneyRules<TQENCurrency> : WrappingMoneyRules<TQENCurrency, std::uint32_t> {};

template <>
struct MoneyRules<TQENLongCurrency> : WrappingMoneyRules<TQENLongCurrency, std::uint64_t> {};

// Summed in 64 bits, exact while the sum stays within them (beyond, it wraps).
template <>
struct MoneyRules<Currency> : WrappingMoneyRules<Currency, std::uint64_t> {
  using T = Currency;
  // stored x A + B x 10000: B is an amount, not a stored unit.
  static T Linear(T x, Extended A, Extended B) {
    return T(RoundWrapping(StoredOf(x) * A + B * kMoneyScale<Currency>));
  }
  // The amount against the tolerance, as the float vectors do.
  static bool IsNegative(T x) { return FloatIsNegative(Currency2Float(x)); }
  static bool IsPositive(T x) { return FloatIsPositive(Currency2Float(x)); }
  static bool IsZero(T x) { return FloatIsZero(Currency2Float(x)); }
  static bool IsNonZero(T x) { return !FloatIsZero(Currency2Float(x)); }
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
