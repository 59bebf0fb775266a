#!/usr/bin/env python3
"""Makes the table and the meshes of a study: 200 plates with a hole, by a Latin hypercube of load, thickness, hole and
fineness of the mesh.

usage: make_study.py [FOLDER]   (the folder of the template; default: this one)

Each variable's range is cut into 200 parts, and each part is met once. Holes have ten radii and meshes two sizes, so
that 20 mesh files serve 200 decks.
"""

import csv
import math
import pathlib
import random
import sys

ROWS = 200
LENGTH, WIDTH = 200.0, 100.0
RADII = [10.0 + 2.5 * i for i in range(10)]
# Elements around the hole and from it to the edge.
FINENESS = {"coarse": (32, 6), "fine": (64, 12)}


def hypercube(rows, variables, chance):
    """Points in the unit cube: in each direction one in each of `rows` equal parts."""
    columns = []
    for _ in range(variables):
        places = [(part + chance.random()) / rows for part in range(rows)]
        chance.shuffle(places)
        columns.append(places)
    return list(zip(*columns))


def outer_point(angle):
    """Where a ray from the centre meets the edge of the plate."""
    x, y = math.cos(angle), math.sin(angle)
    reach = min(LENGTH / 2 / abs(x) if abs(x) > 1e-12 else math.inf,
                WIDTH / 2 / abs(y) if abs(y) > 1e-12 else math.inf)
    return reach * x, reach * y


def angles(count):
    """Around the hole, with a ray to each corner of the plate."""
    corner = math.atan2(WIDTH, LENGTH)
    sides = [(-corner, corner), (corner, math.pi - corner), (math.pi - corner, math.pi + corner),
             (math.pi + corner, 2 * math.pi - corner)]
    each = count // 4
    return [begin + (end - begin) * i / each for begin, end in sides for i in range(each)]


def mesh_text(radius, around, across):
    """Quadrangles in rings around the hole, in MSH 2.2, with the groups that the template knows."""
    rays = angles(around)
    nodes = []
    for ring in range(across + 1):
        part = ring / across
        for angle in rays:
            x, y = outer_point(angle)
            nodes.append((LENGTH / 2 + (1 - part) * radius * math.cos(angle) + part * x,
                          WIDTH / 2 + (1 - part) * radius * math.sin(angle) + part * y))

    def node(ring, ray):
        return ring * around + ray % around + 1

    def edges(ring, chosen):
        return [(node(ring, ray), node(ring, ray + 1)) for ray in range(around) if chosen(ray)]

    side = around // 4
    groups = {"hole": edges(0, lambda ray: True), "pulled": edges(across, lambda ray: ray < side),
              "clamped": edges(across, lambda ray: 2 * side <= ray < 3 * side)}
    cells = [(1, number, pair) for number, name in enumerate(groups, 2) for pair in groups[name]]
    cells += [(3, 1, (node(ring, ray), node(ring + 1, ray), node(ring + 1, ray + 1), node(ring, ray + 1)))
              for ring in range(across) for ray in range(around)]
    lines = ["$MeshFormat", "2.2 0 8", "$EndMeshFormat", "$PhysicalNames", "4", '2 1 "plate"']
    lines += [f'1 {number} "{name}"' for number, name in enumerate(groups, 2)]
    lines += ["$EndPhysicalNames", "$Nodes", str(len(nodes))]
    lines += [f"{label} {x:.6g} {y:.6g} 0" for label, (x, y) in enumerate(nodes, 1)]
    lines += ["$EndNodes", "$Elements", str(len(cells))]
    lines += [f"{label} {kind} 2 {group} {group} " + " ".join(map(str, ends))
              for label, (kind, group, ends) in enumerate(cells, 1)]
    return "\n".join(lines + ["$EndElements", ""])


def main():
    folder = pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else __file__)
    folder = folder if folder.is_dir() else folder.parent
    (folder / "meshes").mkdir(exist_ok=True)
    for radius in RADII:
        for name, (around, across) in FINENESS.items():
            (folder / f"meshes/{name}-{radius:g}.msh").write_text(mesh_text(radius, around, across))
    chance = random.Random(2026)
    with open(folder / "plates.csv", "w", newline="", encoding="utf-8") as file:
        table = csv.writer(file)
        table.writerow(["name", "load", "thickness", "mesh", "title"])
        for number, (load, thickness, hole, fineness) in enumerate(hypercube(ROWS, 4, chance), 1):
            pressure = round(0.0005 + 0.0045 * load, 6)
            sheet = round(1.0 + 4.0 * thickness, 3)
            radius = RADII[int(hole * len(RADII))]
            mesh = list(FINENESS)[int(fineness * len(FINENESS))]
            table.writerow([f"plate-{number:03}", pressure, sheet, f"meshes/{mesh}-{radius:g}.msh",
                            f"Plate of {sheet:g} mm with a hole of radius {radius:g} mm, {mesh} mesh"])


if __name__ == "__main__":
    main()
