#include "conditions/oif_Boundary.h"

#include "conditions/ConditionTesting.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"

namespace {

/// A condition "B" on the node set N, of the class and with the states, in steps by their letters.
class OneCondition : public ConditionModel {
public:
    OneCondition(std::string_view steps, const std::string& className, const std::string& states,
                 const std::string& fields = "")
        : ConditionModel(steps, R"("boundaryConditions": {"B": {"class": ")" + className + "\"" +
                                    (fields.empty() ? "" : ", " + fields) +
                                    R"(, "region": "A.N", "states": {)" + states + "}}}") {}

    const kbcC_BC& Record() const { return Condition("B"); }
    oif_BCCard Card(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0,
                    const char* name = "B") const {
        return {name, Record(), "A.N", step, op, {}, static_cast<float>(scale)};
    }
    std::string Boundary(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0,
                         const char* name = "B", bool shellToSolid = false) const {
        return Written(oif_Boundary(Card(step, op, scale, name), shellToSolid, "S0"));
    }
    std::string Motion(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0) const {
        oif_BCCard card = Card(step, op, scale);
        card.setName = "A.E";
        return Written(oif_ConnectorMotion(card, "S0"));
    }
};

const char kDisplacement[] = "kbcC_DisplacementBC";

/// A class that has no form.
class OtherCondition final : public cls_RecordOf<OtherCondition, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"OtherCondition", "a condition without a keyword", 0x2980099};
    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};

} // namespace

TEST(Boundary, Displacement_WritesTheComponentsThatWereSet) {
    const OneCondition model("IG", kDisplacement,
                             R"("S1": {"u1": 0.5, "u2": -2, "u3": 0, "ur1": 1e-5, "ur2": 3, "ur3": 4})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\n"
                                    "A.N, 1, 1, 0.5\n"
                                    "A.N, 2, 2, -2.\n"
                                    "A.N, 3, 3\n"
                                    "A.N, 4, 4, 1e-05\n"
                                    "A.N, 5, 5, 3.\n"
                                    "A.N, 6, 6, 4.\n");
}

TEST(Boundary, ValueOfZero_LeavesTheValueOutAndTheLineStays) {
    const OneCondition model("I", kDisplacement, R"("S0": {"u2": -0.0})");
    EXPECT_EQ(model.Boundary("S0"), "*Boundary\nA.N, 2, 2\n");
}

TEST(Boundary, DisplacementThatAddsAndChanges_WritesWhatWasSetInTheStep) {
    const OneCondition model("IG", kDisplacement, R"("S0": {"u1": 1, "u2": 2}, "S1": {"u2": 3})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\nA.N, 2, 2, 3.\n");
}

TEST(Boundary, DisplacementWithOpNew_WritesWhatIsCarriedToo) {
    const OneCondition model("IG", kDisplacement, R"("S0": {"u1": 1, "u2": 2}, "S1": {"u2": 3})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\nA.N, 1, 1, 1.\nA.N, 2, 2, 3.\n");
}

TEST(Boundary, DisplacementWithoutAComponentThatPasses_StillWritesItsCard) {
    const OneCondition model("IG", kDisplacement, R"("S0": {"u1": 1})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\n");
}

TEST(Boundary, ComponentThatIsCleared_IsNotWritten) {
    const OneCondition model("IG", kDisplacement, R"("S0": {"u1": 1, "u2": 2}, "S1": {"u1": null})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\nA.N, 2, 2, 2.\n");
}

TEST(Boundary, Scale_MultipliesEveryValue) {
    const OneCondition model("IG", kDisplacement, R"("S1": {"u1": 2, "ur3": -4})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW, 0.5), "*Boundary, op=NEW\nA.N, 1, 1, 1.\nA.N, 6, 6, -2.\n");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW, 0.0), "*Boundary, op=NEW\nA.N, 1, 1\nA.N, 6, 6\n");
}

TEST(Boundary, AmplitudeThatIsNew_BringsAllComponentsAlong) {
    const OneCondition model("IG", kDisplacement,
                             R"("S0": {"u1": 1, "u2": 2}, "S1": {"amplitude": "my amp", "u2": 3})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary, amplitude=\"my amp\"\nA.N, 1, 1, 1.\nA.N, 2, 2, 3.\n");
}

TEST(Boundary, AmplitudeThatIsTakenAway_BringsAllComponentsAlong) {
    const OneCondition model("IGG", kDisplacement,
                             R"("S0": {"u1": 1}, "S1": {"amplitude": "Ramp"}, "S2": {"amplitude": null})");
    EXPECT_EQ(model.Boundary("S2"), "*Boundary\nA.N, 1, 1, 1.\n");
}

TEST(Boundary, AmplitudeThatIsCarried_IsWrittenAndChangesNothing) {
    const OneCondition model("IGG", kDisplacement,
                             R"("S0": {"u1": 1}, "S1": {"amplitude": "Ramp"}, "S2": {"u2": 2})");
    EXPECT_EQ(model.Boundary("S2"), "*Boundary, amplitude=Ramp\nA.N, 2, 2, 2.\n");
}

TEST(Boundary, ConditionThatEnds_IsItsCardAlone) {
    const OneCondition model("IG", kDisplacement,
                             R"("S0": {"u1": 1, "amplitude": "Ramp"}, "S1": {"u2": 3, "deactivated": true})",
                             R"("fixed": true, "distributionType": 1)");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\n");
}

TEST(Boundary, ConditionThatEndsInABucklingStep_HasTheFirstLoadCase) {
    const OneCondition model("IB", kDisplacement, R"("S0": {"u1": 1}, "S1": {"deactivated": true})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW, load case=1\n");
    const OneCondition other("IL", kDisplacement, R"("S0": {"u1": 1}, "S1": {"deactivated": true})");
    EXPECT_EQ(other.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\n");
}

TEST(Boundary, FixedDisplacement_HasNoValues) {
    const OneCondition model("IG", kDisplacement, R"("S1": {"u1": 1, "ur2": 0})", R"("fixed": true)");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary, fixed\nA.N, 1, 1\nA.N, 5, 5\n");
}

TEST(Boundary, UserDefinedDistribution_IsAFlagAndAFieldIsNone) {
    const OneCondition user("IG", kDisplacement, R"("S1": {"u1": 1})",
                            R"("distributionType": "USER_DEFINED", "fixed": true)");
    EXPECT_EQ(user.Boundary("S1"), "*Boundary, fixed, user\nA.N, 1, 1\n");
    const OneCondition field("IG", kDisplacement, R"("S1": {"u1": 1})", R"("distributionType": "FIELD")");
    EXPECT_EQ(field.Boundary("S1"), "*Boundary\nA.N, 1, 1, 1.\n");
}

TEST(Boundary, BaseName_IsTheLastParameter) {
    const OneCondition model("IG", kDisplacement, R"("S1": {"u1": 1, "amplitude": "Ramp"})",
                             R"("fixed": true)");
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 1.0, "__basename__Base 1"),
              "*Boundary, amplitude=Ramp, fixed, base name=\"Base 1\"\nA.N, 1, 1\n");
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 1.0, "not__basename__"),
              "*Boundary, amplitude=Ramp, fixed\nA.N, 1, 1\n");
}

TEST(Boundary, FixBCNameHack_TakesThePrefixAwayAtTheBeginningOnly) {
    EXPECT_EQ(oif_Boundary::FixBCNameHack("__basename__X"), cow_String("X"));
    EXPECT_EQ(oif_Boundary::FixBCNameHack("__basename__"), cow_String(""));
    EXPECT_EQ(oif_Boundary::FixBCNameHack("X__basename__"), cow_String("X__basename__"));
    EXPECT_EQ(oif_Boundary::FixBCNameHack("__BASENAME__X"), cow_String("__BASENAME__X"));
}

TEST(Boundary, LongCard_BreaksAheadOfTheTypeAndNotAheadOfTheBaseName) {
    const OneCondition model("IG", "kbcC_VelocityBC", R"("S1": {"v2": 1})");
    const std::string name(150, 'n');
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 1.0, ("__basename__" + name).c_str()),
              "*Boundary, base name=" + name + ", \ntype=VELOCITY\nA.N, 2, 2, 1.\n");
}

TEST(Boundary, ComplexDisplacement_IsTwoBlocksOfRealAndImaginaryParts) {
    const OneCondition model("ID", kDisplacement,
                             R"("S1": {"u1": 1, "u2": 2, "u1Imag": 3, "ur3": 0, "ur3Imag": 4})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 2.0), "*Boundary, load case=1\n"
                                                         "A.N, 1, 1, 2.\n"
                                                         "A.N, 2, 2, 4.\n"
                                                         "A.N, 6, 6\n"
                                                         "*Boundary, load case=2\n"
                                                         "A.N, 1, 1, 6.\n"
                                                         "A.N, 2, 2\n"
                                                         "A.N, 6, 6, 8.\n");
}

TEST(Boundary, DisplacementInABucklingStep_EntersTheLoadCasesOfItsBuckleCase) {
    const std::string one = "*Boundary, op=NEW, load case=1\nA.N, 1, 1, 2.\n";
    const std::string two = "*Boundary, op=NEW, load case=2\nA.N, 1, 1, 2.\n";
    const std::pair<int, std::string> cases[] = {{0, one + two}, {1, one}, {2, two}, {3, one + two}};
    for (const auto& [buckleCase, text] : cases) {
        const OneCondition model("IB", kDisplacement,
                                 R"("S1": {"u1": 2, "buckleCase": )" + std::to_string(buckleCase) + "}");
        EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), text) << buckleCase;
    }
}

TEST(Boundary, BuckleCaseOfAnotherNumber_WritesNothingAtAll) {
    for (const char* number : {"5", "4", "-1"}) {
        const OneCondition model("IB", kDisplacement,
                                 std::string(R"("S1": {"u1": 2, "buckleCase": )") + number + "}");
        EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "");
        const OneCondition type("IB", "kbcC_TypeBC",
                                std::string(R"("S1": {"typeName": "PINNED", "buckleCase": )") + number + "}");
        EXPECT_EQ(type.Boundary("S1", oif_Op::NEW), "");
    }
}

TEST(Boundary, ConditionOfTheBaseState_IsRewrittenWithoutItsValue) {
    const OneCondition model("IGB", kDisplacement,
                             R"("S0": {"u1": 0.5, "amplitude": "Ramp"}, "S1": {"u2": 3})");
    EXPECT_EQ(model.Boundary("S2", oif_Op::NEW), "*Boundary, op=NEW, load case=1\nA.N, 1, 1\nA.N, 2, 2\n"
                                                 "*Boundary, op=NEW, load case=2\nA.N, 1, 1\nA.N, 2, 2\n");
}

TEST(Boundary, VelocityAndAcceleration_HaveTheirTypeLast) {
    const OneCondition velocity("IG", "kbcC_VelocityBC",
                                R"("S1": {"v1": 1, "v3": 0, "vr2": 5, "amplitude": "Ramp"})",
                                R"("distributionType": 1)");
    EXPECT_EQ(velocity.Boundary("S1", oif_Op::NEW, 2.0),
              "*Boundary, op=NEW, amplitude=Ramp, user, type=VELOCITY\n"
              "A.N, 1, 1, 2.\nA.N, 3, 3\nA.N, 5, 5, 10.\n");
    const OneCondition acceleration("IG", "kbcC_AccelerationBC",
                                    R"("S0": {"a1": 1}, "S1": {"a2": 2, "ar1": 4, "ar3": 6})");
    EXPECT_EQ(acceleration.Boundary("S1"),
              "*Boundary, type=ACCELERATION\nA.N, 2, 2, 2.\nA.N, 4, 4, 4.\nA.N, 6, 6, 6.\n");
}

TEST(Boundary, VelocityInHarmonicAndBucklingSteps_HasTheFirstLoadCaseOnly) {
    for (const char* steps : {"ID", "IB"}) {
        const OneCondition velocity(steps, "kbcC_VelocityBC", R"("S1": {"v2": 1})");
        EXPECT_EQ(velocity.Boundary("S1"), "*Boundary, load case=1, type=VELOCITY\nA.N, 2, 2, 1.\n");
        const OneCondition acceleration(steps, "kbcC_AccelerationBC", R"("S1": {"a2": 1})");
        EXPECT_EQ(acceleration.Boundary("S1"), "*Boundary, load case=1, type=ACCELERATION\nA.N, 2, 2, 1.\n");
    }
}

TEST(Boundary, BaseNameOfAVelocity_StandsAheadOfTheType) {
    const OneCondition velocity("IG", "kbcC_VelocityBC", R"("S1": {"v2": 1})");
    EXPECT_EQ(velocity.Boundary("S1", oif_Op::MODIFY, 1.0, "__basename__X"),
              "*Boundary, base name=X, type=VELOCITY\nA.N, 2, 2, 1.\n");
}

TEST(Boundary, Type_IsTheWordInPlaceOfTheDegreesOfFreedom) {
    const OneCondition model("IG", "kbcC_TypeBC", R"("S1": {"typeName": "ENCASTRE"})",
                             R"("distributionType": 1)");
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 7.0), "*Boundary, user\nA.N, ENCASTRE\n");
    const char* const words[] = {"XSYMM",  "YSYMM",    "ZSYMM",  "XASYMM", "YASYMM",  "ZASYMM",
                                 "PINNED", "ENCASTRE", "NOWARP", "NOOVAL", "NODEFORM"};
    for (int i = 0; i < 11; ++i) {
        const OneCondition each("I", "kbcC_TypeBC", R"("S0": {"typeName": )" + std::to_string(i) + "}");
        EXPECT_EQ(each.Boundary("S0"), std::string("*Boundary\nA.N, ") + words[i] + "\n");
    }
}

TEST(Boundary, TypeThatIsNotSaid_WritesNotEvenItsCard) {
    const OneCondition model("IG", "kbcC_TypeBC", R"("S0": {"typeName": 6}, "S1": {"buckleCase": 1})");
    EXPECT_EQ(model.Boundary("S1"), "");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\nA.N, PINNED\n");
}

TEST(Boundary, TypeInABucklingStep_EntersTheLoadCasesOfItsBuckleCase) {
    const std::string one = "*Boundary, load case=1\nA.N, XSYMM\n";
    const std::string two = "*Boundary, load case=2\nA.N, XSYMM\n";
    const std::pair<const char*, std::string> cases[] = {
        {"0", one + two}, {"1", one}, {"\"buckling\"", two}, {"3", one + two}};
    for (const auto& [buckleCase, text] : cases) {
        const OneCondition model("IB", "kbcC_TypeBC",
                                 std::string(R"("S1": {"typeName": 0, "buckleCase": )") + buckleCase + "}");
        EXPECT_EQ(model.Boundary("S1"), text) << buckleCase;
    }
}

TEST(Boundary, TypeInAHarmonicStep_IsNotComplex) {
    const OneCondition model("ID", "kbcC_TypeBC", R"("S1": {"typeName": 0})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\nA.N, XSYMM\n");
}

TEST(Boundary, SymmetryRecord_IsAFixedTextWithABlankAtItsEnd) {
    const OneCondition model("IG", "kbcC_SymmetryBC", R"("S0": {}, "S1": {"deactivated": true})");
    EXPECT_EQ(model.Boundary("S0"), "**** symm BC output \n");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\n");
}

TEST(Boundary, Temperature_IsOnDegreeOfFreedomEleven) {
    const OneCondition model("IG", "kbcC_TemperatureBC",
                             R"("S0": {"magnitude": 20}, "S1": {"amplitude": "Ramp"})");
    EXPECT_EQ(model.Boundary("S0", oif_Op::MODIFY, 2.0), "*Boundary\nA.N, 11, 11, 40.\n");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary, amplitude=Ramp\nA.N, 11, 11, 20.\n");
    const OneCondition carried("IG", "kbcC_TemperatureBC",
                               R"("S0": {"magnitude": 20}, "S1": {"dofs": [12]})");
    EXPECT_EQ(carried.Boundary("S1"), "*Boundary\n");
}

TEST(Boundary, TemperatureOfShells_HasALineForEachListedDegreeOfFreedom) {
    const char states[] = R"("S0": {"magnitude": 20, "dofs": [11, 13, 12]}, "S1": {"magnitude": 5},
                             "S2": {"dofs": [14]}, "S3": {"dofs": null}, "S4": {"magnitude": null})";
    const OneCondition model("IGGGG", "kbcC_TemperatureBC", states, R"("dofsGiven": true)");
    EXPECT_EQ(model.Boundary("S0"), "*Boundary\nA.N, 11, 11, 20.\nA.N, 13, 13, 20.\nA.N, 12, 12, 20.\n");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\nA.N, 11, 11, 5.\nA.N, 13, 13, 5.\nA.N, 12, 12, 5.\n");
    EXPECT_EQ(model.Boundary("S2"), "*Boundary\nA.N, 14, 14, 5.\n") << "the list alone calls for its lines";
    EXPECT_EQ(model.Boundary("S3"), "*Boundary\n");
    EXPECT_EQ(model.Boundary("S4", oif_Op::NEW), "*Boundary, op=NEW\n");
}

TEST(Boundary, ScalarQuantities_HaveTheirDegreesOfFreedom) {
    const std::pair<const char*, const char*> classes[] = {
        {"kbcC_PorePressureBC", "8"},   {"kbcC_AcousticPressureBC", "8"},
        {"kbcC_FluidPressureBC", "8"},  {"kbcC_ElectricPotentialBC", "9"},
        {"kbcC_ConcentrationBC", "11"}, {"kbcC_FluidCavityPressureBC", "8"},
    };
    for (const auto& [name, dof] : classes) {
        const OneCondition model("IG", name, R"("S0": {"magnitude": 4}, "S1": {"amplitude": "Ramp"})",
                                 R"("distributionType": 1)");
        const std::string line = std::string("A.N, ") + dof + ", " + dof;
        EXPECT_EQ(model.Boundary("S0", oif_Op::MODIFY, 0.5), "*Boundary, user\n" + line + ", 2.\n") << name;
        EXPECT_EQ(model.Boundary("S1"), "*Boundary, amplitude=Ramp, user\n" + line + ", 4.\n") << name;
    }
}

TEST(Boundary, ScalarQuantityThatIsFixed_KeepsItsValue) {
    for (const char* name : {"kbcC_PorePressureBC", "kbcC_ElectricPotentialBC"}) {
        const OneCondition model("IG", name, R"("S1": {"magnitude": 4})", R"("fixed": true)");
        const std::string dof = std::string_view(name) == "kbcC_PorePressureBC" ? "8" : "9";
        EXPECT_EQ(model.Boundary("S1"), "*Boundary, fixed\nA.N, " + dof + ", " + dof + ", 4.\n");
    }
}

TEST(Boundary, ScalarQuantityThatIsNotSaid_WritesItsCardAlone) {
    const OneCondition model("IG", "kbcC_PorePressureBC", R"("S0": {"magnitude": 4})");
    EXPECT_EQ(model.Boundary("S1"), "*Boundary\n");
    const OneCondition acoustic("IG", "kbcC_AcousticPressureBC", R"("S0": {"magnitude": 4})");
    EXPECT_EQ(acoustic.Boundary("S1"), "*Boundary\n");
}

TEST(Boundary, ComplexScalarQuantity_WritesBothPartsWhateverWasSaid) {
    const OneCondition model("ID", "kbcC_ElectricPotentialBC",
                             R"("S1": {"magnitude": 4, "imaginaryMagnitude": -2})", R"("fixed": true)");
    EXPECT_EQ(model.Boundary("S1", oif_Op::MODIFY, 0.5), "*Boundary, load case=1, fixed\nA.N, 9, 9, 2.\n"
                                                         "*Boundary, load case=2, fixed\nA.N, 9, 9, -1.\n");
    const OneCondition none("ID", "kbcC_AcousticPressureBC", R"("S1": {})");
    EXPECT_EQ(none.Boundary("S1"), "*Boundary, load case=1\nA.N, 8, 8\n*Boundary, load case=2\nA.N, 8, 8\n");
    const OneCondition pore("ID", "kbcC_PorePressureBC", R"("S1": {"magnitude": 4})");
    EXPECT_EQ(pore.Boundary("S1"), "*Boundary\nA.N, 8, 8, 4.\n");
}

TEST(Boundary, Submodel_LeavesItsKeywordLineToTheListOfItsStep) {
    const OneCondition model(
        "IG", "kbcC_SubmodelBC",
        R"("S1": {"dofs": [1, 3, 2], "stepName": "2", "increment": 5, "timeScale": true})");
    EXPECT_EQ(model.Boundary("S1"), "A.N, 1, 1\nA.N, 3, 3\nA.N, 2, 2\n");
    const oif_Boundary boundary(model.Card("S1", oif_Op::NEW), false, "S0");
    EXPECT_TRUE(boundary.IsBCSubmodel());
    EXPECT_EQ(boundary.BCSubmodelKwd(), cow_String("*Boundary, op=NEW, submodel, step=2, inc=5, timescale"));
}

TEST(Boundary, SubmodelWithoutIncrement_HasNoneInItsLine) {
    for (const char* increment : {"0", "-3"}) {
        const OneCondition model("IG", "kbcC_SubmodelBC",
                                 std::string(R"("S1": {"dofs": [1], "stepName": "1", "increment": )") +
                                     increment + "}");
        const oif_Boundary boundary(model.Card("S1"), false, "S0");
        EXPECT_EQ(boundary.BCSubmodelKwd(), cow_String("*Boundary, submodel, step=1"));
    }
}

TEST(Boundary, SubmodelThatIsHeld_WritesItsLineItselfAndItsDataAllTheSame) {
    const OneCondition model("IG", "kbcC_SubmodelBC",
                             R"("S1": {"dofs": [1, 2], "stepName": "2", "centerZone": true})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW, fixed\nA.N, 1, 1\nA.N, 2, 2\n");
    EXPECT_FALSE(oif_Boundary(model.Card("S1"), false, "S0").IsBCSubmodel());
}

TEST(Boundary, SubmodelOutOfForceOrSuppressed_IsNoSubmodel) {
    const OneCondition ended("IG", "kbcC_SubmodelBC", R"("S0": {"dofs": [1]}, "S1": {"deactivated": true})");
    EXPECT_FALSE(oif_Boundary(ended.Card("S1", oif_Op::NEW), false, "S0").IsBCSubmodel());
    EXPECT_EQ(ended.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\n");
    const OneCondition suppressed("IG", "kbcC_SubmodelBC", R"("S0": {"dofs": [1], "centerZone": true})",
                                  R"("suppressed": true)");
    const oif_Boundary boundary(suppressed.Card("S0"), false, "S0");
    EXPECT_FALSE(boundary.IsBCSubmodel());
    EXPECT_EQ(boundary.BCSubmodelKwd(), cow_String("*Boundary"));
}

TEST(Boundary, SubmodelBetweenShellAndSolid_HasAThicknessInPlaceOfTheDegreeOfFreedom) {
    const OneCondition zone("IG", "kbcC_SubmodelBC", R"("S1": {"dofs": [1, 2], "shellThicknessValue": 2})",
                            R"("shellThickness": 5)");
    EXPECT_EQ(zone.Boundary("S1", oif_Op::MODIFY, 1.0, "B", true), "A.N, 2\n") << "a text, without a point";
    const OneCondition none("IG", "kbcC_SubmodelBC", R"("S1": {"dofs": [1, 2], "shellThicknessValue": 0})",
                            R"("shellThickness": 5)");
    EXPECT_EQ(none.Boundary("S1", oif_Op::MODIFY, 1.0, "B", true), "A.N, 0.5\n");
    const OneCondition negative("IG", "kbcC_SubmodelBC", R"("S1": {"shellThicknessValue": -1})",
                                R"("shellThickness": 0.25)");
    EXPECT_EQ(negative.Boundary("S1", oif_Op::MODIFY, 3.0, "B", true), "A.N, 0.025\n");
}

TEST(Boundary, ClassWithoutAForm_Fails) {
    OtherCondition other;
    other.Give("S0");
    kprC_StepContainer steps;
    steps.Append("S0", kprC_InitialStep());
    other.Propagate(steps);
    EXPECT_EQ(Raised([&] {
                  Written(oif_Boundary({"B", other, "N", "S0"}, false, "S0"));
              }),
              "Unimplemented boundary condition in input file.");
    EXPECT_EQ(Raised([&] {
                  Written(oif_ConnectorMotion({"B", other, "N", "S0"}, "S0"));
              }),
              "Unimplemented ConnectorMotion condition in input file.");
}

TEST(Boundary, ClassOfTheOtherKeyword_Fails) {
    const OneCondition motion("I", "kbcC_ConnVelocityBC", R"("S0": {"v1": 1})");
    EXPECT_EQ(Raised([&] { motion.Boundary("S0"); }), "Unimplemented boundary condition in input file.");
    const OneCondition boundary("I", kDisplacement, R"("S0": {"u1": 1})");
    EXPECT_EQ(Raised([&] { boundary.Motion("S0"); }),
              "Unimplemented ConnectorMotion condition in input file.");
}

TEST(ConnectorMotion, Displacement_HasOneNumberForEachDegreeOfFreedom) {
    const OneCondition model("IG", "kbcC_ConnDisplacementBC",
                             R"("S0": {"u1": 1}, "S1": {"u2": 3, "ur3": 0, "amplitude": "Ramp"})");
    EXPECT_EQ(model.Motion("S1"), "*Connector Motion, amplitude=Ramp\nA.E, 1, 1.\nA.E, 2, 3.\nA.E, 6\n");
    EXPECT_EQ(model.Motion("S1", oif_Op::NEW, 2.0),
              "*Connector Motion, op=NEW, amplitude=Ramp\nA.E, 1, 2.\nA.E, 2, 6.\nA.E, 6\n");
}

TEST(ConnectorMotion, AmplitudeThatIsTakenAway_DoesNotBringTheOtherComponentsAlong) {
    const OneCondition model("IGG", "kbcC_ConnDisplacementBC",
                             R"("S0": {"u1": 1, "amplitude": "Ramp"}, "S1": {"u2": 3, "amplitude": null})");
    EXPECT_EQ(model.Motion("S1"), "*Connector Motion\nA.E, 2, 3.\n");
}

TEST(ConnectorMotion, ComplexAndBuckling_GoAsDisplacementsOfNodes) {
    const OneCondition complex("ID", "kbcC_ConnDisplacementBC", R"("S1": {"u1": 1, "u1Imag": 2})",
                               R"("fixed": false, "distributionType": 1)");
    EXPECT_EQ(complex.Motion("S1"), "*Connector Motion, load case=1, user\nA.E, 1, 1.\n"
                                    "*Connector Motion, load case=2, user\nA.E, 1, 2.\n");
    const OneCondition buckling("IB", "kbcC_ConnDisplacementBC", R"("S1": {"u1": 1, "buckleCase": 2})");
    EXPECT_EQ(buckling.Motion("S1", oif_Op::NEW), "*Connector Motion, op=NEW, load case=2\nA.E, 1, 1.\n");
}

TEST(ConnectorMotion, FixedDisplacement_HasTheFlagAndNoValues) {
    const OneCondition model("IG", "kbcC_ConnDisplacementBC", R"("S1": {"u1": 1})", R"("fixed": true)");
    EXPECT_EQ(model.Motion("S1"), "*Connector Motion, fixed\nA.E, 1\n");
}

TEST(ConnectorMotion, FixedVelocityAndAcceleration_LeaveTheirValuesOutButHaveNoFlag) {
    const OneCondition velocity("IG", "kbcC_ConnVelocityBC", R"("S1": {"v1": 1, "vr1": 2})",
                                R"("fixed": true)");
    EXPECT_EQ(velocity.Motion("S1"), "*Connector Motion, type=VELOCITY\nA.E, 1\nA.E, 4\n");
    const OneCondition acceleration("ID", "kbcC_ConnAccelerationBC", R"("S1": {"a3": 1})");
    EXPECT_EQ(acceleration.Motion("S1"), "*Connector Motion, load case=1, type=ACCELERATION\nA.E, 3, 1.\n");
}

TEST(ConnectorMotion, ConditionThatEnds_IsItsCardAlone) {
    const OneCondition model("IGB", "kbcC_ConnVelocityBC",
                             R"("S0": {"v1": 1}, "S1": {"deactivated": true}, "S2": {"status": 11})");
    EXPECT_EQ(model.Motion("S1", oif_Op::NEW), "*Connector Motion, op=NEW\n");
    EXPECT_EQ(model.Motion("S2", oif_Op::NEW), "*Connector Motion, op=NEW, load case=1\n");
}

TEST(BoundaryForBoltLoad, ByMethod_IsReleasedAdjustedOrHeld) {
    ConditionModel model("IGGGG", R"("loads": {"B": {"class": "kloC_BoltLoad", "region": "A.F", "states": {
        "S1": {"boltMethod": "APPLY_FORCE", "magnitude": 7}, "S2": {"boltMethod": "ADJUST_LENGTH", "adjustment": 0.25},
        "S3": {"boltMethod": "FIX_LENGTH"}, "S4": {"deactivated": true}}}})");
    const auto text = [&](const char* step, oif_Op op, float scale = 1.0F) {
        const kloC_BoltLoad& bolt = model.Bolt("B");
        return Written(oif_BoundaryForBoltLoad({"B", bolt, "A.N", step, op, {}, scale}, bolt));
    };
    EXPECT_EQ(text("S1", oif_Op::MODIFY), "*Boundary, op=NEW\n") << "a release is never told by adding";
    EXPECT_EQ(text("S2", oif_Op::MODIFY, 2.0F), "*Boundary\nA.N, 1, 1, 0.5\n");
    EXPECT_EQ(text("S2", oif_Op::NEW), "*Boundary, op=NEW\nA.N, 1, 1, 0.25\n");
    EXPECT_EQ(text("S3", oif_Op::MODIFY), "*Boundary, fixed\nA.N, 1, 1\n");
    EXPECT_EQ(text("S3", oif_Op::NEW), "*Boundary, op=NEW, fixed\nA.N, 1, 1\n");
    EXPECT_EQ(text("S4", oif_Op::MODIFY), "*Boundary, op=NEW\n");
}

TEST(BoundaryConditions, QueriesByName_GiveStateAndParts) {
    const OneCondition model("IG", kDisplacement,
                             R"("S0": {"u1": 1, "ur3": 3, "ur3Imag": 4}, "S1": {"u1": null})");
    const auto& bc = static_cast<const kbcC_DisplacementBC&>(model.Record());
    using State = mdl_PropAttributeStateEnm;
    EXPECT_EQ(bc.GetU1State("S0"), State::SET);
    EXPECT_EQ(bc.GetU1State("S1"), State::CLEARED);
    EXPECT_EQ(bc.GetU2State("S1"), State::NEVER_SET);
    EXPECT_EQ(bc.GetUR3State("S1"), State::CARRIED);
    EXPECT_EQ(bc.GetU1Real("S0"), 1.0);
    EXPECT_EQ(bc.GetU1Real("S1"), 0.0);
    EXPECT_EQ(bc.GetUR3Real("S1"), 3.0);
    EXPECT_EQ(bc.GetUR3Imag("S1"), 4.0);
    EXPECT_EQ(bc.GetUR2Imag("S1"), 0.0);

    const OneCondition velocity("I", "kbcC_VelocityBC", R"("S0": {"v2": 5, "vr1": 6})");
    const auto& v = static_cast<const kbcC_VelocityBC&>(velocity.Record());
    EXPECT_EQ(v.GetV2Real("S0") + v.GetVR1Real("S0"), 11.0);
    EXPECT_EQ(v.GetV3State("S0"), State::NEVER_SET);
    const OneCondition acceleration("I", "kbcC_ConnAccelerationBC", R"("S0": {"a3": 5, "ar2": 6})");
    const auto& a = static_cast<const kbcC_ConnAccelerationBC&>(acceleration.Record());
    EXPECT_EQ(a.GetA3Real("S0") + a.GetAR2Real("S0"), 11.0);
    EXPECT_EQ(a.GetAR1State("S0"), State::NEVER_SET);
}

TEST(BoundaryConditions, ValueGivenWithAStateThatHasNone_ReadsAsZero) {
    const OneCondition model("I", kDisplacement, R"("S0": {"u1": {"value": 5, "state": 3}, "u1Imag": 6,
                                                           "u2": {"value": 7, "state": 2}})");
    const auto& bc = static_cast<const kbcC_DisplacementBC&>(model.Record());
    EXPECT_EQ(bc.GetU1Real("S0"), 0.0);
    EXPECT_EQ(bc.GetU1Imag("S0"), 0.0);
    EXPECT_EQ(bc.GetU2Real("S0"), 7.0);
}

TEST(BoundaryConditions, UseComplex_HoldsForTheTwoDirectHarmonicProcedures) {
    const std::pair<const char*, bool> classes[] = {
        {"kbcC_DisplacementBC", true},     {"kbcC_VelocityBC", true},
        {"kbcC_AccelerationBC", true},     {"kbcC_ConnDisplacementBC", true},
        {"kbcC_ConnVelocityBC", true},     {"kbcC_ConnAccelerationBC", true},
        {"kbcC_AcousticPressureBC", true}, {"kbcC_ElectricPotentialBC", true},
        {"kbcC_PorePressureBC", false},    {"kbcC_FluidPressureBC", false},
        {"kbcC_ConcentrationBC", false},   {"kbcC_FluidCavityPressureBC", false},
        {"kbcC_TemperatureBC", false},     {"kbcC_TypeBC", false},
        {"kbcC_SymmetryBC", false},        {"kbcC_SubmodelBC", false}};
    for (const auto& [name, complex] : classes) {
        const OneCondition model("I", name, R"("S0": {})");
        const kbcC_BCState& state = model.Record().ConstGetStateQuad("S0").state.ConstGet();
        for (const unsigned id : {0x23C0076U, 0x23C007EU}) EXPECT_EQ(state.UseComplex(id), complex) << name;
        for (const unsigned id : {0U, 0x23C0077U, 0x23C0070U, 0x23C0066U, 0x23C0073U}) {
            EXPECT_FALSE(state.UseComplex(id)) << name << " " << id;
        }
    }
}

TEST(BoundaryConditions, ModifiedNeedsOpNew_WhereSomethingIsFreed) {
    struct Case {
        const char* className;
        const char* first;
        const char* change;
        bool needed;
        const char* fields = "";
    };
    const Case cases[] = {
        {"kbcC_DisplacementBC", R"("u1": 1)", R"("u1": 2, "amplitude": "Ramp", "buckleCase": 1)", false},
        {"kbcC_DisplacementBC", R"("u1": 1)", R"("u1": null)", true},
        {"kbcC_DisplacementBC", R"("ur3": 1)", R"("ur3": null)", true},
        {"kbcC_DisplacementBC", R"("u1": 1, "amplitude": "Ramp")", R"("amplitude": null)", false},
        {"kbcC_VelocityBC", R"("v1": 1)", R"("v1": null)", true},
        {"kbcC_VelocityBC", R"("v1": 1)", R"("v2": 2)", false},
        {"kbcC_AccelerationBC", R"("ar1": 1)", R"("ar1": null)", true},
        {"kbcC_ConnDisplacementBC", R"("u1": 1)", R"("u1": null)", true},
        {"kbcC_ConnVelocityBC", R"("v1": 1)", R"("v1": 2)", false},
        {"kbcC_ConnAccelerationBC", R"("a1": 1)", R"("a1": null)", true},
        {"kbcC_TypeBC", R"("typeName": 6)", R"("typeName": 7)", true},
        {"kbcC_TypeBC", R"("typeName": 6)", R"("typeName": null)", true},
        {"kbcC_TypeBC", R"("typeName": 6)", R"("buckleCase": 1)", false},
        {"kbcC_SymmetryBC", R"("amplitude": "Ramp")", R"("amplitude": null)", false},
        {"kbcC_TemperatureBC", R"("magnitude": 6)", R"("magnitude": 7, "dofs": [12])", false},
        {"kbcC_TemperatureBC", R"("magnitude": 6)", R"("magnitude": null)", true},
        {"kbcC_TemperatureBC", R"("magnitude": 6)", R"("dofs": [12])", true, R"("dofsGiven": true)"},
        {"kbcC_TemperatureBC", R"("dofs": [12])", R"("dofs": null)", true, R"("dofsGiven": true)"},
        {"kbcC_PorePressureBC", R"("magnitude": 6)", R"("magnitude": 7)", false},
        {"kbcC_PorePressureBC", R"("magnitude": 6)", R"("magnitude": null)", true},
        {"kbcC_ElectricPotentialBC", R"("magnitude": 6)", R"("magnitude": null)", true},
        {"kbcC_SubmodelBC", R"("dofs": [1, 2])", R"("dofs": [1])", true},
        {"kbcC_SubmodelBC", R"("dofs": [1])",
         R"("stepName": "2", "increment": 3, "timeScale": true, "centerZone": true, "shellThicknessValue": 1)",
         false},
    };
    for (const Case& each : cases) {
        const OneCondition model("IG", each.className,
                                 std::string(R"("S0": {)") + each.first + R"(}, "S1": {)" + each.change + "}",
                                 each.fields);
        EXPECT_EQ(model.Record().ModifiedNeedsOpNew("S1"), each.needed)
            << each.className << " " << each.change;
    }
}

TEST(BoundaryConditions, BaseState_HoldsWhatItHeldWithoutValuesAndAmplitude) {
    const OneCondition motion("IF", kDisplacement,
                              R"("S0": {"u1": 1, "u1Imag": 2, "amplitude": "Ramp", "buckleCase": 2})");
    const auto& state = static_cast<const kbcC_DisplacementBCState&>(
        motion.Record().ConstGetStateQuad("S1").state.ConstGet());
    EXPECT_EQ(static_cast<int>(state.u1.State()), 2);
    EXPECT_EQ(state.u1.ConstGet(), 0.0);
    EXPECT_EQ(state.u1Imag, 0.0);
    EXPECT_EQ(static_cast<int>(state.amplitude.State()), 0);
    EXPECT_TRUE(state.amplitude.ConstGet().IsEmpty());
    EXPECT_EQ(state.buckleCase, 2);

    const OneCondition shell("IF", "kbcC_TemperatureBC", R"("S0": {"magnitude": 1, "dofs": [11, 12]})",
                             R"("dofsGiven": true)");
    EXPECT_EQ(shell.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\nA.N, 11, 11\nA.N, 12, 12\n");
    const OneCondition potential("ID", "kbcC_ElectricPotentialBC",
                                 R"("S0": {"magnitude": 1, "imaginaryMagnitude": 2})");
    EXPECT_EQ(potential.Boundary("S1", oif_Op::NEW),
              "*Boundary, op=NEW, load case=1\nA.N, 9, 9\n*Boundary, op=NEW, load case=2\nA.N, 9, 9\n");
    const OneCondition type("IF", "kbcC_TypeBC", R"("S0": {"typeName": "PINNED"})");
    EXPECT_EQ(type.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW\nA.N, PINNED\n");
}

TEST(BoundaryConditions, DisplacementInABucklingStepOfItsOwn_KeepsItsValue) {
    const OneCondition model("IB", kDisplacement, R"("S0": {"u1": 1}, "S1": {"u1": 0.01, "buckleCase": 1})");
    EXPECT_EQ(model.Boundary("S1", oif_Op::NEW), "*Boundary, op=NEW, load case=1\nA.N, 1, 1, 0.01\n");
}
