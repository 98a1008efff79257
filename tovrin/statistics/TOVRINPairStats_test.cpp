// Tests of paired-data correlation and regression. Expected values are exact arithmetic done by
// hand, or come from TOVRINPairStats_reference.inc, made by the script beside it (256-bit
// mpmath from the centred definitions; the parabola's Cramer arithmetic emulated at 64-bit
// precision).
#include <cmath>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/statistics/TOVRINPairStats.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINPairStats_reference.inc"

constexpr long double kRelTolerance = 4e-18L;

::testing::AssertionResult RelNear(long double actual, long double expected,
                                   long double tolerance = kRelTolerance) {
  const long double error = std::fabs(actual - expected);
  if (error <= tolerance * std::fabs(expected)) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << "actual " << static_cast<double>(actual) << " expected "
                                       << static_cast<double>(expected) << " relative error "
                                       << static_cast<double>(error / std::fabs(expected));
}

TQENFloatVector Floats(const std::vector<long double>& values) {
  return TQENFloatVector(values.begin(), values.end());
}

template <typename Call>
void ExpectRaises(TResStringId Ident, Call&& call) {
  try {
    call();
    ADD_FAILURE() << "no EMathError; expected " << ResStringName(Ident);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), Ident) << "raised " << ResStringName(e.Ident()) << ", expected "
                                << ResStringName(Ident);
  }
}

TEST(PairCorrelation, HandExamples) {
  const TQENFloatVector x = Floats({1, 2, 3});
  EXPECT_EQ(CoeffCorrelation(x, Floats({2, 4, 6})), 1);
  EXPECT_EQ(CoeffCorrelation(x, Floats({6, 4, 2})), -1);
  EXPECT_EQ(CoeffDetermination(x, Floats({6, 4, 2})), 1);
  // Unequal lengths and single pairs are no error: the result is 0.
  EXPECT_EQ(CoeffCorrelation(x, Floats({1, 2})), 0);
  EXPECT_EQ(CoeffCorrelation(Floats({1}), Floats({2})), 0);
  EXPECT_EQ(CoeffCorrelation(TQENFloatVector{}, TQENFloatVector{}), 0);
  EXPECT_EQ(CoeffDetermination(x, Floats({1, 2})), 0);
  // No spread in Y: the division by zero is left to the arithmetic.
  EXPECT_TRUE(std::isnan(CoeffCorrelation(x, Floats({5, 5, 5}))));
}

TEST(PairCorrelation, AgreesWithHighPrecision) {
  const TQENFloatVector x = Floats(kX);
  const TQENFloatVector y = Floats(kY);
  EXPECT_TRUE(RelNear(CoeffCorrelation(x, y), kCorrelation));
  EXPECT_TRUE(RelNear(CoeffDetermination(x, y), kDetermination));
  EXPECT_TRUE(RelNear(CoeffCorrelation(y, x), kCorrelation));
}

TEST(PairRegressionLine, HandExampleAndHighPrecision) {
  Extended intercept = 0;
  Extended slope = 0;
  GetRegressionLine(Floats({0, 1, 2}), Floats({1, 3, 5}), intercept, slope);
  EXPECT_EQ(intercept, 1);
  EXPECT_EQ(slope, 2);
  EXPECT_EQ(GetSSE(Floats({0, 1, 2}), Floats({1, 3, 5}), 1, 2), 0);

  const TQENFloatVector x = Floats(kX);
  const TQENFloatVector y = Floats(kY);
  GetRegressionLine(x, y, intercept, slope);
  EXPECT_TRUE(RelNear(slope, kSlope));
  EXPECT_TRUE(RelNear(intercept, kIntercept));
  EXPECT_TRUE(RelNear(GetSSE(x, y, kIntercept, kSlope), kSSEAboutFit));
  EXPECT_EQ(GetSSE(x, y, kGivenIntercept, kGivenSlope), kSSEAboutGiven);  // exact sums
  EXPECT_EQ(GetSSE(TQENFloatVector{}, TQENFloatVector{}, 1, 2), 0);
}

TEST(PairRegressionLine, ErrorsLeaveOutputs) {
  Extended intercept = 7;
  Extended slope = 8;
  ExpectRaises(rsSameDimensions, [&] {
    GetRegressionLine(Floats({1, 2}), Floats({1}), intercept, slope);
  });
  ExpectRaises(rsSameDimensions, [&] {
    GetRegressionLine(TQENFloatVector{}, Floats({1}), intercept, slope);  // length first
  });
  ExpectRaises(rsVectorIsEmpty,
               [&] { GetRegressionLine(TQENFloatVector{}, TQENFloatVector{}, intercept, slope); });
  EXPECT_EQ(intercept, 7);
  EXPECT_EQ(slope, 8);
  ExpectRaises(rsSameDimensions, [] { GetSSE(Floats({1, 2}), Floats({1, 2, 3}), 0, 1); });
}

TEST(PairQuadraticCurve, HandExample) {
  Extended a = 0;
  Extended b = 0;
  Extended c = 0;
  GetQuadraticCurve(Floats({0, 1, 2, 3}), Floats({1, 2, 5, 10}), a, b, c);
  EXPECT_EQ(a, 1);
  EXPECT_EQ(b, 0);
  EXPECT_EQ(c, 1);
}

TEST(PairQuadraticCurve, MatchesTheStatedArithmeticBitForBit) {
  Extended a = 0;
  Extended b = 0;
  Extended c = 0;
  const TQENFloatVector x = Floats(kX);
  const TQENFloatVector y = Floats(kY);
  GetQuadraticCurve(x, y, a, b, c);
  EXPECT_EQ(a, kCramerA);
  EXPECT_EQ(b, kCramerB);
  EXPECT_EQ(c, kCramerC);
  // And Cramer's rule stays close to the exact least-squares parabola on this data.
  EXPECT_TRUE(RelNear(a, kExactA, 1e-14L));
  EXPECT_TRUE(RelNear(b, kExactB, 1e-14L));
  EXPECT_TRUE(RelNear(c, kExactC, 1e-14L));
}

TEST(PairQuadraticCurve, ErrorsLeaveOutputs) {
  Extended a = 1;
  Extended b = 2;
  Extended c = 3;
  ExpectRaises(rsSameDimensions, [&] {
    GetQuadraticCurve(Floats({1, 2, 3}), Floats({1, 2}), a, b, c);
  });
  ExpectRaises(rsDivideByZero, [&] {
    GetQuadraticCurve(Floats({1, 1, 1}), Floats({1, 2, 3}), a, b, c);
  });
  ExpectRaises(rsDivideByZero, [&] {
    GetQuadraticCurve(Floats({1, 2, 1, 2}), Floats({1, 2, 3, 4}), a, b, c);
  });
  ExpectRaises(rsDivideByZero,
               [&] { GetQuadraticCurve(TQENFloatVector{}, TQENFloatVector{}, a, b, c); });
  EXPECT_EQ(a, 1);
  EXPECT_EQ(b, 2);
  EXPECT_EQ(c, 3);
}

}  // namespace
}  // namespace tovrin
