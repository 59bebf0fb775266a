"""A lap joint in N, mm, t, s, degrees Celsius (heat flow in mW): two steel plates with friction between them, a
stud that is welded to the lower one and pulled down by a force at its head, and a stop that the upper plate
meets when it is drawn along. It is tightened, drawn, warmed in an oven and cooled. The friction changes when
the joint is drawn, the stop's contact begins there, films begin with the oven, and one of them ends with it.
Contact and reaction are looked at while the joint is drawn; the step behind it says that there is no more
history output, the last nothing.

usage: bolted_joint.py [DECK.inp]
"""

import sys

import qrx


def model() -> qrx.Model:
    m = qrx.Model(heading="Lap joint with a stud, in N, mm, t, s")

    mesh = qrx.Mesh(
        [
            [0, 0, 0], [20, 0, 0], [40, 0, 0], [0, 20, 0], [20, 20, 0], [40, 20, 0], [0, 0, 10], [20, 0, 10],
            [40, 0, 10], [0, 20, 10], [20, 20, 10], [40, 20, 10],
        ],
        {"C3D8T": [[0, 1, 4, 3, 6, 7, 10, 9], [1, 2, 5, 4, 7, 8, 11, 10]]},
    )
    mesh.add_cell_set("ALL", [0, 1])
    mesh.add_point_set("END", [0, 3, 6, 9])
    mesh.add_surface("BOTTOM", [(1, "S1"), (2, "S1")])
    mesh.add_surface("TOP", [(1, "S2"), (2, "S2")])
    mesh.add_surface("TIP", [(2, "S4")])
    plate = m.add_part("Plate", mesh)
    plate.assign("ALL", "Steel")

    mesh = qrx.Mesh([[0, 0, 0]], {})
    mesh.add_point_set("REF", [0])
    point = m.add_part("Point", mesh)

    mesh = qrx.Mesh(
        [[0, 0, 0], [8, 0, 0], [8, 8, 0], [0, 8, 0], [0, 0, 25], [8, 0, 25], [8, 8, 25], [0, 8, 25]],
        {"C3D8T": [[0, 1, 2, 3, 4, 5, 6, 7]]},
    )
    mesh.add_cell_set("ALL", [0])
    mesh.add_point_set("NODES", [0, 1, 2, 3, 4, 5, 6, 7])
    mesh.add_surface("FOOT", [(1, "S1")])
    mesh.add_surface("HEAD", [(1, "S2")])
    mesh.add_surface("LEFT", [(1, "S6")])
    mesh.add_surface("SHANK", [(1, "S3"), (1, "S4"), (1, "S5"), (1, "S6")])
    stud = m.add_part("Stud", mesh)
    stud.assign("ALL", "Steel")

    m.add_instance("Lower", plate)
    m.add_instance("Point-1", point, translation=(20, 10, 25))
    m.add_instance("Stop-1", stud, translation=(50.03125, 6, 0))
    m.add_instance("Stud-1", stud, translation=(16, 6, 0))
    m.add_instance("Upper", plate, translation=(10, 0, 10))
    m.add_node_set(
        "JOINT",
        {
            "Lower": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12], "Stud-1": [1, 2, 3, 4, 5, 6, 7, 8],
            "Upper": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12],
        },
    )

    m.materials["S355"] = qrx.Material(
        conductivity=50, density=7.85e-09, elastic=[[210000, 0.3]],
        expansion=qrx.Expansion(zero=20, table=[[1.2e-05]]), specific_heat=460000000.0,
    )

    m.sections["Steel"] = qrx.HomogenousSolidSection(material="S355")

    m.amplitudes["Oven"] = qrx.Tabular(table=[[0, 0], [600, 1]])

    m.constraints["Head"] = qrx.Coupling(surface="Stud-1.HEAD", ref_node="Point-1.REF")
    m.constraints["Weld"] = qrx.Tie(
        master="Lower.BOTTOM", slave="Stud-1.FOOT", position_tolerance=0.1, position_tolerance_method=1,
    )

    m.interaction_properties["Air film"] = qrx.FilmConditionProp(
        temperature_dependency=True, table=[[0.01, 20], [0.015, 100]],
    )
    m.interaction_properties["Dry"] = qrx.ContactProperty(
        tangential_behavior=qrx.TangentialBehavior(formulation=1, table=[[0.15]]),
        normal_behavior=qrx.NormalBehavior(),
        thermal_conductance=qrx.ThermalConductance(
            pressure_dependency=True, pressure_table=[[1.5, 0], [8, 20]],
        ),
    )
    m.interaction_properties["Slipping"] = qrx.ContactProperty(
        tangential_behavior=qrx.TangentialBehavior(
            formulation=1, table=[[0.08]], maximum_elastic_slip=1, elastic_slip=0.002,
        ),
    )

    m.add_step(qrx.StaticStep("Tighten", description="5 kN at the head of the stud", initial_inc=0.1))
    m.add_step(qrx.StaticStep("Draw", nlgeom="ON", max_num_inc=200, initial_inc=0.01, max_inc=0.1))
    m.add_step(
        qrx.CoupledTempDisplacementStep(
            "Warm", description="Ten minutes in the oven", time_period=600, max_inc=60, deltmx=10,
        ),
    )
    m.add_step(qrx.CoupledTempDisplacementStep("Cool", time_period=1200, max_inc=60, deltmx=10))

    m.boundary_conditions["Grip"] = qrx.TypeBC("Lower.END").at("Initial", type_name="ENCASTRE")
    m.boundary_conditions["Head"] = qrx.DisplacementBC("Point-1.REF").at("Initial", ur1=0, ur2=0, ur3=0)
    m.boundary_conditions["Hot end"] = (
        qrx.TemperatureBC("Lower.END")
        .at("Warm", amplitude="Oven", magnitude=80)
        .end_at("Cool")
    )
    m.boundary_conditions["Pull"] = qrx.DisplacementBC("Upper.END").at("Draw", u1=0.06)
    m.boundary_conditions["Stop"] = qrx.TypeBC("Stop-1.NODES").at("Initial", type_name="ENCASTRE")

    m.loads["Nut"] = (
        qrx.ConcentratedForce("Point-1.REF")
        .at("Tighten", component3=-5000)
        .at("Cool", component3=-4800)
    )

    m.fields["Room"] = qrx.Temperature("JOINT").at("Initial", values=[20])

    m.interactions["Air"] = (
        qrx.FilmCondition(surface="Upper.TOP", definition=1)
        .at("Warm", film_property="Air film", sink_temperature=80, amplitude="Oven")
        .at("Cool", sink_temperature=20, amplitude=None)
    )
    m.interactions["Faces"] = (
        qrx.SurfaceToSurfaceContactStd(
            master="Lower.TOP", slave="Upper.BOTTOM", adjust="TOLERANCE", adjust_tolerance=0.05,
            formulation=1,
        )
        .at("Tighten", interaction_property="Dry")
        .at("Draw", interaction_property="Slipping")
    )
    m.interactions["Hot blast"] = (
        qrx.FilmCondition(surface="Stud-1.SHANK")
        .at("Warm", sink_temperature=90, film_coeff=0.2)
        .end_at("Cool")
    )
    m.interactions["Stop"] = (
        qrx.SurfaceToSurfaceContactStd(master="Stop-1.LEFT", slave="Upper.TIP", sliding=0)
        .at("Draw", interaction_property="Dry")
    )

    m.field_output_requests["Faces"] = (
        qrx.FieldOutput(interactions=["Faces"])
        .at("Draw", variables=["CSTRESS", "CDISP"])
        .end_at("Warm")
    )
    m.field_output_requests["Usual"] = qrx.FieldOutput().at("Tighten")

    m.history_output_requests["Grip"] = (
        qrx.HistoryOutput("Lower.END")
        .at("Draw", variables=["RF1"])
        .end_at("Warm")
    )
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "bolted_joint.inp")
