#include <cmath>
#include <cstdint>
#include <limits>

#include <gtest/gtest.h>

#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/TOVRINVector_testing.h"

namespace tovrin {
namespace {

using testing::ExpectMathError;
using testing::L;
using testing::Make;
using testing::Values;

// --- Building -------------------------------------------------------------------------------

template <typename V>
class BuildingTest : public ::testing::Test {};
TYPED_TEST_SUITE(BuildingTest, testing::BuildableVectors);

TYPED_TEST(BuildingTest, AppendGrowsByOne) {
  TypeParam v;
  AppendValue2Vector(v, 4);
  AppendValue2Vector(v, 9);
  EXPECT_EQ(Values(v), L({4, 9}));
}

TYPED_TEST(BuildingTest, InsertAtEachPositionOrAppendOutsideThem) {
  const TypeParam start = Make<TypeParam>({1, 2});
  const struct {
    LongInt index;
    std::vector<Extended> expected;
  } cases[] = {{0, {7, 1, 2}},       {1, {1, 7, 2}},
               {2, {1, 2, 7}},       {-1, {1, 2, 7}},
               {1000000, {1, 2, 7}}, {std::numeric_limits<LongInt>::min(), {1, 2, 7}}};
  for (const auto& c : cases) {
    TypeParam v = start;
    AddValue2Vector(v, 7, c.index);
    EXPECT_EQ(Values(v), c.expected) << "index " << c.index;
  }
  for (LongInt index : {-5, 0, 3}) {
    TypeParam empty;
    AddValue2Vector(empty, 7, index);
    EXPECT_EQ(Values(empty), L({7}));
  }
}

TYPED_TEST(BuildingTest, DeleteInsideRangeOnly) {
  TypeParam v = Make<TypeParam>({1, 2, 3});
  DeleteValueFromVector(v, 0);
  EXPECT_EQ(Values(v), L({2, 3}));
  DeleteValueFromVector(v, 2);
  DeleteValueFromVector(v, -1);
  EXPECT_EQ(Values(v), L({2, 3}));
  DeleteValueFromVector(v, 1);
  EXPECT_EQ(Values(v), L({2}));
  DeleteValueFromVector(v, 0);
  EXPECT_TRUE(v.empty());
  EXPECT_EQ(v.capacity(), 0u);  // the storage is released, not merely resized
  DeleteValueFromVector(v, 0);
  EXPECT_TRUE(v.empty());
}

// --- Extremes -------------------------------------------------------------------------------

template <typename V>
class AggregateTest : public ::testing::Test {};
TYPED_TEST_SUITE(AggregateTest, testing::AllVectors);

TYPED_TEST(AggregateTest, ExtremesAndTheirFirstPositions) {
  const TypeParam v = Make<TypeParam>({3, 1, 4, 1, 5});
  EXPECT_EQ(Extended(MaxVector(v)), 5);
  EXPECT_EQ(Extended(MinVector(v)), 1);
  decltype(MaxVector(v)) lo{}, hi{};
  LongWord loIndex = 9, hiIndex = 9;
  bool loUnique = true, hiUnique = false;
  MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(Extended(lo), 1);
  EXPECT_EQ(loIndex, 1u);
  EXPECT_FALSE(loUnique);
  EXPECT_EQ(Extended(hi), 5);
  EXPECT_EQ(hiIndex, 4u);
  EXPECT_TRUE(hiUnique);

  MinMaxVector(Make<TypeParam>({6}), lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(loIndex + hiIndex, 0u);
  EXPECT_TRUE(loUnique && hiUnique);
  MinMaxVector(Make<TypeParam>({2, 2, 2}), lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(loIndex + hiIndex, 0u);
  EXPECT_FALSE(loUnique || hiUnique);
}

TYPED_TEST(AggregateTest, EmptyVectorRaisesBeforeWritingOutputs) {
  const TypeParam empty;
  ExpectMathError(rsVectorIsEmpty, [&] { MaxVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { MinVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { SumVector(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { SumSqVector(empty); });
  decltype(MaxVector(empty)) lo = 7, hi = 8;
  LongWord loIndex = 3, hiIndex = 4;
  bool loUnique = false, hiUnique = false;
  ExpectMathError(rsVectorIsEmpty,
                  [&] { MinMaxVector(empty, lo, hi, loIndex, hiIndex, loUnique, hiUnique); });
  EXPECT_EQ(Extended(lo) + Extended(hi), 15);
  EXPECT_EQ(loIndex + hiIndex, 7u);
  EXPECT_FALSE(loUnique || hiUnique);
}

TYPED_TEST(AggregateTest, SumsInIndexOrderWithoutNarrowing) {
  EXPECT_EQ(SumVector(Make<TypeParam>({100, 100, 27})), 227);
  EXPECT_EQ(SumSqVector(Make<TypeParam>({3, 4, 10})), 125);
}

TEST(AggregateTest, ExtremesCompareFloatsExactly) {
  const TQENFloatVector v{2.0L, 2.0L + 1e-15L};
  EXPECT_EQ(MaxVector(v), 2.0L + 1e-15L);
  Extended lo, hi;
  LongWord loIndex, hiIndex;
  bool loUnique, hiUnique;
  MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(hiIndex, 1u);
  EXPECT_TRUE(loUnique && hiUnique);
  EXPECT_EQ(MinVector(TQENSingleVector{1.0f, 1.0f - 1e-7f}), 1.0f - 1e-7f);
}

TEST(AggregateTest, ExtremesKeepTheElementType) {
  static_assert(std::is_same_v<decltype(MaxVector(TQENSingleVector{})), Single>);
  static_assert(std::is_same_v<decltype(MinVector(TQENWordVector{})), Word>);
  static_assert(std::is_same_v<decltype(MaxVector(TQENFloatVector{})), Extended>);
  EXPECT_EQ(MaxVector(TQENWordVector{65535, 1}), 65535);
  EXPECT_EQ(MinVector(TQENSIntVector{-128, 127}), -128);
  EXPECT_EQ(MaxVector(TQENInt64Vector{INT64_MIN, INT64_MAX}), INT64_MAX);
}

// --- Sums -----------------------------------------------------------------------------------

TEST(SumVectorTest, IntegersWidenAndWrapOnlyIn64Bits) {
  EXPECT_EQ(SumVector(TQENByteVector{200, 200}), 400);
  EXPECT_EQ(SumVector(TQENSIntVector{-128, -128, -128}), -384);
  EXPECT_EQ(SumVector(TQENLWordVector{4000000000u, 4000000000u}), 8000000000);
  EXPECT_EQ(SumVector(TQENLIntVector{INT32_MAX, INT32_MAX}), 4294967294);
  EXPECT_EQ(SumVector(TQENInt64Vector{INT64_MAX, 1}), INT64_MIN);
  static_assert(std::is_same_v<decltype(SumVector(TQENByteVector{})), Int64>);
}

TEST(SumVectorTest, FloatsAccumulateInExtended) {
  static_assert(std::is_same_v<decltype(SumVector(TQENSingleVector{})), Extended>);
  // 2^24 + 1 + 1 is not representable on the way in Single, nor 2^53 + 1 in Double.
  EXPECT_EQ(SumVector(TQENSingleVector{16777216.0f, 1.0f, 1.0f}), 16777218.0L);
  EXPECT_EQ(SumVector(TQENDoubleVector{9007199254740992.0, 1.0}), 9007199254740993.0L);
  EXPECT_EQ(SumVector(TQENDoubleVector{0x1p1023, 0x1p1023}), 0x1p1024L);
  EXPECT_EQ(SumVector(TQENFloatVector{1.0L, 0x1p-63L}), 1.0L + 0x1p-63L);
  // The sum starts from the first element itself, so a lone -0 stays -0 (0 + -0 would be +0).
  EXPECT_TRUE(std::signbit(SumVector(TQENDoubleVector{-0.0})));
  EXPECT_TRUE(std::signbit(SumVector(TQENFloatVector{-0.0L, -0.0L})));
}

TEST(SumSqVectorTest, SquaresFollowTheirTypeRules) {
  EXPECT_EQ(SumSqVector(TQENWordVector{65535}), -131071);
  EXPECT_EQ(SumSqVector(TQENWordVector{46340}), 2147395600);  // still fits
  EXPECT_EQ(SumSqVector(TQENLIntVector{46341}), 2147488281 - 4294967296);
  EXPECT_EQ(SumSqVector(TQENLIntVector{-46341}), 2147488281 - 4294967296);
  EXPECT_EQ(SumSqVector(TQENLWordVector{65536}), 0);
  EXPECT_EQ(SumSqVector(TQENLWordVector{65537}), 131073);  // 4295098369 mod 2^32
  EXPECT_EQ(SumSqVector(TQENLWordVector{65535}), 4294836225);
  EXPECT_EQ(SumSqVector(TQENByteVector{255, 255}), 130050);
  EXPECT_EQ(SumSqVector(TQENSmallIntVector{-32768}), 1073741824);
  EXPECT_EQ(SumSqVector(TQENSIntVector{-128, 127}), 32513);
  EXPECT_EQ(SumSqVector(TQENInt64Vector{Int64{1} << 32}), 0);
  EXPECT_EQ(SumSqVector(TQENInt64Vector{3037000500}), -9223372036709301616);  // 2^63 + 145..
  EXPECT_EQ(SumSqVector(TQENDoubleVector{0x1p1000}), 0x1p2000L);
  EXPECT_EQ(SumSqVector(TQENSingleVector{0.5f, 1.5f}), 2.5L);
}

TEST(SumSqDiffVectorTest, CentreOfTheElementType) {
  EXPECT_EQ(SumSqDiffVector(TQENLWordVector{3}, LongWord{5}), 4);
  EXPECT_EQ(SumSqDiffVector(TQENLWordVector{0}, LongWord{65536}), 0);  // 2^32 - 2^16, squared
  // INT32_MIN - 1 wraps to INT32_MAX, whose square has the low 32 bits 1.
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{INT32_MIN}, LongInt{1}), 1);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{46341, 0}, LongInt{0}), 2147488281 - 4294967296);
  EXPECT_EQ(SumSqDiffVector(TQENInt64Vector{INT64_MIN}, Int64{1}), 1);
  EXPECT_EQ(SumSqDiffVector(TQENInt64Vector{1, 2, 3}, Int64{2}), 2);
  EXPECT_EQ(SumSqDiffVector(TQENFloatVector{1, 2, 3}, 2.0L), 2.0L);
  EXPECT_EQ(SumSqDiffVector(TQENDoubleVector{0x1p1000, 0}, 0.0), 0x1p2000L);
  EXPECT_EQ(SumSqDiffVector(TQENSingleVector{0.5f}, 2.0f), 2.25L);
  static_assert(std::is_same_v<decltype(SumSqDiffVector(TQENLIntVector{}, LongInt{})), Int64>);
}

TEST(SumSqDiffVectorTest, ExtendedCentreOfIntegerElements) {
  EXPECT_EQ(SumSqDiffVector(TQENLWordVector{3}, 5.0L), 4.0L);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{1, 2}, 1.5L), 0.5L);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{INT32_MIN}, 1.0L), 4611686022722355201.0L);
  EXPECT_EQ(SumSqDiffVector(TQENInt64Vector{INT64_MIN}, 0.0L), 0x1p126L);
  static_assert(std::is_same_v<decltype(SumSqDiffVector(TQENInt64Vector{}, 0.0L)), Extended>);
}

TEST(SumSqDiffVectorTest, EmptyRaises) {
  ExpectMathError(rsVectorIsEmpty, [] { SumSqDiffVector(TQENDoubleVector{}, 1.0); });
  ExpectMathError(rsVectorIsEmpty, [] { SumSqDiffVector(TQENLIntVector{}, 1.0L); });
  ExpectMathError(rsVectorIsEmpty, [] { SumSqDiffVector(TQENLWordVector{}, LongWord{1}); });
}

// --- Sign predicates ------------------------------------------------------------------------

template <typename V>
class SignTest : public ::testing::Test {};
TYPED_TEST_SUITE(SignTest, testing::SignedVectors);

// The answers of VectorNonNegative, VectorNegative, VectorNonZero, VectorZero,
// VectorNonPositive and VectorPositive, as a string of six 0/1 digits.
template <typename V>
std::string Signs(const V& v) {
  std::string s;
  for (bool b : {VectorNonNegative(v), VectorNegative(v), VectorNonZero(v), VectorZero(v),
                 VectorNonPositive(v), VectorPositive(v)}) {
    s += b ? '1' : '0';
  }
  return s;
}

TYPED_TEST(SignTest, ExactValues) {
  EXPECT_EQ(Signs(Make<TypeParam>({1, 2})), "101001");
  EXPECT_EQ(Signs(Make<TypeParam>({-1, -2})), "011010");
  EXPECT_EQ(Signs(Make<TypeParam>({0, 0})), "100110");
  EXPECT_EQ(Signs(Make<TypeParam>({0, 3})), "100000");
  EXPECT_EQ(Signs(Make<TypeParam>({-3, 0})), "000010");
  EXPECT_EQ(Signs(Make<TypeParam>({2, -3})), "001000");
}

TYPED_TEST(SignTest, EmptyRaises) {
  const TypeParam empty;
  ExpectMathError(rsVectorIsEmpty, [&] { VectorNonNegative(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { VectorNegative(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { VectorNonZero(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { VectorZero(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { VectorNonPositive(empty); });
  ExpectMathError(rsVectorIsEmpty, [&] { VectorPositive(empty); });
}

TEST(SignTest, FloatsWithinTheToleranceCountAsZero) {
  // |x| = 1e-13 is inside the tolerance of 5e-12; 1e-11 is outside.
  EXPECT_EQ(Signs(TQENFloatVector{-1e-13L, 1e-13L}), "100110");
  EXPECT_EQ(Signs(TQENDoubleVector{-1e-13, 1e-13}), "100110");
  EXPECT_EQ(Signs(TQENFloatVector{1e-11L}), "101001");
  EXPECT_EQ(Signs(TQENDoubleVector{-1e-11}), "011010");
  EXPECT_EQ(Signs(TQENSingleVector{-1e-11f}), "011010");
}

TEST(SignTest, SingleNonZeroComparesExactly) {
  EXPECT_TRUE(VectorNonZero(TQENSingleVector{1e-30f}));
  EXPECT_FALSE(VectorNonZero(TQENFloatVector{1e-30L}));
  EXPECT_FALSE(VectorNonZero(TQENDoubleVector{1e-30}));
  EXPECT_FALSE(VectorNonZero(TQENSingleVector{1e-30f, 0.0f}));
  // The other Single predicates keep the tolerance.
  EXPECT_EQ(Signs(TQENSingleVector{1e-30f}), "101110");
}

TEST(SignTest, Int64ComparesExactlyAtTheExtremes) {
  EXPECT_EQ(Signs(TQENInt64Vector{INT64_MIN}), "011010");
  EXPECT_EQ(Signs(TQENInt64Vector{INT64_MAX, 1}), "101001");
}

}  // namespace
}  // namespace tovrin
