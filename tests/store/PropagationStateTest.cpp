#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

namespace {

using namespace sample;

/// State and value of an attribute.
template <class T>
void ExpectAttribute(const mdl_PropAttr<T>& attribute, State state, const T& value) {
    EXPECT_EQ(attribute.State(), state);
    EXPECT_EQ(attribute.ConstGet(), value);
}

const ConditionState& In(const Condition& condition, const char* step) {
    return StateIn<ConditionState>(condition, step);
}
const ForceState& In(const Force& force, const char* step) {
    return StateIn<ForceState>(force, step);
}

TEST(PropagationState, ConditionThatIsChangedAndFreed_KeepsItsBaseBesidePerturbationSteps) {
    Condition condition;
    Give<ConditionState>(condition, "Initial").Set<&ConditionState::u1>(0.0).Set<&ConditionState::u2>(0.0);
    Give<ConditionState>(condition, "Load").Set<&ConditionState::u2>(0.5);
    Give<ConditionState>(condition, "Unload").Clear<&ConditionState::u1>();
    EXPECT_TRUE(condition.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(condition, LoadFreqUnloadBuckle()), (Ints{1, 3, 9, 3, 9}));

    ExpectAttribute(In(condition, "Initial").u1, State::SET, 0.0);
    ExpectAttribute(In(condition, "Load").u1, State::CARRIED, 0.0);
    ExpectAttribute(In(condition, "Freq").u1, State::CARRIED, 0.0);
    ExpectAttribute(In(condition, "Unload").u1, State::CLEARED, 0.0);
    ExpectAttribute(In(condition, "Buckle").u1, State::NEVER_SET, 0.0);

    ExpectAttribute(In(condition, "Initial").u2, State::SET, 0.0);
    ExpectAttribute(In(condition, "Load").u2, State::SET, 0.5);
    ExpectAttribute(In(condition, "Freq").u2, State::CARRIED, 0.0);
    ExpectAttribute(In(condition, "Unload").u2, State::CARRIED, 0.5);
    ExpectAttribute(In(condition, "Buckle").u2, State::CARRIED, 0.0);

    for (const char* step : {"Initial", "Load", "Freq", "Unload", "Buckle"}) {
        ExpectAttribute(In(condition, step).u3, State::NEVER_SET, 0.0);
    }
}

TEST(PropagationState, ConditionEndedInAPerturbationStep_IsBackInTheNextGeneralStep) {
    Condition condition;
    Give<ConditionState>(condition, "Initial").Set<&ConditionState::u1>(2.0);
    Give<ConditionState>(condition, "Freq").Deactivate();
    EXPECT_TRUE(condition.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(condition, LoadFreqUnloadBuckle()), (Ints{1, 2, 11, 2, 9}));
    ExpectAttribute(In(condition, "Freq").u1, State::CARRIED, 0.0);
    ExpectAttribute(In(condition, "Unload").u1, State::CARRIED, 2.0);
}

TEST(PropagationState, ConditionChangedInABucklingStep_HasItsOwnValueThere) {
    Condition condition;
    Give<ConditionState>(condition, "Initial").Set<&ConditionState::u1>(0.0);
    Give<ConditionState>(condition, "Buckle")
        .Set<&ConditionState::u1>(0.01)
        .Set<&ConditionState::buckleCase>(1);
    EXPECT_TRUE(condition.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(condition, LoadFreqUnloadBuckle()), (Ints{1, 2, 9, 2, 10}));
    ExpectAttribute(In(condition, "Initial").u1, State::SET, 0.0);
    for (const char* step : {"Load", "Freq", "Unload"}) {
        ExpectAttribute(In(condition, step).u1, State::CARRIED, 0.0);
        EXPECT_EQ(In(condition, step).buckleCase, 0);
    }
    ExpectAttribute(In(condition, "Buckle").u1, State::SET, 0.01);
    EXPECT_EQ(In(condition, "Buckle").buckleCase, 1);
}

TEST(PropagationState, ForceEndedInALaterStep_KeepsItsValuesThere) {
    Force force;
    Give<ForceState>(force, "Load").Set<&ForceState::magnitude>(10.0).Set<&ForceState::amplitude>("A");
    Give<ForceState>(force, "Unload").Deactivate();
    EXPECT_TRUE(force.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(force, LoadFreqUnloadBuckle()), (Ints{0, 1, 8, 4, 5}));
    ExpectAttribute(In(force, "Load").magnitude, State::SET, 10.0);
    ExpectAttribute(In(force, "Freq").magnitude, State::CARRIED, 10.0);
    ExpectAttribute(In(force, "Unload").magnitude, State::CARRIED, 10.0);
    ExpectAttribute(In(force, "Freq").amplitude, State::CARRIED, cow_String("A"));
    EXPECT_FALSE(force.ConstGetStateQuad("Initial").hasState);
    EXPECT_FALSE(force.ConstGetStateQuad("Buckle").hasState);
}

TEST(PropagationState, ForceOfAFrequencyStep_LivesInThatStepOnly) {
    Force force;
    Give<ForceState>(force, "Freq").Set<&ForceState::magnitude>(1.0);
    EXPECT_TRUE(force.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(force, LoadFreqUnloadBuckle()), (Ints{0, 0, 1, 5, 5}));
    ExpectAttribute(In(force, "Freq").magnitude, State::SET, 1.0);
}

TEST(PropagationState, PressureOfTwoPerturbationSteps_IsCreatedInEach) {
    Force force;
    Give<ForceState>(force, "Freq").Set<&ForceState::magnitude>(1.0);
    Give<ForceState>(force, "Buckle").Set<&ForceState::note>("second");
    EXPECT_TRUE(force.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(force, LoadFreqUnloadBuckle()), (Ints{0, 0, 1, 5, 1}));
    ExpectAttribute(In(force, "Buckle").magnitude, State::NEVER_SET, 0.0);
    EXPECT_EQ(In(force, "Buckle").note, "second");
}

cow_List<mdl_PropAttr<double>> Values(std::initializer_list<double> numbers) {
    cow_List<mdl_PropAttr<double>> values;
    for (const double number : numbers) values.Append(mdl_PropAttr<double>(number));
    return values;
}

TEST(PropagationState, TemperatureThatEnds_IsResetWithItsLastValues) {
    Temperature temperature;
    using S = TemperatureState;
    Give<S>(temperature, "Initial").Set<&S::values>(Values({20.0}));
    Give<S>(temperature, "Load").Set<&S::values>(Values({100.0, 200.0}));
    Give<S>(temperature, "Unload").Deactivate();
    EXPECT_TRUE(temperature.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(temperature, LoadFreqUnloadBuckle()), (Ints{1, 3, 8, 15, 5}));
    EXPECT_EQ(StateIn<S>(temperature, "Initial").values.Length(), 1);
    const auto& loaded = StateIn<S>(temperature, "Load").values;
    ASSERT_EQ(loaded.Length(), 2);
    ExpectAttribute(loaded[1], State::SET, 200.0);
    for (const char* step : {"Freq", "Unload"}) {
        const auto& carried = StateIn<S>(temperature, step).values;
        ASSERT_EQ(carried.Length(), 2);
        ExpectAttribute(carried[0], State::CARRIED, 100.0);
        ExpectAttribute(carried[1], State::CARRIED, 200.0);
    }
}

TEST(PropagationState, BoltLoad_ChangesItsMethod) {
    Force bolt;
    Give<ForceState>(bolt, "Load")
        .Set<&ForceState::boltMethod>(BoltMethodEnm::APPLY_FORCE)
        .Set<&ForceState::magnitude>(1000.0);
    Give<ForceState>(bolt, "Unload").Set<&ForceState::boltMethod>(BoltMethodEnm::FIX_LENGTH);
    EXPECT_TRUE(bolt.Propagate(LoadFreqUnloadBuckle()).empty());
    EXPECT_EQ(Statuses(bolt, LoadFreqUnloadBuckle()), (Ints{0, 1, 8, 3, 8}));
    ExpectAttribute(In(bolt, "Load").boltMethod, State::SET, BoltMethodEnm::APPLY_FORCE);
    ExpectAttribute(In(bolt, "Freq").boltMethod, State::CARRIED, BoltMethodEnm::APPLY_FORCE);
    ExpectAttribute(In(bolt, "Unload").boltMethod, State::SET, BoltMethodEnm::FIX_LENGTH);
    ExpectAttribute(In(bolt, "Buckle").boltMethod, State::CARRIED, BoltMethodEnm::FIX_LENGTH);
    ExpectAttribute(In(bolt, "Buckle").magnitude, State::CARRIED, 1000.0);
}

TEST(PropagationState, PressureCreatedAnewAfterItsEnd_StartsFresh) {
    Force force;
    Give<ForceState>(force, "S1").Set<&ForceState::magnitude>(1.0).Set<&ForceState::amplitude>("A");
    Give<ForceState>(force, "S2").Deactivate();
    Give<ForceState>(force, "S4").Set<&ForceState::magnitude>(3.0);
    EXPECT_TRUE(force.Propagate(StepsOf("IGGGG")).empty());
    EXPECT_EQ(Statuses(force, StepsOf("IGGGG")), (Ints{0, 1, 4, 5, 1}));
    ExpectAttribute(In(force, "S1").magnitude, State::SET, 1.0);
    ExpectAttribute(In(force, "S2").magnitude, State::CARRIED, 1.0);
    ExpectAttribute(In(force, "S4").magnitude, State::SET, 3.0);
    ExpectAttribute(In(force, "S4").amplitude, State::NEVER_SET, cow_String());
}

TEST(PropagationState, ClearedAttribute_IsClearedOnceAndThenNeverSet) {
    Force force;
    Give<ForceState>(force, "S1").Set<&ForceState::magnitude>(1.0).Set<&ForceState::amplitude>("A");
    Give<ForceState>(force, "S2").Clear<&ForceState::amplitude>();
    EXPECT_TRUE(force.Propagate(StepsOf("IGGG")).empty());
    EXPECT_EQ(Statuses(force, StepsOf("IGGG")), (Ints{0, 1, 3, 2}));
    ExpectAttribute(In(force, "S1").amplitude, State::SET, cow_String("A"));
    ExpectAttribute(In(force, "S2").amplitude, State::CLEARED, cow_String());
    ExpectAttribute(In(force, "S3").amplitude, State::NEVER_SET, cow_String());
    ExpectAttribute(In(force, "S1").magnitude, State::SET, 1.0);
    ExpectAttribute(In(force, "S2").magnitude, State::CARRIED, 1.0);
    ExpectAttribute(In(force, "S3").magnitude, State::CARRIED, 1.0);
}

TEST(PropagationState, ClearedInTheStepOfCreation_IsClearedWithTheDefault) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(5.0).Clear<&ForceState::magnitude>();
    force.Propagate(StepsOf("IG"));
    ExpectAttribute(In(force, "S0").magnitude, State::CLEARED, 0.0);
    ExpectAttribute(In(force, "S1").magnitude, State::NEVER_SET, 0.0);
}

TEST(PropagationState, EmptyState_ModifiesWithoutAChangeOfValues) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(5.0);
    force.Give("S1");
    force.Propagate(StepsOf("IG"));
    EXPECT_EQ(force.Status("S1"), Status::MODIFIED);
    ExpectAttribute(In(force, "S1").magnitude, State::CARRIED, 5.0);
}

TEST(PropagationState, PlainField_IsCarriedGivenOrResetToItsDefault) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::note>("first");
    Give<ForceState>(force, "S2").Set<&ForceState::note>("second");
    Give<ForceState>(force, "S4").Clear<&ForceState::note>();
    force.Propagate(StepsOf("IGGPG"));
    const char* notes[] = {"first", "first", "second", "second", ""};
    for (int i = 0; i < 5; ++i) EXPECT_EQ(StateIn<ForceState>(force, StepName(i)).note, notes[i]) << i;
}

TEST(PropagationState, DeactivatedWithValues_LaysThemOverTheCarriedOnes) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(5.0).Set<&ForceState::amplitude>("A");
    Give<ForceState>(force, "S1").Set<&ForceState::magnitude>(6.0).Deactivate();
    EXPECT_TRUE(force.Propagate(StepsOf("IG")).empty());
    EXPECT_EQ(force.Status("S1"), Status::DEACTIVATED);
    ExpectAttribute(In(force, "S1").magnitude, State::SET, 6.0);
    ExpectAttribute(In(force, "S1").amplitude, State::CARRIED, cow_String("A"));
}

TEST(PropagationState, EveryStatusWithAState_IsFreshOrCarriedByItsRule) {
    const bool carried[16] = {false, false, true, true, true,  false, false, false,
                              true,  true,  true, true, false, false, true,  true};
    for (int number = 0; number < 16; ++number) {
        SCOPED_TRACE(number);
        Condition condition;
        Give<ConditionState>(condition, "S0").Set<&ConditionState::u1>(3.0).Clear<&ConditionState::u3>();
        Give<ConditionState>(condition, "S1")
            .Set<&ConditionState::u2>(4.0)
            .Status(static_cast<Status>(number));
        condition.Propagate(StepsOf("IG"));
        EXPECT_TRUE(condition.ConstGetStateQuad("S1").hasState);
        const ConditionState& state = In(condition, "S1");
        ExpectAttribute(state.u1, carried[number] ? State::CARRIED : State::NEVER_SET,
                        carried[number] ? 3.0 : 0.0);
        ExpectAttribute(state.u2, State::SET, 4.0);
        ExpectAttribute(state.u3, State::NEVER_SET, 0.0);
    }
}

TEST(PropagationState, StatusesOutsideTheLife_HaveNoStateWithoutAUsersOne) {
    Condition condition;
    Give<ConditionState>(condition, "S1").Set<&ConditionState::u1>(3.0);
    Give<ConditionState>(condition, "S2").Deactivate();
    condition.Propagate(StepsOf("IGGG"));
    EXPECT_FALSE(condition.ConstGetStateQuad("S0").hasState);
    EXPECT_TRUE(condition.ConstGetStateQuad("S2").hasState);
    EXPECT_FALSE(condition.ConstGetStateQuad("S3").hasState);
    ExpectAttribute(In(condition, "S3").u1, State::NEVER_SET, 0.0);
}

TEST(PropagationState, ConditionInThePerturbationStep_HoldsButDoesNotMove) {
    Condition condition;
    Give<ConditionState>(condition, "S0")
        .Set<&ConditionState::u1>(3.0)
        .Set<&ConditionState::amplitude>("A")
        .Set<&ConditionState::typeName>("PINNED")
        .Set<&ConditionState::buckleCase>(2)
        .Set<&ConditionState::u1Imag>(0.5);
    Give<ConditionState>(condition, "S2").Set<&ConditionState::u2>(7.0).Set<&ConditionState::amplitude>("B");
    condition.Propagate(StepsOf("IPBG"));
    EXPECT_EQ(Statuses(condition, StepsOf("IPBG")), (Ints{1, 9, 10, 2}));

    const ConditionState& carried = In(condition, "S1");
    ExpectAttribute(carried.u1, State::CARRIED, 0.0);
    ExpectAttribute(carried.amplitude, State::NEVER_SET, cow_String());
    ExpectAttribute(carried.typeName, State::CARRIED, cow_String("PINNED"));
    EXPECT_EQ(carried.buckleCase, 2);
    EXPECT_EQ(carried.u1Imag, 0.0);

    const ConditionState& changed = In(condition, "S2");
    ExpectAttribute(changed.u1, State::CARRIED, 0.0);
    ExpectAttribute(changed.u2, State::SET, 7.0);
    ExpectAttribute(changed.amplitude, State::SET, cow_String("B"));

    const ConditionState& after = In(condition, "S3");
    ExpectAttribute(after.u1, State::CARRIED, 3.0);
    ExpectAttribute(after.u2, State::NEVER_SET, 0.0);
    ExpectAttribute(after.amplitude, State::CARRIED, cow_String("A"));
    EXPECT_EQ(after.u1Imag, 0.5);
}

TEST(PropagationState, BuiltInObject_CarriesEverythingUnchanged) {
    Force force;
    Give<ForceState>(force, "S0")
        .Set<&ForceState::magnitude>(3.0)
        .Set<&ForceState::amplitude>("A")
        .Set<&ForceState::note>("n");
    force.Propagate(StepsOf("IP"));
    EXPECT_EQ(force.Status("S1"), Status::BUILT_INTO_BASE_STATE);
    ExpectAttribute(In(force, "S1").magnitude, State::CARRIED, 3.0);
    ExpectAttribute(In(force, "S1").amplitude, State::CARRIED, cow_String("A"));
    EXPECT_EQ(In(force, "S1").note, "n");
}

TEST(PropagationState, ValueAndStateAsTheyStand_FollowNoRule) {
    for (int number = 0; number < 4; ++number) {
        SCOPED_TRACE(number);
        const auto state = static_cast<State>(number);
        Force force;
        Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(3.0);
        GiveMarked(force, "S1", &ForceState::magnitude, "magnitude", mdl_PropAttr<double>(8.0, state),
                   Given::AS_IT_STANDS);
        force.Propagate(StepsOf("IGG"));
        ExpectAttribute(In(force, "S1").magnitude, state, 8.0);
        const bool active = number == 1 || number == 2;
        ExpectAttribute(In(force, "S2").magnitude, active ? State::CARRIED : State::NEVER_SET,
                        active ? 8.0 : 0.0);
    }
}

TEST(PropagationState, StateAlone_TakesTheDefaultOrTheCarriedValue) {
    for (int number = 0; number < 4; ++number) {
        SCOPED_TRACE(number);
        const auto state = static_cast<State>(number);
        Force force;
        Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(3.0);
        GiveMarked(force, "S1", &ForceState::magnitude, "magnitude", mdl_PropAttr<double>(0.0, state),
                   Given::STATE_ONLY);
        force.Propagate(StepsOf("IG"));
        ExpectAttribute(In(force, "S1").magnitude, state, number == 1 || number == 2 ? 3.0 : 0.0);
    }
}

TEST(PropagationState, ListOfAttributes_IsReplacedAsAWhole) {
    Temperature temperature;
    using S = TemperatureState;
    Give<S>(temperature, "S0").Set<&S::values>(Values({1.0, 2.0, 3.0}));
    Give<S>(temperature, "S1").Set<&S::values>(Values({9.0}));
    Give<S>(temperature, "S2").Clear<&S::values>();
    temperature.Propagate(StepsOf("IGG"));
    EXPECT_EQ(StateIn<S>(temperature, "S0").values.Length(), 3);
    ASSERT_EQ(StateIn<S>(temperature, "S1").values.Length(), 1);
    ExpectAttribute(StateIn<S>(temperature, "S1").values[0], State::SET, 9.0);
    EXPECT_EQ(StateIn<S>(temperature, "S2").values.Length(), 0);
}

TEST(PropagationState, ClearedItemOfAList_HasItsDefaultInTheNextStep) {
    Temperature temperature;
    using S = TemperatureState;
    auto values = Values({1.0});
    values.Append(mdl_PropAttr<double>(5.0, State::CLEARED));
    Give<S>(temperature, "S0").Set<&S::values>(values);
    temperature.Propagate(StepsOf("IG"));
    ExpectAttribute(StateIn<S>(temperature, "S0").values[1], State::CLEARED, 5.0);
    ExpectAttribute(StateIn<S>(temperature, "S1").values[0], State::CARRIED, 1.0);
    ExpectAttribute(StateIn<S>(temperature, "S1").values[1], State::NEVER_SET, 0.0);
}

TEST(PropagationState, CompletedField_FollowsTheStatusUnlessItIsGiven) {
    Contact contact;
    using S = ContactState;
    Give<S>(contact, "S1").Set<&S::friction>(0.3);
    Give<S>(contact, "S3").Deactivate();
    Give<S>(contact, "S4").Set<&S::opDelete>(true);
    Give<S>(contact, "S6").Set<&S::opDelete>(false).Deactivate();
    contact.Propagate(StepsOf("IGGGGGG"));
    EXPECT_EQ(Statuses(contact, StepsOf("IGGGGGG")), (Ints{0, 1, 2, 4, 1, 2, 4}));
    const bool deleted[] = {false, false, false, true, true, false, false};
    for (int i = 0; i < 7; ++i) EXPECT_EQ(StateIn<S>(contact, StepName(i)).opDelete, deleted[i]) << i;
    ExpectAttribute(StateIn<S>(contact, "S3").friction, State::CARRIED, 0.3);
}

TEST(PropagationState, StepsThatCarryOneState_ShareIt) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(3.0);
    force.Propagate(StepsOf("IGGG"));
    EXPECT_NE(&In(force, "S0"), &In(force, "S1"));
    EXPECT_EQ(&In(force, "S1"), &In(force, "S2"));
    EXPECT_EQ(&In(force, "S2"), &In(force, "S3"));
}

TEST(PropagationState, Quad_NamesStepStatusAndProcedure) {
    Force force;
    Give<ForceState>(force, "Load").Set<&ForceState::magnitude>(3.0);
    force.Propagate(LoadFreqUnloadBuckle());
    EXPECT_EQ(force.ConstGetStateQuad("Initial").procedureType, 0U);
    const auto& quad = force.ConstGetStateQuad("Freq");
    EXPECT_EQ(quad.stepName, "Freq");
    EXPECT_EQ(quad.status, Status::BUILT_INTO_BASE_STATE);
    EXPECT_EQ(quad.procedureType, 0x23C006AU);
    EXPECT_EQ(force.ConstGetStateQuad("Load").procedureType, 0x23C0073U);
    EXPECT_EQ(force.ConstGetStateQuad("Buckle").procedureType, 0x23C0066U);
}

TEST(PropagationState, CopiedObject_IsApartFromTheOriginal) {
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(3.0);
    force.Propagate(StepsOf("IG"));
    Force copy(force);
    Give<ForceState>(copy, "S0").Set<&ForceState::magnitude>(4.0);
    copy.Propagate(StepsOf("IG"));
    ExpectAttribute(In(force, "S0").magnitude, State::SET, 3.0);
    ExpectAttribute(In(copy, "S0").magnitude, State::SET, 4.0);
    force.Propagate(StepsOf("IG"));
    ExpectAttribute(In(force, "S1").magnitude, State::CARRIED, 3.0);
}

TEST(PropagationState, GivenStates_AreKeptByStepAndField) {
    Condition condition;
    EXPECT_EQ(condition.GivenState("S1"), nullptr);
    Give<ConditionState>(condition, "S1").Set<&ConditionState::u2>(1.0).Clear<&ConditionState::amplitude>();
    Give<ConditionState>(condition, "S1").Set<&ConditionState::u3>(2.0);
    ASSERT_EQ(condition.GivenStates().size(), 1U);
    const mdl_GivenState* given = condition.GivenState("S1");
    ASSERT_NE(given, nullptr);
    EXPECT_FALSE(given->IsGiven("u1"));
    EXPECT_TRUE(given->IsGiven("u2"));
    EXPECT_TRUE(given->IsGiven("u3"));
    EXPECT_TRUE(given->IsGiven("amplitude"));
    EXPECT_FALSE(given->IsGiven("no field of this name"));
}

TEST(PropagationState, CopyOfAnObject_HasAHistoryOfItsOwn) {
    const kprC_StepContainer steps = StepsOf("IG");
    Condition original;
    Give<ConditionState>(original, "S0").Set<&ConditionState::u1>(1.0);
    original.Propagate(steps);
    Condition copy(original);
    Give<ConditionState>(copy, "S1").Deactivate();
    copy.Propagate(steps);
    EXPECT_EQ(Statuses(original, steps), (std::vector<int>{1, 2}));
    EXPECT_EQ(Statuses(copy, steps), (std::vector<int>{1, 4}));
    EXPECT_EQ(original.GivenStates().size(), 1U);
    EXPECT_EQ(StateIn<ConditionState>(original, "S1").u1.ConstGet(), 1.0);
}

} // namespace
