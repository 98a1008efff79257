// Money vectors beside their numeric and plain counterparts on the same values: the quick sort
// of a Currency vector against the Int64 QSortVector and std::sort, the wrapping money sum
// against a plain loop, and the float-to-money conversion (exact-product rounding) against
// the naive llroundl(x * 100). One iteration processes the whole vector; items are elements.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <random>
#include <vector>

#include "tovrin/currency/TOVRINFinVector.h"
#include "tovrin/vector/TOVRINVector.h"

namespace {

using namespace tovrin;

constexpr std::size_t kCount = 100000;

const TQENInt64Vector& Stored() {
  static const TQENInt64Vector stored = [] {
    std::mt19937_64 engine(20261121);
    std::uniform_int_distribution<Int64> dist(-100000000000, 100000000000);
    TQENInt64Vector v(kCount);
    for (auto& x : v) x = dist(engine);
    return v;
  }();
  return stored;
}

const TQENCurrencyVector& Money() {
  static const TQENCurrencyVector money = [] {
    TQENCurrencyVector v;
    for (const Int64 x : Stored()) v.push_back(Currency{x});
    return v;
  }();
  return money;
}

const TQENFloatVector& Amounts() {
  static const TQENFloatVector amounts = [] {
    TQENFloatVector v;
    for (const Int64 x : Stored()) v.push_back(static_cast<Extended>(x % 100000000) / 1000);
    return v;
  }();
  return amounts;
}

void BM_QSortVector_Currency(benchmark::State& state) {
  for (auto _ : state) {
    state.PauseTiming();
    TQENCurrencyVector v = Money();
    state.ResumeTiming();
    QSortVector(v, true);
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_QSortVector_Currency);

void BM_QSortVector_Int64(benchmark::State& state) {
  for (auto _ : state) {
    state.PauseTiming();
    TQENInt64Vector v = Stored();
    state.ResumeTiming();
    QSortVector(v, true);
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_QSortVector_Int64);

void BM_StdSort_Int64(benchmark::State& state) {
  for (auto _ : state) {
    state.PauseTiming();
    TQENInt64Vector v = Stored();
    state.ResumeTiming();
    std::sort(v.begin(), v.end());
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_StdSort_Int64);

void BM_SumVector_Currency(benchmark::State& state) {
  const TQENCurrencyVector& v = Money();
  for (auto _ : state) benchmark::DoNotOptimize(SumVector(v));
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_SumVector_Currency);

void BM_PlainLoopSum_Int64(benchmark::State& state) {
  const TQENInt64Vector& v = Stored();
  for (auto _ : state) {
    std::uint64_t sum = 0;
    for (const Int64 x : v) sum += static_cast<std::uint64_t>(x);
    benchmark::DoNotOptimize(sum);
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_PlainLoopSum_Int64);

void BM_Vector2QENCurrVector_Float(benchmark::State& state) {
  const TQENFloatVector& v = Amounts();
  for (auto _ : state) {
    TQENCurrVector r = Vector2QENCurrVector(v);
    benchmark::DoNotOptimize(r.data());
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_Vector2QENCurrVector_Float);

// The naive conversion: the product rounded to Extended, then rounded again (no range check).
void BM_PlainLoopLlroundl_Float(benchmark::State& state) {
  const TQENFloatVector& v = Amounts();
  for (auto _ : state) {
    std::vector<LongInt> r(v.size());
    for (std::size_t i = 0; i < v.size(); ++i) {
      r[i] = static_cast<LongInt>(std::llroundl(Extended(v[i]) * 100));
    }
    benchmark::DoNotOptimize(r.data());
  }
  state.SetItemsProcessed(state.iterations() * kCount);
}
BENCHMARK(BM_PlainLoopLlroundl_Float);

}  // namespace

BENCHMARK_MAIN();
