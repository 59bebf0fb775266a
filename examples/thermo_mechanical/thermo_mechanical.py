"""A clamp in N, mm, t, s, degrees Celsius: an aluminium bar that two steel bolts pull down on an aluminium sleeve.
It is heated, tightened, put under pressure with the bolts held at their length, and its modes are found. The
deck beside it says only what changes in each step; README.md tells why each of its lines stands where it does.

usage: thermo_mechanical.py [DECK.inp]
"""

import sys

import qrx


def model() -> qrx.Model:
    m = qrx.Model(heading="Bolted clamp: heat, preload, pressure, modes, in N, mm, t, s")

    mesh = qrx.Mesh(
        [
            [0, 0, 0], [10, 0, 0], [50, 0, 0], [60, 0, 0], [0, 10, 0], [10, 10, 0], [50, 10, 0], [60, 10, 0],
            [0, 0, 12.5], [10, 0, 12.5], [50, 0, 12.5], [60, 0, 12.5], [0, 10, 12.5], [10, 10, 12.5],
            [50, 10, 12.5], [60, 10, 12.5],
        ],
        {"C3D8": [[0, 1, 5, 4, 8, 9, 13, 12], [1, 2, 6, 5, 9, 10, 14, 13], [2, 3, 7, 6, 10, 11, 15, 14]]},
    )
    mesh.add_cell_set("ALL", [0, 1, 2])
    mesh.add_point_set("END", [3, 7, 11, 15])
    mesh.add_surface("LEFT", [(1, "S1")])
    mesh.add_surface("MIDDLE", [(2, "S1")])
    mesh.add_surface("RIGHT", [(3, "S1")])
    bar = m.add_part("Bar", mesh)
    bar.assign("ALL", "Aluminium solid")

    mesh = qrx.Mesh(
        [
            [0, 0, 0], [10, 0, 0], [10, 10, 0], [0, 10, 0], [0, 0, 20], [10, 0, 20], [10, 10, 20],
            [0, 10, 20], [0, 0, 40], [10, 0, 40], [10, 10, 40], [0, 10, 40],
        ],
        {"C3D8": [[0, 1, 2, 3, 4, 5, 6, 7], [4, 5, 6, 7, 8, 9, 10, 11]]},
    )
    mesh.add_cell_set("ALL", [0, 1])
    mesh.add_surface("CUT", [(1, "S2")])
    mesh.add_surface("TOP", [(2, "S2")])
    bolt = m.add_part("Bolt", mesh)
    bolt.assign("ALL", "Steel solid")

    mesh = qrx.Mesh(
        [[0, 0, 0], [40, 0, 0], [40, 10, 0], [0, 10, 0], [0, 0, 40], [40, 0, 40], [40, 10, 40], [0, 10, 40]],
        {"C3D8": [[0, 1, 2, 3, 4, 5, 6, 7]]},
    )
    mesh.add_cell_set("ALL", [0])
    mesh.add_point_set("BOTTOM", [0, 1, 2, 3])
    mesh.add_surface("SIDE", [(1, "S3")])
    mesh.add_surface("TOP", [(1, "S2")])
    sleeve = m.add_part("Sleeve", mesh)
    sleeve.assign("ALL", "Aluminium solid")

    m.add_instance("Bar-1", bar, translation=(0, 0, 40))
    m.add_instance("Bolt-1", bolt)
    m.add_instance("Bolt-2", bolt, translation=(50, 0, 0))
    m.add_instance("Sleeve-1", sleeve, translation=(10, 0, 0))
    m.add_node_set("FEET", {"Bolt-1": [1, 2, 3, 4], "Bolt-2": [1, 2, 3, 4]})
    m.add_node_set(
        "OVEN",
        {
            "Bar-1": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16],
            "Bolt-1": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12],
            "Bolt-2": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12], "Sleeve-1": [1, 2, 3, 4, 5, 6, 7, 8],
        },
    )

    m.materials["Al-6082"] = qrx.Material(
        density=2.7e-09,
        elastic=qrx.Elastic(temperature_dependency=True, table=[[70000, 0.33, 20], [62000, 0.33, 200]]),
        expansion=qrx.Expansion(zero=20, table=[[2.34e-05]]),
    )
    m.materials["Steel"] = qrx.Material(
        density=7.85e-09, elastic=[[210000, 0.3]], expansion=qrx.Expansion(zero=20, table=[[1.2e-05]]),
    )

    m.sections["Aluminium solid"] = qrx.HomogenousSolidSection(material="Al-6082")
    m.sections["Steel solid"] = qrx.HomogenousSolidSection(material="Steel")

    m.amplitudes["Fill"] = qrx.Tabular(table=[[0, 0], [0.2, 0.5], [1, 1]])
    m.amplitudes["Warm up"] = qrx.SmoothStep(table=[[0, 0], [1, 1]])

    m.constraints["Left"] = qrx.Tie(master="Bar-1.LEFT", slave="Bolt-1.TOP")
    m.constraints["Middle"] = qrx.Tie(master="Bar-1.MIDDLE", slave="Sleeve-1.TOP")
    m.constraints["Right"] = qrx.Tie(master="Bar-1.RIGHT", slave="Bolt-2.TOP")

    m.add_step(qrx.StaticStep("Heat", description="From 20 to 120 degrees", initial_inc=0.1))
    m.add_step(qrx.StaticStep("Preload", description="Each bolt with 12 kN", nlgeom="ON", initial_inc=0.2))
    m.add_step(
        qrx.StaticStep(
            "Pressure", description="6 MPa on the sleeve, bolts locked", initial_inc=0.05, max_inc=0.25,
        ),
    )
    m.add_step(qrx.FrequencyStep("Modes", num_eigen=6))

    m.boundary_conditions["Feet"] = qrx.TypeBC("FEET").at("Initial", type_name="ENCASTRE")
    m.boundary_conditions["Floor"] = (
        qrx.DisplacementBC("Sleeve-1.BOTTOM")
        .at("Initial", u3=0)
        .at("Preload", u3=-0.05)
    )
    m.boundary_conditions["Guide"] = (
        qrx.DisplacementBC("Bar-1.END")
        .at("Initial", u1=0, u2=0)
        .end_at("Pressure")
    )

    m.loads["Bolt left"] = (
        qrx.BoltLoad("Bolt-1.CUT")
        .at("Preload", bolt_method="APPLY_FORCE", magnitude=12000)
        .at("Pressure", bolt_method="FIX_LENGTH")
    )
    m.loads["Bolt right"] = (
        qrx.BoltLoad("Bolt-2.CUT")
        .at("Preload", bolt_method="APPLY_FORCE", magnitude=12000)
        .at("Pressure", bolt_method="FIX_LENGTH")
    )
    m.loads["Process"] = qrx.Pressure("Sleeve-1.SIDE").at("Pressure", amplitude="Fill", magnitude=6)
    m.loads["Weight"] = qrx.Gravity("Bar-1.ALL").at("Heat", component3=-9810)

    m.fields["Oven"] = (
        qrx.Temperature("OVEN")
        .at("Initial", values=[20])
        .at("Heat", values=[120], amplitude="Warm up")
    )

    m.field_output_requests["Mode shapes"] = qrx.FieldOutput().at("Modes")
    m.field_output_requests["Sleeve"] = qrx.FieldOutput("Sleeve-1.ALL").at("Pressure", variables=["S", "E"])
    m.field_output_requests["Usual"] = (
        qrx.FieldOutput()
        .at("Heat")
        .at("Pressure", number_interval=10, frequency_type="NUMBER_INTERVAL")
    )

    m.history_output_requests["Bar end"] = qrx.HistoryOutput("Bar-1.END").at("Heat", variables=["U3"])
    m.history_output_requests["Energy"] = qrx.HistoryOutput().at("Heat", variables=["ALLIE", "ALLSE"])
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "thermo_mechanical.inp")
