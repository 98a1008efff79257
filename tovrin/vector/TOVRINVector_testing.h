// Shared pieces of the vector unit's tests.
#pragma once

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin::testing {

// Runs call and expects it to raise EMathError with the identifier id.
template <typename Call>
void ExpectMathError(TResStringId id, Call call) {
  try {
    call();
    ADD_FAILURE() << "expected EMathError " << LoadResString(id);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), id) << e.what();
  }
}

// A vector of the type V from plain numbers.
template <typename V>
V Make(std::initializer_list<long double> values) {
  V v;
  for (long double x : values) v.push_back(static_cast<detail::ValueOf<typename V::value_type>>(x));
  return v;
}

// The elements as Extended, so that vectors of every type compare alike.
template <typename V>
std::vector<Extended> Values(const V& v) {
  std::vector<Extended> out;
  for (const auto& e : v)
    out.push_back(static_cast<Extended>(static_cast<detail::ValueOf<typename V::value_type>>(e)));
  return out;
}

inline std::vector<Extended> L(std::initializer_list<long double> values) { return values; }

using AllVectors =
    ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector, TQENInt64Vector,
                     TQENLWordVector, TQENLIntVector, TQENWordVector, TQENSmallIntVector,
                     TQENByteVector, TQENSIntVector>;
// The element types that can be built, and the ones with SumSqDiffVector, SquareVector, the
// dot product and the angle.
using BuildableVectors = ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector,
                                          TQENInt64Vector, TQENLWordVector, TQENLIntVector>;
using FloatVectors = ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector>;
using SignedVectors =
    ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector, TQENInt64Vector>;
using AddableVectors = ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector,
                                        TQENInt64Vector, TQENLIntVector>;

}  // namespace tovrin::testing
