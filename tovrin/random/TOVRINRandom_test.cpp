// Tests of the uniform source and the random-variate generators.
//
// Two kinds of test. Exact behaviours use a scripted source that hands out a fixed list of
// uniforms and counts them: the draw order, the literal guards, the shortcuts and the checks
// (every identifier is raised before the first draw). Distribution tests draw 100000 variates
// from a seeded good source and compare them with reference quantiles, probabilities and
// moments computed by TOVRINRandom_test_reference.py (mpmath): a chi-square goodness-of-fit
// test at upper-tail probability 1e-6, and the mean and variance within six standard errors.
// The seeds are fixed, so the tests are deterministic; the thresholds are set by the
// probabilities above and were not fitted to the seeds.
#include "tovrin/random/TOVRINRandom.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <functional>
#include <initializer_list>
#include <limits>
#include <random>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace tovrin {
namespace {

constexpr long double kNaN = std::numeric_limits<long double>::quiet_NaN();
constexpr long double kInf = std::numeric_limits<long double>::infinity();

struct ContinuousReference {
  const char* name;
  std::array<long double, 39> edges;  // quantiles at 1/40 .. 39/40
  long double mean;
  long double variance;
  long double central4;
};

struct DiscreteReference {
  const char* name;
  std::vector<Int64> lastValues;  // bin i holds the values up to lastValues[i]
  std::vector<long double> probabilities;
  long double mean;
  long double variance;
  long double central4;
  long double critical;  // chi-square critical value at 1e-6 for these bins
};

#include "tovrin/random/TOVRINRandom_test_reference.inc"

// A uniform source handing out a fixed list of values; running out fails the test.
class ScriptedSource {
 public:
  ScriptedSource(std::initializer_list<Extended> values) : values_(values) {}
  Extended operator()() {
    if (next_ >= values_.size()) throw std::out_of_range("scripted source ran out");
    return values_[next_++];
  }
  std::size_t Draws() const { return next_; }

 private:
  std::vector<Extended> values_;
  std::size_t next_ = 0;
};

// A good independent source: std::mt19937_64 scaled by 2^-64, counting its draws.
class EngineSource {
 public:
  explicit EngineSource(std::uint64_t seed) : engine_(seed) {}
  Extended operator()() {
    ++draws_;
    return static_cast<Extended>(engine_()) * 0x1p-64L;
  }
  std::size_t Draws() const { return draws_; }

 private:
  std::mt19937_64 engine_;
  std::size_t draws_ = 0;
};

template <typename F>
void ExpectRaises(TResStringId ident, F&& call) {
  try {
    call();
    ADD_FAILURE() << "no EMathError, expected " << ResStringName(ident);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), ident) << "raised " << ResStringName(e.Ident()) << ", expected "
                                << ResStringName(ident);
  }
}

// Raises ident through the scripted overload without drawing, and through the overload without
// a source without moving the thread's stream.
template <typename WithSource, typename WithoutSource>
void ExpectRaisesBeforeDraw(TResStringId ident, WithSource&& withSource,
                            WithoutSource&& withoutSource) {
  ScriptedSource script{0.5L, 0.5L, 0.5L, 0.5L};
  ExpectRaises(ident, [&] { withSource(TRandomGenFunction(script)); });
  EXPECT_EQ(script.Draws(), 0u) << ResStringName(ident);
  SetRandSeed(77);
  const Extended first = VerdanRandom();
  SetRandSeed(77);
  ExpectRaises(ident, withoutSource);
  EXPECT_EQ(VerdanRandom(), first) << ResStringName(ident);
}

// ---------------------------------------------------------------------------------------------
// The uniform source and the source reference

Extended ScriptedGlobalValue() { return 0.25L; }
double DoubleValuedSource() { return 0.75; }

TEST(TRandomGenFunction, IsACheapReference) {
  static_assert(std::is_trivially_copyable_v<TRandomGenFunction>);
  static_assert(sizeof(TRandomGenFunction) <= 2 * sizeof(void*));
  static_assert(!std::is_constructible_v<TRandomGenFunction, int>);
  static_assert(!std::is_constructible_v<TRandomGenFunction, Extended (*)(int)>);
}

TEST(TRandomGenFunction, AcceptsFunctionsAndCallables) {
  EXPECT_EQ(TRandomGenFunction(ScriptedGlobalValue)(), 0.25L);
  EXPECT_EQ(TRandomGenFunction(&ScriptedGlobalValue)(), 0.25L);
  EXPECT_EQ(TRandomGenFunction(DoubleValuedSource)(), 0.75L);
  int calls = 0;
  auto counting = [&calls] {
    ++calls;
    return Extended{0.5L};
  };
  TRandomGenFunction ref(counting);
  const TRandomGenFunction copy = ref;
  EXPECT_EQ(ref(), 0.5L);
  EXPECT_EQ(copy(), 0.5L);
  EXPECT_EQ(calls, 2);
  Extended next = 0;
  auto stepping = [next]() mutable { return next += 0.125L; };  // state lives in the object
  TRandomGenFunction steps(stepping);
  EXPECT_EQ(steps(), 0.125L);
  EXPECT_EQ(steps(), 0.25L);
  const std::function<Extended()> wrapped = [] { return Extended{0.375L}; };
  EXPECT_EQ(TRandomGenFunction(wrapped)(), 0.375L);
  // A lambda written in the argument list lives through the call.
  EXPECT_EQ(Random_Exponential([] { return Extended{0.5L}; }), std::log(2.0L));
}

TEST(VerdanRandom, Seed0GivesTheXoshiroReferenceStream) {
  SetRandSeed(0);
  for (std::uint64_t expected : kXoshiroSeed0) {
    const Extended x = VerdanRandom();
    EXPECT_EQ(static_cast<std::uint64_t>(x * 0x1p64L), expected);
  }
}

TEST(VerdanRandom, SixtyFourBitUniformOnHalfOpenInterval) {
  SetRandSeed(2026);
  constexpr int kDraws = 200000;
  std::array<int, 40> counts{};
  long double sum = 0;
  bool lowBitsSeen = false;
  for (int i = 0; i < kDraws; ++i) {
    const Extended x = VerdanRandom();
    ASSERT_GE(x, 0.0L);
    ASSERT_LT(x, 1.0L);
    const Extended scaled = x * 0x1p64L;
    ASSERT_EQ(scaled, std::trunc(scaled));                    // a multiple of 2^-64
    if (std::fmod(scaled, 2048.0L) != 0) lowBitsSeen = true;  // finer than a double
    ++counts[static_cast<std::size_t>(x * 40)];
    sum += x;
  }
  EXPECT_TRUE(lowBitsSeen);
  long double chi = 0;
  const long double expected = kDraws / 40.0L;
  for (int c : counts) chi += (c - expected) * (c - expected) / expected;
  EXPECT_LT(chi, kChiSquareCriticalBins);
  EXPECT_NEAR(sum / kDraws, 0.5L, 6 * std::sqrt(1.0L / 12 / kDraws));
}

TEST(VerdanRandom, SeedingMakesTheCallingThreadReproducible) {
  SetRandSeed(99);
  std::vector<Extended> first;
  for (int i = 0; i < 5; ++i) first.push_back(VerdanRandom());
  // Another thread drawing meanwhile does not disturb this thread's stream.
  SetRandSeed(99);
  const Extended a = VerdanRandom();
  std::thread other([] {
    for (int i = 0; i < 1000; ++i) VerdanRandom();
  });
  other.join();
  EXPECT_EQ(a, first[0]);
  for (int i = 1; i < 5; ++i) EXPECT_EQ(VerdanRandom(), first[static_cast<std::size_t>(i)]);
  // The same seed set on another thread gives that thread the same sequence.
  std::vector<Extended> there;
  std::thread seeded([&there] {
    SetRandSeed(99);
    for (int i = 0; i < 5; ++i) there.push_back(VerdanRandom());
  });
  seeded.join();
  EXPECT_EQ(there, first);
  // A different seed gives a different sequence.
  SetRandSeed(100);
  EXPECT_NE(VerdanRandom(), first[0]);
}

TEST(VerdanRandom, RandomizeSeedsFromTheClock) {
  SetRandSeed(0);
  const Extended seeded = VerdanRandom();
  Randomize();
  const Extended first = VerdanRandom();
  Randomize();
  const Extended second = VerdanRandom();
  EXPECT_NE(first, seeded);
  EXPECT_NE(first, second);
}

TEST(VerdanRandom, ThreadsDrawDistinctStreamsConcurrently) {
  SetRandSeed(5);
  constexpr int kThreads = 4;
  constexpr int kDraws = 20000;
  std::vector<std::vector<Extended>> values(kThreads);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([&values, t] {
      for (int i = 0; i < kDraws; ++i)
        values[static_cast<std::size_t>(t)].push_back(VerdanRandom());
    });
  }
  for (auto& thread : threads) thread.join();
  std::vector<Extended> all;
  for (const auto& v : values) {
    ASSERT_EQ(v.size(), static_cast<std::size_t>(kDraws));
    all.insert(all.end(), v.begin(), v.end());
  }
  std::sort(all.begin(), all.end());
  EXPECT_EQ(std::adjacent_find(all.begin(), all.end()), all.end());  // no shared stream
}

TEST(VerdanRandom, OverloadsWithoutSourceDrawAsVerdanRandomDoes) {
  Extended mu = 37.5L;
  const std::vector<std::function<Extended(bool)>> pairs = {
      [](bool v) { return v ? Random_Normal(VerdanRandom) : Random_Normal(); },
      [](bool v) { return v ? Random_Normal(2, 3, VerdanRandom) : Random_Normal(2, 3); },
      [](bool v) { return v ? Random_LogNormal(2, 3, VerdanRandom) : Random_LogNormal(2, 3); },
      [](bool v) { return v ? Random_Gamma(0.4L, VerdanRandom) : Random_Gamma(0.4L); },
      [](bool v) { return v ? Random_Gamma(3.5L, VerdanRandom) : Random_Gamma(3.5L); },
      [](bool v) { return v ? Random_ChiSq(7, VerdanRandom) : Random_ChiSq(7); },
      [](bool v) { return v ? Random_Exponential(VerdanRandom) : Random_Exponential(); },
      [](bool v) { return v ? Random_Weibull(1.5L, VerdanRandom) : Random_Weibull(1.5L); },
      [](bool v) { return v ? Random_Beta(0.5L, 2, VerdanRandom) : Random_Beta(0.5L, 2); },
      [](bool v) { return v ? Random_T(4, VerdanRandom) : Random_T(4); },
      [](bool v) { return v ? Random_Inv_Gauss(1, 2, VerdanRandom) : Random_Inv_Gauss(1, 2); },
      [](bool v) {
        return Extended(v ? Random_Binomial1(40, 0.3L, VerdanRandom) : Random_Binomial1(40, 0.3L));
      },
      [](bool v) {
        return Extended(v ? Random_Binomial2(400, 0.3L, VerdanRandom)
                          : Random_Binomial2(400, 0.3L));
      },
      [](bool v) {
        return Extended(v ? Random_Neg_Binomial(2.5L, 0.8L, VerdanRandom)
                          : Random_Neg_Binomial(2.5L, 0.8L));
      },
      [](bool v) { return v ? Random_von_Mises(3, VerdanRandom) : Random_von_Mises(3); },
      [](bool v) { return v ? Random_Cauchy(VerdanRandom) : Random_Cauchy(); },
      [&mu](bool v) { return Extended(v ? Random_Poisson(mu, VerdanRandom) : Random_Poisson(mu)); },
  };
  for (std::size_t i = 0; i < pairs.size(); ++i) {
    SetRandSeed(1000 + i);
    std::vector<Extended> with;
    for (int k = 0; k < 50; ++k) with.push_back(pairs[i](true));
    const Extended nextWith = VerdanRandom();
    SetRandSeed(1000 + i);
    for (int k = 0; k < 50; ++k) EXPECT_EQ(pairs[i](false), with[static_cast<std::size_t>(k)]) << i;
    EXPECT_EQ(VerdanRandom(), nextWith) << i;  // the same number of draws
  }
  TQENFloatVector means{1, 2}, cov{4, 1, 3}, factor, variate1, variate2;
  LongInt error = 0;
  SetRandSeed(3);
  Random_MVNorm(means, cov, factor, variate1, error, VerdanRandom);
  SetRandSeed(3);
  Random_MVNorm(means, cov, factor, variate2, error);
  EXPECT_EQ(std::vector<Extended>(variate1.begin(), variate1.end()),
            std::vector<Extended>(variate2.begin(), variate2.end()));
}

// ---------------------------------------------------------------------------------------------
// Exact behaviours with scripted uniforms

TEST(RandomNormal, LevaDrawsUFirstThenV) {
  ScriptedSource script{0.5L, 0.6L};
  // u = 0.5, v = (0.6 - 0.5) * 1.7156 = 0.17156: accepted at once, v / u = 0.34312.
  EXPECT_NEAR(Random_Normal(script), 0.34312L, 1e-15L);
  EXPECT_EQ(script.Draws(), 2u);
  ScriptedSource swapped{0.6L, 0.5L};  // v = 0 exactly
  EXPECT_EQ(Random_Normal(swapped), 0.0L);
}

TEST(RandomNormal, TransformedVIsRoundedOnceToDouble) {
  // v = (v - 0.5) * 1.7156 is worked out in Extended with the Extended constant and rounded
  // once to double; plain double arithmetic lands one double ulp higher on these uniforms.
  // Expected values from TOVRINRandom_test_normal_reference.py (mpmath, exact roundings).
  struct Case {
    Extended v;
    Extended expected;
  };
  for (const Case& c : {Case{0.5021L, 0x1.d83890c02c283p-8L}, Case{0.5065L, 0x1.6d68b926fd97bp-6L},
                        Case{0.5089L, 0x1.f4545039535efp-6L}}) {
    ScriptedSource script{0.5L, c.v};
    EXPECT_EQ(Random_Normal(script), c.expected) << static_cast<double>(c.v);
    ScriptedSource scaled{0.5L, c.v};
    EXPECT_EQ(Random_Normal(1, 1, scaled), 1 + c.expected) << static_cast<double>(c.v);
  }
}

TEST(RandomNormal, PairsAtTheBoundsFollowTheExtendedQuotient) {
  // u = 0.5 with v placing q within 1e-15 of a bound (outcomes from
  // TOVRINRandom_test_normal_reference.py): next to 0.27597 both pairs are accepted, one by the
  // bound and one by the log test; next to 0.27846 both are rejected, and (0.5, 0.6) follows.
  ScriptedSource inner{0.5L, 0x1.f6fd66ad92a84p-1L};
  EXPECT_EQ(Random_Normal(inner), 0x1.a7bc5c49ef6b6p+0L);
  ScriptedSource logAccept{0.5L, 0x1.f6fd66ad92a85p-1L};
  EXPECT_EQ(Random_Normal(logAccept), 0x1.a7bc5c49ef6b8p+0L);
  for (Extended v : {0x1.f8972c00f75c0p-1L, 0x1.f8972c00f75c1p-1L}) {
    ScriptedSource rejected{0.5L, v, 0.5L, 0.6L};
    EXPECT_NEAR(Random_Normal(rejected), 0.34312L, 1e-15L);
    EXPECT_EQ(rejected.Draws(), 4u);
  }
}

TEST(RandomNormal, RejectedPairsAreRedrawn) {
  // (0.01, 0.99): q is about 0.63, past the outer bound; (0, 0.5): u = 0 makes the log test NaN.
  ScriptedSource script{0.01L, 0.99L, 0.0L, 0.5L, 0.5L, 0.6L};
  EXPECT_NEAR(Random_Normal(script), 0.34312L, 1e-15L);
  EXPECT_EQ(script.Draws(), 6u);
}

TEST(RandomNormal, AcceptedUBelowTinyRaisesDivideByZero) {
  // The smallest double: v = 0 passes the log test, then u < 5.0E-324 refuses the division.
  ScriptedSource script{static_cast<Extended>(std::numeric_limits<double>::denorm_min()), 0.5L};
  ExpectRaises(rsDivideByZero, [&] { Random_Normal(script); });
  EXPECT_EQ(script.Draws(), 2u);
}

TEST(RandomNormal, MeanAndStdDevScaleTheSameDraws) {
  ScriptedSource script{0.5L, 0.6L};
  EXPECT_NEAR(Random_Normal(10, -2, script), 10 - 2 * 0.34312L, 1e-14L);  // StdDev < 0 is used
  ScriptedSource zero{0.5L, 0.6L};
  EXPECT_EQ(Random_Normal(10, 0, zero), 10.0L);
}

TEST(RandomLogNormal, ChecksComeBeforeAnyDraw) {
  ExpectRaisesBeforeDraw(
      rsInvalidMean, [](TRandomGenFunction g) { Random_LogNormal(0, 1, g); },
      [] { Random_LogNormal(0, 1); });
  ExpectRaisesBeforeDraw(
      rsInvalidMean, [](TRandomGenFunction g) { Random_LogNormal(-1, -1, g); },
      [] { Random_LogNormal(-1, -1); });
  ExpectRaisesBeforeDraw(
      rsInvalidStdDev, [](TRandomGenFunction g) { Random_LogNormal(1, 0, g); },
      [] { Random_LogNormal(1, 0); });
  ExpectRaisesBeforeDraw(
      rsInvalidStdDev, [](TRandomGenFunction g) { Random_LogNormal(1, -2, g); },
      [] { Random_LogNormal(1, -2); });
}

TEST(RandomLogNormal, LogarithmIsNormalWithMatchingMoments) {
  // Mean 1, StdDev 1: ln X = -ln(2) / 2 + sqrt(ln 2) Z, with Z = 0.34312 from (0.5, 0.6).
  ScriptedSource script{0.5L, 0.6L};
  const Extended x = Random_LogNormal(1, 1, script);
  EXPECT_NEAR(std::log(x), -0.5L * std::log(2.0L) + std::sqrt(std::log(2.0L)) * 0.34312L, 1e-15L);
  EXPECT_EQ(script.Draws(), 2u);
}

TEST(RandomExponential, RedrawsUniformsUpToTiny) {
  // 0, 4E-324 and exactly 5.0E-324 are all refused (u must exceed 5.0E-324).
  ScriptedSource script{0.0L, 4e-324L, 5.0E-324L, 0.25L};
  EXPECT_EQ(Random_Exponential(script), std::log(4.0L));
  EXPECT_EQ(script.Draws(), 4u);
  ScriptedSource justAbove{5.0000001E-324L};
  EXPECT_NEAR(Random_Exponential(justAbove), 744.0L, 1.0L);
}

TEST(RandomGamma, ShapeOneIsTheExponentialDrawForDraw) {
  ScriptedSource a{0.0L, 4e-324L, 5.0E-324L, 0.25L};
  EXPECT_EQ(Random_Gamma(1, a), std::log(4.0L));
  EXPECT_EQ(a.Draws(), 4u);
  EngineSource left(11), right(11);
  for (int i = 0; i < 1000; ++i) ASSERT_EQ(Random_Gamma(1, left), Random_Exponential(right));
  EXPECT_EQ(left.Draws(), right.Draws());
}

TEST(RandomGamma, ChecksComeBeforeAnyDraw) {
  for (Extended shape : {0.0L, -1.0L, -1e-30L, kNaN}) {
    ExpectRaisesBeforeDraw(
        rsInvalidShape, [shape](TRandomGenFunction g) { Random_Gamma(shape, g); },
        [shape] { Random_Gamma(shape); });
  }
  for (LongInt df : {0, -3}) {
    ExpectRaisesBeforeDraw(
        rsInvalidShape, [df](TRandomGenFunction g) { Random_ChiSq(df, g); },
        [df] { Random_ChiSq(df); });
  }
  for (Extended shape : {1e-4000L, 4.9E-324L}) {
    ExpectRaisesBeforeDraw(
        rsShapeTooSmall, [shape](TRandomGenFunction g) { Random_Gamma(shape, g); },
        [shape] { Random_Gamma(shape); });
  }
  ScriptedSource atTiny{0.5L, 0.5L};
  EXPECT_GE(Random_Gamma(5.0E-324L, atTiny), 0.0L);  // Tiny itself is allowed
}

TEST(RandomGamma, SmallShapeDrawOrderAndShortcuts) {
  // Shape 0.5: t = 0.5, p = 1 / (1 + e^-0.5) = 0.6225. u = 1 is redrawn; u = 1E-300 lies under
  // the floor p (Tiny / t)^0.5 (about 2E-162) and gives 0 at once, without a second uniform.
  ScriptedSource floor{1.0L, 1e-300L};
  EXPECT_EQ(Random_Gamma(0.5L, floor), 0.0L);
  EXPECT_EQ(floor.Draws(), 2u);
  // Body: u = 0.3 <= p gives x = t (u / p)^2 below t; u2 = 0.5 accepts (w = x < 1 - u2).
  ScriptedSource body{0.3L, 0.5L};
  const Extended x = Random_Gamma(0.5L, body);
  EXPECT_NEAR(x, 0.1161423342268519125961405L, 1e-15L);
  EXPECT_EQ(body.Draws(), 2u);
  // Tail: u = 0.9 > p gives x = t - ln((1 - u) / (1 - p)) = 1.828...
  ScriptedSource tail{0.9L, 0.1L};
  EXPECT_NEAR(Random_Gamma(0.5L, tail), 0.5L - std::log(0.1L / (1 - 1 / (1 + std::exp(-0.5L)))),
              1e-15L);
  EXPECT_EQ(tail.Draws(), 2u);
}

TEST(RandomGamma, LargeShapeDrawsANormalThenOneUniform) {
  ScriptedSource script{0.5L, 0.6L, 0.5L};
  const Extended x = Random_Gamma(2, script);
  // d = 5/3, c = 1/sqrt(15), x = 0.34312: d (1 + c x)^3 = 2.150035...
  EXPECT_NEAR(x, 2.150035L, 1e-6L);
  EXPECT_EQ(script.Draws(), 3u);
  ScriptedSource chi{0.5L, 0.6L, 0.5L};
  EXPECT_EQ(Random_ChiSq(4, chi), 2 * x);  // 2 Gamma(2) on the same uniforms
}

TEST(RandomWeibull, NegativeShapeIsAccepted) {
  ScriptedSource script{0.25L};  // E = ln 4
  EXPECT_NEAR(Random_Weibull(-2, script), 0.849321800288019042721502834103L, 1e-18L);
  ScriptedSource positive{0.25L};
  EXPECT_NEAR(Random_Weibull(2, positive), 1.17741002251547469101156932646L, 1e-18L);
  for (Extended shape : {0.0L, 5.0E-324L, -5.0E-324L, 1e-4000L, kNaN}) {
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [shape](TRandomGenFunction g) { Random_Weibull(shape, g); },
        [shape] { Random_Weibull(shape); });
  }
}

TEST(RandomBeta, SwappedParametersReflectOnTheSameUniforms) {
  const std::array<std::array<Extended, 2>, 6> pairs = {
      {{2, 3}, {0.5L, 0.7L}, {3, 0.4L}, {0.2L, 5}, {1, 5}, {0.05L, 0.01L}}};
  for (const auto& [a, b] : pairs) {
    EngineSource left(static_cast<std::uint64_t>(a * 1000 + b)), right(left);
    for (int i = 0; i < 500; ++i) {
      const Extended x = Random_Beta(a, b, left);
      const Extended y = Random_Beta(b, a, right);
      // The overload with the smaller first parameter returns 1 - x of the other's x.
      if (a < b) {
        ASSERT_EQ(x, 1 - y) << a << " " << b;
      } else {
        ASSERT_EQ(y, 1 - x) << a << " " << b;
      }
      ASSERT_GE(x, 0.0L);
      ASSERT_LE(x, 1.0L);
    }
    EXPECT_EQ(left.Draws(), right.Draws());
  }
}

TEST(RandomBeta, ChecksComeBeforeAnyDraw) {
  const std::array<std::array<Extended, 2>, 5> bad = {
      {{0, 1}, {1, 0}, {-1, 2}, {2, -0.5L}, {kNaN, 1}}};
  for (const auto& pair : bad) {
    const Extended a = pair[0];
    const Extended b = pair[1];
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [a, b](TRandomGenFunction g) { Random_Beta(a, b, g); },
        [a, b] { Random_Beta(a, b); });
  }
}

TEST(RandomBeta, RedrawsTinyFirstUniforms) {
  // u1 = 0 (z = 0) and u1 = 4E-324 (below Tiny) are redrawn before any test.
  EngineSource reference(9);
  const Extended expected = Random_Beta(2, 3, reference);
  EngineSource engine(9);
  std::size_t calls = 0;
  auto source = [&calls, &engine]() -> Extended {
    ++calls;
    if (calls == 1) return 0;
    if (calls == 3) return 4e-324L;
    if (calls == 2 || calls == 4) return 0.5L;
    return engine();
  };
  EXPECT_EQ(Random_Beta(2, 3, source), expected);
}

TEST(RandomT, BoundOneForOneDegreeOfFreedom) {
  // u = 0 is redrawn; u = 0.5, v = 0.75: x = (2 v - 1) m / u = m, and m = 1 for DF = 1.
  ScriptedSource script{0.0L, 0.5L, 0.75L};
  EXPECT_EQ(Random_T(1, script), 1.0L);
  EXPECT_EQ(script.Draws(), 3u);
  // DF = 2: m = sqrt(4) 3^-0.75.
  ScriptedSource two{0.5L, 0.75L};
  EXPECT_NEAR(Random_T(2, two), 2 * std::pow(3.0L, -0.75L), 1e-18L);
  for (LongInt df : {0, -1, -100}) {
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [df](TRandomGenFunction g) { Random_T(df, g); }, [df] { Random_T(df); });
  }
}

TEST(RandomT, QuickRejectionKeepsDrawsFromThreeDegreesOn) {
  // FNV-1a hashes of the 10 bytes of 20000 draws each, on a fixed 53-bit uniform stream, as the
  // method gave them with the quick rejection applied at every DF: it only saves time from DF = 3.
  const std::pair<LongInt, std::uint64_t> expected[] = {{3, 0x775e0ce7cfb05d3au},
                                                        {4, 0x3a60c1c772180b58u},
                                                        {7, 0x3c9c1a7fd362b25fu},
                                                        {30, 0x8308f0c06ad70ec6u},
                                                        {1000, 0x7951a77dfbee472du}};
  for (const auto& [df, hash] : expected) {
    std::mt19937_64 engine(20261124u + static_cast<std::uint64_t>(df));
    const auto source = [&] { return static_cast<Extended>(engine() >> 11) * 0x1p-53L; };
    std::uint64_t h = 1469598103934665603u;
    for (int i = 0; i < 20000; ++i) {
      const Extended x = Random_T(df, source);
      unsigned char bytes[10];
      std::memcpy(bytes, &x, sizeof bytes);
      for (unsigned char b : bytes) h = (h ^ b) * 1099511628211u;
    }
    EXPECT_EQ(h, hash) << "DF " << df;
  }
}

TEST(RandomMVNorm, OneDimensionalFactorIsTheSquareRoot) {
  const TQENFloatVector means{5};
  const TQENFloatVector covariance{4};
  TQENFloatVector factor, variate;
  LongInt error = 9;
  ScriptedSource script{0.5L, 0.6L};
  Random_MVNorm(means, covariance, factor, variate, error, script);
  EXPECT_EQ(error, 0);
  ASSERT_EQ(factor.size(), 1u);
  EXPECT_EQ(Extended(factor[0]), 2.0L);
  ASSERT_EQ(variate.size(), 1u);
  EXPECT_NEAR(Extended(variate[0]), 5 + 2 * 0.34312L, 1e-14L);
  EXPECT_EQ(script.Draws(), 2u);
}

TEST(RandomMVNorm, PacksTheUpperFactorByRows) {
  // U = [2 1 -1; 0 3 2; 0 0 1], Covariance = U'U = [4 2 -2; 2 10 5; -2 5 6], packed by columns.
  const TQENFloatVector means{1, 2, 3};
  const TQENFloatVector covariance{4, 2, 10, -2, 5, 6, 123};  // longer than needed is fine
  TQENFloatVector factor{7, 7, 7, 7, 7, 7, 7, 7};             // shrinks to 6
  TQENFloatVector variate;
  LongInt error = -1;
  ScriptedSource script{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L};  // z = 0.34312 three times
  Random_MVNorm(means, covariance, factor, variate, error, script);
  EXPECT_EQ(error, 0);
  EXPECT_EQ(std::vector<Extended>(factor.begin(), factor.end()),
            (std::vector<Extended>{2, 1, -1, 3, 2, 1}));
  ASSERT_EQ(variate.size(), 3u);
  const Extended z = 0.34312L;  // Variate = means + U'z: column sums of U times z
  EXPECT_NEAR(Extended(variate[0]), 1 + 2 * z, 1e-14L);
  EXPECT_NEAR(Extended(variate[1]), 2 + 4 * z, 1e-14L);
  EXPECT_NEAR(Extended(variate[2]), 3 + 2 * z, 1e-14L);
  EXPECT_EQ(script.Draws(), 6u);
}

TEST(RandomMVNorm, NotPositiveDefiniteSetsErrorCode) {
  const TQENFloatVector means{5};
  TQENFloatVector factor{1, 2}, variate{8, 9};
  LongInt error = 0;
  ScriptedSource script{0.5L, 0.6L};
  Random_MVNorm(means, TQENFloatVector{0}, factor, variate, error, script);
  EXPECT_EQ(error, 1);
  EXPECT_EQ(variate.size(), 2u);
  EXPECT_EQ(Extended(variate[0]), 8.0L);
  EXPECT_EQ(Extended(variate[1]), 9.0L);
  EXPECT_EQ(factor.size(), 1u);
  EXPECT_EQ(script.Draws(), 0u);
  // [1 1; 1 1] fails at the second pivot: the first row of the factor is filled.
  const TQENFloatVector means2{0, 0};
  TQENFloatVector factor2, variate2{3};
  Random_MVNorm(means2, TQENFloatVector{1, 1, 1}, factor2, variate2, error, script);
  EXPECT_EQ(error, 1);
  EXPECT_EQ(std::vector<Extended>(factor2.begin(), factor2.end()),
            (std::vector<Extended>{1, 1, 0}));
  EXPECT_EQ(variate2.size(), 1u);
  EXPECT_EQ(script.Draws(), 0u);
}

TEST(RandomMVNorm, ChecksComeBeforeAnyChange) {
  TQENFloatVector factor{1, 2, 3}, variate{4, 5};
  LongInt error = 42;
  const auto unchanged = [&] {
    EXPECT_EQ(factor.size(), 3u);
    EXPECT_EQ(variate.size(), 2u);
    EXPECT_EQ(Extended(factor[2]), 3.0L);
    EXPECT_EQ(Extended(variate[1]), 5.0L);
    EXPECT_EQ(error, 42);
  };
  ExpectRaisesBeforeDraw(
      rsVectorEmpty,
      [&](TRandomGenFunction g) {
        Random_MVNorm({}, {1, 2, 3}, factor, variate, error, g);
      },
      [&] {
        Random_MVNorm({}, {1, 2, 3}, factor, variate, error);
      });
  unchanged();
  ExpectRaisesBeforeDraw(
      rsVectorTooSmall,
      [&](TRandomGenFunction g) {
        Random_MVNorm({1, 2}, {1, 0}, factor, variate, error, g);
      },
      [&] {
        Random_MVNorm({1, 2}, {1, 0}, factor, variate, error);
      });
  unchanged();
}

TEST(RandomMVNorm, OutputsMayBeTheInputs) {
  TQENFloatVector v{4, 2, 10, -2, 5, 6};
  TQENFloatVector means{1, 2, 3};
  LongInt error = 0;
  ScriptedSource script{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L};
  TQENFloatVector variate;
  Random_MVNorm(means, v, v, variate, error, script);  // Factor is the Covariance
  EXPECT_EQ(std::vector<Extended>(v.begin(), v.end()), (std::vector<Extended>{2, 1, -1, 3, 2, 1}));
  EXPECT_NEAR(Extended(variate[1]), 2 + 4 * 0.34312L, 1e-14L);
  TQENFloatVector same;
  ScriptedSource again{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L};
  Random_MVNorm(means, TQENFloatVector{4, 2, 10, -2, 5, 6}, same, same, error, again);
  ASSERT_EQ(same.size(), 3u);  // Factor and Variate are one vector: the variate wins
  EXPECT_NEAR(Extended(same[2]), 3 + 2 * 0.34312L, 1e-14L);
}

TEST(RandomInvGauss, ChecksComeBeforeAnyDraw) {
  const std::array<std::array<Extended, 2>, 6> bad = {
      {{-1, 1},
       {1, 0},
       {1, -2},
       {1e160L, 1},   // Lambda > Omega sqrt(Huge) / 4
       {0, 1e-200L},  // a falls to 0
       {kNaN, 1}}};
  for (const auto& pair : bad) {
    const Extended lambda = pair[0];
    const Extended omega = pair[1];
    ExpectRaisesBeforeDraw(
        rsInvalidValue,
        [lambda, omega](TRandomGenFunction g) { Random_Inv_Gauss(lambda, omega, g); },
        [lambda, omega] { Random_Inv_Gauss(lambda, omega); });
  }
  ScriptedSource script{0.0L, 0.5L, 0.5L};  // u = 0 is redrawn; then x = c v / u = c
  EXPECT_GT(Random_Inv_Gauss(1, 1, script), 0.0L);
  EXPECT_EQ(script.Draws(), 3u);
}

// The binomial (10, 0.35) by exact products, and the order in which the walk visits the values.
long double Binomial10(int k) {
  static constexpr int kChoose[11] = {1, 10, 45, 120, 210, 252, 210, 120, 45, 10, 1};
  return kChoose[k] * std::pow(0.35L, k) * std::pow(0.65L, 10 - k);
}

TEST(RandomBinomial1, ModeShortcutAndOutwardWalk) {
  // Mode Trunc(11 * 0.35) = 3 with probability 0.2522: a first uniform below it returns 3.
  for (Extended u : {0.0L, 0.1L, 0.25L}) {
    ScriptedSource script{u};
    EXPECT_EQ(Random_Binomial1(10, 0.35L, script), 3);
    EXPECT_EQ(script.Draws(), 1u);
  }
  const int order[] = {3, 2, 4, 1, 5, 0, 6, 7, 8, 9, 10};
  for (int step = 0; step < 1000; ++step) {
    const Extended u = (step + 0.5L) / 1000;
    long double cumulative = 0;
    int expected = -1;
    bool nearEdge = false;
    for (int k : order) {
      cumulative += Binomial10(k);
      if (std::fabs(cumulative - u) < 1e-12L) nearEdge = true;
      if (cumulative > u) {
        expected = k;
        break;
      }
    }
    if (nearEdge) continue;
    ScriptedSource script{u};
    ASSERT_EQ(Random_Binomial1(10, 0.35L, script), expected) << u;
  }
}

TEST(RandomBinomial1, CertainOutcomesAndUnfinishedWalk) {
  // P = 0 and P = 1 leave one possible value and draw nothing; N = 0 has the mode 0 with
  // probability 1.
  for (LongInt n : {0, 1, 7, 1000000}) {
    ScriptedSource none{};
    EXPECT_EQ(Random_Binomial1(n, 0, none), 0);
    EXPECT_EQ(Random_Binomial1(n, 1, none), n);
    EXPECT_EQ(none.Draws(), 0u);
  }
  ScriptedSource zero{0.999L};
  EXPECT_EQ(Random_Binomial1(0, 0.4L, zero), 0);
  // N = 1, P = 0.01: the probabilities 0.99 and 0.01, held as doubles, add up to less than the
  // largest uniform, so the walk ends with u still not negative.
  ScriptedSource last{1 - 0x1p-64L};
  ExpectRaises(rsInvalidValue, [&] { Random_Binomial1(1, 0.01L, last); });
}

TEST(RandomBinomial2, InversionNeverGivesZeroBeforeReflection) {
  // N = 5, P = 0.3: q^N = 0.16807. u = 0.1 and 0.05 would give 0 and are redrawn; u = 0.2 gives 1.
  ScriptedSource script{0.1L, 0.05L, 0.2L};
  EXPECT_EQ(Random_Binomial2(5, 0.3L, script), 1);
  EXPECT_EQ(script.Draws(), 3u);
  ScriptedSource reflected{0.1L, 0.05L, 0.2L};
  EXPECT_EQ(Random_Binomial2(5, 0.7L, reflected), 4);  // N - y for P > 0.5
  EXPECT_EQ(reflected.Draws(), 3u);
  // Past y = 110 the search would not end.
  ScriptedSource beyond{1.5L};
  ExpectRaises(rsInvalidValue, [&] { Random_Binomial2(5, 0.3L, beyond); });
  EXPECT_EQ(beyond.Draws(), 1u);
}

TEST(RandomBinomial2, CertainZeroRaisesBeforeAnyDraw) {
  const std::array<std::pair<Int64, Extended>, 5> endless = {
      {{0, 0.3L}, {10, 0}, {10, 1}, {-5, 0.3L}, {10, kNaN}}};
  for (const auto& pair : endless) {
    const Int64 n = pair.first;
    const Extended p = pair.second;
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [n, p](TRandomGenFunction g) { Random_Binomial2(n, p, g); },
        [n, p] { Random_Binomial2(n, p); });
  }
}

TEST(RandomNegBinomial, InversionAndGeometricPart) {
  // R = 1, P = 0.5: probabilities 0.5, 0.25, ...; u = 0.7 gives 1.
  ScriptedSource script{0.7L};
  EXPECT_EQ(Random_Neg_Binomial(1, 0.5L, script), 1);
  // R = 2, P = 0.8: two geometric draws (u = 0 redrawn): Trunc(ln 0.5 / ln 0.8) = 3 and
  // Trunc(ln 0.3 / ln 0.8) = 5; the fraction 0 has start probability 1, so u = 0.9 adds 0.
  ScriptedSource geometric{0.0L, 0.5L, 0.3L, 0.9L};
  EXPECT_EQ(Random_Neg_Binomial(2, 0.8L, geometric), 8);
  EXPECT_EQ(geometric.Draws(), 4u);
}

TEST(RandomNegBinomial, ChecksComeBeforeAnyDraw) {
  const std::array<std::array<Extended, 2>, 8> bad = {
      {{0, 0.5L}, {-1, 0.5L}, {1, 0}, {1, 1}, {1, -0.1L}, {1, 1.5L}, {kNaN, 0.5L}, {1100, 0.5L}}};
  for (const auto& pair : bad) {  // the last: 0.5^1100 < 5.0E-324
    const Extended r = pair[0];
    const Extended p = pair[1];
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [r, p](TRandomGenFunction g) { Random_Neg_Binomial(r, p, g); },
        [r, p] { Random_Neg_Binomial(r, p); });
  }
  ScriptedSource near{0.5L};
  EXPECT_GE(Random_Neg_Binomial(1000, 0.5L, near), 0);  // 0.5^1000 is still above the guard
}

TEST(RandomVonMises, RangeOfKAndDrawOrder) {
  for (Extended k : {-0.1L, 10.0L, 1e30L, kInf, kNaN}) {
    ExpectRaisesBeforeDraw(
        rsInvalidValue, [k](TRandomGenFunction g) { Random_von_Mises(k, g); },
        [k] { Random_von_Mises(k); });
  }
  EngineSource engine(4);
  const Extended x = Random_von_Mises(9.99L, engine);
  EXPECT_LE(std::fabs(x), QENPi);
  // K = 0: one interval [0, pi]; the selecting uniform places the angle (s = 1 - u), the uniform
  // that ends the comparison run gives the sign.
  ScriptedSource plus{0.25L, 0.6L};
  EXPECT_NEAR(Random_von_Mises(0, plus), 0.75L * QENPi, 1e-18L);
  ScriptedSource minus{0.25L, 0.3L};
  EXPECT_NEAR(Random_von_Mises(0, minus), -0.75L * QENPi, 1e-18L);
  EXPECT_EQ(minus.Draws(), 2u);
  // K = 0.3 at 3 pi / 4: h = 0.512; the run 0.4, 0.5 has even length, so a new position
  // s = 0.5 (pi / 2, h = 0.3) is drawn; 0.9 ends a run of length 1 and accepts.
  ScriptedSource run{0.25L, 0.4L, 0.5L, 0.5L, 0.9L};
  EXPECT_NEAR(Random_von_Mises(0.3L, run), QENPi / 2, 1e-18L);
  EXPECT_EQ(run.Draws(), 5u);
}

TEST(RandomCauchy, RedrawsOutsideTheDiscAndOnTheAxis) {
  // (0.5, 0) has y = 0; (0.98, 0.98) lies outside the disc; (0.5, -0.5) gives -1.
  ScriptedSource script{0.75L, 0.5L, 0.99L, 0.99L, 0.75L, 0.25L};
  EXPECT_EQ(Random_Cauchy(script), -1.0L);
  EXPECT_EQ(script.Draws(), 6u);
}

TEST(RandomPoisson, TableUpToTenNormalMethodAbove) {
  Extended mu = 2;
  ScriptedSource two{0.5L};  // P(X <= 1) = 0.406, P(X <= 2) = 0.677
  EXPECT_EQ(Random_Poisson(mu, two), 2);
  EXPECT_EQ(mu, 2.0L);
  mu = 10;
  ScriptedSource ten{0.5L};  // P(X <= 9) = 0.458, P(X <= 10) = 0.583: one uniform, table method
  EXPECT_EQ(Random_Poisson(mu, ten), 10);
  EXPECT_EQ(ten.Draws(), 1u);
  mu = 10.0001L;
  ScriptedSource above{0.5L, 0.6L};  // g = mu + sqrt(mu) 0.34312 = 11.08 >= L = 8: K = 11
  EXPECT_EQ(Random_Poisson(mu, above), 11);
  EXPECT_EQ(above.Draws(), 2u);
  EXPECT_EQ(mu, 10.0001L);
  for (Extended nonPositive : {0.0L, -3.0L, -kInf}) {
    ScriptedSource one{0.999L};
    EXPECT_EQ(Random_Poisson(nonPositive, one), 0);
    EXPECT_EQ(one.Draws(), 1u);
  }
  ScriptedSource literal{0.5L, 0.6L};  // the mean may be a literal
  EXPECT_EQ(Random_Poisson(10.0001L, literal), 11);
}

TEST(RandomPoisson, UnrepresentableMeanRaises) {
  for (Extended mu : {kInf, kNaN, 1e30L}) {
    ScriptedSource script{0.5L, 0.6L, 0.5L, 0.6L};
    ExpectRaises(rsInvalidValue, [&] { Random_Poisson(mu, script); });
  }
}

// FNV-1a over the value bits of a stream of draws: the 10 bytes of an Extended, the 8 of an
// Int64.
class StreamHash {
 public:
  void Add(Extended x) {
    unsigned char bytes[sizeof(Extended)] = {};
    std::memcpy(bytes, &x, sizeof(Extended));
    AddBytes(bytes, 10);
  }
  void Add(Int64 k) {
    unsigned char bytes[sizeof(Int64)];
    std::memcpy(bytes, &k, sizeof(Int64));
    AddBytes(bytes, sizeof(Int64));
  }
  std::uint64_t Value() const { return hash_; }

 private:
  void AddBytes(const unsigned char* bytes, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i) hash_ = (hash_ ^ bytes[i]) * 0x100000001B3ULL;
  }
  std::uint64_t hash_ = 0xCBF29CE484222325ULL;
};

TEST(RandomStreams, FixedSeedsGiveTheRecordedDraws) {
  // The generators are evaluated with shortcuts that must not change a single decision: each
  // row hashes 20000 draws, through a caller's source and through the thread's own stream,
  // against the hash recorded from the plain evaluation of the methods.
  struct Row {
    const char* name;
    std::function<void(StreamHash&, TRandomGenFunction)> draw;
    std::function<void(StreamHash&)> drawOwn;
    std::uint64_t withSource;
    std::uint64_t withoutSource;
  };
  const std::vector<Row> rows = {
      {"Normal", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Normal(g)); },
       [](StreamHash& h) { h.Add(Random_Normal()); }, 0xC2613C5A7626F554ULL, 0xE58B31373893FCCULL},
      {"Exponential", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Exponential(g)); },
       [](StreamHash& h) { h.Add(Random_Exponential()); }, 0x812F68D58DCEB87ULL,
       0x80FC6416F81A1A12ULL},
      {"Gamma_5", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Gamma(5, g)); },
       [](StreamHash& h) { h.Add(Random_Gamma(5)); }, 0xBC98F655F235FFBBULL, 0x25F504E6AB77C72ULL},
      {"Gamma_2_5", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Gamma(2.5L, g)); },
       [](StreamHash& h) { h.Add(Random_Gamma(2.5L)); }, 0xAB47C815F4EB25D5ULL,
       0xD3F667094552BFEULL},
      {"Gamma_0_5", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Gamma(0.5L, g)); },
       [](StreamHash& h) { h.Add(Random_Gamma(0.5L)); }, 0x6F1ECAEE6CF6C11DULL,
       0x9C891ED8A23097CCULL},
      {"Gamma_0_3", [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Gamma(0.3L, g)); },
       [](StreamHash& h) { h.Add(Random_Gamma(0.3L)); }, 0x95E9C5A2A2BE70D7ULL,
       0xB59F9418A6E9AC0BULL},
      {"Binomial2_1000_0_3",
       [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Binomial2(1000, 0.3L, g)); },
       [](StreamHash& h) { h.Add(Random_Binomial2(1000, 0.3L)); }, 0xCE1CC84225D3A83CULL,
       0xE0BE97114E21444AULL},
      {"Binomial2_20_0_3",
       [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Binomial2(20, 0.3L, g)); },
       [](StreamHash& h) { h.Add(Random_Binomial2(20, 0.3L)); }, 0xBDB9D402795CCC21ULL,
       0x329F919F09C92B03ULL},
      {"Binomial2_100000_0_6",
       [](StreamHash& h, TRandomGenFunction g) { h.Add(Random_Binomial2(100000, 0.6L, g)); },
       [](StreamHash& h) { h.Add(Random_Binomial2(100000, 0.6L)); }, 0xCDC59516ACE941F4ULL,
       0x645B5781DBC79630ULL},
      {"Poisson_100",
       [](StreamHash& h, TRandomGenFunction g) {
         Extended mu = 100;
         h.Add(Random_Poisson(mu, g));
       },
       [](StreamHash& h) {
         Extended mu = 100;
         h.Add(Random_Poisson(mu));
       },
       0x1A789606E9D90A19ULL, 0x94CEF0893552773FULL},
      {"Poisson_12_5",
       [](StreamHash& h, TRandomGenFunction g) {
         Extended mu = 12.5L;
         h.Add(Random_Poisson(mu, g));
       },
       [](StreamHash& h) {
         Extended mu = 12.5L;
         h.Add(Random_Poisson(mu));
       },
       0x7321250B33791A32ULL, 0x78D834214F0DCB22ULL},
  };
  for (const Row& row : rows) {
    EngineSource engine(2026);
    StreamHash withSource;
    for (int i = 0; i < 20000; ++i) row.draw(withSource, engine);
    SetRandSeed(2026);
    StreamHash withoutSource;
    for (int i = 0; i < 20000; ++i) row.drawOwn(withoutSource);
    EXPECT_EQ(withSource.Value(), row.withSource)
        << row.name << std::hex << " 0x" << withSource.Value();
    EXPECT_EQ(withoutSource.Value(), row.withoutSource)
        << row.name << std::hex << " 0x" << withoutSource.Value();
  }
}

TEST(RandomExtremes, LargeArgumentsStayWithinRangeWithoutOverflow) {
  // Run under the undefined-behaviour sanitizer: no signed overflow, no bad conversion.
  constexpr Int64 kMax = std::numeric_limits<Int64>::max();
  EngineSource engine(31);
  for (int i = 0; i < 200; ++i) {
    const Int64 half = Random_Binomial2(kMax, 0.5L, engine);
    EXPECT_GE(half, 0);
    EXPECT_LE(half, kMax);
    const Int64 most = Random_Binomial2(kMax, 0.9L, engine);
    EXPECT_GT(most, kMax / 2);
    const Int64 few = Random_Binomial2(kMax, 1e-18L, engine);  // N p = 9.2: inversion
    EXPECT_GE(few, 1);
    EXPECT_LT(few, 100);
  }
  const Int64 wide = Random_Binomial1(std::numeric_limits<LongInt>::max(), 0.5L, engine);
  EXPECT_NEAR(static_cast<long double>(wide), 1073741823.5L, 30 * 23170.5L);
  Extended mu = 1e18L;
  EXPECT_NEAR(static_cast<long double>(Random_Poisson(mu, engine)), 1e18L, 1e10L);
  EXPECT_GE(Random_Neg_Binomial(1e6L, 0.9L, engine), 0);  // a million geometric draws
}

// ---------------------------------------------------------------------------------------------
// Distribution tests

const ContinuousReference& FindContinuous(const std::string& name) {
  for (const auto& r : kContinuous) {
    if (name == r.name) return r;
  }
  throw std::invalid_argument("no reference for " + name);
}

const DiscreteReference& FindDiscrete(const std::string& name) {
  for (const auto& r : kDiscrete) {
    if (name == r.name) return r;
  }
  throw std::invalid_argument("no reference for " + name);
}

void ExpectMoments(const std::string& name, long double sum, long double sumSq, int n,
                   long double mean, long double variance, long double central4) {
  if (!std::isfinite(variance)) return;
  const long double sampleMean = sum / n;
  EXPECT_NEAR(sampleMean, mean, 6 * std::sqrt(variance / n)) << name;
  if (!std::isfinite(central4)) return;
  const long double sampleVariance = (sumSq - n * sampleMean * sampleMean) / (n - 1);
  EXPECT_NEAR(sampleVariance, variance, 6 * std::sqrt((central4 - variance * variance) / n))
      << name;
}

void CheckContinuous(const std::string& name, const std::function<Extended()>& draw) {
  const ContinuousReference& ref = FindContinuous(name);
  std::array<int, kReferenceBins> counts{};
  long double sum = 0;
  long double sumSq = 0;
  for (int i = 0; i < kReferenceDraws; ++i) {
    const Extended x = draw();
    ASSERT_FALSE(std::isnan(x)) << name;
    const auto bin = std::upper_bound(ref.edges.begin(), ref.edges.end(), x) - ref.edges.begin();
    ++counts[static_cast<std::size_t>(bin)];
    sum += x;
    sumSq += x * x;
  }
  const long double expected = static_cast<long double>(kReferenceDraws) / kReferenceBins;
  long double chi = 0;
  for (int c : counts) chi += (c - expected) * (c - expected) / expected;
  EXPECT_LT(chi, kChiSquareCriticalBins) << name;
  ExpectMoments(name, sum, sumSq, kReferenceDraws, ref.mean, ref.variance, ref.central4);
}

void CheckDiscrete(const std::string& name, const std::function<Int64()>& draw) {
  const DiscreteReference& ref = FindDiscrete(name);
  std::vector<int> counts(ref.lastValues.size());
  long double sum = 0;
  long double sumSq = 0;
  for (int i = 0; i < kReferenceDraws; ++i) {
    const Int64 x = draw();
    auto bin = static_cast<std::size_t>(
        std::lower_bound(ref.lastValues.begin(), ref.lastValues.end(), x) - ref.lastValues.begin());
    ++counts[std::min(bin, counts.size() - 1)];
    sum += x;
    sumSq += static_cast<long double>(x) * x;
  }
  long double chi = 0;
  for (std::size_t i = 0; i < counts.size(); ++i) {
    const long double expected = kReferenceDraws * ref.probabilities[i];
    chi += (counts[i] - expected) * (counts[i] - expected) / expected;
  }
  EXPECT_LT(chi, ref.critical) << name;
  ExpectMoments(name, sum, sumSq, kReferenceDraws, ref.mean, ref.variance, ref.central4);
}

// Half of the cases draw from VerdanRandom (the overloads without a source), half from an
// independent std::mt19937_64 through the TRandomGenFunction overloads.
TEST(RandomDistribution, NormalFamily) {
  SetRandSeed(101);
  CheckContinuous("StandardNormal", [] { return Random_Normal(); });
  EngineSource engine(102);
  CheckContinuous("StandardNormal", [&] { return (Random_Normal(3, 2, engine) - 3) / 2; });
  SetRandSeed(103);
  CheckContinuous("LogNormal_2_1_5", [] { return Random_LogNormal(2, 1.5L); });
}

TEST(RandomDistribution, GammaFamily) {
  SetRandSeed(201);
  CheckContinuous("Gamma_0_3", [] { return Random_Gamma(0.3L); });
  EngineSource engine(202);
  CheckContinuous("Gamma_0_5", [&] { return Random_Gamma(0.5L, engine); });
  CheckContinuous("Gamma_1", [] { return Random_Gamma(1); });
  CheckContinuous("Gamma_2_5", [&] { return Random_Gamma(2.5L, engine); });
  CheckContinuous("Gamma_5", [] { return Random_Gamma(5); });
  CheckContinuous("Gamma_30", [&] { return Random_Gamma(30, engine); });
  CheckContinuous("ChiSq_3", [] { return Random_ChiSq(3); });
  CheckContinuous("Gamma_1", [&] { return Random_Exponential(engine); });
  CheckContinuous("Weibull_2_5", [] { return Random_Weibull(2.5L); });
  CheckContinuous("Weibull_neg2", [&] { return Random_Weibull(-2, engine); });
}

TEST(RandomDistribution, BetaAndT) {
  SetRandSeed(301);
  EngineSource engine(302);
  CheckContinuous("Beta_2_3", [] { return Random_Beta(2, 3); });
  CheckContinuous("Beta_0_5_0_7", [&] { return Random_Beta(0.5L, 0.7L, engine); });
  CheckContinuous("Beta_3_0_4", [] { return Random_Beta(3, 0.4L); });
  CheckContinuous("Beta_0_2_5", [&] { return Random_Beta(0.2L, 5, engine); });
  // DF 1 and 2 are decided by the exact test alone (the quick rejection would cut their tails):
  // DF = 1 is the standard Cauchy.
  CheckContinuous("T_1", [] { return Random_T(1); });
  CheckContinuous("Cauchy", [&] { return Random_T(1, engine); });
  CheckContinuous("T_2", [&] { return Random_T(2, engine); });
  CheckContinuous("T_3", [] { return Random_T(3); });
  CheckContinuous("T_10", [&] { return Random_T(10, engine); });
  CheckContinuous("Cauchy", [] { return Random_Cauchy(); });
  CheckContinuous("Cauchy", [&] { return Random_Cauchy(engine); });
}

TEST(RandomDistribution, InverseGaussianAndVonMises) {
  SetRandSeed(401);
  EngineSource engine(402);
  CheckContinuous("InvGauss_0_1", [] { return Random_Inv_Gauss(0, 1); });
  CheckContinuous("InvGauss_0_5_1_5", [&] { return Random_Inv_Gauss(0.5L, 1.5L, engine); });
  CheckContinuous("InvGauss_2_0_5", [] { return Random_Inv_Gauss(2, 0.5L); });
  CheckContinuous("InvGauss_6_20", [&] { return Random_Inv_Gauss(6, 20, engine); });
  CheckContinuous("VonMises_0", [] { return Random_von_Mises(0); });
  CheckContinuous("VonMises_0_3", [&] { return Random_von_Mises(0.3L, engine); });
  CheckContinuous("VonMises_0_5", [] { return Random_von_Mises(0.5L); });
  CheckContinuous("VonMises_2_7", [&] { return Random_von_Mises(2.7L, engine); });
  CheckContinuous("VonMises_9_99", [] { return Random_von_Mises(9.99L); });
}

TEST(RandomDistribution, Binomial) {
  SetRandSeed(501);
  EngineSource engine(502);
  CheckDiscrete("Binomial1_20_0_3", [] { return Random_Binomial1(20, 0.3L); });
  CheckDiscrete("Binomial1_10_0_5", [&] { return Random_Binomial1(10, 0.5L, engine); });
  CheckDiscrete("Binomial1_200_0_7", [] { return Random_Binomial1(200, 0.7L); });
  CheckDiscrete("Binomial1_1000_0_05", [&] { return Random_Binomial1(1000, 0.05L, engine); });
  // The inversion path (N min(P, 1 - P) <= 30) redraws 0: the reference is truncated there.
  CheckDiscrete("Binomial2_20_0_3", [] { return Random_Binomial2(20, 0.3L); });
  CheckDiscrete("Binomial2_20_0_8", [&] { return Random_Binomial2(20, 0.8L, engine); });
  CheckDiscrete("Binomial2_5_0_5", [] { return Random_Binomial2(5, 0.5L); });
  CheckDiscrete("Binomial2_1000_0_3", [&] { return Random_Binomial2(1000, 0.3L, engine); });
  CheckDiscrete("Binomial2_200_0_6", [] { return Random_Binomial2(200, 0.6L); });
  CheckDiscrete("Binomial2_100000_0_45", [&] { return Random_Binomial2(100000, 0.45L, engine); });
  CheckDiscrete("Binomial2_150_0_5", [] { return Random_Binomial2(150, 0.5L); });
}

TEST(RandomDistribution, PoissonAndNegativeBinomial) {
  SetRandSeed(601);
  EngineSource engine(602);
  const std::array<std::pair<const char*, Extended>, 7> poisson = {{{"Poisson_0_5", 0.5L},
                                                                    {"Poisson_4", 4},
                                                                    {"Poisson_10", 10},
                                                                    {"Poisson_10_0001", 10.0001L},
                                                                    {"Poisson_25", 25},
                                                                    {"Poisson_100", 100},
                                                                    {"Poisson_1000", 1000}}};
  bool useEngine = false;
  for (const auto& entry : poisson) {
    const char* name = entry.first;
    Extended mu = entry.second;
    if (useEngine) {
      CheckDiscrete(name, [&] { return Random_Poisson(mu, engine); });
    } else {
      CheckDiscrete(name, [&] { return Random_Poisson(mu); });
    }
    useEngine = !useEngine;
  }
  CheckDiscrete("NegBinomial_2_5_0_4", [] { return Random_Neg_Binomial(2.5L, 0.4L); });
  CheckDiscrete("NegBinomial_3_7_0_8", [&] { return Random_Neg_Binomial(3.7L, 0.8L, engine); });
  CheckDiscrete("NegBinomial_1_0_5", [] { return Random_Neg_Binomial(1, 0.5L); });
  CheckDiscrete("NegBinomial_0_4_0_95", [&] { return Random_Neg_Binomial(0.4L, 0.95L, engine); });
}

TEST(RandomDistribution, MultivariateNormalMoments) {
  // Covariance [4 2 -2; 2 10 5; -2 5 6]: sample means and covariances within six standard
  // errors (for normal data the covariance (i, j) has variance (s_ii s_jj + s_ij^2) / n).
  const Extended sigma[3][3] = {{4, 2, -2}, {2, 10, 5}, {-2, 5, 6}};
  const TQENFloatVector means{1, -2, 3};
  const TQENFloatVector covariance{4, 2, 10, -2, 5, 6};
  constexpr int kDraws = 50000;
  std::array<long double, 3> sum{};
  std::array<std::array<long double, 3>, 3> cross{};
  SetRandSeed(701);
  TQENFloatVector factor, variate;
  LongInt error = 0;
  for (int n = 0; n < kDraws; ++n) {
    Random_MVNorm(means, covariance, factor, variate, error);
    ASSERT_EQ(error, 0);
    for (int i = 0; i < 3; ++i) {
      sum[i] += Extended(variate[i]);
      for (int j = 0; j < 3; ++j) {
        cross[i][j] += (Extended(variate[i]) - Extended(means[i])) *
                       (Extended(variate[j]) - Extended(means[j]));
      }
    }
  }
  for (int i = 0; i < 3; ++i) {
    EXPECT_NEAR(sum[i] / kDraws, Extended(means[i]), 6 * std::sqrt(sigma[i][i] / kDraws));
    for (int j = 0; j < 3; ++j) {
      EXPECT_NEAR(cross[i][j] / kDraws, sigma[i][j],
                  6 * std::sqrt((sigma[i][i] * sigma[j][j] + sigma[i][j] * sigma[i][j]) / kDraws));
    }
  }
}

}  // namespace
}  // namespace tovrin
