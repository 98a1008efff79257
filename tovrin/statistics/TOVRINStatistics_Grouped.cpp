// Statistics of grouped frequency data.
#include "tovrin/statistics/TOVRINStatistics_Grouped.h"

#include <cmath>
#include <cstddef>
#include <vector>

#include "tovrin/foundation/detail/Wrapping.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using detail::RaiseMathError;
using detail::WrappingMul64;

void CheckNotEmpty(const TQENLWordVector& Freqs) {
  if (Freqs.empty()) RaiseMathError(rsVectorIsEmpty);
}

// Lower boundary and midpoint of class i, formed in the order the definitions give.
Extended ClassStart(std::size_t i, Extended Start, Extended Width) {
  return static_cast<Extended>(i) * Width + Start;
}
Extended Midpoint(std::size_t i, Extended Start, Extended Width) {
  return ClassStart(i, Start, Width) + Width / 2;
}

Extended MeanOf(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  CheckNotEmpty(Freqs);
  Extended sum = 0;
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    sum += static_cast<Extended>(Freqs[i]) * Midpoint(i, Start, Width);
  }
  const Int64 total = SumVector(Freqs);  // the 64-bit total, F
  if (total == 0) return 0;
  return sum / static_cast<Extended>(total);
}

Extended VarianceOf(const TQENLWordVector& Freqs, Extended Start, Extended Width, bool Sample) {
  const Extended mean = MeanOf(Freqs, Start, Width);
  Extended sum = 0;
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    const Extended d = Midpoint(i, Start, Width) - mean;
    sum += static_cast<Extended>(Freqs[i]) * (d * d);
  }
  const Int64 total = SumVector(Freqs);  // the 64-bit total, F
  if (Sample) {
    if (total < 2) return 0;
    return sum / static_cast<Extended>(total - 1);
  }
  if (total == 0) return 0;
  return sum / static_cast<Extended>(total);
}

// Cumulative frequencies, 32-bit and wrapping like the table they are kept in.
TQENLWordVector Cumulative(const TQENLWordVector& Freqs) {
  TQENLWordVector cumulative(Freqs.size());
  LongWord running = 0;
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    running += Freqs[i];
    cumulative[i] = running;
  }
  return cumulative;
}

constexpr std::size_t kNotFound = static_cast<std::size_t>(-1);

// The first class whose cumulative frequency reaches Target, or kNotFound.
std::size_t FirstClassReaching(const TQENLWordVector& Cumulative, Extended Target) {
  for (std::size_t k = 0; k < Cumulative.size(); ++k) {
    if (static_cast<Extended>(Cumulative[k]) >= Target) return k;
  }
  return kNotFound;
}

// The interpolated value at Target inside class k.
Extended InterpolateInClass(const TQENLWordVector& Freqs, const TQENLWordVector& Cumulative,
                            std::size_t k, Extended Target, Extended Start, Extended Width) {
  const Extended below = k == 0 ? 0 : static_cast<Extended>(Cumulative[k - 1]);
  return ClassStart(k, Start, Width) + (Target - below) * Width / static_cast<Extended>(Freqs[k]);
}

enum class Shape { kSampleSkew, kPopulationSkew, kSampleKurtosis, kPopulationKurtosis };

Extended ShapeOf(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended Mean,
                 Extended StdDev, Shape shape) {
  CheckNotEmpty(Freqs);
  const Int64 total = SumVector(Freqs);
  const bool skew = shape == Shape::kSampleSkew || shape == Shape::kPopulationSkew;
  if (skew && total < 3) RaiseMathError(rsVectorG2);
  if (!skew && total < 4) RaiseMathError(rsVectorG3);
  if (FloatIsZero(StdDev)) RaiseMathError(rsStdDev);
  // Central sums over the classes, unweighted: only F carries the frequencies.
  Extended s3 = 0;
  Extended s4 = 0;
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    const Extended d = Midpoint(i, Start, Width) - Mean;
    const Extended d2 = d * d;
    s3 += d2 * d;
    s4 += d2 * d2;
  }
  const Extended f = static_cast<Extended>(total);
  const Extended sd2 = StdDev * StdDev;
  const Extended sd3 = sd2 * StdDev;
  const Extended sd4 = sd2 * sd2;
  const Int64 f1 = total - 1;
  const Int64 f2 = total - 2;
  const Int64 f3 = total - 3;
  switch (shape) {
    case Shape::kSampleSkew:
      return s3 / (f * sd3);
    case Shape::kPopulationSkew:
      return f * s3 / (static_cast<Extended>(WrappingMul64(f1, f2)) * sd3);
    case Shape::kSampleKurtosis: {
      const Extended upper = static_cast<Extended>(WrappingMul64(total, total + 1));
      const Extended lower = static_cast<Extended>(WrappingMul64(WrappingMul64(f1, f2), f3));
      const Extended correction = static_cast<Extended>(WrappingMul64(WrappingMul64(3, f1), f1)) /
                                  static_cast<Extended>(WrappingMul64(f2, f3));
      return upper * s4 / (lower * sd4) - correction;
    }
    case Shape::kPopulationKurtosis:
      break;
  }
  return s4 / (f * sd4) - 3;
}

}  // namespace

Extended GroupedMean(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  return MeanOf(Freqs, Start, Width);
}

Extended GroupedMedian(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  CheckNotEmpty(Freqs);
  const TQENLWordVector cumulative = Cumulative(Freqs);
  const Extended target = static_cast<Extended>(SumVector(Freqs)) / 2;
  const std::size_t k = FirstClassReaching(cumulative, target);
  if (k == kNotFound) RaiseMathError(rsMedianNotFound);
  return InterpolateInClass(Freqs, cumulative, k, target, Start, Width);
}

bool GroupedMode(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Mode) {
  CheckNotEmpty(Freqs);
  const std::size_t n = Freqs.size();
  LongWord max = Freqs[0];
  std::size_t k = 0;
  bool tie = false;
  for (std::size_t i = 1; i < n; ++i) {
    if (Freqs[i] == max) {
      tie = true;
    } else if (Freqs[i] > max) {
      k = i;
      max = Freqs[i];
      tie = false;
    }
  }
  if (tie) return false;
  const LongWord d1 = k == 0 ? Freqs[k] : Freqs[k] - Freqs[k - 1];
  const LongWord d2 = k == n - 1 ? Freqs[k] : Freqs[k] - Freqs[k + 1];
  const auto spread = static_cast<LongWord>(d1 + d2);  // 32-bit like its terms
  Mode = ClassStart(k, Start, Width) +
         static_cast<Extended>(d1) * Width / static_cast<Extended>(spread);
  return true;
}

void GroupedQuartiles(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Q1,
                      Extended& Q3) {
  CheckNotEmpty(Freqs);
  const TQENLWordVector cumulative = Cumulative(Freqs);
  const Int64 total = SumVector(Freqs);
  const Extended target1 = static_cast<Extended>(total) / 4;
  const Extended target3 = static_cast<Extended>(WrappingMul64(3, total)) / 4;
  // One scan for both classes, stopping once both are known.
  std::size_t k1 = kNotFound;
  std::size_t k3 = kNotFound;
  for (std::size_t k = 0; k < cumulative.size() && (k1 == kNotFound || k3 == kNotFound); ++k) {
    const auto c = static_cast<Extended>(cumulative[k]);
    if (k1 == kNotFound && c >= target1) k1 = k;
    if (k3 == kNotFound && c >= target3) k3 = k;
  }
  if (k1 == kNotFound || k3 == kNotFound) RaiseMathError(rsQuartilesNotFound);
  const Extended q1 = InterpolateInClass(Freqs, cumulative, k1, target1, Start, Width);
  const Extended q3 = InterpolateInClass(Freqs, cumulative, k3, target3, Start, Width);
  Q1 = q1;
  Q3 = q3;
}

void GetGroupedDeciles(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                       std::array<Extended, 9>& Deciles) {
  CheckNotEmpty(Freqs);
  const TQENLWordVector cumulative = Cumulative(Freqs);
  const Int64 total = SumVector(Freqs);
  std::array<Extended, 9> deciles{};
  for (Int64 j = 1; j <= 9; ++j) {
    const Extended target = static_cast<Extended>(WrappingMul64(total, j)) / 10;
    const std::size_t k = FirstClassReaching(cumulative, target);
    if (k == kNotFound) RaiseMathError(rsQuartilesNotFound);
    deciles[static_cast<std::size_t>(j - 1)] =
        InterpolateInClass(Freqs, cumulative, k, target, Start, Width);
  }
  Deciles = deciles;
}

Extended GroupedSampleVariance(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  return VarianceOf(Freqs, Start, Width, true);
}
Extended GroupedPopulationVariance(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  return VarianceOf(Freqs, Start, Width, false);
}
Extended GroupedSampleStdDev(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  return std::sqrt(VarianceOf(Freqs, Start, Width, true));
}
Extended GroupedPopulationStdDev(const TQENLWordVector& Freqs, Extended Start, Extended Width) {
  return std::sqrt(VarianceOf(Freqs, Start, Width, false));
}

void GroupedSums(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Sum,
                 Extended& SumSq) {
  Sum = 0;
  SumSq = 0;
  CheckNotEmpty(Freqs);
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    const Extended mid = Midpoint(i, Start, Width);
    const auto f = static_cast<Extended>(Freqs[i]);
    Sum += f * mid;
    SumSq += mid * mid * f;
  }
}

Extended GetGroupedMeanDev(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                           Extended Mean) {
  CheckNotEmpty(Freqs);
  Extended sum = 0;
  for (std::size_t i = 0; i < Freqs.size(); ++i) {
    sum += static_cast<Extended>(Freqs[i]) * std::fabs(Midpoint(i, Start, Width) - Mean);
  }
  const Int64 total = SumVector(Freqs);  // the 64-bit total, F
  if (total == 0) return 0;
  return sum / static_cast<Extended>(total);
}

Extended GetGroupedSampleSkew(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                              Extended Mean, Extended StdDev) {
  return ShapeOf(Freqs, Start, Width, Mean, StdDev, Shape::kSampleSkew);
}
Extended GetGroupedPopulationSkew(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                  Extended Mean, Extended StdDev) {
  return ShapeOf(Freqs, Start, Width, Mean, StdDev, Shape::kPopulationSkew);
}
Extended GetGroupedSampleKurtosis(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                  Extended Mean, Extended StdDev) {
  return ShapeOf(Freqs, Start, Width, Mean, StdDev, Shape::kSampleKurtosis);
}
Extended GetGroupedPopulationKurtosis(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                      Extended Mean, Extended StdDev) {
  return ShapeOf(Freqs, Start, Width, Mean, StdDev, Shape::kPopulationKurtosis);
}

}  // namespace tovrin
