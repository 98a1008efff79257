// Tests of the combinatorics and discrete distributions against exact values (integer
// arithmetic in the reference script, hand-worked fractions) and mpmath sums at 40 digits.
// Each term rounds with a relative error growing with its exponents and factor counts.
#include <array>
#include <cmath>
#include <limits>
#include <utility>

#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINStatistics_Distributions_reference.inc"

using namespace testing;  // NOLINT: the shared checks and constants
LongWord U(Extended v) { return static_cast<LongWord>(v); }

TEST(Combinatorics, AgainstExactValues) {
  for (const auto& [n, value] : kFactorialRef) {
    EXPECT_TRUE(RelNear(Factorial(U(n)), value, kEps / 2 * std::fmax(1, n)))
        << static_cast<double>(n);
  }
  for (const auto& [n, r, value] : kPermutationRef) {
    EXPECT_TRUE(RelNear(Permutation(U(n), U(r)), value, kEps / 2 * (1 + r)))
        << static_cast<double>(n);
  }
  for (const auto& [n, k, value] : kBinomialCoeffRef) {
    EXPECT_TRUE(RelNear(BinomialCoeff(U(n), U(k)), value, kEps * (1 + std::fmin(k, n - k))))
        << static_cast<double>(n) << " " << static_cast<double>(k);
  }
  EXPECT_EQ(Factorial(0), 1);
  EXPECT_EQ(Factorial(20), 2432902008176640000.0L);  // exact: below 2^64
  EXPECT_TRUE(std::isfinite(Factorial(1754)));
  EXPECT_EQ(Permutation(7, 0) + Permutation(0, 0), 2);
  EXPECT_EQ(Permutation(4294967295U, 1), 4294967295.0L);
  EXPECT_TRUE(std::isfinite(Permutation(1754, 1754)));
  EXPECT_EQ(BinomialCoeff(5, 0) + BinomialCoeff(5, 5) + BinomialCoeff(0, 0), 3);
  EXPECT_EQ(BinomialCoeff(67, 33), 14226520737620288370.0L);  // the exact result rounds back
  EXPECT_EQ(BinomialCoeff(4294967295U, 4294967294U), 4294967295.0L);  // K replaced by N - K
  EXPECT_TRUE(std::isfinite(BinomialCoeff(16000, 8000)));
  ExpectEachRaises(rsFactOverflow, {[] { Factorial(1755); }, [] { Factorial(2147483648U); }});
  ExpectEachRaises(rsPermInvalid, {[] { Permutation(5, 6); }, [] { Permutation(0, 1); }});
  ExpectEachRaises(rsPermOverflowed, {[] { Permutation(1755, 1755); },
                                      [] { Permutation(4294967295U, 4294967295U); }});
  ExpectEachRaises(rsBinomInvalid, {[] { BinomialCoeff(3, 5); }, [] { BinomialCoeff(0, 1); }});
  ExpectEachRaises(rsBinomOverflowed, {[] { BinomialCoeff(20000, 10000); },
                                       [] { BinomialCoeff(4294967295U, 2147483647U); }});
}

TEST(Binomial, AgainstReference) {
  for (const auto& [p, n, r, eq, less, greater] : kBinomialRef) {
    SCOPED_TRACE(::testing::Message() << static_cast<double>(p) << " " << n << " " << r);
    const Extended termError = 4 * kEps * (4 + n);
    EXPECT_TRUE(RelNear(BinomialEq(p, U(n), U(r)), eq, termError));
    EXPECT_TRUE(Near(BinomialLess(p, U(n), U(r)), less, termError * less + 4 * kEps));
    EXPECT_TRUE(Near(BinomialGreater(p, U(n), U(r)), greater, termError + 4 * kEps));
  }
  // R1 < R2 excludes both ends, R1 > R2 includes them.
  const struct {
    LongWord r1, r2;
    Extended p;
  } between[] = {{1, 3, 0.375L}, {3, 1, 0.875L}, {2, 2, 0.375L}, {0, 4, 0.875L}, {4, 0, 1}};
  for (const auto& b : between) EXPECT_EQ(BinomialBetween(0.5L, 4, b.r1, b.r2), b.p) << b.r1;
  EXPECT_EQ(BinomialLess(0.5L, 4, 0) + BinomialGreater(0.5L, 4, 4), 0);
  EXPECT_EQ(BinomialGreater(0.5L, 4, 0), 0.9375L);
  EXPECT_EQ(BinomialLess(0.5L, 4, 4), 0.9375L);
  EXPECT_EQ(BinomialEq(0, 5, 0) + BinomialEq(1, 5, 5), 2);
}

// Each sum adds BinomialEq(P, N, k) for k = 0, 1, ... to the bit, on both sides of N / 2,
// and the table holds the same terms.
TEST(Binomial, SumsAreTheTermsAddedInCountOrder) {
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
      Extended inner = 0;
      for (LongWord k = 0; k < n; ++k) inner += BinomialEq(p, n, k);
      EXPECT_EQ(BinomialBetween(p, n, 0, n), inner - BinomialEq(p, n, 0));
      EXPECT_EQ(BinomialBetween(p, n, n, 0), sum);
    }
  }
  ExpectEachRaises(rsBinomOverflowed, {[] { BinomialLess(0.5L, 20000, 19000); },
                                       [] { BinomialBetween(0.5L, 20000, 19000, 3); }});
  EXPECT_NO_THROW(BinomialLess(0.5L, 20000, 10));  // stops short of the first overflow
}

TEST(Binomial, Checks) {
  ExpectEachRaises(rsBinomDistInvalid,
                   {[] { BinomialEq(-0.1L, 4, 1); }, [] { BinomialLess(1.1L, 4, 1); },
                    [] { BinomialGreater(-0.1L, 4, 1); }, [] { BinomialBetween(1.1L, 4, 1, 2); },
                    [] { BinomialEq(0.5L, 0, 0); }, [] { BinomialEq(0.5L, 4, 5); },
                    [] { BinomialGreater(0.5L, 4, 5); }, [] { BinomialBetween(0.5L, 4, 1, 5); }});
  ExpectRaises(rsBinomOverflowed, [] { BinomialEq(0.5L, 20000, 10000); });
  EXPECT_TRUE(std::isnan(BinomialEq(kNaN, 4, 1)));  // passes the checks
}

TEST(HyperGeometric, AgainstReferenceAndExactCounts) {
  for (const auto& [n, s, m, x, eq, less, greater] : kHyperGeometricRef) {
    SCOPED_TRACE(::testing::Message() << n << " " << s << " " << m << " " << x);
    const Extended termError = 4 * kEps * (4 + s + m);
    EXPECT_TRUE(RelNear(HyperGeometricEq(U(n), U(s), U(m), U(x)), eq, termError));
    EXPECT_TRUE(
        Near(HyperGeometricLess(U(n), U(s), U(m), U(x)), less, termError * less + 4 * kEps));
    EXPECT_TRUE(Near(HyperGeometricGreater(U(n), U(s), U(m), U(x)), greater, termError + 4 * kEps));
  }
  // N = 20, S = 5, M = 7: C(7,k) C(13,5-k) of 15504. Between mirrors the binomial rule.
  const Extended counts[] = {1287, 5005, 6006, 2730, 455, 21}, total = 15504, bound = 64 * kEps;
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 1, 3), (5005 + 6006 + 2730) / total, bound));
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 3, 1), 6006 / total, bound));
  EXPECT_TRUE(Near(HyperGeometricBetween(20, 5, 7, 0, 5), 1, bound));
  EXPECT_TRUE(Near(HyperGeometricLess(20, 5, 7, 5), 1 - counts[5] / total, bound));
  TQENFloatVector v{7};
  HyperGeometricPDFValues(20, 5, 7, v);
  ASSERT_EQ(v.size(), 6U);
  for (LongWord k = 0; k <= 5; ++k) {
    EXPECT_TRUE(Near(HyperGeometricEq(20, 5, 7, k), counts[k] / total, bound));
    EXPECT_TRUE(Near(Extended(v[k]), counts[k] / total, 16 * kEps));
  }
  // Counts above min(M, S) or needing more failures than there are have probability 0.
  EXPECT_EQ(HyperGeometricEq(20, 5, 3, 4) + HyperGeometricEq(10, 5, 8, 1), 0);
  HyperGeometricPDFValues(10, 5, 8, v);
  EXPECT_EQ(Extended(v[0]) + Extended(v[2]), 0);
  EXPECT_TRUE(Near(Extended(v[3]), 56 / 252.0L, 16 * kEps));  // C(8,3) C(2,2) / C(10,5)
  EXPECT_EQ(HyperGeometricBetween(10, 5, 3, 6, 6), 0);        // equal counts: the point probability
  ExpectEachRaises(
      rsHyperGeometricInvalid,
      {[] { HyperGeometricEq(0, 0, 0, 0); }, [] { HyperGeometricEq(10, 0, 3, 0); },
       [] { HyperGeometricEq(10, 11, 3, 0); }, [] { HyperGeometricLess(10, 5, 11, 0); },
       [] { HyperGeometricGreater(10, 5, 3, 6); }, [] { HyperGeometricBetween(10, 5, 3, 1, 6); }});
  ExpectRaises(rsBinomOverflowed, [] { HyperGeometricEq(20000, 10000, 10, 3); });
  const std::array<LongWord, 3> bad[] = {{0, 1, 0}, {10, 0, 3}, {10, 11, 3}, {10, 5, 11}};
  for (const auto& b : bad) {
    v.assign(2, 1);
    ExpectRaises(rsHyperGeometricInvalid, [&] { HyperGeometricPDFValues(b[0], b[1], b[2], v); });
    EXPECT_TRUE(v.empty());
  }
}

TEST(Poisson, AgainstReferenceAndRules) {
  for (const auto& [mean, x, eq, less] : kPoissonRef) {
    SCOPED_TRACE(::testing::Message() << static_cast<double>(mean) << " " << x);
    const Extended termError = 4 * kEps * (4 + mean + x);
    EXPECT_TRUE(RelNear(PoissonEq(mean, U(x)), eq, termError));
    EXPECT_TRUE(Near(PoissonLess(mean, U(x)), less, termError * less + 4 * kEps));
    if (x < 1754) {
      EXPECT_TRUE(Near(PoissonGreater(mean, U(x)), 1 - less - eq, termError + 4 * kEps));
    }
  }
  const Extended m = 3.2L;
  const auto eq = [m](LongWord k) { return PoissonEq(m, k); };
  EXPECT_TRUE(Near(PoissonBetween(m, 1, 4), eq(2) + eq(3), 16 * kEps));  // ends excluded
  EXPECT_TRUE(Near(PoissonBetween(m, 4, 1), eq(1) + eq(2) + eq(3) + eq(4), 16 * kEps));
  EXPECT_EQ(PoissonBetween(m, 3, 3), eq(3));
  EXPECT_EQ(PoissonLess(m, 0), 0);
  EXPECT_TRUE(Near(PoissonGreater(m, 0), 1 - std::exp(-m), 16 * kEps));
  EXPECT_TRUE(std::isnan(PoissonEq(kNaN, 3)));
  ExpectEachRaises(
      rsPoissonInvalid,
      {[] { PoissonEq(0, 1); }, [] { PoissonEq(-1, 1); }, [] { PoissonGreater(-2, 1); },
       [] { PoissonBetween(0, 1, 2); }, [] { PoissonLess(0, 4000000000U); }});  // Mean first
  ExpectEachRaises(rsFactOverflow, {[] { PoissonEq(2, 1755); }, [] { PoissonLess(2, 1756); },
                                    [] { PoissonGreater(2, 4294967295U); }});
  EXPECT_NO_THROW(PoissonLess(2, 1755));
}

TEST(Discrete, TablesAndTheirChecks) {
  TQENFloatVector v{7, 7};
  BinomialPDFValues(4, 0.5L, v);
  EXPECT_EQ(Values(v), (std::vector<Extended>{1 / 16.0L, 0.25L, 0.375L, 0.25L, 1 / 16.0L}));
  const std::pair<LongInt, Extended> bad[] = {
      {4, -0.1L}, {4, 1.1L}, {4, kNaN}, {0, 0.5L}, {-3, 0.5L}};
  for (const auto& pair : bad) {
    v.assign(3, 1);
    ExpectRaises(rsBinomDistInvalid, [&] { BinomialPDFValues(pair.first, pair.second, v); });
    EXPECT_TRUE(v.empty());
  }
  v.assign(3, 1);
  ExpectRaises(rsBinomOverflowed, [&] { BinomialPDFValues(2147483647, 0.5L, v); });
  EXPECT_TRUE(v.empty());
  // The Poisson window: Number counts around the mean, clipped at 0.
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
  const struct {
    LongInt number;
    Extended mean;
    TResStringId ident;
  } failing[] = {{5, 0, rsPoissonInvalid},     {5, -1, rsPoissonInvalid},
                 {5, kNaN, rsPoissonInvalid},  {0, 3, rsPoissonInvalid},
                 {5, 1753.5L, rsFactOverflow}, {2147483647, 3, rsFactOverflow},
                 {3, kInf, rsFactOverflow}};
  for (const auto& f : failing) {
    counts.assign(2, 1);
    probs.assign(2, 1);
    ExpectRaises(f.ident, [&] { PoissonPDFValues(f.number, f.mean, counts, probs); });
    EXPECT_TRUE(counts.empty() && probs.empty());
  }
}

}  // namespace
}  // namespace tovrin
