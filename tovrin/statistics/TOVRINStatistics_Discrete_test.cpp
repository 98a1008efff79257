// Tests of the combinatorics and discrete distributions against exact values (integer
// arithmetic in the reference script, hand-worked fractions) and mpmath sums at 40 digits.
#include <array>
#include <cmath>
#include <limits>
#include <numeric>

#include "gtest/gtest.h"
#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/statistics/TOVRINStatistics_Distributions_testing.h"

namespace tovrin {
namespace {

using namespace testing_distributions;  // NOLINT

// === Combinatorics =============================================================================

TEST(FactorialTest, AgainstExactValues) {
  for (const auto& [n, value] : kFactorialRef) {
    SCOPED_TRACE(static_cast<double>(n));
    // n - 1 roundings of half an ulp each.
    EXPECT_TRUE(RelNear(Factorial(U(n)), value, kEps / 2 * std::fmax(1, n)));
  }
  EXPECT_EQ(Factorial(0), 1);
  EXPECT_EQ(Factorial(1), 1);
  EXPECT_EQ(Factorial(20), 2432902008176640000.0L);  // exact: below 2^64
  EXPECT_TRUE(std::isfinite(Factorial(1754)));
}

TEST(FactorialTest, Overflow) {
  ExpectRaises(rsFactOverflow, [] { Factorial(1755); });
  ExpectRaises(rsFactOverflow, [] { Factorial(2147483648U); });  // 2^31
  ExpectRaises(rsFactOverflow, [] { Factorial(4294967295U); });
}

TEST(PermutationTest, AgainstExactValues) {
  for (const auto& [n, r, value] : kPermutationRef) {
    SCOPED_TRACE(::testing::Message() << static_cast<double>(n) << " P " << static_cast<double>(r));
    EXPECT_TRUE(RelNear(Permutation(U(n), U(r)), value, kEps / 2 * (1 + r)));
  }
  EXPECT_EQ(Permutation(5, 2), 20);
  EXPECT_EQ(Permutation(7, 0), 1);
  EXPECT_EQ(Permutation(0, 0), 1);
  EXPECT_EQ(Permutation(20, 20), 2432902008176640000.0L);
  EXPECT_EQ(Permutation(4294967295U, 1), 4294967295.0L);
}

TEST(PermutationTest, Checks) {
  ExpectRaises(rsPermInvalid, [] { Permutation(5, 6); });
  ExpectRaises(rsPermInvalid, [] { Permutation(0, 1); });
  // 1755 factors above 1754 would pass the largest Extended; much larger factors overflow
  // after a few hundred.
  ExpectRaises(rsPermOverflowed, [] { Permutation(1755, 1755); });
  ExpectRaises(rsPermOverflowed, [] { Permutation(4294967295U, 4294967295U); });
  EXPECT_TRUE(std::isfinite(Permutation(1754, 1754)));
}

TEST(BinomialCoeffTest, AgainstExactValues) {
  for (const auto& [n, k, value] : kBinomialCoeffRef) {
    SCOPED_TRACE(::testing::Message() << static_cast<double>(n) << " C " << static_cast<double>(k));
    // One multiplication and at most one division per factor, each rounding by half an ulp.
    EXPECT_TRUE(RelNear(BinomialCoeff(U(n), U(k)), value, kEps * (1 + std::fmin(k, n - k))));
  }
  EXPECT_EQ(BinomialCoeff(10, 3), 120);
  EXPECT_EQ(BinomialCoeff(5, 0), 1);
  EXPECT_EQ(BinomialCoeff(5, 5), 1);
  EXPECT_EQ(BinomialCoeff(0, 0), 1);
  EXPECT_EQ(BinomialCoeff(67, 33), 14226520737620288370.0L);  // exact result rounds back
  EXPECT_EQ(BinomialCoeff(4294967295U, 1), 4294967295.0L);
  EXPECT_EQ(BinomialCoeff(4294967295U, 4294967294U), 4294967295.0L);  // K replaced by N - K
}

TEST(BinomialCoeffTest, Checks) {
  ExpectRaises(rsBinomInvalid, [] { BinomialCoeff(3, 5); });
  ExpectRaises(rsBinomInvalid, [] { BinomialCoeff(0, 1); });
  ExpectRaises(rsBinomOverflowed, [] { BinomialCoeff(20000, 10000); });
  ExpectRaises(rsBinomOverflowed, [] { BinomialCoeff(4294967295U, 2147483647U); });
  EXPECT_TRUE(std::isfinite(BinomialCoeff(16000, 8000)));
}

// === Binomial ==================================================================================

TEST(BinomialTest, AgainstReference) {
  for (const auto& [p, n, r, eq, less, greater] : kBinomialRef) {
    SCOPED_TRACE(::testing::Message()
                 << "p=" << static_cast<double>(p) << " n=" << n << " r=" << r);
    // P^r and (1 - P)^(n - r) round with relative error growing with the exponents (1 - P is
    // itself rounded); sums of up to n terms add their roundings.
    const Extended termError = 4 * kEps * (4 + n);
    EXPECT_TRUE(RelNear(BinomialEq(p, U(n), U(r)), eq, termError));
    EXPECT_TRUE(Near(BinomialLess(p, U(n), U(r)), less, termError * less + 4 * kEps));
    EXPECT_TRUE(Near(BinomialGreater(p, U(n), U(r)), greater, termError + 4 * kEps));
  }
}

TEST(BinomialTest, StatedValues) {
  EXPECT_EQ(BinomialLess(0.5L, 4, 0), 0);
  EXPECT_EQ(BinomialGreater(0.5L, 4, 4), 0);
  EXPECT_EQ(BinomialEq(0.5L, 4, 2), 0.375L);
  // R1 < R2: both ends excluded, P(X = 2); R1 > R2: both ends included, P(1 <= X <= 3).
  EXPECT_EQ(BinomialBetween(0.5L, 4, 1, 3), 0.375L);
  EXPECT_EQ(BinomialBetween(0.5L, 4, 3, 1), 0.875L);
  EXPECT_EQ(BinomialBetween(0.5L, 4, 2, 2), 0.375L);
  EXPECT_EQ(BinomialBetween(0.5L, 4, 0, 4), 0.875L);  // P(1 <= X <= 3) again
  EXPECT_EQ(BinomialBetween(0.5L, 4, 4, 0), 1);       // everything
  EXPECT_EQ(BinomialGreater(0.5L, 4, 0), 0.9375L);
  EXPECT_EQ(BinomialLess(0.5L, 4, 4), 0.9375L);
  EXPECT_EQ(BinomialEq(0, 5, 0), 1);  // 0^0 = 1
  EXPECT_EQ(BinomialEq(1, 5, 5), 1);
}

TEST(BinomialTest, SumsAreTheTermsAddedInCountOrder) {
  // Each sum adds BinomialEq(P, N, k) for k = 0, 1, ... to the bit, on both sides of N / 2
  // (where C(N, k) = C(N, N - k) comes from the same product loop), and the table holds the
  // same terms.
  for (LongWord n : {1U, 2U, 7U, 40U, 41U, 1000U, 1001U}) {
    for (Extended p : {0.3L, 0.5L, 0.99L}) {
      SCOPED_TRACE(::testing::Message() << "n=" << n << " p=" << static_cast<double>(p));
      TQENFloatVector table;
      BinomialPDFValues(static_cast<LongInt>(n), p, table);
      ASSERT_EQ(table.size(), n + 1);
      Extended sum = 0;
      for (LongWord k = 0; k <= n; ++k) {
        const Extended term = BinomialEq(p, n, k);
        EXPECT_EQ(Extended(table[k]), term);
        if (k % 61 == 0 || k + 2 >= n) {
          EXPECT_EQ(BinomialLess(p, n, k), sum) << "k=" << k;
        }
        sum += term;
      }
      // Between: below N minus below 1 for (0, N); everything for (N, 0).
      Extended inner = 0;
      for (LongWord k = 0; k < n; ++k) inner += BinomialEq(p, n, k);
      EXPECT_EQ(BinomialBetween(p, n, 0, n), inner - BinomialEq(p, n, 0));
      EXPECT_EQ(BinomialBetween(p, n, n, 0), sum);
    }
  }
  // The first coefficient beyond Extended still raises, and a sum that stops short of it
  // does not.
  ExpectRaises(rsBinomOverflowed, [] { BinomialLess(0.5L, 20000, 19000); });
  ExpectRaises(rsBinomOverflowed, [] { BinomialBetween(0.5L, 20000, 19000, 3); });
  EXPECT_NO_THROW(BinomialLess(0.5L, 20000, 10));
}

TEST(BinomialTest, Checks) {
  for (Extended p : {-0.1L, 1.1L}) {
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialEq(p, 4, 1); });
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialLess(p, 4, 1); });
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialGreater(p, 4, 1); });
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialBetween(p, 4, 1, 2); });
  }
  ExpectRaises(rsBinomDistInvalid, [] { BinomialEq(0.5L, 0, 0); });
  ExpectRaises(rsBinomDistInvalid, [] { BinomialEq(0.5L, 4, 5); });
  ExpectRaises(rsBinomDistInvalid, [] { BinomialLess(0.5L, 4, 5); });
  ExpectRaises(rsBinomDistInvalid, [] { BinomialGreater(0.5L, 4, 5); });
  ExpectRaises(rsBinomDistInvalid, [] { BinomialBetween(0.5L, 4, 1, 5); });
  ExpectRaises(rsBinomDistInvalid, [] { BinomialBetween(0.5L, 0, 0, 0); });
  // A coefficient beyond Extended.
  ExpectRaises(rsBinomOverflowed, [] { BinomialEq(0.5L, 20000, 10000); });
  // A NaN probability passes the documented checks and gives NaN.
  EXPECT_TRUE(std::isnan(BinomialEq(kNaN, 4, 1)));
}

// === Hypergeometric ============================================================================

TEST(HyperGeometricTest, AgainstReference) {
  for (const auto& [n, s, m, x, eq, less, greater] : kHyperGeometricRef) {
    SCOPED_TRACE(::testing::Message() << n << " " << s << " " << m << " " << x);
    // Three coefficients (each good to (1 + k) ulps) and a quotient per term.
    const Extended termError = 4 * kEps * (4 + s + m);
    EXPECT_TRUE(RelNear(HyperGeometricEq(U(n), U(s), U(m), U(x)), eq, termError));
    EXPECT_TRUE(
        Near(HyperGeometricLess(U(n), U(s), U(m), U(x)), less, termError * less + 4 * kEps));
    EXPECT_TRUE(Near(HyperGeometricGreater(U(n), U(s), U(m), U(x)), greater, termError + 4 * kEps));
  }
}

TEST(HyperGeometricTest, BetweenIsTheMirrorOfTheBinomialRule) {
  // N = 20, S = 5, M = 7: the point probabilities C(7,k) C(13,5-k) / C(20,5), 15504 in all.
  const Extended total = 15504;
  const Extended counts[] = {1287, 5005, 6006, 2730, 455, 21};
  const Extended bound = 64 * kEps;
  // X1 < X2: both ends included.
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 1, 3), (5005 + 6006 + 2730) / total, bound));
  // X1 > X2: both ends excluded.
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 3, 1), 6006 / total, bound));
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 2, 2), counts[2] / total, bound));
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 0, 5), 1, bound));
  EXPECT_TRUE(Near(HyperGeometricGreater(20, 5, 7, 5), 0, bound));
  EXPECT_TRUE(Near(HyperGeometricLess(20, 5, 7, 5), 1 - counts[5] / total, bound));
  for (LongWord k = 0; k <= 5; ++k) {
    EXPECT_TRUE(Near(HyperGeometricEq(20, 5, 7, k), counts[k] / total, bound));
  }
  // Counts above min(M, S), and counts needing more failures than there are, have probability 0.
  EXPECT_EQ(HyperGeometricEq(20, 5, 3, 4), 0);
  EXPECT_EQ(HyperGeometricEq(10, 5, 8, 1), 0);  // only 2 failures for 4 places
}

TEST(HyperGeometricTest, Checks) {
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricEq(0, 0, 0, 0); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricEq(10, 0, 3, 0); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricEq(10, 11, 3, 0); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricEq(10, 5, 11, 0); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricLess(10, 5, 11, 0); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricLess(10, 5, 3, 6); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricGreater(10, 5, 3, 6); });
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricBetween(10, 5, 3, 1, 6); });
  EXPECT_EQ(HyperGeometricBetween(10, 5, 3, 6, 6), 0);  // equal counts: the point probability
  ExpectRaises(rsHyperGeometricInvalid, [] { HyperGeometricBetween(0, 5, 3, 1, 2); });
  ExpectRaises(rsBinomOverflowed, [] { HyperGeometricEq(20000, 10000, 10, 3); });
}

// === Poisson ===================================================================================

TEST(PoissonTest, AgainstReference) {
  for (const auto& [mean, x, eq, less] : kPoissonRef) {
    SCOPED_TRACE(::testing::Message() << "mean=" << static_cast<double>(mean) << " x=" << x);
    // exp(-mean) and mean^x round with relative errors growing with mean and x; x! with x.
    const Extended termError = 4 * kEps * (4 + mean + x);
    EXPECT_TRUE(RelNear(PoissonEq(mean, U(x)), eq, termError));
    EXPECT_TRUE(Near(PoissonLess(mean, U(x)), less, termError * less + 4 * kEps));
    if (x < 1754) {
      EXPECT_TRUE(Near(PoissonGreater(mean, U(x)), 1 - less - eq, termError + 4 * kEps));
    }
  }
}

TEST(PoissonTest, BetweenFollowsTheBinomialRule) {
  const Extended m = 3.2L;
  const auto eq = [m](LongWord k) { return PoissonEq(m, k); };
  const Extended bound = 16 * kEps;
  EXPECT_TRUE(Near(PoissonBetween(m, 1, 4), eq(2) + eq(3), bound));                  // excluded
  EXPECT_TRUE(Near(PoissonBetween(m, 4, 1), eq(1) + eq(2) + eq(3) + eq(4), bound));  // included
  EXPECT_EQ(PoissonBetween(m, 3, 3), eq(3));
  EXPECT_EQ(PoissonLess(m, 0), 0);
  EXPECT_TRUE(Near(PoissonGreater(m, 0), 1 - std::exp(-m), bound));
}

TEST(PoissonTest, Checks) {
  ExpectRaises(rsPoissonInvalid, [] { PoissonEq(0, 1); });
  ExpectRaises(rsPoissonInvalid, [] { PoissonEq(-1, 1); });
  ExpectRaises(rsPoissonInvalid, [] { PoissonLess(0, 1); });
  ExpectRaises(rsPoissonInvalid, [] { PoissonGreater(-2, 1); });
  ExpectRaises(rsPoissonInvalid, [] { PoissonBetween(0, 1, 2); });
  ExpectRaises(rsPoissonInvalid, [] { PoissonLess(0, 4000000000U); });  // Mean first
  ExpectRaises(rsFactOverflow, [] { PoissonEq(2, 1755); });
  ExpectRaises(rsFactOverflow, [] { PoissonLess(2, 1756); });
  ExpectRaises(rsFactOverflow, [] { PoissonGreater(2, 1755); });
  ExpectRaises(rsFactOverflow, [] { PoissonLess(2, 4294967295U); });
  ExpectRaises(rsFactOverflow, [] { PoissonGreater(2, 4294967295U); });
  EXPECT_NO_THROW(PoissonLess(2, 1755));
}

// === Non-finite arguments ======================================================================

// NaN and infinite probabilities and means give NaN or raise; the sums stay bounded by their
// counts.
TEST(DiscreteNonFiniteTest, ReturnsOrRaises) {
  const auto tryCall = [](auto call) {
    try {
      (void)call();
    } catch (const EMathError&) {
    }
  };
  TQENFloatVector v;
  TQENLIntVector counts;
  for (Extended x : {kNaN, kInf, -kInf}) {
    tryCall([&] { return BinomialEq(x, 10, 3); });
    tryCall([&] { return BinomialLess(x, 10, 3); });
    tryCall([&] { return BinomialGreater(x, 10, 3); });
    tryCall([&] { return BinomialBetween(x, 10, 7, 2); });
    tryCall([&] { return PoissonEq(x, 3); });
    tryCall([&] { return PoissonLess(x, 1000); });
    tryCall([&] { return PoissonGreater(x, 3); });
    tryCall([&] { return PoissonBetween(x, 1, 5); });
    tryCall([&] {
      BinomialPDFValues(10, x, v);
      return 0;
    });
    tryCall([&] {
      PoissonPDFValues(10, x, counts, v);
      return 0;
    });
  }
  EXPECT_TRUE(std::isnan(PoissonEq(kNaN, 3)));
  SUCCEED();
}

// === Tables ====================================================================================

TEST(DiscreteTablesTest, Binomial) {
  TQENFloatVector v{7, 7};
  BinomialPDFValues(4, 0.5L, v);
  ASSERT_EQ(v.size(), 5U);
  const Extended expected[] = {1, 4, 6, 4, 1};
  for (std::size_t k = 0; k < 5; ++k) EXPECT_EQ(Extended(v[k]), expected[k] / 16);
  for (Extended p : {-0.1L, 1.1L, static_cast<Extended>(kNaN)}) {
    v.assign(3, 1);
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialPDFValues(4, p, v); });
    EXPECT_TRUE(v.empty());
  }
  for (LongInt n : {0, -3}) {
    v.assign(3, 1);
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialPDFValues(n, 0.5L, v); });
    EXPECT_TRUE(v.empty());
  }
  v.assign(3, 1);
  ExpectRaises(rsBinomOverflowed, [&] { BinomialPDFValues(2147483647, 0.5L, v); });
  EXPECT_TRUE(v.empty());
}

TEST(DiscreteTablesTest, HyperGeometric) {
  TQENFloatVector v{7};
  HyperGeometricPDFValues(20, 5, 7, v);
  ASSERT_EQ(v.size(), 6U);
  const Extended counts[] = {1287, 5005, 6006, 2730, 455, 21};
  for (std::size_t k = 0; k < 6; ++k)
    EXPECT_TRUE(Near(Extended(v[k]), counts[k] / 15504, 16 * kEps));
  HyperGeometricPDFValues(10, 5, 8, v);  // S > N - M: the low counts cannot occur
  ASSERT_EQ(v.size(), 6U);
  EXPECT_EQ(Extended(v[0]), 0);
  EXPECT_EQ(Extended(v[2]), 0);
  EXPECT_TRUE(Near(Extended(v[3]), 56 / 252.0L, 16 * kEps));  // C(8,3) C(2,2) / C(10,5)
  const LongWord bad[][3] = {{0, 1, 0}, {10, 0, 3}, {10, 11, 3}, {10, 5, 11}};
  for (const auto& b : bad) {
    v.assign(2, 1);
    ExpectRaises(rsHyperGeometricInvalid, [&] { HyperGeometricPDFValues(b[0], b[1], b[2], v); });
    EXPECT_TRUE(v.empty());
  }
}

TEST(DiscreteTablesTest, PoissonCountWindow) {
  TQENLIntVector counts{9};
  TQENFloatVector probs{9};
  PoissonPDFValues(5, 10.7L, counts, probs);
  EXPECT_EQ(counts, (TQENLIntVector{8, 9, 10, 11, 12}));
  ASSERT_EQ(probs.size(), 5U);
  for (std::size_t i = 0; i < 5; ++i) {
    EXPECT_EQ(Extended(probs[i]), PoissonEq(10.7L, static_cast<LongWord>(counts[i])));
  }
  PoissonPDFValues(4, 10.7L, counts, probs);
  EXPECT_EQ(counts, (TQENLIntVector{9, 10, 11, 12}));
  PoissonPDFValues(10, 2.2L, counts, probs);
  EXPECT_EQ(counts, (TQENLIntVector{0, 1, 2, 3, 4, 5, 6, 7}));
  EXPECT_EQ(probs.size(), 8U);
  PoissonPDFValues(1, 0.5L, counts, probs);
  EXPECT_EQ(counts, (TQENLIntVector{0}));
  for (Extended mean : {0.0L, -1.0L, static_cast<Extended>(kNaN)}) {
    counts.assign(2, 1);
    probs.assign(2, 1);
    ExpectRaises(rsPoissonInvalid, [&] { PoissonPDFValues(5, mean, counts, probs); });
    EXPECT_TRUE(counts.empty());
    EXPECT_TRUE(probs.empty());
  }
  counts.assign(2, 1);
  probs.assign(2, 1);
  ExpectRaises(rsPoissonInvalid, [&] { PoissonPDFValues(0, 3, counts, probs); });
  EXPECT_TRUE(counts.empty() && probs.empty());
  // Counts whose factorial overflows.
  ExpectRaises(rsFactOverflow, [&] { PoissonPDFValues(5, 1753.5L, counts, probs); });
  EXPECT_TRUE(counts.empty() && probs.empty());
  ExpectRaises(rsFactOverflow, [&] { PoissonPDFValues(2147483647, 3, counts, probs); });
  ExpectRaises(rsFactOverflow, [&] { PoissonPDFValues(3, kInf, counts, probs); });
}

}  // namespace
}  // namespace tovrin
