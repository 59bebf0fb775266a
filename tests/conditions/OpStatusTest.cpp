#include "conditions/oif_OpStatus.h"

#include "conditions/ConditionTesting.h"
#include "conditions/oif_BCTable.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"
#include "store/PropagationRecords.h"

#include <chrono>

namespace {

using sample::Status;

/// A load whose class number can be any.
template <unsigned Number>
class AnyLoad final : public cls_RecordOf<AnyLoad<Number>, kloC_Load> {
public:
    static constexpr cls_ClassInfo Class{"AnyLoad", "a load of any class", Number};
    cls_Record* NewState(unsigned) const override { return new kloC_LoadState(); }
};
template <unsigned Number>
class AnyField final : public cls_RecordOf<AnyField<Number>, kpfC_Field> {
public:
    static constexpr cls_ClassInfo Class{"AnyField", "a field of any class", Number};
    cls_Record* NewState(unsigned) const override { return new kpfC_FieldState(); }
};
template <unsigned Number>
class AnyInteraction final : public cls_RecordOf<AnyInteraction<Number>, kinC_Interaction> {
public:
    static constexpr cls_ClassInfo Class{"AnyInteraction", "an interaction of any class", Number};
    cls_Record* NewState(unsigned) const override { return new kinC_InteractionState(); }
};
template <unsigned Number>
class AnyCondition final : public cls_RecordOf<AnyCondition<Number>, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"AnyCondition", "a condition of any class", Number};
    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};

constexpr unsigned kPressure = 0x2880008;
constexpr unsigned kForce = 0x2880047;
constexpr unsigned kBodyForce = 0x288001E;

/// `given` has one letter a step: "." nothing, "s" a state, "d" deactivated.
template <class T>
T Given(const char* given, bool suppressed = false) {
    T object;
    object.suppressed = suppressed;
    for (int i = 0; given[i] != '\0'; ++i) {
        if (given[i] != '.') object.Give(sample::StepName(i)).deactivated = given[i] == 'd';
    }
    return object;
}

/// The flags of a class over all steps: "0010".
std::string Flags(const oif_OpStatus& status, unsigned typeId, int steps) {
    std::string flags;
    for (int i = 0; i < steps; ++i) flags += status.OpNew(typeId, sample::StepName(i)) ? '1' : '0';
    return flags;
}

template <class T>
kprC_PropagatingContainer<T> Container(std::initializer_list<std::pair<const char*, const T*>> objects,
                                       const kprC_StepContainer& steps) {
    kprC_PropagatingContainer<T> container;
    for (const auto& [name, object] : objects) container.Insert(name, *object);
    container.Propagate(steps);
    return container;
}

oif_LoadOpStatus LoadStatus(std::initializer_list<std::pair<const char*, const kloC_Load*>> loads,
                            const char* kinds) {
    TestStore store;
    const kprC_StepContainer steps = sample::StepsOf(kinds);
    oif_LoadOpStatus status;
    status.Configure(Container<kloC_Load>(loads, steps), steps.Keys(), store.Info());
    return status;
}

oif_BCOpStatus ConditionStatus(const ConditionModel& model) {
    oif_BCOpStatus status;
    status.Configure(model.Store().boundaryConditions, model.Store().loads, model.StepNames());
    return status;
}

} // namespace

TEST(ObjectsOfSteps, EachStep_HasThoseThatPassTheTestInTheOrderOfTheirNames) {
    const auto one = Given<AnyLoad<kPressure>>(".s.");
    const auto other = Given<AnyLoad<kPressure>>(".ss");
    const kprC_StepContainer steps = sample::StepsOf("IGG");
    const auto loads = Container<kloC_Load>({{"B", &one}, {"A", &other}, {"C", &other}}, steps);
    const oif_ObjectsOfSteps<kloC_Load> given(
        "load", loads, steps, LoadStatus({{"B", &one}, {"A", &other}, {"C", &other}}, "IGG"),
        [](const kloC_Load& load, const cow_String& step, bool) { return load.HasStep(step); });
    const auto names = [&](int step) {
        std::string text;
        for (const auto* entry : given.In(step)) {
            EXPECT_EQ(&entry->object, &loads.ConstGet(entry->name));
            text += entry->name.View();
        }
        return text;
    };
    EXPECT_EQ(names(0), "");
    EXPECT_EQ(names(1), "ABC");
    EXPECT_EQ(names(2), "AC");
}

TEST(ObjectsOfSteps, Test_RunsInTheContextOfStepAndObject) {
    const auto load = Given<AnyLoad<kPressure>>(".s");
    const kprC_StepContainer steps = sample::StepsOf("IG");
    const auto loads = Container<kloC_Load>({{"L", &load}}, steps);
    atr_String context;
    const auto test = [&](const kloC_Load&, const cow_String& step, bool) -> bool {
        if (step == "S1") context = nex_Context::Text();
        return false;
    };
    oif_ObjectsOfSteps<kloC_Load>("load", loads, steps, LoadStatus({{"L", &load}}, "IG"), test);
    EXPECT_EQ(context.View(), "step 'S1', load 'L'");
}

// The steps in which nothing changes are asked for once for all that agree in op=NEW and load cases.
TEST(WrittenSteps, AreThoseOfAWalkOverAllSteps) {
    const auto carried = Given<AnyLoad<kPressure>>(".s........");
    const auto changed = Given<AnyLoad<kPressure>>("..s..sd...");
    const auto ends = Given<AnyLoad<kPressure>>(".s..d.....");
    const auto force = Given<AnyLoad<kBodyForce>>("...s.....s");
    const char* kinds = "IGGPGGGPGG";
    const kprC_StepContainer steps = sample::StepsOf(kinds);
    const oif_LoadOpStatus status =
        LoadStatus({{"Carried", &carried}, {"Changed", &changed}, {"Ends", &ends}, {"Force", &force}}, kinds);
    const auto loads = Container<kloC_Load>(
        {{"Carried", &carried}, {"Changed", &changed}, {"Ends", &ends}, {"Force", &force}}, steps);
    oif_WrittenSteps written(steps, status);
    for (const auto& [name, load] : loads) {
        int asked = 0;
        const auto test = [&](const kloC_Load& each, const cow_String& step, bool) {
            ++asked;
            return status.Writes(each, step);
        };
        std::vector<int> expected;
        for (int i = 0; i < steps.Size(); ++i) {
            if (status.Writes(load, steps.NameAt(i))) expected.push_back(i);
        }
        EXPECT_EQ(written.Of("load", name, load, test), expected) << name.View();
        EXPECT_LE(asked, 12) << name.View();
    }
}

TEST(OpStatus, LoadThatEnds_SetsItsFamilysFlagInThatStepOnly) {
    const auto ends = Given<AnyLoad<kPressure>>(".s.d.");
    const auto stays = Given<AnyLoad<kBodyForce>>(".s...");
    const oif_LoadOpStatus status = LoadStatus({{"Ends", &ends}, {"Stays", &stays}}, "IGGGG");
    EXPECT_EQ(Flags(status, kPressure, 5), "00010");
    EXPECT_EQ(Flags(status, 0x2880055, 5), "00010") << "tractions are of the pressure's family";
    EXPECT_EQ(Flags(status, kBodyForce, 5), "00000");
}

TEST(OpStatus, NeighbourOfALoadThatEnds_IsWrittenAnew) {
    auto ends = Given<AnyLoad<kForce>>(".sd.");
    auto carried = Given<AnyLoad<kForce>>(".s..");
    TestStore store;
    const kprC_StepContainer steps = sample::StepsOf("IGGG");
    const auto loads = Container<kloC_Load>({{"Ends", &ends}}, steps);
    oif_LoadOpStatus status;
    status.Configure(loads, steps.Keys(), store.Info());
    carried.Propagate(steps);
    EXPECT_TRUE(status.Writes(carried, "S1"));
    EXPECT_TRUE(status.Writes(carried, "S2"));
    EXPECT_FALSE(status.Writes(carried, "S3"));
}

TEST(OpStatus, TwoLoadsOfAFamilyOnOneRegion_AreWrittenAnewInEveryAnalysisStep) {
    const auto one = Given<AnyLoad<kBodyForce>>(".s...");
    const auto two = Given<AnyLoad<0x2880020>>("...s.");
    // Two regions without a value share the empty name.
    EXPECT_EQ(Flags(LoadStatus({{"One", &one}, {"Two", &two}}, "IGGGG"), kBodyForce, 5), "01111");
}

TEST(OpStatus, LoadsOfOtherFamiliesOnOneRegion_LeaveTheFlagsAlone) {
    const auto one = Given<AnyLoad<kBodyForce>>(".s...");
    const auto two = Given<AnyLoad<kForce>>(".s...");
    const oif_LoadOpStatus status = LoadStatus({{"One", &one}, {"Two", &two}}, "IGGGG");
    EXPECT_EQ(Flags(status, kBodyForce, 5), "00000");
    EXPECT_EQ(Flags(status, kForce, 5), "00000");
}

TEST(OpStatus, LoadsOfAFamilyOnTwoRegions_LeaveTheFlagsAlone) {
    ConditionModel model("IGG", R"("loads": {
        "B1": {"class": "kloC_BoltLoad", "region": "A.F", "states": {"S1": {}}},
        "B2": {"class": "kloC_BoltLoad", "region": "A.N", "states": {"S1": {}}}})");
    oif_LoadOpStatus status;
    status.Configure(model.Store().loads, model.StepNames(), model.Info());
    EXPECT_EQ(Flags(status, kForce, 3), "000");
}

TEST(OpStatus, SuppressedLoad_NeitherEndsNorOverlaps) {
    const auto one = Given<AnyLoad<kBodyForce>>(".s...");
    const auto two = Given<AnyLoad<kBodyForce>>(".s.d.", true);
    EXPECT_EQ(Flags(LoadStatus({{"One", &one}, {"Two", &two}}, "IGGGG"), kBodyForce, 5), "00000");
}

TEST(OpStatus, InitialStepAlone_SetsNoFlag) {
    const auto one = Given<AnyLoad<kBodyForce>>("s");
    const auto two = Given<AnyLoad<kBodyForce>>("s");
    EXPECT_EQ(Flags(LoadStatus({{"One", &one}, {"Two", &two}}, "I"), kBodyForce, 1), "0");
}

TEST(OpStatus, BoltThatChangesItsMethod_SetsTheFlagOfConcentratedLoads) {
    ConditionModel model("IGGGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
        "S1": {"boltMethod": 0, "magnitude": 10}, "S2": {"magnitude": 20}, "S3": {"boltMethod": 2},
        "S4": {"deactivated": true}}}})");
    oif_LoadOpStatus status;
    status.Configure(model.Store().loads, model.StepNames(), model.Info());
    EXPECT_EQ(Flags(status, kForce, 5), "00011");
    // By a force it is a load; a new method is told once; then it is none.
    std::string writes;
    for (int i = 0; i < 5; ++i) writes += status.Writes(model.Bolt("B"), sample::StepName(i)) ? '1' : '0';
    EXPECT_EQ(writes, "01110");
}

TEST(OpStatus, BoltAmongBoundaryConditions_SetsTheFlagWhenItsMethodChangesOrItsLengthIsLetGo) {
    ConditionModel model("IGGFGG", R"("loads": {
        "B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
            "S1": {"boltMethod": 0}, "S2": {"boltMethod": 1}, "S5": {"deactivated": true}}}})");
    EXPECT_EQ(Flags(ConditionStatus(model), kloC_BoltLoad::TypeId(), 6), "001001");

    ConditionModel byForce("IGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
        "S1": {"boltMethod": 0}, "S2": {"deactivated": true}}}})");
    EXPECT_EQ(Flags(ConditionStatus(byForce), kloC_BoltLoad::TypeId(), 3), "000");

    ConditionModel suppressed("IGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "suppressed": true,
        "region": "A.F", "states": {"S1": {"boltMethod": 1}, "S2": {"deactivated": true}}}})");
    EXPECT_EQ(Flags(ConditionStatus(suppressed), kloC_BoltLoad::TypeId(), 3), "000");
}

TEST(OpStatus, BoltWithoutAStateInAStep_ReadsAsOneOfAnUnchangedForce) {
    ConditionModel model("IGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F",
        "states": {"S1": {"status": 5}, "S2": {"status": 0}}}})");
    EXPECT_EQ(Flags(ConditionStatus(model), kloC_BoltLoad::TypeId(), 3), "000");
    // The user's own state counts under any status but 1 and 8.
    ConditionModel given("IGGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
        "S1": {"status": 5, "boltMethod": 1}, "S2": {"status": 1, "boltMethod": 1},
        "S3": {"status": 8, "boltMethod": 1}}}})");
    EXPECT_EQ(Flags(ConditionStatus(given), kloC_BoltLoad::TypeId(), 4), "0100");
}

TEST(OpStatus, BoundaryConditionThatEndsOrFreesAComponent_SetsTheFlag) {
    ConditionModel model("IGGLLG", R"("boundaryConditions": {
        "Ends": {"class": "kbcC_DisplacementBC", "region": "A.N",
                 "states": {"S0": {"u1": 0}, "S1": {"deactivated": true}}},
        "Frees": {"class": "kbcC_DisplacementBC", "region": "A.N2",
                  "states": {"S0": {"u1": 0, "u2": 0}, "S3": {"deactivated": true}, "S4": {"u2": null}}}})");
    EXPECT_EQ(Flags(ConditionStatus(model), 0x2980010, 6), "010110");
    EXPECT_EQ(Flags(ConditionStatus(model), 0x2980024, 6), "000000") << "connectors are another family";
}

TEST(OpStatus, BoundaryConditionThatChangesItsValuesOnly_LeavesTheFlagClear) {
    ConditionModel model("IGG", R"("boundaryConditions": {"B": {"class": "kbcC_DisplacementBC",
        "region": "A.N", "states": {"S0": {"u1": 0}, "S1": {"u1": 1}, "S2": {"u2": 1, "amplitude": "Ramp"}}}})");
    EXPECT_EQ(Flags(ConditionStatus(model), 0x2980005, 3), "000");
}

TEST(OpStatus, SuppressedBoundaryCondition_LeavesTheFlagClear) {
    ConditionModel model("IG", R"("boundaryConditions": {"B": {"class": "kbcC_DisplacementBC",
        "suppressed": true, "states": {"S0": {"u1": 0}, "S1": {"deactivated": true}}}})");
    EXPECT_EQ(Flags(ConditionStatus(model), 0x2980005, 2), "00");
}

TEST(OpStatus, ForceOpNew_SetsAllFamiliesAndPassesOverStepsThatAreNotThere) {
    ConditionModel model("IGG", "");
    oif_BCOpStatus status = ConditionStatus(model);
    status.ForceOpNew(2);
    status.ForceOpNew(3);
    EXPECT_EQ(Flags(status, 0x2980005, 3), "001");
    EXPECT_EQ(Flags(status, 0x2980028, 3), "001");
}

TEST(OpStatus, BucklingStep_IsOpNewForBothFamiliesOfBoundaryConditions) {
    ConditionModel model("IGBLB", "");
    const oif_BCOpStatus status = oif_BoundaryConditionBuilder::OpStatusOf(
        model.Store().boundaryConditions, model.Store().loads, model.Store().steps);
    EXPECT_EQ(Flags(status, 0x2980005, 5), "00101");
    EXPECT_EQ(Flags(status, 0x2980024, 5), "00101");
}

TEST(OpStatus, FieldThatIsReset_SetsItsFlagEvenWhenItIsSuppressed) {
    const auto temperature = Given<AnyField<0x2EC0008>>("s.d.");
    const auto stress = Given<AnyField<0x2EC000A>>("sd..", true);
    const auto velocity = Given<AnyField<0x2EC0016>>("s...");
    const kprC_StepContainer steps = sample::StepsOf("IGGG");
    oif_FieldOpStatus status;
    status.Configure(Container<kpfC_Field>({{"T", &temperature}, {"S", &stress}, {"V", &velocity}}, steps),
                     steps.Keys());
    EXPECT_EQ(Flags(status, 0x2EC0008, 4), "0010");
    EXPECT_EQ(Flags(status, 0x2EC000A, 4), "0100");
    EXPECT_EQ(Flags(status, 0x2EC0016, 4), "0000");
}

TEST(OpStatus, GeneralField_IsWrittenAlsoWhereItIsCarriedAndOthersOnlyWithTheFlag) {
    auto general = Given<AnyField<0x2EC0015>>("s.d..");
    auto temperature = Given<AnyField<0x2EC0008>>("s....");
    auto suppressed = Given<AnyField<0x2EC0015>>("s....", true);
    auto reset = Given<AnyField<0x2EC0008>>("..sd.");
    const kprC_StepContainer steps = sample::StepsOf("IGGGG");
    oif_FieldOpStatus status;
    status.Configure(Container<kpfC_Field>({{"R", &reset}}, steps), steps.Keys());
    const auto writes = [&](kpfC_Field& field) {
        field.Propagate(steps);
        std::string text;
        for (const auto& [name, step] : steps) text += status.Writes(field, name) ? '1' : '0';
        return text;
    };
    EXPECT_EQ(writes(general), "11100");
    EXPECT_EQ(writes(temperature), "10010");
    EXPECT_EQ(writes(reset), "00110");
    EXPECT_EQ(writes(suppressed), "00000");
}

TEST(OpStatus, InteractionThatEnds_SetsItsFlagIfItsClassHasAFamily) {
    const auto film = Given<AnyInteraction<0x2A0001F>>("s.d.");
    const auto radiation = Given<AnyInteraction<0x2A00023>>("s..d", true);
    const auto other = Given<AnyInteraction<0x2A00012>>("sd..");
    const kprC_StepContainer steps = sample::StepsOf("IGGG");
    oif_InteractionOpStatus status;
    status.Configure(Container<kinC_Interaction>({{"F", &film}, {"O", &other}, {"R", &radiation}}, steps),
                     steps.Keys());
    EXPECT_EQ(Flags(status, 0x2A0001F, 4), "0010");
    EXPECT_EQ(Flags(status, 0x2A00023, 4), "0001") << "suppressed ones count too";
    EXPECT_EQ(Flags(status, 0x2A00033, 4), "0000");
    EXPECT_EQ(Flags(status, 0x2A00070, 4), "0000");
}

TEST(OpStatus, ClassWithoutAFamily_FailsInTheWordsOfItsStatus) {
    const kprC_StepContainer steps = sample::StepsOf("IG");
    TestStore store;
    oif_BCOpStatus conditions;
    conditions.Configure({}, {}, steps.Keys());
    EXPECT_EQ(Raised([&] { conditions.OpNew(1, "S1"); }), "Unimplemented bc->statusKey conversion");
    oif_LoadOpStatus loads;
    loads.Configure({}, steps.Keys(), store.Info());
    EXPECT_EQ(Raised([&] { loads.OpNew(0x288005C, "S1"); }), "Unimplemented load->statusKey conversion");
    EXPECT_FALSE(loads.OpNew(0x2880012, "S1")) << "a family that no keyword is of";
    oif_FieldOpStatus fields;
    fields.Configure({}, steps.Keys());
    EXPECT_EQ(Raised([&] { fields.OpNew(1, "S1"); }), "Unimplemented field->statusKey conversion");
    oif_InteractionOpStatus interactions;
    interactions.Configure({}, steps.Keys());
    EXPECT_EQ(Raised([&] { interactions.OpNew(0x2A00034, "S1"); }),
              "\"Unimplemented interaction->statusKey conversion\" == 0");
}

TEST(OpStatus, SubmodelStressLoad_FailsWhenOverlapsAreLookedForUnlessItIsSuppressed) {
    const auto load = Given<AnyLoad<0x288005C>>(".s");
    const auto suppressed = Given<AnyLoad<0x288005C>>(".s", true);
    EXPECT_EQ(Raised([&] { LoadStatus({{"L", &load}}, "IG"); }), "Unimplemented load->statusKey conversion");
    EXPECT_EQ(Raised([&] { LoadStatus({{"L", &suppressed}}, "IG"); }), "nothing raised");
}

TEST(OpStatus, UnknownStep_FailsAsAListDoes) {
    oif_FieldOpStatus status;
    status.Configure({}, sample::StepsOf("IG").Keys());
    EXPECT_EQ(Raised([&] { status.OpNew(0x2EC0008, "no step"); }),
              "cow_List: index -1 is out of range, expected 0 to 1");
}

TEST(OpStatus, Copy_KeepsTheFlags) {
    ConditionModel model("IGG", "");
    oif_BCOpStatus status = ConditionStatus(model);
    status.ForceOpNew(1);
    const oif_BCOpStatus copy(status);
    status.ForceOpNew(2);
    EXPECT_EQ(Flags(copy, 0x2980005, 3), "010");
}

TEST(OpStatus, EndOfAnObject_FlagsTheClassesOfItsRowsFamilyAndNoOther) {
    const kprC_StepContainer steps = sample::StepsOf("IGG");
    // For each class of the rows, the status with one object of the class that ends.
    const auto expect = [&](auto rows, const auto& statusOf) {
        for (const auto& row : rows) {
            const std::unique_ptr<cls_Record> record(cls_Classes().Find(row.typeId)->create());
            auto& object = static_cast<kprC_PropagatingObject&>(*record);
            object.Give("S1");
            object.Give("S2").deactivated = true;
            object.Propagate(steps);
            const auto status = statusOf(object);
            for (const auto& other : rows) {
                EXPECT_EQ(status.OpNew(other.typeId, "S2"), other.family == row.family)
                    << row.label << ", " << other.label;
                EXPECT_FALSE(status.OpNew(other.typeId, "S1")) << row.label << ", " << other.label;
            }
        }
    };
    expect(oif_BCRows(), [&](const kprC_PropagatingObject& bc) {
        oif_BCOpStatus status;
        status.Configure(Container<kbcC_BC>({{"B", static_cast<const kbcC_BC*>(&bc)}}, steps), {},
                         steps.Keys());
        return status;
    });
    expect(oif_LoadRows(), [&](const kprC_PropagatingObject& load) {
        return LoadStatus({{"L", static_cast<const kloC_Load*>(&load)}}, "IGG");
    });
    expect(oif_FieldRows(), [&](const kprC_PropagatingObject& field) {
        oif_FieldOpStatus status;
        status.Configure(Container<kpfC_Field>({{"F", static_cast<const kpfC_Field*>(&field)}}, steps),
                         steps.Keys());
        return status;
    });
}

TEST(OpStatus, EveryClassOfItsTable_HasAFamily) {
    ConditionModel model("IG", "");
    const oif_BCOpStatus conditions = ConditionStatus(model);
    for (const unsigned id : {0x2880024U, 0x2980005U, 0x2980007U, 0x2980009U, 0x298000CU, 0x298000EU,
                              0x2980010U, 0x2980014U, 0x2980016U, 0x2980018U, 0x298001AU, 0x298001CU,
                              0x2980022U, 0x2980031U, 0x2980024U, 0x2980026U, 0x2980028U}) {
        EXPECT_FALSE(conditions.OpNew(id, "S1")) << id;
    }
}

TEST(OpStatus, BoltThatIsLetGo_FlagsTheBoundariesAndNotTheConnectors) {
    ConditionModel model("IGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
        "S1": {"boltMethod": 1}, "S2": {"deactivated": true}}}})");
    const oif_BCOpStatus status = ConditionStatus(model);
    for (const oif_BCRow& row : oif_BCRows()) {
        EXPECT_EQ(Flags(status, row.typeId, 3), row.family == oif_BCFamily::BOUNDARY ? "001" : "000")
            << row.label;
    }
}

TEST(OpStatus, PlacesOfAStep_AreItsLoadCasesOrItself) {
    ConditionModel model(R"(IGL{"loadCases": {
            "a": {"bcs": {"B": 0.5}, "loads": {"L": 2}, "baseStateBCs": false},
            "b": {"loadsAreStepLoads": true}, "c": {"baseStateBCs": false}}}L{"loadCases": {
            "d": {"loadsAreStepLoads": true}}})",
                         R"("loads": {"L": {"class": "kloC_BoltLoad", "region": "A.F"}},
        "boundaryConditions": {"B": {"class": "kbcC_DisplacementBC", "region": "A.N"}})");
    const auto shown = [](const oif_ConditionPlaces& places) {
        std::ostringstream text;
        for (const auto& [loadCase, scale] : places) text << "[" << loadCase.CStr() << " " << scale << "]";
        return text.str();
    };
    const auto& steps = model.Store().steps;
    EXPECT_EQ(shown(oif_BCOpStatus::Places(steps.StepAt(0), "B", Status::CREATED)), "[ 1]");
    EXPECT_EQ(shown(oif_BCOpStatus::Places(steps.StepAt(1), "B", Status::CREATED)), "[ 1]");
    EXPECT_EQ(shown(oif_BCOpStatus::Places(steps.StepAt(2), "B", Status::CREATED)), "[a 0.5]");
    EXPECT_EQ(shown(oif_BCOpStatus::Places(steps.StepAt(2), "B", Status::PROPAGATED_FROM_BASE_STATE)),
              "[a 0.5][b 1]");
    EXPECT_EQ(shown(oif_BCOpStatus::Places(steps.StepAt(2), "C", Status::MODIFIED_FROM_BASE_STATE)), "[b 1]");
    EXPECT_EQ(shown(oif_LoadOpStatus::Places(steps.StepAt(2), "L")), "[a 2]");
    EXPECT_EQ(shown(oif_LoadOpStatus::Places(steps.StepAt(2), "M")), "");
    EXPECT_EQ(shown(oif_LoadOpStatus::Places(steps.StepAt(3), "L")), "[ 1]");
    EXPECT_EQ(shown(oif_FieldOpStatus::Places(steps.StepAt(1), "T")), "[ 1]");
    EXPECT_EQ(shown(oif_FieldOpStatus::Places(steps.StepAt(3), "T")), "");
}

TEST(OpStatus, TenThousandLoadsInAHundredSteps_TakeNoSquareOfTheirNumber) {
    TestStore store;
    kprC_StepContainer steps = sample::StepsOf(std::string(1, 'I').append(99, 'G').c_str());
    kprC_PropagatingContainer<kloC_Load> loads;
    for (int i = 0; i < 10000; ++i) {
        auto load = Given<AnyLoad<kPressure>>(".s");
        loads.Insert(cow_String("L") + cow_String(i), load);
    }
    loads.Propagate(steps);
    const auto start = std::chrono::steady_clock::now();
    oif_LoadOpStatus status;
    status.Configure(loads, steps.Keys(), store.Info());
    int written = 0;
    for (const auto& [loadName, load] : loads) {
        for (const auto& [stepName, step] : steps) written += status.Writes(load, stepName) ? 1 : 0;
    }
    EXPECT_EQ(written, 10000 * 99);
    // Seconds would show a walk over all loads or steps for each of them; a slow machine needs less.
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
}
