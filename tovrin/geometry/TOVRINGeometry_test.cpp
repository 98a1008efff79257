// Tests of the geometry formulas against TOVRINGeometry_reference.inc: every value computed by a
// route of its own (shoelace sums, convex hulls of the solids' vertices, quadrature, triangles
// from coordinates), in mpmath at 40 digits.
#include "tovrin/geometry/TOVRINGeometry.h"

#include <array>
#include <cmath>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

struct GeometryReference {
  const char* call;
  Extended (*fn)();
  Extended expected;
};
struct LineCase {
  std::array<Extended, 8> p;
  Extended x, y;
};
struct CircleCase {
  std::array<Extended, 6> p;
  Extended cx, cy, r;
};
#include "tovrin/geometry/TOVRINGeometry_reference.inc"

using testing::ExpectRaises;
// Relative above 1, absolute below: the references carry 30 digits, the functions some ulps.
constexpr Extended kTol = 1e-17L;
constexpr Extended kPi = 3.14159265358979323846264338327950288L;

TEST(GeometryFormulas, AgreeWithIndependentConstructions) {
  for (const auto& r : kGeometryReferences) {
    EXPECT_TRUE(testing::ScaledNear(r.fn(), r.expected, kTol)) << r.call;
  }
  using F1 = Extended (*)(Extended);
  const std::pair<F1, F1> inverses[] = {{&AreaCircle2Radius, &AreaCircle},
                                        {&AreaSemiCircle2Radius, &AreaSemiCircle},
                                        {&CircumferenceCircle2Radius, &CircumferenceCircle},
                                        {&CircumferenceSemiCircle2Radius, &CircumferenceSemiCircle},
                                        {&VolSphere2Radius, &VolSphere},
                                        {&VolHemiSphere2Radius, &VolHemiSphere},
                                        {&SurfaceAreaSphere2Radius, &SurfaceAreaSphere},
                                        {&SurfaceAreaHemiSphere2Radius, &SurfaceAreaHemiSphere}};
  for (const Extended r : {0.5L, 1.0L, 3.75L, 120.0L}) {  // each ...2Radius undoes its formula
    for (const auto& [inverse, formula] : inverses) {
      EXPECT_TRUE(testing::ScaledNear(inverse(formula(r)), r, kTol)) << static_cast<double>(r);
    }
  }
  EXPECT_TRUE(std::isnan(AreaCircle2Radius(-1)));  // the inverses check nothing
  EXPECT_EQ(CircumferenceCircle2Radius(-2 * QENPi), -1);
  EXPECT_EQ(PerimeterRectangle(2.5L, 4), 13);
  EXPECT_EQ(PerimeterPentagon(1.5L) + PerimeterHexagon(1.5L), 16.5L);
  EXPECT_EQ(PerimeterOctagon(1.5L) + PerimeterDecagon(1.5L), 27);
}

// A negative value in any position raises rsLengthNotNeg; zeros give 0.
TEST(GeometryChecks, EveryLengthArgumentIsChecked) {
  using F1 = Extended (*)(Extended);
  using F2 = Extended (*)(Extended, Extended);
  using F3 = Extended (*)(Extended, Extended, Extended);
  // clang-format off
  const F1 ones[] = {
      &AreaSquare, &AreaCircle, &AreaSemiCircle, &AreaPentagon, &AreaHexagon, &AreaHeptagon,
      &AreaOctagon, &AreaNonagon, &AreaDecagon, &PerimeterSquare, &CircumferenceCircle,
      &CircumferenceSemiCircle, &PerimeterPentagon, &PerimeterHexagon, &PerimeterOctagon,
      &PerimeterDecagon, &VolCube, &VolSphere, &VolHemiSphere, &VolTetrahedron, &VolOctahedron,
      &VolDodecahedron, &VolIcosahedron, &SurfaceAreaCube, &SurfaceAreaSphere,
      &SurfaceAreaHemiSphere, &SurfaceAreaTetrahedron, &SurfaceAreaOctahedron,
      &SurfaceAreaDodecahedron, &SurfaceAreaIcosahedron};
  // clang-format on
  for (F1 f : ones) {
    ExpectRaises(rsLengthNotNeg, [&] { f(-0.5L); });
    EXPECT_EQ(f(0), 0);
  }
  // clang-format off
  const F2 twos[] = {
      &AreaRectangle, &AreaParallelogram, &AreaRhombus, &AreaSector, &AreaEllipse,
      &PerimeterRectangle, &ArcLength, &PerimeterSector, &VolRectangularPrism, &VolCylinder,
      &VolPyramid, &VolCone, &SurfaceAreaRectangularPrism, &SurfaceAreaCylinder,
      &SurfaceAreaPyramid, &SurfaceAreaCone};
  // clang-format on
  for (F2 f : twos) {
    ExpectRaises(rsLengthNotNeg, [&] { f(-0.5L, 4); });
    ExpectRaises(rsLengthNotNeg, [&] { f(3, -0.5L); });
    EXPECT_EQ(f(0, 0), 0);
  }
  const F3 threes[] = {&AreaTriangle, &AreaTrapezium, &PerimeterTriangle, &VolRectangularSolid,
                       &SurfaceAreaRectangularSolid};
  for (F3 f : threes) {
    for (int k = 0; k < 3; ++k) {
      std::array<Extended, 3> a{3, 4, 5};
      a[static_cast<std::size_t>(k)] = -0.5L;
      ExpectRaises(rsLengthNotNeg, [&] { f(a[0], a[1], a[2]); });
    }
    EXPECT_EQ(f(0, 0, 0), 0);
  }
  // Triangles that cannot close, after the length check; a flat one is accepted.
  ExpectRaises(rsInvalidSides, [] { AreaTriangle(1, 1, 3); });
  ExpectRaises(rsInvalidSides, [] { PerimeterTriangle(1, 1, 3); });
  ExpectRaises(rsInvalidSides, [] { AreaTriangle(10, 1, 1); });
  ExpectRaises(rsLengthNotNeg, [] { AreaTriangle(1, -1, 3); });
  EXPECT_EQ(AreaTriangle(1, 1, 2), 0);
  EXPECT_EQ(PerimeterTriangle(1, 1, 2), 4);
}

TEST(GeometryChecks, SectorsAboveTwoPiAreWholeCircles) {
  EXPECT_EQ(AreaSector(2, 7), AreaCircle(2));
  EXPECT_TRUE(testing::ScaledNear(AreaSector(2, TwoPi), 4 * kPi, kTol));
  EXPECT_EQ(ArcLength(3, 7), CircumferenceCircle(3));
  EXPECT_TRUE(testing::ScaledNear(PerimeterSector(1, 10), 2 * kPi, kTol));  // no radii
  EXPECT_TRUE(testing::ScaledNear(PerimeterSector(1, TwoPi), 2 * kPi + 2, kTol));
}

TEST(TriangleThirdSide, LenientLengthCheckAndAngleLimit) {
  EXPECT_NO_THROW(TriangleThirdSide(-1, -2, 1));  // negative only with a negative angle
  EXPECT_NO_THROW(TriangleThirdSide(1, -2, -1));
  ExpectRaises(rsLengthNotNeg, [] { TriangleThirdSide(-1, -2, -1); });
  ExpectRaises(rsAngleNotLEPi, [] { TriangleThirdSide(1, 1, 4); });
  ExpectRaises(rsAngleNotLEPi, [] { TriangleThirdSide(-1, 1, 3.2L); });
  EXPECT_NO_THROW(TriangleThirdSide(1, 1, QENPi));
  EXPECT_EQ(TriangleThirdSide(3, 4, 0), 1);
}

TEST(LineIntersection, MeetingPointsParallelAndCoincidentLines) {
  for (const LineCase& c : kLineIntersections) {
    const auto& p = c.p;
    EXPECT_FALSE(LinesAreParallel(p[0], p[1], p[2], p[3], p[4], p[5], p[6], p[7]));
    Extended x = 99, y = 99;
    EXPECT_TRUE(LineIntersection(p[0], p[1], p[2], p[3], p[4], p[5], p[6], p[7], x, y));
    EXPECT_TRUE(testing::ScaledNear(x, c.x, kTol));
    EXPECT_TRUE(testing::ScaledNear(y, c.y, kTol));
  }
  Extended x = 5, y = 7;
  EXPECT_TRUE(LinesAreParallel(0, 0, 1, 1, 0, 1, 2, 3));
  EXPECT_FALSE(LineIntersection(0, 0, 1, 1, 0, 1, 2, 3, x, y));
  EXPECT_EQ(x * 10 + y, 0);
  x = 5;
  EXPECT_FALSE(LineIntersection(0, 0, 1, 2, 2, 4, 3, 6, x, y));  // the same line
  EXPECT_EQ(x, 0);
  // The cross product is tested against the tolerance: 1e-13 counts as zero, 1e-11 not.
  EXPECT_TRUE(LinesAreParallel(0, 0, 1, 0, 0, 1, 1, 1 + 1e-13L));
  EXPECT_FALSE(LinesAreParallel(0, 0, 1, 0, 0, 1, 1, 1 + 1e-11L));
}

TEST(GetCircleWithPoints, ThreePointsOfAKnownCircle) {
  std::vector<CircleCase> cases(std::begin(kCircles), std::end(kCircles));
  cases.push_back({{0, 0, 2, 0, 0, 2}, 1, 1, 1.41421356237309504880168872420969808L});
  for (const CircleCase& c : cases) {
    const auto& p = c.p;
    Extended cx = 0, cy = 0, r = 0;
    GetCircleWithPoints(p[0], p[1], p[2], p[3], p[4], p[5], cx, cy, r);
    // The inverse of the 3 x 3 system loses a few digits to its condition.
    EXPECT_TRUE(testing::Near(cx, c.cx, 1e-14L));
    EXPECT_TRUE(testing::Near(cy, c.cy, 1e-14L));
    EXPECT_TRUE(testing::Near(r, c.r, 1e-14L));
  }
  Extended cx = 0, cy = 0, r = 0;  // collinear or equal points raise nothing
  EXPECT_NO_THROW(GetCircleWithPoints(0, 0, 1, 1, 2, 2, cx, cy, r));
  EXPECT_NO_THROW(GetCircleWithPoints(1, 1, 1, 1, 1, 1, cx, cy, r));
}

}  // namespace
}  // namespace tovrin
