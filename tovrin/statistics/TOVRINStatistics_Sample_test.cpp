// Tests of the sample statistics. Expected values are exact arithmetic done by hand, or come
// from TOVRINStatistics_Sample_reference.inc, made by the script beside it (256-bit mpmath from
// the textbook definitions; the one-pass variance emulated at 64-bit precision).
#include <array>
#include <cmath>
#include <limits>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

#include "tovrin/statistics/TOVRINStatistics_Sample_reference.inc"

// Agreement with a high-precision value to within a few units of 1e-18, relatively.
constexpr long double kRelTolerance = 4e-18L;

::testing::AssertionResult RelNear(long double actual, long double expected,
                                   long double tolerance = kRelTolerance) {
  const long double error = std::fabs(actual - expected);
  if (error <= tolerance * std::fabs(expected)) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << "actual " << static_cast<double>(actual) << " expected "
                                       << static_cast<double>(expected) << " relative error "
                                       << static_cast<double>(error / std::fabs(expected));
}

template <typename V>
V Make(const std::vector<long double>& values) {
  V out;
  for (const long double x : values) out.push_back(static_cast<typename V::value_type>(x));
  return out;
}

TQENFloatVector Floats(std::initializer_list<long double> values) {
  return Make<TQENFloatVector>(std::vector<long double>(values));
}

// Runs Call and expects EMathError with Ident.
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

bool SameElements(const TQENFloatVector& a, const TQENFloatVector& b) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (Extended(a[i]) != Extended(b[i])) return false;
  }
  return true;
}

// ---------------------------------------------------------------------------------------------
// Families over all six element types.

template <typename V>
class SampleFamilies : public ::testing::Test {};
using SixVectorTypes = ::testing::Types<TQENFloatVector, TQENDoubleVector, TQENSingleVector,
                                        TQENInt64Vector, TQENLWordVector, TQENLIntVector>;
TYPED_TEST_SUITE(SampleFamilies, SixVectorTypes);

TYPED_TEST(SampleFamilies, MeanAndTwoPassVariances) {
  using V = TypeParam;
  using T = typename V::value_type;
  const V x = Make<V>(kSmallInts);
  EXPECT_TRUE(RelNear(QENMean(x), kSmallIntsMean));
  // The centre handed to the sum of squared differences is rounded to Double and Single for
  // those element types, which the reference reproduces.
  long double sample = kSmallIntsSampleVarianceExact;
  long double population = kSmallIntsPopulationVarianceExact;
  if (std::is_same_v<T, Double>) {
    sample = kSmallIntsSampleVarianceDouble;
    population = kSmallIntsPopulationVarianceDouble;
  } else if (std::is_same_v<T, Single>) {
    sample = kSmallIntsSampleVarianceSingle;
    population = kSmallIntsPopulationVarianceSingle;
  }
  EXPECT_TRUE(RelNear(SampleVariance(x), sample));
  EXPECT_TRUE(RelNear(PopulationVariance(x), population));
  EXPECT_TRUE(RelNear(SampleStdDev(x), std::sqrt(sample)));
  EXPECT_TRUE(RelNear(PopulationStdDev(x), std::sqrt(population)));
}

TYPED_TEST(SampleFamilies, OnePassFormsMatchTheEmulatedArithmeticBitForBit) {
  using V = TypeParam;
  const V x = Make<V>(kSmallInts);
  Extended variance = 0;
  Extended mean = 0;
  SampleVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kSmallIntsOnePassSampleVariance);
  EXPECT_EQ(mean, kSmallIntsOnePassMean);
  PopulationVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kSmallIntsOnePassPopulationVariance);
  EXPECT_EQ(mean, kSmallIntsOnePassMean);
  Extended std_dev = 0;
  SampleStdDevAndMean(x, std_dev, mean);
  EXPECT_EQ(std_dev, std::sqrt(kSmallIntsOnePassSampleVariance));
  EXPECT_EQ(mean, kSmallIntsOnePassMean);
  PopulationStdDevAndMean(x, std_dev, mean);
  EXPECT_EQ(std_dev, std::sqrt(kSmallIntsOnePassPopulationVariance));
  // And the one-pass value stays within rounding of the true variance.
  EXPECT_TRUE(RelNear(variance, kSmallIntsPopulationVarianceExact, 1e-17L));
}

TYPED_TEST(SampleFamilies, SizeErrorsLeaveOutputsAlone) {
  using V = TypeParam;
  const V empty;
  const V one = Make<V>({7});
  const V one_before = one;
  ExpectRaises(rsVectorIsEmpty, [&] { QENMean(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { SampleVariance(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { PopulationVariance(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { SampleStdDev(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { PopulationStdDev(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { GetMedian(empty); });
  ExpectRaises(rsVectorG1, [&] { SampleVariance(one); });
  ExpectRaises(rsVectorG1, [&] { SampleStdDev(one); });
  EXPECT_EQ(PopulationVariance(one), 0);
  EXPECT_EQ(PopulationStdDev(one), 0);

  Extended a = 11;
  Extended b = 13;
  ExpectRaises(rsVectorIsEmpty, [&] { SampleVarianceAndMean(empty, a, b); });
  ExpectRaises(rsVectorIsEmpty, [&] { PopulationVarianceAndMean(empty, a, b); });
  ExpectRaises(rsVectorIsEmpty, [&] { SampleStdDevAndMean(empty, a, b); });
  ExpectRaises(rsVectorIsEmpty, [&] { PopulationStdDevAndMean(empty, a, b); });
  ExpectRaises(rsVectorG1, [&] { SampleVarianceAndMean(one, a, b); });
  ExpectRaises(rsVectorG1, [&] { SampleStdDevAndMean(one, a, b); });
  EXPECT_EQ(a, 11);
  EXPECT_EQ(b, 13);
  EXPECT_EQ(one, one_before);
  PopulationVarianceAndMean(one, a, b);
  EXPECT_EQ(a, 0);
  EXPECT_EQ(b, 7);
}

TYPED_TEST(SampleFamilies, MedianReadsTheMiddleAsStored) {
  using V = TypeParam;
  EXPECT_EQ(GetMedian(Make<V>({9})), 9);
  EXPECT_EQ(GetMedian(Make<V>({3, 1, 2})), 1);  // not sorted: the middle element as stored
  EXPECT_EQ(GetMedian(Make<V>({1, 2, 4, 7})), 3);
  EXPECT_EQ(GetMedian(Make<V>({1, 2, 5, 7})), 3.5L);
}

TYPED_TEST(SampleFamilies, TrimmedMeansAndTheirCheckOrder) {
  using V = TypeParam;
  const V x = Make<V>({1, 2, 3, 4, 100});
  const V before = x;
  EXPECT_EQ(TrimmedMean(x, 0.2L), 3);
  EXPECT_EQ(ExcelTrimmedMean(x, 0.4L), 3);
  EXPECT_EQ(TrimmedMean(x, 0), 22);       // the mean
  EXPECT_EQ(TrimmedMean(x, 1e-13L), 22);  // zero within tolerance
  EXPECT_EQ(ExcelTrimmedMean(x, 0), 22);
  EXPECT_EQ(TrimmedMean(x, 0.5L), 3);  // the median
  EXPECT_EQ(ExcelTrimmedMean(x, 1.0L), 3);
  EXPECT_EQ(TrimmedMean(x, 0.1L), 22);       // Trunc(0.5) = 0 elements dropped
  EXPECT_EQ(ExcelTrimmedMean(x, 0.2L), 22);  // Trunc(1) div 2 = 0
  EXPECT_EQ(TrimmedMean(Make<V>({1, 2, 3, 4}), 0.49L), 2.5L);
  EXPECT_EQ(TrimmedMean(Make<V>({5}), 0.3L), 5);

  // The argument checks come before the emptiness check, and the two shortcut values before
  // the range check.
  const V empty;
  ExpectRaises(rsInvalidValue, [&] { TrimmedMean(empty, 0.7L); });
  ExpectRaises(rsInvalidValue, [&] { TrimmedMean(x, -0.1L); });
  ExpectRaises(rsInvalidValue, [&] { TrimmedMean(x, 0.51L); });
  ExpectRaises(rsInvalidValue, [&] { ExcelTrimmedMean(x, 1.01L); });
  ExpectRaises(rsInvalidValue, [&] { ExcelTrimmedMean(empty, -1.0L); });
  ExpectRaises(rsInvalidValue, [&] { TrimmedMean(x, std::numeric_limits<Extended>::quiet_NaN()); });
  ExpectRaises(rsVectorIsEmpty, [&] { TrimmedMean(empty, 0.2L); });
  ExpectRaises(rsVectorIsEmpty, [&] { TrimmedMean(empty, 0); });     // through QENMean
  ExpectRaises(rsVectorIsEmpty, [&] { TrimmedMean(empty, 0.5L); });  // through GetMedian
  ExpectRaises(rsVectorIsEmpty, [&] { ExcelTrimmedMean(empty, 0.3L); });
  EXPECT_EQ(x, before);
}

// ---------------------------------------------------------------------------------------------
// Accumulators and wrap-around that differ by element type.

TEST(SampleVarianceAndMean, FloatSamplesMatchTheEmulatedArithmeticBitForBit) {
  Extended variance = 0;
  Extended mean = 0;
  // The centred values are exact in Single as well, so all three float types agree.
  SampleVarianceAndMean(Make<TQENFloatVector>(kCentred), variance, mean);
  EXPECT_EQ(variance, kCentredOnePassSampleVariance);
  EXPECT_EQ(mean, kCentredOnePassSampleMean);
  SampleVarianceAndMean(Make<TQENDoubleVector>(kCentred), variance, mean);
  EXPECT_EQ(variance, kCentredOnePassSampleVariance);
  SampleVarianceAndMean(Make<TQENSingleVector>(kCentred), variance, mean);
  EXPECT_EQ(variance, kCentredOnePassSampleVariance);
  PopulationVarianceAndMean(Make<TQENFloatVector>(kCentred), variance, mean);
  EXPECT_EQ(variance, kCentredOnePassPopulationVariance);
  EXPECT_EQ(mean, kCentredOnePassPopulationMean);

  // Far from zero the one-pass formula loses digits that the two-pass one keeps.
  const TQENFloatVector offset = Make<TQENFloatVector>(kOffset);
  SampleVarianceAndMean(offset, variance, mean);
  EXPECT_EQ(variance, kOffsetOnePassSampleVariance);
  EXPECT_EQ(mean, kOffsetOnePassSampleMean);
  PopulationVarianceAndMean(offset, variance, mean);
  EXPECT_EQ(variance, kOffsetOnePassPopulationVariance);
  EXPECT_TRUE(RelNear(SampleVariance(offset), kOffsetSampleVar));
  EXPECT_TRUE(RelNear(PopulationVariance(offset), kOffsetPopulationVar));
  EXPECT_TRUE(RelNear(QENMean(offset), kOffsetMean));
}

TEST(SampleVarianceAndMean, Int64SumsWrapIncludingTheSquareOfTheSum) {
  const TQENInt64Vector x = {3037000500, 3037000500, 1, -7};
  Extended variance = 0;
  Extended mean = 0;
  SampleVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kWrap64OnePassSampleVariance);
  EXPECT_EQ(mean, kWrap64OnePassMean);
  PopulationVarianceAndMean(x, variance, mean);
  EXPECT_EQ(variance, kWrap64OnePassPopulationVariance);
}

TEST(SampleVarianceAndMean, LongWordSquaresKeepTheirLow32Bits) {
  // 65536^2 = 2^32 leaves 0: S1 = 131072, S2 = 0, variance = -131072^2 / 2 / 1.
  Extended variance = 0;
  Extended mean = 0;
  SampleVarianceAndMean(TQENLWordVector{65536, 65536}, variance, mean);
  EXPECT_EQ(variance, -8589934592.0L);
  EXPECT_EQ(mean, 65536);
  // 4294967295^2 mod 2^32 = 1; S1 in Extended = 4294967295.
  PopulationVarianceAndMean(TQENLWordVector{4294967295u}, variance, mean);
  EXPECT_EQ(variance, 1 - 4294967295.0L * 4294967295.0L);
  EXPECT_EQ(mean, 4294967295.0L);
}

TEST(SampleVarianceAndMean, LongIntSquaresKeepTheirLow32BitsSigned) {
  // 46341^2 = 2147488281 = 2^32 - 2147479015 as a LongInt: each square counts -2147479015.
  Extended variance = 0;
  Extended mean = 0;
  SampleVarianceAndMean(TQENLIntVector{46341, -46341}, variance, mean);
  EXPECT_EQ(variance, -4294958030.0L);
  EXPECT_EQ(mean, 0);
  // 46340^2 still fits.
  SampleVarianceAndMean(TQENLIntVector{46340, -46340}, variance, mean);
  EXPECT_EQ(variance, 2.0L * 46340 * 46340);
}

TEST(SampleMean, Int64SumWraps) {
  const TQENInt64Vector x = {std::numeric_limits<Int64>::max(), 1};
  EXPECT_EQ(QENMean(x), -4611686018427387904.0L);                                // -2^63 / 2
  EXPECT_EQ(QENMean(TQENLWordVector{4294967295u, 4294967295u}), 4294967295.0L);  // no wrap
}

TEST(SampleMedian, MiddlePairsAddInTheirOwnWidth) {
  const LongInt big = std::numeric_limits<LongInt>::max();
  EXPECT_EQ(GetMedian(TQENLIntVector{big, big}), -1);  // 2^32 - 2 wraps to -2
  EXPECT_EQ(GetMedian(TQENLWordVector{4294967295u, 4294967295u}), 2147483647);
  const Int64 big64 = std::numeric_limits<Int64>::max();
  EXPECT_EQ(GetMedian(TQENInt64Vector{big64, big64}), -1);
  EXPECT_EQ(GetMedian(TQENLIntVector{-3, 4}), 0.5L);
  // Floats add in Extended: no overflow for two large Double values.
  EXPECT_EQ(GetMedian(TQENDoubleVector{1e308, 1e308}), static_cast<long double>(1e308));
}

TEST(SampleVariance, TwoPassAgreesWithHighPrecision) {
  const TQENFloatVector x = Make<TQENFloatVector>(kCentred);
  EXPECT_TRUE(RelNear(QENMean(x), kCentredMean));
  EXPECT_TRUE(RelNear(SampleVariance(x), kCentredSampleVar));
  EXPECT_TRUE(RelNear(PopulationVariance(x), kCentredPopulationVar));
  EXPECT_TRUE(RelNear(SampleStdDev(x), std::sqrt(kCentredSampleVar)));
  EXPECT_TRUE(RelNear(SampleVariance(Make<TQENDoubleVector>(kCentred)), kCentredSampleVar));
}

TEST(SampleTrimmedMean, AgreesWithHighPrecision) {
  const TQENFloatVector x = Make<TQENFloatVector>(kCentredSorted);  // n = 37
  EXPECT_TRUE(RelNear(TrimmedMean(x, 0.1L), kCentredTrimmed1_10));
  EXPECT_TRUE(RelNear(TrimmedMean(x, 0.25L), kCentredTrimmed1_4));
  EXPECT_TRUE(RelNear(TrimmedMean(x, 0.3L), kCentredTrimmed3_10));
  EXPECT_TRUE(RelNear(ExcelTrimmedMean(x, 0.1L), kCentredExcelTrimmed1_10));
  EXPECT_TRUE(RelNear(ExcelTrimmedMean(x, 0.25L), kCentredExcelTrimmed1_4));
  EXPECT_TRUE(RelNear(ExcelTrimmedMean(x, 0.3L), kCentredExcelTrimmed3_10));
}

TEST(SampleTrimmedMean, IntegerElementsAddInExtendedWhileTheZeroShortcutWraps) {
  // Three times 2^62 is 2^63 + 2^62: exact in Extended, -2^62 as a wrapping Int64 sum.
  const Int64 quarter = Int64{1} << 62;
  const TQENInt64Vector x = {quarter, quarter, quarter};
  EXPECT_EQ(TrimmedMean(x, 0.1L), 0x1p62L);  // Trunc(0.3) = 0 dropped, summed in Extended
  EXPECT_EQ(ExcelTrimmedMean(x, 0.5L), 0x1p62L);
  EXPECT_EQ(TrimmedMean(x, 0), -0x1p62L / 3);  // QENMean, with its wrapping sum
}

// ---------------------------------------------------------------------------------------------
// Quartiles and deciles: the Hazen quantile with its position held in single precision.

TEST(SampleQuartiles, HandExamples) {
  Extended q1 = 0;
  Extended q3 = 0;
  GetQuartiles(Floats({1, 2, 3, 4}), q1, q3);
  EXPECT_EQ(q1, 1.5L);
  EXPECT_EQ(q3, 3.5L);
  GetQuartiles(Floats({1, 2, 3}), q1, q3);
  EXPECT_EQ(q1, 1.25L);
  EXPECT_EQ(q3, 2.75L);
  GetQuartiles(Floats({42}), q1, q3);
  EXPECT_EQ(q1, 42);
  EXPECT_EQ(q3, 42);
  // Two elements: Q1 at position 1.0, Q3 at 2.0 (the last element, nothing to interpolate).
  GetQuartiles(Floats({10, 20}), q1, q3);
  EXPECT_EQ(q1, 10);
  EXPECT_EQ(q3, 20);
}

TEST(SampleQuartiles, AgreeWithSinglePrecisionHazenPositions) {
  for (const QuantileRow& row : kQuantiles) {
    const std::vector<long double> part(kCentred.begin(), kCentred.begin() + row.n);
    TQENFloatVector x = Make<TQENFloatVector>(part);
    QSortVector(x, true);
    Extended q1 = 0;
    Extended q3 = 0;
    GetQuartiles(x, q1, q3);
    EXPECT_TRUE(RelNear(q1, row.q1)) << "n = " << row.n;
    EXPECT_TRUE(RelNear(q3, row.q3)) << "n = " << row.n;
    std::array<Extended, 9> deciles{};
    GetDeciles(x, deciles);
    for (int j = 0; j < 9; ++j) {
      EXPECT_TRUE(RelNear(deciles[static_cast<std::size_t>(j)], row.deciles[j]))
          << "n = " << row.n << ", decile " << j + 1;
    }
  }
}

TEST(SampleDeciles, SinglePrecisionPositionShowsInTheResult) {
  // n = 7, first decile: p = 1.2 held as the Single 1.20000004768..., so the result lies a
  // little above 10 + 0.2 * 10 = 12.
  std::array<Extended, 9> deciles{};
  GetDeciles(Floats({10, 20, 30, 40, 50, 60, 70}), deciles);
  const long double single_fraction = static_cast<long double>(1.2F) - 1;
  EXPECT_EQ(deciles[0], 10 + 10 * single_fraction);
  EXPECT_NE(deciles[0], 12.0L);
  EXPECT_EQ(deciles[4], 40);  // p = 4.0 exactly
}

TEST(SampleDeciles, PositionsBeforeTheFirstElementReadTheFirst) {
  // n = 2: p = 0.7 for the first decile (k = 0), 0.9 for the second.
  std::array<Extended, 9> deciles{};
  GetDeciles(Floats({10, 20}), deciles);
  EXPECT_EQ(deciles[0], 10);
  EXPECT_EQ(deciles[1], 10);
  EXPECT_EQ(deciles[2], 10 + 10 * (static_cast<long double>(1.1F) - 1));
  EXPECT_EQ(deciles[8], 20);  // p = 2.3, past the last element
  GetDeciles(Floats({5}), deciles);
  for (const Extended d : deciles) EXPECT_EQ(d, 5);
}

TEST(SampleQuantiles, EmptyVectorLeavesOutputs) {
  Extended q1 = 1;
  Extended q3 = 2;
  ExpectRaises(rsVectorIsEmpty, [&] { GetQuartiles(TQENFloatVector{}, q1, q3); });
  EXPECT_EQ(q1, 1);
  EXPECT_EQ(q3, 2);
  std::array<Extended, 9> deciles{};
  deciles.fill(-4);
  ExpectRaises(rsVectorIsEmpty, [&] { GetDeciles(TQENFloatVector{}, deciles); });
  for (const Extended d : deciles) EXPECT_EQ(d, -4);
}

// ---------------------------------------------------------------------------------------------
// Mode and most frequent values.

TEST(SampleMode, RunsTiesAndTheLastRun) {
  Extended mode = 0;
  EXPECT_FALSE(GetMode(Floats({1, 1, 2, 2}), mode));
  EXPECT_EQ(mode, 1);  // the first of the tied runs
  EXPECT_TRUE(GetMode(Floats({1, 1, 2, 2, 2}), mode));
  EXPECT_EQ(mode, 2);
  EXPECT_FALSE(GetMode(Floats({1, 2, 3}), mode));
  EXPECT_EQ(mode, -1.1e4932L);
  EXPECT_TRUE(GetMode(Floats({2, 2}), mode));
  EXPECT_EQ(mode, 2);
  EXPECT_TRUE(GetMode(Floats({1, 2, 2}), mode));
  EXPECT_EQ(mode, 2);
  EXPECT_TRUE(GetMode(Floats({1, 1, 2}), mode));
  EXPECT_EQ(mode, 1);
  EXPECT_TRUE(GetMode(Floats({1, 1, 1, 2, 2, 3, 3}), mode));
  EXPECT_EQ(mode, 1);
  EXPECT_FALSE(GetMode(Floats({1, 1, 2, 3, 3}), mode));
  EXPECT_TRUE(GetMode(Floats({1, 1, 2, 3, 3, 3}), mode));
  EXPECT_EQ(mode, 3);
  EXPECT_TRUE(GetMode(Floats({7}), mode));
  EXPECT_EQ(mode, 7);
  // Neighbours within tolerance form a run, reported by its last element.
  EXPECT_TRUE(GetMode(Floats({0.5L, 1, 1 + 1e-13L, 3}), mode));
  EXPECT_EQ(mode, 1 + 1e-13L);
}

TEST(SampleMode, EmptyVectorLeavesMode) {
  Extended mode = 9;
  ExpectRaises(rsVectorIsEmpty, [&] { GetMode(TQENFloatVector{}, mode); });
  EXPECT_EQ(mode, 9);
}

TEST(SampleMostFrequent, AllLongestRuns) {
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 2, 2})), Floats({1, 2})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 2, 2})), Floats({1})));  // by design
  EXPECT_TRUE(GetMostFrequent(Floats({1, 2, 3})).empty());
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({4})), Floats({4})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 2, 3, 3})), Floats({1, 3})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 2, 3, 3, 3})), Floats({3})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 1, 2, 2, 3})), Floats({1})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 2, 2, 3, 4, 4, 5})), Floats({1, 2, 4})));
  EXPECT_TRUE(SameElements(GetMostFrequent(Floats({1, 1, 2, 2, 2, 3, 3, 3})), Floats({2, 3})));
  ExpectRaises(rsVectorIsEmpty, [] { GetMostFrequent(TQENFloatVector{}); });
}

// ---------------------------------------------------------------------------------------------
// Skew and kurtosis: the sample forms are the bias-corrected G1 and G2, the population forms
// the moment ratios g1 and g2 - 3.

TEST(SampleShape, AgreesWithTheMomentStatistics) {
  const TQENFloatVector x = Make<TQENFloatVector>(kCentred);
  EXPECT_TRUE(RelNear(GetSampleSkew(x), kCentredSampleSkew));
  EXPECT_TRUE(RelNear(GetPopulationSkew(x), kCentredPopulationSkew));
  EXPECT_TRUE(RelNear(GetSampleKurtosis(x), kCentredSampleKurtosis));
  EXPECT_TRUE(RelNear(GetPopulationKurtosis(x), kCentredPopulationKurtosis));
  // The forms given the mean and standard deviation.
  const long double sample_sd = std::sqrt(kCentredSampleVar);
  const long double population_sd = std::sqrt(kCentredPopulationVar);
  EXPECT_TRUE(RelNear(GetSampleSkew(x, kCentredMean, sample_sd), kCentredSampleSkew));
  EXPECT_TRUE(RelNear(GetPopulationSkew(x, kCentredMean, population_sd), kCentredPopulationSkew));
  EXPECT_TRUE(RelNear(GetSampleKurtosis(x, kCentredMean, sample_sd), kCentredSampleKurtosis));
  EXPECT_TRUE(
      RelNear(GetPopulationKurtosis(x, kCentredMean, population_sd), kCentredPopulationKurtosis));
}

TEST(SampleShape, HandExamples) {
  // [1, 2, 3]: symmetric, skew 0.
  EXPECT_EQ(GetSampleSkew(Floats({1, 2, 3})), 0);
  EXPECT_EQ(GetPopulationSkew(Floats({1, 2, 3})), 0);
  // [0, 0, 0, 4] with m = 1, s = 2: S3 = 3 (-1) + 27 = 24, S4 = 3 + 81 = 84.
  const TQENFloatVector x = Floats({0, 0, 0, 4});
  EXPECT_EQ(GetSampleSkew(x, 1, 2), 4 * 24 / (3.0L * 2 * 8));
  EXPECT_EQ(GetPopulationSkew(x, 1, 2), 24 / (4.0L * 8));
  EXPECT_EQ(GetPopulationKurtosis(x, 1, 2), 84 / (4.0L * 16) - 3);
  // 4 * 5 * 84 / (3 * 2 * 1 * 16) - 3 * 9 / 2 = 17.5 - 13.5.
  EXPECT_EQ(GetSampleKurtosis(x, 1, 2), 4);
}

TEST(SampleShape, CheckOrder) {
  const TQENFloatVector empty;
  const TQENFloatVector two = Floats({1, 2});
  const TQENFloatVector three = Floats({1, 2, 3});
  const TQENFloatVector flat = Floats({5, 5, 5, 5});
  for (auto* skew : {static_cast<Extended (*)(const TQENFloatVector&)>(&GetSampleSkew),
                     static_cast<Extended (*)(const TQENFloatVector&)>(&GetPopulationSkew)}) {
    ExpectRaises(rsVectorIsEmpty, [&] { skew(empty); });
    ExpectRaises(rsVectorG2, [&] { skew(two); });
    ExpectRaises(rsVectorG2, [&] { skew(Floats({1})); });  // the size error, not rsVectorG1
    ExpectRaises(rsStdDev, [&] { skew(flat); });
  }
  for (auto* kurtosis :
       {static_cast<Extended (*)(const TQENFloatVector&)>(&GetSampleKurtosis),
        static_cast<Extended (*)(const TQENFloatVector&)>(&GetPopulationKurtosis)}) {
    ExpectRaises(rsVectorIsEmpty, [&] { kurtosis(empty); });
    ExpectRaises(rsVectorG3, [&] { kurtosis(three); });
    ExpectRaises(rsStdDev, [&] { kurtosis(flat); });
  }
  using Given = Extended (*)(const TQENFloatVector&, Extended, Extended);
  for (Given skew : {static_cast<Given>(&GetSampleSkew), static_cast<Given>(&GetPopulationSkew)}) {
    ExpectRaises(rsVectorIsEmpty, [&] { skew(empty, 0, 0); });
    ExpectRaises(rsVectorG2, [&] { skew(two, 0, 0); });
    ExpectRaises(rsStdDev, [&] { skew(three, 2, 1e-13L); });  // zero within tolerance
    EXPECT_NO_THROW(skew(three, 2, 1e-11L));
  }
  for (Given kurtosis :
       {static_cast<Given>(&GetSampleKurtosis), static_cast<Given>(&GetPopulationKurtosis)}) {
    ExpectRaises(rsVectorIsEmpty, [&] { kurtosis(empty, 0, 0); });
    ExpectRaises(rsVectorG3, [&] { kurtosis(three, 0, 0); });
    ExpectRaises(rsStdDev, [&] { kurtosis(flat, 5, 0); });
  }
}

// ---------------------------------------------------------------------------------------------
// Standardise.

TEST(SampleStandardise, FourValueFormIsExactOnDyadicData) {
  TQENFloatVector x = Floats({1, 2, 3, 4});
  Standardise(x, 2.5L, 0.5L, 10, 2);
  EXPECT_TRUE(SameElements(x, Floats({4, 8, 12, 16})));
  // A tiny but non-zero StdDev is accepted: the test is exact.
  TQENFloatVector y = Floats({1});
  Standardise(y, 1, 1e-13L, 0, 1);
  EXPECT_EQ(Extended(y[0]), 0);
}

TEST(SampleStandardise, TwoValueFormGivesTheRequestedMoments) {
  TQENFloatVector x = Make<TQENFloatVector>(kCentred);
  Standardise(x, 0, 1, false);
  EXPECT_NEAR(static_cast<double>(QENMean(x)), 0, 1e-17);
  EXPECT_TRUE(RelNear(SampleVariance(x), 1, 1e-17L));
  TQENFloatVector y = Make<TQENFloatVector>(kCentred);
  Standardise(y, 5, 3, true);
  EXPECT_TRUE(RelNear(QENMean(y), 5, 1e-17L));
  EXPECT_TRUE(RelNear(PopulationVariance(y), 9, 1e-17L));
}

TEST(SampleStandardise, ErrorsLeaveTheVector) {
  TQENFloatVector empty;
  ExpectRaises(rsVectorIsEmpty, [&] { Standardise(empty, 0, 0, 0, 1); });  // before rsStdDev
  ExpectRaises(rsVectorIsEmpty, [&] { Standardise(empty, 0, 1, true); });
  EXPECT_TRUE(empty.empty());
  TQENFloatVector x = Floats({1, 2, 3});
  const TQENFloatVector before = x;
  ExpectRaises(rsStdDev, [&] { Standardise(x, 2, 0, 0, 1); });
  EXPECT_TRUE(SameElements(x, before));
  TQENFloatVector one = Floats({3});
  ExpectRaises(rsVectorG1, [&] { Standardise(one, 0, 1, false); });
  ExpectRaises(rsStdDev, [&] { Standardise(one, 0, 1, true); });  // population s of 1 value = 0
  EXPECT_EQ(Extended(one[0]), 3);
}

// ---------------------------------------------------------------------------------------------
// Geometric and other means.

TEST(SampleGeometric, AgreesWithHighPrecision) {
  const TQENFloatVector x = Make<TQENFloatVector>(kPositive);
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
  // Exact cases: [2, 8] has geometric mean 4; [4, 4] spread exp(0) = 1.
  EXPECT_EQ(GeometricMean(Floats({2, 8})), 4);
  EXPECT_EQ(GeometricStdDev(Floats({4, 4}), 4, true), 1);
  EXPECT_EQ(GeometricStdDev(Floats({5}), false), 1);
}

TEST(SampleGeometric, ErrorsInOrder) {
  const TQENFloatVector empty;
  const TQENFloatVector not_positive = Floats({1, 0, 2});
  const TQENFloatVector tiny = Floats({1, 1e-13L});  // not positive beyond tolerance
  const TQENFloatVector negative_one = Floats({-1});
  const TQENFloatVector before = not_positive;
  ExpectRaises(rsVectorIsEmpty, [&] { GeometricMean(empty); });
  ExpectRaises(rsVectorNotPos, [&] { GeometricMean(not_positive); });
  ExpectRaises(rsVectorNotPos, [&] { GeometricMean(tiny); });
  for (const bool sample : {true, false}) {
    ExpectRaises(rsVectorIsEmpty, [&] { GeometricStdDev(empty, sample); });
    ExpectRaises(rsVectorIsEmpty, [&] { GeometricStdDev(empty, 2, sample); });
    ExpectRaises(rsVectorIsEmpty, [&] { GeometricVariance(empty, sample); });
    ExpectRaises(rsVectorIsEmpty, [&] { GeometricVariance(empty, 2, sample); });
    ExpectRaises(rsVectorNotPos, [&] { GeometricStdDev(not_positive, 2, sample); });
    ExpectRaises(rsVectorNotPos, [&] { GeometricVariance(not_positive, sample); });
    // Without a centre, GeometricMean runs first and raises its own error.
    ExpectRaises(rsVectorNotPos, [&] { GeometricStdDev(negative_one, sample); });
  }
  ExpectRaises(rsVectorG1, [&] { GeometricStdDev(negative_one, 2, true); });  // size first
  ExpectRaises(rsVectorNotPos, [&] { GeometricStdDev(negative_one, 2, false); });
  ExpectRaises(rsVectorG1, [&] { GeometricStdDev(Floats({3}), true); });
  ExpectRaises(rsVectorG1, [&] { GeometricVariance(Floats({3}), 3, true); });
  EXPECT_TRUE(SameElements(not_positive, before));
}

TEST(SampleOtherMeans, AgreeWithHighPrecision) {
  const TQENFloatVector x = Make<TQENFloatVector>(kPositive);
  EXPECT_TRUE(RelNear(HarmonicMean(x), kPositiveHarmonicMean));
  EXPECT_TRUE(RelNear(RootMeanSquare(x), kPositiveRootMeanSquare));
  EXPECT_TRUE(RelNear(MeanDeviation(x, 40), kPositiveMeanDeviationAbout40));
  EXPECT_EQ(HarmonicMean(Floats({1, 2, 4})), 3 / 1.75L);
  EXPECT_EQ(RootMeanSquare(Floats({3, -4})), std::sqrt(12.5L));
  EXPECT_EQ(MeanDeviation(Floats({1, 5}), 2), 2);
  EXPECT_EQ(MeanDeviation(TQENFloatVector{}, 2), 0);
  EXPECT_EQ(HeronianMean(4, 9), (4 + 6 + 9) / 3.0L);
  EXPECT_EQ(HeronianMean(0, 3), 1);
}

TEST(SampleOtherMeans, Errors) {
  ExpectRaises(rsVectorIsEmpty, [] { HarmonicMean(TQENFloatVector{}); });
  ExpectRaises(rsVectorNotPos, [] { HarmonicMean(Floats({1, -2})); });
  ExpectRaises(rsVectorIsEmpty, [] { RootMeanSquare(TQENFloatVector{}); });
  ExpectRaises(rsValueGEZero, [] { HeronianMean(-1, 4); });
  ExpectRaises(rsValueGEZero, [] { HeronianMean(4, -1e-11L); });
  EXPECT_NO_THROW(HeronianMean(4, -1e-13L));  // negative only beyond tolerance
}

}  // namespace
}  // namespace tovrin
