// Vector aggregates, the quick sort and ranking, each beside a plain loop or std::sort on the
// same input.
#include <algorithm>
#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

#include "tovrin/vector/TOVRINVector.h"

namespace {

using namespace tovrin;

constexpr std::size_t kN = 1000000;

template <typename V>
V RandomVector(std::size_t n, std::uint64_t seed) {
  std::mt19937_64 gen(seed);
  V v(n);
  using E = std::conditional_t<std::is_same_v<typename V::value_type, PackedExtended>, Extended,
                               typename V::value_type>;
  for (auto& e : v) {
    if constexpr (std::is_floating_point_v<E>) {
      e = static_cast<E>(std::uniform_real_distribution<double>(-1e6, 1e6)(gen));
    } else {
      e = static_cast<E>(gen());
    }
  }
  return v;
}

// --- Aggregates ------------------------------------------------------------------------------

template <typename V>
void BM_SumVector(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 1);
  for (auto _ : state) benchmark::DoNotOptimize(SumVector(v));
  state.SetItemsProcessed(state.iterations() * kN);
}

// The same sums written as a plain loop: Extended accumulation for floats, a wrapping 64-bit
// accumulation for integers.
template <typename V>
void BM_SumLoop(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 1);
  for (auto _ : state) {
    if constexpr (std::is_same_v<V, TQENFloatVector> || std::is_same_v<V, TQENDoubleVector>) {
      Extended s = 0;
      for (const auto& e : v) s += Extended(e);
      benchmark::DoNotOptimize(s);
    } else {
      std::uint64_t s = 0;
      for (auto e : v) s += static_cast<std::uint64_t>(static_cast<Int64>(e));
      benchmark::DoNotOptimize(s);
    }
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

template <typename V>
void BM_SumSqVector(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 2);
  for (auto _ : state) benchmark::DoNotOptimize(SumSqVector(v));
  state.SetItemsProcessed(state.iterations() * kN);
}

template <typename V>
void BM_SumSqLoop(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 2);
  for (auto _ : state) {
    if constexpr (std::is_same_v<V, TQENFloatVector> || std::is_same_v<V, TQENDoubleVector>) {
      Extended s = 0;
      for (const auto& e : v) {
        const Extended x = e;
        s += x * x;
      }
      benchmark::DoNotOptimize(s);
    } else {
      std::uint64_t s = 0;  // 32-bit signed square, sign-extended
      for (auto e : v) {
        const auto u = static_cast<std::uint32_t>(e);
        s += static_cast<std::uint64_t>(static_cast<Int64>(static_cast<LongInt>(u * u)));
      }
      benchmark::DoNotOptimize(s);
    }
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

template <typename V>
void BM_MinMaxVector(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 3);
  decltype(MaxVector(v)) lo, hi;
  LongWord loIndex, hiIndex;
  bool loUnique, hiUnique;
  for (auto _ : state) {
    MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
    benchmark::DoNotOptimize(lo);
    benchmark::DoNotOptimize(hi);
    benchmark::DoNotOptimize(loIndex);
    benchmark::DoNotOptimize(hiIndex);
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

template <typename V>
void BM_MinMaxLoop(benchmark::State& state) {
  const V v = RandomVector<V>(kN, 3);
  for (auto _ : state) {
    decltype(MaxVector(v)) lo = v[0], hi = v[0];
    LongWord loIndex = 0, hiIndex = 0;
    bool loUnique = true, hiUnique = true;
    for (std::size_t i = 1; i < v.size(); ++i) {
      const decltype(lo) x = v[i];
      if (x < lo) {
        lo = x;
        loIndex = LongWord(i);
        loUnique = true;
      } else if (x == lo) {
        loUnique = false;
      }
      if (x > hi) {
        hi = x;
        hiIndex = LongWord(i);
        hiUnique = true;
      } else if (x == hi) {
        hiUnique = false;
      }
    }
    benchmark::DoNotOptimize(lo);
    benchmark::DoNotOptimize(hi);
    benchmark::DoNotOptimize(loIndex);
    benchmark::DoNotOptimize(hiIndex);
    benchmark::DoNotOptimize(loUnique);
    benchmark::DoNotOptimize(hiUnique);
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

#define TOVRIN_AGGREGATE_BENCH(Family, Loop)                                   \
  BENCHMARK_TEMPLATE(Family, TQENFloatVector)->Unit(benchmark::kMicrosecond);  \
  BENCHMARK_TEMPLATE(Loop, TQENFloatVector)->Unit(benchmark::kMicrosecond);    \
  BENCHMARK_TEMPLATE(Family, TQENDoubleVector)->Unit(benchmark::kMicrosecond); \
  BENCHMARK_TEMPLATE(Loop, TQENDoubleVector)->Unit(benchmark::kMicrosecond);   \
  BENCHMARK_TEMPLATE(Family, TQENLIntVector)->Unit(benchmark::kMicrosecond);   \
  BENCHMARK_TEMPLATE(Loop, TQENLIntVector)->Unit(benchmark::kMicrosecond);     \
  BENCHMARK_TEMPLATE(Family, TQENByteVector)->Unit(benchmark::kMicrosecond);   \
  BENCHMARK_TEMPLATE(Loop, TQENByteVector)->Unit(benchmark::kMicrosecond)

TOVRIN_AGGREGATE_BENCH(BM_SumVector, BM_SumLoop);
TOVRIN_AGGREGATE_BENCH(BM_SumSqVector, BM_SumSqLoop);
TOVRIN_AGGREGATE_BENCH(BM_MinMaxVector, BM_MinMaxLoop);

// --- Sorting ---------------------------------------------------------------------------------

enum Shape { kRandom, kSorted, kReversed, kAllEqual, kFewDistinct };

template <typename V>
V ShapedVector(Shape shape) {
  V v = RandomVector<V>(kN, 4);
  using E = decltype(MaxVector(v));
  switch (shape) {
    case kRandom:
      break;
    case kSorted:
      QSortVector(v, true);
      break;
    case kReversed:
      QSortVector(v, false);
      break;
    case kAllEqual:
      FillVector(v, E(42));
      break;
    case kFewDistinct: {
      std::mt19937 gen(9);
      for (auto& e : v) e = E(gen() % 10);
      break;
    }
  }
  return v;
}

const char* ShapeName(Shape shape) {
  static const char* const names[] = {"random", "sorted", "reversed", "all_equal", "few_distinct"};
  return names[shape];
}

// Both sorts work on a fresh copy each iteration; the copy is outside the timing.
template <typename V>
void BM_QSortVector(benchmark::State& state) {
  const Shape shape = static_cast<Shape>(state.range(0));
  const V input = ShapedVector<V>(shape);
  state.SetLabel(ShapeName(shape));
  for (auto _ : state) {
    state.PauseTiming();
    V v = input;
    state.ResumeTiming();
    QSortVector(v, true);
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

template <typename V>
void BM_StdSort(benchmark::State& state) {
  const Shape shape = static_cast<Shape>(state.range(0));
  const V input = ShapedVector<V>(shape);
  state.SetLabel(ShapeName(shape));
  using E = decltype(MaxVector(input));
  for (auto _ : state) {
    state.PauseTiming();
    V v = input;
    state.ResumeTiming();
    std::sort(v.begin(), v.end(), [](const auto& a, const auto& b) { return E(a) < E(b); });
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kN);
}

// The same values of a TQENFloatVector as native long double (16 bytes each), sorted by
// std::sort: what a caller holding plain long double would run.
void BM_StdSortLongDouble(benchmark::State& state) {
  const Shape shape = static_cast<Shape>(state.range(0));
  const TQENFloatVector packed = ShapedVector<TQENFloatVector>(shape);
  const std::vector<long double> input(packed.begin(), packed.end());
  state.SetLabel(ShapeName(shape));
  for (auto _ : state) {
    state.PauseTiming();
    std::vector<long double> v = input;
    state.ResumeTiming();
    std::sort(v.begin(), v.end());
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kN);
}
BENCHMARK(BM_StdSortLongDouble)->DenseRange(0, 4)->Unit(benchmark::kMillisecond);

#define TOVRIN_SORT_BENCH(V)                                                              \
  BENCHMARK_TEMPLATE(BM_QSortVector, V)->DenseRange(0, 4)->Unit(benchmark::kMillisecond); \
  BENCHMARK_TEMPLATE(BM_StdSort, V)->DenseRange(0, 4)->Unit(benchmark::kMillisecond)

TOVRIN_SORT_BENCH(TQENDoubleVector);
TOVRIN_SORT_BENCH(TQENLIntVector);
TOVRIN_SORT_BENCH(TQENFloatVector);

// --- Ranking ---------------------------------------------------------------------------------

void BM_Vector2RankVector(benchmark::State& state) {
  const TQENDoubleVector v = RandomVector<TQENDoubleVector>(kN, 5);
  for (auto _ : state) benchmark::DoNotOptimize(Vector2RankVector(v, true).data());
  state.SetItemsProcessed(state.iterations() * kN);
}
BENCHMARK(BM_Vector2RankVector)->Unit(benchmark::kMillisecond);

// The yardstick of the ranking goal: one std::sort of the same values (copy included).
void BM_StdSortOfRankInput(benchmark::State& state) {
  const TQENDoubleVector input = RandomVector<TQENDoubleVector>(kN, 5);
  for (auto _ : state) {
    TQENDoubleVector v = input;
    std::sort(v.begin(), v.end());
    benchmark::DoNotOptimize(v.data());
  }
  state.SetItemsProcessed(state.iterations() * kN);
}
BENCHMARK(BM_StdSortOfRankInput)->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
