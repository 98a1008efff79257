// The precise distribution family against the mpmath table of TOVRINPrecise_reference.py, and
// its argument errors.
#include <cmath>
#include <limits>
#include <map>
#include <string>
#include <utility>

#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/statistics/TOVRINPrecise_testing.h"
#include "tovrin/testing/TOVRIN_testing.h"

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

// Each check of each family raises its identifier, in the classic functions' order (the
// argument checked first raises).
TEST(PreciseArguments, RaiseTheClassicIdentifiers) {
  testing::ExpectEachRaises(
      rsValue01,
      {[] { InvNormalLess(0); }, [] { InvNormalGreater(1); }, [] { InvNormalLess(kNaN); },
       [] { InvNormalDistLess(0, -1, 2); }, [] { InvLogNormalLess(0, 1, 1); }});
  testing::ExpectEachRaises(
      rsStdDev, {[] { NormalPDF(0, 0, 1); }, [] { NormalDistLess(0, -1, 1); },
                 [] { NormalDistGreater(0, 1e-13L, 1); }, [] { InvNormalDistGreater(0, -1, 0.5L); },
                 [] { LogNormalLess(0, 0, 1); }, [] { InvLogNormalGreater(0, 0, 0.5L); }});
  testing::ExpectEachRaises(rsValueGZero,
                            {[] { LogNormalPDF(0, 1, 0); }, [] { IncompleteGammaUpper(0, 1); },
                             [] { FDistLess(0, 0, 1); }, [] { BetaDistLess(0.5L, 0, 1); },
                             [] { InvBetaDistGreater(0.5L, 1, -1); }, [] { BetaPDF(0.5L, 1, 0); }});
  testing::ExpectEachRaises(rsValueGEZero,
                            {[] { IncompleteGamma(-1, -1); }, [] { ChiSquareLess(-1, 0); },
                             [] { InvChiSquareGreater(1.5L, 3); }, [] { FDistPDF(-1, 1, 1); }});
  testing::ExpectEachRaises(rsDF,
                            {[] { ChiSquareGreater(1, 0); }, [] { ChiSquarePDF(1, -2); },
                             [] { InvChiSquareLess(2, 0); }, [] { FDistGreater(1, 1, 0); },
                             [] { FDistPDF(-1, 0, 1); }, [] { InvFDistGreater(0.5L, 1, 0); },
                             [] { StudentTLess(1, 0); }, [] { StudentTGreater(1, kNaN); },
                             [] { StudentTPDF(1, -1); }, [] { InvStudentTGreater(0.5L, 0); }});
  testing::ExpectEachRaises(rsValue01Inc,
                            {[] { InvFDistLess(-0.1L, 0, 1); }, [] { InvStudentTLess(2, 0); },
                             [] { InvBetaDistLess(1.5L, 0, 1); }});
  testing::ExpectEachRaises(rsExpDistInvalid,
                            {[] { ExponentialLess(0, 1); }, [] { ExponentialGreater(1, -1); },
                             [] { ExponentialPDF(1, kNaN); }});
  testing::ExpectEachRaises(
      rsSameValue, {[] { BetaDistGreater(0.5L, 0, 1, 2, 2); },
                    [] { InvBetaDistLess(2, 1, 1, 3, 3); }, [] { BetaPDF(0.5L, 1, 1, 1, 1); }});
  testing::ExpectEachRaises(rsBinomDistInvalid,
                            {[] { BinomialEq(0.5L, 0, 0); }, [] { BinomialLess(1.5L, 4, 1); },
                             [] { BinomialGreater(0.5L, 4, 5); }});
  testing::ExpectEachRaises(rsHyperGeometricInvalid, {[] { HyperGeometricEq(5, 6, 1, 0); },
                                                      [] { HyperGeometricLess(10, 3, 4, 4); },
                                                      [] { HyperGeometricGreater(10, 3, 11, 1); }});
  testing::ExpectEachRaises(rsPoissonInvalid, {[] { PoissonEq(0, 1); }, [] { PoissonLess(-1, 1); },
                                               [] { PoissonGreater(0, 1); }});
}

// The ends of the domains, where the value is exact.
TEST(PreciseEdges, ExactValuesAtTheEnds) {
  const std::pair<Extended, Extended> cases[] = {{NormalLess(0), 0.5L},
                                                 {NormalGreater(kInf), 0},
                                                 {IncompleteGamma(2, 0), 0},
                                                 {IncompleteGammaUpper(2, kInf), 0},
                                                 {StudentTLess(0, 7), 0.5L},
                                                 {StudentTLess(-kInf, 3), 0},
                                                 {InvStudentTLess(0, 3), -kInf},
                                                 {InvStudentTGreater(0.5L, 3), 0},
                                                 {InvFDistLess(1, 2, 3), 0},
                                                 {InvChiSquareLess(0, 4), 0},
                                                 {InvChiSquareGreater(0, 4), kInf},
                                                 {InvBetaDistLess(1, 2, 3), 1},
                                                 {InvBetaDistLess(0, 2, 3, 5, 1), 1},
                                                 {BetaDistLess(-1, 2, 3), 0},
                                                 {BetaDistGreater(2, 2, 3), 0},
                                                 {BetaPDF(0, 1, 3), 3},
                                                 {ChiSquarePDF(0, 2), 0.5L},
                                                 {FDistPDF(0, 2, 5), 1},
                                                 {ExponentialLess(2, 0), 0},
                                                 {LogNormalLess(0, 1, 0), 0},
                                                 {LogNormalGreater(0, 1, -1), 1},
                                                 {BinomialLess(0.5L, 4, 0), 0},
                                                 {BinomialGreater(0.5L, 4, 4), 0},
                                                 {BinomialEq(0, 4, 0), 1},
                                                 {BinomialEq(1, 4, 3), 0},
                                                 {HyperGeometricEq(10, 3, 4, 4), 0},
                                                 {HyperGeometricLess(10, 10, 4, 4), 0},
                                                 {PoissonLess(3, 0), 0},
                                                 {PoissonEq(2, 0), std::exp(-2.0L)}};
  for (std::size_t i = 0; i < std::size(cases); ++i) {
    EXPECT_EQ(cases[i].first, cases[i].second) << "case " << i;
  }
}

}  // namespace
}  // namespace tovrin
