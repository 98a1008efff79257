// Draws per second of the uniform source and the generators, each beside the <random>
// distribution for the same parameters on std::mt19937_64 (Boost's beta where available, else
// the beta as a ratio of two std gammas). One benchmark iteration is one draw.
#include <benchmark/benchmark.h>

#include <cstdint>
#include <random>

#include "tovrin/random/TOVRINRandom.h"

#ifdef TOVRIN_HAVE_BOOST
#include <boost/random/beta_distribution.hpp>
#endif

namespace {

using namespace tovrin;

std::mt19937_64& Engine() {
  static std::mt19937_64 engine(20261121);
  return engine;
}
std::mt19937& Engine32() {
  static std::mt19937 engine(20261121);
  return engine;
}

template <typename Draw>
void RunDraws(benchmark::State& state, Draw draw) {
  for (auto _ : state) benchmark::DoNotOptimize(draw());
  state.SetItemsProcessed(state.iterations());
}

// --- Uniform -------------------------------------------------------------------------------------
void BM_VerdanRandom(benchmark::State& state) {
  SetRandSeed(1);
  RunDraws(state, [] { return VerdanRandom(); });
}
void BM_Std_UniformDouble(benchmark::State& state) {
  std::uniform_real_distribution<double> dist(0, 1);
  RunDraws(state, [&] { return dist(Engine()); });
}
void BM_Std_CanonicalLongDouble64(benchmark::State& state) {
  RunDraws(state, [] { return std::generate_canonical<long double, 64>(Engine()); });
}
BENCHMARK(BM_VerdanRandom);
BENCHMARK(BM_Std_UniformDouble);
BENCHMARK(BM_Std_CanonicalLongDouble64);

// --- Normal and exponential
// ------------------------------------------------------------------------
void BM_Random_Normal(benchmark::State& state) {
  SetRandSeed(2);
  RunDraws(state, [] { return Random_Normal(); });
}
void BM_Random_Normal_MtSource(benchmark::State& state) {
  // The TRandomGenFunction overload, fed by the same engine as the std distribution.
  auto source = [] { return static_cast<Extended>(Engine()()) * 0x1p-64L; };
  RunDraws(state, [&] { return Random_Normal(source); });
}
void BM_Random_Normal_MtEngine(benchmark::State& state) {
  // The engine itself passed as the source (the same uniforms as the lambda above).
  RunDraws(state, [] { return Random_Normal(Engine()); });
}
void BM_Std_Normal(benchmark::State& state) {
  std::normal_distribution<double> dist(0, 1);
  RunDraws(state, [&] { return dist(Engine()); });
}
void BM_Random_Normal_Mt32Engine(benchmark::State& state) {
  RunDraws(state, [] { return Random_Normal(Engine32()); });
}
void BM_Std_Normal_Mt32(benchmark::State& state) {
  std::normal_distribution<double> dist(0, 1);
  RunDraws(state, [&] { return dist(Engine32()); });
}
void BM_Random_Exponential(benchmark::State& state) {
  SetRandSeed(3);
  RunDraws(state, [] { return Random_Exponential(); });
}
void BM_Std_Exponential(benchmark::State& state) {
  std::exponential_distribution<double> dist(1);
  RunDraws(state, [&] { return dist(Engine()); });
}
BENCHMARK(BM_Random_Normal);
BENCHMARK(BM_Random_Normal_MtSource);
BENCHMARK(BM_Random_Normal_MtEngine);
BENCHMARK(BM_Std_Normal);
BENCHMARK(BM_Random_Normal_Mt32Engine);
BENCHMARK(BM_Std_Normal_Mt32);
BENCHMARK(BM_Random_Exponential);
BENCHMARK(BM_Std_Exponential);

// --- Gamma and beta
// ----------------------------------------------------------------------------------
void BM_Random_Gamma(benchmark::State& state) {
  const Extended shape = state.range(0) / 10.0L;
  SetRandSeed(4);
  RunDraws(state, [shape] { return Random_Gamma(shape); });
}
void BM_Std_Gamma(benchmark::State& state) {
  std::gamma_distribution<double> dist(state.range(0) / 10.0);
  RunDraws(state, [&] { return dist(Engine()); });
}
void BM_Random_Gamma_MtSource(benchmark::State& state) {
  const Extended shape = state.range(0) / 10.0L;
  auto source = [] { return static_cast<Extended>(Engine()()) * 0x1p-64L; };
  RunDraws(state, [&] { return Random_Gamma(shape, source); });
}
void BM_Random_Gamma_MtEngine(benchmark::State& state) {
  const Extended shape = state.range(0) / 10.0L;
  RunDraws(state, [shape] { return Random_Gamma(shape, Engine()); });
}
BENCHMARK(BM_Random_Gamma)->Arg(5)->Arg(50);
BENCHMARK(BM_Random_Gamma_MtSource)->Arg(5)->Arg(50);
BENCHMARK(BM_Random_Gamma_MtEngine)->Arg(5)->Arg(50);
BENCHMARK(BM_Std_Gamma)->Arg(5)->Arg(50);

void BM_Random_Beta(benchmark::State& state) {
  SetRandSeed(5);
  RunDraws(state, [] { return Random_Beta(2, 3); });
}
#ifdef TOVRIN_HAVE_BOOST
void BM_Boost_Beta(benchmark::State& state) {
  boost::random::beta_distribution<double> dist(2, 3);
  RunDraws(state, [&] { return dist(Engine()); });
}
BENCHMARK(BM_Random_Beta);
BENCHMARK(BM_Boost_Beta);
#else
BENCHMARK(BM_Random_Beta);
#endif
void BM_Std_BetaByGammas(benchmark::State& state) {
  std::gamma_distribution<double> a(2), b(3);
  RunDraws(state, [&] {
    const double x = a(Engine());
    return x / (x + b(Engine()));
  });
}
BENCHMARK(BM_Std_BetaByGammas);

// --- Binomial and Poisson
// ------------------------------------------------------------------------------ Args: N and P in
// hundredths.
void BM_Random_Binomial2(benchmark::State& state) {
  const Int64 n = state.range(0);
  const Extended p = state.range(1) / 100.0L;
  SetRandSeed(6);
  RunDraws(state, [n, p] { return Random_Binomial2(n, p); });
}
void BM_Std_Binomial(benchmark::State& state) {
  std::binomial_distribution<std::int64_t> dist(state.range(0), state.range(1) / 100.0);
  RunDraws(state, [&] { return dist(Engine()); });
}
void BM_Random_Binomial2_MtSource(benchmark::State& state) {
  const Int64 n = state.range(0);
  const Extended p = state.range(1) / 100.0L;
  auto source = [] { return static_cast<Extended>(Engine()()) * 0x1p-64L; };
  RunDraws(state, [&] { return Random_Binomial2(n, p, source); });
}
BENCHMARK(BM_Random_Binomial2)->Args({1000, 30})->Args({20, 30});
void BM_Random_Binomial2_MtEngine(benchmark::State& state) {
  const Int64 n = state.range(0);
  const Extended p = state.range(1) / 100.0L;
  RunDraws(state, [n, p] { return Random_Binomial2(n, p, Engine()); });
}
void BM_Random_Binomial2_Mt32Engine(benchmark::State& state) {
  const Int64 n = state.range(0);
  const Extended p = state.range(1) / 100.0L;
  RunDraws(state, [n, p] { return Random_Binomial2(n, p, Engine32()); });
}
void BM_Std_Binomial_Mt32(benchmark::State& state) {
  std::binomial_distribution<std::int64_t> dist(state.range(0), state.range(1) / 100.0);
  RunDraws(state, [&] { return dist(Engine32()); });
}
BENCHMARK(BM_Random_Binomial2_MtSource)->Args({1000, 30});
BENCHMARK(BM_Random_Binomial2_MtEngine)->Args({1000, 30});
BENCHMARK(BM_Random_Binomial2_Mt32Engine)->Args({1000, 30});
BENCHMARK(BM_Std_Binomial_Mt32)->Args({1000, 30});
BENCHMARK(BM_Std_Binomial)->Args({1000, 30})->Args({20, 30});
void BM_Random_Binomial1(benchmark::State& state) {
  const auto n = static_cast<LongInt>(state.range(0));
  const Extended p = state.range(1) / 100.0L;
  SetRandSeed(7);
  RunDraws(state, [n, p] { return Random_Binomial1(n, p); });
}
BENCHMARK(BM_Random_Binomial1)->Args({1000, 30})->Args({20, 30});

void BM_Random_Poisson(benchmark::State& state) {
  Extended mu = static_cast<Extended>(state.range(0));
  SetRandSeed(8);
  RunDraws(state, [&mu] { return Random_Poisson(mu); });
}
void BM_Std_Poisson(benchmark::State& state) {
  std::poisson_distribution<std::int64_t> dist(static_cast<double>(state.range(0)));
  RunDraws(state, [&] { return dist(Engine()); });
}
void BM_Random_Poisson_MtSource(benchmark::State& state) {
  Extended mu = static_cast<Extended>(state.range(0));
  auto source = [] { return static_cast<Extended>(Engine()()) * 0x1p-64L; };
  RunDraws(state, [&] { return Random_Poisson(mu, source); });
}
BENCHMARK(BM_Random_Poisson)->Arg(4)->Arg(100);
void BM_Random_Poisson_MtEngine(benchmark::State& state) {
  Extended mu = static_cast<Extended>(state.range(0));
  RunDraws(state, [&mu] { return Random_Poisson(mu, Engine()); });
}
void BM_Random_Poisson_Mt32Engine(benchmark::State& state) {
  Extended mu = static_cast<Extended>(state.range(0));
  RunDraws(state, [&mu] { return Random_Poisson(mu, Engine32()); });
}
void BM_Std_Poisson_Mt32(benchmark::State& state) {
  std::poisson_distribution<std::int64_t> dist(static_cast<double>(state.range(0)));
  RunDraws(state, [&] { return dist(Engine32()); });
}
BENCHMARK(BM_Random_Poisson_MtSource)->Arg(100);
BENCHMARK(BM_Random_Poisson_MtEngine)->Arg(100);
BENCHMARK(BM_Random_Poisson_Mt32Engine)->Arg(100);
BENCHMARK(BM_Std_Poisson_Mt32)->Arg(100);
BENCHMARK(BM_Std_Poisson)->Arg(4)->Arg(100);

}  // namespace

BENCHMARK_MAIN();
