#include "tovrin/currency/TOVRINFinMatrix.h"

#include <gtest/gtest.h>

#include "tovrin/testing/TOVRIN_testing.h"

#include <cstdint>
#include <initializer_list>
#include <type_traits>
#include <vector>

namespace tovrin {
namespace {

using Ints = std::vector<Int64>;
using IntRows = std::vector<Ints>;
using testing::ExpectRaises;
template <typename T>
T M(Int64 stored) {
  return testing::Money<T>(stored);
}
template <typename T>
std::vector<T> Vec(std::initializer_list<Int64> stored) {
  return testing::MoneyVec<T>(stored);
}
template <typename T>
auto StoredOf(const T& x) {
  return testing::Stored(x);
}
template <typename T>
std::vector<std::vector<T>> Mat(std::initializer_list<std::initializer_list<Int64>> rows) {
  return testing::MoneyMat<T>(rows);
}
using SwitchGuard = testing::SwitchGuard<decltype(QENMatrixRectangularCheck), bool>;

template <typename T>
std::vector<std::vector<T>> Created(LongWord Rows, LongWord Cols) {
  if constexpr (std::is_same_v<T, TQENCurrency>) return CreateCurrMatrix(Rows, Cols);
  if constexpr (std::is_same_v<T, TQENLongCurrency>) return CreateLongCurrMatrix(Rows, Cols);
  if constexpr (std::is_same_v<T, Currency>) return CreateCurrencyMatrix(Rows, Cols);
}
template <typename T>
std::vector<std::vector<T>> Identity(LongWord N) {
  if constexpr (std::is_same_v<T, TQENCurrency>) return CreateCurrIdentityMatrix(N);
  if constexpr (std::is_same_v<T, TQENLongCurrency>) return CreateLongCurrIdentityMatrix(N);
  if constexpr (std::is_same_v<T, Currency>) return CreateCurrencyIdentityMatrix(N);
}

template <typename T>
class MoneyMatrix : public ::testing::Test {};
using MoneyTypes = ::testing::Types<TQENCurrency, TQENLongCurrency, Currency>;
TYPED_TEST_SUITE(MoneyMatrix, MoneyTypes);

TYPED_TEST(MoneyMatrix, CreatorsAndIdentityHoldTheStoredOne) {
  using T = TypeParam;
  EXPECT_EQ(StoredOf(Created<T>(2, 3)), (IntRows{{0, 0, 0}, {0, 0, 0}}));
  EXPECT_TRUE(Created<T>(0, 5).empty());
  EXPECT_EQ(StoredOf(Created<T>(2, 0)), (IntRows{{}, {}}));
  EXPECT_TRUE(Identity<T>(0).empty());
  const Int64 one = std::is_same_v<T, TQENCurrency>       ? 100
                    : std::is_same_v<T, TQENLongCurrency> ? 1000000
                                                          : 10000;
  EXPECT_EQ(StoredOf(Identity<T>(3)), (IntRows{{one, 0, 0}, {0, one, 0}, {0, 0, one}}));
  // The stored one is the amount 1.
  EXPECT_EQ(Extended(Matrix2FloatMatrix(Identity<T>(1))[0][0]), 1.0L);
}

TYPED_TEST(MoneyMatrix, ShapeQueriesFollowTheSwitch) {
  using T = TypeParam;
  const auto ragged = Mat<T>({{1, 2}, {3}});
  const auto empty = Mat<T>({});
  LongWord rows = 9, cols = 9;
  bool rect = true;
  EXPECT_FALSE(MatrixIsRectangular(ragged));
  EXPECT_FALSE(MatrixIsRectangular(empty));
  EXPECT_TRUE(MatrixIsRectangular(Mat<T>({{}, {}})));
  MatrixDimensions(ragged, rows, cols, rect);
  EXPECT_EQ(rows, 2u);
  EXPECT_EQ(cols, 0u);
  EXPECT_FALSE(rect);
  MatrixDimensions(empty, rows, cols, rect);
  EXPECT_FALSE(rect);
  EXPECT_FALSE(MatrixIsSquare(empty));
  EXPECT_TRUE(MatrixIsSquare(Mat<T>({{1, 2}, {3, 4}})));
  EXPECT_FALSE(MatrixIsSquare(Mat<T>({{1, 2}})));
  EXPECT_TRUE(MatricesSameDimensions(Mat<T>({{1, 2}}), Mat<T>({{5, 6}})));
  EXPECT_FALSE(MatricesSameDimensions(Mat<T>({{1, 2}}), Mat<T>({{5}, {6}})));
  {
    SwitchGuard off(QENMatrixRectangularCheck, false);
    MatrixDimensions(ragged, rows, cols, rect);
    EXPECT_EQ(rows, 2u);
    EXPECT_EQ(cols, 2u);
    EXPECT_TRUE(rect);
    EXPECT_TRUE(MatrixIsSquare(empty));
    EXPECT_FALSE(MatrixIsRectangular(ragged));
  }
}

TYPED_TEST(MoneyMatrix, TwoMatrixArithmeticAndItsChecks) {
  using T = TypeParam;
  const auto a = Mat<T>({{1, 2}, {3, 4}});
  const auto b = Mat<T>({{10, -20}, {30, 40}});
  EXPECT_EQ(StoredOf(AddMatrices(a, b)), (IntRows{{11, -18}, {33, 44}}));
  EXPECT_EQ(StoredOf(SubtractMatrices(a, b)), (IntRows{{-9, 22}, {-27, -36}}));
  auto c = a;
  AddToMatrix(c, b);
  EXPECT_EQ(StoredOf(c), (IntRows{{11, -18}, {33, 44}}));
  SubtractFromMatrix(c, b);
  EXPECT_EQ(StoredOf(c), StoredOf(a));
  const auto ragged = Mat<T>({{1, 2}, {3}});
  ExpectRaises(rsSameDimensions, [&] { AddMatrices(ragged, ragged); });
  ExpectRaises(rsSameDimensions, [&] { AddToMatrix(c, Mat<T>({{1, 2}})); });
  ExpectRaises(rsSameDimensions, [&] { SubtractFromMatrix(c, Mat<T>({{1, 2, 3}, {4, 5, 6}})); });
  EXPECT_EQ(StoredOf(c), StoredOf(a));
  ExpectRaises(rsMatrixIsEmpty, [&] { SubtractMatrices(Mat<T>({{}}), Mat<T>({{}})); });
  EXPECT_THROW(AddMatrices(Mat<T>({}), Mat<T>({})), EAccessViolation);
}

TYPED_TEST(MoneyMatrix, ScalarProductsRoundHalvesToEven) {
  using T = TypeParam;
  // 2.5 -> 2, 3.5 -> 4, -2.5 -> -2, 0.5 -> 0: the stored integer times K, rounded.
  const auto m = Mat<T>({{5, 7}, {-5, 1}});
  EXPECT_EQ(StoredOf(MultiplyMatrixByConst(m, 0.5L)), (IntRows{{2, 4}, {-2, 0}}));
  auto n = m;
  MultiplyMatrixByConst2(n, 0.5L);
  EXPECT_EQ(StoredOf(n), (IntRows{{2, 4}, {-2, 0}}));
  // Ragged matrices are processed row by row.
  EXPECT_EQ(StoredOf(MultiplyMatrixByConst(Mat<T>({{1, 2}, {3}, {}}), 2)),
            (IntRows{{2, 4}, {6}, {}}));
  auto e = Mat<T>({});
  ExpectRaises(rsMatrixIsEmpty, [&] { MultiplyMatrixByConst(e, 2); });
  ExpectRaises(rsMatrixIsEmpty, [&] { MultiplyMatrixByConst2(e, 2); });
  ExpectRaises(rsMatrixIsEmpty, [&] { LinearTransformMatrix(e, 2, 1); });
}

TYPED_TEST(MoneyMatrix, GrandMeanRoundsToTheElementType) {
  using T = TypeParam;
  LongWord n = 0;
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{1, 2}}), n)), 2);  // 1.5
  EXPECT_EQ(n, 2u);
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{1, 4}}), n)), 2);  // 2.5
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{3, 4}}), n)), 4);  // 3.5
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{-1, -4}}), n)), -2);
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{1, 2}, {}, {3, 4, 5, 6}}), n)), 4);  // 3.5
  EXPECT_EQ(n, 6u);
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<T>({{1, 2, 4}}), n)), 2);  // 2.33
  n = 77;
  ExpectRaises(rsMatrixIsEmpty, [&] { GrandMean(Mat<T>({}), n); });
  ExpectRaises(rsMatrixIsEmpty, [&] { GrandMean(Mat<T>({{}, {}}), n); });
}

TYPED_TEST(MoneyMatrix, RowAndColumnOperations) {
  using T = TypeParam;
  auto m = Mat<T>({{3, 0, 9}, {1, 5, 8}, {2, 7, 6}});
  const auto original = m;
  SwapMatrixRows(m, 0, 2);
  EXPECT_EQ(StoredOf(m), (IntRows{{2, 7, 6}, {1, 5, 8}, {3, 0, 9}}));
  SwapMatrixCols(m, 0, 2);
  EXPECT_EQ(StoredOf(m), (IntRows{{6, 7, 2}, {8, 5, 1}, {9, 0, 3}}));
  m = original;
  QSortMatrixRowsOnCol(m, 0, true);
  EXPECT_EQ(StoredOf(m), (IntRows{{1, 5, 8}, {2, 7, 6}, {3, 0, 9}}));
  QSortMatrixRowsOnCol(m, 1, false);
  EXPECT_EQ(StoredOf(m), (IntRows{{2, 7, 6}, {1, 5, 8}, {3, 0, 9}}));
  QSortMatrixColsOnRow(m, 2, true);
  EXPECT_EQ(StoredOf(m), (IntRows{{7, 2, 6}, {5, 1, 8}, {0, 3, 9}}));
  // One column: nothing is checked or sorted.
  auto column = Mat<T>({{3}, {1}, {2}});
  QSortMatrixRowsOnCol(column, 5, true);
  EXPECT_EQ(StoredOf(column), (IntRows{{3}, {1}, {2}}));

  m = original;
  EXPECT_EQ(StoredOf(ExtractMatrixRow(m, 1)), (Ints{1, 5, 8}));
  EXPECT_EQ(StoredOf(ExtractMatrixCol(m, 2)), (Ints{9, 8, 6}));
  EXPECT_TRUE(ExtractMatrixCol(Mat<T>({}), 0).empty());
  OverwriteMatrixRow(m, 0, Vec<T>({-9}), M<T>(4));
  EXPECT_EQ(StoredOf(m[0]), (Ints{-9, 4, 4}));
  OverwriteMatrixCol(m, 1, Vec<T>({11, 12, 13, 14}), M<T>(0));
  EXPECT_EQ(StoredOf(m), (IntRows{{-9, 11, 4}, {1, 12, 8}, {2, 13, 6}}));
  auto copy = CopyMatrix(Mat<T>({{1, 2}, {3}, {}}));
  EXPECT_EQ(StoredOf(copy), (IntRows{{1, 2}, {3}, {}}));
  EXPECT_EQ(StoredOf(TransposeMatrix(Mat<T>({{1, 2, 3}}))), (IntRows{{1}, {2}, {3}}));
  ExpectRaises(rsMatrixRect, [] { TransposeMatrix(Mat<T>({})); });
  {
    SwitchGuard off(QENMatrixRectangularCheck, false);
    EXPECT_TRUE(TransposeMatrix(Mat<T>({})).empty());
  }
}

TYPED_TEST(MoneyMatrix, RowAndColumnChecksLeaveTheMatrix) {
  using T = TypeParam;
  auto m = Mat<T>({{1, 2}, {3, 4}});
  const IntRows before = StoredOf(m);
  SwapMatrixRows(m, 7, 7);  // equal indices: no check at all
  ExpectRaises(rsInvalidRow, [&] { SwapMatrixRows(m, 0, 2); });
  ExpectRaises(rsInvalidCol, [&] { SwapMatrixCols(m, 2, 0); });
  ExpectRaises(rsInvalidCol, [&] { QSortMatrixRowsOnCol(m, 2, true); });
  ExpectRaises(rsInvalidRow, [&] { QSortMatrixColsOnRow(m, 2, true); });
  ExpectRaises(rsInvalidRow, [&] { ExtractMatrixRow(m, 2); });
  ExpectRaises(rsInvalidCol, [&] { ExtractMatrixCol(m, 2); });
  ExpectRaises(rsInvalidRow, [&] { OverwriteMatrixRow(m, 2, Vec<T>({9}), M<T>(0)); });
  ExpectRaises(rsInvalidCol, [&] { OverwriteMatrixCol(m, 2, Vec<T>({9}), M<T>(0)); });
  EXPECT_EQ(StoredOf(m), before);
  // Under the switch a ragged matrix reports Cols 0: the row operations find it empty and
  // the sorts leave it alone; with the switch off a short row is refused as rsMatrixRect.
  auto ragged = Mat<T>({{1, 2}, {3}});
  ExpectRaises(rsMatrixIsEmpty, [&] { SwapMatrixRows(ragged, 0, 1); });
  QSortMatrixRowsOnCol(ragged, 0, false);
  ExpectRaises(rsMatrixRect, [&] { TransposeMatrix(ragged); });
  {
    SwitchGuard off(QENMatrixRectangularCheck, false);
    ExpectRaises(rsMatrixRect, [&] { SwapMatrixRows(ragged, 0, 1); });
    ExpectRaises(rsMatrixRect, [&] { QSortMatrixRowsOnCol(ragged, 0, false); });
    ExpectRaises(rsMatrixRect, [&] { TransposeMatrix(ragged); });
  }
  auto empty = Mat<T>({});
  ExpectRaises(rsMatrixIsEmpty, [&] { SwapMatrixCols(empty, 0, 1); });
  EXPECT_EQ(StoredOf(ragged), (IntRows{{1, 2}, {3}}));
}

// --- Type-specific rules ----------------------------------------------------------------------

TEST(MoneyMatrixWrapAround, SumsAndProductsWrapAtTheStoredWidth) {
  EXPECT_EQ(StoredOf(AddMatrices(Mat<TQENCurrency>({{INT32_MAX}}), Mat<TQENCurrency>({{1}}))),
            (IntRows{{INT32_MIN}}));
  EXPECT_EQ(StoredOf(SubtractMatrices(Mat<TQENLongCurrency>({{INT64_MIN}}),
                                      Mat<TQENLongCurrency>({{1}}))),
            (IntRows{{INT64_MAX}}));
  auto c = Mat<Currency>({{INT64_MAX}});
  AddToMatrix(c, Mat<Currency>({{1}}));
  EXPECT_EQ(StoredOf(c), (IntRows{{INT64_MIN}}));
  // Products: the rounded value keeps the low 32 (64) bits, without an error.
  EXPECT_EQ(StoredOf(MultiplyMatrixByConst(Mat<TQENCurrency>({{INT32_MAX}}), 2)), (IntRows{{-2}}));
  EXPECT_EQ(StoredOf(MultiplyMatrixByConst(Mat<TQENLongCurrency>({{INT64_MAX}}), 2)),
            (IntRows{{-2}}));
}

TEST(MoneyMatrixGrandMean, SumsWrapAtTheStoredWidth) {
  LongWord n = 0;
  // 2^31 - 1 + 1 wraps to -2^31 in 32 bits; half of it is -2^30.
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<TQENCurrency>({{INT32_MAX, 1}}), n)), -1073741824);
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<TQENLongCurrency>({{INT64_MAX, 1}}), n)), INT64_MIN / 2);
  // Currency: the exact 64-bit sum 2^63 - 7, halved and rounded to the even neighbour.
  EXPECT_EQ(detail::StoredOf(GrandMean(Mat<Currency>({{INT64_MAX - 2, -4}}), n)),
            4611686018427387900);
}

TEST(MoneyMatrixScalar, LongCurrencyTimesHalf) {
  EXPECT_EQ(StoredOf(MultiplyMatrixByConst(Mat<TQENLongCurrency>({{3}}), 0.5L)), (IntRows{{2}}));
}

TEST(MoneyMatrixLinearTransform, WorksInAmounts) {
  auto c = Mat<Currency>({{15000, -5000}, {0}});
  LinearTransformMatrix(c, 2, 0.25L);
  EXPECT_EQ(StoredOf(c), (IntRows{{32500, -7500}, {2500}}));
  auto q = Mat<TQENCurrency>({{150, 50}});
  LinearTransformMatrix(q, 0.25L, 0);  // 37.5 and 12.5 hundredths
  EXPECT_EQ(StoredOf(q), (IntRows{{38, 12}}));
  auto l = Mat<TQENLongCurrency>({{1500000}});
  LinearTransformMatrix(l, 2, 0.25L);
  EXPECT_EQ(StoredOf(l), (IntRows{{3250000}}));
  // Out of range the conversion wraps unreported: 10^10 hundredths keep their low 32 bits.
  auto big = Mat<TQENCurrency>({{1, 2}, {10000000}});
  LinearTransformMatrix(big, 1000, 0);
  EXPECT_EQ(StoredOf(big), (IntRows{{1000, 2000}, {10000000000 % 4294967296}}));
  // The same amount rounds alike through every money path: 6.5 stored units go to 6.
  auto half = Mat<Currency>({{1}});
  MultiplyMatrixByConst2(half, 6.5L);
  EXPECT_EQ(StoredOf(half), (IntRows{{6}}));
}

TEST(MoneyMatrixConversion, ToFloatKeepsTheShape) {
  const TQENFloatMatrix f = Matrix2FloatMatrix(Mat<TQENCurrency>({{12345, -1}, {}, {7}}));
  ASSERT_EQ(f.size(), 3u);
  ASSERT_EQ(f[0].size(), 2u);
  EXPECT_EQ(Extended(f[0][0]), 123.45L);
  EXPECT_EQ(Extended(f[0][1]), -0.01L);
  EXPECT_TRUE(f[1].empty());
  EXPECT_EQ(Extended(f[2][0]), 0.07L);
  EXPECT_EQ(Extended(Matrix2FloatMatrix(Mat<Currency>({{12346}}))[0][0]), 1.2346L);
  EXPECT_EQ(Extended(Matrix2FloatMatrix(Mat<TQENLongCurrency>({{-1500000}}))[0][0]), -1.5L);
  EXPECT_TRUE(Matrix2FloatMatrix(Mat<Currency>({})).empty());
}

}  // namespace
}  // namespace tovrin
