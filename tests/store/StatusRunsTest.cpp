#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <random>

namespace {

using namespace sample;

/// The rules of statuses, step by step, for conditions ('B'), loads ('L') and output requests ('O').
class StepByStep {
public:
    explicit StepByStep(char family) : family_(family) {}

    int Next(bool perturbation, char given) {
        if (!perturbation) runAlive_ = false;
        const bool ofRun = perturbation && family_ == 'O';
        bool& alive = ofRun ? runAlive_ : alive_;
        const int status = perturbation && !ofRun ? InPerturbation(given) : InChain(alive, ofRun, given);
        if (status == 1) begun_ = true;
        if (!perturbation || ofRun) {
            if (status >= 1 && status <= 3) alive = true;
            if (status == 0 || status == 4 || status == 5) alive = false;
        }
        return status;
    }

private:
    int Dead() const { return begun_ ? 5 : 0; }
    int InChain(bool alive, bool ofRun, char given) const {
        if (given == 's') return alive ? 3 : 1;
        if (given == 'd' && alive) return 4;
        if (alive) return 2;
        return ofRun && alive_ ? 6 : Dead();
    }
    int InPerturbation(char given) const {
        if (!alive_) return given == 's' ? 1 : Dead();
        if (family_ == 'L') return 8;
        return given == 's' ? 10 : given == 'd' ? 11 : 9;
    }

    char family_;
    bool alive_ = false;
    bool runAlive_ = false;
    bool begun_ = false;
};

template <class T>
void ExpectStepByStep(char family, const std::string& kinds, const std::string& given) {
    SCOPED_TRACE(std::string(1, family) + " " + kinds + " " + given);
    T object;
    for (std::size_t i = 0; i < given.size(); ++i) {
        if (given[i] != '.') object.Give(StepName(static_cast<int>(i))).deactivated = given[i] == 'd';
    }
    const kprC_StepContainer steps = StepsOf(kinds.c_str());
    object.Propagate(steps);
    StepByStep rules(family);
    Ints expected;
    for (std::size_t i = 0; i < kinds.size(); ++i) {
        expected.push_back(rules.Next(kinds[i] == 'P' || kinds[i] == 'B', given[i]));
    }
    ASSERT_EQ(Statuses(object, steps), expected);
    // Runs cover each step once.
    Ints covered(kinds.size());
    for (const auto& [first, end, perturbation] : object.Runs()) {
        for (int i = first; i < end; i = object.Timeline().Next(perturbation, i + 1)) {
            ASSERT_EQ(object.Timeline().IsPerturbation(i), perturbation);
            ++covered[static_cast<std::size_t>(i)];
        }
    }
    EXPECT_EQ(covered, Ints(kinds.size(), 1));
}

std::string Some(std::mt19937& random, const std::string& letters, std::size_t length) {
    std::uniform_int_distribution<std::size_t> any(0, letters.size() - 1);
    std::string text;
    while (text.size() < length) text += letters[any(random)];
    return text;
}

TEST(StatusRuns, AnySteps_HaveTheStatusesOfAWalkStepByStep) {
    std::mt19937 random(7);
    for (int i = 0; i < 2000; ++i) {
        const std::size_t length = 1 + random() % 24;
        // Some with few perturbations, some with many; most steps say nothing.
        const std::string kinds = "I" + Some(random,
                                             i % 3 == 0   ? "GGGGGP"
                                             : i % 3 == 1 ? "GP"
                                                          : "GPPPB",
                                             length);
        const std::string given = Some(random, i % 2 == 0 ? "......sd" : ".sd", length + 1);
        ExpectStepByStep<Condition>('B', kinds, given);
        ExpectStepByStep<Force>('L', kinds, given);
        ExpectStepByStep<Request>('O', kinds, given);
    }
}

TEST(StatusRuns, ManyStepsThatCarryOneStateOn_AreFewRuns) {
    const std::string general(5000, 'G');
    std::string both;
    for (int i = 0; i < 5000; ++i) both += "GP";
    for (const std::string& kinds : {"I" + general, "I" + both}) {
        const kprC_StepContainer steps = StepsOf(kinds.c_str());
        Force force;
        Give<ForceState>(force, "S1").Set<&ForceState::magnitude>(2.5);
        Give<ForceState>(force, "S3001").Set<&ForceState::magnitude>(3.5);
        EXPECT_TRUE(force.Propagate(steps).empty());
        EXPECT_LT(force.Runs().size(), 12U);
        EXPECT_EQ(StateIn<ForceState>(force, "S2999").magnitude.ConstGet(), 2.5);
        EXPECT_EQ(StateIn<ForceState>(force, "S4999").magnitude.ConstGet(), 3.5);
        EXPECT_EQ(StateIn<ForceState>(force, "S4999").magnitude.State(), State::CARRIED);
        EXPECT_EQ(force.ConstGetStateQuad("S4999").stepName, "S4999");
        EXPECT_EQ(force.CreateStepName(), "S1");
    }
}

TEST(StatusRuns, StateThatIsReplaced_IsOfItsStepAlone) {
    const kprC_StepContainer steps = StepsOf("IGGG");
    Contact contact;
    Give<ContactState>(contact, "S1").Set<&ContactState::friction>(0.1);
    contact.Propagate(steps);
    ContactState state;
    state.friction.Set(0.7);
    contact.Insert("S3", state);
    EXPECT_EQ(StateIn<ContactState>(contact, "S2").friction.ConstGet(), 0.1);
    EXPECT_EQ(StateIn<ContactState>(contact, "S3").friction.ConstGet(), 0.7);
    EXPECT_EQ(contact.Status("S3"), Status::PROPAGATED);
}

TEST(GivenStates, Many_AreFoundByTheirStepsAndKeepTheirOrder) {
    Force force;
    for (int i = 200; i > 0; --i) {
        Give<ForceState>(force, StepName(i)).Set<&ForceState::magnitude>(static_cast<double>(i));
    }
    const Force copy(force);
    Give<ForceState>(force, StepName(7)).Set<&ForceState::magnitude>(-1.0);
    ASSERT_EQ(copy.GivenStates().size(), 200U);
    EXPECT_EQ(copy.GivenStates()[0].stepName, "S200");
    EXPECT_EQ(copy.GivenState("S7"), &copy.GivenStates()[193]);
    EXPECT_EQ(static_cast<const ForceState&>(copy.GivenState("S7")->record.ConstGet()).magnitude.ConstGet(),
              7.0);
    EXPECT_EQ(static_cast<const ForceState&>(force.GivenState("S7")->record.ConstGet()).magnitude.ConstGet(),
              -1.0);
    EXPECT_EQ(copy.GivenState("S201"), nullptr);
}

} // namespace
