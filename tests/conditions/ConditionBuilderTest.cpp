#include "conditions/oif_ConditionBuilder.h"

#include "conditions/ConditionTesting.h"

namespace {

/// Says each interaction as its name, its op and its step.
class InteractionTeller final : public oif_ConditionBuilder<InteractionTeller> {
public:
    explicit InteractionTeller(oif_ModelInfo& modelInfo) : oif_ConditionBuilder(modelInfo, "INTERACTIONS") {}
    void Build() override {
        const kprC_StepContainer& steps = Model().Steps();
        oif_InteractionOpStatus opStatus;
        opStatus.Configure(Model().Interactions(), steps.Keys());
        const oif_ObjectsOfSteps<kinC_Interaction> written(
            "interaction", Model().Interactions(), steps, opStatus,
            [&](const kinC_Interaction& interaction, const cow_String& step, bool) {
                return interaction.HasStep(step) || opStatus.OpNew(interaction.DynTypeId(), step);
            });
        for (int i = 0; i < steps.Size(); ++i) {
            MakeCards(
                written, i, opStatus,
                [](const cow_String& name, const kinC_Interaction&) {
                    return cow_String("Interaction: ") + name;
                },
                [&](const oif_CardOf<kinC_Interaction>& card, const auto& entry) {
                    if (card.name == "silent") return;
                    AddComment(card, entry);
                    Add(card, oif_RawKeyword(card.name + (card.op == oif_Op::NEW ? ", op=NEW, " : ", ") +
                                             card.step));
                });
        }
    }
};

} // namespace

TEST(ConditionBuilder, Interactions_GoTheWayOfConditionsInTheStepItself) {
    ConditionModel model("IGG", R"("interactions": {
        "a": {"class": "kinC_FilmCondition", "surface": "A.F", "states": {"S1": {}, "S2": {"deactivated": true}}},
        "b": {"class": "kinC_FilmCondition", "surface": "A.F", "states": {"S1": {}}}})");
    InteractionTeller builder(model.Info());
    builder.Build();
    const std::string banner = "** \n** INTERACTIONS\n** \n";
    EXPECT_EQ(WrittenAll(builder.StepDefinition("S0")), "");
    EXPECT_EQ(WrittenAll(builder.StepDefinition("S1")),
              banner + "** Interaction: a\na, S1\n** Interaction: b\nb, S1\n");
    EXPECT_EQ(WrittenAll(builder.StepDefinition("S2")),
              banner + "** Interaction: a\na, op=NEW, S2\n** Interaction: b\nb, op=NEW, S2\n");
    ConditionModel cases(R"(IL{"loadCases": {"case": {}}})", R"("interactions": {
        "a": {"class": "kinC_FilmCondition", "surface": "A.F", "states": {"S1": {}}}})");
    InteractionTeller ofCases(cases.Info());
    ofCases.Build();
    EXPECT_EQ(WrittenAll(ofCases.StepDefinition("S1")), banner + "** Interaction: a\na, S1\n");
    EXPECT_EQ(WrittenAll(ofCases.StepDefinition("S1", "case")), "");
}

TEST(ConditionBuilder, Banner_StandsAlsoWhereNothingFollows) {
    ConditionModel model("IG", R"("interactions": {
        "silent": {"class": "kinC_FilmCondition", "surface": "A.F", "states": {"S1": {}}}})");
    InteractionTeller builder(model.Info());
    builder.Build();
    EXPECT_EQ(WrittenAll(builder.StepDefinition("S1")), "** \n** INTERACTIONS\n** \n");
}

TEST(ConditionBuilder, CardsOfAnObject_ShareItsRecord) {
    ConditionModel model("IG", R"("loads": {"L": {"class": "kloC_ConcentratedForce", "region": "A.N",
        "states": {"S1": {"component1": 1}}}})");
    const kprC_PropagatingContainer<kloC_Load>& loads = model.Store().loads;
    const oif_LoadCard card{"L", loads.ConstGet("L"), "A.N", "S1"};
    const oif_LoadCard other = card;
    EXPECT_EQ(&card.Object(), &other.Object());
    EXPECT_EQ(card.op, oif_Op::MODIFY);
    EXPECT_FALSE(card.InLoadCase());
    EXPECT_EQ(card.Factor(), 1.0);
    EXPECT_EQ(card.Quad().status, mdl_PropagationStatusEnm::CREATED);
}
