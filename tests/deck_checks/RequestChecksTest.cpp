#include "deck_checks/FindingsTest.h"

namespace {

const std::string kFieldPlace = "/fieldOutputRequests/A~1B: ";
const std::string kHistoryPlace = "/historyOutputRequests/A~1B: ";
const std::string kLoads =
    R"(, "loads": {"Bolt": {"class": "kloC_BoltLoad", "region": "I.S", "states": {"Step-1": {}}},
                   "Off": {"class": "kloC_BoltLoad", "region": "I.S", "suppressed": true,
                           "states": {"Step-1": {}}},
                   "Push": {"class": "kloC_Pressure", "region": "I.S", "states": {"Step-1": {}}}})";
const std::string kContact =
    R"(, "interactionProperties": {"P": {"class": "kinC_ContactProperty"}},
        "interactions": {
            "On": {"class": "kinC_SelfContactStd", "surface": "I.S",
                   "states": {"Initial": {"InteractionProperty": "P"}}},
            "Off": {"class": "kinC_SelfContactStd", "surface": "I.S", "suppressed": true,
                    "states": {"Initial": {"InteractionProperty": "P"}}}})";

/// What is found of one request with these members, in steps of these procedures.
Texts OfField(const std::string& members, const std::vector<std::string>& procedures,
              const std::string& more = "") {
    return FindingsIn(StepsOf(procedures) + R"(, "fieldOutputRequests": {"A/B": {)" + members + "}}" + more,
                      "/fieldOutputRequests");
}
Texts OfHistory(const std::string& members, const std::vector<std::string>& procedures,
                const std::string& more = "") {
    return FindingsIn(StepsOf(procedures) + R"(, "historyOutputRequests": {"A/B": {)" + members + "}}" + more,
                      "/historyOutputRequests");
}
/// The states of a request that begins in the first step.
std::string Begun(const std::string& state) {
    return R"("states": {"Step-1": {)" + state + "}}";
}

} // namespace

TEST(RequestChecks, RequestThatCanBeGiven_HasNothingToSay) {
    EXPECT_EQ(OfField(Begun(""), {"Static"}), Texts{});
    EXPECT_EQ(OfField(R"("region": "I.E", )" + Begun(R"("variables": ["S", "LE"])"), {"Static"}), Texts{});
    EXPECT_EQ(OfHistory(R"("region": "I.N", )" + Begun(R"("variables": ["U1"])"), {"Static"}), Texts{});
    EXPECT_EQ(OfField(Begun(R"("variables": ["ALL"])"), {"Static"}), Texts{});
    EXPECT_EQ(OfField(Begun(R"("variables": ["PRESELECT"])"), {"Static"}), Texts{});
}

TEST(RequestChecks, FrequencyThatTheProcedureDoesNotAllow_IsToldWithWhatTheDeckGets) {
    const std::string five = Begun(R"("frequencyType": "FREQUENCY", "frequency": 5)");
    EXPECT_EQ(OfField(five, {"ExplicitDynamics"}),
              Texts{kFieldPlace + "in step 'Step-1' the procedure doesn't allow FREQUENCY output; the deck "
                                  "gets 20 intervals"});
    EXPECT_EQ(OfField(five, {"Frequency"}),
              Texts{kFieldPlace + "in step 'Step-1' the procedure doesn't allow FREQUENCY output; the deck "
                                  "gets all modes"});
    EXPECT_EQ(OfHistory(five, {"ExplicitDynamics"}), Texts{});
    EXPECT_EQ(OfHistory(Begun(R"("frequencyType": "TIME_POINTS", "timePoints": "T")"), {"ExplicitDynamics"},
                        R"(, "timePoints": {"T": {"points": [[1]]}})"),
              Texts{kHistoryPlace + "in step 'Step-1' the procedure doesn't allow TIME POINTS output; the "
                                    "deck gets 200 intervals"});
    EXPECT_EQ(OfField(Begun(R"("frequencyType": "TIME_INTERVAL", "timeInterval": 1)"), {"StaticRiks"}),
              Texts{kFieldPlace + "in step 'Step-1' the procedure doesn't allow TIME INTERVAL output; the "
                                  "deck gets a frequency of 1"});
    EXPECT_EQ(OfField(Begun(R"("frequencyType": "MODE_LIST", "modeList": [1])"), {"ImplicitDynamics"}),
              Texts{kFieldPlace + "in step 'Step-1' the procedure doesn't allow MODE LIST output; the deck "
                                  "gets a frequency of 10"});
}

TEST(RequestChecks, WhatHoldsInSeveralSteps_IsToldPerStepAndOnlyOfThoseThatItLivesIn) {
    const std::string text =
        " the procedure doesn't allow NUMBER INTERVAL output; the deck gets a frequency of 1";
    const std::string intervals = R"("Step-2": {"frequencyType": "NUMBER_INTERVAL"})";
    EXPECT_EQ(OfField("\"states\": {" + intervals + R"(, "Step-4": {"deactivated": true}})",
                      {"StaticRiks", "StaticRiks", "StaticRiks", "StaticRiks", "StaticRiks"}),
              Texts{kFieldPlace + "in step 'Step-2'" + text});
}

TEST(RequestChecks, VariableThatTheProcedureOrTheChannelDoesNotKnow_IsNamed) {
    EXPECT_EQ(OfField(Begun(R"("variables": ["U", "NT", "u"])"), {"Static"}),
              (Texts{kFieldPlace + "in step 'Step-1' the procedure has no field variable 'NT'",
                     kFieldPlace + "in step 'Step-1' the procedure has no field variable 'u'"}));
    EXPECT_EQ(OfField(Begun(R"("variables": ["U", "ALLKE"])"), {"Static"}),
              Texts{kFieldPlace + "in step 'Step-1' the procedure has no field variable 'ALLKE'"});
    EXPECT_EQ(OfHistory(Begun(R"("variables": ["ALLKE", "MISESERI"])"), {"Static"}),
              Texts{kHistoryPlace + "in step 'Step-1' the procedure has no history variable 'MISESERI'"});
}

TEST(RequestChecks, VariablesThatAreAllDropped_AreToldWithWhatTheDeckGets) {
    const std::string unknown = kFieldPlace + "in step 'Step-1' the procedure has no field variable 'NT'";
    const auto found = [](const std::string& type) {
        return OfField(Begun(R"("variables": ["NT"], "variablesType": ")" + type + "\""), {"Static"});
    };
    const std::string none = kFieldPlace + "in step 'Step-1' none of its variables is left";
    EXPECT_EQ(found("PRESELECT"), (Texts{unknown, none + "; the deck gets the preselected ones"}));
    EXPECT_EQ(found("ALL"), (Texts{unknown, none + "; the deck gets all there are"}));
    EXPECT_EQ(found("LISTED"), (Texts{unknown, none + ", so it gives no output"}));
}

TEST(RequestChecks, VariableThatTheRegionCannotGive_IsNamedOnce) {
    EXPECT_EQ(
        OfField(R"("region": "I.E", )" + Begun(R"("variables": ["S", "U"])"), {"Static", "Static"}),
        Texts{kFieldPlace + "asks an element set for 'U', a variable of nodes; it won't stand in the deck"});
    EXPECT_EQ(
        OfField(R"("region": "I.N", )" + Begun(R"("variables": ["S", "U"])"), {"Static"}),
        Texts{kFieldPlace + "asks a node set for 'S', a variable of elements; it won't stand in the deck"});
    EXPECT_EQ(
        OfField(R"("region": "I.S", )" + Begun(R"("variables": ["S", "U", "CSTRESS"])"), {"Static"}),
        (Texts{kFieldPlace + "asks a surface for 'S', a variable of elements; it won't stand in the deck",
               kFieldPlace + "asks a surface for 'U', a variable of nodes; it won't stand in the deck"}));
}

TEST(RequestChecks, BoltLoadThatIsNone_IsTold) {
    EXPECT_EQ(OfHistory(R"("boltLoad": "Bolt", )" + Begun(""), {"Static"}, kLoads), Texts{});
    EXPECT_EQ(OfHistory(R"("boltLoad": "Push", )" + Begun(""), {"Static"}, kLoads),
              Texts{kHistoryPlace + "boltLoad names 'Push', which is no bolt load"});
    EXPECT_EQ(OfHistory(R"("boltLoad": "Off", )" + Begun(""), {"Static"}, kLoads),
              Texts{kHistoryPlace + "boltLoad names 'Off', which is suppressed"});
}

TEST(RequestChecks, InteractionsThatDoNotCount_AreTold) {
    EXPECT_EQ(OfField(R"("interactions": ["On"], )" + Begun(""), {"Static"}, kContact), Texts{});
    EXPECT_EQ(OfField(R"("interactions": ["On", "Off"], )" + Begun(""), {"Static"}, kContact),
              Texts{kFieldPlace + "names 2 interactions, of which only the first counts"});
    EXPECT_EQ(OfField(R"("interactions": ["Off"], )" + Begun(""), {"Static"}, kContact),
              Texts{kFieldPlace + "names interaction 'Off', which is suppressed"});
}

TEST(RequestChecks, Springs_AreToldAlone) {
    EXPECT_EQ(OfHistory(R"("springs": ["link"], )" + Begun(R"("variables": ["NOSUCH"])"), {"Static"}),
              Texts{kHistoryPlace + "asks for springs and dashpots, of which decks have none; it gives no "
                                    "output"});
}

TEST(RequestChecks, HistoryInAStepOfLoadCases_IsTold) {
    const std::string cases = R"(StaticLinearPerturbation, "loadCases": {"up": {}})";
    EXPECT_EQ(OfHistory(Begun(R"("variables": ["NOSUCH"])"), {cases}),
              Texts{kHistoryPlace + "in step 'Step-1' it gives no output: a step of load cases has no "
                                    "history"});
    EXPECT_EQ(OfField(Begun(""), {cases}), Texts{});
}

TEST(RequestChecks, SuppressedRequest_IsPassedOver) {
    EXPECT_EQ(OfField(R"("suppressed": true, )" + Begun(R"("variables": ["NOSUCH"])"), {"Static"}), Texts{});
}
