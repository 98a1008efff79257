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

// Every function of the family that the reference table exercises, by name.
inline constexpr NamedCall kPreciseCalls[] = {
    {"NormalZ", [](const Extended* a) { return precise::NormalZ(a[0]); }},
    {"NormalLess", [](const Extended* a) { return precise::NormalLess(a[0]); }},
    {"NormalGreater", [](const Extended* a) { return precise::NormalGreater(a[0]); }},
    {"InvNormalLess", [](const Extended* a) { return precise::InvNormalLess(a[0]); }},
    {"InvNormalGreater", [](const Extended* a) { return precise::InvNormalGreater(a[0]); }},
    {"NormalPDF", [](const Extended* a) { return precise::NormalPDF(a[0], a[1], a[2]); }},
    {"NormalDistLess", [](const Extended* a) { return precise::NormalDistLess(a[0], a[1], a[2]); }},
    {"NormalDistGreater",
     [](const Extended* a) { return precise::NormalDistGreater(a[0], a[1], a[2]); }},
    {"InvNormalDistLess",
     [](const Extended* a) { return precise::InvNormalDistLess(a[0], a[1], a[2]); }},
    {"InvNormalDistGreater",
     [](const Extended* a) { return precise::InvNormalDistGreater(a[0], a[1], a[2]); }},
    {"LogNormalPDF", [](const Extended* a) { return precise::LogNormalPDF(a[0], a[1], a[2]); }},
    {"LogNormalLess", [](const Extended* a) { return precise::LogNormalLess(a[0], a[1], a[2]); }},
    {"LogNormalGreater",
     [](const Extended* a) { return precise::LogNormalGreater(a[0], a[1], a[2]); }},
    {"InvLogNormalLess",
     [](const Extended* a) { return precise::InvLogNormalLess(a[0], a[1], a[2]); }},
    {"InvLogNormalGreater",
     [](const Extended* a) { return precise::InvLogNormalGreater(a[0], a[1], a[2]); }},
    {"IncompleteGamma", [](const Extended* a) { return precise::IncompleteGamma(a[0], a[1]); }},
    {"IncompleteGammaUpper",
     [](const Extended* a) { return precise::IncompleteGammaUpper(a[0], a[1]); }},
    {"ChiSquareLess", [](const Extended* a) { return precise::ChiSquareLess(a[0], a[1]); }},
    {"ChiSquareGreater", [](const Extended* a) { return precise::ChiSquareGreater(a[0], a[1]); }},
    {"InvChiSquareLess", [](const Extended* a) { return precise::InvChiSquareLess(a[0], a[1]); }},
    {"InvChiSquareGreater",
     [](const Extended* a) { return precise::InvChiSquareGreater(a[0], a[1]); }},
    {"ChiSquarePDF", [](const Extended* a) { return precise::ChiSquarePDF(a[0], a[1]); }},
    {"FDistLess", [](const Extended* a) { return precise::FDistLess(a[0], a[1], a[2]); }},
    {"FDistGreater", [](const Extended* a) { return precise::FDistGreater(a[0], a[1], a[2]); }},
    {"InvFDistLess", [](const Extended* a) { return precise::InvFDistLess(a[0], a[1], a[2]); }},
    {"InvFDistGreater",
     [](const Extended* a) { return precise::InvFDistGreater(a[0], a[1], a[2]); }},
    {"FDistPDF", [](const Extended* a) { return precise::FDistPDF(a[0], a[1], a[2]); }},
    {"StudentTLess", [](const Extended* a) { return precise::StudentTLess(a[0], a[1]); }},
    {"StudentTGreater", [](const Extended* a) { return precise::StudentTGreater(a[0], a[1]); }},
    {"InvStudentTLess", [](const Extended* a) { return precise::InvStudentTLess(a[0], a[1]); }},
    {"InvStudentTGreater",
     [](const Extended* a) { return precise::InvStudentTGreater(a[0], a[1]); }},
    {"StudentTPDF", [](const Extended* a) { return precise::StudentTPDF(a[0], a[1]); }},
    {"ExponentialLess", [](const Extended* a) { return precise::ExponentialLess(a[0], a[1]); }},
    {"ExponentialGreater",
     [](const Extended* a) { return precise::ExponentialGreater(a[0], a[1]); }},
    {"ExponentialPDF", [](const Extended* a) { return precise::ExponentialPDF(a[0], a[1]); }},
    {"BetaDistLess",
     [](const Extended* a) {
       return a[3] == a[4] ? precise::BetaDistLess(a[0], a[1], a[2])
                           : precise::BetaDistLess(a[0], a[1], a[2], a[3], a[4]);
     }},
    {"BetaDistGreater",
     [](const Extended* a) {
       return a[3] == a[4] ? precise::BetaDistGreater(a[0], a[1], a[2])
                           : precise::BetaDistGreater(a[0], a[1], a[2], a[3], a[4]);
     }},
    {"InvBetaDistLess",
     [](const Extended* a) { return precise::InvBetaDistLess(a[0], a[1], a[2]); }},
    {"InvBetaDistGreater",
     [](const Extended* a) { return precise::InvBetaDistGreater(a[0], a[1], a[2]); }},
    {"BetaPDF",
     [](const Extended* a) {
       return a[3] == a[4] ? precise::BetaPDF(a[0], a[1], a[2])
                           : precise::BetaPDF(a[0], a[1], a[2], a[3], a[4]);
     }},
    {"BinomialEq", [](const Extended* a) { return precise::BinomialEq(a[0], U(a[1]), U(a[2])); }},
    {"BinomialLess",
     [](const Extended* a) { return precise::BinomialLess(a[0], U(a[1]), U(a[2])); }},
    {"BinomialGreater",
     [](const Extended* a) { return precise::BinomialGreater(a[0], U(a[1]), U(a[2])); }},
    {"HyperGeometricEq",
     [](const Extended* a) {
       return precise::HyperGeometricEq(U(a[0]), U(a[1]), U(a[2]), U(a[3]));
     }},
    {"HyperGeometricLess",
     [](const Extended* a) {
       return precise::HyperGeometricLess(U(a[0]), U(a[1]), U(a[2]), U(a[3]));
     }},
    {"HyperGeometricGreater",
     [](const Extended* a) {
       return precise::HyperGeometricGreater(U(a[0]), U(a[1]), U(a[2]), U(a[3]));
     }},
    {"PoissonEq", [](const Extended* a) { return precise::PoissonEq(a[0], U(a[1])); }},
    {"PoissonLess", [](const Extended* a) { return precise::PoissonLess(a[0], U(a[1])); }},
    {"PoissonGreater", [](const Extended* a) { return precise::PoissonGreater(a[0], U(a[1])); }},
};

inline PreciseCall FindPreciseCall(std::string_view name) {
  for (const NamedCall& c : kPreciseCalls) {
    if (c.name == name) return c.call;
  }
  return nullptr;
}

inline bool IsInverse(std::string_view name) { return name.starts_with("Inv"); }

}  // namespace tovrin::testing_precise
