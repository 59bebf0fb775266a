#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"

#include <gtest/gtest.h>

namespace {

using namespace sample;
using S = RequestState;

int Frequency(const Request& request, int step) {
    return StateIn<S>(request, StepName(step)).frequency.ConstGet();
}

TEST(OutputChain, NeverSetAttribute_HasTheDefaultOfTheCreatingStepsProcedure) {
    Request request;
    Give<S>(request, "S1").Set<&S::variable>("U");
    Give<S>(request, "S2").Set<&S::variable>("S");
    Give<S>(request, "S5").Set<&S::variable>("RF");
    request.Propagate(StepsOf("IGPPGB"));
    EXPECT_EQ(Statuses(request, StepsOf("IGPPGB")), (Ints{0, 1, 1, 2, 2, 1}));
    EXPECT_EQ(Frequency(request, 1), 1);
    EXPECT_EQ(Frequency(request, 2), 10);
    EXPECT_EQ(Frequency(request, 3), 10);
    EXPECT_EQ(Frequency(request, 4), 1);
    EXPECT_EQ(Frequency(request, 5), 20);
}

TEST(OutputChain, RunOverTwoProcedures_KeepsTheDefaultsOfTheFirst) {
    Request request;
    Give<S>(request, "S1").Set<&S::variable>("U");
    Give<S>(request, "S2").Set<&S::variable>("S");
    request.Propagate(StepsOf("IPB"));
    EXPECT_EQ(Frequency(request, 1), 10);
    EXPECT_EQ(Frequency(request, 2), 10);
}

TEST(OutputChain, ClearedAttribute_GoesBackToTheDefaultOfTheCreatingStep) {
    Request request;
    Give<S>(request, "S1").Set<&S::frequency>(7);
    Give<S>(request, "S2").Clear<&S::frequency>();
    request.Propagate(StepsOf("IPBB"));
    EXPECT_EQ(Frequency(request, 1), 7);
    EXPECT_EQ(StateIn<S>(request, "S2").frequency, State::CLEARED);
    EXPECT_EQ(Frequency(request, 2), 10);
    EXPECT_EQ(StateIn<S>(request, "S3").frequency, State::NEVER_SET);
    EXPECT_EQ(Frequency(request, 3), 10);
}

TEST(OutputChain, GeneralStep_GoesOnFromTheLastGeneralStep) {
    Request request;
    Give<S>(request, "S1").Set<&S::frequency>(7).Set<&S::variable>("U");
    Give<S>(request, "S2").Set<&S::frequency>(3);
    request.Propagate(StepsOf("IGPG"));
    EXPECT_EQ(Frequency(request, 2), 3);
    EXPECT_EQ(StateIn<S>(request, "S2").variable, State::NEVER_SET);
    EXPECT_EQ(Frequency(request, 3), 7);
    EXPECT_EQ(StateIn<S>(request, "S3").variable, cow_String("U"));
}

TEST(OutputChain, RequestOfGeneralSteps_HasNoStateInPerturbationSteps) {
    Request request;
    Give<S>(request, "S1").Set<&S::frequency>(7);
    request.Propagate(StepsOf("IGPG"));
    EXPECT_EQ(request.Status("S2"), Status::TYPE_NOT_APPLICABLE);
    EXPECT_FALSE(request.ConstGetStateQuad("S2").hasState);
    EXPECT_FALSE(request.HasStep("S2"));
    EXPECT_TRUE(request.HasStep("S3"));
}

TEST(OutputChain, EndInARun_IsAnEndOfTheGeneralStatus) {
    Request request;
    request.Give("S1");
    request.Give("S2").deactivated = true;
    request.Propagate(StepsOf("IPPG"));
    EXPECT_EQ(request.Status("S2"), Status::DEACTIVATED);
    EXPECT_TRUE(request.HasStep("S2"));
    EXPECT_FALSE(request.HasStep("S3"));
}

TEST(OutputChain, RequestThatNoStepCreates_HasTheDefaultsOfAGeneralStaticStep) {
    korC_FieldOutput request;
    request.Give("S1").status = Status::PROPAGATED;
    request.Propagate(StepsOf("IP"));
    const auto& state = static_cast<const korC_FieldOutputState&>(request.ConstGetState("S1"));
    const korC_FieldOutputState expected(kStatic);
    EXPECT_EQ(state.frequency.ConstGet(), expected.frequency.ConstGet());
    EXPECT_EQ(state.numberInterval.ConstGet(), expected.numberInterval.ConstGet());
    EXPECT_EQ(state.timeMarks.ConstGet(), expected.timeMarks.ConstGet());
    EXPECT_EQ(state.variablesType.ConstGet(), expected.variablesType.ConstGet());
}

} // namespace
