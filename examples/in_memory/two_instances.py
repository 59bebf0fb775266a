"""Two stacked blocks: one part, shown twice, and sets of the assembly with members in both.

usage: two_instances.py [DECK.inp]
"""

import sys

import qrx


def model() -> qrx.Model:
    m = qrx.Model(heading="Two stacked blocks")
    lower = [(0.0, 0.0), (20.0, 0.0), (20.0, 20.0), (0.0, 20.0)]
    points = [(x, y, z) for z in (0.0, 10.5) for x, y in lower]
    mesh = qrx.Mesh(points, {"C3D8": [[0, 1, 2, 3, 4, 5, 6, 7]]})
    mesh.add_point_set("BASE", [0, 1, 2, 3])
    mesh.add_cell_set("ALL", [0])
    mesh.add_surface("TOP", {"S2": [1]})
    block = m.add_part("BLOCK", mesh)

    m.add_instance("lower", block)
    m.add_instance("upper", block, translation=(0, 0, 10.5), rotation=(0, 0, 1.0))

    # Sets of the assembly name nodes and elements by their labels.
    m.add_node_set("TIPS", {"lower": [5, 6], "upper": [7, 8]})
    m.add_surface("JOINT", {"lower": {"S2": [1]}, "upper": {"S1": [1]}})
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "two_instances.inp")
