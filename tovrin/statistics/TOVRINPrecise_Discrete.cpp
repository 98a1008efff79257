// The precise discrete distributions: binomial, hypergeometric and Poisson. Point
// probabilities use Loader's saddle-point form (Stirling's remainders and the deviance
// bd0(x, m) = x ln(x / m) + m - x), so they neither overflow nor underflow before the result;
// the binomial and Poisson tails are incomplete beta and gamma functions (constant time in N
// and the mean); the hypergeometric tails sum from the cut towards the far end, the side
// without the mode, so their terms fall off geometrically.
#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>

#include "tovrin/statistics/detail/PreciseCommon.h"

namespace tovrin::precise {
namespace {

using namespace common;  // NOLINT: the family's shared names

constexpr Extended kEpsilon = std::numeric_limits<Extended>::epsilon();
constexpr Extended kTwoPi = 6.28318530717958647692528676655900577L;

// ln(n!) - ln(sqrt(2 pi n) (n / e)^n) for the counts n = 1..11 (mpmath, 25 digits); from 12 on
// Stirling's series is as cheap.
constexpr Extended kStirlingErrorOfCount[] = {
    0.08106146679532725821967026L,  0.04134069595540929409382208L,  0.02767792568499833914878929L,
    0.02079067210376509311152277L,  0.01664469118982119216319487L,  0.01387612882307074799874573L,
    0.01189670994589177009505572L,  0.01041126526197209649747857L,  0.009255462182712732917728637L,
    0.008330563433362871256469319L, 0.007573675487951840794972024L,
};

// ln(n!) - ln(sqrt(2 pi n) (n / e)^n) for n > 0; 0 for n = 0 (the terms using it vanish).
Extended StirlingError(Extended n) {
  if (n < 12.0L) {
    if (!(n > 0.0L)) return 0.0L;
    // Truncated through double: SSE's conversion needs no switch of the x87 rounding mode.
    const int k = static_cast<int>(static_cast<double>(n));
    if (k == n) return kStirlingErrorOfCount[k - 1];
  }
  return detail::StirlingRemainder(n);
}

// Near the mean the exponent E of a point probability e^-E is small and the deviances form it
// to a few units in its last place: one exp instead of the powers, whose error E times that
// stays far inside the bound up to this E.
constexpr Extended kDirectExponent = 16.0L;

// Whether bd0(x, m) takes Loader's series (no logarithm) in Deviance.
bool NearMean(Extended x, const Pair& m) { return std::fabs(x - m.hi) < 0.1L * (x + m.hi); }

// bd0(x, m) = x ln(x / m) + m - x >= 0, for m = hi + lo: Loader's series in v = (x - m) /
// (x + m) near x = m, where the three terms cancel, and the direct form elsewhere.
Extended Deviance(Extended x, const Pair& m) {
  Extended d;
  if (x == 0.0L) {
    d = m.hi;
  } else if (NearMean(x, m)) {
    const Extended v = (x - m.hi) / (x + m.hi);
    Extended s = (x - m.hi) * v;
    Extended ej = 2.0L * x * v;
    const Extended v2 = v * v;
    for (int j = 1; j < 1000; ++j) {
      ej *= v2;
      const Extended next = s + ej / (2 * j + 1);
      if (next == s) break;
      s = next;
    }
    d = s;
  } else {
    d = x * std::log(x / m.hi) + m.hi - x;
  }
  // d bd0 / d m = 1 - x / m.
  return d + m.lo * (1.0L - x / m.hi);
}

// (m / x)^x for m = hi + lo: the power of the double-length base, so the result carries only
// the power's own rounding. Not normal when it leaves the range.
Extended PowerOfRatio(const Pair& m, Extended x) {
  const Pair q = detail::Quotient(m, Pair{x});
  return detail::PrecisePower(q.hi, x) * (1.0L + x * (q.lo / q.hi));
}

bool AllNormal(Extended a, Extended b, Extended c) {
  return std::isnormal(a) && std::isnormal(b) && std::isnormal(c);
}

// The binomial point probability C(n, x) p^x q^(n - x), with n p and n q given as pairs:
// e^-(bd0(x, np) + bd0(n - x, nq)) = (np / x)^x (nq / (n - x))^(n - x), since the linear terms
// cancel; the powers are used while they stay in range, the deviances beyond.
Extended BinomialPoint(Extended x, Extended n, const Pair& np, const Pair& nq) {
  if (x == 0.0L || x == n) {
    const Pair& m = x == 0.0L ? nq : np;
    const Extended power = PowerOfRatio(m, n);
    if (std::isnormal(power)) return power;
    const Pair& other = x == 0.0L ? np : nq;
    return std::exp(-Deviance(n, m) - other.hi) * (1.0L - other.lo);
  }
  const Extended stirling = StirlingError(n) - StirlingError(x) - StirlingError(n - x);
  const Extended root = std::sqrt(n / (kTwoPi * x * (n - x)));
  if (NearMean(x, np) && NearMean(n - x, nq)) {
    const Extended exponent = Deviance(x, np) + Deviance(n - x, nq);
    if (exponent <= kDirectExponent) return detail::Exp80(stirling - exponent) * root;
  }
  const Extended left = PowerOfRatio(np, x);
  const Extended right = PowerOfRatio(nq, n - x);
  if (AllNormal(left, right, left * right)) return left * right * std::exp(stirling) * root;
  // The two powers leave the range though their product need not: take the product of their
  // k-th roots (k = 2^m) and raise it by squaring, about k units of rounding, while that is
  // fewer than the size of the exponent that the deviances would round.
  const Extended exponent = Deviance(x, np) + Deviance(n - x, nq);
  const Pair q1 = detail::Quotient(np, Pair{x});
  const Pair q2 = detail::Quotient(nq, Pair{n - x});
  const Extended size =
      std::fmax(x * std::fabs(std::log(q1.hi)), (n - x) * std::fabs(std::log(q2.hi)));
  Extended k = 1.0L;
  int m = 0;
  while (size / k > 11000.0L && k < exponent) {
    k *= 2.0L;
    ++m;
  }
  Extended h = std::pow(q1.hi, x / k) * std::pow(q2.hi, (n - x) / k);
  if (k < exponent && exponent < 12000.0L && std::isnormal(h)) {
    for (int i = 0; i < m; ++i) h *= h;
    h *= (1.0L + x * (q1.lo / q1.hi)) * (1.0L + (n - x) * (q2.lo / q2.hi));
    if (std::isnormal(h)) return h * std::exp(stirling) * root;
  }
  return std::exp(stirling - exponent) * root;
}

// (p, 1 - p) as pairs, each exact to twice the working precision.
struct Proportion {
  Pair p;
  Pair q;
};

Proportion ProportionOf(Extended P) {
  const Extended q = 1.0L - P;
  return {Pair{P}, Pair{q, (1.0L - q) - P}};
}

Extended BinomialProbability(Extended x, Extended n, const Proportion& pq) {
  if (pq.p.hi == 0.0L) return x == 0.0L ? 1.0L : 0.0L;
  if (pq.q.hi == 0.0L) return x == n ? 1.0L : 0.0L;
  return BinomialPoint(x, n, detail::Product(Pair{n}, pq.p), detail::Product(Pair{n}, pq.q));
}

void CheckBinomial(Extended P, LongWord N, LongWord R) {
  if (N == 0 || P < 0 || P > 1) RaiseMathError(rsBinomDistInvalid);
  if (N < R) RaiseMathError(rsBinomDistInvalid);
}

// --- Hypergeometric ---------------------------------------------------------------------------

// The counts that can occur, [first, last].
struct CountRange {
  std::int64_t first;
  std::int64_t last;
};

CountRange HyperGeometricRange(LongWord N, LongWord S, LongWord M) {
  const std::int64_t failures = std::int64_t{N} - M;
  return {std::max<std::int64_t>(0, std::int64_t{S} - failures), std::min<std::int64_t>(M, S)};
}

// C(M, x) C(N - M, S - x) / C(N, S) = b(x; M, p) b(S - x; N - M, p) / b(S; N, p), p = S / N
// (Loader's form; the powers of p and q cancel).
Extended HyperGeometricPoint(LongWord N, LongWord S, LongWord M, std::int64_t x) {
  const CountRange range = HyperGeometricRange(N, S, M);
  if (x < range.first || x > range.last) return 0.0L;
  if (S == N) return 1.0L;
  const Extended n = N;
  const Extended s = S;
  const Pair p = detail::Quotient(Pair{s}, Pair{n});
  const Pair q = detail::Quotient(Pair{n - s}, Pair{n});
  const Proportion pq{p, q};
  const Extended m = M;
  const Extended k = static_cast<Extended>(x);
  return BinomialProbability(k, m, pq) * BinomialProbability(s - k, n - m, pq) /
         BinomialProbability(s, n, pq);
}

// The sum of the point probabilities from `from` towards `to` (one step at a time), from the
// first term on by the ratio of neighbours; stops once the terms no longer count.
Extended HyperGeometricRun(LongWord N, LongWord S, LongWord M, std::int64_t from, std::int64_t to) {
  const Extended n = N;
  const Extended s = S;
  const Extended m = M;
  Extended term = HyperGeometricPoint(N, S, M, from);
  Extended sum = term;
  const int step = to >= from ? 1 : -1;
  for (std::int64_t k = from; k != to && term > 0.0L; k += step) {
    const Extended kk = static_cast<Extended>(k);
    // p(k + 1) / p(k) = (M - k)(S - k) / ((k + 1)(N - M - S + k + 1)).
    if (step > 0) {
      term *= (m - kk) * (s - kk) / ((kk + 1.0L) * (n - m - s + kk + 1.0L));
    } else {
      term *= kk * (n - m - s + kk) / ((m - kk + 1.0L) * (s - kk + 1.0L));
    }
    sum += term;
    if (term <= sum * kEpsilon * 0.125L) break;
  }
  return sum;
}

// P(X < x) and P(X >= x), the one without the mode summed.
Tails HyperGeometricSplit(LongWord N, LongWord S, LongWord M, std::int64_t x) {
  const CountRange range = HyperGeometricRange(N, S, M);
  if (x <= range.first) return {0.0L, 1.0L};
  if (x > range.last) return {1.0L, 0.0L};
  const Extended mode =
      std::floor((static_cast<Extended>(S) + 1.0L) * (static_cast<Extended>(M) + 1.0L) /
                 (static_cast<Extended>(N) + 2.0L));
  if (static_cast<Extended>(x) <= mode) {
    const Extended below = HyperGeometricRun(N, S, M, x - 1, range.first);
    return {below, 1.0L - below};
  }
  const Extended above = HyperGeometricRun(N, S, M, x, range.last);
  return {1.0L - above, above};
}

}  // namespace

// === Binomial ===================================================================================

Extended BinomialEq(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N, R);
  if (std::isnan(P)) return kNaN;
  return BinomialProbability(R, N, ProportionOf(P));
}

Extended BinomialLess(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N, R);
  if (std::isnan(P)) return kNaN;
  if (R == 0) return 0;
  if (P == 0) return 1;
  if (P == 1) return 0;
  // P(X <= R - 1) = 1 - I_p(R, N - R + 1).
  const Proportion pq = ProportionOf(P);
  return detail::IncompleteBetaTails(pq.p.hi, pq.p.lo, pq.q.hi, pq.q.lo, R,
                                     static_cast<Extended>(N) - R + 1)
      .upper;
}

Extended BinomialGreater(Extended P, LongWord N, LongWord R) {
  CheckBinomial(P, N, R);
  if (std::isnan(P)) return kNaN;
  if (R == N) return 0;
  if (P == 0) return 0;
  if (P == 1) return 1;
  // P(X >= R + 1) = I_p(R + 1, N - R).
  const Proportion pq = ProportionOf(P);
  return detail::IncompleteBetaTails(pq.p.hi, pq.p.lo, pq.q.hi, pq.q.lo,
                                     static_cast<Extended>(R) + 1, static_cast<Extended>(N) - R)
      .lower;
}

// === Hypergeometric =============================================================================

Extended HyperGeometricEq(LongWord N, LongWord S, LongWord M, LongWord X) {
  CheckHyperGeometric(N, S, M);
  return HyperGeometricPoint(N, S, M, X);
}

namespace {
// P(X < Cut) and P(X >= Cut) after the checks of Less and Greater at X.
Tails CheckedHyperGeometricSplit(LongWord N, LongWord S, LongWord M, LongWord X, std::int64_t Cut) {
  CheckHyperGeometric(N, S, M);
  if (X > S) RaiseMathError(rsHyperGeometricInvalid);
  return HyperGeometricSplit(N, S, M, Cut);
}
}  // namespace

Extended HyperGeometricLess(LongWord N, LongWord S, LongWord M, LongWord X) {
  return CheckedHyperGeometricSplit(N, S, M, X, X).lower;
}

Extended HyperGeometricGreater(LongWord N, LongWord S, LongWord M, LongWord X) {
  return CheckedHyperGeometricSplit(N, S, M, X, std::int64_t{X} + 1).upper;
}

// === Poisson ====================================================================================

Extended PoissonEq(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  if (std::isnan(Mean)) return kNaN;
  if (X == 0) return std::exp(-Mean);
  // e^-bd0(x, Mean) = (Mean / x)^x e^(x - Mean), from powers while they stay in range.
  const Extended x = X;
  if (NearMean(x, Pair{Mean})) {
    const Extended exponent = Deviance(x, Pair{Mean});
    if (exponent <= kDirectExponent) {
      return detail::Exp80(-StirlingError(x) - exponent) / std::sqrt(kTwoPi * x);
    }
  }
  const Extended root = std::exp(-StirlingError(x)) / std::sqrt(kTwoPi * x);
  // The power as the square of its half, which reaches twice as far.
  const Pair q = detail::Quotient(Pair{Mean}, Pair{x});
  const Extended half = detail::PrecisePower(q.hi, 0.5L * x);
  const Pair d = detail::ExactSum(x, -Mean);
  const Extended decay = std::exp(d.hi);
  const Extended partial = half * decay * root;
  if (AllNormal(half, decay, partial) && std::isnormal(partial * half)) {
    return partial * half * (1.0L + x * (q.lo / q.hi)) * (1.0L + d.lo);
  }
  return std::exp(-Deviance(x, Pair{Mean})) * root;
}

Extended PoissonLess(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  if (std::isnan(Mean)) return kNaN;
  if (X == 0) return 0;
  // P(Y <= X - 1) = Q(X, Mean).
  return detail::IncompleteGammaTails(X, Mean).upper;
}

Extended PoissonGreater(Extended Mean, LongWord X) {
  CheckPoisson(Mean);
  if (std::isnan(Mean)) return kNaN;
  // P(Y >= X + 1) = P(X + 1, Mean).
  return detail::IncompleteGammaTails(static_cast<Extended>(X) + 1, Mean).lower;
}

}  // namespace tovrin::precise
