// The precise continuous distributions: normal, log-normal, incomplete gamma, chi-square, F,
// Student t, exponential and beta, each tail computed directly.
#include <cmath>
#include <limits>
#include <utility>

#include "tovrin/statistics/TOVRINStatistics_Continuous.h"
#include "tovrin/statistics/detail/PreciseCommon.h"

namespace tovrin::precise {
namespace {

using namespace common;  // NOLINT: the family's shared names
using detail::Exp80;
using detail::Ln80;

// 1/sqrt(2) as hi + lo, 1/sqrt(2 pi) and 2/sqrt(pi).
constexpr Extended kInvSqrt2 = 0.707106781186547524381894036516L;
constexpr Extended kInvSqrt2Lo = 1.895032558893257079655062e-20L;
constexpr Extended kInvSqrt2Pi = 0.398942280401432677939946059934381868L;
constexpr Extended kTwoOverSqrtPi = 1.12837916709551257389615890312154517L;

// --- Checks, as the classic functions make them (detail/DistributionChecks.h) ---------------

// Degrees of freedom are Extended here.
void CheckDF(Extended DF) {
  if (!(DF > 0)) RaiseMathError(rsDF);
}

// --- Normal tails -----------------------------------------------------------------------------

// P(Z > z) for z = hi + lo: erfc(z / sqrt 2) / 2 with the argument carried to twice the working
// precision (far in the tail the relative error of erfc is 2 x^2 times that of x).
Extended NormalUpper(const Pair& z) {
  if (std::isnan(z.hi)) return kNaN;
  const Pair x = detail::Product(z, Pair{kInvSqrt2, kInvSqrt2Lo});
  Extended e = std::erfc(x.hi);
  // The correction is x.lo erfc'(x.hi), at most 2 x^2 units in the last place of erfc for
  // x > 0 and less than one below: below x = 2 it is not worth its exp. It needs few digits
  // (a relative 1e-6 at most), which the double exp gives while x^2 < 700.
  if (x.lo != 0.0L && x.hi > 2.0L && x.hi < 110.0L) {
    const Extended x2 = x.hi * x.hi;
    const Extended decay =
        x2 < 700.0L ? static_cast<Extended>(std::exp(static_cast<double>(-x2))) : Exp80(-x2);
    e -= x.lo * kTwoOverSqrtPi * decay;
  }
  return 0.5L * e;
}

// The upper half (32 bits) of x for |x| <= 2^8000 (Veltkamp's split): products of two such
// halves are exact, and x minus its half is exact too.
Extended UpperHalf(Extended x) {
  const Extended t = 4294967297.0L * x;  // 2^32 + 1
  return t - (t - x);
}

// e^(-z^2 / 2) for z = h + l with h of 32 bits and |l| < 2^-31 |h|: z^2 = h^2 + (2 h + l) l,
// the first term exact, the sum renormalised for Exp80 (the rounding of z^2 in one piece would
// cost z^2 / 2 units in the last place).
Extended ExpMinusHalfSquareOfHalves(Extended h, Extended l) {
  const Extended h2 = h * h;
  const Extended rest = (h + h + l) * l;
  const Extended s = h2 + rest;
  return Exp80(-0.5L * s, -0.5L * (rest - (s - h2)));
}

// e^(-z^2 / 2) for z = hi + lo (|lo| a few units in the last place of hi); 0 beyond |z| = 152,
// where it is below the smallest subnormal.
Extended ExpMinusHalfSquare(Extended hi, Extended lo) {
  if (!(std::fabs(hi) < 152.0L)) return std::isnan(hi) ? kNaN : 0.0L;
  const Extended h = UpperHalf(hi);
  return ExpMinusHalfSquareOfHalves(h, (hi - h) + lo);
}

// Scales within 2^(+-1000) have a normal reciprocal and split without overflow (the bounds are
// doubles, cheap to load).
bool ScaleInRange(Extended s) { return s >= 0x1p-1000 && s <= 0x1p1000; }

// q = n / d to twice the precision with the reciprocal r = 1 / d given (d within
// ScaleInRange, |n r| below 2^8000): h is the upper half of n r, so h times either half of d is
// exact, n - h d is exact (it is 2^-31 of n at most) and l is that remainder times r. One
// division in all, and few values alive at once for the eight x87 registers.
Pair HalvesOfQuotient(Extended n, Extended nlo, Extended d, Extended r) {
  const Extended h = UpperHalf(n * r);
  const Extended d_hi = UpperHalf(d);
  return {h, (((n - h * d_hi) - h * (d - d_hi)) + nlo) * r};
}

// (X - Mean) / StdDev to twice the working precision (hi + lo, |lo| below 2^-31 |hi|).
Pair Standardized(Extended Mean, Extended StdDev, Extended X) {
  const Pair d = detail::ExactSum(X, -Mean);
  if (ScaleInRange(StdDev)) {
    const Extended inverse = 1.0L / StdDev;
    if (std::fabs(d.hi * inverse) < 0x1p1000) return HalvesOfQuotient(d.hi, d.lo, StdDev, inverse);
  }
  return detail::Quotient(d, Pair{StdDev});
}

// The normal density at X, z = (X - Mean) / StdDev carried to twice the precision, times
// Scale (which the log-normal density forms beside its logarithm).
Extended NormalDensity(Extended Mean, Extended StdDev, Extended X, Extended Scale = 1.0L) {
  if (!ScaleInRange(StdDev)) {
    const Pair z = Standardized(Mean, StdDev, X);
    return kInvSqrt2Pi * ExpMinusHalfSquare(z.hi, z.lo) / StdDev * Scale;
  }
  const Extended inverse = 1.0L / StdDev;
  const Pair d = detail::ExactSum(X, -Mean);
  const Extended rounded = d.hi * inverse;
  if (!(std::fabs(rounded) < 152.0L)) return std::isnan(rounded) ? kNaN : 0.0L;
  const Pair z = HalvesOfQuotient(d.hi, d.lo, StdDev, inverse);
  return kInvSqrt2Pi * inverse * Scale * ExpMinusHalfSquareOfHalves(z.hi, z.lo);
}

#include "tovrin/statistics/TOVRINPrecise_InvNormal.inc"

// c[0] + c[1] t + ... + c[N-1] t^(N-1) as Horner's rule in t^2 over the pairs c[i] + c[i+1] t:
// half the dependent steps of the plain rule, the same rounding for coefficients of one sign.
template <int N>
Extended Polynomial(const Extended (&c)[N], Extended t) {
  const Extended t2 = t * t;
  Extended v = N % 2 == 1 ? c[N - 1] : c[N - 2] + c[N - 1] * t;
  for (int i = N % 2 == 1 ? N - 3 : N - 4; i >= 0; i -= 2) v = v * t2 + (c[i] + c[i + 1] * t);
  return v;
}

// The z >= 0 with P(Z > z) = p, for 0 < p <= 1/2, from the rational approximations fitted by
// TOVRINPrecise_InvNormal.py (about 1e-20 relative): in q = 1/2 - p for p >= 0.075, beyond in
// r = sqrt(-ln p) on six intervals up to the smallest subnormal p. No correction step follows:
// the rounding of ln p moves z by about one unit in the last place.
Extended InverseNormalUpper(Extended p) {
  if (p >= 0.075L) {
    const Extended q = 0.5L - p;
    const Extended v = kInvNormalCentralEdge - q * q;
    return q * Polynomial(kInvNormalCentralP, v) / Polynomial(kInvNormalCentralQ, v);
  }
  const Extended r = std::sqrt(-Ln80(p));
  int k = 0;
  while (k + 1 < kInvNormalTailRegions && r >= kInvNormalTailStart[k + 1]) ++k;
  const Extended s = r - kInvNormalTailStart[k];
  return r * Polynomial(kInvNormalTailP[k], s) / Polynomial(kInvNormalTailQ[k], s);
}

// The z with P(Z < z) = P for 0 < P < 1 (1 - P is exact where it is used).
Extended InverseNormalLess(Extended P) {
  return P <= 0.5L ? -InverseNormalUpper(P) : InverseNormalUpper(1.0L - P);
}

// --- Gamma inverse ----------------------------------------------------------------------------

// First estimate of the x with P(a, x) = p and Q(a, x) = q: for a = 1/2, Q = 2 P(Z > sqrt(2x))
// exactly; for a >= 1 Wilson and Hilferty's cube; otherwise, or where that fails, the lower
// tail's power law x^a / Gamma(a + 1) in the lower tail or while x is small (with its first
// correction x e^(x / (a + 1)) below x = a + 1), and the upper tail's
// x^(a - 1) e^-x / Gamma(a) (1 + (a - 1) / x) beyond, solved by two fixed-point steps.
Extended InverseGammaStart(Extended a, Extended p, Extended q) {
  const bool use_lower = p <= q;
  if (a == 0.5L && !use_lower) {
    const Extended z = InverseNormalUpper(0.5L * q);
    return 0.5L * z * z;
  }
  if (a >= 1.0L) {
    // The classic inverse (good to about 1e-16) is enough for a start.
    const Extended z = use_lower ? tovrin::InvNormalLess(p) : -tovrin::InvNormalLess(q);
    const Extended base = 1.0L - 1.0L / (9.0L * a) + z / (3.0L * std::sqrt(a));
    if (base > 0.1L) return a * base * base * base;
  }
  Extended x = std::exp((std::log(p) + LnGamma(a + 1.0L)) / a);
  if (use_lower || x < 0.5L) {
    if (x < a + 1.0L) x *= std::exp(x / (a + 1.0L));
  } else {
    const Extended level = -std::log(q) - LnGamma(a);
    x = std::fmax(1.0L, level);
    for (int i = 0; i < 2; ++i) {
      x = std::fmax(1.0L, level + (a - 1.0L) * std::log(x) + std::log1p((a - 1.0L) / x));
    }
  }
  if (!(x > 0.0L)) x = std::numeric_limits<Extended>::min();
  if (std::isinf(x)) x = std::numeric_limits<Extended>::max();
  return x;
}

// The x with P(a, x) = p and Q(a, x) = q (q = 1 - p, each exact where it is the smaller): the
// first estimate above, then Halley steps (Newton on the logarithm far in a tail) kept inside a
// shrinking bracket, each reusing the density factor that the tails formed.
Extended InverseGamma(Extended a, Extended p, Extended q) {
  if (p <= 0.0L) return 0.0L;
  if (q <= 0.0L) return kInf;
  const bool use_lower = p <= q;
  const Extended target = use_lower ? p : q;
  Extended x = InverseGammaStart(a, p, q);
  Extended lo = 0.0L;
  Extended hi = kInf;
  for (int i = 0; i < 400; ++i) {
    const Tails t = detail::IncompleteGammaTails(a, x);
    const Extended f = use_lower ? t.lower - p : q - t.upper;
    if (f == 0.0L) return x;
    if (f < 0.0L) {
      lo = x;
    } else {
      hi = x;
    }
    const Extended density = (std::isnan(t.factor) ? detail::GammaPowerFactor(a, x) : t.factor) / x;
    const Extended tail = use_lower ? t.lower : t.upper;
    Extended next = kNaN;
    // Newton doubles and Halley triples the correct digits: a Newton step below 1e-10 of x, or a
    // Halley step below 1e-7, leaves the next iterate exact to the working precision.
    Extended last_step = 1e-10L;
    if (density > 0.0L && std::isfinite(density)) {
      if (target < 0.01L && tail > 0.0L) {
        const Extended g = use_lower ? std::log(tail / p) : std::log(q / tail);
        const Extended slope = x * density / tail;
        next = x * std::exp(-g / slope);
      } else {
        const Extended step = f / density;
        Extended denom = 1.0L - 0.5L * step * ((a - 1.0L) / x - 1.0L);
        if (denom > 0.5L && denom < 2.0L) {
          last_step = 1e-7L;
        } else {
          denom = 1.0L;
        }
        next = x - step / denom;
      }
    }
    if (std::fabs(next - x) <= last_step * x) return std::fmin(std::fmax(next, lo), hi);
    if (!(next > lo && next < hi)) {
      if (std::isinf(hi)) {
        next = x * 16.0L;
      } else if (lo == 0.0L) {
        next = hi / 16.0L;
        if (next == 0.0L) return 0.0L;
      } else if (hi > 16.0L * lo) {
        next = std::sqrt(lo) * std::sqrt(hi);
      } else {
        next = 0.5L * (lo + hi);
      }
    }
    if (next == x) return x;
    x = next;
  }
  return x;
}

// --- Beta-based helpers -----------------------------------------------------------------------

// x = u / (u + v) and y = v / (u + v) for u = hi + lo and v > 0, each to twice the precision.
std::pair<Pair, Pair> Proportions(const Pair& u, Extended v) {
  const Pair s = detail::Sum(u, Pair{v});
  return {detail::Quotient(u, s), detail::Quotient(Pair{v}, s)};
}

Tails BetaTails(const std::pair<Pair, Pair>& xy, Extended a, Extended b) {
  return detail::IncompleteBetaTails(xy.first.hi, xy.first.lo, xy.second.hi, xy.second.lo, a, b);
}

Extended BetaFactor(const std::pair<Pair, Pair>& xy, Extended a, Extended b) {
  return detail::BetaPowerFactor(xy.first.hi, xy.first.lo, xy.second.hi, xy.second.lo, a, b);
}

// The point of the Student t distribution: x = t^2 / (DF + t^2), y = DF / (DF + t^2).
std::pair<Pair, Pair> StudentPoint(Extended T, Extended DF) {
  const Extended t = std::fabs(T);
  const Pair t2 = detail::ExactProduct(t, t);
  if (!std::isfinite(t2.hi)) {
    const Extended y = DF / t / t;
    return {Pair{1.0L - y}, Pair{y}};
  }
  return Proportions(t2, DF);
}

// P(T < t) for the Student t: half the two-sided tail beyond |t|, which is the complement of
// I_x(1/2, DF/2).
Extended StudentLess(Extended T, Extended DF) {
  if (std::isnan(T)) return kNaN;
  if (std::isinf(T)) return T > 0 ? 1.0L : 0.0L;
  const Tails two_sided = BetaTails(StudentPoint(T, DF), 0.5L, 0.5L * DF);
  return T < 0 ? 0.5L * two_sided.upper : 0.5L + 0.5L * two_sided.lower;
}

// The point of the F distribution: x = DF1 X / (DF1 X + DF2), y = DF2 / (DF1 X + DF2).
std::pair<Pair, Pair> FPoint(Extended X, Extended DF1, Extended DF2) {
  const Pair u = detail::ExactProduct(DF1, X);
  if (!std::isfinite(u.hi)) {
    const Extended y = DF2 / DF1 / X;
    return {Pair{1.0L - y}, Pair{y}};
  }
  return Proportions(u, DF2);
}

Tails FTails(Extended X, Extended DF1, Extended DF2) {
  if (!(X > 0)) RaiseMathError(rsValueGZero);
  CheckDF(DF1);
  CheckDF(DF2);
  if (std::isnan(X)) return {kNaN, kNaN};
  if (std::isinf(X)) return {1.0L, 0.0L};
  return BetaTails(FPoint(X, DF1, DF2), 0.5L * DF1, 0.5L * DF2);
}

// The root (x, y = 1 - x) of I_x(a, b) = p, 1 - I_x = q, the smaller member computed directly.
detail::BetaRoot BetaRoot(Extended p, Extended q, Extended a, Extended b) {
  return detail::InverseIncompleteBetaTails(p, q, a, b);
}

// The root of I_x(a, b) = p as the ratio x / y.
Extended BetaRootRatio(Extended p, Extended q, Extended a, Extended b) {
  const detail::BetaRoot r = BetaRoot(p, q, a, b);
  return r.x / r.y;
}

// --- Beta on an interval ----------------------------------------------------------------------

std::pair<Extended, Extended> BetaInterval(Extended Lower, Extended Upper) {
  if (Lower == Upper) RaiseMathError(rsSameValue);
  return Lower < Upper ? std::pair{Lower, Upper} : std::pair{Upper, Lower};
}

// (x, 1 - x) for X on [0, 1], or for X mapped from [low, high].
std::pair<Pair, Pair> UnitPoint(Extended X) {
  const Extended y = 1.0L - X;
  return {Pair{X}, Pair{y, (1.0L - y) - X}};
}

std::pair<Pair, Pair> IntervalPoint(Extended X, Extended low, Extended high) {
  const Pair width = detail::ExactSum(high, -low);
  return {detail::Quotient(detail::ExactSum(X, -low), width),
          detail::Quotient(detail::ExactSum(high, -X), width)};
}

Tails BetaDistTails(const std::pair<Pair, Pair>& xy, Extended A, Extended B) {
  if (std::isnan(xy.first.hi) || std::isnan(xy.second.hi)) return {kNaN, kNaN};
  if (xy.first.hi <= 0.0L) return {0.0L, 1.0L};
  if (xy.second.hi <= 0.0L) return {1.0L, 0.0L};
  return BetaTails(xy, A, B);
}

Extended BetaDensityAt(const std::pair<Pair, Pair>& xy, Extended A, Extended B) {
  const Extended x = xy.first.hi;
  const Extended y = xy.second.hi;
  if (std::isnan(x) || std::isnan(y)) return kNaN;
  if (x < 0.0L || y < 0.0L) return 0.0L;
  if (x == 0.0L || y == 0.0L) {
    const Extended shape = x == 0.0L ? A : B;
    if (shape < 1.0L) return kInf;
    if (shape > 1.0L) return 0.0L;
    return 1.0L / Beta(A, B);
  }
  return BetaFactor(xy, A, B) / x / y;
}

}  // namespace

// === Standard normal ============================================================================

Extended NormalZ(Extended Z) { return kInvSqrt2Pi * ExpMinusHalfSquare(Z, 0.0L); }

Extended NormalLess(Extended Z) { return NormalUpper(Pair{-Z}); }

Extended NormalGreater(Extended Z) { return NormalUpper(Pair{Z}); }

Extended InvNormalLess(Extended P) {
  CheckOpenProbability(P);
  return InverseNormalLess(P);
}

Extended InvNormalGreater(Extended P) {
  CheckOpenProbability(P);
  return P <= 0.5L ? InverseNormalUpper(P) : -InverseNormalUpper(1.0L - P);
}

Extended ZAlpha(Extended Alpha) { return InvNormalDistGreater(0, 1, Alpha); }

// === Normal with parameters =====================================================================

Extended NormalPDF(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  return NormalDensity(Mean, StdDev, X);
}

Extended NormalDistLess(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  const Pair z = Standardized(Mean, StdDev, X);
  return NormalUpper(Pair{-z.hi, -z.lo});
}

Extended NormalDistGreater(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  return NormalUpper(Standardized(Mean, StdDev, X));
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
  const Extended lnX = detail::elementary::LnInline(X);
  if (ScaleInRange(X)) return NormalDensity(Mean, StdDev, lnX, 1.0L / X);
  return NormalDensity(Mean, StdDev, lnX) / X;
}

Extended LogNormalLess(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  if (std::isnan(X)) return kNaN;
  if (X <= 0) return 0;
  return NormalDistLess(Mean, StdDev, detail::elementary::LnInline(X));
}

Extended LogNormalGreater(Extended Mean, Extended StdDev, Extended X) {
  CheckStdDev(StdDev);
  if (std::isnan(X)) return kNaN;
  if (X <= 0) return 1;
  return NormalDistGreater(Mean, StdDev, detail::elementary::LnInline(X));
}

namespace {
// exp(Mean + StdDev z) with the exponent carried to twice the working precision.
Extended ExpOfAffine(Extended Mean, Extended StdDev, Extended z) {
  const Pair e = detail::Sum(detail::ExactProduct(StdDev, z), Pair{Mean});
  return Exp80(e.hi, e.lo);
}
}  // namespace

Extended InvLogNormalLess(Extended Mean, Extended StdDev, Extended P) {
  CheckOpenProbability(P);
  CheckInverseStdDev(StdDev);
  return ExpOfAffine(Mean, StdDev, InvNormalLess(P));
}

Extended InvLogNormalGreater(Extended Mean, Extended StdDev, Extended P) {
  CheckOpenProbability(P);
  CheckInverseStdDev(StdDev);
  return ExpOfAffine(Mean, StdDev, InvNormalGreater(P));
}

// === Incomplete gamma and chi-square ===========================================================

Extended IncompleteGamma(Extended A, Extended X) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (A <= 0) RaiseMathError(rsValueGZero);
  return detail::IncompleteGammaTails(A, X).lower;
}

Extended IncompleteGammaUpper(Extended A, Extended X) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (A <= 0) RaiseMathError(rsValueGZero);
  return detail::IncompleteGammaTails(A, X).upper;
}

Extended ChiSquareLess(Extended X, Extended DF) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  CheckDF(DF);
  return detail::IncompleteGammaTails(0.5L * DF, 0.5L * X).lower;
}

Extended ChiSquareGreater(Extended X, Extended DF) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  CheckDF(DF);
  return detail::IncompleteGammaTails(0.5L * DF, 0.5L * X).upper;
}

Extended InvChiSquareLess(Extended P, Extended DF) {
  CheckDF(DF);
  if (!(P >= 0 && P <= 1)) RaiseMathError(rsValueGEZero);
  return 2.0L * InverseGamma(0.5L * DF, P, 1.0L - P);
}

Extended InvChiSquareGreater(Extended P, Extended DF) {
  CheckDF(DF);
  if (!(P >= 0 && P <= 1)) RaiseMathError(rsValueGEZero);
  return 2.0L * InverseGamma(0.5L * DF, 1.0L - P, P);
}

Extended ChiSquarePDF(Extended X, Extended DF) {
  if (X < 0) RaiseMathError(rsValueGEZero);
  CheckDF(DF);
  if (std::isnan(X)) return kNaN;
  if (X == 0) return DF < 2 ? kInf : (DF == 2 ? 0.5L : 0.0L);
  return detail::GammaPowerFactor(0.5L * DF, 0.5L * X) / X;
}

// === F ==========================================================================================

Extended FDistLess(Extended X, Extended DF1, Extended DF2) { return FTails(X, DF1, DF2).lower; }

Extended FDistGreater(Extended X, Extended DF1, Extended DF2) { return FTails(X, DF1, DF2).upper; }

Extended InvFDistLess(Extended P, Extended DF1, Extended DF2) {
  CheckClosedProbability(P);
  CheckDF(DF1);
  CheckDF(DF2);
  if (P == 1) return 0;
  return DF2 / DF1 * BetaRootRatio(P, 1.0L - P, 0.5L * DF1, 0.5L * DF2);
}

Extended InvFDistGreater(Extended P, Extended DF1, Extended DF2) {
  CheckClosedProbability(P);
  CheckDF(DF1);
  CheckDF(DF2);
  if (P == 0) return 0;
  return DF2 / DF1 * BetaRootRatio(1.0L - P, P, 0.5L * DF1, 0.5L * DF2);
}

Extended FDistPDF(Extended X, Extended DF1, Extended DF2) {
  CheckDF(DF1);
  CheckDF(DF2);
  if (X < 0) RaiseMathError(rsValueGEZero);
  if (std::isnan(X)) return kNaN;
  if (std::isinf(X)) return 0;
  if (X == 0) return DF1 < 2 ? kInf : (DF1 == 2 ? 1.0L : 0.0L);
  return BetaFactor(FPoint(X, DF1, DF2), 0.5L * DF1, 0.5L * DF2) / X;
}

// === Student t ==================================================================================

Extended StudentTLess(Extended T, Extended DF) {
  CheckDF(DF);
  return StudentLess(T, DF);
}

Extended StudentTGreater(Extended T, Extended DF) {
  CheckDF(DF);
  return StudentLess(-T, DF);
}

namespace {
// t^2 / DF for the t with P(T > t) = p (0 < p <= 1/2), as a first estimate: exact for DF = 1
// and 2, Hill's approximation (CACM Algorithm 396) from DF = 3 on, NaN below that or where the
// approximation leaves the range.
Extended StudentRatioEstimate(Extended p, Extended DF) {
  constexpr Extended kHalfPi = 1.57079632679489661923132169163975144L;
  const Extended two_sided = 2.0L * p;
  if (DF == 1.0L) {
    const Extended cot = 1.0L / std::tan(kHalfPi * two_sided);
    return cot * cot;
  }
  if (DF == 2.0L) return (1.0L - two_sided) * (1.0L - two_sided) / (two_sided * (2.0L - two_sided));
  if (!(DF >= 3.0L) || !(0.5L * two_sided > 0.0L)) return kNaN;
  const Extended n = DF;
  const Extended a = 1.0L / (n - 0.5L);
  const Extended b = 48.0L / (a * a);
  Extended c = ((20700.0L * a / b - 98.0L) * a - 16.0L) * a + 96.36L;
  const Extended d = ((94.5L / (b + c) - 3.0L) / b + 1.0L) * std::sqrt(a * kHalfPi) * n;
  Extended y = std::pow(d * two_sided, 2.0L / n);
  if (y > 0.05L + a) {
    // The expansion about the normal quantile.
    const Extended x = tovrin::InvNormalLess(0.5L * two_sided);
    y = x * x;
    if (n < 5.0L) c += 0.3L * (n - 4.5L) * (x + 0.6L);
    c = (((0.05L * d * x - 5.0L) * x - 7.0L) * x - 2.0L) * x + b + c;
    y = (((((0.4L * y + 6.3L) * y + 36.0L) * y + 94.5L) / c - y - 3.0L) / b + 1.0L) * x;
    return std::expm1(a * y * y);
  }
  if (!(y > 0.0L)) return kNaN;
  return ((1.0L / (((n + 6.0L) / (n * y) - 0.089L * d - 0.822L) * (n + 2.0L) * 3.0L) +
           0.5L / (n + 4.0L)) *
              y -
          1.0L) *
             (n + 1.0L) / (n + 2.0L) +
         1.0L / y;
}

// The t >= 0 with P(T > t) = p for 0 < p <= 1/2: x / y = t^2 / DF from the beta root, started
// from the estimate above.
Extended InverseStudentUpper(Extended p, Extended DF) {
  if (p == 0.5L) return 0.0L;
  const Extended ratio = StudentRatioEstimate(p, DF);
  detail::BetaRoot start{kNaN, kNaN};
  if (ratio > 0.0L && std::isfinite(ratio)) start = {ratio / (1.0L + ratio), 1.0L / (1.0L + ratio)};
  const detail::BetaRoot r =
      detail::InverseIncompleteBetaTails(1.0L - 2.0L * p, 2.0L * p, 0.5L, 0.5L * DF, &start);
  return std::sqrt(DF) * std::sqrt(r.x / r.y);
}
}  // namespace

Extended InvStudentTLess(Extended P, Extended DF) {
  CheckClosedProbability(P);
  CheckDF(DF);
  if (P == 0) return -kInf;
  if (P == 1) return kInf;
  return P <= 0.5L ? -InverseStudentUpper(P, DF) : InverseStudentUpper(1.0L - P, DF);
}

Extended InvStudentTGreater(Extended P, Extended DF) {
  CheckClosedProbability(P);
  CheckDF(DF);
  if (P == 0) return kInf;
  if (P == 1) return -kInf;
  return P <= 0.5L ? InverseStudentUpper(P, DF) : -InverseStudentUpper(1.0L - P, DF);
}

Extended StudentTPDF(Extended T, Extended DF) {
  CheckDF(DF);
  if (std::isnan(T)) return kNaN;
  if (std::isinf(T)) return 0;
  const std::pair<Pair, Pair> xy = StudentPoint(T, DF);
  if (xy.first.hi == 0.0L) return 1.0L / (std::sqrt(DF) * Beta(0.5L, 0.5L * DF));
  return BetaFactor(xy, 0.5L, 0.5L * DF) / std::fabs(T);
}

// === Exponential ================================================================================

Extended ExponentialLess(Extended Mean, Extended X) {
  if (Mean <= 0 || X < 0) RaiseMathError(rsExpDistInvalid);
  // 1 - e^-q moves by q e^-q / (1 - e^-q) <= 1 times the relative error of q: the rounded
  // quotient is enough.
  return -std::expm1(-(X / Mean));
}

namespace {
// e^-q for q = X / Mean >= 0, divided by Mean as well for the density. The rounding of q
// would move e^-q by q units in the last place, so q is carried to twice the precision, with
// one division as for the normal density.
Extended ExpMinusRatio(Extended X, Extended Mean, bool density) {
  if (!ScaleInRange(Mean)) {
    const Pair q = detail::Quotient(Pair{X}, Pair{Mean});
    if (!(q.hi < 12000.0L)) return std::isnan(q.hi) ? kNaN : 0.0L;
    const Extended e = Exp80(-q.hi, -q.lo);
    return density ? e / Mean : e;
  }
  const Extended inverse = 1.0L / Mean;
  if (!(X * inverse < 12000.0L)) return std::isnan(X * inverse) ? kNaN : 0.0L;
  const Pair q = HalvesOfQuotient(X, 0.0L, Mean, inverse);
  const Extended s = q.hi + q.lo;
  const Extended e = Exp80(-s, (s - q.hi) - q.lo);
  return density ? e * inverse : e;
}
}  // namespace

Extended ExponentialGreater(Extended Mean, Extended X) {
  if (Mean <= 0 || X < 0) RaiseMathError(rsExpDistInvalid);
  return ExpMinusRatio(X, Mean, false);
}

Extended ExponentialPDF(Extended X, Extended Mean) {
  if (!(Mean > 0) || X < 0) RaiseMathError(rsExpDistInvalid);
  return ExpMinusRatio(X, Mean, true);
}

// === Beta =======================================================================================

namespace {
// The point (x, 1 - x) after the checks: X on [0, 1] (width 1), or X mapped from
// [Lower, Upper] (the width of the interval).
struct BetaPoint {
  std::pair<Pair, Pair> xy;
  Extended width;
};
BetaPoint CheckedBetaPoint(Extended X, Extended A, Extended B) {
  CheckBetaShapes(A, B);
  return {UnitPoint(X), 1.0L};
}
BetaPoint CheckedBetaPoint(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  CheckBetaShapes(A, B);
  return {IntervalPoint(X, low, high), high - low};
}

// The root with P below it (above it for Greater) after the checks, on [0, 1] or mapped to
// [Lower, Upper] from whichever end is nearer.
detail::BetaRoot CheckedBetaRoot(Extended P, Extended A, Extended B, bool greater) {
  CheckClosedProbability(P);
  CheckBetaShapes(A, B);
  return greater ? BetaRoot(1.0L - P, P, A, B) : BetaRoot(P, 1.0L - P, A, B);
}
Extended CheckedBetaRoot(Extended P, Extended A, Extended B, Extended Lower, Extended Upper,
                         bool greater) {
  const auto [low, high] = BetaInterval(Lower, Upper);
  const detail::BetaRoot r = CheckedBetaRoot(P, A, B, greater);
  return r.x <= 0.5L ? low + (high - low) * r.x : high - (high - low) * r.y;
}
}  // namespace

Extended BetaDistLess(Extended X, Extended A, Extended B) {
  return BetaDistTails(CheckedBetaPoint(X, A, B).xy, A, B).lower;
}

Extended BetaDistLess(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  return BetaDistTails(CheckedBetaPoint(X, A, B, Lower, Upper).xy, A, B).lower;
}

Extended BetaDistGreater(Extended X, Extended A, Extended B) {
  return BetaDistTails(CheckedBetaPoint(X, A, B).xy, A, B).upper;
}

Extended BetaDistGreater(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  return BetaDistTails(CheckedBetaPoint(X, A, B, Lower, Upper).xy, A, B).upper;
}

Extended InvBetaDistLess(Extended P, Extended A, Extended B) {
  return CheckedBetaRoot(P, A, B, false).x;
}

Extended InvBetaDistLess(Extended P, Extended A, Extended B, Extended Lower, Extended Upper) {
  return CheckedBetaRoot(P, A, B, Lower, Upper, false);
}

Extended InvBetaDistGreater(Extended P, Extended A, Extended B) {
  return CheckedBetaRoot(P, A, B, true).x;
}

Extended InvBetaDistGreater(Extended P, Extended A, Extended B, Extended Lower, Extended Upper) {
  return CheckedBetaRoot(P, A, B, Lower, Upper, true);
}

Extended BetaPDF(Extended X, Extended A, Extended B) {
  return BetaDensityAt(CheckedBetaPoint(X, A, B).xy, A, B);
}

Extended BetaPDF(Extended X, Extended A, Extended B, Extended Lower, Extended Upper) {
  const BetaPoint point = CheckedBetaPoint(X, A, B, Lower, Upper);
  return BetaDensityAt(point.xy, A, B) / point.width;
}

}  // namespace tovrin::precise
