// Benchmarks of the Qt controls, each beside the library calls it makes on the same inputs,
// so the control's overhead is the ratio of the two.
//
// SetVector of 10^6 values, Sort() and the first paint of the grid, against a copy of the
// vector and QSortVector; Inverse() of a 100 x 100 matrix through TQENMatrixEdit (SetMatrix
// included), against a copy and MatrixInverse.
#include <benchmark/benchmark.h>

#include <QApplication>
#include <QPixmap>
#include <random>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/widgets/TOVRINWidgets.h"

namespace {

using namespace tovrin;

TQENFloatVector RandomVector(std::size_t N) {
  std::mt19937_64 gen(17);
  std::uniform_real_distribution<double> u(-1e6, 1e6);
  TQENFloatVector v(N);
  for (auto& x : v) x = u(gen);
  return v;
}

// Diagonally dominant, hence invertible.
TQENFloatMatrix RandomMatrix(std::size_t N) {
  std::mt19937_64 gen(18);
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  TQENFloatMatrix m(N, TQENFloatVector(N));
  for (std::size_t i = 0; i < N; ++i) {
    for (auto& x : m[i]) x = u(gen);
    m[i][i] += 4.0L;
  }
  return m;
}

void BM_VectorEdit_SetSortPaint(benchmark::State& state) {
  const TQENFloatVector data = RandomVector(static_cast<std::size_t>(state.range(0)));
  TQENVectorEdit edit;
  edit.resize(300, 400);
  edit.show();
  for (auto _ : state) {
    edit.SetVector(data);
    edit.Sort();
    benchmark::DoNotOptimize(edit.grab());
  }
}
BENCHMARK(BM_VectorEdit_SetSortPaint)->Arg(1000000)->Unit(benchmark::kMillisecond);

void BM_Library_CopySort(benchmark::State& state) {
  const TQENFloatVector data = RandomVector(static_cast<std::size_t>(state.range(0)));
  for (auto _ : state) {
    TQENFloatVector v = data;
    QSortVector(v, true);
    benchmark::DoNotOptimize(v.data());
  }
}
BENCHMARK(BM_Library_CopySort)->Arg(1000000)->Unit(benchmark::kMillisecond);

void BM_MatrixEdit_Inverse(benchmark::State& state) {
  const TQENFloatMatrix data = RandomMatrix(static_cast<std::size_t>(state.range(0)));
  TQENMatrixEdit edit;
  for (auto _ : state) {
    edit.SetMatrix(data);
    benchmark::DoNotOptimize(edit.Inverse());
  }
}
BENCHMARK(BM_MatrixEdit_Inverse)->Arg(100)->Unit(benchmark::kMillisecond);

void BM_Library_Inverse(benchmark::State& state) {
  const TQENFloatMatrix data = RandomMatrix(static_cast<std::size_t>(state.range(0)));
  for (auto _ : state) {
    TQENFloatMatrix m = data;
    TQENFloatMatrix inverse;
    benchmark::DoNotOptimize(MatrixInverse(m, inverse));
  }
}
BENCHMARK(BM_Library_Inverse)->Arg(100)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  QApplication app(argc, argv);
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return 0;
}
