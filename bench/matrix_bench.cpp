// Benchmarks of the matrix unit, each beside a plain peer on the same inputs.
//
// MultiplyMatrices (i, k, j loops) against the naive i, j, k loop with the same rounding;
// MatrixInverse and MatrixDeterminant against a plain Gauss-Jordan / Gaussian elimination on
// the same element type; QSortMatrixRowsOnCol against std::sort of the rows by the key.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <random>
#include <vector>

#include "tovrin/matrix/TOVRINMatrix.h"

namespace {

using namespace tovrin;

template <typename T>
using Matrix = std::vector<std::vector<T>>;

template <typename T>
Matrix<T> RandomMatrix(std::size_t Rows, std::size_t Cols, std::uint64_t Seed,
                       bool Dominant = false) {
  std::mt19937_64 gen(Seed);
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  Matrix<T> m(Rows, std::vector<T>(Cols));
  for (std::size_t i = 0; i < Rows; ++i) {
    for (std::size_t j = 0; j < Cols; ++j) {
      m[i][j] = T(static_cast<long double>(u(gen)));
    }
    if (Dominant && i < Cols) m[i][i] = T(static_cast<long double>(m[i][i]) + 4.0L);
  }
  return m;
}

// --- Matrix product ---

// The naive loop: one element at a time, k innermost, with the library's rounding (Extended
// work, each partial sum stored at the element precision).
template <typename T>
Matrix<T> NaiveProduct(const Matrix<T>& A, const Matrix<T>& B) {
  const std::size_t n = A.size(), m = B.size(), p = B[0].size();
  Matrix<T> r(n, std::vector<T>(p));
  for (std::size_t i = 0; i < n; ++i) {
    for (std::size_t j = 0; j < p; ++j) {
      T acc = T(0);
      for (std::size_t k = 0; k < m; ++k) {
        acc = T(static_cast<long double>(acc) +
                static_cast<long double>(B[k][j]) * static_cast<long double>(A[i][k]));
      }
      r[i][j] = acc;
    }
  }
  return r;
}

template <typename T>
void BM_MultiplyMatrices(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 1), b = RandomMatrix<T>(n, n, 2);
  for (auto _ : state) benchmark::DoNotOptimize(MultiplyMatrices(a, b));
  state.SetItemsProcessed(state.iterations() * n * n * n);
}

template <typename T>
void BM_NaiveProduct(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 1), b = RandomMatrix<T>(n, n, 2);
  for (auto _ : state) benchmark::DoNotOptimize(NaiveProduct(a, b));
  state.SetItemsProcessed(state.iterations() * n * n * n);
}

#define PRODUCT_BENCH(T)                                                                         \
  BENCHMARK(BM_MultiplyMatrices<T>)->Arg(64)->Arg(256)->Arg(512)->Unit(benchmark::kMillisecond); \
  BENCHMARK(BM_NaiveProduct<T>)->Arg(64)->Arg(256)->Arg(512)->Unit(benchmark::kMillisecond);
PRODUCT_BENCH(PackedExtended)
PRODUCT_BENCH(Double)
PRODUCT_BENCH(Single)

// --- Inverse and determinant ---

// Plain peers on one contiguous array of the element type's working type (Extended for
// Extended, the element type itself otherwise): Gauss-Jordan with partial pivoting on the
// augmented matrix, and Gaussian elimination for the determinant.
template <typename T>
using Work = std::conditional_t<std::is_same_v<T, PackedExtended>, long double, T>;

template <typename T>
bool PlainInverse(const Matrix<T>& A, std::vector<Work<T>>& Inv) {
  using W = Work<T>;
  const std::size_t n = A.size(), w = 2 * n;
  std::vector<W> g(n * w);
  for (std::size_t i = 0; i < n; ++i) {
    for (std::size_t j = 0; j < n; ++j) g[i * w + j] = static_cast<W>(A[i][j]);
    g[i * w + n + i] = 1;
  }
  for (std::size_t c = 0; c < n; ++c) {
    std::size_t p = c;
    for (std::size_t i = c + 1; i < n; ++i) {
      if (std::fabs(g[i * w + c]) > std::fabs(g[p * w + c])) p = i;
    }
    if (g[p * w + c] == 0) return false;
    if (p != c) std::swap_ranges(&g[p * w], &g[p * w] + w, &g[c * w]);
    const W inv = 1 / g[c * w + c];
    for (std::size_t j = 0; j < w; ++j) g[c * w + j] *= inv;
    for (std::size_t i = 0; i < n; ++i) {
      const W f = g[i * w + c];
      if (i == c || f == 0) continue;
      for (std::size_t j = 0; j < w; ++j) g[i * w + j] -= f * g[c * w + j];
    }
  }
  Inv.resize(n * n);
  for (std::size_t i = 0; i < n; ++i) {
    for (std::size_t j = 0; j < n; ++j) Inv[i * n + j] = g[i * w + n + j];
  }
  return true;
}

template <typename T>
long double PlainDeterminant(const Matrix<T>& A) {
  using W = Work<T>;
  const std::size_t n = A.size();
  std::vector<W> g(n * n);
  for (std::size_t i = 0; i < n; ++i) {
    for (std::size_t j = 0; j < n; ++j) g[i * n + j] = static_cast<W>(A[i][j]);
  }
  long double d = 1;
  for (std::size_t c = 0; c < n; ++c) {
    std::size_t p = c;
    for (std::size_t i = c + 1; i < n; ++i) {
      if (std::fabs(g[i * n + c]) > std::fabs(g[p * n + c])) p = i;
    }
    if (g[p * n + c] == 0) return 0;
    if (p != c) {
      std::swap_ranges(&g[p * n], &g[p * n] + n, &g[c * n]);
      d = -d;
    }
    d *= g[c * n + c];
    for (std::size_t i = c + 1; i < n; ++i) {
      const W f = g[i * n + c] / g[c * n + c];
      for (std::size_t j = c; j < n; ++j) g[i * n + j] -= f * g[c * n + j];
    }
  }
  return d;
}

template <typename T>
void BM_MatrixInverse(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 3, true);
  Matrix<T> inv;
  for (auto _ : state) {
    auto m = a;
    benchmark::DoNotOptimize(MatrixInverse(m, inv));
  }
}

template <typename T>
void BM_PlainInverse(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 3, true);
  std::vector<Work<T>> inv;
  for (auto _ : state) benchmark::DoNotOptimize(PlainInverse(a, inv));
}

template <typename T>
void BM_MatrixDeterminant(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 4, true);
  for (auto _ : state) {
    auto m = a;
    benchmark::DoNotOptimize(MatrixDeterminant(m));
  }
}

template <typename T>
void BM_PlainDeterminant(benchmark::State& state) {
  const auto n = static_cast<std::size_t>(state.range(0));
  const auto a = RandomMatrix<T>(n, n, 4, true);
  for (auto _ : state) benchmark::DoNotOptimize(PlainDeterminant(a));
}

#define REDUCE_BENCH(T)                                                                  \
  BENCHMARK(BM_MatrixInverse<T>)->Arg(100)->Arg(300)->Unit(benchmark::kMillisecond);     \
  BENCHMARK(BM_PlainInverse<T>)->Arg(100)->Arg(300)->Unit(benchmark::kMillisecond);      \
  BENCHMARK(BM_MatrixDeterminant<T>)->Arg(100)->Arg(300)->Unit(benchmark::kMillisecond); \
  BENCHMARK(BM_PlainDeterminant<T>)->Arg(100)->Arg(300)->Unit(benchmark::kMillisecond);
REDUCE_BENCH(PackedExtended)
REDUCE_BENCH(Double)

// --- Sorting rows on a column ---

Matrix<Double> SortInput() {
  std::mt19937_64 gen(5);
  std::uniform_int_distribution<int> key(0, 49999);  // repeated keys, as in real tables
  Matrix<Double> m(100000, std::vector<Double>(4));
  for (std::size_t i = 0; i < m.size(); ++i) {
    m[i] = {static_cast<Double>(key(gen)), static_cast<Double>(i), 1.0, 2.0};
  }
  return m;
}

void BM_QSortMatrixRowsOnCol(benchmark::State& state) {
  const auto input = SortInput();
  for (auto _ : state) {
    state.PauseTiming();
    auto m = input;
    state.ResumeTiming();
    QSortMatrixRowsOnCol(m, 0, true);
    benchmark::DoNotOptimize(m.data());
  }
}

void BM_StdSortRows(benchmark::State& state) {
  const auto input = SortInput();
  for (auto _ : state) {
    state.PauseTiming();
    auto m = input;
    state.ResumeTiming();
    std::sort(m.begin(), m.end(), [](const auto& a, const auto& b) { return a[0] < b[0]; });
    benchmark::DoNotOptimize(m.data());
  }
}
BENCHMARK(BM_QSortMatrixRowsOnCol)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_StdSortRows)->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
