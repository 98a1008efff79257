// The uniform source and the random-variate generators.
//
// Every generator comes as a pair: one overload takes a uniform source (TRandomGenFunction) as
// its last argument, its twin without it draws from VerdanRandom and behaves exactly as the
// first given VerdanRandom. A generator keeps nothing between calls: two calls with the same
// arguments differ only through the state of the uniform source. Argument checks raise
// EMathError before the first uniform is drawn, unless a family says otherwise; a NaN argument
// fails the range check it meets.
//
// Where a generator truncates a value to an integer (Trunc), a value that is NaN or lies outside
// the Int64 range raises rsInvalidValue instead (the conversion would be undefined).
#pragma once

#include <concepts>
#include <cstdint>
#include <memory>
#include <random>
#include <type_traits>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- The uniform source ---
// A uniform on [0, 1) with 64 random mantissa bits (every multiple of 2^-64 below 1 is equally
// likely). Safe to call from several threads; no lock is taken on the way.
//
// Seeding rule. The process holds one seed (0 at start-up, so a program that never seeds gets
// the same numbers on every run) from which numbered streams of a xoshiro256** generator are
// derived; every thread draws from a stream of its own:
//  - SetRandSeed(S) makes S the process seed and puts the calling thread on stream 0 of S at
//    once, so the draws that thread makes after SetRandSeed(S) are the same on every run,
//    whatever other threads do.
//  - Any other thread moves to a fresh stream of the new seed (1, 2, ..., in the order in which
//    the threads next draw) at its next draw. A thread that draws for the first time takes the
//    next stream number of the current seed (the first thread ever to draw without a seed being
//    set gets stream 0 of seed 0).
//  - Randomize() is SetRandSeed with a value taken from the clocks.
// A thread that needs a reproducible stream independent of other threads' scheduling seeds on
// that thread, or passes its own TRandomGenFunction.
Extended VerdanRandom();
void SetRandSeed(std::uint64_t Seed);
void Randomize();

namespace detail {
// bits * 2^-64, exact in the 64-bit mantissa. The word is loaded as a signed integer and moved
// up by 2^63, which avoids the branch of an unsigned conversion.
inline Extended UniformFromBits(std::uint64_t bits) {
  const auto shifted = static_cast<std::int64_t>(bits ^ 0x8000000000000000ULL);
  return (static_cast<Extended>(shifted) + 0x1p63L) * 0x1p-64L;
}
// The same uniform rounded to double, without the trip through the 80-bit type: the top 53
// bits and the last 11, each exact as a double, added with one rounding to nearest, which is
// the rounding of the exact uniform.
inline double UniformDoubleFromBits(std::uint64_t bits) {
  return static_cast<double>(static_cast<std::int64_t>(bits >> 11)) * 0x1p-53 +
         static_cast<double>(static_cast<std::int64_t>(bits & 0x7FF)) * 0x1p-64;
}
// The 64 bits of one uniform from an engine of 64 full bits, or of two words of one of 32 (the
// first giving the low half), as std::generate_canonical<long double, 64> combines them.
template <typename T>
inline std::uint64_t EngineWord64(T& engine) {
  if constexpr (static_cast<std::uint64_t>(T::max()) == 0xFFFFFFFFULL) {
    const auto low = static_cast<std::uint64_t>(engine());
    return low | (static_cast<std::uint64_t>(engine()) << 32);
  } else {
    return static_cast<std::uint64_t>(engine());
  }
}
}  // namespace detail

// A reference to a uniform source: a function of no arguments returning an Extended uniform on
// [0, 1). It accepts a plain function (`Extended MyUniform()`), a function pointer, or any
// callable object such as a capturing lambda. It does not own or copy the callable: it holds a
// pointer to it, so the callable must outlive every call made through the reference (a lambda
// written in the argument list of a generator call lives long enough). Copying the reference
// and calling through it never allocates. A function pointer passed in must not be null.
//
// A uniform random bit generator (std::mt19937_64, std::mt19937, ...) is accepted too, by
// reference like a callable, and gives the uniforms std::generate_canonical<long double, 64>
// would make of it: word * 2^-64 for a 64-bit engine, (first + second * 2^32) * 2^-64 for a
// 32-bit one. Those two kinds are converted without a detour; the generators that work with
// uniforms rounded to double (the normal) take them rounded from the bits directly.
class TRandomGenFunction {
 public:
  template <typename F>
  requires(!std::is_same_v<std::remove_cvref_t<F>, TRandomGenFunction> &&
           !std::uniform_random_bit_generator<std::remove_cvref_t<F>> &&
           std::is_invocable_r_v<Extended, F&>) TRandomGenFunction(F&& Source)
  noexcept {  // NOLINT: implicit by design
    using T = std::remove_reference_t<F>;
    using Plain = std::remove_cvref_t<F>;
    if constexpr (std::is_function_v<T>) {
      target_.function = reinterpret_cast<void (*)()>(&Source);
      calls_ = &kCalls<CallFunction<T*>>;
    } else if constexpr (std::is_pointer_v<Plain> &&
                         std::is_function_v<std::remove_pointer_t<Plain>>) {
      target_.function = reinterpret_cast<void (*)()>(Source);
      calls_ = &kCalls<CallFunction<Plain>>;
    } else {
      target_.object = const_cast<void*>(static_cast<const void*>(std::addressof(Source)));
      calls_ = &kCalls<CallObject<T>>;
    }
  }

  template <typename G>
  requires(std::uniform_random_bit_generator<std::remove_cvref_t<G>> &&
           !std::is_const_v<std::remove_reference_t<G>>) TRandomGenFunction(G&& Engine)
  noexcept {  // NOLINT: implicit by design
    using T = std::remove_reference_t<G>;
    target_.object = static_cast<void*>(std::addressof(Engine));
    if constexpr (kFullWords<T>) {
      calls_ = &kEngineCalls<T>;
    } else {
      calls_ = &kCalls<CallCanonical<T>>;
    }
  }

  Extended operator()() const { return calls_->extended(target_); }
  // The next uniform rounded to double: static_cast<double>((*this)()), which a bit generator
  // gives without the 80-bit value.
  double NextDouble() const { return calls_->rounded(target_); }
  // The engine this reference was made from if it is a bit generator of type T (one of 32 or
  // 64 full bits), else null: a generator may then draw its words inline.
  template <typename T>
  T* EngineOf() const {
    if constexpr (kFullWords<T>) {
      if (calls_ == &kEngineCalls<T>) return static_cast<T*>(target_.object);
    }
    return nullptr;
  }

 private:
  union Target {
    void* object;
    void (*function)();
  };
  struct Calls {
    Extended (*extended)(Target);
    double (*rounded)(Target);
  };
  template <Extended (*Call)(Target)>
  static double Rounded(Target t) {
    return static_cast<double>(Call(t));
  }
  template <Extended (*Call)(Target)>
  static constexpr Calls kCalls{Call, &Rounded<Call>};

  template <typename Pointer>
  static Extended CallFunction(Target t) {
    return static_cast<Extended>(reinterpret_cast<Pointer>(t.function)());
  }
  template <typename T>
  static Extended CallObject(Target t) {
    return static_cast<Extended>((*static_cast<T*>(t.object))());
  }

  // Engines whose words are 32 or 64 full bits.
  template <typename T>
  static constexpr bool kFullWords = T::min() == 0 &&
                                     (static_cast<std::uint64_t>(T::max()) == 0xFFFFFFFFULL ||
                                      static_cast<std::uint64_t>(T::max()) == ~std::uint64_t{0});
  template <typename T>
  static std::uint64_t Word64(Target t) {
    return detail::EngineWord64(*static_cast<T*>(t.object));
  }
  template <typename T>
  static Extended EngineUniform(Target t) {
    return detail::UniformFromBits(Word64<T>(t));
  }
  template <typename T>
  static double EngineDouble(Target t) {
    return detail::UniformDoubleFromBits(Word64<T>(t));
  }
  template <typename T>
  static constexpr Calls kEngineCalls{&EngineUniform<T>, &EngineDouble<T>};
  template <typename T>
  static Extended CallCanonical(Target t) {
    return std::generate_canonical<long double, 64>(*static_cast<T*>(t.object));
  }

  Target target_;
  const Calls* calls_;
};

// --- Normal and log-normal ---
// Standard normal by Leva's ratio of uniforms (two uniforms per attempt, u first, held as
// doubles). Raises rsDivideByZero when the accepted u is below 5.0E-324.
Extended Random_Normal(TRandomGenFunction Gen);
Extended Random_Normal();
// Mean + StdDev * Z. StdDev is not checked (zero and negative values are used as given).
Extended Random_Normal(Extended Mean, Extended StdDev, TRandomGenFunction Gen);
Extended Random_Normal(Extended Mean, Extended StdDev);
// A log-normal variate whose own mean and standard deviation are Mean and StdDev.
// Raises rsInvalidMean for Mean <= 0, rsInvalidStdDev for StdDev <= 0.
Extended Random_LogNormal(Extended Mean, Extended StdDev, TRandomGenFunction Gen);
Extended Random_LogNormal(Extended Mean, Extended StdDev);

// --- Gamma, chi-square, exponential, Weibull ---
// Gamma(Shape, scale 1): Marsaglia-Tsang above 1, a power-law/exponential rejection below 1,
// the exponential at exactly 1. Raises rsInvalidShape for Shape <= 0 and rsShapeTooSmall for
// 0 < Shape < 5.0E-324.
Extended Random_Gamma(Extended Shape, TRandomGenFunction Gen);
Extended Random_Gamma(Extended Shape);
// 2 * Gamma(DF / 2); DF <= 0 raises rsInvalidShape (the gamma's check).
Extended Random_ChiSq(LongInt DF, TRandomGenFunction Gen);
Extended Random_ChiSq(LongInt DF);
// Exponential with mean 1: -ln u for the first u above 5.0E-324.
Extended Random_Exponential(TRandomGenFunction Gen);
Extended Random_Exponential();
// E^(1/Shape) for an exponential E; negative shapes are accepted. Raises rsInvalidValue for
// |Shape| <= 5.0E-324.
Extended Random_Weibull(Extended Shape, TRandomGenFunction Gen);
Extended Random_Weibull(Extended Shape);

// --- Beta and Student t ---
// Beta(A, B) on [0, 1] by Cheng's algorithm BA with the larger parameter leading, so that
// Random_Beta(A, B) = 1 - Random_Beta(B, A) on the same uniforms when A != B. Raises rsInvalidValue
// for A <= 0 or B <= 0.
Extended Random_Beta(Extended A, Extended B, TRandomGenFunction Gen);
Extended Random_Beta(Extended A, Extended B);
// Student t by ratio of uniforms with a quick acceptance and, from DF = 3 on, a quick rejection
// (below 3 it would cut into the acceptance region; DF = 1 gives a standard Cauchy variate).
// Raises rsInvalidValue for DF < 1.
Extended Random_T(LongInt DF, TRandomGenFunction Gen);
Extended Random_T(LongInt DF);

// --- Multivariate normal ---
// Covariance holds the upper triangle of the n x n covariance matrix packed column by column
// ((i, j), i <= j, 1-based, at (j - 1) j / 2 + i - 1), n = Means.size(). Factor is resized to
// n (n + 1) / 2 (keeping what it held in front) and receives the upper Cholesky factor U
// (Covariance = U'U) packed row by row ((i, j) at (i - 1)(2n - i) / 2 + j - 1); Variate becomes
// Means + U'z for n standard normals z drawn in index order. ErrorCode is 0 on success; a
// covariance that is not positive definite sets it to 1 and returns at once with Factor partly
// filled and Variate unchanged. Raises rsVectorEmpty for empty Means and rsVectorTooSmall for
// a Covariance shorter than n (n + 1) / 2 (nothing is changed then).
void Random_MVNorm(const TQENFloatVector& Means, const TQENFloatVector& Covariance,
                   TQENFloatVector& Factor, TQENFloatVector& Variate, LongInt& ErrorCode,
                   TRandomGenFunction Gen);
void Random_MVNorm(const TQENFloatVector& Means, const TQENFloatVector& Covariance,
                   TQENFloatVector& Factor, TQENFloatVector& Variate, LongInt& ErrorCode);

// --- Generalised inverse Gaussian ---
// Density proportional to x^(Lambda - 1) exp(-(Omega / 2)(x + 1/x)). Raises rsInvalidValue for
// Lambda < 0, Omega <= 0, Lambda > 0.25 Omega sqrt(1.7E+308), or when the method's bounds fall
// to 5.0E-324 or below.
Extended Random_Inv_Gauss(Extended Lambda, Extended Omega, TRandomGenFunction Gen);
Extended Random_Inv_Gauss(Extended Lambda, Extended Omega);

// --- Binomial and negative binomial ---
// Binomial(N, P) by inversion walking outward from the mode Trunc((N + 1) P); the mode is returned
// at once when the first uniform lies below its probability. P = 0 gives 0 and P = 1 gives N,
// drawing nothing. Arguments are not otherwise checked. If rounding
// leaves the walk unfinished once both ends are reached (it could only step on for ever),
// rsInvalidValue is raised.
Int64 Random_Binomial1(LongInt N, Extended P, TRandomGenFunction Gen);
Int64 Random_Binomial1(LongInt N, Extended P);
// Binomial(N, P) by BTPE, or by inversion when N min(P, 1 - P) <= 30. Arguments are not
// checked. The inversion path never gives 0 before the reflection N - y for P > 0.5 (a draw
// that would give 0 is redrawn). It cannot finish when the probability of 0 is 1 or NaN
// (P = 0, P = 1, N <= 0 ...), nor when rounding leaves the walk unfinished past 110; those
// cases raise rsInvalidValue (the first before any draw) instead of running for ever.
Int64 Random_Binomial2(Int64 N, Extended P, TRandomGenFunction Gen);
Int64 Random_Binomial2(Int64 N, Extended P);
// Negative binomial with probabilities C(x + R - 1, x) (1 - P)^R P^x. Raises rsInvalidValue for
// R <= 0, P <= 0 or P >= 1 (before any draw), and, after the geometric part for P > 0.7 has
// drawn its uniforms, when the start probability (1 - P)^rho of the remaining fraction would
// fall below 5.0E-324. Also raises rsInvalidValue if rounding leaves the inversion unfinished
// after its probabilities have underflowed to zero.
Int64 Random_Neg_Binomial(Extended R, Extended P, TRandomGenFunction Gen);
Int64 Random_Neg_Binomial(Extended R, Extended P);

// --- von Mises and Cauchy ---
// An angle in [-pi, pi] with density proportional to exp(K cos theta). Raises rsInvalidValue unless
// 0 <= K < 10.
Extended Random_von_Mises(Extended K, TRandomGenFunction Gen);
Extended Random_von_Mises(Extended K);
// Standard Cauchy: x / y for a point (x, y) uniform in the unit disc.
Extended Random_Cauchy(TRandomGenFunction Gen);
Extended Random_Cauchy();

// --- Poisson ---
// Poisson(Mu) by Ahrens-Dieter PD: table inversion for Mu <= 10, the normal-based method above.
// Mu is read only (passed by reference, so literals and temporaries are accepted too). A
// non-positive Mu gives 0.
Int64 Random_Poisson(const Extended& Mu, TRandomGenFunction Gen);
Int64 Random_Poisson(const Extended& Mu);

}  // namespace tovrin
