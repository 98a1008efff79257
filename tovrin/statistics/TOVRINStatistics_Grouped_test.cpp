// Tests of the grouped-data statistics. Expected values are exact arithmetic by hand, or come
// from TOVRINStatistics_Grouped_reference.inc (exact rationals and 256-bit mpmath).
#include <array>
#include <cmath>

#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINStatistics_Grouped_reference.inc"

using namespace testing;  // NOLINT: the shared checks and constants

TEST(GroupedStatistics, HandExampleAndExactReference) {
  // [1, 2, 1] from 0 in steps of 10: midpoints 5, 15, 25; quartile targets 1 and 3 are met at
  // the upper boundaries of classes 0 and 1.
  const TQENLWordVector f = {1, 2, 1};
  Extended a = 0, b = 0;
  EXPECT_EQ(GroupedMedian(f, 0, 10), 15);
  EXPECT_EQ(GroupedSampleVariance(f, 0, 10), 200 / 3.0L);
  EXPECT_EQ(GroupedPopulationStdDev(f, 0, 10), std::sqrt(50.0L));
  EXPECT_EQ(GetGroupedMeanDev(f, 0, 10, 15), 5);
  GroupedQuartiles(f, 0, 10, a, b);
  EXPECT_EQ(a * 100 + b, 1020);
  GroupedSums(f, 0, 10, a, b);
  EXPECT_EQ(a, 60);
  EXPECT_EQ(b, 25 + 450 + 625);

  EXPECT_TRUE(RelNear(GroupedMean(kFreqs, kStart, kWidth), kMean));
  EXPECT_TRUE(RelNear(GroupedSampleVariance(kFreqs, kStart, kWidth), kSampleVariance));
  EXPECT_TRUE(RelNear(GroupedPopulationVariance(kFreqs, kStart, kWidth), kPopulationVariance));
  EXPECT_TRUE(RelNear(GroupedSampleStdDev(kFreqs, kStart, kWidth), kSampleStdDev));
  EXPECT_TRUE(RelNear(GroupedPopulationStdDev(kFreqs, kStart, kWidth), kPopulationStdDev));
  EXPECT_TRUE(RelNear(GroupedMedian(kFreqs, kStart, kWidth), kMedian));
  EXPECT_TRUE(RelNear(GetGroupedMeanDev(kFreqs, kStart, kWidth, 1), kMeanDevAbout1));
  EXPECT_TRUE(GroupedMode(kFreqs, kStart, kWidth, a));
  EXPECT_TRUE(RelNear(a, kMode));
  GroupedQuartiles(kFreqs, kStart, kWidth, a, b);
  EXPECT_TRUE(RelNear(a, kQ1));
  EXPECT_TRUE(RelNear(b, kQ3));
  std::array<Extended, 9> deciles{};
  GetGroupedDeciles(kFreqs, kStart, kWidth, deciles);
  for (std::size_t j = 0; j < 9; ++j) EXPECT_TRUE(RelNear(deciles[j], kDeciles[j])) << j + 1;
  GroupedSums(kFreqs, kStart, kWidth, a, b);
  EXPECT_EQ(a, kSum);  // dyadic midpoints: exact
  EXPECT_EQ(b, kSumSq);
  // The shape measures weigh the central sums over the classes without the frequencies, and
  // "sample" skew is S3 / (F s^3): the names are swapped against the textbook forms.
  const auto [m, s] = std::pair{kGivenMean, kGivenStdDev};
  EXPECT_TRUE(RelNear(GetGroupedSampleSkew(kFreqs, kStart, kWidth, m, s), kSampleSkew));
  EXPECT_TRUE(RelNear(GetGroupedPopulationSkew(kFreqs, kStart, kWidth, m, s), kPopulationSkew));
  EXPECT_TRUE(RelNear(GetGroupedSampleKurtosis(kFreqs, kStart, kWidth, m, s), kSampleKurtosis));
  EXPECT_TRUE(
      RelNear(GetGroupedPopulationKurtosis(kFreqs, kStart, kWidth, m, s), kPopulationKurtosis));
}

TEST(GroupedStatistics, ZeroAndSmallTotals) {
  const TQENLWordVector zeros = {0, 0}, one = {0, 1};
  for (const Extended x :
       {GroupedMean(zeros, 1, 2), GroupedSampleVariance(zeros, 1, 2),
        GroupedPopulationVariance(zeros, 1, 2), GetGroupedMeanDev(zeros, 1, 2, 0),
        GroupedSampleStdDev(one, 1, 2) /* no sample variance */,
        GroupedPopulationVariance(one, 1, 2)}) {
    EXPECT_EQ(x, 0);
  }
  EXPECT_EQ(GroupedMean(one, 1, 2), 4);
}

TEST(GroupedMode, TiesEndsAndTheWrappingSpread) {
  Extended mode = 123;
  EXPECT_FALSE(GroupedMode(TQENLWordVector{1, 5, 3, 5}, 0, 1, mode));
  EXPECT_EQ(mode, 123);  // left as it was on a tie
  const struct {
    TQENLWordVector freqs;
    Extended start, width, mode;
  } cases[] = {{{2, 2, 6}, 0, 5, 12},  // a later larger class clears a tie; last class: d2 = f[k]
               {{8, 4}, 0, 3, 2},      // first class: d1 = f[k] = 8, d2 = 4: 8 x 3 / 12
               {{3}, 10, 4, 12},       // one class: the midpoint
               // d1 = d2 = 3 x 2^30: the 32-bit spread 3 x 2^31 wraps to 2^31, so the mode lies 1.5
               // widths into class 1 rather than at its middle.
               {{0, 3221225472u, 0}, 0, 1, 2.5L}};
  for (const auto& c : cases) {
    EXPECT_TRUE(GroupedMode(c.freqs, c.start, c.width, mode));
    EXPECT_EQ(mode, c.mode);
  }
}

TEST(GroupedShape, HandExamples) {
  // [1, 2] from 0 by 2 (midpoints 1, 3), mean 0, s = 1, F = 3: S3 = 1 + 27 = 28 unweighted.
  EXPECT_EQ(GetGroupedSampleSkew(TQENLWordVector{1, 2}, 0, 2, 0, 1), 28 / 3.0L);
  EXPECT_EQ(GetGroupedPopulationSkew(TQENLWordVector{1, 2}, 0, 2, 0, 1), 42);
  // F = 4 with [1, 3]: S4 = 82; 82 / 4 - 3, and 4 x 5 x 82 / 6 - 3 x 9 / 2.
  EXPECT_EQ(GetGroupedPopulationKurtosis(TQENLWordVector{1, 3}, 0, 2, 0, 1), 82 / 4.0L - 3);
  EXPECT_TRUE(
      RelNear(GetGroupedSampleKurtosis(TQENLWordVector{1, 3}, 0, 2, 0, 1), 1640 / 6.0L - 13.5L));
}

TEST(GroupedErrors, EmptySizeSpreadAndTargetsInOrder) {
  const TQENLWordVector empty, two = {1, 0, 1}, three = {1, 1, 1};
  Extended a = 7, b = 8;
  std::array<Extended, 9> deciles{};
  deciles.fill(3);
  ExpectEachRaises(
      rsVectorIsEmpty,
      {[&] { GroupedMean(empty, 0, 1); }, [&] { GroupedMedian(empty, 0, 1); },
       [&] { GroupedMode(empty, 0, 1, a); }, [&] { GroupedQuartiles(empty, 0, 1, a, b); },
       [&] { GetGroupedDeciles(empty, 0, 1, deciles); }, [&] { GroupedSampleStdDev(empty, 0, 1); },
       [&] { GroupedPopulationVariance(empty, 0, 1); }, [&] { GetGroupedMeanDev(empty, 0, 1, 0); },
       [&] { GetGroupedPopulationKurtosis(empty, 0, 1, 0, 1); }});
  EXPECT_EQ(a * 10 + b, 78);
  EXPECT_EQ(deciles[8], 3);
  ExpectRaises(rsVectorIsEmpty, [&] { GroupedSums(empty, 0, 1, a, b); });
  EXPECT_EQ(a + b, 0);  // GroupedSums zeroes its outputs before it checks
  ExpectEachRaises(rsVectorG2, {[&] { GetGroupedSampleSkew(two, 0, 1, 0, 0); },  // before rsStdDev
                                [&] { GetGroupedPopulationSkew(two, 0, 1, 0, 0); }});
  ExpectEachRaises(rsVectorG3, {[&] { GetGroupedSampleKurtosis(three, 0, 1, 0, 0); },
                                [&] { GetGroupedPopulationKurtosis(three, 0, 1, 0, 0); }});
  ExpectEachRaises(rsStdDev, {[&] { GetGroupedSampleSkew(three, 0, 1, 0, 1e-13L); },
                              [&] { GetGroupedPopulationKurtosis(kFreqs, 0, 1, 0, -1e-13L); }});
  // F = 5e9, but the 32-bit cumulative frequencies are 1e9 and 5e9 - 2^32, so the median
  // target is never reached; with F = 4.5e9 only the third quartile's target is out of reach.
  const TQENLWordVector f = {1000000000u, 4000000000u}, g = {2000000000u, 2500000000u};
  a = 1;
  ExpectRaises(rsMedianNotFound, [&] { GroupedMedian(f, 0, 1); });
  ExpectEachRaises(rsQuartilesNotFound, {[&] { GroupedQuartiles(f, 0, 1, a, b); },
                                         [&] { GroupedQuartiles(g, 0, 1, a, b); },
                                         [&] { GetGroupedDeciles(f, 0, 1, deciles); }});
  EXPECT_EQ(a, 1);
  EXPECT_EQ(deciles[0], 3);  // the first deciles are reached, but nothing is written
}

}  // namespace
}  // namespace tovrin
