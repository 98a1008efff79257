// Tests of the element-wise transforms, the moving average, the two-vector operations, the
// conversions and the polynomial.
#include <cmath>
#include <cstdint>
#include <limits>
#include <span>

#include "tovrin/testing/TOVRIN_testing.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using namespace testing;

TOVRIN_TYPED_SUITE(FloatTransform, testing::FloatElements);

TYPED_TEST(FloatTransform, ValuesAndChecksBeforeAnyWrite) {
  using V = std::vector<TypeParam>;
  auto v = Vec<TypeParam>({4, 0.25, 16});
  SqrtVector(v);
  EXPECT_EQ(Values(v), (Row{2, 0.5, 4}));
  InvVector(v);
  EXPECT_EQ(Values(v), (Row{0.5, 2, 0.25}));
  SquareVector(v);
  EXPECT_EQ(Values(v), (Row{0.25, 4, 0.0625}));
  auto twos = Vec<TypeParam>({8, 0.5, 1024});
  Log2Vector(twos);
  EXPECT_EQ(Values(twos), (Row{3, -1, 10}));
  auto logs = Vec<TypeParam>({1, 100, 7.38905609893065022723L});
  auto lns = logs;
  Log10Vector(logs);
  LnVector(lns);
  EXPECT_EQ(Values(logs)[0], 0);
  EXPECT_NEAR(double(Values(logs)[1]), 2, 1e-7);
  EXPECT_NEAR(double(Values(lns)[2]), 2, 1e-6);
  auto m = Vec<TypeParam>({0, 1, -4});
  LinearTransformVector(m, 2, 1);
  EXPECT_EQ(Values(m), (Row{1, 3, -7}));
  ExpectRaisesUntouched(rsVectorNeg, Vec<TypeParam>({4, -1, 9}), [](V& x) { SqrtVector(x); });
  ExpectRaisesUntouched(rsVectorZero, Vec<TypeParam>({2, 0, 5}), [](V& x) { InvVector(x); });
  const auto p = Vec<TypeParam>({3, 1, 0});
  ExpectRaisesUntouched(rsVectorNotPos, p, [](V& x) { LnVector(x); });
  ExpectRaisesUntouched(rsVectorNotPos, p, [](V& x) { Log10Vector(x); });
  ExpectRaisesUntouched(rsVectorNotPos, p, [](V& x) { Log2Vector(x); });
  using Fn = void (*)(V&);
  for (Fn f : {Fn(&SqrtVector), Fn(&InvVector), Fn(&LnVector), Fn(&Log10Vector), Fn(&Log2Vector),
               Fn(&SquareVector)}) {
    ExpectRaisesUntouched(rsVectorIsEmpty, V{}, f);
  }
  ExpectRaisesUntouched(rsVectorIsEmpty, V{}, [](V& x) { LinearTransformVector(x, 2, 1); });
}

TEST(FloatTransform, ChecksUseTheToleranceButSingleReciprocalsTestZeroExactly) {
  TQENDoubleVector v{4, -1e-13};  // -1e-13 counts as zero: its root is taken (NaN)
  SqrtVector(v);
  EXPECT_TRUE(std::isnan(v[1]));
  TQENFloatVector small{1, 1e-13L};
  ExpectRaises(rsVectorNotPos, [&] { LnVector(small); });
  TQENSingleVector tiny{1e-30f};
  InvVector(tiny);
  EXPECT_FLOAT_EQ(tiny[0], 1e30f);
  ExpectRaisesUntouched(rsVectorZero, TQENDoubleVector{1e-30}, [](auto& x) { InvVector(x); });
}

// Integer squares wrap in their own width; float squares are formed in Extended and rounded.
TEST(SquareVector, TypeRules) {
  TQENLIntVector li{46341, 65536, -3};
  SquareVector(li);
  EXPECT_EQ(li, (TQENLIntVector{-2147479015, 0, 9}));
  TQENLWordVector lw{65537, 65535};
  SquareVector(lw);
  EXPECT_EQ(lw, (TQENLWordVector{131073, 4294836225u}));
  TQENInt64Vector j{(Int64{1} << 32) + 1, INT64_MIN};
  SquareVector(j);
  EXPECT_EQ(j, (TQENInt64Vector{(Int64{1} << 33) + 1, 0}));
  TQENSingleVector f{0x1p100f};
  SquareVector(f);
  EXPECT_EQ(f[0], std::numeric_limits<Single>::infinity());
  TQENFloatVector g{0x1p100L + 1};
  SquareVector(g);
  EXPECT_EQ(Extended(g[0]), 0x1p200L + 0x1p101L);
  TQENInt64Vector k{Int64{1} << 62, INT64_MAX};
  LinearTransformVector(k, 4, 1);
  EXPECT_EQ(k, (TQENInt64Vector{1, -3}));
  TQENSingleVector s{16777216.0f};  // 2^24 + 1 formed in Extended, stored rounded to even
  LinearTransformVector(s, 1.0f, 1.0f);
  EXPECT_EQ(s[0], 16777216.0f);
}

Double Halve(Double x) { return x / 2; }

TEST(TransformVector, FunctionsLambdasAndChecks) {
  TQENDoubleVector d{2, 5};
  TransformVector(d, Halve);
  EXPECT_EQ(d, (TQENDoubleVector{1, 2.5}));
  Extended offset = 0.25L;
  TQENFloatVector g{1, 2};
  TransformVector(g, [offset](Extended x) { return x + offset; });
  EXPECT_EQ(Values(g), (Row{1.25, 2.25}));
  int calls = 0;
  TQENSingleVector empty;
  ExpectRaises(rsVectorIsEmpty,
               [&] { TransformVector(empty, [&calls](Single x) { return ++calls, x; }); });
  EXPECT_EQ(calls, 0);
  ExpectRaisesUntouched(rsInvalidValue, TQENDoubleVector{1, 2},
                        [](auto& x) { TransformVector(x, TQENDoubleTransformFunc{}); });
}

TOVRIN_TYPED_SUITE(WholeVector, testing::RuleElements);

TYPED_TEST(WholeVector, FillClearReverseCopyAndMagnitude) {
  auto v = Vec<TypeParam>({1, 2, 3});
  EXPECT_EQ(Values(ReverseVector(v)), (Row{3, 2, 1}));
  auto copy = CopyVector(v);
  EXPECT_NE(copy.data(), v.data());
  FillVector(v, 7);
  EXPECT_EQ(Values(v), (Row{7, 7, 7}));
  EXPECT_EQ(Values(copy), (Row{1, 2, 3}));
  ClearVector(v);
  EXPECT_EQ(Values(v), (Row{0, 0, 0}));
  std::vector<TypeParam> empty;
  FillVector(empty, 1);
  EXPECT_TRUE(empty.empty() && ReverseVector(empty).empty() && CopyVector(empty).empty());
  EXPECT_EQ(VectorMagnitude(Vec<TypeParam>({3, 4})), 5);
  EXPECT_EQ(VectorMagnitude(empty), 0);
}

TEST(WholeVector, MagnitudeNeverWraps) {
  EXPECT_EQ(VectorMagnitude(TQENWordVector{65535}), 65535);
  EXPECT_EQ(VectorMagnitude(TQENLIntVector{INT32_MIN}), 2147483648.0L);
  EXPECT_EQ(VectorMagnitude(TQENInt64Vector{INT64_MIN}), 0x1p63L);
  EXPECT_EQ(VectorMagnitude(TQENDoubleVector{0x1p1000, 0x1p1000}), 0x1p1000L * Sqrt2);
}

TEST(MovingAverage, WindowsOffsetsAndCheckOrder) {
  const TQENDoubleVector v{1, 2, 3, 4, 5};
  const struct {
    LongWord window, offset;
    Row expected;
  } cases[] = {{3, 0, {2, 3, 4, 0, 0}},        {3, 2, {0, 0, 2, 3, 4}}, {3, 1, {0, 2, 3, 4, 0}},
               {3, 9, {0, 0, 2, 3, 4}},        {5, 0, {3, 0, 0, 0, 0}}, {1, 4, {1, 2, 3, 4, 5}},
               {2, 0, {1.5, 2.5, 3.5, 4.5, 0}}};
  for (const auto& c : cases) EXPECT_EQ(Values(MovingAverage(v, c.window, c.offset)), c.expected);
  EXPECT_EQ(Values(MovingAverage(TQENSingleVector{1, 2}, 2, 0)), (Row{1.5, 0}));
  ExpectRaises(rsVectorIsEmpty, [] { MovingAverage(TQENFloatVector{}, 0, 0); });
  ExpectRaises(rsValueNotZero, [&] { MovingAverage(v, 0, 0); });
  ExpectRaises(rsInvalidValue, [&] { MovingAverage(v, 6, 0); });
  ExpectRaises(rsInvalidValue, [&] { MovingAverage(v, 4294967295u, 0); });
  // Each window is summed afresh in Extended: 2^70 + 1 rounds to 2^70, so a running total
  // would give the window [1, 1] the sum 1; and 2^53 + 3 is no Double.
  EXPECT_EQ(Values(MovingAverage(TQENFloatVector{0x1p70L, 1, 1, 1}, 2, 0)),
            (Row{0x1p69L, 1, 1, 0}));
  EXPECT_EQ(MovingAverage(TQENDoubleVector{0x1p53, 3}, 2, 0)[0], 0x1p52 + 2);
}

TOVRIN_TYPED_SUITE(TwoVectors, testing::ArithmeticElements);

TYPED_TEST(TwoVectors, SumsDifferencesAndLengths) {
  using V = std::vector<TypeParam>;
  const auto a = Vec<TypeParam>({1, 2, -3});
  const auto b = Vec<TypeParam>({10, 20, 30});
  EXPECT_EQ(Values(AddVectors(a, b)), (Row{11, 22, 27}));
  EXPECT_EQ(Values(SubtractVectors(a, b)), (Row{-9, -18, -33}));
  auto c = a;
  AddToVector(c, b);
  SubtractFromVector(c, a);
  EXPECT_EQ(Values(c), (Row{10, 20, 30}));
  EXPECT_TRUE(AddVectors(V{}, V{}).empty());
  const auto three = Vec<TypeParam>({1, 2, 3});
  ExpectRaises(rsSameDimensions, [&] { AddVectors(b, V{1}); });
  ExpectRaises(rsSameDimensions, [&] { SubtractVectors(b, V{1}); });
  ExpectRaisesUntouched(rsSameDimensions, V{1}, [&](V& x) { AddToVector(x, three); });
  ExpectRaisesUntouched(rsSameDimensions, V{1}, [&](V& x) { SubtractFromVector(x, three); });
}

TOVRIN_TYPED_SUITE(Products, testing::BuildableElements);

TYPED_TEST(Products, DotProductDifferencesAnglesAndCheckOrder) {
  using V = std::vector<TypeParam>;
  EXPECT_EQ(DotProdVectors(Vec<TypeParam>({1, 2, 3}), Vec<TypeParam>({4, 0, 6})), 22);
  EXPECT_EQ(SumSqDiffVectors(Vec<TypeParam>({4, 0, 6}), Vec<TypeParam>({1, 2, 3})), 22);
  const auto one = Vec<TypeParam>({1}), two = Vec<TypeParam>({1, 0});
  ExpectRaises(rsSameDimensions, [&] { DotProdVectors(two, one); });
  ExpectRaises(rsSameDimensions, [&] { DotProdVectors(V{}, one); });  // the length first
  ExpectRaises(rsVectorIsEmpty, [&] { DotProdVectors(V{}, V{}); });
  ExpectRaises(rsSameDimensions, [&] { SumSqDiffVectors(one, V{}); });
  ExpectRaises(rsVectorIsEmpty, [&] { SumSqDiffVectors(V{}, V{}); });
  EXPECT_NEAR(double(AngleBetweenVectors(two, Vec<TypeParam>({0, 1}))), double(QENPi / 2), 1e-18);
  EXPECT_EQ(AngleBetweenVectors(two, Vec<TypeParam>({2, 0})), 0);
  // The magnitudes are tested before the lengths.
  ExpectRaises(rsMagZero, [&] { AngleBetweenVectors(Vec<TypeParam>({0, 0}), two); });
  ExpectRaises(rsMagZero, [&] { AngleBetweenVectors(two, Vec<TypeParam>({0})); });
  ExpectRaises(rsMagZero, [&] { AngleBetweenVectors(V{}, V{}); });
  ExpectRaises(rsSameDimensions, [&] { AngleBetweenVectors(two, Vec<TypeParam>({1, 0, 0})); });
}

// Wrapping widths of the element-wise operations: LongInt keeps the low 32 bits signed,
// LongWord unsigned, Int64 64 bits; squared differences of two vectors widen to 64 bits
// first (unlike SumSqDiffVector); floats work in Extended and sum from +0.
TEST(Products, TypeRules) {
  EXPECT_EQ(AddVectors(TQENLIntVector{INT32_MAX}, TQENLIntVector{1}), TQENLIntVector{INT32_MIN});
  EXPECT_EQ(SubtractVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{1}),
            TQENLIntVector{INT32_MAX});
  TQENInt64Vector j{INT64_MIN};
  SubtractFromVector(j, TQENInt64Vector{1});
  EXPECT_EQ(j, TQENInt64Vector{INT64_MAX});
  EXPECT_EQ(DotProdVectors(TQENLIntVector{46341}, TQENLIntVector{46341}), -2147479015);
  EXPECT_EQ(DotProdVectors(TQENLIntVector{65536, 1}, TQENLIntVector{65536, 1}), 1);
  EXPECT_EQ(DotProdVectors(TQENLWordVector{65536}, TQENLWordVector{65537}), 65536);
  EXPECT_EQ(DotProdVectors(TQENLWordVector{65535}, TQENLWordVector{65535}), 4294836225);
  EXPECT_EQ(DotProdVectors(TQENInt64Vector{Int64{1} << 32}, TQENInt64Vector{Int64{1} << 32}), 0);
  EXPECT_EQ(SumSqDiffVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{INT32_MAX}), -8589934591);
  EXPECT_EQ(SumSqDiffVectors(TQENLIntVector{INT32_MIN}, TQENLIntVector{1}), 4611686022722355201);
  EXPECT_EQ(SumSqDiffVectors(TQENLWordVector{0}, TQENLWordVector{4294967295u}), -8589934591);
  EXPECT_EQ(SumSqDiffVectors(TQENInt64Vector{INT64_MIN}, TQENInt64Vector{INT64_MAX}), 1);
  EXPECT_EQ(DotProdVectors(TQENDoubleVector{0x1p1000}, TQENDoubleVector{0x1p1000}), 0x1p2000L);
  EXPECT_EQ(SumSqDiffVectors(TQENSingleVector{0x1p100f}, TQENSingleVector{-0x1p100f}), 0x1p202L);
  EXPECT_FALSE(std::signbit(DotProdVectors(TQENDoubleVector{-1}, TQENDoubleVector{0})));
  EXPECT_EQ(AngleBetweenVectors(TQENLIntVector{3, 0}, TQENLIntVector{-2, 0}), QENPi);
}

TEST(Conversions, WidenExactlyBySignedness) {
  const Double d[] = {0.1, -2.5};
  EXPECT_EQ(Values(Array2FloatVector(std::span<const Double>(d))), (Row{Extended(0.1), -2.5L}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENInt64Vector{INT64_MAX})), (Row{0x1p63L - 1}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENLWordVector{4294967295u})), (Row{4294967295.0L}));
  EXPECT_EQ(Values(Vector2FloatVector(TQENSIntVector{-128})), (Row{-128}));
  EXPECT_TRUE(Array2FloatVector(std::span<const Byte>()).empty());
  const LongWord lw[] = {4294967295u, 0};
  EXPECT_EQ(Array2Int64Vector(std::span<const LongWord>(lw)), (TQENInt64Vector{4294967295, 0}));
  EXPECT_EQ(Vector2Int64Vector(TQENLIntVector{INT32_MIN}), TQENInt64Vector{INT32_MIN});
  EXPECT_EQ(Vector2Int64Vector(TQENByteVector{255}), TQENInt64Vector{255});
  EXPECT_EQ(Vector2Int64Vector(TQENSIntVector{-1}), TQENInt64Vector{-1});
  const Word w[] = {65535};
  EXPECT_EQ(Array2LIntVector(std::span<const Word>(w)), TQENLIntVector{65535});
  EXPECT_EQ(Vector2LIntVector(TQENSmallIntVector{-32768}), TQENLIntVector{-32768});
  EXPECT_EQ(Vector2LIntVector(TQENByteVector{200}), TQENLIntVector{200});
}

TEST(Polynomial, AscendingCoefficientsWithPowersFormedFirst) {
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, 2, 3}, 2), 17);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{}, 2), 0);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{0, 0, 0, 1}, -3), -27);
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, -1, 1, -1}, 0.5L), 0.625L);
  // X^2 = 1e6000 overflows Extended, so the term 1e-3000 X^2 is infinite (Horner's form would
  // give 1e3000).
  EXPECT_EQ(QENPolynomial(TQENFloatVector{0, 0, 1e-3000L}, 1e3000L),
            std::numeric_limits<Extended>::infinity());
  EXPECT_EQ(QENPolynomial(TQENFloatVector{1, 1}, 1e3000L), 1e3000L);
}

}  // namespace
}  // namespace tovrin
