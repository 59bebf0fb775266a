#include "interactions/oif_ContactControls.h"
#include "support/DeckTest.h"

namespace {

std::string Explicit(const kinC_ExpContactControls& controls, bool isNew = false, bool reset = false) {
    return Written(oif_ContactControls(controls, "C 1", isNew, reset));
}

std::string Standard(const kinC_StdContactControls& controls, bool isNew = true, bool reset = false) {
    return Written(oif_ContactControls(controls, "I.M", "I.S", isNew, reset));
}

const std::string kExplicit = "*Contact Controls, cpset=\"C 1\"";
const std::string kStandard = "*Contact Controls, master=I.M, slave=I.S";

} // namespace

TEST(ExplicitControls, NewAndReset_WritesNothing) {
    EXPECT_EQ(Explicit({}, true, true), "");
}

TEST(ExplicitControls, Reset_HasNoOption) {
    kinC_ExpContactControls controls;
    controls.scalePenalty = 2.0;
    EXPECT_EQ(Explicit(controls, false, true), kExplicit + ", reset\n");
}

TEST(ExplicitControls, Default_ResetsAll) {
    EXPECT_EQ(Explicit({}), kExplicit + ", reset\n");
}

TEST(ExplicitControls, OneOption_ResetsTheOthers) {
    kinC_ExpContactControls controls;
    controls.fastLocalTrk = false;
    EXPECT_EQ(Explicit(controls), kExplicit + ", fastlocaltrk=NO, reset\n");
    controls = {};
    controls.globTrkChoice = 1;
    EXPECT_EQ(Explicit(controls, true), kExplicit + ", globtrkinc=100, reset\n");
    controls = {};
    controls.scalePenalty = 2.0;
    EXPECT_EQ(Explicit(controls), kExplicit + ", scale penalty=2., reset\n");
    controls = {};
    controls.warpCheckPeriod = 10;
    EXPECT_EQ(Explicit(controls), kExplicit + ", warp check period=10, reset\n");
    controls = {};
    controls.warpCutoff = 30.0;
    EXPECT_EQ(Explicit(controls), kExplicit + ", warp cut off=30., reset\n");
}

TEST(ExplicitControls, AllOptions_ResetNothing) {
    kinC_ExpContactControls controls;
    controls.fastLocalTrk = false;
    controls.globTrkChoice = 1;
    controls.globTrkInc = 5;
    controls.scalePenalty = 2.0;
    controls.warpCheckPeriod = 10;
    controls.warpCutoff = 30.0;
    EXPECT_EQ(Explicit(controls), kExplicit + ", fastlocaltrk=NO, globtrkinc=5, scale penalty=2., warp check "
                                              "period=10, warp cut off=30.\n");
}

TEST(ExplicitControls, LongName_BreaksAheadOfAnyOptionButTheFirst) {
    kinC_ExpContactControls controls;
    controls.fastLocalTrk = false;
    controls.scalePenalty = 2.0;
    const std::string name(120, 'n');
    EXPECT_EQ(Written(oif_ContactControls(controls, cow_String(name), false, false)),
              "*Contact Controls, cpset=" + name + ", fastlocaltrk=NO, \nscale penalty=2., reset\n");
}

TEST(StandardControls, NewAndReset_WritesNothing) {
    EXPECT_EQ(Standard({}, true, true), "");
}

TEST(StandardControls, Reset_IsOneLine) {
    kinC_StdContactControls controls;
    controls.maxchp = 3;
    EXPECT_EQ(Standard(controls, false, true), kStandard + ", reset\n");
}

TEST(StandardControls, DefaultAndNotNew_AreTheLineThatResets) {
    EXPECT_EQ(Standard({}, false), kStandard + ", reset\n");
    EXPECT_EQ(Standard({}, true), "");
}

TEST(StandardControls, NotNew_ResetOnALineOfTheirOwnFirst) {
    kinC_StdContactControls controls;
    controls.maxchp = 3;
    EXPECT_EQ(Standard(controls, false), kStandard + ", reset\n" + kStandard + ", maxchp=3\n");
}

TEST(StandardControls, PenetrationTolerance_IsRelativeOrAbsolute) {
    kinC_StdContactControls controls;
    controls.relativePenetrationTolerance = 0.01;
    EXPECT_EQ(Standard(controls), kStandard + ", relativePenetrationTolerance=0.01\n");
    controls = {};
    controls.relativeTolerance = 0;
    controls.relativePenetrationTolerance = 0.01;
    EXPECT_EQ(Standard(controls), kStandard + ", absolutePenetrationTolerance=0.\n");
    controls = {};
    controls.absolutePenetrationTolerance = 5.0;
    // Not in force, but the controls aren't the default ones any more.
    EXPECT_EQ(Standard(controls), kStandard + "\n");
}

TEST(StandardControls, Options_AreWrittenUnlessDefault) {
    kinC_StdContactControls controls;
    controls.stiffnessScaleFactor = 2.0;
    controls.limitSlideDistance = true;
    controls.slideDistance = 0.5;
    controls.delayedFrictionOnset = 1;
    controls.maxchp = 3;
    controls.perrmx = 0.25;
    controls.uerrmx = 0.125;
    EXPECT_EQ(Standard(controls),
              kStandard + ", stiffnessScaleFactor=2., slideDistance=0.5, frictionOnset=DELAYED, maxchp=3, "
                          "perrmx=0.25, \nuerrmx=0.125\n");
}

TEST(StandardControls, AutomaticTolerances_HideTheThreeTolerances) {
    kinC_StdContactControls controls;
    controls.automaticTolerances = true;
    controls.maxchp = 3;
    controls.perrmx = 0.25;
    controls.uerrmx = 0.125;
    EXPECT_EQ(Standard(controls), kStandard + ", automaticTolerances\n");
}

TEST(StandardControls, Stabilization_HasItsCoefficientOrNone) {
    kinC_StdContactControls controls;
    controls.stabilization = 1;
    controls.dampCoef = 0.1;
    controls.tangFraction = 0.5;
    controls.eosFraction = 0.25; // without a data line, nowhere
    EXPECT_EQ(Standard(controls), kStandard + ", stabilize=0.1, tangent fraction=0.5\n");
}

TEST(StandardControls, StabilizationOff_HidesAllItsFigures) {
    kinC_StdContactControls controls;
    controls.tangFraction = 0.5;
    controls.zeroDampingClearance = 1.0;
    EXPECT_EQ(Standard(controls), kStandard + "\n");
}

TEST(StandardControls, AutomaticStabilization_AlwaysHasADataLine) {
    kinC_StdContactControls controls;
    controls.stabilization = 2;
    EXPECT_EQ(Standard(controls), kStandard + ", stabilize\n , 0.\n");
    controls.eosFraction = 0.25;
    controls.zeroDampingClearance = 1.5;
    EXPECT_EQ(Standard(controls), kStandard + ", stabilize\n0.25, 1.5\n");
}

TEST(StandardControls, ZeroDamping_IsWrittenForItsChoiceOnly) {
    kinC_StdContactControls controls;
    controls.stabilization = 1;
    controls.zeroDampingChoice = 1;
    controls.zeroDamping = 0.75;
    EXPECT_EQ(Standard(controls), kStandard + ", stabilize=0.\n , 0., 0.75\n");
    controls.zeroDampingChoice = 2;
    EXPECT_EQ(Standard(controls), kStandard + ", stabilize=0.\n");
}

TEST(ContactControls, OfANewRecord_AreTheDefault) {
    EXPECT_TRUE(kinC_StdContactControls().IsDefault());
    EXPECT_TRUE(kinC_ExpContactControls().IsDefault());
}

TEST(ContactControls, WithAnyFieldChanged_AreNotTheDefault) {
    kinC_StdContactControls standard;
    standard.zeroDamping = 1.0;
    EXPECT_FALSE(standard.IsDefault());
    kinC_ExpContactControls controls;
    controls.globTrkInc = 5;
    EXPECT_FALSE(controls.IsDefault());
}
