"""A plate with a hole, of which a study varies load, thickness, hole and mesh. Lengths in mm, forces in N.

usage: plate_study.py [FOLDER]   (a deck for each row that make_study.py has drawn; default: plates)
"""

import csv
import pathlib
import sys

import qrx

HERE = pathlib.Path(__file__).parent


def model(mesh_file: pathlib.Path = HERE / "meshes" / "coarse-25.msh") -> qrx.Model:
    m = qrx.Model(heading="Plate with a hole")

    mesh = qrx.Mesh.read(
        mesh_file,
        element_types={"quad4": "S4R"},
        groups={"clamped": "CLAMPED", "pulled": "PULLED", "hole": "HOLE"},
    )
    plate = m.add_part("PLATE", mesh)
    plate.assign("plate", "Sheet")

    m.add_instance("PLATE-1", plate)

    m.materials["Steel"] = qrx.Material(elastic=[[210000, 0.3]])

    m.sections["Sheet"] = qrx.HomogenousShellSection(thickness=2, material="Steel")

    m.add_step(qrx.StaticStep("Load"))

    m.boundary_conditions["Drawn"] = qrx.DisplacementBC("PLATE-1.PULLED").at("Load", u1=0.1)
    m.boundary_conditions["Held"] = qrx.TypeBC("PLATE-1.CLAMPED").at("Initial", type_name="ENCASTRE")

    m.loads["Wind"] = qrx.Pressure("PLATE-1.plate_SPOS").at("Load", magnitude=0.001)

    m.field_output_requests["Usual"] = qrx.FieldOutput().at("Load")
    return m


# What the rows change, by the columns of the table.
PLACES = {
    "load": "/models/Default Model/loads/Wind/states/Load/magnitude",
    "thickness": "/models/Default Model/sections/Sheet/thickness",
    "title": "/models/Default Model/topLevelSolverInput/1",
}


def rows_by_mesh() -> dict[str, list[dict[str, object]]]:
    """The rows of the table by the mesh that they take, with numbers where a column has such."""
    found: dict[str, list[dict[str, object]]] = {}
    with open(HERE / "plates.csv", newline="", encoding="utf-8") as file:
        for row in csv.DictReader(file):
            values = {"load": float(row["load"]), "thickness": float(row["thickness"]), "title": row["title"]}
            changes = {PLACES[name]: value for name, value in values.items()}
            found.setdefault(row["mesh"], []).append({"name": row["name"], **changes})
    return found


def main() -> None:
    folder = pathlib.Path(sys.argv[1] if len(sys.argv) > 1 else "plates")
    folder.mkdir(exist_ok=True)
    for mesh_file, rows in rows_by_mesh().items():
        for result in qrx.study(model(HERE / mesh_file), rows, jobs=2):
            if result.ok:
                result.write(folder / f"{result.name}.inp")
            else:
                print(result.name, result.errors[0])


if __name__ == "__main__":
    main()
