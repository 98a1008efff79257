// Tests of paired-data correlation and regression. Expected values are exact arithmetic by hand
// or come from TOVRINPairStats_reference.inc (256-bit mpmath from the centred definitions; the
// parabola's Cramer arithmetic emulated at 64-bit precision).
#include <cmath>
#include <vector>

#include "tovrin/statistics/TOVRINPairStats.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINPairStats_reference.inc"

using namespace testing;  // NOLINT: the shared checks and constants

TQENFloatVector Floats(const std::vector<long double>& values) {
  return TQENFloatVector(values.begin(), values.end());
}

TEST(PairCorrelation, HandExamplesAndHighPrecision) {
  const TQENFloatVector x = Floats({1, 2, 3});
  EXPECT_EQ(CoeffCorrelation(x, Floats({2, 4, 6})), 1);
  EXPECT_EQ(CoeffCorrelation(x, Floats({6, 4, 2})), -1);
  EXPECT_EQ(CoeffDetermination(x, Floats({6, 4, 2})), 1);
  // Unequal lengths and single pairs are no error: the result is 0. No spread in Y: the
  // division by zero is left to the arithmetic.
  EXPECT_EQ(CoeffCorrelation(x, Floats({1, 2})), 0);
  EXPECT_EQ(CoeffCorrelation(Floats({1}), Floats({2})), 0);
  EXPECT_EQ(CoeffDetermination(x, Floats({1, 2})), 0);
  EXPECT_TRUE(std::isnan(CoeffCorrelation(x, Floats({5, 5, 5}))));
  EXPECT_TRUE(RelNear(CoeffCorrelation(Floats(kX), Floats(kY)), kCorrelation));
  EXPECT_TRUE(RelNear(CoeffDetermination(Floats(kX), Floats(kY)), kDetermination));
  EXPECT_TRUE(RelNear(CoeffCorrelation(Floats(kY), Floats(kX)), kCorrelation));
}

TEST(PairRegressionLine, ValuesAndErrors) {
  Extended intercept = 0, slope = 0;
  GetRegressionLine(Floats({0, 1, 2}), Floats({1, 3, 5}), intercept, slope);
  EXPECT_EQ(intercept * 10 + slope, 12);
  EXPECT_EQ(GetSSE(Floats({0, 1, 2}), Floats({1, 3, 5}), 1, 2), 0);
  const TQENFloatVector x = Floats(kX), y = Floats(kY);
  GetRegressionLine(x, y, intercept, slope);
  EXPECT_TRUE(RelNear(slope, kSlope));
  EXPECT_TRUE(RelNear(intercept, kIntercept));
  EXPECT_TRUE(RelNear(GetSSE(x, y, kIntercept, kSlope), kSSEAboutFit));
  EXPECT_EQ(GetSSE(x, y, kGivenIntercept, kGivenSlope), kSSEAboutGiven);  // exact sums
  EXPECT_EQ(GetSSE(TQENFloatVector{}, TQENFloatVector{}, 1, 2), 0);
  intercept = 7, slope = 8;
  const TQENFloatVector empty;
  ExpectEachRaises(rsSameDimensions,
                   {[&] {
                      GetRegressionLine(Floats({1, 2}), Floats({1}), intercept, slope);
                    },
                    [&] { GetRegressionLine(empty, Floats({1}), intercept, slope); },
                    [] {
                      GetSSE(Floats({1, 2}), Floats({1, 2, 3}), 0, 1);
                    }});
  ExpectRaises(rsVectorIsEmpty, [&] { GetRegressionLine(empty, empty, intercept, slope); });
  EXPECT_EQ(intercept * 10 + slope, 78);
}

TEST(PairQuadraticCurve, ValuesAndErrors) {
  Extended a = 0, b = 0, c = 0;
  GetQuadraticCurve(Floats({0, 1, 2, 3}), Floats({1, 2, 5, 10}), a, b, c);
  EXPECT_EQ(a * 100 + b * 10 + c, 101);
  GetQuadraticCurve(Floats(kX), Floats(kY), a, b, c);
  EXPECT_EQ(a, kCramerA);  // the stated arithmetic, bit for bit
  EXPECT_EQ(b, kCramerB);
  EXPECT_EQ(c, kCramerC);
  // And Cramer's rule stays close to the exact least-squares parabola on this data.
  EXPECT_TRUE(RelNear(a, kExactA, 1e-14L));
  EXPECT_TRUE(RelNear(b, kExactB, 1e-14L));
  EXPECT_TRUE(RelNear(c, kExactC, 1e-14L));
  a = 1, b = 2, c = 3;
  ExpectRaises(rsSameDimensions, [&] {
    GetQuadraticCurve(Floats({1, 2, 3}), Floats({1, 2}), a, b, c);
  });
  ExpectEachRaises(rsDivideByZero,
                   {[&] {
                      GetQuadraticCurve(Floats({1, 1, 1}), Floats({1, 2, 3}), a, b, c);
                    },
                    [&] {
                      GetQuadraticCurve(Floats({1, 2, 1, 2}), Floats({1, 2, 3, 4}), a, b, c);
                    },
                    [&] { GetQuadraticCurve(TQENFloatVector{}, TQENFloatVector{}, a, b, c); }});
  EXPECT_EQ(a * 100 + b * 10 + c, 123);
}

}  // namespace
}  // namespace tovrin
