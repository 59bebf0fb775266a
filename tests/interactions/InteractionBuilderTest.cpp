#include "interactions/InteractionTesting.h"

namespace {

const std::string kProperties =
    R"("interactionProperties": {"P": {"class": "kinC_ContactProperty"},
                                 "Q": {"class": "kinC_ContactProperty", "tangentialBehavior": {"formulation": 3}}},
       "contactControls": {"Default": {"class": "kinC_StdContactControls"},
                           "Max": {"class": "kinC_StdContactControls", "maxchp": 3},
                           "XDefault": {"class": "kinC_ExpContactControls"},
                           "Slow": {"class": "kinC_ExpContactControls", "fastLocalTrk": false}}, )";
const std::string kSurfaces = R"("master": "I.MASTER", "slave": "I.SLAVE", )";
const std::string kLine = "I.SLAVE, I.MASTER\n";
const std::string kComment = "** Interaction: C\n";
const std::string kControls = "** Contact Controls for Interaction: C\n";
const std::string kStdControls = "*Contact Controls, master=I.MASTER, slave=I.SLAVE";
const std::string kAdd = "*Model Change, type=CONTACT PAIR, add\n" + kLine;
const std::string kRemove = "*Model Change, type=CONTACT PAIR, remove\n" + kLine;

InteractionModel Contact(const std::string& className, const std::string& states,
                         const std::string& members = "", const std::string& steps = StaticSteps(3)) {
    const bool isSelf = className.starts_with("Self");
    return InteractionModel(kProperties + steps + ", " +
                            Interactions(className, (isSelf ? R"("surface": "I.MASTER", )" : kSurfaces) +
                                                        members + "\"states\": {" + states + "}"));
}

InteractionModel Standard(const std::string& states, const std::string& members = "",
                          const std::string& steps = StaticSteps(3)) {
    return Contact("SurfaceToSurfaceContactStd", states, members, steps);
}

InteractionModel Explicit(const std::string& states, const std::string& members = "",
                          const std::string& steps = StepsOf({"ExplicitDynamics", "ExplicitDynamics"})) {
    return Contact("SurfaceToSurfaceContactXpl", states, members, steps);
}

/// The explicit pair with this property; or deleted.
std::string XplPair(const std::string& property) {
    return "*Contact Pair, interaction=" + property + ", mechanical constraint=KINEMATIC, cpset=C\n" + kLine;
}
const std::string kDelete = "*Contact Pair, op=DELETE, cpset=C\n" + kLine;

} // namespace

// Contact of the implicit solver.

TEST(StandardContact, FromTheInitialStep_NeedsNoModelChange) {
    InteractionModel model = Standard(R"("Initial": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Initial"), kBanner + kComment + "*Contact Pair, interaction=P\n" + kLine);
    for (const char* step : {"Step-1", "Step-2", "Step-3"}) EXPECT_EQ(model.StepText(step), "");
}

TEST(StandardContact, FromTheFirstGeneralStep_NeedsNoModelChange) {
    InteractionModel model = Standard(R"("Step-1": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Initial"), kBanner + kComment + "*Contact Pair, interaction=P\n" + kLine);
    EXPECT_EQ(model.StepText("Step-1"), "");
}

TEST(StandardContact, FromALaterStep_IsRemovedInTheFirstGeneralStepAndAddedInItsOwn) {
    InteractionModel model = Standard(R"("Step-2": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Initial"), kBanner + kComment + "*Contact Pair, interaction=P\n" + kLine);
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + kRemove);
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kAdd);
    EXPECT_EQ(model.StepText("Step-3"), "");
}

TEST(StandardContact, AheadOfTheFirstGeneralStep_PerturbationStepsSayNothing) {
    InteractionModel model =
        Standard(R"("Step-3": {"InteractionProperty": "P"})", "", StepsOf({"Frequency", "Static", "Static"}));
    EXPECT_EQ(model.StepText("Step-1"), "");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kRemove);
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kComment + kAdd);
}

TEST(StandardContact, EndedAndBegunAgain_IsRemovedAndAdded) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-1": {"deactivated": true}, "Step-3": {})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + kRemove);
    EXPECT_EQ(model.StepText("Step-2"), "");
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kComment + kAdd);
}

TEST(StandardContact, OfNoStep_IsRemovedInTheFirstGeneralStep) {
    InteractionModel model = Standard("");
    EXPECT_EQ(model.StepText("Initial"), kBanner + kComment + "*Contact Pair, interaction=\n" + kLine);
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + kRemove);
}

TEST(StandardContact, ChangedProperty_HasACopyOfItsFirstOneFromTheStart) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "Q"})");
    EXPECT_EQ(model.StepText("Initial"),
              kBanner + kComment + "*Contact Pair, interaction=_C-Property\n" + kLine);
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kComment + "*Change Friction, interaction=_C-Property\n*Friction, rough\n");
    EXPECT_EQ(model.ModelText(), "** \n** INTERACTION PROPERTIES\n** \n"
                                 "*Surface Interaction, name=P\n1.,\n"
                                 "*Surface Interaction, name=Q\n1.,\n*Friction, rough\n"
                                 "*Surface Interaction, name=_C-Property\n1.,\n");
}

TEST(StandardContact, PropertyThatComesBack_IsAChangeAgain) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kComment + "*Change Friction, interaction=_C-Property\n*Friction\n0.,\n");
}

TEST(StandardContact, PropertyNamedLikeTheCopy_IsReplacedByIt_Wanted) {
    InteractionModel model(
        R"("interactionProperties": {"P": {"class": "kinC_ContactProperty", "tangentialBehavior": {"formulation": 3}},
               "_C-Property": {"class": "kinC_ContactProperty"}}, )" +
        StaticSteps(1) + ", " + Interactions("SelfContactStd", R"("surface": "I.MASTER", "states": {
            "Initial": {"InteractionProperty": "P"}, "Step-1": {"InteractionProperty": "P"}})"));
    EXPECT_EQ(model.ModelText(), "** \n** INTERACTION PROPERTIES\n** \n"
                                 "*Surface Interaction, name=P\n1.,\n*Friction, rough\n"
                                 "*Surface Interaction, name=_C-Property\n1.,\n*Friction, rough\n");
}

TEST(StandardContact, InAnExplicitJob_NamesACopyThatIsNotThere_Wanted) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "Q"})", "",
                 StaticSteps(3) + R"(, "analysisProduct": "EXPLICIT")");
    EXPECT_EQ(model.StepText("Initial"),
              kBanner + kComment + "*Contact Pair, interaction=_C-Property\n" + kLine);
    EXPECT_EQ(model.ModelText(), "** \n** INTERACTION PROPERTIES\n** \n*Surface Interaction, name=P\n"
                                 "*Surface Interaction, name=Q\n*Friction, rough\n");
}

TEST(StandardContact, PropertyTakenAwayInALaterStep_Raises) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-1": {"InteractionProperty": null})");
    EXPECT_EQ(Raised([&] { model.ModelText(); }), "kinC_InteractionProperty: no entry named ''");
}

TEST(StandardContact, PropertyThatBeginsAsNoneAndChanges_Raises) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": null}, "Step-1": {"InteractionProperty": "P"})");
    EXPECT_EQ(Raised([&] { model.ModelText(); }), "kinC_InteractionProperty: no entry named ''");
}

TEST(StandardContact, Clearance_StandsInTheModelBehindTheProperties) {
    InteractionModel model = Standard(R"("Step-2": {"InteractionProperty": "P"})",
                                      R"("clearanceType": 1, "pitch": 1, "clearanceRegion": "I.NODES", )");
    EXPECT_TRUE(model.ModelText().ends_with("*Clearance, master=I.MASTER, slave=I.SLAVE, bolt, tabular\n"
                                            "0., 1., , \nI.NODES, \n"));
    InteractionModel single =
        Standard(R"("Initial": {})", R"("clearanceType": 2, "initialClearance": 0.5, )");
    EXPECT_TRUE(single.ModelText().ends_with("*Clearance, master=I.MASTER, slave=I.SLAVE, value=0.5\n"));
}

namespace {

const std::string kFit = R"("interferenceType": 1)";
const std::string kInterference = "*Contact Interference, shrink\n" + kLine;

} // namespace

TEST(StandardContact, InterferenceOfTheFirstStep_HasItsCommentAheadOfTheBanner_Wanted) {
    InteractionModel model = Standard(R"("Step-1": {)" + kFit + "}");
    EXPECT_EQ(model.StepText("Step-1"), kComment + kBanner + kInterference);
}

TEST(StandardContact, InterferenceOfALaterCreatingStep_SharesTheCommentOfTheModelChange) {
    InteractionModel model = Standard(R"("Step-2": {)" + kFit + "}");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kAdd + kInterference);
}

TEST(StandardContact, InterferenceOfAChange_HasItsCommentBehindTheBanner) {
    InteractionModel model = Standard(R"("Initial": {}, "Step-2": {)" + kFit + "}");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kInterference);
    InteractionModel both = Standard(
        R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "Q", )" + kFit + "}");
    EXPECT_EQ(both.StepText("Step-2"), kBanner + kComment +
                                           "*Change Friction, interaction=_C-Property\n*Friction, rough\n" +
                                           kInterference);
}

TEST(StandardContact, InterferenceThatIsCarried_IsSaidAgainWithAnyChange_Wanted) {
    InteractionModel model = Standard(R"("Step-1": {)" + kFit + R"(}, "Step-3": {"amplitude": ""})");
    EXPECT_EQ(model.StepText("Step-2"), "");
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kComment + kInterference);
}

// Controls of the implicit solver.

TEST(StandardControlsHistory, DefaultInTheCreatingStep_AreNotWritten) {
    EXPECT_EQ(Standard(R"("Step-1": {"ContactControls": "Default"})").StepText("Step-1"), "");
}

TEST(StandardControlsHistory, InTheCreatingStep_AreWrittenOnce) {
    InteractionModel model = Standard(R"("Step-2": {"ContactControls": "Max"})");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kComment + kAdd + kControls + kStdControls + ", maxchp=3\n");
    EXPECT_EQ(model.StepText("Step-3"), "");
}

TEST(StandardControlsHistory, FromTheInitialStep_AreWrittenInTheFirstGeneralStepAsNotNew) {
    InteractionModel model = Standard(R"("Initial": {"ContactControls": "Max"})");
    EXPECT_EQ(model.StepText("Step-1"),
              kBanner + kControls + kStdControls + ", reset\n" + kStdControls + ", maxchp=3\n");
    EXPECT_EQ(model.StepText("Step-2"), "");
    EXPECT_EQ(Standard(R"("Initial": {"ContactControls": "Default"})").StepText("Step-1"),
              kBanner + kControls + kStdControls + ", reset\n");
}

TEST(StandardControlsHistory, FromTheInitialStep_SkipPerturbationStepsAheadOfTheFirstGeneralOne) {
    InteractionModel model =
        Standard(R"("Initial": {"ContactControls": "Max"})", "", StepsOf({"Frequency", "Static", "Static"}));
    EXPECT_EQ(model.StepText("Step-1"), "");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kControls + kStdControls + ", reset\n" + kStdControls + ", maxchp=3\n");
}

TEST(StandardControlsHistory, ChangedLater_ResetFirst) {
    InteractionModel model = Standard(
        R"("Initial": {}, "Step-2": {"ContactControls": "Max"}, "Step-3": {"ContactControls": "Default"})");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kControls + kStdControls + ", reset\n" + kStdControls + ", maxchp=3\n");
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kControls + kStdControls + ", reset\n");
}

TEST(StandardControlsHistory, ClearedLater_AreReset) {
    InteractionModel model =
        Standard(R"("Step-1": {"ContactControls": "Max"}, "Step-2": {"ContactControls": null})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kControls + kStdControls + ", reset\n");
    EXPECT_EQ(model.StepText("Step-3"), "");
}

TEST(StandardControlsHistory, ClearedInTheCreatingStep_WriteNothing) {
    EXPECT_EQ(Standard(R"("Step-1": {"ContactControls": null})").StepText("Step-1"), "");
}

TEST(StandardControlsHistory, ClearedWithTheirName_AreWrittenInAnyStepButTheFirst_Wanted) {
    const std::string cleared = R"({"ContactControls": {"value": "Max", "state": 3}})";
    InteractionModel model = Standard(R"("Initial": {}, "Step-1": )" + cleared + R"(, "Step-2": )" + cleared);
    EXPECT_EQ(model.StepText("Step-1"), "");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kControls + kStdControls + ", reset\n" + kStdControls + ", maxchp=3\n");
}

TEST(StandardControlsHistory, InTheStepThatEndsThePair_AreNotWritten) {
    InteractionModel model =
        Standard(R"("Initial": {}, "Step-1": {"deactivated": true, "ContactControls": "Max"})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + kRemove);
}

// Self contact of the implicit solver.

TEST(StandardSelfContact, ChangedProperty_HasNeitherBannerNorComment_Wanted) {
    InteractionModel model = Contact("SelfContactStd", R"("Initial": {"InteractionProperty": "P"},
                                                          "Step-2": {"InteractionProperty": "Q"})");
    EXPECT_EQ(model.StepText("Initial"),
              kBanner + kComment + "*Contact Pair, interaction=_C-Property\nI.MASTER,\n");
    EXPECT_EQ(model.StepText("Step-2"), "*Change Friction, interaction=_C-Property\n*Friction, rough\n");
}

TEST(StandardSelfContact, FromALaterStep_IsRemovedAndAdded) {
    InteractionModel model = Contact("SelfContactStd", R"("Step-2": {"InteractionProperty": "P"},
                                                          "Step-3": {"deactivated": true})");
    EXPECT_EQ(model.StepText("Step-1"),
              kBanner + kComment + "*Model Change, type=CONTACT PAIR, remove\nI.MASTER, \n");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kComment + "*Model Change, type=CONTACT PAIR, add\nI.MASTER, \n");
    EXPECT_EQ(model.StepText("Step-3"),
              kBanner + kComment + "*Model Change, type=CONTACT PAIR, remove\nI.MASTER, \n");
}

TEST(StandardSelfContact, Controls_NameTheSurfaceTwice) {
    InteractionModel model = Contact("SelfContactStd", R"("Step-1": {"ContactControls": "Max"})");
    EXPECT_EQ(model.StepText("Step-1"),
              kBanner + kControls + "*Contact Controls, master=I.MASTER, slave=I.MASTER, maxchp=3\n");
}

// Contact of the explicit solver.

TEST(ExplicitContact, FromTheInitialStep_StandsInTheFirstAnalysisStep) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Initial"), "");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + XplPair("P"));
    EXPECT_EQ(model.StepText("Step-2"), "");
}

TEST(ExplicitContact, WithOnlyTheInitialStep_WritesNothing) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P"})", "", StepsOf({}));
    EXPECT_EQ(model.StepText("Initial"), "");
}

TEST(ExplicitContact, FromALaterStep_StandsThere) {
    InteractionModel model = Explicit(R"("Step-2": {"InteractionProperty": "P"})");
    EXPECT_EQ(model.StepText("Step-1"), "");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + XplPair("P"));
}

TEST(ExplicitContact, BegunWithoutAProperty_IsNotWritten_Wanted) {
    EXPECT_EQ(Explicit(R"("Step-2": {})").StepText("Step-2"), "");
}

TEST(ExplicitContact, ChangedProperty_IsDeletedAndDeclaredAgain) {
    InteractionModel model =
        Explicit(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "Q"})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + XplPair("P"));
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kDelete + XplPair("Q"));
    // No copy of a property.
    EXPECT_EQ(model.ModelText().find("_C-Property"), std::string::npos);
}

TEST(ExplicitContact, Ended_IsDeleted) {
    InteractionModel model =
        Explicit(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"deactivated": true})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kDelete);
}

TEST(ExplicitContact, BegunAgain_IsDeclaredAgain) {
    InteractionModel model =
        Explicit(R"("Step-1": {"InteractionProperty": "P"}, "Step-2": {"deactivated": true},
                    "Step-3": {"InteractionProperty": "Q"})",
                 "", StepsOf({"ExplicitDynamics", "ExplicitDynamics", "ExplicitDynamics"}));
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kDelete);
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kComment + XplPair("Q"));
}

TEST(ExplicitContact, ChangeOfAnythingButTheProperty_WritesNoPair) {
    InteractionModel model =
        Explicit(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"ContactControls": "Slow"})");
    EXPECT_EQ(model.StepText("Step-2"),
              kBanner + kControls + "*Contact Controls, cpset=C, fastlocaltrk=NO, reset\n");
}

TEST(ExplicitContact, Clearance_StandsInTheFirstAnalysisStepWithoutBanner_Wanted) {
    const std::string clearance = R"("clearanceType": 2, "initialClearance": 0.5, )";
    InteractionModel model = Explicit(R"("Step-2": {"InteractionProperty": "P"})", clearance);
    EXPECT_EQ(model.StepText("Step-1"), "*Clearance, cpset=C, value=0.5\n");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + XplPair("P"));
    InteractionModel initial = Explicit(R"("Initial": {"InteractionProperty": "P"})", clearance);
    EXPECT_EQ(initial.StepText("Step-1"),
              "*Clearance, cpset=C, value=0.5\n" + kBanner + kComment + XplPair("P"));
    EXPECT_EQ(initial.ModelText().find("*Clearance"), std::string::npos);
}

TEST(ExplicitSelfContact, Histories_AreThoseOfAPair) {
    InteractionModel model = Contact("SelfContactXpl",
                                     R"("Initial": {"InteractionProperty": "P"},
                                        "Step-1": {"InteractionProperty": "Q"}, "Step-2": {"deactivated": true})",
                                     "", StepsOf({"ExplicitDynamics", "ExplicitDynamics"}));
    const auto pair = [](const char* property) {
        return std::string("*Contact Pair, interaction=") + property +
               ", mechanical constraint=KINEMATIC, cpset=C\nI.MASTER,\n";
    };
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + pair("P") + kComment +
                                            "*Contact Pair, op=DELETE\nI.MASTER,\n" + pair("Q"));
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + "*Contact Pair, op=DELETE\nI.MASTER,\n");
}

// Controls of the explicit solver.

TEST(ExplicitControlsHistory, DefaultInTheCreatingStep_AreNotWritten) {
    EXPECT_EQ(Explicit(R"("Step-1": {"InteractionProperty": "P", "ContactControls": "XDefault"})")
                  .StepText("Step-1"),
              kBanner + kComment + XplPair("P"));
    EXPECT_EQ(Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "XDefault"})")
                  .StepText("Step-1"),
              kBanner + kComment + XplPair("P"));
}

TEST(ExplicitControlsHistory, FromTheInitialStep_StandInTheFirstAnalysisStep) {
    InteractionModel model =
        Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "Slow"})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + XplPair("P") + kControls +
                                            "*Contact Controls, cpset=C, fastlocaltrk=NO, reset\n");
    EXPECT_EQ(model.StepText("Step-2"), "");
}

TEST(ExplicitControlsHistory, FromTheInitialStepOfAPairThatTheFirstStepEnds_AreNotWritten) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "Slow"},
                                         "Step-1": {"deactivated": true})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + XplPair("P") + kComment + kDelete);
}

TEST(ExplicitControlsHistory, WithOnlyTheInitialStep_StandInIt_Wanted) {
    InteractionModel model =
        Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "Slow"})", "", StepsOf({}));
    EXPECT_EQ(model.StepText("Initial"),
              kBanner + kControls + "*Contact Controls, cpset=C, fastlocaltrk=NO, reset\n");
}

TEST(ExplicitControlsHistory, DefaultLater_ResetAll) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "Slow"},
                                         "Step-2": {"ContactControls": "XDefault"})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kControls + "*Contact Controls, cpset=C, reset\n");
}

TEST(ExplicitControlsHistory, ClearedLater_AreReset) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P", "ContactControls": "Slow"},
                                         "Step-2": {"ContactControls": null})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kControls + "*Contact Controls, cpset=C, reset\n");
}

TEST(ExplicitControlsHistory, ClearedInTheCreatingStep_WriteNotEvenTheComment) {
    EXPECT_EQ(
        Explicit(R"("Step-1": {"InteractionProperty": "P", "ContactControls": null})").StepText("Step-1"),
        kBanner + kComment + XplPair("P"));
}

TEST(ExplicitControlsHistory, ClearedWithTheirName_AreNotWritten_Wanted) {
    InteractionModel model = Explicit(R"("Initial": {"InteractionProperty": "P"},
                                         "Step-2": {"ContactControls": {"value": "Slow", "state": 3}})");
    EXPECT_EQ(model.StepText("Step-2"), "");
}

// General contact.

namespace {

InteractionModel General(const std::string& states, const std::string& members = "") {
    return InteractionModel(StaticSteps(3) + ", " +
                            Interactions("ContactExp", members + "\"states\": {" + states + "}"));
}

const std::string kWhole = "*Contact, op=NEW\n*Contact Inclusions, ALL EXTERIOR\n";

} // namespace

TEST(GeneralContactHistory, BeginsAndChanges_WithContent) {
    InteractionModel model = General(R"("Initial": {"wholeModelContact": true}, "Step-2": {})");
    EXPECT_EQ(model.StepText("Initial"), kBanner + kComment + kWhole);
    EXPECT_EQ(model.StepText("Step-1"), "");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kComment + kWhole);
}

TEST(GeneralContactHistory, Ended_IsABareKeywordWithoutComment) {
    InteractionModel model =
        General(R"("Step-1": {"wholeModelContact": true}, "Step-2": {"deactivated": true})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kComment + kWhole);
    EXPECT_EQ(model.StepText("Step-2"), kBanner + "*Contact, op=NEW\n");
    EXPECT_EQ(model.StepText("Step-3"), "");
}

TEST(GeneralContactHistory, OneEndsAndAnotherBeginsInAStep_TheBareKeywordIsLeftOut) {
    InteractionModel model(StaticSteps(2) + R"(, "interactions": {
        "A": {"class": "kinC_ContactExp", "states": {"Step-1": {}, "Step-2": {"deactivated": true}}},
        "B": {"class": "kinC_ContactExp", "states": {"Step-2": {"wholeModelContact": true}}}})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + "** Interaction: B\n" + kWhole);
}

TEST(GeneralContactHistory, SuppressedOneThatEnds_StillBringsTheBareKeyword_Wanted) {
    InteractionModel model(StaticSteps(2) + R"(, "interactions": {
        "A": {"class": "kinC_ContactExp", "suppressed": true,
              "states": {"Step-1": {}, "Step-2": {"deactivated": true}}},
        "B": {"class": "kinC_ContactExp", "states": {"Step-1": {"wholeModelContact": true}}}})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + "*Contact, op=NEW\n");
}

TEST(GeneralContactHistory, SuppressedAlone_WritesNothing) {
    InteractionModel model =
        General(R"("Step-1": {}, "Step-2": {"deactivated": true})", R"("suppressed": true, )");
    for (const char* step : {"Initial", "Step-1", "Step-2", "Step-3"}) EXPECT_EQ(model.StepText(step), "");
}

// Cavity radiation.

namespace {

InteractionModel
Cavity(const std::string& states,
       const std::string& steps = StepsOf({"HeatTransfer", "HeatTransfer", "HeatTransfer"})) {
    return InteractionModel(
        steps + ", " +
        Interactions("CavityRadiation", R"("surfaces": ["I.MASTER"], "states": {)" + states + "}"));
}

const std::string kOn = "*Radiation Viewfactor, cavity=C, blocking=ALL, reflection=YES, vtol=0.05\n";
const std::string kOff = "*Radiation Viewfactor, cavity=C, off\n";

} // namespace

TEST(CavityRadiationHistory, FromTheInitialStep_IsSaidInTheFirstAnalysisStep) {
    InteractionModel model = Cavity(R"("Initial": {})");
    EXPECT_EQ(model.StepText("Initial"), "*Cavity Definition, name=C\nI.MASTER\n");
    EXPECT_EQ(model.StepText("Step-1"), kOn);
    EXPECT_EQ(model.StepText("Step-2"), "");
}

TEST(CavityRadiationHistory, BegunChangedAndEnded_IsOffInEveryOtherStep_Wanted) {
    InteractionModel model = Cavity(R"("Step-2": {}, "Step-3": {"vtol": 0.5})");
    EXPECT_EQ(model.StepText("Initial"), "*Cavity Definition, name=C\nI.MASTER\n");
    EXPECT_EQ(model.StepText("Step-1"), kOff);
    EXPECT_EQ(model.StepText("Step-2"), kOn);
    EXPECT_EQ(model.StepText("Step-3"),
              "*Radiation Viewfactor, cavity=C, blocking=ALL, reflection=YES, vtol=0.5\n");
    InteractionModel ended = Cavity(R"("Step-1": {}, "Step-2": {"deactivated": true})");
    EXPECT_EQ(ended.StepText("Step-2"), kOff);
    EXPECT_EQ(ended.StepText("Step-3"), kOff);
}

TEST(CavityRadiationHistory, StepOfStatusSixOrSeven_SwitchesOff) {
    for (const char* status : {"6", "7"}) {
        InteractionModel model = Cavity(std::string(R"("Step-1": {}, "Step-2": {"status": )") + status + "}");
        EXPECT_EQ(model.StepText("Step-2"), kOff);
    }
}

TEST(CavityRadiationHistory, AliveInAPerturbationStep_Raises) {
    InteractionModel model = Cavity(R"("Initial": {})", StepsOf({"Static", "Frequency"}));
    EXPECT_EQ(Raised([&] { model.ModelText(); }), "Error in cavity radiation history status.");
}

// What steps say anew.

namespace {

InteractionModel Films(const std::string& statesOfA, const std::string& statesOfB,
                       const std::string& className = "FilmCondition") {
    const std::string head = R"({"class": "kinC_)" + className + R"(", "surface": "I.MASTER", "states": {)";
    return InteractionModel(StepsOf({"HeatTransfer", "HeatTransfer", "HeatTransfer"}) +
                            R"(, "interactions": {"A": )" + head + statesOfA + R"(}}, "B": )" + head +
                            statesOfB + "}}}");
}

const std::string kA = "** Interaction: A\n";
const std::string kB = "** Interaction: B\n";
const std::string kFilm = "I.MASTER, F, 0., 0.\n";

} // namespace

TEST(StepInteractions, Film_IsSaidWhereItBeginsOrChanges) {
    InteractionModel model = Films(R"("Step-1": {}, "Step-3": {"sinkTemperature": 5})", R"("Step-2": {})");
    EXPECT_EQ(model.StepText("Initial"), "");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kA + "*Sfilm\n" + kFilm);
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kB + "*Sfilm\n" + kFilm);
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kA + "*Sfilm\nI.MASTER, F, 5., 0.\n");
}

TEST(StepInteractions, EndOfAFilm_SaysAllOthersAgain) {
    InteractionModel model = Films(R"("Step-1": {}, "Step-2": {"deactivated": true})", R"("Step-1": {})");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kA + "*Sfilm, op=NEW\n" + kB + "*Sfilm, op=NEW\n" + kFilm);
    EXPECT_EQ(model.StepText("Step-3"), "");
}

TEST(StepInteractions, FilmOfTheInitialStep_IsNeverWrittenUntilAnotherEnds_Wanted) {
    InteractionModel model = Films(R"("Initial": {})", R"("Step-1": {}, "Step-3": {"deactivated": true})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kB + "*Sfilm\n" + kFilm);
    EXPECT_EQ(model.StepText("Step-2"), "");
    EXPECT_EQ(model.StepText("Step-3"), kBanner + kA + "*Sfilm, op=NEW\n" + kFilm + kB + "*Sfilm, op=NEW\n");
}

TEST(StepInteractions, Families_EndApart) {
    InteractionModel model(StepsOf({"HeatTransfer", "HeatTransfer"}) + R"(, "interactions": {
        "A": {"class": "kinC_FilmCondition", "surface": "I.MASTER", "states": {"Step-1": {}, "Step-2": {"deactivated": true}}},
        "B": {"class": "kinC_RadiationToAmbient", "surface": "I.SLAVE", "states": {"Step-1": {}}},
        "C": {"class": "kinC_ConcRadiationToAmbient", "surface": "I.NODES", "states": {"Step-1": {}}}})");
    EXPECT_EQ(model.StepText("Step-1"), kBanner + kA + "*Sfilm\n" + kFilm + kB +
                                            "*Sradiate\nI.SLAVE, R, 0., 0.\n" + kComment +
                                            "*Cradiate\nI.NODES, 1., 0., 0.\n");
    EXPECT_EQ(model.StepText("Step-2"), kBanner + kA + "*Sfilm, op=NEW\n");
}

TEST(StepInteractions, FilmInAPerturbationStep_IsLeftAlone) {
    InteractionModel model(
        StepsOf({"Static", "Frequency"}) + ", " +
        Interactions("FilmCondition", R"("surface": "I.MASTER", "states": {"Step-1": {}})"));
    EXPECT_EQ(model.StepText("Step-2"), "");
}

TEST(StepInteractions, ClassesWithoutAFamily_RaiseInTheFirstAnalysisStep_Wanted) {
    for (const char* className : {"ConcFilmCondition", "AcousticImpedance", "IncidentWave"}) {
        InteractionModel model(StaticSteps(1) + ", " + Interactions(className, R"("states": {})"));
        EXPECT_EQ(Raised([&] { model.ModelText(); }),
                  "\"Unimplemented interaction->statusKey conversion\" == 0")
            << className;
    }
}

TEST(StepInteractions, ClassesWithoutAFamily_WriteNothingWithoutAnAnalysisStep) {
    InteractionModel model(StepsOf({}) + ", " + Interactions("IncidentWave", R"("states": {"Initial": {}})"));
    EXPECT_EQ(model.StepText("Initial"), "");
}

TEST(StepInteractions, Suppressed_LeaveNoTraceAndDoNotRaise) {
    InteractionModel model(StaticSteps(1) + ", " +
                           Interactions("IncidentWave", R"("suppressed": true, "states": {"Step-1": {}})"));
    EXPECT_EQ(model.StepText("Step-1"), "");
}

TEST(InteractionHistory, SuppressedContact_LeavesNoTrace) {
    InteractionModel model =
        Standard(R"("Initial": {"InteractionProperty": "P"}, "Step-2": {"InteractionProperty": "Q"})",
                 R"("suppressed": true, "clearanceType": 2, "initialClearance": 1, )");
    for (const char* step : {"Initial", "Step-1", "Step-2", "Step-3"}) EXPECT_EQ(model.StepText(step), "");
    EXPECT_EQ(model.ModelText().find("_C-Property"), std::string::npos);
    EXPECT_EQ(model.ModelText().find("*Clearance"), std::string::npos);
}

TEST(InteractionHistory, ElasticFoundationAndCyclicSymmetry_WriteNothing) {
    for (const char* className : {"ElasticFoundation", "CyclicSymmetry"}) {
        InteractionModel model(StaticSteps(1) + ", " +
                               Interactions(className, R"("states": {"Initial": {}})"));
        EXPECT_EQ(model.StepText("Initial"), "");
        EXPECT_EQ(model.StepText("Step-1"), "");
    }
}

TEST(InteractionHistory, ControlsThatAreNotThere_Raise) {
    InteractionModel model = Standard(R"("Step-1": {"ContactControls": "Max"})");
    model.Model().contactControls.Remove("Max");
    EXPECT_EQ(Raised([&] { model.ModelText(); }), "kinC_ContactControls: no entry named 'Max'");
}

// Properties.

TEST(InteractionProperties, OfAllKinds_ComeInNameOrderUnderOneBanner) {
    InteractionModel model(R"("interactionProperties": {
        "C": {"class": "kinC_ContactProperty", "geometricProperties": {"contactArea": 2},
              "radiation": {}, "heatGeneration": {}, "thermalConductance": {"definition": 1},
              "damping": {"table": [[1, 0]]}, "normalBehavior": {}, "tangentialBehavior": {}},
        "B": {"class": "kinC_AcousticImpedanceProp"}, "A": {"class": "kinC_FilmConditionProp"}}, )" +
                           StaticSteps(1));
    EXPECT_EQ(model.ModelText(), "** \n** INTERACTION PROPERTIES\n** \n"
                                 "*Film Property, name=A\n"
                                 "*Impedance Property, name=B, data=IMPEDANCE\n"
                                 "*Surface Interaction, name=C\n2.,\n"
                                 "*Friction\n0.,\n"
                                 "*Surface Behavior, pressure-overclosure=HARD\n"
                                 "*Contact Damping, definition=DAMPING COEFFICIENT\n1., \n"
                                 "*Gap Conductance, user\n"
                                 "*Gap Heat Generation\n1., 0.5\n"
                                 "*Gap Radiation\n0., 0.\n");
}

TEST(InteractionProperties, OfIncidentWaves_BringNotEvenTheBanner_Wanted) {
    InteractionModel model(R"("interactionProperties": {"W": {"class": "kinC_IncidentWaveProperty"}}, )" +
                           StaticSteps(1));
    EXPECT_EQ(model.ModelText(), "");
}
