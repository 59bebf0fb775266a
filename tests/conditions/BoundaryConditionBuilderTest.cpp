#include "conditions/oif_BoundaryConditionBuilder.h"

#include "conditions/ConditionTesting.h"

namespace {

const std::string kBanner = "** \n** BOUNDARY CONDITIONS\n** \n";

class AnyUnfamiliarCondition final : public cls_RecordOf<AnyUnfamiliarCondition, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"AnyUnfamiliarCondition", "a condition without a keyword",
                                         0x2980098};
    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};

std::string Conditions(const std::string& entries) {
    return R"("boundaryConditions": {)" + entries + "}";
}
std::string Displacement(const char* name, const char* region, const std::string& states) {
    return std::string("\"") + name + R"(": {"class": "kbcC_DisplacementBC", "region": ")" + region +
           R"(", "states": {)" + states + "}}";
}

} // namespace

TEST(BoundaryConditionBuilder, NoConditions_AddNothing) {
    ConditionModel model("IG", "");
    EXPECT_EQ(model.StepText("S0") + model.StepText("S1") + model.AssemblyText(), "");
}

TEST(BoundaryConditionBuilder, ConditionsOfAStep_StandUnderOneBannerInTheOrderOfTheirNames) {
    ConditionModel model("IG", Conditions(Displacement("b", "A.N", R"("S0": {"u1": 0})") + "," +
                                          Displacement("a", "A.N2", R"("S0": {"u2": 1})")));
    EXPECT_EQ(model.StepText("S0"), kBanner +
                                        "** Name: a Type: Displacement/Rotation\n*Boundary\nA.N2, 2, 2, 1.\n"
                                        "** Name: b Type: Displacement/Rotation\n*Boundary\nA.N, 1, 1\n");
}

TEST(BoundaryConditionBuilder, StepWithoutAChange_HasNeitherBannerNorKeyword) {
    ConditionModel model("IG", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 0})")));
    EXPECT_EQ(model.StepText("S1"), "");
}

TEST(BoundaryConditionBuilder, ConditionThatEnds_LetsAllOthersBeSaidAnew) {
    ConditionModel model(
        "IGG", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 0}, "S1": {"deactivated": true})") + "," +
                          Displacement("b", "A.N2", R"("S0": {"u2": 1})") + "," +
                          Displacement("c", "A.N3", R"("S1": {"u3": 2})")));
    EXPECT_EQ(model.StepText("S1"),
              kBanner + "** Name: a Type: Displacement/Rotation\n*Boundary, op=NEW\n"
                        "** Name: b Type: Displacement/Rotation\n*Boundary, op=NEW\nA.N2, 2, 2, 1.\n"
                        "** Name: c Type: Displacement/Rotation\n*Boundary, op=NEW\nA.N3, 3, 3, 2.\n");
    EXPECT_EQ(model.StepText("S2"), "");
}

TEST(BoundaryConditionBuilder, ConditionsOfOtherFamilies_KeepTheirOwnFlag) {
    ConditionModel model(
        "IG", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 0}, "S1": {"deactivated": true})") +
                         R"(,"c": {"class": "kbcC_ConnVelocityBC", "region": "A.E",
                                             "connectors": ["A.E"], "states": {"S0": {"v1": 1}}})"));
    EXPECT_EQ(model.StepText("S1"), kBanner + "** Name: a Type: Displacement/Rotation\n*Boundary, op=NEW\n");
}

TEST(BoundaryConditionBuilder, SuppressedCondition_LeavesNoTrace) {
    ConditionModel model("IG", Conditions(R"("a": {"class": "kbcC_ConnVelocityBC", "suppressed": true,
        "region": "A.E", "connectors": ["A.E"], "states": {"S0": {"v1": 1}}},
        "b": {"class": "kbcC_SubmodelBC", "suppressed": true, "region": "A.N", "states": {"S0": {"dofs": [1]}}})"));
    EXPECT_EQ(model.StepText("S0") + model.AssemblyText(), "");
}

TEST(BoundaryConditionBuilder, BucklingStep_SaysAllConditionsOfTheBaseStateAnew) {
    ConditionModel model("IGB", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 0.5})")));
    EXPECT_EQ(model.StepText("S2"), kBanner + "** Name: a Type: Displacement/Rotation\n"
                                              "*Boundary, op=NEW, load case=1\nA.N, 1, 1\n"
                                              "*Boundary, op=NEW, load case=2\nA.N, 1, 1\n");
}

TEST(BoundaryConditionBuilder, PerturbationStep_IsSilentOnTheBaseStateUnlessAConditionEndsThere) {
    ConditionModel model(
        "ILL", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 0.5})") + "," +
                          Displacement("b", "A.N2", R"("S0": {"u1": 0}, "S2": {"deactivated": true})")));
    EXPECT_EQ(model.StepText("S1"), "");
    EXPECT_EQ(model.StepText("S2"),
              kBanner + "** Name: a Type: Displacement/Rotation\n*Boundary, op=NEW\nA.N, 1, 1\n"
                        "** Name: b Type: Displacement/Rotation\n*Boundary, op=NEW\n");
}

TEST(BoundaryConditionBuilder, BaseName_StandsInCommentAndParameter) {
    ConditionModel model("I", Conditions(Displacement("__basename__Left", "A.N", R"("S0": {"u1": 0})")));
    EXPECT_EQ(model.StepText("S0"),
              kBanner + "** Name: Left Type: Displacement/Rotation\n*Boundary, base name=Left\nA.N, 1, 1\n");
}

TEST(BoundaryConditionBuilder, ConditionWithoutARegion_HasAnEmptySetName) {
    ConditionModel model(
        "I", Conditions(R"("a": {"class": "kbcC_TypeBC", "states": {"S0": {"typeName": "PINNED"}}})"));
    EXPECT_EQ(model.StepText("S0"),
              kBanner + "** Name: a Type: Symmetry/Antisymmetry/Encastre\n*Boundary\n, PINNED\n");
}

TEST(BoundaryConditionBuilder, LoadCases_HaveNoBannerAndAlwaysOpNew) {
    ConditionModel model(
        R"(IL{"loadCases": {"one": {"bcs": {"a": 0.5}}, "two": {"bcs": {"a": 1e-7, "b": 2}}}})",
        Conditions(Displacement("a", "A.N", R"("S1": {"u1": 2})") + "," +
                   Displacement("b", "A.N2", R"("S0": {"u2": 4})")));
    EXPECT_EQ(model.StepText("S1"), "");
    // b is of the base state: the first case takes it without naming it, with the factor 1.
    EXPECT_EQ(model.StepText("S1", "one"),
              "** Name: a Type: Displacement/Rotation   Scale factor: 0.5\n*Boundary, op=NEW\nA.N, 1, 1, 1.\n"
              "** Name: b Type: Displacement/Rotation   Scale factor: 1\n*Boundary, op=NEW\nA.N2, 2, 2\n");
    EXPECT_EQ(
        model.StepText("S1", "two"),
        "** Name: a Type: Displacement/Rotation   Scale factor: 1e-07\n*Boundary, op=NEW\nA.N, 1, 1, 2e-07\n"
        "** Name: b Type: Displacement/Rotation   Scale factor: 2\n*Boundary, op=NEW\nA.N2, 2, 2\n");
}

TEST(BoundaryConditionBuilder, LoadCaseThatDropsTheBaseState_TakesOnlyWhatItNames) {
    ConditionModel model(R"(IL{"loadCases": {"one": {"baseStateBCs": false, "bcs": {"a": 1}}}})",
                         Conditions(Displacement("a", "A.N", R"("S1": {"u1": 2})") + "," +
                                    Displacement("b", "A.N2", R"("S0": {"u2": 4})")));
    EXPECT_EQ(model.StepText("S1", "one"),
              "** Name: a Type: Displacement/Rotation   Scale factor: 1\n*Boundary, op=NEW\nA.N, 1, 1, 2.\n");
}

TEST(BoundaryConditionBuilder, LoadCaseWithoutConditions_ClearsThoseOfTheStep) {
    ConditionModel model(R"(IL{"loadCases": {"one": {}, "two": {"baseStateBCs": false}}})", "");
    EXPECT_EQ(model.StepText("S1"), "");
    EXPECT_EQ(model.StepText("S1", "one"), "*Boundary, op=NEW\n");
    EXPECT_EQ(model.StepText("S1", "two"), "*Boundary, op=NEW\n");
}

TEST(BoundaryConditionBuilder, LoadCaseThatKeepsTheBaseState_ClearsNothing) {
    ConditionModel model(R"(IL{"loadCases": {"one": {}, "two": {"baseStateBCs": false}}})",
                         Conditions(Displacement("a", "A.N", R"("S0": {"u1": 2})")));
    EXPECT_EQ(model.StepText("S1", "one"),
              "** Name: a Type: Displacement/Rotation   Scale factor: 1\n*Boundary, op=NEW\nA.N, 1, 1\n");
    EXPECT_EQ(model.StepText("S1", "two"), "*Boundary, op=NEW\n");
}

TEST(BoundaryConditionBuilder, SuppressedConditionOfTheBaseState_DoesNotKeepALoadCaseFromClearing) {
    ConditionModel model(
        R"(IL{"loadCases": {"one": {}}})",
        Conditions(R"("a": {"class": "kbcC_DisplacementBC", "suppressed": true, "region": "A.N",
                                             "states": {"S0": {"u1": 2}}})"));
    EXPECT_EQ(model.StepText("S1", "one"), "*Boundary, op=NEW\n");
}

TEST(BoundaryConditionBuilder, ModalDynamicsStep_ClearsNothingInItsLoadCases) {
    ConditionModel model(R"(IM{"loadCases": {"one": {}}})", "");
    EXPECT_EQ(model.StepText("S1", "one"), "");
}

TEST(BoundaryConditionBuilder, ConnectorConditions_TellWhereTheyApplyAndMakeAnElementSet) {
    ConditionModel model("I", Conditions(R"("pull it": {"class": "kbcC_ConnDisplacementBC", "region": "A.E",
        "connectors": ["A.E", "A.two words"], "states": {"S0": {"u1": 1}}})"));
    EXPECT_EQ(model.StepText("S0"), kBanner + "** Name: pull it Type: Connector displacement\n"
                                              "** Applies To: A.E, A.two words\n"
                                              "*Connector Motion\nA.E, 1, 1.\n");
    EXPECT_EQ(model.AssemblyText(), "*Elset, elset=\"pull it\", internal\nA.E, \n\"A.two words\", \n");
}

TEST(BoundaryConditionBuilder, SubmodelsOnTwoSets_EndTheStepUnderOneComment) {
    ConditionModel model("IG", Conditions(R"(
        "z": {"class": "kbcC_TypeBC", "region": "A.N3", "states": {"S1": {"typeName": "PINNED"}}},
        "s1": {"class": "kbcC_SubmodelBC", "region": "A.N", "states": {"S1": {"dofs": [1, 2], "stepName": "2"}}},
        "s2": {"class": "kbcC_SubmodelBC", "region": "A.N2", "states": {"S1": {"dofs": [3], "stepName": "3"}}})"));
    EXPECT_EQ(model.StepText("S1"),
              kBanner + "** Name: z Type: Symmetry/Antisymmetry/Encastre\n*Boundary\nA.N3, PINNED\n"
                        "** Name: s1, s2 Type: Submodel\n"
                        "*Boundary, submodel, step=2\n"
                        "A.N, 1, 1\nA.N, 2, 2\nA.N2, 3, 3\n");
    EXPECT_EQ(model.AssemblyText(), "*Submodel, exteriorTolerance=0.05\nA.N, \nA.N2, \n");
}

TEST(BoundaryConditionBuilder, SubmodelAlone_HasTheBannerAheadOfItsLine) {
    ConditionModel model("IG", Conditions(R"(
        "__basename__s": {"class": "kbcC_SubmodelBC", "region": "A.N", "states": {"S1": {"dofs": [1], "stepName": "2"}}})"));
    EXPECT_EQ(model.StepText("S1"),
              kBanner + "** Name: s Type: Submodel\n*Boundary, submodel, step=2\nA.N, 1, 1\n");
}

TEST(BoundaryConditionBuilder, SubmodelsThatDifferInThickness_AreTwoSubmodels) {
    ConditionModel model("IG", Conditions(R"(
        "s1": {"class": "kbcC_SubmodelBC", "region": "A.N", "shellThickness": 1, "states": {}},
        "s2": {"class": "kbcC_SubmodelBC", "region": "A.N2", "shellThickness": 2, "states": {}},
        "s3": {"class": "kbcC_SubmodelBC", "region": "A.N3", "shellThickness": 1, "states": {}})"));
    EXPECT_EQ(model.AssemblyText(), "*Submodel, shell thickness=1., exteriorTolerance=0.05\nA.N, \nA.N3, \n"
                                    "*Submodel, shell thickness=2., exteriorTolerance=0.05\nA.N2, \n");
}

TEST(BoundaryConditionBuilder, SubmodelInTwoLoadCases_IsAppendedForEach) {
    ConditionModel model(R"(IL{"loadCases": {"one": {"bcs": {"s": 1}}, "two": {"bcs": {"s": 1}}}})",
                         Conditions(R"("s": {"class": "kbcC_SubmodelBC", "region": "A.N",
                                             "states": {"S1": {"dofs": [1], "stepName": "2"}}})"));
    EXPECT_EQ(model.StepText("S1", "one") + model.StepText("S1", "two"), "");
    EXPECT_EQ(model.StepText("S1"), "** Name: s, s Type: Submodel\n*Boundary, op=NEW, submodel, step=2\n"
                                    "A.N, 1, 1\nA.N, 1, 1\n");
}

TEST(BoundaryConditionBuilder, BoltsByTheirMethods_AreCommentsWithoutAKeyword) {
    ConditionModel model("IGGGG", R"("loads": {
        "by force": {"class": "kloC_BoltLoad", "region": "A.F", "states": {"S1": {"boltMethod": 0}, "S4": {"deactivated": true}}},
        "by length": {"class": "kloC_BoltLoad", "region": "A.E", "states": {"S1": {"boltMethod": 1, "adjustment": 2}, "S4": {"boltMethod": 0}}},
        "then held": {"class": "kloC_BoltLoad", "region": "A.N", "states": {"S1": {"boltMethod": 0}, "S2": {"boltMethod": 2}}}})");
    const auto comment = [](const char* name) {
        return std::string("** Name: ") + name + " Type: Bolt load\n";
    };
    EXPECT_EQ(model.StepText("S0"), "");
    EXPECT_EQ(model.StepText("S1"), kBanner + comment("by length"));
    EXPECT_EQ(model.StepText("S2"), kBanner + comment("by length") + comment("then held"))
        << "carried: the flag is set";
    EXPECT_EQ(model.StepText("S3"), "");
    EXPECT_EQ(model.StepText("S4"),
              kBanner + comment("by force") + comment("by length") + comment("then held"));
}

TEST(BoundaryConditionBuilder, BoltInALoadCase_KeepsItFromClearing) {
    ConditionModel model(
        R"(IL{"loadCases": {"one": {"loads": {"bolt": 0.25}}, "two": {"loads": {"force": 2}}}})",
        R"("loads": {
        "bolt": {"class": "kloC_BoltLoad", "region": "A.F", "states": {"S1": {"boltMethod": 2}}},
        "force": {"class": "kloC_BoltLoad", "region": "A.E", "states": {"S1": {"boltMethod": 0}}}})");
    EXPECT_EQ(model.StepText("S1", "one"), "** Name: bolt Type: Bolt load   Scale factor: 0.25\n");
    EXPECT_EQ(model.StepText("S1", "two"), "*Boundary, op=NEW\n")
        << "a bolt tightened by a force wrote nothing";
    EXPECT_EQ(model.StepText("S1"), "");
}

TEST(BoundaryConditionBuilder, BoltOfTheBaseStateOrSuppressed_IsPassedOver) {
    ConditionModel model("IGL", R"("loads": {
        "built in": {"class": "kloC_BoltLoad", "region": "A.F", "states": {"S1": {"boltMethod": 1}}},
        "off": {"class": "kloC_BoltLoad", "region": "A.E", "suppressed": true, "states": {"S1": {"boltMethod": 1}}}})");
    EXPECT_EQ(model.StepText("S1"), kBanner + "** Name: built in Type: Bolt load\n");
    EXPECT_EQ(model.StepText("S2"), "");
}

TEST(BoundaryConditionBuilder, BoltNamedWithAPrefix_LosesIt) {
    ConditionModel model("IG", R"("loads": {"__basename__b": {"class": "kloC_BoltLoad", "region": "A.F",
                                             "states": {"S1": {"boltMethod": 1}}}})");
    EXPECT_EQ(model.StepText("S1"), kBanner + "** Name: b Type: Bolt load\n");
}

TEST(BoundaryConditionBuilder, Comment_WithoutALabelEndsWithABlank) {
    EXPECT_EQ(oif_BoundaryConditionBuilder::Comment("x", ""), cow_String("Name: x Type: "));
    EXPECT_EQ(oif_BoundaryConditionBuilder::Comment("__basename__x", "Temperature"),
              cow_String("Name: x Type: Temperature"));
}

TEST(BoundaryConditionBuilder, Comment_HasTheScaleOfItsLoadCaseInSinglePrecision) {
    ConditionModel model(
        R"(IL{"loadCases": {"case": {"bcs": {"x": 0.1}}}})",
        Conditions(
            R"("x": {"class": "kbcC_TemperatureBC", "region": "A.N", "states": {"S1": {"magnitude": 0}}})"));
    EXPECT_EQ(model.StepText("S1", "case"),
              "** Name: x Type: Temperature   Scale factor: 0.1\n*Boundary, op=NEW\nA.N, 11, 11\n");
}

TEST(BoundaryConditionBuilder, BoltOfTheInitialStep_IsPassedOverThere) {
    ConditionModel model("IG", R"("loads": {"b": {"class": "kloC_BoltLoad", "region": "A.F",
                                             "states": {"S0": {"boltMethod": 1}}}})");
    EXPECT_EQ(model.StepText("S0") + model.StepText("S1"), "");
}

TEST(BoundaryConditionBuilder, EveryStatus_IsWrittenAlwaysInLoadCasesOrNever) {
    const std::string comment = "** Name: a Type: Displacement/Rotation";
    const std::string line = "A.N, 1, 1, 2.\n";
    for (int status = 0; status < 16; ++status) {
        const std::string states = R"("S1": {"u1": 2, "status": )" + std::to_string(status) + "}";
        ConditionModel inStep("IG", Conditions(Displacement("a", "A.N", states)));
        std::string expected;
        if (status == 1 || status == 3 || status == 10) {
            expected = kBanner + comment + "\n*Boundary\n" + line;
        } else if (status == 4 || status == 11) {
            expected = kBanner + comment + "\n*Boundary, op=NEW\n";
        }
        EXPECT_EQ(inStep.StepText("S1"), expected) << status;

        ConditionModel inCase(R"(IL{"loadCases": {"c": {"bcs": {"a": 1}}}})",
                              Conditions(Displacement("a", "A.N", states)));
        const std::string scaled = comment + "   Scale factor: 1\n*Boundary, op=NEW\n";
        expected.clear();
        if (status == 4 || status == 11) {
            expected = scaled;
        } else if (status == 1 || status == 2 || status == 3 || status == 9 || status == 10) {
            expected = scaled + line;
        }
        EXPECT_EQ(inCase.StepText("S1", "c"), expected) << status;
    }
}

TEST(BoundaryConditionBuilder, ConditionEndedInTheInitialStep_HasNoOpNewSinceThatStepHasNoFlag) {
    ConditionModel model("I", Conditions(Displacement("a", "A.N", R"("S0": {"u1": 2, "status": 4})")));
    EXPECT_EQ(model.StepText("S0"), kBanner + "** Name: a Type: Displacement/Rotation\n*Boundary\n");
}

TEST(BoundaryConditionBuilder, ClassWithoutAFamily_Fails) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    AnyUnfamiliarCondition unknown;
    store.model.boundaryConditions.Insert("u", unknown);
    store.model.Complete();
    EXPECT_EQ(Raised([&] { oif_BoundaryConditionBuilder(store.Info()).Build(); }),
              "Unimplemented bc->statusKey conversion");
}
