#include "tovrin/geometry/TOVRINGeometry.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <functional>
#include <limits>
#include <string>
#include <vector>

namespace tovrin {
namespace {

// Relative agreement (absolute below 1): the references carry 30 digits, the functions
// some ulps of Extended rounding.
constexpr Extended kRelTol = 1e-17L;

void ExpectNear(Extended Actual, Extended Expected, const std::string& What) {
  const Extended scale = std::fmax(1.0L, std::fabs(Expected));
  EXPECT_LE(std::fabs(Actual - Expected), kRelTol * scale)
      << What << ": got " << static_cast<double>(Actual) << ", want "
      << static_cast<double>(Expected);
}

template <typename Call>
void ExpectRaises(TResStringId Ident, Call&& call, const std::string& What = "") {
  try {
    call();
    ADD_FAILURE() << What << ": no EMathError raised";
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), Ident) << What << ": " << e.what();
  }
}

struct Reference {
  const char* call;
  std::function<Extended()> fn;
  Extended expected;
};

// Values from TOVRINGeometry_ref.py: shoelace sums over polygon vertices, convex hulls of the
// solids' vertex coordinates, quadrature for round shapes, triangles from coordinates.
const std::vector<Reference>& References() {
  static const std::vector<Reference> table = {
      {"AreaTriangle(3L, 4L, 5L)", [] { return AreaTriangle(3L, 4L, 5L); }, 6.0L},
      {"AreaTriangle(2.5L, 3.25L, 4.75L)", [] { return AreaTriangle(2.5L, 3.25L, 4.75L); },
       3.79967103839266590791718605151L},
      {"AreaTriangle(7L, 7L, 7L)", [] { return AreaTriangle(7L, 7L, 7L); },
       21.2176223927187468457112176834L},
      {"AreaSquare(1L)", [] { return AreaSquare(1L); }, 1.0L},
      {"AreaPentagon(1L)", [] { return AreaPentagon(1L); }, 1.72047740058896692275901197739L},
      {"AreaHexagon(1L)", [] { return AreaHexagon(1L); }, 2.59807621135331594029116951226L},
      {"AreaHeptagon(1L)", [] { return AreaHeptagon(1L); }, 3.6339124440015889925361930076L},
      {"AreaOctagon(1L)", [] { return AreaOctagon(1L); }, 4.82842712474619009760337744842L},
      {"AreaNonagon(1L)", [] { return AreaNonagon(1L); }, 6.18182419377290012721374405962L},
      {"AreaDecagon(1L)", [] { return AreaDecagon(1L); }, 7.69420884293813350642572644009L},
      {"AreaSquare(2.75L)", [] { return AreaSquare(2.75L); }, 7.5625L},
      {"AreaPentagon(2.75L)", [] { return AreaPentagon(2.75L); }, 13.011110341954062353365028079L},
      {"AreaHexagon(2.75L)", [] { return AreaHexagon(2.75L); }, 19.6479513483594517984519694365L},
      {"AreaHeptagon(2.75L)", [] { return AreaHeptagon(2.75L); }, 27.48146285776201675605495962L},
      {"AreaOctagon(2.75L)", [] { return AreaOctagon(2.75L); }, 36.5149801308930626131255419537L},
      {"AreaNonagon(2.75L)", [] { return AreaNonagon(2.75L); }, 46.7500454654075572120539394509L},
      {"AreaDecagon(2.75L)", [] { return AreaDecagon(2.75L); }, 58.1874543747196346423445562032L},
      {"AreaRectangle(2.5L, 4.25L)", [] { return AreaRectangle(2.5L, 4.25L); }, 10.625L},
      {"AreaParallelogram(3.5L, 1.25L)", [] { return AreaParallelogram(3.5L, 1.25L); }, 4.375L},
      {"AreaRhombus(3L, 5.5L)", [] { return AreaRhombus(3L, 5.5L); }, 8.25L},
      {"AreaTrapezium(3L, 5L, 2.5L)", [] { return AreaTrapezium(3L, 5L, 2.5L); }, 10.0L},
      {"AreaCircle(1.75L)", [] { return AreaCircle(1.75L); }, 9.62112750161874179279184536129L},
      {"AreaSemiCircle(1.75L)", [] { return AreaSemiCircle(1.75L); },
       4.81056375080937089639592268065L},
      {"AreaSector(2L, 1.25L)", [] { return AreaSector(2L, 1.25L); }, 2.5L},
      {"AreaSector(2L, 7L)", [] { return AreaSector(2L, 7L); }, 12.5663706143591729538505735331L},
      {"AreaEllipse(3L, 1.5L)", [] { return AreaEllipse(3L, 1.5L); },
       14.1371669411540695730818952248L},
      {"PerimeterTriangle(2.5L, 3.25L, 4.75L)",
       [] { return PerimeterTriangle(2.5L, 3.25L, 4.75L); }, 10.5L},
      {"CircumferenceCircle(1.75L)", [] { return CircumferenceCircle(1.75L); },
       10.9955742875642763346192518415L},
      {"CircumferenceSemiCircle(1.75L)", [] { return CircumferenceSemiCircle(1.75L); },
       8.99778714378213816730962592074L},
      {"ArcLength(1.5L, 2L)", [] { return ArcLength(1.5L, 2L); }, 3.0L},
      {"ArcLength(1.5L, 6.5L)", [] { return ArcLength(1.5L, 6.5L); },
       9.42477796076937971538793014984L},
      {"PerimeterSector(1.5L, 2L)", [] { return PerimeterSector(1.5L, 2L); }, 6.0L},
      {"PerimeterSector(1L, 10L)", [] { return PerimeterSector(1L, 10L); },
       6.28318530717958647692528676656L},
      {"VolTetrahedron(1L)", [] { return VolTetrahedron(1L); }, 0.117851130197757920733474060351L},
      {"SurfaceAreaTetrahedron(1L)", [] { return SurfaceAreaTetrahedron(1L); },
       1.73205080756887729352744634151L},
      {"VolTetrahedron(1.5L)", [] { return VolTetrahedron(1.5L); },
       0.397747564417432982475474953684L},
      {"SurfaceAreaTetrahedron(1.5L)", [] { return SurfaceAreaTetrahedron(1.5L); },
       3.89711431702997391043675426839L},
      {"VolOctahedron(1L)", [] { return VolOctahedron(1L); }, 0.471404520791031682933896241403L},
      {"SurfaceAreaOctahedron(1L)", [] { return SurfaceAreaOctahedron(1L); },
       3.46410161513775458705489268301L},
      {"VolOctahedron(1.5L)", [] { return VolOctahedron(1.5L); }, 1.59099025766973192990189981474L},
      {"SurfaceAreaOctahedron(1.5L)", [] { return SurfaceAreaOctahedron(1.5L); },
       7.79422863405994782087350853678L},
      {"VolDodecahedron(1L)", [] { return VolDodecahedron(1L); }, 7.66311896062463196871605392028L},
      {"SurfaceAreaDodecahedron(1L)", [] { return SurfaceAreaDodecahedron(1L); },
       20.6457288070676030731081437287L},
      {"VolDodecahedron(1.5L)", [] { return VolDodecahedron(1.5L); },
       25.8630264921081328944166819809L},
      {"SurfaceAreaDodecahedron(1.5L)", [] { return SurfaceAreaDodecahedron(1.5L); },
       46.4528898159021069144933233895L},
      {"VolIcosahedron(1L)", [] { return VolIcosahedron(1L); }, 2.18169499062491237350382236197L},
      {"SurfaceAreaIcosahedron(1L)", [] { return SurfaceAreaIcosahedron(1L); },
       8.66025403784438646763723170753L},
      {"VolIcosahedron(1.5L)", [] { return VolIcosahedron(1.5L); },
       7.36322059335907926057540047165L},
      {"SurfaceAreaIcosahedron(1.5L)", [] { return SurfaceAreaIcosahedron(1.5L); },
       19.4855715851498695521837713419L},
      {"VolCube(1.25L)", [] { return VolCube(1.25L); }, 1.953125L},
      {"SurfaceAreaCube(1.25L)", [] { return SurfaceAreaCube(1.25L); }, 9.375L},
      {"VolRectangularSolid(2L, 3.5L, 0.75L)", [] { return VolRectangularSolid(2L, 3.5L, 0.75L); },
       5.25L},
      {"SurfaceAreaRectangularSolid(2L, 3.5L, 0.75L)",
       [] { return SurfaceAreaRectangularSolid(2L, 3.5L, 0.75L); }, 22.25L},
      {"VolRectangularPrism(1.5L, 4L)", [] { return VolRectangularPrism(1.5L, 4L); },
       3.89711431702997391043675426839L},
      {"SurfaceAreaRectangularPrism(1.5L, 4L)",
       [] { return SurfaceAreaRectangularPrism(1.5L, 4L); }, 19.9485571585149869552183771342L},
      {"VolPyramid(3L, 2L)", [] { return VolPyramid(3L, 2L); }, 6.0L},
      {"SurfaceAreaPyramid(3L, 2L)", [] { return SurfaceAreaPyramid(3L, 2L); }, 24.0L},
      {"VolSphere(1.25L)", [] { return VolSphere(1.25L); }, 8.18123086872341989182980047729L},
      {"VolHemiSphere(1.25L)", [] { return VolHemiSphere(1.25L); },
       4.09061543436170994591490023865L},
      {"SurfaceAreaSphere(1.25L)", [] { return SurfaceAreaSphere(1.25L); },
       19.6349540849362077403915211455L},
      {"SurfaceAreaHemiSphere(1.25L)", [] { return SurfaceAreaHemiSphere(1.25L); },
       14.7262155637021558052936408591L},
      {"VolCylinder(1.25L, 3L)", [] { return VolCylinder(1.25L, 3L); },
       14.7262155637021558052936408591L},
      {"SurfaceAreaCylinder(1.25L, 3L)", [] { return SurfaceAreaCylinder(1.25L, 3L); },
       33.3794219443915531586655859473L},
      {"VolCone(1.25L, 3L)", [] { return VolCone(1.25L, 3L); }, 4.90873852123405193509788028637L},
      {"SurfaceAreaCone(1.25L, 3.25L)", [] { return SurfaceAreaCone(1.25L, 3.25L); },
       17.6714586764425869663523690309L},
      {"TriangleThirdSide(3L, 4L, 1.2L)", [] { return TriangleThirdSide(3L, 4L, 1.2L); },
       4.03774861681108549626720741136L},
      {"TriangleThirdSide(2.5L, 1L, 3L)", [] { return TriangleThirdSide(2.5L, 1L, 3L); },
       3.49284446876785902019274459414L},
      {"TriangleThirdSide(1L, 1L, 0.5L)", [] { return TriangleThirdSide(1L, 1L, 0.5L); },
       0.494807918509045859193697409699L},
      {"TriangleThirdSide(2L, 3L, QENPi)", [] { return TriangleThirdSide(2L, 3L, QENPi); }, 5.0L},
      {"AngleSizeGiven3Points(1L, 0L, 0L, 0L, 0L, 1L)",
       [] { return AngleSizeGiven3Points(1L, 0L, 0L, 0L, 0L, 1L); },
       1.57079632679489661923132169164L},
      {"AngleSizeGiven3Points(3L, 1L, 0.5L, -2L, -1L, 4L)",
       [] { return AngleSizeGiven3Points(3L, 1L, 0.5L, -2L, -1L, 4L); },
       0.939716939323567350289356651723L},
      {"AngleSizeGiven3Points(2L, 2L, 1L, 1L, 3L, 1L)",
       [] { return AngleSizeGiven3Points(2L, 2L, 1L, 1L, 3L, 1L); },
       0.78539816339744830961566084582L},
  };
  return table;
}

TEST(GeometryFormulas, AgreeWithIndependentConstructions) {
  for (const Reference& r : References()) ExpectNear(r.fn(), r.expected, r.call);
}

// Each ...2Radius inverse undoes its formula.
TEST(GeometryFormulas, RadiusInversesRoundTrip) {
  for (const Extended r : {0.5L, 1.0L, 3.75L, 120.0L}) {
    ExpectNear(AreaCircle2Radius(AreaCircle(r)), r, "AreaCircle2Radius");
    ExpectNear(AreaSemiCircle2Radius(AreaSemiCircle(r)), r, "AreaSemiCircle2Radius");
    ExpectNear(CircumferenceCircle2Radius(CircumferenceCircle(r)), r, "CircumferenceCircle2Radius");
    ExpectNear(CircumferenceSemiCircle2Radius(CircumferenceSemiCircle(r)), r,
               "CircumferenceSemiCircle2Radius");
    ExpectNear(VolSphere2Radius(VolSphere(r)), r, "VolSphere2Radius");
    ExpectNear(VolHemiSphere2Radius(VolHemiSphere(r)), r, "VolHemiSphere2Radius");
    ExpectNear(SurfaceAreaSphere2Radius(SurfaceAreaSphere(r)), r, "SurfaceAreaSphere2Radius");
    ExpectNear(SurfaceAreaHemiSphere2Radius(SurfaceAreaHemiSphere(r)), r,
               "SurfaceAreaHemiSphere2Radius");
  }
  // They check nothing: a negative argument gives a NaN, not an error.
  EXPECT_TRUE(std::isnan(AreaCircle2Radius(-1)));
  EXPECT_EQ(CircumferenceCircle2Radius(-2 * QENPi), -1);
}

TEST(GeometryFormulas, SimplePerimetersAreMultiplesOfTheSide) {
  EXPECT_EQ(PerimeterSquare(2.5L), 10);
  EXPECT_EQ(PerimeterRectangle(2.5L, 4), 13);
  EXPECT_EQ(PerimeterPentagon(1.5L), 7.5L);
  EXPECT_EQ(PerimeterHexagon(1.5L), 9);
  EXPECT_EQ(PerimeterOctagon(1.5L), 12);
  EXPECT_EQ(PerimeterDecagon(1.5L), 15);
}

struct Checked {
  const char* name;
  int arity;
  std::function<Extended(const std::array<Extended, 3>&)> fn;
};

// Every function with a length check, by arity.
std::vector<Checked> CheckedFunctions() {
  using A = const std::array<Extended, 3>&;
  return {
      {"AreaTriangle", 3, [](A a) { return AreaTriangle(a[0], a[1], a[2]); }},
      {"AreaSquare", 1, [](A a) { return AreaSquare(a[0]); }},
      {"AreaRectangle", 2, [](A a) { return AreaRectangle(a[0], a[1]); }},
      {"AreaParallelogram", 2, [](A a) { return AreaParallelogram(a[0], a[1]); }},
      {"AreaRhombus", 2, [](A a) { return AreaRhombus(a[0], a[1]); }},
      {"AreaTrapezium", 3, [](A a) { return AreaTrapezium(a[0], a[1], a[2]); }},
      {"AreaCircle", 1, [](A a) { return AreaCircle(a[0]); }},
      {"AreaSemiCircle", 1, [](A a) { return AreaSemiCircle(a[0]); }},
      {"AreaSector", 2, [](A a) { return AreaSector(a[0], a[1]); }},
      {"AreaEllipse", 2, [](A a) { return AreaEllipse(a[0], a[1]); }},
      {"AreaPentagon", 1, [](A a) { return AreaPentagon(a[0]); }},
      {"AreaHexagon", 1, [](A a) { return AreaHexagon(a[0]); }},
      {"AreaHeptagon", 1, [](A a) { return AreaHeptagon(a[0]); }},
      {"AreaOctagon", 1, [](A a) { return AreaOctagon(a[0]); }},
      {"AreaNonagon", 1, [](A a) { return AreaNonagon(a[0]); }},
      {"AreaDecagon", 1, [](A a) { return AreaDecagon(a[0]); }},
      {"PerimeterTriangle", 3, [](A a) { return PerimeterTriangle(a[0], a[1], a[2]); }},
      {"PerimeterSquare", 1, [](A a) { return PerimeterSquare(a[0]); }},
      {"PerimeterRectangle", 2, [](A a) { return PerimeterRectangle(a[0], a[1]); }},
      {"CircumferenceCircle", 1, [](A a) { return CircumferenceCircle(a[0]); }},
      {"CircumferenceSemiCircle", 1, [](A a) { return CircumferenceSemiCircle(a[0]); }},
      {"ArcLength", 2, [](A a) { return ArcLength(a[0], a[1]); }},
      {"PerimeterSector", 2, [](A a) { return PerimeterSector(a[0], a[1]); }},
      {"PerimeterPentagon", 1, [](A a) { return PerimeterPentagon(a[0]); }},
      {"PerimeterHexagon", 1, [](A a) { return PerimeterHexagon(a[0]); }},
      {"PerimeterOctagon", 1, [](A a) { return PerimeterOctagon(a[0]); }},
      {"PerimeterDecagon", 1, [](A a) { return PerimeterDecagon(a[0]); }},
      {"VolCube", 1, [](A a) { return VolCube(a[0]); }},
      {"VolRectangularSolid", 3, [](A a) { return VolRectangularSolid(a[0], a[1], a[2]); }},
      {"VolSphere", 1, [](A a) { return VolSphere(a[0]); }},
      {"VolHemiSphere", 1, [](A a) { return VolHemiSphere(a[0]); }},
      {"VolRectangularPrism", 2, [](A a) { return VolRectangularPrism(a[0], a[1]); }},
      {"VolCylinder", 2, [](A a) { return VolCylinder(a[0], a[1]); }},
      {"VolPyramid", 2, [](A a) { return VolPyramid(a[0], a[1]); }},
      {"VolCone", 2, [](A a) { return VolCone(a[0], a[1]); }},
      {"VolTetrahedron", 1, [](A a) { return VolTetrahedron(a[0]); }},
      {"VolOctahedron", 1, [](A a) { return VolOctahedron(a[0]); }},
      {"VolDodecahedron", 1, [](A a) { return VolDodecahedron(a[0]); }},
      {"VolIcosahedron", 1, [](A a) { return VolIcosahedron(a[0]); }},
      {"SurfaceAreaCube", 1, [](A a) { return SurfaceAreaCube(a[0]); }},
      {"SurfaceAreaRectangularSolid", 3,
       [](A a) { return SurfaceAreaRectangularSolid(a[0], a[1], a[2]); }},
      {"SurfaceAreaSphere", 1, [](A a) { return SurfaceAreaSphere(a[0]); }},
      {"SurfaceAreaHemiSphere", 1, [](A a) { return SurfaceAreaHemiSphere(a[0]); }},
      {"SurfaceAreaRectangularPrism", 2,
       [](A a) { return SurfaceAreaRectangularPrism(a[0], a[1]); }},
      {"SurfaceAreaCylinder", 2, [](A a) { return SurfaceAreaCylinder(a[0], a[1]); }},
      {"SurfaceAreaPyramid", 2, [](A a) { return SurfaceAreaPyramid(a[0], a[1]); }},
      {"SurfaceAreaCone", 2, [](A a) { return SurfaceAreaCone(a[0], a[1]); }},
      {"SurfaceAreaTetrahedron", 1, [](A a) { return SurfaceAreaTetrahedron(a[0]); }},
      {"SurfaceAreaOctahedron", 1, [](A a) { return SurfaceAreaOctahedron(a[0]); }},
      {"SurfaceAreaDodecahedron", 1, [](A a) { return SurfaceAreaDodecahedron(a[0]); }},
      {"SurfaceAreaIcosahedron", 1, [](A a) { return SurfaceAreaIcosahedron(a[0]); }},
  };
}

// A negative value in any position raises rsLengthNotNeg; zeros are accepted.
TEST(GeometryChecks, EveryLengthArgumentIsChecked) {
  for (const Checked& f : CheckedFunctions()) {
    for (int k = 0; k < f.arity; ++k) {
      std::array<Extended, 3> args{3, 4, 5};
      args[static_cast<std::size_t>(k)] = -0.5L;
      ExpectRaises(
          rsLengthNotNeg, [&] { f.fn(args); },
          std::string(f.name) + " argument " + std::to_string(k));
    }
    EXPECT_NO_THROW(f.fn({0, 0, 0})) << f.name;
    EXPECT_EQ(f.fn({0, 0, 0}), 0) << f.name;
  }
}

TEST(GeometryChecks, TrianglesThatCannotCloseRaiseInvalidSides) {
  ExpectRaises(rsInvalidSides, [] { AreaTriangle(1, 1, 3); });
  ExpectRaises(rsInvalidSides, [] { PerimeterTriangle(1, 1, 3); });
  ExpectRaises(rsInvalidSides, [] { AreaTriangle(10, 1, 1); });
  // The length check comes first.
  ExpectRaises(rsLengthNotNeg, [] { AreaTriangle(1, -1, 3); });
  EXPECT_EQ(AreaTriangle(1, 1, 2), 0);
  EXPECT_EQ(PerimeterTriangle(1, 1, 2), 4);
}

TEST(GeometryChecks, SectorsAboveTwoPiAreWholeCircles) {
  EXPECT_EQ(AreaSector(2, 7), AreaCircle(2));
  ExpectNear(AreaSector(2, TwoPi), 4 * 3.14159265358979323846264338327950288L, "2 pi sector");
  EXPECT_EQ(ArcLength(3, 7), CircumferenceCircle(3));
  ExpectNear(PerimeterSector(1, 10), 2 * 3.14159265358979323846264338327950288L,
             "PerimeterSector(1, 10) has no radii");
  ExpectNear(PerimeterSector(1, TwoPi), 2 * 3.14159265358979323846264338327950288L + 2,
             "PerimeterSector(1, 2 pi) keeps the radii");
}

TEST(TriangleThirdSide, LenientLengthCheckAndAngleLimit) {
  EXPECT_NO_THROW(TriangleThirdSide(-1, 2, 1));
  EXPECT_NO_THROW(TriangleThirdSide(-1, -2, 1));
  EXPECT_NO_THROW(TriangleThirdSide(1, -2, -1));
  ExpectRaises(rsLengthNotNeg, [] { TriangleThirdSide(-1, -2, -1); });
  ExpectRaises(rsAngleNotLEPi, [] { TriangleThirdSide(1, 1, 4); });
  ExpectRaises(rsAngleNotLEPi, [] { TriangleThirdSide(-1, 1, 3.2L); });
  EXPECT_NO_THROW(TriangleThirdSide(1, 1, QENPi));
  EXPECT_EQ(TriangleThirdSide(3, 4, 0), 1);
}

TEST(LineIntersection, MeetingPointsFromASolvedSystem) {
  struct Case {
    std::array<Extended, 8> p;
    Extended x, y;
  };
  const Case cases[] = {
      {{0L, 0L, 2L, 2L, 0L, 2L, 2L, 0L}, 1.0L, 1.0L},
      {{1L, 3L, 4L, -1L, -2L, 0.5L, 5L, 2L}, 2.2L, 1.4L},
      {{0.5L, 0L, 0.5L, 7L, -3L, 1.25L, 9L, 1.25L}, 0.5L, 1.25L},
  };
  for (const Case& c : cases) {
    const auto& p = c.p;
    EXPECT_FALSE(LinesAreParallel(p[0], p[1], p[2], p[3], p[4], p[5], p[6], p[7]));
    Extended x = 99, y = 99;
    EXPECT_TRUE(LineIntersection(p[0], p[1], p[2], p[3], p[4], p[5], p[6], p[7], x, y));
    ExpectNear(x, c.x, "X");
    ExpectNear(y, c.y, "Y");
  }
}

TEST(LineIntersection, ParallelAndCoincidentLinesGiveFalseAndZero) {
  Extended x = 5, y = 7;
  EXPECT_TRUE(LinesAreParallel(0, 0, 1, 1, 0, 1, 2, 3));
  EXPECT_FALSE(LineIntersection(0, 0, 1, 1, 0, 1, 2, 3, x, y));
  EXPECT_EQ(x, 0);
  EXPECT_EQ(y, 0);
  x = 5;
  y = 7;
  EXPECT_FALSE(LineIntersection(0, 0, 1, 2, 2, 4, 3, 6, x, y));  // the same line
  EXPECT_EQ(x, 0);
  EXPECT_EQ(y, 0);
  // The cross product is tested against the tolerance: 1e-13 counts as zero, 1e-11 not.
  EXPECT_TRUE(LinesAreParallel(0, 0, 1, 0, 0, 1, 1, 1 + 1e-13L));
  EXPECT_FALSE(LinesAreParallel(0, 0, 1, 0, 0, 1, 1, 1 + 1e-11L));
}

TEST(GetCircleWithPoints, ThreePointsOfAKnownCircle) {
  struct Case {
    std::array<Extended, 6> p;
    Extended cx, cy, r;
  };
  // Points at chosen angles on circles of known centre and radius (TOVRINGeometry_ref.py).
  const Case cases[] = {
      {{3.86600946737681806876973081303L, -1.1134393800159813065031347577L,
        -0.248440509641427160992704688502L, 0.727892280477045086188059597735L,
        -0.724471839599807606736371697346L, -4.45483133319323090013964174783L},
       1L,
       -2L,
       3L},
      {{-0.0947732705988952119492975444178L, 0.881103238605922379989376741223L,
        -0.812110127410356790248176172126L, 0.931973070119261271547014899434L,
        -1.24249437245033409295367959605L, 0.355840006044900416575558602106L},
       -0.5L,
       0.25L,
       0.75L},
      {{15.0L, 20.0L, 14.387912809451863580581407913L, 22.3971276930210150013664396761L,
        5.31771656354601831150671186664L, 18.2460838615519007593981559998L},
       10L,
       20L,
       5L},

      {{0, 0, 2, 0, 0, 2}, 1, 1, 1.41421356237309504880168872420969808L},
  };
  for (const Case& c : cases) {
    const auto& p = c.p;
    Extended cx = 0, cy = 0, r = 0;
    GetCircleWithPoints(p[0], p[1], p[2], p[3], p[4], p[5], cx, cy, r);
    // The inverse of the 3 x 3 system loses a few digits to its condition.
    EXPECT_NEAR(static_cast<double>(cx), static_cast<double>(c.cx), 1e-14);
    EXPECT_NEAR(static_cast<double>(cy), static_cast<double>(c.cy), 1e-14);
    EXPECT_NEAR(static_cast<double>(r), static_cast<double>(c.r), 1e-14);
  }
}

TEST(GetCircleWithPoints, CollinearPointsRaiseNothing) {
  Extended cx = 0, cy = 0, r = 0;
  EXPECT_NO_THROW(GetCircleWithPoints(0, 0, 1, 1, 2, 2, cx, cy, r));
  EXPECT_NO_THROW(GetCircleWithPoints(1, 1, 1, 1, 1, 1, cx, cy, r));
}

}  // namespace
}  // namespace tovrin
