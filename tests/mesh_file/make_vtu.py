#!/usr/bin/env python3
"""Makes the VTU files of this folder's tests with VTK, from the legacy files that make_meshes.py made.

    apt-get install python3-vtk9
    /usr/bin/python3 tests/mesh_file/make_vtu.py
"""

import pathlib

import vtk

FOLDER = pathlib.Path(__file__).with_name("meshes")
FORMS = {
    "ascii": lambda w: w.SetDataModeToAscii(),
    "base64": lambda w: (w.SetDataModeToBinary(), w.SetCompressorTypeToNone()),
    "base64z": lambda w: (w.SetDataModeToBinary(), w.SetCompressorTypeToZLib(), w.SetBlockSize(1024)),
    "raw": lambda w: (w.SetDataModeToAppended(), w.EncodeAppendedDataOff(), w.SetCompressorTypeToNone()),
    "raw64": lambda w: (w.SetDataModeToAppended(), w.EncodeAppendedDataOff(), w.SetCompressorTypeToNone(), w.SetHeaderTypeToUInt64()),
    "rawz": lambda w: (w.SetDataModeToAppended(), w.EncodeAppendedDataOff(), w.SetCompressorTypeToZLib(), w.SetBlockSize(1024)),
    "appended": lambda w: (w.SetDataModeToAppended(), w.EncodeAppendedDataOn(), w.SetCompressorTypeToNone()),
    "appendedz": lambda w: (w.SetDataModeToAppended(), w.EncodeAppendedDataOn(), w.SetCompressorTypeToZLib()),
}


def grid_of(name):
    reader = vtk.vtkUnstructuredGridReader()
    reader.SetFileName(str(FOLDER / name))
    reader.ReadAllScalarsOn()
    reader.Update()
    return reader.GetOutput()


def main():
    for stem, forms in {"tets": FORMS, "bricks": {"raw": FORMS["raw"]}, "prisms": {"base64z": FORMS["base64z"]}}.items():
        for name, choose in forms.items():
            writer = vtk.vtkXMLUnstructuredGridWriter()
            writer.SetInputData(grid_of(f"{stem}_a.vtk"))
            writer.SetFileName(str(FOLDER / f"{stem}_{name}.vtu"))
            choose(writer)
            writer.Write()
    # The legacy format of today, with offsets.
    for form in ("ASCII", "Binary"):
        writer = vtk.vtkUnstructuredGridWriter()
        writer.SetInputData(grid_of("tets_a.vtk"))
        writer.SetFileName(str(FOLDER / f"tets_51{form[0].lower()}.vtk"))
        getattr(writer, f"SetFileTypeTo{form}")()
        writer.Write()


if __name__ == "__main__":
    main()
