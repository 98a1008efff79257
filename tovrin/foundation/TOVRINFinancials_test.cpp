#include "tovrin/foundation/TOVRINFinancials.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <random>

namespace tovrin {
namespace {

template <typename T>
Int64 Stored(T X) {
  return detail::StoredOf(X);
}

void ExpectInvalidValue(auto&& Call) {
  try {
    Call();
    ADD_FAILURE() << "no EMathError raised";
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), rsInvalidValue);
  }
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
  EXPECT_EQ(Stored(Float2QENCurrency(0.125L)), 12);
  EXPECT_EQ(Stored(Float2QENCurrency(0.375L)), 38);
  EXPECT_EQ(Stored(Float2QENCurrency(0.625L)), 62);
  EXPECT_EQ(Stored(Float2QENCurrency(0.875L)), 88);
  EXPECT_EQ(Stored(Float2QENCurrency(-0.125L)), -12);
  EXPECT_EQ(Stored(Float2QENCurrency(-0.375L)), -38);
  EXPECT_EQ(Stored(Float2QENCurrency(-0.004L)), 0);
  EXPECT_EQ(Stored(Float2QENLongCurrency(0.0078125L)), 7812);   // 2^-7 x 10^6 = 7812.5
  EXPECT_EQ(Stored(Float2QENLongCurrency(0.0234375L)), 23438);  // 23437.5
  EXPECT_EQ(Stored(Float2QENLongCurrency(-0.0078125L)), -7812);
}

// Values from TOVRINFinancials_ref.py (exact rational arithmetic): the nearest integer to the
// exact product. Rounding the product to Extended first would give 268, 102 and 0 for the
// first three, whose literals lie just below or above a half.
TEST(Float2QENCurrency, RoundsTheExactProduct) {
  EXPECT_EQ(Stored(Float2QENCurrency(2.675L)), 267);
  EXPECT_EQ(Stored(Float2QENCurrency(1.015L)), 101);
  EXPECT_EQ(Stored(Float2QENLongCurrency(0.0000005L)), 1);
  EXPECT_EQ(Stored(Float2QENCurrency(1.005L)), 100);
  EXPECT_EQ(Stored(Float2QENCurrency(-1.005L)), -100);
  EXPECT_EQ(Stored(Float2QENCurrency(1234567.885L)), 123456788);
  EXPECT_EQ(Stored(Float2QENLongCurrency(1.0000005L)), 1000000);
  EXPECT_EQ(Stored(detail::Float2Money<Currency>(1.23456L)), 12346);
  EXPECT_EQ(Stored(detail::Float2Money<Currency>(0.00015L)), 2);
}

TEST(Float2QENCurrency, RangeEndsAreAcceptedAndBeyondRaises) {
  EXPECT_EQ(Stored(Float2QENCurrency(21474836.47L)), INT32_MAX);
  EXPECT_EQ(Stored(Float2QENCurrency(-21474836.48L)), INT32_MIN);
  ExpectInvalidValue([] { Float2QENCurrency(21474836.48L); });
  ExpectInvalidValue([] { Float2QENCurrency(-21474836.49L); });
  ExpectInvalidValue([] { Float2QENCurrency(1e300L); });
  ExpectInvalidValue([] { Float2QENCurrency(std::numeric_limits<Extended>::quiet_NaN()); });
  ExpectInvalidValue([] { Float2QENCurrency(std::numeric_limits<Extended>::infinity()); });
  ExpectInvalidValue([] { Float2QENLongCurrency(-std::numeric_limits<Extended>::infinity()); });
  EXPECT_EQ(Stored(Float2QENLongCurrency(9e12L)), 9000000000000000000);
  EXPECT_EQ(Stored(Float2QENLongCurrency(-9223372036854.775808L)), INT64_MIN);
  ExpectInvalidValue([] { Float2QENLongCurrency(1e13L); });
  ExpectInvalidValue([] { detail::Float2Money<Currency>(1e15L); });
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

// The exact product X * Scale rounded half to even, in 128-bit integer arithmetic: X is
// taken apart into its 64-bit significand and exponent, so nothing is rounded on the way.
Int64 ExactScaledReference(Extended X, Int64 Scale) {
  if (X == 0) return 0;
  int e = 0;
  const Extended f = std::frexp(std::fabs(X), &e);  // |X| = f 2^e, f in [0.5, 1)
  const auto m = static_cast<unsigned __int128>(static_cast<std::uint64_t>(std::ldexp(f, 64)));
  const unsigned __int128 p = m * static_cast<unsigned __int128>(Scale);  // |X| Scale = p 2^(e-64)
  unsigned __int128 q = 0;
  const int k = 64 - e;  // right shift
  if (k <= 0) {
    q = p << -k;
  } else if (k < 127) {
    q = p >> k;
    const unsigned __int128 rem = p & ((static_cast<unsigned __int128>(1) << k) - 1);
    const unsigned __int128 half = static_cast<unsigned __int128>(1) << (k - 1);
    if (rem > half || (rem == half && (q & 1) != 0)) ++q;
  }
  const auto r = static_cast<Int64>(q);
  return X < 0 ? -r : r;
}

TEST(Float2QENCurrency, AgreesWithExactIntegerArithmetic) {
  std::mt19937_64 gen(7);
  std::uniform_real_distribution<double> unit(-1, 1);
  for (int i = 0; i < 50000; ++i) {
    // Random significands at many magnitudes, and values next to halves of a stored unit.
    const int exponent = static_cast<int>(gen() % 40) - 20;
    Extended x = std::ldexp(
        static_cast<Extended>(unit(gen)) + static_cast<Extended>(unit(gen)) * 1e-17L, exponent);
    if (i % 3 == 0) {
      const Extended half =
          (static_cast<Extended>(static_cast<int>(gen() % 2000000) - 1000000) + 0.5L) / 100;
      x = (i % 2 == 0) ? std::nextafter(half, 1e30L) : half;
    }
    EXPECT_EQ(Stored(Float2QENCurrency(x)), ExactScaledReference(x, 100)) << double(x);
    EXPECT_EQ(Stored(Float2QENLongCurrency(x)), ExactScaledReference(x, 1000000)) << double(x);
    EXPECT_EQ(Stored(detail::Float2Money<Currency>(x)), ExactScaledReference(x, 10000))
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
  ExpectInvalidValue([] { Currency2QENLongCurrency(Currency{92233720368547759}); });
  ExpectInvalidValue([] { Currency2QENLongCurrency(Currency{-92233720368547759}); });
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
  // 2147483647.5 hundredths rounds to the even 2147483648, one past the range.
  ExpectInvalidValue([] { Currency2QENCurrency(Currency{214748364750}); });
  EXPECT_EQ(Stored(Currency2QENCurrency(Currency{-214748364850})), INT32_MIN);
  ExpectInvalidValue([] { Currency2QENCurrency(Currency{-214748364851}); });
  ExpectInvalidValue([] { QENLongCurrency2QENCurrency(TQENLongCurrency{INT64_MAX}); });
}

TEST(SameCurrency, ComparesStoredIntegersExactly) {
  EXPECT_TRUE(SameCurrency(Currency{5}, Currency{5}));
  EXPECT_FALSE(SameCurrency(Currency{5}, Currency{6}));
  EXPECT_FALSE(SameCurrency(Currency{INT64_MAX}, Currency{INT64_MAX - 1}));
}

TEST(SwapXY, ExchangesMoney) {
  TQENCurrency a{1}, b{2};
  SwapXY(a, b);
  EXPECT_EQ(Stored(a), 2);
  EXPECT_EQ(Stored(b), 1);
  TQENLongCurrency c{3}, d{4};
  SwapXY(c, d);
  EXPECT_EQ(Stored(c), 4);
  Currency e{5}, f{6};
  SwapXY(e, f);
  EXPECT_EQ(Stored(f), 5);
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
