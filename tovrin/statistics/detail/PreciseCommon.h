// What the precise family's sources share: the double-length numbers, both tails of the
// incomplete gamma and beta functions, the library's own elementary kernels, the argument
// checks of the classic functions and the one error route.
#pragma once

#include <limits>

#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINMath.h"
#include "tovrin/foundation/detail/Elementary.h"
#include "tovrin/foundation/detail/IncompleteTails.h"
#include "tovrin/statistics/TOVRINPrecise.h"
#include "tovrin/statistics/detail/DistributionChecks.h"
#include "tovrin/statistics/detail/PairArithmetic.h"

namespace tovrin::precise::common {

using detail::Pair;
using detail::RaiseMathError;
using detail::Tails;
using namespace detail::checks;  // NOLINT: the checks are named as the classic functions name them

inline constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
inline constexpr Extended kInf = std::numeric_limits<Extended>::infinity();

}  // namespace tovrin::precise::common
