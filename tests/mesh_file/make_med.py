#!/usr/bin/env python3
"""Makes the MED files of this folder's tests, and a universal file of another writer, with FreeCAD's mesher layer from
the universal files that make_meshes.py made.

    apt-get install freecad-python3
    /usr/bin/python3 tests/mesh_file/make_med.py
"""

import pathlib
import sys

sys.path.insert(0, "/usr/lib/freecad-python3/lib")
import FreeCAD  # noqa: E402, F401
import Fem  # noqa: E402

FOLDER = pathlib.Path(__file__).with_name("meshes")


def main():
    for stem in ("tets", "bricks", "prisms", "plate"):
        mesh = Fem.FemMesh()
        mesh.read(str(FOLDER / f"{stem}.unv"))
        mesh.write(str(FOLDER / f"{stem}.med"))
    mesh.write(str(FOLDER / "plate_smesh.unv"))
    mesh = Fem.FemMesh()
    mesh.read(str(FOLDER / "tets.unv"))
    mesh.write(str(FOLDER / "tets_smesh.unv"))


if __name__ == "__main__":
    main()
