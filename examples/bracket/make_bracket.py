#!/usr/bin/env python3
"""Make bracket.msh: an L-shaped mounting bracket, meshed with quadratic tetrahedra, its faces in named groups.

The mesh file is kept in the repository beside the model file, so this script runs only when the part changes:

    apt-get install gmsh python3-gmsh
    /usr/bin/python3 examples/bracket/make_bracket.py

Lengths are in mm. The wall stands in the plane x = 0 and is bolted through two holes; the base lies
in the plane z = 0 and carries a load on its upper side, around a bore. The mesher runs on one thread
with a fixed seed: one version of it gives one mesh.
"""

import argparse
import math
import struct
import sys
from pathlib import Path

LENGTH, WIDTH, HEIGHT = 90.0, 60.0, 70.0
THICKNESS = 10.0
INNER_RADIUS = 8.0
CORNER_RADIUS = 12.0
BOLT_RADIUS = 5.5
BOLT_HOLES = {"BOLT-HOLE-1": (15.0, 48.0), "BOLT-HOLE-2": (45.0, 48.0)}  # y, z
BORE_RADIUS = 10.0
BORE = (58.0, 30.0)  # x, y
MESH_SIZE = 5.0
DIGITS = 6
TOLERANCE = 2e-6

# Corners of the faces S1 to S4, by position in the element; seen from outside they run clockwise.
FACES = ((0, 1, 2), (0, 3, 1), (1, 3, 2), (2, 3, 0))
# Corner pairs of the midside nodes 5 to 10. The mesher has the last two in the other order.
MIDSIDES = ((0, 1), (1, 2), (2, 0), (0, 3), (1, 3), (2, 3))
DECK_ORDER = (0, 1, 2, 3, 4, 5, 6, 7, 9, 8)


def on_wall_back(p):
    return abs(p[0]) < TOLERANCE


def on_base_top(p):
    return abs(p[2] - THICKNESS) < TOLERANCE and p[0] > THICKNESS + INNER_RADIUS - TOLERANCE


def on_bore(p):
    return abs(math.hypot(p[0] - BORE[0], p[1] - BORE[1]) - BORE_RADIUS) < TOLERANCE


def on_bolt_hole(name):
    y, z = BOLT_HOLES[name]
    return lambda p: abs(math.hypot(p[1] - y, p[2] - z) - BOLT_RADIUS) < TOLERANCE


# Faces of the part, and the groups that each is in: the holes are in one of their own and in BOLTS.
FACES_OF_PART = {"CLAMPED-FACE": on_wall_back, **{name: on_bolt_hole(name) for name in BOLT_HOLES},
                 "LOADED-FACE": on_base_top, "BORE": on_bore}
GROUPS = ["CLAMPED-FACE", *BOLT_HOLES, "BOLTS", "LOADED-FACE", "BORE"]
GROUPS_OF_FACE = {name: [name] + (["BOLTS"] if name in BOLT_HOLES else []) for name in FACES_OF_PART}


def exact_measures():
    """Volume of the solid and areas of its surfaces, in closed form."""
    corner = (1.0 - math.pi / 4.0)
    profile = LENGTH * THICKNESS + (HEIGHT - THICKNESS) * THICKNESS + corner * INNER_RADIUS**2
    volume = profile * WIDTH - THICKNESS * (
        4.0 * corner * CORNER_RADIUS**2 + math.pi * (2.0 * BOLT_RADIUS**2 + BORE_RADIUS**2))
    top = ((LENGTH - THICKNESS - INNER_RADIUS) * WIDTH
           - 2.0 * corner * CORNER_RADIUS**2 - math.pi * BORE_RADIUS**2)
    return volume, {"LOADED-FACE": top, "BORE": 2.0 * math.pi * BORE_RADIUS * THICKNESS}


def build_solid(gmsh):
    occ = gmsh.model.occ
    inner = THICKNESS + INNER_RADIUS
    profile = [(0, 0), (LENGTH, 0), (LENGTH, THICKNESS), (inner, THICKNESS),
               (THICKNESS, inner), (THICKNESS, HEIGHT), (0, HEIGHT)]
    points = [occ.addPoint(x, 0, z) for x, z in profile]
    centre = occ.addPoint(inner, 0, inner)
    curves = []
    for i, start in enumerate(points):
        end = points[(i + 1) % len(points)]
        curves.append(occ.addCircleArc(start, centre, end) if i == 3 else occ.addLine(start, end))
    face = occ.addPlaneSurface([occ.addCurveLoop(curves)])
    solid = next(tag for dim, tag in occ.extrude([(2, face)], 0, WIDTH, 0) if dim == 3)
    occ.synchronize()

    def is_outer_corner(edge):
        box = gmsh.model.getBoundingBox(1, edge)
        size = [box[i + 3] - box[i] for i in range(3)]
        upright = size[2] > 0.9 * THICKNESS and max(size[:2]) < 0.1 and box[0] > LENGTH - 0.1
        lying = size[0] > 0.9 * THICKNESS and max(size[1:]) < 0.1 and box[2] > HEIGHT - 0.1
        return upright or lying

    corners = [tag for _, tag in gmsh.model.getEntities(1) if is_outer_corner(tag)]
    if len(corners) != 4:
        sys.exit(f"make_bracket: 4 outer corners expected, {len(corners)} found")
    body = occ.fillet([solid], corners, [CORNER_RADIUS])
    tools = [(3, occ.addCylinder(-1, y, z, THICKNESS + 2, 0, 0, BOLT_RADIUS)) for y, z in BOLT_HOLES.values()]
    tools.append((3, occ.addCylinder(*BORE, -1, 0, 0, THICKNESS + 2, BORE_RADIUS)))
    occ.cut(body, tools)
    occ.synchronize()


def mesh_solid():
    """Coordinates and connectivity in the deck's order, with nodes numbered from 1."""
    import gmsh
    gmsh.initialize()
    for option, value in {"General.Terminal": 0, "General.NumThreads": 1, "Mesh.RandomSeed": 1,
                          "Mesh.Algorithm": 6, "Mesh.Algorithm3D": 1, "Mesh.Optimize": 1,
                          "Mesh.MeshSizeMax": MESH_SIZE, "Mesh.MeshSizeMin": 0.6 * MESH_SIZE,
                          "Mesh.MeshSizeFromCurvature": 16, "Mesh.ElementOrder": 2,
                          "Mesh.HighOrderOptimize": 1}.items():
        gmsh.option.setNumber(option, value)
    gmsh.model.add("bracket")
    build_solid(gmsh)
    gmsh.model.mesh.generate(3)
    tags, flat, _ = gmsh.model.mesh.getNodes()
    position = {int(tag): flat[3 * i:3 * i + 3] for i, tag in enumerate(tags)}
    tet10 = gmsh.model.mesh.getElementType("Tetrahedron", 2)
    _, ends = gmsh.model.mesh.getElementsByType(tet10)
    gmsh.finalize()

    rows = [[int(ends[i + k]) for k in DECK_ORDER] for i in range(0, len(ends), 10)]
    label = {tag: i for i, tag in enumerate(sorted({tag for row in rows for tag in row}), 1)}
    # Adding zero turns a rounded -0.0 into 0.0.
    nodes = [[round(float(c), DIGITS) + 0.0 for c in position[tag]] for tag in label]
    return nodes, [[label[tag] for tag in row] for row in rows]


def subtract(a, b):
    return [a[i] - b[i] for i in range(3)]


def cross(a, b):
    return [a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]]


def dot(a, b):
    return sum(x * y for x, y in zip(a, b))


def gradients(r, s, t):
    """Derivatives of the ten shape functions by r, s and t."""
    natural = (1.0 - r - s - t, r, s, t)
    slope = ((-1.0, -1.0, -1.0), (1.0, 0.0, 0.0), (0.0, 1.0, 0.0), (0.0, 0.0, 1.0))
    rows = [[(4.0 * natural[i] - 1.0) * g for g in slope[i]] for i in range(4)]
    for i, j in MIDSIDES:
        rows.append([4.0 * (natural[i] * slope[j][k] + natural[j] * slope[i][k]) for k in range(3)])
    return rows


A, B = (5.0 - math.sqrt(5.0)) / 20.0, (5.0 + 3.0 * math.sqrt(5.0)) / 20.0
GAUSS = [gradients(*p) for p in ((A, A, A), (B, A, A), (A, B, A), (A, A, B))]
CORNERS = [gradients(*p) for p in ((0, 0, 0), (1, 0, 0), (0, 1, 0), (0, 0, 1))]


def jacobian(points, slopes):
    rows = [[sum(p[i] * g[k] for p, g in zip(points, slopes)) for i in range(3)] for k in range(3)]
    return dot(rows[0], cross(rows[1], rows[2]))


def facets_on(nodes, elements, predicate):
    """Facets whose six nodes all lie on the geometric face."""
    on = [predicate(p) for p in nodes]
    facets = []
    for label, row in enumerate(elements, 1):
        for corners in FACES:
            if all(on[n - 1] for n in face_nodes(row, corners)):
                facets.append((label, corners))
    return facets


def face_nodes(row, corners):
    """Corners, then the midside nodes of the edges from each to the next."""
    edges = [set(pair) for pair in zip(corners, corners[1:] + corners[:1])]
    middles = [next(row[4 + i] for i, m in enumerate(MIDSIDES) if set(m) == edge) for edge in edges]
    return [row[i] for i in corners] + middles


def triangle(points):
    """Area times the outward normal, of corners that run clockwise seen from outside."""
    return [0.5 * c for c in cross(subtract(points[2], points[0]), subtract(points[1], points[0]))]


def check(nodes, elements, facets):
    """The mesh's figures, or an exit with the first thing that is wrong."""
    def require(condition, message):
        if not condition:
            sys.exit(f"make_bracket: {message}")

    require(len(nodes) >= 10000, f"at least 10000 nodes expected, {len(nodes)} found")
    require(len({tuple(p) for p in nodes}) == len(nodes), "two nodes share one place")
    require({n for row in elements for n in row} == set(range(1, len(nodes) + 1)),
            "connectivity and node labels differ")

    volume = 0.0
    worst = math.inf
    facet_count = {}
    for label, row in enumerate(elements, 1):
        require(len(row) == 10 and len(set(row)) == 10, f"element {label}: ten different nodes expected")
        points = [nodes[n - 1] for n in row]
        part = [jacobian(points, slopes) for slopes in GAUSS]
        corner = [jacobian(points, slopes) for slopes in CORNERS]
        require(min(part + corner) > 0.0, f"element {label}: volume not positive")
        volume += sum(part) / 24.0
        worst = min(worst, min(part + corner) / max(part + corner))
        for i, (a, b) in enumerate(MIDSIDES, 4):
            middle = [(points[a][k] + points[b][k]) / 2.0 for k in range(3)]
            require(math.dist(middle, points[i]) < 0.15 * math.dist(points[a], points[b]),
                    f"element {label}: node {i + 1} of 10 is not midway between {a + 1} and {b + 1}")
        for corners in FACES:
            key = frozenset(row[i] for i in corners)
            facet_count[key] = facet_count.get(key, 0) + 1
    require(max(facet_count.values()) == 2, "a face belongs to more than two elements")

    exact_volume, exact_areas = exact_measures()
    require(abs(volume / exact_volume - 1.0) < 1e-3, f"volume {exact_volume:.2f} expected, {volume:.2f} found")
    for name, faces in facets.items():
        area = 0.0
        require(faces, f"{name} has no facets")
        for label, corners in faces:
            row = elements[label - 1]
            points = [nodes[row[i] - 1] for i in corners]
            require(facet_count[frozenset(row[i] for i in corners)] == 1, f"{name}: element {label} is inside")
            normal = triangle(points)
            opposite = nodes[row[({0, 1, 2, 3} - set(corners)).pop()] - 1]
            require(dot(normal, subtract(opposite, points[0])) < 0.0, f"{name}: element {label} points inwards")
            area += math.hypot(*normal)
        if name in exact_areas:
            require(abs(area / exact_areas[name] - 1.0) < 1e-2,
                    f"{name}: area {exact_areas[name]:.2f} expected, {area:.2f} found")
    sizes = ", ".join(f"{name} {len(faces)}" for name, faces in facets.items())
    return (f"{len(nodes)} nodes, {len(elements)} elements, volume {volume:.2f} mm3 (exact {exact_volume:.2f}), "
            f"lowest Jacobian ratio {worst:.3f}; facets: {sizes}")


def msh(nodes, elements, facets, tip):
    """The bytes of a mesh file, MSH 4.1: the solid is volume 1, the faces are surfaces 1, 2, ..., the tip a point."""
    names = list(facets)
    low, high = ([min(p[k] for p in nodes) for k in range(3)], [max(p[k] for p in nodes) for k in range(3)])
    out = [b"$MeshFormat\n4.1 1 8\n", struct.pack("<i", 1), b"\n$EndMeshFormat\n$PhysicalNames\n"]
    out.append(f"{len(GROUPS) + 1}\n0 1 \"TIP\"\n".encode())
    out += [f'2 {GROUPS.index(name) + 1} "{name}"\n'.encode() for name in GROUPS]
    out += [b"$EndPhysicalNames\n$Entities\n", struct.pack("<4Q", 1, 0, len(names), 1)]
    out.append(struct.pack("<i3dQi", 1, *nodes[tip - 1], 1, 1))
    for number, name in enumerate(names, 1):
        groups = [GROUPS.index(group) + 1 for group in GROUPS_OF_FACE[name]]
        out.append(struct.pack("<i6dQ", number, *low, *high, len(groups)) + struct.pack(f"<{len(groups)}i", *groups))
        out.append(struct.pack("<Q", 0))
    out.append(struct.pack("<i6dQQ", 1, *low, *high, 0, len(names)) + struct.pack(f"<{len(names)}i", *range(1, len(names) + 1)))
    out += [b"\n$EndEntities\n$Nodes\n", struct.pack("<4Q3iQ", 1, len(nodes), 1, len(nodes), 3, 1, 0, len(nodes))]
    out.append(struct.pack(f"<{len(nodes)}Q", *range(1, len(nodes) + 1)))
    out += [struct.pack("<3d", *p) for p in nodes]
    blocks = [(3, 1, 11, [[row[k] for k in DECK_ORDER] for row in elements])]
    blocks += [(2, number, 9, [face_nodes(elements[label - 1], corners) for label, corners in facets[name]])
               for number, name in enumerate(names, 1)]
    blocks.append((0, 1, 15, [[tip]]))
    count = sum(len(rows) for *_, rows in blocks)
    out += [b"\n$EndNodes\n$Elements\n", struct.pack("<4Q", len(blocks), count, 1, count)]
    label = 0
    for dimension, entity, kind, rows in blocks:
        out.append(struct.pack("<3iQ", dimension, entity, kind, len(rows)))
        for row in rows:
            label += 1
            out.append(struct.pack(f"<{len(row) + 1}Q", label, *row))
    return b"".join(out) + b"\n$EndElements\n"


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("output", nargs="?", type=Path, default=Path(__file__).with_name("bracket.msh"))
    arguments = parser.parse_args()
    nodes, elements = mesh_solid()
    facets = {name: facets_on(nodes, elements, predicate) for name, predicate in FACES_OF_PART.items()}
    tip = min(range(len(nodes)), key=lambda i: math.dist(nodes[i], (LENGTH, WIDTH / 2, THICKNESS))) + 1
    print(check(nodes, elements, facets))
    arguments.output.write_bytes(msh(nodes, elements, facets, tip))


if __name__ == "__main__":
    main()
