#include "deck_checks/FindingsTest.h"

namespace {

void CheckConflicts(const odiK_Model& model, fnd_Sink& sink) {
    dck_CheckMeetings(model, sink);
    dck_CheckTies(model, sink);
    dck_CheckContactPairs(model, sink);
}

/// Two tetrahedra on one face, as the instance I; N12 and N2 are node sets, LOW and HIGH the shared face as
/// each of them has it, ALSO_LOW is LOW under another name.
Texts Found(const std::string& members) {
    return FindingsOf<CheckConflicts>(StepsOf({"Static", "Static"}) + R"(,
        "parts": {"P": {"mesh": {
            "nodes": {"labels": {"from": 1, "to": 5},
                      "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0], [0, 0, 1], [0, 0, -1]]},
            "elements": [{"type": "C3D4", "labels": [1, 2], "connectivity": [[1, 2, 3, 4], [1, 3, 2, 5]]}],
            "sets": [{"name": "N12", "kind": "node", "labels": [1, 2]},
                     {"name": "N2", "kind": "node", "labels": [2]},
                     {"name": "N5", "kind": "node", "labels": [5]},
                     {"name": "LOW", "kind": "surface", "facets": [[1, "S1"]]},
                     {"name": "ALSO_LOW", "kind": "surface", "facets": [[1, "S1"]]},
                     {"name": "HIGH", "kind": "surface", "facets": [[2, "S1"]]},
                     {"name": "FAR", "kind": "surface", "facets": [[2, "S2"]]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}}}, )" +
                                      members);
}

std::string Moved(const std::string& name, const std::string& region, const std::string& state) {
    return "\"" + name + R"(": {"class": "kbcC_DisplacementBC", "region": "I.)" + region +
           R"(", "states": {)" + state + "}}";
}
std::string Conditions(const std::string& conditions) {
    return R"("boundaryConditions": {)" + conditions + "}";
}

} // namespace

TEST(ConflictChecks, TwoValuesOfOneDegreeOfFreedom_AreTold) {
    EXPECT_EQ(Found(Conditions(Moved("A", "N12", R"("Initial": {"u1": 0, "u2": 0})") + ", " +
                               Moved("B", "N2", R"("Step-1": {"u2": 1.5})"))),
              Texts{"/boundaryConditions/B: in step 'Step-1' it gives degree of freedom 2 of node I.2 the "
                    "value 1.5, and 'A' gives it 0.0"});
}

TEST(ConflictChecks, EqualValuesOtherNodesOrOtherComponents_AreNone) {
    EXPECT_EQ(Found(Conditions(Moved("A", "N12", R"("Initial": {"u1": 0})") + ", " +
                               Moved("B", "N2", R"("Step-1": {"u1": 0, "u3": 2})") + ", " +
                               Moved("C", "N5", R"("Step-1": {"u1": 9})"))),
              Texts{});
}

TEST(ConflictChecks, ConditionThatHasEnded_IsNoConflict) {
    EXPECT_EQ(Found(Conditions(Moved("A", "N12", R"("Step-1": {"u1": 0}, "Step-2": {"deactivated": true})") +
                               ", " + Moved("B", "N2", R"("Step-2": {"u1": 1})"))),
              Texts{});
}

TEST(ConflictChecks, NamedSupports_HoldTheirDegreesOfFreedom) {
    EXPECT_EQ(Found(Conditions(R"("A": {"class": "kbcC_TypeBC", "region": "I.N12",
                                        "states": {"Initial": {"typeName": "YSYMM"}}}, )" +
                               Moved("B", "N2", R"("Step-1": {"u1": 1, "ur3": 0.1})"))),
              Texts{"/boundaryConditions/B: in step 'Step-1' it gives degree of freedom 6 of node I.2 the "
                    "value 0.1, and 'A' gives it 0.0"});
}

TEST(ConflictChecks, LoadOnAHeldDegreeOfFreedom_IsTold) {
    const auto force = [](const std::string& state) {
        return R"(, "loads": {"F": {"class": "kloC_ConcentratedForce", "region": "I.N12",
                                    "states": {"Step-1": )" +
               state + "}}}";
    };
    const std::string held = Conditions(Moved("A", "N2", R"("Initial": {"u1": 0})"));
    EXPECT_EQ(Found(held + force(R"({"component1": 5})")),
              Texts{"/loads/F: in step 'Step-1' the load acts on degree of freedom 1 of node I.2, which the "
                    "condition 'A' prescribes"});
    EXPECT_EQ(Found(held + force(R"({"component1": 0, "component2": 5})")), Texts{});
}

TEST(ConflictChecks, TieOfSurfacesWithCommonNodes_IsTold) {
    const auto tie = [](const std::string& slave) {
        return R"("constraints": {"T": {"class": "kcoC_Tie", "master": "I.LOW", "slave": "I.)" + slave +
               "\"}}";
    };
    EXPECT_EQ(Found(tie("HIGH")), Texts{"/constraints/T: found 3 nodes on both sides, the first I.1"});
    EXPECT_EQ(Found(tie("N5")), Texts{});
    EXPECT_EQ(Found(tie("FAR")), Texts{"/constraints/T: found 2 nodes on both sides, the first I.1"});
}

TEST(ConflictChecks, ContactOfOneSurfaceUnderTwoNames_IsTold) {
    const auto pair = [](const std::string& slave) {
        return R"("interactions": {"C": {"class": "kinC_SurfaceToSurfaceContactStd", "master": "I.LOW",
                  "slave": "I.)" +
               slave + R"(", "states": {"Step-1": {}}}})";
    };
    EXPECT_EQ(Found(pair("ALSO_LOW")),
              Texts{"/interactions/C: found 'LOW' and 'ALSO_LOW', which are the same faces; for a surface "
                    "that meets itself there is self-contact"});
    EXPECT_EQ(Found(pair("HIGH")), Texts{});
}
