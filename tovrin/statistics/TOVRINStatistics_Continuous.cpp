// Continuous distributions. Every scalar is worked in the 80-bit Extended type.
#include "tovrin/statistics/TOVRINStatistics_Continuous.h"

#include <cmath>
#include <cstddef>
#include <limits>
#include <utility>

#include "tovrin/statistics/detail/DistributionChecks.h"

namespace tovrin {
namespace {

using detail::RaiseMathError;
using namespace detail::checks;  // NOLINT: the checks shared with the precise family

constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
constexpr Extended kInf = std::numeric_limits<Extended>::infinity();

// --- Density tables ---------------------------------------------------------------------------

// The PDFValues tables: empties the outputs, runs Checks (which raise before anything is built),
// then builds the N + 1 points XLow + i * step and their densities into local vectors and hands
// them over only when every point is done, so that a raise leaves the caller's outputs empty.
// With kZeroBelowZero a negative point gets density 0 without calling Density.
template <bool kZeroBelowZero, typename Checks, typename Density>
void DensityTable(Extended XLow, Extended XHigh, LongWord N, TQENFloatVector& XValues,
                  TQENFloatVector& YValues, Checks checks, Density density) {
  XValues.clear();
  YValues.clear();
  checks();
  const Extended step = N >= 1 ? (XHigh - XLow) / static_cast<Extended>(N) : Extended(0);
  const std::size_t count = static_cast<std::size_t>(N) + 1;
  TQENFloatVector xs(count);
  TQENFloatVector ys(count);
  for (std::size_t i = 0; i < count; ++i) {
    const Extended x = XLow + step * static_cast<Extended>(i);
    xs[i] = x;
    ys[i] = (kZeroBelowZero && x < 0) ? Extended(0) : density(x);
  }
  XValues = std::move(xs);
  YValues = std::move(ys);
}

// --- Checks -----------------------------------------------------------------------------------

// The rest are in detail/DistributionChecks.h.
void CheckDF(LongWord DF) {
  if (DF == 0) RaiseMathError(rsDF);
}

// --- Beta density, shared by the beta and F densities ------------------------------------------

// x^(a-1) (1-x)^(b-1) / B(a, b) on [0, 1], 0 outside. The direct product is used while its
// factors stay finite and normal; otherwise the logarithms carry it.
Extended BetaDensity(Extended x, Extended a, Extended b) {
  if (std::isnan(x)) return kNaN;
  if (x < 0 || x > 1) return 0;
  const Extended beta = Beta(a, b);
  const Extended left = XtoY(x, a - 1);
  const Extended right = XtoY(1 - x, b - 1);
  constexpr Extended kSmallest = std::numeric_limits<Extended>::min();
  const bool edge = x == 0 || x == 1;
  if (edge || (std::isfinite(beta) && beta > kSmallest && std::isfinite(left) && left > kSmallest &&
               std::isfinite(right) && right > kSmallest)) {
    return left * right / beta;
  }
  const Extended lnBeta = (std::isfinite(beta) && beta > kSmallest)
                              ? std::log(beta)
                              : LnGamma(a) + LnGamma(b) - LnGamma(a + b);
  return std::exp((a - 1) * std::log(x) + (b - 1) * std::log1p(-x) - lnBeta);
}

// ln Gamma(h + 1) - ((h + 1/2) ln h - h + ln sqrt(2 pi)), the error of Stirling's formula, for
// h > 0. Half-integers up to 15 come from a table (40-digit values), larger h from the
// asymptotic series, whose first neglected term is below 1e-21 of the result from 15 on.
Extended StirlingError(Extended h) {
  static constexpr Extended kHalfSteps[30] = {
      0.1534264097200273452913839L,   0.08106146679532725821967026L,
      0.0548141210519176538961387L,   0.04134069595540929409382208L,
      0.03316287351993628748511051L,  0.02767792568499833914878929L,
      0.02374616365629749597133028L,  0.02079067210376509311152277L,
      0.01848845053267318523077936L,  0.01664469118982119216319487L,
      0.01513497322191737887351384L,  0.01387612882307074799874573L,
      0.01281046524292022692425066L,  0.01189670994589177009505572L,
      0.01110455975820691732663076L,  0.01041126526197209649747857L,
      0.009799416126158803298390373L, 0.009255462182712732917728637L,
      0.008768700134139385462955047L, 0.008330563433362871256469319L,
      0.007934114564314020547249562L, 0.007573675487951840794972024L,
      0.007244554301320383179546197L, 0.006942840107209529865664153L,
      0.006665247032707682442356181L, 0.006408994188004207068439631L,
      0.006171712263039457647534605L, 0.005951370112758847735624416L,
      0.005746216513010115682026102L, 0.00555473355196280137103869L};
  if (h <= 15) {
    const Extended twice = 2 * h;
    if (twice == std::floor(twice) && twice >= 1) return kHalfSteps[static_cast<int>(twice) - 1];
    return LnGamma(h + 1) - (h + 0.5L) * std::log(h) + h - 0.5L * std::log(2 * QENPi);
  }
  // Bernoulli terms B(2k) / (2k (2k - 1) h^(2k - 1)), k = 1..9.
  static constexpr Extended kTerms[9] = {1.0L / 12,    -1.0L / 360,       1.0L / 1260,
                                         -1.0L / 1680, 1.0L / 1188,       -691.0L / 360360,
                                         1.0L / 156,   -3617.0L / 122400, 43867.0L / 244188};
  const Extended r2 = 1 / (h * h);
  Extended sum = kTerms[8];
  for (int k = 7; k >= 0; --k) sum = kTerms[k] + sum * r2;
  return sum / h;
}

// x ln(x / m) + m - x, the deviance of x from the mean m (x, m > 0), without the cancellation of
// its two halves when x is close to m.
Extended Deviance(Extended x, Extended m) {
  const Extended difference = x - m;
  if (std::fabs(difference) < 0.1L * (x + m)) {
    const Extended v = difference / (x + m);
    const Extended v2 = v * v;
    Extended sum = difference * v;
    Extended term = 2 * x * v;
    // |v| < 0.1: each round gains two decimal digits, so 12 rounds pass the 80-bit precision.
    for (int j = 1; j <= 16; ++j) {
      term *= v2;
      const Extended next = sum + term / (2 * j + 1);
      if (next == sum) break;
      sum = next;
    }
    return sum;
  }
  const Extended ratio = x / m;
  const Extended logRatio =
      std::isfinite(ratio) && ratio > 0 ? std::log(ratio) : std::log(x) - std::log(m);
  return x * logRatio + m - x;
}

// The binomial probability Gamma(n + 1) / (Gamma(k + 1) Gamma(n - k + 1)) p^k q^(n - k) for real
// 0 <= k <= n, with p + q = 1 given as two numbers so that neither is formed as 1 - the other.
// Saddle-point form (Loader, 2000): Stirling errors and deviances, no power of a number near 1.
Extended BinomialTerm(Extended k, Extended n, Extended p, Extended q) {
  if (p == 0) return k == 0 ? 1 : 0;
  if (q == 0) return k == n ? 1 : 0;
  if (k == 0)
    return n == 0 ? 1 : std::exp(p < 0.1L ? -Deviance(n, n * q) - n * p : n * std::log(q));
  if (k == n) return std::exp(q < 0.1L ? -Deviance(n, n * p) - n * q : n * std::log(p));
  const Extended exponent = StirlingError(n) - StirlingError(k) - StirlingError(n - k) -
                            Deviance(k, n * p) - Deviance(n - k, n * q);
  return std::exp(exponent) * std::sqrt(n / (2 * QENPi * k * (n - k)));
}

// Gamma(h + 1/2) / Gamma(h) for h = DF / 2: directly while Gamma stays finite, else by the
// asymptotic series of its logarithm (its first neglected term is below 1e-31 at h = 1500).
Extended HalfStepGammaRatio(Extended h) {
  if (h <= 1500) return Gamma(h + 0.5L) / Gamma(h);
  const Extended r = 1 / h;
  const Extended r2 = r * r;
  const Extended series =
      r * (-1.0L / 8 + r2 * (1.0L / 192 + r2 * (-1.0L / 640 + r2 * (17.0L / 14336))));
  return std::sqrt(h) * std::exp(series);
}

// --- Bisection shared by the chi-square and t inverses -----------------------------------------

// At most 100 halvings of [Low, High]; stops when Less(m) is within 1e-16 of P. The last
// midpoint is the result, so a root outside the bracket yields the nearer end.
template <typename Less>
Extended BisectProbability(Extended P, Extended Low, Extended High, Less less) {
  Extended mid = (Low + High) / 2;
  for (int round = 0; round < 100; ++round) {
    mid = (Low + High) / 2;
    const Extended value = less(mid);
    if (std::fabs(value - P) < 1e-16L) break;
    if (value > P) {
      High = mid;
    } else {
      Low = mid;
    }
  }
  return mid;
}

// The same bisection with the same midpoints and decisions, most of them settled without
// evaluating Less.
//
// For each end of the bracket whose value has been established, an interval [lo, hi] holding
// the exact distribution function F there is kept. Where the density f is monotone between a
// midpoint m and an established end x,
//   F(m) = F(x) + integral of f from x to m  lies within  F(x) + (m - x) [min f, max f],
// the extremes of f on [x, m] being its values at x and m; a unimodal f whose mode lies
// between them reaches its largest value there instead. density(t, down, up) encloses f(t)
// (both 0 where it cannot), modeBetween(a, b) tells whether the mode lies between a and b (and
// then modeDensity(up) bounds f there), and error(m, lo, hi, fUp) bounds how far Less(m) lies
// from F(m) for F(m) within [lo, hi] and f at most fUp about m (infinite where it is not known).
// When the interval for F(m), widened by that error, lies beyond P + 1e-16 or below P - 1e-16
// (with a margin for this function's own rounding), the evaluation could neither stop the
// search nor decide the other way, and the midpoint is settled without it. Otherwise Less(m)
// is evaluated and decides as in BisectProbability; its value, widened by the error, becomes
// the interval at m.
template <typename Less, typename Density, typename ModeBetween, typename ModeDensity,
          typename Error>
Extended BisectEnclosed(Extended P, Extended Low, Extended High, Less less, Density density,
                        ModeBetween modeBetween, ModeDensity modeDensity, Error error) {
  constexpr Extended kMargin = 1.01e-16L;
  struct End {
    Extended x;
    Extended lo, hi;      // the exact F(x) lies within
    Extended fDown, fUp;  // and f(x) within; fUp = 0 when unknown
  };
  End low{Low, 0, 1, 0, 0};
  End high{High, 0, 1, 0, 0};
  Extended mid = (Low + High) / 2;
  for (int round = 0; round < 100; ++round) {
    mid = (low.x + high.x) / 2;
    Extended fDown, fUp;
    density(mid, fDown, fUp);
    // The established end with the narrower interval (both lie half the bracket away).
    const End* end = nullptr;
    if (low.fUp > 0) end = &low;
    if (high.fUp > 0 && (end == nullptr || high.hi - high.lo < end->hi - end->lo)) end = &high;
    if (fUp > 0 && end != nullptr) {
      const Extended fLow = fDown < end->fDown ? fDown : end->fDown;
      Extended fHigh = fUp > end->fUp ? fUp : end->fUp;
      if (modeBetween(mid, end->x)) fHigh = modeDensity();
      const Extended delta = mid - end->x;  // exact: both lie within a factor 1.25
      const Extended lo0 = end->lo + delta * (delta >= 0 ? fLow : fHigh);
      const Extended hi0 = end->hi + delta * (delta >= 0 ? fHigh : fLow);
      const Extended pad = 0x1p-60L * (std::fabs(end->hi) + std::fabs(delta) * fHigh);
      const Extended lo = lo0 - pad;
      const Extended hi = hi0 + pad;
      const Extended err = error(mid, lo, hi, fHigh);
      if ((lo - err) - P > kMargin) {
        high = End{mid, lo, hi, fDown, fUp};
        continue;
      }
      if (P - (hi + err) > kMargin) {
        low = End{mid, lo, hi, fDown, fUp};
        continue;
      }
    }
    const Extended value = less(mid);
    if (std::fabs(value - P) < 1e-16L) break;
    const Extended err = error(mid, value, value, fUp);
    const End here{mid, value - err, value + err, fDown, std::isfinite(err) ? fUp : 0};
    if (value > P) {
      high = here;
    } else {
      low = here;
    }
  }
  return mid;
}

// The t distribution: on a bracket of one sign the density f is monotone. f is evaluated in
// double; its relative error is below 1.2e-15 |E| + 2.3e-16 (|ln scale| + 1) for the exponent
// E = -(n + 1)/2 log1p(t^2 / n) (the argument, the logarithm, the product and exp, each within
// 2 units in the last place, and the scale from the 80-bit gamma ratio), here bounded by
// 2e-15 (|E| + |ln scale| + 1).
// StudentTLess(m) itself differs from F(m) by at most
//   Err(m) = 2e-16 Fside + max f 4 u (n + m^2) / (2 |m|) + 1e-18,
// twice the documented error of IncompleteBeta (1e-16 relative to the two-sided tail 2 Fside,
// Fside = min(F, 1 - F)), plus what the rounding of its argument n / (n + m^2) by 3 units
// u = 2^-64 moves F, plus the rounding of the final sums.
Extended BisectStudentT(Extended P, Extended Low, Extended High, LongWord DF) {
  const auto less = [DF](Extended t) { return StudentTLess(t, DF); };
  if (!(Low > 0 || High < 0) || !std::isfinite(Low) || !std::isfinite(High)) {
    return BisectProbability(P, Low, High, less);
  }
  const Extended n = DF;
  const double nD = static_cast<double>(DF);
  const double halfN1 = (nD + 1) / 2;  // exact: DF < 2^32
  const double logScale =
      static_cast<double>(std::log(HalfStepGammaRatio(n / 2) / std::sqrt(n * QENPi)));
  const double scaleError = 2e-15 * (std::fabs(logScale) + 1);
  // 4 u (n + m^2) / (2 |m|) for every m of the bracket.
  const Extended inner = std::fabs(Low) < std::fabs(High) ? std::fabs(Low) : std::fabs(High);
  const Extended outer = std::fabs(Low) < std::fabs(High) ? std::fabs(High) : std::fabs(Low);
  const Extended argumentFactor = 0x1p-62L * (n + outer * outer) / (2 * inner);

  // The density's bounds at t; both 0 where the double evaluation could lose range.
  const auto density = [&](Extended t, Extended& down, Extended& up) {
    const double td = static_cast<double>(t);
    const double e = -halfN1 * std::log1p(td * td / nD);
    const double exponent = logScale + e;
    if (!(exponent > -700 && exponent < 700)) {
      down = up = 0;
      return;
    }
    const double f = std::exp(exponent);
    const double error = 2e-15 * std::fabs(e) + scaleError;
    down = f - f * error;
    up = f + f * error;
  };
  const auto evaluationError = [&](Extended m, Extended lo, Extended hi, Extended fUp) {
    const Extended side = m < 0 ? hi : 1 - lo;
    return 2e-16L * (side > 0 ? side : 0) + fUp * argumentFactor + 1e-18L;
  };
  return BisectEnclosed(
      P, Low, High, less, density, [](Extended, Extended) { return false; },
      [] { return Extended(0); }, evaluationError);
}

// --- AS 241 -----------------------------------------------------------------------------------

template <std::size_t N>
Extended Horner(const Extended (&c)[N], Extended x) {
  Extended sum = c[N - 1];
  for (std::size_t i = N - 1; i-- > 0;) sum = sum * x + c[i];
  return sum;
}

// Wichura's PPND16 coefficients, lowest degree first.
constexpr Extended kA[] = {3.3871328727963666080e0L,  1.3314166789178437745e+2L,
                           1.9715909503065514427e+3L, 1.3731693765509461125e+4L,
                           4.5921953931549871457e+4L, 6.7265770927008700853e+4L,
                           3.3430575583588128105e+4L, 2.5090809287301226727e+3L};
constexpr Extended kB[] = {1.0L,
                           4.2313330701600911252e+1L,
                           6.8718700749205790830e+2L,
                           5.3941960214247511077e+3L,
                           2.1213794301586595867e+4L,
                           3.9307895800092710610e+4L,
                           2.8729085735721942674e+4L,
                           5.2264952788528545610e+3L};
constexpr Extended kC[] = {1.42343711074968357734e0L,  4.63033784615654529590e0L,
                           5.76949722146069140550e0L,  3.64784832476320460504e0L,
                           1.27045825245236838258e0L,  2.41780725177450611770e-1L,
                           2.27238449892691845833e-2L, 7.74545014278341407640e-4L};
constexpr Extended kD[] = {1.0L,
                           2.05319162663775882187e0L,
                           1.67638483018380384940e0L,
                           6.89767334985100004550e-1L,
                           1.48103976427480074590e-1L,
                           1.51986665636164571966e-2L,
                           5.47593808499534494600e-4L,
                           1.05075007164441684324e-9L};
constexpr Extended kE[] = {6.65790464350110377720e0L,  5.46378491116411436990e0L,
                           1.78482653991729133580e0L,  2.96560571828504891230e-1L,
                           2.65321895265761230930e-2L, 1.24266094738807843860e-3L,
                           2.71155556874348757815e-5L, 2.01033439929228813265e-7L};
constexpr Extended kF[] = {1.0L,
                           5.99832206555887937690e-1L,
                           1.36929880922735805310e-1L,
                           1.48753612908506148525e-2L,
                           7.86869131145613259100e-4L,
                           1.84631831751005468180e-5L,
                           1.42151175831644588870e-7L,
                           2.04426310338993978564e-15L};

// --- AS 91 ------------------------------------------------------------------------------------

// Best and Roberts' starting value for the chi-square quantile, with the published constants
// (the seventh-order Taylor step uses 175 and 264 in S5, the values that make it seventh order).
// Returns -1, the algorithm's failure value, for P outside [0.000002, 0.999998] or V <= 0.
// Both loops are capped (20 Taylor steps, as in the later revisions of the algorithm).
Extended AS91Start(Extended P, Extended V) {
  constexpr Extended kE = 0.5e-6L, kAA = 0.6931471806L;
  constexpr Extended kPMin = 0.000002L, kPMax = 0.999998L;
  constexpr Extended C1 = 0.01L, C2 = 0.222222L, C3 = 0.32L, C4 = 0.4L, C5 = 1.24L, C6 = 2.2L,
                     C7 = 4.67L, C8 = 6.66L, C9 = 6.73L, C10 = 13.32L, C11 = 60, C12 = 70, C13 = 84,
                     C14 = 105, C15 = 120, C16 = 127, C17 = 140, C18 = 175, C19 = 210, C20 = 252,
                     C21 = 264, C22 = 294, C23 = 346, C24 = 420, C25 = 462, C26 = 606, C27 = 672,
                     C28 = 707, C29 = 735, C30 = 889, C31 = 932, C32 = 966, C33 = 1141, C34 = 1182,
                     C35 = 1278, C36 = 1740, C37 = 2520, C38 = 5040;
  if (!(P >= kPMin && P <= kPMax) || !(V > 0)) return -1;
  const Extended g = LnGamma(V / 2);
  const Extended xx = V / 2;
  const Extended c = xx - 1;
  Extended ch;
  if (V < -C5 * std::log(P)) {
    // Small chi-square.
    ch = XtoY(P * xx * std::exp(g + xx * kAA), 1 / xx);
    if (ch < kE) return ch;
  } else if (V <= C3) {
    // Very small degrees of freedom: iterate on the small-V expansion.
    ch = C4;
    const Extended a = std::log(1 - P);
    for (int round = 0; round < 100; ++round) {
      const Extended q = ch;
      const Extended p1 = 1 + ch * (C7 + ch);
      const Extended p2 = ch * (C9 + ch * (C8 + ch));
      const Extended t = -0.5L + (C7 + 2 * ch) / p1 - (C9 + ch * (C10 + 3 * ch)) / p2;
      ch = ch - (1 - std::exp(a + g + 0.5L * ch + c * kAA) * p2 / p1) / t;
      if (!(std::fabs(q / ch - 1) > C1)) break;
    }
  } else {
    // Wilson and Hilferty, with the correction for P near 1.
    const Extended x = InvNormalLess(P);
    const Extended p1 = C2 / V;
    const Extended w = x * std::sqrt(p1) + 1 - p1;
    ch = V * w * w * w;
    if (ch > C6 * V + 6) ch = -2 * (std::log(1 - P) - c * std::log(0.5L * ch) + g);
  }
  for (int round = 0; round < 20; ++round) {
    const Extended q = ch;
    const Extended p1 = 0.5L * ch;
    const Extended p2 = P - IncompleteGamma(xx, p1);
    const Extended t = p2 * std::exp(xx * kAA + g + p1 - c * std::log(ch));
    const Extended b = t / ch;
    const Extended a = 0.5L * t - b * c;
    const Extended s1 = (C19 + a * (C17 + a * (C14 + a * (C13 + a * (C12 + C11 * a))))) / C24;
    const Extended s2 = (C24 + a * (C29 + a * (C32 + a * (C33 + C35 * a)))) / C37;
    const Extended s3 = (C19 + a * (C25 + a * (C28 + C31 * a))) / C37;
    const Extended s4 = (C20 + a * (C27 + C34 * a) + c * (C22 + a * (C30 + C36 * a))) / C38;
    const Extended s5 = (C13 + C21 * a + c * (C18 + C26 * a)) / C37;
    const Extended s6 = (C15 + c * (C23 + C16 * c)) / C38;
    ch = ch + t * (1 + 0.5L * t * s1 -
                   b * c * (s1 - b * (s2 - b * (s3 - b * (s4 - b * (s5 - b * s6))))));
    if (!(std::fabs(q / ch - 1) > kE)) break;
  }
  return ch;
}

// --- Student t starting value -----------------------------------------------------------------

// The t with upper-tail probability Q (0 < Q <= 1/2) and n degrees of freedom: exact for
// n = 1 and 2, otherwise Hill's expansion (Comm. ACM 13, 1970, algorithm 396), which is good
// to a few parts in 1e6 and so lies well inside the +-10 % bracket of the bisection.
Extended StudentTStart(Extended Q, LongWord DF) {
  if (DF == 1) return std::cos(QENPi * Q) / std::sin(QENPi * Q);
  if (DF == 2) return (1 - 2 * Q) / std::sqrt(2 * Q * (1 - Q));
  const Extended n = DF;
  const Extended P = 2 * Q;  // two-sided probability
  const Extended a = 1 / (n - 0.5L);
  const Extended b = 48 / (a * a);
  Extended c = ((20700 * a / b - 98) * a - 16) * a + 96.36L;
  const Extended d = ((94.5L / (b + c) - 3) / b + 1) * std::sqrt(a * QENPi / 2) * n;
  Extended y = XtoY(d * P, 2 / n);
  if (y > 0.05L + a) {
    // Asymptotic inverse expansion about the normal deviate.
    const Extended x = InvNormalLess(Q);  // negative
    y = x * x;
    if (DF < 5) c += 0.3L * (n - 4.5L) * (x + 0.6L);
    c = (((0.05L * d * x - 5) * x - 7) * x - 2) * x + b + c;
    y = (((((0.4L * y + 6.3L) * y + 36) * y + 94.5L) / c - y - 3) / b + 1) * x;
    y = std::expm1(a * y * y);
  } else {
    y = ((1 / (((n + 6) / (n * y) - 0.089L * d - 0.822L) * (n + 2) * 3) + 0.5L / (n + 4)) * y - 1) *
            (n + 1) / (n + 2) +
        1 / y;
  }
  return std::sqrt(n * y);
}

// --- Ridders' method for the F inverse ---------------------------------------------------------

bool SameSign(Extended a, Extended b) { return (a > 0 && b > 0) || (a < 0 && b < 0); }

}  // namespace

// === Standard normal ============================================================================

Extended NormalZ(Extended Z) { return std::exp(-Z * Z / 2) / std::sqrt(TwoPi); }

Extended NormalLess(Extended Z) {
  const Extended phi = NormalZ(Z);
  if (!(phi >= 1e-20L)) return Z > 0 ? 1 : 0;
  const Extended z2 = Z * Z;
  Extended term = Z, sum = Z, denominator = 1, previous = 0, result = 0.5L;
  for (int k = 1; k <= 100; ++k) {
    term *= z2;
    denominator *= static_cast<Extended>(2 * k + 1);
    sum += term / denominator;
    result = phi * sum + 0.5L;
    if (std::fabs(result - previous) < 1e-18L) break;
    previous = result;
  }
  return result;
}

Extended NormalGreater(Extended Z) { return 1 - NormalLess(Z); }

Extended InvNormalLess(Extended P) {
  CheckOpenProbability(P);
  const Extended q = P - 0.5L;
  if (std::fabs(q) <= 0.425L) {
    const Extended r = 0.180625L - q * q;
    return q * Horner(kA, r) / Horner(kB, r);
  }
  Extended r = std::sqrt(-std::log(q < 0 ? P : 1 - P));
  Extended value;
  if (r <= 5) {
    r -= 1.6L;
    value = Horner(kC, r) / Horner(kD, r);
  } else {
    r -= 5;
    value = Horner(kE, r) / Horner(kF, r);
  }
  return q < 0 ? -value : value;
}

Extended InvNormalGreater(Extended P) {
  CheckOpenProbability(P);
  return InvNormalLess(1 - P);
}

Extended ZAlpha(Extended Alpha) { return InvNormalDistGreater(0, 1, Alpha); }

// === Normal with parameters =====================================================================

Extended NormalPDF(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  const Extended d = X - Mean;
  return std::exp(-d * d / (2 * StdDev * StdDev)) / (StdDev * std::sqrt(TwoPi));
}

void NormalPDFValues(Extended Mean, Extended StdDev, Extended XLow, Extended XHigh, LongWord N,
                     TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<false>(
      XLow, XHigh, N, XValues, YValues, [&] { CheckStdDev(StdDev); },
      [&](Extended x) { return NormalPDF(Mean, StdDev, x); });
}

Extended NormalDistLess(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  const Extended z = (X - Mean) / StdDev;
  if (z < 0) return 1 - NormalLess((Mean - X) / StdDev);
  return NormalLess(z);
}

Extended NormalDistGreater(Extended Mean, Extended StdDev, Extended X) {
  return 1 - NormalDistLess(Mean, StdDev, X);
}

Extended NormalDistBetween(Extended Mean, Extended StdDev, Extended X1, Extended X2) {
  CheckStdDev(StdDev);
  if (SameFloat(X1, X2)) return 0;
  const Extended difference = NormalDistLess(Mean, StdDev, X2) - NormalDistLess(Mean, StdDev, X1);
  return X2 < X1 ? -difference : difference;
}

Extended InvNormalDistLess(Extended Mean, Extended StdDev, Extended P) {
  return NormalQuantile(Mean, StdDev, P, InvNormalLess);
}

Extended InvNormalDistGreater(Extended Mean, Extended StdDev, Extended P) {
  return NormalQuantile(Mean, StdDev, P, InvNormalGreater);
}

// === Log-normal =================================================================================

Extended LogNormalPDF(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  if (!(X > 0)) RaiseMathError(rsValueGZero);
  const Extended d = std::log(X) - Mean;
  return std::exp(-d * d / (2 * StdDev * StdDev)) / (X * StdDev * std::sqrt(TwoPi));
}

Extended LogNormalLess(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  if (std::isnan(X)) return kNaN;
  if (X <= 0) return 0;
  return NormalDistLess(Mean, StdDev, std::log(X));
}

Extended LogNormalGreater(Extended Mean, Extended StdDev, Extended X) {
  return 1 - LogNormalLess(Mean, StdDev, X);
}

Extended LogNormalBetween(Extended Mean, Extended StdDev, Extended X1, Extended X2) {
  CheckStdDev(StdDev);
  return LogNormalLess(Mean, StdDev, X2) - LogNormalLess(Mean, StdDev, X1);
}

Extended InvLogNormalLess(Extended Mean, Extended StdDev, Extended P) {
  CheckOpenProbability(P);
  CheckInverseStdDev(StdDev);
  return std::exp(Mean + StdDev * InvNormalLess(P));
}

Extended InvLogNormalGreater(Extended Mean, Extended StdDev, Extended P) {
  CheckOpenProbability(P);
  CheckInverseStdDev(StdDev);
  return std::exp(Mean + StdDev * InvNormalGreater(P));
}

void LogNormalPDFValues(Extended Mean, Extended StdDev, Extended XLow, Extended XHigh, LongWord N,
                        TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<false>(
      XLow, XHigh, N, XValues, YValues,
      [&] {
        CheckStdDev(StdDev);
        // The points run monotonically from XLow to XHigh, so the smaller end decides.
        const Extended step = N >= 1 ? (XHigh - XLow) / static_cast<Extended>(N) : Extended(0);
        const Extended last = XLow + step * static_cast<Extended>(N);
        if (!(XLow > 0) || !(last > 0)) RaiseMathError(rsValueGZero);
      },
      [&](Extended x) { return LogNormalPDF(Mean, StdDev, x); });
}

// === Incomplete gamma ===========================================================================

namespace {

// LnGamma(A + 1) and LnGamma(A), for the series and the continued fraction of IncompleteGamma:
// given by a caller that evaluates many points of one shape, else formed on the way.
struct GammaLogs {
  Extended lnGammaA1;
  Extended lnGammaA;
};

// IncompleteGamma after its checks.
Extended IncompleteGammaWith(Extended A, Extended X, const GammaLogs* logs) {
  if (std::isnan(A) || std::isnan(X)) return kNaN;
  Extended result = 0;
  if (FloatIsZero(X)) return result;
  if (X > 1e8L) return 1;
  if (std::isinf(A)) return result;
  if (X <= 1 || X < A) {
    // Series of the lower tail.
    Extended term = 1, sum = 1, b = A;
    do {
      b += 1;
      term = term * X / b;
      sum += term;
    } while (term > QENTolerance);
    const Extended lnGammaA1 = logs != nullptr ? logs->lnGammaA1 : LnGamma(A + 1);
    const Extended e = A * std::log(X) - X - lnGammaA1 + std::log(sum);
    if (e >= -88) result = std::exp(e);
    return result;
  }
  // Continued fraction of the upper tail, by the three-term recurrences.
  constexpr Extended kOverflow = 1.7e308L;
  Extended a0 = 1, b0 = X, a1 = X + 1, b1 = (X + 2 - A) * X;
  Extended f = a1 / b1;
  Extended shifted = 1 - A;  // n + 1 - A before its first increment
  Extended denominatorTerm = X + 2 - A;
  for (Extended n = 1;; n += 1) {
    shifted += 1;
    denominatorTerm += 2;
    const Extended numeratorTerm = n * shifted;
    const Extended a2 = denominatorTerm * a1 - numeratorTerm * a0;
    const Extended b2 = denominatorTerm * b1 - numeratorTerm * b0;
    if (std::fabs(b2) > 0) {
      const Extended fNew = a2 / b2;
      const Extended change = std::fabs(f - fNew);
      f = fNew;
      if (change <= MinXY(fNew * QENTolerance, QENTolerance)) break;
    }
    a0 = a1;
    b0 = b1;
    a1 = a2;
    b1 = b2;
    if (std::fabs(a1) >= kOverflow) {
      a0 /= kOverflow;
      b0 /= kOverflow;
      a1 /= kOverflow;
      b1 /= kOverflow;
    }
  }
  const Extended lnGammaA = logs != nullptr ? logs->lnGammaA : LnGamma(A);
  const Extended e = A * std::log(X) - X - lnGammaA + std::log(f);
  result = 1;
  if (e >= -88) result = 1 - std::exp(e);
  return result;
}

}  // namespace

Extended IncompleteGamma(Extended A, Extended X) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (A <= 0) RaiseMathError(rsValueGZero);
  return IncompleteGammaWith(A, X, nullptr);
}

Extended IncompleteGamma2(Extended A, Extended X) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (A <= 0) RaiseMathError(rsValueGZero);
  if (std::isnan(A) || std::isnan(X)) return kNaN;
  // Round half to even, as the runtime's Round; degrees of freedom beyond LongWord saturate
  // (Gamma(A) has long overflowed there).
  const Extended twiceA = std::nearbyint(2 * A);
  const LongWord df =
      twiceA >= 4294967295.0L ? LongWord(4294967295U) : static_cast<LongWord>(twiceA);
  return ChiSquareGreater(2 * X, df) * Gamma(A);
}

// === Chi-square =================================================================================

Extended ChiSquareLess(Extended X, LongWord DF) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  CheckDF(DF);
  return IncompleteGamma(static_cast<Extended>(DF) / 2, X / 2);
}

Extended ChiSquareGreater(Extended X, LongWord DF) { return 1 - ChiSquareLess(X, DF); }

Extended ChiSquareBetween(Extended X1, Extended X2, LongWord DF) {
  return ChiSquareLess(X2, DF) - ChiSquareLess(X1, DF);
}

namespace {

// The bisection of InvChiSquareLess, settled by BisectEnclosed: ChiSquareLess(x) is
// P(A, X) for A = DF / 2, X = x / 2, evaluated with LnGamma(A + 1) and LnGamma(A) formed once
// (the same values). The density f(x) = X^(A - 1) e^-X / (2 Gamma(A)) is unimodal (decreasing
// for A <= 1, else largest at X = A - 1) and is evaluated in double from the exponent
// E = (A - 1) ln X - X - ln Gamma(A) - ln 2: rounding x to double, the logarithm, the products,
// the sums and ln Gamma(A) in double move E by at most
// 1.2e-15 (|A - 1| (|ln X| + 1) + X + |ln Gamma(A)| + 1), and exp adds 2.3e-16.
//
// Where IncompleteGamma takes its series (X <= 1 or X < A), its value differs from P(A, X) by
//  - the series' tail beyond the first term at most QENTolerance: the later terms shrink by
//    factors of at most rho = X / (A + 2) < 1, so the tail is below QENTolerance rho / (1 - rho),
//    relative to the sum, which is at least 1;
//  - the rounding of the sum's K terms, below (3 K + 1) u (u = 2^-64), where the terms fall
//    below QENTolerance (above e^-27) after at most K = 40 + A + sqrt(108 A) of them: the
//    products of X / (A + k) < A / (A + k) fall below e^-27 by then;
//  - the rounding of the exponent e = A ln X - X - ln Gamma(A + 1) + ln(sum): the logarithms
//    within 4 u, the product and the three sums within u of the parts' magnitudes, ln Gamma
//    within 1e-17 (well above its measured error), ln(sum) <= X; and expl's 2 u.
// On its continued fraction (the other X) no such bound is stated: there the error is infinite
// and the midpoint is evaluated. IncompleteGamma's two cut-offs (0 for X below QENTolerance,
// 1 above 1e8) are evaluated too.
Extended BisectChiSquare(Extended P, Extended Low, Extended High, LongWord DF) {
  const Extended a = static_cast<Extended>(DF) / 2;
  const GammaLogs logs{LnGamma(a + 1), LnGamma(a)};
  const auto less = [a, &logs](Extended x) { return IncompleteGammaWith(a, x / 2, &logs); };
  if (!(Low >= 0) || !std::isfinite(High)) return BisectProbability(P, Low, High, less);
  constexpr double kU = 0x1p-64;
  const double aD = static_cast<double>(a);  // exact: DF < 2^32
  const double lnGammaA = static_cast<double>(logs.lnGammaA);
  const double lnGammaA1 = std::fabs(static_cast<double>(logs.lnGammaA1));
  const double maxTerms = 40 + aD + std::sqrt(108 * aD);
  const auto density = [&](Extended x, Extended& down, Extended& up) {
    const double half = static_cast<double>(x) / 2;
    down = up = 0;
    if (!(half > 0)) return;
    const double lnX = std::log(half);
    const double exponent = (aD - 1) * lnX - half - lnGammaA - 0.6931471805599453;
    const double error =
        1.2e-15 * (std::fabs(aD - 1) * (std::fabs(lnX) + 1) + half + std::fabs(lnGammaA) + 1);
    if (!(exponent > -700 && exponent < 700) || !(error < 1e-3)) return;
    const double f = std::exp(exponent);
    const double relative = 1.01 * error + 2.3e-16;
    down = f - f * relative;
    up = f + f * relative;
  };
  const Extended modeX = 2 * (a - 1);  // the mode in x, for A > 1
  Extended modeUp = -1;                // formed on first use
  const auto modeBetween = [&](Extended m, Extended x) {
    return a > 1 && (m < modeX) != (x < modeX);
  };
  const auto modeDensity = [&] {
    if (modeUp < 0) {
      Extended down;
      density(modeX, down, modeUp);
      if (!(modeUp > 0)) modeUp = kInf;
    }
    return modeUp;
  };
  const auto evaluationError = [&](Extended m, Extended, Extended hi, Extended) {
    const Extended x = m / 2;  // IncompleteGamma's own tests on its argument
    if (!(x >= 2 * QENTolerance) || x > 1e8L || !(x <= 1 || x < a)) return kInf;
    const double half = static_cast<double>(x);
    const double rho = half / (aD + 2);
    const double lnX = std::fabs(std::log(half));
    const double relative =
        1.01 * static_cast<double>(QENTolerance) * rho / (1 - rho) +
        kU * (10 * aD * (lnX + 1e-3) + 12 * half + 4 * lnGammaA1 + 3 * maxTerms + 8) +
        1e-17 * lnGammaA1;
    return 1.02L * Extended(relative) * (hi > 0 ? hi : 0) + 1e-19L;
  };
  return BisectEnclosed(P, Low, High, less, density, modeBetween, modeDensity, evaluationError);
}

}  // namespace

Extended InvChiSquareLess(Extended P, LongWord DF) {
  CheckDF(DF);
  const Extended g = AS91Start(P, static_cast<Extended>(DF));
  if (!(g >= 0)) RaiseMathError(rsValueGEZero);
  return BisectChiSquare(P, MaxXY(Extended(0), g - g / 10), g + g / 10, DF);
}

Extended InvChiSquareGreater(Extended P, LongWord DF) { return InvChiSquareLess(1 - P, DF); }

Extended ChiSquarePDF(Extended X, LongWord DF) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  CheckDF(DF);
  const Extended half = static_cast<Extended>(DF) / 2;
  const Extended density = XtoY(X, half - 1) * std::exp(-X / 2) / (TwoToY(half) * Gamma(half));
  // Past about 3500 degrees of freedom the factors overflow (inf / inf); the logarithms then
  // give the value the product cannot hold.
  if (!std::isfinite(density) && X > 0 && std::isfinite(X)) {
    return std::exp((half - 1) * std::log(X) - X / 2 - half * 0.693147180559945309417232121458L -
                    LnGamma(half));
  }
  return density;
}

void ChiSquarePDFValues(LongWord DF, Extended XLow, Extended XHigh, LongWord N,
                        TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<true>(
      XLow, XHigh, N, XValues, YValues, [&] { CheckDF(DF); },
      [DF](Extended x) { return ChiSquarePDF(x, DF); });
}

// === F ==========================================================================================

Extended FDistLess(Extended X, LongWord DF1, LongWord DF2) {
  if (!(X > 0)) RaiseMathError(rsValueGZero);
  if (DF1 == 0 || DF2 == 0) RaiseMathError(rsDF);
  const Extended d1 = DF1, d2 = DF2;
  const Extended w = d2 / (d2 + X * d1);
  return 1 - IncompleteBeta(w, d2 / 2, d1 / 2);
}

Extended FDistGreater(Extended X, LongWord DF1, LongWord DF2) { return 1 - FDistLess(X, DF1, DF2); }

Extended FDistBetween(Extended X1, Extended X2, LongWord DF1, LongWord DF2) {
  return FDistLess(X2, DF1, DF2) - FDistLess(X1, DF1, DF2);
}

Extended InvFDistLess(Extended P, LongWord DF1, LongWord DF2) {
  CheckClosedProbability(P);
  if (DF1 == 0 || DF2 == 0) RaiseMathError(rsDF);
  if (P == 1) return 0;
  const auto f = [&](Extended x) { return FDistLess(x, DF1, DF2) - P; };
  // Bracket: push the end with the smaller value outwards by 1.6 bracket widths.
  Extended x1 = 1e-16L, x2 = 100;
  Extended f1 = f(x1), f2 = f(x2);
  for (int round = 0; round < 99 && SameSign(f1, f2); ++round) {
    if (std::fabs(f1) < std::fabs(f2)) {
      x1 += 1.6L * (x1 - x2);
      f1 = f(x1);
    } else {
      x2 += 1.6L * (x2 - x1);
      f2 = f(x2);
    }
  }
  if (SameSign(f1, f2) || std::isnan(f1) || std::isnan(f2)) RaiseMathError(rsInvalidValue);
  if (f1 == 0) return x1;
  if (f2 == 0) return x2;
  // Ridders' method.
  Extended xl = x1, fl = f1, xh = x2, fh = f2;
  Extended estimate = kNaN;
  for (int round = 0; round < 100; ++round) {
    const Extended xm = (xl + xh) / 2;
    const Extended fm = f(xm);
    const Extended s = std::sqrt(fm * fm - fl * fh);
    if (s == 0) return round == 0 ? xm : estimate;
    const Extended xNew = xm + (xm - xl) * ((fl >= fh ? 1 : -1) * fm / s);
    if (round > 0 && std::fabs(xNew - estimate) <= 1e-16L) return xNew;
    estimate = xNew;
    const Extended fNew = f(estimate);
    if (FloatIsZero(fNew)) return estimate;
    if (SignXY(fm, fNew) != fm) {
      xl = xm;
      fl = fm;
      xh = estimate;
      fh = fNew;
    } else if (SignXY(fl, fNew) != fl) {
      xh = estimate;
      fh = fNew;
    } else if (SignXY(fh, fNew) != fh) {
      xl = estimate;
      fl = fNew;
    } else {
      RaiseMathError(rsInvalidValue);
    }
  }
  RaiseMathError(rsInvalidValue);
}

Extended InvFDistGreater(Extended P, LongWord DF1, LongWord DF2) {
  CheckClosedProbability(P);
  return InvFDistLess(1 - P, DF1, DF2);
}

Extended FDistPDF(Extended X, LongWord DF1, LongWord DF2) {
  if (DF1 == 0 || DF2 == 0) RaiseMathError(rsDF);
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (std::isnan(X)) return kNaN;
  if (std::isinf(X)) return 0;
  // With p = d1 x / (d2 + d1 x) and q = d2 / (d2 + d1 x), the density is a binomial term:
  // (d1 q / 2) b((d1 - 2) / 2; (d1 + d2 - 2) / 2, p) for d1 >= 2, and
  // d1^2 q / (2 p (d1 + d2)) b(d1 / 2; (d1 + d2) / 2, p) for d1 = 1.
  const Extended d1 = DF1, d2 = DF2;
  if (X == 0) return DF1 > 2 ? 0 : DF1 == 2 ? 1 : kInf;
  const Extended d1x = d1 * X;
  const Extended sum = d2 + d1x;
  Extended p = d1x / sum;
  Extended q = d2 / sum;
  if (!std::isfinite(d1x)) {  // only for X beyond 1e4922: q underflows anyway
    p = 1;
    q = d2 / d1 / X;
  }
  if (DF1 >= 2) return d1 * q / 2 * BinomialTerm((d1 - 2) / 2, (d1 + d2 - 2) / 2, p, q);
  return d1 * d1 * q / (2 * p * (d1 + d2)) * BinomialTerm(d1 / 2, (d1 + d2) / 2, p, q);
}

void FDistPDFValues(LongWord DF1, LongWord DF2, Extended XLow, Extended XHigh, LongWord N,
                    TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<true>(
      XLow, XHigh, N, XValues, YValues,
      [&] {
        if (DF1 == 0 || DF2 == 0) RaiseMathError(rsDF);
      },
      [=](Extended x) { return FDistPDF(x, DF1, DF2); });
}

// === Student t ==================================================================================

Extended StudentTLess(Extended T, LongWord DF) {
  CheckDF(DF);
  if (std::isnan(T)) return kNaN;
  const Extended n = DF;
  // I = 1 - A(|T|), the two-sided probability beyond |T|.
  const Extended tail = IncompleteBeta(n / (n + T * T), n / 2, 0.5L);
  if (T >= 0) return (1 - tail) / 2 + 0.5L;
  return tail / 2;
}

Extended StudentTGreater(Extended T, LongWord DF) { return 1 - StudentTLess(T, DF); }

Extended StudentTBetween(Extended T1, Extended T2, LongWord DF) {
  return StudentTLess(T2, DF) - StudentTLess(T1, DF);
}

Extended InvStudentTLess(Extended P, LongWord DF) {
  CheckClosedProbability(P);
  CheckDF(DF);
  if (P == 0) return -kInf;
  if (P == 1) return kInf;
  const Extended g = P <= 0.5L ? -StudentTStart(P, DF) : StudentTStart(1 - P, DF);
  const Extended end1 = g - g / 10, end2 = g + g / 10;
  return BisectStudentT(P, MinXY(end1, end2), MaxXY(end1, end2), DF);
}

Extended InvStudentTGreater(Extended P, LongWord DF) {
  CheckClosedProbability(P);
  return InvStudentTLess(1 - P, DF);
}

Extended StudentTPDF(Extended T, LongWord DF) {
  CheckDF(DF);
  const Extended n = DF;
  const Extended scale = HalfStepGammaRatio(n / 2) / std::sqrt(n * QENPi);
  return scale * std::exp(-(n + 1) / 2 * std::log1p(T * T / n));
}

void StudentTPDFValues(LongWord DF, Extended XLow, Extended XHigh, LongWord N,
                       TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<false>(
      XLow, XHigh, N, XValues, YValues, [&] { CheckDF(DF); },
      [DF](Extended t) { return StudentTPDF(t, DF); });
}

// === Exponential ================================================================================

Extended ExponentialLess(Extended Mean, Extended X) {
  if (Mean <= 0 || X < 0) RaiseMathError(rsExpDistInvalid);
  const Extended lambda = 1 / Mean;
  return 1 - std::exp(-X * lambda);
}

Extended ExponentialGreater(Extended Mean, Extended X) { return 1 - ExponentialLess(Mean, X); }

Extended ExponentialBetween(Extended Mean, Extended X1, Extended X2) {
  return ExponentialLess(Mean, X2) - ExponentialLess(Mean, X1);
}

Extended ExponentialPDF(Extended X, Extended Mean) {
  if (!(Mean > 0) || X < 0) RaiseMathError(rsExpDistInvalid);
  const Extended lambda = 1 / Mean;
  return std::exp(-lambda * X) * lambda;
}

void ExponentialPDFValues(Extended Mean, Extended XLow, Extended XHigh, LongWord N,
                          TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<true>(
      XLow, XHigh, N, XValues, YValues,
      [&] {
        if (!(Mean > 0)) RaiseMathError(rsExpDistInvalid);
      },
      [Mean](Extended x) { return ExponentialPDF(x, Mean); });
}

// === Beta =======================================================================================

namespace {

// The interval [Lower, Upper] in increasing order; equal bounds raise rsSameValue.
std::pair<Extended, Extended> BetaInterval(Extended Lower, Extended Upper) {
  if (Lower == Upper) RaiseMathError(rsSameValue);
  return Lower < Upper ? std::pair{Lower, Upper} : std::pair{Upper, Lower};
}

}  // namespace

Extended BetaDistLess(Extended X, Extended A, Extended B) {
  CheckBetaShapes(A, B);
  if (std::isnan(X)) return kNaN;
  if (X <= 0) return 0;
  if (X >= 1) return 1;
  return IncompleteBeta(X, A, B);
}

Extended BetaDistLess(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  return BetaDistLess((X - low) / (high - low), A, B);
}

Extended BetaDistGreater(Extended X, Extended A, Extended B) { return 1 - BetaDistLess(X, A, B); }

Extended BetaDistGreater(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  return 1 - BetaDistLess(X, A, B, Lower, Upper);
}

Extended BetaDistBetween(Extended X1, Extended X2, Extended A, Extended B) {
  return BetaDistLess(X2, A, B) - BetaDistLess(X1, A, B);
}

Extended BetaDistBetween(Extended X1, Extended X2, Extended A, Extended B, Extended Lower,
                         Extended Upper) {
  return BetaDistLess(X2, A, B, Lower, Upper) - BetaDistLess(X1, A, B, Lower, Upper);
}

Extended InvBetaDistLess(Extended P, Extended A, Extended B) {
  CheckClosedProbability(P);
  CheckBetaShapes(A, B);
  if (P == 0) return 0;
  if (P == 1) return 1;
  return InverseIncompleteBeta(P, A, B);
}

Extended InvBetaDistLess(Extended P, Extended A, Extended B, Extended Lower, Extended Upper) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  return low + (high - low) * InvBetaDistLess(P, A, B);
}

Extended InvBetaDistGreater(Extended P, Extended A, Extended B) {
  CheckClosedProbability(P);
  return InvBetaDistLess(1 - P, A, B);
}

Extended InvBetaDistGreater(Extended P, Extended A, Extended B, Extended Lower, Extended Upper) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  return low + (high - low) * InvBetaDistGreater(P, A, B);
}

Extended BetaPDF(Extended X, Extended A, Extended B) {
  CheckBetaShapes(A, B);
  return BetaDensity(X, A, B);
}

Extended BetaPDF(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  return BetaPDF((X - low) / (high - low), A, B) / (high - low);
}

void BetaPDFValues(Extended A, Extended B, Extended XLow, Extended XHigh, LongWord N,
                   TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<false>(
      XLow, XHigh, N, XValues, YValues, [&] { CheckBetaShapes(A, B); },
      [=](Extended x) { return BetaPDF(x, A, B); });
}

void BetaPDFValues(Extended A, Extended B, Extended Lower, Extended Upper, Extended XLow,
                   Extended XHigh, LongWord N, TQENFloatVector& XValues, TQENFloatVector& YValues) {
  DensityTable<false>(
      XLow, XHigh, N, XValues, YValues,
      [&] {
        BetaInterval(Lower, Upper);
        CheckBetaShapes(A, B);
      },
      [=](Extended x) { return BetaPDF(x, A, B, Lower, Upper); });
}

}  // namespace tovrin
