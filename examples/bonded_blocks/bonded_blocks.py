"""A rubber pad bonded to a steel block: two solid groups of one mesh file, a section and a material for each, and
a tie between two groups of faces. The file is in mm, the model in m and N.

usage: bonded_blocks.py [DECK.inp]
"""

import pathlib
import sys

import qrx

HERE = pathlib.Path(__file__).parent


def model() -> qrx.Model:
    m = qrx.Model(heading="Rubber pad on a steel block")

    mesh = qrx.Mesh.read(
        HERE / "blocks.msh",
        scale=0.001,
        groups={
            "steel block": "STEEL", "rubber pad": "RUBBER", "foot": "FOOT", "top": "TOP",
            "steel contact": "BELOW", "rubber contact": "ABOVE",
        },
    )
    blocks = m.add_part("BLOCKS", mesh)
    blocks.assign("STEEL", "Steel")
    blocks.assign("RUBBER", "Rubber")

    m.add_instance("BLOCKS-1", blocks)

    m.materials["Rubber"] = qrx.Material(elastic=[[5000000.0, 0.45]])
    m.materials["Steel"] = qrx.Material(elastic=[[210000000000.0, 0.3]])

    m.sections["Rubber"] = qrx.HomogenousSolidSection(material="Rubber")
    m.sections["Steel"] = qrx.HomogenousSolidSection(material="Steel")

    m.constraints["Bond"] = qrx.Tie(master="BLOCKS-1.BELOW", slave="BLOCKS-1.ABOVE")

    m.add_step(qrx.StaticStep("Press", nlgeom="ON", initial_inc=0.1))

    m.boundary_conditions["Foot"] = qrx.DisplacementBC("BLOCKS-1.FOOT_NODES").at("Initial", u1=0, u2=0, u3=0)

    m.loads["Weight"] = qrx.Pressure("BLOCKS-1.TOP").at("Press", magnitude=50000)

    m.field_output_requests["Usual"] = qrx.FieldOutput().at("Press")
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "bonded_blocks.inp")
