// Paired data: correlation and regression.
#include "tovrin/statistics/TOVRINPairStats.h"

#include <cmath>
#include <cstddef>

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin {
namespace {

using detail::RaiseMathError;

void CheckSameLength(const TQENFloatVector& X, const TQENFloatVector& Y) {
  if (X.size() != Y.size()) RaiseMathError(rsSameDimensions);
}

// The sums behind the correlation and the line, gathered in one pass. Each is the sum that
// SumVector, SumSqVector or DotProdVectors gives (the same additions in the same order), taken
// directly so that the pairs are read once instead of five times. X and Y have equal lengths.
struct PairSums {
  Extended Sx;
  Extended Sy;
  Extended Sxx;
  Extended Syy;
  Extended Sxy;
};

PairSums SumsOf(const TQENFloatVector& X, const TQENFloatVector& Y) {
  // Local accumulators: the result is written once, so the loop keeps them in registers.
  Extended sx = 0;
  Extended sy = 0;
  Extended sxx = 0;
  Extended syy = 0;
  Extended sxy = 0;
  for (std::size_t i = 0; i < X.size(); ++i) {
    const Extended x = X[i];
    const Extended y = Y[i];
    sx += x;
    sy += y;
    sxx += x * x;
    syy += y * y;
    sxy += x * y;
  }
  return PairSums{sx, sy, sxx, syy, sxy};
}

}  // namespace

Extended CoeffCorrelation(const TQENFloatVector& X, const TQENFloatVector& Y) {
  if (X.size() != Y.size() || X.size() < 2) return 0;
  const auto n = static_cast<Extended>(X.size());
  const PairSums s = SumsOf(X, Y);
  const Extended ssx = s.Sxx - s.Sx * s.Sx / n;
  const Extended ssy = s.Syy - s.Sy * s.Sy / n;
  const Extended spxy = s.Sxy - s.Sx * s.Sy / n;
  const Extended sdx = std::sqrt(ssx / (n - 1));
  const Extended sdy = std::sqrt(ssy / (n - 1));
  return (spxy / (n - 1)) / (sdx * sdy);
}

Extended CoeffDetermination(const TQENFloatVector& X, const TQENFloatVector& Y) {
  const Extended r = CoeffCorrelation(X, Y);
  return r * r;
}

void GetRegressionLine(const TQENFloatVector& X, const TQENFloatVector& Y, Extended& Intercept,
                       Extended& Slope) {
  CheckSameLength(X, Y);
  if (X.empty()) RaiseMathError(rsVectorIsEmpty);  // as SumVector raises it
  const PairSums s = SumsOf(X, Y);
  const auto n = static_cast<Extended>(X.size());
  const Extended ssx = s.Sxx - s.Sx * s.Sx / n;
  const Extended spxy = s.Sxy - s.Sx * s.Sy / n;
  const Extended slope = spxy / ssx;
  Slope = slope;
  Intercept = (s.Sy - slope * s.Sx) / n;
}

void GetQuadraticCurve(const TQENFloatVector& X, const TQENFloatVector& Y, Extended& A, Extended& B,
                       Extended& C) {
  CheckSameLength(X, Y);
  Extended s1 = 0, s2 = 0, s3 = 0, s4 = 0, t0 = 0, t1 = 0, t2 = 0;
  for (std::size_t i = 0; i < X.size(); ++i) {
    const Extended x = X[i];
    const Extended y = Y[i];
    const Extended q = x * x;
    s1 += x;
    s2 += q;
    s3 += q * x;
    s4 += q * q;
    t0 += y;
    t1 += y * x;
    t2 += y * q;
  }
  const auto n = static_cast<Extended>(X.size());
  const Extended s1_sq = s1 * s1;
  const Extended s2_sq = s2 * s2;
  const Extended s3_sq = s3 * s3;
  // Determinant of the system with rows (n, S1, S2), (S1, S2, S3), (S2, S3, S4). The terms of
  // it and of the three numerators stand in a fixed arrangement (additions before
  // subtractions); the rounding of the coefficients depends on it.
  const Extended d = 2 * s1 * s2 * s3 + s4 * s2 * n - s2 * s2_sq - s4 * s1_sq - s3_sq * n;
  if (FloatIsZero(d)) RaiseMathError(rsDivideByZero);
  const Extended a =
      (t2 * s3 * s1 + t1 * s3 * s2 + t0 * s4 * s2 - t2 * s2_sq - t1 * s4 * s1 - t0 * s3_sq) / d;
  const Extended b =
      (t0 * s3 * s2 + t2 * s2 * s1 + t1 * s4 * n - t1 * s2_sq - t0 * s4 * s1 - t2 * s3 * n) / d;
  const Extended c =
      (t1 * s2 * s1 + t0 * s3 * s1 + t2 * s2 * n - t0 * s2_sq - t2 * s1_sq - t1 * s3 * n) / d;
  A = a;
  B = b;
  C = c;
}

Extended GetSSE(const TQENFloatVector& X, const TQENFloatVector& Y, Extended Intercept,
                Extended Slope) {
  CheckSameLength(X, Y);
  Extended sum = 0;
  for (std::size_t i = 0; i < X.size(); ++i) {
    const Extended p = Slope * Extended(X[i]) + Intercept;
    const Extended e = p - Extended(Y[i]);
    sum += e * e;
  }
  return sum;
}

}  // namespace tovrin
