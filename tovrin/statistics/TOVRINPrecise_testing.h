// Shared by the precise family's test and benchmark: the reference rows and a call by name.
#pragma once

#include <cstddef>
#include <string_view>

#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/statistics/TOVRINPrecise.h"

namespace tovrin::testing_precise {

struct PreciseRow {
  const char* name;
  Extended args[5];
  Extended expected;
};
#include "tovrin/statistics/TOVRINPrecise_reference.inc"

using PreciseCall = Extended (*)(const Extended* a);

struct NamedCall {
  std::string_view name;
  PreciseCall call;
};

inline LongWord U(Extended v) { return static_cast<LongWord>(v); }

// Every function of the family that the reference table exercises, by name, by its arguments:
// 1, 2 or 3 Extended; B(inomial) P, N, R; H(ypergeometric) N, S, M, X; P(oisson) mean, X; the
// beta family takes its bounds from a[3] and a[4] when they differ.
// clang-format off
#define TOVRIN_CALL(F, ...) NamedCall{#F, [](const Extended* a) { return precise::F(__VA_ARGS__); }}
#define TOVRIN_1(F) TOVRIN_CALL(F, a[0])
#define TOVRIN_2(F) TOVRIN_CALL(F, a[0], a[1])
#define TOVRIN_3(F) TOVRIN_CALL(F, a[0], a[1], a[2])
#define TOVRIN_B(F) TOVRIN_CALL(F, a[0], U(a[1]), U(a[2]))
#define TOVRIN_H(F) TOVRIN_CALL(F, U(a[0]), U(a[1]), U(a[2]), U(a[3]))
#define TOVRIN_P(F) TOVRIN_CALL(F, a[0], U(a[1]))
#define TOVRIN_BOUNDED(F) NamedCall{#F, [](const Extended* a) {                   \
    return a[3] == a[4] ? precise::F(a[0], a[1], a[2])                               \
                        : precise::F(a[0], a[1], a[2], a[3], a[4]); }}
// clang-format on
inline constexpr NamedCall kPreciseCalls[] = {
    // normal and log-normal
    TOVRIN_1(NormalZ), TOVRIN_1(NormalLess), TOVRIN_1(NormalGreater), TOVRIN_1(InvNormalLess),
    TOVRIN_1(InvNormalGreater), TOVRIN_3(NormalPDF), TOVRIN_3(NormalDistLess),
    TOVRIN_3(NormalDistGreater), TOVRIN_3(InvNormalDistLess), TOVRIN_3(InvNormalDistGreater),
    TOVRIN_3(LogNormalPDF), TOVRIN_3(LogNormalLess), TOVRIN_3(LogNormalGreater),
    TOVRIN_3(InvLogNormalLess), TOVRIN_3(InvLogNormalGreater),
    // gamma and chi-square
    TOVRIN_2(IncompleteGamma), TOVRIN_2(IncompleteGammaUpper), TOVRIN_2(ChiSquareLess),
    TOVRIN_2(ChiSquareGreater), TOVRIN_2(InvChiSquareLess), TOVRIN_2(InvChiSquareGreater),
    TOVRIN_2(ChiSquarePDF),
    // F, Student's t, exponential
    TOVRIN_3(FDistLess), TOVRIN_3(FDistGreater), TOVRIN_3(InvFDistLess), TOVRIN_3(InvFDistGreater),
    TOVRIN_3(FDistPDF), TOVRIN_2(StudentTLess), TOVRIN_2(StudentTGreater),
    TOVRIN_2(InvStudentTLess), TOVRIN_2(InvStudentTGreater), TOVRIN_2(StudentTPDF),
    TOVRIN_2(ExponentialLess), TOVRIN_2(ExponentialGreater), TOVRIN_2(ExponentialPDF),
    // beta
    TOVRIN_BOUNDED(BetaDistLess), TOVRIN_BOUNDED(BetaDistGreater), TOVRIN_3(InvBetaDistLess),
    TOVRIN_3(InvBetaDistGreater), TOVRIN_BOUNDED(BetaPDF),
    // discrete
    TOVRIN_B(BinomialEq), TOVRIN_B(BinomialLess), TOVRIN_B(BinomialGreater),
    TOVRIN_H(HyperGeometricEq), TOVRIN_H(HyperGeometricLess), TOVRIN_H(HyperGeometricGreater),
    TOVRIN_P(PoissonEq), TOVRIN_P(PoissonLess), TOVRIN_P(PoissonGreater)};
#undef TOVRIN_CALL
#undef TOVRIN_1
#undef TOVRIN_2
#undef TOVRIN_3
#undef TOVRIN_B
#undef TOVRIN_H
#undef TOVRIN_P
#undef TOVRIN_BOUNDED

inline PreciseCall FindPreciseCall(std::string_view name) {
  for (const NamedCall& c : kPreciseCalls) {
    if (c.name == name) return c.call;
  }
  return nullptr;
}

inline bool IsInverse(std::string_view name) { return name.starts_with("Inv"); }

}  // namespace tovrin::testing_precise
