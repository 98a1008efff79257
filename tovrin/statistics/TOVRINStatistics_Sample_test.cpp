// Tests of the sample statistics. Expected values are exact arithmetic by hand, or come from
// TOVRINStatistics_Sample_reference.inc (256-bit mpmath from the textbook definitions; the
// one-pass variance emulated at 64-bit precision).
#include <array>
#include <cmath>
#include <limits>
#include <vector>

#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/testing/TOVRIN_testing.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINStatistics_Sample_reference.inc"

using namespace testing;  // NOLINT: the shared checks and constants

template <typename T>
std::vector<T> From(const std::vector<long double>& values) {
  return std::vector<T>(values.begin(), values.end());
}
TQENFloatVector Floats(std::initializer_list<long double> values) {
  return Vec<PackedExtended>(values);
}

template <typename T>
class SampleFamilies : public ::testing::Test {};
TYPED_TEST_SUITE(SampleFamilies, BuildableElements);

// The two-pass variances hand SumSqDiffVector a centre rounded to Double and Single for those
// element types, which the reference reproduces; the one-pass forms match the emulated
// arithmetic to the bit.
TYPED_TEST(SampleFamilies, MeanAndVariances) {
  using T = TypeParam;
  const auto x = From<T>(kSmallInts);
  EXPECT_TRUE(RelNear(QENMean(x), kSmallIntsMean));
  long double sample = kSmallIntsSampleVarianceExact,
              population = kSmallIntsPopulationVarianceExact;
  if (std::is_same_v<T, Single>) {
    sample = kSmallIntsSampleVarianceSingle;
    population = kSmallIntsPopulationVarianceSingle;
  }
  EXPECT_TRUE(RelNear(SampleVariance(x), sample));
  EXPECT_TRUE(RelNear(PopulationVariance(x), population));
  EXPECT_TRUE(RelNear(SampleStdDev(x), std::sqrt(sample)));
  EXPECT_TRUE(RelNear(PopulationStdDev(x), std::sqrt(population)));
  Extended variance = 0, mean = 0, sd = 0;
  SampleVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kSmallIntsOnePassSampleVariance);
  EXPECT_EQ(mean, kSmallIntsOnePassMean);
  PopulationVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kSmallIntsOnePassPopulationVariance);
  SampleStdDevAndMean(x, sd, mean);
  EXPECT_EQ(sd, std::sqrt(kSmallIntsOnePassSampleVariance));
  PopulationStdDevAndMean(x, sd, mean);
  EXPECT_EQ(sd, std::sqrt(kSmallIntsOnePassPopulationVariance));
  EXPECT_EQ(mean, kSmallIntsOnePassMean);
}

TYPED_TEST(SampleFamilies, SizeErrorsLeaveOutputsAlone) {
  const std::vector<TypeParam> empty, one = Vec<TypeParam>({7});
  Extended a = 11, b = 13;
  ExpectEachRaises(rsVectorIsEmpty, {[&] { QENMean(empty); }, [&] { PopulationVariance(empty); },
                                     [&] { SampleStdDev(empty); }, [&] { GetMedian(empty); },
                                     [&] { SampleVarianceAndMean(empty, a, b); },
                                     [&] { PopulationStdDevAndMean(empty, a, b); }});
  ExpectEachRaises(rsVectorG1, {[&] { SampleVariance(one); }, [&] { SampleStdDev(one); },
                                [&] { SampleVarianceAndMean(one, a, b); },
                                [&] { SampleStdDevAndMean(one, a, b); }});
  EXPECT_EQ(PopulationStdDev(one), 0);
  EXPECT_EQ(a * 100 + b, 1113);
  PopulationVarianceAndMean(one, a, b);
  EXPECT_EQ(a * 100 + b, 7);
}

TYPED_TEST(SampleFamilies, MedianAndTrimmedMeans) {
  using V = std::vector<TypeParam>;
  EXPECT_EQ(GetMedian(Vec<TypeParam>({3, 1, 2})), 1);  // the middle element as stored
  EXPECT_EQ(GetMedian(Vec<TypeParam>({1, 2, 5, 7})), 3.5L);
  const V x = Vec<TypeParam>({1, 2, 3, 4, 100});
  const struct {
    long double alpha;
    bool excel;
    long double expected;
  } cases[] = {{0.2L, false, 3}, {0.4L, true, 3},  {0, false, 22},  {1e-13L, false, 22},
               {0, true, 22},    {0.5L, false, 3}, {1.0L, true, 3}, {0.1L, false, 22},
               {0.2L, true, 22}};  // the last two drop Trunc(0.5) = 0 and Trunc(1) div 2 = 0
  for (const auto& c : cases) {
    EXPECT_EQ(c.excel ? ExcelTrimmedMean(x, c.alpha) : TrimmedMean(x, c.alpha), c.expected)
        << c.alpha;
  }
  EXPECT_EQ(TrimmedMean(Vec<TypeParam>({1, 2, 3, 4}), 0.49L), 2.5L);
  EXPECT_EQ(TrimmedMean(Vec<TypeParam>({5}), 0.3L), 5);
  // The range check comes before the emptiness check, the two shortcuts before the range.
  const V empty;
  ExpectEachRaises(rsInvalidValue,
                   {[&] { TrimmedMean(empty, 0.7L); }, [&] { TrimmedMean(x, -0.1L); },
                    [&] { TrimmedMean(x, 0.51L); }, [&] { ExcelTrimmedMean(x, 1.01L); },
                    [&] { TrimmedMean(x, std::numeric_limits<Extended>::quiet_NaN()); }});
  // 0 goes through QENMean, 0.5 through GetMedian.
  ExpectEachRaises(rsVectorIsEmpty,
                   {[&] { TrimmedMean(empty, 0.2L); }, [&] { TrimmedMean(empty, 0); },
                    [&] { TrimmedMean(empty, 0.5L); }, [&] { ExcelTrimmedMean(empty, 0.3L); }});
}

// The accumulators and wrap-around that differ by element type.
TEST(SampleTypeRules, OnePassAccumulators) {
  Extended variance = 0, mean = 0;
  for (const auto& x : {From<PackedExtended>(kCentred), From<PackedExtended>(kOffset)}) {
    const bool centred = x.size() == kCentred.size();
    SampleVarianceAndMean(x, variance, mean);
    EXPECT_EQ(variance, centred ? kCentredOnePassSampleVariance : kOffsetOnePassSampleVariance);
    EXPECT_EQ(mean, centred ? kCentredOnePassSampleMean : kOffsetOnePassSampleMean);
    PopulationVarianceAndMean(x, variance, mean);
    EXPECT_EQ(variance,
              centred ? kCentredOnePassPopulationVariance : kOffsetOnePassPopulationVariance);
  }
  SampleVarianceAndMean(From<Single>(kCentred), variance, mean);  // exact in Single too
  EXPECT_EQ(variance, kCentredOnePassSampleVariance);
  // Int64 sums wrap, and so does the square of the sum.
  SampleVarianceAndMean(TQENInt64Vector{3037000500, 3037000500, 1, -7}, variance, mean);
  EXPECT_EQ(variance, kWrap64OnePassSampleVariance);
  EXPECT_EQ(mean, kWrap64OnePassMean);
  // LongWord squares keep their low 32 bits: 65536^2 leaves 0, 4294967295^2 leaves 1.
  SampleVarianceAndMean(TQENLWordVector{65536, 65536}, variance, mean);
  EXPECT_EQ(variance, -8589934592.0L);
  PopulationVarianceAndMean(TQENLWordVector{4294967295u}, variance, mean);
  EXPECT_EQ(variance, 1 - 4294967295.0L * 4294967295.0L);
  // LongInt squares keep them signed: 46341^2 counts as -2147479015; 46340^2 still fits.
  SampleVarianceAndMean(TQENLIntVector{46341, -46341}, variance, mean);
  EXPECT_EQ(variance, -4294958030.0L);
  SampleVarianceAndMean(TQENLIntVector{46340, -46340}, variance, mean);
  EXPECT_EQ(variance, 2.0L * 46340 * 46340);
}

TEST(SampleTypeRules, MeansMediansAndTrimmedMeansWrapInTheirWidth) {
  const LongInt big = std::numeric_limits<LongInt>::max();
  const Int64 big64 = std::numeric_limits<Int64>::max();
  EXPECT_EQ(QENMean(TQENInt64Vector{big64, 1}), -4611686018427387904.0L);  // -2^63 / 2
  EXPECT_EQ(QENMean(TQENLWordVector{4294967295u, 4294967295u}), 4294967295.0L);
  EXPECT_EQ(GetMedian(TQENLIntVector{big, big}), -1);  // 2^32 - 2 wraps to -2
  EXPECT_EQ(GetMedian(TQENLWordVector{4294967295u, 4294967295u}), 2147483647);
  EXPECT_EQ(GetMedian(TQENInt64Vector{big64, big64}), -1);
  EXPECT_EQ(GetMedian(TQENLIntVector{-3, 4}), 0.5L);
  EXPECT_EQ(GetMedian(TQENDoubleVector{1e308, 1e308}), static_cast<long double>(1e308));
  // Trimmed sums are Extended, while the zero shortcut goes through the wrapping mean.
  const Int64 quarter = Int64{1} << 62;
  const TQENInt64Vector x = {quarter, quarter, quarter};
  EXPECT_EQ(TrimmedMean(x, 0.1L), 0x1p62L);
  EXPECT_EQ(ExcelTrimmedMean(x, 0.5L), 0x1p62L);
  EXPECT_EQ(TrimmedMean(x, 0), -0x1p62L / 3);
}

TEST(SampleReference, TwoPassTrimmedAndShape) {
  const auto x = From<PackedExtended>(kCentred);
  const auto offset = From<PackedExtended>(kOffset);
  EXPECT_TRUE(RelNear(QENMean(x), kCentredMean));
  EXPECT_TRUE(RelNear(SampleVariance(x), kCentredSampleVar));
  EXPECT_TRUE(RelNear(PopulationVariance(x), kCentredPopulationVar));
  EXPECT_TRUE(RelNear(SampleVariance(From<Double>(kCentred)), kCentredSampleVar));
  EXPECT_TRUE(RelNear(SampleVariance(offset), kOffsetSampleVar));  // far from 0: two passes
  EXPECT_TRUE(RelNear(PopulationVariance(offset), kOffsetPopulationVar));
  const auto sorted = From<PackedExtended>(kCentredSorted);  // n = 37
  const std::array<std::array<long double, 3>, 3> trimmed = {
      {{0.1L, kCentredTrimmed1_10, kCentredExcelTrimmed1_10},
       {0.25L, kCentredTrimmed1_4, kCentredExcelTrimmed1_4},
       {0.3L, kCentredTrimmed3_10, kCentredExcelTrimmed3_10}}};
  for (const auto& [alpha, plain, excel] : trimmed) {
    EXPECT_TRUE(RelNear(TrimmedMean(sorted, alpha), plain));
    EXPECT_TRUE(RelNear(ExcelTrimmedMean(sorted, alpha), excel));
  }
  // The sample forms are the bias-corrected G1 and G2, the population forms g1 and g2 - 3.
  EXPECT_TRUE(RelNear(GetSampleSkew(x), kCentredSampleSkew));
  EXPECT_TRUE(RelNear(GetPopulationSkew(x), kCentredPopulationSkew));
  EXPECT_TRUE(RelNear(GetSampleKurtosis(x), kCentredSampleKurtosis));
  EXPECT_TRUE(RelNear(GetPopulationKurtosis(x), kCentredPopulationKurtosis));
  const long double s = std::sqrt(kCentredSampleVar), p = std::sqrt(kCentredPopulationVar);
  EXPECT_TRUE(RelNear(GetSampleSkew(x, kCentredMean, s), kCentredSampleSkew));
  EXPECT_TRUE(RelNear(GetPopulationSkew(x, kCentredMean, p), kCentredPopulationSkew));
  EXPECT_TRUE(RelNear(GetSampleKurtosis(x, kCentredMean, s), kCentredSampleKurtosis));
  EXPECT_TRUE(RelNear(GetPopulationKurtosis(x, kCentredMean, p), kCentredPopulationKurtosis));
  // [0, 0, 0, 4] with m = 1, s = 2: S3 = 24, S4 = 84.
  const TQENFloatVector h = Floats({0, 0, 0, 4});
  EXPECT_EQ(GetSampleSkew(h, 1, 2), 4 * 24 / (3.0L * 2 * 8));
  EXPECT_EQ(GetPopulationSkew(h, 1, 2), 24 / (4.0L * 8));
  EXPECT_EQ(GetPopulationKurtosis(h, 1, 2), 84 / (4.0L * 16) - 3);
  EXPECT_EQ(GetSampleKurtosis(h, 1, 2), 4);  // 4 x 5 x 84 / (3 x 2 x 1 x 16) - 27 / 2
}

// The Hazen quantile with its position held in single precision.
TEST(SampleQuantiles, HandExamplesAndSinglePrecisionPositions) {
  Extended q1 = 0, q3 = 0;
  const struct {
    std::initializer_list<long double> x;
    Extended q1, q3;
  } cases[] = {
      {{1, 2, 3, 4}, 1.5L, 3.5L}, {{1, 2, 3}, 1.25L, 2.75L}, {{42}, 42, 42}, {{10, 20}, 10, 20}};
  for (const auto& c : cases) {
    GetQuartiles(Floats(c.x), q1, q3);
    EXPECT_EQ(q1, c.q1);
    EXPECT_EQ(q3, c.q3);
  }
  for (const QuantileRow& row : kQuantiles) {
    TQENFloatVector x = From<PackedExtended>({kCentred.begin(), kCentred.begin() + row.n});
    QSortVector(x, true);
    GetQuartiles(x, q1, q3);
    EXPECT_TRUE(RelNear(q1, row.q1)) << "n = " << row.n;
    EXPECT_TRUE(RelNear(q3, row.q3)) << "n = " << row.n;
    std::array<Extended, 9> deciles{};
    GetDeciles(x, deciles);
    for (int j = 0; j < 9; ++j)
      EXPECT_TRUE(RelNear(deciles[j], row.deciles[j])) << row.n << " " << j;
  }
  // n = 7: p = 1.2 is held as the Single 1.20000004768...; n = 2: p = 0.7 and 0.9 read the
  // first element, 2.3 the last.
  std::array<Extended, 9> d{};
  GetDeciles(Floats({10, 20, 30, 40, 50, 60, 70}), d);
  EXPECT_EQ(d[0], 10 + 10 * (static_cast<long double>(1.2F) - 1));
  EXPECT_EQ(d[4], 40);
  GetDeciles(Floats({10, 20}), d);
  EXPECT_EQ(Values(std::vector<Extended>{d[0], d[1], d[8]}), (std::vector<Extended>{10, 10, 20}));
  EXPECT_EQ(d[2], 10 + 10 * (static_cast<long double>(1.1F) - 1));
  q1 = 1;
  d.fill(-4);
  ExpectEachRaises(rsVectorIsEmpty, {[&] { GetQuartiles(TQENFloatVector{}, q1, q3); },
                                     [&] { GetDeciles(TQENFloatVector{}, d); }});
  EXPECT_EQ(q1 + d[0], -3);
}

TEST(SampleMode, RunsTiesAndTheLastRun) {
  const struct {
    std::initializer_list<long double> x;
    bool found;
    Extended mode;
  } cases[] = {{{1, 1, 2, 2}, false, 1},
               {{1, 1, 2, 2, 2}, true, 2},
               {{1, 2, 3}, false, -1.1e4932L},
               {{2, 2}, true, 2},
               {{1, 2, 2}, true, 2},
               {{1, 1, 2}, true, 1},
               {{1, 1, 1, 2, 2, 3, 3}, true, 1},
               {{1, 1, 2, 3, 3}, false, 1},
               {{1, 1, 2, 3, 3, 3}, true, 3},
               {{7}, true, 7},
               {{0.5L, 1, 1 + 1e-13L, 3}, true, 1 + 1e-13L}};  // a run within tolerance
  for (const auto& c : cases) {
    Extended mode = 0;
    EXPECT_EQ(GetMode(Floats(c.x), mode), c.found);
    EXPECT_EQ(mode, c.mode);
  }
  Extended mode = 9;
  ExpectRaises(rsVectorIsEmpty, [&] { GetMode(TQENFloatVector{}, mode); });
  EXPECT_EQ(mode, 9);
  const struct {
    std::initializer_list<long double> x, expected;
  } frequent[] = {{{1, 1, 2, 2}, {1, 2}},
                  {{1, 2, 2}, {1}},  // only the last run: by design
                  {{1, 2, 3}, {}},
                  {{4}, {4}},
                  {{1, 1, 2, 3, 3, 3}, {3}},
                  {{1, 1, 1, 2, 2, 3}, {1}},
                  {{1, 1, 2, 2, 3, 4, 4, 5}, {1, 2, 4}},
                  {{1, 1, 2, 2, 2, 3, 3, 3}, {2, 3}}};
  for (const auto& c : frequent)
    EXPECT_TRUE(SameBits(GetMostFrequent(Floats(c.x)), Floats(c.expected)));
  ExpectRaises(rsVectorIsEmpty, [] { GetMostFrequent(TQENFloatVector{}); });
}

TEST(SampleShape, CheckOrder) {
  using Plain = Extended (*)(const TQENFloatVector&);
  using Given = Extended (*)(const TQENFloatVector&, Extended, Extended);
  const TQENFloatVector empty, one = Floats({1}), three = Floats({1, 2, 3}),
                               flat = Floats({5, 5, 5, 5});
  for (const bool skew : {true, false}) {
    const Plain plain[] = {skew ? Plain(&GetSampleSkew) : Plain(&GetSampleKurtosis),
                           skew ? Plain(&GetPopulationSkew) : Plain(&GetPopulationKurtosis)};
    const Given given[] = {skew ? Given(&GetSampleSkew) : Given(&GetSampleKurtosis),
                           skew ? Given(&GetPopulationSkew) : Given(&GetPopulationKurtosis)};
    const TResStringId size = skew ? rsVectorG2 : rsVectorG3;
    const TQENFloatVector& tooFew = skew ? Floats({1, 2}) : three;
    for (int k = 0; k < 2; ++k) {
      ExpectRaises(rsVectorIsEmpty, [&] { plain[k](empty); });
      ExpectRaises(size, [&] { plain[k](one); });  // the size error, not rsVectorG1
      ExpectRaises(size, [&] { plain[k](tooFew); });
      ExpectRaises(rsStdDev, [&] { plain[k](flat); });
      ExpectRaises(rsVectorIsEmpty, [&] { given[k](empty, 0, 0); });
      ExpectRaises(size, [&] { given[k](tooFew, 0, 0); });
      ExpectRaises(rsStdDev, [&] { given[k](flat, 5, 1e-13L); });  // zero within tolerance
      EXPECT_NO_THROW(given[k](flat, 2, 1e-11L));
    }
  }
}

TEST(SampleStandardise, BothFormsAndTheirErrors) {
  TQENFloatVector x = Floats({1, 2, 3, 4});
  Standardise(x, 2.5L, 0.5L, 10, 2);
  EXPECT_TRUE(SameBits(x, Floats({4, 8, 12, 16})));
  TQENFloatVector y = Floats({1});
  Standardise(y, 1, 1e-13L, 0, 1);  // a tiny StdDev is accepted: the test is exact
  EXPECT_EQ(Extended(y[0]), 0);
  auto z = From<PackedExtended>(kCentred);
  Standardise(z, 0, 1, false);
  EXPECT_TRUE(Near(QENMean(z), 0, 1e-17L));
  EXPECT_TRUE(RelNear(SampleVariance(z), 1, 1e-17L));
  z = From<PackedExtended>(kCentred);
  Standardise(z, 5, 3, true);
  EXPECT_TRUE(RelNear(QENMean(z), 5, 1e-17L));
  EXPECT_TRUE(RelNear(PopulationVariance(z), 9, 1e-17L));
  ExpectRaisesUntouched(rsVectorIsEmpty, TQENFloatVector{},
                        [](auto& v) { Standardise(v, 0, 0, 0, 1); });
  ExpectRaisesUntouched(rsVectorIsEmpty, TQENFloatVector{},
                        [](auto& v) { Standardise(v, 0, 1, true); });
  ExpectRaisesUntouched(rsStdDev, Floats({1, 2, 3}), [](auto& v) { Standardise(v, 2, 0, 0, 1); });
  ExpectRaisesUntouched(rsVectorG1, Floats({3}), [](auto& v) { Standardise(v, 0, 1, false); });
  ExpectRaisesUntouched(rsStdDev, Floats({3}), [](auto& v) { Standardise(v, 0, 1, true); });
}

TEST(SampleMeans, GeometricHarmonicAndOthers) {
  const auto x = From<PackedExtended>(kPositive);
  EXPECT_TRUE(RelNear(GeometricMean(x), kPositiveGeometricMean));
  EXPECT_TRUE(RelNear(GeometricStdDev(x, true), kPositiveGeometricStdDevSample, 1e-17L));
  EXPECT_TRUE(RelNear(GeometricStdDev(x, false), kPositiveGeometricStdDevPopulation, 1e-17L));
  EXPECT_TRUE(RelNear(GeometricVariance(x, true), kPositiveGeometricVarianceSample, 2e-17L));
  EXPECT_TRUE(RelNear(GeometricVariance(x, false), kPositiveGeometricVariancePopulation, 2e-17L));
  EXPECT_TRUE(RelNear(GeometricStdDev(x, 3, true), kPositiveGeometricStdDevAbout3Sample, 1e-17L));
  EXPECT_TRUE(
      RelNear(GeometricStdDev(x, 3, false), kPositiveGeometricStdDevAbout3Population, 1e-17L));
  const long double about3 = kPositiveGeometricStdDevAbout3Sample;
  EXPECT_TRUE(RelNear(GeometricVariance(x, 3, true), about3 * about3, 2e-17L));
  EXPECT_EQ(GeometricMean(Floats({2, 8})), 4);
  EXPECT_EQ(GeometricStdDev(Floats({5}), false), 1);
  EXPECT_TRUE(RelNear(HarmonicMean(x), kPositiveHarmonicMean));
  EXPECT_TRUE(RelNear(RootMeanSquare(x), kPositiveRootMeanSquare));
  EXPECT_TRUE(RelNear(MeanDeviation(x, 40), kPositiveMeanDeviationAbout40));
  EXPECT_EQ(MeanDeviation(TQENFloatVector{}, 2), 0);
  EXPECT_EQ(HeronianMean(4, 9), (4 + 6 + 9) / 3.0L);
  EXPECT_NO_THROW(HeronianMean(4, -1e-13L));  // negative only beyond tolerance
}

TEST(SampleMeans, ErrorsInOrder) {
  const TQENFloatVector empty, zero = Floats({1, 0, 2}), tiny = Floats({1, 1e-13L}),
                               negativeOne = Floats({-1});
  // tiny is not positive beyond the tolerance; negativeOne fails in the geometric mean.
  for (const bool sample : {true, false}) {
    ExpectEachRaises(
        rsVectorIsEmpty,
        {[&] { GeometricMean(empty); }, [&] { GeometricStdDev(empty, sample); },
         [&] { GeometricStdDev(empty, 2, sample); }, [&] { GeometricVariance(empty, 2, sample); },
         [] { HarmonicMean(TQENFloatVector{}); }, [] { RootMeanSquare(TQENFloatVector{}); }});
    ExpectEachRaises(rsVectorNotPos, {[&] { GeometricMean(zero); }, [&] { GeometricMean(tiny); },
                                      [&] { GeometricStdDev(zero, 2, sample); },
                                      [&] { GeometricVariance(zero, sample); },
                                      [&] { GeometricStdDev(negativeOne, sample); },
                                      [] {
                                        HarmonicMean(Floats({1, -2}));
                                      }});
  }
  ExpectEachRaises(rsVectorG1, {[&] { GeometricStdDev(negativeOne, 2, true); },  // size first
                                [&] { GeometricVariance(Floats({3}), 3, true); }});
  ExpectEachRaises(rsValueGEZero, {[] { HeronianMean(-1, 4); }, [] { HeronianMean(4, -1e-11L); }});
}

}  // namespace
}  // namespace tovrin
