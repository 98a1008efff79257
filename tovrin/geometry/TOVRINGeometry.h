// Plane and solid geometry formulas.
//
// Every argument and result is an Extended passed by value (the outputs of the two coordinate
// constructions are references). Every argument of an area, perimeter, volume or surface
// function (angles included) is checked in argument order before any arithmetic: a value
// below 0 raises EMathError(rsLengthNotNeg); 0 is accepted. The ...2Radius inverses
// and the coordinate functions check nothing: a negative root or a division by zero gives the
// IEEE 754 result (a NaN or an infinity).
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Areas ------------------------------------------------------------------------------------
// Heron's formula; a negative Heron product (sides that make no triangle) raises
// rsInvalidSides after the length checks. A degenerate triangle (1, 1, 2) has area 0.
Extended AreaTriangle(Extended A, Extended B, Extended C);
Extended AreaSquare(Extended Side);
Extended AreaRectangle(Extended Length, Extended Width);
Extended AreaParallelogram(Extended Base, Extended Height);
Extended AreaRhombus(Extended D1, Extended D2);  // from the two diagonals
Extended AreaTrapezium(Extended A, Extended B, Extended Height);
Extended AreaCircle(Extended R);
Extended AreaCircle2Radius(Extended Area);
Extended AreaSemiCircle(Extended R);
Extended AreaSemiCircle2Radius(Extended Area);
// A sector of Angle radians; an angle above 2 pi gives the whole circle.
Extended AreaSector(Extended R, Extended Angle);
Extended AreaEllipse(Extended A, Extended B);  // from the two semi-axes
// Regular polygons from the side.
Extended AreaPentagon(Extended Side);
Extended AreaHexagon(Extended Side);
Extended AreaHeptagon(Extended Side);
Extended AreaOctagon(Extended Side);
Extended AreaNonagon(Extended Side);
Extended AreaDecagon(Extended Side);

// --- Perimeters ---------------------------------------------------------------------------------
// Raises rsInvalidSides, as AreaTriangle, for sides that make no triangle.
Extended PerimeterTriangle(Extended A, Extended B, Extended C);
Extended PerimeterSquare(Extended Side);
Extended PerimeterRectangle(Extended Length, Extended Width);
Extended CircumferenceCircle(Extended R);
Extended CircumferenceCircle2Radius(Extended C);
Extended CircumferenceSemiCircle(Extended R);  // the arc and the diameter
Extended CircumferenceSemiCircle2Radius(Extended C);
// Arc of Angle radians; above 2 pi, the whole circumference.
Extended ArcLength(Extended R, Extended Angle);
// The arc and the two radii; above 2 pi, the circumference alone (no radii).
Extended PerimeterSector(Extended R, Extended Angle);
Extended PerimeterPentagon(Extended Side);
Extended PerimeterHexagon(Extended Side);
Extended PerimeterOctagon(Extended Side);
Extended PerimeterDecagon(Extended Side);

// --- Volumes ------------------------------------------------------------------------------------
Extended VolCube(Extended Side);
Extended VolRectangularSolid(Extended A, Extended B, Extended C);
Extended VolSphere(Extended R);
Extended VolSphere2Radius(Extended V);
Extended VolHemiSphere(Extended R);
Extended VolHemiSphere2Radius(Extended V);
// A prism whose base is an equilateral triangle of the given side (despite the name).
Extended VolRectangularPrism(Extended Side, Extended Length);
Extended VolCylinder(Extended R, Extended Height);
Extended VolPyramid(Extended Side, Extended Height);  // square base
Extended VolCone(Extended R, Extended Height);
// Regular solids from the edge.
Extended VolTetrahedron(Extended Edge);
Extended VolOctahedron(Extended Edge);
Extended VolDodecahedron(Extended Edge);
Extended VolIcosahedron(Extended Edge);

// --- Surface areas --------------------------------------------------------------------------
Extended SurfaceAreaCube(Extended Side);
Extended SurfaceAreaRectangularSolid(Extended A, Extended B, Extended C);
Extended SurfaceAreaSphere(Extended R);
Extended SurfaceAreaSphere2Radius(Extended S);
Extended SurfaceAreaHemiSphere(Extended R);  // the dome and the base disc
Extended SurfaceAreaHemiSphere2Radius(Extended S);
// The triangular prism of VolRectangularPrism: two end triangles and three sides.
Extended SurfaceAreaRectangularPrism(Extended Side, Extended Length);
Extended SurfaceAreaCylinder(Extended R, Extended Height);
// Square pyramid from the perpendicular height.
Extended SurfaceAreaPyramid(Extended Side, Extended Height);
// Cone from the slant height (unlike the pyramid).
Extended SurfaceAreaCone(Extended R, Extended Slant);
Extended SurfaceAreaTetrahedron(Extended Edge);
Extended SurfaceAreaOctahedron(Extended Edge);
Extended SurfaceAreaDodecahedron(Extended Edge);
Extended SurfaceAreaIcosahedron(Extended Edge);

// --- Triangles and coordinates ----------------------------------------------------------------
// The side opposite Angle (radians) between sides A and B, by the law of cosines. Lenient
// length check: rsLengthNotNeg only when A, B and Angle are all below 0. Then an angle above
// pi raises rsAngleNotLEPi (pi itself is accepted).
Extended TriangleThirdSide(Extended A, Extended B, Extended Angle);
// The circle through three points: centre (CX, CY) and radius R, solved through
// MatrixInverse. Collinear or coincident points make the matrix singular; the outputs are then
// whatever the partly reduced inverse gives (not meaningful) and nothing is raised.
void GetCircleWithPoints(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3,
                         Extended Y3, Extended& CX, Extended& CY, Extended& R);
// The angle at (X2, Y2) between the rays to (X1, Y1) and (X3, Y3), in radians, 0 to pi.
// Coincident points divide by zero (NaN).
Extended AngleSizeGiven3Points(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3,
                               Extended Y3);
// Whether the line through points 1 and 2 is parallel to the line through points 3 and 4
// (the cross product of their directions is zero within the tolerance).
bool LinesAreParallel(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3, Extended Y3,
                      Extended X4, Extended Y4);
// The intersection (X, Y) of those two lines and true; for parallel or coincident lines
// X = Y = 0 and false.
bool LineIntersection(Extended X1, Extended Y1, Extended X2, Extended Y2, Extended X3, Extended Y3,
                      Extended X4, Extended Y4, Extended& X, Extended& Y);

}  // namespace tovrin
