#include "tovrin/geometry/TOVRINGeometry.h"

#include <cmath>
#include <cstddef>
#include <initializer_list>

#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {
namespace {

// Coefficients kept as Extended literals, as the formulas have always used them.
constexpr Extended kFourThirds = 4.0L / 3.0L;
constexpr Extended kTwoThirds = 2.0L / 3.0L;
constexpr Extended kPiOver7 = 0.4487989505128276054946633404685004120L;
constexpr Extended kPiOver9 = 0.3490658503988659153847381536977225427L;

// Every argument is a length (or an angle) that must not be below 0; they are checked in the
// order given, before any arithmetic.
void CheckLengths(std::initializer_list<Extended> Lengths) {
  for (const Extended x : Lengths) {
    if (x < 0) detail::RaiseMathError(rsLengthNotNeg);
  }
}

Extended Sqr(Extended X) { return X * X; }
// The perimeter of a regular polygon of Sides sides.
Extended RegularPerimeter(int Sides, Extended Side) {
  CheckLengths({Side});
  return Sides * Side;
}
Extended Cube(Extended X) { return X * X * X; }

// Heron's product s(s - a)(s - b)(s - c); below 0 the sides make no triangle.
Extended CheckedHeronProduct(Extended A, Extended B, Extended C) {
  CheckLengths({A, B, C});
  const Extended s = (A + B + C) * 0.5L;
  const Extended product = s * (s - A) * (s - B) * (s - C);
  if (product < 0) detail::RaiseMathError(rsInvalidSides);
  return product;
}

}  // namespace

// --- Areas ------------------------------------------------------------------------------------

Extended AreaTriangle(Extended A, Extended B, Extended C) {
  return std::sqrt(CheckedHeronProduct(A, B, C));
}

Extended AreaSquare(Extended Side) {
  CheckLengths({Side});
  return Sqr(Side);
}

Extended AreaRectangle(Extended Length, Extended Width) {
  CheckLengths({Length, Width});
  return Length * Width;
}

Extended AreaParallelogram(Extended Base, Extended Height) {
  CheckLengths({Base, Height});
  return Base * Height;
}

Extended AreaRhombus(Extended D1, Extended D2) {
  CheckLengths({D1, D2});
  return D1 * D2 * 0.5L;
}

Extended AreaTrapezium(Extended A, Extended B, Extended Height) {
  CheckLengths({A, B, Height});
  return (A + B) * 0.5L * Height;
}

Extended AreaCircle(Extended R) {
  CheckLengths({R});
  return Sqr(R) * QENPi;
}

Extended AreaCircle2Radius(Extended Area) { return std::sqrt(Area / QENPi); }

Extended AreaSemiCircle(Extended R) {
  CheckLengths({R});
  return Sqr(R) * QENPi * 0.5L;
}

Extended AreaSemiCircle2Radius(Extended Area) { return std::sqrt(2 * Area / QENPi); }

Extended AreaSector(Extended R, Extended Angle) {
  CheckLengths({R, Angle});
  if (Angle > TwoPi) return AreaCircle(R);
  return Sqr(R) * 0.5L * Angle;
}

Extended AreaEllipse(Extended A, Extended B) {
  CheckLengths({A, B});
  return QENPi * A * B;
}

Extended AreaPentagon(Extended Side) {
  CheckLengths({Side});
  return std::sqrt(25 + 10 * Sqrt5) * Sqr(Side) * 0.25L;
}

Extended AreaHexagon(Extended Side) {
  CheckLengths({Side});
  return 1.5L * Sqrt3 * Sqr(Side);
}

Extended AreaHeptagon(Extended Side) {
  CheckLengths({Side});
  return 1.75L * Sqr(Side) / QENTan(kPiOver7);
}

Extended AreaOctagon(Extended Side) {
  CheckLengths({Side});
  return 2 * (1 + Sqrt2) * Sqr(Side);
}

Extended AreaNonagon(Extended Side) {
  CheckLengths({Side});
  return 2.25L * Sqr(Side) / QENTan(kPiOver9);
}

Extended AreaDecagon(Extended Side) {
  CheckLengths({Side});
  return 2.5L * std::sqrt(5 + 2 * Sqrt5) * Sqr(Side);
}

// --- Perimeters ---------------------------------------------------------------------------------

Extended PerimeterTriangle(Extended A, Extended B, Extended C) {
  CheckedHeronProduct(A, B, C);
  return A + B + C;
}

Extended PerimeterSquare(Extended Side) {
  CheckLengths({Side});
  return 4 * Side;
}

Extended PerimeterRectangle(Extended Length, Extended Width) {
  CheckLengths({Length, Width});
  return 2 * (Length + Width);
}

Extended CircumferenceCircle(Extended R) {
  CheckLengths({R});
  return 2 * QENPi * R;
}

Extended CircumferenceCircle2Radius(Extended C) { return C / QENPi * 0.5L; }

Extended CircumferenceSemiCircle(Extended R) {
  CheckLengths({R});
  return (QENPi + 2) * R;
}

Extended CircumferenceSemiCircle2Radius(Extended C) { return C / (QENPi + 2); }

Extended ArcLength(Extended R, Extended Angle) {
  CheckLengths({R, Angle});
  if (Angle > TwoPi) return CircumferenceCircle(R);
  return R * Angle;
}

Extended PerimeterSector(Extended R, Extended Angle) {
  CheckLengths({R, Angle});
  if (Angle > TwoPi) return CircumferenceCircle(R);
  return ArcLength(R, Angle) + 2 * R;
}

Extended PerimeterPentagon(Extended Side) { return RegularPerimeter(5, Side); }
Extended PerimeterHexagon(Extended Side) { return RegularPerimeter(6, Side); }
Extended PerimeterOctagon(Extended Side) { return RegularPerimeter(8, Side); }
Extended PerimeterDecagon(Extended Side) { return RegularPerimeter(10, Side); }

// --- Volumes ------------------------------------------------------------------------------------

Extended VolCube(Extended Side) {
  CheckLengths({Side});
  return Cube(Side);
}

Extended VolRectangularSolid(Extended A, Extended B, Extended C) {
  CheckLengths({A, B, C});
  return A * B * C;
}

Extended VolSphere(Extended R) {
  CheckLengths({R});
  return kFourThirds * QENPi * Cube(R);
}

Extended VolSphere2Radius(Extended V) { return CubeRoot(0.75L * V / QENPi); }

Extended VolHemiSphere(Extended R) {
  CheckLengths({R});
  return kTwoThirds * QENPi * Cube(R);
}

Extended VolHemiSphere2Radius(Extended V) { return CubeRoot(1.5L * V / QENPi); }

Extended VolRectangularPrism(Extended Side, Extended Length) {
  CheckLengths({Side, Length});
  return Sqrt3 * 0.25L * Sqr(Side) * Length;
}

Extended VolCylinder(Extended R, Extended Height) {
  CheckLengths({R, Height});
  return QENPi * Sqr(R) * Height;
}

Extended VolPyramid(Extended Side, Extended Height) {
  CheckLengths({Side, Height});
  return Sqr(Side) * Height / 3;
}

Extended VolCone(Extended R, Extended Height) {
  CheckLengths({R, Height});
  return QENPi * Sqr(R) * Height / 3;
}

Extended VolTetrahedron(Extended Edge) {
  CheckLengths({Edge});
  return Sqrt2 * Cube(Edge) / 12;
}

Extended VolOctahedron(Extended Edge) {
  CheckLengths({Edge});
  return Sqrt2 * Cube(Edge) / 3;
}

Extended VolDodecahedron(Extended Edge) {
  CheckLengths({Edge});
  return (15 + 7 * Sqrt5) * 0.25L * Cube(Edge);
}

Extended VolIcosahedron(Extended Edge) {
  CheckLengths({Edge});
  return 5 * (3 + Sqrt5) * Cube(Edge) / 12;
}

// --- Surface areas --------------------------------------------------------------------------

Extended SurfaceAreaCube(Extended Side) {
  CheckLengths({Side});
  return 6 * Sqr(Side);
}

Extended SurfaceAreaRectangularSolid(Extended A, Extended B, Extended C) {
  CheckLengths({A, B, C});
  return 2 * (A * B + A * C + B * C);
}

Extended SurfaceAreaSphere(Extended R) {
  CheckLengths({R});
  return 4 * QENPi * Sqr(R);
}

Extended SurfaceAreaSphere2Radius(Extended S) { return std::sqrt(0.25L * S / QENPi); }

Extended SurfaceAreaHemiSphere(Extended R) {
  CheckLengths({R});
  return 3 * QENPi * Sqr(R);
}

Extended SurfaceAreaHemiSphere2Radius(Extended S) { return std::sqrt(S / (3 * QENPi)); }

Extended SurfaceAreaRectangularPrism(Extended Side, Extended Length) {
  CheckLengths({Side, Length});
  return (Sqrt3 * 0.5L * Side + 3 * Length) * Side;
}

Extended SurfaceAreaCylinder(Extended R, Extended Height) {
  CheckLengths({R, Height});
  return TwoPi * R * (R + Height);
}

Extended SurfaceAreaPyramid(Extended Side, Extended Height) {
  CheckLengths({Side, Height});
  return Sqr(Side) + 2 * Side * std::sqrt(0.25L * Sqr(Side) + Sqr(Height));
}

Extended SurfaceAreaCone(Extended R, Extended Slant) {
  CheckLengths({R, Slant});
  return QENPi * R * (R + Slant);
}

Extended SurfaceAreaTetrahedron(Extended Edge) {
  CheckLengths({Edge});
  return Sqrt3 * Sqr(Edge);
}

Extended SurfaceAreaOctahedron(Extended Edge) {
  CheckLengths({Edge});
  return 2 * Sqrt3 * Sqr(Edge);
}

Extended SurfaceAreaDodecahedron(Extended Edge) {
  CheckLengths({Edge});
  return 3 * std::sqrt(25 + 10 * Sqrt5) * Sqr(Edge);
}

Extended SurfaceAreaIcosahedron(Extended Edge) {
  CheckLengths({Edge});
  return 5 * Sqrt3 * Sqr(Edge);
}

// --- Triangles and coordinates ----------------------------------------------------------------

Extended TriangleThirdSide(Extended A, Extended B, Extended Angle) {
  // Deliberately lenient: only all three below 0 is refused.
  if (A < 0 && B < 0 && Angle < 0) detail::RaiseMathError(rsLengthNotNeg);
  if (Angle > QENPi) detail::RaiseMathError(rsAngleNotLEPi);
  return std::sqrt(Sqr(A) + Sqr(B) - 2 * A * B * std::cos(Angle));
}

void GetCircleWithPoints(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3,
                         Extended Y3, Extended& CX, Extended& CY, Extended& R) {
  // The circle x^2 + y^2 + 2Dx + 2Ey + F = 0 through the three points: M (D, E, F) = b.
  TQENFloatMatrix m{{2 * X1, 2 * Y1, 1}, {2 * X2, 2 * Y2, 1}, {2 * X3, 2 * Y3, 1}};
  const TQENFloatVector b{-(Sqr(X1) + Sqr(Y1)), -(Sqr(X2) + Sqr(Y2)), -(Sqr(X3) + Sqr(Y3))};
  TQENFloatMatrix inverse;
  MatrixInverse(m, inverse);  // singular (collinear points): no check of our own
  Extended def[3] = {0, 0, 0};
  for (std::size_t i = 0; i < 3 && i < inverse.size(); ++i) {
    for (std::size_t k = 0; k < 3 && k < inverse[i].size(); ++k) {
      def[i] += Extended(inverse[i][k]) * Extended(b[k]);
    }
  }
  CX = -def[0];
  CY = -def[1];
  R = std::sqrt(Sqr(def[0]) + Sqr(def[1]) - def[2]);
}

Extended AngleSizeGiven3Points(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3,
                               Extended Y3) {
  const Extended d1 = QENDistance(X2, Y2, X3, Y3);
  const Extended d2 = QENDistance(X1, Y1, X3, Y3);
  const Extended d3 = QENDistance(X1, Y1, X2, Y2);
  return QENArcCos((Sqr(d1) + Sqr(d3) - Sqr(d2)) / (2 * d1 * d3));
}

namespace {
// The cross product of the two directions; zero (within tolerance) for parallel lines.
Extended DirectionCross(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3,
                        Extended Y3, Extended X4, Extended Y4) {
  return (X1 - X2) * (Y3 - Y4) - (Y1 - Y2) * (X3 - X4);
}
}  // namespace

bool LinesAreParallel(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3, Extended Y3,
                      Extended X4, Extended Y4) {
  return FloatIsZero(DirectionCross(X1, Y1, X2, Y2, X3, Y3, X4, Y4));
}

bool LineIntersection(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3, Extended Y3,
                      Extended X4, Extended Y4, Extended& X, Extended& Y) {
  if (LinesAreParallel(X1, Y1, X2, Y2, X3, Y3, X4, Y4)) {
    X = 0;
    Y = 0;
    return false;
  }
  const Extended d = DirectionCross(X1, Y1, X2, Y2, X3, Y3, X4, Y4);
  const Extended a = X1 * Y2 - Y1 * X2;
  const Extended b = X3 * Y4 - Y3 * X4;
  X = (a * (X3 - X4) - (X1 - X2) * b) / d;
  Y = (a * (Y3 - Y4) - (Y1 - Y2) * b) / d;
  return true;
}

}  // namespace tovrin
