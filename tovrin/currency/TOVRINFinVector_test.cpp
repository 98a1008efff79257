// Tests of the money vectors. Building, sorting, copying and the checks are the numeric
// vectors' algorithms (tovrin/detail, tested in tovrin/vector); here their wiring for the money
// types and the money rules: stored-integer order and equality, wrapping sums, the linear
// transform, the conversions element by element.
#include "tovrin/currency/TOVRINFinVector.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <string>
#include <type_traits>
#include <vector>

#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using namespace testing;
using Ints = std::vector<Int64>;

TOVRIN_TYPED_SUITE(MoneyVector, MoneyElements);

TYPED_TEST(MoneyVector, BuildingCopyingAndTheSameTypeConversion) {
  using T = TypeParam;
  auto v = MoneyVec<T>({1, 2});
  AddValue2Vector(v, Money<T>(7), 1);
  AddValue2Vector(v, Money<T>(8), -1);  // outside: appended
  AppendValue2Vector(v, Money<T>(-3));
  EXPECT_EQ(Stored(v), (Ints{1, 7, 2, 8, -3}));
  DeleteValueFromVector(v, 0);
  DeleteValueFromVector(v, 9);
  EXPECT_EQ(Stored(ReverseVector(v)), (Ints{-3, 8, 2, 7}));
  auto copy = CopyVector(v);
  EXPECT_NE(copy.data(), v.data());
  FillVector(v, Money<T>(-4));
  EXPECT_EQ(Stored(v), (Ints{-4, -4, -4, -4}));
  ClearVector(v);
  EXPECT_EQ(Stored(v), (Ints{0, 0, 0, 0}));
  EXPECT_EQ(Stored(copy), (Ints{7, 2, 8, -3}));
  std::vector<T> same;
  if constexpr (std::is_same_v<T, TQENCurrency>) same = Vector2QENCurrVector(copy);
  if constexpr (std::is_same_v<T, TQENLongCurrency>) same = Vector2QENLongCurrVector(copy);
  if constexpr (std::is_same_v<T, Currency>) same = Vector2QENCurrencyVector(copy);
  EXPECT_EQ(Stored(same), Stored(copy));
  EXPECT_NE(same.data(), copy.data());
}

TYPED_TEST(MoneyVector, ExtremesAndSumsOfStoredIntegers) {
  using T = TypeParam;
  const auto v = MoneyVec<T>({3, 1, 4, 1, 5});
  EXPECT_EQ(Stored(MaxVector(v)) * 10 + Stored(MinVector(v)), 51);
  T lo{}, hi{};
  LongWord loIndex = 9, hiIndex = 9;
  bool loUnique = true, hiUnique = false;
  MinMaxVector(v, lo, hi, loIndex, hiIndex, loUnique, hiUnique);
  EXPECT_EQ(Stored(lo) * 10 + Stored(hi), 15);
  EXPECT_EQ(loIndex * 10 + hiIndex, 14u);
  EXPECT_TRUE(!loUnique && hiUnique);
  EXPECT_EQ(Stored(SumVector(v)), 14);
  const auto a = MoneyVec<T>({1, -2, 300}), b = MoneyVec<T>({10, 20, -30});
  EXPECT_EQ(Stored(AddVectors(a, b)), (Ints{11, 18, 270}));
  EXPECT_EQ(Stored(SubtractVectors(a, b)), (Ints{-9, -22, 330}));
  auto c = a;
  AddToVector(c, b);
  SubtractFromVector(c, a);
  EXPECT_EQ(Stored(c), Stored(b));
  ExpectRaisesUntouched(rsSameDimensions, c, [](auto& x) { AddToVector(x, MoneyVec<T>({1})); });
  // Every function that needs an element raises before it writes anything.
  const std::vector<T> e;
  ExpectRaises(rsVectorIsEmpty, [&] { SumVector(e); });
  ExpectRaisesUntouched(rsVectorIsEmpty, e, [](auto& x) { LinearTransformVector(x, 2, 1); });
  lo = Money<T>(11);
  ExpectRaises(rsVectorIsEmpty,
               [&] { MinMaxVector(e, lo, hi, loIndex, hiIndex, loUnique, hiUnique); });
  EXPECT_EQ(Stored(lo), 11);
  EXPECT_EQ(loIndex, 1u);
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
  for (const auto& c : cases) {
    const auto v = MoneyVec<T>(c.stored);
    std::string s;
    for (bool b : {VectorNonNegative(v), VectorNegative(v), VectorNonZero(v), VectorZero(v),
                   VectorNonPositive(v), VectorPositive(v)}) {
      s += b ? '1' : '0';
    }
    EXPECT_EQ(s, c.expected);
  }
  ExpectRaises(rsVectorIsEmpty, [] { VectorNonZero(std::vector<T>{}); });
}

TYPED_TEST(MoneyVector, SortsAndRanksByStoredIntegers) {
  using T = TypeParam;
  auto v = MoneyVec<T>({3, 1, 2});
  QSortVector(v, true);
  EXPECT_EQ(Stored(v), (Ints{1, 2, 3}));
  QSortVector(v, false);
  EXPECT_EQ(Stored(v), (Ints{3, 2, 1}));
  // Neighbouring stored integers are different values, never ties.
  EXPECT_EQ(Vector2RankVector(MoneyVec<T>({2, 1, 2, 3}), true), (TQENLIntVector{1, 0, 1, 3}));
  EXPECT_EQ(Vector2RankVector(MoneyVec<T>({10, 30, 20}), false), (TQENLIntVector{2, 0, 1}));
  EXPECT_EQ(Vector2Rank(MoneyVec<T>({10, 30, 20}), 2, true), 1);
  EXPECT_EQ(Vector2RankValue(MoneyVec<T>({10, 30, 20}), Money<T>(30), false), 0);
  EXPECT_EQ(Vector2RankValue(MoneyVec<T>({10, 30, 20}), Money<T>(21), true), -1);
}

// --- Type-specific rules ----------------------------------------------------------------------

TEST(MoneyVectorWrapAround, SumsWrapAtTheStoredWidth) {
  // 32 bits for TQENCurrency: the sum is not widened to 64.
  EXPECT_EQ(Stored(SumVector(MoneyVec<TQENCurrency>({INT32_MAX, 1}))), INT32_MIN);
  EXPECT_EQ(Stored(SumVector(MoneyVec<TQENLongCurrency>({INT64_MAX, 1}))), INT64_MIN);
  EXPECT_EQ(Stored(SumVector(MoneyVec<Currency>({INT64_MIN, -1}))), INT64_MAX);
  EXPECT_EQ(Stored(AddVectors(MoneyVec<TQENCurrency>({INT32_MAX}), MoneyVec<TQENCurrency>({2}))),
            (Ints{INT32_MIN + 1}));
  EXPECT_EQ(
      Stored(SubtractVectors(MoneyVec<TQENCurrency>({INT32_MIN}), MoneyVec<TQENCurrency>({1}))),
      (Ints{INT32_MAX}));
  auto l = MoneyVec<TQENLongCurrency>({INT64_MAX});
  AddToVector(l, MoneyVec<TQENLongCurrency>({1}));
  EXPECT_EQ(Stored(l), (Ints{INT64_MIN}));
  auto c = MoneyVec<Currency>({INT64_MIN});
  SubtractFromVector(c, MoneyVec<Currency>({1}));
  EXPECT_EQ(Stored(c), (Ints{INT64_MAX}));
}

// x A + B in amounts, rounded half to even; overflow wraps unreported.
TEST(MoneyVectorLinearTransform, AmountsHalvesToEvenAndWrapping) {
  auto c = MoneyVec<Currency>({15000});
  LinearTransformVector(c, 2, 0.25L);
  EXPECT_EQ(Stored(c), (Ints{32500}));
  auto q = MoneyVec<TQENCurrency>({150});
  LinearTransformVector(q, 2, 0.25L);
  EXPECT_EQ(Stored(q), (Ints{325}));
  auto l = MoneyVec<TQENLongCurrency>({1500000});
  LinearTransformVector(l, 2, 0.25L);
  EXPECT_EQ(Stored(l), (Ints{3250000}));
  // Amounts 0.5 and 1.5 times 0.25 are 12.5 and 37.5 hundredths.
  q = MoneyVec<TQENCurrency>({50, 150, -50});
  LinearTransformVector(q, 0.25L, 0);
  EXPECT_EQ(Stored(q), (Ints{12, 38, -12}));
  l = MoneyVec<TQENLongCurrency>({1000000});
  LinearTransformVector(l, 0.0078125L, 0);  // 7812.5 millionths
  EXPECT_EQ(Stored(l), (Ints{7812}));
  c = MoneyVec<Currency>({1, 3, 5});
  LinearTransformVector(c, 0.5L, 0);  // 0.5, 1.5, 2.5 stored units
  EXPECT_EQ(Stored(c), (Ints{0, 2, 2}));
  c = MoneyVec<Currency>({0});
  LinearTransformVector(c, 1, 0.00065L);  // B is 6.5 stored units, rounded as converted
  EXPECT_EQ(Stored(c), (Ints{6}));
  // 10^10 hundredths keep their low 32 bits; 2 x 10^19 millionths wrap modulo 2^64; Currency
  // works on its stored integer: (2^63 - 1) x 2 = 2^64 - 2.
  q = MoneyVec<TQENCurrency>({1, 10000000});
  LinearTransformVector(q, 1000, 0);
  EXPECT_EQ(Stored(q), (Ints{1000, 10000000000 % 4294967296}));
  l = MoneyVec<TQENLongCurrency>({1, 5000000000000000000});
  LinearTransformVector(l, 4, 0);
  EXPECT_EQ(Stored(l), (Ints{4, 1553255926290448384}));
  c = MoneyVec<Currency>({INT64_MAX});
  LinearTransformVector(c, 2, 0);
  EXPECT_EQ(Stored(c), (Ints{-2}));
}

// Each conversion applies the scalar one of TOVRINFinancials (tested there) element by element.
TEST(MoneyVectorConversions, ElementByElement) {
  EXPECT_EQ(Values(Vector2FloatVector(MoneyVec<TQENCurrency>({12345, -1}))),
            (Row{123.45L, -0.01L}));
  EXPECT_EQ(Values(Vector2FloatVector(MoneyVec<TQENLongCurrency>({1500000}))), (Row{1.5L}));
  EXPECT_EQ(Values(Vector2FloatVector(MoneyVec<Currency>({-12346}))), (Row{-1.2346L}));
  EXPECT_TRUE(Vector2FloatVector(std::vector<Currency>{}).empty());
  // 0.125 is a true half of a hundredth; 2.675L x 100 rounds to 267.5 in Extended, as 0.00065L
  // x 10000 does to 6.5 (see TOVRINFinancials_reference.inc); 2^31 hundredths wrap.
  EXPECT_EQ(Stored(Vector2QENCurrVector(TQENFloatVector{0.125L, 2.675L, -0.125L, 21474836.48L})),
            (Ints{12, 268, -12, INT32_MIN}));
  EXPECT_EQ(Stored(Vector2QENLongCurrVector(TQENFloatVector{0.0078125L, 0.0000005L})),
            (Ints{7812, 0}));
  EXPECT_EQ(Stored(Vector2QENCurrencyVector(TQENFloatVector{0.00065L, 0.00015L})), (Ints{6, 2}));
  EXPECT_TRUE(Vector2QENCurrVector(TQENFloatVector{}).empty());
  EXPECT_EQ(Stored(Vector2QENLongCurrVector(MoneyVec<TQENCurrency>({-12345}))), (Ints{-123450000}));
  EXPECT_EQ(Stored(Vector2QENCurrencyVector(MoneyVec<TQENCurrency>({12345}))), (Ints{1234500}));
  EXPECT_EQ(Stored(Vector2QENCurrVector(MoneyVec<TQENLongCurrency>({15000, 25000, -25001}))),
            (Ints{2, 2, -3}));
  EXPECT_EQ(Stored(Vector2QENCurrencyVector(MoneyVec<TQENLongCurrency>({250, 350}))), (Ints{2, 4}));
  EXPECT_EQ(Stored(Vector2QENCurrVector(MoneyVec<Currency>({150, -50, 214748364750}))),
            (Ints{2, 0, INT32_MIN}));
  EXPECT_EQ(Stored(Vector2QENLongCurrVector(MoneyVec<Currency>({-15, INT64_MAX}))),
            (Ints{-1500, -100}));
}

}  // namespace
}  // namespace tovrin
