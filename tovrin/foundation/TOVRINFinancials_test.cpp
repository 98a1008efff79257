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

TEST(MoneyConversions, WideningIsExact) {
  EXPECT_EQ(Stored(QENCurrency2QENLongCurrency(TQENCurrency{-12345})), -123450000);
  EXPECT_EQ(Stored(QENCurrency2QENLongCurrency(TQENCurrency{INT32_MIN})), -21474836480000);
  EXPECT_EQ(Stored(QENCurrency2Currency(TQENCurrency{12345})), 1234500);
  EXPECT_EQ(Stored(QENCurrency2Currency(TQENCurrency{INT32_MAX})), 214748364700);
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{-15})), -1500);
  EXPECT_EQ(Stored(Currency2QENLongCurrency(Currency{92233720368547758})),
            9223372036854775800);
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
  EXPECT_EQ(Stored(QENLongCurrency2Currency(TQENLongCurrency{INT64_MIN})),
            -92233720368547758);
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
