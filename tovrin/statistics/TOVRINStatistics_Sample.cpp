// Descriptive statistics of a sample: one template per algorithm, the listed overloads forward.
#include "tovrin/statistics/TOVRINStatistics_Sample.h"

#include <cmath>
#include <cstddef>
#include <type_traits>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using detail::RaiseMathError;
using detail::ValueOf;

template <typename T>
Extended Count(const std::vector<T>& X) {
  return static_cast<Extended>(X.size());
}

template <typename T>
void CheckNotEmpty(const std::vector<T>& X) {
  if (X.empty()) RaiseMathError(rsVectorIsEmpty);
}

// --- Mean and the two-pass variances ------------------------------------------------------

template <typename T>
Extended MeanOf(const std::vector<T>& X) {
  CheckNotEmpty(X);
  // SumVector is Extended for the float types and a wrapping Int64 for the integer types.
  return static_cast<Extended>(SumVector(X)) / Count(X);
}

// The centre handed to SumSqDiffVector: Double and Single samples get the mean rounded to
// their own type, the others the Extended mean.
template <typename T>
auto CentreFor(Extended Mean) {
  if constexpr (std::is_same_v<T, Double> || std::is_same_v<T, Single>) {
    return static_cast<T>(Mean);
  } else {
    return Mean;
  }
}

template <typename T>
Extended TwoPassVariance(const std::vector<T>& X, bool Sample) {
  CheckNotEmpty(X);
  if (Sample && X.size() == 1) RaiseMathError(rsVectorG1);
  const Extended sum_sq = static_cast<Extended>(SumSqDiffVector(X, CentreFor<T>(MeanOf(X))));
  return sum_sq / (Sample ? Count(X) - 1 : Count(X));
}

// --- One-pass variance with its per-type accumulators ---------------------------------------

struct VarianceAndMean {
  Extended Variance;
  Extended Mean;
};

template <typename T>
VarianceAndMean OnePassVariance(const std::vector<T>& X, bool Sample) {
  CheckNotEmpty(X);
  if (Sample && X.size() == 1) RaiseMathError(rsVectorG1);
  const Extended n = Count(X);
  const Extended d = Sample ? n - 1 : n;
  if constexpr (std::is_same_v<T, Int64>) {
    // Integer running sums that wrap, and S1^2 wrapping too before it meets Extended.
    Int64 s1 = 0;
    Int64 s2 = 0;
    for (const Int64 x : X) {
      s1 = detail::WrappingAdd64(s1, x);
      s2 = detail::WrappingAdd64(s2, detail::WrappingMul64(x, x));
    }
    const Extended s1_sq = static_cast<Extended>(detail::WrappingMul64(s1, s1));
    return {(static_cast<Extended>(s2) - s1_sq / n) / d, static_cast<Extended>(s1) / n};
  } else {
    Extended s1 = 0;
    Extended s2 = 0;
    for (const T& element : X) {
      if constexpr (std::is_same_v<T, LongWord>) {
        s1 += static_cast<Extended>(element);
        s2 += static_cast<Extended>(static_cast<LongWord>(element * element));  // low 32 bits
      } else if constexpr (std::is_same_v<T, LongInt>) {
        s1 += static_cast<Extended>(element);
        s2 += static_cast<Extended>(detail::WrappingSquare32(element));  // low 32 bits, signed
      } else {
        const Extended x = static_cast<ValueOf<T>>(element);
        s1 += x;
        s2 += x * x;
      }
    }
    return {(s2 - s1 * s1 / n) / d, s1 / n};
  }
}

template <typename T>
void VarianceAndMeanInto(const std::vector<T>& X, bool Sample, Extended& Variance, Extended& Mean) {
  const VarianceAndMean r = OnePassVariance(X, Sample);
  Variance = r.Variance;
  Mean = r.Mean;
}

template <typename T>
void StdDevAndMeanInto(const std::vector<T>& X, bool Sample, Extended& StdDev, Extended& Mean) {
  const VarianceAndMean r = OnePassVariance(X, Sample);
  StdDev = std::sqrt(r.Variance);
  Mean = r.Mean;
}

// --- Order statistics -----------------------------------------------------------------------

template <typename T>
Extended MedianOf(const std::vector<T>& X) {
  CheckNotEmpty(X);
  const std::size_t n = X.size();
  if (n % 2 == 1) return static_cast<ValueOf<T>>(X[n / 2]);
  const T a = X[n / 2 - 1];
  const T b = X[n / 2];
  if constexpr (std::is_same_v<T, LongInt>) {
    const auto sum = static_cast<LongInt>(static_cast<LongWord>(a) + static_cast<LongWord>(b));
    return static_cast<Extended>(sum) / 2;
  } else if constexpr (std::is_same_v<T, LongWord>) {
    return static_cast<Extended>(static_cast<LongWord>(a + b)) / 2;
  } else if constexpr (std::is_same_v<T, Int64>) {
    return static_cast<Extended>(detail::WrappingAdd64(a, b)) / 2;
  } else {
    return (static_cast<Extended>(static_cast<ValueOf<T>>(a)) +
            static_cast<Extended>(static_cast<ValueOf<T>>(b))) /
           2;
  }
}

// The value at one-based position P of the ascending X (n >= 1), P already rounded to single
// precision: linear interpolation between the Trunc(P)-th and the next order statistic. Past
// the end the last element is taken; a position before the first element reads the first.
Extended ValueAtPosition(const TQENFloatVector& X, Single P) {
  const auto n = static_cast<Int64>(X.size());
  const auto k = static_cast<Int64>(P);
  const Single f = P - std::trunc(P);
  if (k < 1) return X[0];
  if (k <= n - 1) {
    const Extended lower = X[static_cast<std::size_t>(k - 1)];
    const Extended upper = X[static_cast<std::size_t>(k)];
    return lower + (upper - lower) * static_cast<Extended>(f);
  }
  return X[static_cast<std::size_t>((k < n ? k : n) - 1)];
}

// Walks the runs of SameFloat neighbours of X (two elements at least): Closed(length, last
// index) is called for every run of two or more that ends before the last element, in order;
// the length of the final run, which the mode rules weigh on their own, is returned.
template <typename OnRun>
Int64 ForEachRepeatedRun(const TQENFloatVector& X, OnRun&& Closed) {
  Int64 count = 1;
  for (std::size_t i = 1; i < X.size(); ++i) {
    if (SameFloat(Extended(X[i]), Extended(X[i - 1]))) {
      ++count;
    } else {
      if (count != 1) Closed(count, i - 1);
      count = 1;
    }
  }
  return count;
}

template <typename T>
Extended TrimmedMeanOf(const std::vector<T>& X, Extended Alpha, bool Excel) {
  if (FloatIsZero(Alpha)) return MeanOf(X);
  const Extended upper_bound = Excel ? 1.0L : 0.5L;
  if (SameFloat(Alpha, upper_bound)) return MedianOf(X);
  // Written so that a NaN Alpha fails too: it could not be truncated to a count.
  if (!(Alpha >= 0 && Alpha <= upper_bound)) RaiseMathError(rsInvalidValue);
  CheckNotEmpty(X);
  const auto n = static_cast<Int64>(X.size());
  if (n == 1) return static_cast<ValueOf<T>>(X[0]);
  Int64 k = static_cast<Int64>(std::trunc(static_cast<Extended>(n) * Alpha));
  if (Excel) k /= 2;
  Extended sum = 0;
  for (Int64 i = k; i <= n - 1 - k; ++i) {
    sum += static_cast<Extended>(static_cast<ValueOf<T>>(X[static_cast<std::size_t>(i)]));
  }
  if (n > 2 * k) return sum / static_cast<Extended>(n - 2 * k);
  return 0;
}

// --- Shape ---------------------------------------------------------------------------------

struct CentralSums {
  Extended S3;
  Extended S4;
};

CentralSums CentralSumsAbout(const TQENFloatVector& X, Extended Mean) {
  CentralSums sums{0, 0};
  for (const Extended x : X) {
    const Extended d = x - Mean;
    const Extended d2 = d * d;
    sums.S3 += d2 * d;
    sums.S4 += d2 * d2;
  }
  return sums;
}

enum class Shape { kSampleSkew, kPopulationSkew, kSampleKurtosis, kPopulationKurtosis };

constexpr bool IsSkew(Shape shape) {
  return shape == Shape::kSampleSkew || shape == Shape::kPopulationSkew;
}
constexpr bool IsSample(Shape shape) {
  return shape == Shape::kSampleSkew || shape == Shape::kSampleKurtosis;
}

void CheckShapeSize(const TQENFloatVector& X, Shape shape) {
  CheckNotEmpty(X);
  if (IsSkew(shape)) {
    if (X.size() < 3) RaiseMathError(rsVectorG2);
  } else {
    if (X.size() < 4) RaiseMathError(rsVectorG3);
  }
}

Extended ShapeOf(const TQENFloatVector& X, Extended Mean, Extended StdDev, Shape shape) {
  CheckShapeSize(X, shape);
  if (FloatIsZero(StdDev)) RaiseMathError(rsStdDev);
  const Extended n = Count(X);
  const CentralSums sums = CentralSumsAbout(X, Mean);
  const Extended s2 = StdDev * StdDev;
  switch (shape) {
    case Shape::kSampleSkew:
      return n * sums.S3 / ((n - 1) * (n - 2) * (s2 * StdDev));
    case Shape::kPopulationSkew:
      return sums.S3 / (n * (s2 * StdDev));
    case Shape::kSampleKurtosis:
      return n * (n + 1) * sums.S4 / ((n - 1) * (n - 2) * (n - 3) * (s2 * s2)) -
             3 * (n - 1) * (n - 1) / ((n - 2) * (n - 3));
    case Shape::kPopulationKurtosis:
      break;
  }
  return sums.S4 / (n * (s2 * s2)) - 3;
}

Extended ShapeOf(const TQENFloatVector& X, Shape shape) {
  CheckShapeSize(X, shape);
  const VarianceAndMean r = OnePassVariance(X, IsSample(shape));
  return ShapeOf(X, r.Mean, std::sqrt(r.Variance), shape);
}

// --- Geometric measures ---------------------------------------------------------------------

void CheckPositive(const TQENFloatVector& X) {
  CheckNotEmpty(X);
  if (!VectorPositive(X)) RaiseMathError(rsVectorNotPos);
}

Extended GeometricStdDevOf(const TQENFloatVector& X, Extended GeoMean, bool Sample) {
  CheckNotEmpty(X);
  if (Sample && X.size() == 1) RaiseMathError(rsVectorG1);
  if (!VectorPositive(X)) RaiseMathError(rsVectorNotPos);
  const Extended log_centre = std::log(GeoMean);
  Extended sum = 0;
  for (const Extended x : X) {
    const Extended d = std::log(x) - log_centre;
    sum += d * d;
  }
  const Extended divisor = Sample ? Count(X) - 1 : Count(X);
  return std::exp(std::sqrt(sum / divisor));
}

}  // namespace

// --- Public overloads ---------------------------------------------------------------------

Extended QENMean(const TQENFloatVector& X) { return MeanOf(X); }
Extended QENMean(const TQENDoubleVector& X) { return MeanOf(X); }
Extended QENMean(const TQENSingleVector& X) { return MeanOf(X); }
Extended QENMean(const TQENInt64Vector& X) { return MeanOf(X); }
Extended QENMean(const TQENLWordVector& X) { return MeanOf(X); }
Extended QENMean(const TQENLIntVector& X) { return MeanOf(X); }

Extended SampleVariance(const TQENFloatVector& X) { return TwoPassVariance(X, true); }
Extended SampleVariance(const TQENDoubleVector& X) { return TwoPassVariance(X, true); }
Extended SampleVariance(const TQENSingleVector& X) { return TwoPassVariance(X, true); }
Extended SampleVariance(const TQENInt64Vector& X) { return TwoPassVariance(X, true); }
Extended SampleVariance(const TQENLWordVector& X) { return TwoPassVariance(X, true); }
Extended SampleVariance(const TQENLIntVector& X) { return TwoPassVariance(X, true); }

Extended PopulationVariance(const TQENFloatVector& X) { return TwoPassVariance(X, false); }
Extended PopulationVariance(const TQENDoubleVector& X) { return TwoPassVariance(X, false); }
Extended PopulationVariance(const TQENSingleVector& X) { return TwoPassVariance(X, false); }
Extended PopulationVariance(const TQENInt64Vector& X) { return TwoPassVariance(X, false); }
Extended PopulationVariance(const TQENLWordVector& X) { return TwoPassVariance(X, false); }
Extended PopulationVariance(const TQENLIntVector& X) { return TwoPassVariance(X, false); }

Extended SampleStdDev(const TQENFloatVector& X) { return std::sqrt(SampleVariance(X)); }
Extended SampleStdDev(const TQENDoubleVector& X) { return std::sqrt(SampleVariance(X)); }
Extended SampleStdDev(const TQENSingleVector& X) { return std::sqrt(SampleVariance(X)); }
Extended SampleStdDev(const TQENInt64Vector& X) { return std::sqrt(SampleVariance(X)); }
Extended SampleStdDev(const TQENLWordVector& X) { return std::sqrt(SampleVariance(X)); }
Extended SampleStdDev(const TQENLIntVector& X) { return std::sqrt(SampleVariance(X)); }

Extended PopulationStdDev(const TQENFloatVector& X) { return std::sqrt(PopulationVariance(X)); }
Extended PopulationStdDev(const TQENDoubleVector& X) { return std::sqrt(PopulationVariance(X)); }
Extended PopulationStdDev(const TQENSingleVector& X) { return std::sqrt(PopulationVariance(X)); }
Extended PopulationStdDev(const TQENInt64Vector& X) { return std::sqrt(PopulationVariance(X)); }
Extended PopulationStdDev(const TQENLWordVector& X) { return std::sqrt(PopulationVariance(X)); }
Extended PopulationStdDev(const TQENLIntVector& X) { return std::sqrt(PopulationVariance(X)); }

void SampleVarianceAndMean(const TQENFloatVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}
void SampleVarianceAndMean(const TQENDoubleVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}
void SampleVarianceAndMean(const TQENSingleVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}
void SampleVarianceAndMean(const TQENInt64Vector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}
void SampleVarianceAndMean(const TQENLWordVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}
void SampleVarianceAndMean(const TQENLIntVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}

void PopulationVarianceAndMean(const TQENFloatVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}
void PopulationVarianceAndMean(const TQENDoubleVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}
void PopulationVarianceAndMean(const TQENSingleVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}
void PopulationVarianceAndMean(const TQENInt64Vector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}
void PopulationVarianceAndMean(const TQENLWordVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}
void PopulationVarianceAndMean(const TQENLIntVector& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}

void SampleStdDevAndMean(const TQENFloatVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}
void SampleStdDevAndMean(const TQENDoubleVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}
void SampleStdDevAndMean(const TQENSingleVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}
void SampleStdDevAndMean(const TQENInt64Vector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}
void SampleStdDevAndMean(const TQENLWordVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}
void SampleStdDevAndMean(const TQENLIntVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}

void PopulationStdDevAndMean(const TQENFloatVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}
void PopulationStdDevAndMean(const TQENDoubleVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}
void PopulationStdDevAndMean(const TQENSingleVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}
void PopulationStdDevAndMean(const TQENInt64Vector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}
void PopulationStdDevAndMean(const TQENLWordVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}
void PopulationStdDevAndMean(const TQENLIntVector& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}

Extended GetMedian(const TQENFloatVector& X) { return MedianOf(X); }
Extended GetMedian(const TQENDoubleVector& X) { return MedianOf(X); }
Extended GetMedian(const TQENSingleVector& X) { return MedianOf(X); }
Extended GetMedian(const TQENInt64Vector& X) { return MedianOf(X); }
Extended GetMedian(const TQENLWordVector& X) { return MedianOf(X); }
Extended GetMedian(const TQENLIntVector& X) { return MedianOf(X); }

Extended TrimmedMean(const TQENFloatVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}
Extended TrimmedMean(const TQENDoubleVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}
Extended TrimmedMean(const TQENSingleVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}
Extended TrimmedMean(const TQENInt64Vector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}
Extended TrimmedMean(const TQENLWordVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}
Extended TrimmedMean(const TQENLIntVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}

Extended ExcelTrimmedMean(const TQENFloatVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}
Extended ExcelTrimmedMean(const TQENDoubleVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}
Extended ExcelTrimmedMean(const TQENSingleVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}
Extended ExcelTrimmedMean(const TQENInt64Vector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}
Extended ExcelTrimmedMean(const TQENLWordVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}
Extended ExcelTrimmedMean(const TQENLIntVector& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, true);
}

bool GetMode(const TQENFloatVector& X, Extended& Mode) {
  CheckNotEmpty(X);
  const std::size_t n = X.size();
  if (n == 1) {
    Mode = X[0];
    return true;
  }
  // The runtime's negated largest-Extended constant: what Mode holds when no value repeats.
  Extended mode = -1.1e4932L;
  Int64 max_count = 0;
  bool tie = false;
  const Int64 count = ForEachRepeatedRun(X, [&](Int64 run, std::size_t last) {
    if (run == max_count) {
      tie = true;
    } else if (run > max_count) {
      mode = X[last];
      max_count = run;
      tie = false;
    }
  });
  // The last run, weighed once.
  if (max_count <= 0 && count > 1) {
    mode = X[n - 1];
    max_count = count;
  } else if (max_count > 0 && count == max_count) {
    tie = true;
  } else if (max_count > 0 && count > max_count) {
    mode = X[n - 1];
    tie = false;
  }
  Mode = mode;
  return max_count > 0 && !tie;
}

TQENFloatVector GetMostFrequent(const TQENFloatVector& X) {
  TQENFloatVector result;
  CheckNotEmpty(X);
  const std::size_t n = X.size();
  if (n == 1) {
    result.push_back(X[0]);
    return result;
  }
  Int64 max_count = 0;
  const Int64 count = ForEachRepeatedRun(X, [&](Int64 run, std::size_t last) {
    if (run == max_count) {
      result.push_back(X[last]);
    } else if (run > max_count) {
      result.assign(1, X[last]);
      max_count = run;
    }
  });
  // When only the last run repeats, the first element of X is what is reported (by design).
  if (max_count < 1 && count > 1) {
    result.assign(1, X[0]);
  } else if (max_count >= 1 && count == max_count) {
    result.push_back(X[n - 1]);
  } else if (max_count >= 1 && count > max_count) {
    result.assign(1, X[n - 1]);
  }
  return result;
}

void GetQuartiles(const TQENFloatVector& X, Extended& Q1, Extended& Q3) {
  CheckNotEmpty(X);
  const std::size_t n = X.size();
  if (n == 1) {
    Q1 = X[0];
    Q3 = X[0];
    return;
  }
  // Positions held in single precision, so the quartiles of large samples shift slightly.
  const Extended size = static_cast<Extended>(n);
  const auto p1 = static_cast<Single>(size / 4 + 0.5L);
  const auto p3 = static_cast<Single>(static_cast<Extended>(3 * static_cast<Int64>(n)) / 4 + 0.5L);
  const Extended q1 = ValueAtPosition(X, p1);
  const Extended q3 = ValueAtPosition(X, p3);
  Q1 = q1;
  Q3 = q3;
}

void GetDeciles(const TQENFloatVector& X, std::array<Extended, 9>& Deciles) {
  CheckNotEmpty(X);
  const std::size_t n = X.size();
  std::array<Extended, 9> deciles{};
  if (n == 1) {
    deciles.fill(X[0]);
  } else {
    for (Int64 j = 1; j <= 9; ++j) {
      const auto scaled = static_cast<Extended>(static_cast<Int64>(n) * j);
      const auto p = static_cast<Single>(scaled / 10 + 0.5L);
      deciles[static_cast<std::size_t>(j - 1)] = ValueAtPosition(X, p);
    }
  }
  Deciles = deciles;
}

Extended GetSampleSkew(const TQENFloatVector& X) { return ShapeOf(X, Shape::kSampleSkew); }
Extended GetSampleSkew(const TQENFloatVector& X, Extended Mean, Extended StdDev) {
  return ShapeOf(X, Mean, StdDev, Shape::kSampleSkew);
}
Extended GetPopulationSkew(const TQENFloatVector& X) { return ShapeOf(X, Shape::kPopulationSkew); }
Extended GetPopulationSkew(const TQENFloatVector& X, Extended Mean, Extended StdDev) {
  return ShapeOf(X, Mean, StdDev, Shape::kPopulationSkew);
}
Extended GetSampleKurtosis(const TQENFloatVector& X) { return ShapeOf(X, Shape::kSampleKurtosis); }
Extended GetSampleKurtosis(const TQENFloatVector& X, Extended Mean, Extended StdDev) {
  return ShapeOf(X, Mean, StdDev, Shape::kSampleKurtosis);
}
Extended GetPopulationKurtosis(const TQENFloatVector& X) {
  return ShapeOf(X, Shape::kPopulationKurtosis);
}
Extended GetPopulationKurtosis(const TQENFloatVector& X, Extended Mean, Extended StdDev) {
  return ShapeOf(X, Mean, StdDev, Shape::kPopulationKurtosis);
}

void Standardise(TQENFloatVector& X, Extended Mean, Extended StdDev, Extended NewMean,
                 Extended NewStdDev) {
  CheckNotEmpty(X);
  if (StdDev == 0) RaiseMathError(rsStdDev);  // exact, unlike the shape measures
  for (PackedExtended& element : X) {
    element = (Extended(element) - Mean) / StdDev;
    element = Extended(element) * NewStdDev + NewMean;
  }
}

void Standardise(TQENFloatVector& X, Extended NewMean, Extended NewStdDev, bool Population) {
  CheckNotEmpty(X);
  Extended std_dev = 0;
  Extended mean = 0;
  StdDevAndMeanInto(X, !Population, std_dev, mean);
  Standardise(X, mean, std_dev, NewMean, NewStdDev);
}

Extended GeometricMean(const TQENFloatVector& X) {
  CheckPositive(X);
  Extended sum = 0;
  for (const Extended x : X) sum += std::log(x);
  return std::exp(sum / Count(X));
}

Extended GeometricStdDev(const TQENFloatVector& X, bool Sample) {
  const Extended geo_mean = GeometricMean(X);
  return GeometricStdDevOf(X, geo_mean, Sample);
}
Extended GeometricStdDev(const TQENFloatVector& X, Extended GeoMean, bool Sample) {
  return GeometricStdDevOf(X, GeoMean, Sample);
}
Extended GeometricVariance(const TQENFloatVector& X, bool Sample) {
  const Extended s = GeometricStdDev(X, Sample);
  return s * s;
}
Extended GeometricVariance(const TQENFloatVector& X, Extended GeoMean, bool Sample) {
  const Extended s = GeometricStdDevOf(X, GeoMean, Sample);
  return s * s;
}

Extended HarmonicMean(const TQENFloatVector& X) {
  CheckPositive(X);
  Extended sum = 0;
  for (const Extended x : X) sum += 1 / x;
  return Count(X) / sum;
}

Extended RootMeanSquare(const TQENFloatVector& X) {
  CheckNotEmpty(X);
  return std::sqrt(SumSqVector(X) / Count(X));
}

Extended MeanDeviation(const TQENFloatVector& X, Extended Mean) {
  if (X.empty()) return 0;
  Extended sum = 0;
  for (const Extended x : X) sum += std::fabs(x - Mean);
  return sum / Count(X);
}

Extended HeronianMean(Extended A, Extended B) {
  if (FloatIsNegative(A) || FloatIsNegative(B)) RaiseMathError(rsValueGEZero);
  return (A + std::sqrt(A * B) + B) / 3;
}

}  // namespace tovrin
