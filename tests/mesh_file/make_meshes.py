#!/usr/bin/env python3
"""Makes the mesh files of this folder's tests, by real meshers and from geometry of our own.

    apt-get install gmsh python3-gmsh
    /usr/bin/python3 tests/mesh_file/make_meshes.py

The files are kept in the repository (meshes/); the script runs only when the geometry changes. Two blocks of
2 x 1 x 1 and 1 x 1 x 1 stand side by side; groups overlap, and have blanks and accents in their names.
"""

import pathlib
import sys

import gmsh

FOLDER = pathlib.Path(__file__).with_name("meshes")


def start():
    gmsh.initialize()
    for option, value in {"General.Terminal": 0, "General.NumThreads": 1, "Mesh.RandomSeed": 1}.items():
        gmsh.option.setNumber(option, value)


def box_groups():
    """Physical groups by what they bound; `both` lies over the two others."""
    volumes = [tag for _, tag in gmsh.model.getEntities(3)]
    left = next(v for v in volumes if gmsh.model.occ.getCenterOfMass(3, v)[0] < 2)
    right = next(v for v in volumes if v != left)

    def faces(axis, value):
        found = []
        for _, tag in gmsh.model.getEntities(2):
            box = gmsh.model.getBoundingBox(2, tag)
            if abs(box[axis] - value) < 1e-3 and abs(box[axis + 3] - value) < 1e-3:
                found.append(tag)
        return found

    def edges(y, z):
        found = []
        for _, tag in gmsh.model.getEntities(1):
            box = gmsh.model.getBoundingBox(1, tag)
            if all(abs(v - w) < 1e-3 for v, w in zip((box[1], box[4], box[2], box[5]), (y, y, z, z))):
                found.append(tag)
        return found

    corner = next(tag for _, tag in gmsh.model.getEntities(0) if max(map(abs, gmsh.model.getValue(0, tag, []))) < 1e-6)
    for dimension, tags, name in ((3, [left], "left block"), (3, [right], "Bloc à droite"), (3, [left, right], "both"),
                                  (2, faces(0, 0), "fix holes"), (2, faces(2, 1), "Oberfläche"),
                                  (1, edges(0, 0), "edge"), (0, [corner], "corner")):
        gmsh.model.setPhysicalName(dimension, gmsh.model.addPhysicalGroup(dimension, tags), name)


def make_box(order, hexahedra, incomplete=1):
    gmsh.clear()
    gmsh.model.add("box")
    occ = gmsh.model.occ
    occ.addBox(0, 0, 0, 2, 1, 1)
    occ.addBox(2, 0, 0, 1, 1, 1)
    occ.fragment([(3, 1)], [(3, 2)])
    occ.synchronize()
    box_groups()
    gmsh.option.setNumber("Mesh.MeshSizeMax", 1.0)
    gmsh.option.setNumber("Mesh.MeshSizeMin", 1.0)
    gmsh.option.setNumber("Mesh.SecondOrderIncomplete", incomplete)
    if hexahedra:
        for _, curve in gmsh.model.getEntities(1):
            gmsh.model.mesh.setTransfiniteCurve(curve, 3)
        for _, surface in gmsh.model.getEntities(2):
            gmsh.model.mesh.setTransfiniteSurface(surface)
            gmsh.model.mesh.setRecombine(2, surface)
        for _, volume in gmsh.model.getEntities(3):
            gmsh.model.mesh.setTransfiniteVolume(volume)
    gmsh.model.mesh.generate(3)
    gmsh.model.mesh.setOrder(order)
    gmsh.model.mesh.renumberElements()


def make_prisms():
    """A triangle drawn up: wedges, and a pyramid on a quadrangle beside it."""
    gmsh.clear()
    gmsh.model.add("prisms")
    occ = gmsh.model.occ
    base = occ.addRectangle(0, 0, 0, 2, 1)
    occ.extrude([(2, base)], 0.3, 0.2, 1, numElements=[2], recombine=True)
    occ.synchronize()
    gmsh.model.setPhysicalName(3, gmsh.model.addPhysicalGroup(3, [1]), "wedges")
    gmsh.model.setPhysicalName(2, gmsh.model.addPhysicalGroup(2, [base]), "base")
    gmsh.option.setNumber("Mesh.MeshSizeMax", 1.0)
    gmsh.option.setNumber("Mesh.SecondOrderIncomplete", 1)
    gmsh.model.mesh.generate(3)
    gmsh.model.mesh.setOrder(2)


def make_plate():
    """A plate of quadrangles with a hole's edge for a group."""
    gmsh.clear()
    gmsh.model.add("plate")
    occ = gmsh.model.occ
    plate = occ.cut([(2, occ.addRectangle(0, 0, 0, 4, 2))], [(2, occ.addDisk(2, 1, 0, 0.5, 0.5))])[0][0][1]
    occ.synchronize()
    curves = gmsh.model.getEntities(1)
    boxes = {t: gmsh.model.getBoundingBox(1, t) for _, t in curves}
    hole = [t for t, box in boxes.items() if box[0] > 1 and box[3] < 3 and box[1] > 0.2]
    left = [t for t, box in boxes.items() if box[3] < 1e-3]
    for dimension, tags, name in ((2, [plate], "plate"), (1, hole, "hole"), (1, left, "left")):
        gmsh.model.setPhysicalName(dimension, gmsh.model.addPhysicalGroup(dimension, tags), name)
    gmsh.option.setNumber("Mesh.MeshSizeMax", 0.5)
    gmsh.option.setNumber("Mesh.RecombineAll", 1)
    gmsh.model.mesh.generate(2)
    gmsh.option.setNumber("Mesh.RecombineAll", 0)


def write(name, version=4.1, binary=0, all_cells=0, nodes=0):
    gmsh.option.setNumber("Mesh.MshFileVersion", version)
    gmsh.option.setNumber("Mesh.Binary", binary)
    gmsh.option.setNumber("Mesh.SaveAll", all_cells)
    gmsh.option.setNumber("Mesh.SaveGroupsOfNodes", nodes)
    gmsh.write(str(FOLDER / name))


def write_all_formats(stem):
    write(f"{stem}_41.msh")
    write(f"{stem}_41b.msh", binary=1)
    write(f"{stem}_22.msh", 2.2)
    write(f"{stem}_22b.msh", 2.2, binary=1)
    write(f"{stem}.unv")
    write(f"{stem}_nodes.unv", nodes=1)
    write(f"{stem}_a.vtk")
    write(f"{stem}_b.vtk", binary=1)


def main():
    FOLDER.mkdir(exist_ok=True)
    start()
    make_box(2, False)
    write_all_formats("tets")
    make_box(1, False)
    write("tets1_22.msh", 2.2)
    make_box(2, True)
    write_all_formats("bricks")
    make_box(2, True, incomplete=0)
    write("bricks27.msh", binary=1)
    make_prisms()
    write_all_formats("prisms")
    make_plate()
    write_all_formats("plate")
    make_box(1, False)
    write("box_a.stl", all_cells=1)
    write("box_b.stl", binary=1, all_cells=1)
    gmsh.finalize()


if __name__ == "__main__":
    sys.exit(main())
