// Sample statistics and paired-data regression on 10^6 values, each beside a hand-written loop
// over the same TQENFloatVector that computes the same quantity in long double. One benchmark
// iteration is one pass of the statistic over the whole vector; items are elements.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <random>
#include <vector>

#include "tovrin/statistics/TOVRINPairStats.h"
#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/vector/TOVRINVector.h"

namespace {

using namespace tovrin;

constexpr std::size_t kCount = 1000000;

const TQENFloatVector& Sample() {
  static const TQENFloatVector sample = [] {
    std::mt19937_64 engine(20261121);
    std::normal_distribution<double> dist(10, 3);
    TQENFloatVector v(kCount);
    for (auto& x : v) x = static_cast<Extended>(dist(engine));
    return v;
  }();
  return sample;
}

// A response roughly quadratic in Sample(), with noise.
const TQENFloatVector& Response() {
  static const TQENFloatVector response = [] {
    std::mt19937_64 engine(7);
    std::normal_distribution<double> noise(0, 1);
    const TQENFloatVector& x = Sample();
    TQENFloatVector y(kCount);
    for (std::size_t i = 0; i < kCount; ++i) {
      const Extended v = x[i];
      y[i] = 2 - 0.5L * v + 0.25L * v * v + static_cast<Extended>(noise(engine));
    }
    return y;
  }();
  return response;
}

template <typename Body>
void Run(benchmark::State& state, Body body) {
  for (auto _ : state) benchmark::DoNotOptimize(body());
  state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(kCount));
}

// --- Mean ----------------------------------------------------------------------------------------
void BM_QENMean(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] { return QENMean(x); });
}
void BM_Loop_Mean(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    long double s = 0;
    for (const long double v : x) s += v;
    return s / static_cast<long double>(x.size());
  });
}
BENCHMARK(BM_QENMean);
BENCHMARK(BM_Loop_Mean);

// --- Two-pass variance -------------------------------------------------------------------------
void BM_SampleVariance(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] { return SampleVariance(x); });
}
void BM_Loop_TwoPassVariance(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    long double s = 0;
    for (const long double v : x) s += v;
    const long double n = static_cast<long double>(x.size());
    const long double m = s / n;
    long double ss = 0;
    for (const long double v : x) ss += (v - m) * (v - m);
    return ss / (n - 1);
  });
}
BENCHMARK(BM_SampleVariance);
BENCHMARK(BM_Loop_TwoPassVariance);

// --- One-pass variance and mean ----------------------------------------------------------------
void BM_SampleVarianceAndMean(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    Extended variance = 0;
    Extended mean = 0;
    SampleVarianceAndMean(x, variance, mean);
    return variance + mean;
  });
}
void BM_Loop_OnePassVarianceAndMean(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    long double s1 = 0;
    long double s2 = 0;
    for (const long double v : x) {
      s1 += v;
      s2 += v * v;
    }
    const long double n = static_cast<long double>(x.size());
    return (s2 - s1 * s1 / n) / (n - 1) + s1 / n;
  });
}
BENCHMARK(BM_SampleVarianceAndMean);
BENCHMARK(BM_Loop_OnePassVarianceAndMean);

// --- Median of unsorted data: sort a copy, read the middle -------------------------------------
void BM_QSortVector_GetMedian(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    TQENFloatVector copy = x;
    QSortVector(copy, true);
    return GetMedian(copy);
  });
}
void BM_Std_NthElementMedian(benchmark::State& state) {
  // The std:: peer on plain long double storage (16-byte elements).
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    std::vector<long double> copy(x.begin(), x.end());
    const auto mid = copy.begin() + static_cast<std::ptrdiff_t>(copy.size() / 2);
    std::nth_element(copy.begin(), mid, copy.end());
    const long double upper = *mid;
    const long double lower = *std::max_element(copy.begin(), mid);
    return (lower + upper) / 2;
  });
}
void BM_Std_SortMedian(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    std::vector<long double> copy(x.begin(), x.end());
    std::sort(copy.begin(), copy.end());
    const std::size_t n = copy.size();
    return (copy[n / 2 - 1] + copy[n / 2]) / 2;
  });
}
BENCHMARK(BM_QSortVector_GetMedian)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Std_SortMedian)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Std_NthElementMedian)->Unit(benchmark::kMillisecond);

// --- Sample kurtosis: mean and standard deviation, then the fourth central sum ---------------
void BM_GetSampleKurtosis(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] { return GetSampleKurtosis(x); });
}
void BM_Loop_SampleKurtosis(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  Run(state, [&] {
    long double s1 = 0;
    long double s2 = 0;
    for (const long double v : x) {
      s1 += v;
      s2 += v * v;
    }
    const long double n = static_cast<long double>(x.size());
    const long double m = s1 / n;
    const long double var = (s2 - s1 * s1 / n) / (n - 1);
    long double s4 = 0;
    for (const long double v : x) {
      const long double d2 = (v - m) * (v - m);
      s4 += d2 * d2;
    }
    return n * (n + 1) * s4 / ((n - 1) * (n - 2) * (n - 3) * var * var) -
           3 * (n - 1) * (n - 1) / ((n - 2) * (n - 3));
  });
}
BENCHMARK(BM_GetSampleKurtosis);
BENCHMARK(BM_Loop_SampleKurtosis);

// --- Quadratic curve ---------------------------------------------------------------------------
void BM_GetQuadraticCurve(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  const TQENFloatVector& y = Response();
  Run(state, [&] {
    Extended a = 0;
    Extended b = 0;
    Extended c = 0;
    GetQuadraticCurve(x, y, a, b, c);
    return a + b + c;
  });
}
void BM_Loop_QuadraticCurve(benchmark::State& state) {
  const TQENFloatVector& xs = Sample();
  const TQENFloatVector& ys = Response();
  Run(state, [&] {
    long double s1 = 0, s2 = 0, s3 = 0, s4 = 0, t0 = 0, t1 = 0, t2 = 0;
    for (std::size_t i = 0; i < xs.size(); ++i) {
      const long double x = xs[i];
      const long double y = ys[i];
      const long double q = x * x;
      s1 += x;
      s2 += q;
      s3 += q * x;
      s4 += q * q;
      t0 += y;
      t1 += y * x;
      t2 += y * q;
    }
    const long double n = static_cast<long double>(xs.size());
    // Cramer's rule on the 3 x 3 normal equations.
    const long double d =
        n * (s2 * s4 - s3 * s3) - s1 * (s1 * s4 - s3 * s2) + s2 * (s1 * s3 - s2 * s2);
    const long double a =
        (t0 * (s2 * s4 - s3 * s3) - s1 * (t1 * s4 - s3 * t2) + s2 * (t1 * s3 - s2 * t2)) / d;
    const long double b =
        (n * (t1 * s4 - t2 * s3) - t0 * (s1 * s4 - s3 * s2) + s2 * (s1 * t2 - t1 * s2)) / d;
    const long double c =
        (n * (s2 * t2 - s3 * t1) - s1 * (s1 * t2 - s3 * t0) + t0 * (s1 * s3 - s2 * s2)) / d;
    return a + b + c;
  });
}
BENCHMARK(BM_GetQuadraticCurve);
BENCHMARK(BM_Loop_QuadraticCurve);

// --- Correlation -------------------------------------------------------------------------------
void BM_CoeffCorrelation(benchmark::State& state) {
  const TQENFloatVector& x = Sample();
  const TQENFloatVector& y = Response();
  Run(state, [&] { return CoeffCorrelation(x, y); });
}
void BM_Loop_Correlation(benchmark::State& state) {
  const TQENFloatVector& xs = Sample();
  const TQENFloatVector& ys = Response();
  Run(state, [&] {
    long double sx = 0, sy = 0, sxx = 0, syy = 0, sxy = 0;
    for (std::size_t i = 0; i < xs.size(); ++i) {
      const long double x = xs[i];
      const long double y = ys[i];
      sx += x;
      sy += y;
      sxx += x * x;
      syy += y * y;
      sxy += x * y;
    }
    const long double n = static_cast<long double>(xs.size());
    const long double cov = sxy - sx * sy / n;
    return cov / std::sqrt((sxx - sx * sx / n) * (syy - sy * sy / n));
  });
}
BENCHMARK(BM_CoeffCorrelation);
BENCHMARK(BM_Loop_Correlation);

}  // namespace

BENCHMARK_MAIN();
