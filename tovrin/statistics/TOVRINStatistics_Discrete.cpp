// Discrete distributions and combinatorics.
#include "tovrin/statistics/TOVRINStatistics_Discrete.h"

#include <array>
#include <cmath>
#include <cstdint>
#include <utility>
#include <vector>

#include "tovrin/statistics/detail/DistributionChecks.h"

namespace tovrin {
namespace {

using detail::RaiseMathError;
using namespace detail::checks;  // NOLINT: the checks shared with the precise family
using Count = std::uint64_t;     // counts one past a LongWord without wrapping

constexpr LongWord kLargestFactorial = 1754;

// n! for n = 0..1754, each the running product 2 * 3 * ... * n in Extended, built once.
const std::array<Extended, kLargestFactorial + 1>& FactorialTable() {
  static const auto table = [] {
    std::array<Extended, kLargestFactorial + 1> t{};
    t[0] = 1;
    Extended product = 1;
    for (LongWord n = 1; n <= kLargestFactorial; ++n) {
      if (n >= 2) product *= static_cast<Extended>(n);
      t[n] = product;
    }
    return t;
  }();
  return table;
}

// --- Binomial ---------------------------------------------------------------------------------

void CheckBinomial(Extended P, LongWord N) {
  if (N == 0 || P < 0 || P > 1) RaiseMathError(rsBinomDistInvalid);
}

Extended BinomialTerm(Extended P, LongWord N, LongWord k, Extended coefficient) {
  return XtoY(P, k) * coefficient * XtoY(1 - P, N - k);
}

Extended BinomialTerm(Extended P, LongWord N, LongWord k) {
  return BinomialTerm(P, N, k, BinomialCoeff(N, k));
}

// The coefficients C(N, k) of one N for k = 0, 1, 2, ..., each product loop run once.
// BinomialCoeff runs the same loop for k and N - k, so past N/2 a sum that started at 0 reads
// the value it already has: the same bits, and an overflow raises at the same k as before.
class BinomialCoefficients {
 public:
  explicit BinomialCoefficients(LongWord n) : n_(n) {}

  Extended operator()(LongWord k) {
    const LongWord loop_k = k > n_ / 2 ? n_ - k : k;
    if (loop_k < known_.size()) return known_[loop_k];
    const Extended c = BinomialCoeff(n_, k);
    if (loop_k == known_.size()) known_.push_back(c);
    return c;
  }

 private:
  LongWord n_;
  std::vector<Extended> known_;
};

// Sum of the point probabilities of the counts 0..Below-1 (Below may be N + 1).
Extended BinomialSumBelow(Extended P, LongWord N, Count Below, BinomialCoefficients& coefficients) {
  Extended sum = 0;
  for (Count k = 0; k < Below; ++k) {
    const auto count = static_cast<LongWord>(k);
    sum += BinomialTerm(P, N, count, coefficients(count));
  }
  return sum;
}

Extended BinomialSumBelow(Extended P, LongWord N, Count Below) {
  BinomialCoefficients coefficients(N);
  return BinomialSumBelow(P, N, Below, coefficients);
}

// --- Hypergeometric ---------------------------------------------------------------------------

Extended HyperGeometricTerm(LongWord N, LongWord S, LongWord M, LongWord X) {
  if (X > MinXY(M, S)) return 0;
  // Fewer failures than the sample needs: the count cannot occur.
  if (S - X > N - M) return 0;
  return BinomialCoeff(M, X) * BinomialCoeff(N - M, S - X) / BinomialCoeff(N, S);
}

// Sum over the counts below Below, the upper count limited to MinXY(M, S).
Extended HyperGeometricSumBelow(LongWord N, LongWord S, LongWord M, Count Below) {
  const Count top = MinXY(M, S);
  // Counts that need more failures than the population holds add exact zeros: skip them, so
  // that a large sample does not walk billions of empty terms.
  const Count first = S > N - M ? static_cast<Count>(S - (N - M)) : Count{0};
  Extended sum = 0;
  for (Count k = first; k < Below && k <= top; ++k) {
    sum += HyperGeometricTerm(N, S, M, static_cast<LongWord>(k));
  }
  return sum;
}

// --- Poisson ----------------------------------------------------------------------------------

// Sum of the point probabilities of the counts 0..Below-1.
Extended PoissonSumBelow(Extended Mean, Count Below) {
  // The last count's factorial decides, so an overflow raises before any term is summed.
  if (Below > Count{kLargestFactorial} + 1) RaiseMathError(rsFactOverflow);
  // Each term is PoissonEq(Mean, k), evaluated the same way with exp(-Mean) formed once.
  const Extended decay = std::exp(-Mean);
  const auto& factorials = FactorialTable();
  Extended sum = 0;
  for (Count k = 0; k < Below; ++k)
    sum += decay * XtoY(Mean, static_cast<Extended>(k)) / factorials[k];
  return sum;
}

}  // namespace

// === Combinatorics ==============================================================================

Extended Factorial(LongWord N) {
  if (N > kLargestFactorial) RaiseMathError(rsFactOverflow);
  return FactorialTable()[N];
}

Extended Permutation(LongWord N, LongWord R) {
  if (N < R) RaiseMathError(rsPermInvalid);
  if (R == 0) return 1;
  Extended product = 1;
  const Count last = Count{N} - R + 1;
  for (Count i = N; i >= last; --i) {
    product *= static_cast<Extended>(i);
    if (!std::isfinite(product)) RaiseMathError(rsPermOverflowed);
  }
  return std::trunc(product + 0.5L);
}

Extended BinomialCoeff(LongWord N, LongWord K) {
  if (N < K) RaiseMathError(rsBinomInvalid);
  if (K == 0 || K == N) return 1;
  if (K > N / 2) K = N - K;
  // One division per multiplication keeps the running value near C(i, i - N + K).
  Extended result = 1;
  Count divisor = 2;
  for (Count i = Count{N} - K + 1; i <= N; ++i) {
    result *= static_cast<Extended>(i);
    if (divisor <= K) {
      result /= static_cast<Extended>(divisor);
      ++divisor;
    }
    if (!std::isfinite(result)) RaiseMathError(rsBinomOverflowed);
  }
  return std::trunc(result + 0.5L);
}

// === Binomial ===================================================================================

Extended BinomialEq(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N);
  if (N < R) RaiseMathError(rsBinomDistInvalid);
  return BinomialTerm(P, N, R);
}

Extended BinomialLess(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N);
  if (N < R) RaiseMathError(rsBinomDistInvalid);
  return BinomialSumBelow(P, N, R);
}

Extended BinomialGreater(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N);
  if (N < R) RaiseMathError(rsBinomDistInvalid);
  return 1 - BinomialSumBelow(P, N, Count{R} + 1);
}

Extended BinomialBetween(Extended P, LongWord N, LongWord R1, LongWord R2) {
  CheckBinomial(P, N);
  if (N < R1 || N < R2) RaiseMathError(rsBinomDistInvalid);
  if (R1 == R2) return BinomialTerm(P, N, R1);
  BinomialCoefficients coefficients(N);
  const Extended below_r2 = BinomialSumBelow(P, N, R2, coefficients);
  const Extended difference = below_r2 - BinomialSumBelow(P, N, Count{R1} + 1, coefficients);
  return R1 > R2 ? -difference : difference;
}

// === Hypergeometric =============================================================================

Extended HyperGeometricEq(LongWord N, LongWord S, LongWord M, LongWord X) {
  CheckHyperGeometric(N, S, M);
  return HyperGeometricTerm(N, S, M, X);
}

Extended HyperGeometricLess(LongWord N, LongWord S, LongWord M, LongWord X) {
  CheckHyperGeometric(N, S, M);
  if (X > S) RaiseMathError(rsHyperGeometricInvalid);
  return HyperGeometricSumBelow(N, S, M, X);
}

Extended HyperGeometricGreater(LongWord N, LongWord S, LongWord M, LongWord X) {
  CheckHyperGeometric(N, S, M);
  if (X > S) RaiseMathError(rsHyperGeometricInvalid);
  return 1 - HyperGeometricSumBelow(N, S, M, Count{X} + 1);
}

Extended HyperGeometricBetween(LongWord N, LongWord S, LongWord M, LongWord X1, LongWord X2) {
  CheckHyperGeometric(N, S, M);
  if (X1 == X2) return HyperGeometricTerm(N, S, M, X2);
  if (X1 > S || X2 > S) RaiseMathError(rsHyperGeometricInvalid);
  const Extended difference =
      HyperGeometricSumBelow(N, S, M, X1) - HyperGeometricSumBelow(N, S, M, Count{X2} + 1);
  return X2 > X1 ? -difference : difference;
}

// === Poisson ====================================================================================

Extended PoissonEq(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  const Extended factorial = Factorial(X);
  return std::exp(-Mean) * XtoY(Mean, X) / factorial;
}

Extended PoissonLess(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  return PoissonSumBelow(Mean, X);
}

Extended PoissonGreater(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  return 1 - PoissonSumBelow(Mean, Count{X} + 1);
}

Extended PoissonBetween(Extended Mean, LongWord X1, LongWord X2) {
  CheckPoisson(Mean);
  // The counts are compared as Single values, within that type's tolerance.
  if (SameFloat(static_cast<Single>(X1), static_cast<Single>(X2))) return PoissonEq(Mean, X1);
  const Extended difference = PoissonSumBelow(Mean, X2) - PoissonSumBelow(Mean, Count{X1} + 1);
  return X1 > X2 ? -difference : difference;
}

// === Tables =====================================================================================

void BinomialPDFValues(LongInt N, Extended P, TQENFloatVector& V) {
  V.clear();
  if (N <= 0 || !(P >= 0 && P <= 1)) RaiseMathError(rsBinomDistInvalid);
  // Filled locally so that an overflow part-way leaves V empty; an N whose coefficients
  // overflow raises after a few hundred entries, long before the table grows large.
  TQENFloatVector values;
  BinomialCoefficients coefficients(static_cast<LongWord>(N));
  for (LongInt k = 0; k <= N; ++k) {
    const auto count = static_cast<LongWord>(k);
    values.push_back(BinomialTerm(P, static_cast<LongWord>(N), count, coefficients(count)));
  }
  V = std::move(values);
}

void HyperGeometricPDFValues(LongWord N, LongWord S, LongWord M, TQENFloatVector& V) {
  V.clear();
  if (N == 0 || S == 0 || S > N || M > N) RaiseMathError(rsHyperGeometricInvalid);
  const Extended total = BinomialCoeff(N, S);  // raises rsBinomOverflowed before any entry
  (void)total;
  TQENFloatVector values(static_cast<std::size_t>(S) + 1);
  for (Count k = 0; k <= S; ++k) values[k] = HyperGeometricTerm(N, S, M, static_cast<LongWord>(k));
  V = std::move(values);
}

void PoissonPDFValues(LongInt N, Extended Mean, TQENLIntVector& Counts, TQENFloatVector& Probs) {
  Counts.clear();
  Probs.clear();
  if (N <= 0 || !(Mean > 0)) RaiseMathError(rsPoissonInvalid);
  const Int64 half = N / 2;
  Int64 low = (N % 2 == 0) ? half - 1 : half;
  // Counts beyond the largest factorial raise, so a mean that large needs no exact Trunc.
  if (!(Mean < static_cast<Extended>(kLargestFactorial) + 1)) RaiseMathError(rsFactOverflow);
  const Int64 m = static_cast<Int64>(std::trunc(Mean));
  if (m + half > kLargestFactorial) RaiseMathError(rsFactOverflow);
  if (m < low) low = m;
  const std::size_t count = static_cast<std::size_t>(half + low + 1);
  TQENLIntVector counts(count);
  TQENFloatVector probs(count);
  for (std::size_t i = 0; i < count; ++i) {
    const Int64 k = m - low + static_cast<Int64>(i);
    counts[i] = static_cast<LongInt>(k);
    probs[i] = PoissonEq(Mean, static_cast<LongWord>(k));
  }
  Counts = std::move(counts);
  Probs = std::move(probs);
}

}  // namespace tovrin
