// tovrin eval --precise: the precise distribution family, by name.
#include "tools/Registry.h"
#include "tools/Subcommands.h"
#include "tovrin/statistics/TOVRINPrecise.h"

namespace tovrin::cli {
namespace {

using E = Extended;
using U = LongWord;
namespace p = tovrin::precise;

#define TOVRIN_PRECISE(Name) TOVRIN_CALLABLE(p::Name)

void AddPreciseContinuous(CallableTable& t) {
  AddScalar<E>(t, "NormalZ", {"Z"}, TOVRIN_PRECISE(NormalZ));
  AddScalar<E>(t, "NormalLess", {"Z"}, TOVRIN_PRECISE(NormalLess));
  AddScalar<E>(t, "NormalGreater", {"Z"}, TOVRIN_PRECISE(NormalGreater));
  AddScalar<E>(t, "InvNormalLess", {"P"}, TOVRIN_PRECISE(InvNormalLess));
  AddScalar<E>(t, "InvNormalGreater", {"P"}, TOVRIN_PRECISE(InvNormalGreater));
  AddScalar<E>(t, "ZAlpha", {"Alpha"}, TOVRIN_PRECISE(ZAlpha));
  const std::array<const char*, 3> msx{"Mean", "StdDev", "X"};
  const std::array<const char*, 3> msp{"Mean", "StdDev", "P"};
  AddScalar<E, E, E>(t, "NormalPDF", msx, TOVRIN_PRECISE(NormalPDF));
  AddScalar<E, E, E>(t, "NormalDistLess", msx, TOVRIN_PRECISE(NormalDistLess));
  AddScalar<E, E, E>(t, "NormalDistGreater", msx, TOVRIN_PRECISE(NormalDistGreater));
  AddScalar<E, E, E>(t, "InvNormalDistLess", msp, TOVRIN_PRECISE(InvNormalDistLess));
  AddScalar<E, E, E>(t, "InvNormalDistGreater", msp, TOVRIN_PRECISE(InvNormalDistGreater));
  AddScalar<E, E, E>(t, "LogNormalPDF", msx, TOVRIN_PRECISE(LogNormalPDF));
  AddScalar<E, E, E>(t, "LogNormalLess", msx, TOVRIN_PRECISE(LogNormalLess));
  AddScalar<E, E, E>(t, "LogNormalGreater", msx, TOVRIN_PRECISE(LogNormalGreater));
  AddScalar<E, E, E>(t, "InvLogNormalLess", msp, TOVRIN_PRECISE(InvLogNormalLess));
  AddScalar<E, E, E>(t, "InvLogNormalGreater", msp, TOVRIN_PRECISE(InvLogNormalGreater));
  AddScalar<E, E>(t, "IncompleteGamma", {"A", "X"}, TOVRIN_PRECISE(IncompleteGamma));
  AddScalar<E, E>(t, "IncompleteGammaUpper", {"A", "X"}, TOVRIN_PRECISE(IncompleteGammaUpper));
  AddScalar<E, E>(t, "ChiSquareLess", {"X", "DF"}, TOVRIN_PRECISE(ChiSquareLess));
  AddScalar<E, E>(t, "ChiSquareGreater", {"X", "DF"}, TOVRIN_PRECISE(ChiSquareGreater));
  AddScalar<E, E>(t, "InvChiSquareLess", {"P", "DF"}, TOVRIN_PRECISE(InvChiSquareLess));
  AddScalar<E, E>(t, "InvChiSquareGreater", {"P", "DF"}, TOVRIN_PRECISE(InvChiSquareGreater));
  AddScalar<E, E>(t, "ChiSquarePDF", {"X", "DF"}, TOVRIN_PRECISE(ChiSquarePDF));
  const std::array<const char*, 3> xdd{"X", "DF1", "DF2"};
  const std::array<const char*, 3> pdd{"P", "DF1", "DF2"};
  AddScalar<E, E, E>(t, "FDistLess", xdd, TOVRIN_PRECISE(FDistLess));
  AddScalar<E, E, E>(t, "FDistGreater", xdd, TOVRIN_PRECISE(FDistGreater));
  AddScalar<E, E, E>(t, "InvFDistLess", pdd, TOVRIN_PRECISE(InvFDistLess));
  AddScalar<E, E, E>(t, "InvFDistGreater", pdd, TOVRIN_PRECISE(InvFDistGreater));
  AddScalar<E, E, E>(t, "FDistPDF", xdd, TOVRIN_PRECISE(FDistPDF));
  AddScalar<E, E>(t, "StudentTLess", {"T", "DF"}, TOVRIN_PRECISE(StudentTLess));
  AddScalar<E, E>(t, "StudentTGreater", {"T", "DF"}, TOVRIN_PRECISE(StudentTGreater));
  AddScalar<E, E>(t, "InvStudentTLess", {"P", "DF"}, TOVRIN_PRECISE(InvStudentTLess));
  AddScalar<E, E>(t, "InvStudentTGreater", {"P", "DF"}, TOVRIN_PRECISE(InvStudentTGreater));
  AddScalar<E, E>(t, "StudentTPDF", {"T", "DF"}, TOVRIN_PRECISE(StudentTPDF));
  AddScalar<E, E>(t, "ExponentialLess", {"Mean", "X"}, TOVRIN_PRECISE(ExponentialLess));
  AddScalar<E, E>(t, "ExponentialGreater", {"Mean", "X"}, TOVRIN_PRECISE(ExponentialGreater));
  AddScalar<E, E>(t, "ExponentialPDF", {"X", "Mean"}, TOVRIN_PRECISE(ExponentialPDF));
  const std::array<const char*, 3> xab{"X", "A", "B"};
  const std::array<const char*, 5> xablu{"X", "A", "B", "Lower", "Upper"};
  const std::array<const char*, 3> pab{"P", "A", "B"};
  const std::array<const char*, 5> pablu{"P", "A", "B", "Lower", "Upper"};
  AddScalar<E, E, E>(t, "BetaDistLess", xab, TOVRIN_PRECISE(BetaDistLess));
  AddScalar<E, E, E, E, E>(t, "BetaDistLess", xablu, TOVRIN_PRECISE(BetaDistLess));
  AddScalar<E, E, E>(t, "BetaDistGreater", xab, TOVRIN_PRECISE(BetaDistGreater));
  AddScalar<E, E, E, E, E>(t, "BetaDistGreater", xablu, TOVRIN_PRECISE(BetaDistGreater));
  AddScalar<E, E, E>(t, "InvBetaDistLess", pab, TOVRIN_PRECISE(InvBetaDistLess));
  AddScalar<E, E, E, E, E>(t, "InvBetaDistLess", pablu, TOVRIN_PRECISE(InvBetaDistLess));
  AddScalar<E, E, E>(t, "InvBetaDistGreater", pab, TOVRIN_PRECISE(InvBetaDistGreater));
  AddScalar<E, E, E, E, E>(t, "InvBetaDistGreater", pablu, TOVRIN_PRECISE(InvBetaDistGreater));
  AddScalar<E, E, E>(t, "BetaPDF", xab, TOVRIN_PRECISE(BetaPDF));
  AddScalar<E, E, E, E, E>(t, "BetaPDF", xablu, TOVRIN_PRECISE(BetaPDF));
}

void AddPreciseDiscrete(CallableTable& t) {
  const std::array<const char*, 3> pnr{"P", "N", "R"};
  const std::array<const char*, 4> nsmx{"N", "S", "M", "X"};
  AddScalar<E, U, U>(t, "BinomialEq", pnr, TOVRIN_PRECISE(BinomialEq));
  AddScalar<E, U, U>(t, "BinomialLess", pnr, TOVRIN_PRECISE(BinomialLess));
  AddScalar<E, U, U>(t, "BinomialGreater", pnr, TOVRIN_PRECISE(BinomialGreater));
  AddScalar<U, U, U, U>(t, "HyperGeometricEq", nsmx, TOVRIN_PRECISE(HyperGeometricEq));
  AddScalar<U, U, U, U>(t, "HyperGeometricLess", nsmx, TOVRIN_PRECISE(HyperGeometricLess));
  AddScalar<U, U, U, U>(t, "HyperGeometricGreater", nsmx, TOVRIN_PRECISE(HyperGeometricGreater));
  AddScalar<E, U>(t, "PoissonEq", {"Mean", "X"}, TOVRIN_PRECISE(PoissonEq));
  AddScalar<E, U>(t, "PoissonLess", {"Mean", "X"}, TOVRIN_PRECISE(PoissonLess));
  AddScalar<E, U>(t, "PoissonGreater", {"Mean", "X"}, TOVRIN_PRECISE(PoissonGreater));
}

}  // namespace

const CallableTable& PreciseEvalTable() {
  static const CallableTable table = [] {
    CallableTable t;
    AddPreciseContinuous(t);
    AddPreciseDiscrete(t);
    return t;
  }();
  return table;
}

}  // namespace tovrin::cli
