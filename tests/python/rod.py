"""A rod of two elements that is held and pulled."""

import qrx


def mesh():
    return qrx.Mesh(
        [[0, 0, 0], [50, 0, 0], [100, 0, 0]],
        {"T3D2": [[0, 1], [1, 2]]},
        point_sets={"FOOT": [0], "TIP": [2]},
        cell_sets={"ALL": [0, 1]},
    )


def model():
    m = qrx.Model(heading="A rod, in N and mm")
    rod = m.add_part("ROD", mesh())
    rod.assign("ALL", "Round")
    m.add_instance("ROD-1", rod, translation=(100, 0, 0))
    m.sections["Round"] = qrx.TrussSection(material="Steel", area=78.5)
    m.materials["Steel"] = qrx.Material(elastic=[[210000, 0.3]])
    pull = m.add_step(qrx.StaticStep("Pull"))
    m.boundary_conditions["Held"] = qrx.TypeBC("ROD-1.FOOT").at("Initial", type_name="PINNED")
    m.loads["Force"] = qrx.ConcentratedForce("ROD-1.TIP").at(pull, component1=1000)
    m.field_output_requests["Usual"] = qrx.FieldOutput().at(pull)
    return m


# By hand, from the rules of the deck language.
DECK = """\
*Heading
A rod, in N and mm
**
** PARTS
**
*Part, name=ROD
*End Part
**
** ASSEMBLY
**
*Assembly, name=Assembly
*Instance, name=ROD-1, part=ROD
        100.,           0.,           0.
*Node
      1,           0.,           0.,           0.
      2,          50.,           0.,           0.
      3,         100.,           0.,           0.
*Element, type=T3D2
1, 1, 2
2, 2, 3
*Nset, nset=FOOT
1, 
*Nset, nset=TIP
3, 
*Elset, elset=ALL
1,2
** Region: (Round:ALL)
** Section: Round
*Solid Section, elset=ALL, material=Steel
78.5,
*End Instance
*End Assembly
** 
** MATERIALS
** 
*Material, name=Steel
*Elastic
210000., 0.3
** 
** BOUNDARY CONDITIONS
** 
** Name: Held Type: Symmetry/Antisymmetry/Encastre
*Boundary
ROD-1.FOOT, PINNED
** ----------------------------------------------------------------
** 
** STEP: Pull
** 
*Step, name=Pull
*Static
1., 1., 1e-05, 1.
** 
** LOADS
** 
** Name: Force   Type: Concentrated force
*Cload
ROD-1.TIP, 1, 1000.
** 
** OUTPUT REQUESTS
** 
** 
** FIELD OUTPUT: Usual
** 
*Output, field, variable=PRESELECT
*End Step
"""
