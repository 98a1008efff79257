// Runs the library on several threads at once: row reduction of distinct matrices while
// another thread watches QENMatrixRectangularCheck, VerdanRandom draws, statistics of shared
// read-only vectors, and message-text replacement during raises. Built under ThreadSanitizer
// (the `tsan` preset) it must report nothing; in every build the results must agree with a
// single-threaded run.
#include <atomic>
#include <cmath>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/tovrin.h"

namespace tovrin {
namespace {

constexpr int kThreads = 4;

TQENDoubleMatrix WellConditioned(int n, int seed) {
  TQENDoubleMatrix m(n, TQENDoubleVector(n));
  for (int i = 0; i < n; ++i) {
    for (int j = 0; j < n; ++j) m[i][j] = std::sin(seed + i * 7.0 + j * 3.0);
    m[i][i] += n;  // diagonally dominant
  }
  return m;
}

TEST(ThreadSafetyTest, RowReductionNeverChangesTheShapeSwitch) {
  std::atomic<bool> done{false};
  std::atomic<long> switch_changes{0};
  std::thread watcher([&] {
    while (!done.load()) {
      if (!QENMatrixRectangularCheck.load()) ++switch_changes;
    }
  });
  std::vector<Extended> determinants(kThreads), expected(kThreads);
  for (int t = 0; t < kThreads; ++t) {
    TQENDoubleMatrix m = WellConditioned(40, t);
    expected[t] = MatrixDeterminant(m);
  }
  std::vector<std::thread> workers;
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([t, &determinants] {
      for (int round = 0; round < 20; ++round) {
        TQENDoubleMatrix m = WellConditioned(40, t);
        TQENDoubleMatrix inverse;
        TQENDoubleMatrix copy = m;
        ASSERT_TRUE(MatrixInverse(copy, inverse));
        determinants[t] = MatrixDeterminant(m);
        TQENDoubleMatrix notSquare{{1, 2}};  // a failed call leaves the switch alone too
        EXPECT_THROW(MatrixInverse(notSquare, inverse), EMathError);
      }
    });
  }
  for (auto& w : workers) w.join();
  done = true;
  watcher.join();
  EXPECT_EQ(switch_changes.load(), 0);
  for (int t = 0; t < kThreads; ++t) EXPECT_EQ(determinants[t], expected[t]);
}

TEST(ThreadSafetyTest, UniformDrawsOnSeveralThreads) {
  std::vector<std::thread> workers;
  std::vector<Extended> sums(kThreads);
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([t, &sums] {
      Extended sum = 0;
      for (int i = 0; i < 20000; ++i) {
        const Extended u = VerdanRandom();
        ASSERT_GE(u, 0.0L);
        ASSERT_LT(u, 1.0L);
        sum += u;
      }
      sums[t] = sum;
    });
  }
  for (auto& w : workers) w.join();
  // Each thread's mean of 20000 uniforms is 0.5 within six standard errors (0.0122).
  for (Extended s : sums) EXPECT_NEAR(static_cast<double>(s / 20000), 0.5, 0.0122);
}

TEST(ThreadSafetyTest, StatisticsOfSharedReadOnlyVectors) {
  TQENFloatVector values(5001);
  for (std::size_t i = 0; i < values.size(); ++i) values[i] = std::cos(Extended(i));
  TQENFloatVector sorted = values;
  QSortVector(sorted, true);
  const Extended median = GetMedian(sorted);
  const Extended variance = SampleVariance(values);
  std::atomic<int> mismatches{0};
  std::vector<std::thread> workers;
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([&] {
      for (int round = 0; round < 20; ++round) {
        if (GetMedian(sorted) != median) ++mismatches;
        if (SampleVariance(values) != variance) ++mismatches;
        TQENFloatVector copy = values;
        QSortVector(copy, true);
        if (Extended(copy[2500]) != median) ++mismatches;
      }
    });
  }
  for (auto& w : workers) w.join();
  EXPECT_EQ(mismatches.load(), 0);
}

TEST(ThreadSafetyTest, MessageTextsReplacedWhileRaising) {
  std::atomic<bool> done{false};
  std::thread translator([&] {
    for (int i = 0; !done.load(); ++i) {
      SetResString(rsVectorIsEmpty, i % 2 ? "Vecteur vide" : "Vector is empty");
    }
  });
  std::vector<std::thread> workers;
  std::atomic<int> raised{0};
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([&] {
      for (int i = 0; i < 2000; ++i) {
        try {
          SumVector(TQENDoubleVector{});
        } catch (const EMathError& e) {
          if (e.Ident() == rsVectorIsEmpty) ++raised;
        }
      }
    });
  }
  for (auto& w : workers) w.join();
  done = true;
  translator.join();
  ResetResStrings();
  EXPECT_EQ(raised.load(), kThreads * 2000);
}

}  // namespace
}  // namespace tovrin
