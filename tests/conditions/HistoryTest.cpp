#include "conditions/ConditionTesting.h"
#include "store/PropagationRecords.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <cstdio>

namespace {

/// One object in steps S0, S1, ...: what the user gave, and what comes out of it.
struct History {
    const char* name;
    const char* steps;     ///< I initial, G general, F frequency and B buckling: perturbations
    const char* container; ///< of the model file
    const char* object;    ///< class and states
    std::vector<int> statuses;
    /// For an attribute "state value" step by step, for a plain field its value; "-" where there is no state.
    std::vector<std::pair<const char*, const char*>> fields;
    /// Of a boundary condition, for steps of status 3 and 10.
    const char* needsOpNew = "";
};

std::string ValueText(const cls_FieldType& type, const void* value) {
    switch (type.Kind()) {
    case cls_FieldKind::Bool: return *static_cast<const bool*>(value) ? "true" : "false";
    case cls_FieldKind::Int: return std::to_string(*static_cast<const int*>(value));
    case cls_FieldKind::Enum: return std::to_string(static_cast<const cls_EnumType&>(type).Get(value));
    case cls_FieldKind::String: return "'" + std::string(static_cast<const cow_String*>(value)->View()) + "'";
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        return std::to_string(attribute.State(value)) + " " +
               ValueText(attribute.ValueType(), attribute.Value(value));
    }
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        std::string text;
        for (int i = 0; i < list.Length(value); ++i) {
            text += (i > 0 ? " " : "") + ValueText(list.ItemType(), list.Item(value, i));
        }
        return "[" + text + "]";
    }
    default: {
        char text[32];
        std::snprintf(text, sizeof text, "%g", *static_cast<const double*>(value));
        return text;
    }
    }
}

template <class T>
void ExpectHistory(const T& object, const History& history, const kprC_StepContainer& steps) {
    EXPECT_EQ(sample::Statuses(object, steps), history.statuses);
    for (const auto& [name, expected] : history.fields) {
        std::string found;
        for (int i = 0; i < steps.Size(); ++i) {
            const auto& quad = object.ConstGetStateQuad(steps.NameAt(i));
            found += i > 0 ? ", " : "";
            if (!quad.hasState) {
                found += "-";
                continue;
            }
            const cls_Record& state = quad.state.ConstGet();
            const cls_Field* field = state.DynFields().Find(name);
            ASSERT_NE(field, nullptr) << name;
            found += ValueText(*field->type, field->In(state));
        }
        EXPECT_EQ(found, expected) << name;
    }
    if constexpr (std::is_same_v<T, kbcC_BC>) {
        std::string needs;
        for (int i = 0; i < steps.Size(); ++i) {
            const int status = history.statuses[static_cast<std::size_t>(i)];
            if (status != 3 && status != 10) continue;
            needs += object.ModifiedNeedsOpNew(steps.NameAt(i)) ? '1' : '0';
        }
        EXPECT_EQ(needs, history.needsOpNew);
    }
}

class ObjectOverSteps : public testing::TestWithParam<History> {
protected:
    static void SetUpTestSuite() {
        static const bool once = [] {
            cls_Classes().Add<sample::Temperature>();
            cls_Classes().Add<sample::TemperatureState>();
            return true;
        }();
        EXPECT_TRUE(once);
    }
};

TEST_P(ObjectOverSteps, IsWhatItsStatesMakeIt) {
    const History& history = GetParam();
    const std::string container = history.container;
    const ConditionModel model(history.steps, "\"" + container + R"(": {"O": {)" + history.object + "}}");
    const odiK_Model& store = model.Store();
    if (container == "boundaryConditions") {
        ExpectHistory(store.boundaryConditions.ConstGet("O"), history, store.steps);
    } else if (container == "loads") {
        ExpectHistory(store.loads.ConstGet("O"), history, store.steps);
    } else {
        ExpectHistory(store.fields.ConstGet("O"), history, store.steps);
    }
}

constexpr char kBCs[] = "boundaryConditions";
constexpr char kLoads[] = "loads";
constexpr char kFields[] = "fields";

INSTANTIATE_TEST_SUITE_P(
    History, ObjectOverSteps,
    testing::Values(
        // The steps of these: initial, general, perturbation, general, perturbation.
        History{"ConditionThatIsFreedInPart",
                "IGFGB",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 0, "u2": 0}, "S1": {"u2": 0.5},
                   "S3": {"u1": null}})",
                {1, 3, 9, 3, 9},
                {{"u1", "1 0, 2 0, 2 0, 3 0, 0 0"},
                 {"u2", "1 0, 1 0.5, 2 0, 2 0.5, 2 0"},
                 {"u3", "0 0, 0 0, 0 0, 0 0, 0 0"}},
                "01"},
        History{"ConditionThatEndsInAPerturbationStep",
                "IGFGB",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 0}, "S2": {"deactivated": true}})",
                {1, 2, 11, 2, 9},
                {{"u1", "1 0, 2 0, 2 0, 2 0, 2 0"}}},
        History{
            "ConditionThatIsChangedInABucklingStep",
            "IGFGB",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 0}, "S4": {"u1": 0.01, "buckleCase": 1}})",
            {1, 2, 9, 2, 10},
            {{"u1", "1 0, 2 0, 2 0, 2 0, 1 0.01"}, {"buckleCase", "0, 0, 0, 0, 1"}},
            "0"},
        History{
            "ForceThatEnds",
            "IGFGB",
            kLoads,
            R"("class": "kloC_BoltLoad", "states": {"S1": {"magnitude": 10, "amplitude": "Ramp"},
                   "S3": {"deactivated": true}})",
            {0, 1, 8, 4, 5},
            {{"magnitude", "-, 1 10, 2 10, 2 10, -"}, {"amplitude", "-, 1 'Ramp', 2 'Ramp', 2 'Ramp', -"}}},
        History{"ForceOfAPerturbationStep",
                "IGFGB",
                kLoads,
                R"("class": "kloC_BoltLoad", "states": {"S2": {"magnitude": 1}})",
                {0, 0, 1, 5, 5},
                {{"magnitude", "-, -, 1 1, -, -"}}},
        History{"ForceOfTwoPerturbationSteps",
                "IGFGB",
                kLoads,
                R"("class": "kloC_BoltLoad", "states": {"S2": {"magnitude": 1}, "S4": {"magnitude": 2}})",
                {0, 0, 1, 5, 1},
                {{"magnitude", "-, -, 1 1, -, 1 2"}}},
        History{"TemperatureThatIsReset",
                "IGFGB",
                kFields,
                R"("class": "sample_Temperature", "states": {"S0": {"values": [20]}, "S1": {"values": [100]},
                   "S3": {"deactivated": true}})",
                {1, 3, 8, 15, 5},
                {{"values", "[1 20], [1 100], [2 100], [2 100], -"}}},
        History{
            "BoltThatIsHeld",
            "IGFGB",
            kLoads,
            R"("class": "kloC_BoltLoad", "states": {"S1": {"boltMethod": "APPLY_FORCE", "magnitude": 1000},
                   "S3": {"boltMethod": "FIX_LENGTH"}})",
            {0, 1, 8, 3, 8},
            {{"boltMethod", "-, 1 0, 2 0, 1 2, 2 2"}, {"magnitude", "-, 1 1000, 2 1000, 2 1000, 2 1000"}}},
        History{"LoadThatEndsAndBeginsAgain",
                "IGGGG",
                kLoads,
                R"("class": "kloC_BoltLoad", "states": {"S1": {"magnitude": 1}, "S2": {"deactivated": true},
                   "S4": {"magnitude": 3}})",
                {0, 1, 4, 5, 1},
                {{"magnitude", "-, 1 1, 2 1, -, 1 3"}}},
        History{"AmplitudeThatIsCleared",
                "IGGG",
                kLoads,
                R"("class": "kloC_BoltLoad", "states": {"S1": {"magnitude": 1, "amplitude": "Ramp"},
                   "S2": {"amplitude": null}})",
                {0, 1, 3, 2},
                {{"amplitude", "-, 1 'Ramp', 3 '', 0 ''"}, {"magnitude", "-, 1 1, 2 1, 2 1"}}},

        // From each kind of step into each other, alive or not, with and without a state.
        History{
            "GeneralAfterGeneral",
            "IGGGGG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S1": {"u1": 1}, "S3": {"u2": 2}, "S4": {"deactivated": true}})",
            {0, 1, 2, 3, 4, 5},
            {{"u1", "-, 1 1, 2 1, 2 1, 2 1, -"}, {"u2", "-, 0 0, 0 0, 1 2, 2 2, -"}},
            "0"},
        History{
            "PerturbationAfterPerturbation",
            "IFFFFF",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S2": {"u2": 2}, "S3": {"deactivated": true},
                   "S5": {"u1": null}})",
            {1, 9, 10, 11, 9, 10},
            {{"u1", "1 1, 2 0, 2 0, 2 0, 2 0, 3 0"}, {"u2", "0 0, 0 0, 1 2, 0 0, 0 0, 0 0"}},
            "01"},
        History{"PerturbationsBeforeTheCreation",
                "IFBGFG",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S3": {"u1": 1}})",
                {0, 0, 0, 1, 9, 2},
                {{"u1", "-, -, -, 1 1, 2 0, 2 1"}}},
        History{
            "ConditionOfPerturbationStepsOnly",
            "IFBGFG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S1": {"u1": 1}, "S2": {"u2": 2}, "S4": {"u3": 3}})",
            {0, 1, 1, 5, 1, 5},
            {{"u1", "-, 1 1, 0 0, -, 0 0, -"}, {"u2", "-, 0 0, 1 2, -, 0 0, -"}}},
        History{
            "GeneralCreationAfterAPerturbationOne",
            "IFGFGF",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S1": {"u1": 1}, "S2": {"u2": 2}, "S4": {"deactivated": true}})",
            {0, 1, 1, 9, 4, 5},
            {{"u1", "-, 1 1, 0 0, 0 0, 0 0, -"}, {"u2", "-, 0 0, 1 2, 2 0, 2 2, -"}}},
        History{
            "EndedConditionInAPerturbationStep",
            "IGGFG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S1": {"deactivated": true}, "S3": {"u1": 2}})",
            {1, 4, 5, 1, 5},
            {{"u1", "1 1, 2 1, -, 1 2, -"}}},
        History{
            "LoadInEveryKindOfStep",
            "IFGBGF",
            kLoads,
            R"("class": "kloC_BoltLoad", "states": {"S0": {"magnitude": 1}, "S2": {"magnitude": 2}, "S4": {}})",
            {1, 8, 3, 8, 3, 8},
            {{"magnitude", "1 1, 2 1, 1 2, 2 2, 2 2, 2 2"}}},
        History{
            "FieldInEveryKindOfStep",
            "IFGBGG",
            kFields,
            R"("class": "sample_Temperature", "states": {"S0": {"values": [1, 2]}, "S2": {"values": null}, "S4": {"values": [3]},
                   "S5": {"deactivated": true, "values": [4]}})",
            {1, 8, 3, 8, 3, 15},
            {{"values", "[1 1 1 2], [2 1 2 2], [], [], [1 3], [1 4]"}}},

        // What belongs to the base state and what doesn't.
        History{
            "AmplitudeStaysBehindInTheBaseState",
            "IGFG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1, "u1Imag": 4, "amplitude": "Ramp"}})",
            {1, 2, 9, 2},
            {{"amplitude", "1 'Ramp', 2 'Ramp', 0 '', 2 'Ramp'"}, {"u1Imag", "4, 4, 0, 4"}}},
        History{"RatesStayBehindInTheBaseState",
                "IF",
                kBCs,
                R"("class": "kbcC_VelocityBC", "states": {"S0": {"v1": 1, "vr3": 2}})",
                {1, 9},
                {{"v1", "1 1, 2 0"}, {"vr3", "1 2, 2 0"}}},
        History{"AccelerationsOfConnectorsStayBehind",
                "IF",
                kBCs,
                R"("class": "kbcC_ConnAccelerationBC", "states": {"S0": {"a1": 1, "ar2": 2}})",
                {1, 9},
                {{"a1", "1 1, 2 0"}, {"ar2", "1 2, 2 0"}}},
        History{"MagnitudesStayBehindAndListsDoNot",
                "IF",
                kBCs,
                R"("class": "kbcC_TemperatureBC", "states": {"S0": {"magnitude": 9, "dofs": [11, 12]}})",
                {1, 9},
                {{"magnitude", "1 9, 2 0"}, {"dofs", "1 [11 12], 2 [11 12]"}}},
        History{
            "ComplexMagnitudesStayBehind",
            "IF",
            kBCs,
            R"("class": "kbcC_AcousticPressureBC", "states": {"S0": {"magnitude": 9, "imaginaryMagnitude": 8}})",
            {1, 9},
            {{"magnitude", "1 9, 2 0"}, {"imaginaryMagnitude", "8, 0"}}},
        History{
            "SupportsAreCarriedIntoTheBaseState",
            "IFF",
            kBCs,
            R"("class": "kbcC_TypeBC", "states": {"S0": {"typeName": "PINNED", "buckleCase": 2}, "S2": {"typeName": 7}})",
            {1, 9, 10},
            {{"typeName", "1 6, 2 6, 1 7"}, {"buckleCase", "2, 2, 2"}},
            "1"},
        History{
            "SubmodelsAreCarriedIntoTheBaseState",
            "IFG",
            kBCs,
            R"("class": "kbcC_SubmodelBC", "states": {"S0": {"dofs": [1], "stepName": "2", "centerZone": true,
                   "shellThicknessValue": 3, "increment": 4, "timeScale": true}})",
            {1, 9, 2},
            {{"dofs", "1 [1], 2 [1], 2 [1]"},
             {"centerZone", "1 true, 2 true, 2 true"},
             {"shellThicknessValue", "1 3, 2 3, 2 3"},
             {"stepName", "'2', '2', '2'"},
             {"increment", "4, 4, 4"},
             {"timeScale", "true, true, true"}}},
        History{"LoadsCarryEverythingIntoTheBaseState",
                "IGF",
                kLoads,
                R"("class": "kloC_BoltLoad", "states": {"S1": {"magnitude": 5, "amplitude": "Ramp"}})",
                {0, 1, 8},
                {{"magnitude", "-, 1 5, 2 5"}, {"amplitude", "-, 1 'Ramp', 2 'Ramp'"}}},
        History{"ClearedAttributeInThePerturbationStepOnly",
                "IGFG",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S2": {"u1": null}})",
                {1, 2, 10, 2},
                {{"u1", "1 1, 2 1, 3 0, 2 1"}},
                "1"},
        History{
            "ValuesOfTheStepOfTheEnd",
            "IG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S1": {"deactivated": true, "u2": 3}})",
            {1, 4},
            {{"u1", "1 1, 2 1"}, {"u2", "0 0, 1 3"}}},
        History{"EmptyStates",
                "IGG",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S0": {}, "S1": {}})",
                {1, 3, 2},
                {{"u1", "0 0, 0 0, 0 0"}},
                "0"},

        // Statuses and attributes given as they stand.
        History{
            "StatusOverridesEveryRule",
            "IGFGG",
            kLoads,
            R"("class": "kloC_BoltLoad", "states": {"S1": {"magnitude": 1}, "S2": {"status": 3, "magnitude": 2},
                   "S3": {"status": "NOT_APPLICABLE"}})",
            {0, 1, 3, 13, 2},
            {{"magnitude", "-, 1 1, 1 2, 0 0, 2 1"}}},
        History{
            "CreatedByStatus",
            "IGGG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S1": {"status": 2, "u1": 1}, "S3": {"status": "CREATED", "u2": 2}})",
            {0, 2, 2, 1},
            {{"u1", "-, 1 1, 2 1, 0 0"}, {"u2", "-, 0 0, 0 0, 1 2"}}},
        History{"EndedByStatus",
                "IGGG",
                kBCs,
                R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S2": {"status": 4}})",
                {1, 2, 4, 5},
                {{"u1", "1 1, 2 1, 2 1, -"}}},
        History{
            "PerturbationStatusOfAGeneralStep",
            "IGGG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": 1}, "S1": {"status": 9}, "S2": {"status": 11}})",
            {1, 9, 11, 2},
            {{"u1", "1 1, 2 1, 2 1, 2 1"}}},
        History{
            "FieldPropagatedByStatus",
            "IGGG",
            kFields,
            R"("class": "sample_Temperature", "states": {"S0": {"values": [1]}, "S1": {"status": 14}, "S2": {"status": 5}})",
            {1, 14, 5, 5},
            {{"values", "[1 1], [2 1], [], -"}}},
        History{
            "AttributeAsItStands",
            "IGG",
            kBCs,
            R"("class": "kbcC_DisplacementBC", "states": {"S0": {"u1": {"value": 5, "state": 2}, "u2": {"value": 6, "state": 3},
                   "u3": {"value": 7, "state": 0}}, "S1": {"u1": {"state": 1}}, "S2": {"u1": {"state": 3}}})",
            {1, 3, 3},
            {{"u1", "2 5, 1 5, 3 0"}, {"u2", "3 6, 0 0, 0 0"}, {"u3", "0 7, 0 0, 0 0"}},
            "01"}),
    [](const auto& test) { return std::string(test.param.name); });

} // namespace
