#!/usr/bin/env python3
"""Makes the meshes of the recipes: structured blocks of hexahedra with a group on each side.

usage: make_meshes.py [--check]   (--check fails when a file beside this script isn't what would be made)

Lengths in mm. A block has the volume group BODY and the surface groups X0, X1, Y0, Y1, Z0 and Z1, its ends along each
axis. The wedge is a block that is bent around the z axis: X is the radius, Y the angle.
"""

import argparse
import math
import pathlib
import sys

FOLDER = pathlib.Path(__file__).resolve().parent / "meshes"


def straight(x, y, z):
    return x, y, z


def bent(degrees):
    """From radius, part of the angle and height to a point."""
    def place(radius, part, height):
        angle = math.radians(degrees) * part
        return radius * math.cos(angle), radius * math.sin(angle), height
    return place


def msh(names, nodes, cells):
    """MSH 2.2: names are (dimension, name) by number from 1, cells (kind, group, nodes)."""
    lines = ["$MeshFormat", "2.2 0 8", "$EndMeshFormat", "$PhysicalNames", str(len(names))]
    lines += [f'{dimension} {number} "{name}"' for number, (dimension, name) in enumerate(names, 1)]
    lines += ["$EndPhysicalNames", "$Nodes", str(len(nodes))]
    lines += [f"{label} " + " ".join(f"{value:.6g}" for value in node) for label, node in enumerate(nodes, 1)]
    lines += ["$EndNodes", "$Elements", str(len(cells))]
    lines += [f"{label} {kind} 2 {group} {group} " + " ".join(map(str, ends))
              for label, (kind, group, ends) in enumerate(cells, 1)]
    return "\n".join(lines + ["$EndElements", ""])


def grid(count, size, begin=0):
    """Points of an axis, evenly spaced."""
    return [begin + size * n / count for n in range(count + 1)]


def block(xs, ys, zs, place=straight, holes=()):
    """Hexahedra between the points of three axes, but for the columns (i, j) along z that are holes."""
    nx, ny, nz = len(xs) - 1, len(ys) - 1, len(zs) - 1

    def node(i, j, k):
        return 1 + i + (nx + 1) * (j + (ny + 1) * k)

    nodes = [place(xs[i], ys[j], zs[k]) for k in range(nz + 1) for j in range(ny + 1) for i in range(nx + 1)]
    bodies = [(5, 1, (node(i, j, k), node(i + 1, j, k), node(i + 1, j + 1, k), node(i, j + 1, k),
                      node(i, j, k + 1), node(i + 1, j, k + 1), node(i + 1, j + 1, k + 1), node(i, j + 1, k + 1)))
              for k in range(nz) for j in range(ny) for i in range(nx) if (i, j) not in holes]
    sides = []
    for group, i in ((2, 0), (3, nx)):
        sides += [(3, group, (node(i, j, k), node(i, j + 1, k), node(i, j + 1, k + 1), node(i, j, k + 1)))
                  for k in range(nz) for j in range(ny)]
    for group, j in ((4, 0), (5, ny)):
        sides += [(3, group, (node(i, j, k), node(i + 1, j, k), node(i + 1, j, k + 1), node(i, j, k + 1)))
                  for k in range(nz) for i in range(nx)]
    for group, k in ((6, 0), (7, nz)):
        sides += [(3, group, (node(i, j, k), node(i + 1, j, k), node(i + 1, j + 1, k), node(i, j + 1, k)))
                  for j in range(ny) for i in range(nx) if (i, j) not in holes]
    names = [(3, "BODY"), *((2, name) for name in ("X0", "X1", "Y0", "Y1", "Z0", "Z1"))]
    return msh(names, nodes, sides + bodies)


MESHES = {
    "bar.msh": block(grid(6, 60), grid(2, 20), grid(2, 20)),
    "bolt.msh": block(grid(2, 20), grid(2, 20), grid(6, 60)),
    "cube.msh": block(grid(2, 10), grid(2, 10), grid(2, 10)),
    "punch.msh": block(grid(2, 30), grid(2, 30), grid(2, 30)),
    "slab.msh": block(grid(4, 80), grid(4, 80), grid(2, 20)),
    "sleeve.msh": block([0, 8, 32, 40], [0, 8, 32, 40], grid(4, 60), holes={(1, 1)}),
    "wedge.msh": block(grid(3, 40, 20), grid(3, 1), grid(2, 10), bent(30)),
}


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--check", action="store_true")
    check = parser.parse_args().check
    FOLDER.mkdir(exist_ok=True)
    stale = []
    for name, text in MESHES.items():
        file = FOLDER / name
        if not check:
            file.write_text(text, encoding="utf-8")
        elif not file.exists() or file.read_text(encoding="utf-8") != text:
            stale.append(name)
    if stale:
        print(f"out of date: {', '.join(stale)}; run {pathlib.Path(__file__).name}", file=sys.stderr)
    return 1 if stale else 0


if __name__ == "__main__":
    sys.exit(main())
