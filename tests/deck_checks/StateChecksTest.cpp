#include "deck_checks/FindingsTest.h"

namespace {

Texts Found(const std::string& members) {
    return FindingsOf<dck_CheckStates>(StepsOf({R"(Static, "timePeriod": 2)", "Static"}) + R"(,
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
            "sets": [{"name": "N", "kind": "node", "labels": [1]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}}}, )" +
                                       members);
}

std::string Force(const std::string& states) {
    return R"("loads": {"F": {"class": "kloC_ConcentratedForce", "region": "I.N", "states": {)" + states +
           "}}}";
}

std::string WithAmplitude(const std::string& more, const std::string& step) {
    return R"("amplitudes": {"Ramp": {"class": "kamC_Tabular")" + more +
           R"(, "table": [[0, 0], [1, 1]]}}, )" +
           Force("\"" + step + R"(": {"component1": 1, "amplitude": "Ramp"})");
}

} // namespace

TEST(StateChecks, AmplitudeThatEndsBeforeTheStep_IsTold) {
    EXPECT_EQ(
        Found(WithAmplitude("", "Step-1")),
        Texts{"/loads/F/states/Step-1/amplitude: found 'Ramp', which ends at 1.0, expected points up to "
              "2.0, the end of the step; behind its last point it keeps its last value"});
    EXPECT_EQ(Found(WithAmplitude("", "Step-2")), Texts{});
}

TEST(StateChecks, AmplitudeOverTheTotalTime_NeedsTheTimesOfTheStepsBefore) {
    EXPECT_EQ(
        Found(WithAmplitude(R"(, "timeSpan": "TOTAL")", "Step-2")),
        Texts{"/loads/F/states/Step-2/amplitude: found 'Ramp', which ends at 1.0, expected points up to "
              "3.0, the end of the step; behind its last point it keeps its last value"});
}

TEST(StateChecks, AmplitudesOfEveryKindWithPoints_EndAtTheLast) {
    const std::string force = Force(R"("Step-1": {"component1": 1, "amplitude": "A"})");
    const std::string expected = ", expected points up to 2.0, the end of the step; behind its last point it "
                                 "keeps its last value";
    EXPECT_EQ(Found(R"("amplitudes": {"A": {"class": "SmoothStep", "table": [[0, 0], [1.5, 1]]}}, )" + force),
              Texts{"/loads/F/states/Step-1/amplitude: found 'A', which ends at 1.5" + expected});
    // Three values from 0.25 on, each half a second behind the one before.
    EXPECT_EQ(Found(R"("amplitudes": {"A": {"class": "EquallySpaced", "fixedInterval": 0.5, "begin": 0.25,
                  "values": [0, 1, 2]}}, )" +
                    force),
              Texts{"/loads/F/states/Step-1/amplitude: found 'A', which ends at 1.25" + expected});
}

TEST(StateChecks, AmplitudesThatEndAtZeroOrHaveNoEnd_AreLeftAlone) {
    const std::string force = Force(R"("Step-1": {"component1": 1, "amplitude": "A"})");
    for (const char* amplitude :
         {R"({"class": "SmoothStep", "table": [[0, 1], [1, 0]]})",
          R"({"class": "EquallySpaced", "fixedInterval": 0.5, "values": [0, 1, 0]})",
          R"({"class": "EquallySpaced", "fixedInterval": 0.5})", R"({"class": "Tabular"})",
          R"({"class": "Decay", "initial": 1, "maximum": 2, "start": 0, "decayTime": 1})"}) {
        EXPECT_EQ(Found(std::string(R"("amplitudes": {"A": )") + amplitude + "}, " + force), Texts{})
            << amplitude;
    }
}

TEST(StateChecks, LoadWithoutAComponent_HasAKeywordWithoutLines) {
    EXPECT_EQ(Found(Force(R"("Step-1": {})")),
              Texts{"/loads/F/states/Step-1: found no component, so the keyword will have no line"});
    EXPECT_EQ(Found(Force(R"("Step-1": {"component2": 0}, "Step-2": {})")), Texts{});
}

TEST(StateChecks, OutputIntervalsOfAnotherType_DoNotCount) {
    EXPECT_EQ(Found(R"("fieldOutputRequests": {"O": {"states": {
                  "Step-1": {"timeInterval": 0.1, "frequencyType": "FREQUENCY", "frequency": 2}}}})"),
              Texts{"/fieldOutputRequests/O/states/Step-1/timeInterval: found a value, and frequencyType is "
                    "FREQUENCY, so it doesn't count"});
    EXPECT_EQ(Found(R"("fieldOutputRequests": {"O": {"states": {
                  "Step-1": {"timeInterval": 0.1, "frequencyType": "TIME_INTERVAL"}}}})"),
              Texts{});
}
