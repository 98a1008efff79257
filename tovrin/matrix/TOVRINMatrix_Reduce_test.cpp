// Tests of row echelon form, rank, inverse, determinant, zero rows and the identity test.
#include <gtest/gtest.h>

#include <atomic>
#include <cmath>
#include <random>
#include <thread>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/matrix/TOVRINMatrix_reduce_test_table.h"
#include "tovrin/matrix/TOVRINMatrix_test_support.h"

namespace tovrin {
namespace {

using testing::ExpectMathError;
using testing::ExpectRaisesUntouched;
using testing::Make;
using testing::Matrix;
using testing::RectangularCheckSwitch;
using testing::SameBits;
using testing::Values;
using Rows = std::vector<std::vector<long double>>;

template <typename T>
class Reduce : public ::testing::Test {};
TYPED_TEST_SUITE(Reduce, testing::FloatMatrixTypes);

template <typename T>
long double At(const Matrix<T>& M, std::size_t i, std::size_t j) {
  return static_cast<long double>(M[i][j]);
}

// The unit roundoff of the element type, for error bounds.
template <typename T>
long double Epsilon() {
  if constexpr (std::is_same_v<T, PackedExtended>) {
    return std::numeric_limits<long double>::epsilon();
  } else {
    return std::numeric_limits<T>::epsilon();
  }
}

TYPED_TEST(Reduce, SmallCasesWorkedByHand) {
  auto m = Make<TypeParam>({{2, 4}, {1, 3}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, 1}}));
  m = Make<TypeParam>({{2, 4}, {1, 3}});
  LongWord rank = 0;
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(rank, 2u);
  m = Make<TypeParam>({{2, 4}, {1, 3}});
  EXPECT_EQ(MatrixDeterminant(m), 2.0L);
  // The pivot search takes row 1 for column 0 and swaps.
  m = Make<TypeParam>({{0, 2}, {1, 1}});
  EXPECT_EQ(MatrixDeterminant(m), -2.0L);
  EXPECT_EQ(Values(m), (Rows{{1, 1}, {0, 1}}));
  // Singular.
  m = Make<TypeParam>({{1, 2}, {2, 4}});
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(rank, 1u);
  m = Make<TypeParam>({{1, 2}, {2, 4}});
  Matrix<TypeParam> inv;
  EXPECT_FALSE(MatrixInverse(m, inv));
  m = Make<TypeParam>({{1, 2}, {2, 4}});
  EXPECT_EQ(MatrixDeterminant(m), 0.0L);
  // A 2 x 3 matrix reduces but has no determinant.
  m = Make<TypeParam>({{0, 0, 3}, {0, 2, 4}});
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(Values(m), (Rows{{0, 1, 2}, {0, 0, 1}}));
  EXPECT_EQ(rank, 2u);
  ExpectRaisesUntouched(rsMatrixSqr, Make<TypeParam>({{1, 2, 3}, {4, 5, 6}}),
                        [](Matrix<TypeParam>& x) { MatrixDeterminant(x); });
  // A column with nothing in it is skipped; the zero row stays at the bottom.
  m = Make<TypeParam>({{0, 3, 6}, {0, 1, 2}, {0, 0, 0}});
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(Values(m), (Rows{{0, 1, 2}, {0, 0, 0}, {0, 0, 0}}));
  EXPECT_EQ(rank, 1u);
}

TYPED_TEST(Reduce, EqualMagnitudesKeepTheUpperRowAsPivot) {
  auto m = Make<TypeParam>({{1, 0}, {-1, 1}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0}, {0, 1}}));  // a swap would have given [[1,-1],[0,1]]
  m = Make<TypeParam>({{2, 1}, {-2, 3}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0.5}, {0, 1}}));  // a swap would have given [[1,-1.5],[0,1]]
  // A strictly larger magnitude further down does win.
  m = Make<TypeParam>({{2, 1}, {-4, 3}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, -0.75}, {0, 1}}));
  // A tie below the current row: rows 1 and 2 hold 2 and -2; the upper one (row 1) is swapped
  // up. Worked by hand: [[2,0],[0,1],[-2,4]] -> [[1,0],[0,1],[0,4]] -> 4 is the next pivot ->
  // [[1,0],[0,1],[0,0]]. Taking row 2 instead would have left [[1,-2],[0,1],[0,0]].
  m = Make<TypeParam>({{0, 1}, {2, 0}, {-2, 4}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0}, {0, 1}, {0, 0}}));
  // The leftmost column with a non-zero entry decides, however large later columns are.
  m = Make<TypeParam>({{0, 4, 4}, {0, 4, 4}, {1, 0, 0}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0, 0}, {0, 1, 1}, {0, 0, 0}}));
}

// Every swap turns the sign: an anti-diagonal matrix needs one swap, a cyclic permutation
// two. Both determinants by cofactor expansion: -(2 x 3 x 4) and +(2 x 3 x 4).
TYPED_TEST(Reduce, DeterminantSignFollowsTheSwaps) {
  auto m = Make<TypeParam>({{0, 0, 2}, {0, 3, 0}, {4, 0, 0}});
  EXPECT_EQ(MatrixDeterminant(m), -24.0L);
  EXPECT_EQ(Values(m), (Rows{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}));
  m = Make<TypeParam>({{0, 2, 0}, {0, 0, 3}, {4, 0, 0}});
  EXPECT_EQ(MatrixDeterminant(m), 24.0L);
  m = Make<TypeParam>({{0, 1, 0}, {0, 0, 1}, {1, 0, 0}});
  EXPECT_EQ(MatrixDeterminant(m), 1.0L);  // two swaps, no scaling
}

// A singular matrix: False, and both matrices stay as the elimination left them (no clearing
// above the pivots). By hand: swap (|2| > |1|), scale row 0 by 1/2, subtract row 0 from row 1.
TYPED_TEST(Reduce, InverseOfASingularMatrixStopsAfterTheElimination) {
  auto m = Make<TypeParam>({{1, 2}, {2, 4}});
  Matrix<TypeParam> inv = Make<TypeParam>({{7, 7, 7}});
  EXPECT_FALSE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, 0}}));
  EXPECT_EQ(Values(inv), (Rows{{0, 0.5}, {1, -0.5}}));
}

TYPED_TEST(Reduce, TolerancesOfTheElimination) {
  // Entries within tolerance of zero are neither pivots nor eliminated.
  auto m = Make<TypeParam>({{1, 0}, {1e-13L, 1}});
  RowEchelonForm(m);
  EXPECT_EQ(At(m, 1, 0), static_cast<long double>(TypeParam(1e-13L)));
  EXPECT_EQ(At(m, 1, 1), 1.0L);
  // A column whose entries are all within tolerance of zero is skipped: column 1 gives the
  // pivot 4 (row 1, swapped up), and 1e-13 stays behind in the zero row.
  m = Make<TypeParam>({{1e-13L, 2}, {0, 4}});
  LongWord rank = 0;
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(Values(m), (Rows{{0, 1}, {static_cast<long double>(TypeParam(1e-13L)), 0}}));
  EXPECT_EQ(rank, 1u);  // VectorZero counts [1e-13, 0] as zero
}

TEST(ReduceExtended, PivotWithinToleranceOfOneIsNotScaled) {
  const long double nearOne = 1.0L + 1e-13L;
  TQENFloatMatrix m{{nearOne, 3.0L}, {0.0L, 1.0L}};
  RowEchelonForm(m);
  EXPECT_EQ(static_cast<long double>(m[0][0]), nearOne);
  EXPECT_EQ(static_cast<long double>(m[0][1]), 3.0L);
  TQENFloatMatrix d{{nearOne, 3.0L}, {0.0L, 2.0L}};
  EXPECT_EQ(MatrixDeterminant(d), nearOne * 2.0L);
}

TYPED_TEST(Reduce, InverseOfASmallMatrix) {
  auto m = Make<TypeParam>({{2, 4}, {1, 3}});
  Matrix<TypeParam> inv = Make<TypeParam>({{9}});
  ASSERT_TRUE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(inv), (Rows{{1.5, -2}, {-0.5, 1}}));
  EXPECT_TRUE(MatrixIsIdentity(m));
  // Order 1.
  m = Make<TypeParam>({{4}});
  ASSERT_TRUE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(inv), (Rows{{0.25}}));
}

// Random integer matrices against determinants and inverses computed in exact rational
// arithmetic (see TOVRINMatrix_reduce_test_table.py).
TYPED_TEST(Reduce, RandomMatricesAgainstExactArithmetic) {
  const long double eps = Epsilon<TypeParam>();
  for (const auto& c : testing::ReduceCases()) {
    SCOPED_TRACE(::testing::Message() << "order " << c.N);
    Matrix<TypeParam> a(c.N);
    for (int i = 0; i < c.N; ++i) {
      for (int j = 0; j < c.N; ++j) a[i].push_back(TypeParam(c.A[i][j]));
    }
    const long double bound = 8 * c.N * c.Condition * eps;
    auto d = a;
    const long double det = MatrixDeterminant(d);
    EXPECT_LE(std::fabs(det - c.Determinant), bound * std::fabs(c.Determinant));
    auto m = a;
    Matrix<TypeParam> inv;
    ASSERT_TRUE(MatrixInverse(m, inv));
    long double largest = 0;
    for (const auto& row : c.Inverse) {
      for (long double x : row) largest = std::max(largest, std::fabs(x));
    }
    for (int i = 0; i < c.N; ++i) {
      for (int j = 0; j < c.N; ++j) {
        EXPECT_LE(std::fabs(At(inv, i, j) - c.Inverse[i][j]), bound * largest)
            << "element " << i << ", " << j;
      }
    }
    auto r = a;
    LongWord rank = 0;
    RowEchelonFormRank(r, rank);
    EXPECT_EQ(rank, static_cast<LongWord>(c.N));
  }
}

// A larger random, diagonally dominant (so well-conditioned) matrix: A x A^-1 is the identity
// within a few units of roundoff, and the rank is full.
TYPED_TEST(Reduce, RandomInverseRoundTrip) {
  constexpr int n = 40;
  std::mt19937_64 gen(77);
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  Matrix<TypeParam> a(n, std::vector<TypeParam>(n));
  for (int i = 0; i < n; ++i) {
    for (int j = 0; j < n; ++j) a[i][j] = TypeParam(static_cast<long double>(u(gen)));
    a[i][i] = TypeParam(static_cast<long double>(a[i][i]) + 2.0L * n);
  }
  auto m = a;
  Matrix<TypeParam> inv;
  ASSERT_TRUE(MatrixInverse(m, inv));
  const auto product = MultiplyMatrices(a, inv);
  long double worst = 0;
  for (int i = 0; i < n; ++i) {
    for (int j = 0; j < n; ++j) {
      worst = std::max(worst, std::fabs(At(product, i, j) - (i == j ? 1.0L : 0.0L)));
    }
  }
  EXPECT_LE(worst, 64 * n * Epsilon<TypeParam>());
}

TYPED_TEST(Reduce, ChecksInOrder) {
  using M = Matrix<TypeParam>;
  using Fn = void (*)(M&);
  const Fn reducers[] = {
      [](M& x) { RowEchelonForm(x); },
      [](M& x) {
        LongWord r = 0;
        RowEchelonFormRank(x, r);
      },
      [](M& x) { MatrixZeroRows(x); },
  };
  const Fn squares[] = {
      [](M& x) {
        M inv;
        MatrixInverse(x, inv);
      },
      [](M& x) { MatrixDeterminant(x); },
      [](M& x) { MatrixIsIdentity(x); },
  };
  RectangularCheckSwitch sw(true);
  for (Fn fn : reducers) {
    ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, fn);
    ExpectRaisesUntouched(rsMatrixIsEmpty, Make<TypeParam>({{}, {}}), fn);
    // Under the switch a ragged matrix reports no columns: it counts as empty.
    ExpectRaisesUntouched(rsMatrixIsEmpty, Make<TypeParam>({{1, 2}, {3}}), fn);
  }
  for (Fn fn : squares) {
    ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, fn);
    ExpectRaisesUntouched(rsMatrixIsEmpty, Make<TypeParam>({{1, 2}, {3}}), fn);
    ExpectRaisesUntouched(rsMatrixSqr, Make<TypeParam>({{1, 2}}), fn);
    ExpectRaisesUntouched(rsMatrixSqr, Make<TypeParam>({{1}, {2}}), fn);
  }
  // The inverse's output is not touched by a failed check either.
  M inv = Make<TypeParam>({{7}});
  M m = Make<TypeParam>({{1, 2}});
  ExpectMathError(rsMatrixSqr, [&] { MatrixInverse(m, inv); });
  EXPECT_EQ(Values(inv), (Rows{{7}}));
}

TYPED_TEST(Reduce, RaggedMatricesWithTheSwitchOff) {
  using M = Matrix<TypeParam>;
  RectangularCheckSwitch sw(false);
  // Row 1 is longer than row 0: only the first two columns take part.
  auto m = Make<TypeParam>({{2, 4}, {1, 3, 7}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, 1, 7}}));
  m = Make<TypeParam>({{2, 4}, {1, 3, 7}});
  EXPECT_EQ(MatrixDeterminant(m), 2.0L);
  // A row shorter than row 0 is never read past its end.
  const auto shorter = Make<TypeParam>({{2, 4}, {1}});
  ExpectRaisesUntouched(rsMatrixRect, shorter, [](M& x) { RowEchelonForm(x); });
  ExpectRaisesUntouched(rsMatrixRect, shorter, [](M& x) { MatrixDeterminant(x); });
  ExpectRaisesUntouched(rsMatrixRect, shorter, [](M& x) { MatrixIsIdentity(x); });
  ExpectRaisesUntouched(rsMatrixRect, shorter, [](M& x) {
    M inv;
    MatrixInverse(x, inv);
  });
  // An empty matrix is still empty.
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { RowEchelonForm(x); });
  // Zero rows are judged by VectorZero over each row's own length.
  EXPECT_EQ(MatrixZeroRows(Make<TypeParam>({{0, 0}, {0, 0, 1}, {0}})), 2u);
  ExpectMathError(rsVectorIsEmpty, [] { MatrixZeroRows(Make<TypeParam>({{0, 0}, {}})); });
}

TYPED_TEST(Reduce, ZeroRowsAndIdentity) {
  EXPECT_EQ(MatrixZeroRows(Make<TypeParam>({{0, 0}, {1e-13L, 0}, {1, 0}})), 2u);
  EXPECT_EQ(MatrixZeroRows(Make<TypeParam>({{1, 0}})), 0u);
  EXPECT_TRUE(MatrixIsIdentity(Make<TypeParam>({{1, 0}, {0, 1}})));
  EXPECT_TRUE(MatrixIsIdentity(Make<TypeParam>({{1, 1e-13L}, {0, 1 + 1e-13L}})));
  EXPECT_FALSE(MatrixIsIdentity(Make<TypeParam>({{1, 0}, {0, 2}})));
  EXPECT_FALSE(MatrixIsIdentity(Make<TypeParam>({{1, 0.001L}, {0, 1}})));
  EXPECT_FALSE(MatrixIsIdentity(Make<TypeParam>({{0}})));
}

TYPED_TEST(Reduce, SingularMatrices) {
  // Every step of this elimination is exact, at every precision.
  const auto singular = Make<TypeParam>({{1, 2, 3}, {2, 4, 6}, {1, 1, 1}});
  auto m = singular;
  Matrix<TypeParam> inv;
  EXPECT_FALSE(MatrixInverse(m, inv));
  LongWord rank = 0;
  m = singular;
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(Values(m), (Rows{{1, 2, 3}, {0, 1, 2}, {0, 0, 0}}));
  EXPECT_EQ(rank, 2u);
  m = singular;
  EXPECT_EQ(MatrixDeterminant(m), 0.0L);
  // Nearly singular in Extended: the determinant is of the order of the tolerance.
  TQENFloatMatrix f{{1.0L, 2.0L, 3.0L}, {4.0L, 5.0L, 6.0L}, {7.0L, 8.0L, 9.0L}};
  EXPECT_LT(std::fabs(MatrixDeterminant(f)), 1e-10L);
}

// The shape switch is never written: a thread watching it all the while never sees it change,
// and it keeps its value after failed calls.
TEST(ReduceSwitch, NeverWritten) {
  for (bool value : {true, false}) {
    RectangularCheckSwitch sw(value);
    std::atomic<bool> done{false};
    std::atomic<bool> changed{false};
    std::thread watcher([&] {
      while (!done.load()) {
        if (QENMatrixRectangularCheck.load() != value) changed = true;
      }
    });
    for (int round = 0; round < 20; ++round) {
      TQENDoubleMatrix m(40, TQENDoubleVector(40));
      for (int i = 0; i < 40; ++i) {
        for (int j = 0; j < 40; ++j) m[i][j] = (i * 7 + j * 3) % 11 + (i == j ? 20 : 0);
      }
      TQENDoubleMatrix inv;
      auto copy = m;
      EXPECT_TRUE(MatrixInverse(m, inv));
      EXPECT_NE(MatrixDeterminant(copy), 0.0L);
      TQENDoubleMatrix bad{{1, 2}};
      EXPECT_THROW(MatrixInverse(bad, inv), EMathError);
    }
    done = true;
    watcher.join();
    EXPECT_FALSE(changed.load());
    EXPECT_EQ(QENMatrixRectangularCheck.load(), value);
  }
}

}  // namespace
}  // namespace tovrin
