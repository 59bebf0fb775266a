#include "hostile/Findings.h"

namespace {

class StepFindings : public testing::TestWithParam<FindingCase> {};

/// A model with parts and sets, the initial step and one more of this class with these members.
std::string Step(const std::string& className, const std::string& members = {}) {
    return Whole({},
                 R"("steps": [{"name": "Initial", "class": "InitialStep"}, {"name": "S", "class": "kprC_)" +
                     className + "\"" + (members.empty() ? "" : ", " + members) + "}]");
}

std::string Controls(const std::string& className, const std::string& members) {
    return Step("StaticStep", R"("controls": {"class": "kprC_)" + className + "\", " + members + "}");
}

std::string Scaling(const std::string& members) {
    return Step("ExplicitDynamicsStep", R"("massScaling": [{)" + members + "}]");
}

const FindingCase stepCases[] = {
    {"EveryProcedure_ByDefault",
     Whole({}, R"("steps": [{"name": "Initial", "class": "InitialStep"},
        {"name": "1", "class": "AnnealStep"}, {"name": "2", "class": "BuckleStep"},
        {"name": "3", "class": "CoupledTempDisplacementStep"},
        {"name": "4", "class": "CoupledThermalElectricStep"}, {"name": "5", "class": "ExplicitDynamicsStep"},
        {"name": "6", "class": "FrequencyStep"}, {"name": "7", "class": "GeostaticStep"},
        {"name": "8", "class": "HeatTransferStep"}, {"name": "9", "class": "ImplicitDynamicsStep"},
        {"name": "10", "class": "MassDiffusionStep"}, {"name": "11", "class": "ModalDynamicsStep"},
        {"name": "12", "class": "RandomResponseStep"}, {"name": "13", "class": "ResponseSpectrumStep"},
        {"name": "14", "class": "SoilsStep"}, {"name": "15", "class": "StaticStep"},
        {"name": "16", "class": "StaticRiksStep"}, {"name": "17", "class": "StaticLinearPerturbationStep"},
        {"name": "18", "class": "SteadyStateDirectStep"}, {"name": "19", "class": "SteadyStateModalStep"},
        {"name": "20", "class": "SubspaceDynamicsStep"}, {"name": "21", "class": "ViscoStep"},
        {"name": "22", "class": "TempDisplacementDynamicsStep"},
        {"name": "23", "class": "SteadyStateSubspaceStep"}])"),
     {}},
    {"FirstStepNotInitial",
     Model(R"("steps": [{"name": "S", "class": "StaticStep"}])"),
     {"@/steps/0/class: found 'StaticStep', expected InitialStep as the first step"}},
    {"InitialStepInTheMiddle",
     Model(R"("steps": [{"name": "I", "class": "InitialStep"}, {"name": "S", "class": "StaticStep"},
                        {"name": "J", "class": "InitialStep"}])"),
     {"@/steps/2/class: found a second InitialStep, expected it in the first place alone"}},
    {"TwoAnalysisStepsOfOneName",
     Model(R"("steps": [{"name": "I", "class": "InitialStep"}, {"name": "S", "class": "StaticStep"},
                        {"name": "S", "class": "FrequencyStep"}])"),
     {"@/steps/2/name: found a second step named 'S', expected names that are unique"}},
    {"NamesThatDifferInCapitals",
     Model(R"("steps": [{"name": "Load", "class": "InitialStep"}, {"name": "LOAD", "class": "StaticStep"}])"),
     {"warning @/steps/1/name: this step and 'Load' differ only in capitals, which solvers take for one "
      "name"}},
    {"Suppressed",
     Step("StaticStep", R"("suppressed": true)"),
     {"warning @/steps/1/suppressed: found true, which changes nothing: a suppressed step is written like "
      "any "
      "other"}},
    {"PeriodZero",
     Step("StaticStep", R"("timePeriod": 0, "initialInc": 0, "minInc": 0)"),
     {"warning @/steps/1/timePeriod: found 0.0, expected more than 0"}},
    {"PeriodNegative",
     Step("ExplicitDynamicsStep", R"("timePeriod": -1)"),
     {"warning @/steps/1/timePeriod: found -1.0, expected more than 0"}},
    {"ArcLengthNegative",
     Step("StaticRiksStep", R"("totalArc": -2, "initialArcInc": -3, "minArcInc": -4)"),
     {"warning @/steps/1/totalArc: found -2.0, expected more than 0",
      "warning @/steps/1/initialArcInc: found -3.0, expected 0 or more",
      "warning @/steps/1/minArcInc: found -4.0, expected 0 or more"}},
    {"InitialAboveThePeriod",
     Step("ViscoStep", R"("timePeriod": 0.5)"),
     {"warning @/steps/1/initialInc: found 1.0, expected timePeriod (0.5) or less"}},
    {"FixedIncrementAboveThePeriod",
     Step("ModalDynamicsStep", R"("timeIncrement": 2)"),
     {"warning @/steps/1/timeIncrement: found 2.0, expected timePeriod (1.0) or less"}},
    {"LeastAboveInitial",
     Step("StaticStep", R"("initialInc": 0.1, "minInc": 0.2)"),
     {"warning @/steps/1/minInc: found 0.2, expected initialInc (0.1) or less"}},
    {"InitialAboveMost",
     Step("StaticStep", R"("initialInc": 0.3, "maxInc": 0.2)"),
     {"warning @/steps/1/initialInc: found 0.3, expected maxInc (0.2) or less"}},
    {"FixedIncrements_LookAtNoBounds",
     Step("StaticStep",
          R"("timeIncrementationMethod": "DIRECT", "initialInc": 0.3, "minInc": 0.5, "maxInc": 0.2)"),
     {}},
    {"NegativeCounts",
     Step("FrequencyStep",
          R"("numEigen": -1, "vectors": -2, "maxIterations": -3, "blockSize": -4, "maxBlocks": -5)"),
     {"@/steps/1/numEigen: found -1, expected 0 or more", "@/steps/1/vectors: found -2, expected 0 or more",
      "@/steps/1/maxIterations: found -3, expected 0 or more",
      "@/steps/1/blockSize: found -4, expected 0 or more",
      "@/steps/1/maxBlocks: found -5, expected 0 or more"}},
    {"NegativeIncrements",
     Step("StaticStep", R"("maxNumInc": -1)"),
     {"@/steps/1/maxNumInc: found -1, expected 0 or more"}},
    {"CountThatIsNoInteger",
     Step("StaticStep", R"("maxNumInc": 1.5)"),
     {"@/steps/1/maxNumInc: found 1.5, expected an integer of 32 bits"}},
    {"PeriodNull",
     Step("StaticStep", R"("timePeriod": null)"),
     {"@/steps/1/timePeriod: found null, expected a number"}},
    {"UnsetFields_MayBeNull",
     Step("FrequencyStep", R"("numEigen": null, "maxEigen": null, "blockSize": 2147483647)"),
     {}},
    {"LoadCasesWhereNoneAreAllowed",
     Step("FrequencyStep", R"("loadCases": {"A": {}})"),
     {"warning @/steps/1/loadCases: found load cases, expected none: this procedure allows none"}},
    {"LoadCasesWhereAllowed", Step("SteadyStateModalStep", R"("loadCases": {"A": {}})"), {}},
    {"LoadCaseWithoutAName",
     Step("StaticLinearPerturbationStep", R"("loadCases": {"": {}})"),
     {"@/steps/1/loadCases/: found an empty name, expected a name that can stand in a deck"}},
    {"ComplexFrequency",
     Step("ComplexFrequencyStep"),
     {"warning @/steps/1/class: found a complex frequency step, of which no deck can be written: writing "
      "fails "
      "with \"Unimplemented function to write out *Step card\""}},
    {"FullyPlastic_IsFreeText", Step("StaticStep", R"("fullyPlastic": "\"no such\".set")"), {}},
    {"FullyPlasticOfRiks_IsFreeText", Step("StaticRiksStep", R"("fullyPlastic": "K.nothing")"), {}},
    {"MonitorOnNoSet",
     Step("StaticStep", R"("monitor": {"class": "StandardMonitor", "region": "I.NODE", "dof": -1})"),
     {"@/steps/1/monitor/region: found set 'NODE', expected the name of a set of instance 'I'; did you mean "
      "'NODES'?"}},
    {"MonitorOfNegativeNumbers",
     Step("StaticStep",
          R"("monitor": {"class": "StandardMonitor", "region": "I.NODES", "dof": -1, "frequency": -2})"),
     {"@/steps/1/monitor/dof: found -1, expected 0 or more",
      "@/steps/1/monitor/frequency: found -2, expected 0 or more"}},
    {"RestartOfNegativeFrequency",
     Step("StaticStep", R"("restart": {"class": "StandardRestart", "frequency": -1, "numberInterval": -1})"),
     {"@/steps/1/restart/frequency: found -1, expected 0 or more"}},
    {"RestartWithoutClass",
     Step("StaticStep", R"("restart": {"overlay": true})"),
     {"@/steps/1/restart/class: found nothing, expected one of StandardRestart, ExplicitRestart"}},
    {"ExplicitRestartOfNegativeIntervals",
     Step("StaticStep", R"("restart": {"class": "ExplicitRestart", "numberInterval": -1})"),
     {"@/steps/1/restart/numberInterval: found -1, expected 0 or more"}},
    {"SolveOfAStandardPrint",
     Step("StaticStep", R"("diagnosticPrint": {"class": "StandardDiagnosticPrint", "solve": true})"),
     {"@/steps/1/diagnosticPrint/solve: found an unknown member 'solve', expected one of contact, frequency, "
      "modelChange, class"}},
    {"NegativeSolverIterations",
     Step("StaticStep", R"("solverControls": {"maxIterations": -1})"),
     {"@/steps/1/solverControls/maxIterations: found -1, expected 0 or more"}},
    {"ControlsWithOddIntegers",
     Controls("TypicalControls", R"("timeIncrementation": [4, 8.5])"),
     {"warning @/steps/1/controls/timeIncrementation: found 8.5 as entry 1, which is cut to a whole number"}},
    {"ControlsWithIntegersBeyondTheirRange",
     Controls("TypicalControls", R"("timeIncrementation": [4, 1e10])"),
     {"@/steps/1/controls/timeIncrementation: found 1e+10 as entry 1, expected a whole number of 32 bits"}},
    {"ControlsWithARealAsTwelfth",
     Controls(
         "TypicalControls",
         R"("timeIncrementation": [null, null, null, null, null, null, null, null, null, null, null, 0.3])"),
     {}},
    {"ControlsWithATextInAList",
     Controls("TypicalControls", R"("lineSearch": ["5"])"),
     {"@/steps/1/controls/lineSearch/0: found '5', expected a number"}},
    {"ControlsWithNullBeyondTheDefaults",
     Controls("TypicalControls", R"("lineSearch": [1, 2, 3, 4, 5, null, 7, null])"),
     {"@/steps/1/controls/lineSearch/5: found null, expected a number: the list has defaults for the first 5 "
      "items only",
      "@/steps/1/controls/lineSearch/7: found null, expected a number: the list has defaults for the first 5 "
      "items only"}},
    {"FieldListThatIsTooLong",
     Controls("CTEControls", R"("electricalPotential": [1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11])"),
     {"warning @/steps/1/controls/electricalPotential: found 11 entries, expected at most 10: of a longer "
      "list "
      "nothing is written"}},
    {"MoreResidualValuesThanSets",
     Step("FrequencyStep", R"("residualModeSets": ["I.NODES"], "residualModeValues": [1, 2])"),
     {"@/steps/1/residualModeValues: found 2 items, expected at most 1, one for each of residualModeSets"}},
    {"ResidualSetsOfTheAssemblyAndOfInstances",
     Whole(R"("sets": [{"name": "ENDS", "kind": "node", "members": [{"instance": "I", "labels": [1]}]}])",
           R"("steps": [{"name": "Initial", "class": "InitialStep"}, {"name": "S", "class": "FrequencyStep",
              "residualModeSets": ["ENDS", "I.NODES", "J.NODES", "J.A.B"], "residualModeValues": [1, 2]}])"),
     {}},
    {"ResidualSetOfNothing",
     Step("FrequencyStep", R"("residualModeSets": ["I.NODE", "NODES"])"),
     {"@/steps/1/residualModeSets/0: found 'I.NODE', expected the name of a set; did you mean 'I.NODES'?",
      "@/steps/1/residualModeSets/1: found 'NODES', expected the name of a set; there are 'E.ALL', "
      "'E.NODES', 'E.TOP', 'E.A.B', 'I.ALL', 'I.NODES', 'I.TOP', 'I.A.B', 'J.NODES', 'J.TOP', ... (2 "
      "more)"}},
    {"SpectrumOfNothing",
     Step("ResponseSpectrumStep", R"("components": [{"spectrumName": "quake"}])"),
     {"@/steps/1/components/0/spectrumName: found 'quake', expected the name of an amplitude; there is "
      "none"}},
    {"FrequenciesTheWrongWayRound",
     Step("SteadyStateDirectStep", R"("frequencies": [{"lower": 2, "upper": 1}, {"lower": 1, "upper": 2}])"),
     {"warning @/steps/1/frequencies/0/lower: found 2.0, expected upper (1.0) or less"}},
    {"NegativePoints",
     Step("RandomResponseStep", R"("frequencies": [{"lower": 1, "upper": 2, "points": -1}])"),
     {"@/steps/1/frequencies/0/points: found -1, expected 0 or more"}},
    {"ModesTheWrongWayRound",
     Step("ModalDynamicsStep", R"("directDamping": {"rows": [{"firstMode": 3, "lastMode": 2}]},
                                  "compositeDamping": {"rows": [{"firstMode": -3, "lastMode": 2}]})"),
     {"@/steps/1/compositeDamping/rows/0/firstMode: found -3, expected 0 or more",
      "warning @/steps/1/directDamping/rows/0/firstMode: found 3, expected lastMode (2) or less"}},
    {"ScalingOnNoSet",
     Scaling(R"("region": "I.AL")"),
     {"@/steps/1/massScaling/0/region: found set 'AL', expected the name of a set of instance 'I'; did you "
      "mean "
      "'ALL'?"}},
    {"ScalingOfUnknownDirection",
     Scaling(R"("direction": 4)"),
     {"@/steps/1/massScaling/0/direction: found 4, expected one of X (0), Y (1), Z (2), NONE (3)"}},
    {"ScalingOfAPartialNode",
     Scaling(R"("crossSection": 12.7)"),
     {"warning @/steps/1/massScaling/0/crossSection: found 12.7, which is cut to a whole number"}},
    {"ScalingOfNegativeNumbers",
     Scaling(R"("frequency": -1, "numberInterval": -2)"),
     {"@/steps/1/massScaling/0/frequency: found -1, expected 0 or more",
      "@/steps/1/massScaling/0/numberInterval: found -2, expected 0 or more"}},
};

} // namespace

TEST_P(StepFindings, Step_WithSomethingOdd_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, StepFindings, testing::ValuesIn(stepCases), FindingCaseName);
