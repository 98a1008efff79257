// How each of the ten element types adds, squares, multiplies, compares and tests its sign:
// the one place where the arithmetic rules that differ by element type are written. The
// vector, matrix and statistics algorithms take their type-dependent steps from
// ElementRules<T>; the money units pass MoneyRules<T>, its sibling, to the same algorithms.
//
// Floats work in Extended and round once when a result is stored. Integer sums are kept in a
// wrapping Int64; integer products and squares wrap at the width stated per type (on purpose:
// several integer families square in 32 bits). Equality is SameFloat at the element's own
// precision for floats and exact for integers.
#pragma once

#include <functional>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/TOVRINMath.h"
#include "tovrin/foundation/detail/Wrapping.h"

namespace tovrin::detail {

template <typename T>
struct ElementRules;

// Members every integer type shares.
template <typename T>
struct IntegerRules {
  using Value = T;
  // SumVector: each element sign- or zero-extended into a wrapping Int64.
  using Sum = Int64;
  static constexpr Int64 SumTerm(T x) { return static_cast<Int64>(x); }
  static constexpr Int64 SumAdd(Int64 s, Int64 t) { return WrappingAdd64(s, t); }
  // SumSqDiffVectors: both elements widened to 64 bits, difference and square wrapping there.
  static constexpr Int64 SquaredDifference(T a, T b) {
    const Int64 d = WrappingSub64(static_cast<Int64>(a), static_cast<Int64>(b));
    return WrappingMul64(d, d);
  }
  // The centre an integer sample hands to SumSqDiffVector: its Extended mean.
  static constexpr Extended MeanCentre(Extended Mean) { return Mean; }
  // Whether the one-pass moments keep integer running sums (Int64 only) or Extended ones.
  static constexpr bool kWrappingMoments = false;
  static constexpr bool Equals(T a, T b) { return a == b; }
};

// Extended (stored packed), Double and Single.
template <typename T>
struct FloatRules {
  using Value = ValueOf<T>;
  using Sum = Extended;
  using Scalar = Extended;  // the constant of the matrix scaling
  static Extended SumTerm(Value x) { return x; }
  static Extended SumAdd(Extended s, Extended t) { return s + t; }
  static Extended SquareTerm(Value x) { return Extended(x) * Extended(x); }
  static Value Square(Value x) { return static_cast<Value>(Extended(x) * Extended(x)); }
  static Value Add(Value a, Value b) { return static_cast<Value>(Extended(a) + Extended(b)); }
  static Value Sub(Value a, Value b) { return static_cast<Value>(Extended(a) - Extended(b)); }
  static Value Mul(Extended k, Value x) { return static_cast<Value>(k * Extended(x)); }
  // a + k x b
  static Value AddScaled(Value a, Extended k, Value b) {
    return static_cast<Value>(Extended(a) + k * Extended(b));
  }
  // x A + B
  static Value Linear(Value x, Extended A, Extended B) {
    return static_cast<Value>(Extended(x) * A + B);
  }
  static Extended Product(Value a, Value b) { return Extended(a) * Extended(b); }
  static Extended SquaredDifference(Value a, Value b) {
    const Extended d = Extended(a) - Extended(b);
    return d * d;
  }
  // (x - Mean)^2 about a centre of the element type.
  static Extended DeviationSquare(Value x, Value Mean) { return SquaredDifference(x, Mean); }
  // The sum of two order statistics, halved by the median.
  static Extended PairSum(Value a, Value b) { return Extended(a) + Extended(b); }
  // Double and Single samples hand SumSqDiffVector their mean rounded to their own type.
  static Value MeanCentre(Extended Mean) { return static_cast<Value>(Mean); }
  static constexpr bool kWrappingMoments = false;
  static bool Equals(Value a, Value b) { return SameFloat(a, b); }
  // The sign tests of the vector predicates go through the tolerance.
  static bool IsNegative(Value x) { return FloatIsNegative(x); }
  static bool IsPositive(Value x) { return FloatIsPositive(x); }
  static bool IsZero(Value x) { return !FloatIsNotZero(x); }
  static bool IsNonZero(Value x) { return !FloatIsZero(x); }
};

// Extended (as stored and as a value), Double and, but for its non-zero test, Single.
template <typename T>
concept FloatValueElement = FloatElement<StoredElementOf<T>>;
template <FloatValueElement T>
struct ElementRules<T> : FloatRules<T> {};
// The Single non-zero test compares with 0 exactly, unlike its Extended and Double siblings.
template <>
struct ElementRules<Single> : FloatRules<Single> {
  static bool IsNonZero(Single x) { return x != 0; }
};

// Int64 and LongInt: sums, differences, scaling and products wrap at the element's own width.
template <typename T>
struct WrappingIntegerRules : IntegerRules<T> {
  using Scalar = T;
  static constexpr T Add(T a, T b) { return Wrapping(a, b, std::plus<>{}); }
  static constexpr T Sub(T a, T b) { return Wrapping(a, b, std::minus<>{}); }
  static constexpr T Mul(T k, T x) { return Wrapping(k, x, std::multiplies<>{}); }
  // a + k x b
  static constexpr T AddScaled(T a, T k, T b) { return Add(a, Mul(k, b)); }
  // x A + B
  static constexpr T Linear(T x, T A, T B) { return Add(Mul(x, A), B); }
  static constexpr Int64 Product(T a, T b) { return static_cast<Int64>(Mul(a, b)); }
  static constexpr Extended PairSum(T a, T b) { return static_cast<Extended>(Add(a, b)); }
};

// Int64: everything wraps modulo 2^64; the sign tests are exact, except that the non-zero
// test asks FloatIsZero of the widened element.
template <>
struct ElementRules<Int64> : WrappingIntegerRules<Int64> {
  static constexpr Int64 SquareTerm(Int64 x) { return WrappingMul64(x, x); }
  static constexpr Int64 Square(Int64 x) { return WrappingMul64(x, x); }
  static constexpr Int64 DeviationSquare(Int64 x, Int64 Mean) { return SquaredDifference(x, Mean); }
  static constexpr bool kWrappingMoments = true;
  static constexpr bool IsNegative(Int64 x) { return x < 0; }
  static constexpr bool IsPositive(Int64 x) { return x > 0; }
  static constexpr bool IsZero(Int64 x) { return x == 0; }
  static bool IsNonZero(Int64 x) { return !FloatIsZero(static_cast<Extended>(x)); }
};

// LongWord: squares and products keep the low 32 bits, zero-extended; sums of two elements
// and differences wrap in 32 bits (3 - 5 is 4294967294).
template <>
struct ElementRules<LongWord> : IntegerRules<LongWord> {
  static constexpr Int64 SquareTerm(LongWord x) { return WrappingSquareU32(x); }
  static constexpr LongWord Square(LongWord x) {
    return static_cast<LongWord>(WrappingSquareU32(x));
  }
  static constexpr LongWord Add(LongWord a, LongWord b) { return a + b; }
  static constexpr Int64 Product(LongWord a, LongWord b) {
    return static_cast<Int64>(static_cast<LongWord>(static_cast<std::uint64_t>(a) * b));
  }
  static constexpr Int64 DeviationSquare(LongWord x, LongWord Mean) {
    return WrappingSquareU32(static_cast<LongWord>(x - Mean));
  }
  static constexpr Extended PairSum(LongWord a, LongWord b) {
    return static_cast<Extended>(Add(a, b));
  }
};

// LongInt: squares and products keep the low 32 bits, sign-extended; sums, differences and
// scaling wrap in 32 bits.
template <>
struct ElementRules<LongInt> : WrappingIntegerRules<LongInt> {
  static constexpr Int64 SquareTerm(LongInt x) { return WrappingSquare32(x); }
  static constexpr LongInt Square(LongInt x) { return static_cast<LongInt>(WrappingSquare32(x)); }
  static constexpr Int64 DeviationSquare(LongInt x, LongInt Mean) {
    return WrappingSquare32(WrappingSub32(x, Mean));
  }
};

// Word, SmallInt, Byte and ShortInt: squares are the low 32 bits taken as a signed LongInt
// (65535 squared counts as -131071).
template <typename T>
struct NarrowIntegerRules : IntegerRules<T> {
  static constexpr Int64 SquareTerm(T x) { return WrappingSquare32(x); }
};
template <typename T>
concept NarrowIntegerElement = IntegerElement<T> && !WideIntegerElement<T>;
template <NarrowIntegerElement T>
struct ElementRules<T> : NarrowIntegerRules<T> {};

// Equality of two elements as ranking and the modal tests see it.
template <typename T>
bool ElementEquals(ValueOf<T> a, ValueOf<T> b) {
  return ElementRules<T>::Equals(a, b);
}

}  // namespace tovrin::detail
