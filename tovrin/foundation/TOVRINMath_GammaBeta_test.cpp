// Tests of Gamma, LnGamma, Beta, IncompleteBeta and InverseIncompleteBeta against reference
// values computed at 256 bits by TOVRINMath_GammaBeta_reference.py, plus exact values, identities,
// round trips and the domain errors.
#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <iterator>
#include <limits>
#include <string>
#include <utility>

#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINMath.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

#include "tovrin/foundation/TOVRINMath_GammaBeta_reference.inc"

constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
constexpr Extended kInf = std::numeric_limits<Extended>::infinity();

Extended RelativeError(Extended got, Extended expected) {
  if (got == expected) return 0.0L;
  if (expected == 0.0L) return std::fabs(got);
  return std::fabs((got - expected) / expected);
}

std::string Describe(const char* name, Extended x, Extended a, Extended b) {
  char buffer[160];
  std::snprintf(buffer, sizeof buffer, "%s(%.21Lg, %.21Lg, %.21Lg)", name, x, a, b);
  return buffer;
}

// Runs F over a table, checks each entry against its tolerance and reports the largest error.
template <typename Table, typename Call>
void CheckTable(const char* name, const Table& table, Call call) {
  Extended worst = 0.0L;
  for (const auto& row : table) {
    const auto [got, label] = call(row);
    const Extended err = RelativeError(got, row.expected);
    char values[96];
    std::snprintf(values, sizeof values, " = %.20Lg, expected %.20Lg", got, row.expected);
    EXPECT_LE(err, row.tolerance) << label << values;
    if (err > worst) worst = err;
  }
  std::printf("[ info     ] %s: %zu reference values, largest relative error %.3Lg\n", name,
              std::size(table), worst);
}

using testing::ExpectRaises;

// --- Gamma ------------------------------------------------------------------------------------

TEST(SpecialGamma, MatchesReferenceTable) {
  CheckTable("Gamma", kGammaTable, [](const SpecialCase1& r) {
    return std::pair{Gamma(r.x), Describe("Gamma", r.x, 0, 0)};
  });
}

TEST(SpecialGamma, SmallIntegersAreExactFactorials) {
  Extended factorial = 1.0L;
  for (int n = 1; n <= 11; ++n) {
    EXPECT_EQ(Gamma(static_cast<Extended>(n)), factorial) << n;
    factorial *= n;
  }
}

TEST(SpecialGamma, OverflowEdgeAndNegativeArguments) {
  // 1754! = Gamma(1755) is the largest finite factorial; Gamma(1754.5) fits as well.
  EXPECT_TRUE(std::isfinite(Gamma(1755.0L)));
  EXPECT_GT(Gamma(1755.0L), 1e4930L);
  EXPECT_TRUE(std::isfinite(Gamma(1754.5L)));
  EXPECT_TRUE(std::isfinite(Gamma(1755.5L)));
  EXPECT_EQ(Gamma(1756.0L), kInf);
  EXPECT_EQ(Gamma(1e6L), kInf);
  EXPECT_EQ(Gamma(kInf), kInf);
  // Negative arguments alternate in sign; far below the last representable value the result is
  // a signed zero.
  EXPECT_TRUE(Gamma(-0.5L) < 0 && Gamma(-1.5L) > 0 && Gamma(-2.5L) < 0);
  EXPECT_EQ(Gamma(-2000.5L), 0.0L);
}

TEST(SpecialGamma, RecurrenceHoldsAcrossMethodBoundaries) {
  // Gamma(x + 1) = x Gamma(x) on both sides of every switch between methods.
  for (Extended x :
       {-12.25L, -11.75L, -0.6L, -0.4L, 0.4L, 0.6L, 1.4L, 1.6L, 2.4L, 2.6L, 11.4L, 11.6L, 12.3L}) {
    EXPECT_LE(RelativeError(Gamma(x + 1.0L), x * Gamma(x)), 1e-17L) << static_cast<double>(x);
  }
}

// --- LnGamma ----------------------------------------------------------------------------------

TEST(SpecialLnGamma, MatchesReferenceTable) {
  CheckTable("LnGamma", kLnGammaTable, [](const SpecialCase1& r) {
    return std::pair{LnGamma(r.x), Describe("LnGamma", r.x, 0, 0)};
  });
}

TEST(SpecialLnGamma, AgreesWithGammaWhereGammaIsFiniteAndHasExactZeros) {
  EXPECT_EQ(LnGamma(1.0L), 0.0L);
  EXPECT_EQ(LnGamma(2.0L), 0.0L);
  for (Extended x : {0.01L, 3.7L, 20.5L, 170.25L, 1000.5L, 1750.0L}) {
    const Extended lg = LnGamma(x);
    EXPECT_LE(std::fabs(lg - std::log(Gamma(x))), 1e-17L * std::fabs(lg) + 1e-19L)
        << static_cast<double>(x);
  }
}

TEST(SpecialLnGamma, InfinityIsInfinite) {
  EXPECT_EQ(LnGamma(kInf), kInf);
  EXPECT_EQ(LnGamma(std::numeric_limits<Extended>::max()), kInf);
}

// --- Beta -------------------------------------------------------------------------------------

TEST(SpecialBeta, MatchesReferenceTable) {
  CheckTable("Beta", kBetaTable, [](const SpecialCase2& r) {
    return std::pair{Beta(r.a, r.b), Describe("Beta", r.a, r.b, 0)};
  });
}

TEST(SpecialBeta, SymmetricAndExactForSmallIntegers) {
  EXPECT_EQ(Beta(1.0L, 1.0L), 1.0L);
  // B(2, 3) = 1! 2! / 4! = 1/12.
  EXPECT_LE(RelativeError(Beta(2.0L, 3.0L), 1.0L / 12.0L), 1e-18L);
  EXPECT_EQ(Beta(2.5L, 7.25L), Beta(7.25L, 2.5L));
  EXPECT_EQ(Beta(0.1L, 3e4L), Beta(3e4L, 0.1L));
}

TEST(SpecialBeta, TinyAndHugeShapes) {
  // B(a, b) = 1/a + 1/b + O(1) for tiny shapes; over- and underflow give +inf and 0.
  EXPECT_LE(RelativeError(Beta(1e-3000L, 3e-3000L), 1e3000L + 1e3000L / 3.0L), 1e-18L);
  EXPECT_EQ(Beta(1e-4940L, 1e-4940L), kInf);
  EXPECT_EQ(Beta(1e300L, 1e300L), 0.0L);
  // B(a, 1/2) = sqrt(pi / a) (1 + O(1/a)).
  EXPECT_LE(RelativeError(Beta(1e4000L, 0.5L), std::sqrt(3.14159265358979323846L) * 1e-2000L),
            1e-18L);
  // A small shape beside one near the top of the range: B(a, b) = Gamma(a) b^-a (1 + O(a^2/b)),
  // the leading term from mpmath at 256 bits. Neither b / a nor a + b may overflow on the way.
  const Extended max = std::numeric_limits<Extended>::max();
  EXPECT_LE(RelativeError(Beta(0.01L, max), 4.750881970520198514189297e-48L), 2e-17L);
  EXPECT_LE(RelativeError(Beta(max, 0.01L), 4.750881970520198514189297e-48L), 2e-17L);
  // Gamma(a) = 1/a - 0.577... and b^-a = 1 - 2e-1996: B = 1/a to far below the last digit.
  EXPECT_LE(RelativeError(Beta(1e-2000L, 1e4000L), 1.0L / 1e-2000L), 2e-19L);
  EXPECT_LE(RelativeError(Beta(1e-4000L, max), 1.0L / 1e-4000L), 2e-19L);
  // a + b itself overflows: B < 2^-(a + b) underflows to 0.
  EXPECT_EQ(Beta(max, max), 0.0L);
  EXPECT_EQ(Beta(2.0L, max), 0.0L);
}

// --- IncompleteBeta ---------------------------------------------------------------------------

TEST(SpecialIncompleteBeta, MatchesReferenceTable) {
  CheckTable("IncompleteBeta", kIncompleteBetaTable, [](const SpecialCase3& r) {
    return std::pair{IncompleteBeta(r.x, r.a, r.b), Describe("IncompleteBeta", r.x, r.a, r.b)};
  });
}

TEST(SpecialIncompleteBeta, EndsAreExact) {
  for (Extended a : {1e-3L, 0.5L, 1.0L, 7.5L, 1e5L}) {
    for (Extended b : {1e-3L, 0.5L, 3.0L, 1e5L}) {
      EXPECT_EQ(IncompleteBeta(0.0L, a, b), 0.0L);
      EXPECT_EQ(IncompleteBeta(1.0L, a, b), 1.0L);
    }
  }
}

TEST(SpecialIncompleteBeta, ClosedForms) {
  // I_x(1, 1) = x, I_x(a, 1) = x^a, I_x(1, b) = 1 - (1 - x)^b.
  for (Extended x : {1e-12L, 0.125L, 0.5L, 0.875L, 0.999L}) {
    EXPECT_LE(RelativeError(IncompleteBeta(x, 1.0L, 1.0L), x), 2e-19L);
    EXPECT_LE(RelativeError(IncompleteBeta(x, 4.0L, 1.0L), x * x * x * x), 1e-17L);
    // 1 - (1 - x)^3 = x (3 - 3x + x^2), free of cancellation for small x.
    EXPECT_LE(RelativeError(IncompleteBeta(x, 1.0L, 3.0L), x * (3.0L - 3.0L * x + x * x)), 1e-17L);
  }
}

TEST(SpecialIncompleteBeta, ReflectionSumsToOne) {
  // I_x(a, b) + I_{1-x}(b, a) = 1, with x chosen so that 1 - x is exact.
  for (auto [a, b] : {std::pair{0.5L, 0.5L}, std::pair{2.0L, 9.0L}, std::pair{40.0L, 0.3L},
                      std::pair{1e4L, 2e4L}}) {
    for (Extended x : {0.0625L, 0.25L, 0.3125L, 0.5L, 0.6875L, 0.9375L}) {
      EXPECT_NEAR(IncompleteBeta(x, a, b) + IncompleteBeta(1.0L - x, b, a), 1.0L, 4e-19L);
    }
  }
}

TEST(SpecialIncompleteBeta, SymmetricShapesGiveOneHalfAtTheMiddle) {
  // I_{1/2}(a, a) = 1/2 exactly, from small shapes to the hard region of large ones.
  for (Extended a : {1e-3L, 0.5L, 3.0L, 47.5L, 1e3L, 1e5L}) {
    EXPECT_NEAR(IncompleteBeta(0.5L, a, a), 0.5L, 2e-19L) << static_cast<double>(a);
  }
}

TEST(SpecialIncompleteBeta, ExtremeShapes) {
  // Shapes so small that all of the mass sits at the ends, B / (A + B) of it at 0.
  EXPECT_EQ(IncompleteBeta(0.3L, 1e-4500L, 2.0L), 1.0L);
  EXPECT_EQ(IncompleteBeta(0.3L, 2.0L, 1e-4500L), 0.0L);
  EXPECT_LE(RelativeError(IncompleteBeta(0.3L, 3e-4500L, 1e-4500L), 0.25L), 1e-15L);
  // Shapes beyond 1e10: the normal limit, centred on the mean.
  EXPECT_EQ(IncompleteBeta(0.5L, 1e300L, 1e300L), 0.5L);
  // One standard deviation (1 / sqrt(8e12)) below the mean: Phi(-1) = 0.158655253931457.
  EXPECT_NEAR(IncompleteBeta(0.5L - 1.0L / std::sqrt(8e12L), 1e12L, 1e12L), 0.158655253931457L,
              1e-6L);
  EXPECT_EQ(IncompleteBeta(0.4L, 1e300L, 1e300L), 0.0L);
  // Infinite shapes.
  EXPECT_EQ(IncompleteBeta(0.5L, kInf, 2.0L), 0.0L);
  EXPECT_EQ(IncompleteBeta(0.5L, 2.0L, kInf), 1.0L);
}

TEST(SpecialIncompleteBeta, GammaLimitNearTheTopOfTheRange) {
  // With b near the largest Extended, I_x(a, b) = P(a, b x) (1 + O(1/b)): the regularised
  // lower incomplete gamma function, here in closed form. x b = 1 exactly (powers of two).
  const Extended b = 0x1p16000L;
  const Extended x = 0x1p-16000L;
  // P(1, 1) = 1 - 1/e, P(2, 1) = 1 - 2/e, P(1/2, 2) = erf(sqrt 2).
  EXPECT_LE(RelativeError(IncompleteBeta(x, 1.0L, b), 0.632120558828557678404476L), 4e-19L);
  EXPECT_LE(RelativeError(IncompleteBeta(x, 2.0L, b), 0.264241117657115356808952L), 4e-19L);
  EXPECT_LE(RelativeError(IncompleteBeta(2.0L * x, 0.5L, b), 0.954499736103641585599435L), 4e-19L);
  // P(3, 4) = 1 - 13 e^-4, with b the largest Extended and x b = 4 (1 - 2^-64).
  const Extended max = std::numeric_limits<Extended>::max();
  EXPECT_LE(RelativeError(IncompleteBeta(0x1p-16382L, 3.0L, max), 0.761896694446455656181666L),
            4e-19L);
  // The inverse finds x b = 1 again.
  EXPECT_LE(RelativeError(InverseIncompleteBeta(0.264241117657115356808952L, 2.0L, b) * b, 1.0L),
            1e-18L);
  // At x = 1/2 all of the mass of such shapes lies on one side; the small shape may be tiny.
  for (Extended a : {1e-3000L, 0.01L, 2.0L, 1e3000L}) {
    EXPECT_EQ(IncompleteBeta(0.5L, a, max), 1.0L) << static_cast<double>(a);
    EXPECT_EQ(IncompleteBeta(0.5L, max, a), 0.0L) << static_cast<double>(a);
  }
  EXPECT_EQ(IncompleteBeta(0.5L, 1e-3000L, 1e3000L), 1.0L);
  EXPECT_EQ(IncompleteBeta(0.75L, 1e4900L, 1e-20L), 0.0L);
}

TEST(SpecialIncompleteBeta, HugeShapesFinishWithAValue) {
  // Far beyond the tested domain the result still comes back, bounded and ordered.
  const Extended mid = IncompleteBeta(0.5L, 1e9L, 1e9L);
  EXPECT_NEAR(mid, 0.5L, 1e-12L);
  EXPECT_LT(IncompleteBeta(0.4999L, 1e9L, 1e9L), 1e-10L);
  EXPECT_GT(IncompleteBeta(0.5001L, 1e9L, 1e9L), 1.0L - 1e-10L);
}

// --- InverseIncompleteBeta --------------------------------------------------------------------

TEST(SpecialInverseIncompleteBeta, MatchesReferenceTable) {
  CheckTable("InverseIncompleteBeta", kInverseIncompleteBetaTable, [](const SpecialCase3& r) {
    return std::pair{InverseIncompleteBeta(r.x, r.a, r.b),
                     Describe("InverseIncompleteBeta", r.x, r.a, r.b)};
  });
}

TEST(SpecialInverseIncompleteBeta, RoundTrip) {
  // I(InverseIncompleteBeta(P)) = P to within what one unit of x moves the value.
  for (auto [a, b] : {std::pair{0.5L, 0.5L}, std::pair{1.0L, 1.0L}, std::pair{2.0L, 5.0L},
                      std::pair{0.5L, 15.0L}, std::pair{12.0L, 0.5L}, std::pair{30.0L, 30.0L}}) {
    for (Extended p :
         {1e-300L, 1e-40L, 1e-8L, 0.001L, 0.2L, 0.5L, 0.8L, 0.999L, 1.0L - 1e-12L, 1.0L - 1e-18L}) {
      const Extended x = InverseIncompleteBeta(p, a, b);
      // Below x = 1/2 compare I_x(a, b) with P; above it compare I_{1-x}(b, a) (1 - x is
      // exact there) with 1 - P, so that a tail near 1 keeps its relative accuracy.
      if (x < 0.5L) {
        EXPECT_LE(RelativeError(IncompleteBeta(x, a, b), p), 1e-15L)
            << Describe("round trip", p, a, b);
      } else if (x < 1.0L) {
        // x itself is rounded at a spacing of 2^-64 near 1, which moves the small tail
        // 1 - x by a relative 2^-64 / (1 - x); the tail is a power b of it.
        const Extended spacing = std::numeric_limits<Extended>::epsilon() / 2.0L;
        const Extended tolerance = 1e-15L + 2.0L * b * spacing / (1.0L - x);
        EXPECT_LE(RelativeError(IncompleteBeta(1.0L - x, b, a), 1.0L - p), tolerance)
            << Describe("round trip", p, a, b);
      }
    }
  }
}

TEST(SpecialInverseIncompleteBeta, EndsAndMonotonicity) {
  EXPECT_EQ(InverseIncompleteBeta(0.0L, 2.0L, 3.0L), 0.0L);
  EXPECT_EQ(InverseIncompleteBeta(1.0L, 2.0L, 3.0L), 1.0L);
  Extended last = 0.0L;
  for (int i = 1; i < 100; ++i) {
    const Extended x = InverseIncompleteBeta(i / 100.0L, 3.5L, 0.75L);
    EXPECT_GT(x, last);
    last = x;
  }
  // I_x(1, 1) = x.
  EXPECT_LE(RelativeError(InverseIncompleteBeta(0.3L, 1.0L, 1.0L), 0.3L), 1e-18L);
}

TEST(SpecialInverseIncompleteBeta, ExtremeShapesAndTails) {
  EXPECT_EQ(InverseIncompleteBeta(0.5L, 1e300L, 1e300L), 0.5L);
  // A root far below the smallest subnormal comes back as 0, and quickly.
  EXPECT_EQ(InverseIncompleteBeta(1e-300L, 1e-3L, 2.0L), 0.0L);
  EXPECT_EQ(InverseIncompleteBeta(1.0L - 1e-18L, 2.0L, 1e-3L), 1.0L);
  // Shapes so small that I_x is constant on (0, 1): the root is an end.
  EXPECT_EQ(InverseIncompleteBeta(0.3L, 1e-4500L, 2.0L), 0.0L);
  EXPECT_EQ(InverseIncompleteBeta(0.3L, 2.0L, 1e-4500L), 1.0L);
  // I_x(1, 1) = x far down in the tail.
  EXPECT_LE(RelativeError(InverseIncompleteBeta(1e-300L, 1.0L, 1.0L), 1e-300L), 1e-18L);
}

// --- Errors and NaN ---------------------------------------------------------------------------

TEST(SpecialFunctions, PolesAndDomainErrorsRaise) {
  for (Extended x : {0.0L, -0.0L, -1.0L, -2.0L, -170.0L, -1754.0L, -1e30L, -kInf}) {
    ExpectRaises(rsGammaPole, [x] { Gamma(x); });
  }
  for (Extended x : {0.0L, -1.0L, -3.0L, -1e20L}) ExpectRaises(rsGammaPole, [x] { LnGamma(x); });
  using Args = std::array<Extended, 3>;
  for (const Args& a : {Args{0, 1}, Args{1, 0}, Args{-1, 2}, Args{2, -kInf}}) {
    ExpectRaises(rsArgOutsideDomain, [a] { Beta(a[0], a[1]); });
  }
  for (const Args& a : {Args{-0.1L, 1, 1}, Args{1.1L, 1, 1}, Args{0.5L, 0, 1}, Args{0.5L, 1, -2},
                        Args{-kInf, 1, 1}}) {
    ExpectRaises(rsArgOutsideDomain, [a] { IncompleteBeta(a[0], a[1], a[2]); });
  }
  for (const Args& a :
       {Args{-1e-20L, 1, 1}, Args{1.0000001L, 1, 1}, Args{0.5L, 0, 1}, Args{0.5L, 1, -0.5L}}) {
    ExpectRaises(rsArgOutsideDomain, [a] { InverseIncompleteBeta(a[0], a[1], a[2]); });
  }
}

TEST(SpecialFunctions, NaNGivesNaN) {
  for (Extended r : {Gamma(kNaN), LnGamma(kNaN), Beta(kNaN, 1), Beta(1, kNaN),
                     IncompleteBeta(kNaN, 1, 1), IncompleteBeta(0.5L, kNaN, 1),
                     IncompleteBeta(0.5L, 1, kNaN), InverseIncompleteBeta(kNaN, 1, 1),
                     InverseIncompleteBeta(0.5L, kNaN, 1), InverseIncompleteBeta(0.5L, 1, kNaN)}) {
    EXPECT_TRUE(std::isnan(r));
  }
}

}  // namespace
}  // namespace tovrin
