#include "hostile/Findings.h"

namespace {

class InteractionErrors : public testing::TestWithParam<FindingCase> {};

const std::string kNames =
    R"("steps": [{"name": "Initial", "class": "InitialStep"}],
       "contactControls": {"Std": {"class": "StdContactControls"}, "Exp": {"class": "ExpContactControls"}},
       "interactionProperties": {"Contact": {"class": "ContactProperty"},
                                 "Film": {"class": "FilmConditionProp"},
                                 "Wave": {"class": "IncidentWaveProperty"}}, )";

/// The interaction A of the class, with this state in the initial step.
std::string State(const std::string& className, const std::string& state, const std::string& members = "") {
    return Model(kNames + R"("interactions": {"A": {"class": "kinC_)" + className + "\", " + members +
                 R"("states": {"Initial": {)" + state + "}}}}");
}

std::string Pair(const std::string& members) {
    return Model(R"("interactions": {"A": {"class": "SurfaceToSurfaceContactStd", )" + members + "}}");
}

std::string Property(const std::string& className, const std::string& members) {
    return Model(R"("interactionProperties": {"A": {"class": "kinC_)" + className + "\", " + members + "}}");
}

std::string Friction(const std::string& members) {
    return Property("ContactProperty", R"("tangentialBehavior": {)" + members + "}");
}

std::string Normal(const std::string& members) {
    return Property("ContactProperty", R"("normalBehavior": {)" + members + "}");
}

std::string Conductance(const std::string& members) {
    return Property("ContactProperty", R"("thermalConductance": {)" + members + "}");
}

const FindingCase interactionCases[] = {
    {"SingleClearanceWithoutValue",
     Pair(R"("clearanceType": "SINGLE_VALUE")"),
     {"@/interactions/A/initialClearance: found nothing, expected the clearance of clearanceType "
      "SINGLE_VALUE"}},
    {"SingleClearanceOfNull",
     Pair(R"("clearanceType": 2, "initialClearance": null)"),
     {"@/interactions/A/initialClearance: found nothing, expected the clearance of clearanceType "
      "SINGLE_VALUE"}},
    {"SingleClearance", Pair(R"("clearanceType": 2, "initialClearance": 0)"), {}},
    {"BoltClearanceWithoutValue", Pair(R"("clearanceType": "BOLT")"), {}},
    {"PropertyOfAnotherClass",
     State("SurfaceToSurfaceContactStd", R"("InteractionProperty": "Film")"),
     {"@/interactions/A/states/Initial/InteractionProperty: found 'Film', a FilmConditionProp, expected "
      "the "
      "name of a ContactProperty"}},
    {"PropertyThatIsNotThere",
     State("SelfContactXpl", R"("InteractionProperty": "Contacts")"),
     {"@/interactions/A/states/Initial/InteractionProperty: found 'Contacts', expected the name of an "
      "interactionProperty; did you mean 'Contact'?"}},
    {"FilmPropertyOfAnotherClass",
     State("ConcFilmCondition", R"("filmProperty": "Contact")"),
     {"@/interactions/A/states/Initial/filmProperty: found 'Contact', a ContactProperty, expected the "
      "name of "
      "a FilmConditionProp"}},
    {"ImpedancePropertyOfAnotherClass",
     State("AcousticImpedance", R"("property": "Wave")"),
     {"@/interactions/A/states/Initial/property: found 'Wave', a IncidentWaveProperty, expected the "
      "name of a "
      "AcousticImpedanceProp"}},
    {"WavePropertyOfAnotherClass",
     State("IncidentWave", "", R"("property": "Film", )"),
     {"@/interactions/A/property: found 'Film', a FilmConditionProp, expected the name of a "
      "IncidentWaveProperty"}},
    {"PropertyOfAGeneralContactOfAnotherClass",
     State("ContactExp", R"("propertyAssignments": ["Contact", "Film"])",
           R"("propertyAssignmentPairs": [{}, {}], )"),
     {"@/interactions/A/states/Initial/propertyAssignments/1: found 'Film', a FilmConditionProp, "
      "expected the "
      "name of a ContactProperty"}},
    {"ControlsOfTheExplicitSolverForAStandardPair",
     State("SurfaceToSurfaceContactStd", R"("ContactControls": "Exp")"),
     {"@/interactions/A/states/Initial/ContactControls: found 'Exp', a ExpContactControls, expected the "
      "name "
      "of a StdContactControls"}},
    {"ControlsOfTheExplicitSolverForStandardSelfContact",
     State("SelfContactStd", R"("ContactControls": "Exp")"),
     {"@/interactions/A/states/Initial/ContactControls: found 'Exp', a ExpContactControls, expected the "
      "name "
      "of a StdContactControls"}},
    {"ControlsOfTheImplicitSolverForAnExplicitPair",
     State("SurfaceToSurfaceContactXpl", R"("ContactControls": {"value": "Std", "state": 2})"),
     {"@/interactions/A/states/Initial/ContactControls/value: found 'Std', a StdContactControls, "
      "expected the "
      "name of a ExpContactControls"}},
    {"ControlsOfTheImplicitSolverForExplicitSelfContact",
     State("SelfContactXpl", R"("ContactControls": "Std")"),
     {"@/interactions/A/states/Initial/ContactControls: found 'Std', a StdContactControls, expected the "
      "name "
      "of a ExpContactControls"}},
    {"ControlsOfTheirClass", State("SelfContactStd", R"("ContactControls": "Std")"), {}},
    {"GeneralContactListsBeyondTheirPairs",
     State("ContactExp",
           R"("inclusions": [true], "exclusions": [true, false], "propertyAssignments": ["Contact"],
              "surfacePropertyAssignments": [{}, {}], "formulationAssignments": [{}])",
           R"("exclusionPairs": [{}], "surfacePropertyAssignmentPairs": [{}], )"),
     {"@/interactions/A/states/Initial/inclusions: found 1 item, expected no more than the 0 of "
      "inclusionPairs",
      "@/interactions/A/states/Initial/exclusions: found 2 items, expected no more than the 1 of "
      "exclusionPairs",
      "@/interactions/A/states/Initial/propertyAssignments: found 1 item, expected no more than the 0 of "
      "propertyAssignmentPairs",
      "@/interactions/A/states/Initial/surfacePropertyAssignments: found 2 items, expected no more than the "
      "1 of "
      "surfacePropertyAssignmentPairs",
      "@/interactions/A/states/Initial/formulationAssignments: found 1 item, expected no more than the 0 of "
      "formulationAssignmentPairs"}},
    {"GeneralContactListShorterThanItsPairs",
     State("ContactExp", R"("inclusions": [true])", R"("inclusionPairs": [{}, {}], )"),
     {}},
    {"DirectionOfTwoNumbers",
     State("SurfaceToSurfaceContactStd", R"("direction": [1, 2])"),
     {"@/interactions/A/states/Initial/direction: found an array of 2 items, expected an array of 3 items"}},
    {"DirectionBeyondSinglePrecision",
     State("SurfaceToSurfaceContactStd", R"("direction": [1, 2, 1e39])"),
     {"@/interactions/A/states/Initial/direction/2: found 1e+39, expected a number of single precision"}},
    {"ExponentialDecayOfTwoNumbers",
     Friction(R"("formulation": 2, "table": [[1, 2]])"),
     {"@/interactionProperties/A/tangentialBehavior/table: found 2 numbers, expected 3 for an exponential "
      "decay"}},
    {"TestDataOfThreeNumbers",
     Friction(R"("formulation": 2, "exponentialDecayDefinition": 1, "table": [[1, 2, 3]])"),
     {"@/interactionProperties/A/tangentialBehavior/table: found 3 numbers, expected 4 for an exponential "
      "decay"}},
    {"ExponentialDecayInOneColumn", Friction(R"("formulation": 2, "table": [[1], [2], [3]])"), {}},
    {"FrictionColumnsBesideTheFlags",
     Friction(R"("formulation": 1, "directionality": 2, "temperatureDependency": true, "table": [[1, 2]])"),
     {"warning @/interactionProperties/A/tangentialBehavior/table: found rows of 2, where the flags stand "
      "for 3"}},
    {"FrictionCountsNegative",
     Friction(R"("dependencies": -1, "nStateDependentVars": -2)"),
     {"@/interactionProperties/A/tangentialBehavior/dependencies: found -1, expected 0 or more",
      "@/interactionProperties/A/tangentialBehavior/nStateDependentVars: found -2, expected 0 or more"}},
    {"ExponentialRelationOfOneRow",
     Normal(R"("pressureOverclosure": "EXPONENTIAL", "table": [[1, 0]])"),
     {"@/interactionProperties/A/normalBehavior/table: found 1 row of 2 numbers, expected two rows of two "
      "for an "
      "exponential relation"}},
    {"ExponentialRelationOfOneColumn",
     Normal(R"("pressureOverclosure": 1, "table": [[1], [0]])"),
     {"@/interactionProperties/A/normalBehavior/table: found 2 rows of 1 number, expected two rows of two "
      "for an "
      "exponential relation"}},
    {"TabularRelationOfThreeColumns",
     Normal(R"("pressureOverclosure": 3, "table": [[1, 0, 0]])"),
     {"warning @/interactionProperties/A/normalBehavior/table: found rows of 3, where the flags stand for "
      "2"}},
    {"ConductanceTables",
     Conductance(R"("dependencies": -1, "clearanceTable": [[1, 2, 3]], "pressureTable": [[1, 2]],
                    "pressureTableDependencies": 1, "pressureTableMassFlowRateDependency": true)"),
     {"@/interactionProperties/A/thermalConductance/dependencies: found -1, expected 0 or more",
      "warning @/interactionProperties/A/thermalConductance/clearanceTable: found rows of 3, where the flags "
      "stand "
      "for 2",
      "warning @/interactionProperties/A/thermalConductance/pressureTable: found rows of 2, where the flags "
      "stand "
      "for 4"}},
    {"DampingAndRadiationColumns",
     Property("ContactProperty", R"("damping": {"table": [[1]]}, "radiation": {"table": [[1]]})"),
     {"warning @/interactionProperties/A/damping/table: found rows of 1, where the flags stand for 2",
      "warning @/interactionProperties/A/radiation/table: found rows of 1, where the flags stand for 2"}},
    {"FilmPropertyColumns",
     Property("FilmConditionProp", R"("table": [[1, 2]], "dependencies": -3)"),
     {"@/interactionProperties/A/dependencies: found -3, expected 0 or more",
      "warning @/interactionProperties/A/table: found rows of 2, where the flags stand for 1"}},
    {"ImpedanceColumns",
     Property("AcousticImpedanceProp", R"("table": [[1, 2, 3, 4]])"),
     {"warning @/interactionProperties/A/table: found rows of 4, where the flags stand for 2 or 3"}},
    {"ContactPairIsNoClassOfAModelFile",
     Model(R"("interactions": {"A": {"class": "SurfaceToSurfaceContactExp"}})"),
     {"@/interactions/A/class: found 'SurfaceToSurfaceContactExp'; did you mean "
      "'SurfaceToSurfaceContactXpl'? Expected one of SurfaceToSurfaceContactStd, SurfaceToSurfaceContactXpl, "
      "SelfContactStd, SelfContactXpl, ContactExp, RadiationToAmbient, ConcRadiationToAmbient, "
      "AcousticImpedance, ElasticFoundation, ActuatorSensor, ... (5 more)"}},
};

} // namespace

TEST_P(InteractionErrors, WrongInteraction_IsNamedWithItsPlace) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, InteractionErrors, testing::ValuesIn(interactionCases), FindingCaseName);
