"""A plate with a hole, pulled; shells from a universal file. Lengths in mm, forces in N.

usage: perforated_plate.py [DECK.inp]
"""

import pathlib
import sys

import qrx

HERE = pathlib.Path(__file__).parent


def model() -> qrx.Model:
    m = qrx.Model(heading="Plate with a hole, shells")

    mesh = qrx.Mesh.read(
        HERE / "plate.unv",
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

    m.history_output_requests["Rim"] = qrx.HistoryOutput("PLATE-1.HOLE").at("Load", variables=["U1"])
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "perforated_plate.inp")
