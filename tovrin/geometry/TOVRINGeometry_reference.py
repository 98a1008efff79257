#!/usr/bin/env python3
"""Reference table for TOVRINGeometry_test.cpp (python3 + mpmath, 40 digits).

Every value is computed by a route of its own, not by the closed formula under test:
polygon areas by the shoelace sum over the vertices, solids by a convex-hull construction from
their vertex coordinates (face areas and pyramids from an interior point), round shapes by
numerical quadrature (areas, arc lengths, volumes and surfaces of revolution), triangles from
coordinates. Writes TOVRINGeometry_reference.inc beside this script: the formulas with their
values, line intersections and circles through three points of a known circle.
"""
import itertools
import os
from mpmath import mp, mpf, sqrt, sin, cos, pi, quad, atan2, matrix, lu_solve

mp.dps = 40
EPS = mpf(10) ** -25


def shoelace(pts):
    s = mpf(0)
    for (x1, y1), (x2, y2) in zip(pts, pts[1:] + pts[:1]):
        s += x1 * y2 - x2 * y1
    return abs(s) / 2


def regular_polygon_area(n, side):
    r = side / (2 * sin(pi / n))
    return shoelace([(r * cos(2 * pi * k / n), r * sin(2 * pi * k / n)) for k in range(n)])


def sub(a, b):
    return [a[i] - b[i] for i in range(3)]


def dot(a, b):
    return sum(a[i] * b[i] for i in range(3))


def cross(a, b):
    return [a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]]


def polytope(vertices):
    """(volume, surface) of the convex hull of the vertices."""
    vs = [[mpf(c) for c in v] for v in vertices]
    centre = [sum(v[i] for v in vs) / len(vs) for i in range(3)]
    planes = []
    for a, b, c in itertools.combinations(vs, 3):
        n = cross(sub(b, a), sub(c, a))
        norm = sqrt(dot(n, n))
        if norm < EPS:
            continue
        n = [x / norm for x in n]
        d = dot(n, a)
        if dot(n, centre) > d:
            n, d = [-x for x in n], -d
        if all(dot(n, v) <= d + EPS for v in vs):
            if not any(all(abs(n[i] - p[0][i]) < EPS for i in range(3)) for p in planes):
                planes.append((n, d))
    volume = surface = mpf(0)
    for n, d in planes:
        face = [v for v in vs if abs(dot(n, v) - d) < EPS]
        fc = [sum(v[i] for v in face) / len(face) for i in range(3)]
        u = sub(face[0], fc)
        u = [x / sqrt(dot(u, u)) for x in u]
        w = cross(n, u)
        face.sort(key=lambda v: atan2(dot(sub(v, fc), w), dot(sub(v, fc), u)))
        area = abs(sum(dot(cross(face[k], face[(k + 1) % len(face)]), n)
                       for k in range(len(face)))) / 2
        surface += area
        volume += area * (d - dot(n, centre)) / 3
    return volume, surface


PHI = (1 + sqrt(5)) / 2


def cyclic(points):
    out = []
    for p in points:
        out += [p, (p[1], p[2], p[0]), (p[2], p[0], p[1])]
    return out


def signs(*vals):
    return [tuple(s[i] * vals[i] for i in range(len(vals)))
            for s in itertools.product([1, -1], repeat=len(vals))]


SOLIDS = {  # vertex sets and their edge length
    "Tetrahedron": ([(1, 1, 1), (1, -1, -1), (-1, 1, -1), (-1, -1, 1)], 2 * sqrt(2)),
    "Octahedron": (cyclic([(1, 0, 0), (-1, 0, 0)]), sqrt(2)),
    "Icosahedron": (cyclic(signs(0, 1, PHI)), mpf(2)),
    "Dodecahedron": (signs(1, 1, 1) + cyclic(signs(0, 1 / PHI, PHI)), 2 / PHI),
}


def solid(name, edge):
    vs, e0 = SOLIDS[name]
    k = edge / e0
    return polytope([[k * c for c in v] for v in vs])


def box(a, b, c):
    return polytope([(x, y, z) for x in (0, a) for y in (0, b) for z in (0, c)])


def tri_prism(side, length):
    t = [(0, 0), (side, 0), (side / 2, side * sqrt(3) / 2)]
    return polytope([(x, y, z) for x, y in t for z in (0, length)])


def square_pyramid(side, height):
    h = side / 2
    return polytope([(h, h, 0), (h, -h, 0), (-h, h, 0), (-h, -h, 0), (0, 0, height)])


def revolution_volume(f, a, b):
    return quad(lambda x: pi * f(x) ** 2, [a, b])


def revolution_surface(f, df, a, b):
    return quad(lambda x: 2 * pi * f(x) * sqrt(1 + df(x) ** 2), [a, b])


def disc(r):
    return quad(lambda x: 2 * sqrt(r * r - x * x), [-r, r])


def triangle_area(a, b, c):
    x = (b * b + c * c - a * a) / (2 * c)  # C = (x, y), A = (0, 0), B = (c, 0)
    return c * sqrt(b * b - x * x) / 2


def arc(r, t):
    return quad(lambda s: sqrt((r * sin(s)) ** 2 + (r * cos(s)) ** 2), [0, t])


def sphere_f(r):
    return (lambda x: sqrt(r * r - x * x)), (lambda x: -x / sqrt(r * r - x * x))


rows = []


def row(call, value):
    rows.append((call, value))


M = mpf
for a, b, c in [("3", "4", "5"), ("2.5", "3.25", "4.75"), ("7", "7", "7")]:
    row(f"AreaTriangle({a}L, {b}L, {c}L)", triangle_area(M(a), M(b), M(c)))
for s in ["1", "2.75"]:
    x = M(s)
    row(f"AreaSquare({s}L)", shoelace([(0, 0), (x, 0), (x, x), (0, x)]))
    for n, name in [(5, "Pentagon"), (6, "Hexagon"), (7, "Heptagon"), (8, "Octagon"),
                    (9, "Nonagon"), (10, "Decagon")]:
        row(f"Area{name}({s}L)", regular_polygon_area(n, x))
row("AreaRectangle(2.5L, 4.25L)", shoelace([(0, 0), (M("2.5"), 0), (M("2.5"), M("4.25")),
                                             (0, M("4.25"))]))
row("AreaParallelogram(3.5L, 1.25L)", shoelace([(0, 0), (M("3.5"), 0), (M("4.5"), M("1.25")),
                                                 (1, M("1.25"))]))
row("AreaRhombus(3L, 5.5L)", shoelace([(M("1.5"), 0), (0, M("2.75")), (M("-1.5"), 0),
                                        (0, M("-2.75"))]))
row("AreaTrapezium(3L, 5L, 2.5L)", shoelace([(0, 0), (5, 0), (M("4.5"), M("2.5")),
                                              (M("1.5"), M("2.5"))]))
row("AreaCircle(1.75L)", disc(M("1.75")))
row("AreaSemiCircle(1.75L)", disc(M("1.75")) / 2)
row("AreaSector(2L, 1.25L)", quad(lambda rho, phi: rho, [0, 2], [0, M("1.25")]))
row("AreaSector(2L, 7L)", disc(M(2)))
row("AreaEllipse(3L, 1.5L)", 4 * quad(lambda x: M("1.5") * sqrt(1 - (x / 3) ** 2), [0, 3]))
row("PerimeterTriangle(2.5L, 3.25L, 4.75L)", M("10.5"))
row("CircumferenceCircle(1.75L)", arc(M("1.75"), 2 * pi))
row("CircumferenceSemiCircle(1.75L)", arc(M("1.75"), pi) + M("3.5"))
row("ArcLength(1.5L, 2L)", arc(M("1.5"), M(2)))
row("ArcLength(1.5L, 6.5L)", arc(M("1.5"), 2 * pi))
row("PerimeterSector(1.5L, 2L)", arc(M("1.5"), M(2)) + 3)
row("PerimeterSector(1L, 10L)", arc(M(1), 2 * pi))
for name in ["Tetrahedron", "Octahedron", "Dodecahedron", "Icosahedron"]:
    for e in ["1", "1.5"]:
        v, s = solid(name, M(e))
        row(f"Vol{name}({e}L)", v)
        row(f"SurfaceArea{name}({e}L)", s)
v, s = box(M("1.25"), M("1.25"), M("1.25"))
row("VolCube(1.25L)", v)
row("SurfaceAreaCube(1.25L)", s)
v, s = box(M(2), M("3.5"), M("0.75"))
row("VolRectangularSolid(2L, 3.5L, 0.75L)", v)
row("SurfaceAreaRectangularSolid(2L, 3.5L, 0.75L)", s)
v, s = tri_prism(M("1.5"), M("4"))
row("VolRectangularPrism(1.5L, 4L)", v)
row("SurfaceAreaRectangularPrism(1.5L, 4L)", s)
v, s = square_pyramid(M(3), M(2))
row("VolPyramid(3L, 2L)", v)
row("SurfaceAreaPyramid(3L, 2L)", s)
r = M("1.25")
f, df = sphere_f(r)
row("VolSphere(1.25L)", revolution_volume(f, -r, r))
row("VolHemiSphere(1.25L)", revolution_volume(f, 0, r))
row("SurfaceAreaSphere(1.25L)", revolution_surface(f, df, -r, r))
row("SurfaceAreaHemiSphere(1.25L)", revolution_surface(f, df, 0, r) + disc(r))
row("VolCylinder(1.25L, 3L)", revolution_volume(lambda x: r, 0, 3))
row("SurfaceAreaCylinder(1.25L, 3L)",
    revolution_surface(lambda x: r, lambda x: 0, 0, 3) + 2 * disc(r))
row("VolCone(1.25L, 3L)", revolution_volume(lambda x: r * (1 - x / 3), 0, 3))
h = sqrt(M("3.25") ** 2 - r ** 2)  # slant 3.25
row("SurfaceAreaCone(1.25L, 3.25L)",
    revolution_surface(lambda x: r * (1 - x / h), lambda x: -r / h, 0, h) + disc(r))
for a, b, t in [("3", "4", "1.2"), ("2.5", "1", "3"), ("1", "1", "0.5")]:
    A, B, T = M(a), M(b), M(t)
    row(f"TriangleThirdSide({a}L, {b}L, {t}L)",
        sqrt((A - B * cos(T)) ** 2 + (B * sin(T)) ** 2))
row("TriangleThirdSide(2L, 3L, QENPi)", M(5))
for p in [("1", "0", "0", "0", "0", "1"), ("3", "1", "0.5", "-2", "-1", "4"),
          ("2", "2", "1", "1", "3", "1")]:
    x1, y1, x2, y2, x3, y3 = map(M, p)
    ang = abs(atan2(y1 - y2, x1 - x2) - atan2(y3 - y2, x3 - x2))
    if ang > pi:
        ang = 2 * pi - ang
    row("AngleSizeGiven3Points(" + ", ".join(q + "L" for q in p) + ")", ang)

out = ["// Generated by TOVRINGeometry_reference.py (mpmath, 40 digits); do not edit.", "",
       "// {call, the call, value}", "inline const GeometryReference kGeometryReferences[] = {"]
for call, value in rows:
    out.append(f'    {{"{call}", [] {{ return {call}; }}, {mp.nstr(value, 30)}L}},')
out += ["};", "", "// {X1, Y1, X2, Y2, X3, Y3, X4, Y4}, meeting point X, Y",
        "inline const LineCase kLineIntersections[] = {"]
# Line intersections: solve P1 + t (P2 - P1) = P3 + u (P4 - P3) for t and u.
for p in [("0", "0", "2", "2", "0", "2", "2", "0"), ("1", "3", "4", "-1", "-2", "0.5", "5", "2"),
          ("0.5", "0", "0.5", "7", "-3", "1.25", "9", "1.25")]:
    x1, y1, x2, y2, x3, y3, x4, y4 = map(M, p)
    t, u = lu_solve(matrix([[x2 - x1, x3 - x4], [y2 - y1, y3 - y4]]), matrix([x3 - x1, y3 - y1]))
    out.append("    {{" + ", ".join(q + "L" for q in p) + "}, " + mp.nstr(x1 + t * (x2 - x1), 30)
               + "L, " + mp.nstr(y1 + t * (y2 - y1), 30) + "L},")
out += ["};", "", "// three points {X1, Y1, X2, Y2, X3, Y3} on the circle of centre X, Y and radius R",
        "inline const CircleCase kCircles[] = {"]
for cx, cy, rad, angles in [("1", "-2", "3", (0.3, 2.0, 4.1)), ("-0.5", "0.25", "0.75", (1, 2, 3)),
                            ("10", "20", "5", (0, 0.5, 3.5))]:
    pts = [(M(cx) + M(rad) * cos(a), M(cy) + M(rad) * sin(a)) for a in angles]
    out.append("    {{" + ", ".join(mp.nstr(c, 30) + "L" for pt in pts for c in pt) + "}, "
               + f"{cx}L, {cy}L, {rad}L}},")
out.append("};")
with open(os.path.join(os.path.dirname(os.path.abspath(__file__)), "TOVRINGeometry_reference.inc"),
          "w") as f:
    f.write("\n".join(out) + "\n")
