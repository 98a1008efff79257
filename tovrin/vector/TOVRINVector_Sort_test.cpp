// Tests of the quick sort and the ranks.
#include <algorithm>
#include <cfenv>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <random>
#include <string>
#include <utility>

#include "tovrin/detail/QuickSort.h"
#include "tovrin/testing/TOVRIN_testing.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using namespace testing;

TOVRIN_TYPED_SUITE(Sort, testing::RuleElements);

// Random vectors with many repeats come out as std::sort orders them; the empty and the
// one-element vectors are left alone.
TYPED_TEST(Sort, AgreesWithStdSort) {
  std::mt19937 gen(12345);
  for (int size : {0, 1, 2, 3, 7, 16, 100, 4097}) {
    for (int spread : {2, 120}) {
      std::vector<TypeParam> v;
      std::uniform_int_distribution<int> pick(0, spread);
      for (int i = 0; i < size; ++i) v.push_back(TypeParam(pick(gen)));
      Row expected = Values(v);
      std::sort(expected.begin(), expected.end());
      QSortVector(v, true);
      EXPECT_EQ(Values(v), expected) << size;
      std::reverse(expected.begin(), expected.end());
      QSortVector(v, false);
      EXPECT_EQ(Values(v), expected) << size;
    }
  }
}

TEST(Sort, OrdersExactlyAndKeepsNaNs) {
  TQENFloatVector v{1.0L + 0x1p-63L, 1.0L, -0x1p-16000L, 0.0L};
  QSortVector(v, true);
  EXPECT_EQ(Values(v), (Row{-0x1p-16000L, 0.0L, 1.0L, 1.0L + 0x1p-63L}));
  TQENInt64Vector w{INT64_MAX, INT64_MIN, 0, -1};
  QSortVector(w, false);
  EXPECT_EQ(w, (TQENInt64Vector{INT64_MAX, 0, -1, INT64_MIN}));
  const Double nan = std::numeric_limits<Double>::quiet_NaN();
  TQENDoubleVector n{3, nan, 1, nan, 2, 0, nan};
  QSortVector(n, true);
  std::vector<Double> numbers;
  for (Double x : n) {
    if (!std::isnan(x)) numbers.push_back(x);
  }
  std::sort(numbers.begin(), numbers.end());
  EXPECT_EQ(numbers, (std::vector<Double>{0, 1, 2, 3}));
  EXPECT_EQ(n.size(), 7u);
}

// The insertion finish gives the plain partitioning's result to the bit; where equal elements
// differ in their bits (-0 and +0, NaNs) the plain algorithm runs.
template <typename T>
void ExpectSameBitsAsPlainSort(const std::vector<T>& input) {
  for (bool ascending : {true, false}) {
    std::vector<T> fast = input;
    QSortVector(fast, ascending);
    std::vector<T> plain = input;
    T* data = plain.data();
    detail::QuickSortPositions(
        static_cast<LongInt>(plain.size()), ascending, [data](LongInt p) { return data[p - 1]; },
        [](T a, T b) { return a < b; },
        [data](LongInt p, LongInt q) { std::swap(data[p - 1], data[q - 1]); });
    EXPECT_TRUE(SameBits(fast, plain)) << "ascending " << ascending << ", n " << input.size();
  }
}

TEST(Sort, InsertionFinishGivesThePlainResultBitForBit) {
  std::mt19937_64 rng(11);
  for (int size : {2, 15, 16, 17, 18, 33, 1000, 5000}) {
    std::uniform_int_distribution<int> few(-5, 5);
    TQENDoubleVector d(size), signed_zeros(size);
    TQENLIntVector i(size);
    for (int k = 0; k < size; ++k) {
      d[k] = few(rng) * 0.5;
      signed_zeros[k] = few(rng) > 0 ? 0.0 : (few(rng) > 0 ? -0.0 : few(rng));
      i[k] = few(rng) * 100000;
    }
    if (size > 5) d[3] = std::numeric_limits<Double>::quiet_NaN();
    ExpectSameBitsAsPlainSort(d);
    ExpectSameBitsAsPlainSort(signed_zeros);
    ExpectSameBitsAsPlainSort(i);
  }
}

// Extended elements are compared through integer keys made from their bytes unless an encoding
// the keys cannot order (NaN, pseudo-denormal, unnormal) is present.
TEST(Sort, ExtendedKeysGiveThePlainResultBitForBit) {
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
        // Signed zeros, subnormals, infinities, small integers and values of many magnitudes.
        const Extended sign = rng() % 2 ? 1 : -1;
        const std::uint64_t kind = rng() % 6, r = rng();
        v[k] = kind == 0   ? sign * 0.0L
               : kind == 1 ? sign * 0x1p-16440L * static_cast<Extended>(r % 4)
               : kind == 2 ? sign * std::numeric_limits<Extended>::infinity()
               : kind == 3
                   ? static_cast<Extended>(r % 5) - 2
                   : sign * std::ldexp(static_cast<Extended>(r), static_cast<int>(rng() % 64) - 90);
      }
      if (variant > 0) v[static_cast<std::size_t>(size / 2)] = odd[variant - 1];
      ExpectSameBitsAsPlainSort(v);
    }
  }
}

// Shapes that drive simple quick sorts to deep stacks stay within Round(log2 N) + 2 entries
// (a deeper stack would raise). The organ pipe is quadratic for the middle pivot: kept small.
TEST(Sort, AdversarialShapesStayWithinTheStack) {
  const LongInt n = 200000, organN = 3000;
  TQENLIntVector ascending(n), equal(n, 7), sawtooth(n), organ(organN);
  for (LongInt i = 0; i < n; ++i) {
    ascending[i] = i;
    sawtooth[i] = i % 17;
  }
  for (LongInt i = 0; i < organN; ++i) organ[i] = std::min(i, organN - i);
  for (auto* v : {&ascending, &equal, &sawtooth, &organ}) {
    for (bool up : {true, false}) {
      TQENLIntVector w = *v;
      QSortVector(w, up);
      EXPECT_TRUE(up ? std::is_sorted(w.begin(), w.end()) : std::is_sorted(w.rbegin(), w.rend()));
    }
  }
}

// Round(log2 N) + 2 to the nearest integer whatever the caller's rounding mode.
TEST(QuickSortPositions, StackSize) {
  struct RoundingModeGuard {
    int saved = std::fegetround();
    ~RoundingModeGuard() { std::fesetround(saved); }
  } guard;
  for (int mode : {FE_TONEAREST, FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO}) {
    ASSERT_EQ(std::fesetround(mode), 0);
    const std::pair<LongInt, LongInt> cases[] = {{2, 3},     {3, 4},     {5, 4},
                                                 {1000, 12}, {1448, 12}, {1449, 13}};
    for (const auto& [n, size] : cases) EXPECT_EQ(detail::QuickSortStackSize(n), size) << n;
  }
}

// The exchanges of the Hoare scheme around the middle position, traced by hand with tags;
// equal keys stop both scans and are swapped, so the sort is not stable.
TEST(QuickSortPositions, ExchangesAsTracedByHand) {
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
  EXPECT_EQ(sortTagged({{1, 'a'}, {1, 'b'}}, true), "ba");
  EXPECT_EQ(sortTagged({{3, 'a'}, {1, 'b'}, {2, 'c'}}, true), "bca");
  EXPECT_EQ(sortTagged({{5, 'a'}, {5, 'b'}, {5, 'c'}}, true), "cba");
  EXPECT_EQ(sortTagged({{1, 'a'}, {3, 'b'}, {2, 'c'}}, false), "bca");
  // Even length: the pivot is position 2 of 1..4 (key 0, tag b); a and d exchange, b with
  // itself; then the part 3..4 (pivot a) exchanges a and c. The upper middle would give "bdca".
  EXPECT_EQ(sortTagged({{1, 'a'}, {0, 'b'}, {1, 'c'}, {0, 'd'}}, true), "dbac");
}

TOVRIN_TYPED_SUITE(Rank, testing::RuleElements);

TYPED_TEST(Rank, FirstPositionInTheSortedCopy) {
  const auto v = Vec<TypeParam>({10, 30, 20});
  const auto unchanged = v;
  EXPECT_EQ(Vector2RankVector(v, true), (TQENLIntVector{0, 2, 1}));
  EXPECT_EQ(Vector2RankVector(v, false), (TQENLIntVector{2, 0, 1}));
  EXPECT_TRUE(SameBits(v, unchanged));
  EXPECT_EQ(Vector2RankVector(Vec<TypeParam>({5, 3, 5}), false), (TQENLIntVector{0, 2, 0}));
  EXPECT_EQ(Vector2RankVector(Vec<TypeParam>({2, 2, 2}), true), (TQENLIntVector{0, 0, 0}));
  const struct {
    LongWord index;
    bool ascending;
    LongInt rank;
  } byIndex[] = {{3, true, -1}, {4000000000u, true, -1}, {2, true, 1}, {1, false, 0}};
  for (const auto& c : byIndex) EXPECT_EQ(Vector2Rank(v, c.index, c.ascending), c.rank);
  const struct {
    int value;
    bool ascending;
    LongInt rank;
  } byValue[] = {{25, true, -1}, {30, false, 0}, {30, true, 2}, {5, true, -1}, {40, false, -1}};
  for (const auto& c : byValue) EXPECT_EQ(Vector2RankValue(v, c.value, c.ascending), c.rank);
  const std::vector<TypeParam> empty;
  EXPECT_TRUE(Vector2RankVector(empty, true).empty());
  EXPECT_EQ(Vector2Rank(empty, 0, true), -1);
  EXPECT_EQ(Vector2RankValue(empty, 0, false), -1);
}

TEST(Rank, FloatsWithinTheToleranceShareARank) {
  const TQENFloatVector v{10, 30, 20};
  EXPECT_EQ(Vector2RankValue(v, 20.0L + 1e-11L, true), 1);  // relative difference 5e-13
  EXPECT_EQ(Vector2RankValue(v, 20.0L + 1e-9L, true), -1);
  EXPECT_EQ(Vector2RankVector(TQENFloatVector{1.0L + 1e-13L, 1.0L, 5.0L}, true),
            (TQENLIntVector{0, 0, 2}));
  // Single compares at its own, coarser precision.
  EXPECT_EQ(Vector2RankVector(TQENSingleVector{1.000001f, 1.0f}, true), (TQENLIntVector{0, 0}));
  EXPECT_EQ(Vector2RankVector(TQENDoubleVector{1.000001, 1.0}, true), (TQENLIntVector{1, 0}));
  EXPECT_EQ(Vector2RankVector(TQENDoubleVector{1e-13, -0.0, 0.0, -1}, false),
            (TQENLIntVector{0, 0, 0, 3}));
}

// The definition of a rank, written out plainly: the first match in the sorted copy.
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

// Values crowded around a few centres, nudged so that chains of near-ties straddle the
// tolerance, and a few NaNs (equal to nothing: rank 0, and no rank of their own).
TEST(Rank, MatchesTheFirstMatchScan) {
  std::mt19937 gen(2024);
  const long double centres[] = {0.0L, 1.0L, -1.0L, 0.5L, 3.0L, -250.0L, 1e6L, 7.25e9L};
  std::uniform_int_distribution<int> centre(0, 7), nudge(-12, 12);
  auto crowded = [&](auto v, std::size_t n, long double step) {
    using T = typename decltype(v)::value_type;
    for (std::size_t i = 0; i < n; ++i) {
      const long double c = centres[centre(gen)];
      v.push_back(static_cast<ValueOf<T>>(c + nudge(gen) * step * std::max(1.0L, std::fabs(c))));
    }
    return v;
  };
  auto same = [](auto a, auto b) { return SameFloat(a, b); };
  for (int round = 0; round < 30; ++round) {
    const std::size_t n = 1 + gen() % 400;
    for (bool up : {true, false}) {
      const auto f = crowded(TQENSingleVector{}, n, 1e-6L);
      EXPECT_EQ(Vector2RankVector(f, up), ScannedRanks(f, up, same));
      auto d = crowded(TQENDoubleVector{}, n, 1e-12L);
      if (round % 2) d[gen() % n] = std::numeric_limits<Double>::quiet_NaN();
      const TQENLIntVector expected = ScannedRanks(d, up, same);
      EXPECT_EQ(Vector2RankVector(d, up), expected);
      for (std::size_t k = 0; k < n; k += 7) {
        const LongInt rank = std::isnan(d[k]) ? -1 : expected[k];  // a NaN has no rank
        EXPECT_EQ(Vector2Rank(d, static_cast<LongWord>(k), up), rank);
        EXPECT_EQ(Vector2RankValue(d, d[k], up), rank);
      }
      EXPECT_EQ(Vector2RankValue(d, std::numeric_limits<Double>::quiet_NaN(), up), -1);
      TQENByteVector b;
      for (std::size_t i = 0; i < n; ++i) b.push_back(static_cast<Byte>(gen() % 9));
      EXPECT_EQ(Vector2RankVector(b, up),
                ScannedRanks(b, up, [](Byte x, Byte y) { return x == y; }));
    }
  }
}

}  // namespace
}  // namespace tovrin
