#include "output/oif_OutputRequestBuilder.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

namespace {

using RuleMap = mdl_MapString2ObjCow<karC_RemeshingRule>;

/// The view over a store with rules of its own, which a store can't hold.
class ViewWithRules final : public oif_Model {
public:
    ViewWithRules(const ddb_Model& model, const RuleMap& rules)
        : oif_Model(model, cow_String()), rules_(rules) {}
    const RuleMap& RemeshingRules() const override { return rules_; }
    qkw_Model* Copy() const override { return new ViewWithRules(*this); }

private:
    RuleMap rules_;
};

class InfoWithRules final : public oif_ModelInfo {
public:
    InfoWithRules(const ddb_Model& model, const RuleMap& rules) : oif_ModelInfo(model) {
        SetModel(new ViewWithRules(model, rules));
    }
};

class RemeshingRules : public testing::Test {
protected:
    RemeshingRules() {
        odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
        part.mesh->AddElements("S4R", {1}, 4, {1, 2, 3, 4});
        part.mesh->AddElementSet("E", {1});
        store.model.AddInstance("I", "P");
        store.model.steps.Append("Initial", kprC_InitialStep());
        store.model.steps.Append("A", kprC_StaticStep());
    }
    karC_RemeshingRule& AddRule(const char* name, const char* indicator = "MISESERI") {
        karC_RemeshingRule rule;
        rule.stepName = "A";
        rule.variables.Append(indicator);
        rules.Insert(name, rule);
        return rules.Get(name);
    }
    void AddRequest(const char* name, std::initializer_list<const char*> names, int numberInterval = 20) {
        cls_xpListString variables;
        for (const char* variable : names) variables.Append(variable);
        korC_FieldOutput request;
        mdl_StateEdit<korC_FieldOutputState>(request.Give("A"))
            .Set<&korC_FieldOutputState::frequency>(99999)
            .Set<&korC_FieldOutputState::numberInterval>(numberInterval)
            .Set<&korC_FieldOutputState::variables>(variables);
        request.Propagate(store.model.steps);
        store.model.fieldOutputRequests.Insert(name, request);
    }
    std::string BodyOf(const cow_String& stepName = "A") {
        InfoWithRules info(store.View(), rules);
        oif_OutputRequestBuilder builder(info);
        builder.Build();
        return WrittenAll(builder.StepDefinition(stepName));
    }

    TestStore store;
    RuleMap rules;
    const std::string banner = "** \n** OUTPUT REQUESTS\n** \n";
    const std::string indicators = "*Element Output, directions=YES\nMISESAVG, MISESERI, EVOL\n";
};

} // namespace

TEST_F(RemeshingRules, Rule_AsksForItsIndicatorsAndVolumesInTheLastIncrement) {
    AddRule("R");
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                            "*Output, field, frequency=99999\n" +
                            indicators);
}

TEST_F(RemeshingRules, RuleForEveryIncrement_HasTheUsualFrequency) {
    AddRule("R").outputFrequency = karC_RemeshingRule::OutputFrequencyEnm::ALL_INCREMENTS;
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                            "*Output, field\n" +
                            indicators);
}

TEST_F(RemeshingRules, Description_StandsOnALineOfItsOwn) {
    AddRule("R").description = "refine the fillet";
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** refine the fillet\n** \n"
                            "*Output, field, frequency=99999\n" +
                            indicators);
}

TEST_F(RemeshingRules, RegionOfTheRule_IsThatOfTheRequest) {
    AddRule("R").region = store.model.Region("I", "E");
    EXPECT_EQ(BodyOf(), banner + "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                                 "*Output, field, frequency=99999\n"
                                 "*Element Output, elset=I.E, directions=YES\nMISESAVG, MISESERI, EVOL\n");
}

TEST_F(RemeshingRules, VolumesAmongTheIndicators_StandOnce) {
    AddRule("R", "EVOL");
    EXPECT_EQ(BodyOf(), banner + "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                                 "*Output, field, frequency=99999\n"
                                 "*Element Output, directions=YES\nEVOL, \n");
}

TEST_F(RemeshingRules, NamesThatTheProcedureDoesNotKnow_StandNowhere) {
    AddRule("R", "NOSUCH");
    EXPECT_EQ(BodyOf(), banner + "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                                 "*Output, field, frequency=99999\n"
                                 "*Element Output, directions=YES\nEVOL, \n");
}

TEST_F(RemeshingRules, SuppressedRule_IsNoReasonForOutput) {
    AddRule("R").suppressed = true;
    EXPECT_EQ(BodyOf(), "");
}

TEST_F(RemeshingRules, SuppressedRuleBesideAnother_IsLeftOut) {
    AddRule("A").suppressed = true;
    AddRule("B", "PEERI");
    EXPECT_EQ(BodyOf(), banner + "** \n** FIELD OUTPUT:  from REMESHING RULE: B\n** \n"
                                 "*Output, field, frequency=99999\n"
                                 "*Element Output, directions=YES\nPEAVG, PEERI, EVOL\n");
}

TEST_F(RemeshingRules, RuleWithoutFieldOutput_StopsTheOutputOfTheStepWanted) {
    AddRule("R").fieldOutput = false;
    EXPECT_EQ(BodyOf(), banner + "*Output, field, frequency=0\n");
}

TEST_F(RemeshingRules, OtherSteps_HaveNoneOfIt) {
    store.model.steps.Append("B", kprC_StaticStep());
    AddRule("R").stepName = "B";
    EXPECT_EQ(BodyOf("A"), "");
    EXPECT_NE(BodyOf("B"), "");
}

TEST_F(RemeshingRules, SuppressedStep_HasThemAllTheSame) {
    kprC_StaticStep step;
    step.suppressed = true;
    store.model.steps.Append("B", step);
    AddRule("R").stepName = "B";
    EXPECT_NE(BodyOf("B"), "");
}

TEST_F(RemeshingRules, RulesOfTheSameWishes_AreOneRequest) {
    AddRule("R1");
    AddRule("R2").description = "again";
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT:  from REMESHING RULE: R1,  from REMESHING RULE: R2\n"
                            "** again\n** \n*Output, field, frequency=99999\n" +
                            indicators);
}

TEST_F(RemeshingRules, RuleAndRequestOfOneFrequency_ShareTheOutputLine) {
    AddRule("R");
    AddRequest("F", {"U"});
    // The rule's name begins with a blank, so it goes first.
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                            "*Output, field, frequency=99999\n" +
                            indicators + "** \n** FIELD OUTPUT: F\n** \n*Node Output\nU, \n");
}

TEST_F(RemeshingRules, RequestWithTheSameWishes_TakesTheRuleIn) {
    AddRule("R");
    // Values that aren't used have to be a rule's too.
    AddRequest("F", {"MISESAVG", "MISESERI", "EVOL"}, 0);
    EXPECT_EQ(BodyOf(), banner +
                            "** \n** FIELD OUTPUT: F,  from REMESHING RULE: R\n** \n"
                            "*Output, field, frequency=99999\n" +
                            indicators);
}

TEST_F(RemeshingRules, ExplicitStep_HasAFrequencyAllTheSameWanted) {
    kprC_ExplicitDynamicsStep step;
    store.model.steps.Append("X", step);
    AddRule("R", "EVOL").stepName = "X";
    EXPECT_EQ(BodyOf("X"), banner + "** \n** FIELD OUTPUT:  from REMESHING RULE: R\n** \n"
                                    "*Output, field, frequency=99999\n"
                                    "*Element Output, directions=YES\nEVOL, \n");
}
