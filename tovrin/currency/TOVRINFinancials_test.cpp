#include "tovrin/currency/TOVRINFinancials.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <random>
#include <utility>

namespace tovrin {
namespace {

template <typename T>
Int64 Stored(T X) {
  return detail::StoredOf(X);
}

TEST(Currency2Float, DividesTheStoredIntegerByItsScale) {
  EXPECT_EQ(Currency2Float(TQENCurrency{12345}), 123.45L);
  EXPECT_EQ(Currency2Float(TQENCurrency{-1}), -0.01L);
  EXPECT_EQ(Currency2Float(TQENLongCurrency{1500000}), 1.5L);
  EXPECT_EQ(Currency2Float(TQENLongCurrency{-123456789}), -123.456789L);
  EXPECT_EQ(Currency2Float(Currency{15000}), 1.5L);
  EXPECT_EQ(Currency2Float(Currency{12346}), 1.2346L);
  EXPECT_EQ(Currency2Float(TQENCurrency{INT32_MIN}), -21474836.48L);
  // Every Int64 is exact in Extended, so the quotient is correctly rounded.
  EXPECT_EQ(Currency2Float(Currency{INT64_MAX}), 922337203685477.5807L);
}

// Exact halves of the scaled value go to the even integer.
TEST(Float2QENCurrency, ExactHalvesGoToEven) {
  const std::pair<Extended, Int64> curr[] = {{0.125L, 12}, {0.375L, 38},   {0.625L, 62},
                                             {0.875L, 88}, {-0.125L, -12}, {-0.375L, -38},
                                             {-0.004L, 0}};
  for (const auto& [x, stored] : curr) EXPECT_EQ(Stored(Float2QENCurrency(x)), stored);
  // 2^-7 x 10^6 = 7812.5 and 23437.5 millionths.
  const std::pair<Extended, Int64> longCurr[] = {
      {0.0078125L, 7812}, {0.0234375L, 23438}, {-0.0078125L, -7812}};
  for (const auto& [x, stored] : longCurr) EXPECT_EQ(Stored(Float2QENLongCurrency(x)), stored);
}

struct MoneyRounding {
  Extended literal;
  Int64 scale, rounded, exactRounded;
};
#include "tovrin/currency/TOVRINFinancials_reference.inc"

// The Extended product rounded half to even (TOVRINFinancials_reference.inc, exact rational
// arithmetic); the first five literals lie just below or above a half, where rounding the exact
// product would give another result.
TEST(Float2QENCurrency, RoundsTheExtendedProduct) {
  for (const auto& c : kMoneyRounding) {
    const Int64 stored = c.scale == 100     ? Stored(Float2QENCurrency(c.literal))
                         : c.scale == 10000 ? Stored(detail::Float2Money<Currency>(c.literal))
                                            : Stored(Float2QENLongCurrency(c.literal));
    EXPECT_EQ(stored, c.rounded) << static_cast<double>(c.literal);
  }
}

// Overflow is not reported: the rounded value wraps modulo 2^64, a TQENCurrency keeps its low
// 32 bits, and a NaN or an infinity gives the integer indefinite -2^63.
TEST(Float2QENCurrency, OverflowWraps) {
  constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
  constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
  EXPECT_EQ(Stored(Float2QENCurrency(21474836.47L)), INT32_MAX);
  EXPECT_EQ(Stored(Float2QENCurrency(-21474836.48L)), INT32_MIN);
  EXPECT_EQ(Stored(Float2QENCurrency(21474836.48L)), INT32_MIN);  // 2^31 wraps
  EXPECT_EQ(Stored(Float2QENCurrency(-21474836.49L)), INT32_MAX);
  EXPECT_EQ(Stored(Float2QENCurrency(42949672.98L)), 2);  // 2^32 + 2
  EXPECT_EQ(Stored(Float2QENCurrency(kNaN)), 0);
  EXPECT_EQ(Stored(Float2QENCurrency(kInf)), 0);
  EXPECT_EQ(Stored(Float2QENLongCurrency(-kInf)), INT64_MIN);
  EXPECT_EQ(Stored(Float2QENLongCurrency(9e12L)), 9000000000000000000);
  EXPECT_EQ(Stored(Float2QENLongCurrency(-9223372036854.775808L)), INT64_MIN);
  EXPECT_EQ(Stored(Float2QENLongCurrency(1e13L)), -8446744073709551616);  // 10^19 - 2^64
  EXPECT_EQ(Stored(detail::Float2Money<Currency>(kNaN)), INT64_MIN);
}

// A property: every stored value survives the trip through its amount and back.
TEST(Float2QENCurrency, RoundTripThroughTheAmount) {
  std::mt19937_64 gen(20261121);
  for (int i = 0; i < 20000; ++i) {
    const auto c = static_cast<LongInt>(gen());
    EXPECT_EQ(Stored(Float2QENCurrency(Currency2Float(TQENCurrency{c}))), c);
    const auto l = static_cast<Int64>(gen() >> 11) * ((i & 1) ? 1 : -1);
    EXPECT_EQ(Stored(Float2QENLongCurrency(Currency2Float(TQENLongCurrency{l}))), l);
    EXPECT_EQ(Stored(detail::Float2Money<Currency>(Currency2Float(Currency{l}))), l);
  }
}

// The money rule in 128-bit integer arithmetic, nothing rounded by the hardware: |X| = m 2^(e-64)
// with a 64-bit m; the exact product m Scale is rounded to 64 significant bits (ties to even),
// as the Extended product is, and that value to the nearest integer (ties to even).
Int64 ExtendedProductReference(Extended X, Int64 Scale) {
  using U128 = unsigned __int128;
  if (X == 0) return 0;
  const auto roundShift = [](U128 v, int k) {  // v / 2^k rounded half to even
    if (k <= 0) return v << -k;
    if (k >= 127) return U128{0};
    U128 q = v >> k;
    const U128 rem = v & ((U128{1} << k) - 1);
    const U128 half = U128{1} << (k - 1);
    if (rem > half || (rem == half && (q & 1) != 0)) ++q;
    return q;
  };
  int e = 0;
  const Extended f = std::frexp(std::fabs(X), &e);  // |X| = f 2^e, f in [0.5, 1)
  const U128 p =
      static_cast<U128>(static_cast<std::uint64_t>(std::ldexp(f, 64))) * static_cast<U128>(Scale);
  int bits = 0;
  while (bits < 128 && (p >> bits) != 0) ++bits;
  int shift = bits > 64 ? bits - 64 : 0;
  U128 significand = roundShift(p, shift);  // 64 bits, or 2^64 after a carry (exact to halve)
  if ((significand >> 64) != 0) {
    significand >>= 1;
    ++shift;
  }
  const auto r = static_cast<Int64>(roundShift(significand, 64 - e - shift));
  return X < 0 ? -r : r;
}

TEST(Float2QENCurrency, AgreesWithIntegerArithmetic) {
  std::mt19937_64 gen(7);
  std::uniform_real_distribution<double> unit(-1, 1);
  for (int i = 0; i < 50000; ++i) {
    // Random significands at many magnitudes, and the half-unit decimals in [0, 2), of which
    // rounding the exact product instead of the Extended one would get 44 % different.
    const int exponent = static_cast<int>(gen() % 40) - 20;
    Extended x = std::ldexp(
        static_cast<Extended>(unit(gen)) + static_cast<Extended>(unit(gen)) * 1e-17L, exponent);
    if (i < 20000) x = (2 * i + 1) / 20000.0L;
    ASSERT_EQ(Stored(Float2QENCurrency(x)), ExtendedProductReference(x, 100)) << double(x);
    ASSERT_EQ(Stored(Float2QENLongCurrency(x)), ExtendedProductReference(x, 1000000)) << double(x);
    ASSERT_EQ(Stored(detail::Float2Money<Currency>(x)), ExtendedProductReference(x, 10000))
        << double(x);
  }
}

TEST(RoundHalfEven, NearestIntegerWithHalvesToEven) {
  EXPECT_EQ(detail::RoundHalfEven(0.5L), 0);
  EXPECT_EQ(detail::RoundHalfEven(1.5L), 2);
  EXPECT_EQ(detail::RoundHalfEven(-1.5L), -2);
  EXPECT_EQ(detail::RoundHalfEven(-0.5000000001L), -1);
  EXPECT_EQ(detail::RoundHalfEven(0.49999999999999999995L), 0);
  EXPECT_EQ(detail::RoundHalfEven(4611686018427387904.5L), 4611686018427387904.0L);  // 2^62 + .5
  EXPECT_EQ(detail::RoundHalfEven(4611686018427387905.5L), 4611686018427387906.0L);
  EXPECT_EQ(detail::RoundHalfEven(-1e30L), -1e30L);
}

TEST(MoneyConversions, WideningIsExact) {
  EXPECT_EQ(Stored(QENCurrency2QENLongCurrency(TQENCurrency{-12345})), -123450000);
  EXPECT_EQ(Stored(QENCurrency2QENLongCurrency(TQENCurrency{INT32_MIN})), -21474836480000);
  EXPECT_EQ(Stored(QENCurrency2Currency(TQENCurrency{12345})), 1234500);
  EXPECT_EQ(Stored(QENCurrency2Currency(TQENCurrency{INT32_MAX})), 214748364700);
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{-15})), -1500);
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{92233720368547758})), 9223372036854775800);
  // Past the range the product wraps modulo 2^64.
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{92233720368547759})), -9223372036854775716);
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{-92233720368547759})), 9223372036854775716);
}

TEST(MoneyConversions, NarrowingRoundsHalvesToEven) {
  // millionths to hundredths: amount 0.015 is 1.5 hundredths, 0.025 is 2.5
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{15000})), 2);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{25000})), 2);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{25001})), 3);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{14999})), 1);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{-15000})), -2);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{-25000})), -2);
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{-25001})), -3);
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{250})), 2);
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{350})), 4);
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{-350})), -4);
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{-349})), -3);
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{INT64_MIN})), -92233720368547758);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{150})), 2);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{-50})), 0);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{-51})), -1);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{214748364749})), INT32_MAX);
  // 2147483647.5 hundredths rounds to the even 2147483648, one past the range: it wraps.
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{214748364750})), INT32_MIN);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{-214748364850})), INT32_MIN);
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{-214748364851})), INT32_MAX);
  // INT64_MAX / 10000 rounds to 922337203685478 = 0x346DC5D638866, low 32 bits 0x5D638866.
  EXPECT_EQ(Stored(QENLongCurrency2QENCurrency(TQENLongCurrency{INT64_MAX})), 0x5D638866);
}

TEST(SameCurrency, ComparesStoredIntegersExactly) {
  EXPECT_TRUE(SameCurrency(Currency{5}, Currency{5}));
  EXPECT_FALSE(SameCurrency(Currency{5}, Currency{6}));
  EXPECT_FALSE(SameCurrency(Currency{INT64_MAX}, Currency{INT64_MAX - 1}));
}

TEST(SwapXY, ExchangesMoney) {
  TQENCurrency a{1}, b{2};
  SwapXY(a, b);
  EXPECT_EQ(Stored(a) * 10 + Stored(b), 21);
  Currency e{5}, f{6};
  SwapXY(e, f);
  EXPECT_EQ(Stored(e) * 10 + Stored(f), 65);
}

TEST(RoundWrapping, HalvesToEvenAndWrapsModulo2To64) {
  EXPECT_EQ(detail::RoundWrapping(2.5L), 2);
  EXPECT_EQ(detail::RoundWrapping(3.5L), 4);
  EXPECT_EQ(detail::RoundWrapping(-2.5L), -2);
  EXPECT_EQ(detail::RoundWrapping(-0.5L), 0);
  EXPECT_EQ(detail::RoundWrapping(-0.75L), -1);
  EXPECT_EQ(detail::RoundWrapping(0.4999999999L), 0);
  EXPECT_EQ(detail::RoundWrapping(9223372036854775808.0L), INT64_MIN);       // 2^63
  EXPECT_EQ(detail::RoundWrapping(18446744073709551624.0L), 8);              // 2^64 + 8
  EXPECT_EQ(detail::RoundWrapping(-9223372036854775810.0L), INT64_MAX - 1);  // -(2^63 + 2)
  EXPECT_EQ(detail::RoundWrapping(std::numeric_limits<Extended>::quiet_NaN()), INT64_MIN);
  EXPECT_EQ(detail::RoundWrapping(-std::numeric_limits<Extended>::infinity()), INT64_MIN);
  EXPECT_EQ(Stored(detail::WrapToCurr(4294967298)), 2);
  EXPECT_EQ(Stored(detail::WrapToCurr(2147483648)), INT32_MIN);
}

}  // namespace
}  // namespace tovrin
