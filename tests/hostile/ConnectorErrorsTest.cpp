#include "hostile/Findings.h"

namespace {

class ConnectorFindings : public testing::TestWithParam<FindingCase> {};

std::string Section(const std::string& members) {
    return Whole({}, R"("sections": {"C": {"class": "ConnectorSection", )" + members + "}}");
}

/// A section with one option; what is found of it stands under kOption.
std::string Option(const std::string& className, const std::string& members) {
    return Section(R"("options": [{"class": "Connector)" + className + "\", " + members + "}]");
}
const std::string kOption = "@/sections/C/options/0/";

std::string Friction(const std::string& members) {
    return Option("Friction", R"("formulation": "USER_DEFINED", )" + members);
}
std::string Tangential(const std::string& members) {
    return Option("Friction", R"("tangentialBehavior": {)" + members + "}");
}
std::string Term(const std::string& members) {
    return Option("Friction", R"("contactForceDerived": {"terms": [{)" + members + "}]}");
}

std::string Orientation(const std::string& members) {
    return Whole(R"("connectorOrientations": [{"region": "I.ALL", )" + members + "}]");
}

const FindingCase connectorCases[] = {
    {"AssembledTypeBesideBasicOnes",
     Section(R"("assembledType": "BEAM", "translationalType": "JOIN", "rotationalType": 2)"),
     {"warning @/sections/C/translationalType: found a basic type beside an assembled one, which stands in "
      "the deck alone",
      "warning @/sections/C/rotationalType: found a basic type beside an assembled one, which stands in the "
      "deck alone"}},
    {"BasicTypes", Section(R"("translationalType": "JOIN", "rotationalType": "REVOLUTE")"), {}},
    {"ReferenceOfFive",
     Section(R"("constitutiveReference": [1, 2, 3, 4, 5])"),
     {"@/sections/C/constitutiveReference: found an array of 5 items, expected an array of 6 items"}},
    {"ComponentsOutsideAndTwice",
     Option("Stop", R"("components": [0, 7, 3, 3])"),
     {kOption + "components: found 0, expected components from 1 to 6",
      kOption + "components: found 7, expected components from 1 to 6",
      kOption + "components: found 3 twice, expected each component once"}},
    {"ComponentsOfLockAndFailure",
     Section(R"("options": [{"class": "ConnectorLock", "components": [-1]},
                            {"class": "ConnectorFailure", "components": [9]}])"),
     {"@/sections/C/options/0/components: found -1, expected components from 1 to 6",
      "@/sections/C/options/1/components: found 9, expected components from 1 to 6"}},
    {"IndependentComponents",
     Option("Elasticity", R"("independentComponents": [1, 1])"),
     {kOption + "independentComponents: found 1 twice, expected each component once"}},
    {"NegativeDependencies",
     Option("Elasticity", R"("dependencies": -1)"),
     {kOption + "dependencies: found -1, expected 0 or more"}},
    {"LinearTables",
     Option("Elasticity",
            R"("components": [1, 3], "frequencyDependency": true, "temperatureDependency": true,
               "dependencies": 2, "table": [[1, 2]])"),
     {kOption + "table: found rows of 2, expected rows of 6: one per component, frequency, temperature, "
                "2 field variables"}},
    {"LinearTable_OfItsWidth", Option("Elasticity", R"("components": [1, 3], "table": [[1, 2]])"), {}},
    {"LinearTableOfACoupledPosition",
     Option("Elasticity", R"("coupling": 2, "components": [1, 3], "table": [[1, 2, 3]])"),
     {kOption + "table: found rows of 3, expected rows of 2: one per component"}},
    {"MatrixOfThree",
     Option("Elasticity", R"("coupling": "COUPLED", "components": [1, 2, 3], "table": [[1, 2, 3, 4, 5]])"),
     {kOption + "table: found rows of 5, expected rows of 6: the matrix of the components up to its "
                "diagonal"}},
    {"NonlinearTable",
     Option("Elasticity", R"("behavior": "NONLINEAR", "components": [1, 2], "dependencies": 1,
                             "table": [[1, 2]])"),
     {kOption + "table: found rows of 2, expected rows of 3: force, motion, 1 field variable"}},
    {"NonlinearCoupledElasticity",
     Option("Elasticity", R"("behavior": "NONLINEAR", "coupling": "COUPLED", "components": [1, 2],
                             "independentComponents": [4, 5, 6], "table": [[1, 2]])"),
     {kOption + "table: found rows of 2, expected rows of 5: one per component, one per independent "
                "component"}},
    {"NonlinearCoupledDamping",
     Option("Damping", R"("behavior": "NONLINEAR", "coupling": "COUPLED", "components": [1, 2],
                          "independentComponents": [4, 5, 6], "table": [[1, 2]])"),
     {kOption + "table: found rows of 2, expected rows of 7: two per component, one per independent "
                "component"}},
    {"RigidElasticity_TakesAnyTable",
     Option("Elasticity", R"("behavior": "RIGID", "components": [1], "table": [[1, 2, 3]])"),
     {}},
    {"TableWithoutRows_IsTaken", Option("Elasticity", R"("components": [1, 2], "table": [])"), {}},
    {"UserDefinedFriction",
     Friction(R"("contactArea": true, "independentKind": "POSITION", "independentComponents": [1, 2],
                 "table": [[1]])"),
     {kOption + "table: found rows of 1, expected rows of 4: internal contact force, one per independent "
                "component, contact area"}},
    {"UserDefinedFriction_WithoutAKindTakesIndependentComponentsOrNot",
     Section(R"("options": [
        {"class": "ConnectorFriction", "formulation": 1, "independentComponents": [1], "table": [[1]]},
        {"class": "ConnectorFriction", "formulation": 1, "independentComponents": [1], "table": [[1, 2]]},
        {"class": "ConnectorFriction", "formulation": 1, "independentComponents": [1], "table": [[1, 2, 3]]}])"),
     {"@/sections/C/options/2/table: found rows of 3, expected rows of 1 to 2: internal contact force"}},
    {"PredefinedFriction_TakesAnyTable", Option("Friction", R"("table": [[1, 2, 3, 4]])"), {}},
    {"CoefficientTable",
     Tangential(R"("slipRateDependency": true, "pressureDependency": true, "table": [[1]])"),
     {kOption + "tangentialBehavior/table: found rows of 1, expected rows of 3: friction coefficient, slip "
                "rate, contact force"}},
    {"ExponentialDecayTooShort",
     Tangential(R"("formulation": 1, "testData": 1, "table": [[1, 2, 3]])"),
     {kOption + "tangentialBehavior/table: found 3, expected 4 numbers of an exponential decay"}},
    {"ExponentialDecay_InSeveralRows", Tangential(R"("formulation": 1, "table": [[1], [2], [3]])"), {}},
    {"Plasticity",
     Option("Plasticity", R"("isotropicDependencies": -1, "kinematicTable": [[1]], "components": [8])"),
     {kOption + "components: found 8, expected components from 1 to 6",
      kOption + "isotropicDependencies: found -1, expected 0 or more",
      kOption + "kinematicTable: found rows of 1, expected rows of 2 to 3: two of data, a third that may be "
                "left out"}},
    {"DamageOfPlasticMotion",
     Option("Damage", R"("criterion": 2, "modeMixDependency": true, "initiationTable": [[1]],
                         "evolutionTable": [[1]], "affectedComponents": [0])"),
     {kOption + "affectedComponents: found 0, expected components from 1 to 6",
      kOption + "initiationTable: found rows of 1, expected rows of 2: plastic motion, mode-mix ratio",
      kOption + "evolutionTable: found rows of 1, expected rows of 2: motion or energy at failure, mode-mix "
                "ratio"}},
    {"DamageOfForce",
     Option("Damage", R"("softening": "TABULAR", "initiationTable": [[1]], "evolutionTable": [[1]])"),
     {kOption + "initiationTable: found rows of 1, expected rows of 2: lower bound, upper bound",
      kOption + "evolutionTable: found rows of 1, expected rows of 2: two of the softening"}},
    {"TermOfADerivedComponent",
     Term(R"("components": [1, 2], "table": [[1]])"),
     {kOption + "contactForceDerived/terms/0/table: found rows of 1, expected rows of 2: one per component"}},
    {"TermOnIndependentComponents",
     Term(R"("components": [1, 2], "independentGiven": true, "table": [[1, 2]])"),
     {kOption + "contactForceDerived/terms/0/table: found rows of 2, expected rows of 3 or more: one per "
                "component, an independent component at least"}},
    {"TermOnIndependentComponents_TakesMore",
     Term(R"("components": [1], "independentGiven": true, "table": [[1, 2, 3, 4]])"),
     {}},
    {"NameOfAnOrientation_IsTakenWithAWarning",
     Orientation(R"("name": "mine")"),
     {"warning @/assembly/connectorOrientations/0/name: found 'mine', which is best left out: where an angle "
      "isn't 0, the connector section refers to an orientation that is defined under 'ConnOri-' and its "
      "place"}},
    {"NameOfAnOrientation_ThatNoDeckCanCarry",
     Orientation(R"("name": "a\"b")"),
     {"@/assembly/connectorOrientations/0/name: found a name with a double quote, expected a name that can "
      "stand in a deck"}},
};

} // namespace

TEST_P(ConnectorFindings, Connector_WithSomethingOdd_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, ConnectorFindings, testing::ValuesIn(connectorCases), FindingCaseName);
