// Tests of the row and column operations, sorts, extraction, overwriting, copying,
// transposition, the matrix product and the row and column sums.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <random>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using namespace testing;

// --- Every element type ---------------------------------------------------------------------

TOVRIN_TYPED_SUITE(RowColAllTypes, testing::AllElements);

TYPED_TEST(RowColAllTypes, SwapRowsAndCols) {
  using M = Matrix<TypeParam>;
  auto m = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  SwapMatrixRows(m, 0, 1);
  EXPECT_EQ(Values(m), (Rows{{4, 5, 6}, {1, 2, 3}}));
  SwapMatrixCols(m, 2, 0);
  EXPECT_EQ(Values(m), (Rows{{6, 5, 4}, {3, 2, 1}}));
  // Equal indices return before any check.
  M none;
  SwapMatrixRows(m, 7, 7);
  SwapMatrixCols(m, 7, 7);
  SwapMatrixRows(none, 3, 3);
  SwapMatrixCols(none, 3, 3);
  EXPECT_EQ(Values(m), (Rows{{6, 5, 4}, {3, 2, 1}}));
  // Then empty comes first, then rectangular (a ragged matrix reports no columns under the
  // switch, so it fails the first check too), then each of the two indices.
  MatrixSwitch sw(QENMatrixRectangularCheck, true);
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { SwapMatrixRows(x, 0, 9); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, Mat<TypeParam>({{}, {}}),
                        [](M& x) { SwapMatrixCols(x, 0, 9); });
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}});
  ExpectRaisesUntouched(rsMatrixIsEmpty, ragged, [](M& x) { SwapMatrixRows(x, 0, 9); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, ragged, [](M& x) { SwapMatrixCols(x, 0, 9); });
  const auto sq = Mat<TypeParam>({{1, 2}, {3, 4}});
  ExpectRaisesUntouched(rsInvalidRow, sq, [](M& x) { SwapMatrixRows(x, 0, 2); });
  ExpectRaisesUntouched(rsInvalidRow, sq, [](M& x) { SwapMatrixRows(x, 2, 0); });
  ExpectRaisesUntouched(rsInvalidCol, sq, [](M& x) { SwapMatrixCols(x, 1, 5); });
  ExpectRaisesUntouched(rsInvalidCol, sq, [](M& x) { SwapMatrixCols(x, 2, 0); });
}

TYPED_TEST(RowColAllTypes, SwapsWithTheSwitchOffNeverPassARowEnd) {
  using M = Matrix<TypeParam>;
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  // Rows 0 and 1 are long enough; row 2 is not touched.
  auto m = Mat<TypeParam>({{1, 2}, {3, 4, 9}, {5}});
  SwapMatrixRows(m, 0, 1);
  EXPECT_EQ(Values(m), (Rows{{3, 4}, {1, 2, 9}, {5}}));  // the storage itself stays put
  ExpectRaisesUntouched(rsMatrixRect, m, [](M& x) { SwapMatrixRows(x, 0, 2); });
  // A column swap touches every row.
  ExpectRaisesUntouched(rsMatrixRect, m, [](M& x) { SwapMatrixCols(x, 0, 1); });
  auto n = Mat<TypeParam>({{1, 2, 3}, {4, 5}});
  SwapMatrixCols(n, 0, 1);
  EXPECT_EQ(Values(n), (Rows{{2, 1, 3}, {5, 4}}));
  ExpectRaisesUntouched(rsMatrixRect, n, [](M& x) { SwapMatrixCols(x, 0, 2); });
}

TYPED_TEST(RowColAllTypes, SortsOnAColumnOrARowAndTheirChecks) {
  using M = Matrix<TypeParam>;
  auto m = Mat<TypeParam>({{3}, {1}, {2}});
  QSortMatrixRowsOnCol(m, 5, true);  // no check at all
  QSortMatrixColsOnRow(m, 5, true);
  EXPECT_EQ(Values(m), (Rows{{3}, {1}, {2}}));
  M none;
  QSortMatrixRowsOnCol(none, 0, true);
  auto ragged = Mat<TypeParam>({{3, 1, 2}, {1}});
  // Under the switch a ragged matrix reports no columns: no check, no change.
  MatrixSwitch sw(QENMatrixRectangularCheck, true);
  QSortMatrixRowsOnCol(ragged, 9, true);
  QSortMatrixColsOnRow(ragged, 9, true);
  EXPECT_EQ(Values(ragged), (Rows{{3, 1, 2}, {1}}));
  m = Mat<TypeParam>({{7, 3}, {8, 1}, {9, 2}, {6, 5}});
  QSortMatrixRowsOnCol(m, 1, false);
  EXPECT_EQ(Values(m), (Rows{{6, 5}, {7, 3}, {9, 2}, {8, 1}}));
  const auto sq = Mat<TypeParam>({{2, 1}, {1, 2}});
  ExpectRaisesUntouched(rsInvalidCol, sq, [](M& x) { QSortMatrixRowsOnCol(x, 2, true); });
  ExpectRaisesUntouched(rsInvalidRow, sq, [](M& x) { QSortMatrixColsOnRow(x, 2, true); });
}

TYPED_TEST(RowColAllTypes, SortsOrderEqualKeysAsTheQuickSortLeavesThem) {
  // Keys [2, 1, 2, 1] with tags [0, 1, 2, 3]; traced by hand through the explicit-stack
  // quick sort (middle pivot, both scans stopping on equal keys, smaller part first).
  auto m = Mat<TypeParam>({{2, 0}, {1, 1}, {2, 2}, {1, 3}});
  auto up = m;
  QSortMatrixRowsOnCol(up, 0, true);
  EXPECT_EQ(Values(up), (Rows{{1, 3}, {1, 1}, {2, 0}, {2, 2}}));
  auto down = m;
  QSortMatrixRowsOnCol(down, 0, false);
  EXPECT_EQ(Values(down), (Rows{{2, 2}, {2, 0}, {1, 3}, {1, 1}}));
  auto t = Mat<TypeParam>({{2, 1, 2, 1}, {0, 1, 2, 3}});
  QSortMatrixColsOnRow(t, 0, true);
  EXPECT_EQ(Values(t), (Rows{{1, 1, 2, 2}, {3, 1, 0, 2}}));
  t = Mat<TypeParam>({{2, 1, 2, 1}, {0, 1, 2, 3}});
  QSortMatrixColsOnRow(t, 0, false);
  EXPECT_EQ(Values(t), (Rows{{2, 2, 1, 1}, {2, 0, 3, 1}}));
}

// Many repeated keys: the sorted key column is ordered, and every row is still whole (its tag
// and its check value travel with it).
TYPED_TEST(RowColAllTypes, SortsKeepRowsWholeOnLargeInputs) {
  std::mt19937_64 gen(99);
  std::uniform_int_distribution<int> key(0, 9);
  constexpr int n = 300;
  Matrix<TypeParam> m(n);
  for (int i = 0; i < n; ++i) {
    const int k = key(gen);
    m[i] = {TypeParam(k), TypeParam(i % 100), TypeParam((k * 7 + i % 100) % 50)};
  }
  for (bool ascending : {true, false}) {
    auto sorted = m;
    QSortMatrixRowsOnCol(sorted, 0, ascending);
    auto before = Values(m);
    auto after = Values(sorted);
    for (int i = 1; i < n; ++i) {
      EXPECT_TRUE(ascending ? after[i - 1][0] <= after[i][0] : after[i - 1][0] >= after[i][0]);
    }
    std::sort(before.begin(), before.end());
    std::sort(after.begin(), after.end());
    EXPECT_EQ(before, after);
    // The column sort of the transpose moves the same columns.
    auto t = TransposeMatrix(m);
    QSortMatrixColsOnRow(t, 0, ascending);
    EXPECT_TRUE(SameBits(TransposeMatrix(t), sorted));
  }
}

TYPED_TEST(RowColAllTypes, SortsWithTheSwitchOff) {
  using M = Matrix<TypeParam>;
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  auto longer = Mat<TypeParam>({{3, 0}, {1, 1, 9}, {2, 2}});
  QSortMatrixRowsOnCol(longer, 0, true);  // elements past Cols stay in their row storage
  EXPECT_EQ(Values(longer), (Rows{{1, 1}, {2, 2, 9}, {3, 0}}));
  ExpectRaisesUntouched(rsMatrixRect, Mat<TypeParam>({{3, 0}, {1}, {2, 2}}),
                        [](M& x) { QSortMatrixRowsOnCol(x, 0, true); });
  ExpectRaisesUntouched(rsMatrixRect, Mat<TypeParam>({{3, 0, 1}, {1, 2}}),
                        [](M& x) { QSortMatrixColsOnRow(x, 0, true); });
}

TYPED_TEST(RowColAllTypes, ExtractRowsAndColumns) {
  const auto m = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  EXPECT_EQ(Values(ExtractMatrixRow(m, 1)), (Row{4, 5, 6}));
  EXPECT_EQ(Values(ExtractMatrixCol(m, 2)), (Row{3, 6}));
  ExpectRaises(rsInvalidRow, [&] { ExtractMatrixRow(m, 2); });
  ExpectRaises(rsInvalidCol, [&] { ExtractMatrixCol(m, 3); });
  // No rows or no columns: an empty result, whatever the index.
  EXPECT_TRUE(ExtractMatrixRow(Matrix<TypeParam>{}, 5).empty());
  EXPECT_TRUE(ExtractMatrixCol(Matrix<TypeParam>{}, 5).empty());
  EXPECT_TRUE(ExtractMatrixCol(Mat<TypeParam>({{}, {1}}), 5).empty());
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}, {4, 5, 6}});
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);  // a ragged matrix reports no columns
    EXPECT_TRUE(ExtractMatrixRow(ragged, 0).empty());
    EXPECT_TRUE(ExtractMatrixCol(ragged, 9).empty());
  }
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, false);
    EXPECT_EQ(Values(ExtractMatrixRow(ragged, 2)), (Row{4, 5}));
    EXPECT_EQ(Values(ExtractMatrixCol(ragged, 0)), (Row{1, 3, 4}));
    ExpectRaises(rsMatrixRect, [&] { ExtractMatrixRow(ragged, 1); });
    ExpectRaises(rsMatrixRect, [&] { ExtractMatrixCol(ragged, 1); });
  }
}

TYPED_TEST(RowColAllTypes, OverwriteWithPadding) {
  using M = Matrix<TypeParam>;
  using V = std::vector<TypeParam>;
  auto m = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  OverwriteMatrixRow(m, 0, V{TypeParam(9)}, 0);
  EXPECT_EQ(Values(m), (Rows{{9, 0, 0}, {4, 5, 6}}));
  OverwriteMatrixRow(m, 1, V{TypeParam(1), TypeParam(2), TypeParam(3), TypeParam(4)}, 0);
  EXPECT_EQ(Values(m), (Rows{{9, 0, 0}, {1, 2, 3}}));
  OverwriteMatrixCol(m, 2, V{}, 7);
  EXPECT_EQ(Values(m), (Rows{{9, 0, 7}, {1, 2, 7}}));
  OverwriteMatrixCol(m, 0, V{TypeParam(5), TypeParam(6), TypeParam(8)}, 7);
  EXPECT_EQ(Values(m), (Rows{{5, 0, 7}, {6, 2, 7}}));
  ExpectRaisesUntouched(rsInvalidRow, m, [](M& x) { OverwriteMatrixRow(x, 2, V{}, 1); });
  ExpectRaisesUntouched(rsInvalidCol, m, [](M& x) { OverwriteMatrixCol(x, 3, V{}, 1); });
  // Nothing happens to a matrix without rows or columns.
  M none;
  OverwriteMatrixRow(none, 4, V{TypeParam(1)}, 1);
  OverwriteMatrixCol(none, 4, V{TypeParam(1)}, 1);
  EXPECT_TRUE(none.empty());
  auto blank = Mat<TypeParam>({{}, {}});
  OverwriteMatrixCol(blank, 0, V{TypeParam(1)}, 1);
  EXPECT_EQ(Values(blank), (Rows{{}, {}}));
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}});
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { OverwriteMatrixRow(x, 1, V{}, 1); });
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { OverwriteMatrixCol(x, 1, V{}, 1); });
  auto r = ragged;
  OverwriteMatrixCol(r, 0, V{}, 4);
  EXPECT_EQ(Values(r), (Rows{{4, 2}, {4}}));
}

TYPED_TEST(RowColAllTypes, TransposeAndADeepCopy) {
  using M = Matrix<TypeParam>;
  EXPECT_EQ(Values(TransposeMatrix(Mat<TypeParam>({{1, 2, 3}}))), (Rows{{1}, {2}, {3}}));
  EXPECT_EQ(Values(TransposeMatrix(Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}}))),
            (Rows{{1, 4}, {2, 5}, {3, 6}}));
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);
    ExpectRaises(rsMatrixRect, [] { TransposeMatrix(M{}); });
    ExpectRaises(rsMatrixRect, [] { TransposeMatrix(Mat<TypeParam>({{1, 2}, {3}})); });
  }
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, false);
    EXPECT_TRUE(TransposeMatrix(M{}).empty());
    EXPECT_TRUE(TransposeMatrix(Mat<TypeParam>({{}, {1}})).empty());
    ExpectRaises(rsMatrixRect, [] { TransposeMatrix(Mat<TypeParam>({{1, 2}, {3}})); });
    EXPECT_EQ(Values(TransposeMatrix(Mat<TypeParam>({{1, 2}, {3, 4, 5}}))), (Rows{{1, 3}, {2, 4}}));
  }
  const auto m = Mat<TypeParam>({{1, 2}, {}, {3, 4, 5}});
  auto c = CopyMatrix(m);
  EXPECT_TRUE(SameBits(c, m));
  c[0][0] = TypeParam(9);
  EXPECT_EQ(Values(m)[0][0], 1.0L);
  EXPECT_TRUE(CopyMatrix(Matrix<TypeParam>{}).empty());
}

// --- Scaling and adding (arithmetic types) --------------------------------------------------

TOVRIN_TYPED_SUITE(RowColArithmetic, testing::ArithmeticElements);

TYPED_TEST(RowColArithmetic, ScaleRowsAndColumns) {
  using M = Matrix<TypeParam>;
  auto m = Mat<TypeParam>({{1, 2}, {3, 4}});
  ScaleMatrixRow(m, 9, 1);  // K exactly 1 returns before any check
  ScaleMatrixCol(m, 9, 1);
  M none;
  ScaleMatrixRow(none, 0, 1);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {3, 4}}));
  ExpectRaisesUntouched(rsInvalidRow, m, [](M& x) { ScaleMatrixRow(x, 9, 2); });
  ExpectRaisesUntouched(rsInvalidCol, m, [](M& x) { ScaleMatrixCol(x, 2, 2); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, none, [](M& x) { ScaleMatrixRow(x, 0, 2); });
  ScaleMatrixRow(m, 1, -2);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {-6, -8}}));
  ScaleMatrixCol(m, 0, 3);
  EXPECT_EQ(Values(m), (Rows{{3, 2}, {-18, -8}}));
}

TYPED_TEST(RowColArithmetic, AddMultiplesOfRowsAndColumns) {
  using M = Matrix<TypeParam>;
  auto m = Mat<TypeParam>({{1, 2}, {3, 4}});
  AddMatrixRows(m, 1, 0, -3);
  EXPECT_EQ(Values(m), (Rows{{1, 2}, {0, -2}}));
  AddMatrixCols(m, 0, 1, 2);
  EXPECT_EQ(Values(m), (Rows{{5, 2}, {-4, -2}}));
  AddMatrixRows(m, 0, 0, 1);  // a row added to itself
  EXPECT_EQ(Values(m), (Rows{{10, 4}, {-4, -2}}));
  // No shortcut for K = 0: the indices are still checked.
  ExpectRaisesUntouched(rsInvalidRow, m, [](M& x) { AddMatrixRows(x, 0, 2, 0); });
  ExpectRaisesUntouched(rsInvalidCol, m, [](M& x) { AddMatrixCols(x, 2, 0, 0); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { AddMatrixCols(x, 0, 0, 0); });
  // Under the switch a ragged matrix reports no columns and fails the emptiness check.
  MatrixSwitch sw(QENMatrixRectangularCheck, true);
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}});
  ExpectRaisesUntouched(rsMatrixIsEmpty, ragged, [](M& x) { AddMatrixRows(x, 0, 9, 1); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, ragged, [](M& x) { ScaleMatrixCol(x, 9, 2); });
}

TYPED_TEST(RowColArithmetic, RaggedWithTheSwitchOff) {
  using M = Matrix<TypeParam>;
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}, {4, 5}});
  auto m = ragged;
  AddMatrixRows(m, 0, 2, 1);
  ScaleMatrixRow(m, 2, 2);
  ScaleMatrixCol(m, 0, 10);
  EXPECT_EQ(Values(m), (Rows{{50, 7}, {30}, {80, 10}}));
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { AddMatrixRows(x, 0, 1, 1); });
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { ScaleMatrixRow(x, 1, 2); });
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { ScaleMatrixCol(x, 1, 2); });
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { AddMatrixCols(x, 0, 1, 1); });
}

// Scaling and the added multiple wrap at the element width.
TEST(RowColIntegers, ScalingAndAddingWrap) {
  TQENLIntMatrix m{{2147483647, 1}, {2, 3}};
  ScaleMatrixRow(m, 0, 2);
  EXPECT_EQ(m, (TQENLIntMatrix{{-2, 2}, {2, 3}}));
  AddMatrixCols(m, 1, 0, 1073741824);  // 2 + 2^30 x -2 wraps to 2 - 2^31
  EXPECT_EQ(m[0][1], -2147483646);
  TQENInt64Matrix n{{std::numeric_limits<Int64>::max()}, {1}};
  AddMatrixRows(n, 0, 1, 1);
  EXPECT_EQ(n[0][0], std::numeric_limits<Int64>::min());
}

// --- Matrix product -------------------------------------------------------------------------

TOVRIN_TYPED_SUITE(RowColProduct, testing::FloatElements);

TYPED_TEST(RowColProduct, ShapesAndValues) {
  using M = Matrix<TypeParam>;
  const auto a = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  const auto b = Mat<TypeParam>({{1}, {0}, {-1}});
  EXPECT_EQ(Values(MultiplyMatrices(a, b)), (Rows{{-2}, {-2}}));
  EXPECT_EQ(Values(MultiplyMatrices(Mat<TypeParam>({{1, 2}, {3, 4}}),
                                    Mat<TypeParam>({{5, 6, 7}, {8, 9, 10}}))),
            (Rows{{21, 24, 27}, {47, 54, 61}}));
  ExpectRaises(rsMatrixMult, [&] { MultiplyMatrices(a, a); });
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);
    ExpectRaises(rsMatrixRect, [&] { MultiplyMatrices(M{}, b); });
    ExpectRaises(rsMatrixRect, [&] { MultiplyMatrices(a, Mat<TypeParam>({{1}, {2, 3}, {4}})); });
  }
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, false);
    ExpectRaises(rsMatrixIsEmpty, [&] { MultiplyMatrices(M{}, b); });
    ExpectRaises(rsMatrixIsEmpty, [&] { MultiplyMatrices(a, M{}); });
    ExpectRaises(rsMatrixRect, [&] { MultiplyMatrices(Mat<TypeParam>({{1, 2}, {3}}), a); });
    ExpectRaises(rsMatrixRect, [&] {
      MultiplyMatrices(Mat<TypeParam>({{1, 2}}), Mat<TypeParam>({{1, 2}, {3}}));
    });
    ExpectRaises(rsMatrixMult, [&] { MultiplyMatrices(b, Mat<TypeParam>({{1, 2}, {3, 4}})); });
    EXPECT_EQ(Values(MultiplyMatrices(Mat<TypeParam>({{2}, {3, 9}}), Mat<TypeParam>({{4, 5}}))),
              (Rows{{8, 10}, {12, 15}}));
  }
}

// Each product term is formed in Extended and added to an Extended sum; only the result is
// rounded. 1 x 3 times 3 x 1 with terms 1, 2^-60, -1: rounding every partial sum to Double (or
// Single) would lose 2^-60 and give 0, as it must for Double and Single results; Extended keeps it.
TEST(RowColProductRounding, TermsAndSumsInExtendedResultRoundedOnce) {
  const long double tiny = std::ldexp(1.0L, -60);
  EXPECT_EQ(MultiplyMatrices(TQENDoubleMatrix{{1.0, std::ldexp(1.0, -60), -1.0}},
                             TQENDoubleMatrix{{1.0}, {1.0}, {1.0}}),
            (TQENDoubleMatrix{{0.0}}));
  EXPECT_EQ(MultiplyMatrices(TQENSingleMatrix{{std::ldexp(1.0F, -30), 1.0F, -1.0F}},
                             TQENSingleMatrix{{std::ldexp(1.0F, -30)}, {1.0F}, {1.0F}}),
            (TQENSingleMatrix{{0.0F}}));
  const auto g = MultiplyMatrices(TQENFloatMatrix{{1.0L, tiny, -1.0L}},
                                  TQENFloatMatrix{{1.0L}, {1.0L}, {1.0L}});
  EXPECT_EQ(static_cast<long double>(g[0][0]), tiny);
  // (1 + 2^-52)^2 = 1 + 2^-51 + 2^-104: Extended keeps 1 + 2^-51, Double gets it.
  const double x = 1.0 + std::ldexp(1.0, -52);
  EXPECT_EQ(MultiplyMatrices(TQENDoubleMatrix{{x}}, TQENDoubleMatrix{{x}})[0][0],
            1.0 + std::ldexp(1.0, -51));
}

// --- Sums -----------------------------------------------------------------------------------

using SumTypes = ::testing::Types<PackedExtended, Double, Single, Int64, LongWord, SmallInt, Word,
                                  ShortInt, Byte>;
TOVRIN_TYPED_SUITE(RowColSums, SumTypes);

TYPED_TEST(RowColSums, SumsAndChecks) {
  const auto m = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  EXPECT_EQ(static_cast<long double>(SumMatrixRow(m, 1)), 15.0L);
  EXPECT_EQ(static_cast<long double>(SumMatrixCol(m, 2)), 9.0L);
  ExpectRaises(rsInvalidRow, [&] { SumMatrixRow(m, 2); });
  ExpectRaises(rsInvalidCol, [&] { SumMatrixCol(m, 3); });
  ExpectRaises(rsMatrixIsEmpty, [&] { SumMatrixRow(Matrix<TypeParam>{}, 0); });
  ExpectRaises(rsMatrixIsEmpty, [&] { SumMatrixCol(Mat<TypeParam>({{}, {}}), 0); });
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}});
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);  // ragged: no columns reported
    ExpectRaises(rsMatrixIsEmpty, [&] { SumMatrixRow(ragged, 0); });
    ExpectRaises(rsMatrixIsEmpty, [&] { SumMatrixCol(ragged, 0); });
  }
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  EXPECT_EQ(static_cast<long double>(SumMatrixRow(ragged, 0)), 3.0L);
  EXPECT_EQ(static_cast<long double>(SumMatrixCol(ragged, 0)), 4.0L);
  ExpectRaises(rsMatrixRect, [&] { SumMatrixRow(ragged, 1); });
  ExpectRaises(rsMatrixRect, [&] { SumMatrixCol(ragged, 1); });
}

// The sums follow the element rules of SumVector (VectorSums.TypeRules).
TEST(RowColSumsWidths, IntegersAreWidenedTo64Bits) {
  static_assert(std::is_same_v<decltype(SumMatrixRow(TQENByteMatrix{}, 0)), Int64>);
  static_assert(std::is_same_v<decltype(SumMatrixRow(TQENSingleMatrix{}, 0)), Extended>);
  EXPECT_EQ(SumMatrixCol(TQENSIntMatrix{{-128}, {-128}}, 0), -256);
  EXPECT_EQ(SumMatrixRow(TQENLWordMatrix{{4294967295u, 1}}, 0), 4294967296LL);
  EXPECT_EQ(SumMatrixRow(TQENDoubleMatrix{{1.0, std::ldexp(1.0, -60)}}, 0),
            1.0L + std::ldexp(1.0L, -60));
}

}  // namespace
}  // namespace tovrin
