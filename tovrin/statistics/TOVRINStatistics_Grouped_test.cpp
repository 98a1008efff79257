// Tests of the grouped-data statistics. Expected values are exact arithmetic done by hand, or
// come from TOVRINStatistics_Grouped_reference.inc, made by the script beside it (exact
// rationals and 256-bit mpmath).
#include <array>
#include <cmath>
#include <limits>

#include <gtest/gtest.h>

#include "tovrin/statistics/TOVRINStatistics.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINStatistics_Grouped_reference.inc"

constexpr long double kRelTolerance = 4e-18L;

::testing::AssertionResult RelNear(long double actual, long double expected) {
  const long double error = std::fabs(actual - expected);
  if (error <= kRelTolerance * std::fabs(expected)) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << "actual " << static_cast<double>(actual) << " expected "
                                       << static_cast<double>(expected) << " relative error "
                                       << static_cast<double>(error / std::fabs(expected));
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

TEST(GroupedStatistics, HandExample) {
  // [1, 2, 1] from 0 in steps of 10: midpoints 5, 15, 25.
  const TQENLWordVector f = {1, 2, 1};
  EXPECT_EQ(GroupedMean(f, 0, 10), 15);
  EXPECT_EQ(GroupedMedian(f, 0, 10), 15);
  Extended mode = 0;
  EXPECT_TRUE(GroupedMode(f, 0, 10, mode));
  EXPECT_EQ(mode, 15);
  // (100 + 0 + 100) / 3 and / 4.
  EXPECT_EQ(GroupedSampleVariance(f, 0, 10), 200 / 3.0L);
  EXPECT_EQ(GroupedPopulationVariance(f, 0, 10), 50);
  EXPECT_EQ(GroupedPopulationStdDev(f, 0, 10), std::sqrt(50.0L));
  EXPECT_EQ(GetGroupedMeanDev(f, 0, 10, 15), 5);
  Extended q1 = 0;
  Extended q3 = 0;
  GroupedQuartiles(f, 0, 10, q1, q3);
  EXPECT_EQ(q1, 10);  // target 1: class 0 complete at its upper boundary
  EXPECT_EQ(q3, 20);  // target 3: class 1 complete
  Extended sum = 0;
  Extended sum_sq = 0;
  GroupedSums(f, 0, 10, sum, sum_sq);
  EXPECT_EQ(sum, 60);
  EXPECT_EQ(sum_sq, 25 + 450 + 625);
}

TEST(GroupedStatistics, AgreeWithExactReference) {
  EXPECT_TRUE(RelNear(GroupedMean(kFreqs, kStart, kWidth), kMean));
  EXPECT_TRUE(RelNear(GroupedSampleVariance(kFreqs, kStart, kWidth), kSampleVariance));
  EXPECT_TRUE(RelNear(GroupedPopulationVariance(kFreqs, kStart, kWidth), kPopulationVariance));
  EXPECT_TRUE(RelNear(GroupedSampleStdDev(kFreqs, kStart, kWidth), kSampleStdDev));
  EXPECT_TRUE(RelNear(GroupedPopulationStdDev(kFreqs, kStart, kWidth), kPopulationStdDev));
  EXPECT_TRUE(RelNear(GroupedMedian(kFreqs, kStart, kWidth), kMedian));
  EXPECT_TRUE(RelNear(GetGroupedMeanDev(kFreqs, kStart, kWidth, 1), kMeanDevAbout1));
  Extended mode = 0;
  EXPECT_TRUE(GroupedMode(kFreqs, kStart, kWidth, mode));
  EXPECT_TRUE(RelNear(mode, kMode));
  Extended q1 = 0;
  Extended q3 = 0;
  GroupedQuartiles(kFreqs, kStart, kWidth, q1, q3);
  EXPECT_TRUE(RelNear(q1, kQ1));
  EXPECT_TRUE(RelNear(q3, kQ3));
  std::array<Extended, 9> deciles{};
  GetGroupedDeciles(kFreqs, kStart, kWidth, deciles);
  for (std::size_t j = 0; j < 9; ++j) {
    EXPECT_TRUE(RelNear(deciles[j], kDeciles[j])) << "decile " << j + 1;
  }
  EXPECT_EQ(deciles[4], GroupedMedian(kFreqs, kStart, kWidth));
  Extended sum = 0;
  Extended sum_sq = 0;
  GroupedSums(kFreqs, kStart, kWidth, sum, sum_sq);
  EXPECT_EQ(sum, kSum);  // dyadic midpoints: exact
  EXPECT_EQ(sum_sq, kSumSq);
}

TEST(GroupedStatistics, ZeroAndSmallTotals) {
  const TQENLWordVector zeros = {0, 0};
  EXPECT_EQ(GroupedMean(zeros, 1, 2), 0);
  EXPECT_EQ(GroupedSampleVariance(zeros, 1, 2), 0);
  EXPECT_EQ(GroupedPopulationVariance(zeros, 1, 2), 0);
  EXPECT_EQ(GetGroupedMeanDev(zeros, 1, 2, 0), 0);
  Extended sum = 5;
  Extended sum_sq = 5;
  GroupedSums(zeros, 1, 2, sum, sum_sq);
  EXPECT_EQ(sum, 0);
  EXPECT_EQ(sum_sq, 0);
  // One observation: no sample variance, population variance 0.
  const TQENLWordVector one = {0, 1};
  EXPECT_EQ(GroupedSampleVariance(one, 1, 2), 0);
  EXPECT_EQ(GroupedSampleStdDev(one, 1, 2), 0);
  EXPECT_EQ(GroupedPopulationVariance(one, 1, 2), 0);
  EXPECT_EQ(GroupedMean(one, 1, 2), 4);
}

TEST(GroupedMode, TiesAndEnds) {
  Extended mode = 123;
  EXPECT_FALSE(GroupedMode(TQENLWordVector{2, 2}, 0, 1, mode));
  EXPECT_FALSE(GroupedMode(TQENLWordVector{1, 5, 3, 5}, 0, 1, mode));
  EXPECT_EQ(mode, 123);  // left as it was on a tie
  // A later larger class clears an earlier tie.
  EXPECT_TRUE(GroupedMode(TQENLWordVector{2, 2, 6}, 0, 5, mode));
  // Last class: d1 = 4, d2 = 6 (f[k] itself): 2 * 5 + 4 * 5 / 10.
  EXPECT_EQ(mode, 12);
  // First class: d1 = 8 (f[k] itself), d2 = 8 - 4 = 4: 0 + 8 * 3 / 12.
  EXPECT_TRUE(GroupedMode(TQENLWordVector{8, 4}, 0, 3, mode));
  EXPECT_EQ(mode, 2);
  // One class: d1 = d2 = f[0], the midpoint.
  EXPECT_TRUE(GroupedMode(TQENLWordVector{3}, 10, 4, mode));
  EXPECT_EQ(mode, 12);
}

TEST(GroupedShape, UnweightedCentralSumsAndSwappedSkewNames) {
  EXPECT_TRUE(
      RelNear(GetGroupedSampleSkew(kFreqs, kStart, kWidth, kGivenMean, kGivenStdDev), kSampleSkew));
  EXPECT_TRUE(RelNear(GetGroupedPopulationSkew(kFreqs, kStart, kWidth, kGivenMean, kGivenStdDev),
                      kPopulationSkew));
  EXPECT_TRUE(RelNear(GetGroupedSampleKurtosis(kFreqs, kStart, kWidth, kGivenMean, kGivenStdDev),
                      kSampleKurtosis));
  EXPECT_TRUE(
      RelNear(GetGroupedPopulationKurtosis(kFreqs, kStart, kWidth, kGivenMean, kGivenStdDev),
              kPopulationKurtosis));
  // By hand: frequencies [1, 2] from 0 by 2 (midpoints 1 and 3), mean 0, s = 1, F = 3:
  // S3 = 1 + 27 = 28 with no weight; "sample" skew S3 / (F s^3), "population" F S3 / (2 * 1).
  const TQENLWordVector f = {1, 2};
  EXPECT_EQ(GetGroupedSampleSkew(f, 0, 2, 0, 1), 28 / 3.0L);
  EXPECT_EQ(GetGroupedPopulationSkew(f, 0, 2, 0, 1), 42);
  // F = 4 with [1, 3]: S4 = 1 + 81 = 82; 82 / 4 - 3; and 4 * 5 * 82 / 6 - 3 * 9 / 2.
  const TQENLWordVector g = {1, 3};
  EXPECT_EQ(GetGroupedPopulationKurtosis(g, 0, 2, 0, 1), 82 / 4.0L - 3);
  EXPECT_TRUE(RelNear(GetGroupedSampleKurtosis(g, 0, 2, 0, 1), 1640 / 6.0L - 13.5L));
}

TEST(GroupedErrors, EmptyFrequenciesEverywhere) {
  const TQENLWordVector empty;
  Extended a = 7;
  Extended b = 8;
  std::array<Extended, 9> deciles{};
  deciles.fill(3);
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedMean(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedMedian(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedMode(empty, 0, 1, a); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedQuartiles(empty, 0, 1, a, b); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedDeciles(empty, 0, 1, deciles); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedSampleVariance(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedPopulationVariance(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedSampleStdDev(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedPopulationStdDev(empty, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedMeanDev(empty, 0, 1, 0); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedSampleSkew(empty, 0, 1, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedPopulationSkew(empty, 0, 1, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedSampleKurtosis(empty, 0, 1, 0, 1); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetGroupedPopulationKurtosis(empty, 0, 1, 0, 1); });
  EXPECT_EQ(a, 7);
  EXPECT_EQ(b, 8);
  for (const Extended d : deciles) EXPECT_EQ(d, 3);
  // GroupedSums zeroes its outputs before it checks.
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedSums(empty, 0, 1, a, b); });
  EXPECT_EQ(a, 0);
  EXPECT_EQ(b, 0);
}

TEST(GroupedErrors, ShapeChecksInOrder) {
  const TQENLWordVector two = {1, 0, 1};    // F = 2
  const TQENLWordVector three = {1, 1, 1};  // F = 3
  const TQENLWordVector before = two;
  ExpectRaises(rsVectorG2, [&] { GetGroupedSampleSkew(two, 0, 1, 0, 0); });  // before rsStdDev
  ExpectRaises(rsVectorG2, [&] { GetGroupedPopulationSkew(two, 0, 1, 0, 0); });
  ExpectRaises(rsVectorG3, [&] { GetGroupedSampleKurtosis(three, 0, 1, 0, 0); });
  ExpectRaises(rsVectorG3, [&] { GetGroupedPopulationKurtosis(three, 0, 1, 0, 0); });
  ExpectRaises(rsStdDev, [&] { GetGroupedSampleSkew(three, 0, 1, 0, 1e-13L); });
  ExpectRaises(rsStdDev, [&] { GetGroupedPopulationSkew(three, 0, 1, 0, 0); });
  ExpectRaises(rsStdDev, [&] { GetGroupedSampleKurtosis(kFreqs, 0, 1, 0, 0); });
  ExpectRaises(rsStdDev, [&] { GetGroupedPopulationKurtosis(kFreqs, 0, 1, 0, -1e-13L); });
  EXPECT_EQ(two, before);
}

TEST(GroupedErrors, TargetsNotReachedBecauseCumulativeFrequenciesWrap) {
  // F = 5e9, but the 32-bit cumulative frequencies are 1e9 and 5e9 - 2^32 = 705032704, so the
  // median target 2.5e9 is never reached.
  const TQENLWordVector f = {1000000000u, 4000000000u};
  Extended q1 = 1;
  Extended q3 = 2;
  std::array<Extended, 9> deciles{};
  deciles.fill(5);
  ExpectRaises(rsMedianNotFound, [&] { GroupedMedian(f, 0, 1); });
  ExpectRaises(rsQuartilesNotFound, [&] { GroupedQuartiles(f, 0, 1, q1, q3); });
  ExpectRaises(rsQuartilesNotFound, [&] { GetGroupedDeciles(f, 0, 1, deciles); });
  EXPECT_EQ(q1, 1);
  EXPECT_EQ(q3, 2);
  for (const Extended d : deciles) EXPECT_EQ(d, 5);
  // The first deciles (targets 5e8, 1e9) are reached in class 0; the raise still leaves the
  // array. With only the Q3 target out of reach the quartiles fail too: F = 4.5e9, C = 2e9 and
  // 4.5e9 - 2^32 = 205032704 < 3.375e9, while Q1 = 1.125e9 is reached in class 0.
  const TQENLWordVector g = {2000000000u, 2500000000u};
  ExpectRaises(rsQuartilesNotFound, [&] { GroupedQuartiles(g, 0, 1, q1, q3); });
  EXPECT_EQ(q1, 1);
}

}  // namespace
}  // namespace tovrin
