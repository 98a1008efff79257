// The uniform source and the random-variate generators.
//
// Each method is one function template over its uniform source: the overloads that take a
// TRandomGenFunction call through it, the ones without it use ThreadSource, which draws from
// the calling thread's stream directly (the same numbers VerdanRandom would give, without a
// call per draw).
#include "tovrin/random/TOVRINRandom.h"

#include "tovrin/foundation/detail/Elementary.h"
#include "tovrin/foundation/detail/Wrapping.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>
#include <cstddef>
#include <cstring>
#include <functional>
#include <mutex>
#include <random>
#include <thread>

namespace tovrin {

namespace {

using detail::Exp80;
using detail::Ln80;
using detail::RaiseMathError;

// The two literal guards of the methods: the literal 5.0E-324 held as an Extended (not the
// double denormal 4.94E-324) and the largest usable value.
constexpr Extended kTiny = 5.0E-324L;
constexpr Extended kHuge = 1.7E+308L;

// ---------------------------------------------------------------------------------------------
// The uniform source: xoshiro256** (Blackman and Vigna), one stream per thread.

constexpr std::uint64_t RotateLeft(std::uint64_t x, int k) { return (x << k) | (x >> (64 - k)); }

// The SplitMix64 output function: a bijection of 64-bit words with Mix64(0) = 0.
constexpr std::uint64_t Mix64(std::uint64_t z) {
  z = (z ^ (z >> 30)) * 0xBF58476D1CE4E5B9ULL;
  z = (z ^ (z >> 27)) * 0x94D049BB133111EBULL;
  return z ^ (z >> 31);
}

struct ThreadStream {
  std::uint64_t s[4];
  std::uint64_t epoch;  // the seed generation this stream belongs to; 0: none yet
};

// Stream k of a seed: the xoshiro state filled by SplitMix64 started at Seed + Mix64(k). Stream
// 0 is the generator's customary seeding from Seed itself. SplitMix64 never yields four zero
// words in a row, so the state is never the all-zero one.
void StartStream(ThreadStream& stream, std::uint64_t seed, std::uint64_t index) {
  std::uint64_t x = seed + Mix64(index);
  for (std::uint64_t& word : stream.s) {
    x += 0x9E3779B97F4A7C15ULL;
    word = Mix64(x);
  }
}

inline std::uint64_t NextBits(ThreadStream& stream) {
  std::uint64_t* s = stream.s;
  const std::uint64_t result = RotateLeft(s[1] * 5, 7) * 9;
  const std::uint64_t t = s[1] << 17;
  s[2] ^= s[0];
  s[3] ^= s[1];
  s[1] ^= s[2];
  s[0] ^= s[3];
  s[2] ^= t;
  s[3] = RotateLeft(s[3], 45);
  return result;
}

using detail::UniformDoubleFromBits;
using detail::UniformFromBits;

// The process seed. Only the slow paths (a thread joining a seed, a new seed) take the lock;
// a draw reads the atomic generation and nothing else that is shared.
std::mutex gSeedLock;
std::uint64_t gSeed = 0;        // guarded by gSeedLock
std::uint64_t gNextStream = 0;  // guarded by gSeedLock
std::atomic<std::uint64_t> gEpoch{1};

thread_local ThreadStream tStream{};

[[gnu::noinline]] void JoinCurrentSeed(ThreadStream& stream) {
  std::lock_guard<std::mutex> lock(gSeedLock);
  StartStream(stream, gSeed, gNextStream++);
  stream.epoch = gEpoch.load(std::memory_order_relaxed);
}

inline ThreadStream& CurrentStream() {
  ThreadStream& stream = tStream;
  if (stream.epoch != gEpoch.load(std::memory_order_acquire)) [[unlikely]] {
    JoinCurrentSeed(stream);
  }
  return stream;
}

// The default source as the generators see it: the calling thread's stream, looked up once
// per generator call.
class ThreadSource {
 public:
  ThreadSource() : stream_(CurrentStream()) {}
  Extended operator()() { return UniformFromBits(NextBits(stream_)); }
  // The next uniform rounded to double.
  double NextDouble() { return UniformDoubleFromBits(NextBits(stream_)); }

 private:
  ThreadStream& stream_;
};

// The standard Mersenne Twisters passed as a TRandomGenFunction: the generators draw their
// words inline instead of through the reference, the same uniforms in the same order.
template <typename Engine>
class EngineSource {
 public:
  explicit EngineSource(Engine& engine) : engine_(engine) {}
  Extended operator()() { return UniformFromBits(detail::EngineWord64(engine_)); }
  double NextDouble() { return UniformDoubleFromBits(detail::EngineWord64(engine_)); }

 private:
  Engine& engine_;
};

// body(source) with the engine behind gen drawn inline where it is a known one.
template <typename Body>
auto WithSource(TRandomGenFunction gen, Body body) {
  if (auto* engine = gen.EngineOf<std::mt19937_64>()) {
    EngineSource<std::mt19937_64> source(*engine);
    return body(source);
  }
  if (auto* engine = gen.EngineOf<std::mt19937>()) {
    EngineSource<std::mt19937> source(*engine);
    return body(source);
  }
  return body(gen);
}

// ---------------------------------------------------------------------------------------------
// Conversions to integers. Truncating NaN or a value past the Int64 range has no integer
// result (and would be undefined in C++): it raises rsInvalidValue.

// The x87 unit would change its rounding mode twice for each truncation, which costs more than
// the rest of a typical draw: the truncations work by arithmetic below 2^53 and read the bits
// of the 80-bit value (64-bit mantissa with its leading bit explicit, 15-bit biased exponent)
// above.
struct ExtendedBits {
  std::uint64_t mantissa;
  bool negative;
  int exponent;  // unbiased: the value is mantissa 2^(exponent - 63)
  bool nan;
};

inline ExtendedBits BitsOf(Extended x) {
  unsigned char bytes[sizeof(Extended)];
  std::memcpy(bytes, &x, sizeof(Extended));
  ExtendedBits b;
  std::memcpy(&b.mantissa, bytes, 8);
  std::uint16_t signExponent;
  std::memcpy(&signExponent, bytes + 8, 2);
  b.negative = (signExponent & 0x8000) != 0;
  b.exponent = (signExponent & 0x7FFF) - 16383;
  b.nan = (signExponent & 0x7FFF) == 0x7FFF && (b.mantissa << 1) != 0;
  return b;
}

// Trunc(x) for |x| < 2^63 (the exponent is below 63).
inline Int64 SmallTrunc(const ExtendedBits& b) {
  if (b.exponent < 0) return 0;
  const auto magnitude = static_cast<Int64>(b.mantissa >> (63 - b.exponent));
  return b.negative ? -magnitude : magnitude;
}

// -2^63 itself: the one value with exponent 63 that has an Int64.
inline bool IsMinInt64(const ExtendedBits& b) {
  return b.negative && b.exponent == 63 && b.mantissa == 0x8000000000000000ULL;
}

// Trunc(x) for |x| < 2^62, by arithmetic: adding and removing 1.5 2^63 rounds x to the
// nearest integer (the sum's last mantissa bit is worth 1), and one step toward zero makes it
// Trunc. A zero result is +0.
[[gnu::always_inline]] inline Extended NearTrunc(Extended x) {
  constexpr Extended kShift = 0x1.8p63L;
  Extended nearest = (x + kShift) - kShift;
  if (x >= 0) {
    if (nearest > x) nearest -= 1;
  } else if (nearest < x) {
    nearest += 1;
  }
  return nearest;
}

// std::trunc(x) in the 80-bit type, up to the sign of a zero result.
Extended TruncExtended(Extended x) {
  if (std::fabs(x) < 0x1p62L) [[likely]]
    return NearTrunc(x);
  return std::trunc(x);
}

// Below 2^53 the whole number converts to double exactly, and from there to Int64 in one step.
// The step toward zero is taken without a branch: whether rounding went up or down is
// random in the generators.
[[gnu::always_inline]] inline bool SmallTruncInt64(Extended x, Int64& result) {
  if (!(std::fabs(x) < 0x1p53L)) return false;
  constexpr Extended kShift = 0x1.8p63L;
  const Extended nearest = (x + kShift) - kShift;
  const auto whole = static_cast<Int64>(static_cast<double>(nearest));
  const int overshoot = static_cast<int>(x >= 0) & static_cast<int>(nearest > x);
  const int undershoot = static_cast<int>(x < 0) & static_cast<int>(nearest < x);
  result = whole - overshoot + undershoot;
  return true;
}

[[gnu::noinline]] Int64 TruncCheckedFromBits(Extended x) {
  const ExtendedBits b = BitsOf(x);
  if (b.exponent < 63) return SmallTrunc(b);
  if (IsMinInt64(b)) return std::numeric_limits<Int64>::min();
  RaiseMathError(rsInvalidValue);
}

[[gnu::always_inline]] inline Int64 TruncChecked(Extended x) {
  Int64 small;
  if (SmallTruncInt64(x, small)) [[likely]]
    return small;
  return TruncCheckedFromBits(x);
}

// For a candidate that a range test refuses next: values past either end of Int64 (from the
// logarithm of a zero uniform) saturate, so the test sees them as out of range. NaN raises.
[[gnu::noinline]] Int64 TruncSaturatedFromBits(Extended x) {
  const ExtendedBits b = BitsOf(x);
  if (b.exponent < 63) return SmallTrunc(b);
  if (b.nan) RaiseMathError(rsInvalidValue);
  return b.negative ? std::numeric_limits<Int64>::min() : std::numeric_limits<Int64>::max();
}

[[gnu::always_inline]] inline Int64 TruncSaturated(Extended x) {
  Int64 small;
  if (SmallTruncInt64(x, small)) [[likely]]
    return small;
  return TruncSaturatedFromBits(x);
}

// XtoY, with the squares and cubes of the methods (Gamma's (1 + c x)^3, the body's power for
// Shape 1/2) formed in place: XtoY gives the same products.
[[gnu::always_inline]] inline Extended Power(Extended x, Extended y) {
  if (y == 2) return x * x;
  if (y == 3) return x * x * x;
  return XtoY(x, y);
}

// ---------------------------------------------------------------------------------------------
// Normal, log-normal, exponential

// A uniform rounded to double.
template <typename Gen>
double DrawDouble(Gen& gen) {
  return gen.NextDouble();
}

// Leva's ratio of uniforms. The uniforms, the transformed v and the intermediates x, y, q are
// held as doubles (the published method's precision); each of them is computed in Extended
// arithmetic with Extended constants and rounded once when it is stored, like every other
// value of the library. The comparisons, the logarithmic test and the ratio are Extended.
//
// v enters the result, so it is worked out that way whenever it is used: on acceptance and for
// the logarithmic test. x, y and q only steer the two bounds: plain double arithmetic on the
// uniforms, v taken as (v - 0.5) 1.7156 in double (within 5e-16 of the stored v), gives q within
// 2e-15 of the stored value, which settles both bounds alike unless q lies within 1e-9 of one
// of them, and only then is the Extended form computed. So the Extended v stays off the path of
// the rejections. The Extended bounds 0.27597 and 0.27846 lie above their nearest doubles and
// below the next ones, so for a double q, q < 0.27597L is q <= 0.27597 and q > 0.27846L is
// q > 0.27846.
inline double LevaV(double v) { return static_cast<double>((v - 0.5L) * 1.7156L); }

template <typename Gen>
Extended StandardNormal(Gen& gen) {
  double u;
  double v;
  for (;;) {
    u = DrawDouble(gen);
    const double rawV = DrawDouble(gen);
    const double vNear = (rawV - 0.5) * 1.7156;
    double x = u - 0.449871;
    double y = std::fabs(vNear) + 0.386595;
    double q = x * x + y * (0.196 * y - 0.25472 * x);
    // Clear of both bounds (the common case) the estimate decides alone.
    if (q <= 0.27597 - 1e-9) {
      v = LevaV(rawV);
      break;
    }
    if (q >= 0.27846 + 1e-9) continue;
    v = LevaV(rawV);
    if (std::fabs(q - 0.27597) < 1e-9 || std::fabs(q - 0.27846) < 1e-9) {
      x = static_cast<double>(u - 0.449871L);
      y = static_cast<double>(std::fabs(v) + 0.386595L);
      const Extended xe = x;
      const Extended ye = y;
      q = static_cast<double>(xe * xe + ye * (0.196L * ye - 0.25472L * xe));
    }
    if (q <= 0.27597) break;
    if (q > 0.27846) continue;
    if (static_cast<Extended>(v) * v < -4.0L * static_cast<Extended>(u) * u * Ln80(Extended{u})) {
      break;
    }
  }
  if (u < kTiny) RaiseMathError(rsDivideByZero);
  return static_cast<Extended>(v) / u;
}

template <typename Gen>
Extended NormalVariate(Extended mean, Extended stdDev, Gen& gen) {
  return StandardNormal(gen) * stdDev + mean;
}

template <typename Gen>
Extended LogNormalVariate(Extended mean, Extended stdDev, Gen& gen) {
  if (!(mean > 0)) RaiseMathError(rsInvalidMean);
  if (!(stdDev > 0)) RaiseMathError(rsInvalidStdDev);
  const Extended r = stdDev / mean;
  const Extended logSpread = std::log(r * r + 1);
  const Extended mu = std::log(mean) - 0.5L * logSpread;
  const Extended sigma = std::sqrt(logSpread);
  return std::exp(NormalVariate(mu, sigma, gen));
}

template <typename Gen>
Extended ExponentialVariate(Gen& gen) {
  Extended u;
  do {
    u = gen();
  } while (!(u > kTiny));
  return -Ln80(u);
}

// ---------------------------------------------------------------------------------------------
// Gamma and its relatives

// Comparisons with a logarithm on one side are first settled from the logarithm in double:
// only where the two sides lie within the bound below does the Extended logarithm decide.
//
// ln x in double for a positive x in the normal double range, with a bound on its distance
// from the Extended logarithm (Ln80, or std::log where the C library's is still used):
// rounding x to double moves ln x by 1.2e-16, the double log is within an ulp
// (2.3e-16 |ln x|) and so are the Extended ones; 5e-16 (1 + |ln x|) covers all.
struct BoundedLog {
  double value;
  double bound;
};
inline bool DoubleLog(Extended x, BoundedLog& out) {
  const auto xd = static_cast<double>(x);
  if (!(xd > 0x1p-1000 && xd < 0x1p1000)) return false;
  const double value = std::log(xd);
  out = {value, 5e-16 * (1 + std::fabs(value))};
  return true;
}

enum class Settled { kNo, kYes, kUnsure };

// a < b for values known within a +- ea and b +- eb (and the rounding of this test itself).
inline Settled SettleLess(Extended a, Extended ea, Extended b, Extended eb) {
  const Extended slack = ea + eb + 0x1p-61L * (std::fabs(a) + std::fabs(b));
  if (a + slack < b) return Settled::kYes;
  if (a - slack > b) return Settled::kNo;
  return Settled::kUnsure;
}

// Marsaglia and Tsang, for Shape > 1.
template <typename Gen>
Extended GammaLargeShape(Extended shape, Gen& gen) {
  const Extended d = shape - 1.0L / 3.0L;
  const Extended c = 1 / std::sqrt(9 * d);
  for (;;) {
    Extended x;
    Extended t;
    do {
      x = StandardNormal(gen);
      t = Power(1 + c * x, 3);
    } while (!(t > 0));
    const Extended u = gen();
    const Extended x2 = x * x;
    if (u < 1 - 0.0331L * x2 * x2) return d * t;
    // ln u < x^2 / 2 + d (1 - t + ln t), the logarithms first in double: the right side then
    // differs from its Extended value by d times the bound of ln t and its roundings.
    BoundedLog logU;
    BoundedLog logT;
    if (DoubleLog(u, logU) && DoubleLog(t, logT)) {
      const Extended lnT = logT.value;
      const Extended right = 0.5L * x2 + d * (1 - t + lnT);
      const Extended rightError =
          d * Extended(logT.bound) * 1.01L + 0x1p-60L * (0.5L * x2 + d * (1 + t + std::fabs(lnT)));
      const Settled settled = SettleLess(logU.value, logU.bound, right, rightError);
      if (settled == Settled::kYes) return d * t;
      if (settled == Settled::kNo) continue;
    }
    if (Ln80(u) < 0.5L * x2 + d * (1 - t + Ln80(t))) return d * t;
  }
}

// Shape < 1: a power-law body on [0, t] and an exponential tail beyond, t = 1 - Shape.
template <typename Gen>
Extended GammaSmallShape(Extended shape, Gen& gen) {
  if (shape < kTiny) RaiseMathError(rsShapeTooSmall);
  const Extended t = 1 - shape;
  const Extended p = t / (t + shape * Exp80(-t));
  // Below the floor w0 = p (Tiny / t)^Shape the body's candidate would underflow: such a draw
  // gives 0 at once. The power is costly, so w0 (and t ln t, needed by the tail only) are
  // computed on first use. Since Tiny / t <= 1E-304 and p <= 1, w0 <= exp(-699 Shape): a
  // uniform above twice that bound cannot lie under the floor, and w0 is needed only below it.
  // For Shape >= 0.01 the bound is below 2 e^-6.99 < 2^-9, so it is formed only for a uniform
  // under 2^-9 (or a smaller shape).
  double floorBound = -1;  // not formed yet
  const auto underFloorBound = [&floorBound, shape](Extended u) {
    if (!(u < 0x1p-9L) && shape >= 0.01L) return false;
    if (floorBound < 0) floorBound = 2 * std::exp(-699.0 * static_cast<double>(shape));
    return u <= floorBound;
  };
  const Extended oneMinusP = 1 - p;
  const Extended power = 1 / shape;
  Extended w0 = 0;
  bool haveW0 = false;
  Extended tLnT = 0;
  bool haveTLnT = false;
  BoundedLog logT{};  // ln t in double, formed on first use like t ln t
  bool haveLogT = false;
  bool logTValid = false;
  for (;;) {
    const Extended u = gen();
    if (u >= 1) continue;
    if (!(u > p)) {
      // The body: x = t (u / p)^(1 / Shape), accepted if x < 1 - u2, or u2 <= 0, or
      // u2 (1 + x) < 1 and x < -ln u2, the logarithm first in double.
      if (underFloorBound(u)) {
        if (!haveW0) {
          w0 = p * XtoY(kTiny / t, shape);
          haveW0 = true;
        }
        if (u <= w0) return 0;
      }
      const Extended x = t * Power(u / p, power);
      const Extended u2 = gen();
      if (x < 1 - u2) return x;
      if (u2 <= 0) return x;
      if (!(u2 * (1 + x) < 1)) continue;
      BoundedLog logU2;
      if (DoubleLog(u2, logU2)) {
        const Settled beyond = SettleLess(x, 0, -logU2.value, logU2.bound);
        if (beyond == Settled::kYes) return x;
        if (beyond == Settled::kNo) continue;
      }
      if (x < -Ln80(u2)) return x;
      continue;
    }
    // The tail: the same test with w = t ln x - t ln t, first from an estimate within wError.
    const Extended x = t - Ln80((1 - u) / oneMinusP);
    Extended w = 0;
    Extended wError = -1;  // -1: w is not known yet
    BoundedLog logX;
    if (!haveLogT) {
      logTValid = DoubleLog(t, logT);
      haveLogT = true;
    }
    if (DoubleLog(x, logX) && logTValid) {
      const Extended lnX = logX.value;
      const Extended lnT = logT.value;
      w = t * lnX - t * lnT;
      wError = t * Extended(logX.bound + logT.bound) * 1.01L +
               0x1p-60L * t * (std::fabs(lnX) + std::fabs(lnT));
    }
    const Extended u2 = gen();
    if (wError >= 0) {
      const Settled below = SettleLess(w, wError, 1 - u2, 0);
      if (below == Settled::kYes) return x;
      if (below == Settled::kNo) {
        if (u2 <= 0) return x;
        const Settled product = SettleLess(u2 * (1 + w), u2 * wError, 1, 0);
        if (product == Settled::kNo) continue;
        BoundedLog logU2;
        if (product == Settled::kYes && DoubleLog(u2, logU2)) {
          const Settled beyond = SettleLess(w, wError, -logU2.value, logU2.bound);
          if (beyond == Settled::kYes) return x;
          if (beyond == Settled::kNo) continue;
        }
      }
    }
    if (!haveTLnT) {
      tLnT = t * Ln80(t);
      haveTLnT = true;
    }
    w = t * Ln80(x) - tLnT;
    if (w < 1 - u2) return x;
    if (u2 <= 0) return x;
    if (u2 * (1 + w) < 1 && w < -Ln80(u2)) return x;
  }
}

template <typename Gen>
Extended GammaVariate(Extended shape, Gen& gen) {
  if (!(shape > 0)) RaiseMathError(rsInvalidShape);
  if (shape > 1) return GammaLargeShape(shape, gen);
  if (shape < 1) return GammaSmallShape(shape, gen);
  return ExponentialVariate(gen);
}

template <typename Gen>
Extended ChiSquareVariate(LongInt df, Gen& gen) {
  return 2 * GammaVariate(df * 0.5L, gen);
}

template <typename Gen>
Extended WeibullVariate(Extended shape, Gen& gen) {
  if (!(std::fabs(shape) > kTiny)) RaiseMathError(rsInvalidValue);
  return XtoY(ExponentialVariate(gen), 1 / shape);
}

// ---------------------------------------------------------------------------------------------
// Beta and Student t

// Cheng's BA with the larger parameter leading: x ~ Beta(max, min), reflected when A < B.
template <typename Gen>
Extended BetaVariate(Extended a, Extended b, Gen& gen) {
  if (!(a > 0) || !(b > 0)) RaiseMathError(rsInvalidValue);
  const bool reflect = a < b;
  const Extended p = reflect ? b : a;
  const Extended q = reflect ? a : b;
  const Extended alpha = p + q;
  const Extended rho = p / q;
  Extended c;
  Extended h;  // u1 at or above h would overflow w (only for a small min)
  if (q > 1) {
    c = std::sqrt((2 * p * q - alpha) / (alpha - 2));
    h = 1;
  } else {
    c = q;
    h = 1 / (1 + XtoY(p / (kHuge * q), q));
  }
  const Extended gamma = p + c;
  constexpr Extended kLn4 = 1.386294361119890600L;
  Extended x;
  for (;;) {
    const Extended u1 = gen();
    const Extended u2 = gen();
    const Extended z = u1 * u1 * u2;
    if (u1 < kTiny || z <= 0) continue;
    if (u1 < h) {
      const Extended v = std::log(u1 / (1 - u1)) / c;
      const Extended w = rho * std::exp(v);
      const Extended t = alpha * std::log((1 + rho) / (1 + w)) + gamma * v - kLn4;
      if (t < z - 1) {
        if (z - z * t > 1 || t < std::log(z)) continue;
      }
      x = w / (1 + w);
      break;
    }
    if (4 * z <= XtoY(1 + 1 / rho, alpha)) {
      x = 1;
      break;
    }
  }
  return reflect ? 1 - x : x;
}

template <typename Gen>
Extended StudentTVariate(LongInt df, Gen& gen) {
  if (df < 1) RaiseMathError(rsInvalidValue);
  const Extended n = df;
  const Extended e = -0.25L * (n + 1);
  const Extended s = 4 / XtoY(1 + 1 / n, e);
  const Extended c = 16 / s;
  const Extended m = df > 1 ? std::sqrt(2 * n / (n - 1)) * XtoY((n + 1) / (n - 1), e) : 1;
  for (;;) {
    const Extended u = gen();
    if (u <= 0) continue;
    const Extended v = gen();
    const Extended x = (2 * v - 1) * m / u;
    const Extended x2 = x * x;
    if (x2 <= 5 - s * u) return x;
    // The quick rejection c < (x^2 + 3) u only holds the acceptance region inside it from three
    // degrees of freedom on; below that the exact test alone decides.
    if (df >= 3 && c < (x2 + 3) * u) continue;
    if (u <= XtoY(1 + x2 / n, e)) return x;
  }
}

// ---------------------------------------------------------------------------------------------
// Multivariate normal

template <typename Gen>
void MultivariateNormal(const TQENFloatVector& Means, const TQENFloatVector& Covariance,
                        TQENFloatVector& Factor, TQENFloatVector& Variate, LongInt& ErrorCode,
                        Gen& gen) {
  const std::size_t n = Means.size();
  if (n == 0) RaiseMathError(rsVectorEmpty);
  // Past 2^32 - 1 means no covariance could be long enough (and n (n + 1) / 2 would wrap).
  if (n > 0xFFFFFFFFu || Covariance.size() < n * (n + 1) / 2) RaiseMathError(rsVectorTooSmall);

  // The outputs may be the caller's input vectors themselves: read those through copies.
  TQENFloatVector meansCopy;
  TQENFloatVector covarianceCopy;
  const TQENFloatVector* means = &Means;
  const TQENFloatVector* covariance = &Covariance;
  if (&Factor == &Means) means = &(meansCopy = Means);
  if (&Factor == &Covariance) covariance = &(covarianceCopy = Covariance);

  // 1-based (i, j), i <= j: the covariance packed by columns, the factor packed by rows.
  const auto cov = [covariance](std::size_t i, std::size_t j) -> Extended {
    return (*covariance)[(j - 1) * j / 2 + i - 1];
  };
  const auto at = [n](std::size_t i, std::size_t j) { return (i - 1) * (2 * n - i) / 2 + j - 1; };

  ErrorCode = 0;
  Factor.resize(n * (n + 1) / 2);
  const Extended c11 = cov(1, 1);
  if (!(c11 > 0)) {
    ErrorCode = 1;
    return;
  }
  const Extended u11 = std::sqrt(c11);
  Factor[0] = u11;
  for (std::size_t j = 2; j <= n; ++j) Factor[at(1, j)] = cov(1, j) / u11;
  for (std::size_t i = 2; i <= n; ++i) {
    Extended squares = 0;
    for (std::size_t k = 1; k < i; ++k) {
      const Extended uki = Factor[at(k, i)];
      squares += uki * uki;
    }
    const Extended s = cov(i, i) - squares;
    if (!(s > 0)) {
      ErrorCode = 1;
      return;
    }
    const Extended uii = std::sqrt(s);
    Factor[at(i, i)] = uii;
    for (std::size_t j = i + 1; j <= n; ++j) {
      Extended products = 0;
      for (std::size_t k = 1; k < i; ++k) {
        products += Extended(Factor[at(k, i)]) * Extended(Factor[at(k, j)]);
      }
      Factor[at(i, j)] = (cov(i, j) - products) / uii;
    }
  }

  TQENFloatVector factorCopy;
  const TQENFloatVector* factor = &Factor;
  if (&Variate == &Factor) factor = &(factorCopy = Factor);
  Variate = *means;
  for (std::size_t i = 1; i <= n; ++i) {
    const Extended z = StandardNormal(gen);
    for (std::size_t j = i; j <= n; ++j) Variate[j - 1] += Extended((*factor)[at(i, j)]) * z;
  }
}

// ---------------------------------------------------------------------------------------------
// Generalised inverse Gaussian: ratio of uniforms without shift.

template <typename Gen>
Extended InverseGaussianVariate(Extended lambda, Extended omega, Gen& gen) {
  if (lambda < 0 || !(omega > 0) || lambda > 0.25L * omega * std::sqrt(kHuge)) {
    RaiseMathError(rsInvalidValue);
  }
  const Extended a =
      (std::sqrt((lambda + 1) * (lambda + 1) + omega * omega) - (lambda + 1)) / omega;
  const Extended m =
      (std::sqrt((lambda - 1) * (lambda - 1) + omega * omega) + (lambda - 1)) / omega;
  if (!(a > kTiny) || !(m > kTiny)) RaiseMathError(rsInvalidValue);
  const Extended h = (lambda - 1) / 2;
  const Extended q = -omega / 4;
  const Extended c =
      XtoY(m * a, -lambda / 2) * std::sqrt(m / a) * std::exp(omega / 4 * (m + 1 / m - a - 1 / a));
  if (!(c > kTiny)) RaiseMathError(rsInvalidValue);
  const Extended k = -h * std::log(m) - q * (m + 1 / m);
  for (;;) {
    const Extended u = gen();
    if (u <= 0) continue;
    const Extended v = gen();
    const Extended x = c * v / u;
    if (x <= 0) continue;
    if (std::log(u) < h * std::log(x) + q * (x + 1 / x) + k) return x;
  }
}

// ---------------------------------------------------------------------------------------------
// Binomial

// Inversion from the mode, walking outward one step down, one step up. The probabilities are
// held as doubles.
template <typename Gen>
Int64 BinomialFromMode(LongInt n, Extended prob, Gen& gen) {
  // The mode's probability would need ln 0 here; the outcome is certain anyway.
  if (prob == 0) return 0;
  if (prob == 1) return n;
  const Extended trials = n;
  const Int64 mode = TruncChecked((trials + 1) * prob);
  const Extended modeX = static_cast<Extended>(mode);
  const double f = static_cast<double>(
      std::exp(LnGamma(trials + 1) - LnGamma(modeX + 1) - LnGamma(trials - modeX + 1) +
               modeX * std::log(prob) + (trials - modeX) * std::log(1 - prob)));
  const Extended r = prob < 1 ? prob / (1 - prob) : kHuge;
  Extended u = gen() - f;
  if (u < 0) return mode;
  double fLow = f;
  double fHigh = f;
  Int64 low = mode;
  Int64 high = mode;
  for (;;) {
    bool stepped = false;
    if (low > 0) {
      --low;
      fLow = static_cast<double>(fLow * Extended(low + 1) / ((trials - Extended(low)) * r));
      u -= fLow;
      if (u < 0) return low;
      stepped = true;
    }
    if (high < n) {
      ++high;
      fHigh = static_cast<double>(fHigh * (trials - Extended(high) + 1) * r / Extended(high));
      u -= fHigh;
      if (u < 0) return high;
      stepped = true;
    }
    // Both ends reached with u still not negative: the walk could only step on for ever.
    if (!stepped) RaiseMathError(rsInvalidValue);
  }
}

// Inversion for N min(P, 1 - P) <= 30; p <= 0.5 here. A draw that would give 0 is redrawn.
template <typename Gen>
Int64 BinomialInversion(Int64 n, Extended p, Extended q, Gen& gen) {
  const Extended trials = static_cast<Extended>(n);
  const Extended qn = XtoY(q, trials);
  // The probability of 0 is 1 (or NaN): every draw would be redrawn.
  if (!(qn < 1)) RaiseMathError(rsInvalidValue);
  const Extended r = p / q;
  const Extended g = (trials + 1) * r;
  bool flag = false;
  for (;;) {
    Int64 y = 0;
    Extended f = qn;
    Extended u = gen();
    while (u >= f) {
      // Past 110 the values no longer change: the search could not end.
      if (y > 110) RaiseMathError(rsInvalidValue);
      flag = true;
      u -= f;
      ++y;
      f = f * (g / static_cast<Extended>(y) - r);
    }
    if (flag) return y;
  }
}

// Stirling's correction term of BTPE's final test.
inline Extended StirlingTail(Extended a) {
  const Extended a2 = a * a;
  return (13860 - (462 - (132 - (99 - 140 / a2) / a2) / a2) / a2) / a / 166320;
}

// BTPE's test v <= f, f = prod (g/i - r) over i = M + 1..y, or 1 / prod over i = y + 1..M,
// evaluated in Extended factor by factor. The same product in double settles the test first
// unless v lies within its error bound: for i <= 7 (N + 1)/9, g/i >= 9 r / 7 (g / r = N + 1),
// so g/i - r >= (g/i + r) / 8, and each factor's rounding in either precision (g and r
// rounded to double, the quotient, the difference, the product) stays below
// 18 (2^-53 + 2^-64) < 2.1e-15 of it: the double and Extended products differ by less than
// 5e-15 per factor.
inline bool BtpeRecursionAccepts(Extended v, Int64 mode, Int64 y, Extended g, Extended r,
                                 Extended trials) {
  const Int64 from = mode < y ? mode : y;
  const Int64 to = mode < y ? y : mode;
  const Int64 count = to - from;
  if (count <= 1000 && to < (Int64{1} << 53) && 9 * static_cast<Extended>(to) <= 7 * (trials + 1)) {
    const double gd = static_cast<double>(g);
    const double rd = static_cast<double>(r);
    double product = 1;
    for (Int64 i = from + 1; i <= to; ++i) product *= gd / static_cast<double>(i) - rd;
    const double f = mode < y ? product : 1 / product;
    if (f > 1e-290 && f < 1e290) {
      const double slack = 5e-15 * static_cast<double>(count + 2) * f;
      if (v < f - slack) return true;
      if (v > f + slack) return false;
    }
  }
  Extended f = 1;
  for (Int64 i = mode; i < y;) {
    ++i;
    f = f * (g / static_cast<Extended>(i) - r);
  }
  for (Int64 i = y; i < mode;) {
    ++i;
    f = f / (g / static_cast<Extended>(i) - r);
  }
  return v <= f;
}

// BTPE's attempts in double.
//
// Every draw starts with the set-up, which in Extended costs more than the rest of a typical
// draw; the attempts are mostly settled from the set-up run in double: p1 exactly (unless
// 2.195 sqrt(npq) - 4.6 q lies within 1e-12 of a whole number), xm, xl, xr exactly, and c,
// lambdaL, lambdaR, p2, p3, p4 each with a relative error below
//   eps = 2 (6 fm / (p1 - 1/2) + 40) (2^-53 + 2^-64)
// against their Extended values: every quantity's rounding (about 40 roundings and constants
// in all) is bounded by its operands' relative errors, and the only cancellations are fm - xl
// and xr - fm, both at least p1 - 1/2 while fm is their scale. Each later quantity of the
// attempt carries an absolute bound on its distance from the Extended value (its operands'
// bounds, plus a unit 2^-53 + 2^-64 of each operation for the two roundings); a region, a
// truncation or a test is taken from the double values only when the bounds settle it.
// Otherwise (and for N at or above 2^52) the attempt is left to the Extended set-up, on the
// same two uniforms. An attempt settled as a redraw is followed by the next one in double.
enum class FirstAttempt { kAccept, kRedraw, kUnsure };  // of one attempt

class BtpeInDouble {
 public:
  BtpeInDouble(Int64 n, Extended p, Extended q, Extended np, Int64 mode)
      : n(n),
        mode(mode),
        pd(static_cast<double>(p)),
        qd(static_cast<double>(q)),
        npq(static_cast<double>(np) * qd),
        modeD(static_cast<double>(mode)),
        xm(modeD + 0.5) {
    if (n >= (Int64{1} << 52)) return;
    const double spread = 2.195 * std::sqrt(npq) - 4.6 * qd;
    const double whole = std::floor(spread);
    if (!(spread - whole > 1e-12 * spread && whole + 1 - spread > 1e-12 * spread)) return;
    p1 = whole + 0.5;
    const double fm = static_cast<double>(np) + pd;
    xl = xm - p1;
    xr = xm + p1;
    c = 0.134 + 20.5 / (15.3 + modeD);
    double a = (fm - xl) / (fm - xl * pd);
    lambdaL = a * (1 + 0.5 * a);
    a = (xr - fm) / (xr * qd);
    lambdaR = a * (1 + 0.5 * a);
    p2 = p1 * (1 + 2 * c);
    p3 = p2 + c / lambdaL;
    p4 = p3 + c / lambdaR;
    eps = 2 * (6 * fm / (p1 - 0.5) + 40) * kUnit;
    valid = true;
  }

  FirstAttempt Attempt(Extended first, Extended second, Int64& y) const {
    constexpr auto kUnsure = FirstAttempt::kUnsure;
    if (!valid) return kUnsure;
    const double u = static_cast<double>(first) * p4;
    const double uError = u * (eps + 3 * kUnit);
    const double v0 = static_cast<double>(second);
    // Trunc(z) for z within zError of the Extended value, when that settles it (0 <= z < 2^62).
    const auto truncate = [](double z, double zError, Int64& whole) {
      const double low = std::floor(z - zError);
      if (!(z - zError >= 0 && z + zError < 0x1p62) || low != std::floor(z + zError)) {
        return false;
      }
      whole = static_cast<Int64>(low);
      return true;
    };

    if (u + uError < p1) {
      const double z = xm - p1 * v0 + u;
      const double zError = uError + 8 * kUnit * (xm + p1 + u + z);
      return truncate(z, zError, y) ? FirstAttempt::kAccept : kUnsure;
    }
    if (!(u - uError > p1)) return kUnsure;
    double v;       // the v of the final test
    double vError;  // and its bound
    if (u + uError < p2 - p2 * eps) {
      const double offset = (u - p1) / c;
      const double offsetError = (uError + (u - p1) * kUnit) / c + offset * (eps + kUnit);
      const double x = xl + offset;
      const double xError = offsetError + 2 * kUnit * (std::fabs(xl) + std::fabs(x));
      const double distance = std::fabs(xm - x) / p1;
      v = v0 * c + 1 - distance;
      vError = v0 * c * (eps + 3 * kUnit) + (xError + 2 * kUnit * std::fabs(xm - x)) / p1 +
               4 * kUnit * (v0 * c + 1 + distance);
      if (v - vError > 1 || v + vError <= 0) return FirstAttempt::kRedraw;
      if (!(v + vError <= 1 && v - vError > 0)) return kUnsure;
      if (!truncate(x, xError, y)) return kUnsure;
    } else {
      BoundedLog logV;
      if (!DoubleLog(second, logV)) return kUnsure;
      if (u - uError > p2 + p2 * eps && u + uError < p3 - p3 * eps) {
        const double step = logV.value / lambdaL;
        const double x = xl + step;
        const double xError = logV.bound / lambdaL + std::fabs(step) * (eps + 2 * kUnit) +
                              2 * kUnit * (std::fabs(xl) + std::fabs(x));
        if (x + xError <= -1) return FirstAttempt::kRedraw;  // Trunc(x) < 0
        if (!truncate(x, xError, y)) return kUnsure;
        const double width = u - p2;
        v = v0 * width * lambdaL;
        vError =
            v0 * (uError + p2 * eps + width * kUnit) * lambdaL + std::fabs(v) * (eps + 4 * kUnit);
      } else if (u - uError > p3 + p3 * eps) {
        const double step = logV.value / lambdaR;
        const double x = xr - step;
        const double xError = logV.bound / lambdaR + std::fabs(step) * (eps + 2 * kUnit) +
                              2 * kUnit * (std::fabs(xr) + std::fabs(x));
        if (!truncate(x, xError, y)) return kUnsure;
        if (y > n) return FirstAttempt::kRedraw;
        const double width = u - p3;
        v = v0 * width * lambdaR;
        vError =
            v0 * (uError + p3 * eps + width * kUnit) * lambdaR + std::fabs(v) * (eps + 4 * kUnit);
      } else {
        return kUnsure;
      }
    }

    // The test: k = |y - M|, by the recursion for k <= 20 or k >= npq/2 - 1, else the squeeze.
    const Int64 k = y > mode ? y - mode : mode - y;
    const double kD = static_cast<double>(k);
    const double threshold = npq / 2 - 1;
    const double thresholdError = npq * 4 * kUnit;
    if (k > 20 && std::fabs(kD - threshold) <= thresholdError) return kUnsure;
    if (k <= 20 || kD > threshold) {
      // f = prod (g/i - r) over M < i <= y, or its reciprocal over y < i <= M, with g/i - r at
      // least (g/i + r)/8 (see BtpeRecursionAccepts); g and r formed in double from p and q
      // have 4 and 3 units of error, the factor and product two more: under 1e-14 a factor.
      const Int64 from = mode < y ? mode : y;
      const Int64 to = mode < y ? y : mode;
      if (k > 1000 || 9 * static_cast<double>(to) > 7 * (static_cast<double>(n) + 1)) {
        return kUnsure;
      }
      const double r = pd / qd;
      const double g = (static_cast<double>(n) + 1) * r;
      double product = 1;
      for (Int64 i = from + 1; i <= to; ++i) product *= g / static_cast<double>(i) - r;
      const double f = mode < y ? product : 1 / product;
      if (!(f > 1e-290 && f < 1e290)) return kUnsure;
      const double fError = 1e-14 * static_cast<double>(k + 2) * f;
      if (v + vError < f - fError) return FirstAttempt::kAccept;
      if (v - vError > f + fError) return FirstAttempt::kRedraw;
      return kUnsure;
    }
    const double rho = (kD / npq) * ((kD * (kD / 3 + 0.625) + 0.1666666666666) / npq + 0.5);
    const double t = -kD * kD / (2 * npq);
    const double boundsError = (std::fabs(rho) + std::fabs(t)) * 24 * kUnit;
    if (!(v - vError > 0)) return kUnsure;
    BoundedLog logV;
    if (!DoubleLog(v, logV)) return kUnsure;
    // ln of the Extended v: within logV's bound of ln of v in double, and vError / (v - vError)
    // of the first.
    const double logError = logV.bound + vError / (v - vError) + boundsError;
    if (logV.value + logError < t - rho) return FirstAttempt::kAccept;
    if (logV.value - logError > t + rho) return FirstAttempt::kRedraw;
    // The final comparison, ln v <= xm ln(f1/x1) + (N - M + 1/2) ln(z/w)
    // + (y - M) ln(w p / (x1 q)) + S(f1) + S(z) + S(x1) + S(w): each logarithm's argument is
    // formed with at most five roundings, each term and the sum with a few more.
    const double yD = static_cast<double>(y);
    const double nD = static_cast<double>(n);
    const double x1 = yD + 1;
    const double f1 = modeD + 1;
    const double z = nD + 1 - modeD;
    const double w = nD - yD + 1;
    BoundedLog logA, logB, logC;
    if (!DoubleLog(f1 / x1, logA) || !DoubleLog(z / w, logB) ||
        !DoubleLog(w * pd / (x1 * qd), logC)) {
      return kUnsure;
    }
    const double coefficientB = nD - modeD + 0.5;
    const double coefficientC = yD - modeD;
    const double termA = xm * logA.value;
    const double termB = coefficientB * logB.value;
    const double termC = coefficientC * logC.value;
    const auto stirling = [](double x) {
      const double x2 = x * x;
      return (13860 - (462 - (132 - (99 - 140 / x2) / x2) / x2) / x2) / x / 166320;
    };
    const double tails = stirling(f1) + stirling(z) + stirling(x1) + stirling(w);
    const double right = termA + termB + termC + tails;
    const double rightError =
        xm * (logA.bound + 2 * kUnit) + coefficientB * (logB.bound + 2 * kUnit) +
        std::fabs(coefficientC) * (logC.bound + 6 * kUnit) +
        12 * kUnit * (std::fabs(termA) + std::fabs(termB) + std::fabs(termC) + std::fabs(tails));
    const double valueError = vError / (v - vError) + logV.bound;
    if (logV.value + valueError < right - rightError) return FirstAttempt::kAccept;
    if (logV.value - valueError > right + rightError) return FirstAttempt::kRedraw;
    return kUnsure;
  }

 private:
  static constexpr double kUnit = 0x1p-53 + 0x1p-64;
  bool valid = false;
  Int64 n;
  Int64 mode;
  double pd, qd, npq, modeD, xm;
  double p1 = 0, xl = 0, xr = 0, c = 0, lambdaL = 0, lambdaR = 0, p2 = 0, p3 = 0, p4 = 0, eps = 0;
};

// Kachitvichyanukul and Schmeiser's BTPE for N p > 30, p <= 0.5.
template <typename Gen>
Int64 BinomialBtpe(Int64 n, Extended p, Extended q, Extended np, Gen& gen) {
  const Extended fm = np + p;
  const Int64 mode = TruncChecked(fm);
  // Attempts in double while they settle; the first one that does not is taken up by the
  // Extended set-up with the same two uniforms.
  const BtpeInDouble inDouble(n, p, q, np, mode);
  Extended first;
  Extended second;
  FirstAttempt outcome;
  do {
    first = gen();
    second = gen();
    Int64 quick = 0;
    outcome = inDouble.Attempt(first, second, quick);
    if (outcome == FirstAttempt::kAccept) return quick;
  } while (outcome == FirstAttempt::kRedraw);

  const Extended trials = static_cast<Extended>(n);
  const Extended npq = np * q;
  const Extended modeX = static_cast<Extended>(mode);
  const Extended p1 = TruncExtended(2.195L * std::sqrt(npq) - 4.6L * q) + 0.5L;
  const Extended xm = modeX + 0.5L;
  const Extended xl = xm - p1;
  const Extended xr = xm + p1;
  const Extended c = 0.134L + 20.5L / (15.3L + modeX);
  Extended a = (fm - xl) / (fm - xl * p);
  const Extended lambdaL = a * (1 + 0.5L * a);
  a = (xr - fm) / (xr * q);
  const Extended lambdaR = a * (1 + 0.5L * a);
  const Extended p2 = p1 * (1 + 2 * c);
  const Extended p3 = p2 + c / lambdaL;
  const Extended p4 = p3 + c / lambdaR;
  const Extended r = p / q;
  const Extended g = (trials + 1) * r;
  for (bool drawn = true;; drawn = false) {
    if (!drawn) {
      first = gen();
      second = gen();
    }
    const Extended u = first * p4;
    Extended v = second;
    Int64 y;
    if (u <= p1) return TruncSaturated(xm - p1 * v + u);
    if (u <= p2) {
      const Extended x = xl + (u - p1) / c;
      v = v * c + 1 - std::fabs(xm - x) / p1;
      if (v > 1 || v <= 0) continue;
      y = TruncSaturated(x);
    } else if (u <= p3) {
      y = TruncSaturated(xl + std::log(v) / lambdaL);
      if (y < 0) continue;
      v = v * (u - p2) * lambdaL;
    } else {
      y = TruncSaturated(xr - std::log(v) / lambdaR);
      if (y > n) continue;
      v = v * (u - p3) * lambdaR;
    }
    const Extended yX = static_cast<Extended>(y);
    const Extended k = std::fabs(yX - modeX);
    if (k <= 20 || k >= npq / 2 - 1) {
      if (BtpeRecursionAccepts(v, mode, y, g, r, trials)) return y;
      continue;
    }
    const Extended rho = (k / npq) * ((k * (k / 3 + 0.625L) + 0.1666666666666L) / npq + 0.5L);
    const Extended t = -k * k / (2 * npq);
    // The squeeze, first from ln v in double.
    BoundedLog approximateLogV;
    if (DoubleLog(v, approximateLogV)) {
      const Settled below = SettleLess(approximateLogV.value, approximateLogV.bound, t - rho, 0);
      if (below == Settled::kYes) return y;
      if (below == Settled::kNo &&
          SettleLess(t + rho, 0, approximateLogV.value, approximateLogV.bound) == Settled::kYes) {
        continue;
      }
    }
    const Extended logV = std::log(v);
    if (logV < t - rho) return y;
    if (logV > t + rho) continue;
    const Extended x1 = yX + 1;
    const Extended f1 = modeX + 1;
    const Extended z = trials + 1 - modeX;
    const Extended w = trials - yX + 1;
    if (logV <= xm * std::log(f1 / x1) + (trials - modeX + 0.5L) * std::log(z / w) +
                    (yX - modeX) * std::log(w * p / (x1 * q)) + StirlingTail(f1) + StirlingTail(z) +
                    StirlingTail(x1) + StirlingTail(w)) {
      return y;
    }
  }
}

template <typename Gen>
Int64 BinomialVariate(Int64 n, Extended prob, Gen& gen) {
  const Extended p = 1 - prob < prob ? 1 - prob : prob;  // MinXY(P, 1 - P)
  const Extended q = 1 - p;
  const Extended np = static_cast<Extended>(n) * p;
  const Int64 y = np <= 30 ? BinomialInversion(n, p, q, gen) : BinomialBtpe(n, p, q, np, gen);
  return prob > 0.5L ? detail::WrappingSub64(n, y) : y;
}

template <typename Gen>
Int64 NegativeBinomialVariate(Extended r, Extended prob, Gen& gen) {
  if (!(r > 0) || !(prob > 0) || !(prob < 1)) RaiseMathError(rsInvalidValue);
  const Extended q = 1 - prob;
  Extended count = 0;  // whole numbers, kept as Extended so that no sum can overflow
  Extended rho = r;
  if (prob > 0.7L) {
    // One geometric variate per whole unit of R.
    const Int64 whole = TruncChecked(r);
    const Extended logP = std::log(prob);
    for (Int64 i = 0; i < whole; ++i) {
      Extended u;
      do {
        u = gen();
      } while (!(u > 0));
      count += TruncExtended(std::log(u) / logP);
    }
    rho = r - static_cast<Extended>(whole);
  }
  if (rho > std::log(kTiny) / std::log(q)) RaiseMathError(rsInvalidValue);
  Extended f = XtoY(q, rho);
  Extended x = 0;
  Extended a = rho;
  Extended u = gen();
  while (u >= f) {
    // Once the probabilities have underflowed to zero, u can no longer fall below them.
    if (f == 0) RaiseMathError(rsInvalidValue);
    u -= f;
    x += 1;
    f = f * prob * a / x;
    a += 1;
  }
  return TruncChecked(count + x + 0.5L);
}

// ---------------------------------------------------------------------------------------------
// von Mises: intervals of [0, pi] on which K cos theta falls by one, chosen by their exact
// probability, then Forsythe's comparison method inside the chosen interval.

constexpr std::array<Extended, 3> kLegendreNodes = {0.238619186083197L, 0.661209386466265L,
                                                    0.932469514203152L};
constexpr std::array<Extended, 3> kLegendreWeights = {0.467913934572691L, 0.360761573048139L,
                                                      0.171324492379170L};

Extended VonMisesMass(Extended from, Extended to, Extended k) {
  const Extended middle = (from + to) / 2;
  const Extended half = (to - from) / 2;
  Extended sum = 0;
  for (std::size_t i = 0; i < kLegendreNodes.size(); ++i) {
    const Extended offset = half * kLegendreNodes[i];
    sum += kLegendreWeights[i] *
           (std::exp(k * std::cos(middle - offset)) + std::exp(k * std::cos(middle + offset)));
  }
  return half * sum;
}

template <typename Gen>
Extended VonMisesVariate(Extended k, Gen& gen) {
  if (!(k >= 0) || !(2 * k + 1 < 21)) RaiseMathError(rsInvalidValue);
  int n = static_cast<int>(2 * k + 1);  // 1..20
  std::array<Extended, 21> theta{};     // bounds theta[0..n]
  std::array<Extended, 21> prob{};      // prob[1..n]
  if (k > 0.5L) {
    for (int i = 1; i < n; ++i) theta[i] = QENArcCos(1 - i / k);
    theta[n] = QENPi;
    Extended total = 0;
    for (int i = 1; i <= n; ++i) {
      prob[i] = VonMisesMass(theta[i - 1], theta[i], k);
      total += prob[i];
    }
    for (int i = 1; i <= n; ++i) prob[i] /= total;
  } else {
    n = 1;
    theta[1] = QENPi;
    prob[1] = 1;
  }

  Extended u = gen();
  int j = n;
  Extended width = 0;  // stays 0 when rounding lets u survive every interval
  for (int i = 1; i <= n; ++i) {
    u -= prob[i];
    if (u < 0) {
      j = i;
      width = theta[i] - theta[i - 1];
      break;
    }
  }
  Extended s = -u / prob[j];
  for (;;) {
    const Extended angle = theta[j - 1] + width * s;
    const Extended h = (k - j + 1) - k * std::cos(angle);
    bool odd = true;
    Extended previous = h;
    do {
      u = gen();
      if (u <= previous) {
        odd = !odd;
        previous = u;
      }
    } while (!(u > previous));
    if (odd) {
      const Extended sign = (u - previous) / (1 - previous) - 0.5L;
      return sign < 0 ? -std::fabs(angle) : std::fabs(angle);
    }
    s = gen();
  }
}

template <typename Gen>
Extended CauchyVariate(Gen& gen) {
  Extended x;
  Extended y;
  do {
    x = 2 * (gen() - 0.5L);
    y = 2 * (gen() - 0.5L);
  } while (!(std::fabs(y) > kTiny && x * x + y * y < 1));
  return x / y;
}

// ---------------------------------------------------------------------------------------------
// Poisson: Ahrens and Dieter's algorithm PD.

// Case B, Mu <= 10: inversion with a cumulative table built during the call.
template <typename Gen>
Int64 PoissonByTable(Extended mu, Gen& gen) {
  constexpr int kTableSize = 35;
  const int m = mu < 1 ? 1 : static_cast<int>(mu);  // MaxXY(1, Trunc(Mu)), Mu <= 10
  const Extended p0 = std::exp(-mu);
  std::array<Extended, kTableSize + 1> cumulative{};  // cumulative[1..35]
  bool full = false;
  for (;;) {
    const Extended u = gen();
    if (u <= p0) return 0;
    if (full) {
      const int start = u > 0.458L ? std::min(kTableSize, m) : 1;
      for (int k = start; k <= kTableSize; ++k) {
        if (u <= cumulative[k]) return k;
      }
      continue;
    }
    Extended p = p0;
    Extended q = p0;
    for (int k = 1; k <= kTableSize; ++k) {
      p = p * mu / k;
      q += p;
      cumulative[k] = q;
      if (u <= q) return k;
    }
    full = true;
  }
}

constexpr std::array<Extended, 10> kFactorials = {1, 1, 2, 6, 24, 120, 720, 5040, 40320, 362880};

// Case A, Mu > 10: a normal candidate with squeeze, quotient and hat tests.
template <typename Gen>
Int64 PoissonByNormal(Extended mu, Gen& gen) {
  const Extended s = std::sqrt(mu);
  const Extended d = 6 * mu * mu;
  const Int64 bigL = TruncChecked(mu - 1.1484L);

  // Step N. K and u stay 0 when g is exactly 0 (step N is skipped, step Q is not).
  Int64 k = 0;
  Extended u = 0;
  const Extended g = mu + s * StandardNormal(gen);
  if (g > 0) {
    k = TruncChecked(g);
    if (k >= bigL) return k;
    u = gen();
    const Extended difference = mu - static_cast<Extended>(k);
    if (d * u >= difference * difference * difference) return k;
  }

  // Step P.
  const Extended omega = 0.3989423L / s;
  const Extended b1 = 0.04166667L / mu;
  const Extended b2 = 0.3L * b1 * b1;
  const Extended c3 = 0.1428571L * b1 * b2;
  const Extended c2 = b2 - 15 * c3;
  const Extended c1 = b1 - 6 * b2 + 45 * c3;
  const Extended c0 = 1 - b1 + 3 * b2 - 15 * c3;
  const Extended c = 0.1069L / mu;

  // Procedure F.
  Extended px = 0;
  Extended py = 0;
  Extended fx = 0;
  Extended fy = 0;
  const auto procedureF = [&](Int64 candidate) {
    const Extended kx = static_cast<Extended>(candidate);
    if (candidate >= 0 && candidate < 10) {
      px = -mu;
      py = XtoY(mu, kx) / kFactorials[static_cast<std::size_t>(candidate)];
    } else {
      Extended delta = 0.08333333L / kx;
      delta = delta - 4.8L * delta * delta * delta;
      const Extended v = (mu - kx) / kx;
      if (std::fabs(v) <= 0.25L) {
        constexpr Extended a0 = -0.5L, a1 = 0.3333333L, a2 = -0.2500068L, a3 = 0.2000118L;
        constexpr Extended a4 = -0.1661269L, a5 = 0.1421878L, a6 = -0.1384794L, a7 = 0.1250060L;
        px = kx * v * v *
                 (((((((a7 * v + a6) * v + a5) * v + a4) * v + a3) * v + a2) * v + a1) * v + a0) -
             delta;
      } else {
        px = kx * std::log(1 + v) - (mu - kx) - delta;
      }
      py = 0.3989423L / std::sqrt(kx);
    }
    const Extended x = (0.5L - (mu - kx)) / s;
    const Extended x2 = x * x;
    fx = -0.5L * x2;
    fy = omega * (((c3 * x2 + c2) * x2 + c1) * x2 + c0);
  };

  // Step Q.
  if (g >= 0) {
    procedureF(k);
    if (fy - u * fy <= py * std::exp(px - fx)) return k;
  }
  // Steps E and H.
  for (;;) {
    const Extended e = ExponentialVariate(gen);
    u = 2 * gen() - 1;
    const Extended t = u >= 0 ? 1.8L + e : 1.8L - e;
    if (t <= -0.6744L) continue;
    k = TruncChecked(mu + s * t);
    procedureF(k);
    if (c * std::fabs(u) <= py * std::exp(px + e) - fy * std::exp(fx + e)) return k;
  }
}

template <typename Gen>
Int64 PoissonVariate(Extended mu, Gen& gen) {
  if (mu <= 10) return PoissonByTable(mu, gen);
  return PoissonByNormal(mu, gen);
}

}  // namespace

// ---------------------------------------------------------------------------------------------
// The uniform source

Extended VerdanRandom() { return UniformFromBits(NextBits(CurrentStream())); }

void SetRandSeed(std::uint64_t Seed) {
  std::lock_guard<std::mutex> lock(gSeedLock);
  gSeed = Seed;
  gNextStream = 1;
  const std::uint64_t epoch = gEpoch.load(std::memory_order_relaxed) + 1;
  gEpoch.store(epoch, std::memory_order_release);
  StartStream(tStream, Seed, 0);
  tStream.epoch = epoch;
}

void Randomize() {
  const auto wall =
      static_cast<std::uint64_t>(std::chrono::system_clock::now().time_since_epoch().count());
  const auto steady =
      static_cast<std::uint64_t>(std::chrono::steady_clock::now().time_since_epoch().count());
  const auto thread =
      static_cast<std::uint64_t>(std::hash<std::thread::id>{}(std::this_thread::get_id()));
  SetRandSeed(Mix64(wall) ^ Mix64(steady + 0x9E3779B97F4A7C15ULL) ^ Mix64(~thread));
}

// ---------------------------------------------------------------------------------------------
// The generators, one row each: result, public name, parameters, method, arguments. A row
// writes both overloads: the one that takes a TRandomGenFunction runs the method on it through
// WithSource (a known engine behind it is drawn inline, giving the same uniforms), its twin runs
// the method on a ThreadSource.
#define TOVRIN_RANDOM_GENERATORS(X)                                                            \
  X(Extended, Random_Normal, (), StandardNormal, ())                                           \
  X(Extended, Random_Normal, (Extended Mean, Extended StdDev), NormalVariate, (Mean, StdDev))  \
  X(Extended, Random_LogNormal, (Extended Mean, Extended StdDev), LogNormalVariate,            \
    (Mean, StdDev))                                                                            \
  X(Extended, Random_Gamma, (Extended Shape), GammaVariate, (Shape))                           \
  X(Extended, Random_ChiSq, (LongInt DF), ChiSquareVariate, (DF))                              \
  X(Extended, Random_Exponential, (), ExponentialVariate, ())                                  \
  X(Extended, Random_Weibull, (Extended Shape), WeibullVariate, (Shape))                       \
  X(Extended, Random_Beta, (Extended A, Extended B), BetaVariate, (A, B))                      \
  X(Extended, Random_T, (LongInt DF), StudentTVariate, (DF))                                   \
  X(void, Random_MVNorm,                                                                       \
    (const TQENFloatVector& Means, const TQENFloatVector& Covariance, TQENFloatVector& Factor, \
     TQENFloatVector& Variate, LongInt& ErrorCode),                                            \
    MultivariateNormal, (Means, Covariance, Factor, Variate, ErrorCode))                       \
  X(Extended, Random_Inv_Gauss, (Extended Lambda, Extended Omega), InverseGaussianVariate,     \
    (Lambda, Omega))                                                                           \
  X(Int64, Random_Binomial1, (LongInt N, Extended P), BinomialFromMode, (N, P))                \
  X(Int64, Random_Binomial2, (Int64 N, Extended P), BinomialVariate, (N, P))                   \
  X(Int64, Random_Neg_Binomial, (Extended R, Extended P), NegativeBinomialVariate, (R, P))     \
  X(Extended, Random_von_Mises, (Extended K), VonMisesVariate, (K))                            \
  X(Extended, Random_Cauchy, (), CauchyVariate, ())                                            \
  X(Int64, Random_Poisson, (const Extended& Mu), PoissonVariate, (Mu))

// A parenthesised list without its parentheses, followed by a comma unless it is empty.
#define TOVRIN_LEADING(...) __VA_ARGS__ __VA_OPT__(, )
#define TOVRIN_UNPARENTHESISED(...) __VA_ARGS__

#define TOVRIN_DEFINE_GENERATOR(Result, Name, Params, Method, Args)                           \
  Result Name(TOVRIN_LEADING Params TRandomGenFunction Gen) {                                 \
    return WithSource(Gen, [&](auto& source) { return Method(TOVRIN_LEADING Args source); }); \
  }                                                                                           \
  Result Name(TOVRIN_UNPARENTHESISED Params) {                                                \
    ThreadSource gen;                                                                         \
    return Method(TOVRIN_LEADING Args gen);                                                   \
  }
TOVRIN_RANDOM_GENERATORS(TOVRIN_DEFINE_GENERATOR)
#undef TOVRIN_DEFINE_GENERATOR
#undef TOVRIN_UNPARENTHESISED
#undef TOVRIN_LEADING
#undef TOVRIN_RANDOM_GENERATORS

}  // namespace tovrin
