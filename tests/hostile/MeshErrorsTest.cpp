#include "hostile/Findings.h"

namespace {

class MeshErrors : public testing::TestWithParam<FindingCase> {};

const std::string twoNodes = R"("nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]})";
const std::string truss =
    twoNodes + R"(, "elements": [{"type": "T3D2", "labels": [7], "connectivity": [[1, 2]]}])";

std::string Elements(const std::string& element) {
    return Mesh(twoNodes + R"(, "elements": [)" + element + "]");
}

std::string Sets(const std::string& sets) {
    return Mesh(truss + R"(, "sets": [)" + sets + "]");
}

std::string AssemblySet(const std::string& members, const std::string& kind = "node") {
    return Whole(R"("sets": [{"name": "S", "kind": ")" + kind + R"(", "members": [)" + members + "]}]");
}

/// A surface of one facet on an element of the part that Whole() makes.
std::string Facet(const std::string& facet) {
    return AssemblySet(R"({"instance": "I", "facets": [)" + facet + "]}", "surface");
}

/// The assembly's own mesh with one connector between these ends.
std::string Connector(const std::string& ends) {
    return Whole(R"("mesh": {"elements": [{"type": "CONN3D2", "labels": [1], "connectivity": [[)" + ends +
                 "]]}]}");
}

const FindingCase meshCases[] = {
    {"MeshAsArray",
     Model(R"("parts": {"P": {"mesh": []}})"),
     {"@/parts/P/mesh: found an array of 0 items, expected an object"}},
    {"MeshUnknownMember",
     Mesh(R"("node": {})"),
     {"@/parts/P/mesh/node: found an unknown member 'node', expected one of nodes, elements, sets; did you "
      "mean 'nodes'?"}},
    {"NodesAsArray",
     Mesh(R"("nodes": [1])"),
     {"@/parts/P/mesh/nodes: found an array of 1 item, expected an object"}},
    {"NodesWithoutLabels",
     Mesh(R"("nodes": {"coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes: found no labels or no coordinates, expected both"}},
    {"NodesWithoutCoordinates",
     Mesh(R"("nodes": {"labels": [1]})"),
     {"@/parts/P/mesh/nodes: found no labels or no coordinates, expected both"}},
    {"NodesUnknownMember",
     Mesh(R"("nodes": {"labels": [], "coordinates": [], "ids": []})"),
     {"@/parts/P/mesh/nodes/ids: found an unknown member 'ids', expected one of labels, coordinates"}},
    {"FewerPointsThanLabels",
     Mesh(R"("nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/coordinates: found 1 point for 3 labels, expected one for each"}},
    {"LabelZero",
     Mesh(R"("nodes": {"labels": [0], "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/0: found 0, expected a positive label"}},
    {"LabelNegative",
     Mesh(R"("nodes": {"labels": [1, -2147483648], "coordinates": [[0, 0, 0], [0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/1: found -2147483648, expected a positive label"}},
    {"LabelReal",
     Mesh(R"("nodes": {"labels": [1, 2.0], "coordinates": [[0, 0, 0], [0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/1: found 2.0, expected a label"}},
    {"LabelBeyond32Bits",
     Mesh(R"("nodes": {"labels": [4294967297], "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/0: found 4294967297, expected a label"}},
    {"LabelText",
     Mesh(R"("nodes": {"labels": ["1"], "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/0: found '1', expected a label"}},
    {"LabelsText",
     Mesh(R"("nodes": {"labels": "1-2", "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels: found '1-2', expected an array of labels, or {\"from\": ..., \"to\": "
      "..., "
      "\"by\": ...}"}},
    {"NodeLabelTwice",
     Mesh(R"("nodes": {"labels": [5, 6, 5], "coordinates": [[0, 0, 0], [0, 0, 1], [0, 0, 2]]})"),
     {"@/parts/P/mesh/nodes/labels/2: node label 5 stands twice, expected labels that are unique in the "
      "mesh"}},
    {"RangeWithoutTo",
     Mesh(R"("nodes": {"labels": {"from": 1}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/to: found nothing, expected a label"}},
    {"RangeFromZero",
     Mesh(R"("nodes": {"labels": {"from": 0, "to": 1}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/from: found 0, expected a positive integer"}},
    {"RangeByZero",
     Mesh(R"("nodes": {"labels": {"from": 1, "to": 1, "by": 0}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/by: found 0, expected a positive integer"}},
    {"RangeByReal",
     Mesh(R"("nodes": {"labels": {"from": 1, "to": 1, "by": 1.0}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/by: found 1.0, expected a positive integer"}},
    {"RangeBackwards",
     Mesh(R"("nodes": {"labels": {"from": 3, "to": 1}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels: found a range from 3 to 1, expected from not above to"}},
    {"RangeTooLong",
     Mesh(R"("nodes": {"labels": {"from": 1, "to": 2147483647}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels: found a range of 2147483647 labels, expected at most 1"}},
    {"RangeUnknownMember",
     Mesh(R"("nodes": {"labels": {"from": 1, "to": 1, "step": 1}, "coordinates": [[0, 0, 0]]})"),
     {"@/parts/P/mesh/nodes/labels/step: found an unknown member 'step', expected one of from, to, by"}},
    {"PointOfTwo",
     Mesh(R"("nodes": {"labels": [1], "coordinates": [[0, 0]]})"),
     {"@/parts/P/mesh/nodes/coordinates/0: found an array of 2 items, expected three coordinates"}},
    {"PointsFlat",
     Mesh(R"("nodes": {"labels": [1], "coordinates": [0, 0, 0]})"),
     {"@/parts/P/mesh/nodes/coordinates/0: found 0, expected three coordinates",
      "@/parts/P/mesh/nodes/coordinates/1: found 0, expected three coordinates",
      "@/parts/P/mesh/nodes/coordinates/2: found 0, expected three coordinates"}},
    {"CoordinateNull",
     Mesh(R"("nodes": {"labels": [1], "coordinates": [[0, null, 0]]})"),
     {"@/parts/P/mesh/nodes/coordinates/0/1: found null, expected a number"}},
    {"CoordinateBeyondSingle",
     Mesh(R"("nodes": {"labels": [1], "coordinates": [[0, 3.5e38, 0]]})"),
     {"@/parts/P/mesh/nodes/coordinates/0/1: found 3.5e+38, expected a coordinate of single precision"}},
    {"CoordinatesAsObject",
     Mesh(R"("nodes": {"labels": [1], "coordinates": {}})"),
     {"@/parts/P/mesh/nodes/coordinates: found an object, expected an array of points [x, y, z]"}},

    {"ElementsAsObject",
     Mesh(R"("elements": {})"),
     {"@/parts/P/mesh/elements: found an object, expected an array of element classes"}},
    {"ElementClassAsNumber",
     Mesh(R"("elements": [1])"),
     {"@/parts/P/mesh/elements/0: found 1, expected an object"}},
    {"ElementClassWithoutType",
     Elements(R"({"labels": [1], "connectivity": [[1, 2]]})"),
     {"@/parts/P/mesh/elements/0: found an element class without type, labels or connectivity, expected all "
      "three"}},
    {"ElementTypeNumber",
     Elements(R"({"type": 2, "labels": [1], "connectivity": [[1, 2]]})"),
     {"@/parts/P/mesh/elements/0/type: found 2, expected the label of an element type"}},
    {"ElementTypeEmpty",
     Elements(R"({"type": "", "labels": [1], "connectivity": [[1, 2]]})"),
     {"@/parts/P/mesh/elements/0/type: found an empty name, expected a name that can stand in a deck"}},
    {"ElementUnknownMember",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[1, 2]], "control": {}})"),
     {"@/parts/P/mesh/elements/0/control: found an unknown member 'control', expected one of type, labels, "
      "connectivity, controls; did you mean 'controls'?"}},
    {"ElementWithoutNodes",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": []})"),
     {"@/parts/P/mesh/elements/0/connectivity: found 0 rows for 1 label, expected one for each"}},
    {"MoreRowsThanLabels",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[1, 2], [1, 2]]})"),
     {"@/parts/P/mesh/elements/0/connectivity: found 2 rows for 1 label, expected one for each"}},
    {"RowsOfDifferentLength",
     Elements(R"({"type": "T3D2", "labels": [1, 2], "connectivity": [[1, 2], [1]]})"),
     {"@/parts/P/mesh/elements/0/connectivity/1: found an array of 1 item, expected a row of 2 node labels, "
      "as the first one"}},
    {"RowEmpty",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[]]})"),
     {"@/parts/P/mesh/elements/0/connectivity/0: found an array of 0 items, expected a row of node labels"}},
    {"ConnectivityFlat",
     Elements(R"({"type": "T3D2", "labels": [1, 2], "connectivity": [1, 2]})"),
     {"@/parts/P/mesh/elements/0/connectivity/0: found 1, expected a row of node labels",
      "@/parts/P/mesh/elements/0/connectivity/1: found 2, expected a row of node labels"}},
    {"ConnectivityReal",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[1, 2.5]]})"),
     {"@/parts/P/mesh/elements/0/connectivity/0/1: found 2.5, expected a node label"}},
    {"ConnectivityScopedInAPart",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[1, "I.2"]]})"),
     {"@/parts/P/mesh/elements/0/connectivity/0/1: found 'I.2', expected a node label"}},
    {"ConnectivityToNoNode",
     Elements(R"({"type": "T3D2", "labels": [1], "connectivity": [[1, 3]]})"),
     {"@/parts/P/mesh/elements/0/connectivity/0/1: found node 3, expected the label of a node of this mesh"}},
    {"ElementLabelTwice",
     Elements(R"({"type": "T3D2", "labels": [4], "connectivity": [[1, 2]]},
                 {"type": "T3D2", "labels": [3, 4], "connectivity": [[1, 2], [2, 1]]})"),
     {"@/parts/P/mesh/elements/1/labels/1: element label 4 stands twice, expected labels that are unique in "
      "the mesh"}},
    {"ElementLabelZero",
     Elements(R"({"type": "T3D2", "labels": [0], "connectivity": [[1, 2]]})"),
     {"@/parts/P/mesh/elements/0/labels/0: found 0, expected a positive label"}},
    {"ControlsOfUnknownWord",
     Elements(
         R"({"type": "T3D2", "labels": [1], "connectivity": [[1, 2]], "controls": {"stressRate": "SPINN"}})"),
     {"@/parts/P/mesh/elements/0/controls/stressRate: found 'SPINN', expected one of DEFAULT (0), JAUMANN "
      "(1), "
      "SPIN (2); did you mean 'SPIN'?"}},

    {"WrongNodesAreNotReportedAgainByElementsAndSets",
     Mesh(R"("nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [0, 0]]},
             "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}],
             "sets": [{"name": "A", "kind": "node", "labels": [1]}, {"name": "B", "kind": "element", "labels": [1]}])"),
     {"@/parts/P/mesh/nodes/coordinates/1: found an array of 2 items, expected three coordinates"}},
    {"WrongElementsAreNotReportedAgainBySets",
     Mesh(twoNodes + R"(, "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 9]]}],
             "sets": [{"name": "B", "kind": "element", "labels": {"from": 1, "to": 1}}])"),
     {"@/parts/P/mesh/elements/0/connectivity/0/1: found node 9, expected the label of a node of this mesh"}},

    {"SetsAsObject",
     Mesh(R"("sets": {"A": []})"),
     {"@/parts/P/mesh/sets: found an object, expected an array of sets"}},
    {"SetAsNumber", Sets("1"), {"@/parts/P/mesh/sets: found an array of 1 item, expected an array of sets"}},
    {"SetWithoutName",
     Sets(R"({"kind": "node", "labels": []})"),
     {"@/parts/P/mesh/sets/0/name: found nothing, expected the name of the set"}},
    {"SetNameNull",
     Sets(R"({"name": null, "kind": "node", "labels": []})"),
     {"@/parts/P/mesh/sets/0/name: found null, expected the name of a set"}},
    {"SetNameWithATab",
     Sets(R"({"name": "a\tb", "kind": "node", "labels": []})"),
     {"@/parts/P/mesh/sets/0/name: found a name with a control character, expected a name that can stand in "
      "a "
      "deck"}},
    {"SetWithoutKind",
     Sets(R"({"name": "A", "labels": [1]})"),
     {"@/parts/P/mesh/sets/0/kind: found nothing, expected one of node, element, surface"}},
    {"SetOfUnknownKind",
     Sets(R"({"name": "A", "kind": "face", "labels": [1]})"),
     {"@/parts/P/mesh/sets/0/kind: found 'face', expected one of node, element, surface"}},
    {"SetInternalAsNumber",
     Sets(R"({"name": "A", "kind": "node", "internal": 1, "labels": [1]})"),
     {"@/parts/P/mesh/sets/0/internal: found 1, expected true or false"}},
    {"SetWithoutLabels",
     Sets(R"({"name": "A", "kind": "node"})"),
     {"@/parts/P/mesh/sets/0/labels: found nothing, expected the labels of the set"}},
    {"SurfaceWithLabels",
     Sets(R"({"name": "A", "kind": "surface", "labels": [7]})"),
     {"@/parts/P/mesh/sets/0/labels: found an unknown member 'labels', expected one of name, kind, internal, "
      "facets",
      "@/parts/P/mesh/sets/0/facets: found nothing, expected the facets of the set"}},
    {"SetNameTwice",
     Sets(R"({"name": "A", "kind": "node", "labels": [1]}, {"name": "A", "kind": "element", "labels": [7]})"),
     {"@/parts/P/mesh/sets/1/name: found a second set named 'A', expected names that are unique in the "
      "mesh"}},
    {"SetOfNoNode",
     Sets(R"({"name": "A", "kind": "node", "labels": [1, 3, 0]})"),
     {"@/parts/P/mesh/sets/0/labels/1: found 3, expected the label of a node of the mesh",
      "@/parts/P/mesh/sets/0/labels/2: found 0, expected the label of a node of the mesh"}},
    {"SetOfNoElement",
     Sets(R"({"name": "A", "kind": "element", "labels": [1]})"),
     {"@/parts/P/mesh/sets/0/labels/0: found 1, expected the label of an element of the mesh"}},
    {"SetRangeBeyondTheMesh",
     Sets(R"({"name": "A", "kind": "node", "labels": {"from": 1, "to": 2147483647}})"),
     {"@/parts/P/mesh/sets/0/labels: found a range of 2147483647 labels, expected at most 2"}},

    {"FacetsAsObject",
     Sets(R"({"name": "A", "kind": "surface", "facets": {}})"),
     {"@/parts/P/mesh/sets/0/facets: found an object, expected an array of facets [label, face]"}},
    {"FacetOfThree",
     Sets(R"({"name": "A", "kind": "surface", "facets": [[7, "END1", 0]]})"),
     {"@/parts/P/mesh/sets/0/facets/0: found an array of 3 items, expected a facet [label, face]"}},
    {"FacetWithARealFace",
     Sets(R"({"name": "A", "kind": "surface", "facets": [[7, 1.0]]})"),
     {"@/parts/P/mesh/sets/0/facets/0: found an array of 2 items, expected a facet [label, face]"}},
    {"FacetWithoutFace",
     Sets(R"({"name": "A", "kind": "surface", "facets": [[7, "END1"], [7]]})"),
     {"@/parts/P/mesh/sets/0/facets/1: found an array of 1 item, expected a facet [label, face]"}},
    {"FacetEmptyFace",
     Sets(R"({"name": "A", "kind": "surface", "facets": [[7, ""]]})"),
     {"@/parts/P/mesh/sets/0/facets/0: found an empty face, expected a face name or a number"}},
    {"FacetOnNoElement",
     Sets(R"({"name": "A", "kind": "surface", "facets": [[8, "END1"]]})"),
     {"@/parts/P/mesh/sets/0/facets/0/0: found 8, expected the label of an element of the mesh"}},
    {"SolidFaceSeven",
     Facet(R"([1, "S7"])"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 'S7', expected a face of an element of type C3D8"}},
    {"SolidFaceNumberSix",
     Facet("[1, 6]"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 6, expected a face of an element of type C3D8"}},
    {"SolidFaceNegative",
     Facet("[1, -1]"),
     {"@/assembly/sets/0/members/0/facets/0/1: found -1, expected a face of an element of type C3D8"}},
    {"SolidFaceInSmallLetters",
     Facet(R"([1, "s1"])"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 's1', expected a face of an element of type C3D8"}},
    {"ShellFaceS1",
     Facet(R"([3, "S1"])"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 'S1', expected a face of an element of type S4"}},
    {"ShellFaceNumberTwo",
     Facet("[3, 2]"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 2, expected a face of an element of type S4"}},
    {"BeamEndThree",
     Facet(R"([4, "END3"])"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 'END3', expected a face of an element of type B31"}},
    {"BeamEndNumberTwo",
     Facet("[4, 2]"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 2, expected a face of an element of type B31"}},
    {"PointFaceByName",
     Facet(R"([5, "S1"])"),
     {"@/assembly/sets/0/members/0/facets/0/1: found 'S1', expected a face of an element of type MASS"}},

    {"AssemblyMeshWithSets",
     Whole(R"("mesh": {"sets": []})"),
     {"@/assembly/mesh/sets: found sets, expected them in the member \"sets\" of the assembly"}},
    {"EndInNoInstance",
     Connector(R"("I.1", "K.2")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found instance 'K', expected the name of an instance; "
      "there are 'E', "
      "'I', 'J'"}},
    {"EndInAnEntryThatIsNoInstance",
     Connector(R"("I.1", "E.2")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found 'E', which is no part instance, expected one"}},
    {"EndAtNoNode",
     Connector(R"("I.1", "J.9")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found node '9', expected the label of a node of instance "
      "'J'"}},
    {"EndWithoutNumber",
     Connector(R"("I.1", "J.x")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found node 'x', expected the label of a node of instance "
      "'J'"}},
    {"EndWithAHugeNumber",
     Connector(R"("I.1", "J.99999999999999999999")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found node '99999999999999999999', expected the label of "
      "a "
      "node of instance 'J'"}},
    {"EndWithoutADot",
     Connector(R"("I.1", "J")"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found 'J', expected a node label, or "
      "\"INSTANCE.LABEL\""}},
    {"EndOfNoOwnNode",
     Connector(R"("I.1", 1)"),
     {"@/assembly/mesh/elements/0/connectivity/0/1: found 1, expected the label of a node of the assembly's "
      "own "
      "mesh"}},

    {"AssemblySetInNoInstance",
     AssemblySet(R"({"instance": "K", "labels": [1]})"),
     {"@/assembly/sets/0/members/0/instance: found instance 'K', expected the name of an instance; there are "
      "'E', "
      "'I', 'J'"}},
    {"AssemblySetInstanceNull",
     AssemblySet(R"({"instance": null, "labels": [1]})"),
     {"@/assembly/sets/0/members/0/instance: found null, expected the name of an instance"}},
    {"AssemblySetWithoutMembers",
     Whole(R"("sets": [{"name": "S", "kind": "node"}])"),
     {"@/assembly/sets/0/members: found nothing, expected an array of members"}},
    {"AssemblySetWithLabels",
     Whole(
         R"("sets": [{"name": "S", "kind": "node", "labels": [1], "members": [{"instance": "I", "labels": [1]}]}])"),
     {"@/assembly/sets/0/labels: found an unknown member 'labels', expected one of name, kind, internal, "
      "members; is it meant for '/models/Default Model/assembly/sets/0/members/.../labels'?"}},
    {"AssemblySetMemberEmpty",
     AssemblySet(R"({"instance": "I", "labels": []})"),
     {"@/assembly/sets/0/members/0: found an entry without members, expected at least one"}},
    {"AssemblySetMemberUnknownMember",
     AssemblySet(R"({"instanze": "I", "instance": "I", "labels": [1]})"),
     {"@/assembly/sets/0/members/0/instanze: found an unknown member 'instanze', expected one of instance, "
      "labels; did you mean 'instance'?"}},
    {"AssemblySetOfNoNode",
     AssemblySet(R"({"instance": "I", "labels": [1, 9]})"),
     {"@/assembly/sets/0/members/0/labels/1: found 9, expected the label of a node of the mesh"}},
    {"AssemblySetWithoutAMesh",
     AssemblySet(R"({"labels": [1]})"),
     {"@/assembly/sets/0/members/0/labels/0: found 1, expected the label of a node of the mesh"}},
    {"AssemblySetNameTwice",
     Whole(R"("sets": [{"name": "S", "kind": "node", "members": [{"instance": "I", "labels": [1]}]},
                       {"name": "S", "kind": "node", "members": [{"instance": "I", "labels": [1]}]}])"),
     {"@/assembly/sets/1/name: found a second set named 'S', expected names that are unique in the "
      "assembly"}},
};

} // namespace

TEST_P(MeshErrors, Mesh_WithSomethingWrong_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, MeshErrors, testing::ValuesIn(meshCases), FindingCaseName);
