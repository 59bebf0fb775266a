#include "hostile/Findings.h"

namespace {

class ReferenceErrors : public testing::TestWithParam<FindingCase> {};

const std::string section = R"("sections": {"WELD": {"class": "ConnectorSection", "assembledType": "WELD"}})";

/// A section assignment of the assembly on this region.
std::string Region(const std::string& region) {
    return Whole(
        R"("sets": [{"name": "WIRES", "kind": "element", "members": [{"instance": "I", "labels": [4]}]},
                             {"name": "POINTS", "kind": "node", "members": [{"instance": "I", "labels": [1]}]},
                             {"name": "SKIN", "kind": "surface", "members": [{"instance": "I", "facets": [[3, 6]]}]}],
                    "sectionAssignments": [{"sectionName": "WELD", "region": )" +
            region + "}]",
        section);
}

/// An attribute list of the part, on its own sets A (element 7), N (a node set) and F (a surface).
std::string Attribute(const std::string& member, const std::string& record) {
    return Model(R"("parts": {"P": {"mesh": {
        "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
        "elements": [{"type": "T3D2", "labels": [7], "connectivity": [[1, 2]]}],
        "sets": [{"name": "A", "kind": "element", "labels": [7]}, {"name": "N", "kind": "node", "labels": [1]},
                 {"name": "F", "kind": "surface", "facets": [[7, "END1"]]}]}, ")" +
                 member + R"(": [)" + record + R"(]}}, "datums": [{"name": "LOCAL"}], )" + section);
}

/// An equation of one term in a system, on this set.
std::string EquationTerm(const std::string& set) {
    return Whole(
        R"("sets": [{"name": "WIRES", "kind": "element", "members": [{"instance": "I", "labels": [4]}]},
                             {"name": "POINTS", "kind": "node", "members": [{"instance": "I", "labels": [1]}]}])",
        R"("datums": [{"name": "LOCAL"}],
           "constraints": {"Q": {"class": "Equation", "terms": [{"setName": ")" +
            set + R"(", "dof": 1, "csys": "LOCAL"}]}})");
}

const FindingCase referenceCases[] = {
    {"TermInASystemOnANodeSetOfTheAssembly", EquationTerm("POINTS"), {}},
    {"TermInASystemOnElements",
     EquationTerm("WIRES"),
     {"@/constraints/Q/terms/0/setName: found 'WIRES', expected a node set of the assembly, since the term "
      "has a csys"}},
    {"TermInASystemOnASetOfAnInstance",
     EquationTerm("I.ALL"),
     {"@/constraints/Q/terms/0/setName: found 'I.ALL', expected a node set of the assembly, since the term "
      "has a csys"}},
    {"RegionOfNoAssemblySet",
     Region(R"("WIRE")"),
     {"@/assembly/sectionAssignments/0/region: found set 'WIRE', expected the name of a set of the assembly; "
      "did "
      "you mean 'WIRES'?"}},
    {"RegionOfNoInstance",
     Region(R"("K.ALL")"),
     {"@/assembly/sectionAssignments/0/region: found instance 'K', expected the name of an instance; there "
      "are 'E', 'I', 'J'"}},
    {"RegionOfNoInstanceSet",
     Region(R"("I.AL")"),
     {"@/assembly/sectionAssignments/0/region: found set 'AL', expected the name of a set of instance 'I'; "
      "did "
      "you mean 'ALL'?"}},
    {"RegionWithTwoDots",
     Region(R"("I.A.B")"),
     {"@/assembly/sectionAssignments/0/region: found 'I.A.B', expected {\"instance\": ..., \"set\": ...} for "
      "names "
      "with dots"}},
    {"RegionBeginningWithADot",
     Region(R"(".ALL")"),
     {"@/assembly/sectionAssignments/0/region: found '.ALL', expected {\"instance\": ..., \"set\": ...} for "
      "names "
      "with dots"}},
    {"RegionEndingWithADot",
     Region(R"("I.")"),
     {"@/assembly/sectionAssignments/0/region: found set '', expected the name of a set of instance 'I'"}},
    {"RegionEmpty",
     Region(R"("")"),
     {"@/assembly/sectionAssignments/0/region: found set '', expected the name of a set of the assembly"}},
    {"RegionNumber",
     Region("4"),
     {"@/assembly/sectionAssignments/0/region: found 4, expected \"SET\", \"INSTANCE.SET\", an object of "
      "both "
      "names, or null"}},
    {"RegionArray",
     Region(R"(["I", "ALL"])"),
     {"@/assembly/sectionAssignments/0/region: found an array of 2 items, expected \"SET\", "
      "\"INSTANCE.SET\", an "
      "object of both names, or null"}},
    {"RegionObjectWithoutSet",
     Region(R"({"instance": "I"})"),
     {"@/assembly/sectionAssignments/0/region/set: found nothing, expected the name of a set"}},
    {"RegionObjectSetNumber",
     Region(R"({"set": 1})"),
     {"@/assembly/sectionAssignments/0/region/set: found 1, expected a name"}},
    {"RegionObjectUnknownMember",
     Region(R"({"instnace": "I", "set": "WIRES"})"),
     {"@/assembly/sectionAssignments/0/region/instnace: found an unknown member 'instnace', expected one of "
      "instance, set; did you mean 'instance'?"}},
    {"RegionNull",
     Region("null"),
     {"@/assembly/sectionAssignments/0/region: found nothing, expected the set that the attribute is "
      "assigned to"}},
    {"RegionOfANodeSet",
     Region(R"("POINTS")"),
     {"@/assembly/sectionAssignments/0/region: found 'POINTS', which is no element set, expected an element "
      "set"}},
    {"RegionOfASurface",
     Region(R"("SKIN")"),
     {"@/assembly/sectionAssignments/0/region: found 'SKIN', which is no element set, expected an element "
      "set"}},
    {"RegionOfAnInstancesNodeSet",
     Region(R"("J.NODES")"),
     {"@/assembly/sectionAssignments/0/region: found 'NODES', which is no element set, expected an element "
      "set"}},
    {"ConnectorOrientationWithoutRegion",
     Whole(R"("connectorOrientations": [{}])"),
     {"@/assembly/connectorOrientations/0/region: found nothing, expected the set that the attribute is "
      "assigned "
      "to"}},
    {"ConnectorOrientationWithAName",
     Whole(R"("connectorOrientations": [{"region": "I.ALL", "name": "X"}])"),
     {"warning @/assembly/connectorOrientations/0/name: found 'X', which is best left out: where an angle "
      "isn't 0, the connector section refers to an orientation that is defined under 'ConnOri-' and its "
      "place"}},

    {"AttributesAsObject",
     Model(R"("parts": {"P": {"sectionAssignments": {}}})"),
     {"@/parts/P/sectionAssignments: found an object, expected an array"}},
    {"AttributeAsText",
     Attribute("sectionAssignments", R"("A")"),
     {"@/parts/P/sectionAssignments/0: found 'A', expected an object"}},
    {"AttributeWithoutRegion",
     Attribute("sectionAssignments", R"({"sectionName": "WELD"})"),
     {"@/parts/P/sectionAssignments/0/region: found nothing, expected the name of an element set of the "
      "mesh"}},
    {"AttributeRegionAsObject",
     Attribute("sectionAssignments", R"({"sectionName": "WELD", "region": {"set": "A"}})"),
     {"@/parts/P/sectionAssignments/0/region: found an object, expected the name of an element set of the "
      "mesh"}},
    {"AttributeOfNoSet",
     Attribute("sectionAssignments", R"({"sectionName": "WELD", "region": "B.C"})"),
     {"@/parts/P/sectionAssignments/0/region: found 'B.C', expected the name of a set of the mesh"}},
    {"AttributeOfANodeSet",
     Attribute("materialOrientations", R"({"region": "N"})"),
     {"@/parts/P/materialOrientations/0/region: found 'N', which is no element set, expected an element "
      "set"}},
    {"AttributeOfASurface",
     Attribute("beamOrientations", R"({"region": "F"})"),
     {"@/parts/P/beamOrientations/0/region: found 'F', which is no element set, expected an element set"}},
    {"AttributeWithoutSection",
     Attribute("sectionAssignments", R"({"region": "A"})"),
     {"@/parts/P/sectionAssignments/0/sectionName: found nothing, expected name of the section"}},
    {"AttributeWithEmptySection",
     Attribute("sectionAssignments", R"({"region": "A", "sectionName": ""})"),
     {"@/parts/P/sectionAssignments/0/sectionName: found nothing, expected name of the section"}},
    {"AttributeOfNoSection",
     Attribute("sectionAssignments", R"({"region": "A", "sectionName": "WELDS"})"),
     {"@/parts/P/sectionAssignments/0/sectionName: found 'WELDS', expected the name of a section; did you "
      "mean "
      "'WELD'?"}},
    {"AttributeOfOtherCapitals",
     Attribute("sectionAssignments", R"({"region": "A", "sectionName": "weld"})"),
     {"@/parts/P/sectionAssignments/0/sectionName: found 'weld', expected the name of a section; did you "
      "mean "
      "'WELD'?"}},
    {"AttributeUnknownMember",
     Attribute("beamOrientations", R"({"region": "A", "vektor": [0, 0, 1]})"),
     {"@/parts/P/beamOrientations/0/vektor: found an unknown member 'vektor', expected one of region, "
      "vector, "
      "class; did you mean 'vector'?"}},
    {"DatumOfNoName",
     Attribute("materialOrientations", R"({"region": "A", "datum": "LOCAL2"})"),
     {"@/parts/P/materialOrientations/0/datum: found 'LOCAL2', expected the name of a datum, or null; did "
      "you mean "
      "'LOCAL'?"}},
    {"DatumByNumber",
     Attribute("materialOrientations", R"({"region": "A", "datum": 1})"),
     {"@/parts/P/materialOrientations/0/datum: found 1, expected the name of a datum, or null"}},

    {"InstanceMeshLacksAnInheritedSet",
     Model(R"("parts": {"P": {"mesh": {"sets": [{"name": "A", "kind": "element", "labels": []}]},
                              "sectionAssignments": [{"region": "A", "sectionName": "WELD"}]}},
              "assembly": {"instances": {"I": {"part": "P", "mesh": {}}}}, )" +
           section),
     {"warning @/parts/P/mesh/sets/0: the set is empty, and will not stand in the deck",
      "@/assembly/instances/I/sectionAssignments/0/region: found 'A', expected the name of a set of the "
      "mesh"}},

    {"WrongDatumIsReportedOnce",
     Model(R"("datums": [{"name": "D", "xAxis": [0, 0, 0]}],
              "parts": {"P": {"mesh": {"sets": [{"name": "A", "kind": "element", "labels": []}]},
                              "materialOrientations": [{"region": "A", "datum": "D"}]}})"),
     {"@/datums/0/xAxis: found a direction of no length, expected one with a length",
      "warning @/parts/P/mesh/sets/0: the set is empty, and will not stand in the deck"}},
    {"WrongSetIsReportedOnce",
     Whole(R"("sets": [{"name": "S", "kind": "elements", "members": []}],
              "connectorOrientations": [{"region": "S"}])"),
     {"@/assembly/sets/0/kind: found 'elements', expected one of node, element, surface; did you mean "
      "'element'?"}},
    {"WrongInstanceIsReportedOnce",
     Model(R"("assembly": {"instances": {"I": 1},
                           "sets": [{"name": "S", "kind": "node", "members": [{"instance": "I", "labels": [1]}]}],
                           "connectorOrientations": [{"region": "I.A"}]})"),
     {"@/assembly/instances/I: found 1, expected an object"}},
};

} // namespace

TEST_P(ReferenceErrors, Reference_ToNothingOrTheWrongThing_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, ReferenceErrors, testing::ValuesIn(referenceCases), FindingCaseName);
