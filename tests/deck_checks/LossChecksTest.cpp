#include "deck_checks/FindingsTest.h"

namespace {

Texts Found(const std::string& members) {
    return FindingsOf<dck_CheckLoss>(members);
}

const std::string kLost = ": found a value, and no line of a deck carries it; ";

} // namespace

TEST(LossChecks, ConstantsAndJobData_ReachNoDeck) {
    const std::string constants = kLost + "put the line of physical constants into topLevelSolverInput";
    const std::string restart = kLost + "the job's command line says what it goes on from";
    EXPECT_EQ(Found(R"("absoluteZero": -273.15, "stefanBoltzmann": 5.67e-11, "restartJob": "old",
                       "restartStep": "Pull", "restartIncrement": 3, "endRestartStep": true, "globalJob": "g")"),
              (Texts{"/absoluteZero" + constants, "/stefanBoltzmann" + constants, "/restartJob" + restart,
                     "/restartStep" + restart, "/restartIncrement" + restart, "/endRestartStep" + restart,
                     "/globalJob" + kLost + "the job's command line names the global job"}));
}

TEST(LossChecks, DefaultsThatAreGiven_AreNoLoss) {
    EXPECT_EQ(Found(R"("absoluteZero": 0, "restartJob": "", "endRestartStep": false)"), Texts{});
}

TEST(LossChecks, ObjectsThatNothingRefersTo_AreCountedByKind) {
    EXPECT_EQ(Found(R"("amplitudes": {"A": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]},
                                      "B": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}},
                       "beamProfiles": {"Rod": {"class": "kbpC_CircularProfile", "r": 1}},
                       "sections": {"Beam": {"class": "kseC_BeamSection", "profileName": "Rod",
                                             "materialName": "M"}}, "materials": {"M": {"damping": {}}, "a/b": {"damping": {}}})"),
              (Texts{"/materials: nothing uses 1 of the materials: a/b",
                     "/sections: nothing uses 1 of the sections: Beam",
                     "/amplitudes: nothing uses 2 of the amplitudes: A, B"}));
}

TEST(LossChecks, NodesOfTheAssembly_AreNamedWithTheirSets) {
    EXPECT_EQ(
        Found(R"("assembly": {"mesh": {"nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]}},
                  "sets": [{"name": "RP", "kind": "node", "members": [{"labels": [2]}]}]})"),
        (Texts{": nothing uses 1 of the sets: RP",
               "/assembly/mesh/nodes: the assembly's own 2 nodes reach no deck; they stand in the sets "
               "'RP'; make each a part of one node, and an instance of it"}));
}

TEST(LossChecks, SetsThatNothingNames_AreCounted) {
    const auto found = [](const std::string& more) { return Found(ShellModel(StepsOf({"Static"}) + more)); };
    EXPECT_EQ(found(""), Texts{": nothing uses 3 of the sets: P.N, P.E, P.S"});
    EXPECT_EQ(found(R"(, "loads": {"L": {"class": "kloC_Moment", "region": "I.N"}})"),
              Texts{": nothing uses 2 of the sets: P.E, P.S"});
    // Texts that go into the deck as they stand may name any.
    EXPECT_EQ(found(R"(, "solverInput": "*Nset, nset=X\nI.N,")"), Texts{});
}

TEST(LossChecks, DatumThatIsNoSystem_IsToldWhereItIsNamed) {
    const auto found = [](const std::string& type) {
        return FindingsOf<dck_CheckLoss>(
            ShellModel(R"("datums": [{"name": "D", "type": ")" + type + R"("}], )" + StepsOf({"Static"}) +
                       R"(, "loads": {"L": {"class": "kloC_ConcentratedForce", "region": "I.N", "datum": "D",
                                            "states": {"Step-1": {"component1": 1}}}})"),
            "/loads");
    };
    EXPECT_EQ(found("point"), Texts{"/loads/L/datum: writing fails with \"Wrong datum type during input "
                                    "generation\": 'D' is no coordinate system"});
    EXPECT_EQ(found("csys"), Texts{});
}
