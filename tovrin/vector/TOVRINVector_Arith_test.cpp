#include <cmath>
#include <cstdint>
#include <limits>
#include <span>

#include <gtest/gtest.h>

#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/TOVRINVector_testing.h"

namespace tovrin {
namespace {

using testing::ExpectMathError;
using testing::L;
using testing::Make;
using testing::Values;

// --- In-place transforms --------------------------------------------------------------------

template <typename V>
class SquareTest : public ::testing::Test {};
TYPED_TEST_SUITE(SquareTest, testing::BuildableVectors);

TYPED_TEST(SquareTest, SquaresEveryElementAndRejectsEmpty) {
  TypeParam v = Make<TypeParam>({2, 3, 0, 11});
  SquareVector(v);
  EXPECT_EQ(Values(v), L({4, 9, 0, 121}));
  TypeParam empty;
  ExpectMathError(rsVectorIsEmpty, [&] { SquareVector(empty); });
}

TEST(SquareTest, IntegerSquaresWrapInTheirWidth) {
  TQENLIntVector li{46341, 65536, -3};
  SquareVector(li);
  EXPECT_EQ(li, (TQENLIntVector{-2147479015, 0, 9}));
  TQENLWordVector lw{65537, 65535};
  SquareVector(lw);
  EXPECT_EQ(lw, (TQENLWordVector{131073, 4294836225u}));
  TQENInt64Vector j{(Int64{1} << 32) + 1, INT64_MIN};
  SquareVector(j);
  EXPECT_EQ(j, (TQENInt64Vector{(Int64{1} << 33) + 1, 0}));
}

TEST(SquareTest, FloatsSquareInExtendedThenRound) {
  TQENSingleVector f{0x1p100f};
  SquareVector(f);
  EXPECT_EQ(f[0], std::numeric_limits<Single>::infinity());
  TQENFloatVector g{0x1p100L + 1};
  SquareVector(g);
  EXPECT_EQ(Extended(g[0]), 0x1p200L + 0x1p101L);  // the 1 is lost only in the rounding
}

template <typename V>
class FloatTransformTest : public ::testing::Test {};
TYPED_TEST_SUITE(FloatTransformTest, testing::FloatVectors);

TYPED_TEST(FloatTransformTest, RootsReciprocalsAndLogarithms) {
  TypeParam v = Make<TypeParam>({4, 0.25, 16});
  SqrtVector(v);
  EXPECT_EQ(Values(v), L({2, 0.5, 4}));
  InvVector(v);
  EXPECT_EQ(Values(v), L({0.5, 2, 0.25}));
  TypeParam logs = Make<TypeParam>({1, 100, 0.001});
  Log10Vector(logs);
  EXPECT_NEAR(double(Values(logs)[0]), 0, 0);
  EXPECT_NEAR(double(Values(logs)[1]), 2, 1e-7);
  EXPECT_NEAR(double(Values(logs)[2]), -3, 1e-6);
  TypeParam twos = Make<TypeParam>({8, 0.5, 1024});
  Log2Vector(twos);
  EXPECT_EQ(Values(twos), L({3, -1, 10}));
  TypeParam e = Make<TypeParam>({1, 7.38905609893065022723L});
  LnVector(e);
  EXPECT_EQ(Values(e)[0], 0);
  EXPECT_NEAR(double(Values(e)[1]), 2, 1e-6);
}

TYPED_TEST(FloatTransformTest, FailedChecksLeaveTheVectorAsItWas) {
  TypeParam v = Make<TypeParam>({4, -1, 9});
  const TypeParam before = v;
  ExpectMathError(rsVectorNeg, [&] { SqrtVector(v); });
  EXPECT_EQ(v, before);
  TypeParam z = Make<TypeParam>({2, 0, 5});
  const TypeParam zBefore = z;
  ExpectMathError(rsVectorZero, [&] { InvVector(z); });
  EXPECT_EQ(z, zBefore);
  TypeParam p = Make<TypeParam>({3, 1, 0});
  const TypeParam pBefore = p;
  ExpectMathError(rsVectorNotPos, [&] { LnVector(p); });
  ExpectMathError(rsVectorNotPos, [&] { Log10Vector(p); });
  ExpectMathError(rsVectorNotPos, [&] { Log2Vector(p); });
  EXPECT_EQ(p, pBefore);
  TypeParam empty;
  ExpectMathError(rsVectorIsEmpty, [&] { SqrtVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { InvVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { LnVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { Log10Vector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { Log2Vector(empty); });
}

TEST(FloatTransformTest, ChecksUseTheTolerance) {
  // -1e-13 counts as zero: it passes the square-root check (and its root is NaN) ...
  TQENDoubleVector v{4, -1e-13};
  SqrtVector(v);
  EXPECT_EQ(v[0], 2);
  EXPECT_TRUE(std::isnan(v[1]));
  // ... and fails the logarithms' positivity check.
  TQENFloatVector small{1, 1e-13L};
  ExpectMathError(rsVectorNotPos, [&] { LnVector(small); });
  // Single reciprocals test for an exact zero only.
  TQENSingleVector tiny{1e-30f};
  InvVector(tiny);
  EXPECT_FLOAT_EQ(tiny[0], 1e30f);
  TQENDoubleVector tinyDouble{1e-30};
  ExpectMathError(rsVectorZero, [&] { InvVector(tinyDouble); });
  EXPECT_EQ(tinyDouble[0], 1e-30);
}

template <typename V>
class LinearTransformTest : public ::testing::Test {};
TYPED_TEST_SUITE(LinearTransformTest, testing::SignedVectors);

TYPED_TEST(LinearTransformTest, MTimesXPlusC) {
  TypeParam v = Make<TypeParam>({0, 1, -4});
  LinearTransformVector(v, 2, 1);
  EXPECT_EQ(Values(v), L({1, 3, -7}));
  TypeParam empty;
  ExpectMathError(rsVectorIsEmpty, [&] { LinearTransformVector(empty, 2, 1); });
}

TEST(LinearTransformTest, Int64WrapsAndFloatsWorkInExtended) {
  TQENInt64Vector j{Int64{1} << 62, INT64_MAX};
  LinearTransformVector(j, 4, 1);
  EXPECT_EQ(j, (TQENInt64Vector{1, -3}));
  // 2^24 + 1 is formed exactly in Extended and rounds to even when stored as a Single.
  TQENSingleVector f{16777216.0f};
  LinearTransformVector(f, 1.0f, 1.0f);
  EXPECT_EQ(f[0], 16777216.0f);
}

Double Halve(Double x) { return x / 2; }

TEST(TransformVectorTest, PlainFunctionsAndCapturingLambdas) {
  TQENDoubleVector d{2, 5};
  TransformVector(d, Halve);
  EXPECT_EQ(d, (TQENDoubleVector{1, 2.5}));
  Extended offset = 0.25L;
  TQENFloatVector g{1, 2};
  TransformVector(g, [offset](Extended x) { return x + offset; });
  EXPECT_EQ(Values(g), L({1.25, 2.25}));
  TQENSingleVector f{9};
  TransformVector(f, [](Single x) { return -x; });
  EXPECT_EQ(f[0], -9.0f);
  TQENSingleVector empty;
  int calls = 0;
  ExpectMathError(rsVectorIsEmpty, [&] {
    TransformVector(empty, [&calls](Single x) {
      ++calls;
      return x;
    });
  });
  EXPECT_EQ(calls, 0);
  TQENDoubleVector kept{1, 2};
  ExpectMathError(rsInvalidValue, [&] { TransformVector(kept, TQENDoubleTransformFunc{}); });
  EXPECT_EQ(kept, (TQENDoubleVector{1, 2}));
}

// --- Filling, clearing, reversing, copying ---------------------------------------------------

template <typename V>
class WholeVectorTest : public ::testing::Test {};
TYPED_TEST_SUITE(WholeVectorTest, testing::AllVectors);

TYPED_TEST(WholeVectorTest, FillClearReverseCopy) {
  TypeParam v = Make<TypeParam>({1, 2, 3});
  const TypeParam reversed = ReverseVector(v);
  EXPECT_EQ(Values(reversed), L({3, 2, 1}));
  EXPECT_EQ(Values(v), L({1, 2, 3}));
  TypeParam copy = CopyVector(v);
  EXPECT_EQ(Values(copy), L({1, 2, 3}));
  EXPECT_NE(copy.data(), v.data());
  FillVector(v, 7);
  EXPECT_EQ(Values(v), L({7, 7, 7}));
  EXPECT_EQ(Values(copy), L({1, 2, 3}));
  ClearVector(v);
  EXPECT_EQ(Values(v), L({0, 0, 0}));
  TypeParam empty;
  FillVector(empty, 1);
  ClearVector(empty);
  EXPECT_TRUE(empty.empty());
  EXPECT_TRUE(ReverseVector(empty).empty());
  EXPECT_TRUE(CopyVector(empty).empty());
}

TYPED_TEST(WholeVectorTest, Magnitude) {
  EXPECT_EQ(VectorMagnitude(Make<TypeParam>({3, 4})), 5);
  EXPECT_EQ(VectorMagnitude(TypeParam{}), 0);
}

TEST(WholeVectorTest, MagnitudeNeverWraps) {
  EXPECT_EQ(VectorMagnitude(TQENWordVector{65535}), 65535);
  EXPECT_EQ(VectorMagnitude(TQENLIntVector{INT32_MIN}), 2147483648.0L);
  EXPECT_EQ(VectorMagnitude(TQENInt64Vector{INT64_MIN}), 0x1p63L);
  EXPECT_EQ(VectorMagnitude(TQENDoubleVector{0x1p1000, 0x1p1000}), 0x1p1000L * Sqrt2);
}

// --- Moving average --------------------------------------------------------------------------

template <typename V>
class MovingAverageTest : public ::testing::Test {};
TYPED_TEST_SUITE(MovingAverageTest, testing::FloatVectors);

TYPED_TEST(MovingAverageTest, WindowsAndOffsets) {
  const TypeParam v = Make<TypeParam>({1, 2, 3, 4, 5});
  EXPECT_EQ(Values(MovingAverage(v, 3, 0)), L({2, 3, 4, 0, 0}));
  EXPECT_EQ(Values(MovingAverage(v, 3, 2)), L({0, 0, 2, 3, 4}));
  EXPECT_EQ(Values(MovingAverage(v, 3, 1)), L({0, 2, 3, 4, 0}));
  EXPECT_EQ(Values(MovingAverage(v, 3, 9)), L({0, 0, 2, 3, 4}));
  EXPECT_EQ(Values(MovingAverage(v, 5, 0)), L({3, 0, 0, 0, 0}));
  EXPECT_EQ(Values(MovingAverage(v, 1, 4)), L({1, 2, 3, 4, 5}));
  EXPECT_EQ(Values(MovingAverage(v, 2, 0)), L({1.5, 2.5, 3.5, 4.5, 0}));
}

TYPED_TEST(MovingAverageTest, ChecksInOrder) {
  const TypeParam v = Make<TypeParam>({1, 2, 3, 4, 5});
  ExpectMathError(rsVectorIsEmpty, [] { MovingAverage(TypeParam{}, 0, 0); });
  ExpectMathError(rsVectorIsEmpty, [] { MovingAverage(TypeParam{}, 3, 0); });
  ExpectMathError(rsValueNotZero, [&] { MovingAverage(v, 0, 0); });
  ExpectMathError(rsInvalidValue, [&] { MovingAverage(v, 6, 0); });
  ExpectMathError(rsInvalidValue, [&] { MovingAverage(v, 4294967295u, 0); });
  EXPECT_EQ(Values(v), L({1, 2, 3, 4, 5}));
}

TEST(MovingAverageTest, SumsInExtended) {
  // Neither the sum 2^53 + 1 nor the average is a Double; the average rounds once.
  const TQENDoubleVector v{0x1p53, 3};
  EXPECT_EQ(MovingAverage(v, 2, 0)[0], 0x1p52 + 2);
}

TEST(MovingAverageTest, EachWindowIsSummedAfresh) {
  // 2^70 + 1 rounds to 2^70 in Extended (the unit in the last place there is 2^7), so a total
  // carried from window to window (add the new element, subtract the old one) would give the
  // window [1, 1] the sum 1; summed afresh it is 2.
  EXPECT_EQ(Values(MovingAverage(TQENFloatVector{0x1p70L, 1, 1, 1}, 2, 0)), L({0x1p69L, 1, 1, 0}));
  EXPECT_EQ(MovingAverage(TQENDoubleVector{0x1p70, 1, 1, 1}, 2, 1),
            (TQENDoubleVector{0, 0x1p69, 1, 1}));
}

// --- Two vectors ----------------------------------------------------------------------------

template <typename V>
class TwoVectorTest : public ::testing::Test {};
TYPED_TEST_SUITE(TwoVectorTest, testing::AddableVectors);

TYPED_TEST(TwoVectorTest, SumsAndDifferences) {
  const TypeParam a = Make<TypeParam>({1, 2, -3});
  const TypeParam b = Make<TypeParam>({10, 20, 30});
  EXPECT_EQ(Values(AddVectors(a, b)), L({11, 22, 27}));
  EXPECT_EQ(Values(SubtractVectors(a, b)), L({-9, -18, -33}));
  TypeParam c = a;
  AddToVector(c, b);
  EXPECT_EQ(Values(c), L({11, 22, 27}));
  SubtractFromVector(c, a);
  EXPECT_EQ(Values(c), L({10, 20, 30}));
  EXPECT_TRUE(AddVectors(TypeParam{}, TypeParam{}).empty());
  TypeParam empty;
  SubtractFromVector(empty, TypeParam{});
  EXPECT_TRUE(empty.empty());
}

TYPED_TEST(TwoVectorTest, UnequalLengthsRaiseAndChangeNothing) {
  TypeParam a = Make<TypeParam>({1, 2});
  const TypeParam b = Make<TypeParam>({1, 2, 3});
  ExpectMathError(rsSameDimensions, [&] { AddVectors(a, b); });
  ExpectMathError(rsSameDimensions, [&] { SubtractVectors(a, b); });
  ExpectMathError(rsSameDimensions, [&] { AddToVector(a, b); });
  ExpectMathError(rsSameDimensions, [&] { SubtractFromVector(a, b); });
  EXPECT_EQ(Values(a), L({1, 2}));
}

TEST(TwoVectorTest, IntegerSumsWrapInTheirWidth) {
  EXPECT_EQ(AddVectors(TQENLIntVector{INT32_MAX}, TQENLIntVector{1}), TQENLIntVector{INT32_MIN});
  EXPECT_EQ(SubtractVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{1}),
            TQENLIntVector{INT32_MAX});
  EXPECT_EQ(AddVectors(TQENInt64Vector{INT64_MAX}, TQENInt64Vector{2}),
            TQENInt64Vector{INT64_MIN + 1});
  TQENInt64Vector j{INT64_MIN};
  SubtractFromVector(j, TQENInt64Vector{1});
  EXPECT_EQ(j, TQENInt64Vector{INT64_MAX});
}

template <typename V>
class ProductTest : public ::testing::Test {};
TYPED_TEST_SUITE(ProductTest, testing::BuildableVectors);

TYPED_TEST(ProductTest, DotProductAndSquaredDifferences) {
  const TypeParam a = Make<TypeParam>({1, 2, 3});
  const TypeParam b = Make<TypeParam>({4, 0, 6});
  EXPECT_EQ(DotProdVectors(a, b), 22);
  EXPECT_EQ(SumSqDiffVectors(b, a), 9 + 4 + 9);
}

TYPED_TEST(ProductTest, LengthIsCheckedBeforeEmptiness) {
  const TypeParam one = Make<TypeParam>({1});
  const TypeParam two = Make<TypeParam>({1, 2});
  const TypeParam empty;
  ExpectMathError(rsSameDimensions, [&] { DotProdVectors(two, one); });
  ExpectMathError(rsSameDimensions, [&] { DotProdVectors(empty, one); });
  ExpectMathError(rsVectorIsEmpty, [&] { DotProdVectors(empty, empty); });
  ExpectMathError(rsSameDimensions, [&] { SumSqDiffVectors(one, empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { SumSqDiffVectors(empty, empty); });
}

TYPED_TEST(ProductTest, Angles) {
  EXPECT_NEAR(double(AngleBetweenVectors(Make<TypeParam>({1, 0}), Make<TypeParam>({0, 1}))),
              double(QENPi / 2), 1e-18);
  EXPECT_EQ(AngleBetweenVectors(Make<TypeParam>({1, 0}), Make<TypeParam>({2, 0})), 0);
  ExpectMathError(rsMagZero, [] {
    AngleBetweenVectors(Make<TypeParam>({0, 0}), Make<TypeParam>({1, 1}));
  });
  ExpectMathError(rsMagZero, [] {
    AngleBetweenVectors(Make<TypeParam>({1, 1}), Make<TypeParam>({0}));
  });
  ExpectMathError(rsMagZero, [] { AngleBetweenVectors(TypeParam{}, TypeParam{}); });
  ExpectMathError(rsSameDimensions, [] {
    AngleBetweenVectors(Make<TypeParam>({1, 0}), Make<TypeParam>({1, 0, 0}));
  });
}

TEST(ProductTest, SignedAngles) {
  EXPECT_EQ(AngleBetweenVectors(TQENLIntVector{3, 0}, TQENLIntVector{-2, 0}), QENPi);
  EXPECT_NEAR(double(AngleBetweenVectors(TQENDoubleVector{1, 0}, TQENDoubleVector{1, 1})),
              0.785398163397448309616, 1e-16);
}

TEST(ProductTest, IntegerProductWidthsDiffer) {
  // Dot products: LongInt keeps the low 32 bits signed, LongWord unsigned, Int64 64 bits.
  EXPECT_EQ(DotProdVectors(TQENLIntVector{46341}, TQENLIntVector{46341}), -2147479015);
  EXPECT_EQ(DotProdVectors(TQENLIntVector{65536, 1}, TQENLIntVector{65536, 1}), 1);
  EXPECT_EQ(DotProdVectors(TQENLWordVector{65536}, TQENLWordVector{65537}), 65536);
  EXPECT_EQ(DotProdVectors(TQENLWordVector{65535}, TQENLWordVector{65535}), 4294836225);
  EXPECT_EQ(DotProdVectors(TQENInt64Vector{Int64{1} << 32}, TQENInt64Vector{Int64{1} << 32}), 0);
  // Squared differences widen to 64 bits first, unlike SumSqDiffVector.
  EXPECT_EQ(SumSqDiffVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{INT32_MAX}),
            -8589934591);  // (2^32 - 1)^2 mod 2^64
  EXPECT_EQ(SumSqDiffVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{1}), 4611686022722355201);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{INT32_MIN}, LongInt{1}), 1);
  EXPECT_EQ(SumSqDiffVectors(TQENLWordVector{0}, TQENLWordVector{4294967295u}), -8589934591);
  EXPECT_EQ(SumSqDiffVectors(TQENInt64Vector{INT64_MIN}, TQENInt64Vector{INT64_MAX}), 1);
}

TEST(ProductTest, FloatsWorkInExtended) {
  EXPECT_EQ(DotProdVectors(TQENDoubleVector{0x1p1000}, TQENDoubleVector{0x1p1000}), 0x1p2000L);
  EXPECT_EQ(SumSqDiffVectors(TQENSingleVector{0x1p100f}, TQENSingleVector{-0x1p100f}), 0x1p202L);
}

TEST(ProductTest, FloatSumsStartFromZero) {
  // The only term is -1 * 0 = -0; a sum that starts at +0 ends at +0.
  EXPECT_FALSE(std::signbit(DotProdVectors(TQENDoubleVector{-1}, TQENDoubleVector{0})));
  EXPECT_FALSE(std::signbit(DotProdVectors(TQENFloatVector{0}, TQENFloatVector{-1})));
}

// --- Conversions ----------------------------------------------------------------------------

TEST(ConversionTest, ToExtended) {
  const Double d[] = {0.1, -2.5};
  const TQENFloatVector fromArray = Array2FloatVector(std::span<const Double>(d));
  EXPECT_EQ(Extended(fromArray[0]), Extended(0.1));
  EXPECT_EQ(Extended(fromArray[1]), -2.5L);
  EXPECT_EQ(Values(Vector2FloatVector(TQENInt64Vector{INT64_MAX})), L({0x1p63L - 1}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENLWordVector{4294967295u})), L({4294967295.0L}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENSIntVector{-128})), L({-128}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENSingleVector{0.1f})), L({Extended(0.1f)}));
  const Extended g[] = {1.0L + 0x1p-63L};
  EXPECT_EQ(Values(Array2FloatVector(std::span<const Extended>(g))), L({1.0L + 0x1p-63L}));
  EXPECT_TRUE(Array2FloatVector(std::span<const Byte>()).empty());
  EXPECT_TRUE(Vector2FloatVector(TQENWordVector{}).empty());
}

TEST(ConversionTest, ToInt64AndLongIntExtendBySignedness) {
  const LongWord lw[] = {4294967295u, 0};
  EXPECT_EQ(Array2Int64Vector(std::span<const LongWord>(lw)), (TQENInt64Vector{4294967295, 0}));
  EXPECT_EQ(Vector2Int64Vector(TQENLIntVector{INT32_MIN}), TQENInt64Vector{INT32_MIN});
  EXPECT_EQ(Vector2Int64Vector(TQENByteVector{255}), TQENInt64Vector{255});
  EXPECT_EQ(Vector2Int64Vector(TQENSIntVector{-1}), TQENInt64Vector{-1});
  EXPECT_EQ(Vector2Int64Vector(TQENInt64Vector{INT64_MIN}), TQENInt64Vector{INT64_MIN});
  const Word w[] = {65535};
  EXPECT_EQ(Array2LIntVector(std::span<const Word>(w)), TQENLIntVector{65535});
  EXPECT_EQ(Vector2LIntVector(TQENSmallIntVector{-32768}), TQENLIntVector{-32768});
  EXPECT_EQ(Vector2LIntVector(TQENByteVector{200}), TQENLIntVector{200});
  const ShortInt z[] = {-128, 127};
  EXPECT_EQ(Array2LIntVector(std::span<const ShortInt>(z)), (TQENLIntVector{-128, 127}));
  EXPECT_TRUE(Vector2LIntVector(TQENLIntVector{}).empty());
}

// --- Polynomial -----------------------------------------------------------------------------

TEST(PolynomialTest, AscendingCoefficients) {
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, 2, 3}, 2), 17);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{}, 2), 0);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{5}, 1e300L), 5);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{0, 0, 0, 1}, -3), -27);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, -1, 1, -1}, 0.5L), 0.625L);
}

TEST(PolynomialTest, PowersAreFormedBeforeTheyAreScaled) {
  // X^2 = 1e6000 lies beyond the Extended range (about 1.19e4932), so the term 1e-3000 * X^2
  // is infinite, although Horner's form 1e-3000 * X * X would stay at 1e3000.
  EXPECT_EQ(QENPolynomial(TQENFloatVector{0, 0, 1e-3000L}, 1e3000L),
            std::numeric_limits<Extended>::infinity());
  // 1e-3000 * X is exact here, and the powers stay finite: 1 + 1 * 1e3000 is 1e3000.
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, 1}, 1e3000L), 1e3000L);
}

}  // namespace
}  // namespace tovrin
