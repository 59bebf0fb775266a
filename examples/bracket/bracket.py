"""An L-shaped mounting bracket: two bolt holes in the wall, a bore in the base; lengths in mm, forces in N, times
in s, so masses are in t. It is loaded, then watched in small motions about that state: bent both ways, its
modes, the response to a shaking machine and to a sudden stop.

usage: bracket.py [DECK.inp]
"""

import pathlib
import sys

import qrx

HERE = pathlib.Path(__file__).parent


def model() -> qrx.Model:
    m = qrx.Model(heading="Mounting bracket, quadratic tetrahedra, lengths in mm")

    mesh = qrx.Mesh.read(HERE / "bracket.msh")
    bracket = m.add_part("BRACKET", mesh)
    bracket.assign("ALL", "Solid")

    m.add_instance("BRACKET-1", bracket, translation=(250, 40, 0), rotation=(0, 0, 1.570796))

    m.materials["Aluminium"] = qrx.Material(density=2.7e-09, elastic=[[70000, 0.33]])

    m.sections["Solid"] = qrx.HomogenousSolidSection(material="Aluminium")

    m.amplitudes["Knock"] = qrx.Tabular(table=[[0, 1], [0.005, 1], [0.006, 0]])
    m.amplitudes["Rise"] = qrx.Tabular(table=[[0, 0], [1, 1]])

    m.add_step(
        qrx.StaticStep(
            "Tighten", description="Large displacements, in increments of a tenth",
            restart=qrx.StandardRestart(frequency=5), monitor=qrx.StandardMonitor("BRACKET-1.TIP", dof=3),
            nlgeom="ON", initial_inc=0.1, max_inc=0.2,
        ),
    )
    m.add_step(
        qrx.StaticLinearPerturbationStep(
            "Bend",
            load_cases={
                "Down": qrx.LoadCase(loads={"Push": 1}),
                "Sideways": qrx.LoadCase(loads={"Pull": 1, "Push": 0.1}),
            },
        ),
    )
    m.add_step(qrx.FrequencyStep("Modes", num_eigen=12))
    m.add_step(
        qrx.SteadyStateModalStep(
            "Shake", frequencies=[qrx.SteadyStateModalFrequency(upper=2000, lower=10, points=40)],
            direct_damping=qrx.DirectDamping(rows=[qrx.ModeDampingRow(last_mode=12, value=0.02)]),
        ),
    )
    m.add_step(
        qrx.ModalDynamicsStep(
            "Stop", time_period=0.05, time_increment=0.0001,
            direct_damping=qrx.DirectDamping(rows=[qrx.ModeDampingRow(last_mode=12, value=0.02)]),
        ),
    )

    m.boundary_conditions["Bolted"] = (
        qrx.DisplacementBC("BRACKET-1.BOLTS_NODES")
        .at("Initial", u1=0, u2=0, u3=0)
    )
    m.boundary_conditions["Wall"] = qrx.DisplacementBC("BRACKET-1.CLAMPED-FACE_NODES").at("Initial", u2=0)

    m.loads["Jolt"] = qrx.ConcentratedForce("BRACKET-1.TIP").at("Stop", amplitude="Knock", component2=250)
    m.loads["Pull"] = qrx.ConcentratedForce("BRACKET-1.TIP").at("Bend", component1=100)
    m.loads["Push"] = qrx.ConcentratedForce("BRACKET-1.TIP").at("Bend", component3=-100)
    m.loads["Shaker"] = (
        qrx.ConcentratedForce("BRACKET-1.TIP", complex=True, complex_component3=[20, 5])
        .at("Shake", component3=20)
    )
    m.loads["Weight on the pad"] = (
        qrx.Pressure("BRACKET-1.LOADED-FACE")
        .at("Tighten", amplitude="Rise", magnitude=0.5)
    )

    m.field_output_requests["Shapes"] = (
        qrx.FieldOutput()
        .at("Bend")
        .at("Modes", frequency_type="MODE_LIST")
        .at("Shake", frequency=1, frequency_type="FREQUENCY")
    )
    m.field_output_requests["Stresses"] = (
        qrx.FieldOutput()
        .at("Tighten", time_interval=0.25, frequency_type="TIME_INTERVAL", variables=["S", "U", "RF"])
    )

    m.history_output_requests["Energies"] = qrx.HistoryOutput().at("Tighten")
    m.history_output_requests["Tip"] = (
        qrx.HistoryOutput("BRACKET-1.TIP")
        .at("Tighten", variables=["U3"])
        .at("Shake", variables=["U1", "U2", "U3"])
    )
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "bracket.inp")
