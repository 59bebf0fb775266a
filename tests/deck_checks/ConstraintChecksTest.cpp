#include "deck_checks/FindingsTest.h"

namespace {

const std::string kPlace = "/constraints/A~1B";

Texts Found(const std::string& className, const std::string& members, const std::string& model = "",
            const std::vector<std::string>& procedures = {}) {
    return FindingsOf<dck_CheckConstraints>(ShellModel(StepsOf(procedures) +
                                                       R"(, "constraints": {"A/B": {"class": ")" + className +
                                                       "\", " + members + "}}" + model),
                                            "/constraints");
}

std::string Wrong(const std::string& member, const std::string& set, const std::string& kind,
                  const std::string& wanted) {
    return kPlace + "/" + member + ": '" + set + "' is " + kind + ", and the constraint needs " + wanted;
}
std::string Missing(const std::string& member, const std::string& wanted) {
    return kPlace + "/" + member + ": there is none; the deck will name nothing where it needs " + wanted;
}

const char kEither[] = "a surface or a node set";
const char kSector[] =
    R"(, "cyclicSymmetry": {"symmetryType": "CYCLIC", "numberOfSectors": 4, "endPoint": [0, 0, 1]})";

} // namespace

TEST(ConstraintChecks, RegionsOfTheRightKind_HaveNothingToSay) {
    for (const char* tie : {"kcoC_Tie", "odiK_Tie"}) {
        EXPECT_EQ(Found(tie, R"("master": "I.S", "slave": "I.N")"), Texts{});
    }
    for (const char* coupling : {"kcoC_Coupling", "odiK_Coupling"}) {
        EXPECT_EQ(Found(coupling, R"("refNode": "I.N", "surface": "I.S")"), Texts{});
        EXPECT_EQ(Found(coupling, R"("refNode": "I.N", "surface": "I.N")"), Texts{});
    }
    // A rigid body needs no more than its reference node.
    EXPECT_EQ(Found("kcoC_RigidBody", R"("refNode": "I.N")"), Texts{});
    EXPECT_EQ(Found("kcoC_RigidBody",
                    R"("refNode": "I.N", "elements": "I.E", "tieNodes": "I.N", "pinNodes": "I.N",
                       "surface": "I.S")"),
              Texts{});
    EXPECT_EQ(Found("kcoC_EmbeddedRegion", R"("host": "I.E", "embedded": "I.E")"), Texts{});
    EXPECT_EQ(Found("kcoC_ShellSolidCoupling", R"("shellEdge": "I.S", "solidFace": "I.S")"), Texts{});
}

TEST(ConstraintChecks, RegionsOfTheWrongKind_AreNamed) {
    EXPECT_EQ(Found("kcoC_Tie", R"("master": "I.E", "slave": "I.E")"),
              (Texts{Wrong("master", "E", "an element set", kEither),
                     Wrong("slave", "E", "an element set", kEither)}));
    EXPECT_EQ(Found("odiK_Coupling", R"("refNode": "I.E", "surface": "I.E")"),
              (Texts{Wrong("surface", "E", "an element set", kEither),
                     Wrong("refNode", "E", "an element set", "a node set")}));
    EXPECT_EQ(Found("kcoC_RigidBody",
                    R"("refNode": "I.S", "elements": "I.N", "tieNodes": "I.E", "pinNodes": "I.S",
                       "surface": "I.N")"),
              (Texts{Wrong("refNode", "S", "a surface", "a node set"),
                     Wrong("elements", "N", "a node set", "an element set"),
                     Wrong("tieNodes", "E", "an element set", "a node set"),
                     Wrong("pinNodes", "S", "a surface", "a node set"),
                     Wrong("surface", "N", "a node set", "a surface")}));
    EXPECT_EQ(Found("kcoC_EmbeddedRegion", R"("host": "I.S", "embedded": "I.N")"),
              (Texts{Wrong("host", "S", "a surface", "an element set"),
                     Wrong("embedded", "N", "a node set", "an element set")}));
    EXPECT_EQ(Found("kcoC_ShellSolidCoupling", R"("shellEdge": "I.N", "solidFace": "I.E")"),
              (Texts{Wrong("shellEdge", "N", "a node set", "a surface"),
                     Wrong("solidFace", "E", "an element set", "a surface")}));
}

TEST(ConstraintChecks, RegionsThatAreMissing_AreNamedWhereOneIsNeeded) {
    EXPECT_EQ(Found("kcoC_Tie", R"("master": null)"),
              (Texts{Missing("master", kEither), Missing("slave", kEither)}));
    EXPECT_EQ(Found("kcoC_Coupling", R"("surface": "I.S")"), Texts{Missing("refNode", "a node set")});
    EXPECT_EQ(Found("kcoC_RigidBody", R"("elements": "I.E")"), Texts{Missing("refNode", "a node set")});
    EXPECT_EQ(Found("kcoC_EmbeddedRegion", R"("host": null)"),
              (Texts{Missing("host", "an element set"), Missing("embedded", "an element set")}));
    EXPECT_EQ(Found("kcoC_ShellSolidCoupling", R"("solidFace": "I.S")"),
              Texts{Missing("shellEdge", "a surface")});
}

TEST(ConstraintChecks, EquationWithoutTermsOrNodes_IsTold) {
    EXPECT_EQ(Found("kcoC_Equation", R"("terms": [])"), Texts{kPlace + ": the equation has no terms"});
    EXPECT_EQ(Found("kcoC_Equation",
                    R"("terms": [{"coefficient": 1, "setName": "I.N", "dof": 1},
                                 {"coefficient": 1, "setName": "", "dof": 2}])"),
              Texts{kPlace + "/terms/1/setName: there is none; the deck will name no nodes"});
    EXPECT_EQ(Found("kcoC_Equation", R"("terms": [{"coefficient": 1, "setName": "I.N", "dof": 1}])"),
              Texts{});
}

TEST(ConstraintChecks, CyclicTieInAModelThatIsNot_IsTold) {
    const std::string tie = R"("master": "I.S", "slave": "I.N", "cyclicSymmetry": true)";
    EXPECT_EQ(Found("kcoC_Tie", tie),
              Texts{kPlace + ": cyclicSymmetry joins no sector: the model isn't cyclic"});
    EXPECT_EQ(Found("kcoC_Tie", tie, kSector), Texts{});
    EXPECT_EQ(Found("kcoC_Tie", tie, R"(, "cyclicSymmetry": {"symmetryType": "NONE"})"),
              Texts{kPlace + ": cyclicSymmetry joins no sector: the model isn't cyclic"});
}

TEST(ConstraintChecks, CyclicSymmetryInAnExplicitJob_IsForetold) {
    const auto found = [](const std::string& procedure, const std::string& more) {
        return FindingsIn(StepsOf({procedure}) + kSector + more, "/cyclicSymmetry");
    };
    const Texts failure{
        R"(/cyclicSymmetry: writing fails with "Cyclic symmetry is not valid for Explicit.")"};
    EXPECT_EQ(found("ExplicitDynamics", ""), failure);
    EXPECT_EQ(found("Static", R"(, "analysisProduct": "EXPLICIT")"), failure);
    EXPECT_EQ(found("Static", ""), Texts{});
}
