#!/usr/bin/env python3
"""Make bracket.json: an L-shaped mounting bracket, meshed with quadratic tetrahedra.

The model file is kept in the repository, so this script runs only when the part changes:

    apt-get install gmsh python3-gmsh
    /usr/bin/python3 examples/bracket/make_bracket.py

    make_bracket.py --check FILE    checks a model file against the geometry, without the mesher

Lengths are in mm. The wall stands in the plane x = 0 and is bolted through two holes; the base lies
in the plane z = 0 and carries a load on its upper side, around a bore. The mesher runs on one thread
with a fixed seed: one version of it gives one mesh.
"""

import argparse
import json
import math
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


NODE_SETS = {"CLAMPED-FACE": on_wall_back, **{name: on_bolt_hole(name) for name in BOLT_HOLES}}
SURFACES = {"LOADED-FACE": on_base_top, "BORE": on_bore}

# The bracket is loaded, then watched in small motions about that state: bent both ways, its modes, the
# response to a shaking machine and to a sudden stop. Forces are in N, times in s, so masses are in t.
DAMPING = {"directDamping": {"rows": [{"firstMode": 1, "lastMode": 12, "value": 0.02}]}}
STEPS = [
    {"name": "Initial", "class": "kprC_InitialStep"},
    {"name": "Tighten", "class": "kprC_StaticStep", "description": "Large displacements, in increments of a tenth",
     "nlgeom": "ON", "initialInc": 0.1, "maxInc": 0.2, "restart": {"class": "kprC_StandardRestart", "frequency": 5},
     "monitor": {"class": "kprC_StandardMonitor", "region": "TIP", "dof": 3}},
    {"name": "Bend", "class": "kprC_StaticLinearPerturbationStep", "loadCases": {
        "Down": {"loads": {"Push": 1.0}}, "Sideways": {"loads": {"Pull": 1.0, "Push": 0.1}}}},
    {"name": "Modes", "class": "kprC_FrequencyStep", "numEigen": 12},
    {"name": "Shake", "class": "kprC_SteadyStateModalStep",
     "frequencies": [{"lower": 10, "upper": 2000, "points": 40}], **DAMPING},
    {"name": "Stop", "class": "kprC_ModalDynamicsStep", "timePeriod": 0.05, "timeIncrement": 1e-4, **DAMPING},
]
PHYSICS = {
    "materials": {"Aluminium": {
        "elastic": {"table": [[70000, 0.33]]}, "density": {"table": [[2.7e-09]]}}},
    "sections": {"Solid": {"class": "kseC_HomogenousSolidSection", "materialName": "Aluminium"}},
    "amplitudes": {
        "Rise": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]},
        "Knock": {"class": "kamC_Tabular", "table": [[0, 1], [0.005, 1], [0.006, 0]]}},
    "boundaryConditions": {
        "Bolted": {"class": "kbcC_DisplacementBC", "region": "BOLTS",
                   "states": {"Initial": {"u1": 0, "u2": 0, "u3": 0}}},
        "Wall": {"class": "kbcC_DisplacementBC", "region": "BRACKET-1.CLAMPED-FACE",
                 "states": {"Initial": {"u2": 0}}}},
    "loads": {
        "Weight on the pad": {"class": "kloC_Pressure", "region": "PAD",
                              "states": {"Tighten": {"magnitude": 0.5, "amplitude": "Rise"}}},
        "Push": {"class": "kloC_ConcentratedForce", "region": "TIP", "states": {"Bend": {"component3": -100}}},
        "Pull": {"class": "kloC_ConcentratedForce", "region": "TIP", "states": {"Bend": {"component1": 100}}},
        "Shaker": {"class": "kloC_ConcentratedForce", "region": "TIP", "complex": True,
                   "complexComponent3": [20, 5], "states": {"Shake": {"component3": 20}}},
        "Jolt": {"class": "kloC_ConcentratedForce", "region": "TIP",
                 "states": {"Stop": {"component2": 250, "amplitude": "Knock"}}}},
    "fieldOutputRequests": {
        "Stresses": {"class": "korC_FieldOutput",
                     "states": {"Tighten": {"variables": ["S", "U", "RF"], "frequencyType": "TIME_INTERVAL",
                                            "timeInterval": 0.25}}},
        "Shapes": {"class": "korC_FieldOutput",
                   "states": {"Bend": {}, "Modes": {"frequencyType": "MODE_LIST"},
                              "Shake": {"frequencyType": "FREQUENCY", "frequency": 1}}}},
    "historyOutputRequests": {
        "Tip": {"class": "korC_HistoryOutput", "region": "TIP",
                "states": {"Tighten": {"variables": ["U3"]}, "Shake": {"variables": ["U1", "U2", "U3"]}}},
        "Energies": {"class": "korC_HistoryOutput", "states": {"Tighten": {}}}},
}


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
        for face, corners in enumerate(FACES, 1):
            if all(on[n - 1] for n in face_nodes(row, corners)):
                facets.append([label, f"S{face}"])
    return facets


def face_nodes(row, corners):
    pairs = [set(pair) for pair in zip(corners, corners[1:] + corners[:1])]
    return [row[i] for i in corners] + [row[4 + MIDSIDES.index(m)] for m in MIDSIDES if set(m) in pairs]


def model_of(nodes, elements):
    sets = [{"name": "ALL", "kind": "element", "labels": {"from": 1, "to": len(elements)}}]
    node_sets = {name: [i for i, p in enumerate(nodes, 1) if predicate(p)]
                 for name, predicate in NODE_SETS.items()}
    surfaces = {name: facets_on(nodes, elements, predicate) for name, predicate in SURFACES.items()}
    sets += [{"name": name, "kind": "node", "labels": labels} for name, labels in node_sets.items()]
    sets += [{"name": name, "kind": "surface", "facets": facets} for name, facets in surfaces.items()]

    def member(**what):
        return [{"instance": "BRACKET-1", **what}]

    tip = min(range(len(nodes)), key=lambda i: math.dist(nodes[i], (LENGTH, WIDTH / 2, THICKNESS))) + 1
    bolts = sorted(set().union(*(node_sets[name] for name in BOLT_HOLES)))
    mesh = {"nodes": {"labels": {"from": 1, "to": len(nodes)}, "coordinates": nodes},
            "elements": [{"type": "C3D10", "labels": {"from": 1, "to": len(elements)},
                          "connectivity": elements}],
            "sets": sets}
    return {"format": "qrx-model/1", "models": {"Default Model": {
        "description": "An L-shaped mounting bracket: two bolt holes in the wall, a bore in the base; lengths in mm. "
                       "Made by make_bracket.py.",
        "topLevelSolverInput": ["*Heading", "Mounting bracket, quadratic tetrahedra, lengths in mm"],
        "parts": {"BRACKET": {"mesh": mesh,
                              "sectionAssignments": [{"region": "ALL", "sectionName": "Solid"}]}},
        "assembly": {
            "instances": {"BRACKET-1": {"part": "BRACKET", "translation": [250, 40, 0],
                                        "rotation": [0, 0, round(math.pi / 2, DIGITS)]}},
            "sets": [{"name": "BOLTS", "kind": "node", "members": member(labels=bolts)},
                     {"name": "TIP", "kind": "node", "members": member(labels=[tip])},
                     {"name": "PAD", "kind": "surface", "members": member(facets=surfaces["LOADED-FACE"])}]},
        "steps": STEPS, **PHYSICS}}}


def triangle(points):
    """Area times the outward normal, of corners that run clockwise seen from outside."""
    return [0.5 * c for c in cross(subtract(points[2], points[0]), subtract(points[1], points[0]))]


def check(document):
    """The mesh's figures, or an exit with the first thing that is wrong."""
    def require(condition, message):
        if not condition:
            sys.exit(f"make_bracket: {message}")

    model = document["models"]["Default Model"]
    mesh = model["parts"]["BRACKET"]["mesh"]
    nodes = mesh["nodes"]["coordinates"]
    (block,) = mesh["elements"]
    elements = block["connectivity"]
    require(mesh["nodes"]["labels"] == {"from": 1, "to": len(nodes)}, "node labels do not fit the coordinates")
    require(block["labels"] == {"from": 1, "to": len(elements)}, "element labels do not fit the connectivity")
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

    sets = {entry["name"]: entry for entry in mesh["sets"]}
    require(len(sets) == len(mesh["sets"]), "two sets have one name")
    require(sets["ALL"]["labels"] == block["labels"], "set ALL does not hold all elements")
    for name, predicate in NODE_SETS.items():
        labels = sets[name]["labels"]
        require(labels and labels == sorted(set(labels)), f"set {name}: empty or out of order")
        require(all(predicate(nodes[n - 1]) for n in labels), f"set {name}: a node is off its face")
    for name, predicate in SURFACES.items():
        area = 0.0
        for label, face in sets[name]["facets"]:
            corners = FACES[int(face[1:]) - 1]
            row = elements[label - 1]
            points = [nodes[row[i] - 1] for i in corners]
            require(facet_count[frozenset(row[i] for i in corners)] == 1, f"{name}: {label} {face} is inside")
            require(all(predicate(nodes[n - 1]) for n in face_nodes(row, corners)),
                    f"{name}: {label} {face} is off its face")
            normal = triangle(points)
            opposite = nodes[row[({0, 1, 2, 3} - set(corners)).pop()] - 1]
            require(dot(normal, subtract(opposite, points[0])) < 0.0, f"{name}: {label} {face} points inwards")
            if name == "LOADED-FACE":
                require(normal[2] > 0.999 * math.hypot(*normal), f"{name}: {label} {face} does not look up")
            area += math.hypot(*normal)
        require(abs(area / exact_areas[name] - 1.0) < 1e-2,
                f"{name}: area {exact_areas[name]:.2f} expected, {area:.2f} found")

    require(model["steps"] == STEPS, "the steps are others than those of this script")
    for name, content in PHYSICS.items():
        require(model[name] == content, f"the {name} are others than those of this script")
    for entry in model["assembly"]["sets"]:
        for part in entry["members"]:
            require(part["instance"] in model["assembly"]["instances"], f"{entry['name']}: unknown instance")
    sizes = ", ".join(f"{name} {len(sets[name]['labels'])}" for name in NODE_SETS)
    sizes += "".join(f", {name} {len(sets[name]['facets'])}" for name in SURFACES)
    return (f"{len(nodes)} nodes, {len(elements)} elements, volume {volume:.2f} mm3 (exact {exact_volume:.2f}), "
            f"lowest Jacobian ratio {worst:.3f}; {sizes}")


def layout(value, depth=0):
    """JSON with one node, element or facet per line and labels in rows."""
    pad, inner = " " * depth, " " * (depth + 1)
    if isinstance(value, dict) and any(isinstance(v, (dict, list)) for v in value.values()):
        items = [f"{inner}{json.dumps(k)}: {layout(v, depth + 1)}" for k, v in value.items()]
        return "{\n" + ",\n".join(items) + f"\n{pad}}}"
    if isinstance(value, list) and value and isinstance(value[0], (dict, list)):
        return "[\n" + ",\n".join(inner + layout(v, depth + 1) for v in value) + f"\n{pad}]"
    if isinstance(value, list) and len(value) > 16:
        rows = [", ".join(map(json.dumps, value[i:i + 16])) for i in range(0, len(value), 16)]
        return "[\n" + ",\n".join(inner + row for row in rows) + f"\n{pad}]"
    return json.dumps(value)


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("output", nargs="?", type=Path, default=Path(__file__).with_name("bracket.json"))
    parser.add_argument("--check", action="store_true", help="check the file instead of making it")
    arguments = parser.parse_args()
    if not arguments.check:
        document = model_of(*mesh_solid())
        check(document)
        arguments.output.write_text(layout(document) + "\n", encoding="utf-8")
    print(check(json.loads(arguments.output.read_text(encoding="utf-8"))))


if __name__ == "__main__":
    main()
