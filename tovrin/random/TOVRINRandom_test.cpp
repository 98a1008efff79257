// Tests of the uniform source and the random-variate generators.
//
// Exact behaviours use a scripted source that hands out a fixed list of uniforms and counts
// them: the draw order, the guards, the shortcuts and the checks (every identifier is raised
// before the first draw). Distribution tests draw 100000 variates from a seeded source and
// compare them with the quantiles, probabilities and moments of TOVRINRandom_reference.inc
// (mpmath): a chi-square goodness-of-fit test at upper-tail probability 1e-6, and the mean and
// variance within six standard errors. The seeds are fixed; the thresholds follow from the
// probabilities and were not fitted to the seeds.
#include "tovrin/random/TOVRINRandom.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <functional>
#include <initializer_list>
#include <limits>
#include <random>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using namespace testing;           // NOLINT: the shared checks and constants
constexpr Extended kZ = 0.34312L;  // Leva's normal on the uniforms (0.5, 0.6)

struct ContinuousReference {
  const char* name;
  std::array<long double, 39> edges;  // quantiles at 1/40 .. 39/40
  long double mean, variance, central4;
};
struct DiscreteReference {
  const char* name;
  std::vector<Int64> lastValues;  // bin i holds the values up to lastValues[i]
  std::vector<long double> probabilities;
  long double mean, variance, central4;
  long double critical;  // chi-square critical value at 1e-6 for these bins
};
#include "tovrin/random/TOVRINRandom_reference.inc"

// A uniform source handing out a fixed list of values and counting them; running out fails
// the test.
struct Uniforms {
  Uniforms(std::initializer_list<Extended> list) : values(list) {}
  Extended operator()() {
    if (next >= values.size()) throw std::out_of_range("scripted source ran out");
    return values[next++];
  }
  std::size_t Draws() const { return next; }
  std::vector<Extended> values;
  std::size_t next = 0;
};

// An independent source: std::mt19937_64 scaled by 2^-64.
struct EngineSource {
  explicit EngineSource(std::uint64_t seed) : engine(seed) {}
  Extended operator()() { return static_cast<Extended>(engine()) * 0x1p-64L; }
  std::mt19937_64 engine;
};

// One generator call, through the caller's source g or, for g null, through the overload
// without a source (the thread's stream). EITHER(Random_Gamma, 2) writes it for a generator.
using Draw = std::function<Extended(TRandomGenFunction*)>;
#define EITHER(F, ...)                                                       \
  [=](TRandomGenFunction* g) {                                               \
    return Extended(g ? F(__VA_ARGS__ __VA_OPT__(, ) * g) : F(__VA_ARGS__)); \
  }

// Raises Ident through a scripted source without drawing, and through the overload without a
// source without moving the thread's stream.
void ExpectRaisesBeforeDraw(TResStringId Ident, const Draw& draw) {
  Uniforms script{0.5L, 0.5L, 0.5L, 0.5L};
  TRandomGenFunction source(script);
  ExpectRaises(Ident, [&] { draw(&source); });
  EXPECT_EQ(script.Draws(), 0u) << ResStringName(Ident);
  SetRandSeed(77);
  const Extended first = VerdanRandom();
  SetRandSeed(77);
  ExpectRaises(Ident, [&] { draw(nullptr); });
  EXPECT_EQ(VerdanRandom(), first) << ResStringName(Ident);
}
// The same for a family over a table of bad parameters.
template <typename Param, typename F>
void ExpectEachRaisesBeforeDraw(TResStringId Ident, std::initializer_list<Param> bad, F draw) {
  for (const Param& p : bad) ExpectRaisesBeforeDraw(Ident, draw(p));
}
using Pair = std::array<Extended, 2>;

Extended ScriptedGlobalValue() { return 0.25L; }

TEST(TRandomGenFunction, IsACheapReferenceToAnyCallable) {
  static_assert(std::is_trivially_copyable_v<TRandomGenFunction>);
  static_assert(sizeof(TRandomGenFunction) <= 2 * sizeof(void*));
  static_assert(!std::is_constructible_v<TRandomGenFunction, int>);
  static_assert(!std::is_constructible_v<TRandomGenFunction, Extended (*)(int)>);
  EXPECT_EQ(TRandomGenFunction(ScriptedGlobalValue)(), 0.25L);
  EXPECT_EQ(TRandomGenFunction(+[] { return 0.75; })(), 0.75L);  // a double-valued function
  int calls = 0;
  auto counting = [&calls] { return ++calls, Extended{0.5L}; };
  TRandomGenFunction ref(counting);
  const TRandomGenFunction copy = ref;
  EXPECT_EQ(ref() + copy(), 1.0L);
  EXPECT_EQ(calls, 2);
  Extended next = 0;
  auto stepping = [next]() mutable { return next += 0.125L; };  // state lives in the object
  TRandomGenFunction steps(stepping);
  EXPECT_EQ(steps() + steps(), 0.375L);
  const std::function<Extended()> wrapped = [] { return Extended{0.375L}; };
  EXPECT_EQ(TRandomGenFunction(wrapped)(), 0.375L);
  // A lambda written in the argument list lives through the call.
  EXPECT_EQ(Random_Exponential([] { return Extended{0.5L}; }), std::log(2.0L));
}

// A bit generator passed as the source gives the uniforms of std::generate_canonical<long
// double, 64> on it, draw for draw, whether a generator draws its words inline (the normal,
// gamma, binomial and Poisson on the Mersenne Twisters) or through the reference.
template <typename Engine>
void ExpectEngineDrawsAsCanonical() {
  Engine direct(2026);
  Engine viaCanonical(2026);
  auto canonical = [&viaCanonical] {
    return std::generate_canonical<long double, 64>(viaCanonical);
  };
  for (int i = 0; i < 2000; ++i) {
    Extended mu = 100;
    ASSERT_EQ(Random_Normal(direct), Random_Normal(canonical));
    ASSERT_EQ(Random_Normal(1, 2, direct), Random_Normal(1, 2, canonical));
    ASSERT_EQ(Random_Gamma(0.5L, direct), Random_Gamma(0.5L, canonical));
    ASSERT_EQ(Random_Gamma(5, direct), Random_Gamma(5, canonical));
    ASSERT_EQ(Random_Binomial2(1000, 0.3L, direct), Random_Binomial2(1000, 0.3L, canonical));
    ASSERT_EQ(Random_Poisson(mu, direct), Random_Poisson(mu, canonical));
    ASSERT_EQ(Random_Beta(2, 3, direct), Random_Beta(2, 3, canonical));
  }
  EXPECT_EQ(direct, viaCanonical);  // the same words consumed
}

TEST(TRandomGenFunction, TakesBitGeneratorsAsGenerateCanonicalDoes) {
  ExpectEngineDrawsAsCanonical<std::mt19937_64>();
  ExpectEngineDrawsAsCanonical<std::mt19937>();
  ExpectEngineDrawsAsCanonical<std::ranlux24_base>();  // 24-bit words
}

TEST(TRandomGenFunction, WordsRoundToDoubleAsTheirUniforms) {
  // Ties to even in both halves of the range, the last words below 2^53 and 1, and random words.
  std::vector<std::uint64_t> words = {0,
                                      1,
                                      (std::uint64_t{1} << 53) - 1,
                                      (std::uint64_t{1} << 53) + 1,
                                      0x0020000000000003ULL,
                                      0x8000000000000400ULL,
                                      0x8000000000000C00ULL,
                                      0x8000000000000401ULL,
                                      0x4000000000000200ULL,
                                      0x4000000000000600ULL,
                                      ~std::uint64_t{0},
                                      ~std::uint64_t{0} - 1024};
  std::mt19937_64 engine(9);
  for (int i = 0; i < 100000; ++i) words.push_back(engine() >> (i % 64));
  for (const std::uint64_t word : words) {
    const Extended uniform = static_cast<Extended>(word) * 0x1p-64L;
    ASSERT_EQ(detail::UniformFromBits(word), uniform) << word;
    ASSERT_EQ(detail::UniformDoubleFromBits(word), static_cast<double>(uniform)) << word;
  }
}

TEST(VerdanRandom, Seed0GivesTheXoshiroReferenceStream) {
  SetRandSeed(0);
  for (std::uint64_t expected : kXoshiroSeed0) {
    EXPECT_EQ(static_cast<std::uint64_t>(VerdanRandom() * 0x1p64L), expected);
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
    ASSERT_TRUE(x >= 0 && x < 1);
    const Extended scaled = x * 0x1p64L;
    ASSERT_EQ(scaled, std::trunc(scaled));                    // a multiple of 2^-64
    if (std::fmod(scaled, 2048.0L) != 0) lowBitsSeen = true;  // finer than a double
    ++counts[static_cast<std::size_t>(x * 40)];
    sum += x;
  }
  EXPECT_TRUE(lowBitsSeen);
  long double chi = 0;
  for (int c : counts) chi += (c - kDraws / 40.0L) * (c - kDraws / 40.0L) / (kDraws / 40.0L);
  EXPECT_LT(chi, kChiSquareCriticalBins);
  EXPECT_NEAR(sum / kDraws, 0.5L, 6 * std::sqrt(1.0L / 12 / kDraws));
}

// Each thread has its own stream: seeding makes the calling thread reproducible, another
// thread drawing meanwhile does not disturb it, and concurrent threads draw distinct values.
TEST(VerdanRandom, StreamsPerThread) {
  auto five = [] {
    std::vector<Extended> v;
    for (int i = 0; i < 5; ++i) v.push_back(VerdanRandom());
    return v;
  };
  SetRandSeed(99);
  const std::vector<Extended> first = five();
  SetRandSeed(99);
  std::thread([] {
    for (int i = 0; i < 1000; ++i) VerdanRandom();
  }).join();
  EXPECT_EQ(five(), first);
  std::vector<Extended> there;
  std::thread([&] {
    SetRandSeed(99);
    there = five();
  }).join();
  EXPECT_EQ(there, first);
  SetRandSeed(100);
  EXPECT_NE(VerdanRandom(), first[0]);
  Randomize();
  const Extended clock1 = VerdanRandom();
  Randomize();
  EXPECT_NE(VerdanRandom(), clock1);
  SetRandSeed(5);
  std::vector<std::vector<Extended>> values(4);
  std::vector<std::thread> threads;
  for (auto& v : values) {
    threads.emplace_back([&v] {
      for (int i = 0; i < 20000; ++i) v.push_back(VerdanRandom());
    });
  }
  for (auto& thread : threads) thread.join();
  std::vector<Extended> all;
  for (const auto& v : values) all.insert(all.end(), v.begin(), v.end());
  std::sort(all.begin(), all.end());
  EXPECT_EQ(all.size(), 80000u);
  EXPECT_EQ(std::adjacent_find(all.begin(), all.end()), all.end());
}

TEST(VerdanRandom, OverloadsWithoutSourceDrawAsVerdanRandomDoes) {
  const Draw draws[] = {EITHER(Random_Normal, 2, 3),
                        EITHER(Random_LogNormal, 2, 3),
                        EITHER(Random_Gamma, 0.4L),
                        EITHER(Random_Gamma, 3.5L),
                        EITHER(Random_ChiSq, 7),
                        EITHER(Random_Weibull, 1.5L),
                        EITHER(Random_Beta, 0.5L, 2),
                        EITHER(Random_T, 4),
                        EITHER(Random_Inv_Gauss, 1, 2),
                        EITHER(Random_Binomial1, 40, 0.3L),
                        EITHER(Random_Binomial2, 400, 0.3L),
                        EITHER(Random_Neg_Binomial, 2.5L, 0.8L),
                        EITHER(Random_von_Mises, 3),
                        EITHER(Random_Cauchy),
                        EITHER(Random_Poisson, 37.5L)};
  TRandomGenFunction verdan(VerdanRandom);
  for (std::size_t i = 0; i < std::size(draws); ++i) {
    SetRandSeed(1000 + i);
    std::vector<Extended> with;
    for (int k = 0; k < 50; ++k) with.push_back(draws[i](&verdan));
    const Extended nextWith = VerdanRandom();
    SetRandSeed(1000 + i);
    for (int k = 0; k < 50; ++k)
      EXPECT_EQ(draws[i](nullptr), with[static_cast<std::size_t>(k)]) << i;
    EXPECT_EQ(VerdanRandom(), nextWith) << i;  // the same number of draws
  }
  TQENFloatVector means{1, 2}, cov{4, 1, 3}, factor, variate1, variate2;
  LongInt error = 0;
  SetRandSeed(3);
  Random_MVNorm(means, cov, factor, variate1, error, VerdanRandom);
  SetRandSeed(3);
  Random_MVNorm(means, cov, factor, variate2, error);
  EXPECT_TRUE(SameBits(variate1, variate2));
}

TEST(RandomNormal, LevaDrawOrderRoundingAndRedraws) {
  Uniforms script{0.5L, 0.6L};
  // u = 0.5, v = (0.6 - 0.5) 1.7156 = 0.17156: accepted at once, v / u = 0.34312.
  EXPECT_TRUE(Near(Random_Normal(script), kZ, 1e-15L));
  EXPECT_EQ(script.Draws(), 2u);
  EXPECT_EQ(Random_Normal(Uniforms{0.6L, 0.5L}), 0.0L);  // v = 0 exactly
  for (const auto& [v, expected] : kNormalRounding) {    // v rounded once to double
    EXPECT_EQ(Random_Normal(Uniforms{0.5L, v}), expected) << static_cast<double>(v);
    EXPECT_EQ(Random_Normal(1, 1, Uniforms{0.5L, v}), 1 + expected) << static_cast<double>(v);
  }
  for (const auto& [v, accepted, expected] : kNormalAtBounds) {  // q within 1e-15 of a bound
    Uniforms s{0.5L, v, 0.5L, 0.6L};
    if (accepted != 0) {
      EXPECT_EQ(Random_Normal(s), expected);
    } else {
      EXPECT_TRUE(Near(Random_Normal(s), kZ, 1e-15L));
      EXPECT_EQ(s.Draws(), 4u);
    }
  }
  // (0.01, 0.99): q past the outer bound; (0, 0.5): u = 0 makes the log test NaN.
  Uniforms redrawn{0.01L, 0.99L, 0.0L, 0.5L, 0.5L, 0.6L};
  EXPECT_TRUE(Near(Random_Normal(redrawn), kZ, 1e-15L));
  EXPECT_EQ(redrawn.Draws(), 6u);
  // The smallest double: v = 0 passes the log test, then u < 5.0E-324 refuses the division.
  ExpectRaises(rsDivideByZero, [] {
    Random_Normal(Uniforms{static_cast<Extended>(std::numeric_limits<double>::denorm_min()), 0.5L});
  });
  EXPECT_TRUE(Near(Random_Normal(10, -2, Uniforms{0.5L, 0.6L}), 10 - 2 * kZ, 1e-14L));  // SD < 0
  EXPECT_EQ(Random_Normal(10, 0, Uniforms{0.5L, 0.6L}), 10.0L);
  // The log-normal's logarithm is normal with matching moments: mean 1, StdDev 1.
  EXPECT_TRUE(Near(std::log(Random_LogNormal(1, 1, Uniforms{0.5L, 0.6L})),
                   -0.5L * std::log(2.0L) + std::sqrt(std::log(2.0L)) * kZ, 1e-15L));
  const auto logNormalDraw = [](Pair p) { return EITHER(Random_LogNormal, p[0], p[1]); };
  ExpectEachRaisesBeforeDraw<Pair>(rsInvalidMean, {{0, 1}, {-1, -1}}, logNormalDraw);
  ExpectEachRaisesBeforeDraw<Pair>(rsInvalidStdDev, {{1, 0}, {1, -2}}, logNormalDraw);
}

TEST(RandomGamma, ExponentialShapesAndDrawOrder) {
  // 0, 4E-324 and exactly 5.0E-324 are refused (u must exceed 5.0E-324); shape 1 is the
  // exponential draw for draw.
  Uniforms script{0.0L, 4e-324L, 5.0E-324L, 0.25L}, a{0.0L, 4e-324L, 5.0E-324L, 0.25L};
  EXPECT_EQ(Random_Exponential(script), std::log(4.0L));
  EXPECT_EQ(Random_Gamma(1, a), std::log(4.0L));
  EXPECT_EQ(a.Draws(), 4u);
  EXPECT_NEAR(Random_Exponential(Uniforms{5.0000001E-324L}), 744.0L, 1.0L);
  EngineSource left(11), right(11);
  for (int i = 0; i < 1000; ++i) ASSERT_EQ(Random_Gamma(1, left), Random_Exponential(right));
  // Shape 0.5: t = 0.5, p = 1 / (1 + e^-0.5). u = 1 is redrawn; u = 1E-300 lies under the
  // floor p (Tiny / t)^0.5 and gives 0 at once, without a second uniform.
  Uniforms floor{1.0L, 1e-300L};
  EXPECT_EQ(Random_Gamma(0.5L, floor), 0.0L);
  EXPECT_EQ(floor.Draws(), 2u);
  // u <= p: x = t (u / p)^2, u2 = 0.5 accepts; u > p: x = t - ln((1 - u) / (1 - p)).
  EXPECT_NEAR(Random_Gamma(0.5L, Uniforms{0.3L, 0.5L}), 0.1161423342268519125961405L, 1e-15L);
  EXPECT_NEAR(Random_Gamma(0.5L, Uniforms{0.9L, 0.1L}),
              0.5L - std::log(0.1L / (1 - 1 / (1 + std::exp(-0.5L)))), 1e-15L);
  // Shape 2: a normal, then one uniform; d = 5/3, c = 1/sqrt(15): d (1 + c z)^3 = 2.150035...
  Uniforms large{0.5L, 0.6L, 0.5L}, chi{0.5L, 0.6L, 0.5L};
  const Extended x = Random_Gamma(2, large);
  EXPECT_NEAR(x, 2.150035L, 1e-6L);
  EXPECT_EQ(large.Draws(), 3u);
  EXPECT_EQ(Random_ChiSq(4, chi), 2 * x);
  const auto gamma = [](Extended shape) { return EITHER(Random_Gamma, shape); };
  ExpectEachRaisesBeforeDraw(rsInvalidShape, {0.0L, -1e-30L, kNaN}, gamma);
  ExpectEachRaisesBeforeDraw(rsInvalidShape, {0, -3},
                             [](int df) { return EITHER(Random_ChiSq, df); });
  ExpectEachRaisesBeforeDraw(rsShapeTooSmall, {1e-4000L, 4.9E-324L}, gamma);
  EXPECT_GE(Random_Gamma(5.0E-324L, Uniforms{0.5L, 0.5L}), 0.0L);  // Tiny itself is allowed
}

TEST(RandomWeibullBetaAndT, DrawsAndChecks) {
  // E = ln 4; a negative shape is accepted.
  EXPECT_NEAR(Random_Weibull(-2, Uniforms{0.25L}), 0.849321800288019042721502834103L, 1e-18L);
  EXPECT_NEAR(Random_Weibull(2, Uniforms{0.25L}), 1.17741002251547469101156932646L, 1e-18L);
  ExpectEachRaisesBeforeDraw(rsInvalidValue, {0.0L, 5.0E-324L, -5.0E-324L, 1e-4000L, kNaN},
                             [](Extended shape) { return EITHER(Random_Weibull, shape); });
  // Swapped beta parameters reflect on the same uniforms: the smaller first parameter gives
  // 1 - x of the other's x.
  const std::array<Extended, 2> shapes[] = {{2, 3}, {0.5L, 0.7L}, {3, 0.4L}, {0.05L, 0.01L}};
  for (const auto& [a, b] : shapes) {
    EngineSource left(static_cast<std::uint64_t>(a * 1000 + b)), right(left);
    for (int i = 0; i < 500; ++i) {
      const Extended x = Random_Beta(a, b, left), y = Random_Beta(b, a, right);
      ASSERT_EQ(a < b ? x : y, 1 - (a < b ? y : x)) << a << " " << b;
      ASSERT_TRUE(x >= 0 && x <= 1);
    }
  }
  ExpectEachRaisesBeforeDraw<Pair>(rsInvalidValue, {{0, 1}, {1, 0}, {-1, 2}, {2, -0.5L}, {kNaN, 1}},
                                   [](Pair p) { return EITHER(Random_Beta, p[0], p[1]); });
  // u1 = 0 (z = 0) and u1 = 4E-324 (below Tiny) are redrawn before any test.
  EngineSource reference(9), engine(9);
  const Extended expected = Random_Beta(2, 3, reference);
  std::size_t calls = 0;
  auto source = [&calls, &engine]() -> Extended {
    ++calls;
    return calls == 1 ? 0 : calls == 3 ? 4e-324L : calls <= 4 ? 0.5L : engine();
  };
  EXPECT_EQ(Random_Beta(2, 3, source), expected);
  // T: u = 0 is redrawn; u = 0.5, v = 0.75 gives x = (2 v - 1) m / u = m: 1 for DF = 1,
  // sqrt(4) 3^-0.75 for DF = 2.
  Uniforms t1{0.0L, 0.5L, 0.75L};
  EXPECT_EQ(Random_T(1, t1), 1.0L);
  EXPECT_EQ(t1.Draws(), 3u);
  EXPECT_NEAR(Random_T(2, Uniforms{0.5L, 0.75L}), 2 * std::pow(3.0L, -0.75L), 1e-18L);
  ExpectEachRaisesBeforeDraw(rsInvalidValue, {0, -100},
                             [](int df) { return EITHER(Random_T, df); });
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
    ValueHash h(1469598103934665603u);
    for (int i = 0; i < 20000; ++i) h.Add(Random_T(df, source));
    EXPECT_EQ(h.Value(), hash) << "DF " << df;
  }
}

TEST(RandomMVNorm, PacksTheUpperFactorByRows) {
  // U = [2 1 -1; 0 3 2; 0 0 1], Covariance = U'U = [4 2 -2; 2 10 5; -2 5 6], packed by columns;
  // a longer Covariance is fine, and Factor shrinks to 6. Variate = means + U'z.
  const TQENFloatVector means{1, 2, 3};
  TQENFloatVector factor{7, 7, 7, 7, 7, 7, 7, 7}, variate;
  LongInt error = -1;
  Uniforms script{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L};
  Random_MVNorm(means, TQENFloatVector{4, 2, 10, -2, 5, 6, 123}, factor, variate, error, script);
  EXPECT_EQ(error, 0);
  EXPECT_EQ(Values(factor), (std::vector<Extended>{2, 1, -1, 3, 2, 1}));
  ASSERT_EQ(variate.size(), 3u);
  for (int i = 0; i < 3; ++i) {
    EXPECT_TRUE(
        Near(Extended(variate[i]), Extended(means[i]) + Extended(i == 1 ? 4 : 2) * kZ, 1e-14L));
  }
  // One dimension: the square root.
  TQENFloatVector one;
  Random_MVNorm({5}, {4}, factor, one, error, Uniforms{0.5L, 0.6L});
  EXPECT_EQ(Extended(factor[0]), 2.0L);
  EXPECT_TRUE(Near(Extended(one[0]), 5 + 2 * kZ, 1e-14L));
  // The outputs may be the inputs: Factor is the Covariance; Factor and Variate are one
  // vector (the variate wins).
  TQENFloatVector v{4, 2, 10, -2, 5, 6}, same;
  Random_MVNorm(means, v, v, variate, error, Uniforms{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L});
  EXPECT_EQ(Values(v), (std::vector<Extended>{2, 1, -1, 3, 2, 1}));
  Random_MVNorm(means, {4, 2, 10, -2, 5, 6}, same, same, error,
                Uniforms{0.5L, 0.6L, 0.5L, 0.6L, 0.5L, 0.6L});
  ASSERT_EQ(same.size(), 3u);
  EXPECT_TRUE(Near(Extended(same[2]), 3 + 2 * kZ, 1e-14L));
}

TEST(RandomMVNorm, ErrorsAndChecks) {
  TQENFloatVector factor{1, 2}, variate{8, 9};
  LongInt error = 0;
  Uniforms script{0.5L, 0.6L};
  Random_MVNorm(TQENFloatVector{5}, TQENFloatVector{0}, factor, variate, error, script);
  EXPECT_EQ(error, 1);  // not positive definite: the variate is left, the factor sized
  EXPECT_EQ(Values(variate), (std::vector<Extended>{8, 9}));
  EXPECT_EQ(factor.size(), 1u);
  // [1 1; 1 1] fails at the second pivot: the first row of the factor is filled.
  TQENFloatVector factor2, variate2{3};
  Random_MVNorm(TQENFloatVector{0, 0}, TQENFloatVector{1, 1, 1}, factor2, variate2, error, script);
  EXPECT_EQ(error, 1);
  EXPECT_EQ(Values(factor2), (std::vector<Extended>{1, 1, 0}));
  EXPECT_EQ(variate2.size() * 10 + script.Draws(), 10u);
  TQENFloatVector f{1, 2, 3}, v{4, 5};
  error = 42;
  const struct {
    TQENFloatVector means, covariance;
    TResStringId ident;
  } bad[] = {{{}, {1, 2, 3}, rsVectorEmpty}, {{1, 2}, {1, 0}, rsVectorTooSmall}};
  for (const auto& b : bad) {
    ExpectRaisesBeforeDraw(b.ident, [&](TRandomGenFunction* g) {
      g ? Random_MVNorm(b.means, b.covariance, f, v, error, *g)
        : Random_MVNorm(b.means, b.covariance, f, v, error);
      return 0;
    });
    EXPECT_EQ(f.size() * 10 + v.size(), 32u);
    EXPECT_EQ(error, 42);
  }
}

// The binomial (10, 0.35) by exact products.
long double Binomial10(int k) {
  static constexpr int kChoose[11] = {1, 10, 45, 120, 210, 252, 210, 120, 45, 10, 1};
  return kChoose[k] * std::pow(0.35L, k) * std::pow(0.65L, 10 - k);
}

TEST(RandomBinomial, ModeShortcutOutwardWalkAndInversion) {
  // Mode Trunc(11 x 0.35) = 3 with probability 0.2522: a first uniform below it returns 3;
  // for (10, 0.39) the mode is Trunc(4.29) = 4, not Trunc(10 x 0.39) = 3.
  for (Extended u : {0.0L, 0.25L}) {
    Uniforms script{u};
    EXPECT_EQ(Random_Binomial1(10, 0.35L, script), 3);
    EXPECT_EQ(script.Draws(), 1u);
    EXPECT_EQ(Random_Binomial1(10, 0.39L, Uniforms{u}), 4);
  }
  const int order[] = {3, 2, 4, 1, 5, 0, 6, 7, 8, 9, 10};  // the walk's order of visits
  for (int step = 0; step < 1000; ++step) {
    const Extended u = (step + 0.5L) / 1000;
    long double cumulative = 0;
    int expected = -1;
    bool nearEdge = false;
    for (int k : order) {
      cumulative += Binomial10(k);
      nearEdge = nearEdge || std::fabs(cumulative - u) < 1e-12L;
      if (cumulative > u) {
        expected = k;
        break;
      }
    }
    if (!nearEdge) {
      ASSERT_EQ(Random_Binomial1(10, 0.35L, Uniforms{u}), expected) << u;
    }
  }
  // P = 0 and P = 1 leave one possible value and draw nothing; N = 0 has the mode 0.
  for (LongInt n : {0, 1, 7, 1000000}) {
    Uniforms none{};
    EXPECT_EQ(Random_Binomial1(n, 0, none), 0);
    EXPECT_EQ(Random_Binomial1(n, 1, none), n);
    EXPECT_EQ(none.Draws(), 0u);
  }
  EXPECT_EQ(Random_Binomial1(0, 0.4L, Uniforms{0.999L}), 0);
  // N = 1, P = 0.01: the probabilities 0.99 and 0.01, held as doubles, add up to less than the
  // largest uniform, so the walk ends with u still not negative.
  ExpectRaises(rsInvalidValue, [] { Random_Binomial1(1, 0.01L, Uniforms{1 - 0x1p-64L}); });
  // N = 5, P = 0.3: q^N = 0.16807. u = 0.1 and 0.05 would give 0 and are redrawn; u = 0.2
  // gives 1, or N - 1 reflected for P > 0.5. Past y = 110 the search would not end.
  Uniforms script{0.1L, 0.05L, 0.2L}, beyond{1.5L};
  EXPECT_EQ(Random_Binomial2(5, 0.3L, script), 1);
  EXPECT_EQ(script.Draws(), 3u);
  EXPECT_EQ(Random_Binomial2(5, 0.7L, Uniforms{0.1L, 0.05L, 0.2L}), 4);
  ExpectRaises(rsInvalidValue, [&] { Random_Binomial2(5, 0.3L, beyond); });
  EXPECT_EQ(beyond.Draws(), 1u);
  ExpectEachRaisesBeforeDraw<Pair>(
      rsInvalidValue, {{0, 0.3L}, {10, 0}, {10, 1}, {-5, 0.3L}, {10, kNaN}},
      [](Pair p) { return EITHER(Random_Binomial2, Int64(p[0]), p[1]); });
}

TEST(RandomDiscrete, NegativeBinomialPoissonAndCauchy) {
  // R = 1, P = 0.5: u = 0.7 gives 1. R = 2, P = 0.8: two geometric draws (u = 0 redrawn),
  // Trunc(ln 0.5 / ln 0.8) = 3 and Trunc(ln 0.3 / ln 0.8) = 5; the fraction 0 adds nothing.
  Uniforms geometric{0.0L, 0.5L, 0.3L, 0.9L};
  EXPECT_EQ(Random_Neg_Binomial(1, 0.5L, Uniforms{0.7L}), 1);
  EXPECT_EQ(Random_Neg_Binomial(2, 0.8L, geometric), 8);
  EXPECT_EQ(geometric.Draws(), 4u);
  // 0.5^1000 is still above the guard.
  EXPECT_GE(Random_Neg_Binomial(1000, 0.5L, Uniforms{0.5L}), 0);
  ExpectEachRaisesBeforeDraw<Pair>(
      rsInvalidValue,
      {{0, 0.5L}, {1, 0}, {1, 1}, {1, -0.1L}, {1, 1.5L}, {kNaN, 0.5L}, {1100, 0.5L}},
      [](Pair p) { return EITHER(Random_Neg_Binomial, p[0], p[1]); });
  // Poisson: the table up to a mean of 10 (one uniform), the normal method above; the mean is
  // left alone; a mean that is not positive gives 0.
  const struct {
    Extended mu;
    std::initializer_list<Extended> uniforms;
    Int64 expected;
    std::size_t draws;
  } poisson[] = {{2, {0.5L}, 2, 1},
                 {10, {0.5L}, 10, 1},
                 {10.0001L, {0.5L, 0.6L}, 11, 2},
                 {0, {0.999L}, 0, 1},
                 {-kInf, {0.999L}, 0, 1}};
  for (const auto& c : poisson) {
    Extended mu = c.mu;
    Uniforms s(c.uniforms);
    EXPECT_EQ(Random_Poisson(mu, s), c.expected) << static_cast<double>(c.mu);
    EXPECT_EQ(s.Draws(), c.draws);
    EXPECT_EQ(mu, c.mu);
  }
  EXPECT_EQ(Random_Poisson(10.0001L, Uniforms{0.5L, 0.6L}), 11);  // the mean may be a literal
  for (Extended mu : {kInf, kNaN, 1e30L}) {
    ExpectRaises(rsInvalidValue, [&] { Random_Poisson(mu, Uniforms{0.5L, 0.6L, 0.5L, 0.6L}); });
  }
  // Cauchy: (0.5, 0) has y = 0; (0.98, 0.98) lies outside the disc; (0.5, -0.5) gives -1.
  Uniforms cauchy{0.75L, 0.5L, 0.99L, 0.99L, 0.75L, 0.25L};
  EXPECT_EQ(Random_Cauchy(cauchy), -1.0L);
  EXPECT_EQ(cauchy.Draws(), 6u);
}

TEST(RandomInvGaussAndVonMises, DrawsAndChecks) {
  // Lambda > Omega sqrt(Huge) / 4, and a falling to 0, are refused too.
  ExpectEachRaisesBeforeDraw<Pair>(rsInvalidValue,
                                   {{-1, 1}, {1, 0}, {1, -2}, {1e160L, 1}, {0, 1e-200L}, {kNaN, 1}},
                                   [](Pair p) { return EITHER(Random_Inv_Gauss, p[0], p[1]); });
  Uniforms script{0.0L, 0.5L, 0.5L};  // u = 0 is redrawn
  EXPECT_GT(Random_Inv_Gauss(1, 1, script), 0.0L);
  EXPECT_EQ(script.Draws(), 3u);
  ExpectEachRaisesBeforeDraw(rsInvalidValue, {-0.1L, 10.0L, kInf, kNaN},
                             [](Extended k) { return EITHER(Random_von_Mises, k); });
  // K = 0: one interval [0, pi]; the selecting uniform places the angle (s = 1 - u), the
  // uniform that ends the comparison run gives the sign.
  EXPECT_NEAR(Random_von_Mises(0, Uniforms{0.25L, 0.6L}), 0.75L * QENPi, 1e-18L);
  EXPECT_NEAR(Random_von_Mises(0, Uniforms{0.25L, 0.3L}), -0.75L * QENPi, 1e-18L);
  // K = 0.3 at 3 pi / 4: h = 0.512; the run 0.4, 0.5 has even length, so a new position s = 0.5
  // (pi / 2, h = 0.3) is drawn; 0.9 ends a run of length 1 and accepts.
  Uniforms run{0.25L, 0.4L, 0.5L, 0.5L, 0.9L};
  EXPECT_NEAR(Random_von_Mises(0.3L, run), QENPi / 2, 1e-18L);
  EXPECT_EQ(run.Draws(), 5u);
}

TEST(RandomStreams, FixedSeedsGiveTheRecordedDraws) {
  // The generators are evaluated with shortcuts that must not change a single decision: each
  // row hashes 20000 draws, through a caller's source and through the thread's own stream,
  // against the hash recorded from the plain evaluation of the methods (counts hash as Int64).
  // The exponential and the gamma below shape 1 were recorded again when their logarithms and
  // e^-t moved from the C library to Ln80 and Exp80: over 6 million draws against the earlier
  // code, every draw took the same uniforms, 22 % of the exponentials and 3 % of the
  // shape-1/2 gammas differed by one unit in the last place (the power (u / p)^(1 / Shape)
  // spreads p's unit to up to 1 / Shape of them: 98 at shape 0.01), and of 3000 differing
  // arguments checked with mpmath the new logarithm was the closer one every time, the new
  // exponential in all but one.
  const struct {
    Draw draw;
    bool count;
    std::uint64_t withSource, withoutSource;
  } rows[] = {
      {EITHER(Random_Normal), false, 0xC2613C5A7626F554ULL, 0xE58B31373893FCCULL},
      {EITHER(Random_Exponential), false, 0x9CBBED4CD054558FULL, 0xFD50325D51A0D81EULL},
      {EITHER(Random_Gamma, 5), false, 0xBC98F655F235FFBBULL, 0x25F504E6AB77C72ULL},
      {EITHER(Random_Gamma, 2.5L), false, 0xAB47C815F4EB25D5ULL, 0xD3F667094552BFEULL},
      {EITHER(Random_Gamma, 0.5L), false, 0x7CE6D3EAD03947D9ULL, 0xEFB90BB3CC001B14ULL},
      {EITHER(Random_Gamma, 0.3L), false, 0x8BF3B5AEAF6375F4ULL, 0x169C319B17DE8C72ULL},
      {EITHER(Random_Binomial2, 1000, 0.3L), true, 0xCE1CC84225D3A83CULL, 0xE0BE97114E21444AULL},
      {EITHER(Random_Binomial2, 20, 0.3L), true, 0xBDB9D402795CCC21ULL, 0x329F919F09C92B03ULL},
      {EITHER(Random_Binomial2, 100000, 0.6L), true, 0xCDC59516ACE941F4ULL, 0x645B5781DBC79630ULL},
      {EITHER(Random_Poisson, 100), true, 0x1A789606E9D90A19ULL, 0x94CEF0893552773FULL},
      {EITHER(Random_Poisson, 12.5L), true, 0x7321250B33791A32ULL, 0x78D834214F0DCB22ULL},
  };
  for (std::size_t i = 0; i < std::size(rows); ++i) {
    const auto& row = rows[i];
    EngineSource engine(2026);
    TRandomGenFunction source(engine);
    ValueHash withSource, withoutSource;
    const auto add = [&row](ValueHash& h, Extended x) {
      row.count ? h.Add(static_cast<Int64>(x)) : h.Add(x);
    };
    for (int k = 0; k < 20000; ++k) add(withSource, row.draw(&source));
    SetRandSeed(2026);
    for (int k = 0; k < 20000; ++k) add(withoutSource, row.draw(nullptr));
    EXPECT_EQ(withSource.Value(), row.withSource) << i << std::hex << " 0x" << withSource.Value();
    EXPECT_EQ(withoutSource.Value(), row.withoutSource)
        << i << std::hex << " 0x" << withoutSource.Value();
  }
}

TEST(RandomExtremes, LargeArgumentsStayWithinRangeWithoutOverflow) {
  constexpr Int64 kMax = std::numeric_limits<Int64>::max();  // run under UBSan too
  EngineSource engine(31);
  for (int i = 0; i < 200; ++i) {
    const Int64 half = Random_Binomial2(kMax, 0.5L, engine);
    EXPECT_TRUE(half >= 0 && half <= kMax);
    EXPECT_GT(Random_Binomial2(kMax, 0.9L, engine), kMax / 2);
    const Int64 few = Random_Binomial2(kMax, 1e-18L, engine);  // N p = 9.2: inversion
    EXPECT_TRUE(few >= 1 && few < 100);
  }
  const Int64 wide = Random_Binomial1(std::numeric_limits<LongInt>::max(), 0.5L, engine);
  EXPECT_NEAR(static_cast<long double>(wide), 1073741823.5L, 30 * 23170.5L);
  Extended mu = 1e18L;
  EXPECT_NEAR(static_cast<long double>(Random_Poisson(mu, engine)), 1e18L, 1e10L);
  EXPECT_GE(Random_Neg_Binomial(1e6L, 0.9L, engine), 0);  // a million geometric draws
}

// Counts kReferenceDraws draws into the bins of the named reference (continuous: between its
// quantiles; discrete: up to its last values), then compares the counts with the bin
// probabilities (chi-square below the critical value) and the mean and variance with the
// reference's.
void CheckDraws(const std::string& name, const std::function<long double()>& draw) {
  const auto c = std::find_if(std::begin(kContinuous), std::end(kContinuous),
                              [&](const auto& r) { return name == r.name; });
  const auto d = std::find_if(std::begin(kDiscrete), std::end(kDiscrete),
                              [&](const auto& r) { return name == r.name; });
  const bool continuous = c != std::end(kContinuous);
  ASSERT_TRUE(continuous || d != std::end(kDiscrete)) << name;
  const std::size_t bins = continuous ? kReferenceBins : d->lastValues.size();
  std::vector<int> counts(bins);
  long double sum = 0, sumSq = 0;
  for (int i = 0; i < kReferenceDraws; ++i) {
    const long double x = draw();
    ASSERT_FALSE(std::isnan(x)) << name;
    const auto bin =
        continuous
            ? std::upper_bound(c->edges.begin(), c->edges.end(), x) - c->edges.begin()
            : std::lower_bound(d->lastValues.begin(), d->lastValues.end(), static_cast<Int64>(x)) -
                  d->lastValues.begin();
    ++counts[std::min(static_cast<std::size_t>(bin), bins - 1)];
    sum += x;
    sumSq += x * x;
  }
  long double chi = 0;
  for (std::size_t i = 0; i < bins; ++i) {
    const long double expected =
        kReferenceDraws * (continuous ? 1.0L / kReferenceBins : d->probabilities[i]);
    chi += (counts[i] - expected) * (counts[i] - expected) / expected;
  }
  EXPECT_LT(chi, continuous ? kChiSquareCriticalBins : d->critical) << name;
  const long double n = kReferenceDraws, mean = continuous ? c->mean : d->mean,
                    variance = continuous ? c->variance : d->variance,
                    central4 = continuous ? c->central4 : d->central4;
  if (!std::isfinite(variance)) return;
  EXPECT_NEAR(sum / n, mean, 6 * std::sqrt(variance / n)) << name;
  if (!std::isfinite(central4)) return;
  EXPECT_NEAR((sumSq - sum * sum / n) / (n - 1), variance,
              6 * std::sqrt((central4 - variance * variance) / n))
      << name;
}

// Half of the cases draw from VerdanRandom (the overloads without a source), half from an
// independent std::mt19937_64 through the TRandomGenFunction overloads.
TEST(RandomDistribution, Continuous) {
  SetRandSeed(101);
  EngineSource e(102);
  CheckDraws("StandardNormal", [] { return Random_Normal(); });
  CheckDraws("StandardNormal", [&] { return (Random_Normal(3, 2, e) - 3) / 2; });
  CheckDraws("LogNormal_2_1_5", [] { return Random_LogNormal(2, 1.5L); });
  CheckDraws("Gamma_0_3", [] { return Random_Gamma(0.3L); });
  CheckDraws("Gamma_0_5", [&] { return Random_Gamma(0.5L, e); });
  CheckDraws("Gamma_1", [] { return Random_Gamma(1); });
  CheckDraws("Gamma_2_5", [&] { return Random_Gamma(2.5L, e); });
  CheckDraws("Gamma_5", [] { return Random_Gamma(5); });
  CheckDraws("Gamma_30", [&] { return Random_Gamma(30, e); });
  CheckDraws("ChiSq_3", [] { return Random_ChiSq(3); });
  CheckDraws("Gamma_1", [&] { return Random_Exponential(e); });
  CheckDraws("Weibull_2_5", [] { return Random_Weibull(2.5L); });
  CheckDraws("Weibull_neg2", [&] { return Random_Weibull(-2, e); });
  CheckDraws("Beta_2_3", [] { return Random_Beta(2, 3); });
  CheckDraws("Beta_0_5_0_7", [&] { return Random_Beta(0.5L, 0.7L, e); });
  CheckDraws("Beta_3_0_4", [] { return Random_Beta(3, 0.4L); });
  CheckDraws("Beta_0_2_5", [&] { return Random_Beta(0.2L, 5, e); });
  // DF 1 and 2 are decided by the exact test alone (the quick rejection would cut their tails):
  // DF = 1 is the standard Cauchy.
  CheckDraws("T_1", [] { return Random_T(1); });
  CheckDraws("Cauchy", [&] { return Random_T(1, e); });
  CheckDraws("T_2", [&] { return Random_T(2, e); });
  CheckDraws("T_3", [] { return Random_T(3); });
  CheckDraws("T_10", [&] { return Random_T(10, e); });
  CheckDraws("Cauchy", [] { return Random_Cauchy(); });
  CheckDraws("Cauchy", [&] { return Random_Cauchy(e); });
  CheckDraws("InvGauss_0_1", [] { return Random_Inv_Gauss(0, 1); });
  CheckDraws("InvGauss_0_5_1_5", [&] { return Random_Inv_Gauss(0.5L, 1.5L, e); });
  CheckDraws("InvGauss_2_0_5", [] { return Random_Inv_Gauss(2, 0.5L); });
  CheckDraws("InvGauss_6_20", [&] { return Random_Inv_Gauss(6, 20, e); });
  CheckDraws("VonMises_0", [] { return Random_von_Mises(0); });
  CheckDraws("VonMises_0_3", [&] { return Random_von_Mises(0.3L, e); });
  CheckDraws("VonMises_0_5", [] { return Random_von_Mises(0.5L); });
  CheckDraws("VonMises_2_7", [&] { return Random_von_Mises(2.7L, e); });
  CheckDraws("VonMises_9_99", [] { return Random_von_Mises(9.99L); });
}

TEST(RandomDistribution, Discrete) {
  SetRandSeed(501);
  EngineSource e(502);
  CheckDraws("Binomial1_20_0_3", [] { return Random_Binomial1(20, 0.3L); });
  CheckDraws("Binomial1_10_0_5", [&] { return Random_Binomial1(10, 0.5L, e); });
  CheckDraws("Binomial1_200_0_7", [] { return Random_Binomial1(200, 0.7L); });
  CheckDraws("Binomial1_1000_0_05", [&] { return Random_Binomial1(1000, 0.05L, e); });
  // The inversion path (N min(P, 1 - P) <= 30) redraws 0: the reference is truncated there.
  CheckDraws("Binomial2_20_0_3", [] { return Random_Binomial2(20, 0.3L); });
  CheckDraws("Binomial2_20_0_8", [&] { return Random_Binomial2(20, 0.8L, e); });
  CheckDraws("Binomial2_5_0_5", [] { return Random_Binomial2(5, 0.5L); });
  CheckDraws("Binomial2_1000_0_3", [&] { return Random_Binomial2(1000, 0.3L, e); });
  CheckDraws("Binomial2_200_0_6", [] { return Random_Binomial2(200, 0.6L); });
  CheckDraws("Binomial2_100000_0_45", [&] { return Random_Binomial2(100000, 0.45L, e); });
  CheckDraws("Binomial2_150_0_5", [] { return Random_Binomial2(150, 0.5L); });
  const std::pair<const char*, Extended> poisson[] = {
      {"Poisson_0_5", 0.5L},         {"Poisson_4", 4},   {"Poisson_10", 10},
      {"Poisson_10_0001", 10.0001L}, {"Poisson_25", 25}, {"Poisson_100", 100},
      {"Poisson_1000", 1000}};
  for (std::size_t i = 0; i < std::size(poisson); ++i) {
    Extended mu = poisson[i].second;
    CheckDraws(poisson[i].first,
               [&] { return i % 2 ? Random_Poisson(mu, e) : Random_Poisson(mu); });
  }
  CheckDraws("NegBinomial_2_5_0_4", [] { return Random_Neg_Binomial(2.5L, 0.4L); });
  CheckDraws("NegBinomial_3_7_0_8", [&] { return Random_Neg_Binomial(3.7L, 0.8L, e); });
  CheckDraws("NegBinomial_1_0_5", [] { return Random_Neg_Binomial(1, 0.5L); });
  CheckDraws("NegBinomial_0_4_0_95", [&] { return Random_Neg_Binomial(0.4L, 0.95L, e); });
}

TEST(RandomDistribution, MultivariateNormalMoments) {
  // Sample means and covariances within six standard errors (for normal data the covariance
  // (i, j) has variance (s_ii s_jj + s_ij^2) / n).
  const Extended sigma[3][3] = {{4, 2, -2}, {2, 10, 5}, {-2, 5, 6}}, mu[3] = {1, -2, 3};
  constexpr int kDraws = 50000;
  std::array<long double, 3> sum{};
  std::array<std::array<long double, 3>, 3> cross{};
  SetRandSeed(701);
  TQENFloatVector factor, variate;
  LongInt error = 0;
  for (int n = 0; n < kDraws; ++n) {
    Random_MVNorm({1, -2, 3}, {4, 2, 10, -2, 5, 6}, factor, variate, error);
    ASSERT_EQ(error, 0);
    const std::vector<Extended> v = Values(variate);
    for (int i = 0; i < 3; ++i) {
      sum[i] += v[i];
      for (int j = 0; j < 3; ++j) cross[i][j] += (v[i] - mu[i]) * (v[j] - mu[j]);
    }
  }
  for (int i = 0; i < 3; ++i) {
    EXPECT_NEAR(sum[i] / kDraws, mu[i], 6 * std::sqrt(sigma[i][i] / kDraws));
    for (int j = 0; j < 3; ++j) {
      EXPECT_NEAR(cross[i][j] / kDraws, sigma[i][j],
                  6 * std::sqrt((sigma[i][i] * sigma[j][j] + sigma[i][j] * sigma[i][j]) / kDraws));
    }
  }
}

}  // namespace
}  // namespace tovrin
