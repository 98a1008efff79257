// Tests of the money matrices. Shapes, checks and row and column moves are the numeric
// matrices' algorithms (tovrin/detail, tested in tovrin/matrix); here their wiring for the money
// types and the money rules the matrices use: the stored one, wrapping sums, rounded products
// and means.
#include "tovrin/currency/TOVRINFinMatrix.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <type_traits>
#include <vector>

#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using namespace testing;
using IntRows = std::vector<std::vector<Int64>>;
// The stored integer of the amount 1.
template <typename T>
constexpr Int64 kOne = std::is_same_v<T, TQENCurrency>       ? 100
                       : std::is_same_v<T, TQENLongCurrency> ? 1000000
                                                             : 10000;

TOVRIN_TYPED_SUITE(MoneyMatrix, MoneyElements);

TYPED_TEST(MoneyMatrix, CreatorsAndIdentityHoldTheStoredOne) {
  using T = TypeParam;
  constexpr bool curr = std::is_same_v<T, TQENCurrency>,
                 lcurr = std::is_same_v<T, TQENLongCurrency>;
  const auto create = [](LongWord r, LongWord c) {
    if constexpr (curr) return CreateCurrMatrix(r, c);
    if constexpr (lcurr) return CreateLongCurrMatrix(r, c);
    if constexpr (!curr && !lcurr) return CreateCurrencyMatrix(r, c);
  };
  const auto identity = [](LongWord n) {
    if constexpr (curr) return CreateCurrIdentityMatrix(n);
    if constexpr (lcurr) return CreateLongCurrIdentityMatrix(n);
    if constexpr (!curr && !lcurr) return CreateCurrencyIdentityMatrix(n);
  };
  EXPECT_EQ(Stored(create(2, 3)), (IntRows{{0, 0, 0}, {0, 0, 0}}));
  EXPECT_TRUE(create(0, 5).empty() && identity(0).empty());
  EXPECT_EQ(Stored(create(2, 0)), (IntRows{{}, {}}));
  const Int64 one = kOne<T>;
  EXPECT_EQ(Stored(identity(3)), (IntRows{{one, 0, 0}, {0, one, 0}, {0, 0, one}}));
  EXPECT_EQ(Extended(Matrix2FloatMatrix(identity(1))[0][0]), 1.0L);  // the amount 1
}

// Every operation reaches the shared algorithm with its money type, and every identifier the
// family raises comes out with the matrix unchanged.
TYPED_TEST(MoneyMatrix, SharedAlgorithmsAndTheirChecks) {
  using T = TypeParam;
  using M = Matrix<T>;
  const auto m = MoneyMat<T>({{3, 0, 9}, {1, 5, 8}, {2, 7, 6}});
  auto w = m;
  SwapMatrixRows(w, 0, 2);
  SwapMatrixCols(w, 0, 2);
  EXPECT_EQ(Stored(w), (IntRows{{6, 7, 2}, {8, 5, 1}, {9, 0, 3}}));
  QSortMatrixRowsOnCol(w, 2, true);
  QSortMatrixColsOnRow(w, 0, false);
  EXPECT_EQ(Stored(w), (IntRows{{8, 5, 1}, {6, 7, 2}, {9, 0, 3}}));
  EXPECT_EQ(Stored(ExtractMatrixRow(m, 1)), (std::vector<Int64>{1, 5, 8}));
  EXPECT_EQ(Stored(ExtractMatrixCol(m, 2)), (std::vector<Int64>{9, 8, 6}));
  w = m;
  OverwriteMatrixRow(w, 0, MoneyVec<T>({-9}), Money<T>(4));
  OverwriteMatrixCol(w, 1, MoneyVec<T>({11, 12, 13, 14}), Money<T>(0));
  EXPECT_EQ(Stored(w), (IntRows{{-9, 11, 4}, {1, 12, 8}, {2, 13, 6}}));
  EXPECT_EQ(Stored(CopyMatrix(MoneyMat<T>({{1, 2}, {3}, {}}))), (IntRows{{1, 2}, {3}, {}}));
  EXPECT_EQ(Stored(TransposeMatrix(MoneyMat<T>({{1, 2, 3}}))), (IntRows{{1}, {2}, {3}}));
  LongWord rows = 9, cols = 9;
  bool rect = true;
  MatrixDimensions(MoneyMat<T>({{1, 2}, {3}}), rows, cols, rect);
  EXPECT_EQ(rows * 10 + cols, 20u);
  EXPECT_FALSE(rect || MatrixIsRectangular(MoneyMat<T>({{1, 2}, {3}})));
  EXPECT_TRUE(MatrixIsSquare(MoneyMat<T>({{1, 2}, {3, 4}})));
  EXPECT_FALSE(MatricesSameDimensions(MoneyMat<T>({{1, 2}}), MoneyMat<T>({{5}, {6}})));

  const auto sq = MoneyMat<T>({{1, 2}, {3, 4}}), ragged = MoneyMat<T>({{1, 2}, {3}});
  ExpectRaisesUntouched(rsInvalidRow, sq, [](M& x) { SwapMatrixRows(x, 0, 2); });
  ExpectRaisesUntouched(rsInvalidCol, sq, [](M& x) { QSortMatrixRowsOnCol(x, 2, true); });
  ExpectRaisesUntouched(rsSameDimensions, sq, [](M& x) { AddToMatrix(x, MoneyMat<T>({{1}})); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, ragged, [](M& x) { SwapMatrixCols(x, 0, 1); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { MultiplyMatrixByConst2(x, 2); });
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { TransposeMatrix(x); });
  EXPECT_THROW(AddMatrices(M{}, M{}), EAccessViolation);
  MatrixSwitch off(QENMatrixRectangularCheck, false);
  ExpectRaisesUntouched(rsMatrixRect, ragged, [](M& x) { QSortMatrixRowsOnCol(x, 0, false); });
}

TYPED_TEST(MoneyMatrix, SumsProductsAndTransformsFollowTheMoneyRules) {
  using T = TypeParam;
  const auto a = MoneyMat<T>({{1, 2}, {3, 4}}), b = MoneyMat<T>({{10, -20}, {30, 40}});
  EXPECT_EQ(Stored(AddMatrices(a, b)), (IntRows{{11, -18}, {33, 44}}));
  EXPECT_EQ(Stored(SubtractMatrices(a, b)), (IntRows{{-9, 22}, {-27, -36}}));
  auto c = a;
  AddToMatrix(c, b);
  SubtractFromMatrix(c, a);
  EXPECT_EQ(Stored(c), Stored(b));
  // The stored integer times K, rounded half to even: 2.5 -> 2, 3.5 -> 4, -2.5 -> -2, 0.5 -> 0.
  const auto m = MoneyMat<T>({{5, 7}, {-5, 1}, {}});
  EXPECT_EQ(Stored(MultiplyMatrixByConst(m, 0.5L)), (IntRows{{2, 4}, {-2, 0}, {}}));
  c = m;
  MultiplyMatrixByConst2(c, 0.5L);
  EXPECT_EQ(Stored(c), (IntRows{{2, 4}, {-2, 0}, {}}));
  // The linear transform of the vectors, row by row (its rules: TOVRINFinVector_test.cpp).
  const Int64 one = kOne<T>;
  c = MoneyMat<T>({{15 * one / 10, -one / 2}, {0}});
  LinearTransformMatrix(c, 2, 0.25L);
  EXPECT_EQ(Stored(c), (IntRows{{325 * one / 100, -75 * one / 100}, {one / 4}}));
}

TYPED_TEST(MoneyMatrix, GrandMeanRoundsToTheElementType) {
  using T = TypeParam;
  LongWord n = 0;
  const struct {
    std::initializer_list<std::initializer_list<Int64>> m;
    Int64 mean;
    LongWord n;
  } cases[] = {{{{1, 2}}, 2, 2},                                         // 1.5
               {{{1, 4}}, 2, 2},                                         // 2.5
               {{{3, 4}}, 4, 2},                                         // 3.5
               {{{-1, -4}}, -2, 2}, {{{1, 2}, {}, {3, 4, 5, 6}}, 4, 6},  // 3.5
               {{{1, 2, 4}}, 2, 3}};                                     // 2.33
  for (const auto& c : cases) {
    EXPECT_EQ(Stored(GrandMean(MoneyMat<T>(c.m), n)), c.mean);
    EXPECT_EQ(n, c.n);
  }
  ExpectRaises(rsMatrixIsEmpty, [&] { GrandMean(MoneyMat<T>({{}, {}}), n); });
}

// --- Type-specific rules ----------------------------------------------------------------------

TEST(MoneyMatrixWrapAround, SumsProductsAndMeansWrapAtTheStoredWidth) {
  auto c = MoneyMat<Currency>({{INT64_MAX}});
  AddToMatrix(c, MoneyMat<Currency>({{1}}));
  EXPECT_EQ(Stored(c), (IntRows{{INT64_MIN}}));
  // Products: the rounded value keeps the low 32 (64) bits, without an error.
  EXPECT_EQ(Stored(MultiplyMatrixByConst(MoneyMat<TQENCurrency>({{INT32_MAX}}), 2)),
            (IntRows{{-2}}));
  EXPECT_EQ(Stored(MultiplyMatrixByConst(MoneyMat<TQENLongCurrency>({{INT64_MAX}}), 2)),
            (IntRows{{-2}}));
  LongWord n = 0;
  // 2^31 - 1 + 1 wraps to -2^31 in 32 bits; half of it is -2^30.
  EXPECT_EQ(Stored(GrandMean(MoneyMat<TQENCurrency>({{INT32_MAX, 1}}), n)), -1073741824);
  EXPECT_EQ(Stored(GrandMean(MoneyMat<TQENLongCurrency>({{INT64_MAX, 1}}), n)), INT64_MIN / 2);
  // Currency: the exact 64-bit sum 2^63 - 7, halved and rounded to the even neighbour.
  EXPECT_EQ(Stored(GrandMean(MoneyMat<Currency>({{INT64_MAX - 2, -4}}), n)), 4611686018427387900);
}

TEST(MoneyMatrixConversion, ToFloatKeepsTheShape) {
  EXPECT_EQ(Values(Matrix2FloatMatrix(MoneyMat<TQENCurrency>({{12345, -1}, {}, {7}}))),
            (Rows{{123.45L, -0.01L}, {}, {0.07L}}));
  EXPECT_EQ(Extended(Matrix2FloatMatrix(MoneyMat<Currency>({{12346}}))[0][0]), 1.2346L);
  EXPECT_EQ(Extended(Matrix2FloatMatrix(MoneyMat<TQENLongCurrency>({{-1500000}}))[0][0]), -1.5L);
  EXPECT_TRUE(Matrix2FloatMatrix(Matrix<Currency>{}).empty());
}

}  // namespace
}  // namespace tovrin
