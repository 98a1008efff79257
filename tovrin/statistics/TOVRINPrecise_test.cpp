// The precise distribution family against the mpmath table of TOVRINPrecise_reference.py, and
// its argument errors.
#include <cmath>
#include <limits>
#include <map>
#include <string>

#include "gtest/gtest.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/statistics/TOVRINPrecise_testing.h"

namespace tovrin {
namespace {

using testing_precise::FindPreciseCall;
using testing_precise::IsInverse;
using testing_precise::kPreciseReference;

constexpr Extended kSmallestNormal = std::numeric_limits<Extended>::min();

// Every row within 1e-17 relative (1e-16 for the inverses), the exact zeros and ones exactly.
TEST(PreciseReference, EveryRowToFullAccuracy) {
  ASSERT_GE(std::size(kPreciseReference), 1000u);
  std::map<std::string, Extended> worst;
  for (const auto& row : kPreciseReference) {
    const auto call = FindPreciseCall(row.name);
    ASSERT_NE(call, nullptr) << row.name;
    const Extended got = call(row.args);
    const Extended want = row.expected;
    // Far in a tail the value is e^-E for an exponent E formed in the working precision, which
    // leaves a relative error of about E eps: the bound grows by that much beyond |ln v| = 100.
    const Extended exponent_error = 1e-19L * std::fabs(std::log(std::fabs(want)));
    const Extended bound = (IsInverse(row.name) ? 1e-16L : 1e-17L) + exponent_error;
    Extended error = std::fabs(got - want);
    if (std::fabs(want) >= kSmallestNormal) error /= std::fabs(want);
    worst[row.name] = std::fmax(worst[row.name], error);
    EXPECT_LE(error, bound) << row.name << "(" << static_cast<double>(row.args[0]) << ", "
                            << static_cast<double>(row.args[1]) << ", "
                            << static_cast<double>(row.args[2]) << ", "
                            << static_cast<double>(row.args[3])
                            << ") = " << static_cast<double>(got) << ", want "
                            << static_cast<double>(want);
  }
  for (const auto& [name, error] : worst) {
    RecordProperty(name, std::to_string(static_cast<double>(error)));
  }
}

using namespace precise;  // NOLINT: the family under test

constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();

struct ErrorCase {
  const char* what;
  TResStringId ident;
  Extended (*call)();
};

// Each check of each family raises its identifier, in the classic functions' order.
TEST(PreciseArguments, RaiseTheClassicIdentifiers) {
  const ErrorCase cases[] = {
      {"InvNormalLess(0)", rsValue01, [] { return InvNormalLess(0); }},
      {"InvNormalGreater(1)", rsValue01, [] { return InvNormalGreater(1); }},
      {"InvNormalLess(NaN)", rsValue01, [] { return InvNormalLess(kNaN); }},
      {"NormalPDF sd 0", rsStdDev, [] { return NormalPDF(0, 0, 1); }},
      {"NormalDistLess sd < 0", rsStdDev, [] { return NormalDistLess(0, -1, 1); }},
      {"NormalDistGreater sd tiny", rsStdDev, [] { return NormalDistGreater(0, 1e-13L, 1); }},
      {"InvNormalDistLess P first", rsValue01, [] { return InvNormalDistLess(0, -1, 2); }},
      {"InvNormalDistGreater sd", rsStdDev, [] { return InvNormalDistGreater(0, -1, 0.5L); }},
      {"LogNormalPDF X 0", rsValueGZero, [] { return LogNormalPDF(0, 1, 0); }},
      {"LogNormalLess sd", rsStdDev, [] { return LogNormalLess(0, 0, 1); }},
      {"InvLogNormalLess P", rsValue01, [] { return InvLogNormalLess(0, 1, 1); }},
      {"InvLogNormalGreater sd", rsStdDev, [] { return InvLogNormalGreater(0, 0, 0.5L); }},
      {"IncompleteGamma X < 0", rsValueGEZero, [] { return IncompleteGamma(-1, -1); }},
      {"IncompleteGammaUpper A 0", rsValueGZero, [] { return IncompleteGammaUpper(0, 1); }},
      {"ChiSquareLess X < 0", rsValueGEZero, [] { return ChiSquareLess(-1, 0); }},
      {"ChiSquareGreater DF 0", rsDF, [] { return ChiSquareGreater(1, 0); }},
      {"ChiSquarePDF DF < 0", rsDF, [] { return ChiSquarePDF(1, -2); }},
      {"InvChiSquareLess DF", rsDF, [] { return InvChiSquareLess(2, 0); }},
      {"InvChiSquareGreater P", rsValueGEZero, [] { return InvChiSquareGreater(1.5L, 3); }},
      {"FDistLess X 0", rsValueGZero, [] { return FDistLess(0, 0, 1); }},
      {"FDistGreater DF2", rsDF, [] { return FDistGreater(1, 1, 0); }},
      {"FDistPDF DF first", rsDF, [] { return FDistPDF(-1, 0, 1); }},
      {"FDistPDF X < 0", rsValueGEZero, [] { return FDistPDF(-1, 1, 1); }},
      {"InvFDistLess P", rsValue01Inc, [] { return InvFDistLess(-0.1L, 0, 1); }},
      {"InvFDistGreater DF", rsDF, [] { return InvFDistGreater(0.5L, 1, 0); }},
      {"StudentTLess DF", rsDF, [] { return StudentTLess(1, 0); }},
      {"StudentTGreater DF NaN", rsDF, [] { return StudentTGreater(1, kNaN); }},
      {"StudentTPDF DF", rsDF, [] { return StudentTPDF(1, -1); }},
      {"InvStudentTLess P", rsValue01Inc, [] { return InvStudentTLess(2, 0); }},
      {"InvStudentTGreater DF", rsDF, [] { return InvStudentTGreater(0.5L, 0); }},
      {"ExponentialLess mean", rsExpDistInvalid, [] { return ExponentialLess(0, 1); }},
      {"ExponentialGreater X", rsExpDistInvalid, [] { return ExponentialGreater(1, -1); }},
      {"ExponentialPDF mean NaN", rsExpDistInvalid, [] { return ExponentialPDF(1, kNaN); }},
      {"BetaDistLess shape", rsValueGZero, [] { return BetaDistLess(0.5L, 0, 1); }},
      {"BetaDistGreater bounds", rsSameValue, [] { return BetaDistGreater(0.5L, 0, 1, 2, 2); }},
      {"InvBetaDistLess P", rsValue01Inc, [] { return InvBetaDistLess(1.5L, 0, 1); }},
      {"InvBetaDistGreater shape", rsValueGZero, [] { return InvBetaDistGreater(0.5L, 1, -1); }},
      {"InvBetaDistLess bounds", rsSameValue, [] { return InvBetaDistLess(2, 1, 1, 3, 3); }},
      {"BetaPDF shape", rsValueGZero, [] { return BetaPDF(0.5L, 1, 0); }},
      {"BetaPDF bounds", rsSameValue, [] { return BetaPDF(0.5L, 1, 1, 1, 1); }},
      {"BinomialEq N 0", rsBinomDistInvalid, [] { return BinomialEq(0.5L, 0, 0); }},
      {"BinomialLess P > 1", rsBinomDistInvalid, [] { return BinomialLess(1.5L, 4, 1); }},
      {"BinomialGreater R > N", rsBinomDistInvalid, [] { return BinomialGreater(0.5L, 4, 5); }},
      {"HyperGeometricEq S > N", rsHyperGeometricInvalid,
       [] { return HyperGeometricEq(5, 6, 1, 0); }},
      {"HyperGeometricLess X > S", rsHyperGeometricInvalid,
       [] { return HyperGeometricLess(10, 3, 4, 4); }},
      {"HyperGeometricGreater M > N", rsHyperGeometricInvalid,
       [] { return HyperGeometricGreater(10, 3, 11, 1); }},
      {"PoissonEq mean 0", rsPoissonInvalid, [] { return PoissonEq(0, 1); }},
      {"PoissonLess mean < 0", rsPoissonInvalid, [] { return PoissonLess(-1, 1); }},
      {"PoissonGreater mean 0", rsPoissonInvalid, [] { return PoissonGreater(0, 1); }},
  };
  for (const ErrorCase& c : cases) {
    try {
      c.call();
      ADD_FAILURE() << c.what << ": no EMathError";
    } catch (const EMathError& e) {
      EXPECT_EQ(e.Ident(), c.ident) << c.what << " raised " << ResStringName(e.Ident());
    }
  }
}

// The ends of the domains, where the value is exact.
TEST(PreciseEdges, ExactValuesAtTheEnds) {
  const struct {
    const char* what;
    Extended got;
    Extended want;
  } cases[] = {
      {"NormalLess(0)", NormalLess(0), 0.5L},
      {"NormalGreater(inf)", NormalGreater(kInf), 0},
      {"IncompleteGamma(2, 0)", IncompleteGamma(2, 0), 0},
      {"IncompleteGammaUpper(2, inf)", IncompleteGammaUpper(2, kInf), 0},
      {"StudentTLess(0, 7)", StudentTLess(0, 7), 0.5L},
      {"StudentTLess(-inf, 3)", StudentTLess(-kInf, 3), 0},
      {"InvStudentTLess(0, 3)", InvStudentTLess(0, 3), -kInf},
      {"InvStudentTGreater(0.5, 3)", InvStudentTGreater(0.5L, 3), 0},
      {"InvFDistLess(1, 2, 3)", InvFDistLess(1, 2, 3), 0},
      {"InvChiSquareLess(0, 4)", InvChiSquareLess(0, 4), 0},
      {"InvChiSquareGreater(0, 4)", InvChiSquareGreater(0, 4), kInf},
      {"InvBetaDistLess(1, 2, 3)", InvBetaDistLess(1, 2, 3), 1},
      {"InvBetaDistLess(0, 2, 3, 5, 1)", InvBetaDistLess(0, 2, 3, 5, 1), 1},
      {"BetaDistLess(-1, 2, 3)", BetaDistLess(-1, 2, 3), 0},
      {"BetaDistGreater(2, 2, 3)", BetaDistGreater(2, 2, 3), 0},
      {"BetaPDF(0, 1, 3)", BetaPDF(0, 1, 3), 3},
      {"ChiSquarePDF(0, 2)", ChiSquarePDF(0, 2), 0.5L},
      {"FDistPDF(0, 2, 5)", FDistPDF(0, 2, 5), 1},
      {"ExponentialLess(2, 0)", ExponentialLess(2, 0), 0},
      {"LogNormalLess(0, 1, 0)", LogNormalLess(0, 1, 0), 0},
      {"LogNormalGreater(0, 1, -1)", LogNormalGreater(0, 1, -1), 1},
      {"BinomialLess(0.5, 4, 0)", BinomialLess(0.5L, 4, 0), 0},
      {"BinomialGreater(0.5, 4, 4)", BinomialGreater(0.5L, 4, 4), 0},
      {"BinomialEq(0, 4, 0)", BinomialEq(0, 4, 0), 1},
      {"BinomialEq(1, 4, 3)", BinomialEq(1, 4, 3), 0},
      {"HyperGeometricEq(10, 3, 4, 4)", HyperGeometricEq(10, 3, 4, 4), 0},
      {"HyperGeometricLess(10, 10, 4, 4)", HyperGeometricLess(10, 10, 4, 4), 0},
      {"PoissonLess(3, 0)", PoissonLess(3, 0), 0},
      {"PoissonEq(2, 0)", PoissonEq(2, 0), std::exp(-2.0L)},
  };
  for (const auto& c : cases) EXPECT_EQ(c.got, c.want) << c.what;
}

}  // namespace
}  // namespace tovrin
