#include "tovrin/currency/TOVRINFinVector.h"

#include <gtest/gtest.h>

#include "tovrin/testing/TOVRIN_testing.h"

#include <algorithm>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <string>
#include <type_traits>
#include <utility>
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
class MoneyVector : public ::testing::Test {};
using MoneyTypes = ::testing::Types<TQENCurrency, TQENLongCurrency, Currency>;
TYPED_TEST_SUITE(MoneyVector, MoneyTypes);

TYPED_TEST(MoneyVector, BuildingFollowsTheIndexRules) {
  using T = TypeParam;
  auto v = Vec<T>({1, 2});
  AddValue2Vector(v, M<T>(7), 0);
  EXPECT_EQ(StoredOf(v), (Ints{7, 1, 2}));
  v = Vec<T>({1, 2});
  AddValue2Vector(v, M<T>(7), 1);
  EXPECT_EQ(StoredOf(v), (Ints{1, 7, 2}));
  for (const LongInt index : {2, -1, 1000000}) {
    v = Vec<T>({1, 2});
    AddValue2Vector(v, M<T>(7), index);
    EXPECT_EQ(StoredOf(v), (Ints{1, 2, 7})) << index;
  }
  std::vector<T> e;
  AddValue2Vector(e, M<T>(7), 5);
  EXPECT_EQ(StoredOf(e), (Ints{7}));
  AppendValue2Vector(e, M<T>(-3));
  EXPECT_EQ(StoredOf(e), (Ints{7, -3}));
  v = Vec<T>({1, 2});
  DeleteValueFromVector(v, 2);
  EXPECT_EQ(StoredOf(v), (Ints{1, 2}));
  DeleteValueFromVector(v, -1);
  EXPECT_EQ(StoredOf(v), (Ints{1, 2}));
  v = Vec<T>({1, 2, 3});
  DeleteValueFromVector(v, 0);
  EXPECT_EQ(StoredOf(v), (Ints{2, 3}));
  v = Vec<T>({5});
  DeleteValueFromVector(v, 0);
  EXPECT_TRUE(v.empty());
}

TYPED_TEST(MoneyVector, ExtremesCompareStoredIntegers) {
  using T = TypeParam;
  const auto v = Vec<T>({3, 1, 4, 1, 5});
  EXPECT_EQ(detail::StoredOf(MaxVector(v)), 5);
  EXPECT_EQ(detail::StoredOf(MinVector(v)), 1);
  T lo{}, hi{};
  LongWord loIndex = 9, hiIndex = 9;
  bool loUnique = true, hiUnique = false;
  MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(detail::StoredOf(lo), 1);
  EXPECT_EQ(loIndex, 1u);
  EXPECT_FALSE(loUnique);
  EXPECT_EQ(detail::StoredOf(hi), 5);
  EXPECT_EQ(hiIndex, 4u);
  EXPECT_TRUE(hiUnique);
  MinMaxVector(Vec<T>({-2, -2}), lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(detail::StoredOf(lo), -2);
  EXPECT_EQ(loIndex, 0u);
  EXPECT_FALSE(loUnique);
  EXPECT_FALSE(hiUnique);
}

TYPED_TEST(MoneyVector, EmptyVectorsRaiseBeforeAnything) {
  using T = TypeParam;
  const std::vector<T> e;
  ExpectRaises(rsVectorIsEmpty, [&] { MaxVector(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { MinVector(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { SumVector(e); });
  T lo = M<T>(11), hi = M<T>(12);
  LongWord i1 = 3, i2 = 4;
  bool u1 = false, u2 = false;
  ExpectRaises(rsVectorIsEmpty, [&] { MinMaxVector(e, lo, hi, i1, i2, u1, u2); });
  EXPECT_EQ(detail::StoredOf(lo), 11);
  EXPECT_EQ(i1, 3u);
  ExpectRaises(rsVectorIsEmpty, [&] { VectorNonNegative(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { VectorNegative(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { VectorNonPositive(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { VectorNonZero(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { VectorZero(e); });
  ExpectRaises(rsVectorIsEmpty, [&] { VectorPositive(e); });
  std::vector<T> w;
  ExpectRaises(rsVectorIsEmpty, [&] { LinearTransformVector(w, 2, 1); });
  EXPECT_TRUE(w.empty());
}

// VectorNonNegative, VectorNegative, VectorNonZero, VectorZero, VectorNonPositive and
// VectorPositive as six 0/1 digits. The smallest stored unit is beyond the tolerance for every
// type, Currency included.
TYPED_TEST(MoneyVector, SignPredicates) {
  using T = TypeParam;
  const struct {
    std::initializer_list<Int64> stored;
    const char* expected;
  } cases[] = {{{-1, -7}, "011010"}, {{0, 0}, "100110"}, {{1, 7}, "101001"}, {{0, 1}, "100000"}};
  for (const auto& [stored, expected] : cases) {
    const auto v = Vec<T>(stored);
    std::string s;
    for (bool b : {VectorNonNegative(v), VectorNegative(v), VectorNonZero(v), VectorZero(v),
                   VectorNonPositive(v), VectorPositive(v)}) {
      s += b ? '1' : '0';
    }
    EXPECT_EQ(s, expected);
  }
}

TYPED_TEST(MoneyVector, SortsAndRanksByStoredIntegers) {
  using T = TypeParam;
  auto v = Vec<T>({3, 1, 2});
  QSortVector(v, true);
  EXPECT_EQ(StoredOf(v), (Ints{1, 2, 3}));
  QSortVector(v, false);
  EXPECT_EQ(StoredOf(v), (Ints{3, 2, 1}));
  // A reference scan: a longer vector sorts to the order std::sort gives.
  std::vector<Int64> raw;
  for (Int64 k = 0; k < 300; ++k) raw.push_back((k * 7919) % 101 - 50);
  std::vector<T> big;
  for (const Int64 s : raw) big.push_back(M<T>(s));
  QSortVector(big, true);
  std::sort(raw.begin(), raw.end());
  EXPECT_EQ(StoredOf(big), raw);

  EXPECT_EQ(Vector2RankVector(Vec<T>({10, 30, 20}), true), (TQENLIntVector{0, 2, 1}));
  EXPECT_EQ(Vector2RankVector(Vec<T>({10, 30, 20}), false), (TQENLIntVector{2, 0, 1}));
  EXPECT_EQ(Vector2RankVector(Vec<T>({5, 3, 5}), true), (TQENLIntVector{1, 0, 1}));
  EXPECT_EQ(Vector2RankVector(Vec<T>({2, 2, 2}), true), (TQENLIntVector{0, 0, 0}));
  // Neighbouring stored integers are different values, never ties.
  EXPECT_EQ(Vector2RankVector(Vec<T>({2, 1, 2, 3}), true), (TQENLIntVector{1, 0, 1, 3}));
  EXPECT_TRUE(Vector2RankVector(std::vector<T>{}, true).empty());
  EXPECT_EQ(Vector2Rank(Vec<T>({10, 30, 20}), 3, true), -1);
  EXPECT_EQ(Vector2Rank(Vec<T>({10, 30, 20}), 2, true), 1);
  EXPECT_EQ(Vector2RankValue(Vec<T>({10, 30, 20}), M<T>(25), true), -1);
  EXPECT_EQ(Vector2RankValue(Vec<T>({10, 30, 20}), M<T>(30), false), 0);
  EXPECT_EQ(Vector2RankValue(Vec<T>({10, 30, 20}), M<T>(21), true), -1);
  EXPECT_EQ(Vector2RankValue(std::vector<T>{}, M<T>(0), true), -1);
}

TYPED_TEST(MoneyVector, SumsAndDifferencesOfEqualLengths) {
  using T = TypeParam;
  const auto a = Vec<T>({1, -2, 300}), b = Vec<T>({10, 20, -30});
  EXPECT_EQ(StoredOf(AddVectors(a, b)), (Ints{11, 18, 270}));
  EXPECT_EQ(StoredOf(SubtractVectors(a, b)), (Ints{-9, -22, 330}));
  auto c = a;
  AddToVector(c, b);
  EXPECT_EQ(StoredOf(c), (Ints{11, 18, 270}));
  SubtractFromVector(c, b);
  EXPECT_EQ(StoredOf(c), (Ints{1, -2, 300}));
  EXPECT_TRUE(AddVectors(std::vector<T>{}, std::vector<T>{}).empty());
  const auto shorter = Vec<T>({1, 2});
  ExpectRaises(rsSameDimensions, [&] { AddVectors(a, shorter); });
  ExpectRaises(rsSameDimensions, [&] { SubtractVectors(a, shorter); });
  ExpectRaises(rsSameDimensions, [&] { AddToVector(c, shorter); });
  ExpectRaises(rsSameDimensions, [&] { SubtractFromVector(c, shorter); });
  EXPECT_EQ(StoredOf(c), (Ints{1, -2, 300}));
  EXPECT_EQ(detail::StoredOf(SumVector(a)), 299);
}

TYPED_TEST(MoneyVector, FillClearReverseCopy) {
  using T = TypeParam;
  auto v = Vec<T>({1, 2, 3});
  EXPECT_EQ(StoredOf(ReverseVector(v)), (Ints{3, 2, 1}));
  EXPECT_EQ(StoredOf(v), (Ints{1, 2, 3}));
  auto copy = CopyVector(v);
  EXPECT_NE(copy.data(), v.data());
  FillVector(v, M<T>(-4));
  EXPECT_EQ(StoredOf(v), (Ints{-4, -4, -4}));
  EXPECT_EQ(StoredOf(copy), (Ints{1, 2, 3}));
  ClearVector(v);
  EXPECT_EQ(StoredOf(v), (Ints{0, 0, 0}));
  EXPECT_TRUE(ReverseVector(std::vector<T>{}).empty());
}

TYPED_TEST(MoneyVector, ConversionsToTheSameTypeCopy) {
  using T = TypeParam;
  const auto v = Vec<T>({5, -6});
  std::vector<T> same;
  if constexpr (std::is_same_v<T, TQENCurrency>) same = Vector2QENCurrVector(v);
  if constexpr (std::is_same_v<T, TQENLongCurrency>) same = Vector2QENLongCurrVector(v);
  if constexpr (std::is_same_v<T, Currency>) same = Vector2QENCurrencyVector(v);
  EXPECT_EQ(StoredOf(same), (Ints{5, -6}));
  EXPECT_NE(same.data(), v.data());
}

// --- Type-specific rules ----------------------------------------------------------------------

TEST(MoneyVectorWrapAround, SumsWrapAtTheStoredWidth) {
  // 32 bits for TQENCurrency: the sum is not widened to 64.
  EXPECT_EQ(detail::StoredOf(SumVector(Vec<TQENCurrency>({INT32_MAX, 1}))), INT32_MIN);
  EXPECT_EQ(detail::StoredOf(SumVector(Vec<TQENLongCurrency>({INT64_MAX, 1}))), INT64_MIN);
  EXPECT_EQ(detail::StoredOf(SumVector(Vec<Currency>({INT64_MIN, -1}))), INT64_MAX);
  EXPECT_EQ(StoredOf(AddVectors(Vec<TQENCurrency>({INT32_MAX}), Vec<TQENCurrency>({2}))),
            (Ints{INT32_MIN + 1}));
  EXPECT_EQ(StoredOf(SubtractVectors(Vec<TQENCurrency>({INT32_MIN}), Vec<TQENCurrency>({1}))),
            (Ints{INT32_MAX}));
  auto l = Vec<TQENLongCurrency>({INT64_MAX});
  AddToVector(l, Vec<TQENLongCurrency>({1}));
  EXPECT_EQ(StoredOf(l), (Ints{INT64_MIN}));
  auto c = Vec<Currency>({INT64_MIN});
  SubtractFromVector(c, Vec<Currency>({1}));
  EXPECT_EQ(StoredOf(c), (Ints{INT64_MAX}));
}

TEST(MoneyVectorLinearTransform, WorksInAmounts) {
  // Currency [1.5] with A = 2 and B = 0.25 (an amount) gives [3.25].
  auto c = Vec<Currency>({15000});
  LinearTransformVector(c, 2, 0.25L);
  EXPECT_EQ(StoredOf(c), (Ints{32500}));
  auto q = Vec<TQENCurrency>({150});
  LinearTransformVector(q, 2, 0.25L);
  EXPECT_EQ(StoredOf(q), (Ints{325}));
  auto l = Vec<TQENLongCurrency>({1500000});
  LinearTransformVector(l, 2, 0.25L);
  EXPECT_EQ(StoredOf(l), (Ints{3250000}));
}

TEST(MoneyVectorLinearTransform, HalvesGoToEven) {
  // Amounts 0.5 and 1.5 times 0.25 are 12.5 and 37.5 hundredths.
  auto q = Vec<TQENCurrency>({50, 150, -50});
  LinearTransformVector(q, 0.25L, 0);
  EXPECT_EQ(StoredOf(q), (Ints{12, 38, -12}));
  auto l = Vec<TQENLongCurrency>({1000000});
  LinearTransformVector(l, 0.0078125L, 0);  // 7812.5 millionths
  EXPECT_EQ(StoredOf(l), (Ints{7812}));
  auto c = Vec<Currency>({1, 3, 5});
  LinearTransformVector(c, 0.5L, 0);  // 0.5, 1.5, 2.5 stored units
  EXPECT_EQ(StoredOf(c), (Ints{0, 2, 2}));
}

TEST(MoneyVectorLinearTransform, OverflowWrapsUnreported) {
  // 10^10 hundredths keep their low 32 bits; 2 x 10^19 millionths wrap modulo 2^64.
  auto q = Vec<TQENCurrency>({1, 10000000});
  LinearTransformVector(q, 1000, 0);
  EXPECT_EQ(StoredOf(q), (Ints{1000, 10000000000 % 4294967296}));
  auto l = Vec<TQENLongCurrency>({1, 5000000000000000000});
  LinearTransformVector(l, 4, 0);
  EXPECT_EQ(StoredOf(l), (Ints{4, 1553255926290448384}));
  // 0.00065 as B: 6.5 stored units round to 6, as the conversion rounds it.
  auto b = Vec<Currency>({0});
  LinearTransformVector(b, 1, 0.00065L);
  EXPECT_EQ(StoredOf(b), (Ints{6}));
  // Currency works on its stored integer and wraps unreported: (2^63 - 1) x 2 = 2^64 - 2.
  auto c = Vec<Currency>({INT64_MAX});
  LinearTransformVector(c, 2, 0);
  EXPECT_EQ(StoredOf(c), (Ints{-2}));
}

TEST(MoneyVectorConversions, ToFloatDividesByTheScale) {
  const TQENFloatVector f = Vector2FloatVector(Vec<TQENCurrency>({12345, -1}));
  ASSERT_EQ(f.size(), 2u);
  EXPECT_EQ(Extended(f[0]), 123.45L);
  EXPECT_EQ(Extended(f[1]), -0.01L);
  EXPECT_EQ(Extended(Vector2FloatVector(Vec<TQENLongCurrency>({1500000}))[0]), 1.5L);
  EXPECT_EQ(Extended(Vector2FloatVector(Vec<Currency>({-12346}))[0]), -1.2346L);
  EXPECT_TRUE(Vector2FloatVector(std::vector<Currency>{}).empty());
}

TEST(MoneyVectorConversions, FromFloatRoundsTheExtendedProduct) {
  const TQENFloatVector f{1.23456L};
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(f)), (Ints{12346}));
  // 0.125 is a true half of a hundredth; 2.675L x 100 rounds to 267.5 in Extended, as 0.00065L
  // x 10000 does to 6.5 (see TOVRINFinancials_reference.inc).
  const TQENFloatVector g{0.125L, 0.375L, 2.675L, -0.125L};
  EXPECT_EQ(StoredOf(Vector2QENCurrVector(g)), (Ints{12, 38, 268, -12}));
  EXPECT_EQ(StoredOf(Vector2QENLongCurrVector(TQENFloatVector{0.0078125L, 0.0000005L})),
            (Ints{7812, 0}));
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(TQENFloatVector{0.00065L, 0.00035L})), (Ints{6, 4}));
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(TQENFloatVector{0.000025L, 0.00015L})), (Ints{0, 2}));
  EXPECT_TRUE(Vector2QENCurrVector(TQENFloatVector{}).empty());
  // Overflow wraps as everywhere in money: 2^31 hundredths become -2^31.
  EXPECT_EQ(StoredOf(Vector2QENCurrVector(TQENFloatVector{1, 21474836.48L})),
            (Ints{100, INT32_MIN}));
}

TEST(MoneyVectorConversions, FloatToCurrencyOverflowIsNotReported) {
  // The Currency conversion is a rounding of x x 10000 whose overflow is not reported: 1e20
  // stored units wrap modulo 2^64 to 1e20 - 5 x 2^64 (exact integer arithmetic).
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(TQENFloatVector{1e16L, -1e16L})),
            (Ints{7766279631452241920, -7766279631452241920}));
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(
                TQENFloatVector{std::numeric_limits<Extended>::quiet_NaN()})),
            (Ints{INT64_MIN}));
  // Amounts that fit are still rounded exactly: 1/32 and 3/32 are 312.5 and 937.5 units.
  EXPECT_EQ(
      StoredOf(Vector2QENCurrencyVector(TQENFloatVector{922337203685477.25L, -0.03125L, 0.09375L})),
      (Ints{9223372036854772500, -312, 938}));
}

TEST(MoneyVectorConversions, BetweenMoneyTypes) {
  EXPECT_EQ(StoredOf(Vector2QENLongCurrVector(Vec<TQENCurrency>({-12345}))), (Ints{-123450000}));
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(Vec<TQENCurrency>({12345}))), (Ints{1234500}));
  EXPECT_EQ(StoredOf(Vector2QENCurrVector(Vec<TQENLongCurrency>({15000, 25000, -25001}))),
            (Ints{2, 2, -3}));
  EXPECT_EQ(StoredOf(Vector2QENCurrencyVector(Vec<TQENLongCurrency>({250, 350}))), (Ints{2, 4}));
  EXPECT_EQ(StoredOf(Vector2QENCurrVector(Vec<Currency>({150, -50}))), (Ints{2, 0}));
  EXPECT_EQ(StoredOf(Vector2QENLongCurrVector(Vec<Currency>({-15}))), (Ints{-1500}));
  EXPECT_TRUE(Vector2QENLongCurrVector(std::vector<Currency>{}).empty());
  // Past the range: 2147483647.5 hundredths round to 2^31 and wrap; (2^63 - 1) x 100 wraps to -100.
  EXPECT_EQ(StoredOf(Vector2QENCurrVector(Vec<Currency>({214748364750}))), (Ints{INT32_MIN}));
  EXPECT_EQ(StoredOf(Vector2QENLongCurrVector(Vec<Currency>({INT64_MAX}))), (Ints{-100}));
}

}  // namespace
}  // namespace tovrin
