// tovrin eval: any scalar function of the library, by its name.
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Registry.h"
#include "tools/Subcommands.h"
#include "tovrin/tovrin.h"

namespace tovrin::cli {
namespace {

using E = Extended;
using U = LongWord;

constexpr std::string_view kHelp =
    "Usage: tovrin eval [--digits N] FUNCTION [ARG...]\n"
    "       tovrin eval --list\n"
    "       tovrin eval --precise FUNCTION [ARG...]\n"
    "       tovrin eval --precise --list\n"
    "\n"
    "Calls the library's scalar function FUNCTION (its exact name) with the ARGs and prints\n"
    "the result with 21 significant digits (N with --digits N), a Boolean as True or False.\n"
    "Functions with several results print one line each: name, TAB, value.\n"
    "\n"
    "Examples:\n"
    "  tovrin eval NormalLess 1.96\n"
    "  tovrin eval --digits 6 NormalLess 1.96\n"
    "  tovrin eval InvStudentTLess 0.975 10\n"
    "  tovrin eval BinomialBetween 0.5 4 1 3\n"
    "  tovrin eval AreaTriangle 3 4 5\n"
    "\n"
    "Money values are written and printed as their stored integers: TQENCurrency is the\n"
    "amount x 100, TQENLongCurrency x 1000000, Currency x 10000. An argument may name its\n"
    "type, as in 'Currency2Float Currency:15000' (1.5), to choose among overloads; a bare\n"
    "integer takes the first form listed.\n"
    "\n"
    "An error raised by the function is printed on standard error (exit status 1).\n"
    "\n"
    "Options:\n"
    "  --digits N   significant digits of real results, 1 to 40 (default 21, which tell\n"
    "               every Extended apart)\n"
    "  --list       list the functions with their argument names and what they compute\n"
    "  --precise    use the precise distribution family (tovrin::precise) instead\n"
    "  --help       show this help\n";

std::string Labelled(const char* Name, Extended Value) {
  return std::string(Name) + "\t" + FormatSignificant(Value);
}

void AddFoundation(CallableTable& t) {
  AddScalar<E>(t, "FloatIsZero", {"X"}, TOVRIN_CALLABLE(FloatIsZero));
  AddScalar<E>(t, "FloatIsNotZero", {"X"}, TOVRIN_CALLABLE(FloatIsNotZero));
  AddScalar<E>(t, "FloatIsPositive", {"X"}, TOVRIN_CALLABLE(FloatIsPositive));
  AddScalar<E>(t, "FloatIsNegative", {"X"}, TOVRIN_CALLABLE(FloatIsNegative));
  AddScalar<E, E>(t, "SameFloat", {"X", "Y"}, TOVRIN_CALLABLE(SameFloat));
  AddScalar<E, E>(t, "NotSameFloat", {"X", "Y"}, TOVRIN_CALLABLE(NotSameFloat));
  AddScalar<E, E>(t, "MinXY", {"X", "Y"}, TOVRIN_CALLABLE(MinXY));
  AddScalar<E, E>(t, "MaxXY", {"X", "Y"}, TOVRIN_CALLABLE(MaxXY));
  AddScalar<E, E>(t, "SignXY", {"X", "Y"}, TOVRIN_CALLABLE(SignXY));
  AddScalar<E, E>(t, "XtoY", {"X", "Y"}, TOVRIN_CALLABLE(XtoY));
  AddScalar<E>(t, "TwoToY", {"Y"}, TOVRIN_CALLABLE(TwoToY));
  AddScalar<E>(t, "QENLog10", {"X"}, TOVRIN_CALLABLE(QENLog10));
  AddScalar<E>(t, "QENLog2", {"X"}, TOVRIN_CALLABLE(QENLog2));
  AddScalar<E>(t, "CubeRoot", {"X"}, TOVRIN_CALLABLE(CubeRoot));
  AddScalar<E>(t, "QENArcCos", {"X"}, TOVRIN_CALLABLE(QENArcCos));
  AddScalar<E>(t, "QENTan", {"X"}, TOVRIN_CALLABLE(QENTan));
  AddScalar<E, E, E, E>(t, "QENDistance", {"X1", "Y1", "X2", "Y2"}, TOVRIN_CALLABLE(QENDistance));
  AddScalar<E>(t, "Gamma", {"X"}, TOVRIN_CALLABLE(Gamma));
  AddScalar<E>(t, "LnGamma", {"X"}, TOVRIN_CALLABLE(LnGamma));
  AddScalar<E, E>(t, "Beta", {"A", "B"}, TOVRIN_CALLABLE(Beta));
  AddScalar<E, E, E>(t, "IncompleteBeta", {"X", "A", "B"}, TOVRIN_CALLABLE(IncompleteBeta));
  AddScalar<E, E, E>(t, "InverseIncompleteBeta", {"P", "A", "B"},
                     TOVRIN_CALLABLE(InverseIncompleteBeta));
}

void AddMoney(CallableTable& t) {
  using C = TQENCurrency;
  using L = TQENLongCurrency;
  using Y = Currency;
  AddScalar<C>(t, "Currency2Float", {"X:TQENCurrency"}, TOVRIN_CALLABLE(Currency2Float));
  AddScalar<L>(t, "Currency2Float", {"X:TQENLongCurrency"}, TOVRIN_CALLABLE(Currency2Float));
  AddScalar<Y>(t, "Currency2Float", {"X:Currency"}, TOVRIN_CALLABLE(Currency2Float));
  AddScalar<E>(t, "Float2QENCurrency", {"X"}, TOVRIN_CALLABLE(Float2QENCurrency));
  AddScalar<E>(t, "Float2QENLongCurrency", {"X"}, TOVRIN_CALLABLE(Float2QENLongCurrency));
  AddScalar<C>(t, "QENCurrency2QENLongCurrency", {"X:TQENCurrency"},
               TOVRIN_CALLABLE(QENCurrency2QENLongCurrency));
  AddScalar<C>(t, "QENCurrency2Currency", {"X:TQENCurrency"},
               TOVRIN_CALLABLE(QENCurrency2Currency));
  AddScalar<L>(t, "QENLongCurrency2QENCurrency", {"X:TQENLongCurrency"},
               TOVRIN_CALLABLE(QENLongCurrency2QENCurrency));
  AddScalar<L>(t, "QENLongCurrency2Currency", {"X:TQENLongCurrency"},
               TOVRIN_CALLABLE(QENLongCurrency2Currency));
  AddScalar<Y>(t, "Currency2QENCurrency", {"X:Currency"}, TOVRIN_CALLABLE(Currency2QENCurrency));
  AddScalar<Y>(t, "Currency2QENLongCurrency", {"X:Currency"},
               TOVRIN_CALLABLE(Currency2QENLongCurrency));
  AddScalar<Y, Y>(t, "SameCurrency", {"X:Currency", "Y:Currency"}, TOVRIN_CALLABLE(SameCurrency));
}

void AddSample(CallableTable& t) {
  AddScalar<E, E>(t, "HeronianMean", {"A", "B"}, TOVRIN_CALLABLE(HeronianMean));
}

void AddContinuous(CallableTable& t) {
  AddScalar<E>(t, "NormalZ", {"Z"}, TOVRIN_CALLABLE(NormalZ));
  AddScalar<E>(t, "NormalLess", {"Z"}, TOVRIN_CALLABLE(NormalLess));
  AddScalar<E>(t, "NormalGreater", {"Z"}, TOVRIN_CALLABLE(NormalGreater));
  AddScalar<E>(t, "InvNormalLess", {"P"}, TOVRIN_CALLABLE(InvNormalLess));
  AddScalar<E>(t, "InvNormalGreater", {"P"}, TOVRIN_CALLABLE(InvNormalGreater));
  AddScalar<E>(t, "ZAlpha", {"Alpha"}, TOVRIN_CALLABLE(ZAlpha));
  AddScalar<E, E, E>(t, "NormalPDF", {"Mean", "StdDev", "X"}, TOVRIN_CALLABLE(NormalPDF));
  AddScalar<E, E, E>(t, "NormalDistLess", {"Mean", "StdDev", "X"}, TOVRIN_CALLABLE(NormalDistLess));
  AddScalar<E, E, E>(t, "NormalDistGreater", {"Mean", "StdDev", "X"},
                     TOVRIN_CALLABLE(NormalDistGreater));
  AddScalar<E, E, E, E>(t, "NormalDistBetween", {"Mean", "StdDev", "X1", "X2"},
                        TOVRIN_CALLABLE(NormalDistBetween));
  AddScalar<E, E, E>(t, "InvNormalDistLess", {"Mean", "StdDev", "P"},
                     TOVRIN_CALLABLE(InvNormalDistLess));
  AddScalar<E, E, E>(t, "InvNormalDistGreater", {"Mean", "StdDev", "P"},
                     TOVRIN_CALLABLE(InvNormalDistGreater));
  AddScalar<E, E, E>(t, "LogNormalPDF", {"Mean", "StdDev", "X"}, TOVRIN_CALLABLE(LogNormalPDF));
  AddScalar<E, E, E>(t, "LogNormalLess", {"Mean", "StdDev", "X"}, TOVRIN_CALLABLE(LogNormalLess));
  AddScalar<E, E, E>(t, "LogNormalGreater", {"Mean", "StdDev", "X"},
                     TOVRIN_CALLABLE(LogNormalGreater));
  AddScalar<E, E, E, E>(t, "LogNormalBetween", {"Mean", "StdDev", "X1", "X2"},
                        TOVRIN_CALLABLE(LogNormalBetween));
  AddScalar<E, E, E>(t, "InvLogNormalLess", {"Mean", "StdDev", "P"},
                     TOVRIN_CALLABLE(InvLogNormalLess));
  AddScalar<E, E, E>(t, "InvLogNormalGreater", {"Mean", "StdDev", "P"},
                     TOVRIN_CALLABLE(InvLogNormalGreater));
  AddScalar<E, E>(t, "IncompleteGamma", {"A", "X"}, TOVRIN_CALLABLE(IncompleteGamma));
  AddScalar<E, E>(t, "IncompleteGamma2", {"A", "X"}, TOVRIN_CALLABLE(IncompleteGamma2));
  AddScalar<E, U>(t, "ChiSquareLess", {"X", "DF"}, TOVRIN_CALLABLE(ChiSquareLess));
  AddScalar<E, U>(t, "ChiSquareGreater", {"X", "DF"}, TOVRIN_CALLABLE(ChiSquareGreater));
  AddScalar<E, E, U>(t, "ChiSquareBetween", {"X1", "X2", "DF"}, TOVRIN_CALLABLE(ChiSquareBetween));
  AddScalar<E, U>(t, "InvChiSquareLess", {"P", "DF"}, TOVRIN_CALLABLE(InvChiSquareLess));
  AddScalar<E, U>(t, "InvChiSquareGreater", {"P", "DF"}, TOVRIN_CALLABLE(InvChiSquareGreater));
  AddScalar<E, U>(t, "ChiSquarePDF", {"X", "DF"}, TOVRIN_CALLABLE(ChiSquarePDF));
  AddScalar<E, U, U>(t, "FDistLess", {"X", "DF1", "DF2"}, TOVRIN_CALLABLE(FDistLess));
  AddScalar<E, U, U>(t, "FDistGreater", {"X", "DF1", "DF2"}, TOVRIN_CALLABLE(FDistGreater));
  AddScalar<E, E, U, U>(t, "FDistBetween", {"X1", "X2", "DF1", "DF2"},
                        TOVRIN_CALLABLE(FDistBetween));
  AddScalar<E, U, U>(t, "InvFDistLess", {"P", "DF1", "DF2"}, TOVRIN_CALLABLE(InvFDistLess));
  AddScalar<E, U, U>(t, "InvFDistGreater", {"P", "DF1", "DF2"}, TOVRIN_CALLABLE(InvFDistGreater));
  AddScalar<E, U, U>(t, "FDistPDF", {"X", "DF1", "DF2"}, TOVRIN_CALLABLE(FDistPDF));
  AddScalar<E, U>(t, "StudentTLess", {"T", "DF"}, TOVRIN_CALLABLE(StudentTLess));
  AddScalar<E, U>(t, "StudentTGreater", {"T", "DF"}, TOVRIN_CALLABLE(StudentTGreater));
  AddScalar<E, E, U>(t, "StudentTBetween", {"T1", "T2", "DF"}, TOVRIN_CALLABLE(StudentTBetween));
  AddScalar<E, U>(t, "InvStudentTLess", {"P", "DF"}, TOVRIN_CALLABLE(InvStudentTLess));
  AddScalar<E, U>(t, "InvStudentTGreater", {"P", "DF"}, TOVRIN_CALLABLE(InvStudentTGreater));
  AddScalar<E, U>(t, "StudentTPDF", {"T", "DF"}, TOVRIN_CALLABLE(StudentTPDF));
  AddScalar<E, E>(t, "ExponentialLess", {"Mean", "X"}, TOVRIN_CALLABLE(ExponentialLess));
  AddScalar<E, E>(t, "ExponentialGreater", {"Mean", "X"}, TOVRIN_CALLABLE(ExponentialGreater));
  AddScalar<E, E, E>(t, "ExponentialBetween", {"Mean", "X1", "X2"},
                     TOVRIN_CALLABLE(ExponentialBetween));
  AddScalar<E, E>(t, "ExponentialPDF", {"X", "Mean"}, TOVRIN_CALLABLE(ExponentialPDF));
  AddScalar<E, E, E>(t, "BetaDistLess", {"X", "A", "B"}, TOVRIN_CALLABLE(BetaDistLess));
  AddScalar<E, E, E, E, E>(t, "BetaDistLess", {"X", "A", "B", "Lower", "Upper"},
                           TOVRIN_CALLABLE(BetaDistLess));
  AddScalar<E, E, E>(t, "BetaDistGreater", {"X", "A", "B"}, TOVRIN_CALLABLE(BetaDistGreater));
  AddScalar<E, E, E, E, E>(t, "BetaDistGreater", {"X", "A", "B", "Lower", "Upper"},
                           TOVRIN_CALLABLE(BetaDistGreater));
  AddScalar<E, E, E, E>(t, "BetaDistBetween", {"X1", "X2", "A", "B"},
                        TOVRIN_CALLABLE(BetaDistBetween));
  AddScalar<E, E, E, E, E, E>(t, "BetaDistBetween", {"X1", "X2", "A", "B", "Lower", "Upper"},
                              TOVRIN_CALLABLE(BetaDistBetween));
  AddScalar<E, E, E>(t, "InvBetaDistLess", {"P", "A", "B"}, TOVRIN_CALLABLE(InvBetaDistLess));
  AddScalar<E, E, E, E, E>(t, "InvBetaDistLess", {"P", "A", "B", "Lower", "Upper"},
                           TOVRIN_CALLABLE(InvBetaDistLess));
  AddScalar<E, E, E>(t, "InvBetaDistGreater", {"P", "A", "B"}, TOVRIN_CALLABLE(InvBetaDistGreater));
  AddScalar<E, E, E, E, E>(t, "InvBetaDistGreater", {"P", "A", "B", "Lower", "Upper"},
                           TOVRIN_CALLABLE(InvBetaDistGreater));
  AddScalar<E, E, E>(t, "BetaPDF", {"X", "A", "B"}, TOVRIN_CALLABLE(BetaPDF));
  AddScalar<E, E, E, E, E>(t, "BetaPDF", {"X", "A", "B", "Lower", "Upper"},
                           TOVRIN_CALLABLE(BetaPDF));
}

void AddDiscrete(CallableTable& t) {
  AddScalar<U>(t, "Factorial", {"N"}, TOVRIN_CALLABLE(Factorial));
  AddScalar<U, U>(t, "Permutation", {"N", "R"}, TOVRIN_CALLABLE(Permutation));
  AddScalar<U, U>(t, "BinomialCoeff", {"N", "K"}, TOVRIN_CALLABLE(BinomialCoeff));
  AddScalar<E, U, U>(t, "BinomialEq", {"P", "N", "R"}, TOVRIN_CALLABLE(BinomialEq));
  AddScalar<E, U, U>(t, "BinomialLess", {"P", "N", "R"}, TOVRIN_CALLABLE(BinomialLess));
  AddScalar<E, U, U>(t, "BinomialGreater", {"P", "N", "R"}, TOVRIN_CALLABLE(BinomialGreater));
  AddScalar<E, U, U, U>(t, "BinomialBetween", {"P", "N", "R1", "R2"},
                        TOVRIN_CALLABLE(BinomialBetween));
  AddScalar<U, U, U, U>(t, "HyperGeometricEq", {"N", "S", "M", "X"},
                        TOVRIN_CALLABLE(HyperGeometricEq));
  AddScalar<U, U, U, U>(t, "HyperGeometricLess", {"N", "S", "M", "X"},
                        TOVRIN_CALLABLE(HyperGeometricLess));
  AddScalar<U, U, U, U>(t, "HyperGeometricGreater", {"N", "S", "M", "X"},
                        TOVRIN_CALLABLE(HyperGeometricGreater));
  AddScalar<U, U, U, U, U>(t, "HyperGeometricBetween", {"N", "S", "M", "X1", "X2"},
                           TOVRIN_CALLABLE(HyperGeometricBetween));
  AddScalar<E, U>(t, "PoissonEq", {"Mean", "X"}, TOVRIN_CALLABLE(PoissonEq));
  AddScalar<E, U>(t, "PoissonLess", {"Mean", "X"}, TOVRIN_CALLABLE(PoissonLess));
  AddScalar<E, U>(t, "PoissonGreater", {"Mean", "X"}, TOVRIN_CALLABLE(PoissonGreater));
  AddScalar<E, U, U>(t, "PoissonBetween", {"Mean", "X1", "X2"}, TOVRIN_CALLABLE(PoissonBetween));
}

void AddGeometry(CallableTable& t) {
  AddScalar<E, E, E>(t, "AreaTriangle", {"A", "B", "C"}, TOVRIN_CALLABLE(AreaTriangle));
  AddScalar<E>(t, "AreaSquare", {"Side"}, TOVRIN_CALLABLE(AreaSquare));
  AddScalar<E, E>(t, "AreaRectangle", {"Length", "Width"}, TOVRIN_CALLABLE(AreaRectangle));
  AddScalar<E, E>(t, "AreaParallelogram", {"Base", "Height"}, TOVRIN_CALLABLE(AreaParallelogram));
  AddScalar<E, E>(t, "AreaRhombus", {"D1", "D2"}, TOVRIN_CALLABLE(AreaRhombus));
  AddScalar<E, E, E>(t, "AreaTrapezium", {"A", "B", "Height"}, TOVRIN_CALLABLE(AreaTrapezium));
  AddScalar<E>(t, "AreaCircle", {"R"}, TOVRIN_CALLABLE(AreaCircle));
  AddScalar<E>(t, "AreaCircle2Radius", {"Area"}, TOVRIN_CALLABLE(AreaCircle2Radius));
  AddScalar<E>(t, "AreaSemiCircle", {"R"}, TOVRIN_CALLABLE(AreaSemiCircle));
  AddScalar<E>(t, "AreaSemiCircle2Radius", {"Area"}, TOVRIN_CALLABLE(AreaSemiCircle2Radius));
  AddScalar<E, E>(t, "AreaSector", {"R", "Angle"}, TOVRIN_CALLABLE(AreaSector));
  AddScalar<E, E>(t, "AreaEllipse", {"A", "B"}, TOVRIN_CALLABLE(AreaEllipse));
  AddScalar<E>(t, "AreaPentagon", {"Side"}, TOVRIN_CALLABLE(AreaPentagon));
  AddScalar<E>(t, "AreaHexagon", {"Side"}, TOVRIN_CALLABLE(AreaHexagon));
  AddScalar<E>(t, "AreaHeptagon", {"Side"}, TOVRIN_CALLABLE(AreaHeptagon));
  AddScalar<E>(t, "AreaOctagon", {"Side"}, TOVRIN_CALLABLE(AreaOctagon));
  AddScalar<E>(t, "AreaNonagon", {"Side"}, TOVRIN_CALLABLE(AreaNonagon));
  AddScalar<E>(t, "AreaDecagon", {"Side"}, TOVRIN_CALLABLE(AreaDecagon));
  AddScalar<E, E, E>(t, "PerimeterTriangle", {"A", "B", "C"}, TOVRIN_CALLABLE(PerimeterTriangle));
  AddScalar<E>(t, "PerimeterSquare", {"Side"}, TOVRIN_CALLABLE(PerimeterSquare));
  AddScalar<E, E>(t, "PerimeterRectangle", {"Length", "Width"},
                  TOVRIN_CALLABLE(PerimeterRectangle));
  AddScalar<E>(t, "CircumferenceCircle", {"R"}, TOVRIN_CALLABLE(CircumferenceCircle));
  AddScalar<E>(t, "CircumferenceCircle2Radius", {"C"}, TOVRIN_CALLABLE(CircumferenceCircle2Radius));
  AddScalar<E>(t, "CircumferenceSemiCircle", {"R"}, TOVRIN_CALLABLE(CircumferenceSemiCircle));
  AddScalar<E>(t, "CircumferenceSemiCircle2Radius", {"C"},
               TOVRIN_CALLABLE(CircumferenceSemiCircle2Radius));
  AddScalar<E, E>(t, "ArcLength", {"R", "Angle"}, TOVRIN_CALLABLE(ArcLength));
  AddScalar<E, E>(t, "PerimeterSector", {"R", "Angle"}, TOVRIN_CALLABLE(PerimeterSector));
  AddScalar<E>(t, "PerimeterPentagon", {"Side"}, TOVRIN_CALLABLE(PerimeterPentagon));
  AddScalar<E>(t, "PerimeterHexagon", {"Side"}, TOVRIN_CALLABLE(PerimeterHexagon));
  AddScalar<E>(t, "PerimeterOctagon", {"Side"}, TOVRIN_CALLABLE(PerimeterOctagon));
  AddScalar<E>(t, "PerimeterDecagon", {"Side"}, TOVRIN_CALLABLE(PerimeterDecagon));
  AddScalar<E>(t, "VolCube", {"Side"}, TOVRIN_CALLABLE(VolCube));
  AddScalar<E, E, E>(t, "VolRectangularSolid", {"A", "B", "C"},
                     TOVRIN_CALLABLE(VolRectangularSolid));
  AddScalar<E>(t, "VolSphere", {"R"}, TOVRIN_CALLABLE(VolSphere));
  AddScalar<E>(t, "VolSphere2Radius", {"V"}, TOVRIN_CALLABLE(VolSphere2Radius));
  AddScalar<E>(t, "VolHemiSphere", {"R"}, TOVRIN_CALLABLE(VolHemiSphere));
  AddScalar<E>(t, "VolHemiSphere2Radius", {"V"}, TOVRIN_CALLABLE(VolHemiSphere2Radius));
  AddScalar<E, E>(t, "VolRectangularPrism", {"Side", "Length"},
                  TOVRIN_CALLABLE(VolRectangularPrism));
  AddScalar<E, E>(t, "VolCylinder", {"R", "Height"}, TOVRIN_CALLABLE(VolCylinder));
  AddScalar<E, E>(t, "VolPyramid", {"Side", "Height"}, TOVRIN_CALLABLE(VolPyramid));
  AddScalar<E, E>(t, "VolCone", {"R", "Height"}, TOVRIN_CALLABLE(VolCone));
  AddScalar<E>(t, "VolTetrahedron", {"Edge"}, TOVRIN_CALLABLE(VolTetrahedron));
  AddScalar<E>(t, "VolOctahedron", {"Edge"}, TOVRIN_CALLABLE(VolOctahedron));
  AddScalar<E>(t, "VolDodecahedron", {"Edge"}, TOVRIN_CALLABLE(VolDodecahedron));
  AddScalar<E>(t, "VolIcosahedron", {"Edge"}, TOVRIN_CALLABLE(VolIcosahedron));
  AddScalar<E>(t, "SurfaceAreaCube", {"Side"}, TOVRIN_CALLABLE(SurfaceAreaCube));
  AddScalar<E, E, E>(t, "SurfaceAreaRectangularSolid", {"A", "B", "C"},
                     TOVRIN_CALLABLE(SurfaceAreaRectangularSolid));
  AddScalar<E>(t, "SurfaceAreaSphere", {"R"}, TOVRIN_CALLABLE(SurfaceAreaSphere));
  AddScalar<E>(t, "SurfaceAreaSphere2Radius", {"S"}, TOVRIN_CALLABLE(SurfaceAreaSphere2Radius));
  AddScalar<E>(t, "SurfaceAreaHemiSphere", {"R"}, TOVRIN_CALLABLE(SurfaceAreaHemiSphere));
  AddScalar<E>(t, "SurfaceAreaHemiSphere2Radius", {"S"},
               TOVRIN_CALLABLE(SurfaceAreaHemiSphere2Radius));
  AddScalar<E, E>(t, "SurfaceAreaRectangularPrism", {"Side", "Length"},
                  TOVRIN_CALLABLE(SurfaceAreaRectangularPrism));
  AddScalar<E, E>(t, "SurfaceAreaCylinder", {"R", "Height"}, TOVRIN_CALLABLE(SurfaceAreaCylinder));
  AddScalar<E, E>(t, "SurfaceAreaPyramid", {"Side", "Height"}, TOVRIN_CALLABLE(SurfaceAreaPyramid));
  AddScalar<E, E>(t, "SurfaceAreaCone", {"R", "Slant"}, TOVRIN_CALLABLE(SurfaceAreaCone));
  AddScalar<E>(t, "SurfaceAreaTetrahedron", {"Edge"}, TOVRIN_CALLABLE(SurfaceAreaTetrahedron));
  AddScalar<E>(t, "SurfaceAreaOctahedron", {"Edge"}, TOVRIN_CALLABLE(SurfaceAreaOctahedron));
  AddScalar<E>(t, "SurfaceAreaDodecahedron", {"Edge"}, TOVRIN_CALLABLE(SurfaceAreaDodecahedron));
  AddScalar<E>(t, "SurfaceAreaIcosahedron", {"Edge"}, TOVRIN_CALLABLE(SurfaceAreaIcosahedron));
  AddScalar<E, E, E>(t, "TriangleThirdSide", {"A", "B", "Angle"},
                     TOVRIN_CALLABLE(TriangleThirdSide));
  AddScalar<E, E, E, E, E, E>(t, "AngleSizeGiven3Points", {"X1", "Y1", "X2", "Y2", "X3", "Y3"},
                              TOVRIN_CALLABLE(AngleSizeGiven3Points));
  AddScalar<E, E, E, E, E, E, E, E>(t, "LinesAreParallel",
                                    {"X1", "Y1", "X2", "Y2", "X3", "Y3", "X4", "Y4"},
                                    TOVRIN_CALLABLE(LinesAreParallel));
  // The two constructions with results in var parameters print one labelled line each.
  AddScalar<E, E, E, E, E, E>(
      t, "GetCircleWithPoints", {"X1", "Y1", "X2", "Y2", "X3", "Y3"},
      [](auto... p) -> decltype(GetCircleWithPoints(p..., std::declval<Extended&>(),
                                                    std::declval<Extended&>(),
                                                    std::declval<Extended&>()),
                                std::string()) {
        Extended cx = 0, cy = 0, r = 0;
        GetCircleWithPoints(p..., cx, cy, r);
        return Labelled("CX", cx) + "\n" + Labelled("CY", cy) + "\n" + Labelled("R", r);
      });
  AddScalar<E, E, E, E, E, E, E, E>(
      t, "LineIntersection", {"X1", "Y1", "X2", "Y2", "X3", "Y3", "X4", "Y4"},
      [](auto... p) -> decltype(LineIntersection(p..., std::declval<Extended&>(),
                                                 std::declval<Extended&>()),
                                std::string()) {
        Extended x = 0, y = 0;
        const bool found = LineIntersection(p..., x, y);
        return FormatResult(found) + "\n" + Labelled("X", x) + "\n" + Labelled("Y", y);
      });
}

const CallableTable& EvalTable() {
  static const CallableTable table = [] {
    CallableTable t;
    AddFoundation(t);
    AddMoney(t);
    AddSample(t);
    AddContinuous(t);
    AddDiscrete(t);
    AddGeometry(t);
    return t;
  }();
  return table;
}

// The result with Digits significant digits in place of 21: every line's value (after its TAB,
// if any) that is a number is written again. 21 digits identify an Extended, so reading the
// text back gives the result itself.
std::string WithDigits(const std::string& Result, int Digits) {
  std::string text;
  std::size_t start = 0;
  while (start <= Result.size()) {
    std::size_t end = Result.find('\n', start);
    if (end == std::string::npos) end = Result.size();
    const std::string_view line(Result.data() + start, end - start);
    const std::size_t tab = line.find('\t');
    const std::size_t value_at = tab == std::string_view::npos ? 0 : tab + 1;
    const std::optional<Extended> value = ParseNumber(line.substr(value_at));
    text += value ? std::string(line.substr(0, value_at)) + FormatSignificant(*value, Digits)
                  : std::string(line);
    if (end == Result.size()) break;
    text += '\n';
    start = end + 1;
  }
  return text;
}

}  // namespace

int RunEval(std::span<const std::string> Words) {
  // Options come before the function's name: every word after it is one of its arguments
  // (so that negative numbers pass), except --help.
  for (const std::string& word : Words) {
    if (word == "--help" || word == "-h") {
      WriteOut(std::string(kHelp));
      return kExitOk;
    }
  }
  std::optional<int> digits;
  bool precise = false;
  std::size_t first = 0;
  for (; first < Words.size() &&
         (Words[first].starts_with("--digits") || Words[first] == "--precise");
       ++first) {
    const std::string& word = Words[first];
    if (word == "--precise") {
      precise = true;
      continue;
    }
    std::string text;
    if (word.starts_with("--digits=")) {
      text = word.substr(9);
    } else if (word == "--digits") {
      if (first + 1 == Words.size()) throw UsageError("option --digits needs a value");
      text = Words[++first];
    } else {
      throw UsageError("unknown option " + word);
    }
    digits = static_cast<int>(ParseSignedArgument(text, "--digits", 1, 40));
  }
  Words = Words.subspan(first);
  if (Words.empty()) throw UsageError("eval needs a FUNCTION name (eval --list shows them)");
  const CallableTable& table = precise ? PreciseEvalTable() : EvalTable();
  if (Words[0] == "--list") {
    if (Words.size() > 1) throw UsageError("--list takes no arguments");
    WriteOut(ListCallables(table));
    return kExitOk;
  }
  if (Words[0].starts_with("-")) throw UsageError("unknown option " + Words[0]);
  const auto call =
      BindByName(table, precise ? "precise function" : "function", Words[0], Words.subspan(1));
  const std::string result = call();
  WriteOut((digits ? WithDigits(result, *digits) : result) + "\n");
  return kExitOk;
}

}  // namespace tovrin::cli
