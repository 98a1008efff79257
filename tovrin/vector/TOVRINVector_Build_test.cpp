// Tests of building vectors, their extremes, sums and sign predicates.
#include <cmath>
#include <cstdint>
#include <limits>

#include "tovrin/testing/TOVRIN_testing.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using namespace testing;

TOVRIN_TYPED_SUITE(VectorBuild, testing::BuildableElements);

TYPED_TEST(VectorBuild, AppendInsertAndDelete) {
  std::vector<TypeParam> v;
  AppendValue2Vector(v, 4);
  AppendValue2Vector(v, 9);
  EXPECT_EQ(Values(v), (Row{4, 9}));
  // An index inside 0..size inserts there; any other appends.
  const struct {
    LongInt index;
    Row expected;
  } cases[] = {{0, {7, 1, 2}},       {1, {1, 7, 2}},
               {2, {1, 2, 7}},       {-1, {1, 2, 7}},
               {1000000, {1, 2, 7}}, {std::numeric_limits<LongInt>::min(), {1, 2, 7}}};
  for (const auto& c : cases) {
    auto w = Vec<TypeParam>({1, 2});
    AddValue2Vector(w, 7, c.index);
    EXPECT_EQ(Values(w), c.expected) << "index " << c.index;
  }
  std::vector<TypeParam> empty;
  AddValue2Vector(empty, 7, -5);
  EXPECT_EQ(Values(empty), (Row{7}));
  auto d = Vec<TypeParam>({1, 2, 3});
  for (LongInt index : {0, 2, -1}) DeleteValueFromVector(d, index);  // the last two are outside
  EXPECT_EQ(Values(d), (Row{2, 3}));
  DeleteValueFromVector(d, 1);
  DeleteValueFromVector(d, 0);
  EXPECT_TRUE(d.empty());
  EXPECT_EQ(d.capacity(), 0u);  // the storage is released, not merely resized
}

TOVRIN_TYPED_SUITE(VectorAggregate, testing::AllElements);

TYPED_TEST(VectorAggregate, ExtremesSumsAndEmptiness) {
  const auto v = Vec<TypeParam>({3, 1, 4, 1, 5});
  EXPECT_EQ(Extended(MaxVector(v)), 5);
  EXPECT_EQ(Extended(MinVector(v)), 1);
  EXPECT_EQ(SumVector(Vec<TypeParam>({100, 100, 27})), 227);
  EXPECT_EQ(SumSqVector(Vec<TypeParam>({3, 4, 10})), 125);
  decltype(MaxVector(v)) lo = 7, hi = 8;
  LongWord loIndex = 3, hiIndex = 4;
  bool loUnique = false, hiUnique = false;
  const std::vector<TypeParam> empty;
  ExpectRaises(rsVectorIsEmpty, [&] { MaxVector(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { MinVector(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { SumVector(empty); });
  ExpectRaises(rsVectorIsEmpty, [&] { SumSqVector(empty); });
  ExpectRaises(rsVectorIsEmpty,
               [&] { MinMaxVector(empty, lo, hi, loIndex, hiIndex, loUnique, hiUnique); });
  EXPECT_EQ(Extended(lo) + Extended(hi), 15);  // nothing written before the check
  EXPECT_EQ(loIndex + hiIndex, 7u);
  EXPECT_FALSE(loUnique || hiUnique);
  // The first position of each extreme, and whether it occurs once.
  MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(Extended(lo) * 10 + Extended(hi), 15);
  EXPECT_EQ(loIndex * 10 + hiIndex, 14u);
  EXPECT_FALSE(loUnique);
  EXPECT_TRUE(hiUnique);
  MinMaxVector(Vec<TypeParam>({2, 2, 2}), lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(loIndex + hiIndex, 0u);
  EXPECT_FALSE(loUnique || hiUnique);
}

TEST(VectorAggregate, ExtremesKeepTheTypeAndCompareExactly) {
  static_assert(std::is_same_v<decltype(MaxVector(TQENSingleVector{})), Single>);
  static_assert(std::is_same_v<decltype(MinVector(TQENWordVector{})), Word>);
  EXPECT_EQ(MaxVector(TQENFloatVector{2.0L, 2.0L + 1e-15L}), 2.0L + 1e-15L);
  EXPECT_EQ(MinVector(TQENSingleVector{1.0f, 1.0f - 1e-7f}), 1.0f - 1e-7f);
  EXPECT_EQ(MaxVector(TQENInt64Vector{INT64_MIN, INT64_MAX}), INT64_MAX);
  Extended lo, hi;
  LongWord loIndex, hiIndex;
  bool loUnique, hiUnique;
  MinMaxVector(TQENFloatVector{2.0L, 2.0L + 1e-15L}, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(hiIndex, 1u);
  EXPECT_TRUE(loUnique && hiUnique);
}

// The type rules of the sums: integers widen to a wrapping Int64, floats sum in Extended from
// the first element (a lone -0 stays -0); squares wrap at 32 bits (signed, or unsigned for
// LongWord) or 64 bits for Int64.
TEST(VectorSums, TypeRules) {
  static_assert(std::is_same_v<decltype(SumVector(TQENByteVector{})), Int64>);
  static_assert(std::is_same_v<decltype(SumVector(TQENSingleVector{})), Extended>);
  EXPECT_EQ(SumVector(TQENByteVector{200, 200}), 400);
  EXPECT_EQ(SumVector(TQENSIntVector{-128, -128, -128}), -384);
  EXPECT_EQ(SumVector(TQENLWordVector{4000000000u, 4000000000u}), 8000000000);
  EXPECT_EQ(SumVector(TQENLIntVector{INT32_MAX, INT32_MAX}), 4294967294);
  EXPECT_EQ(SumVector(TQENInt64Vector{INT64_MAX, 1}), INT64_MIN);
  EXPECT_EQ(SumVector(TQENSingleVector{16777216.0f, 1.0f, 1.0f}), 16777218.0L);
  EXPECT_EQ(SumVector(TQENDoubleVector{0x1p1023, 0x1p1023}), 0x1p1024L);
  EXPECT_EQ(SumVector(TQENFloatVector{1.0L, 0x1p-63L}), 1.0L + 0x1p-63L);
  EXPECT_TRUE(std::signbit(SumVector(TQENDoubleVector{-0.0})));
  EXPECT_TRUE(std::signbit(SumVector(TQENFloatVector{-0.0L, -0.0L})));
  EXPECT_EQ(SumSqVector(TQENWordVector{65535}), -131071);
  EXPECT_EQ(SumSqVector(TQENWordVector{46340}), 2147395600);
  EXPECT_EQ(SumSqVector(TQENLIntVector{-46341}), 2147488281 - 4294967296);
  EXPECT_EQ(SumSqVector(TQENLWordVector{65537}), 131073);  // 4295098369 mod 2^32
  EXPECT_EQ(SumSqVector(TQENLWordVector{65535}), 4294836225);
  EXPECT_EQ(SumSqVector(TQENByteVector{255, 255}), 130050);
  EXPECT_EQ(SumSqVector(TQENSmallIntVector{-32768}), 1073741824);
  EXPECT_EQ(SumSqVector(TQENInt64Vector{3037000500}), -9223372036709301616);
  EXPECT_EQ(SumSqVector(TQENDoubleVector{0x1p1000}), 0x1p2000L);
}

// The centre has the element type (32-bit wrapping differences and squares) or is Extended.
TEST(VectorSums, SquaredDifferencesFromACentre) {
  static_assert(std::is_same_v<decltype(SumSqDiffVector(TQENLIntVector{}, LongInt{})), Int64>);
  static_assert(std::is_same_v<decltype(SumSqDiffVector(TQENInt64Vector{}, 0.0L)), Extended>);
  EXPECT_EQ(SumSqDiffVector(TQENLWordVector{3}, LongWord{5}), 4);
  EXPECT_EQ(SumSqDiffVector(TQENLWordVector{0}, LongWord{65536}), 0);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{INT32_MIN}, LongInt{1}), 1);  // wraps to INT32_MAX
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{46341, 0}, LongInt{0}), 2147488281 - 4294967296);
  EXPECT_EQ(SumSqDiffVector(TQENInt64Vector{INT64_MIN}, Int64{1}), 1);
  EXPECT_EQ(SumSqDiffVector(TQENFloatVector{1, 2, 3}, 2.0L), 2.0L);
  EXPECT_EQ(SumSqDiffVector(TQENDoubleVector{0x1p1000, 0}, 0.0), 0x1p2000L);
  EXPECT_EQ(SumSqDiffVector(TQENSingleVector{0.5f}, 2.0f), 2.25L);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{1, 2}, 1.5L), 0.5L);
  EXPECT_EQ(SumSqDiffVector(TQENLIntVector{INT32_MIN}, 1.0L), 4611686022722355201.0L);
  EXPECT_EQ(SumSqDiffVector(TQENInt64Vector{INT64_MIN}, 0.0L), 0x1p126L);
  ExpectRaises(rsVectorIsEmpty, [] { SumSqDiffVector(TQENDoubleVector{}, 1.0); });
  ExpectRaises(rsVectorIsEmpty, [] { SumSqDiffVector(TQENLIntVector{}, 1.0L); });
}

// VectorNonNegative, VectorNegative, VectorNonZero, VectorZero, VectorNonPositive and
// VectorPositive as six 0/1 digits.
template <typename V>
std::string Signs(const V& v) {
  std::string s;
  for (bool b : {VectorNonNegative(v), VectorNegative(v), VectorNonZero(v), VectorZero(v),
                 VectorNonPositive(v), VectorPositive(v)}) {
    s += b ? '1' : '0';
  }
  return s;
}

TOVRIN_TYPED_SUITE(VectorSigns, testing::FloatElements);

TYPED_TEST(VectorSigns, ExactValuesAndTheTolerance) {
  const struct {
    std::initializer_list<long double> values;
    const char* signs;
  } cases[] = {{{1, 2}, "101001"},   {{-1, -2}, "011010"}, {{0, 0}, "100110"},
               {{0, 3}, "100000"},   {{-3, 0}, "000010"},  {{2, -3}, "001000"},
               {{1e-11L}, "101001"}, {{-1e-11L}, "011010"}};
  for (const auto& c : cases) EXPECT_EQ(Signs(Vec<TypeParam>(c.values)), c.signs);
  const std::vector<TypeParam> empty;
  for (auto f :
       {&VectorNonNegative<TypeParam>, &VectorNegative<TypeParam>, &VectorNonZero<TypeParam>,
        &VectorZero<TypeParam>, &VectorNonPositive<TypeParam>, &VectorPositive<TypeParam>}) {
    ExpectRaises(rsVectorIsEmpty, [&] { f(empty); });
  }
}

TEST(VectorSigns, SingleNonZeroIsExactAndInt64HasNoTolerance) {
  EXPECT_EQ(Signs(TQENSingleVector{1e-30f}), "101110");  // only VectorNonZero is exact
  EXPECT_EQ(Signs(TQENDoubleVector{1e-30}), "100110");
  EXPECT_EQ(Signs(TQENFloatVector{-1e-13L, 1e-13L}), "100110");
  EXPECT_FALSE(VectorNonZero(TQENSingleVector{1e-30f, 0.0f}));
  EXPECT_EQ(Signs(TQENInt64Vector{INT64_MIN}), "011010");
  EXPECT_EQ(Signs(TQENInt64Vector{INT64_MAX, 1}), "101001");
  EXPECT_EQ(Signs(TQENInt64Vector{0, 3}), "100000");
}

}  // namespace
}  // namespace tovrin
