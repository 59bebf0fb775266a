"""Three parts in N, mm, t, s that show sections of all kinds: a steel flange with its gasket and a counterweight,
a frame with a beam of every profile, a sandwich skin, and two bushings between flange and frame.

usage: assembly.py [DECK.inp]
"""

import sys

import qrx


def model() -> qrx.Model:
    m = qrx.Model(heading="Flange on a frame, in N, mm, t, s")
    m.add_datum(qrx.Datum("Skin axis", system="cylindrical"))
    m.add_datum(qrx.Datum("Mount", x_axis=(0.6, 0.8, 0), y_axis=(-0.8, 0.6, 0)))

    mesh = qrx.Mesh(
        [
            [0, 0, 0], [50, 0, 0], [100, 0, 0], [0, 40, 0], [50, 40, 0], [100, 40, 0], [0, 0, 20],
            [50, 0, 20], [100, 0, 20], [0, 40, 20], [50, 40, 20], [100, 40, 20], [0, 0, 22.5], [50, 0, 22.5],
            [100, 0, 22.5], [0, 40, 22.5], [50, 40, 22.5], [100, 40, 22.5], [50, 20, 60],
        ],
        {
            "C3D8": [[0, 1, 4, 3, 6, 7, 10, 9], [1, 2, 5, 4, 7, 8, 11, 10]],
            "GK3D8": [[6, 7, 10, 9, 12, 13, 16, 15], [7, 8, 11, 10, 13, 14, 17, 16]], "MASS": [[18]],
        },
        cell_labels={"C3D8": [1, 2], "GK3D8": [11, 12], "MASS": [21]},
    )
    mesh.add_cell_set("BODY", [0, 1])
    mesh.add_cell_set("SEAL", [2, 3])
    mesh.add_cell_set("COUNTERWEIGHT", [4])
    flange = m.add_part("Flange", mesh)
    flange.assign("BODY", "Steel body")
    flange.assign("SEAL", "Seal")
    flange.assign("COUNTERWEIGHT", "Weight")

    mesh = qrx.Mesh(
        [
            [0, 0, 0], [100, 0, 0], [200, 0, 0], [300, 0, 0], [400, 0, 0], [500, 0, 0], [600, 0, 0],
            [700, 0, 0], [800, 0, 0], [900, 0, 0], [1000, 0, 0], [1100, 0, 0],
        ],
        {"B31": [[0, 1], [1, 2], [2, 3], [3, 4], [4, 5], [5, 6], [6, 7], [7, 8], [8, 9], [9, 10], [10, 11]]},
    )
    mesh.add_cell_set("GENERAL", [0])
    mesh.add_cell_set("CIRCLE", [1])
    mesh.add_cell_set("HEXAGON", [2])
    mesh.add_cell_set("PIPE", [3])
    mesh.add_cell_set("I", [4])
    mesh.add_cell_set("BOX", [5])
    mesh.add_cell_set("ARBITRARY", [6])
    mesh.add_cell_set("RECTANGLE", [7])
    mesh.add_cell_set("L", [8])
    mesh.add_cell_set("T", [9])
    mesh.add_cell_set("TRAPEZOID", [10])
    mesh.add_cell_set("OPEN", [4, 8, 9])
    frame = m.add_part("Frame", mesh)
    frame.assign("GENERAL", "Stiff beam")
    frame.assign("CIRCLE", "Round bar")
    frame.assign("HEXAGON", "Hexagonal tube")
    frame.assign("PIPE", "Sunken pipe")
    frame.assign("I", "I beam")
    frame.assign("BOX", "Box girder")
    frame.assign("ARBITRARY", "Folded sheet")
    frame.assign("RECTANGLE", "Flat bar")
    frame.assign("L", "Angle")
    frame.assign("T", "T bar")
    frame.assign("TRAPEZOID", "Wedge")
    frame.orient_beams("OPEN", (0, 1, 0))
    frame.orient_beams("TRAPEZOID", (0, -0.6, 0.8))

    mesh = qrx.Mesh(
        [
            [100, 0, 0], [70.71068, 70.71068, 0], [0, 100, 0], [100, 0, 80], [70.71068, 70.71068, 80],
            [0, 100, 80],
        ],
        {"S4R": [[0, 1, 4, 3], [1, 2, 5, 4]]},
    )
    mesh.add_cell_set("SANDWICH", [0, 1])
    skin = m.add_part("Skin", mesh)
    skin.assign("SANDWICH", "Sandwich", offset=0.5)
    skin.orient_material("SANDWICH", datum="Skin axis", angle=30)

    m.add_instance("Flange-1", flange)
    m.add_instance("Frame-1", frame, translation=(-450, 0, -50))
    m.add_instance("Skin-1", skin, translation=(250, 20, 12.5))
    m.assembly.mesh = qrx.AssemblyMesh(
        [], [("CONN3D2", [["Flange-1.2", "Frame-1.6"], ["Flange-1.5", "Frame-1.6"]], [1, 2])],
    )
    m.add_element_set("FRONT", {None: [1]})
    m.add_element_set("REAR", {None: [2]})
    m.assembly.section_assignments.append(qrx.SectionAssignment("FRONT", "Rubber bushing"))
    m.assembly.section_assignments.append(qrx.SectionAssignment("REAR", "Rubber bushing"))
    m.assembly.connector_orientations.append(qrx.ConnectorOrientation("FRONT", csys1="Mount"))
    m.assembly.connector_orientations.append(
        qrx.ConnectorOrientation("REAR", csys1="Mount", axis1="AXIS_3", angle1=90),
    )

    m.materials["CFRP"] = qrx.Material(
        density=1.55e-09, elastic=qrx.Elastic(type="LAMINA", table=[[135000, 9500, 0.3, 4800, 4800, 3500]]),
    )
    m.materials["Gasket-MLS"] = qrx.Material(
        thickness_behavior=qrx.ThicknessBehavior(
            type="DAMAGE", table=[[0, 0], [20, 0.05], [60, 0.11]],
            unloading_table=[[0, 0.02, 0.11], [60, 0.11, 0.11]],
        ),
        trans_shear_elastic=35,
    )
    m.materials["PVC foam"] = qrx.Material(density=6e-11, elastic=[[70, 0.32]])
    m.materials["Steel"] = qrx.Material(density=7.85e-09, elastic=[[210000, 0.3]])

    m.sections["Angle"] = qrx.BeamSection(profile="L", material="Steel")
    m.sections["Box girder"] = qrx.BeamSection(
        poisson=0.3, temperature_var="VALUES", profile="Box", material="Steel",
    )
    m.sections["Flat bar"] = qrx.BeamSection(profile="Rectangle", material="Steel")
    m.sections["Folded sheet"] = qrx.BeamSection(profile="Arbitrary", material="Steel")
    m.sections["Hexagonal tube"] = qrx.BeamSection(profile="Hexagon", material="Steel")
    m.sections["I beam"] = qrx.BeamSection(profile="I", material="Steel")
    m.sections["Round bar"] = qrx.BeamSection(profile="Circle", material="Steel")
    m.sections["Rubber bushing"] = qrx.ConnectorSection(
        assembled_type="BUSHING",
        options=[
            qrx.ConnectorElasticity(table=[[4000, 4000, 1500]], components=[1, 2, 3]),
            qrx.ConnectorDamping(table=[[2.5, 2.5, 0.8]], components=[1, 2, 3]),
        ],
    )
    m.sections["Sandwich"] = qrx.CompositeShellSection(
        layers=[
            qrx.CompositeShellLayer(thickness=0.5, material="CFRP", orientation_angle=45),
            qrx.CompositeShellLayer(thickness=6, integration_points=5, material="PVC foam"),
            qrx.CompositeShellLayer(thickness=0.5, material="CFRP", orientation_angle=-45),
        ],
    )
    m.sections["Seal"] = qrx.GasketSection(initial_thickness=2.5, material="Gasket-MLS")
    m.sections["Steel body"] = qrx.HomogenousSolidSection(material="Steel")
    m.sections["Stiff beam"] = qrx.BeamSection(
        integration="BEFORE_ANALYSIS", poisson=0.3, temperature_dependency=True, density=7.85e-09,
        profile="General", material_table=[[210000, 80769, 20], [195000, 75000, 200]],
        section_points=[[10, 10], [-10, -10]],
    )
    m.sections["Sunken pipe"] = qrx.BeamSection(
        use_fluid_inertia=True, fluid_value1=1.025e-09, fluid_value2=20, profile="Pipe", material="Steel",
    )
    m.sections["T bar"] = qrx.BeamSection(profile="T", material="Steel")
    m.sections["Wedge"] = qrx.BeamSection(profile="Trapezoid", material="Steel")
    m.sections["Weight"] = qrx.PointSection(mass=0.0012, mass_alpha_damping=0.5)

    m.beam_profiles["Arbitrary"] = qrx.ArbitraryProfile(
        table=[[0, 0, 0], [40, 0, 3], [40, 50, 3], [10, 50, 2]],
    )
    m.beam_profiles["Box"] = qrx.BoxProfile(a=40, b=60, uniform_thickness=True, t1=3)
    m.beam_profiles["Circle"] = qrx.CircularProfile(r=12)
    m.beam_profiles["General"] = qrx.GeneralizedProfile(area=400, i11=13333, i22=13333, j=22500)
    m.beam_profiles["Hexagon"] = qrx.HexagonalProfile(r=14, t=2)
    m.beam_profiles["I"] = qrx.IbeamProfile(l=30, h=60, b1=40, b2=40, t1=4, t2=4, t3=3)
    m.beam_profiles["L"] = qrx.LbeamProfile(a=40, b=50, t1=4, t2=5)
    m.beam_profiles["Pipe"] = qrx.PipeProfile(r=20, t=2.5)
    m.beam_profiles["Rectangle"] = qrx.RectangularProfile(a=20, b=40)
    m.beam_profiles["T"] = qrx.TbeamProfile(b=50, h=60, l=20, tf=5, tw=4)
    m.beam_profiles["Trapezoid"] = qrx.TrapezoidalProfile(a=40, b=30, c=20, d=15)

    m.add_step(
        qrx.StaticStep(
            "Settle", description="The flange settles on its bushings", nlgeom="ON", initial_inc=0.1,
            max_inc=0.25,
        ),
    )
    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "assembly.inp")
