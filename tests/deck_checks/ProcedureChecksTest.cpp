#include "deck_checks/FindingsTest.h"

namespace {

/// A tetrahedron of the type with a material of these options, in these steps.
Texts Found(const std::vector<std::string>& procedures, const std::string& options,
            const std::string& type = "C3D4", const std::string& more = "") {
    return FindingsOf<dck_CheckProcedures>(StepsOf(procedures) + R"(,
        "parts": {"P": {"mesh": {
            "nodes": {"labels": {"from": 1, "to": 4},
                      "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0], [0, 0, 1]]},
            "elements": [{"type": ")" + type +
                                           R"(", "labels": [1], "connectivity": [[1, 2, 3, 4]]}],
            "sets": [{"name": "ALL", "kind": "element", "labels": [1]}]},
            "sectionAssignments": [{"region": "ALL", "sectionName": "S"}]}},
        "assembly": {"instances": {"I": {"part": "P"}}},
        "sections": {"S": {"class": "kseC_HomogenousSolidSection", "materialName": "M"}},
        "materials": {"M": {)" + options + R"(}, "Idle": {}})" +
                                           more);
}

const std::string kElastic = R"("elastic": {"table": [[210000, 0.3]]})";
const std::string kDensity = R"("density": {"table": [[7.85e-9]]})";

} // namespace

TEST(ProcedureChecks, StaticStep_NeedsNoDensity) {
    EXPECT_EQ(Found({"Static"}, kElastic), Texts{});
}

TEST(ProcedureChecks, DynamicsAndFrequencies_NeedTheDensity) {
    EXPECT_EQ(Found({"Frequency"}, kElastic),
              Texts{"/materials/M: found no density, which step 'Step-1' needs"});
    EXPECT_EQ(Found({"Static", "ImplicitDynamics"}, kElastic),
              Texts{"/materials/M: found no density, which step 'Step-2' needs"});
    EXPECT_EQ(Found({"ExplicitDynamics"}, kElastic),
              Texts{"/materials/M: found no density, which step 'Step-1' needs"});
    EXPECT_EQ(Found({"Frequency"}, kElastic + ", " + kDensity), Texts{});
}

TEST(ProcedureChecks, AssignmentsOfAnInstance_StandInForThoseOfItsPart) {
    EXPECT_EQ(FindingsOf<dck_CheckProcedures>(StepsOf({"Frequency"}) + R"(,
        "parts": {"P": {"mesh": {
            "nodes": {"labels": {"from": 1, "to": 4},
                      "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0], [0, 0, 1]]},
            "elements": [{"type": "C3D4", "labels": [1], "connectivity": [[1, 2, 3, 4]]}],
            "sets": [{"name": "ALL", "kind": "element", "labels": [1]}]},
            "sectionAssignments": [{"region": "ALL", "sectionName": "S"}]}},
        "assembly": {"instances": {"I": {"part": "P",
            "sectionAssignments": [{"region": "ALL", "sectionName": "T"}]}}},
        "sections": {"S": {"class": "kseC_HomogenousSolidSection", "materialName": "M"},
                     "T": {"class": "kseC_HomogenousSolidSection", "materialName": "N"}},
        "materials": {"M": {)" + kElastic + R"(}, "N": {)" +
                                              kElastic + "}}"),
              Texts{"/materials/N: found no density, which step 'Step-1' needs"});
}

TEST(ProcedureChecks, Gravity_NeedsTheDensityWhereItActs) {
    const std::string gravity = R"(, "loads": {"G": {"class": "kloC_Gravity", "region": "I.ALL",
        "states": {"Step-2": {"component3": -9.81}}}})";
    EXPECT_EQ(Found({"Static", "Static"}, kElastic, "C3D4", gravity),
              Texts{"/materials/M: found no density, which gravity in step 'Step-2' needs"});
}

TEST(ProcedureChecks, HeatTransfer_NeedsConductivityAndForATransientHeatCapacityToo) {
    EXPECT_EQ(Found({"HeatTransfer"}, kElastic, "DC3D4"),
              (Texts{"/materials/M: found no density, which step 'Step-1' needs",
                     "/materials/M: found no conductivity, which step 'Step-1' needs",
                     "/materials/M: found no specific heat, which step 'Step-1' needs"}));
    EXPECT_EQ(Found({R"(HeatTransfer, "response": "STEADY_STATE")"}, kElastic, "DC3D4"),
              Texts{"/materials/M: found no conductivity, which step 'Step-1' needs"});
}

TEST(ProcedureChecks, MaterialsOfLayers_CountAsOthersDo) {
    const auto found = [](const std::string& type, const std::string& section) {
        return FindingsOf<dck_CheckProcedures>(StepsOf({"Frequency"}) + R"(,
            "parts": {"P": {"mesh": {
                "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0]]},
                "elements": [{"type": ")" + type +
                                               R"(", "labels": [1], "connectivity": [[1, 2, 3]]}],
                "sets": [{"name": "ALL", "kind": "element", "labels": [1]}]},
                "sectionAssignments": [{"region": "ALL", "sectionName": "S"}]}},
            "assembly": {"instances": {"I": {"part": "P"}}}, "materials": {"M": {}, "N": {}, "Idle": {}},
            "sections": {"S": )" + section + "}");
    };
    const Texts both{"/materials/M: found no density, which step 'Step-1' needs",
                     "/materials/N: found no density, which step 'Step-1' needs"};
    EXPECT_EQ(found("S3", R"({"class": "CompositeShellSection", "layers": [{"materialName": "M"},
                  {"materialName": "N"}]})"),
              both);
    EXPECT_EQ(found("CPS3", R"({"class": "CompositeSolidSection", "layers": [{"materialName": "M"},
                  {"materialName": "N"}]})"),
              both);
}

TEST(ProcedureChecks, MaterialOfUserCode_IsTrusted) {
    EXPECT_EQ(Found({"Frequency"}, R"("userMaterial": {"mechanicalConstants": [1]})"), Texts{});
}

TEST(ProcedureChecks, ElementsWithoutTheDegreesOfFreedom_AreCounted) {
    const std::string thermal = R"("conductivity": {"table": [[50]]}, "specificHeat": {"table": [[5e8]]}, )";
    EXPECT_EQ(Found({"HeatTransfer"}, thermal + kDensity),
              Texts{"/steps/1: step 'Step-1' solves for temperatures, which 1 element doesn't have (C3D4); "
                    "take elements for heat transfer, such as DC3D8 for C3D8"});
    EXPECT_EQ(Found({"Static"}, kElastic, "DC3D4"),
              Texts{"/steps/1: step 'Step-1' solves for displacements, which 1 element doesn't have (DC3D4); "
                    "take structural elements, such as C3D8 for DC3D8"});
}

TEST(ProcedureChecks, StepsOfBothSolvers_AreToldOnce) {
    EXPECT_EQ(Found({"Static", "ExplicitDynamics", "Static"}, kElastic + ", " + kDensity),
              Texts{"/steps/2: found steps of the explicit and of the implicit solver in one job; make two "
                    "models, the second with an initial state from the first"});
}
