#include "interactions/InteractionTesting.h"
#include "interactions/oif_Contact.h"

namespace {

const std::string kProperty = R"("interactionProperties": {"P 1": {"class": "kinC_ContactProperty"}}, )";

const std::string kPairs = R"(
    "inclusionPairs": [{"first": "I.MASTER", "second": "I.SLAVE"}, {"first": "I.SLAVE"}],
    "exclusionPairs": [{"first": "I.MASTER", "second": "I.NODES"}],
    "propertyAssignmentPairs": [{}, {"first": "I.MASTER", "second": "I.SLAVE"}],
    "surfacePropertyAssignmentPairs": [{"first": "I.MASTER"}, {"first": "I.SLAVE"}, {"first": "I.NODES"}],
    "formulationAssignmentPairs": [{"first": "I.MASTER", "second": "I.SLAVE"}, {"first": "I.SLAVE"}, {}], )";

std::unique_ptr<InteractionModel> General(const std::string& states) {
    return std::make_unique<InteractionModel>(
        kProperty + StaticSteps(2) + ", " +
        Interactions("ContactExp", kPairs + "\"states\": {" + states + "}"));
}

/// The keyword of the interaction in Step-1.
std::string Contact(const std::string& state) {
    const auto model = General(R"("Step-1": {)" + state + "}");
    return Written(oif_Contact("C", model->Interaction(), "Step-1", model->Info()));
}

template <class Assignments>
std::string Assigned(const std::string& state, const cow_String& step = "Step-1",
                     const std::string& later = "") {
    const auto model = General(R"("Step-1": {)" + state + "}" + later);
    return Written(Assignments(model->Interaction(), step, model->Info()));
}

} // namespace

TEST(GeneralContact, Bare_EndsWhatWasBefore) {
    InteractionModel model(StaticSteps(1));
    EXPECT_EQ(Written(oif_Contact(model.Info())), "*Contact, op=NEW\n");
}

TEST(GeneralContact, StateWithoutEntries_WritesTheKeywordAlone) {
    EXPECT_EQ(Contact(""), "*Contact, op=NEW\n");
}

TEST(GeneralContact, WholeModel_NeedsNoPairs) {
    EXPECT_EQ(Contact(R"("wholeModelContact": true)"),
              "*Contact, op=NEW\n*Contact Inclusions, ALL EXTERIOR\n");
}

TEST(GeneralContact, WholeModel_HidesInclusionsButNotExclusions) {
    EXPECT_EQ(Contact(R"("wholeModelContact": true, "inclusions": [true, true], "exclusions": [true])"),
              "*Contact, op=NEW\n*Contact Inclusions, ALL EXTERIOR\n*Contact Exclusions\n"
              "I.MASTER , I_NODES_CNS_\n");
}

TEST(GeneralContact, Domains_HoldTheEntriesThatAreTrue) {
    EXPECT_EQ(Contact(R"("inclusions": [false, true], "exclusions": [false])"),
              "*Contact, op=NEW\n*Contact Inclusions\nI.SLAVE , \n");
    EXPECT_EQ(Contact(R"("inclusions": [true, true])"),
              "*Contact, op=NEW\n*Contact Inclusions\nI.MASTER , I.SLAVE\nI.SLAVE , \n");
}

TEST(GeneralContact, ListShorterThanItsPairs_LeavesTheRestOut) {
    EXPECT_EQ(Contact(R"("inclusions": [true])"),
              "*Contact, op=NEW\n*Contact Inclusions\nI.MASTER , I.SLAVE\n");
}

TEST(GeneralContact, WithAll_HasDomainsThenAssignments) {
    EXPECT_EQ(Contact(R"("wholeModelContact": true, "exclusions": [true], "propertyAssignments": ["P 1"],
                         "surfacePropertyAssignments": [{"type": 0}], "formulationAssignments": [{}])"),
              "*Contact, op=NEW\n"
              "*Contact Inclusions, ALL EXTERIOR\n"
              "*Contact Exclusions\nI.MASTER , I_NODES_CNS_\n"
              "*Contact property assignment\n ,  , \"P 1\"\n"
              "*Surface property assignment, property=THICKNESS\nI.MASTER , ORIG , 1.\n"
              "*Contact formulation, type=PURE MASTER-SLAVE\nI.MASTER , I.SLAVE , MASTER\n");
}

TEST(GeneralContact, AnotherInteraction_Raises) {
    InteractionModel model(StaticSteps(1) + ", " + Interactions("CyclicSymmetry", R"("states": {})"));
    EXPECT_NE(Raised([&] { oif_Contact("C", model.Interaction(), "Step-1", model.Info()); }),
              "nothing raised");
    EXPECT_NE(Raised([&] { oif_ContactPropertyAssignments(model.Interaction(), "Step-1", model.Info()); }),
              "nothing raised");
}

TEST(GeneralContact, PropertyAssignments_HaveEntriesThatWereEverSet) {
    using Assignments = oif_ContactPropertyAssignments;
    EXPECT_EQ(Assigned<Assignments>(""), "");
    EXPECT_EQ(Assigned<Assignments>(R"("propertyAssignments": [{"state": 0}, "P 1"])"),
              "*Contact property assignment\nI.MASTER , I.SLAVE , \"P 1\"\n");
    // Carried into the next step.
    EXPECT_EQ(Assigned<Assignments>(R"("propertyAssignments": [{"state": 0}, "P 1"])", "Step-2"),
              "*Contact property assignment\nI.MASTER , I.SLAVE , \"P 1\"\n");
}

TEST(GeneralContact, AssignmentThatIsCleared_IsStillWritten_Wanted) {
    using Assignments = oif_ContactPropertyAssignments;
    EXPECT_EQ(Assigned<Assignments>(R"("propertyAssignments": [{"value": "P 1", "state": 3}])"),
              "*Contact property assignment\n ,  , \"P 1\"\n");
    EXPECT_EQ(Assigned<Assignments>(R"("propertyAssignments": [null, null])"),
              "*Contact property assignment\n ,  , \nI.MASTER , I.SLAVE , \n");
}

TEST(GeneralContact, Thickness_IsAWordOrTheNumber) {
    EXPECT_EQ(
        Assigned<oif_SurfacePropertyAssignments>(
            R"("surfacePropertyAssignments": [{"type": 0, "value": 5}, {"type": 3, "value": 5, "scale": 2},
                     {"type": 1, "value": 0.5, "scale": 0.25}])"),
        "*Surface property assignment, property=THICKNESS\nI.MASTER , ORIG , 1.\nI.SLAVE , CURR , 2.\n"
        "I_NODES_CNS_ , 0.5 , 0.25\n");
}

TEST(GeneralContact, Formulation_IsTheWordOfItsRole) {
    EXPECT_EQ(Assigned<oif_ContactFormulationAssignments>(
                  R"("formulationAssignments": [{"masterSlave": 0}, {"masterSlave": "SLAVE"},
                     {"masterSlave": "BALANCED"}])"),
              "*Contact formulation, type=PURE MASTER-SLAVE\nI.MASTER , I.SLAVE , MASTER\n"
              "I.SLAVE ,  , SLAVE\n ,  , BALANCED\n");
}
