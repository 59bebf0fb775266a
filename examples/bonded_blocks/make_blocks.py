#!/usr/bin/env python3
"""Make blocks.msh: a rubber pad on a steel block, each meshed for itself, with the faces that are to be joined.

    apt-get install gmsh python3-gmsh
    /usr/bin/python3 examples/bonded_blocks/make_blocks.py

The mesh file is kept beside the model file; groups: the two solids, the faces between them, foot and top.
"""

import pathlib

import gmsh


def main():
    gmsh.initialize()
    for option, value in {"General.Terminal": 0, "General.NumThreads": 1, "Mesh.RandomSeed": 1, "Mesh.MshFileVersion": 4.1,
                          "Mesh.Binary": 1, "Mesh.SecondOrderIncomplete": 1}.items():
        gmsh.option.setNumber(option, value)
    gmsh.model.add("blocks")
    occ = gmsh.model.occ
    steel = occ.addBox(0, 0, 0, 40, 40, 20)
    rubber = occ.addBox(10, 10, 20, 20, 20, 10)
    occ.synchronize()

    def face(volume, axis, value):
        for _, tag in gmsh.model.getBoundary([(3, volume)], oriented=False):
            box = gmsh.model.getBoundingBox(2, tag)
            if abs(box[axis] - value) < 1e-3 and abs(box[axis + 3] - value) < 1e-3:
                return tag
        raise LookupError(value)

    for dimension, tag, name in ((3, steel, "steel block"), (3, rubber, "rubber pad"), (2, face(steel, 2, 0), "foot"),
                                 (2, face(steel, 2, 20), "steel contact"), (2, face(rubber, 2, 20), "rubber contact"),
                                 (2, face(rubber, 2, 30), "top")):
        gmsh.model.setPhysicalName(dimension, gmsh.model.addPhysicalGroup(dimension, [tag]), name)
    for volume, parts in ((steel, 4), (rubber, 5)):
        faces = gmsh.model.getBoundary([(3, volume)], oriented=False)
        for _, curve in gmsh.model.getBoundary(faces, combined=False, oriented=False):
            gmsh.model.mesh.setTransfiniteCurve(curve, parts + 1)
        for _, surface in faces:
            gmsh.model.mesh.setTransfiniteSurface(surface)
            gmsh.model.mesh.setRecombine(2, surface)
        gmsh.model.mesh.setTransfiniteVolume(volume)
    gmsh.model.mesh.generate(3)
    gmsh.write(str(pathlib.Path(__file__).with_name("blocks.msh")))
    gmsh.finalize()


if __name__ == "__main__":
    main()
