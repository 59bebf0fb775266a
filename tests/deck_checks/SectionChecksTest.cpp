#include "deck_checks/FindingsTest.h"

namespace {

/// A part P with four elements of the type, of which the set SOME holds the first three, and two instances.
std::string Part(const std::string& type, const std::string& attributes) {
    return R"("parts": {"P": {"mesh": {
        "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
        "elements": [{"type": ")" +
           type + R"(", "labels": [1, 2, 3, 4], "connectivity": [[1, 2], [1, 2], [1, 2], [1, 2]]}],
        "sets": [{"name": "SOME", "kind": "element", "labels": [1, 2, 3]}, {"name": "ALL", "kind": "element", "labels": [1, 2, 3, 4]}]})" +
           attributes + R"(}}, "assembly": {"instances": {"A": {"part": "P"}, "B": {"part": "P"}}})";
}

const std::string kSteel = R"("materials": {"Steel": {}},)";
const std::string kSolid =
    R"("sections": {"S": {"class": "HomogenousSolidSection", "materialName": "Steel"}},)";
const std::string kOnAll = R"(, "sectionAssignments": [{"region": "ALL", "sectionName": "S"}])";

} // namespace

TEST(ModelChecks, ElementsWithoutASection_AreCountedOnceForAllInstancesOfAPart) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(Part("C3D8", "")), Texts{"/parts/P: 4 elements have no section"});
    EXPECT_EQ(FindingsOf<dck_CheckSections>(
                  kSteel + kSolid +
                  Part("C3D8", R"(, "sectionAssignments": [{"region": "SOME", "sectionName": "S"}])")),
              Texts{"/parts/P: 1 element has no section"});
}

TEST(ModelChecks, WholeModel_HasNothingToSay) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + Part("C3D8", kOnAll)), Texts{});
}

TEST(ModelChecks, RigidSurfaceAndConnectorElements_NeedNoSection) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(Part("R3D4", "")), Texts{});
    EXPECT_EQ(FindingsOf<dck_CheckSections>(Part("SURF3D4", "")), Texts{});
    EXPECT_EQ(FindingsOf<dck_CheckSections>(Part("CONN3D2", "")), Texts{});
}

TEST(ModelChecks, ElementTypeThatCannotTakeTheSection_IsNamed) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + Part("S4R", kOnAll)),
              Texts{"/parts/P: 4 elements of type 'S4R' can't take the section 'S' "
                    "(HomogenousSolidSection)"});
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + Part("b31", kOnAll)),
              Texts{"/parts/P: 4 elements of type 'b31' can't take the section 'S' "
                    "(HomogenousSolidSection)"});
}

TEST(ModelChecks, TrussElements_TakeSolidAndTrussSections) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + Part("T3D2", kOnAll)), Texts{});
    EXPECT_EQ(FindingsOf<dck_CheckSections>(
                  kSteel + R"("sections": {"S": {"class": "TrussSection", "materialName": "Steel"}},)" +
                  Part("T3D2", kOnAll)),
              Texts{});
}

TEST(ModelChecks, MembranesAndGaskets_TakeTheirOwnSectionsOnly) {
    const auto section = [](const std::string& name) {
        return R"("sections": {"S": {"class": ")" + name + R"(", "materialName": "Steel"}},)";
    };
    for (const auto& [type, own] : {std::pair("M3D4", "MembraneSection"), {"GK3D8", "GasketSection"}}) {
        EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + section(own) + Part(type, kOnAll)), Texts{});
        EXPECT_EQ(
            FindingsOf<dck_CheckSections>(kSteel + section("HomogenousShellSection") + Part(type, kOnAll)),
            Texts{"/parts/P: 4 elements of type '" + std::string(type) +
                  "' can't take the section 'S' (HomogenousShellSection)"});
    }
}

TEST(ModelChecks, UnknownElementType_TakesAnySection) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + Part("SPRINGA", kOnAll)), Texts{});
}

TEST(ModelChecks, LaterAssignment_DecidesWhichSectionAnElementHas) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(
                  kSteel + R"("sections": {
                 "Shell": {"class": "HomogenousShellSection", "materialName": "Steel"},
                 "Solid": {"class": "HomogenousSolidSection", "materialName": "Steel"}},)" +
                  Part("S4", R"(, "sectionAssignments": [{"region": "ALL", "sectionName": "Solid"},
                                                              {"region": "SOME", "sectionName": "Shell"}])")),
              Texts{"/parts/P: 1 element of type 'S4' can't take the section 'Solid' "
                    "(HomogenousSolidSection)"});
}

TEST(ModelChecks, InstanceWithAssignmentsOfItsOwn_IsLookedAtByItself) {
    EXPECT_EQ(FindingsOf<dck_CheckSections>(kSteel + kSolid + R"("parts": {"P": {"mesh": {
        "nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
        "elements": [{"type": "MASS", "labels": [1], "connectivity": [[1]]}],
        "sets": [{"name": "ALL", "kind": "element", "labels": [1]}]}}},
        "assembly": {"instances": {"A": {"part": "P"},
          "B": {"part": "P", "sectionAssignments": [{"region": "ALL", "sectionName": "S"}]}}})"),
              (Texts{"/parts/P: 1 element has no section",
                     "/assembly/instances/B: 1 element of type 'MASS' can't take the section 'S' "
                     "(HomogenousSolidSection)"}));
}

namespace {

/// Findings on a condition "B", or on conditions given whole, on a mesh that needs no section.
Texts ConditionFindings(const std::string& conditions, const std::string& loadCases = "") {
    const std::string mesh = R"("parts": {"P": {"mesh": {
        "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
        "elements": [{"type": "CONN3D2", "labels": [1], "connectivity": [[1, 2]]}],
        "sets": [{"name": "N", "kind": "node", "labels": [1]}, {"name": "E", "kind": "element", "labels": [1]},
                 {"name": "S", "kind": "surface", "facets": [[1, "END1"]]}]}}},
        "assembly": {"instances": {"A": {"part": "P"}}})";
    return FindingsOf<dck_CheckConditions>(mesh +
                                           R"(, "steps": [{"name": "Initial", "class": "InitialStep"},
        {"name": "Linear", "class": "StaticLinearPerturbationStep", "loadCases": {)" +
                                           loadCases + R"(}}], "boundaryConditions": {)" + conditions + "}");
}

const std::string kPlace = "/boundaryConditions/";

} // namespace

TEST(ModelChecks, ConditionOnNodes_NeedsANodeSet) {
    EXPECT_EQ(
        ConditionFindings(R"(
        "element": {"class": "DisplacementBC", "region": "A.E", "states": {"Initial": {"u1": 0}}},
        "none": {"class": "TypeBC", "states": {"Initial": {"typeName": 0}}},
        "right": {"class": "PorePressureBC", "region": "A.N", "states": {"Initial": {"magnitude": 0}}},
        "suppressed": {"class": "TypeBC", "region": "A.E", "suppressed": true},
        "surface": {"class": "SubmodelBC", "region": "A.S", "states": {"Initial": {"dofs": [1]}}})"),
        (Texts{kPlace + "element/region: found 'E', which is an element set; the condition acts on nodes",
               kPlace + "none: the condition has no region, so its lines name no set",
               kPlace + "surface/region: found 'S', which is a surface; the condition acts on nodes"}));
}

TEST(ModelChecks, ConditionOnConnectors_NeedsElementSets) {
    EXPECT_EQ(
        ConditionFindings(R"(
        "nodes": {"class": "ConnVelocityBC", "region": "A.N", "connectors": ["A.E", "A.N"],
                  "states": {"Initial": {"v1": 0}}},
        "nothing": {"class": "ConnVelocityBC", "region": "A.E", "states": {"Initial": {"v1": 0}}},
        "right": {"class": "ConnDisplacementBC", "region": "A.E", "connectors": ["A.E"],
                  "states": {"Initial": {"u1": 0}}})"),
        (Texts{kPlace +
                   "nodes/region: found 'N', which is a node set; the condition acts on connector elements",
               kPlace + "nodes/connectors/1: found 'A.N', which is no element set",
               kPlace + "nothing/connectors: the condition names no connectors, so no element set carries "
                        "its name"}));
}

TEST(ModelChecks, ConditionThatNoStepWrites_IsTold) {
    EXPECT_EQ(ConditionFindings(R"(
        "left out": {"class": "TypeBC", "region": "A.N", "states": {"Linear": {"typeName": 0}}},
        "taken": {"class": "TypeBC", "region": "A.N", "states": {"Linear": {"typeName": 0}}},
        "without states": {"class": "TypeBC", "region": "A.N"})",
                                R"("case": {"bcs": {"taken": 1}})"),
              (Texts{kPlace + "left out: no step writes the condition",
                     kPlace + "without states: no step writes the condition"}));
}

TEST(MaterialChecks, GasketOptionsWithoutAGasketSection_AreNamed) {
    const Texts found = FindingsOf<dck_CheckSections>(
        R"("materials": {"M": {"transShearElastic": {}, "membraneElastic": {}}})");
    const std::string left = ": no gasket section names this material, so this will not stand in the deck";
    EXPECT_EQ(found, (Texts{"/materials/M/transShearElastic" + left, "/materials/M/membraneElastic" + left}));
}

TEST(MaterialChecks, OtherOptionsOfAGasket_AreNamed) {
    const Texts found = FindingsOf<dck_CheckSections>(
        R"("materials": {"M": {"membraneElastic": {}, "density": {}, "creep": {}, "regularization": {}}},
           "sections": {"S": {"class": "GasketSection", "materialName": "M"}})");
    const std::string left =
        ": the material is a gasket behaviour, which has no such option, so this will not stand "
        "in the deck";
    EXPECT_EQ(found, (Texts{"/materials/M/density" + left, "/materials/M/regularization" + left}));
}
