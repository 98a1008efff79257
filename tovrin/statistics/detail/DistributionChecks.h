// The argument checks that the classic and the precise distribution functions share, each
// raising its identifier through the library's one error path. A NaN passes the checks that
// are written as comparisons, so that it gives NaN.
#pragma once

#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/TOVRINMath.h"

namespace tovrin::detail::checks {

// A standard deviation that is not positive (within the tolerance).
inline void CheckStdDev(Extended StdDev) {
  if (!(StdDev > QENTolerance)) RaiseMathError(rsStdDev);  // !FloatIsPositive, inline
}
// The inverses reject a standard deviation that is zero within the tolerance or negative, so
// QENTolerance itself passes here while CheckStdDev rejects it.
inline void CheckInverseStdDev(Extended StdDev) {
  if (FloatIsZero(StdDev) || FloatIsNegative(StdDev)) RaiseMathError(rsStdDev);
}
inline void CheckOpenProbability(Extended P) {
  if (!(P > 0 && P < 1)) RaiseMathError(rsValue01);
}
inline void CheckClosedProbability(Extended P) {
  if (!(P >= 0 && P <= 1)) RaiseMathError(rsValue01Inc);
}
inline void CheckBetaShapes(Extended A, Extended B) {
  if (!(A > 0) || !(B > 0)) RaiseMathError(rsValueGZero);
}
inline void CheckHyperGeometric(LongWord N, LongWord S, LongWord M) {
  if (N == 0 || S == 0 || N < S || N < M) RaiseMathError(rsHyperGeometricInvalid);
}
inline void CheckPoisson(Extended Mean) {
  if (Mean <= 0) RaiseMathError(rsPoissonInvalid);
}

// Mean + StdDev z for the standard normal quantile z = StandardInverse(P), after the checks of
// the normal's inverse functions.
inline Extended NormalQuantile(Extended Mean, Extended StdDev, Extended P,
                               Extended (*StandardInverse)(Extended)) {
  CheckOpenProbability(P);
  CheckInverseStdDev(StdDev);
  return Mean + StdDev * StandardInverse(P);
}

}  // namespace tovrin::detail::checks
