// How the five arithmetic element types of the matrix unit (Extended, Double, Single, Int64,
// LongInt) add, subtract and scale. Floats work in Extended and round once when stored;
// Int64 wraps in 64 bits and LongInt in 32 bits, through unsigned arithmetic.
#pragma once

#include <cstdint>

#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/detail/ElementRules.h"

namespace tovrin::detail {

template <typename T>
struct FloatMatrixRules {
  using Scalar = Extended;
  static T Add(T a, T b) { return T(Extended(a) + Extended(b)); }
  static T Sub(T a, T b) { return T(Extended(a) - Extended(b)); }
  static T Mul(Scalar k, T x) { return T(k * Extended(x)); }
  // a + k x b
  static T AddScaled(T a, Scalar k, T b) { return T(Extended(a) + k * Extended(b)); }
  static T Linear(T x, Scalar a, Scalar b) { return T(Extended(x) * a + b); }
};

struct Int64MatrixRules {
  using Scalar = Int64;
  static Int64 Add(Int64 a, Int64 b) { return WrappingAdd64(a, b); }
  static Int64 Sub(Int64 a, Int64 b) { return WrappingSub64(a, b); }
  static Int64 Mul(Int64 k, Int64 x) { return WrappingMul64(k, x); }
  static Int64 AddScaled(Int64 a, Int64 k, Int64 b) {
    return WrappingAdd64(a, WrappingMul64(k, b));
  }
  static Int64 Linear(Int64 x, Int64 a, Int64 b) { return WrappingAdd64(WrappingMul64(x, a), b); }
};

struct LongIntMatrixRules {
  using Scalar = LongInt;
  static std::uint32_t U(LongInt x) { return static_cast<std::uint32_t>(x); }
  static LongInt Add(LongInt a, LongInt b) { return static_cast<LongInt>(U(a) + U(b)); }
  static LongInt Sub(LongInt a, LongInt b) { return static_cast<LongInt>(U(a) - U(b)); }
  static LongInt Mul(LongInt k, LongInt x) { return static_cast<LongInt>(U(k) * U(x)); }
  static LongInt AddScaled(LongInt a, LongInt k, LongInt b) {
    return static_cast<LongInt>(U(a) + U(k) * U(b));
  }
  static LongInt Linear(LongInt x, LongInt a, LongInt b) {
    return static_cast<LongInt>(U(x) * U(a) + U(b));
  }
};

template <typename T>
struct MatrixRulesOf {
  using type = FloatMatrixRules<T>;
};
template <>
struct MatrixRulesOf<Int64> {
  using type = Int64MatrixRules;
};
template <>
struct MatrixRulesOf<LongInt> {
  using type = LongIntMatrixRules;
};
template <typename T>
using MatrixRules = typename MatrixRulesOf<T>::type;

}  // namespace tovrin::detail
