#include <algorithm>
#include <cfenv>
#include <cmath>
#include <cstring>
#include <functional>
#include <limits>
#include <random>
#include <string>
#include <utility>

#include <gtest/gtest.h>

#include "tovrin/detail/QuickSort.h"
#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/TOVRINVector_testing.h"

namespace tovrin {
namespace {

using testing::L;
using testing::Make;
using testing::Values;

// --- QSortVector ----------------------------------------------------------------------------

template <typename V>
class SortTest : public ::testing::Test {};
TYPED_TEST_SUITE(SortTest, testing::AllVectors);

TYPED_TEST(SortTest, SmallCases) {
  TypeParam v = Make<TypeParam>({3, 1, 2});
  QSortVector(v, true);
  EXPECT_EQ(Values(v), L({1, 2, 3}));
  QSortVector(v, false);
  EXPECT_EQ(Values(v), L({3, 2, 1}));
  TypeParam one = Make<TypeParam>({5});
  QSortVector(one, false);
  EXPECT_EQ(Values(one), L({5}));
  TypeParam empty;
  QSortVector(empty, true);
  EXPECT_TRUE(empty.empty());
}

// Random vectors with many repeats come out as std::sort orders them (the elements are
// values, so any correct order is the same sequence).
TYPED_TEST(SortTest, AgreesWithStdSortOnRandomVectors) {
  std::mt19937 gen(12345);
  for (int size : {2, 3, 7, 16, 100, 1000, 4097}) {
    for (int spread : {2, 50, 120}) {
      TypeParam v;
      std::uniform_int_distribution<int> pick(0, spread);
      for (int i = 0; i < size; ++i) v.push_back(typename TypeParam::value_type(pick(gen)));
      std::vector<Extended> expected = Values(v);
      std::sort(expected.begin(), expected.end());
      QSortVector(v, true);
      EXPECT_EQ(Values(v), expected) << size << " " << spread;
      std::reverse(expected.begin(), expected.end());
      QSortVector(v, false);
      EXPECT_EQ(Values(v), expected) << size << " " << spread;
    }
  }
}

TEST(SortTest, OrdersFloatsExactly) {
  TQENFloatVector v{1.0L + 0x1p-63L, 1.0L, -0x1p-16000L, 0.0L};
  QSortVector(v, true);
  EXPECT_EQ(Values(v), L({-0x1p-16000L, 0.0L, 1.0L, 1.0L + 0x1p-63L}));
  TQENInt64Vector w{INT64_MAX, INT64_MIN, 0, -1};
  QSortVector(w, false);
  EXPECT_EQ(w, (TQENInt64Vector{INT64_MAX, 0, -1, INT64_MIN}));
}

// Inputs that drive simple quick sorts to quadratic time or deep stacks must finish within
// the stack of Round(log2 N) + 2 entries (a deeper stack would raise). The organ pipe (rising
// then falling) is a quadratic case of the middle-element pivot, so it is kept small here.
// The insertion finish must give the plain partitioning's result to the bit, and the plain
// algorithm must still run where equal elements differ in their bits (-0 and +0, NaNs).
template <typename T>
std::vector<T> PlainQuickSort(std::vector<T> v, bool ascending) {
  T* data = v.data();
  detail::QuickSortPositions(
      static_cast<LongInt>(v.size()), ascending, [data](LongInt p) { return data[p - 1]; },
      [](T a, T b) { return a < b; },
      [data](LongInt p, LongInt q) { std::swap(data[p - 1], data[q - 1]); });
  return v;
}

template <typename T>
void ExpectSameBitsAsPlainSort(const std::vector<T>& input) {
  for (bool ascending : {true, false}) {
    std::vector<T> fast = input;
    QSortVector(fast, ascending);
    const std::vector<T> plain = PlainQuickSort(input, ascending);
    ASSERT_EQ(fast.size(), plain.size());
    EXPECT_EQ(0, std::memcmp(fast.data(), plain.data(), fast.size() * sizeof(T)))
        << "ascending " << ascending << ", n " << input.size();
  }
}

TEST(SortTest, InsertionFinishGivesThePlainResultBitForBit) {
  std::mt19937_64 rng(11);
  for (int size : {2, 3, 15, 16, 17, 18, 33, 100, 1000, 5000}) {
    std::uniform_int_distribution<int> few(-5, 5);
    TQENDoubleVector d(size), signed_zeros(size);
    TQENSingleVector f(size);
    TQENLIntVector i(size);
    TQENByteVector b(size);
    for (int k = 0; k < size; ++k) {
      d[k] = few(rng) * 0.5;
      signed_zeros[k] = few(rng) > 0 ? 0.0 : (few(rng) > 0 ? -0.0 : few(rng));
      f[k] = static_cast<Single>(few(rng));
      i[k] = few(rng) * 100000;
      b[k] = static_cast<Byte>(rng());
    }
    if (size > 5) d[3] = std::numeric_limits<Double>::quiet_NaN();
    ExpectSameBitsAsPlainSort(d);
    ExpectSameBitsAsPlainSort(signed_zeros);
    ExpectSameBitsAsPlainSort(f);
    ExpectSameBitsAsPlainSort(i);
    ExpectSameBitsAsPlainSort(b);
  }
}

TEST(SortTest, ExtendedKeysGiveThePlainResultBitForBit) {
  // Extended elements are compared through integer keys made from their bytes unless an
  // encoding the keys cannot order (NaN, pseudo-denormal, unnormal) is present.
  const auto packed = [](std::uint64_t mantissa, std::uint16_t signExponent) {
    unsigned char bytes[10];
    std::memcpy(bytes, &mantissa, 8);
    std::memcpy(bytes + 8, &signExponent, 2);
    PackedExtended x;
    std::memcpy(&x, bytes, 10);
    return x;
  };
  const PackedExtended odd[] = {
      Extended(std::numeric_limits<Extended>::quiet_NaN()),
      packed(0x8000000000000001ULL, 0x0000),  // pseudo-denormal, equal to a normal
      packed(0x4000000000000000ULL, 0x3FFF),  // unnormal
  };
  std::mt19937_64 rng(12);
  for (int size : {2, 17, 100, 1000, 5000}) {
    for (int variant = 0; variant <= 3; ++variant) {
      TQENFloatVector v(size);
      for (int k = 0; k < size; ++k) {
        switch (rng() % 6) {
          case 0:
            v[k] = rng() % 2 ? 0.0L : -0.0L;
            break;
          case 1:
            v[k] = 0x1p-16440L * static_cast<Extended>(rng() % 4) * (rng() % 2 ? 1 : -1);
            break;
          case 2:
            v[k] = rng() % 2 ? std::numeric_limits<Extended>::infinity()
                             : -std::numeric_limits<Extended>::infinity();
            break;
          case 3:
            v[k] = static_cast<Extended>(rng() % 5) - 2;
            break;
          default:
            v[k] = std::ldexp(static_cast<Extended>(rng()), static_cast<int>(rng() % 64) - 90) *
                   (rng() % 2 ? 1 : -1);
        }
      }
      if (variant > 0) v[static_cast<std::size_t>(size / 2)] = odd[variant - 1];
      ExpectSameBitsAsPlainSort(v);
    }
  }
}

TEST(SortTest, AdversarialShapesStayWithinTheStack) {
  const LongInt n = 200000;
  const LongInt organN = 3000;
  TQENLIntVector ascending(n), descending(n), equal(n, 7), sawtooth(n), organ(organN);
  for (LongInt i = 0; i < n; ++i) {
    ascending[i] = i;
    descending[i] = n - i;
    sawtooth[i] = i % 17;
  }
  for (LongInt i = 0; i < organN; ++i) organ[i] = std::min(i, organN - i);
  for (auto* v : {&ascending, &descending, &equal, &sawtooth, &organ}) {
    for (bool up : {true, false}) {
      TQENLIntVector w = *v;
      QSortVector(w, up);
      if (up) {
        EXPECT_TRUE(std::is_sorted(w.begin(), w.end()));
      } else {
        EXPECT_TRUE(std::is_sorted(w.rbegin(), w.rend()));
      }
    }
  }
}

TEST(SortTest, NaNsNeitherCrashNorLoseElements) {
  const Double nan = std::numeric_limits<Double>::quiet_NaN();
  TQENDoubleVector v{3, nan, 1, nan, 2, 0, nan};
  QSortVector(v, true);
  ASSERT_EQ(v.size(), 7u);
  EXPECT_EQ(std::count_if(v.begin(), v.end(), [](Double x) { return std::isnan(x); }), 3);
  std::vector<Double> numbers;
  for (Double x : v) {
    if (!std::isnan(x)) numbers.push_back(x);
  }
  std::sort(numbers.begin(), numbers.end());
  EXPECT_EQ(numbers, (std::vector<Double>{0, 1, 2, 3}));
}

// --- The shared quick sort ------------------------------------------------------------------

TEST(QuickSortPositionsTest, StackSizeIsRoundedLog2PlusTwo) {
  EXPECT_EQ(detail::QuickSortStackSize(2), 3);
  EXPECT_EQ(detail::QuickSortStackSize(3), 4);      // log2 3 = 1.58
  EXPECT_EQ(detail::QuickSortStackSize(5), 4);      // log2 5 = 2.32
  EXPECT_EQ(detail::QuickSortStackSize(1000), 12);  // log2 1000 = 9.97
  EXPECT_EQ(detail::QuickSortStackSize(1448), 12);  // log2 1448 = 10.4998
  EXPECT_EQ(detail::QuickSortStackSize(1449), 13);  // log2 1449 = 10.5008
}

// The size is rounded to the nearest integer even when the caller has set another rounding
// mode for its own arithmetic.
TEST(QuickSortPositionsTest, StackSizeIgnoresTheRoundingMode) {
  struct RoundingModeGuard {
    int saved = std::fegetround();
    ~RoundingModeGuard() { std::fesetround(saved); }
  } guard;
  for (int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO}) {
    ASSERT_EQ(std::fesetround(mode), 0);
    EXPECT_EQ(detail::QuickSortStackSize(3), 4) << mode;      // log2 3 = 1.58
    EXPECT_EQ(detail::QuickSortStackSize(5), 4) << mode;      // log2 5 = 2.32
    EXPECT_EQ(detail::QuickSortStackSize(1449), 13) << mode;  // log2 1449 = 10.5008
  }
}

// Positions keyed by a number, carrying a tag: the exchanges are those of the Hoare scheme
// traced by hand, equal keys included (they are swapped, so the sort is not stable).
TEST(QuickSortPositionsTest, ExchangesAsTracedByHand) {
  auto sortTagged = [](std::vector<std::pair<int, char>> items, bool ascending) {
    auto* data = items.data();
    detail::QuickSortPositions(
        static_cast<LongInt>(items.size()), ascending,
        [data](LongInt p) { return data[p - 1].first; }, [](int a, int b) { return a < b; },
        [data](LongInt p, LongInt q) { std::swap(data[p - 1], data[q - 1]); });
    std::string tags;
    for (const auto& item : items) tags += item.second;
    return tags;
  };
  // Two equal keys: the pivot stops both scans at once, and the pair is exchanged.
  EXPECT_EQ(sortTagged({{1, 'a'}, {1, 'b'}}, true), "ba");
  // [3, 1, 2]: pivot 1; 3 and 1 exchange, then (2, 3) is pushed and [3, 2] exchanged.
  EXPECT_EQ(sortTagged({{3, 'a'}, {1, 'b'}, {2, 'c'}}, true), "bca");
  // Three equal keys: pivot at 2; (1,3) exchange, then 2 with itself; the left part is [1, 1].
  EXPECT_EQ(sortTagged({{5, 'a'}, {5, 'b'}, {5, 'c'}}, true), "cba");
  EXPECT_EQ(sortTagged({{1, 'a'}, {3, 'b'}, {2, 'c'}}, false), "bca");
}

TEST(QuickSortPositionsTest, SortsRowsOfAnotherContainerByAKey) {
  std::vector<std::vector<int>> rows{{3, 0}, {1, 1}, {2, 2}, {1, 3}};
  detail::QuickSortPositions(
      4, false, [&](LongInt p) { return rows[p - 1][0]; }, std::less<int>(),
      [&](LongInt p, LongInt q) { std::swap(rows[p - 1], rows[q - 1]); });
  EXPECT_EQ(rows[0][0], 3);
  EXPECT_EQ(rows[1][0], 2);
  EXPECT_EQ(rows[2][0] + rows[3][0], 2);
}

// --- Ranks ----------------------------------------------------------------------------------

template <typename V>
class RankTest : public ::testing::Test {};
TYPED_TEST_SUITE(RankTest, testing::AllVectors);

TYPED_TEST(RankTest, SmallCases) {
  const TypeParam v = Make<TypeParam>({10, 30, 20});
  EXPECT_EQ(Vector2RankVector(v, true), (TQENLIntVector{0, 2, 1}));
  EXPECT_EQ(Vector2RankVector(v, false), (TQENLIntVector{2, 0, 1}));
  EXPECT_EQ(Vector2RankVector(Make<TypeParam>({5, 3, 5}), true), (TQENLIntVector{1, 0, 1}));
  EXPECT_EQ(Vector2RankVector(Make<TypeParam>({5, 3, 5}), false), (TQENLIntVector{0, 2, 0}));
  EXPECT_EQ(Vector2RankVector(Make<TypeParam>({2, 2, 2}), true), (TQENLIntVector{0, 0, 0}));
  EXPECT_EQ(Vector2Rank(v, 3, true), -1);
  EXPECT_EQ(Vector2Rank(v, 4000000000u, true), -1);
  EXPECT_EQ(Vector2Rank(v, 2, true), 1);
  EXPECT_EQ(Vector2Rank(v, 1, false), 0);
  EXPECT_EQ(Vector2RankValue(v, 25, true), -1);
  EXPECT_EQ(Vector2RankValue(v, 30, false), 0);
  EXPECT_EQ(Vector2RankValue(v, 30, true), 2);
  EXPECT_EQ(Vector2RankValue(v, 5, true), -1);
  EXPECT_EQ(Vector2RankValue(v, 40, false), -1);
  const TypeParam unchanged = v;
  Vector2RankVector(v, true);
  EXPECT_EQ(v, unchanged);
}

TYPED_TEST(RankTest, EmptyVector) {
  const TypeParam empty;
  EXPECT_TRUE(Vector2RankVector(empty, true).empty());
  EXPECT_EQ(Vector2Rank(empty, 0, true), -1);
  EXPECT_EQ(Vector2RankValue(empty, 0, false), -1);
}

TEST(RankTest, FloatValuesWithinTheToleranceShareARank) {
  const TQENFloatVector v{10, 30, 20};
  EXPECT_EQ(Vector2RankValue(v, 20.0L + 1e-11L, true), 1);  // relative difference 5e-13
  EXPECT_EQ(Vector2RankValue(v, 20.0L + 1e-9L, true), -1);
  EXPECT_EQ(Vector2RankVector(TQENFloatVector{1.0L + 1e-13L, 1.0L, 5.0L}, true),
            (TQENLIntVector{0, 0, 2}));
  // Single compares at its own, coarser precision; Double and Extended do not see the tie.
  EXPECT_EQ(Vector2RankVector(TQENSingleVector{1.000001f, 1.0f}, true), (TQENLIntVector{0, 0}));
  EXPECT_EQ(Vector2RankVector(TQENDoubleVector{1.000001, 1.0}, true), (TQENLIntVector{1, 0}));
  // Signed zeros and a value within the tolerance of zero are one group.
  EXPECT_EQ(Vector2RankVector(TQENDoubleVector{1e-13, -0.0, 0.0, -1}, false),
            (TQENLIntVector{0, 0, 0, 3}));
}

// The first-match scan of the sorted copy, written out plainly: the definition of a rank.
template <typename V, typename Equal>
TQENLIntVector ScannedRanks(const V& v, bool ascending, Equal equal) {
  V sorted = v;
  QSortVector(sorted, ascending);
  TQENLIntVector ranks(v.size(), 0);
  for (std::size_t i = 0; i < v.size(); ++i) {
    for (std::size_t j = 0; j < sorted.size(); ++j) {
      if (equal(sorted[j], v[i])) {
        ranks[i] = static_cast<LongInt>(j);
        break;
      }
    }
  }
  return ranks;
}

// Values crowded around a few centres (near 0, near 1 where the tolerance turns relative,
// and large ones), each nudged by multiples of `step` so that chains of near-ties straddle
// the tolerance.
template <typename V>
V CrowdedValues(std::mt19937& gen, std::size_t n, long double step) {
  const long double centres[] = {0.0L, 1.0L, -1.0L, 0.5L, 3.0L, -250.0L, 1e6L, 7.25e9L};
  std::uniform_int_distribution<int> centre(0, 7), nudge(-12, 12);
  V v;
  for (std::size_t i = 0; i < n; ++i) {
    const long double c = centres[centre(gen)];
    const long double scale = std::max(1.0L, std::fabs(c));
    v.push_back(
        static_cast<detail::ValueOf<typename V::value_type>>(c + nudge(gen) * step * scale));
  }
  return v;
}

TEST(RankTest, MatchesTheFirstMatchScanOnCrowdedFloats) {
  std::mt19937 gen(2024);
  for (int round = 0; round < 30; ++round) {
    const std::size_t n = 1 + gen() % 400;
    for (bool up : {true, false}) {
      const auto g = CrowdedValues<TQENFloatVector>(gen, n, 1e-12L);
      EXPECT_EQ(Vector2RankVector(g, up),
                ScannedRanks(g, up, [](Extended a, Extended b) { return SameFloat(a, b); }));
      const auto d = CrowdedValues<TQENDoubleVector>(gen, n, 1e-12L);
      EXPECT_EQ(Vector2RankVector(d, up),
                ScannedRanks(d, up, [](Double a, Double b) { return SameFloat(a, b); }));
      const auto f = CrowdedValues<TQENSingleVector>(gen, n, 1e-6L);
      EXPECT_EQ(Vector2RankVector(f, up),
                ScannedRanks(f, up, [](Single a, Single b) { return SameFloat(a, b); }));
      const TQENLIntVector expected =
          ScannedRanks(d, up, [](Double a, Double b) { return SameFloat(a, b); });
      for (std::size_t k = 0; k < n; k += 7) {
        EXPECT_EQ(Vector2Rank(d, static_cast<LongWord>(k), up), expected[k]);
        EXPECT_EQ(Vector2RankValue(d, d[k], up), expected[k]);
      }
    }
  }
}

TEST(RankTest, MatchesTheFirstMatchScanOnIntegers) {
  std::mt19937 gen(77);
  for (int round = 0; round < 30; ++round) {
    const std::size_t n = 1 + gen() % 300;
    TQENLIntVector li;
    TQENByteVector b;
    TQENInt64Vector j;
    for (std::size_t i = 0; i < n; ++i) {
      li.push_back(static_cast<LongInt>(gen() % 40) - 20);
      b.push_back(static_cast<Byte>(gen() % 9));
      j.push_back(static_cast<Int64>(gen() % 5) * (INT64_MAX / 4));
    }
    for (bool up : {true, false}) {
      auto same = [](auto a, auto b) { return a == b; };
      EXPECT_EQ(Vector2RankVector(li, up), ScannedRanks(li, up, same));
      EXPECT_EQ(Vector2RankVector(b, up), ScannedRanks(b, up, same));
      EXPECT_EQ(Vector2RankVector(j, up), ScannedRanks(j, up, same));
      EXPECT_EQ(Vector2RankValue(li, 21, up), -1);
    }
  }
}

// A NaN is equal to nothing, so it keeps rank 0 in the rank vector and has no rank of its
// own; the other elements are ranked as the scan ranks them.
TEST(RankTest, NaNsAreRankedByTheScan) {
  const Double nan = std::numeric_limits<Double>::quiet_NaN();
  std::mt19937 gen(5);
  for (int round = 0; round < 20; ++round) {
    TQENDoubleVector v = CrowdedValues<TQENDoubleVector>(gen, 60, 1e-12L);
    v[gen() % v.size()] = nan;
    v[gen() % v.size()] = nan;
    for (bool up : {true, false}) {
      EXPECT_EQ(Vector2RankVector(v, up),
                ScannedRanks(v, up, [](Double a, Double b) { return SameFloat(a, b); }));
      EXPECT_EQ(Vector2RankValue(v, nan, up), -1);
    }
  }
}

}  // namespace
}  // namespace tovrin
