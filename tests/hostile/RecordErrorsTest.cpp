#include "hostile/Findings.h"

namespace {

class RecordErrors : public testing::TestWithParam<FindingCase> {};

std::string Section(const std::string& members) {
    return Model(R"("sections": {"S": {"class": "ConnectorSection")" + members + "}}");
}

std::string Cyclic(const std::string& members) {
    return Model(R"("cyclicSymmetry": {"symmetryType": "CYCLIC", )" + members + "}");
}

std::string TimePoints(const std::string& members) {
    return Model(R"("timePoints": {"T": {)" + members + "}}");
}

/// A mesh constraint in a model that has the step Initial.
std::string States(const std::string& states) {
    return Model(R"("steps": [{"name": "Initial", "class": "InitialStep"}],
                    "adaptiveMeshConstraints": {"C": {"states": )" +
                 states + "}}");
}

std::string Steps(const std::string& steps) {
    return Model(R"("steps": [)" + steps + "]");
}

std::string Amplitude(const std::string& members) {
    return Model(R"("amplitudes": {"A": {)" + members + "}}");
}

// Of members and words beyond ten those that are most like what was found, or the first ones.
const std::string connectorMembers =
    "assembledType, translationalType, rotationalType, regularize, regularization, contactAngle, "
    "materialFlowFactor, massPerLength, options, class, ... (4 more)";

const std::string connectionTypes =
    "NONE (0), BEAM (1), BUSHING (2), CVJOINT (3), CYLINDRICAL (4), HINGE (5), PLANAR (6), RETRACTOR (7), "
    "SLIPRING (8), TRANSLATOR (9), ... (2 more)";

const FindingCase recordCases[] = {
    {"ContainerAsArray",
     Model(R"("timePoints": [])"),
     {"@/timePoints: found an array of 0 items, expected an object, each member time points"}},
    {"RecordAsNumber", Model(R"("timePoints": {"T": 1})"), {"@/timePoints/T: found 1, expected an object"}},
    {"RecordNameEmpty",
     Model(R"("timePoints": {"": {}})"),
     {"@/timePoints/: found an empty name, expected a name that can stand in a deck"}},
    {"ClassOfAnotherFamily",
     Model(R"("timePoints": {"T": {"class": "Material"}})"),
     {"@/timePoints/T/class: found 'Material', expected TimePoint"}},
    {"ClassAsNumber",
     Model(R"("timePoints": {"T": {"class": 1}})"),
     {"@/timePoints/T/class: found 1, expected the name of a class"}},
    {"UnknownMember",
     Section(R"(, "assembledtype": "WELD", "assembly": 1)"),
     {"@/sections/S/assembledtype: found an unknown member 'assembledtype'; did you mean "
      "'assembledType'? Expected one of assembledType, translationalType, rotationalType, regularize, "
      "regularization, extrapolationLinear, contactAngle, massPerLength, options, class, ... (4 more)",
      "@/sections/S/assembly: found an unknown member 'assembly'; is it meant for '/models/Default "
      "Model/assembly'? "
      "Expected one of " +
          connectorMembers}},
    {"StatesWhereThereAreNone",
     Section(R"(, "states": {})"),
     {"@/sections/S/states: found an unknown member 'states', expected one of " + connectorMembers}},

    {"AmplitudeTableOfThreeColumns",
     Amplitude(R"("class": "Tabular", "table": [[0, 1, 2]])"),
     {"@/amplitudes/A/table: found rows of 3, expected rows of 2: time, value"}},
    {"SmoothStepTableOfOneColumn",
     Amplitude(R"("class": "SmoothStep", "table": [[0], [1]])"),
     {"@/amplitudes/A/table: found rows of 1, expected rows of 2: time, value"}},
    {"PeriodicTableOfThreeColumns",
     Amplitude(R"("class": "Periodic", "table": [[0, 1, 2]])"),
     {"@/amplitudes/A/table: found rows of 3, expected rows of 2: cosine term, sine term"}},
    {"PsdTableOfTwoColumns",
     Amplitude(R"("class": "PsdDefinition", "table": [[0, 1]])"),
     {"@/amplitudes/A/table: found rows of 2, expected rows of 3: real part, imaginary part, frequency"}},
    {"SpectrumTableOfTwoColumns",
     Amplitude(R"("class": "Spectrum", "table": [[0, 1]])"),
     {"@/amplitudes/A/table: found rows of 2, expected rows of 3: magnitude, frequency, fraction of critical "
      "damping"}},
    {"AmplitudeWithoutClass",
     Amplitude(""),
     {"@/amplitudes/A/class: found nothing, expected one of Tabular, EquallySpaced, Periodic, "
      "Modulated, Decay, SolutionDependent, SmoothStep, PsdDefinition, "
      "Spectrum"}},
    {"NumberInTheListOfAnAmplitudeAsNull",
     Amplitude(R"("class": "EquallySpaced", "values": [1, null])"),
     {"@/amplitudes/A/values/1: found null, expected a number"}},

    {"EnumUnknownName",
     Section(R"(, "assembledType": "HINGES")"),
     {"@/sections/S/assembledType: found 'HINGES'; did you mean 'HINGE'? Expected one of "
      "NONE (0), BEAM (1), BUSHING (2), CVJOINT (3), HINGE (5), PLANAR (6), SLIPRING (8), TRANSLATOR (9), "
      "UJOINT (10), WELD (11), ... (2 more)"}},
    {"EnumUnknownNumber",
     Section(R"(, "assembledType": 12)"),
     {"@/sections/S/assembledType: found 12, expected one of " + connectionTypes}},
    {"EnumNegative",
     Section(R"(, "assembledType": -1)"),
     {"@/sections/S/assembledType: found -1, expected one of " + connectionTypes}},
    {"EnumReal",
     Section(R"(, "assembledType": 1.0)"),
     {"@/sections/S/assembledType: found 1.0, expected one of " + connectionTypes}},
    {"EnumNull",
     Section(R"(, "assembledType": null)"),
     {"@/sections/S/assembledType: found null, expected one of " + connectionTypes}},
    {"EnumFlag",
     Section(R"(, "assembledType": true)"),
     {"@/sections/S/assembledType: found true, expected one of " + connectionTypes}},

    {"IntegerReal",
     Cyclic(R"("numberOfSectors": 3.0)"),
     {"@/cyclicSymmetry/numberOfSectors: found 3.0, expected an integer of 32 bits"}},
    {"IntegerNull",
     Cyclic(R"("numberOfSectors": null)"),
     {"@/cyclicSymmetry/numberOfSectors: found null, expected an integer of 32 bits"}},
    {"IntegerText",
     Cyclic(R"("numberOfSectors": "3")"),
     {"@/cyclicSymmetry/numberOfSectors: found '3', expected an integer of 32 bits"}},
    {"IntegerTooLarge",
     Cyclic(R"("numberOfSectors": -2147483649)"),
     {"@/cyclicSymmetry/numberOfSectors: found -2147483649, expected an integer of 32 bits"}},
    {"PointOfFour",
     Cyclic(R"("endPoint": [0, 0, 1, 1])"),
     {"@/cyclicSymmetry/endPoint: found an array of 4 items, expected three numbers"}},
    {"PointNull",
     Cyclic(R"("endPoint": null)"),
     {"@/cyclicSymmetry/endPoint: found null, expected three numbers"}},
    {"PointWithAText",
     Cyclic(R"("endPoint": [0, 0, "1"])"),
     {"@/cyclicSymmetry/endPoint/2: found '1', expected a number"}},

    {"FlagText",
     TimePoints(R"("generate": "true")"),
     {"@/timePoints/T/generate: found 'true', expected true or false"}},
    {"FlagNull",
     TimePoints(R"("generate": null)"),
     {"@/timePoints/T/generate: found null, expected true or false"}},
    {"TableAsNumber",
     TimePoints(R"("points": 1)"),
     {"@/timePoints/T/points: found 1, expected an array of rows of numbers"}},
    {"TableNull",
     TimePoints(R"("points": null)"),
     {"@/timePoints/T/points: found null, expected an array of rows of numbers"}},
    {"TableFlat",
     TimePoints(R"("points": [1, 2])"),
     {"@/timePoints/T/points/0: found 1, expected a row of numbers"}},
    {"TableRagged",
     TimePoints(R"("points": [[1, 2, 3], [1]])"),
     {"@/timePoints/T/points/1: found an array of 1 item, expected a row of 3 numbers, as the first one"}},
    {"TableCellNull",
     TimePoints(R"("points": [[1], [null]])"),
     {"@/timePoints/T/points/1/0: found null, expected a number"}},
    {"TextNumber",
     Model(R"("adaptiveMeshControls": {"A": {"description": 1}})"),
     {"@/adaptiveMeshControls/A/description: found 1, expected a string"}},
    {"TextLines",
     Model(R"("adaptiveMeshControls": {"A": {"description": ["a"]}})"),
     {"@/adaptiveMeshControls/A/description: found an array of 1 item, expected a string"}},

    {"StatesAsArray",
     States("[]"),
     {"@/adaptiveMeshConstraints/C/states: found an array of 0 items, expected an object of states by step"}},
    {"StateAsNumber",
     States(R"({"Initial": 1})"),
     {"@/adaptiveMeshConstraints/C/states/Initial: found 1, expected an object"}},
    {"StateInNoStep",
     States(R"({"Inital": {}})"),
     {"@/adaptiveMeshConstraints/C/states/Inital: found 'Inital', expected the name of a step; did you mean "
      "'Initial'?"}},
    {"StateUnknownMember",
     States(R"({"Initial": {"magnitude": 1}})"),
     {"@/adaptiveMeshConstraints/C/states/Initial/magnitude: found an unknown member 'magnitude', expected "
      "one of "
      "deactivated, status"}},
    {"StateDeactivatedAsNumber",
     States(R"({"Initial": {"deactivated": 1}})"),
     {"@/adaptiveMeshConstraints/C/states/Initial/deactivated: found 1, expected true or false"}},
    {"StateEndsWhatHasNotBegun",
     States(R"({"Initial": {"deactivated": true}})"),
     {"@/adaptiveMeshConstraints/C/states/Initial: found deactivated, but it is not active there"}},
    {"StateOfUnknownStatus",
     States(R"({"Initial": {"status": "MODIFED"}})"),
     {"@/adaptiveMeshConstraints/C/states/Initial/status: found 'MODIFED'; did you mean 'MODIFIED'? "
      "Expected one of NOT_YET_ACTIVE (0), CREATED (1), PROPAGATED (2), MODIFIED (3), DEACTIVATED (4), "
      "MODIFIED_FROM_BASE_STATE (10), BUILT_INTO_MODES (12), NOT_APPLICABLE (13), FIELD_PROPAGATED "
      "(14), FIELD_RESET (15), ... (6 more)"}},
    {"SuppressedAsNumber",
     Model(R"("adaptiveMeshConstraints": {"C": {"suppressed": 0}})"),
     {"@/adaptiveMeshConstraints/C/suppressed: found 0, expected true or false"}},

    {"StepsAsObject", Model(R"("steps": {})"), {"@/steps: found an object, expected an array of steps"}},
    {"StepAsText", Steps(R"("Initial")"), {"@/steps/0: found 'Initial', expected an object"}},
    {"StepWithoutClass",
     Steps(R"({"name": "Initial"})"),
     {"@/steps/0/class: found nothing, expected the class of the step"}},
    {"StepWithoutName",
     Steps(R"({"class": "InitialStep"})"),
     {"@/steps/0/name: found nothing, expected the name of the step"}},
    {"StepNameEmpty",
     Steps(R"({"class": "InitialStep", "name": ""})"),
     {"@/steps/0/name: found an empty name, expected a name that can stand in a deck"}},
    {"StepNameTwice",
     Steps(R"({"class": "InitialStep", "name": "S"}, {"class": "InitialStep", "name": "S"})"),
     {"@/steps/1/name: found a second step named 'S', expected names that are unique"}},
    {"SecondInitialStep",
     Steps(R"({"class": "InitialStep", "name": "S"}, {"class": "InitialStep", "name": "T"})"),
     {"@/steps/1/class: found a second InitialStep, expected it in the first place alone"}},
    {"StepDescriptionAsLines",
     Steps(R"({"class": "InitialStep", "name": "S", "description": ["a"]})"),
     {"@/steps/0/description: found an array of 1 item, expected a string"}},
    {"StepInputAsNumber",
     Steps(R"({"class": "InitialStep", "name": "S", "solverInput": 1})"),
     {"@/steps/0/solverInput: found 1, expected a string or an array of strings"}},
};

} // namespace

TEST_P(RecordErrors, Record_WithSomethingWrong_TellsPlaceFoundAndExpected) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, RecordErrors, testing::ValuesIn(recordCases), FindingCaseName);

TEST(RecordErrors, Step_OfUnknownClass_IsToldOnceAndNotByItsStates) {
    const std::vector<std::string> findings =
        Findings(Model(R"("steps": [{"name": "Initial", "class": "InitalStep"}],
                          "adaptiveMeshConstraints": {"C": {"states": {"Initial": {}}}})"));
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_TRUE(findings[0].starts_with("@/steps/0/class: found 'InitalStep'; did you mean "
                                        "'InitialStep'? Expected one of "))
        << findings[0];
}
