#include "deck_checks/FindingsTest.h"

namespace {

/// "place: text" of what is found of interactions in a model with the surface S, the node set N and the
/// element set E of the assembly, and with these steps behind the initial one.
Texts Findings(const std::string& interaction, const std::vector<std::string>& procedures,
               const std::string& members = "") {
    std::string steps = R"({"name": "Initial", "class": "kprC_InitialStep"})";
    int number = 0;
    for (const std::string& procedure : procedures) {
        steps += R"(, {"name": "Step-)" + std::to_string(++number) + R"(", "class": "kprC_)" + procedure +
                 R"(Step"})";
    }
    return DeckFindings(R"(
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0]]},
            "elements": [{"type": "R3D3", "labels": [1], "connectivity": [[1, 2, 3]]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}}, "sets": [
            {"name": "S", "kind": "surface", "members": [{"instance": "I", "facets": [[1, "SPOS"]]}]},
            {"name": "N", "kind": "node", "members": [{"instance": "I", "labels": [1]}]},
            {"name": "E", "kind": "element", "members": [{"instance": "I", "labels": [1]}]}]},
        "interactionProperties": {"P": {"class": "kinC_ContactProperty"}},
        "steps": [)" + steps +
                            R"(], "interactions": {"A/B": {"class": "kinC_)" + interaction + "}}" + members,
                        "/interactions");
}

std::string Pair(const std::string& className, const std::string& states,
                 const std::string& surfaces = R"("master": "S", "slave": "N")") {
    return className + "\", " + surfaces + R"(, "states": {)" + states + "}";
}

const std::string kPlace = "/interactions/A~1B";
const std::string kBegun = R"("Initial": {"InteractionProperty": "P"})";

} // namespace

TEST(InteractionChecks, WholeContact_HasNothingToSay) {
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactStd", kBegun), {"Static"}), Texts{});
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactXpl", kBegun), {"ExplicitDynamics"}), Texts{});
    EXPECT_EQ(Findings(Pair("SelfContactStd", kBegun, R"("surface": "N")"), {"Static"}), Texts{});
}

TEST(InteractionChecks, InteractionOfNoStep_IsToldAlone) {
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactStd", "", R"("master": "E")"), {"Static"}),
              Texts{kPlace + ": no step begins the interaction"});
    EXPECT_EQ(Findings(Pair("ElasticFoundation", "", R"("suppressed": true)"), {"Static"}), Texts{});
}

TEST(InteractionChecks, RegionsOfTheWrongKind_AreNamed) {
    EXPECT_EQ(
        Findings(Pair("SurfaceToSurfaceContactStd", kBegun, R"("master": "N", "slave": "E")"), {"Static"}),
        (Texts{kPlace + "/master: found 'N', which is a node set; needed is a surface",
               kPlace + "/slave: found 'E', which is an element set; needed is a surface or a node set"}));
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactStd", kBegun, R"("master": null)"), {"Static"}),
              (Texts{kPlace + "/master: found nothing, needed is a surface",
                     kPlace + "/slave: found nothing, needed is a surface or a node set"}));
    EXPECT_EQ(Findings(Pair("FilmCondition", R"("Step-1": {})", R"("surface": "N")"), {"HeatTransfer"}),
              Texts{kPlace + "/surface: found 'N', which is a node set; needed is a surface"});
    EXPECT_EQ(
        Findings(Pair("ConcRadiationToAmbient", R"("Step-1": {})", R"("surface": "S")"), {"HeatTransfer"}),
        Texts{kPlace + "/surface: found 'S', which is a surface; needed is a node set"});
    EXPECT_EQ(
        Findings(Pair("ConcRadiationToAmbient", R"("Step-1": {})", R"("surface": "N")"), {"HeatTransfer"}),
        Texts{});
    EXPECT_EQ(
        Findings(Pair("CavityRadiation", R"("Initial": {})", R"("surfaces": ["S", "E"])"), {"HeatTransfer"}),
        Texts{kPlace + "/surfaces/1: found 'E', which is an element set; needed is a surface"});
}

TEST(InteractionChecks, ClassesThatMakeWritingFail_AreForetold) {
    const std::string failure = kPlace +
                                ": writing fails with \"\"Unimplemented interaction->statusKey "
                                "conversion\" == 0\": no deck with an analysis step can have the interaction";
    EXPECT_EQ(Findings(Pair("ConcFilmCondition", R"("Initial": {})", R"("surface": "N")"), {"HeatTransfer"}),
              Texts{failure});
    EXPECT_EQ(Findings(Pair("AcousticImpedance", R"("Initial": {})", R"("surface": "S")"), {"Static"}),
              Texts{failure});
    EXPECT_EQ(Findings(Pair("IncidentWave", R"("Initial": {})",
                            R"("source": "N", "standoff": "N", "surface": "S")"),
                       {"Static"}),
              Texts{failure});
    EXPECT_EQ(Findings(Pair("AcousticImpedance", R"("Initial": {})", R"("surface": "S")"), {}), Texts{});
    EXPECT_EQ(Findings(Pair("AcousticImpedance", "", R"("surface": "S")"), {"Static"}),
              (Texts{failure, kPlace + ": no step begins the interaction"}));
}

TEST(InteractionChecks, CavityInAPerturbationStep_IsForetold) {
    EXPECT_EQ(Findings(Pair("CavityRadiation", R"("Initial": {})", R"("surfaces": ["S"])"),
                       {"Static", "Frequency"}),
              Texts{kPlace + ": writing fails with \"Error in cavity radiation history status.\": the cavity "
                             "radiates in step 'Step-2', which builds on its base state"});
}

TEST(InteractionChecks, ContactOfTheOtherSolver_IsToldByTheStepsAndByTheProduct) {
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactStd", kBegun), {"ExplicitDynamics"}),
              Texts{kPlace + ": contact of the implicit solver in a job for the explicit one"});
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactXpl", kBegun), {"Static"}),
              Texts{kPlace + ": contact of the explicit solver in a job for the implicit one"});
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactXpl", kBegun), {"Static"},
                       R"(, "analysisProduct": "EXPLICIT")"),
              Texts{});
}

TEST(InteractionChecks, ExplicitContactWithoutAnAnalysisStep_IsNotWritten) {
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactXpl", kBegun), {}, R"(, "analysisProduct": "EXPLICIT")"),
              Texts{kPlace + ": without an analysis step the contact is not written"});
}

TEST(InteractionChecks, ContactWithoutAProperty_IsNamedWithItsStep) {
    EXPECT_EQ(Findings(Pair("SurfaceToSurfaceContactStd", R"("Step-1": {})"), {"Static"}),
              Texts{kPlace + ": step 'Step-1' begins the contact without a property"});
    EXPECT_EQ(
        Findings(Pair("SurfaceToSurfaceContactStd", kBegun + R"(, "Step-1": {"InteractionProperty": null})"),
                 {"Static"}),
        Texts{kPlace + ": writing fails: step 'Step-1' takes the property away, and no friction can take its "
                       "place"});
    EXPECT_EQ(
        Findings(Pair("SurfaceToSurfaceContactXpl", kBegun + R"(, "Step-1": {"InteractionProperty": null})"),
                 {"ExplicitDynamics"}),
        Texts{kPlace + ": step 'Step-1' takes the property away"});
    EXPECT_EQ(
        Findings(Pair("SurfaceToSurfaceContactXpl",
                      R"("Initial": {"InteractionProperty": null}, "Step-1": {"InteractionProperty": "P"})"),
                 {"ExplicitDynamics"}),
        Texts{kPlace + ": step 'Initial' begins the contact without a property"});
    EXPECT_EQ(
        Findings(Pair("SurfaceToSurfaceContactStd",
                      R"("Initial": {"InteractionProperty": null}, "Step-1": {"InteractionProperty": "P"})"),
                 {"Static"}),
        (Texts{kPlace + ": step 'Initial' begins the contact without a property",
               kPlace + ": writing fails: the property changes, but begins as none, of which there can be no "
                        "copy"}));
}
