#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

using namespace sample;

/// One object per family letter: B condition, L load, F field, I interaction, M mesh constraint, O output.
std::unique_ptr<kprC_PropagatingObject> NewObject(char family) {
    switch (family) {
    case 'B': return std::make_unique<Condition>();
    case 'L': return std::make_unique<Force>();
    case 'F': return std::make_unique<Temperature>();
    case 'I': return std::make_unique<Contact>();
    case 'M': return std::make_unique<kprC_AdptMeshCons>();
    default: return std::make_unique<Request>();
    }
}

Ints StatusesOf(char family, const kprC_PropagatingObject& object, const kprC_StepContainer& steps) {
    switch (family) {
    case 'B': return Statuses(static_cast<const Condition&>(object), steps);
    case 'L': return Statuses(static_cast<const Force&>(object), steps);
    case 'F': return Statuses(static_cast<const Temperature&>(object), steps);
    case 'I': return Statuses(static_cast<const Contact&>(object), steps);
    case 'M': return Statuses(static_cast<const kprC_AdptMeshCons&>(object), steps);
    default: return Statuses(static_cast<const Request&>(object), steps);
    }
}

/// `given` has one letter a step: "." nothing, "s" a state, "d" deactivated.
struct History {
    char family;
    const char* steps;
    const char* given;
    Ints statuses;
};

struct Outcome {
    Ints statuses;
    Strings problems; // "place: text"
};

Outcome Propagated(char family, const char* kinds, const char* given) {
    const auto object = NewObject(family);
    const kprC_StepContainer steps = StepsOf(kinds);
    for (int i = 0; given[i] != '\0'; ++i) {
        if (given[i] != '.') object->Give(StepName(i)).deactivated = given[i] == 'd';
    }
    Outcome outcome;
    for (const auto& problem : object->Propagate(steps)) {
        outcome.problems.push_back(problem.place + ": " + problem.Text());
    }
    outcome.statuses = StatusesOf(family, *object, steps);
    return outcome;
}

void ExpectHistories(const std::vector<History>& histories) {
    for (const History& history : histories) {
        SCOPED_TRACE(std::string(1, history.family) + " " + history.steps + " " + history.given);
        const Outcome outcome = Propagated(history.family, history.steps, history.given);
        EXPECT_EQ(outcome.statuses, history.statuses);
        EXPECT_EQ(outcome.problems, Strings());
    }
}

TEST(PropagationStatus, EveryFamilyInGeneralSteps_IsCreatedCarriedChangedEndedAndCreatedAnew) {
    for (const char family : {'B', 'L', 'I', 'M', 'O'}) {
        ExpectHistories({
            {family, "IGGGGG", "......", {0, 0, 0, 0, 0, 0}},
            {family, "IGGGGG", "s.....", {1, 2, 2, 2, 2, 2}},
            {family, "IGGGGG", "..s.s.", {0, 0, 1, 2, 3, 2}},
            {family, "IGGGGG", ".s.d..", {0, 1, 2, 4, 5, 5}},
            {family, "IGGGGG", "sdsd.s", {1, 4, 1, 4, 5, 1}},
            {family, "IGGGGG", "ssssss", {1, 3, 3, 3, 3, 3}},
        });
    }
}

TEST(PropagationStatus, FieldThatEnds_IsReset) {
    ExpectHistories({{'F', "IGGGGG", "s.d.sd", {1, 2, 15, 5, 1, 15}}});
}

TEST(PropagationStatus, ConditionInPerturbationSteps_FollowsTheBaseState) {
    ExpectHistories({
        {'B', "IGPGB", "s....", {1, 2, 9, 2, 9}},
        {'B', "IGPGB", ".....", {0, 0, 0, 0, 0}},
        {'B', "IGPGPG", "..s...", {0, 0, 1, 5, 5, 5}},
        {'B', "IGPGPG", "..sss.", {0, 0, 1, 1, 10, 2}},
        {'B', "IGPGPG", "s.dssd", {1, 2, 11, 3, 10, 4}},
        {'B', "IGPGPG", "sd....", {1, 4, 5, 5, 5, 5}},
        {'B', "IGPPGP", "s.dd..", {1, 2, 11, 11, 2, 9}},
        {'B', "IGPPGP", "sds..s", {1, 4, 1, 5, 5, 1}},
        {'B', "IPBGPG", "ss....", {1, 10, 9, 2, 9, 2}},
    });
}

TEST(PropagationStatus, OtherFamiliesInPerturbationSteps_AreBuiltIntoTheBaseState) {
    for (const char family : {'L', 'I', 'M'}) {
        ExpectHistories({
            {family, "IGPGBG", ".s.d..", {0, 1, 8, 4, 5, 5}},
            {family, "IGPGBG", "..s.s.", {0, 0, 1, 5, 1, 5}},
            {family, "IGPPGG", "s...s.", {1, 2, 8, 8, 3, 2}},
            {family, "IGPGGP", "s..sd.", {1, 2, 8, 3, 4, 5}},
            {family, "IGPGBG", "..ss..", {0, 0, 1, 1, 8, 2}},
        });
    }
    ExpectHistories({
        {'F', "IGPGBG", "ss.d.s", {1, 3, 8, 15, 5, 1}},
        {'F', "IGPGBG", "..s...", {0, 0, 1, 5, 5, 5}},
    });
}

TEST(PropagationStatus, OutputRequests_HaveAChainOfTheirOwnInEachRunOfPerturbationSteps) {
    ExpectHistories({
        {'O', "IGPGPG", ".s....", {0, 1, 6, 2, 6, 2}},
        {'O', "IGPPGP", "..s...", {0, 0, 1, 2, 5, 5}},
        {'O', "IGPPPG", ".sssd.", {0, 1, 1, 3, 4, 2}},
        {'O', "IGPPPP", ".ssd.s", {0, 1, 1, 4, 6, 1}},
        {'O', "IGPPPP", "..sd.s", {0, 0, 1, 4, 5, 1}},
        {'O', "IGGPPG", ".sd.s.", {0, 1, 4, 5, 1, 5}},
        {'O', "IGPGPP", ".ss.ss", {0, 1, 1, 2, 1, 3}},
        {'O', "IGPBGB", ".s.s..", {0, 1, 6, 1, 2, 6}},
        {'O', "IPPGPG", ".s.s..", {0, 1, 2, 1, 6, 2}},
    });
}

TEST(PropagationStatus, StateInThePerturbationStep_LeavesNothingBehind) {
    ExpectHistories({
        {'B', "IGPG", "..s.", {0, 0, 1, 5}},
        {'B', "IGPG", "s.d.", {1, 2, 11, 2}},
        {'B', "IGPG", "s.s.", {1, 2, 10, 2}},
    });
}

struct Refusal {
    char family;
    const char* steps;
    const char* given;
    Ints statuses;
    Strings problems;
};

TEST(PropagationStatus, StateThatCannotBe_IsNotedAndTreatedAsNotGiven) {
    const std::string dead = "found deactivated, but it is not active there";
    const std::string base = "found a state in a linear perturbation step, but it belongs to the base state there, "
                             "expected no state";
    std::vector<Refusal> refusals;
    for (const char family : {'B', 'L', 'F', 'I', 'M', 'O'}) {
        refusals.push_back({family, "IG", "d.", {0, 0}, {"/states/S0: " + dead}});
        refusals.push_back({family, "IGG", ".d.", {0, 0, 0}, {"/states/S1: " + dead}});
        refusals.push_back({family, "IGP", "..d", {0, 0, 0}, {"/states/S2: " + dead}});
    }
    for (const char family : {'L', 'F', 'I', 'M'}) {
        refusals.push_back({family, "IGPG", ".ss.", {0, 1, 8, 2}, {"/states/S2: " + base}});
        refusals.push_back({family, "IGPG", ".sd.", {0, 1, 8, 2}, {"/states/S2: " + base}});
    }
    refusals.push_back({'B', "IGGG", "sdd.", {1, 4, 5, 5}, {"/states/S2: " + dead}});
    refusals.push_back({'O', "IGPG", ".sd.", {0, 1, 6, 2}, {"/states/S2: " + dead}});
    refusals.push_back({'L', "IGPB", "dsss", {0, 1, 8, 8}, {"/states/S0: " + dead, "/states/S2: " + base, "/states/S3: " + base}});
    for (const Refusal& refusal : refusals) {
        SCOPED_TRACE(std::string(1, refusal.family) + " " + refusal.steps + " " + refusal.given);
        const Outcome outcome = Propagated(refusal.family, refusal.steps, refusal.given);
        EXPECT_EQ(outcome.statuses, refusal.statuses);
        EXPECT_EQ(outcome.problems, refusal.problems);
    }
}

TEST(PropagationStatus, StateForAnUnknownStep_IsAProblem) {
    Force force;
    force.Give("S1");
    force.Give("Nowhere");
    const auto problems = force.Propagate(StepsOf("IG"));
    ASSERT_EQ(problems.size(), 1U);
    EXPECT_EQ(problems[0].place, "/states/Nowhere");
    EXPECT_EQ(problems[0].Text(), "found a state, but there is no step of that name");
    EXPECT_EQ(force.Status("S1"), Status::CREATED);
}

TEST(PropagationStatus, ExplicitStatusInAGeneralStep_LeavesTheMemoryOfItsRule) {
    const int nextWhenAlive[16] = {5, 2, 2, 2, 5, 5, 2, 2, 2, 2, 2, 2, 2, 2, 2, 5};
    const int nextWhenNeverBegun[16] = {0, 2, 2, 2, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 2, 0};
    for (int number = 0; number < 16; ++number) {
        SCOPED_TRACE(number);
        Force alive;
        alive.Give("S0");
        alive.Give("S1").status = static_cast<Status>(number);
        EXPECT_TRUE(alive.Propagate(StepsOf("IGG")).empty());
        EXPECT_EQ(Statuses(alive, StepsOf("IGG")), (Ints{1, number, nextWhenAlive[number]}));

        Force fresh;
        fresh.Give("S1").status = static_cast<Status>(number);
        EXPECT_TRUE(fresh.Propagate(StepsOf("IGG")).empty());
        EXPECT_EQ(Statuses(fresh, StepsOf("IGG")), (Ints{0, number, nextWhenNeverBegun[number]}));
    }
}

TEST(PropagationStatus, ExplicitStatusInAPerturbationStep_ChangesNeitherLifeNorBase) {
    for (int number = 0; number < 16; ++number) {
        SCOPED_TRACE(number);
        Condition condition;
        Give<ConditionState>(condition, "S0").Set<&ConditionState::u1>(3.0);
        Give<ConditionState>(condition, "S1")
            .Set<&ConditionState::u1>(4.0)
            .Status(static_cast<Status>(number));
        condition.Propagate(StepsOf("IPG"));
        EXPECT_EQ(Statuses(condition, StepsOf("IPG")), (Ints{1, number, 2}));
        EXPECT_EQ(StateIn<ConditionState>(condition, "S2").u1, 3.0);
        EXPECT_EQ(StateIn<ConditionState>(condition, "S2").u1, State::CARRIED);
    }
}

TEST(PropagationStatus, ExplicitStatus_GoesBeforeDeactivationAndRefusals) {
    Force force;
    Give<ForceState>(force, "S1").Deactivate().Status(Status::PROPAGATED);
    EXPECT_TRUE(force.Propagate(StepsOf("IG")).empty());
    EXPECT_EQ(force.Status("S1"), Status::PROPAGATED);

    Force inBase;
    inBase.Give("S0");
    inBase.Give("S1").status = Status::MODIFIED;
    EXPECT_TRUE(inBase.Propagate(StepsOf("IP")).empty());
    EXPECT_EQ(inBase.Status("S1"), Status::MODIFIED);
}

TEST(PropagationStatus, ExplicitCreation_CountsAsBegun) {
    Force force;
    force.Give("S1").status = Status::CREATED;
    force.Propagate(StepsOf("IPG"));
    EXPECT_EQ(Statuses(force, StepsOf("IPG")), (Ints{0, 1, 5}));
}

TEST(PropagationStatus, ActiveAndBuiltIn_AreTheSameSetsForAllFamilies) {
    const bool active[16] = {false, true, true, true,  false, false, false, false,
                             true,  true, true, false, false, false, true,  false};
    for (int number = 0; number < 16; ++number) {
        SCOPED_TRACE(number);
        const auto status = static_cast<Status>(number);
        EXPECT_EQ(kbcC_BC::IsActive(status), active[number]);
        EXPECT_EQ(kloC_Load::IsActive(status), active[number]);
        EXPECT_EQ(kpfC_Field::IsActive(status), active[number]);
        EXPECT_EQ(kinC_Interaction::IsActive(status), active[number]);
        EXPECT_EQ(korC_Output::IsActive(status), active[number]);
        EXPECT_EQ(kloC_Load::IsBuiltIn(status), number == 8);
        EXPECT_EQ(korC_Output::IsBuiltIn(status), number == 8);
    }
}

TEST(PropagationStatus, HasStep_AsksStatesOrStatusesByFamily) {
    for (int number = 0; number < 16; ++number) {
        SCOPED_TRACE(number);
        Contact contact;
        contact.Give("S1").status = static_cast<Status>(number);
        contact.Propagate(StepsOf("IG"));
        const bool inForce =
            number == 1 || number == 2 || number == 3 || number == 8 || number == 9 || number == 10;
        EXPECT_EQ(contact.HasStep("S1"), inForce);
        EXPECT_EQ(contact.IsModified("S1"), number == 1 || number == 3 || number == 4);
        EXPECT_EQ(contact.GetPropStatus("S1"), static_cast<Status>(number));

        Request request;
        request.Give("S1").status = static_cast<Status>(number);
        request.Propagate(StepsOf("IG"));
        EXPECT_EQ(request.HasStep("S1"), inForce || number == 4 || number == 11 || number == 14);

        Force force;
        force.Give("S1").status = static_cast<Status>(number);
        force.Propagate(StepsOf("IG"));
        EXPECT_TRUE(force.HasStep("S1"));
        EXPECT_FALSE(force.HasStep("S0"));
    }
}

TEST(PropagationStatus, HasStepOfALoad_IsFalseWhereItIsCarried) {
    Force force;
    force.Give("S0");
    force.Give("S2").deactivated = true;
    force.Propagate(StepsOf("IGG"));
    EXPECT_TRUE(force.HasStep("S0"));
    EXPECT_FALSE(force.HasStep("S1"));
    EXPECT_TRUE(force.HasStep("S2"));
}

TEST(PropagationStatus, CreateStepName_IsTheFirstStepOfCreation) {
    Contact contact;
    contact.Propagate(StepsOf("IGG"));
    EXPECT_TRUE(contact.CreateStepName().IsEmpty());
    contact.Give("S1");
    contact.Propagate(StepsOf("IGG"));
    EXPECT_EQ(contact.CreateStepName(), "S1");
}

TEST(PropagationStatus, UnknownStep_Raises) {
    Force force;
    EXPECT_EQ(Raised([&] { force.Status("S0"); }), "kprC_PropagatingState: no entry named 'S0'");
    force.Propagate(StepsOf("IG"));
    EXPECT_EQ(Raised([&] { force.ConstGetStateQuad("S9"); }), "kprC_PropagatingState: no entry named 'S9'");
}

TEST(PropagationStatus, UnknownStepOfAnInteraction_HasStatusZero) {
    Contact contact;
    contact.Propagate(StepsOf("IG"));
    EXPECT_FALSE(contact.HasStep("S9"));
    EXPECT_EQ(contact.GetPropStatus("S9"), mdl_PropagationStatusEnm::NOT_YET_ACTIVE);
}

TEST(PropagationStatus, ChangedSteps_CountAfterPropagatingAgain) {
    Force force;
    force.Give("S1");
    force.Propagate(StepsOf("IG"));
    force.Propagate(StepsOf("IGP"));
    EXPECT_EQ(Statuses(force, StepsOf("IGP")), (Ints{0, 1, 8}));
}

TEST(PropagationStatus, ContainerWithABadState_RaisesWithObjectAndStep) {
    kprC_PropagatingContainer<kloC_Load> loads;
    Force good;
    good.Give("S1");
    Force bad;
    bad.Give("S1").deactivated = true;
    loads.Insert("A", good);
    loads.Insert("B", bad);
    EXPECT_EQ(Raised([&] { loads.Propagate(StepsOf("IG")); }),
              "object 'B', /states/S1: found deactivated, but it is not active there");
}

} // namespace
