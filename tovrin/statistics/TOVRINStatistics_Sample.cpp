// Descriptive statistics of a sample: one template per algorithm, the listed overloads forward.
#include "tovrin/statistics/TOVRINStatistics_Sample.h"

#include <cmath>
#include <cstddef>
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

template <typename T>
Extended TwoPassVariance(const std::vector<T>& X, bool Sample) {
  CheckNotEmpty(X);
  if (Sample && X.size() == 1) RaiseMathError(rsVectorG1);
  const Extended sum_sq =
      static_cast<Extended>(SumSqDiffVector(X, detail::ElementRules<T>::MeanCentre(MeanOf(X))));
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
  using Rules = detail::ElementRules<T>;
  if constexpr (Rules::kWrappingMoments) {
    // Integer running sums that wrap, and S1^2 wrapping too before it meets Extended.
    Int64 s1 = 0;
    Int64 s2 = 0;
    for (const T x : X) {
      s1 = Rules::SumAdd(s1, x);
      s2 = Rules::SumAdd(s2, Rules::SquareTerm(x));
    }
    const Extended s1_sq = static_cast<Extended>(Rules::SquareTerm(s1));
    return {(static_cast<Extended>(s2) - s1_sq / n) / d, static_cast<Extended>(s1) / n};
  } else {
    // Each square formed by the element's rule (the low 32 bits for LongWord and LongInt).
    Extended s1 = 0;
    Extended s2 = 0;
    for (const T& element : X) {
      const ValueOf<T> x = element;
      s1 += static_cast<Extended>(x);
      s2 += static_cast<Extended>(Rules::SquareTerm(x));
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
  // Integer neighbours are summed in their own width, wrapping, before they are halved.
  return detail::ElementRules<T>::PairSum(static_cast<ValueOf<T>>(a), static_cast<ValueOf<T>>(b)) /
         2;
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

template <detail::BuildableElement T>
Extended QENMean(const std::vector<T>& X) {
  return MeanOf(X);
}

template <detail::BuildableElement T>
Extended SampleVariance(const std::vector<T>& X) {
  return TwoPassVariance(X, true);
}

template <detail::BuildableElement T>
Extended PopulationVariance(const std::vector<T>& X) {
  return TwoPassVariance(X, false);
}

template <detail::BuildableElement T>
Extended SampleStdDev(const std::vector<T>& X) {
  return std::sqrt(SampleVariance(X));
}

template <detail::BuildableElement T>
Extended PopulationStdDev(const std::vector<T>& X) {
  return std::sqrt(PopulationVariance(X));
}

template <detail::BuildableElement T>
void SampleVarianceAndMean(const std::vector<T>& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, true, Variance, Mean);
}

template <detail::BuildableElement T>
void PopulationVarianceAndMean(const std::vector<T>& X, Extended& Variance, Extended& Mean) {
  VarianceAndMeanInto(X, false, Variance, Mean);
}

template <detail::BuildableElement T>
void SampleStdDevAndMean(const std::vector<T>& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, true, StdDev, Mean);
}

template <detail::BuildableElement T>
void PopulationStdDevAndMean(const std::vector<T>& X, Extended& StdDev, Extended& Mean) {
  StdDevAndMeanInto(X, false, StdDev, Mean);
}

template <detail::BuildableElement T>
Extended GetMedian(const std::vector<T>& X) {
  return MedianOf(X);
}

template <detail::BuildableElement T>
Extended TrimmedMean(const std::vector<T>& X, Extended Alpha) {
  return TrimmedMeanOf(X, Alpha, false);
}

template <detail::BuildableElement T>
Extended ExcelTrimmedMean(const std::vector<T>& X, Extended Alpha) {
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

using detail::ValueOf;

#define TOVRIN_INSTANTIATE(T)                                                           \
  template Extended QENMean(const std::vector<T>&);                                     \
  template Extended SampleVariance(const std::vector<T>&);                              \
  template Extended PopulationVariance(const std::vector<T>&);                          \
  template Extended SampleStdDev(const std::vector<T>&);                                \
  template Extended PopulationStdDev(const std::vector<T>&);                            \
  template void SampleVarianceAndMean(const std::vector<T>&, Extended&, Extended&);     \
  template void PopulationVarianceAndMean(const std::vector<T>&, Extended&, Extended&); \
  template void SampleStdDevAndMean(const std::vector<T>&, Extended&, Extended&);       \
  template void PopulationStdDevAndMean(const std::vector<T>&, Extended&, Extended&);   \
  template Extended GetMedian(const std::vector<T>&);                                   \
  template Extended TrimmedMean(const std::vector<T>&, Extended);                       \
  template Extended ExcelTrimmedMean(const std::vector<T>&, Extended);
TOVRIN_BUILDABLE_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
