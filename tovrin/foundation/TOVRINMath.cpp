#include "tovrin/foundation/TOVRINMath.h"

#include <algorithm>
#include <cmath>

namespace tovrin {
namespace {

template <typename T>
bool SameWithin(T x, T y, T tolerance) {
  if (x == y) return true;  // also equal infinities
  const T scale = std::max({T(1), std::fabs(x), std::fabs(y)});
  return std::fabs(x - y) < tolerance * scale;
}

}  // namespace

bool FloatIsZero(Extended X) { return std::fabs(X) < QENTolerance; }
bool FloatIsNotZero(Extended X) { return !FloatIsZero(X); }
bool FloatIsPositive(Extended X) { return X > QENTolerance; }
bool FloatIsNegative(Extended X) { return X < -QENTolerance; }

bool SameFloat(Extended X, Extended Y) { return SameWithin(X, Y, QENTolerance); }
bool SameFloat(Double X, Double Y) { return SameWithin(X, Y, QENDoubleTolerance); }
bool SameFloat(Single X, Single Y) { return SameWithin(X, Y, QENSingleTolerance); }
bool NotSameFloat(Extended X, Extended Y) { return !SameFloat(X, Y); }

Extended MinXY(Extended X, Extended Y) { return Y < X ? Y : X; }
LongInt MinXY(LongInt X, LongInt Y) { return Y < X ? Y : X; }
Int64 MinXY(Int64 X, Int64 Y) { return Y < X ? Y : X; }
LongWord MinXY(LongWord X, LongWord Y) { return Y < X ? Y : X; }
Extended MaxXY(Extended X, Extended Y) { return Y > X ? Y : X; }
Int64 MaxXY(Int64 X, Int64 Y) { return Y > X ? Y : X; }

Extended SignXY(Extended X, Extended Y) { return Y >= 0 ? std::fabs(X) : -std::fabs(X); }
// The C library's powl forms the powers -1 to 3 by multiplication (and 1 / X); the same
// products here give its results without the call.
Extended XtoY(Extended X, Extended Y) {
  if (Y == 2) return X * X;
  if (Y == 3) return X * X * X;
  return std::pow(X, Y);
}
Extended TwoToY(Extended Y) { return std::exp2(Y); }
Extended QENLog10(Extended X) {
  // The C library's log10 may miss an exact power of ten by a unit in the last place; the
  // powers 10^0 to 10^27 are exact in Extended, so their logarithms are given exactly.
  const Extended result = std::log10(X);
  const Extended nearest = std::nearbyint(result);
  if (nearest >= 0 && nearest <= 27 && std::fabs(result - nearest) < 1e-15L) {
    Extended power = 1;
    for (int i = 0; i < static_cast<int>(nearest); ++i) power *= 10;
    if (power == X) return nearest;
  }
  return result;
}
Extended QENLog2(Extended X) { return std::log2(X); }
Extended CubeRoot(Extended X) { return std::cbrt(X); }
Extended QENArcCos(Extended X) { return std::acos(X); }
Extended QENTan(Extended X) { return std::tan(X); }
Extended QENDistance(Extended X1, Extended Y1, Extended X2, Extended Y2) {
  return std::hypot(X2 - X1, Y2 - Y1);
}

}  // namespace tovrin
