// Tests of creation, shape queries, conversion, arithmetic, element-wise functions and the
// grand mean.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <tuple>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using namespace testing;

// The creators of each element type, so that typed tests can reach the per-type names.
template <typename T>
struct Creators;
#define TOVRIN_CREATORS(T, Name)                                                      \
  template <>                                                                         \
  struct Creators<T> {                                                                \
    static auto Create(LongWord R, LongWord C) { return Create##Name##Matrix(R, C); } \
    static auto Identity(LongWord N) { return Create##Name##IdentityMatrix(N); }      \
  };
TOVRIN_CREATORS(PackedExtended, Float)
TOVRIN_CREATORS(Double, Double)
TOVRIN_CREATORS(Single, Single)
TOVRIN_CREATORS(Int64, Int64)
TOVRIN_CREATORS(LongWord, LWord)
TOVRIN_CREATORS(LongInt, LInt)
TOVRIN_CREATORS(Word, Word)
TOVRIN_CREATORS(SmallInt, SmallInt)
TOVRIN_CREATORS(Byte, Byte)
TOVRIN_CREATORS(ShortInt, SInt)
#undef TOVRIN_CREATORS

// --- Every element type ---------------------------------------------------------------------

TOVRIN_TYPED_SUITE(MatrixAllTypes, testing::AllElements);

TYPED_TEST(MatrixAllTypes, CreatorsAndRowAndColumnCounts) {
  const auto m = Creators<TypeParam>::Create(2, 3);
  static_assert(std::is_same_v<std::remove_const_t<decltype(m)>, Matrix<TypeParam>>);
  EXPECT_EQ(Values(m), (Rows{{0, 0, 0}, {0, 0, 0}}));
  EXPECT_TRUE(Creators<TypeParam>::Create(0, 5).empty() &&
              Creators<TypeParam>::Identity(0).empty());
  EXPECT_EQ(Values(Creators<TypeParam>::Create(3, 0)), (Rows{{}, {}, {}}));
  EXPECT_EQ(Values(Creators<TypeParam>::Identity(3)), (Rows{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}));
  // MatrixRows and MatrixCols look at row 0 only.
  EXPECT_EQ(MatrixRows(Matrix<TypeParam>{}) + MatrixCols(Matrix<TypeParam>{}), 0);
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}, {4, 5, 6}});
  EXPECT_EQ(MatrixRows(ragged) * 10 + MatrixCols(ragged), 32);
}

struct Dims {
  LongWord Rows;
  LongWord Cols;
  bool Rectangular;
  bool operator==(const Dims&) const = default;
};

// MatrixIsRectangular ignores the switch; MatrixDimensions, MatrixIsSquare and
// MatricesSameDimensions follow it: on, a ragged matrix has no columns and is not rectangular;
// off, row 0 gives the columns and every matrix counts as rectangular.
TYPED_TEST(MatrixAllTypes, ShapeQueriesFollowTheSwitch) {
  using M = Matrix<TypeParam>;
  const M none, blank = Mat<TypeParam>({{}, {1}}), shortRow = Mat<TypeParam>({{1, 2}, {3}});
  const M longRow = Mat<TypeParam>({{1, 2}, {3, 4, 5}}),
          wide = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  const M square = Mat<TypeParam>({{1, 2}, {3, 4}});
  const struct {
    const M& m;
    bool on, rectangular, isSquare;
    Dims dims;
  } cases[] = {
      {none, true, false, false, {0, 0, false}},     {blank, true, false, false, {2, 0, false}},
      {shortRow, true, false, false, {2, 0, false}}, {longRow, true, false, false, {2, 0, false}},
      {wide, true, true, false, {2, 3, true}},       {square, true, true, true, {2, 2, true}},
      {none, false, false, true, {0, 0, true}},      {blank, false, false, false, {2, 0, true}},
      {shortRow, false, false, true, {2, 2, true}}};
  for (const auto& c : cases) {
    MatrixSwitch sw(QENMatrixRectangularCheck, c.on);
    Dims d{99, 99, !c.dims.Rectangular};
    MatrixDimensions(c.m, d.Rows, d.Cols, d.Rectangular);
    EXPECT_EQ(d, c.dims) << c.on;
    EXPECT_EQ(MatrixIsRectangular(c.m), c.rectangular) << c.on;
    EXPECT_EQ(MatrixIsSquare(c.m), c.isSquare) << c.on;
  }
  EXPECT_TRUE(MatrixIsRectangular(Mat<TypeParam>({{}, {}})));
  const auto ragged = Mat<TypeParam>({{1, 2, 3}, {4, 5}});
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);
    EXPECT_TRUE(MatricesSameDimensions(wide, Mat<TypeParam>({{0, 0, 0}, {0, 0, 0}})));
    EXPECT_FALSE(MatricesSameDimensions(wide, ragged) || MatricesSameDimensions(ragged, ragged));
    EXPECT_FALSE(MatricesSameDimensions(wide, square) || MatricesSameDimensions(none, none));
  }
  MatrixSwitch sw(QENMatrixRectangularCheck, false);
  EXPECT_TRUE(MatricesSameDimensions(wide, ragged) && MatricesSameDimensions(none, none));
}

TYPED_TEST(MatrixAllTypes, ToFloatMatrixKeepsTheShapeAndTheValues) {
  const auto m = Mat<TypeParam>({{1, 2}, {}, {3, 4, 5}});
  const TQENFloatMatrix f = Matrix2FloatMatrix(m);
  EXPECT_EQ(Values(f), (Rows{{1, 2}, {}, {3, 4, 5}}));
  EXPECT_TRUE(Matrix2FloatMatrix(Matrix<TypeParam>{}).empty());
  // The extreme values of the type are held exactly.
  using V = ValueOf<TypeParam>;
  const Matrix<TypeParam> extremes{
      {TypeParam(std::numeric_limits<V>::max()), TypeParam(std::numeric_limits<V>::lowest())}};
  const TQENFloatMatrix g = Matrix2FloatMatrix(extremes);
  EXPECT_EQ(static_cast<long double>(g[0][0]),
            static_cast<long double>(std::numeric_limits<V>::max()));
  EXPECT_EQ(static_cast<long double>(g[0][1]),
            static_cast<long double>(std::numeric_limits<V>::lowest()));
}

// --- Arithmetic element types ---------------------------------------------------------------

TOVRIN_TYPED_SUITE(MatrixArithmetic, testing::ArithmeticElements);

TYPED_TEST(MatrixArithmetic, AddAndSubtract) {
  const auto a = Mat<TypeParam>({{1, 2, 3}, {4, 5, 6}});
  const auto b = Mat<TypeParam>({{10, 20, 30}, {40, 50, 60}});
  EXPECT_EQ(Values(AddMatrices(a, b)), (Rows{{11, 22, 33}, {44, 55, 66}}));
  EXPECT_EQ(Values(SubtractMatrices(b, a)), (Rows{{9, 18, 27}, {36, 45, 54}}));
  auto c = a;
  AddToMatrix(c, b);
  EXPECT_EQ(Values(c), (Rows{{11, 22, 33}, {44, 55, 66}}));
  SubtractFromMatrix(c, a);
  EXPECT_TRUE(SameBits(c, b));
  EXPECT_EQ(Values(a), (Rows{{1, 2, 3}, {4, 5, 6}}));
}

TYPED_TEST(MatrixArithmetic, TwoMatrixChecksInOrder) {
  using M = Matrix<TypeParam>;
  const auto a = Mat<TypeParam>({{1, 2}, {3, 4}});
  const M none;
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}});
  const auto emptyFirstRow = Mat<TypeParam>({{}, {1, 2}});
  // An M1 without rows has no row 0 to read: access violation, before anything else.
  for (bool on : {true, false}) {
    MatrixSwitch sw(QENMatrixRectangularCheck, on);
    EXPECT_THROW(AddMatrices(none, a), EAccessViolation);
    EXPECT_THROW(SubtractMatrices(none, none), EAccessViolation);
    M target;
    EXPECT_THROW(AddToMatrix(target, a), EAccessViolation);
    EXPECT_THROW(SubtractFromMatrix(target, ragged), EAccessViolation);
    EXPECT_TRUE(target.empty());
    // An empty row 0 comes before the shape test.
    ExpectRaises(rsMatrixIsEmpty, [&] { AddMatrices(emptyFirstRow, a); });
    ExpectRaisesUntouched(rsMatrixIsEmpty, emptyFirstRow, [&](M& m) { AddToMatrix(m, a); });
    ExpectRaisesUntouched(rsMatrixIsEmpty, emptyFirstRow,
                          [&](M& m) { SubtractFromMatrix(m, none); });
    // Shapes that differ.
    ExpectRaises(rsSameDimensions, [&] { SubtractMatrices(a, Mat<TypeParam>({{1, 2}})); });
    ExpectRaisesUntouched(rsSameDimensions, a, [&](M& m) { AddToMatrix(m, none); });
    ExpectRaisesUntouched(rsSameDimensions, a, [&](M& m) {
      SubtractFromMatrix(m, Mat<TypeParam>({{1, 2, 3}}));
    });
  }
  {
    MatrixSwitch sw(QENMatrixRectangularCheck, true);
    ExpectRaises(rsSameDimensions, [&] { AddMatrices(ragged, ragged); });
    ExpectRaisesUntouched(rsSameDimensions, a, [&](M& m) { AddToMatrix(m, ragged); });
    ExpectRaisesUntouched(rsSameDimensions, ragged, [&](M& m) { AddToMatrix(m, a); });
  }
  {
    // Without the switch the shape is row 0's; a short row is never read past its end.
    MatrixSwitch sw(QENMatrixRectangularCheck, false);
    ExpectRaises(rsMatrixRect, [&] { AddMatrices(ragged, a); });
    ExpectRaises(rsMatrixRect, [&] { SubtractMatrices(a, ragged); });
    ExpectRaisesUntouched(rsMatrixRect, ragged, [&](M& m) { AddToMatrix(m, a); });
    ExpectRaisesUntouched(rsMatrixRect, a, [&](M& m) { SubtractFromMatrix(m, ragged); });
    // Longer rows are fine: only the first Cols elements take part.
    const auto longer = Mat<TypeParam>({{1, 2}, {3, 4, 5}});
    EXPECT_EQ(Values(AddMatrices(a, longer)), (Rows{{2, 4}, {6, 8}}));
    EXPECT_EQ(Values(AddMatrices(longer, a)), (Rows{{2, 4}, {6, 8}}));
    auto c = longer;
    AddToMatrix(c, a);
    EXPECT_EQ(Values(c), (Rows{{2, 4}, {6, 8, 5}}));
  }
}

TYPED_TEST(MatrixArithmetic, ScalarArithmeticKeepsRaggedShapes) {
  using M = Matrix<TypeParam>;
  MatrixSwitch sw(QENMatrixRectangularCheck, true);
  const auto ragged = Mat<TypeParam>({{1, 2}, {3}, {}});
  EXPECT_EQ(Values(MultiplyMatrixByConst(ragged, 2)), (Rows{{2, 4}, {6}, {}}));
  auto m = ragged;
  MultiplyMatrixByConst2(m, 3);
  EXPECT_EQ(Values(m), (Rows{{3, 6}, {9}, {}}));
  m = Mat<TypeParam>({{3, 0}, {-1}});
  LinearTransformMatrix(m, 2, 1);
  EXPECT_EQ(Values(m), (Rows{{7, 1}, {-1}}));
  ExpectRaises(rsMatrixIsEmpty, [] { MultiplyMatrixByConst(M{}, 2); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { MultiplyMatrixByConst2(x, 2); });
  ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [](M& x) { LinearTransformMatrix(x, 2, 1); });
  // Rows that are all empty are not an error here.
  EXPECT_EQ(Values(MultiplyMatrixByConst(Mat<TypeParam>({{}, {}}), 2)), (Rows{{}, {}}));
}

TYPED_TEST(MatrixArithmetic, GrandMean) {
  using M = Matrix<TypeParam>;
  LongWord n = 99;
  EXPECT_EQ(GrandMean(Mat<TypeParam>({{1, 2}, {3}}), n), 2.0L);
  EXPECT_EQ(n, 3u);
  EXPECT_EQ(GrandMean(Mat<TypeParam>({{}, {5}, {}, {6}}), n), 5.5L);
  EXPECT_EQ(n, 2u);
  ExpectRaises(rsMatrixIsEmpty, [&] { GrandMean(M{}, n); });
  ExpectRaises(rsMatrixIsEmpty, [&] { GrandMean(Mat<TypeParam>({{}, {}}), n); });
}

// --- Type rules the matrices alone use ---
// (Sums, differences and linear transforms follow the element rules the vector tests check.)

TEST(MatrixIntegerArithmetic, ProductsByAConstantWrapAndTheGrandMeanDoesNot) {
  const LongInt hi = std::numeric_limits<LongInt>::max();
  const LongInt lo = std::numeric_limits<LongInt>::min();
  EXPECT_EQ(MultiplyMatrixByConst(TQENLIntMatrix{{hi}}, 2), (TQENLIntMatrix{{-2}}));
  TQENLIntMatrix m{{lo}};
  MultiplyMatrixByConst2(m, -1);
  EXPECT_EQ(m, (TQENLIntMatrix{{lo}}));
  EXPECT_EQ(MultiplyMatrixByConst(TQENInt64Matrix{{std::numeric_limits<Int64>::max()}}, 2),
            (TQENInt64Matrix{{-2}}));
  LongWord n = 0;
  const Int64 big = Int64{1} << 62;
  EXPECT_EQ(GrandMean(TQENInt64Matrix{{big, big, big}}, n), static_cast<long double>(big));
  EXPECT_EQ(GrandMean(TQENLIntMatrix{{2147483647, 2147483647}}, n), 2147483647.0L);
}

// --- Float rounding ---

TEST(MatrixFloatArithmetic, SumsAndProductsRoundOnceFromExtended) {
  // 1 + (2^-53 + 2^-64): rounded straight to double this is 1 + 2^-52, but the Extended sum is
  // a tie at 64 bits that rounds to 1 + 2^-53, which is again a tie and rounds to 1.
  const Double b = std::ldexp(1.0, -53) + std::ldexp(1.0, -64);
  volatile Double direct = 1.0;
  direct = direct + b;
  ASSERT_EQ(direct, 1.0 + std::ldexp(1.0, -52));
  EXPECT_EQ(AddMatrices(TQENDoubleMatrix{{1.0}}, TQENDoubleMatrix{{b}}), (TQENDoubleMatrix{{1.0}}));
  // K = 1 + 2^-60 is not a double; 3 x K rounded to Single is 3.
  const Extended k = 1.0L + std::ldexp(1.0L, -60);
  EXPECT_EQ(MultiplyMatrixByConst(TQENFloatMatrix{{PackedExtended(3.0L)}}, k)[0][0],
            PackedExtended(3.0L * k));
  EXPECT_EQ(static_cast<Extended>(MultiplyMatrixByConst(TQENFloatMatrix{{3.0L}}, k)[0][0]),
            3.0L + 3.0L * std::ldexp(1.0L, -60));
  EXPECT_EQ(MultiplyMatrixByConst(TQENSingleMatrix{{3.0F}}, k), (TQENSingleMatrix{{3.0F}}));
}

// --- Element-wise functions -----------------------------------------------------------------

TOVRIN_TYPED_SUITE(MatrixElementWise, testing::FloatElements);

TYPED_TEST(MatrixElementWise, Values) {
  auto m = Mat<TypeParam>({{3, -2}, {1.5}, {}});
  SquareMatrix(m);
  EXPECT_EQ(Values(m), (Rows{{9, 4}, {2.25}, {}}));
  SqrtMatrix(m);
  EXPECT_EQ(Values(m), (Rows{{3, 2}, {1.5}, {}}));
  m = Mat<TypeParam>({{0.5, -4}, {0.25}});
  InvMatrix(m);
  EXPECT_EQ(Values(m), (Rows{{2, -0.25}, {4}}));
  m = Mat<TypeParam>({{100, 1000}, {1, 0.01}});
  Log10Matrix(m);
  for (const auto& [i, j, log] : {std::tuple{0, 0, 2.0}, {0, 1, 3.0}, {1, 0, 0.0}, {1, 1, -2.0}}) {
    EXPECT_NEAR(static_cast<double>(m[i][j]), log, log == 0 ? 0 : 1e-6);
  }
  m = Mat<TypeParam>({{1, 2.718281828459045235360287L}});
  LnMatrix(m);
  EXPECT_EQ(static_cast<long double>(m[0][0]), 0.0L);
  EXPECT_NEAR(static_cast<double>(m[0][1]), 1.0, 1e-6);
  // Zero is a valid square root.
  m = Mat<TypeParam>({{0}});
  SqrtMatrix(m);
  EXPECT_EQ(Values(m), (Rows{{0}}));
}

TYPED_TEST(MatrixElementWise, FailuresStopWhereTheyAreWithoutRollBack) {
  using M = Matrix<TypeParam>;
  for (bool on : {true, false}) {
    MatrixSwitch sw(QENMatrixRectangularCheck, on);
    auto m = Mat<TypeParam>({{4, -1, 9}});
    ExpectRaises(rsMatrixNeg, [&] { SqrtMatrix(m); });
    EXPECT_EQ(Values(m), (Rows{{2, -1, 9}}));
    // Rows are visited in order, each at its own length.
    m = Mat<TypeParam>({{4}, {2, 0, 8}, {0.5}});
    ExpectRaises(rsMatrixZero, [&] { InvMatrix(m); });
    EXPECT_EQ(Values(m), (Rows{{0.25}, {0.5, 0, 8}, {0.5}}));
    m = Mat<TypeParam>({{1, 1}, {0, 1}});
    ExpectRaises(rsMatrixNotPos, [&] { LnMatrix(m); });
    EXPECT_EQ(Values(m), (Rows{{0, 0}, {0, 1}}));
    m = Mat<TypeParam>({{10, -5}});
    ExpectRaises(rsMatrixNotPos, [&] { Log10Matrix(m); });
    EXPECT_EQ(static_cast<long double>(m[0][1]), -5.0L);
    // Domain tests are exact: a value far inside the tolerance is not zero.
    m = Mat<TypeParam>({{1e-20L}});
    LnMatrix(m);
    EXPECT_LT(static_cast<long double>(m[0][0]), -40.0L);
    using Fn = void (*)(M&);
    const Fn functions[] = {&SquareMatrix, &SqrtMatrix, &InvMatrix, &LnMatrix, &Log10Matrix};
    for (Fn fn : functions) {
      ExpectRaisesUntouched(rsMatrixIsEmpty, M{}, [fn](M& x) { fn(x); });
    }
  }
}

}  // namespace
}  // namespace tovrin

TEST(ShapeSwitchTest, IsOnAtStartUp) { EXPECT_TRUE(tovrin::QENMatrixRectangularCheck.load()); }
