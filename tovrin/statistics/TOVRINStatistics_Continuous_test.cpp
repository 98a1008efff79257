// Tests of the continuous distributions against reference values computed with mpmath at
// 40 digits (TOVRINStatistics_Distributions_reference.py), exact values and properties.
#include <array>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <functional>
#include <limits>
#include <string>
#include <vector>

#include "gtest/gtest.h"
#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/statistics/TOVRINStatistics_Distributions_testing.h"

namespace tovrin {
namespace {

using namespace testing_distributions;  // NOLINT

// === Standard normal ===========================================================================

TEST(NormalTest, DensityAndSeriesAgainstReference) {
  for (const auto& [z, phi, cdf] : kNormalRef) {
    SCOPED_TRACE(static_cast<double>(z));
    // exp(-z^2/2): the rounding of z^2/2 costs z^2/2 ulps.
    EXPECT_TRUE(RelNear(NormalZ(z), phi,
                        4 * kEps * (1 + z * z)));  // The series stops once a round changes the
                                                   // result by less than 1e-18 and sums in
    // Extended around 0.5, so its error is absolute, a few 1e-18 at most; deep in the lower
    // tail that is large relative to the result (the method's own limit). Beyond |z| = 8 the
    // 100 rounds end before the terms z^(2k+1)/(2k+1)!! have fallen off: the neglected tail is
    // 3e-16 at |z| = 9 and 2e-13 at |z| = 9.5.
    const Extended bound = std::fabs(z) <= 8 ? 5e-18L : std::fabs(z) <= 9 ? 4e-16L : 3e-13L;
    EXPECT_TRUE(Near(NormalLess(z), cdf, bound));
    EXPECT_TRUE(Near(NormalGreater(z), 1 - cdf, bound));
  }
}

TEST(NormalTest, SeriesEdges) {
  EXPECT_EQ(NormalLess(0), 0.5L);
  EXPECT_EQ(NormalLess(40), 1);
  EXPECT_EQ(NormalLess(-40), 0);
  EXPECT_EQ(NormalLess(kInf), 1);
  EXPECT_EQ(NormalLess(-kInf), 0);
  EXPECT_EQ(NormalLess(kNaN), 0);  // unordered density: treated like a negligible one
  EXPECT_EQ(NormalGreater(40), 0);
  // phi(z) < 1e-20 from about |z| = 9.6 on.
  EXPECT_EQ(NormalLess(9.7L), 1);
  EXPECT_GT(NormalLess(-9.5L), 0);
}

TEST(NormalTest, InverseAgainstReference) {
  for (const auto& [p, x, density] : kInvNormalRef) {
    SCOPED_TRACE(static_cast<double>(p));
    // AS 241 is accurate to about 1 part in 1e16 (its rational approximations).
    EXPECT_TRUE(Near(InvNormalLess(p), x, 1.2e-16L * std::fabs(x) + 4 * kEps * kEps));
    if (p >= 1e-15L) {
      // InvNormalGreater goes through 1 - p, whose rounding (half an ulp of 1) moves the
      // result by that much over the density.
      EXPECT_TRUE(Near(InvNormalGreater(1 - p), x, 1.2e-16L * std::fabs(x) + kEps / density));
    }
  }
  EXPECT_EQ(InvNormalLess(0.5L), 0);
  EXPECT_TRUE(RelNear(ZAlpha(0.025L), 1.95996398454005423552L, 2e-16L));
}

TEST(NormalTest, InverseRaisesOutsideOpenInterval) {
  for (Extended p : {Extended(0), Extended(1), Extended(-0.5L), Extended(1.5L), kNaN, kInf}) {
    ExpectRaises(rsValue01, [&] { InvNormalLess(p); });
    ExpectRaises(rsValue01, [&] { InvNormalGreater(p); });
    ExpectRaises(rsValue01, [&] { ZAlpha(p); });
    ExpectRaises(rsValue01, [&] { InvNormalDistLess(0, 1, p); });
    ExpectRaises(rsValue01, [&] { InvNormalDistGreater(0, 1, p); });
  }
  // P is checked before the standard deviation.
  ExpectRaises(rsValue01, [] { InvNormalDistLess(0, -1, 2); });
  ExpectRaises(rsStdDev, [] { InvNormalDistLess(0, -1, 0.5L); });
  ExpectRaises(rsStdDev, [] { InvNormalDistGreater(0, 1e-13L, 0.5L); });
}

// === Normal with parameters ====================================================================

TEST(NormalDistTest, ShiftedAndScaled) {
  // X - Mean and the division by StdDev = 2 are exact, so the standard values apply.
  for (const auto& [z, phi, cdf] : kNormalRef) {
    if (std::fabs(z) > 8) continue;
    const Extended x = 3 + 2 * z;
    SCOPED_TRACE(static_cast<double>(x));
    EXPECT_TRUE(RelNear(NormalPDF(3, 2, x), phi / 2, 4 * kEps * (2 + z * z)));
    if (z >= 0) {
      EXPECT_TRUE(Near(NormalDistLess(3, 2, x), cdf, 5e-18L));
    } else {
      // Mirrored: 1 - NormalLess(-z), an absolute error of the same size.
      EXPECT_TRUE(Near(NormalDistLess(3, 2, x), cdf, 5e-18L));
    }
    EXPECT_TRUE(Near(NormalDistGreater(3, 2, x), 1 - cdf, 5e-18L));
  }
  EXPECT_TRUE(RelNear(InvNormalDistLess(3, 2, 0.975L), 3 + 2 * 1.95996398454005423552L, 2e-16L));
  EXPECT_TRUE(RelNear(InvNormalDistGreater(3, 2, 0.025L), 3 + 2 * 1.95996398454005423552L, 2e-16L));
}

TEST(NormalDistTest, BetweenIgnoresOrder) {
  const Extended expected = 0.682689492137085897170465091264075844955825933453L;
  EXPECT_TRUE(Near(NormalDistBetween(0, 1, 1, -1), expected, 1e-17L));
  EXPECT_TRUE(Near(NormalDistBetween(0, 1, -1, 1), expected, 1e-17L));
  EXPECT_EQ(NormalDistBetween(0, 1, 2, 2 + 1e-13L), 0);  // the same within the tolerance
}

TEST(NormalDistTest, StdDevMustBePositive) {
  for (Extended sd : {Extended(0), Extended(-1), Extended(1e-13L), kNaN}) {
    ExpectRaises(rsStdDev, [&] { NormalPDF(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { NormalDistLess(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { NormalDistGreater(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { NormalDistBetween(0, sd, 1, 2); });
    ExpectRaises(rsStdDev, [&] { LogNormalPDF(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { LogNormalLess(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { LogNormalGreater(0, sd, 1); });
    ExpectRaises(rsStdDev, [&] { LogNormalBetween(0, sd, 1, 2); });
  }
}

// The inverses test the standard deviation as zero within the tolerance (|s| < QENTolerance)
// or negative, not as "not positive": QENTolerance itself passes, and a NaN gives NaN.
TEST(NormalDistTest, InverseStdDevIsZeroOrNegative) {
  for (Extended sd : {Extended(0), Extended(-1), Extended(1e-13L), Extended(4.9e-12L),
                      Extended(-4.9e-12L), Extended(-1e-11L)}) {
    SCOPED_TRACE(static_cast<double>(sd));
    ExpectRaises(rsStdDev, [&] { InvNormalDistLess(0, sd, 0.5L); });
    ExpectRaises(rsStdDev, [&] { InvNormalDistGreater(0, sd, 0.5L); });
    ExpectRaises(rsStdDev, [&] { InvLogNormalLess(0, sd, 0.5L); });
    ExpectRaises(rsStdDev, [&] { InvLogNormalGreater(0, sd, 0.5L); });
  }
  // InvNormalLess(0.5) is exactly 0, so the results are Mean and exp(Mean).
  EXPECT_EQ(InvNormalDistLess(3, QENTolerance, 0.5L), 3);
  EXPECT_EQ(InvNormalDistGreater(3, QENTolerance, 0.5L), 3);
  EXPECT_EQ(InvLogNormalLess(0, QENTolerance, 0.5L), 1);
  EXPECT_EQ(InvLogNormalGreater(0, QENTolerance, 0.5L), 1);
  ExpectRaises(rsStdDev, [] { NormalPDF(0, QENTolerance, 1); });  // "not positive" rejects it
  ExpectRaises(rsStdDev, [] { NormalDistLess(0, QENTolerance, 1); });
  EXPECT_TRUE(std::isnan(InvNormalDistLess(0, kNaN, 0.5L)));
  EXPECT_TRUE(std::isnan(InvLogNormalLess(0, kNaN, 0.5L)));
}

// === Log-normal ================================================================================

TEST(LogNormalTest, AgainstReference) {
  for (const auto& [mean, sd, x, density, cdf] : kLogNormalRef) {
    SCOPED_TRACE(static_cast<double>(x));
    EXPECT_TRUE(RelNear(LogNormalPDF(mean, sd, x), density, 1e-16L));
    // ln x is rounded (half an ulp, carried through the density of ln X) on top of the series.
    EXPECT_TRUE(Near(LogNormalLess(mean, sd, x), cdf, 1e-17L));
    EXPECT_TRUE(Near(LogNormalGreater(mean, sd, x), 1 - cdf, 1e-17L));
  }
  EXPECT_TRUE(Near(LogNormalBetween(0, 1, 1, std::exp(1.0L)), 0.341344746068542948585L, 1e-17L));
  EXPECT_EQ(LogNormalLess(0, 1, 0), 0);
  EXPECT_EQ(LogNormalLess(0, 1, -3), 0);
  // Round trip through the inverse.
  for (Extended p : {1e-6L, 0.2L, 0.5L, 0.9L}) {
    EXPECT_TRUE(
        RelNear(InvLogNormalLess(1, 0.5L, p), std::exp(1 + 0.5L * InvNormalLess(p)), 4 * kEps));
    EXPECT_TRUE(Near(LogNormalLess(1, 0.5L, InvLogNormalLess(1, 0.5L, p)), p, 1e-16L));
    EXPECT_TRUE(Near(LogNormalGreater(1, 0.5L, InvLogNormalGreater(1, 0.5L, p)), p, 1e-16L));
  }
}

TEST(LogNormalTest, Checks) {
  ExpectRaises(rsValueGZero, [] { LogNormalPDF(0, 1, 0); });
  ExpectRaises(rsValueGZero, [] { LogNormalPDF(0, 1, -1); });
  ExpectRaises(rsValue01, [] { InvLogNormalLess(0, -1, 0); });
  ExpectRaises(rsValue01, [] { InvLogNormalGreater(0, 1, 1); });
}

// === Incomplete gamma ==========================================================================

TEST(IncompleteGammaTest, AgainstReference) {
  for (const auto& [a, x, p] : kIncompleteGammaRef) {
    SCOPED_TRACE(::testing::Message()
                 << "a=" << static_cast<double>(a) << " x=" << static_cast<double>(x));
    // Both the series and the continued fraction stop at QENTolerance = 5e-12. The series
    // stops at a term <= 5e-12 of a sum >= 1, with a tail of at most term * x / (b + 1 - x);
    // the fraction stops when a step is at most 5e-12 relative. Both leave errors of the
    // order of 1e-11 relative (in P for the series, in 1 - P for the fraction), growing
    // where x is near a large a (the tail ratio x / b approaches 1); the exponent
    // a ln x - x - ln Gamma(a) adds its rounding, a few ulps of a ln x.
    const Extended slack = a > 1000 ? 2e-9L : 4e-11L;
    const Extended scale = std::fmin(p, 1 - p) + 16 * kEps * a * std::fabs(std::log(x));
    EXPECT_TRUE(Near(IncompleteGamma(a, x), p, slack * scale + 4 * kEps));
  }
}

TEST(IncompleteGammaTest, Edges) {
  EXPECT_EQ(IncompleteGamma(2.5L, 0), 0);
  EXPECT_EQ(IncompleteGamma(0.01L, 4e-12L), 0);  // zero within the tolerance
  EXPECT_EQ(IncompleteGamma(2.5L, 2e8L), 1);
  EXPECT_EQ(IncompleteGamma(1e9L, kInf), 1);
  // Results below exp(-88) are flushed to 0.
  EXPECT_EQ(IncompleteGamma(50, 1e-3L), 0);
  EXPECT_GT(IncompleteGamma(10, 0.1L), 0);
  EXPECT_TRUE(std::isnan(IncompleteGamma(kNaN, 2)));
  EXPECT_TRUE(std::isnan(IncompleteGamma(2, kNaN)));
  EXPECT_EQ(IncompleteGamma(kInf, 2), 0);
  ExpectRaises(rsValueGEZero, [] { IncompleteGamma(1, -1); });
  ExpectRaises(rsValueGEZero, [] { IncompleteGamma(-1, -1); });  // X is checked first
  ExpectRaises(rsValueGZero, [] { IncompleteGamma(0, 1); });
  ExpectRaises(rsValueGZero, [] { IncompleteGamma(-2, 1); });
}

TEST(IncompleteGammaTest, UpperUnregularised) {
  for (const auto& [a, x, upper] : kIncompleteGamma2Ref) {
    SCOPED_TRACE(static_cast<double>(a));
    // 1 - P(a, x) keeps the 1e-11 of the incomplete gamma relative to the smaller tail.
    EXPECT_TRUE(RelNear(IncompleteGamma2(a, x), upper, 1e-10L));
  }
  ExpectRaises(rsValueGEZero, [] { IncompleteGamma2(1, -1); });
  ExpectRaises(rsValueGZero, [] { IncompleteGamma2(0, 1); });
  ExpectRaises(rsDF, [] { IncompleteGamma2(0.2L, 1); });   // Round(0.4) = 0 degrees of freedom
  ExpectRaises(rsDF, [] { IncompleteGamma2(0.25L, 1); });  // Round(0.5) = 0: half to even
  // Round(1.5) = 2: A = 0.75 is treated as 1, Gamma(0.75) times e^-X.
  EXPECT_TRUE(
      RelNear(IncompleteGamma2(0.75L, 2), 1.2254167024651776451L * std::exp(-2.0L), 1e-10L));
}

// === Chi-square ================================================================================

TEST(ChiSquareTest, AgainstReference) {
  for (const auto& [x, df, p, density] : kChiSquareRef) {
    SCOPED_TRACE(::testing::Message()
                 << "x=" << static_cast<double>(x) << " df=" << static_cast<double>(df));
    const Extended slack = df > 1000 ? 2e-9L : 4e-11L;  // as for the incomplete gamma
    EXPECT_TRUE(Near(ChiSquareLess(x, DF(df)), p, slack * std::fmin(p, 1 - p) + 4 * kEps));
    EXPECT_TRUE(Near(ChiSquareGreater(x, DF(df)), 1 - p, slack * std::fmin(p, 1 - p) + 4 * kEps));
    // x^(df/2-1) e^(-x/2) / (2^(df/2) Gamma(df/2)): a few roundings, each growing with the
    // size of the exponents.
    EXPECT_TRUE(RelNear(ChiSquarePDF(x, DF(df)), density, 8 * kEps * (4 + x + df)));
  }
  EXPECT_TRUE(Near(ChiSquareBetween(2, 7.5L, 5), ChiSquareLess(7.5L, 5) - ChiSquareLess(2, 5), 0));
  EXPECT_LT(ChiSquareBetween(7.5L, 2, 5), 0);  // no reordering
  EXPECT_EQ(ChiSquarePDF(0, 2), 0.5L);
  EXPECT_EQ(ChiSquarePDF(0, 1), kInf);
  EXPECT_EQ(ChiSquareLess(0, 3), 0);
}

TEST(ChiSquareTest, Checks) {
  ExpectRaises(rsDF, [] { ChiSquareLess(1, 0); });
  ExpectRaises(rsDF, [] { ChiSquareGreater(1, 0); });
  ExpectRaises(rsDF, [] { ChiSquareBetween(1, 2, 0); });
  ExpectRaises(rsDF, [] { ChiSquarePDF(1, 0); });
  ExpectRaises(rsDF, [] { InvChiSquareLess(0.5L, 0); });
  ExpectRaises(rsDF, [] { InvChiSquareGreater(0.5L, 0); });
  ExpectRaises(rsValueGEZero, [] { ChiSquareLess(-1, 3); });
  ExpectRaises(rsValueGEZero, [] { ChiSquareLess(-1, 0); });  // X first
  ExpectRaises(rsValueGEZero, [] { ChiSquarePDF(-1, 3); });
  ExpectRaises(rsValueGEZero, [] { ChiSquareBetween(-1, 2, 3); });
  // Outside AS 91's probability range there is no start and no bracket above zero.
  for (Extended p : {0.0L, 1e-7L, 0.9999999L, 1.0L, -1.0L, 2.0L}) {
    ExpectRaises(rsValueGEZero, [&] { InvChiSquareLess(p, 4); });
  }
  ExpectRaises(rsValueGEZero, [] { InvChiSquareLess(kNaN, 4); });
}

TEST(ChiSquareTest, InverseAgainstReference) {
  for (const auto& [p, df, x, density] : kInvChiSquareRef) {
    // Where x/2 is zero within the tolerance, ChiSquareLess is 0 (see the next test).
    if (x < 2e-11L) continue;
    SCOPED_TRACE(::testing::Message()
                 << "p=" << static_cast<double>(p) << " df=" << static_cast<double>(df));
    // Bisection stops when ChiSquareLess is within 1e-16 of P; ChiSquareLess itself is good
    // to about 4e-11 of the smaller tail (2e-9 for df > 1000). Either error in probability
    // moves x by itself over the density, plus the last halving's rounding.
    const Extended slack = df > 1000 ? 2e-9L : 4e-11L;
    const Extended bound = (1e-16L + slack * std::fmin(p, 1 - p)) / density + 8 * kEps * x;
    EXPECT_TRUE(
        Near(InvChiSquareLess(p, DF(df)), x,
             bound));  // 1 - p rounds, which may take the ends of AS 91's range just outside it.
    if (p > 0.00001L && p < 0.99999L) {
      EXPECT_TRUE(Near(InvChiSquareGreater(1 - p, DF(df)), x, bound + kEps / density));
    }
  }
}

TEST(ChiSquareTest, InverseWhereTheDistributionFlushesToZero) {
  // For one degree of freedom and P = 2e-6 the root is pi P^2 / 2 = 6.2832e-12, so x/2 is
  // zero within the tolerance and ChiSquareLess gives 0 at every midpoint: the bisection
  // climbs to the upper end of its bracket, 1.1 times AS 91's start (which is close to
  // the root, pi P^2 / 2 being its small-chi-square formula).
  const Extended root = QENPi * 2e-6L * 2e-6L / 2;
  EXPECT_TRUE(RelNear(InvChiSquareLess(2e-6L, 1), 1.1L * root, 1e-6L));
}

// === F =========================================================================================

TEST(FDistTest, AgainstReference) {
  for (const auto& [x, d1, d2, p, density] : kFDistRef) {
    SCOPED_TRACE(::testing::Message() << "x=" << static_cast<double>(x) << " " << d1 << ","
                                      << d2);  // 1 - I_w(d2/2, d1/2): a few ulps of 1, the
                                               // incomplete beta's relative 1e-17, and the
    // rounding of w = d2 / (d2 + x d1), which near 1 stands for a relative change in x of
    // eps (d2 + x d1)^2 / (x d1 d2), moving P by that times x times the density.
    const Extended wRounding = 2 * kEps * (d2 + x * d1) * (d2 + x * d1) / (d1 * d2) * density;
    const Extended bound = 2e-17L + wRounding;
    EXPECT_TRUE(Near(FDistLess(x, DF(d1), DF(d2)), p, bound));
    EXPECT_TRUE(Near(FDistGreater(x, DF(d1), DF(d2)), 1 - p, bound));
    EXPECT_TRUE(RelNear(FDistPDF(x, DF(d1), DF(d2)), density, 1e-17L * (8 + d1 + d2)));
  }
  EXPECT_EQ(FDistLess(kInf, 3, 4), 1);
  EXPECT_TRUE(Near(FDistPDF(0, 2, 5), 1, 4 * kEps));  // 1 at 0 for two numerator degrees
  EXPECT_EQ(FDistPDF(0, 5, 5), 0);
  EXPECT_TRUE(Near(FDistBetween(1, 3.5L, 5, 10), FDistLess(3.5L, 5, 10) - FDistLess(1, 5, 10), 0));
}

TEST(FDistTest, DensityOverWideDegreesOfFreedom) {
  // A few units in the last place, plus the rounding of the logarithms that make up ln f,
  // which carries over to f as a relative error of a few ulps of |ln f|.
  for (const auto& [x, d1, d2, density] : kFDistDensityRef) {
    const Extended got = FDistPDF(x, DF(d1), DF(d2));
    const Extended bound = 4 * kEps + 2 * kEps * std::fabs(std::log(density));
    EXPECT_TRUE(RelNear(got, density, bound))
        << "x=" << static_cast<double>(x) << " " << d1 << "," << d2 << " rel error "
        << static_cast<double>((got - density) / density);
  }
}

TEST(FDistTest, InverseAgainstReference) {
  for (const auto& [p, d1, d2, x, density] : kInvFDistRef) {
    SCOPED_TRACE(::testing::Message() << "p=" << static_cast<double>(p) << " " << d1 << "," << d2);
    // Ridders' search stops when FDistLess is within QENTolerance (5e-12) of P or the
    // estimate moves by at most 1e-16: up to 5e-12 in probability, over the density.
    const Extended bound = 5e-12L / density + 1e-16L + 8 * kEps * x;
    EXPECT_TRUE(Near(InvFDistLess(p, DF(d1), DF(d2)), x, bound));
    EXPECT_TRUE(Near(InvFDistGreater(1 - p, DF(d1), DF(d2)), x, bound));
  }
  EXPECT_EQ(InvFDistLess(1, 3, 4), 0);
  EXPECT_EQ(InvFDistGreater(0, 3, 4), 0);
  // FDistLess(1e-16, 3, 4) is 0 in Extended, so the bracket's lower end is already a root.
  EXPECT_EQ(InvFDistLess(0, 3, 4), 1e-16L);
  // A probability below FDistLess(1e-16) (about 0.7e-8 here) pushes the lower end of the
  // bracket below zero, where FDistLess raises.
  ExpectRaises(rsValueGZero, [] { InvFDistLess(1e-9L, 1, 5); });
  ExpectRaises(rsValueGZero, [] { InvFDistLess(0, 1, 5); });
  // Up to the largest probability below 1 the root stays within the 99 expansions.
  const Extended nearOne = 1 - kEps / 2;
  EXPECT_TRUE(RelNear(FDistLess(InvFDistLess(nearOne, 1, 1), 1, 1), nearOne, 1e-11L));
}

TEST(FDistTest, Checks) {
  ExpectRaises(rsValueGZero, [] { FDistLess(0, 3, 4); });
  ExpectRaises(rsValueGZero, [] { FDistLess(-1, 3, 4); });
  ExpectRaises(rsValueGZero, [] { FDistLess(kNaN, 3, 4); });
  ExpectRaises(rsValueGZero, [] { FDistLess(0, 0, 4); });  // X first
  ExpectRaises(rsValueGZero, [] { FDistGreater(0, 3, 4); });
  ExpectRaises(rsValueGZero, [] { FDistBetween(0, 1, 3, 4); });
  ExpectRaises(rsDF, [] { FDistLess(1, 0, 4); });
  ExpectRaises(rsDF, [] { FDistLess(1, 3, 0); });
  ExpectRaises(rsDF, [] { FDistPDF(1, 3, 0); });
  ExpectRaises(rsValueGEZero, [] { FDistPDF(-1, 3, 4); });
  ExpectRaises(rsDF, [] { InvFDistLess(0.5L, 0, 4); });
  ExpectRaises(rsDF, [] { InvFDistGreater(0.5L, 3, 0); });
  for (Extended p : {-0.1L, 1.1L, static_cast<Extended>(kNaN)}) {
    ExpectRaises(rsValue01Inc, [&] { InvFDistLess(p, 3, 4); });
    ExpectRaises(rsValue01Inc, [&] { InvFDistGreater(p, 3, 4); });
  }
  ExpectRaises(rsValue01Inc, [] { InvFDistLess(2, 0, 4); });  // P first
}

// === Student t =================================================================================

// The error of StudentTLess: the incomplete beta's relative 1e-17 (of the smaller tail), a few
// ulps of 1, and the rounding of x = df / (df + t^2), which near 1 (t^2 much below df)
// stands for a relative change in t of eps (df + t^2) / t^2 and so moves P by the density
// times eps (df + t^2) / |t|: the documented formula's own conditioning.
Extended StudentTLessError(Extended t, Extended df, Extended p, Extended density) {
  const Extended conditioning = t == 0 ? 0 : 2 * kEps * density * (df + t * t) / std::fabs(t);
  return 4e-17L * std::fmin(p, 1 - p) + 4 * kEps + conditioning;
}
TEST(StudentTTest, AgainstReference) {
  for (const auto& [t, df, p, density] : kStudentTRef) {
    SCOPED_TRACE(::testing::Message()
                 << "t=" << static_cast<double>(t) << " df=" << static_cast<double>(df));
    const Extended bound = StudentTLessError(t, df, p, density);
    EXPECT_TRUE(Near(StudentTLess(t, DF(df)), p, bound));
    EXPECT_TRUE(Near(StudentTGreater(t, DF(df)), 1 - p, bound));
    EXPECT_TRUE(RelNear(StudentTPDF(t, DF(df)), density, 16 * kEps * (4 + t * t)));
  }
  for (LongWord df : {1U, 2U, 3U, 10U, 1000U, 4000000000U}) EXPECT_EQ(StudentTLess(0, df), 0.5L);
  EXPECT_EQ(StudentTLess(kInf, 3), 1);
  EXPECT_EQ(StudentTLess(-kInf, 3), 0);
  EXPECT_TRUE(std::isnan(StudentTLess(kNaN, 3)));
  EXPECT_TRUE(Near(StudentTBetween(-2, 2, 1), 2 * std::atan(2.0L) / QENPi, 8 * kEps));
}

TEST(StudentTTest, InverseAgainstReference) {
  for (const auto& [p, df, t, density] : kInvStudentTRef) {
    SCOPED_TRACE(::testing::Message()
                 << "p=" << static_cast<double>(p) << " df=" << static_cast<double>(df));
    // Bisection to 1e-16 in probability, on top of StudentTLess's own error (as above),
    // both divided by the density; the bracket comes from our Hill-type start.
    const Extended lessError = StudentTLessError(t, df, p, density);
    const Extended bound = (1e-16L + lessError) / density + 8 * kEps * std::fabs(t);
    EXPECT_TRUE(Near(InvStudentTLess(p, DF(df)), t, bound));
    EXPECT_TRUE(Near(InvStudentTGreater(1 - p, DF(df)), t, bound + kEps / density));
  }
  EXPECT_EQ(InvStudentTLess(0.5L, 7), 0);
  EXPECT_EQ(InvStudentTLess(0, 7), -kInf);
  EXPECT_EQ(InvStudentTLess(1, 7), kInf);
}

TEST(StudentTTest,
     StartIsInsideTheBracketEverywhere) {  // The bisection can only reach a root within 10 % of the
                                           // start; a scan over degrees of
  // freedom and probabilities shows the result always meets the 1e-16 stopping rule, or,
  // where StudentTLess moves in steps coarser than that (large df, small t), lands within
  // one step of P.
  for (LongWord df : {1U, 2U, 3U, 4U, 5U, 6U, 9U, 15U, 40U, 300U, 5000U, 1000000U}) {
    for (Extended p :
         {1e-300L, 1e-30L, 1e-12L, 1e-5L, 0.01L, 0.1L, 0.3L, 0.49L, 0.51L, 0.8L, 0.975L, 0.9999L}) {
      SCOPED_TRACE(::testing::Message() << "df=" << df << " p=" << static_cast<double>(p));
      const Extended t = InvStudentTLess(p, df);
      const Extended step = StudentTLessError(t, df, 0, StudentTPDF(t, df));
      EXPECT_TRUE(Near(StudentTLess(t, df), p, 1e-16L + 64 * kEps * p + step));
    }
  }
}

TEST(StudentTTest, InverseGivesTheRecordedResultsOverAGrid) {
  // Most halvings of the bisection are settled by bounds on the distribution function instead
  // of evaluating it; the results must be those of the plain bisection to the bit. The hash
  // (FNV-1a over the 10 value bytes of each result) was recorded from the plain bisection.
  std::uint64_t hash = 0xCBF29CE484222325ULL;
  for (LongWord df : {1U, 2U, 3U, 4U, 5U, 7U, 9U, 15U, 40U, 300U, 5000U, 1000000U, 4000000000U}) {
    for (Extended p : {1e-300L, 1e-30L, 1e-12L, 1e-5L, 0.01L, 0.1L, 0.3L, 0.49L, 0.500000001L,
                       0.51L, 0.8L, 0.975L, 0.9999L, 1 - 1e-15L}) {
      const Extended t = InvStudentTLess(p, df);
      unsigned char bytes[sizeof(Extended)] = {};
      std::memcpy(bytes, &t, sizeof(Extended));
      for (int i = 0; i < 10; ++i) hash = (hash ^ bytes[i]) * 0x100000001B3ULL;
    }
  }
  EXPECT_EQ(hash, 8501785353977511018ULL);
}

TEST(StudentTTest, Checks) {
  ExpectRaises(rsDF, [] { StudentTLess(1, 0); });
  ExpectRaises(rsDF, [] { StudentTGreater(1, 0); });
  ExpectRaises(rsDF, [] { StudentTBetween(1, 2, 0); });
  ExpectRaises(rsDF, [] { StudentTPDF(1, 0); });
  ExpectRaises(rsDF, [] { InvStudentTLess(0.5L, 0); });
  ExpectRaises(rsDF, [] { InvStudentTGreater(0.5L, 0); });
  for (Extended p : {-0.1L, 1.1L, static_cast<Extended>(kNaN)}) {
    ExpectRaises(rsValue01Inc, [&] { InvStudentTLess(p, 3); });
    ExpectRaises(rsValue01Inc, [&] { InvStudentTGreater(p, 3); });
  }
  ExpectRaises(rsValue01Inc, [] { InvStudentTLess(-1, 0); });  // P first
}

// === Exponential ===============================================================================

TEST(ExponentialTest, AgainstReferenceWithReversedDensityArguments) {
  for (const auto& [mean, x, p, density] : kExponentialRef) {
    SCOPED_TRACE(static_cast<double>(x));
    EXPECT_TRUE(Near(ExponentialLess(mean, x), p, 4 * kEps * (1 + x / mean)));
    EXPECT_TRUE(Near(ExponentialGreater(mean, x), 1 - p, 4 * kEps * (1 + x / mean)));
    EXPECT_TRUE(RelNear(ExponentialPDF(x, mean), density, 4 * kEps * (1 + x / mean)));
  }
  EXPECT_EQ(ExponentialPDF(0, 4), 0.25L);
  EXPECT_TRUE(Near(ExponentialBetween(1, 1, 2), std::exp(-1.0L) - std::exp(-2.0L), 4 * kEps));
  EXPECT_LT(ExponentialBetween(1, 2, 1), 0);
}

TEST(ExponentialTest, Checks) {
  ExpectRaises(rsExpDistInvalid, [] { ExponentialLess(0, 1); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialLess(-1, 1); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialLess(1, -1); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialGreater(1, -1); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialBetween(1, -1, 2); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialPDF(1, 0); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialPDF(-1, 1); });
  ExpectRaises(rsExpDistInvalid, [] { ExponentialPDF(1, kNaN); });
  // The order matters: ExponentialPDF(Mean = 2, X = -1) would be valid the other way round.
  ExpectRaises(rsExpDistInvalid, [] { ExponentialPDF(2, -1); });
  EXPECT_NO_THROW(ExponentialLess(2, 1));
}

// === Beta ======================================================================================

TEST(BetaTest, AgainstReference) {
  for (const auto& [x, a, b, p, density] : kBetaRef) {
    SCOPED_TRACE(::testing::Message() << "x=" << static_cast<double>(x) << " a="
                                      << static_cast<double>(a) << " b=" << static_cast<double>(b));
    EXPECT_TRUE(RelNear(BetaDistLess(x, a, b), p, 1e-16L));
    EXPECT_TRUE(Near(BetaDistGreater(x, a, b), 1 - p, 1e-16L * p + 4 * kEps));
    // The power factors lose (a + b) ulps of their arguments' rounding.
    EXPECT_TRUE(RelNear(BetaPDF(x, a, b), density,
                        8 * kEps * (4 + a + b)));  // The same through an interval, given with its
                                                   // bounds in reverse order: x maps from
    // 4x in [0, 4], exactly.
    const Extended y = 4 * x;
    EXPECT_TRUE(RelNear(BetaDistLess(y, a, b, 4, 0), p, 1e-16L));
    EXPECT_TRUE(RelNear(BetaPDF(y, a, b, 0, 4), density / 4, 8 * kEps * (4 + a + b)));
  }
  EXPECT_EQ(BetaDistLess(-0.5L, 2, 3), 0);
  EXPECT_EQ(BetaDistLess(1.5L, 2, 3), 1);
  EXPECT_EQ(BetaPDF(1.5L, 2, 3), 0);
  EXPECT_EQ(BetaPDF(-0.5L, 2, 3), 0);
  EXPECT_TRUE(Near(BetaDistBetween(0.2L, 0.7L, 2, 3),
                   BetaDistLess(0.7L, 2, 3) - BetaDistLess(0.2L, 2, 3), 0));
  EXPECT_LT(BetaDistBetween(0.7L, 0.2L, 2, 3), 0);
  EXPECT_TRUE(Near(BetaDistBetween(10.5L, 11, 1, 1, 10, 12), 0.25L, 4 * kEps));
  EXPECT_TRUE(Near(BetaDistGreater(11.5L, 1, 1, 10, 12), 0.25L, 4 * kEps));
}

TEST(BetaTest, InverseAgainstReference) {
  for (const auto& [p, a, b, x] : kInvBetaRef) {
    SCOPED_TRACE(static_cast<double>(p));
    EXPECT_TRUE(RelNear(InvBetaDistLess(p, a, b), x, 1e-15L));
    EXPECT_TRUE(RelNear(InvBetaDistGreater(1 - p, a, b), x, 1e-15L));
    EXPECT_TRUE(RelNear(InvBetaDistLess(p, a, b, 3, 1), 1 + 2 * x, 1e-15L));
    EXPECT_TRUE(RelNear(InvBetaDistGreater(1 - p, a, b, 1, 3), 1 + 2 * x, 1e-15L));
  }
  EXPECT_EQ(InvBetaDistLess(0, 2, 3), 0);
  EXPECT_EQ(InvBetaDistLess(1, 2, 3), 1);
  EXPECT_EQ(InvBetaDistLess(0, 2, 3, 5, 7), 5);
  EXPECT_EQ(InvBetaDistLess(1, 2, 3, 7, 5), 7);
}

TEST(BetaTest, Checks) {
  for (Extended bad : {Extended(0), Extended(-1), kNaN}) {
    ExpectRaises(rsValueGZero, [&] { BetaDistLess(0.5L, bad, 1); });
    ExpectRaises(rsValueGZero, [&] { BetaDistGreater(0.5L, 1, bad); });
    ExpectRaises(rsValueGZero, [&] { BetaDistBetween(0.1L, 0.5L, bad, 1); });
    ExpectRaises(rsValueGZero, [&] { InvBetaDistLess(0.5L, 1, bad); });
    ExpectRaises(rsValueGZero, [&] { InvBetaDistGreater(0.5L, bad, 1); });
    ExpectRaises(rsValueGZero, [&] { BetaPDF(0.5L, bad, 1); });
    ExpectRaises(rsValueGZero, [&] { BetaDistLess(0.5L, bad, 1, 0, 2); });
    ExpectRaises(rsValueGZero, [&] { BetaPDF(0.5L, 1, bad, 0, 2); });
    ExpectRaises(rsValueGZero, [&] { InvBetaDistLess(0.5L, 1, bad, 0, 2); });
  }
  for (Extended p : {-0.1L, 1.1L, static_cast<Extended>(kNaN)}) {
    ExpectRaises(rsValue01Inc, [&] { InvBetaDistLess(p, 2, 3); });
    ExpectRaises(rsValue01Inc, [&] { InvBetaDistGreater(p, 2, 3); });
    ExpectRaises(rsValue01Inc, [&] { InvBetaDistLess(p, 2, 3, 0, 1); });
  }
  ExpectRaises(rsValue01Inc, [] { InvBetaDistLess(2, -1, 3); });  // P before the shapes
  // Equal bounds raise rsSameValue before anything else.
  ExpectRaises(rsSameValue, [] { BetaDistLess(0.5L, -1, 3, 2, 2); });
  ExpectRaises(rsSameValue, [] { BetaDistGreater(0.5L, 2, 3, 2, 2); });
  ExpectRaises(rsSameValue, [] { BetaDistBetween(0.5L, 1, 2, 3, 2, 2); });
  ExpectRaises(rsSameValue, [] { InvBetaDistLess(2, 2, 3, 2, 2); });
  ExpectRaises(rsSameValue, [] { InvBetaDistGreater(0.5L, 2, 3, 2, 2); });
  ExpectRaises(rsSameValue, [] { BetaPDF(0.5L, 2, 3, 2, 2); });
}

// === Non-finite arguments ======================================================================

// Every function given NaN or an infinity in each argument either raises its family's
// identifier or returns; none may loop for ever (the test would time out).
TEST(NonFiniteTest, EveryFunctionReturnsOrRaises) {
  const Extended odd[] = {kNaN, kInf, -kInf};
  // Each call on its own, so that a raise in one does not skip the others.
  const auto tryCall = [](auto call) {
    try {
      (void)call();
    } catch (const EMathError&) {
    }
  };
  TQENFloatVector xs, ys;
  for (Extended v : odd) {
    tryCall([&] { return NormalZ(v); });
    tryCall([&] { return NormalLess(v); });
    tryCall([&] { return NormalGreater(v); });
    tryCall([&] { return InvNormalLess(v); });
    tryCall([&] { return InvNormalGreater(v); });
    tryCall([&] { return ZAlpha(v); });
    for (int slot = 0; slot < 3; ++slot) {
      Extended a[3] = {0, 1, 0.5L};
      a[slot] = v;
      tryCall([&] { return NormalPDF(a[0], a[1], a[2]); });
      tryCall([&] { return NormalDistLess(a[0], a[1], a[2]); });
      tryCall([&] { return NormalDistBetween(a[0], a[1], a[2], 1); });
      tryCall([&] { return InvNormalDistLess(a[0], a[1], a[2]); });
      tryCall([&] { return InvLogNormalGreater(a[0], a[1], a[2]); });
      tryCall([&] { return LogNormalPDF(a[0], a[1], a[2]); });
      tryCall([&] { return LogNormalLess(a[0], a[1], a[2]); });
      tryCall([&] { return BetaDistLess(a[2], a[0] + 2, a[1]); });
      tryCall([&] { return InvBetaDistLess(a[2], a[1], a[0] + 2); });
      tryCall([&] { return BetaPDF(a[2], a[1], 2, a[0], 3); });
      tryCall([&] { return BetaDistLess(a[1], 2, 3, a[0], a[2]); });
      tryCall([&] { return ExponentialLess(a[1], a[2]); });
      tryCall([&] { return ExponentialPDF(a[2], a[1]); });
      tryCall([&] {
        NormalPDFValues(a[0], a[1], a[2], 1, 3, xs, ys);
        return 0;
      });
      tryCall([&] {
        ChiSquarePDFValues(3, a[2], a[0], 3, xs, ys);
        return 0;
      });
      tryCall([&] {
        LogNormalPDFValues(a[0], a[1], a[2], 2, 3, xs, ys);
        return 0;
      });
    }
    tryCall([&] { return IncompleteGamma(v, 2); });
    tryCall([&] { return IncompleteGamma(2, v); });
    tryCall([&] { return IncompleteGamma2(v, 1); });
    tryCall([&] { return IncompleteGamma2(1, v); });
    for (LongWord df : {1U, 7U, 4294967295U}) {
      tryCall([&] { return ChiSquareLess(v, df); });
      tryCall([&] { return ChiSquarePDF(v, df); });
      tryCall([&] { return InvChiSquareLess(v, df); });
      tryCall([&] { return FDistLess(v, df, 3); });
      tryCall([&] { return FDistPDF(v, 3, df); });
      tryCall([&] { return InvFDistLess(v, df, 3); });
      tryCall([&] { return StudentTLess(v, df); });
      tryCall([&] { return StudentTPDF(v, df); });
      tryCall([&] { return InvStudentTLess(v, df); });
    }
  }
  // Extreme but finite degrees of freedom, probabilities and shapes.
  tryCall([] { return InvChiSquareLess(0.5L, 4294967295U); });
  tryCall([] { return InvChiSquareLess(0.999998L, 1); });
  tryCall([] { return InvStudentTLess(1e-4000L, 3); });
  tryCall([] { return InvStudentTLess(0.3L, 4294967295U); });
  tryCall([] { return InvFDistLess(1e-4000L, 4294967295U, 4294967295U); });
  tryCall([] { return InvFDistLess(0.5L, 1, 4294967295U); });
  tryCall([] { return IncompleteGamma(1e300L, 1e7L); });
  tryCall([] { return IncompleteGamma(9.9e7L, 9.9e7L); });
  tryCall([] { return IncompleteGamma(1e-300L, 0.5L); });
  SUCCEED();
}

// === Density tables ============================================================================

// One table function with its density, for the shared tests below.
struct TableCase {
  std::string name;
  std::function<void(Extended, Extended, LongWord, TQENFloatVector&, TQENFloatVector&)> table;
  std::function<Extended(Extended)> density;
  bool zeroBelowZero;
  std::function<void(TQENFloatVector&, TQENFloatVector&)> failing;
  TResStringId failure;
  Extended offset = 0;  // the table's points are the requested ones plus this
};

std::vector<TableCase> TableCases() {
  using V = TQENFloatVector;
  return {
      {"Normal",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         NormalPDFValues(1, 2, lo, hi, n, x, y);
       },
       [](Extended x) { return NormalPDF(1, 2, x); }, false,
       [](V& x, V& y) { NormalPDFValues(1, 0, 0, 1, 4, x, y); }, rsStdDev},
      {"LogNormal",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         LogNormalPDFValues(0, 1, lo + 4, hi + 4, n, x, y);
       },
       [](Extended x) { return LogNormalPDF(0, 1, x); }, false,
       [](V& x, V& y) { LogNormalPDFValues(0, 1, 0, 2, 4, x, y); }, rsValueGZero, 4},
      {"ChiSquare",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         ChiSquarePDFValues(3, lo, hi, n, x, y);
       },
       [](Extended x) { return ChiSquarePDF(x, 3); }, true,
       [](V& x, V& y) { ChiSquarePDFValues(0, 0, 1, 4, x, y); }, rsDF},
      {"F",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         FDistPDFValues(3, 7, lo, hi, n, x, y);
       },
       [](Extended x) { return FDistPDF(x, 3, 7); }, true,
       [](V& x, V& y) { FDistPDFValues(3, 0, 0, 1, 4, x, y); }, rsDF},
      {"StudentT",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         StudentTPDFValues(5, lo, hi, n, x, y);
       },
       [](Extended x) { return StudentTPDF(x, 5); }, false,
       [](V& x, V& y) { StudentTPDFValues(0, 0, 1, 4, x, y); }, rsDF},
      {"Exponential",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         ExponentialPDFValues(2, lo, hi, n, x, y);
       },
       [](Extended x) { return ExponentialPDF(x, 2); }, true,
       [](V& x, V& y) { ExponentialPDFValues(-2, 0, 1, 4, x, y); }, rsExpDistInvalid},
      {"Beta",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         BetaPDFValues(2, 3, lo, hi, n, x, y);
       },
       [](Extended x) { return BetaPDF(x, 2, 3); }, false,
       [](V& x, V& y) { BetaPDFValues(0, 3, 0, 1, 4, x, y); }, rsValueGZero},
      {"BetaInterval",
       [](Extended lo, Extended hi, LongWord n, V& x, V& y) {
         BetaPDFValues(2, 3, 4, -1, lo, hi, n, x, y);
       },
       [](Extended x) { return BetaPDF(x, 2, 3, -1, 4); }, false,
       [](V& x, V& y) { BetaPDFValues(2, 3, 1, 1, 0, 1, 4, x, y); }, rsSameValue},
  };
}

TEST(PDFValuesTest, PointsAndDensities) {
  for (const TableCase& c : TableCases()) {
    SCOPED_TRACE(c.name);
    TQENFloatVector xs{1, 2, 3}, ys{4};
    c.table(-1, 1, 4, xs, ys);
    ASSERT_EQ(xs.size(), 5U);
    ASSERT_EQ(ys.size(), 5U);
    for (std::size_t i = 0; i < 5; ++i) {
      const Extended x = c.offset - 1 + 0.5L * static_cast<Extended>(i);  // exact
      EXPECT_EQ(Extended(xs[i]), x);
      if (c.zeroBelowZero && x < 0) {
        EXPECT_EQ(Extended(ys[i]), 0);
      } else {
        EXPECT_EQ(Extended(ys[i]), c.density(x));
      }
    }
  }
}

TEST(PDFValuesTest, ZeroPointsGiveOnePointAtXLow) {
  for (const TableCase& c : TableCases()) {
    SCOPED_TRACE(c.name);
    TQENFloatVector xs, ys;
    c.table(0.25L, 0.75L, 0, xs, ys);
    ASSERT_EQ(xs.size(), 1U);
    ASSERT_EQ(ys.size(), 1U);
    EXPECT_EQ(Extended(xs[0]), c.offset + 0.25L);
    EXPECT_EQ(Extended(ys[0]), c.density(c.offset + 0.25L));
  }
}

TEST(PDFValuesTest, FailedChecksLeaveBothOutputsEmpty) {
  for (const TableCase& c : TableCases()) {
    SCOPED_TRACE(c.name);
    TQENFloatVector xs{1, 2, 3}, ys{4, 5};
    ExpectRaises(c.failure, [&] { c.failing(xs, ys); });
    EXPECT_TRUE(xs.empty());
    EXPECT_TRUE(ys.empty());
  }
}

TEST(PDFValuesTest, DescendingRange) {
  TQENFloatVector xs, ys;
  ChiSquarePDFValues(2, 2, -2, 2, xs, ys);
  ASSERT_EQ(xs.size(), 3U);
  EXPECT_EQ(Extended(xs[0]), 2);
  EXPECT_EQ(Extended(xs[1]), 0);
  EXPECT_EQ(Extended(xs[2]), -2);
  EXPECT_EQ(Extended(ys[1]), 0.5L);
  EXPECT_EQ(Extended(ys[2]), 0);
}

}  // namespace
}  // namespace tovrin
