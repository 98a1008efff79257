// Shared by the distribution tests: the reference table and the comparisons they use.
#pragma once

#include <array>
#include <cmath>
#include <limits>

#include "gtest/gtest.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::testing_distributions {

constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
constexpr Extended kEps = std::numeric_limits<Extended>::epsilon();  // 2^-63

using Ref2 = std::array<Extended, 2>;
using Ref3 = std::array<Extended, 3>;
using Ref4 = std::array<Extended, 4>;
using Ref5 = std::array<Extended, 5>;
using Ref6 = std::array<Extended, 6>;
using Ref7 = std::array<Extended, 7>;
#include "tovrin/statistics/TOVRINStatistics_Distributions_reference.inc"

// A count or degrees of freedom from a reference row.
inline LongWord DF(Extended v) { return static_cast<LongWord>(v); }
inline LongWord U(Extended v) { return DF(v); }

// Runs Call and expects EMathError with Ident.
template <typename Call>
void ExpectRaises(TResStringId Ident, Call call) {
  try {
    call();
    ADD_FAILURE() << "no EMathError, expected " << ResStringName(Ident);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), Ident) << "raised " << ResStringName(e.Ident()) << ", expected "
                                << ResStringName(Ident);
  }
}

inline ::testing::AssertionResult Near(Extended actual, Extended expected, Extended bound) {
  const Extended error = std::fabs(actual - expected);
  if (error <= bound) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure()
         << "actual " << static_cast<double>(actual) << " expected "
         << static_cast<double>(expected) << " error " << static_cast<double>(error) << " bound "
         << static_cast<double>(bound);
}
inline ::testing::AssertionResult RelNear(Extended actual, Extended expected, Extended relative) {
  return Near(actual, expected, relative * std::fabs(expected));
}

}  // namespace tovrin::testing_distributions
