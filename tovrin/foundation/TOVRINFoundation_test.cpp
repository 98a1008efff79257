#include <cmath>
#include <cstring>
#include <limits>
#include <set>
#include <string>
#include <type_traits>
#include <utility>

#include <gtest/gtest.h>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {
namespace {

constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();

// --- Storage ----------------------------------------------------------------------------------

TEST(PackedExtendedTest, ThreeElementsSpanThirtyBytes) {
  TQENFloatVector v(3);
  const auto* first = reinterpret_cast<const unsigned char*>(v.data());
  const auto* last = reinterpret_cast<const unsigned char*>(v.data() + v.size());
  EXPECT_EQ(last - first, 30);
  for (Extended x : v) EXPECT_EQ(x, 0.0L);  // value-initialised elements are zero
}

TEST(PackedExtendedTest, KeepsEveryBitOfTheValue) {
  for (Extended x : {0.1L, -0.0L, std::numeric_limits<Extended>::max(),
                     std::numeric_limits<Extended>::denorm_min(),
                     std::numeric_limits<Extended>::lowest(), 1.0L + 0x1p-63L, kInf}) {
    const PackedExtended p = x;
    const Extended back = p;
    EXPECT_EQ(back, x);
    EXPECT_EQ(std::signbit(back), std::signbit(x));
  }
  const PackedExtended nan = kNaN;
  EXPECT_TRUE(std::isnan(Extended(nan)));
}

TEST(PackedExtendedTest, CompoundAssignmentWorksInPlace) {
  TQENFloatVector v{1.0L, 2.0L};
  v[0] += 0x1p-63L;  // representable only at 64-bit precision
  v[1] *= 3.0L;
  v[1] -= 1.0L;
  v[1] /= 4.0L;
  EXPECT_EQ(Extended(v[0]), 1.0L + 0x1p-63L);
  EXPECT_EQ(Extended(v[1]), 1.25L);
}

TEST(ConstantsTest, HoldFullExtendedPrecision) {
  // Each constant is the Extended nearest the true value: cos(pi) is -1 and the roots square
  // back to within one rounding.
  EXPECT_EQ(std::cos(QENPi), -1.0L);
  EXPECT_EQ(TwoPi, 2 * QENPi);
  EXPECT_NEAR(static_cast<double>(Sqrt2 * Sqrt2 - 2), 0.0, 4.4e-19);
  EXPECT_NEAR(static_cast<double>(Sqrt3 * Sqrt3 - 3), 0.0, 4.4e-19);
  EXPECT_NEAR(static_cast<double>(Sqrt5 * Sqrt5 - 5), 0.0, 8.7e-19);
  EXPECT_EQ(QENTolerance, 5e-12L);
}

// --- Tolerance predicates ---------------------------------------------------------------------

// FloatIsZero, FloatIsNotZero, FloatIsPositive and FloatIsNegative as four 0/1 digits: the
// tolerance 5e-12 is absolute, and NaN is neither zero nor signed.
std::string Predicates(Extended x) {
  std::string s;
  for (bool b : {FloatIsZero(x), FloatIsNotZero(x), FloatIsPositive(x), FloatIsNegative(x)}) {
    s += b ? '1' : '0';
  }
  return s;
}

TEST(ToleranceTest, PredicatesAndSameFloat) {
  const std::pair<Extended, const char*> predicates[] = {
      {0.0L, "1000"},      {4.9e-12L, "1000"}, {-4.9e-12L, "1000"}, {5e-12L, "0100"},
      {-5.1e-12L, "0101"}, {5.1e-12L, "0110"}, {1e-30L, "1000"},    {kNaN, "0100"}};
  for (const auto& [x, digits] : predicates) EXPECT_EQ(Predicates(x), digits) << double(x);
  // SameFloat: absolute up to 1, relative beyond; Double and Single at their own precision.
  EXPECT_TRUE(SameFloat(0.0L, 4e-12L) && SameFloat(0.5L, 0.5L + 4e-12L));
  EXPECT_TRUE(SameFloat(1.0L, 1.0L + 4e-12L) && !SameFloat(1.0L, 1.0L + 6e-12L));
  EXPECT_TRUE(SameFloat(1e6L, 1e6L + 4e-6L) && !SameFloat(1e6L, 1e6L + 6e-6L));
  EXPECT_TRUE(SameFloat(-1e300L, -1e300L * (1 + 4e-12L)));
  EXPECT_FALSE(SameFloat(0.0L, 6e-12L) || SameFloat(1e-20L, -1.0L) || SameFloat(kNaN, kNaN));
  EXPECT_TRUE(SameFloat(kInf, kInf));
  EXPECT_FALSE(SameFloat(kInf, -kInf) || SameFloat(std::numeric_limits<Extended>::max(), kInf));
  EXPECT_TRUE(NotSameFloat(1.0L, 2.0L) && NotSameFloat(kNaN, 1.0L));
  EXPECT_TRUE(SameFloat(1.0, 1.0 + 4e-12) && !SameFloat(1.0, 1.0 + 6e-12));
  EXPECT_TRUE(SameFloat(1.0F, 1.000004F) && !SameFloat(1.0F, 1.00001F));
  EXPECT_TRUE(SameFloat(0.0F, 4e-6F) && !SameFloat(0.0F, 6e-6F));
}

// --- Elementary helpers -----------------------------------------------------------------------

TEST(ElementaryTest, MinMaxAndSign) {
  EXPECT_EQ(MinXY(2.0L, -3.0L), -3.0L);
  EXPECT_EQ(MinXY(LongInt{-7}, LongInt{4}), -7);
  EXPECT_EQ(MinXY(Int64{1} << 40, Int64{5}), 5);
  EXPECT_EQ(MinXY(LongWord{4000000000U}, LongWord{3}), 3U);
  EXPECT_EQ(MaxXY(2.0L, -3.0L), 2.0L);
  EXPECT_EQ(MaxXY(Int64{-1}, std::numeric_limits<Int64>::min()), -1);
  EXPECT_EQ(SignXY(3.0L, -2.0L), -3.0L);
  EXPECT_EQ(SignXY(-3.0L, 2.0L), 3.0L);
  EXPECT_EQ(SignXY(-3.0L, 0.0L), 3.0L);
}

TEST(ElementaryTest, SquaresAndCubesAreTheCLibrarysToTheBit) {
  // XtoY forms X^2 and X^3 by products, as powl does: the same bits on every kind of argument
  // (the products round twice, so the check is against powl itself).
  const Extended values[] = {1 + 0x1p-63L, 1 - 0x1p-64L, 0.1L,    -0.7L,    3.3L,
                             1e-2000L,     0x1p-16440L,  1e1700L, -1e2000L, 0.0L,
                             -0.0L,        kInf,         -kInf,   kNaN,     1.2345678901234567891L};
  for (const Extended x : values) {
    for (const Extended y : {2.0L, 3.0L}) {
      const Extended ours = XtoY(x, y);
      const Extended theirs = std::pow(x, y);
      EXPECT_EQ(std::memcmp(&ours, &theirs, 10), 0) << static_cast<double>(x) << "^" << y;
    }
  }
}

TEST(ElementaryTest, PowersLogsAndRoots) {
  EXPECT_EQ(XtoY(2.0L, 10.0L), 1024.0L);
  EXPECT_EQ(XtoY(-2.0L, 3.0L), -8.0L);
  EXPECT_EQ(XtoY(9.0L, 0.5L), 3.0L);
  EXPECT_EQ(TwoToY(-3.0L), 0.125L);
  EXPECT_EQ(TwoToY(16383.0L), 0x1p16383L);
  EXPECT_EQ(QENLog2(8.0L), 3.0L);
  EXPECT_EQ(QENLog2(0x1p-16000L), -16000.0L);
  EXPECT_EQ(QENLog10(1000.0L), 3.0L);
  EXPECT_EQ(QENLog10(1e27L), 27.0L);
  EXPECT_NEAR(static_cast<double>(QENLog10(1e-4000L) + 4000), 0.0, 1e-15);
  EXPECT_TRUE(std::isnan(QENLog10(-1.0L)));
  EXPECT_EQ(CubeRoot(-27.0L), -3.0L);
  EXPECT_EQ(QENArcCos(-1.0L), QENPi);
  EXPECT_EQ(QENTan(0.0L), 0.0L);
  // tan(pi/4) is 1 within two units of the last place.
  EXPECT_NEAR(static_cast<double>(QENTan(QENPi / 4) - 1), 0.0, 2.2e-19);
}

TEST(ElementaryTest, DistanceDoesNotOverflowOnTheWay) {
  EXPECT_EQ(QENDistance(1.0L, 1.0L, 4.0L, 5.0L), 5.0L);
  EXPECT_EQ(QENDistance(0.0L, 0.0L, -3e4000L, 4e4000L), 5e4000L);
  EXPECT_EQ(QENDistance(0.0L, 0.0L, 3e-4000L, 4e-4000L), 5e-4000L);
}

TEST(SystemTest, SwapAndClear) {
  LongInt a = 1, b = 2;
  SwapXY(a, b);
  EXPECT_EQ(a * 10 + b, 21);
  TQENFloatVector v{1.5L, 2.5L};  // packed elements swap in place
  SwapXY(v[0], v[1]);
  EXPECT_EQ(Extended(v[0]), 2.5L);
  TQENDoubleVector d{1.0, 2.0, 3.0};
  QENClear(d.data(), 2 * sizeof(Double));
  EXPECT_EQ(d, (TQENDoubleVector{0.0, 0.0, 3.0}));
  QENClear(nullptr, 0);
}

// --- Text conversions -------------------------------------------------------------------------

// Fixed notation of the exact binary value, ties to even, never a negative zero. The decimal
// expansions of the stored values come from Python's decimal module at 64-bit precision:
// 2.675L is 2.67499999999999999995..., 0.3L is 0.30000000000000000001...
TEST(Float2EStrTest, ExactDecimalsTiesToEven) {
  const struct {
    Extended x;
    Byte decimals;
    const char* text;
  } cases[] = {// clang-format off
      {1.5L, 2, "1.50"}, {1.5L, 0, "2"}, {-1234567.0L, 1, "-1234567.0"},
      {1e20L, 0, "100000000000000000000"}, {0.0L, 4, "0.0000"}, {2.5L, 0, "2"}, {3.5L, 0, "4"},
      {0.125L, 2, "0.12"}, {0.375L, 2, "0.38"}, {-2.25L, 1, "-2.2"}, {2.675L, 2, "2.67"},
      {0.3L, 19, "0.3000000000000000000"}, {0.3L, 20, "0.30000000000000000001"},
      {0.1L, 21, "0.100000000000000000001"}, {1e-3L, 25, "0.0009999999999999999999585"},
      {-0.0L, 3, "0.000"}, {-0.001L, 2, "0.00"}, {-0.5L, 0, "0"}, {-0.6L, 0, "-1"}};
  // clang-format on
  for (const auto& c : cases) EXPECT_EQ(Float2EStr(c.x, c.decimals), c.text);
}

TEST(Float2EStrTest, SpecialValuesAndExtremes) {
  EXPECT_EQ(Float2EStr(kNaN, 2), "NAN");
  EXPECT_EQ(Float2EStr(kInf, 2), "INF");
  EXPECT_EQ(Float2EStr(-kInf, 0), "-INF");
  const std::string big = Float2EStr(std::numeric_limits<Extended>::max(), 255);
  EXPECT_EQ(big.substr(0, 8), "11897314");
  EXPECT_EQ(big.size(), 4933U + 1 + 255);
  const std::string tiny = Float2EStr(std::numeric_limits<Extended>::denorm_min(), 255);
  EXPECT_EQ(tiny, "0." + std::string(255, '0'));
}

TEST(Int2EStrTest, PlainDecimal) {
  EXPECT_EQ(Int2EStr(LongInt{0}), "0");
  EXPECT_EQ(Int2EStr(std::numeric_limits<LongInt>::min()), "-2147483648");
  EXPECT_EQ(Int2EStr(std::numeric_limits<Int64>::min()), "-9223372036854775808");
  EXPECT_EQ(Int2EStr(Int64{1234567890123}), "1234567890123");
}

TEST(Str2FloatTest, AcceptsTheDecimalForms) {
  const std::pair<const char*, Extended> cases[] = {
      {"1", 1.0L},  {"-2.5", -2.5L}, {".5", 0.5L},     {"3.", 3.0L},
      {"+7", 7.0L}, {"1e-3", 1e-3L}, {"1E+2", 100.0L}, {" \t0.1  ", 0.1L}};
  for (const auto& [text, value] : cases) EXPECT_EQ(Str2Float(text), value) << text;
  EXPECT_TRUE(std::signbit(Str2Float("-0")));
}

TEST(Str2FloatTest, RoundsCorrectlyToExtended) {
  // 1 + 2^-64 lies halfway between 1 and the next Extended: ties to even give 1.
  EXPECT_EQ(Str2Float("1.0000000000000000000542101086242752217003726400434970855712890625"), 1.0L);
  EXPECT_EQ(Str2Float("1.0000000000000000000542101086242752217003726400434970855712890626"),
            1.0L + 0x1p-63L);
  // 1 + 3 * 2^-64 is a tie between 1 + 2^-63 and 1 + 2^-62: the even one is 1 + 2^-62.
  EXPECT_EQ(Str2Float("1.0000000000000000001626303258728256651011179201304912567138671875"),
            1.0L + 0x1p-62L);
  EXPECT_EQ(Str2Float("1e-4952"), 0.0L);  // below half the smallest subnormal
  EXPECT_EQ(Str2Float("4e-4951"), std::numeric_limits<Extended>::denorm_min());
  EXPECT_EQ(Str2Float("1.18973149535723176502e+4932"), std::numeric_limits<Extended>::max());
}

TEST(Str2FloatTest, RejectsEverythingElseNamingTheText) {
  for (const char* text : {"", "   ", "inf", "nan", "1,5", "0x10", "1e", "e5", ".", "-", "+",
                           "1.2.3", "1 2", "--1", "1e+", "١", "1f", "1.5L", "Infinity"}) {
    try {
      Str2Float(text);
      ADD_FAILURE() << "accepted '" << text << "'";
    } catch (const EConvertError& e) {
      EXPECT_NE(std::string(e.what()).find(std::string("'") + text + "'"), std::string::npos)
          << e.what();
    }
  }
  EXPECT_THROW(Str2Float("1e5000"), EConvertError);
  EXPECT_THROW(Str2Float("-1e5000"), EConvertError);
}

TEST(Str2FloatTest, RoundTripsFloat2EStrAtTwentyDecimals) {
  for (Extended x : {1.0L / 3, -2.0L / 7, 12345.678L, 0.5L}) {
    EXPECT_NEAR(static_cast<double>(Str2Float(Float2EStr(x, 20)) - x), 0.0, 1e-20);
  }
}

TEST(StripTChStrTest, RemovesOnlyTheTrailingRun) {
  EXPECT_EQ(StripTChStr("2.50000", '0'), "2.5");
  EXPECT_EQ(StripTChStr("2.00000", '0'), "2.");
  EXPECT_EQ(StripTChStr("0000", '0'), "");
  EXPECT_EQ(StripTChStr("", '0'), "");
  EXPECT_EQ(StripTChStr("100", '1'), "100");
  EXPECT_EQ(StripTChStr("a--", '-'), "a");
}

// --- Messages ---------------------------------------------------------------------------------

TEST(ResStringTest, EveryIdentifierHasItsOwnTextAndName) {
  std::set<std::string> texts, names;
  for (int i = 0; i < rsResStringCount; ++i) {
    const auto id = static_cast<TResStringId>(i);
    const std::string text = LoadResString(id);
    EXPECT_FALSE(text.empty()) << ResStringName(id);
    EXPECT_TRUE(texts.insert(text).second) << "duplicate text: " << text;
    EXPECT_TRUE(names.insert(ResStringName(id)).second) << ResStringName(id);
  }
  EXPECT_EQ(std::string(ResStringName(rsVectorIsEmpty)), "rsVectorIsEmpty");
  EXPECT_NE(LoadResString(rsVectorIsEmpty), LoadResString(rsVectorEmpty));
  EXPECT_THROW(LoadResString(rsResStringCount), std::out_of_range);
}

TEST(ResStringTest, TextsCanBeReplacedAtRunTime) {
  SetResString(rsMatrixSqr, "La matrice doit être carrée");
  try {
    detail::RaiseMathError(rsMatrixSqr);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), rsMatrixSqr);
    EXPECT_STREQ(e.what(), "La matrice doit être carrée");
  }
  ResetResStrings();
  EXPECT_EQ(EMathError(rsMatrixSqr).what(), LoadResString(rsMatrixSqr));
  EXPECT_STREQ(EConvertError("bad").what(), "bad");
  EXPECT_STREQ(EAccessViolation("no rows").what(), "no rows");
  static_assert(std::is_base_of_v<std::exception, EMathError>);
  EXPECT_STRNE(EMathError(rsMatrixSqr).what(), "La matrice doit être carrée");
  EXPECT_THROW(SetResString(static_cast<TResStringId>(rsResStringCount), "x"), std::out_of_range);
}

}  // namespace
}  // namespace tovrin
