// Tests of row echelon form, rank, inverse, determinant, zero rows and the identity test.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

struct ReduceCase {
  int N;
  std::vector<std::vector<long double>> A;
  long double Determinant;
  std::vector<std::vector<long double>> Inverse;
  double Condition;
};
#include "tovrin/matrix/TOVRINMatrix_Reduce_reference.inc"

using namespace testing;

TOVRIN_TYPED_SUITE(Reduce, testing::FloatElements);

// The unit roundoff of the element type, for error bounds.
template <typename T>
long double Epsilon() {
  return std::numeric_limits<ValueOf<T>>::epsilon();
}

// Worked by hand; every step is exact at every precision.
TYPED_TEST(Reduce, SmallCasesPivotsAndSwaps) {
  using M = Matrix<TypeParam>;
  const struct {
    std::initializer_list<std::initializer_list<long double>> a;
    Rows echelon;
    LongWord rank;
  } cases[] = {
      {{{2, 4}, {1, 3}}, {{1, 2}, {0, 1}}, 2},
      {{{0, 2}, {1, 1}}, {{1, 1}, {0, 1}}, 2},  // the pivot search swaps row 1 up
      {{{1, 2}, {2, 4}}, {{1, 2}, {0, 0}}, 1},
      {{{0, 0, 3}, {0, 2, 4}}, {{0, 1, 2}, {0, 0, 1}}, 2},
      {{{0, 3, 6}, {0, 1, 2}, {0, 0, 0}}, {{0, 1, 2}, {0, 0, 0}, {0, 0, 0}}, 1},  // column skipped
      {{{1, 2, 3}, {2, 4, 6}, {1, 1, 1}}, {{1, 2, 3}, {0, 1, 2}, {0, 0, 0}}, 2},
      // Equal magnitudes keep the upper row as pivot (a swap would give [[1,-1],[0,1]]), a
      // strictly larger one further down wins, a tie below the current row takes the upper
      // of the two, and the leftmost column with a non-zero entry decides.
      {{{1, 0}, {-1, 1}}, {{1, 0}, {0, 1}}, 2},
      {{{2, 1}, {-2, 3}}, {{1, 0.5}, {0, 1}}, 2},
      {{{2, 1}, {-4, 3}}, {{1, -0.75}, {0, 1}}, 2},
      {{{0, 1}, {2, 0}, {-2, 4}}, {{1, 0}, {0, 1}, {0, 0}}, 2},
      {{{0, 4, 4}, {0, 4, 4}, {1, 0, 0}}, {{1, 0, 0}, {0, 1, 1}, {0, 0, 0}}, 2},
  };
  for (const auto& c : cases) {
    M m = Mat<TypeParam>(c.a);
    LongWord rank = 0;
    RowEchelonFormRank(m, rank);
    EXPECT_EQ(Values(m), c.echelon);
    EXPECT_EQ(rank, c.rank);
    m = Mat<TypeParam>(c.a);
    RowEchelonForm(m);
    EXPECT_EQ(Values(m), c.echelon);
  }
  // Determinants: every swap turns the sign (one swap, then two), and the pivots multiply.
  const struct {
    std::initializer_list<std::initializer_list<long double>> a;
    long double det;
  } dets[] = {{{{2, 4}, {1, 3}}, 2},
              {{{0, 2}, {1, 1}}, -2},
              {{{1, 2, 3}, {2, 4, 6}, {1, 1, 1}}, 0},
              {{{0, 0, 2}, {0, 3, 0}, {4, 0, 0}}, -24},
              {{{0, 2, 0}, {0, 0, 3}, {4, 0, 0}}, 24},
              {{{0, 1, 0}, {0, 0, 1}, {1, 0, 0}}, 1}};
  for (const auto& c : dets) {
    M m = Mat<TypeParam>(c.a);
    EXPECT_EQ(MatrixDeterminant(m), c.det);
  }
  M m = Mat<TypeParam>({{0, 0, 2}, {0, 3, 0}, {4, 0, 0}});
  MatrixDeterminant(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}));
}

TYPED_TEST(Reduce, InverseAndSingularMatrices) {
  using M = Matrix<TypeParam>;
  M m = Mat<TypeParam>({{2, 4}, {1, 3}}), inv = Mat<TypeParam>({{9}});
  ASSERT_TRUE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(inv), (Rows{{1.5, -2}, {-0.5, 1}}));
  EXPECT_TRUE(MatrixIsIdentity(m));
  m = Mat<TypeParam>({{4}});
  ASSERT_TRUE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(inv), (Rows{{0.25}}));
  // Singular: false, and both matrices stay as the elimination left them (swap, scale row 0
  // by 1/2, subtract it from row 1; nothing is cleared above the pivots).
  m = Mat<TypeParam>({{1, 2}, {2, 4}});
  inv = Mat<TypeParam>({{7, 7, 7}});
  EXPECT_FALSE(MatrixInverse(m, inv));
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, 0}}));
  EXPECT_EQ(Values(inv), (Rows{{0, 0.5}, {1, -0.5}}));
  TQENFloatMatrix f{{1.0L, 2.0L, 3.0L}, {4.0L, 5.0L, 6.0L}, {7.0L, 8.0L, 9.0L}};
  EXPECT_LT(std::fabs(MatrixDeterminant(f)), 1e-10L);  // nearly singular: of the tolerance's order
}

TYPED_TEST(Reduce, Tolerances) {
  // Entries within tolerance of zero are neither pivots nor eliminated; a column of them is
  // skipped (1e-13 stays behind in the zero row, which VectorZero counts as zero).
  const long double tiny = static_cast<long double>(TypeParam(1e-13L));
  auto m = Mat<TypeParam>({{1, 0}, {1e-13L, 1}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 0}, {tiny, 1}}));
  m = Mat<TypeParam>({{1e-13L, 2}, {0, 4}});
  LongWord rank = 0;
  RowEchelonFormRank(m, rank);
  EXPECT_EQ(Values(m), (Rows{{0, 1}, {tiny, 0}}));
  EXPECT_EQ(rank, 1u);
  EXPECT_EQ(MatrixZeroRows(Mat<TypeParam>({{0, 0}, {1e-13L, 0}, {1, 0}})), 2u);
  EXPECT_EQ(MatrixZeroRows(Mat<TypeParam>({{1, 0}})), 0u);
  EXPECT_TRUE(MatrixIsIdentity(Mat<TypeParam>({{1, 1e-13L}, {0, 1 + 1e-13L}})));
  EXPECT_FALSE(MatrixIsIdentity(Mat<TypeParam>({{1, 0}, {0, 2}})));
  EXPECT_FALSE(MatrixIsIdentity(Mat<TypeParam>({{1, 0.001L}, {0, 1}})));
  EXPECT_FALSE(MatrixIsIdentity(Mat<TypeParam>({{0}})));
}

TEST(Reduce, ExtendedPivotWithinToleranceOfOneIsNotScaled) {
  const long double nearOne = 1.0L + 1e-13L;
  TQENFloatMatrix m{{nearOne, 3.0L}, {0.0L, 1.0L}};
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{nearOne, 3}, {0, 1}}));
  TQENFloatMatrix d{{nearOne, 3.0L}, {0.0L, 2.0L}};
  EXPECT_EQ(MatrixDeterminant(d), nearOne * 2.0L);
}

// Random integer matrices against determinants and inverses in exact rational arithmetic
// (TOVRINMatrix_Reduce_reference.inc), within 8 N cond eps.
TYPED_TEST(Reduce, RandomMatricesAgainstExactArithmetic) {
  for (const auto& c : kReduceCases) {
    SCOPED_TRACE(::testing::Message() << "order " << c.N);
    Matrix<TypeParam> a(c.N);
    for (int i = 0; i < c.N; ++i) {
      for (int j = 0; j < c.N; ++j) a[i].push_back(TypeParam(c.A[i][j]));
    }
    const long double bound = 8 * c.N * c.Condition * Epsilon<TypeParam>();
    auto d = a, m = a, r = a;
    EXPECT_TRUE(RelNear(MatrixDeterminant(d), c.Determinant, bound));
    Matrix<TypeParam> inv;
    ASSERT_TRUE(MatrixInverse(m, inv));
    long double largest = 0;
    for (const auto& row : c.Inverse) {
      for (long double x : row) largest = std::max(largest, std::fabs(x));
    }
    for (int i = 0; i < c.N; ++i) {
      for (int j = 0; j < c.N; ++j) {
        EXPECT_TRUE(Near(Values(inv)[i][j], c.Inverse[i][j], bound * largest)) << i << ", " << j;
      }
    }
    LongWord rank = 0;
    RowEchelonFormRank(r, rank);
    EXPECT_EQ(rank, static_cast<LongWord>(c.N));
  }
  // A larger diagonally dominant matrix: A A^-1 is the identity within a few units.
  constexpr int n = 40;
  std::mt19937_64 gen(77);
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  Matrix<TypeParam> a(n, std::vector<TypeParam>(n));
  for (int i = 0; i < n; ++i) {
    for (int j = 0; j < n; ++j) a[i][j] = TypeParam(u(gen) + (i == j ? 2.0 * n : 0));
  }
  auto m = a;
  Matrix<TypeParam> inv;
  ASSERT_TRUE(MatrixInverse(m, inv));
  const auto product = Values(MultiplyMatrices(a, inv));
  for (int i = 0; i < n; ++i) {
    for (int j = 0; j < n; ++j) {
      EXPECT_TRUE(Near(product[i][j], i == j, 64 * n * Epsilon<TypeParam>()));
    }
  }
}

TYPED_TEST(Reduce, ChecksInOrder) {
  using M = Matrix<TypeParam>;
  using Fn = void (*)(M&);
  const Fn reducers[] = {[](M& x) { RowEchelonForm(x); },
                         [](M& x) {
                           LongWord r = 0;
                           RowEchelonFormRank(x, r);
                         },
                         [](M& x) { MatrixZeroRows(x); }};
  const Fn squares[] = {[](M& x) {
                          M inv;
                          MatrixInverse(x, inv);
                        },
                        [](M& x) { MatrixDeterminant(x); }, [](M& x) { MatrixIsIdentity(x); }};
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);
    for (Fn fn : reducers) {
      ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, fn);
      ExpectRaisesUntouched(rsMatrixIsEmpty, Mat<TypeParam>({{}, {}}), fn);
      ExpectRaisesUntouched(rsMatrixIsEmpty, Mat<TypeParam>({{1, 2}, {3}}),
                            fn);  // ragged: no columns
    }
    for (Fn fn : squares) {
      ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, fn);
      ExpectRaisesUntouched(rsMatrixIsEmpty, Mat<TypeParam>({{1, 2}, {3}}), fn);
      ExpectRaisesUntouched(rsMatrixSqr, Mat<TypeParam>({{1, 2}}), fn);
      ExpectRaisesUntouched(rsMatrixSqr, Mat<TypeParam>({{1}, {2}}), fn);
    }
    M inv = Mat<TypeParam>({{7}}), m = Mat<TypeParam>({{1, 2}});
    ExpectRaises(rsMatrixSqr, [&] { MatrixInverse(m, inv); });
    EXPECT_EQ(Values(inv), (Rows{{7}}));  // the output is not touched either
  }
  // Without the switch row 1 may be longer than row 0 (only two columns take part); a shorter
  // row is never read past its end; zero rows are judged over each row's own length.
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  auto m = Mat<TypeParam>({{2, 4}, {1, 3, 7}});
  RowEchelonForm(m);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, 1, 7}}));
  m = Mat<TypeParam>({{2, 4}, {1, 3, 7}});
  EXPECT_EQ(MatrixDeterminant(m), 2.0L);
  for (Fn fn : squares) ExpectRaisesUntouched(rsMatrixRect, Mat<TypeParam>({{2, 4}, {1}}), fn);
  ExpectRaisesUntouched(rsMatrixRect, Mat<TypeParam>({{2, 4}, {1}}), reducers[0]);
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, reducers[0]);
  EXPECT_EQ(MatrixZeroRows(Mat<TypeParam>({{0, 0}, {0, 0, 1}, {0}})), 2u);
  ExpectRaises(rsVectorIsEmpty, [] { MatrixZeroRows(Mat<TypeParam>({{0, 0}, {}})); });
}

}  // namespace
}  // namespace tovrin
