#!/usr/bin/env python3
"""Make plate.unv: a plate of 200 x 100 with a hole of radius 25, meshed with quadrangles.

    apt-get install gmsh python3-gmsh
    /usr/bin/python3 examples/perforated_plate/make_plate.py

The mesh file is kept beside the model file; groups: the plate, its clamped and its pulled edge, the hole's edge.
"""

import pathlib

import gmsh

LENGTH, WIDTH, RADIUS, SIZE = 200.0, 100.0, 25.0, 10.0


def main():
    gmsh.initialize()
    for option, value in {"General.Terminal": 0, "General.NumThreads": 1, "Mesh.RandomSeed": 1, "Mesh.RecombineAll": 1,
                          "Mesh.MeshSizeMax": SIZE, "Mesh.SaveGroupsOfNodes": 0}.items():
        gmsh.option.setNumber(option, value)
    gmsh.model.add("plate")
    occ = gmsh.model.occ
    disk = occ.addDisk(LENGTH / 2, WIDTH / 2, 0, RADIUS, RADIUS)
    plate = occ.cut([(2, occ.addRectangle(0, 0, 0, LENGTH, WIDTH))], [(2, disk)])[0][0][1]
    occ.synchronize()
    boxes = {tag: gmsh.model.getBoundingBox(1, tag) for _, tag in gmsh.model.getEntities(1)}
    edges = {"clamped": [t for t, b in boxes.items() if b[3] < 1e-3],
             "pulled": [t for t, b in boxes.items() if b[0] > LENGTH - 1e-3],
             "hole": [t for t, b in boxes.items() if b[0] > 1 and b[3] < LENGTH - 1 and b[1] > 1 and b[4] < WIDTH - 1]}
    gmsh.model.setPhysicalName(2, gmsh.model.addPhysicalGroup(2, [plate]), "plate")
    for name, tags in edges.items():
        gmsh.model.setPhysicalName(1, gmsh.model.addPhysicalGroup(1, tags), name)
    gmsh.model.mesh.generate(2)
    gmsh.write(str(pathlib.Path(__file__).with_name("plate.unv")))
    gmsh.finalize()


if __name__ == "__main__":
    main()
