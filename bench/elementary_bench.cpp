// Calls per second of the 80-bit kernels Exp80, Ln80 and Pow80 beside the C library's expl,
// logl and powl (and exp, log and pow in double) on the same 4096 arguments. One item is one
// call.
#include <benchmark/benchmark.h>

#include <cmath>
#include <random>
#include <vector>

#include "tovrin/foundation/detail/Elementary.h"

namespace {

using tovrin::Extended;
constexpr int Count = 4096;

struct Arguments {
  std::vector<Extended> exp, ln, base, power;
};
const Arguments& Inputs() {
  static const Arguments a = [] {
    std::mt19937_64 engine(20261124);
    std::uniform_real_distribution<double> unit(0, 1);
    Arguments r;
    for (int i = 0; i < Count; ++i) {
      r.exp.push_back(-40 + 80 * static_cast<Extended>(unit(engine)));
      r.ln.push_back(std::exp(-23 + 46 * static_cast<Extended>(unit(engine))));
      r.base.push_back(0.1L + 10 * static_cast<Extended>(unit(engine)));
      r.power.push_back(-20 + 40 * static_cast<Extended>(unit(engine)));
    }
    return r;
  }();
  return a;
}

template <typename Call>
void Run(benchmark::State& state, Call call) {
  for (auto _ : state)
    for (int i = 0; i < Count; ++i) benchmark::DoNotOptimize(call(i));
  state.SetItemsProcessed(state.iterations() * Count);
}

void BM_Exp80(benchmark::State& s) {
  Run(s, [&x = Inputs().exp](int i) { return tovrin::detail::Exp80(x[i]); });
}
void BM_Expl(benchmark::State& s) {
  Run(s, [&x = Inputs().exp](int i) { return std::exp(x[i]); });
}
void BM_ExpDouble(benchmark::State& s) {
  Run(s, [&x = Inputs().exp](int i) { return std::exp(static_cast<double>(x[i])); });
}
void BM_Exp80Split(benchmark::State& s) {
  Run(s, [&x = Inputs().exp](int i) { return tovrin::detail::Exp80(x[i], 0x1p-70L * x[i]); });
}
void BM_Ln80(benchmark::State& s) {
  Run(s, [&x = Inputs().ln](int i) { return tovrin::detail::Ln80(x[i]); });
}
void BM_Logl(benchmark::State& s) {
  Run(s, [&x = Inputs().ln](int i) { return std::log(x[i]); });
}
void BM_LogDouble(benchmark::State& s) {
  Run(s, [&x = Inputs().ln](int i) { return std::log(static_cast<double>(x[i])); });
}
void BM_Pow80(benchmark::State& s) {
  Run(s, [&a = Inputs()](int i) { return tovrin::detail::Pow80(a.base[i], a.power[i]); });
}
void BM_Powl(benchmark::State& s) {
  Run(s, [&a = Inputs()](int i) { return std::pow(a.base[i], a.power[i]); });
}
void BM_PowDouble(benchmark::State& s) {
  Run(s, [&a = Inputs()](int i) {
    return std::pow(static_cast<double>(a.base[i]), static_cast<double>(a.power[i]));
  });
}
BENCHMARK(BM_Exp80);
BENCHMARK(BM_Expl);
BENCHMARK(BM_ExpDouble);
BENCHMARK(BM_Exp80Split);
BENCHMARK(BM_Ln80);
BENCHMARK(BM_Logl);
BENCHMARK(BM_LogDouble);
BENCHMARK(BM_Pow80);
BENCHMARK(BM_Powl);
BENCHMARK(BM_PowDouble);

}  // namespace

BENCHMARK_MAIN();
